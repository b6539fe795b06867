#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <transform/findings/Refusal.h>
#include <transform/findings/RuleSettings.h>
#include <transform/workspace/DocumentCopy.h>
#include <transform/workspace/TransformerRecords.h>
#include <translation/CustomExtraction.h>
#include <translation/generation/CustomDefinitions.h>
#include <translation/generation/PreparedWorkspace.h>
#include <translation/graph/NetworkDiagnostics.h>
#include <translation/graph/ReferencedNames.h>
#include <translation/graph/WorkspaceBuilder.h>
#include <translation/graph/WorkspaceListener.h>
#include <translation/validation/WorkspaceChecks.h>

#include <QBuffer>
#include <QSet>

using orx::Rule;

namespace {

const QString kSubDocumentType = QStringLiteral("SubDocumentTransformer");
const QString kVersion = QStringLiteral("VERSION");
const QString kLastSaveBuild = QStringLiteral("LAST_SAVE_BUILD");
// One that was made a file of its own is meant to be shared.
const QLatin1String kLinked("Linked by Default");

// The name by which a record calls its transformer.
QString calledName(const TransformerStruct& record) {
  return record.kind == TransformerKind::SubDocument ? subDocumentName(record) : record.type;
}

QString yesOrNo(bool isSet) {
  return isSet ? QStringLiteral("yes") : QStringLiteral("no");
}

}  // namespace

CustomExtraction::CustomExtraction(const IXMLComponentReader& reader, const QStringList& headerLines,
                                   TransformerSource& source)
    : m_reader(reader), m_headerLines(headerLines), m_source(source) {
  for (const QString& line : headerLines)
    m_global.readHeaderLine(line, 0);
  for (const GlobalParameterStruct& record : reader.GetGlobalParameterList(QString()))
    m_global.declare(GUIType::fromGuiLine(record.guiLine).getName(), record.defaultValue, record.line);
}

QStringList CustomExtraction::names() const {
  QStringList names = m_reader.GetSubDocList();
  names.removeAll(QString());
  names.removeDuplicates();
  return names;
}

// As for the workspace that embeds it, which is refused for the same reasons.
bool CustomExtraction::judge(orx::Findings& diagnostics) {
  orx::Findings found(diagnostics.file());
  WorkspaceBuilder builder(m_source, found);
  builder.includeUnused();
  const std::unique_ptr<Workspace> workspace = builder.build(m_reader, diagnostics.file(), m_headerLines);
  const PreparedWorkspace prepared(*workspace, found);
  const orx::RuleSettings settings;
  WorkspaceChecks(m_reader, m_headerLines, m_source, settings, found)
      .check(*workspace, prepared.isConnected());
  bool isSound = true;
  for (const orx::Finding& finding : found.all()) {
    const QString part = finding.node.section(QLatin1Char('/'), 0, 0);
    // A node of the main document may bear the name.
    const bool isInside = m_parts.contains(part) && (finding.line == 0 || part != finding.node ||
                                                     finding.line >= m_reader.GetDocumentLine(part));
    if (finding.file != diagnostics.file() || !isInside ||
        settings.severity(finding.rule) != orx::Severity::Error)
      continue;
    diagnostics.add(finding);
    isSound = false;
  }
  return isSound;
}

bool CustomExtraction::prepare(const QString& name, int version, orx::Findings& diagnostics) {
  findParts(name);
  findWorkspaceParameters();
  if (!judge(diagnostics))
    return false;
  SubDocumentLibrary library(m_reader, &m_source);
  ExternalDocNetwork* network = library.network(name);
  if (!network || !makeDefinition(library, diagnostics))
    return false;
  const orx::RefusalListener listener;
  const QString fault = findPrefixFault(*network);
  if (!fault.isEmpty()) {
    diagnostics.reportText(Rule::Nesting, m_reader.GetDocumentLine(name), name, fault,
                           listener.refusal().message);
    return false;
  }
  const int stored = version > 0 ? version : network->getVersion();
  addFields(*network, stored);
  return makeDocument(name, stored, diagnostics);
}

void CustomExtraction::findParts(const QString& name) {
  const QStringList all = names();
  QSet<QString> known(all.begin(), all.end());
  QSet<QString> needed{name};
  QStringList open{name};
  while (!open.isEmpty()) {
    for (const TransformerStruct& record : m_reader.GetTransformerList(open.takeLast())) {
      const QString inner = calledName(record);
      if (!known.contains(inner) || needed.contains(inner))
        continue;
      needed.insert(inner);
      open.append(inner);
    }
  }
  m_parts.clear();
  for (const QString& part : all) {
    if (needed.contains(part))
      m_parts.append(part);
  }
}

void CustomExtraction::findWorkspaceParameters() {
  QSet<QString> needed;
  for (const QString& part : m_parts) {
    ReferencedNames names;
    QSet<QString> own;
    for (const GlobalParameterStruct& record : m_reader.GetGlobalParameterList(part)) {
      own.insert(GUIType::fromGuiLine(record.guiLine).getName());
      names.add(record.defaultValue);
    }
    for (const TransformerStruct& record : m_reader.GetTransformerList(part)) {
      for (const XformParmStruct& parameter : record.parameters)
        names.add(parameter.parmValue);
    }
    for (const GlobalParameters::Parameter& parameter : m_global.all()) {
      if (names.contains(parameter.name) && !own.contains(parameter.name))
        needed.insert(parameter.name);
    }
  }
  m_workspaceParameters.clear();
  for (const GlobalParameters::Parameter& parameter : m_global.all()) {
    if (needed.contains(parameter.name))
      m_workspaceParameters.append(parameter.name);
  }
}

bool CustomExtraction::makeDefinition(SubDocumentLibrary& library, orx::Findings& diagnostics) {
  m_definition.clear();
  const std::vector<ExternalDocNetwork*>& networks = library.networks();
  for (const ExternalDocNetwork* network : networks)
    reportNetworkProblems(*network, diagnostics.file(), diagnostics);
  if (diagnostics.hasErrors())
    return false;
  const WorkspaceListener surroundings(m_global);
  CustomDefinitions definitions(networks, networks.size(), surroundings);
  if (!definitions.prepare(diagnostics))
    return false;
  const CustomDefinition& itself = definitions.all().back();
  for (const CustomDefinition& definition : definitions.all()) {
    if (&definition != &itself)
      m_definition += QORXFromLocal8Bit(definition.block().trimmed()).split(QLatin1Char('\n')) << QString();
  }
  m_fields = itself.headerFields();
  m_definition += itself.lines();
  return true;
}

void CustomExtraction::addFields(const ExternalDocNetwork& network, int version) {
  const ParallelSettings parallel = network.getParallelSettings();
  m_fields[1] = QString::number(version);
  m_fields += {kLinked,          yesOrNo(network.blockedLooping()), parallel.parallelism,
               parallel.groupBy, parallel.processSetting,           QString::number(parallel.countSetting),
               QString(),        yesOrNo(network.isDeprecated()),   network.getPythonVersion()};
}

bool CustomExtraction::makeDocument(const QString& name, int version, orx::Findings& diagnostics) {
  m_document.clear();
  QBuffer buffer(&m_document);
  buffer.open(QIODevice::WriteOnly);
  XMLComponentWriter writer(&buffer, kTransformerDocument);
  writer.setEncoding("UTF-8");
  writer.setMiscParms(QString(), {{kLastSaveBuild, QString::number(TransformerCfg::kThisBuild)}});
  // The instance tells which of several sub-documents is the one.
  TransformerStruct instance;
  instance.identifier = 1;
  instance.type = kSubDocumentType;
  instance.version = version;
  XformParmStruct parameter;
  parameter.parmName = kSubDocumentNameParameter;
  parameter.parmValue = name;
  instance.parameters.push_back(parameter);
  writer.addTransformer(QString(), instance);
  for (const QString& part : m_parts) {
    copySections(m_reader, part, writer);
    QHash<QString, QString> settings = m_reader.GetSubDocParms(part);
    if (part == name)
      settings.insert(kVersion, QString::number(version));
    // It is this build that saves it.
    if (settings.contains(kLastSaveBuild))
      settings.insert(kLastSaveBuild, QString::number(TransformerCfg::kThisBuild));
    writer.setMiscParms(part, settings);
  }
  writer.writeDocument();
  writer.stream().flush();
  if (writer.getRefusal().isEmpty())
    return true;
  diagnostics.reportText(Rule::CustomTransformerFault, m_reader.GetDocumentLine(name), name,
                         writer.getRefusal());
  return false;
}
