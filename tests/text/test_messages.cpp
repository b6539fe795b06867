#include <tests/support/Files.h>
#include <tests/support/LanguageGuard.h>
#include <transform/text/MessageStrings.h>

#include <QDirIterator>
#include <QHash>
#include <QMap>
#include <QRegularExpression>
#include <QSet>
#include <gtest/gtest.h>

#include <algorithm>
#include <utility>

namespace {

QMap<long, QString> readMessages(const QString& language) {
  const QByteArray text = readAll(ORX_SOURCE_DIR "/resources/messages/" + language + ".msg");
  QMap<long, QString> messages;
  for (const QString& line : QString::fromUtf8(text).split('\n')) {
    if (line.isEmpty() || line.startsWith('#')) {
      continue;
    }
    const int tab = line.indexOf('\t');
    const long number = line.left(tab).toLong();
    EXPECT_GT(number, 0) << line.toStdString();
    EXPECT_FALSE(messages.contains(number)) << number << " stands twice in " << language.toStdString();
    EXPECT_FALSE(line.mid(tab + 1).trimmed().isEmpty()) << number;
    messages.insert(number, line.mid(tab + 1));
  }
  return messages;
}

QSet<QString> placeholders(const QString& text) {
  static const QRegularExpression kPlaceholder(QStringLiteral("%\\d+"));
  QSet<QString> found;
  for (auto it = kPlaceholder.globalMatch(text); it.hasNext();) {
    found.insert(it.next().captured());
  }
  return found;
}

// Of the library and the command, by path.
QMap<QString, QString> readSources() {
  QMap<QString, QString> sources;
  for (const char* folder : {"platform", "transform", "translation", "apps"}) {
    QDirIterator files(QStringLiteral(ORX_SOURCE_DIR "/") + folder, {"*.h", "*.cpp"}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext()) {
      const QString path = files.next();
      sources.insert(path, QString::fromUtf8(readAll(path)));
    }
  }
  return sources;
}

// Texts of transformers that have no class of their own yet.
bool waitsForItsClass(long number) {
  const std::pair<long, long> kWaiting[] = {
      {370618, 370627},  // joining tables, querying them
      {370631, 370631},  // sorting features by tests, as 370648 and 370652 to 370659
      {370637, 370637},  // pages to print, as 370661
      {370645, 370648},  // queries; tables of attributes
      {370650, 370660},  // queries; tests; writing features
      {370661, 370662},  // pages; running other workspaces
  };
  return std::any_of(std::begin(kWaiting), std::end(kWaiting),
                     [number](const auto& range) { return number >= range.first && number <= range.second; });
}

}  // namespace

TEST(Messages, EveryNumberHasANameATextAndACaller) {
  const QMap<long, QString> english = readMessages("en");
  const QMap<QString, QString> sources = readSources();
  static const QRegularExpression kLiteral("\\b37[01]\\d{3}\\b");
  QHash<QString, long> named;
  QSet<QString> used;
  QSet<QString> rules;
  QString table;
  for (auto source = sources.begin(); source != sources.end(); ++source) {
    if (source.key().endsWith("transform/text/MessageNumbers.h")) {
      static const QRegularExpression kName("constexpr long (k\\w+) = (\\d+);");
      for (auto it = kName.globalMatch(source.value()); it.hasNext();) {
        const QRegularExpressionMatch match = it.next();
        EXPECT_FALSE(named.contains(match.captured(1)));
        named.insert(match.captured(1), match.captured(2).toLong());
      }
      continue;
    }
    EXPECT_FALSE(source.value().contains(kLiteral)) << source.key().toStdString() << " holds a bare number";
    static const QRegularExpression kUse("\\b(messages|Rule)::(\\w+)");
    const bool isTable = source.key().contains("transform/findings/Rules.");
    table += isTable ? source.value() : QString();
    for (auto it = kUse.globalMatch(isTable ? QString() : source.value()); it.hasNext();) {
      const QRegularExpressionMatch match = it.next();
      (match.captured(1) == "Rule" ? rules : used).insert(match.captured(2));
    }
  }
  // The message of a rule is called where the rule is told.
  static const QRegularExpression kRow("\\{Rule::(\\w+),[^}]*messages::(\\w+)\\}");
  for (auto it = kRow.globalMatch(table); it.hasNext();) {
    const QRegularExpressionMatch match = it.next();
    if (rules.contains(match.captured(1))) {
      used.insert(match.captured(2));
    }
  }
  QMap<long, QString> names;
  for (auto name = named.begin(); name != named.end(); ++name) {
    EXPECT_TRUE(used.contains(name.key())) << name.key().toStdString() << " has no caller";
    EXPECT_FALSE(names.contains(name.value())) << name.key().toStdString() << " names a number once more";
    names.insert(name.value(), name.key());
  }
  for (const long number : english.keys()) {
    EXPECT_NE(names.contains(number), waitsForItsClass(number)) << number;
  }
  for (const long number : names.keys()) {
    EXPECT_TRUE(english.contains(number)) << names.value(number).toStdString() << " has no text";
  }
}

TEST(Messages, AllLanguagesSayTheSame) {
  const QMap<long, QString> english = readMessages("en");
  for (long number : {370605L, 370613L, 370627L, 370665L}) {
    EXPECT_TRUE(english.contains(number)) << number;
  }
  for (const char* language : {"de", "fr"}) {
    const QMap<long, QString> other = readMessages(language);
    EXPECT_EQ(other.keys(), english.keys()) << language;
    for (auto it = english.begin(); it != english.end(); ++it) {
      EXPECT_EQ(placeholders(other.value(it.key())), placeholders(it.value())) << language << " " << it.key();
      EXPECT_TRUE(it->size() < 20 || other.value(it.key()) != *it) << language << " " << it.key();
    }
  }
  // One pass fills the placeholders by their order, so their numbers run from 1 without a gap.
  for (auto it = english.begin(); it != english.end(); ++it) {
    const QSet<QString> found = placeholders(it.value());
    for (int i = 1; i <= found.size(); ++i) {
      EXPECT_TRUE(found.contains(QStringLiteral("%%1").arg(i))) << it.key();
    }
  }
}

TEST(Messages, ArgumentsFillPlaceholders) {
  const LanguageGuard english("en");
  EXPECT_EQ(TransformResString(370621), "Column %1 (%2)");
  EXPECT_EQ(TransformResString(370644, QString("%2")), "Version %2");
  EXPECT_EQ(TransformResString(370621, {"%2", "b"}), "Column %2 (b)");
  EXPECT_EQ(TransformResString(370643, {"A", "1", "B", "2"}), "Changes from A (version 1) to B (version 2)");
  EXPECT_EQ(TransformResString(370621, {"1", "2", "3", "4", "5", "6"}), "Column %1 (%2)");
  EXPECT_EQ(TransformResString(1, {"a", "b"}), QString());
  EXPECT_EQ(TransformResString(-1), QString());
}

TEST(Messages, FollowTheLanguage) {
  const LanguageGuard german("de");
  EXPECT_EQ(TransformResString(370665), "Ja");
  QORXSetLanguage("fr");
  EXPECT_EQ(TransformResString(370665), "Oui");
  QORXSetLanguage("xx");
  EXPECT_EQ(TransformResString(370665), "Yes");
}
