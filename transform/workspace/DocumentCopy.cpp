#include <transform/workspace/DocumentCopy.h>

void copySections(const IXMLComponentReader& reader, const QString& document, XMLComponentWriter& writer) {
  writer.setMiscParms(document, reader.GetSubDocParms(document));
  for (const auto& record : reader.GetGlobalParameterList(document))
    writer.addGlobalParameter(document, record);
  for (const auto& record : reader.GetCommentList(document))
    writer.addComment(document, record);
  for (const auto& record : reader.GetBookmarkList(document))
    writer.addBookmark(document, record);
  for (const auto& record : reader.GetTransformerList(document))
    writer.addTransformer(document, record);
  for (const auto& record : reader.GetSubDocumentIOList(document))
    writer.addSubDocumentIO(document, record);
  for (const auto& record : reader.GetFeatureTypeLinkList(document))
    writer.addFeatureTypeLink(document, record);
  for (const auto& record : reader.GetBreakpointList(document))
    writer.addBreakpoint(document, record);
  for (const auto& record : reader.GetAttributeLinkList(document))
    writer.addAttributeLink(document, record);
}

void copyDocument(const IXMLComponentReader& reader, XMLComponentWriter& writer) {
  for (const auto& record : reader.GetDatasetList())
    writer.addDataset(record);
  for (const auto& record : reader.GetDataTypeList())
    writer.addDataType(record);
  for (const auto& record : reader.GetGeomTypeList())
    writer.addGeomType(record);
  for (const auto& record : reader.GetFeatureTypeList())
    writer.addFeatureType(record);
  writer.setServerParameters(reader.GetServerParameters());
  copySections(reader, QString(), writer);
  QStringList names = reader.GetSubDocList();
  names.removeAll(QString());
  names.removeDuplicates();
  for (const QString& name : qAsConst(names))
    copySections(reader, name, writer);
}
