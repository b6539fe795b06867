#include <platform/orxutil/ResourceDirectories.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerSource.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/DocumentBinding.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/findings/Refusal.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/TransformerRecords.h>

namespace messages = orx::messages;

using orx::Rule;

namespace {

// A name with blanks that is not word-encoded would be cut.
bool hasWords(const QString& description, int most) {
  return description.split(QLatin1Char(' '), Qt::SkipEmptyParts).size() <= most;
}

}  // namespace

DocumentBinding::DocumentBinding(const IXMLComponentReader& reader, TransformerSource& source,
                                 orx::Findings& findings, const WorkspaceParameterDirectory* parameters,
                                 TransformerCfgListener* listener)
    : m_reader(reader),
      m_source(source),
      m_findings(findings),
      m_parameters(parameters),
      m_listener(listener) {}

// --- nodes -------------------------------------------------------------------------------------------------

bool DocumentBinding::enter(int identifier, const Place& place) {
  const auto earlier = m_places.constFind(identifier);
  if (earlier == m_places.constEnd()) {
    m_places.insert(identifier, place);
    if (place.gives && !place.port.isEmpty() && !m_givingPorts.contains(place.port))
      m_givingPorts.insert(place.port, identifier);
    return true;
  }
  m_findings.report(Rule::DuplicateNumber, place.line, place.name,
                    {QString::number(identifier), QString::number(earlier->line)});
  return false;
}

const DocumentBinding::Place* DocumentBinding::find(int identifier) const {
  const auto at = m_places.constFind(identifier);
  return at == m_places.constEnd() ? nullptr : &*at;
}

std::unique_ptr<TransformerCfg> DocumentBinding::enter(const TransformerStruct& record, int node) {
  Place place;
  place.node = node;
  place.line = record.line;
  place.name = transformerTitle(record);
  std::unique_ptr<TransformerCfg> cfg;
  if (record.enabled) {
    cfg = make(record, place.name);
    if (cfg) {
      configure(record, place.name, *cfg);
      // It may have come out shorter than the record's name; it is what the statements hold.
      place.name = cfg->getIdentifier();
      place.ports = TransformerPorts(record, *cfg);
      checkOutputs(record, place, *cfg);
    }
    takeName(place.name, record.line);
  }
  place.isLeftOut = !cfg;
  place.cfg = cfg.get();
  return enter(record.identifier, place) ? std::move(cfg) : nullptr;
}

void DocumentBinding::checkOutputs(const TransformerStruct& record, const Place& place,
                                   const TransformerCfg& cfg) {
  const CompoundTransformerNetwork* inner = networkOf(&cfg);
  if (inner && !inner->isBodyLoaded())
    return;
  QStringList tags;
  cfg.getOutputTags(tags);
  for (const OutputFeatStruct& output : record.outputFeats) {
    if (!output.name.isEmpty() && place.ports.output(0, output.name).isNull()) {
      m_findings.reportAs(Rule::UnknownElement, orx::messages::kOutputNotThere, record.line, place.name,
                          {nameWithFile(cfg), output.name, tags.join(QLatin1String(", "))});
    }
  }
}

void DocumentBinding::takeName(const QString& name, int line) {
  const auto earlier = m_linesByName.constFind(name);
  if (earlier != m_linesByName.constEnd())
    m_findings.report(Rule::DuplicateName, line, name, {name, QString::number(*earlier)});
  else
    m_linesByName.insert(name, line);
}

std::unique_ptr<TransformerCfg> DocumentBinding::make(const TransformerStruct& record, const QString& title) {
  const bool isCustom = record.kind == TransformerKind::SubDocument;
  const QString type = isCustom ? subDocumentName(record) : record.type;
  if (isCustom && type.isEmpty()) {
    m_findings.report(Rule::CustomTransformer, record.line, title);
    return nullptr;
  }
  QString refusal;
  const orx::RefusalListener listener;
  std::unique_ptr<TransformerCfg> cfg = m_source.makeTransformer(type, record.version, &refusal);
  const QString version = QString::number(record.version);
  if (cfg && isCustom && record.version != 0 && record.version != cfg->getVersion()) {
    m_findings.report(Rule::UnknownVersion, record.line, title,
                      {type, version, QString::number(cfg->getVersion())});
    return nullptr;
  }
  if (cfg)
    return cfg;
  if (!refusal.isEmpty()) {
    const bool isNesting = listener.refusal().rule == Rule::Nesting;
    m_findings.reportText(isNesting ? Rule::Nesting : Rule::CustomTransformerFault, record.line, title,
                          refusal, isNesting ? listener.refusal().message : 0);
    return nullptr;
  }
  if (const auto newest = m_source.makeTransformer(type, TransformerSource::kNewestVersion)) {
    m_findings.report(Rule::UnknownVersion, record.line, title,
                      {type, version, QString::number(newest->getVersion())});
  } else {
    m_findings.report(
        Rule::UnknownTransformer, record.line, title,
        {type, version, ORX_resourcePlaces(QStringLiteral("transformer")).join(QLatin1String(", "))});
  }
  return nullptr;
}

void DocumentBinding::configure(const TransformerStruct& record, const QString& title, TransformerCfg& cfg) {
  if (record.lastParmEdit > 0)
    cfg.setLastParmEditBuild(record.lastParmEdit);
  cfg.setIdentifier(title);
  if (m_parameters)
    cfg.setParameterDirectory(m_parameters);
  for (const XformParmStruct& parameter : record.parameters) {
    const bool isTaken =
        parameter.parmName == kIdentifierParameter ||
        (record.kind == TransformerKind::SubDocument && parameter.parmName == kSubDocumentNameParameter);
    if (!isTaken && !cfg.setParameterValue(parameter.parmName, parameter.parmValue, false)) {
      m_findings.report(Rule::UnknownParameter, parameter.line, title,
                        {nameWithFile(cfg), parameter.parmName});
    }
  }
  cfg.autoUpgradeTransformer();
  if (cfg.isAutoUpgraded())
    m_findings.report(Rule::Upgraded, record.line, title, {cfg.getName()});
  if (m_listener)
    cfg.setListener(m_listener);
  if (!cfg.dependencyMet())
    m_findings.report(Rule::UnmetDependency, record.line, title, {cfg.getName(), cfg.dependencyMsg()});
}

GUIType DocumentBinding::promptOf(const GlobalParameterStruct& record) {
  const GUIType type = GUIType::fromGuiLine(record.guiLine);
  if (type.getName().isEmpty()) {
    m_findings.report(Rule::BadPromptLine, record.line, QString(), {record.guiLine});
    return GUIType();
  }
  const auto earlier = m_declared.constFind(type.getName());
  if (earlier != m_declared.constEnd()) {
    const bool isEqual = earlier->value == record.defaultValue && earlier->promptLine == record.guiLine;
    m_findings.report(isEqual ? Rule::RepeatedDeclaration : Rule::ContradictingParameter, record.line,
                      QString(), {type.getName(), QString::number(earlier->line)});
  }
  m_declared.insert(type.getName(), {record.defaultValue, record.guiLine, record.line});
  // Its type tells how the value is to be written.
  if (!type.isKnown()) {
    m_findings.reportAs(Rule::BadPromptLine, messages::kUnknownPromptType, record.line, QString(),
                        {type.getName(), type.getType()});
  }
  return type;
}

// --- links -------------------------------------------------------------------------------------------------

bool DocumentBinding::findEnds(const LinkStruct& record, const Place*& source, const Place*& target) {
  source = find(record.sourceNode);
  target = find(record.targetNode);
  if (source && target)
    return record.enabled && !source->isLeftOut && !target->isLeftOut;
  if (record.enabled) {
    m_findings.report(Rule::DanglingLink, record.line, QString(),
                      {QString::number(record.identifier),
                       QString::number(source ? record.targetNode : record.sourceNode)});
  }
  return false;
}

void DocumentBinding::reportPort(const LinkStruct& record, const Place& place, const QString& description) {
  m_findings.report(Rule::BadPort, record.line, place.name,
                    {QString::number(record.identifier), description});
}

bool DocumentBinding::findPort(const LinkStruct& record, const Place& place, bool isOutput, unsigned number,
                               const QString& name, QString& tag) {
  tag = !place.cfg ? place.port
        : isOutput ? place.ports.output(number, name)
                   : place.ports.input(number, name);
  // Feature types and the ports of custom transformers are their own only port.
  const bool isOnly = number == 0 && (name.isEmpty() || name == place.name || name == place.port);
  if (!place.cfg && !isOnly)
    reportPort(record, place, isOutput ? record.sourcePortDesc : record.targetPortDesc);
  if (!place.cfg || !tag.isNull())
    return place.cfg || isOnly;
  // Left where it is, with its ports, because it stands too deep: the nesting is what will be refused.
  const CompoundTransformerNetwork* inner = networkOf(place.cfg);
  if (inner && !inner->isBodyLoaded())
    return false;
  QStringList tags;
  if (isOutput)
    place.cfg->getOutputTags(tags);
  else
    place.cfg->getInputTags(tags);
  m_findings.report(isOutput ? Rule::UnknownOutput : Rule::UnknownInput, record.line, place.name,
                    {nameWithFile(*place.cfg), name.isEmpty() ? QString::number(number) : name,
                     tags.join(QLatin1String(", "))});
  return false;
}

bool DocumentBinding::readPort(const LinkStruct& record, const Place& place, bool isOutput, QString& tag) {
  unsigned number = 0;
  QString name;
  const QString& description = isOutput ? record.sourcePortDesc : record.targetPortDesc;
  if (hasWords(description, 3) && readFeaturePort(description, isOutput, number, name))
    return findPort(record, place, isOutput, number, name, tag);
  reportPort(record, place, description);
  return false;
}

std::optional<DocumentBinding::Flow> DocumentBinding::flow(const LinkStruct& record) {
  std::optional<Flow> flow = findFlow(record);
  if (!flow) {
    m_leftOut.emplace(record.sourceNode, record.targetNode);
    return flow;
  }
  const auto [at, isNew] =
      m_flows.try_emplace({record.sourceNode, flow->output, record.targetNode, flow->input});
  if (isNew) {
    at->second.number = m_flows.size() - 1;
    at->second.line = record.line;
  } else {
    flow->isRepeated = true;
    m_findings.report(Rule::IdleLink, record.line, flow->source->name,
                      {QString::number(record.identifier), QString::number(at->second.line)});
  }
  return flow;
}

std::optional<DocumentBinding::Flow> DocumentBinding::findFlow(const LinkStruct& record) {
  Flow flow;
  if (!findEnds(record, flow.source, flow.target))
    return std::nullopt;
  if (!flow.source->gives)
    reportPort(record, *flow.source, record.sourcePortDesc);
  else if (!flow.target->takes)
    reportPort(record, *flow.target, record.targetPortDesc);
  else if (readPort(record, *flow.source, true, flow.output) &&
           readPort(record, *flow.target, false, flow.input))
    return flow;
  return std::nullopt;
}

std::optional<DocumentBinding::AttributeCopy> DocumentBinding::attributeCopy(const LinkStruct& record) {
  AttributeCopy copy;
  if (!findEnds(record, copy.source, copy.target))
    return std::nullopt;
  unsigned output = 0;
  unsigned input = 0;
  const auto readAttribute = [&](const QString& description, bool wantsOutput, QString& attribute) {
    bool isFeaturePort = false;
    bool isOutput = false;
    unsigned ignored = 0;
    return hasWords(description, 4) &&
           decodePortDescription(description, isFeaturePort, isOutput, wantsOutput ? output : input, ignored,
                                 attribute) &&
           !isFeaturePort && isOutput == wantsOutput && !attribute.isEmpty();
  };
  if (!copy.source->gives || !readAttribute(record.sourcePortDesc, true, copy.from))
    reportPort(record, *copy.source, record.sourcePortDesc);
  else if (!copy.target->takes || !readAttribute(record.targetPortDesc, false, copy.to))
    reportPort(record, *copy.target, record.targetPortDesc);
  else if (findPort(record, *copy.source, true, output, QString(), copy.output) &&
           findPort(record, *copy.target, false, input, QString(), copy.input) && takeAttribute(record, copy))
    return copy;
  return std::nullopt;
}

bool DocumentBinding::takeAttribute(const LinkStruct& record, AttributeCopy& copy) {
  const QString identifier = QString::number(record.identifier);
  const auto along = m_flows.find({record.sourceNode, copy.output, record.targetNode, copy.input});
  if (along == m_flows.end()) {
    // Where features would go but for a link that is disabled or at fault, that one is enough.
    if (m_leftOut.count({record.sourceNode, record.targetNode}) == 0)
      m_findings.reportAs(Rule::IdleLink, messages::kIdleAttributeLink, record.line, copy.source->name,
                          {identifier, copy.source->name, copy.target->name});
    return false;
  }
  copy.flow = along->second.number;
  const int source = m_givingPorts.value(copy.source->port, record.sourceNode);
  const auto [given, isNew] = m_copies[{source, copy.output, record.targetNode, copy.input}].try_emplace(
      copy.to, Taken{copy.from, record.line});
  if (isNew)
    return true;
  const QString line = QString::number(given->second.line);
  if (given->second.from == copy.from)
    m_findings.report(Rule::IdleLink, record.line, copy.source->name, {identifier, line});
  else
    m_findings.report(Rule::AttributeLink, record.line, copy.target->name,
                      {identifier, copy.to, copy.from, line, given->second.from});
  return false;
}
