#include <platform/qorxcore/Language.h>
#include <transform/registry/ChangeLogPage.h>

namespace {

// HTML knows of no other control characters than these; the others have no meaning in a text.
QString escaped(const QString& text) {
  QString result;
  result.reserve(text.size());
  for (const QChar c : text) {
    const bool isControl = c.unicode() < 0x20 || (c.unicode() >= 0x7f && c.unicode() < 0xa0);
    result.append(isControl ? QLatin1Char(' ') : c);
  }
  return result.toHtmlEscaped();
}

}  // namespace

ChangeLogPage::ChangeLogPage(const QString& title) : m_title(escaped(title)) {}

void ChangeLogPage::addVersion(const QString& heading, const QStringList& entries) {
  QStringList items;
  for (const QString& entry : entries) {
    if (!entry.trimmed().isEmpty()) {
      items.append(QLatin1String("<li>") + escaped(entry) + QLatin1String("</li>"));
    }
  }
  if (items.isEmpty()) {
    return;
  }
  m_body.append(QLatin1String("<h3>") + escaped(heading) + QLatin1String("</h3>"));
  m_body.append(QStringLiteral("<ul>"));
  m_body += items;
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
