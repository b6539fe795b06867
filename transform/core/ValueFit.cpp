#include <platform/qorxcore/Lists.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/ValueFit.h>
#include <transform/core/ValueReferences.h>
#include <transform/text/MacroText.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QHash>

#include <algorithm>
#include <cmath>

namespace messages = orx::messages;

namespace {

constexpr int kMostOffered = 12;

const QLatin1String kCheckBoxType("CHECKBOX");
const QLatin1String kTicked("YES");
const QLatin1String kNotTicked("NO");
const QLatin1String kIntegerTypes("INT");
const QLatin1String kFloatTypes("FLOAT");
const QLatin1String kSliderTypes("RANGE_SLIDER");
// What also turns parallelism off.
const QLatin1String kNoProcesses("NO");

// Whether the value is known as it stands.
bool isPlain(const GUIType& type, const QString& value) {
  const std::vector<MacroReference> references = macroReferences(value);
  // What begins like a reference and is none stands for itself.
  const bool refers = std::any_of(references.begin(), references.end(),
                                  [](const MacroReference& reference) { return reference.isClosed; });
  if (isUnsetSetting(value) || value.startsWith(kConditionalPrefix) || refers ||
      !valueReferences(value).empty())
    return false;
  const bool isFunction = value.startsWith(QLatin1Char('@')) && value.endsWith(QLatin1Char(')'));
  const bool isEvaluated = type.mayHoldAttributeReference() || ORX_isChoiceType(type);
  return !(isFunction && isEvaluated);
}

bool isWholeNumber(const QString& text) {
  const QString digits = text.trimmed();
  const bool isSigned = digits.startsWith(QLatin1Char('-')) || digits.startsWith(QLatin1Char('+'));
  return digits.size() > (isSigned ? 1 : 0) &&
         std::all_of(digits.begin() + (isSigned ? 1 : 0), digits.end(),
                     [](QChar c) { return c >= QLatin1Char('0') && c <= QLatin1Char('9'); });
}

bool readNumber(const QString& text, double& number) {
  bool isNumber = false;
  number = text.trimmed().toDouble(&isNumber);
  return isNumber && std::isfinite(number);
}

ValueFit misfitOf(ValueFit::Misfit kind, const QString& value, const QStringList& offered = QStringList()) {
  ValueFit fit;
  fit.misfit = kind;
  fit.value = value;
  fit.offered = offered;
  return fit;
}

ValueFit numberFit(const GUIType& type, const QString& value) {
  const QString& word = type.getType();
  if (word.startsWith(kIntegerTypes))
    return isWholeNumber(value) ? ValueFit() : misfitOf(ValueFit::Misfit::WholeNumber, value);
  const bool isSlider = word.startsWith(kSliderTypes);
  if (!isSlider && !word.startsWith(kFloatTypes))
    return ValueFit();
  double number = 0;
  if (!readNumber(value, number))
    return misfitOf(ValueFit::Misfit::Number, value);
  if (!isSlider)
    return ValueFit();
  const QStringList range = ORX_splitConfig(type.getConfigToken(), QLatin1Char('%')).mid(0, 2);
  double smallest = 0;
  double largest = 0;
  const bool hasRange = range.size() == 2 && readNumber(range[0], smallest) && readNumber(range[1], largest);
  return hasRange && (number < smallest || number > largest) ? misfitOf(ValueFit::Misfit::Range, value, range)
                                                             : ValueFit();
}

ValueFit choiceFit(const GUIType& type, const ChoiceList& choices, const QString& value) {
  // A list box may show a text with blanks, which then stands as it is.
  if (choices.isEmpty() || choices.contains(value))
    return ValueFit();
  const QStringList values =
      ORX_isListBoxType(type) ? QORXStringToList(value, QLatin1Char(' ')) : QStringList(value);
  const auto strange =
      std::find_if(values.begin(), values.end(), [&](const QString& one) { return !choices.contains(one); });
  if (strange == values.end())
    return ValueFit();
  QStringList offered;
  for (const auto& entry : choices.entries())
    offered.append(entry.first);
  return misfitOf(ValueFit::Misfit::Choice, *strange, offered);
}

}  // namespace

ValueFit ValueFit::of(const GUIType& type, const ChoiceList& choices, const QString& value) {
  if (!isPlain(type, value))
    return ValueFit();
  if (ORX_isChoiceType(type))
    return choiceFit(type, choices, value);
  if (type.getType() != kCheckBoxType)
    return numberFit(type, value);
  QStringList states = ORX_splitConfig(type.getConfigToken(), QLatin1Char('%'));
  if (states.isEmpty())
    states << kTicked << kNotTicked;
  return states.contains(value) ? ValueFit() : misfitOf(Misfit::Choice, value, states);
}

std::vector<ValueFit> ValueFit::misfitsOf(const TransformParamCfg& parameter, const QString& value) {
  std::vector<ValueFit> misfits;
  if (parameter.getName() == kProcessCountParameter && value == kNoProcesses)
    return misfits;
  const auto add = [&](ValueFit fit, const QString& prompt) {
    if (fit.fits())
      return;
    fit.prompt = prompt;
    misfits.push_back(fit);
  };
  if (parameter.members().members().empty()) {
    add(of(parameter, parameter.choices(), value), QString());
    return misfits;
  }
  // The rows of a table share the types of its columns.
  QHash<const GUIType*, ChoiceList> choices;
  forEachPart(parameter, value, [&](const GUIType& type, const QString& part) {
    if (!choices.contains(&type))
      choices.insert(&type, ChoiceList(type));
    add(of(type, choices[&type], part), type.getDescription());
  });
  return misfits;
}

long ValueFit::message() const {
  switch (misfit) {
    case Misfit::None:
      break;
    case Misfit::Choice:
      return messages::kUnfitChoice;
    case Misfit::Number:
      return messages::kUnfitNumber;
    case Misfit::WholeNumber:
      return messages::kNoWholeNumber;
    case Misfit::Range:
      return messages::kUnfitRange;
  }
  return 0;
}

QString ValueFit::text() const {
  if (misfit == Misfit::Range)
    return TransformResString(message(), {value, offered.value(0), offered.value(1)});
  if (misfit != Misfit::Choice)
    return fits() ? QString() : TransformResString(message(), value);
  QStringList shown = offered.mid(0, kMostOffered);
  if (shown.size() < offered.size())
    shown.append(QStringLiteral("\u2026"));
  return TransformResString(message(), {value, shown.join(QLatin1String(", "))});
}
