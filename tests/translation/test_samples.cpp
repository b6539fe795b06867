// The shipped samples against their reference output (scripts/renew-samples writes it).
#include <platform/orxutil/orxutil.h>
#include <platform/session/session.h>
#include <tests/support/QtPrinters.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/WorkspaceTranslation.h>

#include <QDir>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

QByteArray readAll(const QString& path) {
  QFile file(path);
  return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

TEST(Samples, GiveTheirReferenceOutput) {
  ORX_addResourceDirectory(QStringLiteral(ORX_SOURCE_DIR) + "/samples/custom");
  ORXSession session;
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  registry.loadTransformers(&session);
  const QDir samples(QStringLiteral(ORX_SOURCE_DIR) + "/samples");
  const QStringList names = samples.entryList({"*.orw"});
  ASSERT_GE(names.size(), 5);
  QTemporaryDir folder;
  for (const QString& name : names) {
    const QString file = samples.filePath(name);
    const QString output = folder.filePath("out.mf");
    orx::Findings diagnostics(file);
    QString error;
    EXPECT_EQ(translateWorkspace({file, output, {}}, registry, diagnostics, error), TranslationResult::Done)
        << name.toStdString();
    for (const orx::Finding& diagnostic : diagnostics.all())
      EXPECT_EQ(diagnostic.severity, orx::Severity::Hint) << orx::formatFinding(diagnostic).toStdString();
    EXPECT_EQ(readAll(output), readAll(samples.filePath(name.chopped(4) + ".mf"))) << name.toStdString();
  }
}

}  // namespace
