#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/StoredValue.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/shared/ParameterTable.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/specialised/shared/TemplateText.h>
#include <transform/specialised/templates/XMLUpdaterTransformerCfg.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

namespace messages = orx::messages;

namespace {

const QLatin1String kDocument("DOCUMENT");
const QLatin1String kUpdates("UPDATES");
const QLatin1String kRemove("REMOVE");
const QLatin1String kTextKind("TEXT");
const QLatin1String kJsonRoot("$");

enum Column { kPath, kAction, kValue, kKind, kColumns };

// Steps joined by "/", or by "." in JSON, with conditions in square brackets. In JSON a step may be a bracket
// alone.
bool isPath(const QString& path, bool isJson) {
  const QLatin1Char separator(isJson ? '.' : '/');
  int depth = 0;
  int stepLength = 0;
  QChar quote;
  for (const QChar c : path) {
    ++stepLength;
    if (!quote.isNull()) {
      quote = c == quote ? QChar() : quote;
    } else if (depth > 0 && (c == QLatin1Char('"') || c == QLatin1Char('\''))) {
      quote = c;
    } else if (c == QLatin1Char('[')) {
      if (stepLength == 1 && !isJson) {
        return false;
      }
      ++depth;
    } else if (c == QLatin1Char(']')) {
      if (--depth < 0) {
        return false;
      }
    } else if (depth == 0 && c == separator) {
      if (stepLength == 1 && isJson) {
        return false;
      }
      stepLength = 0;
    } else if (depth == 0 && c.isSpace()) {
      return false;
    }
  }
  return depth == 0 && stepLength > 0 && (isJson || !path.contains(QLatin1String("///")));
}

// In JSON "$" stands for the root, which every path begins at.
QString fromRoot(const QString& encodedPath, bool isJson) {
  QString path = QORXWwjdDecode(encodedPath);
  if (isJson && path.startsWith(kJsonRoot)) {
    const bool hasSteps = path.size() > 1;
    path.remove(0, hasSteps && path.at(1) == QLatin1Char('.')   ? 2
                   : hasSteps && path.at(1) == QLatin1Char('[') ? 1
                                                                : 0);
  }
  return path;
}

}  // namespace

bool XMLUpdaterTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  return TransformerCfg::validateParameter(parameter, message) &&
         (parameter != kDocument || validateDocument(message)) &&
         (parameter != kUpdates || validateUpdates(message));
}

bool XMLUpdaterTransformerCfg::validateDocument(QString& message) const {
  for (const QString& value : possibleValues(getParameterValue(kDocument, UnpackLevel::Resolved))) {
    int line = 0;
    if (!isUnsetValue(value) && !isOpenValue(value) &&
        !TemplateText(value, TemplateText::languageOf(m_isJson))
             .isWellFormed(TemplateText::Extent::Document, line)) {
      return orx::refuse(message, messages::kNotWellFormed, {QString::number(line)});
    }
  }
  return true;
}

bool XMLUpdaterTransformerCfg::validateUpdates(QString& message) const {
  const ParameterTable updates(*this, kUpdates, kColumns, UnpackLevel::Resolved);
  for (int row = 0; row < updates.rowCount(); ++row) {
    for (const QString& path : possibleValues(updates.cell(row, kPath))) {
      if (!isOpenValue(path) && !isPath(fromRoot(path, m_isJson), m_isJson)) {
        return ParameterTable::refuseRow(message, row, messages::kBadPath, {QORXWwjdDecode(path)});
      }
    }
    if (updates.cell(row, kAction) == kRemove) {
      continue;
    }
    const QString value = updates.cell(row, kValue);
    if (isUnsetValue(value)) {
      return updates.refuseMissing(message, row, kValue);
    }
    if (updates.cell(row, kKind) == kTextKind) {
      continue;
    }
    for (const QString& part : possibleValues(value)) {
      int line = 0;
      if (!TemplateText(part, TemplateText::languageOf(m_isJson))
               .isWellFormed(TemplateText::Extent::Fragment, line)) {
        return ParameterTable::refuseRow(message, row, messages::kNotWellFormed, {QString::number(line)});
      }
    }
  }
  return true;
}

QString XMLUpdaterTransformerCfg::getParameterValueForMappingFile(const QString& name,
                                                                  const TransformParamCfg* parameter,
                                                                  MFBuffer& buffer) const {
  const TransformParamCfg* record = parameter ? parameter : getParameterByMacroName(name);
  ParameterTable updates(record, stripBasicStringInfo(getParameterValue(name)), kColumns);
  if (name != kUpdates || !updates.isValid()) {
    return TransformerCfg::getParameterValueForMappingFile(name, parameter, buffer);
  }
  for (int row = 0; row < updates.rowCount(); ++row) {
    if (updates.cell(row, kAction) == kRemove) {
      updates.setCell(row, kValue, QString());
    }
  }
  return textForMappingFile(updates.packed(), name, record, buffer);
}
