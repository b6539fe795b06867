#include <transform/core/TransformerCfg.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/custom/network/ExternalDocNetworkBuilder.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/IXMLComponentReader.h>

#include <map>

namespace messages = orx::messages;

using orx::Rule;

void ExternalDocNetwork::build(const IXMLComponentReader& reader, const QString& subDocumentName,
                               TransformerSource& source) {
  Builder(*this, reader, subDocumentName, source).build();
}

ExternalDocNetwork::Builder::Builder(ExternalDocNetwork& network, const IXMLComponentReader& reader,
                                     const QString& document, TransformerSource& source)
    : m_network(network),
      m_reader(reader),
      m_document(document),
      m_findings(network.m_problems),
      m_binding(reader, source, network.m_problems) {}

void ExternalDocNetwork::Builder::build() {
  m_network.clearNodes();
  m_network.clearProblems();
  m_network.m_transformerNames.clear();
  const QHash<QString, QString> settings = m_reader.GetSubDocParms(m_document);
  m_network.takeSettings(settings);
  const auto version = settings.constFind(QStringLiteral("VERSION"));
  bool isNumber = true;
  if (version != settings.constEnd() && (version->toInt(&isNumber) < 0 || !isNumber)) {
    m_findings.reportAs(Rule::CustomTransformerFault, messages::kBadVersion,
                        m_reader.GetDocumentLine(m_document), QString(), {m_network.getName(), *version});
  }
  addPorts();
  for (const TransformerStruct& record : m_reader.GetTransformerList(m_document))
    addTransformer(record);
  for (const LinkStruct& record : m_reader.GetFeatureTypeLinkList(m_document))
    addLink(record);
  for (const LinkStruct& record : m_reader.GetAttributeLinkList(m_document))
    addAttributeLink(record);
  addParameters();
  checkLoops();
  m_network.doneAdding(true);
}

// --- nodes -------------------------------------------------------------------------------------------------

void ExternalDocNetwork::Builder::addPorts() {
  int inputs = 0;
  int outputs = 0;
  std::map<SubDocumentIOKind, QHash<QString, int>> lines;
  for (const SubDocumentIOStruct& record : m_reader.GetSubDocumentIOList(m_document)) {
    DocumentBinding::Place place;
    place.line = record.line;
    place.name = record.name;
    place.port = record.name;
    place.takes = record.isSource != SubDocumentIOKind::Input;
    place.gives = record.isSource != SubDocumentIOKind::Output;
    QStringList attributes;
    for (const SubDocumentIOAttrStruct& attribute : record.attributes)
      attributes.append(attribute.attrName);
    // The network has room for one of each name.
    QHash<QString, int>& known = lines[record.isSource];
    const auto earlier = known.constFind(record.name);
    place.isLeftOut = earlier != known.constEnd();
    if (place.isLeftOut)
      m_findings.report(Rule::DuplicateName, record.line, record.name,
                        {record.name, QString::number(*earlier)});
    else
      known.insert(record.name, record.line);
    if (!m_binding.enter(record.identifier, place) || place.isLeftOut)
      continue;
    if (!place.takes) {
      m_network.addInput(record.name, record.identifier, inputs++);
      m_network.setStaticInputAttributes(record.name, attributes);
    } else if (!place.gives) {
      m_network.addOutput(record.name, record.identifier,
                          record.attrMode == kOutgoingOwnList ? kOutgoingOwnList : kOutgoingArriving,
                          attributes, outputs++);
    } else {
      m_network.addLoop(record.name, record.identifier);
    }
    SubDocNetworkObj* port = m_network.nodeByNumber(record.identifier);
    if (port && port->line() == 0)
      port->setLine(record.line);
  }
  const QStringList inputNames = m_network.getInputs();
  const QSet<QString> taken(inputNames.begin(), inputNames.end());
  for (const QString& output : m_network.getOutputs()) {
    if (taken.contains(output)) {
      m_findings.reportAs(Rule::DuplicateName, messages::kSamePortName, m_reader.GetDocumentLine(m_document),
                          output, {output});
    }
  }
}

void ExternalDocNetwork::Builder::addTransformer(const TransformerStruct& record) {
  std::unique_ptr<TransformerCfg> cfg = m_binding.enter(record, record.identifier);
  if (!cfg)
    return;
  const DocumentBinding::Place& place = *m_binding.find(record.identifier);
  SubDocNetworkObjXformer* node = m_network.addTransformer(cfg.release(), {}, record.identifier);
  node->setLine(record.line);
  node->setParameterLines(ParameterLines(record));
  node->setExposedAttributes(place.ports.exposedAttributes(record));
  m_network.m_transformerNames.insert(place.name);
}

// --- links -------------------------------------------------------------------------------------------------

void ExternalDocNetwork::Builder::addLink(const LinkStruct& record) {
  if (const auto flow = m_binding.flow(record)) {
    if (!flow->isRepeated)
      m_network.addLink(record.sourceNode, flow->output, record.targetNode, flow->input);
    return;
  }
  if (SubDocNetworkObj* source = m_network.nodeByNumber(record.sourceNode))
    source->noteMissingOutputLink();
  if (SubDocNetworkObj* target = m_network.nodeByNumber(record.targetNode))
    target->noteMissingInputLink();
}

void ExternalDocNetwork::Builder::addAttributeLink(const LinkStruct& record) {
  const auto copy = m_binding.attributeCopy(record);
  if (copy && copy->from != copy->to) {
    m_network.nodeByNumber(record.sourceNode)
        ->addAttributeCopy(copy->output, *m_network.nodeByNumber(record.targetNode), copy->input, copy->from,
                           copy->to);
  }
}

// Features come back at the first loop point alone, and only where the whole is repeated.
void ExternalDocNetwork::Builder::checkLoops() {
  const int line = m_reader.GetDocumentLine(m_document);
  const QStringList loops = m_network.getLoops();
  if (m_network.blockedLooping() && loops.isEmpty())
    m_findings.reportAs(Rule::CustomTransformerFault, messages::kNoLoop, line, QString());
  for (const QString& output : m_network.getOutputs()) {
    if (loops.contains(output) || (!loops.isEmpty() && output == m_network.getLoopOutput()))
      m_findings.reportAs(Rule::DuplicateName, messages::kSameLoopName, line, output, {output});
  }
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    if (node->kind() != SubDocNetworkObj::Kind::Loop ||
        (m_network.blockedLooping() && node->name() == loops.first()))
      continue;
    const auto report = [&](Rule rule, long message, const QStringList& arguments) {
      m_findings.reportAs(rule, message, m_binding.find(node->number())->line, node->name(), arguments);
    };
    if (m_network.blockedLooping())
      report(Rule::LoopPoint, messages::kSecondLoop, {node->name(), loops.first()});
    else if (!node->feeders().empty() || !node->consumers().empty())
      report(Rule::CustomTransformerFault, messages::kLostLoop, {node->name()});
    else
      report(Rule::LoopPoint, messages::kIdleLoop, {node->name()});
  }
}

// --- parameters --------------------------------------------------------------------------------------------

void ExternalDocNetwork::Builder::addParameters() {
  for (const GlobalParameterStruct& record : m_reader.GetGlobalParameterList(m_document)) {
    const GUIType type = m_binding.promptOf(record);
    if (type.isNull())
      continue;
    m_network.addPublishedParameter(type, type.getName());
    m_network.addPublishedParameter(type.getName(), record.defaultValue);
  }
}
