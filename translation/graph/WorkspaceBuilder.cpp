#include <platform/orxparameter/orxparameter.h>
#include <platform/orxutil/ResourceDirectories.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerSource.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/TransformerRecords.h>
#include <translation/graph/InstanceIdentity.h>
#include <translation/graph/NetworkDiagnostics.h>
#include <translation/graph/WorkspaceBuilder.h>

namespace messages = orx::messages;

using orx::Rule;

WorkspaceBuilder::WorkspaceBuilder(TransformerSource& source, orx::Findings& diagnostics,
                                   const QHash<QString, QString>& parameterValues)
    : m_source(source), m_diagnostics(diagnostics), m_parameterValues(parameterValues) {}

std::unique_ptr<Workspace> WorkspaceBuilder::build(const IXMLComponentReader& reader, const QString& fileName,
                                                   const QStringList& headerLines) {
  m_workspace = std::make_unique<Workspace>();
  m_workspace->fileName = fileName;
  m_workspace->headerLines = headerLines;
  m_workspace->firstHeaderLine = reader.GetFirstHeaderLineNumber();
  m_places.clear();
  m_linesByName.clear();
  m_ports.clear();

  m_workspace->library = std::make_unique<SubDocumentLibrary>(reader, &m_source);
  const QString mainDocument;
  addGlobalParameters(reader);
  for (const FeatureTypeStruct& record : reader.GetFeatureTypeList())
    addFeatureType(record);
  for (const TransformerStruct& record : reader.GetTransformerList(mainDocument))
    addTransformer(record);
  for (const LinkStruct& record : reader.GetFeatureTypeLinkList(mainDocument)) {
    if (!addLink(record))
      noteLeftOut(record);
  }
  for (const LinkStruct& record : reader.GetAttributeLinkList(mainDocument))
    addAttributeLink(record);
  reportRepeatedNames(reader);
  m_workspace->usedCustomTransformers = m_workspace->customTransformers().size();
  if (m_includesUnused)
    buildUnused(reader);
  reportCustomTransformers();
  m_workspace->library->forgetReader();
  return std::move(m_workspace);
}

void WorkspaceBuilder::addGlobalParameters(const IXMLComponentReader& reader) {
  GlobalParameters& parameters = m_workspace->parameters;
  int lineNumber = m_workspace->firstHeaderLine;
  QString statement;
  for (const QString& line : m_workspace->headerLines) {
    statement += line;
    ++lineNumber;
    if (statement.endsWith(QLatin1Char('\\'))) {
      statement.chop(1);
      continue;
    }
    parameters.readHeaderLine(statement, lineNumber - 1);
    statement.clear();
  }
  parameters.readHeaderLine(statement, lineNumber - 1);
  QHash<QString, int> linesByName;
  for (const GlobalParameterStruct& record : reader.GetGlobalParameterList(QString())) {
    const QString name = GUIType::fromGuiLine(record.guiLine).getName();
    if (name.isEmpty()) {
      m_diagnostics.report(Rule::BadPromptLine, record.line, QString(), {record.guiLine});
      continue;
    }
    const auto earlier = linesByName.constFind(name);
    if (earlier != linesByName.constEnd())
      m_diagnostics.report(Rule::RepeatedDeclaration, record.line, QString(),
                           {name, QString::number(*earlier)});
    linesByName.insert(name, record.line);
    parameters.declare(name, record.defaultValue, record.line, record.guiLine);
  }
  QStringList names = m_parameterValues.keys();
  names.sort();
  for (const QString& name : names) {
    if (!parameters.override(name, m_parameterValues.value(name)))
      m_diagnostics.report(Rule::UnknownGlobalParameter, 0, QString(), {name});
  }
}

void WorkspaceBuilder::reportRepeatedNames(const IXMLComponentReader& reader) {
  const QStringList names = reader.GetSubDocList();
  QHash<QString, int> counts;
  for (const QString& name : names)
    ++counts[name];
  for (const QString& name : names) {
    const int count = counts.take(name);
    if (count > 1) {
      m_diagnostics.reportAs(Rule::RepeatedDeclaration, messages::kRepeatedCustomTransformer,
                             reader.GetDocumentLine(name), QString(), {name, QString::number(count)});
    }
  }
}

void WorkspaceBuilder::buildUnused(const IXMLComponentReader& reader) {
  QSet<const ExternalDocNetwork*> used;
  for (const ExternalDocNetwork* network : m_workspace->customTransformers())
    used.insert(network);
  QSet<QString> seen;
  for (const QString& name : reader.GetSubDocList()) {
    if (seen.contains(name))
      continue;
    seen.insert(name);
    // Without a name it cannot be placed, and its document cannot be told from the workspace's own.
    if (name.isEmpty() || !used.contains(m_workspace->library->network(name)))
      m_diagnostics.report(Rule::UnusedCustomTransformer, reader.GetDocumentLine(name), QString(), {name});
  }
}

void WorkspaceBuilder::addFeatureType(const FeatureTypeStruct& record) {
  WorkspaceNode node;
  node.kind = record.isSource ? WorkspaceNode::Kind::Reader : WorkspaceNode::Kind::Writer;
  node.identifier = record.identifier;
  node.line = record.line;
  node.name = record.featureTypeName.isEmpty() ? record.nodeName : record.featureTypeName;
  node.keyword = record.keyword;
  for (const FeatAttributeStruct& attribute : record.attributes)
    node.attributes.append(attribute.attrName);
  if (placeNode(record.identifier, record.line, node.name,
                record.enabled ? static_cast<int>(m_workspace->nodes.size()) : -1) &&
      record.enabled)
    m_workspace->nodes.push_back(std::move(node));
}

void WorkspaceBuilder::addTransformer(const TransformerStruct& record) {
  const QString title = transformerTitle(record);
  if (!record.enabled) {
    placeNode(record.identifier, record.line, title, -1);
    return;
  }
  WorkspaceNode node;
  node.identifier = record.identifier;
  node.line = record.line;
  node.name = title;
  node.cfg = makeTransformer(record, title);
  if (!node.cfg) {
    takeName(title, record.line);
    placeNode(record.identifier, record.line, title, -1);
    return;
  }
  TransformerPorts ports = applyRecord(record, node);
  // The identifier may have come out shorter than the record's name; it is what the statements hold.
  node.name = node.cfg->getIdentifier();
  takeName(node.name, record.line);
  const int number = static_cast<int>(m_workspace->nodes.size());
  if (!placeNode(record.identifier, record.line, node.name, number))
    return;
  m_ports.emplace(number, std::move(ports));
  m_workspace->nodes.push_back(std::move(node));
}

void WorkspaceBuilder::takeName(const QString& name, int line) {
  const auto earlier = m_linesByName.constFind(name);
  if (earlier != m_linesByName.constEnd())
    m_diagnostics.report(Rule::DuplicateName, line, name, {name, QString::number(earlier.value())});
  else
    m_linesByName.insert(name, line);
}

std::unique_ptr<TransformerCfg> WorkspaceBuilder::makeTransformer(const TransformerStruct& record,
                                                                  const QString& nodeName) {
  QString type = record.type;
  if (record.kind == TransformerKind::SubDocument) {
    type = subDocumentName(record);
    if (type.isEmpty()) {
      m_diagnostics.report(Rule::CustomTransformer, record.line, nodeName);
      return nullptr;
    }
  }
  TransformerSource& source = *m_workspace->library;
  std::unique_ptr<TransformerCfg> cfg = source.makeTransformer(type, record.version);
  if (cfg)
    return cfg;
  const QString refusal = source.refusalReason();
  if (!refusal.isEmpty()) {
    const bool isEmbedded = m_workspace->library->holds(type);
    m_diagnostics.reportText(isEmbedded ? Rule::Nesting : Rule::CustomTransformerFault, record.line, nodeName,
                             refusal);
    return nullptr;
  }
  const std::unique_ptr<TransformerCfg> newest =
      source.makeTransformer(type, TransformerSource::kNewestVersion);
  if (newest) {
    m_diagnostics.report(Rule::UnknownVersion, record.line, nodeName,
                         {type, QString::number(record.version), QString::number(newest->getVersion())});
  } else {
    m_diagnostics.report(Rule::UnknownTransformer, record.line, nodeName,
                         {type, QString::number(record.version),
                          ORX_resourcePlaces(QStringLiteral("transformer")).join(QLatin1String(", "))});
  }
  return nullptr;
}

void WorkspaceBuilder::reportCustomTransformers() {
  for (const ExternalDocNetwork* network : m_workspace->customTransformers())
    reportNetworkProblems(*network, m_workspace->fileName, m_diagnostics);
  const std::vector<ExternalDocNetwork*>& embedded = m_workspace->customTransformers();
  std::vector<CompoundTransformerNetwork*> placed(embedded.begin(), embedded.end());
  for (const WorkspaceNode& node : m_workspace->nodes) {
    if (CompoundTransformerNetwork* network = networkOf(node.cfg.get()))
      placed.push_back(network);
  }
  for (CompoundTransformerNetwork* network : nestedNetworks(placed)) {
    auto* linked = dynamic_cast<ExternalTransformerNetwork*>(network);
    if (!linked)
      continue;
    reportNetworkProblems(*linked, linked->getFileName(), m_diagnostics);
    m_workspace->linkedCustomTransformers.push_back(linked);
  }
}

TransformerPorts WorkspaceBuilder::applyRecord(const TransformerStruct& record, WorkspaceNode& node) {
  TransformerCfg& cfg = *node.cfg;
  if (record.lastParmEdit > 0)
    cfg.setLastParmEditBuild(record.lastParmEdit);
  cfg.setIdentifier(node.name);
  cfg.setBaseGuid(instanceStem(QStringList(), record.identifier, node.name));
  cfg.setParameterDirectory(&m_workspace->parameters);
  for (const XformParmStruct& parameter : record.parameters) {
    if (record.kind == TransformerKind::SubDocument && parameter.parmName == kSubDocumentNameParameter)
      continue;
    if (!cfg.setParameterValue(parameter.parmName, parameter.parmValue, false)) {
      m_diagnostics.report(Rule::UnknownParameter, parameter.line, node.name,
                           {nameWithFile(cfg), parameter.parmName});
    }
  }
  node.parameterLines = ParameterLines(record);
  if (record.name.isEmpty())
    cfg.setIdentifier(node.name);

  cfg.autoUpgradeTransformer();
  if (cfg.isAutoUpgraded())
    m_diagnostics.report(Rule::Upgraded, record.line, node.name, {cfg.getName()});
  cfg.setListener(&m_workspace->listener);
  if (!cfg.dependencyMet())
    m_diagnostics.report(Rule::UnmetDependency, record.line, node.name, {cfg.getName(), cfg.dependencyMsg()});

  TransformerPorts ports(record, cfg);
  node.exposed = ports.exposedAttributes(record);
  for (const QStringList& port : readPortOrder(record.inputFtOrder)) {
    const QString tag = ports.input(0, port.value(0));
    if (!tag.isNull())
      node.inputOrder.insert(tag, port.mid(1));
  }
  return ports;
}

bool WorkspaceBuilder::placeNode(int identifier, int line, const QString& name, int node) {
  const auto earlier = m_places.constFind(identifier);
  if (earlier != m_places.constEnd()) {
    m_diagnostics.report(Rule::DuplicateNumber, line, name,
                         {QString::number(identifier), QString::number(earlier->line)});
    return false;
  }
  m_places.insert(identifier, {node, line});
  return true;
}

bool WorkspaceBuilder::findEnds(const LinkStruct& record, int& source, int& target) {
  for (const int identifier : {record.sourceNode, record.targetNode}) {
    if (m_places.contains(identifier))
      continue;
    m_diagnostics.report(Rule::DanglingLink, record.line, QString(),
                         {QString::number(record.identifier), QString::number(identifier)});
    return false;
  }
  source = m_places.value(record.sourceNode).node;
  target = m_places.value(record.targetNode).node;
  return true;
}

bool WorkspaceBuilder::addLink(const LinkStruct& record) {
  WorkspaceLink link;
  if (!record.enabled || !findEnds(record, link.source, link.target) || link.source < 0 || link.target < 0)
    return false;
  const WorkspaceNode& source = m_workspace->nodes[static_cast<std::size_t>(link.source)];
  const WorkspaceNode& target = m_workspace->nodes[static_cast<std::size_t>(link.target)];
  if (source.kind == WorkspaceNode::Kind::Writer || target.kind == WorkspaceNode::Kind::Reader) {
    const bool isSource = source.kind == WorkspaceNode::Kind::Writer;
    m_diagnostics.report(
        Rule::BadPort, record.line, isSource ? source.name : target.name,
        {QString::number(record.identifier), isSource ? record.sourcePortDesc : record.targetPortDesc});
    return false;
  }

  const auto readPort = [&](const QString& description, bool wantsOutput, unsigned& number, QString& name) {
    if (readFeaturePort(description, wantsOutput, number, name))
      return true;
    m_diagnostics.report(Rule::BadPort, record.line, wantsOutput ? source.name : target.name,
                         {QString::number(record.identifier), description});
    return false;
  };
  unsigned number = 0;
  QString name;
  if (!readPort(record.sourcePortDesc, true, number, name) ||
      !findPort(link.source, record, true, number, name, link.output))
    return false;
  number = 0;
  name.clear();
  if (!readPort(record.targetPortDesc, false, number, name) ||
      !findPort(link.target, record, false, number, name, link.input))
    return false;
  link.executionIndex = record.executionIdx;
  link.line = record.line;
  m_workspace->links.push_back(link);
  return true;
}

void WorkspaceBuilder::noteLeftOut(const LinkStruct& record) {
  const int source = m_places.value(record.sourceNode).node;
  const int target = m_places.value(record.targetNode).node;
  if (source >= 0)
    m_workspace->nodes[static_cast<std::size_t>(source)].lacksOutputLink = true;
  if (target >= 0)
    m_workspace->nodes[static_cast<std::size_t>(target)].lacksInputLink = true;
}

bool WorkspaceBuilder::findPort(int node, const LinkStruct& record, bool isOutput, unsigned number,
                                const QString& name, QString& tag) {
  const WorkspaceNode& place = m_workspace->nodes[static_cast<std::size_t>(node)];
  if (!place.isTransformer())
    return true;
  const TransformerPorts& ports = m_ports.at(node);
  tag = isOutput ? ports.output(number, name) : ports.input(number, name);
  if (!tag.isNull())
    return true;
  QStringList tags;
  if (isOutput)
    place.cfg->getOutputTags(tags);
  else
    place.cfg->getInputTags(tags);
  m_diagnostics.report(isOutput ? Rule::UnknownOutput : Rule::UnknownInput, record.line, place.name,
                       {nameWithFile(*place.cfg), name.isEmpty() ? QString::number(number) : name,
                        tags.join(QLatin1String(", "))});
  return false;
}

void WorkspaceBuilder::addAttributeLink(const LinkStruct& record) {
  AttributeLink link;
  int target = -1;
  if (!record.enabled || !findEnds(record, link.source, target) || link.source < 0 || target < 0)
    return;
  const WorkspaceNode& source = m_workspace->nodes[static_cast<std::size_t>(link.source)];
  bool isFeaturePort = false;
  bool isOutput = false;
  unsigned port = 0;
  unsigned ignored = 0;
  if (!decodePortDescription(record.sourcePortDesc, isFeaturePort, isOutput, port, ignored, link.from) ||
      isFeaturePort || !isOutput || link.from.isEmpty() || source.kind == WorkspaceNode::Kind::Writer) {
    m_diagnostics.report(Rule::BadPort, record.line, source.name,
                         {QString::number(record.identifier), record.sourcePortDesc});
    return;
  }
  if (!decodePortDescription(record.targetPortDesc, isFeaturePort, isOutput, ignored, ignored, link.to) ||
      isFeaturePort || isOutput || link.to.isEmpty()) {
    m_diagnostics.report(Rule::BadPort, record.line,
                         m_workspace->nodes[static_cast<std::size_t>(target)].name,
                         {QString::number(record.identifier), record.targetPortDesc});
    return;
  }
  if (link.from == link.to)
    return;
  if (findPort(link.source, record, true, port, QString(), link.output))
    m_workspace->attributeLinks.push_back(link);
}
