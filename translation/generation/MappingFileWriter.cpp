#include <platform/qorxcore/qorxcore.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/AttributeFlow.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/NestedQuestion.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>
#include <translation/ProgramVersion.h>
#include <translation/generation/FlowNames.h>
#include <translation/generation/MappingFileWriter.h>
#include <translation/generation/RouteStatement.h>
#include <translation/graph/FlowOrder.h>
#include <translation/graph/InnerNames.h>
#include <translation/mappingfile/HarmlessText.h>
#include <translation/mappingfile/WrittenCheck.h>

#include <QSet>

#include <algorithm>
#include <limits>

namespace messages = orx::messages;

using orx::Rule;

namespace {

std::size_t at(int number) {
  return static_cast<std::size_t>(number);
}

void writeStatement(MFBuffer& buffer, const QString& line) {
  buffer.add(line);
  buffer.flush();
}

}  // namespace

MappingFileWriter::MappingFileWriter(Workspace& workspace, orx::Findings& diagnostics)
    : m_workspace(workspace),
      m_diagnostics(diagnostics),
      m_definitions(workspace.customTransformers(), workspace.usedCustomTransformers, workspace.listener) {}

bool MappingFileWriter::prepare() {
  const OverrunListener overruns;
  const std::size_t count = m_workspace.nodes.size();
  m_flows.assign(count, {});
  m_functions.assign(count, {});
  m_copies.assign(count, {});
  m_copiedFlows.assign(count, QString());
  m_incoming.assign(count, {});
  m_isConnected = order();
  if (m_isConnected) {
    nameFlows();
    connect();
    pushAttributes();
  }
  check();
  for (const WorkspaceNode& node : m_workspace.nodes)
    m_definitions.addInstance(node.cfg.get());
  const bool isPrepared = m_definitions.prepare(m_diagnostics);
  if (overruns.hasHeard())
    m_diagnostics.reportAs(Rule::Nesting, messages::kNestedTooCostly, 0, QString());
  return isPrepared;
}

bool MappingFileWriter::order() {
  std::vector<std::pair<int, int>> edges;
  edges.reserve(m_workspace.links.size());
  for (const WorkspaceLink& link : m_workspace.links)
    edges.emplace_back(link.source, link.target);
  const FlowOrder flow = flowOrder(static_cast<int>(m_workspace.nodes.size()), edges);
  for (const std::vector<int>& cycle : flow.cycles) {
    QStringList names;
    for (const int member : cycle)
      names.append(m_workspace.nodes[at(member)].name);
    m_diagnostics.report(Rule::Cycle, m_workspace.nodes[at(cycle.front())].line, names.first(),
                         {names.join(QLatin1String(", "))});
  }
  for (const int node : flow.order) {
    if (m_workspace.nodes[at(node)].isTransformer())
      m_order.push_back(node);
  }
  return flow.cycles.empty();
}

void MappingFileWriter::nameFlows() {
  std::vector<QHash<QString, QSet<QString>>> copied(m_workspace.nodes.size());
  for (const AttributeLink& link : m_workspace.attributeLinks) {
    const QString function = copyAttributeFunction(link.to, link.from);
    QSet<QString>& known = copied[at(link.source)][link.output];
    if (known.contains(function))
      continue;
    known.insert(function);
    m_functions[at(link.source)][link.output].append(function);
    m_copies[at(link.source)][link.output].append(link.to);
  }

  std::vector<QSet<QString>> connected(m_workspace.nodes.size());
  for (const WorkspaceLink& link : m_workspace.links)
    connected[at(link.source)].insert(link.output);

  FlowNames names;
  InnerNames inner;
  const int count = static_cast<int>(m_workspace.nodes.size());
  const auto claimTypes = [&](WorkspaceNode::Kind kind) {
    for (int node = 0; node < count; ++node) {
      if (m_workspace.nodes[at(node)].kind == kind)
        m_flows[at(node)].insert(QString(), names.claim(m_workspace.nodes[at(node)].name));
    }
  };
  // What a writer takes keeps the writer's own name, and the inner names of custom transformers are fixed, so
  // those come first.
  claimTypes(WorkspaceNode::Kind::Writer);
  reserveInnerNames(names, inner);
  claimTypes(WorkspaceNode::Kind::Reader);
  for (int node = 0; node < count; ++node) {
    const WorkspaceNode& place = m_workspace.nodes[at(node)];
    if (place.kind == WorkspaceNode::Kind::Reader && m_functions[at(node)].contains(QString())) {
      m_copiedFlows[at(node)] = names.claim(m_flows[at(node)].value(QString()));
    } else if (place.isTransformer()) {
      QStringList tags;
      place.cfg->getOutputTags(tags);
      for (const QString& tag : tags) {
        if (connected[at(node)].contains(tag))
          m_flows[at(node)].insert(tag, names.claim(outputFlowName(*place.cfg, place.name, tag)));
        inner.addFlow(m_flows[at(node)].value(tag));
      }
    }
    inner.addFlow(m_flows[at(node)].value(QString()));
    inner.addFlow(m_copiedFlows[at(node)]);
  }
  for (const GlobalParameters::Parameter& parameter : m_workspace.parameters.all())
    inner.addParameter(parameter.name);
  inner.report(QString(), m_diagnostics);
}

void MappingFileWriter::reserveInnerNames(FlowNames& names, InnerNames& inner) {
  for (const WorkspaceNode& node : m_workspace.nodes) {
    if (!node.isTransformer())
      continue;
    inner.add(node.name, node.line, *node.cfg);
    for (const QString& taken : names.reserve(*node.cfg, node.name))
      m_diagnostics.report(Rule::TakenName, node.line, node.name, {taken});
  }
}

const QString& MappingFileWriter::flowOf(int node, const QString& output) const {
  static const QString none;
  if (!m_copiedFlows[at(node)].isEmpty())
    return m_copiedFlows[at(node)];
  const auto flow = m_flows[at(node)].constFind(output);
  return flow == m_flows[at(node)].constEnd() ? none : flow.value();
}

void MappingFileWriter::connect() {
  for (std::size_t number = 0; number < m_workspace.links.size(); ++number)
    m_incoming[at(m_workspace.links[number].target)].push_back(static_cast<int>(number));

  for (std::size_t target = 0; target < m_workspace.nodes.size(); ++target) {
    const WorkspaceNode& node = m_workspace.nodes[target];
    QHash<QString, QHash<QString, int>> ranks;
    for (auto port = node.inputOrder.cbegin(); port != node.inputOrder.cend(); ++port) {
      for (int position = 0; position < port->size(); ++position)
        ranks[port.key()].insert(port->at(position), position);
    }
    const auto rank = [&](int number) {
      constexpr int last = std::numeric_limits<int>::max();
      const WorkspaceLink& link = m_workspace.links[at(number)];
      const int byOrder =
          ranks.isEmpty() ? last : ranks.value(link.input).value(flowOf(link.source, link.output), last);
      return std::make_pair(byOrder, link.executionIndex < 0 ? last : link.executionIndex);
    };
    std::stable_sort(m_incoming[target].begin(), m_incoming[target].end(),
                     [&](int left, int right) { return rank(left) < rank(right); });
    if (!node.isTransformer())
      continue;
    for (const int number : m_incoming[target]) {
      const WorkspaceLink& link = m_workspace.links[at(number)];
      node.cfg->addInputFeatureType(link.input, flowOf(link.source, link.output));
    }
    for (auto flow = m_flows[target].cbegin(); flow != m_flows[target].cend(); ++flow)
      node.cfg->setOutputFeatureType(flow.key(), flow.value());
    for (auto functions = m_functions[target].cbegin(); functions != m_functions[target].cend(); ++functions)
      node.cfg->setOutputTagFuncs(functions.key(), functions.value());
  }
}

void MappingFileWriter::pushAttributes() {
  // What leaves an output is asked once, however many links take it on.
  std::vector<QHash<QString, AttributeSet>> leaving(m_workspace.nodes.size());
  const auto attributesOf = [&](const WorkspaceLink& link) -> const AttributeSet& {
    QHash<QString, AttributeSet>& known = leaving[at(link.source)];
    const auto found = known.constFind(link.output);
    if (found != known.constEnd())
      return found.value();
    const WorkspaceNode& source = m_workspace.nodes[at(link.source)];
    AttributeSet attributes = source.isTransformer() ? attribute_flow::leaving(*source.cfg, link.output)
                                                     : AttributeSet(source.attributes);
    attributes.add(source.exposed.value(link.output));
    attributes.add(m_copies[at(link.source)].value(link.output));
    return known.insert(link.output, attributes).value();
  };

  for (const int target : m_order) {
    QHash<QString, AttributeSet> arriving;
    for (const int number : m_incoming[at(target)]) {
      const WorkspaceLink& link = m_workspace.links[at(number)];
      arriving[link.input].add(attributesOf(link));
    }
    attribute_flow::enter(*m_workspace.nodes[at(target)].cfg, arriving);
  }
}

bool MappingFileWriter::checkText(const QString& text, const QString& what, int line, const QString& node) {
  const bool isClosed = MFBuffer::closesDeferredMacros(text);
  if (!isClosed)
    m_diagnostics.report(Rule::UnclosedReference, line, node, {what});
  const bool isOneLine = TextPlaces::isOneLine(text);
  if (!isOneLine)
    m_diagnostics.report(Rule::LineBreak, line, node, {what});
  return isClosed && isOneLine;
}

void MappingFileWriter::checkWord(const QString& text, int line, const QString& node) {
  if (!checkText(text, text, line, node))
    return;
  if (const long number = TextPlaces::refuse(TextPlace::Name, text))
    m_diagnostics.reportAs(Rule::UnwritableValue, number, line, node, {text});
}

void MappingFileWriter::checkNoReference(const QString& name, int line, const QString& node) {
  if (beginsMacroReference(name))
    m_diagnostics.reportAs(Rule::UnwritableValue, messages::kReferenceInName, line, node, {name});
}

// Names of attributes are written wherever they are asked for.
void MappingFileWriter::checkAttributes(const WorkspaceNode& node) {
  for (const QString& attribute : node.attributes)
    checkNoReference(attribute, node.line, node.name);
  for (const QStringList& attributes : node.exposed) {
    for (const QString& attribute : attributes)
      checkNoReference(attribute, node.line, node.name);
  }
}

// A script sees what stands before it.
QString MappingFileWriter::refuseScript(const GlobalParameters::Parameter& parameter) const {
  const bool isPython = parameter.language == ScriptLanguage::Python;
  QString message;
  if (isPython ? !canWritePythonParameter(QString(), parameter.name, parameter.value, message)
               : !canWriteTclParameter(QString(), parameter.name, parameter.value, message))
    return message;
  const bool includesOthers =
      std::any_of(m_workspace.headerLines.begin(), m_workspace.headerLines.end(),
                  [](const QString& line) { return line.startsWith(QLatin1String("INCLUDE ")); });
  const auto isSetBefore = [&](const QString& name) {
    const GlobalParameters::Parameter* read = m_workspace.parameters.find(name);
    return read ? read->setInHeader || read < &parameter : includesOthers;
  };
  return unsetReadByScript(isPython, parameter.name, parameter.value, isSetBefore,
                           [&](const QString& name) { return m_workspace.parameters.find(name) != nullptr; });
}

void MappingFileWriter::checkChoices(const GlobalParameters::Parameter& parameter) {
  const TransformParamCfg record(GUIType::fromGuiLine(parameter.promptLine));
  const QString& value = parameter.currentValue();
  const QString stored = single_choices::toStored(record, value);
  QString reason;
  if (stored != value)
    reason = TransformResString(messages::kShownSideWritten, {value, stored});
  else if (single_choices::refersToShownSide(record, value, [this](QString& text) {
             text = m_workspace.parameters.resolve(MFBuffer::withOrdinaryMacros(text));
             return true;
           }))
    reason = TransformResString(messages::kShownSideReferred);
  if (!reason.isEmpty())
    m_diagnostics.reportUnwritable(parameter.line, QString(), parameter.name, reason);
}

void MappingFileWriter::checkParameter(const GlobalParameters::Parameter& parameter, const QString& value) {
  const bool isSound = checkText(value, parameter.name, parameter.line, QString());
  long reason = TextPlaces::refuse(TextPlace::MacroName, parameter.name);
  if (reason == 0 && isSound)
    reason = TextPlaces::refuse(TextPlace::MacroValue, value);
  if (reason != 0)
    m_diagnostics.reportUnwritable(parameter.line, QString(), parameter.name, TransformResString(reason));
}

void MappingFileWriter::checkParameters() {
  for (const GlobalParameters::Parameter& parameter : m_workspace.parameters.all()) {
    if (parameter.isPublished)
      checkChoices(parameter);
    const QString script = parameter.isComputed() ? refuseScript(parameter) : QString();
    if (!script.isEmpty())
      m_diagnostics.reportUnwritable(parameter.line, QString(), parameter.name, script);
    if (!parameter.setInHeader)
      checkParameter(parameter, parameter.value);
    if (parameter.isOverridden)
      checkParameter(parameter, parameter.overridingValue);
  }
  for (const std::vector<const GlobalParameters::Parameter*>& circle : m_workspace.parameters.circles()) {
    QStringList names;
    for (const GlobalParameters::Parameter* parameter : circle)
      names.append(parameter->name);
    m_diagnostics.reportText(
        Rule::Cycle, circle.front()->line, QString(),
        TransformResString(orx::messages::kParameterCircle, names.join(QLatin1String(", "))));
  }
}

void MappingFileWriter::check() {
  checkParameters();
  QSet<const CompoundTransformerNetwork*> checked;
  QSet<const ConfiguredDefinition*> sound;  // whose template needs no second look
  for (const WorkspaceNode& node : m_workspace.nodes) {
    checkAttributes(node);
    if (!node.isTransformer()) {
      checkWord(node.name, node.line, node.name);
      checkWord(node.keyword, node.line, node.name);
      continue;
    }
    if (checkText(node.name, node.name, node.line, node.name))
      checkNoReference(node.name, node.line, node.name);
    if (!sound.contains(node.cfg->definition())) {
      const std::size_t before = m_diagnostics.all().size();
      for (const QString& line : node.cfg->getTemplateLines())
        checkText(line, node.cfg->getName(), node.line, node.name);
      if (m_diagnostics.all().size() == before)
        sound.insert(node.cfg->definition());
    }
    const auto* custom = dynamic_cast<const CompoundTransformerCfg*>(node.cfg.get());
    const QHash<QString, QString> faults =
        custom ? custom->findUnwritableParameters() : node.cfg->findUnwritableValues();
    QString nestingFault = custom ? custom->instantiationFault() : QString();
    if (custom && nestingFault.isEmpty() && !checked.contains(custom->getNetwork())) {
      checked.insert(custom->getNetwork());
      nestingFault = findPrefixFault(*custom->getNetwork());
    }
    if (!nestingFault.isEmpty())
      m_diagnostics.reportText(Rule::Nesting, node.line, node.name, nestingFault);
    for (const QString& fault : custom ? custom->findUnwritablePorts() : QStringList())
      m_diagnostics.reportText(Rule::UnwritableValue, node.line, node.name, fault);
    const QHash<QString, QString> replaced = InnerNames::findReplacedParameters(
        node.name, *node.cfg, [this](const QString& name) { return m_workspace.parameters.find(name); });
    for (const QString& parameter : node.cfg->getParameters()) {
      if (replaced.contains(parameter))
        m_diagnostics.report(Rule::UnwritableValue, node.line, node.name,
                             {parameter, replaced.value(parameter)});
      const auto fault = faults.constFind(parameter);
      if (fault != faults.constEnd())
        m_diagnostics.reportUnwritable(node.parameterLines.of(parameter), node.name, parameter,
                                       fault.value());
    }
  }
}

bool MappingFileWriter::write(MFBuffer& buffer, WrittenCheck* check) {
  writeStatement(buffer, QLatin1String("# Written by ") + programVersion());
  writeHeader(buffer, check);
  writeParameters(buffer, check);
  WrittenCheck* const ofNames = hasHarmfulNames() ? check : nullptr;
  if (check && !ofNames)
    check->skip();
  writeFeatureTypes(buffer, ofNames);
  m_definitions.write(buffer, check);
  const bool isWritten = writeTransformers(buffer, check);
  writeWriterRoutes(buffer, ofNames);
  return isWritten;
}

bool MappingFileWriter::hasHarmfulNames() const {
  const auto areHarmless = [](const QStringList& names) {
    return std::all_of(names.begin(), names.end(), isHarmlessText);
  };
  return !std::all_of(m_workspace.nodes.begin(), m_workspace.nodes.end(),
                      [&](const WorkspaceNode& node) {
                        return isHarmlessText(node.name) && isHarmlessText(node.keyword) &&
                               areHarmless(node.attributes) &&
                               std::all_of(node.exposed.begin(), node.exposed.end(), areHarmless);
                      }) ||
         !std::all_of(m_workspace.attributeLinks.begin(), m_workspace.attributeLinks.end(),
                      [&](const AttributeLink& link) {
                        return areHarmless({link.from, link.to});
                      });
}

void MappingFileWriter::writeHeader(MFBuffer& buffer, WrittenCheck* check) const {
  if (m_workspace.headerLines.isEmpty())
    return;
  int number = m_workspace.firstHeaderLine;
  for (const QString& line : m_workspace.headerLines) {
    if (check)
      check->begin({WrittenPlace::Kind::HeaderLine, number, QString()});
    buffer.write(line.toUtf8() + '\n');
    ++number;
  }
  buffer.write(QByteArray(1, '\n'));
}

// Only what is suspect is judged: what has a value of its own that may do harm, custom transformers, and the
// first of each kind, whose template and defaults stand for those of all.
bool MappingFileWriter::writeTransformers(MFBuffer& buffer, WrittenCheck* check) {
  const bool judgesAll = hasHarmfulNames();
  QSet<const ConfiguredDefinition*> seen;
  bool isWritten = true;
  for (const int number : m_order) {
    const WorkspaceNode& node = m_workspace.nodes[at(number)];
    if (check) {
      const bool isFirst = !seen.contains(node.cfg->definition());
      seen.insert(node.cfg->definition());
      if (judgesAll || isFirst || !node.isHarmless || isCustomTransformer(node.cfg.get()))
        check->begin({WrittenPlace::Kind::Node, node.line, node.name, node.cfg.get(), &node.parameterLines});
      else
        check->skip();
    }
    if (node.cfg->instantiate(buffer, m_workspace.fileName))
      continue;
    m_diagnostics.report(Rule::NotWritten, node.line, node.name, {node.name});
    isWritten = false;
  }
  if (check)
    check->skip();
  return isWritten;
}

void MappingFileWriter::writeParameters(MFBuffer& buffer, WrittenCheck* check) const {
  for (const GlobalParameters::Parameter& parameter : m_workspace.parameters.all()) {
    const QString name = parameter.name + QLatin1Char(' ');
    if (check)
      check->begin({WrittenPlace::Kind::Parameter, parameter.line, parameter.name});
    QStringList script;
    if (parameter.isComputed() && parameter.language == ScriptLanguage::Python)
      getPythonParameterLines(QString(), parameter.name, parameter.value, script);
    else if (parameter.isComputed())
      getTclParameterLines(QString(), parameter.name, parameter.value, script);
    for (const QString& line : qAsConst(script))
      writeStatement(buffer, line);
    if (!parameter.setInHeader && parameter.language == ScriptLanguage::None)
      writeStatement(buffer, kDefaultMacroStatement + name + parameter.value);
    if (parameter.isOverridden)
      writeStatement(buffer, kMacroStatement + name + parameter.overridingValue);
  }
}

void MappingFileWriter::writeFeatureTypes(MFBuffer& buffer, WrittenCheck* check) const {
  for (std::size_t node = 0; node < m_workspace.nodes.size(); ++node) {
    const WorkspaceNode& place = m_workspace.nodes[node];
    if (place.isTransformer())
      continue;
    if (check)
      check->begin({WrittenPlace::Kind::Node, place.line, place.name});
    const QString flow = m_flows[node].value(QString());
    if (flow != place.name) {
      const bool isReader = place.kind == WorkspaceNode::Kind::Reader;
      const QString type = quotifyStringForMF(place.name);
      const QString shownFlow = quotifyStringForMF(flow);
      writeStatement(
          buffer, (isReader ? kReaderTypeStatement : kWriterTypeStatement) + QLatin1Char(' ') +
                      quotifyStringForMF(place.keyword) + QLatin1Char(' ') +
                      (isReader ? type + QLatin1Char(' ') + shownFlow : shownFlow + QLatin1Char(' ') + type));
    }
    if (!m_copiedFlows[node].isEmpty()) {
      writeRoute(buffer, place.keyword + QLatin1Char(' ') + place.name + QLatin1String(" Attribute Copier"),
                 {flow}, m_copiedFlows[node], m_functions[node].value(QString()));
    }
  }
}

void MappingFileWriter::writeWriterRoutes(MFBuffer& buffer, WrittenCheck* check) const {
  for (std::size_t node = 0; node < m_workspace.nodes.size(); ++node) {
    const WorkspaceNode& place = m_workspace.nodes[node];
    if (place.kind != WorkspaceNode::Kind::Writer || m_incoming[node].empty())
      continue;
    if (check)
      check->begin({WrittenPlace::Kind::Node, place.line, place.name});
    QStringList flows;
    for (const int number : m_incoming[node]) {
      const WorkspaceLink& link = m_workspace.links[at(number)];
      flows.append(flowOf(link.source, link.output));
    }
    writeRoute(buffer, place.keyword + QLatin1Char(' ') + place.name + kOutputRenamerName, flows,
               m_flows[node].value(QString()), {});
  }
}
