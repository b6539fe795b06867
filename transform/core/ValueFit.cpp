#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/Keywords.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/ValueFit.h>
#include <transform/core/ValueReferences.h>
#include <transform/text/MacroText.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

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
const QLatin1Char kPartSeparator(';');

// What begins like a reference and is none stands for itself.
bool refersToMacro(const QString& value) {
  const std::vector<MacroReference> references = macroReferences(value);
  return std::any_of(references.begin(), references.end(),
                     [](const MacroReference& reference) { return reference.isClosed; });
}

// Whether the value is known as it stands.
bool isPlain(const GUIType& type, const QString& value) {
  if (isUnsetSetting(value) || value.startsWith(kConditionalPrefix) || refersToMacro(value) ||
      !valueReferences(type, value).empty())
    return false;
  const bool isFunction = value.startsWith(QLatin1Char('@')) && value.endsWith(QLatin1Char(')'));
  return !(isFunction && type.mayHoldAttributeReference());
}

QString expanded(const QString& value, const ExpandReferences& expand) {
  QString result = value;
  if (expand && refersToMacro(value))
    expand(result);
  return result;
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

// The results of a condition are formulas; those that are numbers as they stand are known.
ValueFit resultsFit(const GUIType& type, const QString& value, const ExpandReferences& expand) {
  if (!type.getType().startsWith(kSliderTypes))
    return ValueFit();
  const QStringList parts = value.mid(kConditionalPrefix.size()).split(kPartSeparator);
  for (int i = 0; i < parts.size(); ++i) {
    const bool isResult = i % 2 == 1 || i + 1 == parts.size();
    const QString result = isResult ? QORXWwjdDecode(expanded(parts.at(i), expand)) : QString();
    double number = 0;
    const ValueFit fit = readNumber(result, number) ? numberFit(type, result) : ValueFit();
    if (!fit.fits())
      return fit;
  }
  return ValueFit();
}

ValueFit partFit(const GUIType& type, const QString& stored, const ExpandReferences& expand) {
  if (stored.startsWith(kConditionalPrefix))
    return resultsFit(type, stored, expand);
  const QString part = expanded(stored, expand);
  const bool isNeeded = !type.getFlag(kGUITypeOptional) && !type.getDescription().isEmpty();
  if (part.isEmpty() && !stored.isEmpty() && isNeeded)
    return misfitOf(ValueFit::Misfit::Nothing, stored);
  return isPlain(type, part) ? numberFit(type, part) : ValueFit();
}

QStringList offeredBy(const single_choices::Choice& choice) {
  QStringList offered;
  if (choice.type.getType() == kCheckBoxType) {
    offered = ORX_splitConfig(choice.type.getConfigToken(), QLatin1Char('%'));
    if (offered.isEmpty())
      offered << kTicked << kNotTicked;
    return offered;
  }
  for (const auto& entry : choice.choices.entries())
    offered.append(entry.first);
  return offered;
}

// What is referred to is told only when it is used, and so is what a function gives.
bool isOffered(const single_choices::Choice& choice) {
  const bool isCall = choice.text.startsWith(QLatin1Char('@')) && choice.text.endsWith(QLatin1Char(')'));
  if (choice.refers || isUnsetSetting(choice.text) || (isCall && ORX_isChoiceType(choice.type)))
    return true;
  if (!ORX_isChoiceType(choice.type))
    return offeredBy(choice).contains(choice.text);
  return choice.choices.isEmpty() || choice.choices.contains(choice.text);
}

// Collects the choices that are not offered, as a function that replaces nothing.
single_choices::Replace collecting(std::vector<ValueFit>& misfits, const ExpandReferences& expand) {
  return [&misfits, &expand](const single_choices::Choice& choice) {
    const QString known = choice.refers ? expanded(choice.text, expand) : choice.text;
    if (known != choice.text && !known.startsWith(kConditionalPrefix)) {
      single_choices::replaceIn(choice.type, choice.choices, known, collecting(misfits, nullptr));
    } else if (!isOffered(choice)) {
      misfits.push_back(misfitOf(ValueFit::Misfit::Choice, choice.text, offeredBy(choice)));
      misfits.back().prompt = choice.type.getDescription();
    }
    return choice.text;
  };
}

}  // namespace

ValueFit ValueFit::of(const GUIType& type, const ChoiceList& choices, const QString& value) {
  std::vector<ValueFit> misfits;
  single_choices::replaceIn(type, choices, value, collecting(misfits, nullptr));
  if (!misfits.empty())
    return misfits.front();
  return partFit(type, value, nullptr);
}

std::vector<ValueFit> ValueFit::misfitsOf(const TransformParamCfg& parameter, const QString& value,
                                          const ExpandReferences& expand) {
  std::vector<ValueFit> misfits;
  if (parameter.getName() == kProcessCountParameter && value == kNoProcesses)
    return misfits;
  single_choices::replaceIn(parameter, value, collecting(misfits, expand));
  const bool isComposite = !parameter.members().members().empty();
  forEachPart(parameter, value, [&](const GUIType& type, const QString& stored) {
    const ValueFit fit = partFit(type, stored, expand);
    if (!fit.fits()) {
      misfits.push_back(fit);
      misfits.back().prompt = type.getDescription();
    }
  });
  for (ValueFit& fit : misfits)
    fit.prompt = isComposite ? fit.prompt : QString();
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
    case Misfit::Nothing:
      return messages::kRefersToNothing;
  }
  return 0;
}

orx::Rule ValueFit::rule() const {
  if (misfit == Misfit::Nothing)
    return orx::Rule::MissingValue;
  return misfit == Misfit::Choice ? orx::Rule::UnfitChoice : orx::Rule::UnfitNumber;
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
