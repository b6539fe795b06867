// Prompt lines and type texts of parameters, their choices and their members.
#include <platform/orxparameter/orxparameter.h>
#include <transform/text/TextHelpers.h>

#include <fuzz/FuzzTarget.h>

namespace {

void tryType(const GUIType& type, const QString& value) {
  if (type.isNull()) {
    return;
  }
  const QString line = type.getAsString();
  if (type.isKnown()) {
    require(GUIType::fromGuiLine(line).getAsString() == line,
            "reading a written prompt line changes nothing");
  }
  require(
      GUIType::fromTransformerTypeString(type.getTypeText(), type.getName(), type.getDescription()) == type,
      "the type text gives the type back");
  const ChoiceList choices(type);
  for (const auto& entry : choices.entries()) {
    require(choices.contains(entry.first) && choices.contains(entry.second),
            "both sides of a choice are choices");
  }
  choices.toShown(value);
  choices.toStored(value);

  const MemberList members(type);
  for (const GUIType& member : members.members()) {
    const QString changed = members.withMemberValue(value, member.getName(), QStringLiteral("a \"b\", c"));
    require(members.memberValue(changed, member.getName()) == QLatin1String("a \"b\", c"),
            "a member's part can be set");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const QString text = textFromUtf8(data, size);
  const int lineEnd = text.indexOf(QLatin1Char('\n'));
  const QString line = text.left(lineEnd);
  const QString value = lineEnd < 0 ? QString() : text.mid(lineEnd + 1);

  const GUIType prompted = GUIType::fromGuiLine(line);
  if (prompted.isKnown()) {
    require(GUIType::fromGuiLine(prompted.getAsString()) == prompted, "a prompt line gives the type back");
  }
  tryType(prompted, value);
  tryType(GUIType::fromTransformerTypeString(line, QStringLiteral("NAME"), value), value);

  bool isFeature = false;
  bool isOutput = false;
  unsigned first = 0;
  unsigned second = 0;
  QString name;
  decodePortDescription(text, isFeature, isOutput, first, second, name);
  return 0;
}
