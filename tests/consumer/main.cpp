// The main job through the installed libraries: load the definitions of the installed home, configure a
// transformer, translate a workspace.
#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageStrings.h>
#include <translation/ProgramVersion.h>
#include <translation/WorkspaceTranslation.h>

#include <iostream>

namespace {

void print(const char* what, const QString& text) {
  std::cout << what << ": " << text.toStdString() << '\n';
}

// A copy of a prototype is ours to change.
bool configure(TransformerMgr& manager, const QString& name, const QString& identifier) {
  const std::unique_ptr<TransformerCfg> transformer(
      manager.getTransformer(name, TransformerMgr::NEWEST_VERSION));
  if (transformer == nullptr) {
    return false;
  }
  transformer->setIdentifier(identifier);
  print("configured", transformer->getName() + QLatin1Char(' ') + transformer->getIdentifier());
  return transformer->getIdentifier() == identifier;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 4) {
    std::cerr << "usage: consumer TRANSFORMER WORKSPACE MAPPING_FILE\n";
    return 2;
  }
  print("program", programVersion());
  print("home", QORXOrxHome());
  print("message 370608", TransformResString(370608, QStringLiteral("WIDTH")));

  ORXSession session;
  TransformerMgr& manager = TransformerMgr::getTransformerMgr();
  manager.loadTransformers(&session);
  std::cout << "transformers: " << manager.transformerNames().size() << '\n';
  if (!manager.lastError().isEmpty() ||
      !configure(manager, QORXFromLocal8Bit(argv[1]), QStringLiteral("Mine"))) {
    std::cerr << argv[1] << " cannot be configured " << manager.lastError().toStdString() << '\n';
    return 1;
  }

  TranslationRequest request;
  request.workspaceFile = QORXFromLocal8Bit(argv[2]);
  request.outputFile = QORXFromLocal8Bit(argv[3]);
  orx::Findings diagnostics(request.workspaceFile);
  QString error;
  const TranslationResult result = translateWorkspace(request, manager, diagnostics, error);
  for (const orx::Finding& diagnostic : diagnostics.all()) {
    std::cerr << orx::formatFinding(diagnostic).toStdString() << '\n';
  }
  if (result != TranslationResult::Done) {
    std::cerr << "the workspace was not translated " << error.toStdString() << '\n';
    return 1;
  }
  return 0;
}
