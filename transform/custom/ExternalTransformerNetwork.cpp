// Header, answers and lazy loading; what writes files stands in ExternalTransformerNetworkFiles.cpp.
#include <platform/orxutil/Decipher.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedQuestion.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/TransformerRecords.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceFile.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/XMLComponentReader.h>

#include <QFileInfo>
#include <QScopedValueRollback>

namespace messages = orx::messages;

namespace {

enum Field {
  kInsertMode = 4,
  kBlockedLooping = 5,
  kParallelism = 6,
  kGroupBy = 7,
  kProcessSetting = 8,
  kCountSetting = 9,
  kDeprecated = 11,
  kPython = 12,
};

const QLatin1String kYes("yes");
const QString kEmbeddedByDefault = QStringLiteral("Embedded by Default");
const QLatin1String kLinkedAlways("Linked Always");
const QString kTemporaryName = QStringLiteral("kx-custom-xform-ver-XXXXXX");

// The sub-document that is the custom transformer itself: the one that an instance in the main document
// names, else the one of its name, else the only one, else the main document.
QString bodyName(const IXMLComponentReader& reader, const QString& name) {
  const QStringList documents = reader.GetSubDocList();
  QStringList placed;
  for (const TransformerStruct& record : reader.GetTransformerList(QString())) {
    const QString named = subDocumentName(record);
    if (documents.contains(named))
      placed.append(named);
  }
  if (placed.contains(name) || (placed.isEmpty() && documents.contains(name)))
    return name;
  if (!placed.isEmpty())
    return placed.first();
  return documents.size() == 1 ? documents.first() : QString();
}

// Whose body the document says that it holds, when that is another custom transformer; else empty.
QString otherBody(const IXMLComponentReader& reader, const QString& body, const QString& name) {
  if (body.isEmpty() || body != name)
    return body;
  QStringList named;
  for (const TransformerStruct& record : reader.GetTransformerList(QString()))
    named.append(subDocumentName(record));
  named.removeAll(QString());
  return named.contains(name) ? QString() : named.value(0);
}

}  // namespace

ExternalTransformerNetwork::ExternalTransformerNetwork(const QString& fileName, int version,
                                                       TransformerSource* manager)
    : m_fileName(fileName), m_manager(manager), m_insertMode(kEmbeddedByDefault) {
  setAnswersWithSets(typeid(ExternalTransformerNetwork));
  setPythonVersion(QStringLiteral("27"));
  ParallelSettings parallel;
  parallel.parallelism = kNoParallelism;
  setParallelSettings(parallel);
  readHeader(version);
}

ExternalTransformerNetwork::~ExternalTransformerNetwork() = default;

void ExternalTransformerNetwork::readHeader(int version) {
  QString error;
  try {
    PlainFile plain(m_fileName, kTemporaryName);
    m_isLoaded = m_header.read(plain.fileName(), version, error);
  } catch (const WorkspaceLoaderException& exception) {
    error = exception.getMessage();
  }
  if (!error.isEmpty()) {
    addProblem(orx::Rule::CustomTransformerFault, messages::kNoBody, 0, QString(),
               TransformResString(messages::kNoBody, {getName(), m_fileName, error}));
  }
  if (!m_isLoaded)
    return;
  const QStringList& fields = m_header.fields;
  const auto has = [&](Field field) { return fields.size() > field; };
  setName(m_header.name());
  setVersion(m_header.version());
  setCategory(fields.at(2));
  setGUID(m_header.guid());
  if (has(kInsertMode))
    m_insertMode = fields.at(kInsertMode);
  takeBlockedLooping(fields.value(kBlockedLooping) == kYes);
  ParallelSettings parallel = ExternalDocNetwork::getParallelSettings();
  if (has(kParallelism) && parallelLevel(fields.at(kParallelism)) == fields.at(kParallelism))
    parallel.parallelism = fields.at(kParallelism);
  parallel.groupBy = fields.value(kGroupBy);
  parallel.processSetting = fields.value(kProcessSetting);
  parallel.countSetting = fields.value(kCountSetting).toInt();
  setParallelSettings(parallel);
  setDeprecated(fields.value(kDeprecated) == kYes);
  if (has(kPython))
    setPythonVersion(fields.at(kPython));
}

// --- the body ----------------------------------------------------------------------------------------------

void ExternalTransformerNetwork::takeIdentity(const QHash<QString, QString>& settings) {
  QHash<QString, QString> unknown = settings;
  if (m_settingsChanged || !m_header.fields.value(kBlockedLooping).isEmpty())
    unknown.remove(QStringLiteral("BLOCKED_LOOPING"));
  if (!m_header.fields.value(kPython).isEmpty())
    unknown.remove(QStringLiteral("PYTHON_COMPATIBILITY"));
  takeRunSettings(unknown);
}

void ExternalTransformerNetwork::forceLoad() {
  // Files may name each other in a long row: a row longer than custom transformers may nest is left where it
  // is, and the nesting refused when it is written.
  constexpr auto kKind = NestedQuestion::Kind::Body;
  if (isBodyLoaded() || m_isLoading || !m_manager || NestedQuestion::depth(kKind) > kDeepestNesting)
    return;
  const NestedQuestion question(kKind);
  const QScopedValueRollback<bool> loading(m_isLoading, true);
  m_isComplete = false;
  m_bodyFault.clear();
  m_lacksRoutine = false;
  clearProblems();
  try {
    loadBody();
  } catch (const WorkspaceLoaderException& exception) {
    m_lacksRoutine = lacksRoutine();
    m_bodyFault = m_lacksRoutine ? TransformResString(messages::kEncipheredBody, {getName(), m_fileName})
                                 : TransformResString(messages::kNoBody,
                                                      {getName(), m_fileName, exception.getMessage()});
    addProblem(orx::Rule::CustomTransformerFault,
               m_lacksRoutine ? messages::kEncipheredBody : messages::kNoBody, exception.line(), QString(),
               m_bodyFault);
    doneAdding(true);
  }
}

bool ExternalTransformerNetwork::isBodyLoaded() const {
  // A routine may be registered at any time.
  return !m_isLoaded || (m_isComplete && !(m_lacksRoutine && ORW_hasDecipherRoutine()));
}

bool ExternalTransformerNetwork::lacksRoutine() const {
  const VersionInfo version = findVersion(m_fileName);
  try {
    return !ORW_hasDecipherRoutine() && version.byteLength >= 0 &&
           VersionStore(m_fileName).read(version.byteOffset, version.byteLength).isUnreadable;
  } catch (const WorkspaceLoaderException&) {
    return false;
  }
}

VersionInfo ExternalTransformerNetwork::findVersion(const QString& fileName, int* count) const {
  QString error;
  const QList<VersionInfo> all = VersionStore(fileName).versions(error);
  if (count)
    *count = all.size();
  for (const VersionInfo& version : all) {
    if (version.byteOffset == m_header.byteOffset && version.name == m_header.name() &&
        version.version == m_header.version())
      return version;
  }
  VersionInfo none;
  none.byteLength = -1;
  return none;
}

void ExternalTransformerNetwork::loadBody() {
  PlainFile plain(m_fileName, kTemporaryName);
  const VersionInfo version = findVersion(plain.fileName());
  if (version.byteLength < 0)
    throw WorkspaceLoaderException(messages::kFileChanged, {m_fileName});
  XMLComponentReader reader;
  QStringList headerLines;
  WorkspaceFile::readVersion(reader, plain.fileName(), version, headerLines);
  m_library = std::make_unique<SubDocumentLibrary>(reader, m_manager);
  const QString body = bodyName(reader, getName());
  m_library->build(*this, body);
  const QString other = otherBody(reader, body, getName());
  if (!other.isEmpty()) {
    addProblem(orx::Rule::CustomTransformerFault, messages::kBodyOfOther, reader.GetDocumentLine(body),
               QString(), TransformResString(messages::kBodyOfOther, {getName(), other}));
  }
  m_library->forgetReader();
  for (const ExternalDocNetwork* inner : m_library->networks()) {
    for (const orx::Finding& problem : inner->problems())
      addProblem(problem);
  }
}

void ExternalTransformerNetwork::doneAdding(bool parametersChanged) {
  m_isComplete = true;
  ExternalDocNetwork::doneAdding(parametersChanged);
}

// A body that is read when it is first asked for is no change of the network.
void ExternalTransformerNetwork::ensureBody() const {
  if (!isBodyLoaded())
    const_cast<ExternalTransformerNetwork*>(this)->forceLoad();
}

QStringList ExternalTransformerNetwork::getInputs() const {
  ensureBody();
  return ExternalDocNetwork::getInputs();
}

QStringList ExternalTransformerNetwork::getOutputs() const {
  ensureBody();
  return ExternalDocNetwork::getOutputs();
}

QStringList ExternalTransformerNetwork::getLoops() const {
  ensureBody();
  return ExternalDocNetwork::getLoops();
}

const std::list<TransformerCfg*>& ExternalTransformerNetwork::getTransformers() const {
  ensureBody();
  return ExternalDocNetwork::getTransformers();
}

void ExternalTransformerNetwork::setInputAttributes(const QString& input, const QStringList& attributes) {
  forceLoad();
  ExternalDocNetwork::setInputAttributes(input, attributes);
}

void ExternalTransformerNetwork::setInputAttributes(const QHash<QString, QStringList>& attributes) {
  forceLoad();
  ExternalDocNetwork::setInputAttributes(attributes);
}

QStringList ExternalTransformerNetwork::getOutputAttributes(const QString& output,
                                                            QHash<QString, QString>& origins) const {
  ensureBody();
  return ExternalDocNetwork::getOutputAttributes(output, origins);
}

bool ExternalTransformerNetwork::hasTransformerNamed(const QString& identifier) const {
  ensureBody();
  return ExternalDocNetwork::hasTransformerNamed(identifier);
}

QStringList ExternalTransformerNetwork::getParameters() const {
  ensureBody();
  return ExternalDocNetwork::getParameters();
}

bool ExternalTransformerNetwork::hasParameter(const QString& name) const {
  ensureBody();
  return ExternalDocNetwork::hasParameter(name);
}

const CompoundTransformerParm* ExternalTransformerNetwork::getParameterInfo(const QString& name) const {
  ensureBody();
  return ExternalDocNetwork::getParameterInfo(name);
}

IncomingAttributePropogationMode ExternalTransformerNetwork::getIncomingAttributePropogationMode() const {
  ensureBody();
  return ExternalDocNetwork::getIncomingAttributePropogationMode();
}

QStringList ExternalTransformerNetwork::getUpstreamInputs(const QString& output) const {
  ensureBody();
  return ExternalDocNetwork::getUpstreamInputs(output);
}

QHash<QString, QString> ExternalTransformerNetwork::getProperties() const {
  ensureBody();
  return ExternalDocNetwork::getProperties();
}

QStringList ExternalTransformerNetwork::getDescriptionLines() const {
  ensureBody();
  return ExternalDocNetwork::getDescriptionLines();
}

// --- the header's answers ----------------------------------------------------------------------------------

QString ExternalTransformerNetwork::getFileName() const {
  return m_fileName;
}

int ExternalTransformerNetwork::getStartLine() const {
  return static_cast<int>(m_header.endLine);
}

int ExternalTransformerNetwork::getInsertMode() const {
  static const QStringList modes{kEmbeddedByDefault, QStringLiteral("Linked by Default"),
                                 QStringLiteral("Embedded Always"), QString(kLinkedAlways)};
  return qMax(modes.indexOf(m_insertMode), 0) + 1;
}

bool ExternalTransformerNetwork::getIsEmbeddable() const {
  return m_insertMode != kLinkedAlways;
}

bool ExternalTransformerNetwork::getIsDefinitionValid() const {
  return QFileInfo::exists(m_fileName) && ExternalDocNetwork::getIsDefinitionValid();
}

void ExternalTransformerNetwork::setBlockedLooping(bool blocked) {
  m_settingsChanged = true;
  ExternalDocNetwork::setBlockedLooping(blocked);
}

void ExternalTransformerNetwork::turnOffMultiProcessing() {
  m_settingsChanged = true;
  ExternalDocNetwork::turnOffMultiProcessing();
}
