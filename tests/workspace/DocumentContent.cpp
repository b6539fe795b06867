#include "DocumentContent.h"

#include <transform/workspace/WorkspaceLoaderException.h>

#include <QFile>
#include <QTemporaryFile>
#include <gtest/gtest.h>

namespace {

template <class List>
auto toVector(const List& list) {
  return std::vector<typename List::value_type>(list.begin(), list.end());
}

DocumentSections sectionsOf(const IXMLComponentReader& reader, const QString& name) {
  DocumentSections sections;
  sections.parameters = reader.GetSubDocParms(name);
  sections.globalParameters = toVector(reader.GetGlobalParameterList(name));
  sections.comments = toVector(reader.GetCommentList(name));
  sections.bookmarks = toVector(reader.GetBookmarkList(name));
  sections.transformers = toVector(reader.GetTransformerList(name));
  sections.ports = toVector(reader.GetSubDocumentIOList(name));
  sections.featureLinks = toVector(reader.GetFeatureTypeLinkList(name));
  sections.breakpoints = toVector(reader.GetBreakpointList(name));
  sections.attributeLinks = toVector(reader.GetAttributeLinkList(name));
  return sections;
}

DocumentSections randomSections(RandomRecords& random, const QString& name, int records) {
  DocumentSections sections;
  for (int count = random.below(4); count > 0; --count)
    sections.parameters.insert(random.name(), random.text());
  if (!name.isEmpty())
    sections.parameters.insert(QStringLiteral("NAME"), name);
  for (int i = 0; i < records; ++i) {
    sections.globalParameters.push_back(random.record<tables::GlobalParameter>());
    sections.comments.push_back(random.record<tables::Comment>());
    sections.bookmarks.push_back(random.record<tables::Bookmark>());
    sections.transformers.push_back(random.record<tables::Transformer>());
    if (random.flag())
      sections.ports.push_back(random.record<tables::SubDocumentIO>());
    sections.featureLinks.push_back(random.record<tables::FeatLink>());
    sections.breakpoints.push_back(random.record<tables::Breakpoint>());
    sections.attributeLinks.push_back(random.record<tables::AttrLink>());
  }
  return sections;
}

}  // namespace

DocumentContent randomContent(unsigned seed, int records) {
  RandomRecords random(seed);
  DocumentContent content;
  const DocumentType types[] = {kWorkspaceDocument, kDataSourceDocument, kToolDocument, kTransformerDocument};
  content.type = types[random.below(4)];
  for (int i = 0; i < records; ++i) {
    content.datasets.push_back(random.record<tables::Dataset>());
    content.dataTypes.push_back(random.record<tables::DataType>());
    content.geomTypes.push_back(random.record<tables::GeomType>());
    content.featureTypes.push_back(random.record<tables::FeatureType>());
  }
  content.server = random.record<tables::ServerParameter>();
  content.documents[QString()] = randomSections(random, QString(), records);
  for (int i = 0; i < records; ++i) {
    const QString name = QStringLiteral("%1%2").arg(random.text()).arg(i);
    content.subDocuments.append(name);
    content.documents[name] = randomSections(random, name, random.below(3));
  }
  return content;
}

void queueContent(const DocumentContent& content, XMLComponentWriter& writer) {
  for (const auto& record : content.datasets)
    writer.addDataset(record);
  for (const auto& record : content.dataTypes)
    writer.addDataType(record);
  for (const auto& record : content.geomTypes)
    writer.addGeomType(record);
  for (const auto& record : content.featureTypes)
    writer.addFeatureType(record);
  writer.setServerParameters(content.server);
  for (const QString& name : QStringList(QString()) + content.subDocuments) {
    const DocumentSections& sections = content.documents.at(name);
    writer.setMiscParms(name, sections.parameters);
    for (const auto& record : sections.globalParameters)
      writer.addGlobalParameter(name, record);
    for (const auto& record : sections.comments)
      writer.addComment(name, record);
    for (const auto& record : sections.bookmarks)
      writer.addBookmark(name, record);
    for (const auto& record : sections.transformers)
      writer.addTransformer(name, record);
    for (const auto& record : sections.ports)
      writer.addSubDocumentIO(name, record);
    for (const auto& record : sections.featureLinks)
      writer.addFeatureTypeLink(name, record);
    for (const auto& record : sections.breakpoints)
      writer.addBreakpoint(name, record);
    for (const auto& record : sections.attributeLinks)
      writer.addAttributeLink(name, record);
  }
}

DocumentContent contentOf(const IXMLComponentReader& reader) {
  DocumentContent content;
  content.type = reader.GetDocumentType();
  content.datasets = toVector(reader.GetDatasetList());
  content.dataTypes = toVector(reader.GetDataTypeList());
  content.geomTypes = toVector(reader.GetGeomTypeList());
  content.featureTypes = toVector(reader.GetFeatureTypeList());
  content.server = reader.GetServerParameters();
  content.subDocuments = reader.GetSubDocList();
  for (const QString& name : QStringList(QString()) + content.subDocuments)
    content.documents[name] = sectionsOf(reader, name);
  return content;
}

void expectSame(const DocumentContent& left, const DocumentContent& right) {
  EXPECT_EQ(left.type, right.type);
  EXPECT_TRUE(left.datasets == right.datasets);
  EXPECT_TRUE(left.dataTypes == right.dataTypes);
  EXPECT_TRUE(left.geomTypes == right.geomTypes);
  EXPECT_TRUE(left.featureTypes == right.featureTypes);
  EXPECT_TRUE(left.server == right.server);
  EXPECT_EQ(left.subDocuments, right.subDocuments);
  for (const auto& [name, sections] : left.documents) {
    const DocumentSections& other = right.documents.at(name);
    EXPECT_EQ(sections.parameters, other.parameters);
    EXPECT_TRUE(sections.globalParameters == other.globalParameters);
    EXPECT_TRUE(sections.comments == other.comments);
    EXPECT_TRUE(sections.bookmarks == other.bookmarks);
    EXPECT_TRUE(sections.transformers == other.transformers);
    EXPECT_TRUE(sections.ports == other.ports);
    EXPECT_TRUE(sections.featureLinks == other.featureLinks);
    EXPECT_TRUE(sections.breakpoints == other.breakpoints);
    EXPECT_TRUE(sections.attributeLinks == other.attributeLinks);
  }
}

QByteArray written(const DocumentContent& content, const QByteArray& encoding) {
  QBuffer buffer;
  buffer.open(QIODevice::WriteOnly);
  XMLComponentWriter writer(&buffer, content.type);
  EXPECT_TRUE(writer.setEncoding(encoding));
  queueContent(content, writer);
  writer.writeDocument();
  EXPECT_EQ(writer.getRefusal().toStdString(), "");
  EXPECT_EQ(writer.stream().status(), QTextStream::Ok);
  return buffer.data();
}

std::unique_ptr<XMLComponentReader> readBytes(const QByteArray& bytes) {
  auto reader = std::make_unique<XMLComponentReader>();
  reader->ReadBufferInput(bytes);
  return reader;
}

QString readingError(const QByteArray& bytes) {
  XMLComponentReader reader;
  try {
    reader.ReadBufferInput(bytes);
  } catch (const WorkspaceLoaderException& exception) {
    EXPECT_EQ(reader.getRootNode(), nullptr);
    return exception.getMessage();
  }
  return QString();
}

ScratchFile::ScratchFile(const QByteArray& content) {
  QTemporaryFile file;
  file.setAutoRemove(false);
  EXPECT_TRUE(file.open());
  EXPECT_EQ(file.write(content), content.size());
  m_name = file.fileName();
}

ScratchFile::~ScratchFile() {
  QFile::remove(m_name);
}

QByteArray ScratchFile::content() const {
  QFile file(m_name);
  EXPECT_TRUE(file.open(QIODevice::ReadOnly));
  return file.readAll();
}
