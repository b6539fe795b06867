// The table of rules, its description for people, and what settings may do to it.
#include <tests/support/Files.h>
#include <tests/support/QtPrinters.h>
#include <transform/findings/Refusal.h>
#include <transform/findings/RuleSettings.h>
#include <transform/findings/Rules.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QDir>
#include <QRegularExpression>
#include <gtest/gtest.h>

#include <thread>

namespace {

QString about(orx::RuleKind kind) {
  switch (kind) {
    case orx::RuleKind::Writing:
      return ", cannot be lowered";
    case orx::RuleKind::Machine:
      return ", depends on the machine";
    case orx::RuleKind::Judgement:
      break;
  }
  return QString();
}

TEST(Rules, AreDescribedInTheirOrder) {
  const QString text = QString::fromUtf8(readAll(ORX_SOURCE_DIR "/docs/diagnostics.md"));
  const QStringList sections = text.split("\n## ").mid(1);
  ASSERT_EQ(sections.size(), static_cast<int>(orx::ruleTable().size()));
  static const QRegularExpression kForm(
      "^([a-z0-9-]+)\n\nSeverity: ([a-z, ]+)\n\n> ([^\n]+)\n\nMeaning: [^\n].{15,}\n\nRemedy: [^\n].{10,}$",
      QRegularExpression::DotMatchesEverythingOption);
  for (int i = 0; i < sections.size(); ++i) {
    const orx::RuleRow& rule = orx::ruleTable()[static_cast<std::size_t>(i)];
    EXPECT_EQ(static_cast<int>(rule.rule), i) << rule.name.latin1();
    EXPECT_EQ(orx::findRule(rule.name), &rule) << "two rules are called " << rule.name.latin1();
    const QRegularExpressionMatch match = kForm.match(sections.at(i).trimmed());
    ASSERT_TRUE(match.hasMatch()) << sections.at(i).toStdString();
    EXPECT_EQ(match.captured(1), QString(rule.name));
    EXPECT_EQ(match.captured(2), orx::severityName(rule.severity) + about(rule.kind)) << rule.name.latin1();
    if (rule.message == 0)
      continue;
    const QString message = TransformResString(rule.message);
    ASSERT_FALSE(message.isEmpty()) << rule.name.latin1();
    const QString example = QRegularExpression::escape(message).replace(QRegularExpression("\\\\%\\d"), ".+");
    EXPECT_TRUE(QRegularExpression("^" + example + "$").match(match.captured(3)).hasMatch())
        << match.captured(3).toStdString() << "\n"
        << message.toStdString();
  }
}

// Every rule has a broken workspace that shows it.
TEST(Rules, AreShownByExamples) {
  QByteArray said;
  for (const char* folder : {"/tests/data/broken/", "/tests/data/broken/mapping-files/"}) {
    const QString path = QStringLiteral(ORX_SOURCE_DIR) + folder;
    for (const QString& name : QDir(path).entryList({"*.expected"}))
      said += readAll(path + name);
  }
  QStringList missing;
  for (const orx::RuleRow& rule : orx::ruleTable()) {
    if (rule.rule < orx::Rule::UnreadableFile &&
        !said.contains(QByteArray(" [") + rule.name.latin1() + "]\n"))
      missing << rule.name;
  }
  // The first two are about other commands; the others take large files, or no Python.
  EXPECT_EQ(missing, (QStringList{"unknown-global-parameter", "lost-content", "long-statement", "deep-block",
                                  "unchecked-python", "too-many-findings", "too-many-names"}));
}

// What every rule allows, told by its kind alone.
TEST(RuleSettings, LowerWhatTheyMay) {
  for (const orx::RuleRow& row : orx::ruleTable()) {
    for (const char* word : {"off", "hint", "warning", "error"}) {
      orx::RuleSettings settings;
      QString reason;
      const bool isSet = settings.set(QString(row.name) + "=" + word, reason);
      const bool isAllowed = row.kind != orx::RuleKind::Writing || orx::severityName(row.severity) == word;
      EXPECT_EQ(isSet, isAllowed) << row.name.latin1() << "=" << word;
      EXPECT_EQ(reason.contains(row.name), !isAllowed) << reason.toStdString();
      orx::Finding finding;
      finding.rule = row.rule;
      const std::vector<orx::Finding> left = settings.apply({finding});
      ASSERT_EQ(left.size(), isAllowed && word == QString("off") ? 0U : 1U);
      const QString counted = isAllowed ? QString(word) : orx::severityName(row.severity);
      EXPECT_TRUE(left.empty() || orx::severityName(left.front().severity) == counted) << row.name.latin1();
    }
    EXPECT_TRUE(row.kind != orx::RuleKind::Machine || row.severity == orx::Severity::Warning)
        << row.name.latin1();
    EXPECT_TRUE(row.kind != orx::RuleKind::Writing || row.severity == orx::Severity::Error)
        << row.name.latin1();
  }
  orx::RuleSettings settings;
  QString reason;
  for (const char* wrong : {"no-such-rule=off", "cycle", "=off", "unused-reader=loud", "unused-reader="})
    EXPECT_FALSE(settings.set(wrong, reason)) << wrong;
}

TEST(Refusals, AreHeardByTheInnermostListenerOfTheirThread) {
  const orx::Refusal kMissing{orx::Rule::MissingFile, orx::messages::kMissingFile, true};
  QString text;
  EXPECT_FALSE(orx::refuse(text, kMissing, {"a"}));
  EXPECT_EQ(text, TransformResString(orx::messages::kMissingFile, QString("a")));
  const orx::RefusalListener outer;
  EXPECT_EQ(outer.refusal().message, 0) << "what was told before is not kept";
  {
    const orx::RefusalListener inner;
    orx::refuse(text, orx::messages::kBadPattern);
    orx::refuse(text, kMissing);
    EXPECT_EQ(inner.refusal().rule, orx::Rule::MissingFile);
    EXPECT_TRUE(inner.refusal().namesParameter);
    EXPECT_EQ(outer.refusal().message, 0);
  }
  std::thread([] {
    QString other;
    orx::refuse(other, orx::messages::kBadPattern);
  }).join();
  EXPECT_EQ(outer.refusal().message, 0);
  orx::refuse(text, orx::messages::kBadPattern);
  EXPECT_EQ(outer.refusal().message, orx::messages::kBadPattern);
  EXPECT_EQ(outer.refusal().rule, orx::Rule::InvalidValue);
}

}  // namespace
