#include "DocumentContent.h"

#include <transform/workspace/WorkspaceLoaderException.h>

#include <QFile>
#include <QTemporaryFile>
#include <gtest/gtest.h>

namespace {

// Of each list its table, its place here, in the reader and in the writer.
template <class Visit>
void eachList(const Visit& visit) {
  using C = DocumentContent;
  using R = IXMLComponentReader;
  using W = XMLComponentWriter;
  visit(tables::Dataset(), &C::datasets, &R::GetDatasetList, &W::addDataset);
  visit(tables::DataType(), &C::dataTypes, &R::GetDataTypeList, &W::addDataType);
  visit(tables::GeomType(), &C::geomTypes, &R::GetGeomTypeList, &W::addGeomType);
  visit(tables::FeatureType(), &C::featureTypes, &R::GetFeatureTypeList, &W::addFeatureType);
}

template <class Visit>
void eachSection(const Visit& visit) {
  using S = DocumentSections;
  using R = IXMLComponentReader;
  using W = XMLComponentWriter;
  visit(tables::GlobalParameter(), &S::globalParameters, &R::GetGlobalParameterList, &W::addGlobalParameter);
  visit(tables::Comment(), &S::comments, &R::GetCommentList, &W::addComment);
  visit(tables::Bookmark(), &S::bookmarks, &R::GetBookmarkList, &W::addBookmark);
  visit(tables::Transformer(), &S::transformers, &R::GetTransformerList, &W::addTransformer);
  visit(tables::SubDocumentIO(), &S::ports, &R::GetSubDocumentIOList, &W::addSubDocumentIO);
  visit(tables::FeatLink(), &S::featureLinks, &R::GetFeatureTypeLinkList, &W::addFeatureTypeLink);
  visit(tables::Breakpoint(), &S::breakpoints, &R::GetBreakpointList, &W::addBreakpoint);
  visit(tables::AttrLink(), &S::attributeLinks, &R::GetAttributeLinkList, &W::addAttributeLink);
}

DocumentSections randomSections(RandomRecords& random, const QString& name, int records) {
  DocumentSections sections;
  for (int count = random.below(4); count > 0; --count)
    sections.parameters.insert(random.name(), random.text());
  if (!name.isEmpty())
    sections.parameters.insert(QStringLiteral("NAME"), name);
  eachSection([&](auto table, auto list, auto, auto) {
    for (int i = 0; i < records; ++i)
      (sections.*list).push_back(random.record<decltype(table)>());
  });
  return sections;
}

}  // namespace

DocumentContent randomContent(unsigned seed, int records) {
  RandomRecords random(seed);
  DocumentContent content;
  const DocumentType types[] = {kWorkspaceDocument, kDataSourceDocument, kToolDocument, kTransformerDocument};
  content.type = types[random.below(4)];
  eachList([&](auto table, auto list, auto, auto) {
    for (int i = 0; i < records; ++i)
      (content.*list).push_back(random.record<decltype(table)>());
  });
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
  eachList([&](auto, auto list, auto, auto add) {
    for (const auto& record : content.*list)
      (writer.*add)(record);
  });
  writer.setServerParameters(content.server);
  for (const QString& name : QStringList(QString()) + content.subDocuments) {
    const DocumentSections& sections = content.documents.at(name);
    writer.setMiscParms(name, sections.parameters);
    eachSection([&](auto, auto list, auto, auto add) {
      for (const auto& record : sections.*list)
        (writer.*add)(name, record);
    });
  }
}

DocumentContent contentOf(const IXMLComponentReader& reader) {
  DocumentContent content;
  content.type = reader.GetDocumentType();
  content.server = reader.GetServerParameters();
  content.subDocuments = reader.GetSubDocList();
  eachList([&](auto, auto list, auto get, auto) {
    for (const auto& record : (reader.*get)())
      (content.*list).push_back(record);
  });
  for (const QString& name : QStringList(QString()) + content.subDocuments) {
    DocumentSections& sections = content.documents[name];
    sections.parameters = reader.GetSubDocParms(name);
    eachSection([&](auto, auto list, auto get, auto) {
      for (const auto& record : (reader.*get)(name))
        (sections.*list).push_back(record);
    });
  }
  return content;
}

void expectSame(const DocumentContent& left, const DocumentContent& right) {
  EXPECT_EQ(left.type, right.type);
  EXPECT_TRUE(left.server == right.server);
  EXPECT_EQ(left.subDocuments, right.subDocuments);
  eachList([&](auto, auto list, auto, auto) { EXPECT_TRUE(left.*list == right.*list); });
  for (const auto& [name, sections] : left.documents) {
    const DocumentSections& one = sections;
    const DocumentSections& other = right.documents.at(name);
    EXPECT_EQ(one.parameters, other.parameters);
    eachSection([&](auto, auto list, auto, auto) { EXPECT_TRUE(one.*list == other.*list); });
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
