#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/core/Keywords.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/ValueFit.h>
#include <transform/core/ValueReferences.h>
#include <transform/core/ValueShape.h>
#include <transform/registry/lint/ParameterLint.h>
#include <transform/registry/loading/DefinitionKeywords.h>
#include <transform/text/MessageNumbers.h>

using orx::Rule;
namespace messages = orx::messages;

namespace {

const QLatin1String kMessageType("MESSAGE");
const QLatin1String kDividerType("DIVIDER");

bool isGroup(const GUIType& type) {
  return type.getType().contains(QLatin1String("GROUP"));
}

// Whether the parameter is no more than a piece of the dialog.
bool hasNoValue(const GUIType& type) {
  return isGroup(type) || type.getType() == kMessageType || type.getType() == kDividerType;
}

bool hasEncodedForm(const GUIType& type) {
  return ORX_findGuiType(type.getType() + kEncodedSuffix) != nullptr;
}

}  // namespace

void ParameterLint::add(Rule rule, long message, int line, const QStringList& arguments) {
  m_report.add(rule, message, m_definition.file(), line, arguments);
}

bool ParameterLint::check() {
  if (!checkLines()) {
    return false;
  }
  QHash<QString, int> seen;
  for (const LintedParameter& parameter : m_definition.parameters()) {
    if (parameter.name.isEmpty()) {
      add(Rule::BadValue, messages::kNamelessParameter, parameter.line);
    } else if (seen.contains(parameter.name)) {
      add(Rule::DuplicateParameter, messages::kDuplicateParameter, parameter.line,
          {parameter.name, QString::number(seen[parameter.name])});
    } else {
      seen.insert(parameter.name, parameter.line);
    }
    if (parameter.prompt.isEmpty() && parameter.type.getType() != kDividerType) {
      add(Rule::MissingText, messages::kNoPrompt, parameter.line, {parameter.name});
    }
    checkType(parameter, parameter.type);
    const MemberList members(parameter.type);
    for (const GUIType& member : members.members()) {
      checkType(parameter, member);
    }
    if (isGroup(parameter.type)) {
      checkGroup(parameter);
    }
    checkDefault(parameter);
  }
  return true;
}

// The n-th line of each keyword belongs to the n-th name, so that one left out shifts all that follow.
bool ParameterLint::checkLines() {
  bool isSound = true;
  struct Kind {
    QLatin1String word;
    int count = 0;
    bool isTold = false;
  };
  Kind kinds[] = {{kParameterType}, {kParameterPrompt}, {kParameterDefault}};
  int names = 0;
  QString name;
  for (const LintedDefinition::HeaderLine& line : m_definition.header()) {
    if (!line.keyword) {
      continue;
    }
    if (line.keyword->word == kParameterName) {
      ++names;
      name = line.value;
    } else if (line.keyword->word == kParameterLookup && names == 0) {
      isSound = false;
      add(Rule::ParameterLines, messages::kLineAboveParameters, line.line.number);
    }
    for (Kind& kind : kinds) {
      if (line.keyword->word != kind.word) {
        continue;
      }
      ++kind.count;
      if (kind.count == names || kind.isTold) {
        continue;
      }
      kind.isTold = true;
      isSound = false;
      const QString taken = m_definition.fields().parameterNames.value(kind.count - 1);
      if (taken.isEmpty()) {
        add(Rule::ParameterLines, messages::kLineWithoutParameter, line.line.number, {kind.word});
      } else if (taken == name) {
        add(Rule::ParameterLines, messages::kLineTwice, line.line.number, {name, kind.word});
      } else {
        add(Rule::ParameterLines, messages::kShiftedLine, line.line.number, {kind.word, taken, name});
      }
    }
  }
  for (const LintedParameter& parameter : m_definition.parameters()) {
    if (parameter.type.isNull()) {
      isSound = false;
      if (!kinds[0].isTold) {
        add(Rule::ParameterLines, messages::kNoType, parameter.typeLine, {parameter.name});
      }
    }
  }
  return isSound;
}

void ParameterLint::checkType(const LintedParameter& parameter, const GUIType& type) {
  if (!type.isKnown()) {
    add(Rule::UnknownType, messages::kNoSuchType, parameter.typeLine, {type.getType()});
  } else if (!type.valueIsEncoded() && hasEncodedForm(type)) {
    add(Rule::PlainTextType, messages::kPlainTextType, parameter.typeLine,
        {type.getName(), type.getType() + kEncodedSuffix});
  }
}

void ParameterLint::checkGroup(const LintedParameter& parameter) {
  for (const QString& member : ORX_splitConfig(parameter.type.getConfigToken(), QLatin1Char('%'))) {
    if (!m_definition.parameterNames().contains(member)) {
      add(Rule::UndeclaredParameter, messages::kNoParameterToFrame, parameter.typeLine, {member});
    }
  }
}

void ParameterLint::checkDefault(const LintedParameter& parameter) {
  const MemberList members(parameter.type);
  if (parameter.type.getType() == kTableType && !members.members().empty()) {
    const QString fault = value_shape::fault(TransformParamCfg(parameter.type), parameter.defaultValue);
    if (!isUnsetValue(parameter.defaultValue) && !fault.isEmpty()) {
      add(Rule::BadDefault, messages::kDefaultUnfit, parameter.defaultLine, {parameter.name, fault});
    }
    const QStringList cells = QORXSdfStringToList(parameter.defaultValue, members.separator());
    for (int i = 0; i < cells.size(); ++i) {
      checkDefault(parameter, members.members()[static_cast<std::size_t>(i) % members.members().size()],
                   cells[i]);
    }
    return;
  }
  if (parameter.type.getType() != kMultiParameterType) {
    checkDefault(parameter, parameter.type, parameter.defaultValue);
    return;
  }
  const QStringList pieces = QORXSdfStringToList(parameter.defaultValue, members.separator());
  for (int i = 0; i + 1 < pieces.size(); i += 2) {
    if (const GUIType* member = members.find(pieces[i])) {
      checkDefault(parameter, *member, pieces[i + 1]);
    } else {
      add(Rule::UndeclaredParameter, messages::kNoSuchMember, parameter.defaultLine,
          {parameter.name, pieces[i]});
    }
  }
}

void ParameterLint::checkDefault(const LintedParameter& parameter, const GUIType& type,
                                 const QString& value) {
  const bool isUnset = isUnsetSetting(value);
  const bool isMark = value.startsWith(kAttributeMark) && type.mayHoldAttributeReference();
  const bool isReference =
      isMark ? withAttributeReference(type, value) != value
             : type.mayHoldAttributeReference() && beginsValueReference(value, referenceForms(type, value));
  if (isUnset || isReference || hasNoValue(type) || value.contains(kMacroOpen)) {
    return;
  }
  const auto refuse = [&](long message, const QStringList& what) {
    add(Rule::BadDefault, message, parameter.defaultLine, QStringList(type.getName()) + what);
  };
  if (isMark) {
    refuse(messages::kDefaultNoReference, {value, value.mid(1)});
    return;
  }
  ChoiceList choices(type);
  for (const QString& line : m_definition.fields().parameterLookups.value(parameter.name)) {
    choices.addLookup(line);
  }
  const ValueFit fit = ValueFit::of(type, choices, value);
  if (!fit.fits()) {
    refuse(messages::kDefaultUnfit, {fit.text()});
  } else if (type.valueIsEncoded()) {
    // Lists are packed with commas, which are no part of the words.
    for (const QString& word : value.split(QLatin1Char(','))) {
      if (!QORXWwjdIsWellFormed(word)) {
        refuse(messages::kDefaultNotEncoded, {word, QORXWwjdEncode(QORXWwjdDecode(word))});
      }
    }
  }
}
