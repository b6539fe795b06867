#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/parameters/ParameterDisplay.h>

namespace {

const QLatin1String kPasswordType("PASSWORD");
// Says nothing about the length of what it hides.
const QLatin1String kHiddenText("********");
const QLatin1String kPartSeparator(", ");
const QLatin1String kRowSeparator("; ");

}  // namespace

QString displayText(const GUIType& type, const ChoiceList& choices, const QString& value, bool isDecoded) {
  if (isUnsetValue(value)) {
    return QString();
  }
  if (type.getType().startsWith(kPasswordType)) {
    return kHiddenText;
  }
  const QString text = type.valueIsEncoded() && !isDecoded ? QORXWwjdDecode(value) : value;
  return choices.isEmpty() ? text : choices.toShown(text);
}

QString displayText(const TransformParamCfg& parameter, const QString& value, bool isDecoded) {
  if (parameter.members().members().empty()) {
    return displayText(parameter, parameter.choices(), value, isDecoded);
  }
  const bool isTable = parameter.isTable();
  const int columns = static_cast<int>(parameter.members().members().size());
  QString text;
  int index = 0;
  forEachPart(parameter, value, [&](const GUIType& type, const QString& part) {
    const QString shown = displayText(type, ChoiceList(type), part, isDecoded);
    if (index > 0) {
      text += isTable && index % columns == 0 ? kRowSeparator : kPartSeparator;
    }
    if (!isTable && !type.getDescription().isEmpty()) {
      text += type.getDescription() + QLatin1String(": ");
    }
    text += shown;
    ++index;
  });
  return text;
}
