// The table of rules, its description for people, and the search for the name that was meant.
#include <tests/support/QtPrinters.h>
#include <transform/text/MessageStrings.h>
#include <translation/DiagnosticRules.h>
#include <translation/Diagnostics.h>
#include <translation/NearestSpelling.h>
#include <translation/graph/ReferencedNames.h>

#include <QDir>
#include <QFile>
#include <QRegularExpression>
#include <gtest/gtest.h>

namespace {

TEST(DiagnosticRules, AreDescribedInTheirOrder) {
  QFile file(QStringLiteral(ORX_SOURCE_DIR) + "/docs/diagnostics.md");
  ASSERT_TRUE(file.open(QIODevice::ReadOnly));
  const QStringList sections = QString::fromUtf8(file.readAll()).split("\n## ").mid(1);
  ASSERT_EQ(sections.size(), static_cast<int>(diagnosticRules().size()));
  static const QRegularExpression kForm(
      "^([a-z0-9-]+)\n\nSeverity: ([a-z]+)\n\n> ([^\n]+)\n\nMeaning: [^\n].{15,}\n\nRemedy: [^\n].{10,}$",
      QRegularExpression::DotMatchesEverythingOption);
  for (int i = 0; i < sections.size(); ++i) {
    const DiagnosticRule& rule = diagnosticRules()[static_cast<std::size_t>(i)];
    EXPECT_EQ(static_cast<int>(rule.rule), i) << rule.name.latin1();
    const QRegularExpressionMatch match = kForm.match(sections.at(i).trimmed());
    ASSERT_TRUE(match.hasMatch()) << sections.at(i).toStdString();
    EXPECT_EQ(match.captured(1), QString(rule.name));
    EXPECT_EQ(match.captured(2), severityName(rule.severity)) << rule.name.latin1();
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
TEST(DiagnosticRules, AreShownByExamples) {
  QByteArray said;
  for (const char* folder : {"/tests/data/broken/", "/tests/data/broken/mapping-files/"}) {
    const QString path = QStringLiteral(ORX_SOURCE_DIR) + folder;
    for (const QString& name : QDir(path).entryList({"*.expected"})) {
      QFile file(path + name);
      ASSERT_TRUE(file.open(QIODevice::ReadOnly));
      said += file.readAll();
    }
  }
  QStringList missing;
  for (const DiagnosticRule& rule : diagnosticRules()) {
    if (!said.contains(QByteArray(" [") + rule.name.latin1() + "]\n"))
      missing << rule.name;
  }
  // The first is about an option of another command; the others take large files, or no Python.
  EXPECT_EQ(missing, (QStringList{"unknown-global-parameter", "long-statement", "deep-block",
                                  "unchecked-python", "too-many-findings", "too-many-names"}));
}

TEST(NearestSpelling, FindsTheNameThatWasMeant) {
  const QStringList names = {"id", "height", "Street", "weight", "straße", "x"};
  const struct {
    const char* name;
    const char* nearest;
  } cases[] = {
      {"hieght", "height"},
      {"heigh", "height"},
      {"STREET", "Street"},
      {"weihgt", "weight"},
      {"street_name_1", ""},
      {"di", "id"},
      {"y", ""},
      {"", ""},
      {"Stra\xc3\x9f", "straße"},
      {"height", "height"},
  };
  NearestSpelling spelling;
  for (const auto& test : cases)
    EXPECT_EQ(spelling.find(test.name, names), QString(test.nearest)) << test.name;
}

TEST(NearestSpelling, CostsNoMoreThanItMay) {
  QStringList names;
  for (int i = 0; i < 20000; ++i)
    names << QString("attribute_%1").arg(i, 50, 10, QLatin1Char('0'));
  NearestSpelling spelling;
  EXPECT_EQ(spelling.find("attribute", {"attributes"}), QString("attributes"));
  for (int i = 0; i < 300; ++i)
    spelling.find(names.at(i) + "_", names);
  EXPECT_EQ(spelling.find("attribute", {"attributes"}), QString()) << "the bound is reached";
}

TEST(ReferencedNames, AreFoundHoweverTheyAreWritten) {
  ReferencedNames names;
  for (const char* text :
       {"a $(PLAIN) b", "$[DEFERRED]", "<dollarsign><leftparenthesis>ENCODED<rightparenthesis>",
        "name = 'SCRIPTED'; value = ORX_MacroValues[name]", "$($(INNER)_OUTER)", "$(UNCLOSED", "NOWHERE"})
    names.add(text);
  for (const char* name : {"PLAIN", "DEFERRED", "ENCODED", "SCRIPTED", "INNER"})
    EXPECT_TRUE(names.contains(name)) << name;
  for (const char* name : {"UNCLOSED", "NOWHERE", "a"})
    EXPECT_FALSE(names.contains(name)) << name;
  EXPECT_EQ(ReferencedNames::inValue("$(B) $(A) $(B) $(ls -l) $[C] $() $(1)"), (QStringList{"B", "A", "C"}));
}

}  // namespace
