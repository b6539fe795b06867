#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/StoredValue.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/shared/ParameterTable.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/specialised/templates/ChartGeneratorTransformerCfg.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

#include <QSet>

namespace messages = orx::messages;

namespace {

constexpr int kSmallestSize = 16;
constexpr int kLargestSize = 16384;

const QLatin1String kChartType("CHART_TYPE");
const QLatin1String kSeries("SERIES");
const QLatin1String kWidth("WIDTH");
const QLatin1String kHeight("HEIGHT");
const QLatin1String kBar("BAR");
const QLatin1String kFormerBar("COLUMN");
const QLatin1String kPie("PIE");
const QLatin1String kHistogram("HISTOGRAM");

enum Column { kLabel, kPosition, kValue, kColumns };

}  // namespace

bool ChartGeneratorTransformerCfg::isKind(const QString& kind, UnpackLevel level) const {
  const TransformParamCfg* type = getParameterByMacroName(kChartType);
  return type && type->choices().toStored(getParameterValue(kChartType, level)) == kind;
}

bool ChartGeneratorTransformerCfg::usesPositions(UnpackLevel level) const {
  return !isKind(kHistogram, level);
}

QStringList ChartGeneratorTransformerCfg::getAttributeNamesInValue(const QString& parameter) const {
  if (parameter != kSeries) {
    return TransformerCfg::getAttributeNamesInValue(parameter);
  }
  const ParameterTable series(*this, kSeries, kColumns, UnpackLevel::Resolved);
  const bool withPositions = usesPositions(UnpackLevel::Resolved);
  return series.isValid()
             ? series.attributeNames([&](int, int column) { return column != kPosition || withPositions; })
             : TransformerCfg::getAttributeNamesInValue(parameter);
}

bool ChartGeneratorTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  if (!TransformerCfg::validateParameter(parameter, message)) {
    return false;
  }
  if (parameter == kSeries) {
    return validateSeries(message);
  }
  return (parameter != kWidth && parameter != kHeight) || validateSize(parameter, message);
}

bool ChartGeneratorTransformerCfg::validateSize(const QString& parameter, QString& message) const {
  const QString value = getParameterValue(parameter, UnpackLevel::Resolved);
  const bool isConditional = value.startsWith(kConditionalPrefix);
  for (const QString& possible : possibleValues(value)) {
    const QString text = isConditional ? QORXWwjdDecode(possible) : possible;
    bool isNumber = false;
    const int size = text.toInt(&isNumber);
    // The results of conditions are formulas.
    const bool isKnown = isNumber || (!isConditional && !isOpenValue(text) && !isUnsetValue(text));
    if (isKnown && (!isNumber || size < kSmallestSize || size > kLargestSize)) {
      return orx::refuse(message, messages::kOutOfRange,
                         {text, QString::number(kSmallestSize), QString::number(kLargestSize)});
    }
  }
  return true;
}

bool ChartGeneratorTransformerCfg::validateSeries(QString& message) const {
  const ParameterTable series(*this, kSeries, kColumns, UnpackLevel::Resolved);
  const bool needsPositions = usesPositions(UnpackLevel::Resolved);
  QSet<QString> labels;
  for (int row = 0; row < series.rowCount(); ++row) {
    for (const int column : {kPosition, kValue}) {
      if (isUnsetValue(series.cell(row, column)) && (column == kValue || needsPositions)) {
        return series.refuseMissing(message, row, column);
      }
    }
    const QString label = series.cell(row, kLabel);
    if (labels.contains(label)) {
      return ParameterTable::refuseRow(message, row, messages::kLabelTwice);
    }
    if (!isUnsetValue(label)) {
      labels.insert(label);
    }
  }
  if (series.rowCount() > 1 && isKind(kPie, UnpackLevel::Resolved)) {
    return orx::refuse(message, messages::kOneSeries);
  }
  return true;
}

QString ChartGeneratorTransformerCfg::getParameterValueForMappingFile(const QString& name,
                                                                      const TransformParamCfg* parameter,
                                                                      MFBuffer& buffer) const {
  const TransformParamCfg* record = parameter ? parameter : getParameterByMacroName(name);
  ParameterTable series(record, stripBasicStringInfo(getParameterValue(name)), kColumns);
  if (name != kSeries || !series.isValid()) {
    return TransformerCfg::getParameterValueForMappingFile(name, parameter, buffer);
  }
  // A kind that only the mapping file tells may use everything.
  const bool withPositions = usesPositions(UnpackLevel::Stored);
  series.clearUnused([&](int, int column) { return column != kPosition || withPositions; });
  for (int row = 0; row < series.rowCount(); ++row) {
    if (isUnsetValue(series.cell(row, kLabel))) {
      series.setCell(row, kLabel, series.cell(row, kValue));
    }
  }
  return textForMappingFile(series.packed(), name, record, buffer);
}

void ChartGeneratorTransformerCfg::autoUpgradeTransformer() {
  ParameterTable series(*this, kSeries, kColumns);
  series.replaceAttributeMarks();
  series.upgrade(*this, kSeries);
  if (getParameterValue(kChartType) == kFormerBar) {
    applyParameterValue(kChartType, kBar);
    setAutoUpgraded(true);
  }
}
