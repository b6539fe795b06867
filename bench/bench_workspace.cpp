// Reading and writing of a workspace document of about 20 MB, held against what the libraries at hand need
// for the same bytes in the same run, and the growth of cost and memory with the size of the document.
#include <transform/workspace/XMLComponentReader.h>
#include <transform/workspace/XMLComponentWriter.h>

#include <QBuffer>
#include <QDomDocument>
#include <QXmlStreamWriter>
#include <benchmark/benchmark.h>
#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/parsers/XercesDOMParser.hpp>

#include <bench/PeakMemory.h>
#include <chrono>
#include <cstdio>
#include <map>
#include <string>

namespace {

constexpr int kTransformers = 10000;
constexpr int kParameters = 8;
constexpr int kRepetitions = 5;
const QString kMain;

TransformerStruct transformer(int number) {
  TransformerStruct record;
  record.identifier = number;
  record.type = QStringLiteral("AttributeManager");
  record.version = 3;
  record.position = QPointF(number * 17.25, -number * 3.5);
  record.boundingRect = QRectF(record.position, QSizeF(240, 71));
  record.order = 5.0 + number;
  record.inputFtOrder = QStringLiteral("0");
  record.outputFeats.resize(2);
  record.outputFeats[0].name = QStringLiteral("OUTPUT");
  record.outputFeats[1].name = QStringLiteral("<REJECTED>");
  for (int i = 0; i < 4; ++i) {
    XformAttrStruct attribute;
    attribute.attrName = QStringLiteral("attribute_%1{%2}").arg(i).arg(number % 7);
    attribute.featIndex = i % 2;
    record.attributes.append(attribute);
  }
  for (int i = 0; i < kParameters; ++i) {
    XformParmStruct parameter;
    parameter.parmName = i == 0 ? QStringLiteral("XFORMER_NAME") : QStringLiteral("PARAMETER_NAME_%1").arg(i);
    parameter.parmValue =
        QStringLiteral("value \"%1\" of <openparen>%2<closeparen>, $(MACRO_%1) & more").arg(i).arg(number);
    record.parameters.append(parameter);
  }
  return record;
}

struct Records {
  std::vector<TransformerStruct> transformers;
  std::vector<LinkStruct> links;
};

Records makeRecords(int transformers) {
  Records records;
  for (int i = 0; i < transformers; ++i) {
    records.transformers.push_back(transformer(i));
    LinkStruct link;
    link.identifier = i;
    link.sourceNode = i;
    link.targetNode = i + 1;
    link.sourcePortDesc = QStringLiteral("fo 0 OUTPUT");
    link.targetPortDesc = QStringLiteral("fi 0 INPUT");
    records.links.push_back(link);
  }
  return records;
}

void writeRecords(const Records& records, QByteArray& bytes) {
  QBuffer buffer(&bytes);
  buffer.open(QIODevice::WriteOnly);
  XMLComponentWriter writer(&buffer, kWorkspaceDocument);
  writer.setMiscParms(kMain, {{QStringLiteral("TITLE"), QStringLiteral("benchmark")}});
  for (const TransformerStruct& record : records.transformers)
    writer.addTransformer(kMain, record);
  for (const LinkStruct& record : records.links)
    writer.addFeatureTypeLink(kMain, record);
  writer.writeDocument();
}

const QByteArray& document(int transformers) {
  static std::map<int, QByteArray> documents;
  QByteArray& bytes = documents[transformers];
  if (bytes.isEmpty())
    writeRecords(makeRecords(transformers), bytes);
  return bytes;
}

std::size_t readAllLists(const QByteArray& bytes) {
  XMLComponentReader reader;
  reader.ReadBufferInput(bytes);
  const auto transformers = reader.GetTransformerList(kMain);
  return transformers.size() + reader.GetDatasetList().size() + reader.GetDataTypeList().size() +
         reader.GetGeomTypeList().size() + reader.GetFeatureTypeList().size() +
         reader.GetGlobalParameterList(kMain).size() + reader.GetFeatureTypeLinkList(kMain).size() +
         reader.GetAttributeLinkList(kMain).size() + reader.GetBookmarkList(kMain).size() +
         reader.GetBreakpointList(kMain).size() + reader.GetCommentList(kMain).size() +
         reader.GetConstantList(kMain).size() + reader.GetSubDocumentIOList(kMain).size();
}

void parseWithXerces(const QByteArray& bytes) {
  using namespace XERCES_CPP_NAMESPACE;
  XercesDOMParser parser;
  parser.parse(MemBufInputSource(reinterpret_cast<const XMLByte*>(bytes.constData()),
                                 static_cast<XMLSize_t>(bytes.size()), "benchmark"));
  benchmark::DoNotOptimize(parser.getDocument());
}

void parseWithQtDom(const QByteArray& bytes) {
  QDomDocument dom;
  dom.setContent(bytes);
  benchmark::DoNotOptimize(dom);
}

// The same elements and attributes as the document has, through Qt's own writer.
class StreamWriting {
 public:
  explicit StreamWriting(const QByteArray& bytes) {
    m_dom.setContent(bytes);
    collect(m_dom.documentElement());
  }

  QByteArray write() const {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QXmlStreamWriter writer(&buffer);
    writer.setAutoFormatting(true);
    writer.writeStartDocument();
    for (const Step& step : m_steps) {
      if (step.name.isEmpty()) {
        writer.writeEndElement();
        continue;
      }
      writer.writeStartElement(step.name);
      for (const auto& [name, value] : step.attributes)
        writer.writeAttribute(name, value);
    }
    writer.writeEndDocument();
    return bytes;
  }

 private:
  struct Step {
    QString name;  // empty: an element ends
    std::vector<std::pair<QString, QString>> attributes;
  };

  void collect(const QDomElement& element) {
    Step step{element.tagName(), {}};
    const QDomNamedNodeMap attributes = element.attributes();
    for (int i = 0; i < attributes.count(); ++i)
      step.attributes.emplace_back(attributes.item(i).nodeName(), attributes.item(i).nodeValue());
    m_steps.push_back(step);
    for (QDomElement child = element.firstChildElement(); !child.isNull(); child = child.nextSiblingElement())
      collect(child);
    m_steps.push_back({});
  }

  QDomDocument m_dom;
  std::vector<Step> m_steps;
};

template <class Work>
double bestSeconds(Work&& work, int repetitions = kRepetitions) {
  double best = 1e9;
  for (int i = 0; i < repetitions; ++i) {
    const auto start = std::chrono::steady_clock::now();
    work();
    best = std::min(best, std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count());
  }
  return best;
}

void printRatios() {
  const QByteArray& bytes = document(kTransformers);
  const double megabytes = static_cast<double>(bytes.size()) / 1e6;
  std::printf("document: %.1f MB, %d transformers\n", megabytes, kTransformers);
  // First of all: what is freed stays with the process, and would be used again.
  const auto perByte = [&](double memory) { return memory / static_cast<double>(bytes.size()); };
  std::printf("peak memory per byte: reading %.2f, Xerces-C %.2f, QDomDocument %.2f\n",
              perByte(peakMemory([&] { readAllLists(bytes); })),
              perByte(peakMemory([&] { parseWithXerces(bytes); })),
              perByte(peakMemory([&] { parseWithQtDom(bytes); })));
  const double reading = bestSeconds([&] { benchmark::DoNotOptimize(readAllLists(bytes)); });
  std::fflush(stdout);
  const double xerces = bestSeconds([&] { parseWithXerces(bytes); });
  const double qtDom = bestSeconds([&] { parseWithQtDom(bytes); });
  std::printf("read into all lists          %8.1f ms\n", reading * 1e3);
  std::printf("Xerces-C default DOM parse   %8.1f ms   ratio %.2f (aim 0.50)\n", xerces * 1e3,
              reading / xerces);
  std::printf("QDomDocument parse           %8.1f ms   ratio %.2f\n", qtDom * 1e3, reading / qtDom);

  const Records records = makeRecords(kTransformers);
  const double writing = bestSeconds([&] {
    QByteArray output;
    writeRecords(records, output);
    benchmark::DoNotOptimize(output);
  });
  const StreamWriting stream(bytes);
  const double streaming = bestSeconds([&] { benchmark::DoNotOptimize(stream.write()); });
  std::printf("queue and write              %8.1f ms\n", writing * 1e3);
  std::printf("QXmlStreamWriter             %8.1f ms   ratio %.2f (aim 0.50)\n", streaming * 1e3,
              writing / streaming);

  for (const int count : {1000, 10000, 100000}) {
    const QByteArray& sized = document(count);
    const double seconds = bestSeconds([&] { benchmark::DoNotOptimize(readAllLists(sized)); }, 2);
    std::printf("read %6d transformers       %8.2f us each\n", count, seconds * 1e6 / count);
  }
  std::fflush(stdout);
}

void readLists(benchmark::State& state) {
  const QByteArray& bytes = document(static_cast<int>(state.range(0)));
  for (auto _ : state)
    benchmark::DoNotOptimize(readAllLists(bytes));
  state.SetBytesProcessed(state.iterations() * bytes.size());
}
BENCHMARK(readLists)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);

void xercesParse(benchmark::State& state) {
  const QByteArray& bytes = document(static_cast<int>(state.range(0)));
  for (auto _ : state)
    parseWithXerces(bytes);
  state.SetBytesProcessed(state.iterations() * bytes.size());
}
BENCHMARK(xercesParse)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);

}  // namespace

int main(int argc, char** argv) {
  const XMLComponentReader
      initialised;  // sets up the XML library for the parser that is held against it, too
  printRatios();
  benchmark::Initialize(&argc, argv);
  benchmark::RunSpecifiedBenchmarks();
  return 0;
}
