#include <transform/files/TemporaryFile.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/XMLComponentReader.h>
#include <transform/workspace/reading/WorkspaceSplitter.h>
#include <transform/workspace/records/ElementTable.h>
#include <transform/workspace/records/RecordReader.h>

#include <QBuffer>
#include <QFile>

#include <algorithm>

namespace {

const QString kTemporaryName = QStringLiteral("kx-in-XXXXXX");
constexpr int kRecognisedBytes = 100;

}  // namespace

IXMLComponentReader::~IXMLComponentReader() = default;

std::unique_ptr<IXMLComponentReader> IXMLComponentReader::create() {
  return std::make_unique<XMLComponentReader>();
}

XMLComponentReader::XMLComponentReader() = default;
XMLComponentReader::~XMLComponentReader() = default;

bool XMLComponentReader::IsFileXMLWorkspace(const QString& fileName) {
  QFile file(fileName);
  if (!file.open(QIODevice::ReadOnly | QIODevice::Unbuffered))
    return false;
  return isXMLWorkspace(file.read(kRecognisedBytes));
}

bool XMLComponentReader::isXMLWorkspace(const QByteArray& bytes) {
  const QByteArray start =
      QByteArray::fromRawData(bytes.constData(), std::min(bytes.size(), kRecognisedBytes));
  if (start.contains("ORW"))
    return true;
  if (!start.contains('<'))  // most definition files
    return false;
  for (const char* const tag : {"<WORKSPACE", "<DATASOURCE", "<ETL_TOOL", "<TRANSFORMER"}) {
    if (start.contains(tag))
      return true;
  }
  return false;
}

QString XMLComponentReader::SplitWorkspace(const QString& fileName, QStringList& headerLines,
                                           QHash<QString, QString>* prompts,
                                           QHash<QString, QString>* macros) {
  PlainFile plain(fileName, kTemporaryName);
  TemporaryFile xml(kTemporaryName);
  if (!xml.open())
    throw WorkspaceLoaderException(orx::messages::kFileNotOpened, {xml.fileTemplate()});
  WorkspaceSplitter splitter;
  splitter.split(plain.device(), xml, fileName);
  if (!xml.flush())
    throw WorkspaceLoaderException(orx::messages::kFileNotOpened, {xml.fileName()});
  headerLines += splitter.headerLines();
  if (prompts)
    WorkspaceSplitter::collectPrompts(splitter.headerLines(), *prompts);
  if (macros)
    WorkspaceSplitter::collectMacros(splitter.headerLines(), *macros);
  xml.setAutoRemove(false);
  return xml.fileName();
}

QList<VersionInfo> XMLComponentReader::getVersions(const QString& fileName, QString& error) {
  return VersionStore(fileName).versions(error);
}

void XMLComponentReader::ReadInput(const QString& fileName) {
  XMLComponentParser::ReadInput(fileName);
}
void XMLComponentReader::ReadInput(const IORXString& fileName) {
  XMLComponentParser::ReadInput(fileName);
}

void XMLComponentReader::ReadInput(const QString& fileName, QStringList& headerLines) {
  forgetDocument();
  PlainFile plain(fileName, kTemporaryName);
  ReadOpenedInput(plain, fileName, false, headerLines);
}

void XMLComponentReader::ReadOpenedInput(PlainFile& file, const QString& fileName, bool isXmlAlone,
                                         QStringList& headerLines) {
  if (isXmlAlone) {
    parseWithMarkup(file.rewound(), fileName);
    return;
  }
  WorkspaceSplitter splitter;
  splitAndParse(splitter, file.rewound(), fileName, kTemporaryName);
  headerLines += splitter.headerLines();
  m_firstHeaderLine = splitter.firstHeaderLine();
}

void XMLComponentReader::ReadVersionedInput(const QString& fileName, qint64 offset, qint64 length,
                                            bool withHeader, QStringList& headerLines, QByteArray& before,
                                            QByteArray& behind) {
  forgetDocument();
  VersionStore::Piece piece = VersionStore(fileName).read(offset, length);
  QBuffer buffer(&piece.document);
  buffer.open(QIODevice::ReadOnly);
  WorkspaceSplitter splitter;
  splitter.setFirstLine(piece.documentLine);
  splitAndParse(splitter, buffer, fileName, kTemporaryName);
  if (withHeader)
    headerLines += splitter.headerLines();
  m_firstHeaderLine = splitter.firstHeaderLine();
  before = piece.before;
  behind = piece.behind;
}

void XMLComponentReader::documentForgotten() {
  m_documents.clear();
  m_subDocuments.clear();
  m_serverParameters = ServerParameterStruct();
  m_visualizersDisabled = false;
  m_firstHeaderLine = 0;
}

void XMLComponentReader::indexDocument(std::size_t index, const QString& name) {
  const ElementTable& elements = getElements();
  Document document;
  document.line = elements.line(index);
  elements.eachAttribute(index, [&](const ElementTable::Attribute& attribute) {
    document.parameters.insert(attribute.name, attribute.value);
  });
  elements.eachChild(index,
                     [&](std::size_t child) { document.sections[elements.name(child)].append(child); });
  m_documents.insert(name, document);
}

void XMLComponentReader::documentParsed() {
  const ElementTable& elements = getElements();
  if (elements.size() == 0)
    return;
  indexDocument(0, QString());
  const Document main = m_documents.value(QString());
  m_visualizersDisabled =
      main.parameters.value(words::kDisableVisualizers.toQString()) == words::kTrue.view();
  const QVector<std::size_t> servers = main.sections.value(words::kOrxserver.toQString());
  if (!servers.isEmpty())
    m_serverParameters = RecordReader(elements, m_prompts).read<tables::ServerParameter>(servers.first());
  const QVector<std::size_t> holders = main.sections.value(words::kSubdocuments.toQString());
  for (const std::size_t holder : holders) {
    elements.eachChild(holder, [&](std::size_t child) {
      if (!elements.isNamed(child, words::kSubdocument))
        return;
      const QString name = elements.attribute(child, words::kName);
      m_subDocuments.append(name);
      if (!m_documents.contains(name))
        indexDocument(child, name);
    });
  }
}

DocumentType XMLComponentReader::GetDocumentType() const {
  if (getElements().size() == 0)
    return kUnknownDocument;
  for (const auto& [name, type] : {std::make_pair(words::kWorkspace, kWorkspaceDocument),
                                   std::make_pair(words::kDatasource, kDataSourceDocument),
                                   std::make_pair(words::kEtlTool, kToolDocument),
                                   std::make_pair(words::kTransformer, kTransformerDocument)}) {
    if (getElements().isNamed(0, name))
      return type;
  }
  return kUnknownDocument;
}

QString XMLComponentReader::GetMiscParm(const QString& name, const QString& defaultValue) const {
  return m_documents.value(QString()).parameters.value(name, defaultValue);
}

bool XMLComponentReader::HasMiscParm(const QString& name) const {
  return m_documents.value(QString()).parameters.contains(name);
}

QStringList XMLComponentReader::GetSubDocList() const {
  return m_subDocuments;
}

QHash<QString, QString> XMLComponentReader::GetSubDocParms(const QString& document) const {
  return m_documents.value(document).parameters;
}

ServerParameterStruct XMLComponentReader::GetServerParameters() const {
  return m_serverParameters;
}

template <class Table>
ORXTValSlist<typename Table::Record> XMLComponentReader::readSection(const QString& document,
                                                                     const Word& section) const {
  ORXTValSlist<typename Table::Record> records;
  const auto found = m_documents.constFind(document);
  if (found == m_documents.constEnd())
    return records;
  const ElementTable& elements = getElements();
  const RecordReader reader(elements, m_prompts);
  const QVector<std::size_t> parts = found->sections.value(section.toQString());
  for (const std::size_t part : parts) {
    elements.eachChild(part, [&](std::size_t child) {
      if (elements.isNamed(child, Table::element))
        records.append(reader.read<Table>(child));
    });
  }
  return records;
}

ORXTValSlist<DatasetStruct> XMLComponentReader::GetDatasetList() const {
  return readSection<tables::Dataset>(QString(), words::kDatasets);
}

ORXTValSlist<DataTypeStruct> XMLComponentReader::GetDataTypeList() const {
  return readSection<tables::DataType>(QString(), words::kDataTypes);
}

ORXTValSlist<GeomTypeStruct> XMLComponentReader::GetGeomTypeList() const {
  return readSection<tables::GeomType>(QString(), words::kGeomTypes);
}

ORXTValSlist<FeatureTypeStruct> XMLComponentReader::GetFeatureTypeList() const {
  return readSection<tables::FeatureType>(QString(), words::kFeatureTypes);
}

ORXTValSlist<GlobalParameterStruct> XMLComponentReader::GetGlobalParameterList(
    const QString& document) const {
  return readSection<tables::GlobalParameter>(document, words::kGlobalParameters);
}

ORXTValSlist<TransformerStruct> XMLComponentReader::GetTransformerList(const QString& document) const {
  return readSection<tables::Transformer>(document, words::kTransformers);
}

ORXTValSlist<LinkStruct> XMLComponentReader::GetFeatureTypeLinkList(const QString& document) const {
  return readSection<tables::FeatLink>(document, words::kFeatLinks);
}

ORXTValSlist<LinkStruct> XMLComponentReader::GetAttributeLinkList(const QString& document) const {
  return readSection<tables::AttrLink>(document, words::kAttrLinks);
}

ORXTValSlist<BookmarkStruct> XMLComponentReader::GetBookmarkList(const QString& document) const {
  return readSection<tables::Bookmark>(document, words::kBookmarks);
}

ORXTValSlist<BreakpointStruct> XMLComponentReader::GetBreakpointList(const QString& document) const {
  return readSection<tables::Breakpoint>(document, words::kBreakpoints);
}

ORXTValSlist<CommentStruct> XMLComponentReader::GetCommentList(const QString& document) const {
  return readSection<tables::Comment>(document, words::kComments);
}

ORXTValSlist<ConstantStruct> XMLComponentReader::GetConstantList(const QString& document,
                                                                 bool parameterConstants) const {
  return parameterConstants ? readSection<tables::ParameterConstant>(document, words::kConstants)
                            : readSection<tables::Constant>(document, words::kConstants);
}

ORXTValSlist<SubDocumentIOStruct> XMLComponentReader::GetSubDocumentIOList(const QString& document) const {
  return readSection<tables::SubDocumentIO>(document, words::kSubdocumentIos);
}

OrderedObjectList XMLComponentReader::GetOrderedSubDocumentIOs(const QString& document) const {
  OrderedObjectList ports;
  for (const SubDocumentIOStruct& port : GetSubDocumentIOList(document))
    ports.push_back({port.identifier, port});
  std::stable_sort(
      ports.begin(), ports.end(),
      [](const OrderedObjectStruct& left, const OrderedObjectStruct& right) { return left.key < right.key; });
  return ports;
}

bool XMLComponentReader::AreVisualizersDisabled() const {
  return m_visualizersDisabled;
}
int XMLComponentReader::GetFirstHeaderLineNumber() const {
  return m_firstHeaderLine;
}
int XMLComponentReader::GetDocumentLine(const QString& document) const {
  return m_documents.value(document).line;
}

void XMLComponentReader::SetPromptDefinitionSource(PromptDefinitionSource source) {
  m_prompts = std::move(source);
}
