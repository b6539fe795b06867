#include <platform/vtl/SystemEncoding.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/XMLComponentWriter.h>
#include <transform/workspace/reading/DocumentLimits.h>
#include <transform/workspace/reading/DocumentMessages.h>
#include <transform/workspace/records/RecordCheck.h>
#include <transform/workspace/writing/ElementText.h>
#include <transform/workspace/writing/XmlText.h>

#include <QTextCodec>

namespace messages = orx::messages;

namespace {

const Word& rootElement(DocumentType type) {
  switch (type) {
    case kDataSourceDocument:
      return words::kDatasource;
    case kToolDocument:
      return words::kEtlTool;
    case kTransformerDocument:
      return words::kTransformer;
    default:
      return words::kWorkspace;
  }
}

bool isUtf16(const QByteArray& codecName) {
  return codecName.toUpper().startsWith("UTF-16");
}

}  // namespace

XMLComponentWriter::XMLComponentWriter(QIODevice* device, DocumentType type)
    : m_type(type), m_stream(device) {
  setEncoding(ORXSystemEncodingName());
}

XMLComponentWriter::~XMLComponentWriter() = default;

bool XMLComponentWriter::setEncoding(const QByteArray& name) {
  QTextCodec* const codec = QTextCodec::codecForName(name);
  if (!codec)
    return false;
  m_stream.setCodec(codec);
  m_text = std::make_unique<ElementText>(codec);
  return true;
}

void XMLComponentWriter::setByteOrderMark(bool on) {
  m_byteOrderMark = on;
}

void XMLComponentWriter::refuse(const QString& reason) {
  if (m_refusal.isEmpty())
    m_refusal = reason;
}

template <class Table, class Queue>
void XMLComponentWriter::queue(const typename Table::Record& record, Queue& records) {
  if (m_refusal.isEmpty())
    m_refusal = recordRefusal<Table>(record);
  records.push_back(record);
}

void XMLComponentWriter::addDataset(const DatasetStruct& record) {
  queue<tables::Dataset>(record, m_datasets);
}
void XMLComponentWriter::addDataType(const DataTypeStruct& record) {
  queue<tables::DataType>(record, m_dataTypes);
}
void XMLComponentWriter::addGeomType(const GeomTypeStruct& record) {
  queue<tables::GeomType>(record, m_geomTypes);
}
void XMLComponentWriter::addFeatureType(const FeatureTypeStruct& record) {
  queue<tables::FeatureType>(record, m_featureTypes);
}
void XMLComponentWriter::addGlobalParameter(const QString& document, const GlobalParameterStruct& record) {
  queue<tables::GlobalParameter>(record, m_queues[document].globalParameters);
}
void XMLComponentWriter::addComment(const QString& document, const CommentStruct& record) {
  queue<tables::Comment>(record, m_queues[document].comments);
}
void XMLComponentWriter::addBookmark(const QString& document, const BookmarkStruct& record) {
  queue<tables::Bookmark>(record, m_queues[document].bookmarks);
}
void XMLComponentWriter::addTransformer(const QString& document, const TransformerStruct& record) {
  queue<tables::Transformer>(record, m_queues[document].transformers);
}
void XMLComponentWriter::addFeatureTypeLink(const QString& document, const LinkStruct& record) {
  queue<tables::FeatLink>(record, m_queues[document].featureLinks);
}
void XMLComponentWriter::addBreakpoint(const QString& document, const BreakpointStruct& record) {
  queue<tables::Breakpoint>(record, m_queues[document].breakpoints);
}
void XMLComponentWriter::addAttributeLink(const QString& document, const LinkStruct& record) {
  queue<tables::AttrLink>(record, m_queues[document].attributeLinks);
}
void XMLComponentWriter::addSubDocumentIO(const QString& document, const SubDocumentIOStruct& record) {
  queue<tables::SubDocumentIO>(record, m_queues[document].ports);
}

void XMLComponentWriter::setServerParameters(const ServerParameterStruct& record) {
  refuse(recordRefusal<tables::ServerParameter>(record));
  m_serverParameters = record;
}

void XMLComponentWriter::setMiscParms(const QString& document, const QHash<QString, QString>& parameters) {
  checkParameters(document, parameters);
  if (!document.isEmpty() && !m_parameters.contains(document))
    m_subDocuments.append(document);
  m_parameters.insert(document, parameters);
}

void XMLComponentWriter::checkParameters(const QString& document, const QHash<QString, QString>& parameters) {
  const QString place = document.isEmpty() ? documentText(messages::kDocumentParameters)
                                           : documentText(messages::kSubDocumentParameters, {document});
  const auto check = [&](const QString& name, const QString& reason) {
    if (!reason.isEmpty())
      refuse(documentText(messages::kParameterRefused, {place, name, reason}));
  };
  check(words::kName.toQString(), valueRefusal(document));
  // A sub-document's name is an attribute, too.
  if (parameters.size() >= limits::kAttributesPerElement)
    refuse(documentText(messages::kTooManyParameters,
                        {place, QString::number(limits::kAttributesPerElement - 1)}));
  QStringList names = parameters.keys();
  names.sort();
  for (const QString& name : qAsConst(names)) {
    if (!isXmlName(name))
      check(name, documentText(messages::kNoXmlName));
    check(name, valueRefusal(parameters.value(name)));
  }
}

QStringList XMLComponentWriter::getUnwrittenDocuments() const {
  QStringList names;
  for (const auto& [name, queues] : m_queues) {
    if (!name.isEmpty() && !m_parameters.contains(name))
      names.append(name);
  }
  return names;
}

// Hands the text on, so that a derived writer's own text stands in its place.
void XMLComponentWriter::flushText() {
  m_stream << m_text->text();
  m_text->clear();
}

template <class Table>
void XMLComponentWriter::put(const typename Table::Record& record) {
  m_text->element<Table>(record);
  flushText();
}

template <class Record>
void XMLComponentWriter::section(const Word& name, const std::vector<Record>& records,
                                 void (XMLComponentWriter::*write)(const Record&)) {
  m_text->openSection(name);
  flushText();
  for (const Record& record : records)
    (this->*write)(record);
  m_text->closeElement(name);
  flushText();
}

void XMLComponentWriter::writeParameters(const QString& document) {
  const QHash<QString, QString> parameters = m_parameters.value(document);
  QStringList names = parameters.keys();
  names.sort();
  for (const QString& name : qAsConst(names)) {
    if (document.isEmpty() || name != words::kName.view())
      m_text->attribute(name, parameters.value(name));
  }
}

// Names, unlike values, have no way to hold a character that the encoding lacks.
void XMLComponentWriter::checkEncoding() {
  for (const QString& document : QStringList(QString()) + m_subDocuments) {
    QStringList names = m_parameters.value(document).keys();
    names.sort();
    for (const QString& name : qAsConst(names)) {
      if (!m_stream.codec()->canEncode(name))
        refuse(documentText(messages::kNameNotEncoded, {name}));
    }
  }
}

void XMLComponentWriter::writeDocument() {
  checkEncoding();
  if (!m_refusal.isEmpty()) {
    m_stream.setStatus(QTextStream::WriteFailed);
    return;
  }
  const QByteArray encoding = m_stream.codec()->name();
  m_stream.setGenerateByteOrderMark(m_byteOrderMark && isUtf16(encoding));
  m_stream << QLatin1String("<?xml version=\"1.0\" encoding=\"") << QString::fromLatin1(encoding)
           << QLatin1String("\" ?>\n");
  const Word& root = rootElement(m_type);
  m_text->beginElement(root);
  writeParameters(QString());
  m_text->endAttributes(true);
  flushText();
  section(words::kDatasets, m_datasets, &XMLComponentWriter::writeDataset);
  section(words::kDataTypes, m_dataTypes, &XMLComponentWriter::writeDataType);
  section(words::kGeomTypes, m_geomTypes, &XMLComponentWriter::writeGeomType);
  section(words::kFeatureTypes, m_featureTypes, &XMLComponentWriter::writeFeatureType);
  m_text->openSection(words::kOrxserver);
  flushText();
  writeServerParameters(m_serverParameters);
  m_text->closeElement(words::kOrxserver);
  flushText();
  writeSections(QString());
  writeSubDocuments();
  m_text->openSection(words::kLookupTables);
  m_text->closeElement(words::kLookupTables);
  m_text->closeElement(root);
  flushText();
  m_stream.flush();
}

void XMLComponentWriter::writeSubDocuments() {
  m_text->openSection(words::kSubdocuments);
  for (const QString& name : qAsConst(m_subDocuments)) {
    m_text->beginElement(words::kSubdocument);
    m_text->attribute(words::kName.view(), name);
    writeParameters(name);
    m_text->endAttributes(true);
    flushText();
    writeSections(name);
    m_text->closeElement(words::kSubdocument);
  }
  m_text->closeElement(words::kSubdocuments);
  flushText();
}

void XMLComponentWriter::writeDataset(const DatasetStruct& record) {
  put<tables::Dataset>(record);
}
void XMLComponentWriter::writeDataType(const DataTypeStruct& record) {
  put<tables::DataType>(record);
}
void XMLComponentWriter::writeGeomType(const GeomTypeStruct& record) {
  put<tables::GeomType>(record);
}
void XMLComponentWriter::writeGlobalParameter(const GlobalParameterStruct& record) {
  put<tables::GlobalParameter>(record);
}
void XMLComponentWriter::writeServerParameters(const ServerParameterStruct& record) {
  m_text->children<tables::ServerParameter>(record);
  flushText();
}
void XMLComponentWriter::writeFeatureType(const FeatureTypeStruct& record) {
  put<tables::FeatureType>(record);
}
void XMLComponentWriter::writeComment(const CommentStruct& record) {
  put<tables::Comment>(record);
}
void XMLComponentWriter::writeBookmark(const BookmarkStruct& record) {
  put<tables::Bookmark>(record);
}
void XMLComponentWriter::writeTransformer(const TransformerStruct& record) {
  put<tables::Transformer>(record);
}
void XMLComponentWriter::writeFeatureTypeLink(const LinkStruct& record) {
  put<tables::FeatLink>(record);
}
void XMLComponentWriter::writeBreakpoint(const BreakpointStruct& record) {
  put<tables::Breakpoint>(record);
}
void XMLComponentWriter::writeAttributeLink(const LinkStruct& record) {
  put<tables::AttrLink>(record);
}
void XMLComponentWriter::writeSubDocumentIO(const SubDocumentIOStruct& record) {
  put<tables::SubDocumentIO>(record);
}

void XMLComponentWriter::writeSections(const QString& document) {
  static const Queues none;
  const auto found = m_queues.find(document);
  const Queues& queues = found == m_queues.end() ? none : found->second;
  section(words::kGlobalParameters, queues.globalParameters, &XMLComponentWriter::writeGlobalParameter);
  section(words::kComments, queues.comments, &XMLComponentWriter::writeComment);
  m_text->openSection(words::kConstants);
  m_text->closeElement(words::kConstants);
  section(words::kBookmarks, queues.bookmarks, &XMLComponentWriter::writeBookmark);
  section(words::kTransformers, queues.transformers, &XMLComponentWriter::writeTransformer);
  if (!queues.ports.empty())
    section(words::kSubdocumentIos, queues.ports, &XMLComponentWriter::writeSubDocumentIO);
  section(words::kFeatLinks, queues.featureLinks, &XMLComponentWriter::writeFeatureTypeLink);
  section(words::kBreakpoints, queues.breakpoints, &XMLComponentWriter::writeBreakpoint);
  section(words::kAttrLinks, queues.attributeLinks, &XMLComponentWriter::writeAttributeLink);
}
