// Translates a small workspace and tells what came of it.
#pragma once

#include <tests/translation/SmallWorkspace.h>
#include <translation/WorkspaceTranslation.h>

#include <QRegularExpression>
#include <gtest/gtest.h>

struct Outcome {
  TranslationResult result;
  QStringList diagnostics;  // "rule node"
  QStringList texts;        // of the diagnostics
  QString text;
};

inline QStringList describe(const orx::Findings& diagnostics) {
  QStringList result;
  for (const orx::Finding& diagnostic : diagnostics.all()) {
    EXPECT_FALSE(diagnostic.text.isEmpty()) << orx::ruleRow(diagnostic.rule).name.latin1();
    result << QString("%1 %2").arg(orx::ruleRow(diagnostic.rule).name, diagnostic.node);
  }
  return result;
}

// Small workspaces have loose ends; these rules have tests of their own.
inline orx::RuleSettings withoutLooseEnds() {
  orx::RuleSettings settings;
  QString reason;
  for (const char* rule : {"unfed-input", "unfed-writer", "dropped-output", "unused-reader",
                           "unused-parameter", "unused-custom-transformer", "unknown-reference"})
    EXPECT_TRUE(settings.set(QString(rule) + "=off", reason)) << reason.toStdString();
  return settings;
}

inline Outcome translate(const SmallWorkspace& workspace, TransformerSource& source,
                         const QHash<QString, QString>& values = {}) {
  QTemporaryDir folder;
  const QString file = workspace.save(folder);
  orx::Findings diagnostics(file);
  QString error;
  const QString output = folder.filePath("out.mf");
  Outcome outcome;
  outcome.result = translateWorkspace({file, output, values}, source, diagnostics, error, withoutLooseEnds());
  EXPECT_EQ(error, QString());
  outcome.diagnostics = describe(diagnostics);
  for (const orx::Finding& diagnostic : diagnostics.all())
    outcome.texts << diagnostic.text;
  // Continuation lines joined and padding dropped: what is compared is the statements.
  outcome.text = QString::fromUtf8(QFile::exists(output) ? readAll(output) : "")
                     .replace(QRegularExpression(" +\\\\\n(# )?"), " ")
                     .replace(QRegularExpression(" +"), " ")
                     .replace("\n\n", "\n");
  return outcome;
}

inline Outcome translate(const SmallWorkspace& workspace, const QHash<QString, QString>& values = {}) {
  SmallSource source;
  return translate(workspace, source, values);
}
