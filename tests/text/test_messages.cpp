#include <platform/qorxcore/Language.h>
#include <transform/text/MessageStrings.h>

#include <QFile>
#include <QMap>
#include <QRegularExpression>
#include <QSet>
#include <gtest/gtest.h>

namespace {

QMap<long, QString> readMessages(const QString& language) {
  QFile file(QStringLiteral(ORX_SOURCE_DIR "/resources/messages/") + language + QStringLiteral(".msg"));
  EXPECT_TRUE(file.open(QIODevice::ReadOnly));
  QMap<long, QString> messages;
  for (const QString& line : QString::fromUtf8(file.readAll()).split('\n')) {
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

class LanguageGuard {
 public:
  explicit LanguageGuard(const QString& language) : m_before(QORXLanguage()) { QORXSetLanguage(language); }
  ~LanguageGuard() { QORXSetLanguage(m_before); }

 private:
  QString m_before;
};

}  // namespace

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
