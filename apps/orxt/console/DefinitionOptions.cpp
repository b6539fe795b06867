#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/DefinitionOptions.h>
#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <CLI/CLI.hpp>
#include <QRegularExpression>

namespace messages = orx::messages;

namespace {

std::string noLanguage(const QString& language) {
  const QString known = orx::messageLanguages().join(QLatin1String(", "));
  return TransformResString(messages::kNoLanguage, {language, known}).toStdString();
}

// Why there are no texts in it; empty when there are. A locale counts by its language.
std::string refuseLanguage(const QString& given) {
  static const QRegularExpression kLocale(QStringLiteral("^[A-Za-z]{2}([_.@-].*)?$"));
  const bool isKnown =
      kLocale.match(given).hasMatch() && orx::messageLanguages().contains(given.left(2).toLower());
  return isKnown ? std::string() : noLanguage(given);
}

}  // namespace

void DefinitionOptions::declare(CLI::App& app) {
  app.add_option("--resources", m_resources,
                 "Folder with further definitions, behind all others (repeatable)")
      ->type_name("DIR")
      ->check(CLI::ExistingDirectory)
      ->expected(1)
      ->allow_extra_args(false)
      ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
  declareLanguage(app);
}

void DefinitionOptions::declareLanguage(CLI::App& app) {
  app.add_option("--lang", m_language, "Language of texts, such as en, de or fr")
      ->type_name("LANG")
      ->check([](const std::string& language) { return refuseLanguage(QString::fromStdString(language)); })
      ->each([](const std::string& language) { QORXSetLanguage(QString::fromStdString(language)); });
}

void DefinitionOptions::checkLanguage(Console& console) {
  if (!refuseLanguage(QORXLanguage()).empty() && !orx::messageLanguages().isEmpty())
    console.fail(QString::fromStdString(noLanguage(QORXLanguage())));
}

TransformerMgr& DefinitionOptions::load(Console& console) const {
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
    console.fail(messages::kNoTransformers,
                 {ORX_resourcePlaces(QStringLiteral("transformer")).join(QLatin1String(", "))});
  }
  return registry;
}
