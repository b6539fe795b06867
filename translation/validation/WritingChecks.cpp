#include <transform/core/CarriedReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/Keywords.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TokenScanner.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/findings/Refusal.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>
#include <translation/graph/InnerNames.h>
#include <translation/graph/InstanceIdentity.h>
#include <translation/validation/WritingChecks.h>

#include <algorithm>

namespace messages = orx::messages;

using orx::Rule;

bool WritingChecks::checkText(const QString& text, const QString& what, int line, const QString& node) {
  const bool isClosed = MFBuffer::closesDeferredMacros(text);
  if (!isClosed)
    m_findings.report(Rule::UnclosedReference, line, node, {what});
  const bool isOneLine = TextPlaces::isOneLine(text);
  if (!isOneLine)
    m_findings.report(Rule::LineBreak, line, node, {what});
  return isClosed && isOneLine;
}

void WritingChecks::checkWord(const QString& text, int line, const QString& node) {
  if (!checkText(text, text, line, node))
    return;
  if (const long number = TextPlaces::refuse(TextPlace::Name, text))
    m_findings.reportAs(Rule::UnwritableValue, number, line, node, {text});
}

void WritingChecks::checkNoReference(const QString& name, int line, const QString& node) {
  if (beginsMacroReference(name))
    m_findings.reportAs(Rule::UnwritableValue, messages::kReferenceInName, line, node, {name});
}

// Names of attributes are written wherever they are asked for.
void WritingChecks::checkAttributes(const WorkspaceNode& node) {
  for (const QString& attribute : node.attributes)
    checkNoReference(attribute, node.line, node.name);
  for (const QStringList& attributes : node.exposed) {
    for (const QString& attribute : attributes)
      checkNoReference(attribute, node.line, node.name);
  }
}

// A script sees what stands before it.
QString WritingChecks::refuseScript(const GlobalParameters::Parameter& parameter) const {
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

void WritingChecks::checkChoices(const GlobalParameters::Parameter& parameter) {
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
    m_findings.reportUnwritable(parameter.line, QString(), parameter.name, reason);
}

void WritingChecks::checkParameter(const GlobalParameters::Parameter& parameter, const QString& value) {
  const GlobalParameters& all = m_workspace.parameters;
  const carried_references::Known known{
      [&all](QString& text) {
        text = all.resolve(MFBuffer::withOrdinaryMacros(text));
        return true;
      },
      [&all](const QString& name) { return carried_references::spellingOf(all.typeOf(name)); }};
  const bool isSound = checkText(value, parameter.name, parameter.line, QString());
  long reason = TextPlaces::refuse(TextPlace::MacroName, parameter.name);
  if (reason == 0 && isSound)
    reason = TextPlaces::refuse(TextPlace::MacroValue, value);
  // It has one value for all features.
  const GUIType type = GUIType::fromGuiLine(parameter.promptLine);
  if (reason == 0 && ExpressionWriter::needsWrapping(type, value))
    reason = value.startsWith(kConditionalPrefix) ? messages::kConditionInMacro : messages::kAttributeInMacro;
  if (reason == 0 && isSound && !parameter.isComputed())
    reason = carried_references::refuseInMacro(type, value, known);
  // The text of a script is taken out of its encoding when it is written.
  const bool isScript = parameter.isComputed() || value != parameter.currentValue();
  if (reason == 0 && isSound && !isScript)
    reason = refuseEncoding(type, value);
  if (reason != 0)
    m_findings.reportUnwritable(parameter.line, QString(), parameter.name, TransformResString(reason));
}

// Some names are set by others than the parameter.
void WritingChecks::checkParameterName(const GlobalParameters::Parameter& parameter) {
  if (isReservedToken(parameter.name) || (!parameter.setInHeader && isGlobalMacro(parameter.name)))
    m_findings.reportAs(Rule::TakenName, messages::kNameOfTheSystem, parameter.line, QString(),
                        {parameter.name});
}

// The macro that holds a choice which was looked up begins with the identity of its node.
void WritingChecks::checkLookupMacros() {
  struct Owner {
    const TransformerCfg* cfg;
    QString title;
  };
  QHash<QString, Owner> owners;
  for (const WorkspaceNode& node : m_workspace.nodes) {
    if (node.isTransformer())
      owners.insert(node.cfg->getBaseGuid(), {node.cfg.get(), node.name});
  }
  for (const ExternalDocNetwork* network : m_workspace.customTransformers()) {
    for (const SubDocNetworkObj* object : network->nodes()) {
      if (const auto* node = dynamic_cast<const SubDocNetworkObjXformer*>(object))
        owners.insert(instanceStem({network->getName()}, node->number(), node->name()),
                      {node->getTransformer(), network->getName() + QLatin1Char('/') + node->name()});
    }
  }
  const int length = owners.isEmpty() ? 0 : owners.constBegin().key().size();
  for (const GlobalParameters::Parameter& parameter : m_workspace.parameters.all()) {
    const auto owner = owners.constFind(parameter.name.left(length));
    if (owner != owners.constEnd() && owner->cfg->getParameterByMacroName(parameter.name.mid(length)))
      m_findings.reportAs(Rule::TakenName, messages::kTakenByLookup, parameter.line, QString(),
                          {parameter.name, owner->title});
  }
}

void WritingChecks::checkPrefixMacros() {
  std::vector<const CompoundTransformerNetwork*> networks;
  for (const ExternalDocNetwork* network : m_workspace.customTransformers())
    networks.push_back(network);
  for (const ExternalTransformerNetwork* network : m_workspace.linkedCustomTransformers)
    networks.push_back(network);
  for (const CompoundTransformerNetwork* network : networks) {
    const GlobalParameters::Parameter* parameter =
        m_workspace.parameters.find(makePrefixMacro(network->getName()));
    if (parameter)
      m_findings.reportAs(Rule::TakenName, messages::kPrefixMacroTaken, parameter->line, QString(),
                          {parameter->name, network->getName()});
  }
}

void WritingChecks::checkType(const WorkspaceNode& node) {
  checkWord(node.name, node.line, node.name);
  checkWord(node.keyword, node.line, node.name);
  // A reader's flows are named apart; what stands before a writer bears its name.
  if (node.kind == WorkspaceNode::Kind::Reader)
    return;
  const auto type = qMakePair(node.keyword, node.name);
  if (m_types.contains(type))
    m_findings.reportAs(Rule::TakenName, messages::kTypeTwice, node.line, node.name,
                        {node.name, node.keyword});
  m_types.insert(type);
}

void WritingChecks::checkParameters() {
  checkPrefixMacros();
  checkLookupMacros();
  for (const GlobalParameters::Parameter& parameter : m_workspace.parameters.all()) {
    checkParameterName(parameter);
    if (parameter.isPublished)
      checkChoices(parameter);
    const QString script = parameter.isComputed() ? refuseScript(parameter) : QString();
    if (!script.isEmpty())
      m_findings.reportUnwritable(parameter.line, QString(), parameter.name, script);
    if (!parameter.setInHeader)
      checkParameter(parameter, parameter.value);
    else if (!MFBuffer::closesDeferredMacros(parameter.value))
      m_findings.report(Rule::UnclosedReference, parameter.line, QString(), {parameter.name});
    if (parameter.isOverridden)
      checkParameter(parameter, parameter.overridingValue);
  }
  for (const std::vector<const GlobalParameters::Parameter*>& circle : m_workspace.parameters.circles()) {
    QStringList names;
    for (const GlobalParameters::Parameter* parameter : circle)
      names.append(parameter->name);
    m_findings.reportText(
        Rule::Cycle, circle.front()->line, QString(),
        TransformResString(orx::messages::kParameterCircle, names.join(QLatin1String(", "))),
        orx::messages::kParameterCircle);
  }
}

// An instance sets the prefix macro before it includes its definition.
void WritingChecks::checkHeader() {
  QSet<QString> embedded;
  for (const ExternalDocNetwork* network : m_workspace.customTransformers())
    embedded.insert(network->getName());
  int number = m_workspace.firstHeaderLine;
  for (const QString& line : m_workspace.headerLines) {
    const QString statement = line.trimmed();
    if (statement.startsWith(kIncludeCustomStatement + QLatin1Char(' '))) {
      QString name = statement.mid(kIncludeCustomStatement.size() + 1).trimmed();
      name.truncate(qMax(name.lastIndexOf(QLatin1Char(':')), 0));
      if (embedded.contains(name) && !m_workspace.parameters.find(makePrefixMacro(name)))
        m_findings.reportAs(Rule::UnwritableValue, messages::kIncludedInHeader, number, QString(), {name});
    }
    ++number;
  }
}

void WritingChecks::check() {
  checkHeader();
  checkParameters();
  for (const AttributeLink& link : m_workspace.attributeLinks)
    checkNoReference(link.to, link.line,
                     m_workspace.nodes[static_cast<std::size_t>(m_workspace.links[link.link].target)].name);
  for (std::size_t number = 0; number < m_workspace.nodes.size(); ++number) {
    const WorkspaceNode& node = m_workspace.nodes[number];
    checkAttributes(node);
    if (node.isTransformer())
      checkTransformer(node);
    else
      checkType(node);
  }
}

void WritingChecks::checkTransformer(const WorkspaceNode& node) {
  if (checkText(node.name, node.name, node.line, node.name))
    checkNoReference(node.name, node.line, node.name);
  if (!m_sound.contains(node.cfg->definition())) {
    const std::size_t before = m_findings.all().size();
    for (const QString& line : node.cfg->getTemplateLines())
      checkText(line, node.cfg->getName(), node.line, node.name);
    if (m_findings.all().size() == before)
      m_sound.insert(node.cfg->definition());
  }
  const auto* custom = dynamic_cast<const CompoundTransformerCfg*>(node.cfg.get());
  const QHash<QString, QString> faults =
      custom ? custom->findUnwritableParameters() : node.cfg->findUnwritableValues();
  const orx::RefusalListener nesting;
  QString nestingFault = custom ? custom->instantiationFault() : QString();
  if (custom && nestingFault.isEmpty() && !m_checked.contains(custom->getNetwork())) {
    m_checked.insert(custom->getNetwork());
    nestingFault = findPrefixFault(*custom->getNetwork());
  }
  const QString levelFault = nestingFault.isEmpty() ? m_levels.refuse(*node.cfg) : QString();
  if (!levelFault.isEmpty())
    m_findings.reportText(Rule::UnwritableValue, node.line, node.name, levelFault,
                          messages::kNoParallelLevel);
  if (!nestingFault.isEmpty())
    m_findings.reportText(Rule::Nesting, node.line, node.name, nestingFault, nesting.refusal().message);
  for (const QString& fault : custom ? custom->findUnwritablePorts() : QStringList())
    m_findings.reportText(Rule::UnwritableValue, node.line, node.name, fault);
  const QHash<QString, QString> replaced = InnerNames::findReplacedParameters(
      node.name, *node.cfg, [this](const QString& name) { return m_workspace.parameters.find(name); });
  for (const QString& parameter : node.cfg->getParameters()) {
    if (replaced.contains(parameter))
      m_findings.report(Rule::UnwritableValue, node.line, node.name, {parameter, replaced.value(parameter)});
    const auto fault = faults.constFind(parameter);
    if (fault != faults.constEnd())
      m_findings.reportUnwritable(node.parameterLines.of(parameter), node.name, parameter, fault.value());
  }
}
