#include <platform/orxutil/Decipher.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/core/TransformerSource.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/ScriptParameters.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <translation/MappingFileLint.h>
#include <translation/graph/ReferencedNames.h>
#include <translation/graph/Workspace.h>
#include <translation/validation/FitChecks.h>
#include <translation/validation/FlowChecks.h>
#include <translation/validation/WorkspaceChecks.h>

#include <algorithm>

namespace messages = orx::messages;

using orx::Rule;
using orx::Severity;

namespace {

const QLatin1String kPasswordType("PASSWORD");
const QString kLastSaveBuild = QStringLiteral("LAST_SAVE_BUILD");

}  // namespace

void WorkspaceChecks::check(Workspace& workspace, bool isConnected) {
  checkBuild();
  for (const GlobalParameters::Parameter& parameter : workspace.parameters.all())
    m_parameterNames.append(parameter.name);
  m_includesOthers = std::any_of(m_headerLines.begin(), m_headerLines.end(), [](const QString& line) {
    return line.startsWith(QLatin1String("INCLUDE "));
  });
  checkParameters(workspace);
  checkTransformers(workspace, isConnected);
  for (const ExternalDocNetwork* network : workspace.customTransformers())
    checkInside(*network, workspace, {m_diagnostics, m_values});
  for (const ExternalTransformerNetwork* network : workspace.linkedCustomTransformers)
    checkLinked(*network, workspace);
  checkParameterValues(workspace);
  checkParameterUse(workspace);
  fit_checks::checkParameters(m_reader, workspace.parameters, m_diagnostics);
}

void WorkspaceChecks::checkBuild() {
  const QString build = m_reader.GetMiscParm(kLastSaveBuild);
  if (build.toInt() > TransformerCfg::kThisBuild)
    m_diagnostics.report(Rule::NewerBuild, m_reader.GetDocumentLine(QString()), QString(),
                         {build, QString::number(TransformerCfg::kThisBuild)});
}

bool WorkspaceChecks::isKnown(const GlobalParameters& parameters, const QString& name) const {
  return m_includesOthers || parameters.find(name) || isGlobalMacro(name);
}

// A prompt line says of a value what a definition says of a transformer's, so a transformer with nothing but
// these parameters judges them.
void WorkspaceChecks::checkParameters(Workspace& workspace) {
  TransformerCfg prompts;
  prompts.configure(TransformerDefinition());
  prompts.setIdentifier(m_diagnostics.file());
  std::vector<std::pair<QString, int>> lines;
  for (const GlobalParameters::Parameter& parameter : workspace.parameters.all()) {
    TransformParamCfg record(GUIType::fromGuiLine(parameter.promptLine));
    // No document keeps a password; it is given when the workspace is run.
    const bool isWithheld = record.getType().startsWith(kPasswordType) && parameter.currentValue().isEmpty();
    if (!parameter.isPublished || isWithheld)
      continue;
    record.setValue(parameter.currentValue());
    prompts.addParameter(record);
    lines.emplace_back(parameter.name, parameter.line);
  }
  prompts.setListener(&workspace.listener);
  // Which files and connections a parameter names is settled when the workspace is run; references have their
  // own check.
  m_values.check(
      {prompts, QString(), ParameterLines(lines), /*knowsWhatArrives=*/false, /*isUsedHere=*/false},
      [](const QString&) { return true; }, m_parameterNames);
}

void WorkspaceChecks::checkTransformers(const Workspace& workspace, bool isConnected) {
  const FlowChecks flow(workspace);
  flow.report(m_diagnostics);
  const auto knows = [&](const QString& name) { return isKnown(workspace.parameters, name); };
  for (std::size_t number = 0; number < workspace.nodes.size(); ++number) {
    const WorkspaceNode& node = workspace.nodes[number];
    if (!node.isTransformer())
      continue;
    m_values.check({*node.cfg, node.name, node.parameterLines,
                    isConnected && flow.knowsWhatArrives(static_cast<int>(number))},
                   knows, m_parameterNames);
    fit_checks::checkTransformer(*node.cfg, node.parameterLines, node.name, m_diagnostics,
                                 fit_checks::References::Known);
    fit_checks::checkInside(*node.cfg, node.line, node.name, m_diagnostics);
    checkAge(*node.cfg, node.line, node.name, m_diagnostics);
  }
  if (isConnected)
    checkAttributeLinks(workspace, flow);
}

void WorkspaceChecks::checkAttributeLinks(const Workspace& workspace, const FlowChecks& flow) {
  for (const AttributeLink& link : workspace.attributeLinks) {
    const WorkspaceLink& along = workspace.links[link.link];
    const WorkspaceNode& source = workspace.nodes[static_cast<std::size_t>(along.source)];
    const WorkspaceNode& target = workspace.nodes[static_cast<std::size_t>(along.target)];
    const auto report = [&](long message, const WorkspaceNode& node, const QString& name) {
      m_diagnostics.reportAs(Rule::MissingAttribute, message, link.line, node.name,
                             {QString::number(link.identifier), name});
    };
    if ((!source.isTransformer() || flow.knowsWhatArrives(along.source)) &&
        !source.leaving(along.output).holds(link.from))
      report(messages::kLinkedAttributeMissing, source, link.from);
    if (target.hasFixedAttributes && !AttributeSet(target.attributes).holds(link.to))
      report(messages::kLinkedAttributeUnlisted, target, link.to);
  }
}

void WorkspaceChecks::checkInside(const ExternalDocNetwork& network, const Workspace& workspace,
                                  Place place) {
  reportFlowsInside(network, place.diagnostics);
  const QStringList names = network.getParameters();
  const auto knows = [&](const QString& name) {
    return network.hasParameter(name) || isKnown(workspace.parameters, name);
  };
  checkBuild(network, place.diagnostics);
  for (const SubDocNetworkObj* object : network.nodes()) {
    const auto* node = dynamic_cast<const SubDocNetworkObjXformer*>(object);
    if (!node)
      continue;
    const TransformerCfg& cfg = *node->getTransformer();
    const QString title = network.getName() + QLatin1Char('/') + node->name();
    place.values.check({cfg, title, node->parameterLines(), /*knowsWhatArrives=*/false}, knows, names);
    fit_checks::checkTransformer(cfg, node->parameterLines(), title, place.diagnostics,
                                 fit_checks::References::Open);
    checkAge(cfg, node->line(), title, place.diagnostics);
  }
}

void WorkspaceChecks::checkBuild(const ExternalDocNetwork& network, orx::Findings& diagnostics) {
  const QString build = network.getProperties().value(kLastSaveBuild);
  if (build.toInt() > TransformerCfg::kThisBuild)
    diagnostics.reportAs(Rule::NewerBuild, messages::kSubDocumentOfNewerBuild, 0, network.getName(),
                         {network.getName(), build, QString::number(TransformerCfg::kThisBuild)});
}

// The parameters of an embedded one are judged with the document's, by their lines.
void WorkspaceChecks::checkDefaults(const ExternalTransformerNetwork& linked, const Workspace& workspace,
                                    Place place) {
  for (const QString& parameter : linked.getParameters()) {
    const CompoundTransformerParm& info = *linked.getParameterInfo(parameter);
    if (scriptLanguage(info.type) != ScriptLanguage::None)
      continue;
    for (const QString& name : ReferencedNames::inValue(info.defaultValue)) {
      const bool isOwn = info.type.getFlag(kGUITypeInstanceMacros) && linked.hasParameter(name);
      if (!isOwn && !isKnown(workspace.parameters, name))
        place.diagnostics.reportParameter(
            Rule::UnknownReference, messages::kUnknownReference, 0, linked.getName(), parameter,
            parameter + QLatin1String(": ") + place.values.referenceText(name, m_parameterNames));
    }
  }
}

// Also those that its file embeds; the ones that it links have their own turn.
void WorkspaceChecks::checkLinked(const ExternalTransformerNetwork& linked, const Workspace& workspace) {
  orx::Findings found(linked.getFileName());
  ValueChecks values(found, m_settings);
  checkDefaults(linked, workspace, {found, values});
  QSet<const CompoundTransformerNetwork*> seen{&linked};
  std::vector<const ExternalDocNetwork*> open{&linked};
  while (!open.empty()) {
    const ExternalDocNetwork& network = *open.back();
    open.pop_back();
    checkInside(network, workspace, {found, values});
    for (const TransformerCfg* cfg : network.customTransformers()) {
      const auto* inner = dynamic_cast<const ExternalDocNetwork*>(networkOf(cfg));
      if (!inner || dynamic_cast<const ExternalTransformerNetwork*>(inner) || seen.contains(inner))
        continue;
      seen.insert(inner);
      open.push_back(inner);
    }
  }
  for (const orx::Finding& finding : found.all())
    m_diagnostics.add(finding);
  // An engine runs the statements of the file, not its document; several versions may stand in one.
  const QStringList& statements = linked.definitionLines();
  const bool saysNothing = std::all_of(statements.begin(), statements.end(), [](const QString& line) {
    return line.trimmed().isEmpty() || line.startsWith(QLatin1Char('#'));
  });
  const bool doesSomething =
      std::any_of(linked.nodes().begin(), linked.nodes().end(),
                  [](const SubDocNetworkObj* node) { return !node->feeders().empty(); });
  // What is enciphered is read by engines that can decipher it.
  const bool isPlain = !ORW_hasDecipherRoutine();
  if (isPlain && saysNothing && doesSomething) {
    orx::Findings inFile(linked.getFileName());
    inFile.reportAs(Rule::CustomTransformerFault, messages::kEmptyDefinition, linked.getStartLine(),
                    linked.getName(), {linked.getName(), QString::number(linked.getVersion())});
    m_diagnostics.add(inFile.all().front());
  }
  if (m_lintedFiles.contains(linked.getFileName()))
    return;
  m_lintedFiles.insert(linked.getFileName());
  for (orx::Finding finding : lintMappingFile(linked.getFileName(), linked.getFileName(), {}).findings) {
    // No engine knows such a line, and here nobody else reads it.
    if (isPlain && (finding.rule == Rule::UnknownStatement || finding.rule == Rule::MisspeltStatement))
      finding.rule = Rule::CustomTransformerFault;
    if (m_settings.severity(finding.rule) == orx::Severity::Error)
      m_diagnostics.add(finding);
  }
}

void WorkspaceChecks::checkAge(const TransformerCfg& cfg, int line, const QString& title,
                               orx::Findings& diagnostics) {
  const QString name = cfg.getName();
  const CompoundTransformerNetwork* network = networkOf(&cfg);
  if (cfg.isDeprecated() || (network && network->isDeprecated())) {
    if (cfg.replacedBy().isEmpty())
      diagnostics.reportAs(Rule::Deprecated, messages::kDeprecatedOnly, line, title, {name});
    else
      diagnostics.report(Rule::Deprecated, line, title, {name, cfg.replacedBy()});
    return;
  }
  if (network && !dynamic_cast<const ExternalTransformerNetwork*>(network))
    return;
  auto newest = m_newestByName.constFind(name);
  if (newest == m_newestByName.constEnd()) {
    const std::unique_ptr<TransformerCfg> made =
        m_source.makeTransformer(name, TransformerSource::kNewestVersion);
    newest = m_newestByName.insert(name, made ? made->getVersion() : -1);
  }
  if (newest.value() > cfg.getVersion())
    diagnostics.report(Rule::NewerVersion, line, title,
                       {name, QString::number(cfg.getVersion()), QString::number(newest.value())});
}

void WorkspaceChecks::collectReferences(ReferencedNames& names) const {
  for (const QString& line : m_headerLines)
    names.add(line);
  for (const DatasetStruct& dataset : m_reader.GetDatasetList()) {
    names.add(dataset.dataset);
    for (const MetafileParameterStruct& parameter : dataset.metafileParameters)
      names.add(parameter.value);
  }
  for (const FeatureTypeStruct& type : m_reader.GetFeatureTypeList()) {
    for (const QString& text : {type.featureTypeName, type.featureTypeNameQualifier, type.mergeFilter})
      names.add(text);
    for (const FeatAttributeStruct& attribute : type.attributes)
      names.add(attribute.attrValue);
    for (const DeflineParmStruct& parameter : type.deflineParms)
      names.add(parameter.parmValue);
    for (const NonGuiDeflineParmStruct& parameter : type.nonGuiDeflineParms)
      names.add(parameter.value);
  }
  const auto addTransformers = [&names](const ORXTValSlist<TransformerStruct>& list) {
    for (const TransformerStruct& transformer : list) {
      for (const XformParmStruct& parameter : transformer.parameters)
        names.add(parameter.parmValue);
      for (const XformAttrStruct& attribute : transformer.attributes)
        names.add(attribute.attrValue);
    }
  };
  for (const QString& document : QStringList(QString()) + m_reader.GetSubDocList())
    addTransformers(m_reader.GetTransformerList(document));
  for (const QString& document : m_reader.GetSubDocList()) {
    const QHash<QString, QString> settings = m_reader.GetSubDocParms(document);
    for (const char* name : {"PARALLELISM", "PARALLEL_GROUP_BY", "PARALLEL_PROCESS_SETTING"})
      names.add(settings.value(QLatin1String(name)));
  }
  // Also inside custom transformers, whose scripts see the global parameters.
  for (const QString& document : QStringList(QString()) + m_reader.GetSubDocList()) {
    for (const GlobalParameterStruct& parameter : m_reader.GetGlobalParameterList(document)) {
      names.add(parameter.defaultValue);
      names.add(parameter.guiLine);
    }
    for (const ConstantStruct& constant : m_reader.GetConstantList(document))
      names.add(constant.constValue);
  }
}

// A parameter's value is expanded where the parameter is referred to; inside a custom transformer its own
// parameters have other names.
void WorkspaceChecks::checkParameterValues(const Workspace& workspace) {
  for (const QString& document : QStringList(QString()) + m_reader.GetSubDocList()) {
    for (const GlobalParameterStruct& parameter : m_reader.GetGlobalParameterList(document)) {
      const GUIType type = GUIType::fromGuiLine(parameter.guiLine);
      if (scriptLanguage(type) == ScriptLanguage::None)
        checkParameterValue(workspace, parameter, type, document);
    }
  }
}

void WorkspaceChecks::checkParameterValue(const Workspace& workspace, const GlobalParameterStruct& parameter,
                                          const GUIType& type, const QString& document) {
  const GlobalParameters::Parameter* known =
      document.isEmpty() ? workspace.parameters.find(type.getName()) : nullptr;
  const QString& value = known && known->isOverridden ? known->overridingValue : parameter.defaultValue;
  const bool meansOwn = !document.isEmpty() && type.getFlag(kGUITypeInstanceMacros);
  const auto isOwn = [&](const QString& name) {
    const auto& all = m_reader.GetGlobalParameterList(document);
    return std::any_of(all.begin(), all.end(), [&](const GlobalParameterStruct& other) {
      return GUIType::fromGuiLine(other.guiLine).getName() == name;
    });
  };
  for (const QString& name : ReferencedNames::inValue(value)) {
    if (!isKnown(workspace.parameters, name) && !(meansOwn && isOwn(name)))
      m_diagnostics.reportParameter(
          Rule::UnknownReference, messages::kUnknownReference, parameter.line, document, type.getName(),
          type.getName() + QLatin1String(": ") + m_values.referenceText(name, m_parameterNames));
  }
}

void WorkspaceChecks::checkParameterUse(const Workspace& workspace) {
  const std::vector<GlobalParameters::Parameter>& all = workspace.parameters.all();
  // Who reads them is asked of every record of the document, so not in vain.
  if (std::all_of(all.begin(), all.end(), [](const auto& parameter) { return parameter.setInHeader; }))
    return;
  ReferencedNames names;
  collectReferences(names);
  // What the header sets may be read by the engine itself, and what belongs to the server by that.
  QSet<QString> readElsewhere;
  for (const GlobalParameterStruct& record : m_reader.GetGlobalParameterList(QString())) {
    if (record.isServer)
      readElsewhere.insert(GUIType::fromGuiLine(record.guiLine).getName());
  }
  for (const GlobalParameters::Parameter& parameter : all) {
    if (!parameter.setInHeader && !names.contains(parameter.name) && !readElsewhere.contains(parameter.name))
      m_diagnostics.report(Rule::UnusedParameter, parameter.line, QString(), {parameter.name});
  }
}
