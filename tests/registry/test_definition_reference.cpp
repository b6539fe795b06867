// The reference for whoever writes definitions says all there is to say, and nothing else.
#include <platform/orxparameter/GUITypeTable.h>
#include <tests/registry/RegistryFolders.h>
#include <tests/support/Files.h>
#include <transform/registry/DefinitionLint.h>
#include <transform/registry/loading/DefinitionKeywords.h>

#include <QStringList>
#include <gtest/gtest.h>

namespace {

QString reference() {
  return QString::fromUtf8(readAll(ORX_SOURCE_DIR "/docs/definition-files.md"));
}

// The rows of the table under a heading, without its head: cells of each, without code marks.
QList<QStringList> tableUnder(const QString& heading) {
  QList<QStringList> rows;
  bool isUnder = false;
  for (const QString& line : reference().split('\n')) {
    if (line.startsWith('#')) {
      isUnder = line == heading;
    } else if (isUnder && line.startsWith("| `")) {
      QStringList cells;
      for (const QString& cell : line.mid(1, line.lastIndexOf('|') - 1).split(" | ")) {
        cells.append(cell.trimmed());
      }
      cells.first().remove('`');
      rows.append(cells);
    }
  }
  EXPECT_FALSE(rows.isEmpty()) << heading.toStdString();
  return rows;
}

// In the order of KeywordKind.
const char* const kKindNames[] = {"text",         "number",       "flag",     "list",
                                  "encoded list", "input list",   "modes",    "line list",
                                  "lookup",       "tag and text", "name pair"};

// Of each row the cells that are compared.
QStringList documented(const QString& heading, int cells) {
  QStringList rows;
  for (const QStringList& row : tableUnder(heading)) {
    rows.append(row.mid(0, cells).join(" | "));
    for (const QString& cell : row) {
      EXPECT_FALSE(cell.isEmpty()) << row.join(" | ").toStdString();
    }
  }
  return rows;
}

QStringList keywordRows(unsigned place) {
  QStringList rows;
  for (const DefinitionKeyword& keyword : definitionKeywords()) {
    if (keyword.places & place) {
      rows.append(QString(keyword.word) + " | " + kKindNames[int(keyword.kind)]);
    }
  }
  return rows;
}

}  // namespace

// What people copy first.
TEST(DefinitionReference, ShowsASoundDefinition) {
  RegistryFolders folders;
  DefinitionLint lint;
  lint.checkPath(folders.write("example.ort", reference().section("```\n", 1, 1).toUtf8()));
  for (const orx::Finding& finding : lint.findings()) {
    ADD_FAILURE() << finding.line << ": " << finding.text.toStdString();
  }
  folders.define("example.ort", reference().section("```\n", 1, 1).toUtf8());
  EXPECT_EQ(folders.load().transformerNames(), QStringList("SampleTaker"));
}

TEST(DefinitionReference, ListsEveryKeyword) {
  EXPECT_EQ(documented("## 3. Keywords", 2), keywordRows(DefinitionKeyword::kDefinition));
  EXPECT_EQ(documented("## 9. Localised companions", 2), keywordRows(DefinitionKeyword::kCompanion));
}

TEST(DefinitionReference, ListsEveryType) {
  QStringList rows;
  for (const GUITypeEntry& type : ORX_guiTypes()) {
    rows.append(QStringList{type.word, type.takesConfig ? "yes" : "no", type.valueIsEncoded ? "yes" : "no",
                            type.purpose}
                    .join(" | "));
  }
  EXPECT_EQ(documented("## 5. Types of parameters", 4), rows);
}
