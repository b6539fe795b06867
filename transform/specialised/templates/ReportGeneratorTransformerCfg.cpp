#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/StoredValue.h>
#include <transform/specialised/shared/ParameterTable.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/specialised/templates/ReportGeneratorTransformerCfg.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

#include <QUrl>

#include <algorithm>

namespace messages = orx::messages;

namespace {

const QLatin1String kParts("PARTS");

enum Column { kKind, kContent, kAttributes, kColumns };
enum class Use { No, Optional, Required };

struct Part {
  QLatin1String name;
  QLatin1String formerName;  // what earlier builds stored
  Use content;
  Use attributes;
  bool isAddress;  // the content is one
};

const Part* findPart(const QString& kind) {
  static const Part parts[] = {
      {QLatin1String("HEADING"), QLatin1String("HEADER"), Use::Required, Use::No, false},
      {QLatin1String("TEXT"), QLatin1String("PARAGRAPH"), Use::Required, Use::No, false},
      {QLatin1String("HTML"), QLatin1String(), Use::Required, Use::No, false},
      {QLatin1String("PICTURE"), QLatin1String("IMAGE"), Use::Required, Use::No, true},
      {QLatin1String("LINK"), QLatin1String(), Use::Required, Use::No, true},
      // The content is the caption.
      {QLatin1String("TABLE"), QLatin1String(), Use::Optional, Use::Required, false},
      {QLatin1String("LINE"), QLatin1String("SEPARATOR"), Use::No, Use::No, false},
  };
  const auto* found = std::find_if(std::begin(parts), std::end(parts), [&](const Part& part) {
    return kind == part.name || (part.formerName.size() > 0 && kind == part.formerName);
  });
  return found == std::end(parts) ? nullptr : found;
}

// Whether parts make use of the cell; of an unknown kind they may.
ParameterTable::IsUsed usedCells(const ParameterTable& parts) {
  return [&parts](int row, int column) {
    const Part* part = findPart(parts.cell(row, kKind));
    return !part || column == kKind || (column == kContent ? part->content : part->attributes) != Use::No;
  };
}

}  // namespace

QStringList ReportGeneratorTransformerCfg::getAttributeNamesInValue(const QString& parameter) const {
  const ParameterTable parts(*this, parameter, kColumns, UnpackLevel::Resolved);
  return parameter == kParts && parts.isValid() ? parts.attributeNames(usedCells(parts))
                                                : TransformerCfg::getAttributeNamesInValue(parameter);
}

bool ReportGeneratorTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  return TransformerCfg::validateParameter(parameter, message) &&
         (parameter != kParts || validateParts(message));
}

bool ReportGeneratorTransformerCfg::validateParts(QString& message) const {
  const ParameterTable parts(*this, kParts, kColumns, UnpackLevel::Resolved);
  for (int row = 0; row < parts.rowCount(); ++row) {
    const QString kind = parts.cell(row, kKind);
    if (isOpenValue(kind)) {
      continue;
    }
    const Part* part = findPart(kind);
    if (!part) {
      return ParameterTable::refuseRow(message, row, messages::kUnknownKind, {kind});
    }
    const QString content = parts.cell(row, kContent);
    for (const auto& [column, use] :
         {std::make_pair(kContent, part->content), std::make_pair(kAttributes, part->attributes)}) {
      if (use == Use::Required && isUnsetValue(parts.cell(row, column))) {
        return parts.refuseMissing(message, row, column);
      }
    }
    for (const QString& possible : part->isAddress ? possibleValues(content) : QStringList()) {
      const QString address = QORXWwjdDecode(possible);
      if (!isOpenValue(possible) && !QUrl(address, QUrl::StrictMode).isValid()) {
        return ParameterTable::refuseRow(message, row, messages::kNoAddress, {address});
      }
    }
  }
  return true;
}

QString ReportGeneratorTransformerCfg::getParameterValueForMappingFile(const QString& name,
                                                                       const TransformParamCfg* parameter,
                                                                       MFBuffer& buffer) const {
  const TransformParamCfg* record = parameter ? parameter : getParameterByMacroName(name);
  ParameterTable parts(record, stripBasicStringInfo(getParameterValue(name)), kColumns);
  if (name != kParts || !parts.isValid()) {
    return TransformerCfg::getParameterValueForMappingFile(name, parameter, buffer);
  }
  parts.clearUnused(usedCells(parts));
  return textForMappingFile(parts.packed(), name, record, buffer);
}

void ReportGeneratorTransformerCfg::autoUpgradeTransformer() {
  ParameterTable parts(*this, kParts, kColumns);
  parts.replaceAttributeMarks();
  for (int row = 0; row < parts.rowCount(); ++row) {
    if (const Part* part = findPart(parts.cell(row, kKind))) {
      parts.setCell(row, kKind, part->name);
    }
  }
  parts.upgrade(*this, kParts);
}
