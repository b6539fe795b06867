#include <apps/orxt/console/PrintableText.h>
#include <apps/orxt/console/TextTable.h>
#include <apps/orxt/facts/DocumentFacts.h>
#include <apps/orxt/facts/InfoJson.h>
#include <apps/orxt/facts/InfoText.h>
#include <translation/WorkspaceDocument.h>

#include <algorithm>

namespace {

constexpr int kIndent = 2;
constexpr int kWidestAttribute = 24;
constexpr int kTextWidth = 78;
constexpr int kLongestText = 1000;
constexpr int kLongestName = 200;

const QString kTitle = QStringLiteral("TITLE");

QString counted(int count, const char* one, const char* many) {
  return QString::number(count) + QLatin1Char(' ') + QLatin1String(count == 1 ? one : many);
}

QString disabledMark(bool enabled) {
  return enabled ? QString() : QStringLiteral("disabled");
}

QString joined(QStringList parts) {
  parts.removeAll(QString());
  return parts.join(QLatin1String(", "));
}

QString roleWord(bool isSource) {
  return isSource ? QStringLiteral("reader") : QStringLiteral("writer");
}

QString versionList(const std::set<int>& versions) {
  QStringList numbers;
  for (const int version : versions)
    numbers << QString::number(version);
  return QLatin1String(versions.size() == 1 ? "version " : "versions ") + numbers.join(QLatin1String(", "));
}

}  // namespace

QString InfoText::text(const QString& fileName) {
  m_text.clear();
  head(fileName);
  attributes(m_document.reader().GetSubDocParms(QString()));
  versions();
  datasets();
  featureTypes();
  server();
  sections(QString());
  for (const QString& name : subDocuments(m_document.reader()))
    subDocument(name);
  return m_text;
}

void InfoText::paragraph(const QString& title, std::size_t count, const QString& body) {
  if (count > 0)
    m_text += QStringLiteral("\n%1 (%2)\n").arg(title).arg(count) + body;
}

void InfoText::head(const QString& fileName) {
  QString form;
  switch (m_document.form()) {
    case WorkspaceFile::Form::Workspace:
      form = QStringLiteral("in comment lines, %1, %2")
                 .arg(QString::fromLatin1(m_document.encoding()),
                      counted(m_document.headerLines().size(), "header line", "header lines"));
      break;
    case WorkspaceFile::Form::Versioned:
      form = QStringLiteral("the newest of %1")
                 .arg(counted(m_document.versions().size(), "stored version", "stored versions"));
      break;
    case WorkspaceFile::Form::PlainXml:
    case WorkspaceFile::Form::Unknown:
      form = QStringLiteral("plain XML, %1").arg(QString::fromLatin1(m_document.encoding()));
      break;
  }
  m_text += QStringLiteral("%1\n  %2 document, %3\n")
                .arg(onOneLine(fileName, kLongestText), documentTypeName(m_document), form);
}

void InfoText::attributes(const QHash<QString, QString>& attributes) {
  QStringList names = attributes.keys();
  std::sort(names.begin(), names.end());
  if (names.removeOne(kTitle))
    names.prepend(kTitle);
  if (!names.isEmpty())
    m_text += QLatin1Char('\n');
  int width = 0;
  for (const QString& name : qAsConst(names))
    width = std::max(width, std::min(name.size(), kWidestAttribute));
  const QString blanks(kIndent, QLatin1Char(' '));
  for (const QString& name : qAsConst(names)) {
    QString left = onOneLine(name, kLongestName);
    for (const QString& line : wrapped(onOneLine(attributes.value(name), kLongestText), kTextWidth - width)) {
      m_text += blanks + left.leftJustified(width) + blanks + line + QLatin1Char('\n');
      left.clear();
    }
  }
}

void InfoText::versions() {
  TextTable table(kIndent);
  for (const VersionInfo& info : m_document.versions()) {
    table.addRow({QStringLiteral("%1 %2").arg(info.name).arg(info.version), info.category, info.guid,
                  QStringLiteral("line %1").arg(info.startLine + 1)});
  }
  paragraph(QStringLiteral("Versions"), static_cast<std::size_t>(m_document.versions().size()), table.text());
}

void InfoText::datasets() {
  const auto records = m_document.reader().GetDatasetList();
  TextTable table(kIndent);
  for (const DatasetStruct& record : records) {
    table.addRow({roleWord(record.isSource), record.keyword, record.format, record.name, record.dataset,
                  disabledMark(record.enabled)});
  }
  paragraph(QStringLiteral("Datasets"), records.size(), table.text());
}

void InfoText::featureTypes() {
  const auto records = m_document.reader().GetFeatureTypeList();
  TextTable table(kIndent);
  for (const FeatureTypeStruct& record : records) {
    table.addRow({roleWord(record.isSource), record.keyword,
                  record.featureTypeName.isEmpty() ? record.nodeName : record.featureTypeName,
                  counted(record.attributes.size(), "attribute", "attributes"),
                  disabledMark(record.enabled)});
  }
  paragraph(QStringLiteral("Feature types"), records.size(), table.text());
}

void InfoText::server() {
  const ServerParameterStruct server = m_document.reader().GetServerParameters();
  TextTable table(kIndent);
  for (const ServiceStruct& service : server.services)
    table.addRow({QStringLiteral("service"), service.name});
  for (const ServerNameStruct& repository : server.repositories)
    table.addRow({QStringLiteral("repository"), repository.name});
  for (const ServerNameStruct& item : server.items)
    table.addRow({QStringLiteral("item"), item.name});
  if (!table.isEmpty())
    m_text += QLatin1String("\nServer\n") + table.text();
}

void InfoText::sections(const QString& document) {
  parameters(document);
  transformers(document);
  links(document);
  notes(document);
}

void InfoText::parameters(const QString& document) {
  const auto records = m_document.reader().GetGlobalParameterList(document);
  TextTable table(kIndent);
  for (const GlobalParameterStruct& record : records) {
    const ParameterFacts facts = describe(record);
    const QString shown = facts.shown.isEmpty() ? QStringLiteral("-") : facts.shown;
    if (facts.name.isEmpty())
      table.addRow({QStringLiteral("?"), QStringLiteral("no prompt line"), shown, record.guiLine});
    else
      table.addRow({facts.name, facts.type, shown, facts.prompt});
  }
  paragraph(QStringLiteral("Global parameters"), records.size(), table.text());
}

void InfoText::transformers(const QString& document) {
  TextTable table(kIndent);
  table.alignRight(0);
  int total = 0;
  for (const TransformerCount& entry : countTransformers(m_document.reader(), document)) {
    total += entry.count;
    const QString disabled =
        entry.disabled > 0 ? QStringLiteral("%1 disabled").arg(entry.disabled) : QString();
    const QString type =
        entry.subDocument.isEmpty() ? entry.type : QStringLiteral("custom: %1").arg(entry.subDocument);
    table.addRow({QString::number(entry.count), type,
                  entry.subDocument.isEmpty() ? joined({versionList(entry.versions), disabled}) : disabled});
  }
  paragraph(QStringLiteral("Transformers"), static_cast<std::size_t>(total), table.text());
}

void InfoText::links(const QString& document) {
  const IXMLComponentReader& reader = m_document.reader();
  const auto featureLinks = reader.GetFeatureTypeLinkList(document);
  const int disabled = static_cast<int>(std::count_if(featureLinks.begin(), featureLinks.end(),
                                                      [](const LinkStruct& link) { return !link.enabled; }));
  const std::size_t attributeLinks = reader.GetAttributeLinkList(document).size();
  TextTable table(kIndent);
  table.alignRight(0);
  if (!featureLinks.isEmpty()) {
    table.addRow({QString::number(featureLinks.size()), QStringLiteral("of features"),
                  disabled > 0 ? QStringLiteral("%1 disabled").arg(disabled) : QString()});
  }
  if (attributeLinks > 0)
    table.addRow({QString::number(attributeLinks), QStringLiteral("of attributes")});
  paragraph(QStringLiteral("Links"), featureLinks.size() + attributeLinks, table.text());
}

void InfoText::notes(const QString& document) {
  const IXMLComponentReader& reader = m_document.reader();
  const auto comments = reader.GetCommentList(document);
  TextTable commentTable(kIndent);
  for (const CommentStruct& record : comments)
    commentTable.addRow({record.commentValue});
  paragraph(QStringLiteral("Comments"), comments.size(), commentTable.text());

  const auto bookmarks = reader.GetBookmarkList(document);
  TextTable bookmarkTable(kIndent);
  for (const BookmarkStruct& record : bookmarks)
    bookmarkTable.addRow({record.name, record.description});
  paragraph(QStringLiteral("Bookmarks"), bookmarks.size(), bookmarkTable.text());

  const auto breakpoints = reader.GetBreakpointList(document);
  TextTable breakpointTable(kIndent);
  for (const BreakpointStruct& record : breakpoints) {
    breakpointTable.addRow(
        {record.name, QStringLiteral("on link %1").arg(record.featLink), disabledMark(record.enabled)});
  }
  paragraph(QStringLiteral("Breakpoints"), breakpoints.size(), breakpointTable.text());

  const std::size_t constants =
      reader.GetConstantList(document).size() + reader.GetConstantList(document, true).size();
  paragraph(QStringLiteral("Constants"), constants, QString());
}

void InfoText::subDocument(const QString& name) {
  const IXMLComponentReader& reader = m_document.reader();
  QHash<QString, QString> parameters = reader.GetSubDocParms(name);
  parameters.remove(QStringLiteral("NAME"));
  const QString version = parameters.take(QStringLiteral("VERSION"));
  QString title = QStringLiteral("Custom transformer %1").arg(onOneLine(name, kLongestName));
  if (!version.isEmpty())
    title += QStringLiteral(", version %1").arg(onOneLine(version, kLongestName));
  m_text += QStringLiteral("\n\n%1\n%2\n").arg(title, QString(title.size(), QLatin1Char('=')));
  attributes(parameters);

  const auto ports = reader.GetSubDocumentIOList(name);
  TextTable table(kIndent);
  for (const SubDocumentIOStruct& port : ports) {
    const QString kind = port.isSource == SubDocumentIOKind::Input    ? QStringLiteral("input")
                         : port.isSource == SubDocumentIOKind::Output ? QStringLiteral("output")
                                                                      : QStringLiteral("loop");
    table.addRow({kind, port.name, port.published ? QString() : QStringLiteral("not published")});
  }
  paragraph(QStringLiteral("Ports"), ports.size(), table.text());
  sections(name);
}
