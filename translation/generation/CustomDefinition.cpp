#include <platform/qorxcore/qorxcore.h>
#include <transform/core/CarriedReferences.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/ParameterScopeListener.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/CustomTransformerHeader.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocNetworkObjInput.h>
#include <transform/custom/SubDocNetworkObjLoop.h>
#include <transform/custom/SubDocNetworkObjOutput.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>
#include <translation/generation/CustomDefinition.h>
#include <translation/generation/FlowNames.h>
#include <translation/generation/MFDeviceBuffer.h>
#include <translation/generation/RouteStatement.h>
#include <translation/graph/FlowOrder.h>
#include <translation/graph/InnerNames.h>
#include <translation/graph/InstanceIdentity.h>
#include <translation/mappingfile/WrittenCheck.h>

#include <QBuffer>
#include <QSet>

#include <algorithm>

namespace messages = orx::messages;

using orx::Rule;

// Inside a definition the published parameters are macros whose values only the instance knows: whatever
// refers to them also refers to the prefix macro.
class CustomDefinition::Listener : public ParameterScopeListener, public carried_references::ScopeTypes {
 public:
  Listener(const QString& prefix, const TransformerCfgListener& surroundings)
      : m_prefix(prefix), m_surroundings(surroundings) {}

  // Macros of the workspace are no parameters here, but the engine knows them all the same.
  bool isRunTimeValue(const TransformerCfg& cfg, const QString& value) const override {
    return ParameterScopeListener::isRunTimeValue(cfg, value) || m_surroundings.isRunTimeValue(cfg, value);
  }
  bool expandMacros(const TransformerCfg& cfg, QString& text) const override {
    return m_surroundings.expandMacros(cfg, text);
  }
  GUIType typeOf(const QString& parameter) const override {
    const auto* types = dynamic_cast<const carried_references::ScopeTypes*>(&m_surroundings);
    return types ? types->typeOf(parameter) : GUIType::kNullGuiType;
  }

 protected:
  bool isScopeParameter(const QString& name) const override { return name == m_prefix; }
  QString resolve(const QString& value) const override { return value; }

 private:
  const QString m_prefix;
  const TransformerCfgListener& m_surroundings;
};

CustomDefinition::CustomDefinition(const ExternalDocNetwork& network,
                                   const TransformerCfgListener& surroundings)
    : m_network(network),
      m_prefix(makePrefixMacro(network.getName())),
      m_reference(QLatin1String("$(") + m_prefix + QLatin1Char(')')),
      m_listener(std::make_unique<Listener>(m_prefix, surroundings)) {}

CustomDefinition::~CustomDefinition() = default;

QString CustomDefinition::innerName(const QString& name) const {
  return m_reference + QLatin1Char('_') + name;
}

QString CustomDefinition::redirect(const TransformerCfg& cfg, const QString& parameter) const {
  const QString value = cfg.getParameterValue(parameter);
  // An instance that means its own parameters redirects them itself.
  const bool meansOwn =
      isCustomTransformer(&cfg) && cfg.getParameterByMacroName(parameter)->getFlag(kGUITypeInstanceMacros);
  // Deferred references become ordinary ones as soon as they are written.
  const bool isDeferred = value.contains(kDeferredOpen) && MFBuffer::closesDeferredMacros(value);
  return replaceParameterReferences(isDeferred ? MFBuffer::withOrdinaryMacros(value) : value,
                                    [&](const QString& name, QString& replacement) {
                                      replacement = QLatin1String("$(") + innerName(name) + QLatin1Char(')');
                                      return m_network.hasParameter(name) &&
                                             !(meansOwn && cfg.hasParameter(name));
                                    });
}

bool CustomDefinition::arrange(orx::Findings& diagnostics) {
  const QString nameFault = findNameFault(m_network.getName());
  if (!nameFault.isEmpty())
    diagnostics.reportText(Rule::CustomTransformerFault, 0, m_network.getName(), nameFault);
  checkField(QLatin1String("CATEGORY"), m_network.getCategory(), diagnostics);
  checkField(QLatin1String("GUID"), m_network.getGUID(), diagnostics);
  m_isArranged = nameFault.isEmpty() && order(diagnostics);
  if (!m_isArranged)
    return false;
  nameFlows(diagnostics);
  for (const SubDocNetworkObjXformer* node : m_order)
    makePart(*node);
  for (Part& part : m_parts)
    connect(part);
  return true;
}

void CustomDefinition::checkField(QLatin1String field, const QString& value,
                                  orx::Findings& diagnostics) const {
  if (TextPlaces::refuse(TextPlace::HeaderField, value.trimmed()) != 0) {
    diagnostics.reportAs(Rule::CustomTransformerFault, messages::kFieldCannotHold, 0, m_network.getName(),
                         {field, value.simplified()});
  }
}

bool CustomDefinition::namesAttributes() const {
  const QString token = kMacroOpen + kSchemaToken + QLatin1Char(')');
  return std::any_of(m_parts.begin(), m_parts.end(), [&](const Part& part) {
    const QStringList parameters = part.cfg->getParameters();
    return TransformerCfg::containsToken(part.cfg->getTemplateLines(), kSchemaToken) ||
           std::any_of(parameters.begin(), parameters.end(), [&](const QString& parameter) {
             return part.cfg->getParameterValue(parameter).contains(token);
           });
  });
}

void CustomDefinition::passAttributes(const InnerAttributes::ByPort& arriving) {
  std::vector<InnerAttributes::Member> members;
  for (const Part& part : m_parts)
    members.push_back({part.node, part.cfg.get()});
  InnerAttributes(m_network, members).pass(arriving);
}

std::vector<const TransformerCfg*> CustomDefinition::customTransformers() const {
  std::vector<const TransformerCfg*> found;
  for (const Part& part : m_parts) {
    if (isCustomTransformer(part.cfg.get()))
      found.push_back(part.cfg.get());
  }
  return found;
}

bool CustomDefinition::prepare(orx::Findings& diagnostics) {
  if (!m_isArranged)
    return false;
  for (const Part& part : m_parts)
    check(part, diagnostics);
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    const long number = TextPlaces::refuse(TextPlace::Name, node->name());
    // What else a transformer's name cannot hold is found with its values.
    const bool isFound =
        node->kind() == SubDocNetworkObj::Kind::Transformer && number != messages::kReferenceInName;
    if (number == messages::kBreaksLine)
      diagnostics.report(Rule::LineBreak, node->line(), m_network.getName(), {node->name().simplified()});
    else if (number != 0 && !isFound)
      diagnostics.reportAs(Rule::UnwritableValue, number, node->line(), m_network.getName(), {node->name()});
  }
  if (diagnostics.forbidsWriting())
    return false;
  m_body = makeBody(diagnostics);
  return !diagnostics.forbidsWriting();
}

QStringList CustomDefinition::lines() const {
  return QORXFromLocal8Bit(m_body).split(QLatin1Char('\n'));
}

QStringList CustomDefinition::headerFields() const {
  return {m_network.getName(), QString::number(m_network.getVersion()), m_network.getCategory().trimmed(),
          m_network.getGUID().trimmed()};
}

QByteArray CustomDefinition::block() const {
  QByteArray text = QORXToLocal8Bit(CustomTransformerHeader::openingLine(headerFields())) + '\n';
  for (const QByteArray& line : m_body.split('\n')) {
    if (!line.isEmpty())
      text += "# " + line + '\n';
    else
      text += "#\n";
  }
  return text + "# TRANSFORMER_END\n\n";
}

void CustomDefinition::write(MFBuffer& buffer, WrittenCheck* check) const {
  if (check) {
    check->begin({WrittenPlace::Kind::Node, 0, m_network.getName()});
    // Behind the line that opens the block.
    for (const Part& part : m_parts)
      check->begin({WrittenPlace::Kind::Node, part.node->line(), title(part), part.cfg.get(),
                    &part.node->parameterLines()},
                   part.firstLine + 1);
    check->begin({WrittenPlace::Kind::Node, 0, m_network.getName()}, m_portsLine + 1);
  }
  buffer.write(block());
}

bool CustomDefinition::order(orx::Findings& diagnostics) {
  std::vector<const SubDocNetworkObjXformer*> nodes;
  QHash<const SubDocNetworkObj*, int> places;
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    if (const auto* transformer = dynamic_cast<const SubDocNetworkObjXformer*>(node)) {
      places.insert(node, static_cast<int>(nodes.size()));
      nodes.push_back(transformer);
    }
  }
  std::vector<std::pair<int, int>> edges;
  for (const SubDocNetworkObjXformer* node : nodes) {
    for (const auto& [port, links] : node->feeders()) {
      for (const SubDocNetworkObj::Link& link : links) {
        if (places.contains(link.node))
          edges.emplace_back(places.value(link.node), places.value(node));
      }
    }
  }
  const FlowOrder flow = flowOrder(static_cast<int>(nodes.size()), edges);
  for (const std::vector<int>& cycle : flow.cycles) {
    QStringList names;
    for (const int member : cycle)
      names.append(nodes[static_cast<std::size_t>(member)]->name());
    diagnostics.report(Rule::Cycle, nodes[static_cast<std::size_t>(cycle.front())]->line(),
                       m_network.getName(), {names.join(QLatin1String(", "))});
  }
  for (const int node : flow.order)
    m_order.push_back(nodes[static_cast<std::size_t>(node)]);
  return flow.cycles.empty();
}

// Ports and what stands in custom transformers further in have fixed names; the others keep clear of them.
void CustomDefinition::nameFlows(orx::Findings& diagnostics) {
  FlowNames names;
  QSet<QString> ports;
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    if (node->kind() != SubDocNetworkObj::Kind::Transformer)
      ports.insert(node->name());
    if (node->kind() == SubDocNetworkObj::Kind::Loop)
      ports.insert(m_network.getLoopOutput());
  }
  for (const QString& port : qAsConst(ports))
    names.claim(port);
  const QString scope = m_network.getName() + QLatin1Char('/');
  InnerNames inner;
  for (const SubDocNetworkObjXformer* node : m_order) {
    inner.add(node->name(), node->line(), *node->getTransformer());
    for (const QString& taken : names.reserve(*node->getTransformer(), node->name()))
      reportTakenFlow(*node->getTransformer(), taken, node->line(), scope + node->name(), diagnostics);
  }
  for (const SubDocNetworkObjXformer* node : m_order) {
    for (const auto& [port, links] : node->consumers()) {
      if (links.empty())
        continue;
      const QString flow = names.claim(outputFlowName(*node->getTransformer(), node->name(), port));
      m_flows[node].insert(port, flow);
      inner.addFlow(flow);
    }
  }
  addCopiedFlows(
      m_network, [this](const auto& node, const auto& port) { return flowAt(node, port); }, m_copied);
  m_copied.nameRoutes(names);
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    if (node->kind() == SubDocNetworkObj::Kind::Output || node->kind() == SubDocNetworkObj::Kind::Loop)
      inner.addFactory(node->name() + kCollectorName, node->line(), node->name());
    if (node->kind() != SubDocNetworkObj::Kind::Transformer)
      inner.addFlow(node->name());
    for (const auto& [port, links] : node->consumers()) {
      for (const CopiedFlows::Route& route : m_copied.routes(flowAt(*node, port)))
        inner.addFlow(route.flow);
    }
  }
  for (const QString& parameter : m_network.getParameters())
    inner.addParameter(parameter);
  inner.report(scope, diagnostics);
}

void CustomDefinition::makePart(const SubDocNetworkObjXformer& node) {
  Part part;
  part.node = &node;
  part.cfg.reset(node.getTransformer()->getCopy());
  for (const QString& parameter : part.cfg->getParameters()) {
    const QString value = part.cfg->getParameterValue(parameter);
    const QString redirected = redirect(*part.cfg, parameter);
    if (redirected != value)
      part.cfg->setParameterValue(parameter, redirected, false);
  }
  part.cfg->setIdentifier(innerName(node.name()));
  part.cfg->setBaseGuid(instanceStem({m_network.getName()}, node.number(), node.name()));
  part.cfg->setListener(m_listener.get());
  m_parts.push_back(std::move(part));
}

// What enters by an input, and what a loop point sends back, arrives under the port's inner name.
QString CustomDefinition::flowAt(const SubDocNetworkObj& node, const QString& port) const {
  return node.kind() == SubDocNetworkObj::Kind::Transformer ? m_flows.value(&node).value(port) : node.name();
}

QString CustomDefinition::flowAlong(const SubDocNetworkObj::Link& link, const SubDocNetworkObj& target,
                                    const QString& port) const {
  return innerName(m_copied.behind(flowAt(*link.node, link.port), copiesAlong(link, target, port)));
}

void CustomDefinition::writeCopies(MFBuffer& buffer, const QStringList& flows) const {
  for (const QString& flow : flows) {
    for (const CopiedFlows::Route& route : m_copied.routes(flow))
      ::writeCopies(buffer, innerName(flow), innerName(route.flow), route.function);
  }
}

void CustomDefinition::connect(Part& part) const {
  for (const auto& [port, links] : part.node->feeders()) {
    QSet<QString> flows;
    for (const SubDocNetworkObj::Link& link : links) {
      // A loop point may bear the name of an input: both are one flow then.
      const QString flow = flowAlong(link, *part.node, port);
      if (!flows.contains(flow)) {
        flows.insert(flow);
        part.cfg->addInputFeatureType(port, flow);
      }
    }
  }
  for (const auto& [port, links] : part.node->consumers()) {
    if (links.empty())
      continue;
    const QString flow = flowAt(*part.node, port);
    part.cfg->setOutputFeatureType(port, innerName(flow));
    if (!m_copied.ownFunction(flow).isEmpty())
      part.cfg->setOutputTagFuncs(port, QStringList(m_copied.ownFunction(flow)));
  }
}

QString CustomDefinition::title(const Part& part) const {
  return m_network.getName() + QLatin1Char('/') + part.node->name();
}

void CustomDefinition::check(const Part& part, orx::Findings& diagnostics) const {
  const auto* custom = dynamic_cast<const CompoundTransformerCfg*>(part.cfg.get());
  const QHash<QString, QString> faults =
      custom ? custom->findUnwritableParameters() : part.cfg->findUnwritableValues();
  for (const QString& fault : custom ? custom->findUnwritablePorts() : QStringList())
    diagnostics.reportText(Rule::UnwritableValue, part.node->line(), title(part), fault);
  const QHash<QString, QString> replaced = InnerNames::findReplacedParameters(
      part.node->name(), *part.node->getTransformer(),
      [this](const QString& name) { return m_network.hasParameter(name); });
  for (const QString& parameter : part.cfg->getParameters()) {
    if (replaced.contains(parameter))
      diagnostics.report(Rule::UnwritableValue, part.node->line(), title(part),
                         {parameter, replaced.value(parameter)});
    const auto fault = faults.constFind(parameter);
    if (fault != faults.constEnd())
      diagnostics.reportUnwritable(part.node->parameterLines().of(parameter), title(part), parameter,
                                   fault.value());
  }
}

QByteArray CustomDefinition::makeBody(orx::Findings& diagnostics) {
  QByteArray text;
  QBuffer device(&text);
  device.open(QIODevice::WriteOnly);
  {
    MFDeviceBuffer buffer(device);
    int counted = 0;
    int lines = 0;
    const auto nextLine = [&] {
      lines += static_cast<int>(std::count(text.begin() + counted, text.end(), '\n'));
      counted = text.size();
      return lines;
    };
    writeCopies(buffer, m_network.getInputs() + m_network.getLoops());
    for (Part& part : m_parts) {
      part.firstLine = nextLine();
      if (!part.cfg->instantiate(buffer, m_network.getName()))
        diagnostics.report(Rule::NotWritten, part.node->line(), title(part), {part.cfg->getName()});
      for (const auto& [port, links] : part.node->consumers())
        writeCopies(buffer, {flowAt(*part.node, port)});
    }
    m_portsLine = nextLine();
    // What reaches an output leaves under the port's inner name; what reaches a loop point leaves by the
    // loop's output.
    for (const SubDocNetworkObj* node : m_network.nodes()) {
      const bool isOutput = dynamic_cast<const SubDocNetworkObjOutput*>(node) != nullptr;
      if (!isOutput && !dynamic_cast<const SubDocNetworkObjLoop*>(node))
        continue;
      QStringList flows;
      for (const auto& [port, links] : node->feeders()) {
        for (const SubDocNetworkObj::Link& link : links)
          flows.append(flowAlong(link, *node, port));
      }
      if (flows.isEmpty())
        continue;
      const QString port = isOutput ? node->name() : m_network.getLoopOutput();
      writeRoute(buffer, innerName(node->name()) + kCollectorName, flows, innerName(port), {});
    }
  }
  while (text.endsWith('\n'))
    text.chop(1);
  return text;
}
