#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerSource.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/ScriptParameters.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MessageStrings.h>
#include <translation/WorkspaceDocument.h>
#include <translation/WorkspaceValidation.h>
#include <translation/generation/MappingFileWriter.h>
#include <translation/graph/ReferencedNames.h>
#include <translation/graph/WorkspaceBuilder.h>
#include <translation/validation/DocumentChecks.h>
#include <translation/validation/FitChecks.h>
#include <translation/validation/FlowChecks.h>
#include <translation/validation/ValueChecks.h>

#include <algorithm>

using orx::Rule;
using orx::Severity;

namespace {

constexpr long kDeprecatedOnly = 370861;

class Validation {
 public:
  Validation(const WorkspaceDocument& document, TransformerSource& source, const orx::RuleSettings& settings,
             orx::Findings& diagnostics)
      : m_reader(document.reader()),
        m_headerLines(document.headerLines()),
        m_source(source),
        m_diagnostics(diagnostics),
        m_values(diagnostics, settings) {}

  void run();

 private:
  using Records = QHash<int, const TransformerStruct*>;  // by identifier, the first of each

  static Records byIdentifier(const ORXTValSlist<TransformerStruct>& list);
  void checkBuild();
  void checkTransformers(const Workspace& workspace, bool isConnected);
  void checkInside(const ExternalDocNetwork& network, const Workspace& workspace);
  void checkAge(const TransformerCfg& cfg, int line, const QString& title);
  void checkParameterValues(const Workspace& workspace);
  void checkParameterValue(const Workspace& workspace, const GlobalParameterStruct& parameter,
                           const GUIType& type, const QString& document);
  void checkParameterUse(const Workspace& workspace);
  void collectReferences(ReferencedNames& names) const;
  bool isKnown(const GlobalParameters& parameters, const QString& name) const;

  const IXMLComponentReader& m_reader;
  const QStringList& m_headerLines;
  TransformerSource& m_source;
  orx::Findings& m_diagnostics;
  ValueChecks m_values;
  ORXTValSlist<TransformerStruct> m_transformers;  // of the main document
  QStringList m_parameterNames;
  bool m_includesOthers = false;       // the header takes in files that may set further parameters
  QHash<QString, int> m_newestByName;  // -1: not known outside the document
};

void Validation::run() {
  checkBuild();
  WorkspaceBuilder builder(m_source, m_diagnostics);
  builder.includeUnused();
  const std::unique_ptr<Workspace> workspace = builder.build(m_reader, m_diagnostics.file(), m_headerLines);
  MappingFileWriter writer(*workspace, m_diagnostics);
  writer.prepare();

  for (const GlobalParameters::Parameter& parameter : workspace->parameters.all())
    m_parameterNames.append(parameter.name);
  m_includesOthers = std::any_of(m_headerLines.begin(), m_headerLines.end(), [](const QString& line) {
    return line.startsWith(QLatin1String("INCLUDE "));
  });
  checkTransformers(*workspace, writer.isConnected());
  for (const ExternalDocNetwork* network : workspace->customTransformers())
    checkInside(*network, *workspace);
  checkParameterValues(*workspace);
  checkParameterUse(*workspace);
  fit_checks::checkParameters(m_reader, workspace->parameters, m_diagnostics);
}

Validation::Records Validation::byIdentifier(const ORXTValSlist<TransformerStruct>& list) {
  Records records;
  for (const TransformerStruct& record : list) {
    if (!records.contains(record.identifier))
      records.insert(record.identifier, &record);
  }
  return records;
}

void Validation::checkBuild() {
  const QString build = m_reader.GetMiscParm(QStringLiteral("LAST_SAVE_BUILD"));
  if (build.toInt() > TransformerCfg::kThisBuild)
    m_diagnostics.report(Rule::NewerBuild, m_reader.GetDocumentLine(QString()), QString(),
                         {build, QString::number(TransformerCfg::kThisBuild)});
}

bool Validation::isKnown(const GlobalParameters& parameters, const QString& name) const {
  return m_includesOthers || parameters.find(name) || isGlobalMacro(name);
}

void Validation::checkTransformers(const Workspace& workspace, bool isConnected) {
  const FlowChecks flow(workspace);
  flow.report(m_diagnostics);
  m_transformers = m_reader.GetTransformerList(QString());
  const Records records = byIdentifier(m_transformers);
  const auto knows = [&](const QString& name) { return isKnown(workspace.parameters, name); };
  for (std::size_t number = 0; number < workspace.nodes.size(); ++number) {
    const WorkspaceNode& node = workspace.nodes[number];
    const TransformerStruct* record = node.isTransformer() ? records.value(node.identifier) : nullptr;
    if (!record)
      continue;
    m_values.check({*node.cfg, *record, node.name, node.parameterLines,
                    isConnected && flow.knowsWhatArrives(static_cast<int>(number))},
                   knows, m_parameterNames);
    fit_checks::checkTransformer(*node.cfg, node.parameterLines, node.name, m_diagnostics);
    checkAge(*node.cfg, node.line, node.name);
  }
}

void Validation::checkInside(const ExternalDocNetwork& network, const Workspace& workspace) {
  reportFlowsInside(network, m_reader, m_diagnostics);
  const ORXTValSlist<TransformerStruct> list = m_reader.GetTransformerList(network.getName());
  const Records records = byIdentifier(list);
  const QStringList names = network.getParameters();
  const auto knows = [&](const QString& name) {
    return network.hasParameter(name) || isKnown(workspace.parameters, name);
  };
  for (const SubDocNetworkObj* object : network.nodes()) {
    const auto* node = dynamic_cast<const SubDocNetworkObjXformer*>(object);
    const TransformerStruct* record = node ? records.value(node->number()) : nullptr;
    if (!record)
      continue;
    const TransformerCfg& cfg = *node->getTransformer();
    const QString title = network.getName() + QLatin1Char('/') + node->name();
    m_values.check({cfg, *record, title, node->parameterLines(), /*knowsWhatArrives=*/false}, knows, names);
    fit_checks::checkTransformer(cfg, node->parameterLines(), title, m_diagnostics);
    checkAge(cfg, record->line, title);
  }
}

void Validation::checkAge(const TransformerCfg& cfg, int line, const QString& title) {
  const QString name = cfg.getName();
  const CompoundTransformerNetwork* network = networkOf(&cfg);
  if (cfg.isDeprecated() || (network && network->isDeprecated())) {
    if (cfg.replacedBy().isEmpty())
      m_diagnostics.reportText(Rule::Deprecated, line, title, TransformResString(kDeprecatedOnly, name));
    else
      m_diagnostics.report(Rule::Deprecated, line, title, {name, cfg.replacedBy()});
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
    m_diagnostics.report(Rule::NewerVersion, line, title,
                         {name, QString::number(cfg.getVersion()), QString::number(newest.value())});
}

void Validation::collectReferences(ReferencedNames& names) const {
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
  addTransformers(m_transformers);
  for (const QString& document : m_reader.GetSubDocList())
    addTransformers(m_reader.GetTransformerList(document));
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
void Validation::checkParameterValues(const Workspace& workspace) {
  for (const QString& document : QStringList(QString()) + m_reader.GetSubDocList()) {
    for (const GlobalParameterStruct& parameter : m_reader.GetGlobalParameterList(document)) {
      const GUIType type = GUIType::fromGuiLine(parameter.guiLine);
      if (scriptLanguage(type) == ScriptLanguage::None)
        checkParameterValue(workspace, parameter, type, document);
    }
  }
}

void Validation::checkParameterValue(const Workspace& workspace, const GlobalParameterStruct& parameter,
                                     const GUIType& type, const QString& document) {
  for (const QString& name : ReferencedNames::inValue(parameter.defaultValue)) {
    if (!isKnown(workspace.parameters, name))
      m_diagnostics.reportParameter(
          Rule::UnknownReference, parameter.line, document, type.getName(),
          type.getName() + QLatin1String(": ") + m_values.referenceText(name, m_parameterNames));
  }
}

void Validation::checkParameterUse(const Workspace& workspace) {
  ReferencedNames names;
  collectReferences(names);
  // What the header sets may be read by the engine itself, and what belongs to the server by that.
  QSet<QString> readElsewhere;
  for (const GlobalParameterStruct& record : m_reader.GetGlobalParameterList(QString())) {
    if (record.isServer)
      readElsewhere.insert(GUIType::fromGuiLine(record.guiLine).getName());
  }
  for (const GlobalParameters::Parameter& parameter : workspace.parameters.all()) {
    if (!parameter.setInHeader && !names.contains(parameter.name) && !readElsewhere.contains(parameter.name))
      m_diagnostics.report(Rule::UnusedParameter, parameter.line, QString(), {parameter.name});
  }
}

std::vector<orx::Finding> inDocumentOrder(const orx::Findings& diagnostics) {
  std::vector<orx::Finding> findings = diagnostics.all();
  std::stable_sort(findings.begin(), findings.end(),
                   [&](const orx::Finding& left, const orx::Finding& right) {
                     const bool isLeftOther = left.file != diagnostics.file();
                     const bool isRightOther = right.file != diagnostics.file();
                     if (isLeftOther != isRightOther)
                       return isRightOther;
                     if (left.file != right.file)
                       return left.file < right.file;
                     return left.line < right.line;
                   });
  return findings;
}

}  // namespace

int ValidationReport::count(Severity severity) const {
  return static_cast<int>(
      std::count_if(findings.begin(), findings.end(),
                    [severity](const orx::Finding& finding) { return finding.severity == severity; }));
}

ValidationReport validateWorkspace(const QString& fileName, TransformerSource& source,
                                   const orx::RuleSettings& settings) {
  ValidationReport report;
  report.file = InputFile::shownName(fileName);
  orx::Findings diagnostics(report.file);
  WorkspaceDocument document(fileName);
  switch (document.read(diagnostics, report.readError)) {
    case WorkspaceDocument::Reading::Unreadable:
      return report;
    case WorkspaceDocument::Reading::Refused:
      break;
    case WorkspaceDocument::Reading::Done:
      Validation(document, source, settings, diagnostics).run();
      checkDocument(document, diagnostics);
      break;
  }
  report.findings = settings.apply(inDocumentOrder(diagnostics));
  return report;
}
