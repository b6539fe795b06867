#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Formula.h>
#include <transform/core/FormulaChecks.h>
#include <transform/core/StoredValue.h>
#include <transform/core/ValueReferences.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/conditions/TesterTransformerCfg.h>
#include <transform/specialised/shared/ParameterTable.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

#include <QRegularExpression>

#include <algorithm>

namespace messages = orx::messages;

namespace {

const QLatin1String kTests("TESTS");
const QLatin1String kCombination("COMBINATION");
const QLatin1String kExpression("EXPRESSION");
const QLatin1String kByExpression("EXPRESSION");
const QLatin1String kMatches("MATCHES");

// The columns of the table.
enum Column { kLeft, kComparison, kRight, kColumns };

struct Comparison {
  QLatin1String name;
  QLatin1String symbol;  // what earlier builds stored
  bool takesRight;
  bool needsAttribute;  // the attribute on the left has to be there
};

const Comparison* findComparison(const QString& text) {
  static const Comparison comparisons[] = {
      {QLatin1String("EQUALS"), QLatin1String("="), true, true},
      {QLatin1String("DIFFERS"), QLatin1String("!="), true, true},
      {QLatin1String("LESS"), QLatin1String("<"), true, true},
      {QLatin1String("AT_MOST"), QLatin1String("<="), true, true},
      {QLatin1String("GREATER"), QLatin1String(">"), true, true},
      {QLatin1String("AT_LEAST"), QLatin1String(">="), true, true},
      {QLatin1String("CONTAINS"), QLatin1String(), true, true},
      {QLatin1String("BEGINS_WITH"), QLatin1String(), true, true},
      {QLatin1String("ENDS_WITH"), QLatin1String(), true, true},
      {kMatches, QLatin1String(), true, true},
      {QLatin1String("ONE_OF"), QLatin1String(), true, true},
      {QLatin1String("FILLED"), QLatin1String(), false, true},
      {QLatin1String("EMPTY"), QLatin1String(), false, true},
      {QLatin1String("EXISTS"), QLatin1String(), false, false},
      {QLatin1String("MISSING"), QLatin1String(), false, false},
  };
  const auto* found = std::find_if(std::begin(comparisons), std::end(comparisons), [&](const Comparison& c) {
    return text == c.name || (c.symbol.size() > 0 && text == c.symbol);
  });
  return found == std::end(comparisons) ? nullptr : found;
}

// A whole reference as the name that it holds, since the attribute's value cannot tell whether it is there.
QString attributeNameOf(const QString& encoded) {
  return isValueReference(encoded) ? valueReferences(encoded).front().word : encoded;
}

// Whether the formula joins numbers of tests by words, and there are as many; `message` says what is wrong.
bool namesTests(const Formula& formula, int count, QString& message) {
  for (const Formula::Token& token : formula.tokens()) {
    const bool isWord = token.text.at(0).isLetter();
    if (token.kind == Formula::Kind::Open || token.kind == Formula::Kind::Close ||
        ((token.kind == Formula::Kind::Operator || token.kind == Formula::Kind::Sign) && isWord)) {
      continue;
    }
    bool isNumber = false;
    const int test = token.text.toInt(&isNumber);
    if (token.kind != Formula::Kind::Number || !isNumber) {
      return orx::refuse(message, messages::kNoTestNumber, {token.text});
    }
    if (test < 1 || test > count) {
      return orx::refuse(message, messages::kUnknownTest, {token.text, QString::number(count)});
    }
  }
  return true;
}

}  // namespace

bool TesterTransformerCfg::parameterSupportsAttributeReference(const QString& parameter) const {
  return parameter != kExpression && TransformerCfg::parameterSupportsAttributeReference(parameter);
}

void TesterTransformerCfg::getMissingAttributeReferences(const QString& parameter, QStringList& missing,
                                                         bool& hasReferences) const {
  TransformerCfg::getMissingAttributeReferences(parameter, missing, hasReferences);
  if (parameter != kTests || missing.isEmpty()) {
    return;
  }
  const ParameterTable tests(*this, kTests, kColumns, UnpackLevel::Resolved);
  if (!tests.isValid()) {
    return;
  }
  const QStringList needed = tests.attributeNames([&](int row, int column) {
    const Comparison* comparison = findComparison(tests.cell(row, kComparison));
    return !comparison || column == kComparison ||
           (column == kLeft ? comparison->needsAttribute : comparison->takesRight);
  });
  const QSet<QString> kept(needed.begin(), needed.end());
  missing.erase(std::remove_if(missing.begin(), missing.end(),
                               [&](const QString& name) { return !kept.contains(name); }),
                missing.end());
}

bool TesterTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  if (!TransformerCfg::validateParameter(parameter, message)) {
    return false;
  }
  if (parameter == kTests) {
    return validateTests(message);
  }
  return parameter != kExpression || validateExpression(message);
}

bool TesterTransformerCfg::validateTests(QString& message) const {
  const ParameterTable tests(*this, kTests, kColumns, UnpackLevel::Resolved);
  for (int row = 0; row < tests.rowCount(); ++row) {
    const QString name = tests.cell(row, kComparison);
    const QString right = tests.cell(row, kRight);
    if (isOpenValue(name)) {
      continue;
    }
    const Comparison* comparison = findComparison(name);
    if (!comparison) {
      return orx::refuse(message, messages::kUnknownComparison, {QString::number(row + 1), name});
    }
    if (comparison->takesRight && isUnsetValue(right)) {
      return tests.refuseMissing(message, kRight);
    }
    for (const QString& possible : comparison->name == kMatches ? possibleValues(right) : QStringList()) {
      const QString pattern = QORXWwjdDecode(possible);
      if (!isOpenValue(possible) && !QRegularExpression(pattern).isValid()) {
        return orx::refuse(message, messages::kBadPattern, {pattern});
      }
    }
  }
  return true;
}

bool TesterTransformerCfg::validateExpression(QString& message) const {
  const TransformParamCfg* combination = getParameterByMacroName(kCombination);
  const QString mode = getParameterValue(kCombination, UnpackLevel::Resolved);
  if (!combination || combination->choices().toStored(mode) != kByExpression) {
    return true;
  }
  const QString value = getParameterValue(kExpression, UnpackLevel::Resolved);
  if (isUnsetValue(value)) {
    return orx::refuse(message, {orx::Rule::MissingValue, messages::kMissingValue, true},
                       {getParameterPrompt(kExpression)});
  }
  const TransformParamCfg* expression = getParameterByMacroName(kExpression);
  if (!checkFormulas(*expression, value, message)) {
    return false;
  }
  // Conditions are about attributes.
  const QStringList formulas =
      value.startsWith(kConditionalPrefix) ? QStringList() : formulasIn(*expression, value);
  const int count = ParameterTable(*this, kTests, kColumns).rowCount();
  return std::all_of(formulas.begin(), formulas.end(),
                     [&](const QString& text) { return namesTests(Formula(text), count, message); });
}

QString TesterTransformerCfg::getParameterValueForMappingFile(const QString& name,
                                                              const TransformParamCfg* parameter,
                                                              MFBuffer& buffer) const {
  const TransformParamCfg* record = parameter ? parameter : getParameterByMacroName(name);
  ParameterTable tests(record, stripBasicStringInfo(getParameterValue(name)), kColumns);
  if (name != kTests || !tests.isValid()) {
    return TransformerCfg::getParameterValueForMappingFile(name, parameter, buffer);
  }
  for (int row = 0; row < tests.rowCount(); ++row) {
    if (const Comparison* comparison = findComparison(tests.cell(row, kComparison))) {
      tests.setCell(row, kComparison, comparison->name);
      tests.setCell(row, kRight, comparison->takesRight ? tests.cell(row, kRight) : QString());
      if (!comparison->needsAttribute) {
        tests.setCell(row, kLeft, attributeNameOf(tests.cell(row, kLeft)));
      }
    }
  }
  return textForMappingFile(tests.packed(), name, record, buffer);
}

void TesterTransformerCfg::autoUpgradeTransformer() {
  ParameterTable tests(*this, kTests, kColumns);
  tests.replaceAttributeMarks();
  for (int row = 0; row < tests.rowCount(); ++row) {
    if (const Comparison* comparison = findComparison(tests.cell(row, kComparison))) {
      tests.setCell(row, kComparison, comparison->name);
    }
  }
  tests.upgrade(*this, kTests);
}
