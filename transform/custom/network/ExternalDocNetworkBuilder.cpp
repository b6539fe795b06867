#include <platform/orxutil/ResourceDirectories.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerSource.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/custom/network/ExternalDocNetworkBuilder.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/TransformerRecords.h>

#include <map>

namespace messages = orx::messages;

using orx::Rule;

void ExternalDocNetwork::build(const IXMLComponentReader& reader, const QString& subDocumentName,
                               TransformerSource& source) {
  Builder(*this, reader, subDocumentName, source).build();
}

ExternalDocNetwork::Builder::Builder(ExternalDocNetwork& network, const IXMLComponentReader& reader,
                                     const QString& document, TransformerSource& source)
    : m_network(network), m_reader(reader), m_document(document), m_source(source) {}

void ExternalDocNetwork::Builder::build() {
  m_network.clearNodes();
  m_network.clearProblems();
  m_network.m_transformerNames.clear();
  m_network.takeSettings(m_reader.GetSubDocParms(m_document));
  addPorts();
  for (const TransformerStruct& record : m_reader.GetTransformerList(m_document))
    addTransformer(record);
  for (const LinkStruct& record : m_reader.GetFeatureTypeLinkList(m_document)) {
    if (!addLink(record))
      noteLeftOut(record);
  }
  for (const LinkStruct& record : m_reader.GetAttributeLinkList(m_document))
    addAttributeLink(record);
  addParameters();
  checkLoops();
  m_network.doneAdding(true);
}

void ExternalDocNetwork::Builder::report(Rule rule, int line, const QString& node, long message,
                                         const QStringList& arguments) {
  m_network.addProblem(rule, message, line, node, TransformResString(message, arguments));
}

bool ExternalDocNetwork::Builder::enter(int identifier, const Place& place) {
  const auto earlier = m_places.constFind(identifier);
  if (earlier == m_places.constEnd()) {
    m_places.insert(identifier, place);
    return true;
  }
  report(Rule::DuplicateNumber, place.line, place.title, messages::kDuplicateNumber,
         {QString::number(identifier), QString::number(earlier->line)});
  return false;
}

// --- nodes -------------------------------------------------------------------------------------------------

void ExternalDocNetwork::Builder::addPorts() {
  int inputs = 0;
  int outputs = 0;
  std::map<Kind, QHash<QString, int>> lines;
  for (const SubDocumentIOStruct& record : m_reader.GetSubDocumentIOList(m_document)) {
    Place place;
    place.line = record.line;
    place.title = record.name;
    QStringList attributes;
    for (const SubDocumentIOAttrStruct& attribute : record.attributes)
      attributes.append(attribute.attrName);
    place.kind = record.isSource == SubDocumentIOKind::Input    ? Kind::Input
                 : record.isSource == SubDocumentIOKind::Output ? Kind::Output
                                                                : Kind::Loop;
    // The network has room for one of each name.
    QHash<QString, int>& known = lines[place.kind];
    const auto earlier = known.constFind(record.name);
    place.isLeftOut = earlier != known.constEnd();
    if (place.isLeftOut)
      report(Rule::DuplicateName, record.line, record.name, messages::kDuplicateName,
             {record.name, QString::number(*earlier)});
    else
      known.insert(record.name, record.line);
    if (!enter(record.identifier, place) || place.isLeftOut)
      continue;
    switch (place.kind) {
      case Kind::Input:
        m_network.addInput(record.name, record.identifier, inputs++);
        m_network.setStaticInputAttributes(record.name, attributes);
        break;
      case Kind::Output:
        m_network.addOutput(record.name, record.identifier,
                            record.attrMode == kOutgoingOwnList ? kOutgoingOwnList : kOutgoingArriving,
                            attributes, outputs++);
        break;
      default:
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
      report(Rule::DuplicateName, m_reader.GetDocumentLine(m_document), output, messages::kSamePortName,
             {output});
    }
  }
}

void ExternalDocNetwork::Builder::addTransformer(const TransformerStruct& record) {
  Place place;
  place.line = record.line;
  place.title = transformerTitle(record);
  place.isLeftOut = !record.enabled;
  std::unique_ptr<TransformerCfg> cfg;
  if (record.enabled) {
    const auto sameName = m_linesByTitle.constFind(place.title);
    if (sameName != m_linesByTitle.constEnd()) {
      report(Rule::DuplicateName, record.line, place.title, messages::kDuplicateName,
             {place.title, QString::number(*sameName)});
    } else {
      m_linesByTitle.insert(place.title, record.line);
    }
    cfg = makeTransformer(record, place.title);
    place.isLeftOut = !cfg;
  }
  if (cfg) {
    place.cfg = cfg.get();
    configure(record, place);
  }
  if (!enter(record.identifier, place) || !cfg)
    return;
  SubDocNetworkObjXformer* node = m_network.addTransformer(cfg.release(), {}, record.identifier);
  node->setLine(record.line);
  node->setParameterLines(ParameterLines(record));
  node->setExposedAttributes(place.ports.exposedAttributes(record));
  m_network.m_transformerNames.insert(place.title);
}

std::unique_ptr<TransformerCfg> ExternalDocNetwork::Builder::makeTransformer(const TransformerStruct& record,
                                                                             const QString& title) {
  const bool isCustom = record.kind == TransformerKind::SubDocument;
  const QString type = isCustom ? subDocumentName(record) : record.type;
  if (isCustom && type.isEmpty()) {
    report(Rule::UnknownTransformer, record.line, title, messages::kNoSubDocumentName, {});
    return nullptr;
  }
  std::unique_ptr<TransformerCfg> cfg = m_source.makeTransformer(type, record.version);
  if (cfg)
    return cfg;
  const QString refusal = m_source.refusalReason();
  if (!refusal.isEmpty()) {
    const bool isOfDocument = m_reader.GetSubDocList().contains(type);
    m_network.addProblem(isOfDocument ? Rule::Nesting : Rule::CustomTransformerFault, 0, record.line, title,
                         refusal);
    return nullptr;
  }
  const auto newest = m_source.makeTransformer(type, TransformerSource::kNewestVersion);
  if (newest) {
    report(Rule::UnknownVersion, record.line, title, messages::kUnknownVersion,
           {type, QString::number(record.version), QString::number(newest->getVersion())});
  } else {
    report(Rule::UnknownTransformer, record.line, title, messages::kUnknownTransformer,
           {type, QString::number(record.version),
            ORX_resourcePlaces(QStringLiteral("transformer")).join(QLatin1String(", "))});
  }
  return nullptr;
}

void ExternalDocNetwork::Builder::configure(const TransformerStruct& record, Place& place) {
  TransformerCfg& cfg = *place.cfg;
  if (record.lastParmEdit > 0)
    cfg.setLastParmEditBuild(record.lastParmEdit);
  cfg.setIdentifier(place.title);
  for (const XformParmStruct& parameter : record.parameters) {
    if (record.kind == TransformerKind::SubDocument && parameter.parmName == kSubDocumentNameParameter)
      continue;
    if (!cfg.setParameterValue(parameter.parmName, parameter.parmValue, false)) {
      report(Rule::UnknownParameter, parameter.line, place.title, messages::kUnknownParameter,
             {nameWithFile(cfg), parameter.parmName});
    }
  }
  cfg.autoUpgradeTransformer();
  if (cfg.isAutoUpgraded()) {
    report(Rule::Upgraded, record.line, place.title, messages::kUpgraded, {cfg.getName()});
  }
  if (!cfg.dependencyMet()) {
    report(Rule::UnmetDependency, record.line, place.title, messages::kUnmetDependency,
           {cfg.getName(), cfg.dependencyMsg()});
  }

  place.ports = TransformerPorts(record, cfg);
}

// --- links -------------------------------------------------------------------------------------------------

bool ExternalDocNetwork::Builder::findEnds(const LinkStruct& record, Place*& source, Place*& target) {
  for (const int identifier : {record.sourceNode, record.targetNode}) {
    if (m_places.contains(identifier))
      continue;
    report(Rule::DanglingLink, record.line, QString(), messages::kDanglingLink,
           {QString::number(record.identifier), QString::number(identifier)});
    return false;
  }
  source = &m_places[record.sourceNode];
  target = &m_places[record.targetNode];
  return !source->isLeftOut && !target->isLeftOut;
}

void ExternalDocNetwork::Builder::reportPort(const LinkStruct& record, const Place& place,
                                             const QString& description) {
  report(Rule::BadPort, record.line, place.title, messages::kBadPort,
         {QString::number(record.identifier), description});
}

bool ExternalDocNetwork::Builder::findPort(const LinkStruct& record, const Place& place, bool isOutput,
                                           unsigned number, const QString& name, QString& tag) {
  if (place.kind != Kind::Transformer) {
    tag = place.title;
    return true;
  }
  tag = isOutput ? place.ports.output(number, name) : place.ports.input(number, name);
  if (!tag.isNull())
    return true;
  // Left where it is, with its ports, because it stands too deep: the nesting is what will be refused.
  const CompoundTransformerNetwork* inner = networkOf(place.cfg);
  if (inner && !inner->isBodyLoaded())
    return false;
  QStringList tags;
  if (isOutput)
    place.cfg->getOutputTags(tags);
  else
    place.cfg->getInputTags(tags);
  report(isOutput ? Rule::UnknownOutput : Rule::UnknownInput, record.line, place.title,
         isOutput ? messages::kUnknownOutput : messages::kUnknownInput,
         {nameWithFile(*place.cfg), name.isEmpty() ? QString::number(number) : name,
          tags.join(QLatin1String(", "))});
  return false;
}

void ExternalDocNetwork::Builder::noteLeftOut(const LinkStruct& record) {
  if (SubDocNetworkObj* source = m_network.nodeByNumber(record.sourceNode))
    source->noteMissingOutputLink();
  if (SubDocNetworkObj* target = m_network.nodeByNumber(record.targetNode))
    target->noteMissingInputLink();
}

bool ExternalDocNetwork::Builder::addLink(const LinkStruct& record) {
  Place* source = nullptr;
  Place* target = nullptr;
  if (!record.enabled || !findEnds(record, source, target))
    return false;
  const auto readPort = [&](const Place& place, const QString& description, bool wantsOutput,
                            unsigned& number, QString& name) {
    if (readFeaturePort(description, wantsOutput, number, name))
      return true;
    reportPort(record, place, description);
    return false;
  };
  if (source->kind == Kind::Output || target->kind == Kind::Input) {
    const bool isSource = source->kind == Kind::Output;
    reportPort(record, isSource ? *source : *target,
               isSource ? record.sourcePortDesc : record.targetPortDesc);
    return false;
  }
  unsigned number = 0;
  QString name;
  QString output;
  if (!readPort(*source, record.sourcePortDesc, true, number, name) ||
      !findPort(record, *source, true, number, name, output))
    return false;
  number = 0;
  name.clear();
  QString input;
  if (!readPort(*target, record.targetPortDesc, false, number, name) ||
      !findPort(record, *target, false, number, name, input))
    return false;
  m_network.addLink(record.sourceNode, output, record.targetNode, input);
  return true;
}

void ExternalDocNetwork::Builder::addAttributeLink(const LinkStruct& record) {
  Place* source = nullptr;
  Place* target = nullptr;
  if (!record.enabled || !findEnds(record, source, target))
    return;
  bool isFeaturePort = false;
  bool isOutput = false;
  unsigned port = 0;
  unsigned ignored = 0;
  QString from;
  QString to;
  if (source->kind == Kind::Output ||
      !decodePortDescription(record.sourcePortDesc, isFeaturePort, isOutput, port, ignored, from) ||
      isFeaturePort || !isOutput || from.isEmpty()) {
    reportPort(record, *source, record.sourcePortDesc);
    return;
  }
  if (!decodePortDescription(record.targetPortDesc, isFeaturePort, isOutput, ignored, ignored, to) ||
      isFeaturePort || isOutput || to.isEmpty()) {
    reportPort(record, *target, record.targetPortDesc);
    return;
  }
  QString tag;
  if (from != to && findPort(record, *source, true, port, QString(), tag))
    m_network.nodeByNumber(record.sourceNode)->addAttributeCopy(tag, from, to);
}

// Features come back at the first loop point alone, and only where the whole is repeated.
void ExternalDocNetwork::Builder::checkLoops() {
  const QStringList loops = m_network.getLoops();
  if (m_network.blockedLooping() && loops.isEmpty())
    report(Rule::CustomTransformerFault, m_reader.GetDocumentLine(m_document), QString(), messages::kNoLoop,
           {});
  for (const QString& output : m_network.getOutputs()) {
    if (loops.contains(output) || (!loops.isEmpty() && output == m_network.getLoopOutput()))
      report(Rule::DuplicateName, m_reader.GetDocumentLine(m_document), output, messages::kSameLoopName,
             {output});
  }
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    if (node->kind() != SubDocNetworkObj::Kind::Loop ||
        (m_network.blockedLooping() && node->name() == loops.first()))
      continue;
    const int line = m_places.value(node->number()).line;
    const bool isLost =
        !m_network.blockedLooping() && !(node->feeders().empty() && node->consumers().empty());
    if (isLost)
      report(Rule::CustomTransformerFault, line, node->name(), messages::kLostLoop, {node->name()});
    else if (m_network.blockedLooping())
      report(Rule::LoopPoint, line, node->name(), messages::kSecondLoop, {node->name(), loops.first()});
    else
      report(Rule::LoopPoint, line, node->name(), messages::kIdleLoop, {node->name()});
  }
}

// --- parameters --------------------------------------------------------------------------------------------

void ExternalDocNetwork::Builder::addParameters() {
  for (const GlobalParameterStruct& record : m_reader.GetGlobalParameterList(m_document)) {
    const GUIType type = GUIType::fromGuiLine(record.guiLine);
    if (type.getName().isEmpty()) {
      report(Rule::BadPromptLine, record.line, QString(), messages::kBadPromptLine, {record.guiLine});
      continue;
    }
    m_network.addPublishedParameter(type, type.getName());
    m_network.addPublishedParameter(type.getName(), record.defaultValue);
  }
}
