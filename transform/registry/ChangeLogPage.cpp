#include <transform/registry/ChangeLogPage.h>

ChangeLogPage::ChangeLogPage(const QString& title) {
  m_head = QStringList{
      QStringLiteral("<!DOCTYPE html>"),
      QStringLiteral("<html>"),
      QStringLiteral("<head>"),
      QStringLiteral("<meta charset=\"UTF-8\">"),
      QStringLiteral("<title>%1</title>").arg(title.toHtmlEscaped()),
      QStringLiteral("<style media=\"screen\">"),
      QStringLiteral("h2, h3, h4, .headline, li { font-family: \"Trebuchet MS\", Helvetica, sans-serif; }"),
      QStringLiteral(
          ".headline { font-weight: bold; color: white; font-size: 16px; background-color: #505050; "
          "border-radius: 4px; padding: 4px 8px; }"),
      QStringLiteral("</style>"),
      QStringLiteral("</head>"),
  };
  m_body.append(QStringLiteral("<h2 class=\"headline\">%1</h2>").arg(title.toHtmlEscaped()));
}

void ChangeLogPage::addVersion(const QString& heading, const QStringList& entries) {
  m_body.append(QStringLiteral("<h3>%1</h3>").arg(heading.toHtmlEscaped()));
  m_body.append(QStringLiteral("<ul>"));
  for (const QString& entry : entries) {
    if (!entry.isEmpty())
      m_body.append(QStringLiteral("<li>%1</li>").arg(entry.toHtmlEscaped()));
  }
  m_body.append(QStringLiteral("</ul>"));
}

QStringList ChangeLogPage::lines() const {
  QStringList result = m_head;
  result.append(QStringLiteral("<body>"));
  result += m_body;
  result.append(QStringLiteral("</body>"));
  result.append(QStringLiteral("</html>"));
  return result;
}
