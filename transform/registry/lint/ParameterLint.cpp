#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/core/Keywords.h>
#include <transform/core/StoredValue.h>
#include <transform/core/ValueReferences.h>
#include <transform/registry/lint/ParameterLint.h>
#include <transform/registry/loading/DefinitionKeywords.h>

using orx::Rule;

namespace {

const QLatin1String kMessageType("MESSAGE");
const QLatin1String kDividerType("DIVIDER");
const QLatin1String kCheckBoxType("CHECKBOX");
const QLatin1String kTicked("YES");
const QLatin1String kNotTicked("NO");

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

bool isNumberType(const QString& type, QLatin1String word) {
  return type == word || type == word + kOrAttributeSuffix;
}

bool isWholeNumberType(const QString& type) {
  return isNumberType(type, QLatin1String("INT")) || isNumberType(type, QLatin1String("INTEGER"));
}

}  // namespace

void ParameterLint::add(Rule rule, int line, const QString& text) {
  m_report.add(rule, m_definition.file(), line, text);
}

bool ParameterLint::check() {
  if (!checkLines()) {
    return false;
  }
  QHash<QString, int> seen;
  for (const LintedParameter& parameter : m_definition.parameters()) {
    if (parameter.name.isEmpty()) {
      add(Rule::BadValue, parameter.line, QStringLiteral("The parameter has no name"));
    } else if (seen.contains(parameter.name)) {
      add(Rule::DuplicateParameter, parameter.line,
          QStringLiteral("Parameter '%1' stands on line %2 already")
              .arg(parameter.name)
              .arg(seen[parameter.name]));
    } else {
      seen.insert(parameter.name, parameter.line);
    }
    if (parameter.prompt.isEmpty() && parameter.type.getType() != kDividerType) {
      add(Rule::MissingText, parameter.line,
          QStringLiteral("Parameter '%1' has no prompt").arg(parameter.name));
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
      add(Rule::ParameterLines, line.line.number, QStringLiteral("No parameter is named above this line"));
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
      add(Rule::ParameterLines, line.line.number,
          taken.isEmpty() ? QStringLiteral("No parameter is named for this %1").arg(kind.word)
          : taken == name
              ? QStringLiteral("Parameter '%1' has this %2 already").arg(name, kind.word)
              : QStringLiteral("This %1 is taken for parameter '%2', not '%3'; each parameter needs a line")
                    .arg(kind.word, taken, name));
    }
  }
  for (const LintedParameter& parameter : m_definition.parameters()) {
    if (parameter.type.isNull()) {
      isSound = false;
      if (!kinds[0].isTold) {
        add(Rule::ParameterLines, parameter.typeLine,
            QStringLiteral("Parameter '%1' has no type").arg(parameter.name));
      }
    }
  }
  return isSound;
}

void ParameterLint::checkType(const LintedParameter& parameter, const GUIType& type) {
  if (!type.isKnown()) {
    add(Rule::UnknownType, parameter.typeLine,
        QStringLiteral("There is no parameter type '%1'").arg(type.getType()));
  } else if (!type.valueIsEncoded() && hasEncodedForm(type)) {
    add(Rule::PlainTextType, parameter.typeLine,
        QStringLiteral("'%1' may hold any text, so its type needs to be %2%3")
            .arg(type.getName(), type.getType(), kEncodedSuffix));
  }
}

void ParameterLint::checkGroup(const LintedParameter& parameter) {
  for (const QString& member : ORX_splitConfig(parameter.type.getConfigToken(), QLatin1Char('%'))) {
    if (!m_definition.parameterNames().contains(member)) {
      add(Rule::UndeclaredParameter, parameter.typeLine,
          QStringLiteral("There is no parameter '%1' to frame").arg(member));
    }
  }
}

void ParameterLint::checkDefault(const LintedParameter& parameter) {
  if (parameter.type.getType() != kMultiParameterType) {
    checkDefault(parameter, parameter.type, parameter.defaultValue);
    return;
  }
  const MemberList members(parameter.type);
  const QStringList pieces = QORXSdfStringToList(parameter.defaultValue, members.separator());
  for (int i = 0; i + 1 < pieces.size(); i += 2) {
    if (const GUIType* member = members.find(pieces[i])) {
      checkDefault(parameter, *member, pieces[i + 1]);
    } else {
      add(Rule::UndeclaredParameter, parameter.defaultLine,
          QStringLiteral("'%1' has no member '%2'").arg(parameter.name, pieces[i]));
    }
  }
}

void ParameterLint::checkDefault(const LintedParameter& parameter, const GUIType& type,
                                 const QString& value) {
  const bool isUnset = isUnsetSetting(value);
  const bool isMark = value.startsWith(kAttributeMark) && type.mayHoldAttributeReference();
  const bool isReference = isMark ? withAttributeReference(type, value) != value
                                  : type.mayHoldAttributeReference() && beginsValueReference(value);
  if (isUnset || isReference || hasNoValue(type) || value.contains(kMacroOpen)) {
    return;
  }
  const auto refuse = [&](const QString& text) {
    add(Rule::BadDefault, parameter.defaultLine,
        QStringLiteral("Default of '%1': %2").arg(type.getName(), text));
  };
  if (isMark) {
    refuse(QStringLiteral("'%1' would be written as it stands; write @Value(%2)").arg(value, value.mid(1)));
  } else if (ORX_isChoiceType(type)) {
    ChoiceList choices(type);
    for (const QString& line : m_definition.fields().parameterLookups.value(parameter.name)) {
      choices.addLookup(line);
    }
    const QStringList values =
        ORX_isListBoxType(type) ? QORXStringToList(value, QLatin1Char(' ')) : QStringList(value);
    for (const QString& one : values) {
      // A list box may show a text with blanks, which then stands as it is.
      if (!choices.contains(one) && !choices.contains(value)) {
        refuse(QStringLiteral("'%1' is none of the choices").arg(one));
      }
    }
  } else if (type.getType() == kCheckBoxType) {
    const QStringList states = ORX_splitConfig(type.getConfigToken(), QLatin1Char('%'));
    if (states.isEmpty() ? value != kTicked && value != kNotTicked : !states.contains(value)) {
      refuse(QStringLiteral("'%1' is neither of the two values").arg(value));
    }
  } else if (isWholeNumberType(type.getType()) || isNumberType(type.getType(), QLatin1String("FLOAT"))) {
    bool isNumber = false;
    if (isWholeNumberType(type.getType())) {
      value.toLongLong(&isNumber);
    } else {
      value.toDouble(&isNumber);
    }
    if (!isNumber) {
      refuse(QStringLiteral("'%1' is no number").arg(value));
    }
  } else if (type.valueIsEncoded()) {
    // Lists are packed with commas, which are no part of the words.
    for (const QString& word : value.split(QLatin1Char(','))) {
      if (!QORXWwjdIsWellFormed(word)) {
        refuse(QStringLiteral("'%1' is not word-encoded; write %2")
                   .arg(word, QORXWwjdEncode(QORXWwjdDecode(word))));
      }
    }
  }
}
