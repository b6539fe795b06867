#include <platform/qorxcore/Language.h>
#include <transform/registry/catalogue/ChangeLogPage.h>

#include <QVector>

#include <algorithm>

namespace {

// A page may hold neither control characters nor code points that are no characters.
bool isAllowed(uint c) {
  const bool isControl = c < 0x20 || (c >= 0x7f && c < 0xa0);
  return !isControl && !QChar::isSurrogate(c) && !QChar::isNonCharacter(c);
}

QString escaped(const QString& text) {
  QVector<uint> characters = text.toUcs4();
  std::replace_if(
      characters.begin(), characters.end(), [](uint c) { return !isAllowed(c); }, uint(' '));
  return QString::fromUcs4(characters.constData(), characters.size()).toHtmlEscaped();
}

}  // namespace

ChangeLogPage::ChangeLogPage(const QString& title) : m_title(escaped(title)) {}

void ChangeLogPage::addVersion(const QString& heading, const QStringList& entries) {
  m_body.append(QLatin1String("<h3>") + escaped(heading) + QLatin1String("</h3>"));
  m_body.append(QStringLiteral("<ul>"));
  for (const QString& entry : entries) {
    m_body.append(QLatin1String("<li>") + escaped(entry) + QLatin1String("</li>"));
  }
  m_body.append(QStringLiteral("</ul>"));
}

void ChangeLogPage::addText(const QString& text) {
  m_body.append(QLatin1String("<p>") + escaped(text) + QLatin1String("</p>"));
}

QStringList ChangeLogPage::lines() const {
  QStringList result{
      QStringLiteral("<!DOCTYPE html>"),
      QLatin1String("<html lang=\"") + QORXLanguage() + QLatin1String("\">"),
      QStringLiteral("<head>"),
      QStringLiteral("<meta charset=\"UTF-8\">"),
      QLatin1String("<title>") + m_title + QLatin1String("</title>"),
      QStringLiteral("<style media=\"screen\">"),
      QStringLiteral("h2, h3, h4, .headline, li { font-family: \"Trebuchet MS\", Helvetica, sans-serif; }"),
      QStringLiteral(".headline { font-weight: bold; font-size: 16px; color: white; "
                     "background-color: #505050; border-radius: 4px; padding: 4px 8px; }"),
      QStringLiteral("</style>"),
      QStringLiteral("</head>"),
      QStringLiteral("<body>"),
      QLatin1String("<h2 class=\"headline\">") + m_title + QLatin1String("</h2>"),
  };
  result += m_body;
  result.append(QStringLiteral("</body>"));
  result.append(QStringLiteral("</html>"));
  return result;
}
