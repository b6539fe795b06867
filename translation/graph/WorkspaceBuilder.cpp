#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/TransformerRecords.h>
#include <translation/graph/InstanceIdentity.h>
#include <translation/graph/NetworkDiagnostics.h>
#include <translation/graph/WorkspaceBuilder.h>
#include <translation/mappingfile/HarmlessText.h>

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
  m_workspace->library = std::make_unique<SubDocumentLibrary>(reader, &m_source);
  m_binding.emplace(reader, *m_workspace->library, m_diagnostics, &m_workspace->parameters,
                    &m_workspace->listener);
  const QString mainDocument;
  addGlobalParameters(reader);
  for (const FeatureTypeStruct& record : reader.GetFeatureTypeList())
    addFeatureType(record);
  for (const TransformerStruct& record : reader.GetTransformerList(mainDocument))
    addTransformer(record);
  for (const LinkStruct& record : reader.GetFeatureTypeLinkList(mainDocument))
    addLink(record);
  for (const LinkStruct& record : reader.GetAttributeLinkList(mainDocument))
    addAttributeLink(record);
  for (const SubDocumentIOStruct& port : reader.GetSubDocumentIOList(mainDocument))
    m_diagnostics.reportAs(Rule::UnknownElement, messages::kPortsInMain, port.line, QString(), {port.name});
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
  for (const GlobalParameterStruct& record : reader.GetGlobalParameterList(QString())) {
    const QString name = m_binding->promptOf(record).getName();
    if (name.isEmpty())
      continue;
    parameters.declare(name, record.defaultValue, record.line, record.guiLine);
    const GlobalParameters::Parameter& known = *parameters.find(name);
    if (known.setInHeader && known.language == ScriptLanguage::None &&
        known.value != parameters.asStated(record.guiLine, record.defaultValue))
      m_diagnostics.reportAs(Rule::RepeatedDeclaration, messages::kContradictingParameter, record.line,
                             QString(), {name, QString::number(known.line)});
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
  node.hasFixedAttributes = !record.isSource && !record.attributes.isEmpty() && !record.dynamicSchema;
  DocumentBinding::Place place;
  place.node = static_cast<int>(m_workspace->nodes.size());
  place.line = record.line;
  place.isLeftOut = !record.enabled;
  place.gives = record.isSource;
  place.takes = !record.isSource;
  place.name = node.name;
  if (m_binding->enter(record.identifier, place) && record.enabled)
    m_workspace->nodes.push_back(std::move(node));
}

void WorkspaceBuilder::addTransformer(const TransformerStruct& record) {
  WorkspaceNode node;
  node.cfg = m_binding->enter(record, static_cast<int>(m_workspace->nodes.size()));
  if (!node.cfg)
    return;
  const DocumentBinding::Place& place = *m_binding->find(record.identifier);
  node.identifier = record.identifier;
  node.line = record.line;
  node.name = place.name;
  node.cfg->setBaseGuid(instanceStem(QStringList(), record.identifier, transformerTitle(record)));
  node.parameterLines = ParameterLines(record);
  for (const XformParmStruct& parameter : record.parameters)
    node.isHarmless = node.isHarmless && isHarmlessText(parameter.parmValue);
  node.exposed = place.ports.exposedAttributes(record);
  for (const QStringList& port : readPortOrder(record.inputFtOrder)) {
    const QString tag = place.ports.input(0, port.value(0));
    if (!tag.isNull())
      node.inputOrder.insert(tag, port.mid(1));
  }
  m_workspace->nodes.push_back(std::move(node));
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

WorkspaceNode* WorkspaceBuilder::nodeAt(int identifier) {
  const DocumentBinding::Place* const place = m_binding->find(identifier);
  return place && !place->isLeftOut ? &m_workspace->nodes[static_cast<std::size_t>(place->node)] : nullptr;
}

void WorkspaceBuilder::addLink(const LinkStruct& record) {
  if (const auto flow = m_binding->flow(record)) {
    if (flow->isRepeated)
      return;
    m_workspace->links.push_back({flow->source->node, flow->target->node, flow->output, flow->input,
                                  record.executionIdx, record.line, AttributeCopies()});
    return;
  }
  if (WorkspaceNode* const source = nodeAt(record.sourceNode))
    source->lacksOutputLink = true;
  if (WorkspaceNode* const target = nodeAt(record.targetNode))
    target->lacksInputLink = true;
}

void WorkspaceBuilder::addAttributeLink(const LinkStruct& record) {
  const auto copy = m_binding->attributeCopy(record);
  if (!copy)
    return;
  m_workspace->attributeLinks.push_back({copy->flow, copy->from, copy->to, record.identifier, record.line});
  if (copy->from != copy->to)
    m_workspace->links[copy->flow].copies.add(copy->from, copy->to);
}
