// The part of TransformerCfg that judges parameter values.
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/TransformerSource.h>
#include <transform/findings/Refusal.h>
#include <transform/text/MessageNumbers.h>

#include <QUrlQuery>

#include <sys/stat.h>

using orx::Rule;
namespace messages = orx::messages;

namespace {

constexpr int kLongestMissingText = 100;

const orx::Refusal kMissing{Rule::MissingValue, messages::kMissingValue, true};
const orx::Refusal kNoConnection{Rule::UnknownConnection, messages::kUnknownConnection};

const QLatin1String kConnectionScheme("orx://");
const QLatin1String kConnectionSchemeEncoded("orx:<solidus><solidus>");
const QLatin1String kConnectionItem("connection");
const QLatin1String kFilenameMustExist("FILENAME_MUSTEXIST");
const QLatin1String kFileMustExist("FILEMUSTEXIST");
const QLatin1String kNamedConnection("NAMED_CONNECTION");
const QLatin1String kNamedDatabaseConnection("NAMED_DB_CONNECTION");

QString quotedNames(const QStringList& names) {
  const QLatin1Char quote('\'');
  QString text;
  for (const QString& name : names) {
    if (!text.isEmpty()) {
      text += QLatin1Char(' ');
    }
    text += quote + name + quote;
    if (text.size() > kLongestMissingText) {
      return text.left(kLongestMissingText);
    }
  }
  return text;
}

// The connection that a reference orx://...?connection=NAME names.
QString connectionName(const QString& reference) {
  QString url = reference;
  if (url.startsWith(kConnectionSchemeEncoded)) {
    url = QORXWwjdDecode(url);
  }
  const int mark = url.indexOf(QLatin1Char('?'));
  const int end = url.indexOf(QLatin1Char('#'));
  const int start = mark < 0 ? kConnectionScheme.size() : mark + 1;
  const QUrlQuery query(url.mid(start, end < 0 ? -1 : std::max(0, end - start)));
  return query.queryItemValue(kConnectionItem, QUrl::FullyDecoded);
}

bool isPlainFile(const QString& path) {
  if (path.contains(QChar(QChar::Null))) {
    return false;
  }
  struct stat status;
  return ::stat(QORXToLocal8Bit(path).constData(), &status) == 0 && !S_ISDIR(status.st_mode);
}

std::vector<TransformParamCfg> columnRecords(const MemberList& columns) {
  std::vector<TransformParamCfg> records;
  records.reserve(columns.members().size());
  for (const GUIType& column : columns.members()) {
    records.emplace_back(column);
  }
  return records;
}

}  // namespace

bool TransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  if (!record) {
    return false;
  }
  const QString value = getParameterValue(parameter, UnpackLevel::Stored);
  const QString& prompt = record->getDescription();
  if (prompt.isEmpty()) {
    return true;
  }
  if (value.isEmpty()) {
    if (record->getFlag(kGUITypeOptional)) {
      return true;
    }
    return orx::refuse(message, kMissing, {prompt});
  }
  if (value == kUnusedValue) {
    return true;
  }
  const QString& type = record->getType();
  if (type.startsWith(kAttributeType) &&
      (type.contains(kAllowNew) || record->getConfigToken().contains(kAllowNew))) {
    return true;
  }
  if (record->isMultiParameter()) {
    QString missingPrompt;
    if (!checkMembers(value, *record, record->members(), missingPrompt)) {
      return orx::refuse(message, {Rule::MissingValue, messages::kMissingValue}, {missingPrompt});
    }
  }
  QStringList missing;
  bool hasReferences = false;
  getMissingAttributeReferences(parameter, missing, hasReferences);
  if (!missing.isEmpty()) {
    return orx::refuse(message, {Rule::MissingAttribute, messages::kMissingAttribute},
                       {quotedNames(missing)});
  }
  if (hasReferences && !record->isTable()) {
    return true;
  }
  if (m_listener && m_listener->acceptsValue(*this, parameter, value)) {
    return true;
  }
  if (value.startsWith(kConnectionScheme) || value.startsWith(kConnectionSchemeEncoded)) {
    const QString name = connectionName(value);
    if (!isConnectionKnown(QORXWwjdEncode(name))) {
      return orx::refuse(message, kNoConnection, {name});
    }
  }
  const bool isConditional = value.startsWith(kConditionalPrefix);
  if (type.startsWith(kFilenameMustExist) || (type.startsWith(kFileMustExist) && !isConditional)) {
    return validateFile(*record, parameter, message);
  }
  if (record->getTypeWithConfig() == kTextEncodedType) {
    return QORXWwjdIsWellFormed(value);
  }
  if (m_listener && !isConditional &&
      (type.startsWith(kNamedConnection) || type.startsWith(kNamedDatabaseConnection))) {
    const QString resolved = getParameterValue(parameter, UnpackLevel::Resolved);
    const QString encoded = record->valueIsEncoded() ? resolved : QORXWwjdEncode(resolved);
    if (isConnectionKnown(encoded)) {
      return true;
    }
    return orx::refuse(message, kNoConnection, {QORXWwjdDecode(encoded)});
  }
  return !record->isTable() ||
         validateTableValues(parameter, columnRecords(record->members()),
                             getParameterTableValuesAsParts(parameter, UnpackLevel::Stored), message);
}

bool TransformerCfg::isConnectionKnown(const QString& encodedName) const {
  return m_definitionDirectory && m_definitionDirectory->isConnectionKnown(encodedName);
}

bool TransformerCfg::validateFile(const TransformParamCfg& record, const QString& parameter,
                                  QString& message) const {
  QString path = getParameterValue(parameter, UnpackLevel::Resolved);
  if (record.valueIsEncoded()) {
    path = QORXWwjdDecode(path);
  }
  path = resolveUserTypedMacro(path, UnpackLevel::Resolved);
  return isPlainFile(path) || orx::refuse(message, {Rule::MissingFile, messages::kMissingFile}, {path});
}

bool TransformerCfg::validateParameters(QString& message) const {
  const QStringList names = getParameters();
  for (const QString& name : names) {
    if (!validateParameter(name, message)) {
      return false;
    }
  }
  return true;
}

bool TransformerCfg::validateParameters(QStringList& names, QHash<QString, QString>& messages) const {
  bool isValid = true;
  for (const QString& name : std::as_const(names)) {
    QString message;
    if (!validateParameter(name, message)) {
      messages.insert(name, message);
      isValid = false;
    }
  }
  return isValid;
}

bool TransformerCfg::checkMultiParameterForMissingValues(const QString& value, const QString& type,
                                                         QString& missingPrompt) const {
  const GUIType parsed = GUIType::fromTransformerTypeString(type);
  return checkMembers(value, parsed, MemberList(parsed), missingPrompt);
}

bool TransformerCfg::checkMembers(const QString& value, const GUIType& type, const MemberList& members,
                                  QString& missingPrompt) const {
  if (value.isEmpty()) {
    return true;
  }
  const QStringList parts = QORXSdfStringToList(value, members.separator());
  const MemberList* known =
      m_definitionDirectory && !parts.isEmpty() ? m_definitionDirectory->memberDefinitions(type) : nullptr;
  const MemberList& definitions = known ? *known : members;
  for (int i = 0; i < parts.size() - 1; i += 2) {
    const GUIType* member = parts[i] == kControllerQueryFile ? nullptr : definitions.find(parts[i]);
    if (!member) {
      continue;
    }
    missingPrompt = member->getDescription();
    if (!member->getFlag(kGUITypeOptional) && parts[i + 1].isEmpty()) {
      return false;
    }
  }
  return true;
}

bool TransformerCfg::validateTableValues(const QString& parameter,
                                         const std::vector<TransformParamCfg>& columns,
                                         const QStringList& cells, QString& message) const {
  if (columns.empty()) {
    return true;
  }
  for (int i = 0; i < cells.size(); ++i) {
    const TransformParamCfg& column = columns[static_cast<std::size_t>(i) % columns.size()];
    if (cells[i].isEmpty() && !column.getFlag(kGUITypeOptional)) {
      return orx::refuse(message, kMissing, {getParameterPrompt(parameter)});
    }
  }
  return true;
}
