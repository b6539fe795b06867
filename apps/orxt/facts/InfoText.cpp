#include <apps/orxt/console/PrintableText.h>
#include <apps/orxt/console/TextTable.h>
#include <apps/orxt/facts/DocumentFacts.h>
#include <apps/orxt/facts/InfoJson.h>
#include <apps/orxt/facts/InfoText.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/WorkspaceDocument.h>

#include <algorithm>

namespace messages = orx::messages;

namespace {

constexpr int kIndent = 2;
constexpr int kWidestAttribute = 24;
constexpr int kTextWidth = 78;
constexpr int kLongestText = 1000;
constexpr int kLongestName = 200;

const QString kTitle = QStringLiteral("TITLE");

QString label(long number, int count) {
  return TransformResString(number, QString::number(count));
}

QString disabledMark(bool enabled) {
  return enabled ? QString() : TransformResString(messages::kInfoDisabled);
}

QString disabledCount(int count) {
  return count > 0 ? label(messages::kInfoDisabledCount, count) : QString();
}

QString joined(QStringList parts) {
  parts.removeAll(QString());
  return parts.join(QLatin1String(", "));
}

QString roleWord(bool isSource) {
  return TransformResString(isSource ? messages::kInfoReader : messages::kInfoWriter);
}

QString versionList(const std::set<int>& versions) {
  QStringList numbers;
  for (const int version : versions)
    numbers << QString::number(version);
  return TransformResString(versions.size() == 1 ? messages::kInfoVersion : messages::kInfoVersionNumbers,
                            numbers.join(QLatin1String(", ")));
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

void InfoText::paragraph(long title, std::size_t count, const QString& body) {
  if (count > 0)
    m_text += QStringLiteral("\n%1 (%2)\n").arg(TransformResString(title)).arg(count) + body;
}

void InfoText::head(const QString& fileName) {
  QString form;
  switch (m_document.form()) {
    case WorkspaceFile::Form::Workspace:
      form = TransformResString(
          messages::kInfoInComments,
          {QString::fromLatin1(m_document.encoding()), QString::number(m_document.headerLines().size())});
      break;
    case WorkspaceFile::Form::Versioned:
      form = label(messages::kInfoNewestVersion, m_document.versions().size());
      break;
    case WorkspaceFile::Form::PlainXml:
    case WorkspaceFile::Form::Unknown:
      form = TransformResString(messages::kInfoPlainXml, QString::fromLatin1(m_document.encoding()));
      break;
  }
  m_text += onOneLine(fileName, kLongestText) + QLatin1String("\n  ") +
            TransformResString(messages::kInfoDocument, {documentTypeName(m_document), form}) +
            QLatin1Char('\n');
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
                  label(messages::kInfoLine, info.startLine + 1)});
  }
  paragraph(messages::kInfoVersions, static_cast<std::size_t>(m_document.versions().size()), table.text());
}

void InfoText::datasets() {
  const auto records = m_document.reader().GetDatasetList();
  TextTable table(kIndent);
  for (const DatasetStruct& record : records) {
    table.addRow({roleWord(record.isSource), record.keyword, record.format, record.name, record.dataset,
                  disabledMark(record.enabled)});
  }
  paragraph(messages::kInfoDatasets, records.size(), table.text());
}

void InfoText::featureTypes() {
  const auto records = m_document.reader().GetFeatureTypeList();
  TextTable table(kIndent);
  for (const FeatureTypeStruct& record : records) {
    table.addRow({roleWord(record.isSource), record.keyword,
                  record.featureTypeName.isEmpty() ? record.nodeName : record.featureTypeName,
                  label(messages::kInfoAttributes, record.attributes.size()), disabledMark(record.enabled)});
  }
  paragraph(messages::kInfoFeatureTypes, records.size(), table.text());
}

void InfoText::server() {
  const ServerParameterStruct server = m_document.reader().GetServerParameters();
  TextTable table(kIndent);
  for (const ServiceStruct& service : server.services)
    table.addRow({TransformResString(messages::kInfoService), service.name});
  for (const ServerNameStruct& repository : server.repositories)
    table.addRow({TransformResString(messages::kInfoRepository), repository.name});
  for (const ServerNameStruct& item : server.items)
    table.addRow({TransformResString(messages::kInfoItem), item.name});
  if (!table.isEmpty())
    m_text +=
        QLatin1Char('\n') + TransformResString(messages::kInfoServer) + QLatin1Char('\n') + table.text();
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
      table.addRow({QStringLiteral("?"), TransformResString(messages::kInfoNoPrompt), shown, record.guiLine});
    else
      table.addRow({facts.name, facts.type, shown, facts.prompt});
  }
  paragraph(messages::kInfoParameters, records.size(), table.text());
}

void InfoText::transformers(const QString& document) {
  TextTable table(kIndent);
  table.alignRight(0);
  int total = 0;
  for (const TransformerCount& entry : countTransformers(m_document.reader(), document)) {
    total += entry.count;
    const QString disabled = disabledCount(entry.disabled);
    const QString type = entry.subDocument.isEmpty()
                             ? entry.type
                             : TransformResString(messages::kInfoCustom, entry.subDocument);
    table.addRow({QString::number(entry.count), type,
                  entry.subDocument.isEmpty() ? joined({versionList(entry.versions), disabled}) : disabled});
  }
  paragraph(messages::kInfoTransformers, static_cast<std::size_t>(total), table.text());
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
    table.addRow({QString::number(featureLinks.size()), TransformResString(messages::kInfoOfFeatures),
                  disabledCount(disabled)});
  }
  if (attributeLinks > 0)
    table.addRow({QString::number(attributeLinks), TransformResString(messages::kInfoOfAttributes)});
  paragraph(messages::kInfoLinks, featureLinks.size() + attributeLinks, table.text());
}

void InfoText::notes(const QString& document) {
  const IXMLComponentReader& reader = m_document.reader();
  const auto comments = reader.GetCommentList(document);
  TextTable commentTable(kIndent);
  for (const CommentStruct& record : comments)
    commentTable.addRow({record.commentValue});
  paragraph(messages::kInfoComments, comments.size(), commentTable.text());

  const auto bookmarks = reader.GetBookmarkList(document);
  TextTable bookmarkTable(kIndent);
  for (const BookmarkStruct& record : bookmarks)
    bookmarkTable.addRow({record.name, record.description});
  paragraph(messages::kInfoBookmarks, bookmarks.size(), bookmarkTable.text());

  const auto breakpoints = reader.GetBreakpointList(document);
  TextTable breakpointTable(kIndent);
  for (const BreakpointStruct& record : breakpoints) {
    breakpointTable.addRow(
        {record.name, label(messages::kInfoOnLink, record.featLink), disabledMark(record.enabled)});
  }
  paragraph(messages::kInfoBreakpoints, breakpoints.size(), breakpointTable.text());

  const std::size_t constants =
      reader.GetConstantList(document).size() + reader.GetConstantList(document, true).size();
  paragraph(messages::kInfoConstants, constants, QString());
}

void InfoText::subDocument(const QString& name) {
  const IXMLComponentReader& reader = m_document.reader();
  QHash<QString, QString> parameters = reader.GetSubDocParms(name);
  parameters.remove(QStringLiteral("NAME"));
  const QString version = parameters.take(QStringLiteral("VERSION"));
  const QString shownName = onOneLine(name, kLongestName);
  const QString title = version.isEmpty() ? TransformResString(messages::kInfoCustomTitle, shownName)
                                          : TransformResString(messages::kInfoCustomTitleVersion,
                                                               {shownName, onOneLine(version, kLongestName)});
  m_text += QStringLiteral("\n\n%1\n%2\n").arg(title, QString(title.size(), QLatin1Char('=')));
  attributes(parameters);

  const auto ports = reader.GetSubDocumentIOList(name);
  TextTable table(kIndent);
  for (const SubDocumentIOStruct& port : ports) {
    const long kind = port.isSource == SubDocumentIOKind::Input    ? messages::kInfoInput
                      : port.isSource == SubDocumentIOKind::Output ? messages::kInfoOutput
                                                                   : messages::kInfoLoop;
    table.addRow({TransformResString(kind), port.name,
                  port.published ? QString() : TransformResString(messages::kInfoNotPublished)});
  }
  paragraph(messages::kInfoPorts, ports.size(), table.text());
  sections(name);
}
