#include <transform/scripts/blocks/ScriptRefusal.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

namespace messages = orx::messages;

namespace {

bool isBrokenSurrogate(const QString& text, int index) {
  const QChar character = text[index];
  if (character.isHighSurrogate()) {
    return index + 1 >= text.size() || !text[index + 1].isLowSurrogate();
  }
  return character.isLowSurrogate() && (index == 0 || !text[index - 1].isHighSurrogate());
}

}  // namespace

bool isFreeOf(const QString& text, const QString& specials) {
  for (int i = 0; i < text.size(); ++i) {
    const ushort code = text[i].unicode();
    if (code < 0x20 || code == 0x7f || specials.contains(text[i]) || isBrokenSurrogate(text, i)) {
      return false;
    }
  }
  return true;
}

bool isScriptableName(const QString& name) {
  static const QString kSpecials = QStringLiteral(" '\"\\$[](){}");
  return !name.isEmpty() && isFreeOf(name, kSpecials);
}

ScriptRefusal refuseUnwritableLines(const QStringList& codeLines) {
  for (int number = 1; number <= codeLines.size(); ++number) {
    const QString& line = codeLines[number - 1];
    for (int i = 0; i < line.size(); ++i) {
      if (line[i].isNull() || line[i] == QLatin1Char('\r') || isBrokenSurrogate(line, i)) {
        return {messages::kScriptCharacter, number};
      }
    }
    if (line.trimmed() == kIncludeEnd) {
      return {messages::kScriptBlockEnd, number};
    }
  }
  return {};
}

QString scriptRefusalText(const QString& parameterName, const ScriptRefusal& refusal) {
  const QString why = refusal.line > 0 ? TransformResString(refusal.message, QString::number(refusal.line))
                                       : TransformResString(refusal.message);
  return TransformResString(messages::kScriptRefused, {parameterName, why});
}

QString scriptNameRefusalText(const QString& parameterName, const QString& badName) {
  return TransformResString(messages::kScriptRefused,
                            {parameterName, TransformResString(messages::kScriptName, badName)});
}
