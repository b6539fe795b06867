#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/DefinitionOptions.h>
#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <transform/registry/TransformerMgr.h>

#include <CLI/CLI.hpp>

void DefinitionOptions::declare(CLI::App& app) {
  app.add_option("--resources", m_resources,
                 "Folder with further definitions, behind all others (repeatable)")
      ->type_name("DIR")
      ->check(CLI::ExistingDirectory)
      ->expected(1)
      ->allow_extra_args(false)
      ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
  app.add_option("--lang", m_language, "Language of texts: en, de or fr")->type_name("LANG");
}

void DefinitionOptions::setLanguage() const {
  if (!m_language.empty())
    QORXSetLanguage(QString::fromStdString(m_language));
}

TransformerMgr& DefinitionOptions::load(Console& console) const {
  setLanguage();
  for (const std::string& folder : m_resources)
    ORX_addResourceDirectory(QString::fromStdString(folder));
  // Lives as long as the process: the registry keeps it.
  static ORXSession session;
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  if (!registry.isLoaded()) {
    registry.loadTransformers(&session);
    for (const QString& error : registry.errors())
      console.fail(error);
  }
  return registry;
}

TransformerMgr& DefinitionOptions::loadCatalogue(Console& console) const {
  TransformerMgr& registry = load(console);
  for (const TransformerMgr::IgnoredTransformer& ignored : registry.ignoredTransformers())
    console.fail(ignored.reason());
  if (registry.transformerNames().isEmpty()) {
    console.fail(QStringLiteral("no transformers were found in any of: %1")
                     .arg(ORX_resourcePlaces(QStringLiteral("transformer")).join(QLatin1String(", "))));
  }
  return registry;
}
