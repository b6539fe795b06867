#include <platform/orxutil/ORXLocalizedMessageDatabase.h>
#include <platform/qorxcore/Language.h>
#include <platform/qorxcore/OrxHome.h>

#include <QFile>
#include <QTextStream>

#include <utility>

namespace {

QString unescaped(const QString& text) {
  if (!text.contains(QLatin1Char('\\'))) {
    return text;
  }
  QString plain;
  plain.reserve(text.size());
  for (int position = 0; position < text.size(); ++position) {
    const QChar next = position + 1 < text.size() ? text.at(position + 1) : QChar();
    if (text.at(position) == QLatin1Char('\\') && next == QLatin1Char('n')) {
      plain += QLatin1Char('\n');
      ++position;
    } else if (text.at(position) == QLatin1Char('\\') && next == QLatin1Char('\\')) {
      plain += next;
      ++position;
    } else {
      plain += text.at(position);
    }
  }
  return plain;
}

}  // namespace

bool ORXLocalizedMessageDatabase::getMessage(long number, QORXString& text) const {
  return getMessage(number, text, QORXLanguage());
}

bool ORXLocalizedMessageDatabase::getMessage(long number, QORXString& text, const QString& language) const {
  for (const QString& asked : {language, QStringLiteral("en")}) {
    const Table& texts = table(asked);
    const auto found = texts.constFind(number);
    if (found != texts.constEnd()) {
      text.assign(found.value());
      return true;
    }
  }
  text.assign(QString());
  return false;
}

const ORXLocalizedMessageDatabase::Table& ORXLocalizedMessageDatabase::table(const QString& language) const {
  const std::lock_guard<std::mutex> lock(m_mutex);
  const auto known = m_tables.find(language);
  if (known != m_tables.end()) {
    return known->second;
  }
  Table texts;
  const QString folder = m_folder.isEmpty() ? QORXOrxHome() + QLatin1String("/messages") : m_folder;
  QFile file(folder + QLatin1Char('/') + language + QLatin1String(".msg"));
  if (file.open(QIODevice::ReadOnly)) {
    QTextStream stream(&file);
    stream.setCodec("UTF-8");
    QString line;
    while (stream.readLineInto(&line)) {
      const int tab = line.indexOf(QLatin1Char('\t'));
      bool isNumber = false;
      const long number = line.leftRef(tab).toLong(&isNumber);
      // A number whose text is still missing must not hide the English one.
      if (tab > 0 && isNumber && tab + 1 < line.size()) {
        texts.insert(number, unescaped(line.mid(tab + 1)));
      }
    }
  }
  return m_tables.emplace(language, std::move(texts)).first->second;
}
