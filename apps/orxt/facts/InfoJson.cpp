#include <apps/orxt/facts/DocumentFacts.h>
#include <apps/orxt/facts/InfoJson.h>
#include <translation/WorkspaceDocument.h>

#include <QJsonArray>

namespace {

// A list of records as a list of objects.
template <class Records, class Describe>
QJsonArray list(const Records& records, Describe&& describe) {
  QJsonArray array;
  for (const auto& record : records)
    array.append(describe(record));
  return array;
}

template <class Records>
QJsonArray names(const Records& records) {
  return list(records, [](const auto& record) { return QJsonValue(record.name); });
}

QJsonObject attributesJson(const QHash<QString, QString>& attributes) {
  QJsonObject object;
  for (auto at = attributes.constBegin(); at != attributes.constEnd(); ++at)
    object.insert(at.key(), at.value());
  return object;
}

QString formName(WorkspaceFile::Form form) {
  switch (form) {
    case WorkspaceFile::Form::Workspace:
      return QStringLiteral("workspace");
    case WorkspaceFile::Form::PlainXml:
      return QStringLiteral("xml");
    case WorkspaceFile::Form::Versioned:
      return QStringLiteral("versions");
    case WorkspaceFile::Form::Unknown:
      break;
  }
  return QString();
}

QString kindName(SubDocumentIOKind kind) {
  switch (kind) {
    case SubDocumentIOKind::Input:
      return QStringLiteral("input");
    case SubDocumentIOKind::Output:
      return QStringLiteral("output");
    case SubDocumentIOKind::Loop:
      break;
  }
  return QStringLiteral("loop");
}

QJsonObject parameterJson(const GlobalParameterStruct& record) {
  const ParameterFacts facts = describe(record);
  return {{"name", facts.name},
          {"type", facts.type},
          {"prompt", facts.prompt},
          {"optional", facts.isOptional},
          {"password", facts.isPassword},
          {"standAlone", record.isStandAlone},
          {"server", record.isServer},
          {"default", facts.isPassword ? QJsonValue() : QJsonValue(facts.value)},
          {"line", facts.line}};
}

QJsonObject transformersJson(const TransformerCount& count) {
  QJsonObject object{{"type", count.type},
                     {"count", count.count},
                     {"disabled", count.disabled},
                     {"versions", list(count.versions, [](int version) { return QJsonValue(version); })}};
  if (!count.subDocument.isEmpty())
    object.insert("subDocument", count.subDocument);
  return object;
}

void addSections(QJsonObject& object, const IXMLComponentReader& reader, const QString& document) {
  object.insert("globalParameters", list(reader.GetGlobalParameterList(document), parameterJson));
  object.insert("transformers", list(countTransformers(reader, document), transformersJson));
  int links = 0;
  int disabled = 0;
  for (const LinkStruct& link : reader.GetFeatureTypeLinkList(document)) {
    ++links;
    disabled += link.enabled ? 0 : 1;
  }
  object.insert("featureLinks", QJsonObject{{"count", links}, {"disabled", disabled}});
  object.insert("attributeLinks", static_cast<int>(reader.GetAttributeLinkList(document).size()));
  object.insert("constants", static_cast<int>(reader.GetConstantList(document).size() +
                                              reader.GetConstantList(document, true).size()));
  object.insert("comments", list(reader.GetCommentList(document), [](const CommentStruct& record) {
                  return QJsonObject{{"text", record.commentValue}, {"line", record.line}};
                }));
  object.insert(
      "bookmarks", list(reader.GetBookmarkList(document), [](const BookmarkStruct& record) {
        return QJsonObject{{"name", record.name}, {"description", record.description}, {"line", record.line}};
      }));
  object.insert("breakpoints", list(reader.GetBreakpointList(document), [](const BreakpointStruct& record) {
                  return QJsonObject{{"name", record.name},
                                     {"link", record.featLink},
                                     {"enabled", record.enabled},
                                     {"line", record.line}};
                }));
}

QJsonObject subDocumentJson(const IXMLComponentReader& reader, const QString& name) {
  QHash<QString, QString> attributes = reader.GetSubDocParms(name);
  attributes.remove(QStringLiteral("NAME"));
  bool isNumber = false;
  const int version = attributes.value(QStringLiteral("VERSION")).toInt(&isNumber);
  QJsonObject object{{"name", name},
                     {"version", isNumber ? QJsonValue(version) : QJsonValue()},
                     {"attributes", attributesJson(attributes)}};
  object.insert("ports", list(reader.GetSubDocumentIOList(name), [](const SubDocumentIOStruct& record) {
                  return QJsonObject{{"name", record.name},
                                     {"kind", kindName(record.isSource)},
                                     {"published", record.published}};
                }));
  addSections(object, reader, name);
  return object;
}

QJsonObject datasetJson(const DatasetStruct& record) {
  return {{"role", record.role},       {"keyword", record.keyword}, {"format", record.format},
          {"dataset", record.dataset}, {"name", record.name},       {"enabled", record.enabled},
          {"line", record.line}};
}

QJsonObject featureTypeJson(const FeatureTypeStruct& record) {
  return {{"role", record.isSource ? "READER" : "WRITER"},
          {"name", record.featureTypeName},
          {"node", record.nodeName},
          {"keyword", record.keyword},
          {"geometry", record.featGeomtype},
          {"attributes", record.attributes.size()},
          {"enabled", record.enabled},
          {"line", record.line}};
}

}  // namespace

QString documentTypeName(const WorkspaceDocument& document) {
  switch (document.reader().GetDocumentType()) {
    case kWorkspaceDocument:
      return QStringLiteral("WORKSPACE");
    case kDataSourceDocument:
      return QStringLiteral("DATASOURCE");
    case kToolDocument:
      return QStringLiteral("ETL_TOOL");
    case kTransformerDocument:
      return QStringLiteral("TRANSFORMER");
    case kUnknownDocument:
      break;
  }
  return QStringLiteral("unknown");
}

QJsonObject infoJson(const WorkspaceDocument& document, const QString& fileName) {
  const XMLComponentReader& reader = document.reader();
  const ServerParameterStruct server = reader.GetServerParameters();
  QJsonObject object{{"file", fileName},
                     {"form", formName(document.form())},
                     {"documentType", documentTypeName(document)},
                     {"encoding", QString::fromLatin1(document.encoding())},
                     {"headerLines", document.headerLines().size()},
                     {"attributes", attributesJson(reader.GetSubDocParms(QString()))},
                     {"dataTypes", static_cast<int>(reader.GetDataTypeList().size())},
                     {"geometryTypes", static_cast<int>(reader.GetGeomTypeList().size())}};
  object.insert("versions", list(document.versions(), [](const VersionInfo& info) {
                  return QJsonObject{{"name", info.name},          {"version", info.version},
                                     {"category", info.category},  {"guid", info.guid},
                                     {"line", info.startLine + 1}, {"bytes", info.byteLength}};
                }));
  object.insert("datasets", list(reader.GetDatasetList(), datasetJson));
  object.insert("featureTypes", list(reader.GetFeatureTypeList(), featureTypeJson));
  object.insert("server", QJsonObject{{"services", names(server.services)},
                                      {"repositories", names(server.repositories)},
                                      {"items", names(server.items)}});
  addSections(object, reader, QString());
  object.insert("subDocuments", list(subDocuments(reader),
                                     [&](const QString& name) { return subDocumentJson(reader, name); }));
  return object;
}
