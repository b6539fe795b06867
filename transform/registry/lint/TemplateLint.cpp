#include <platform/orxparameter/orxparameter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/TokenScanner.h>
#include <transform/registry/lint/TemplateLint.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>

#include <QRegularExpression>

using orx::Rule;
namespace messages = orx::messages;

namespace {

const QString kOption = kFactoryOptionStatement + QLatin1Char(' ');

// The tag of a port token, or an empty text.
QString tagOf(const QString& token, QLatin1String start, QLatin1String end) {
  const int size = token.size() - start.size() - end.size();
  return size > 0 && token.startsWith(start) && token.endsWith(end) ? token.mid(start.size(), size)
                                                                    : QString();
}

bool isInstanceToken(const QString& token) {
  return token == kUuidToken || token == kEncodedNameToken || token == kSchemaToken ||
         token == kIdentifierParameter;
}

// Pieces of the dialog are no parameters for the engine.
bool needsUse(const GUIType& type) {
  const QString& word = type.getType();
  return !word.contains(QLatin1String("GROUP")) && word != QLatin1String("MESSAGE") &&
         word != QLatin1String("DIVIDER");
}

QString sortedList(const QSet<QString>& names) {
  QStringList list = names.values();
  list.sort();
  return list.join(QLatin1String(", "));
}

}  // namespace

TemplateLint::TemplateLint(const LintedDefinition& definition, LintReport& report)
    : m_definition(definition), m_report(report), m_tokens(definition.parameterNames()) {
  QSet<QString> members;
  for (const LintedParameter& parameter : definition.parameters()) {
    const bool isOmittable = parameter.type.getFlag(kGUITypeOmittable);
    if (parameter.type.getType() == kMultiParameterType) {
      m_tokens.remove(parameter.name);
      const MemberList list(parameter.type);
      for (const GUIType& member : list.members()) {
        members.insert(member.getName());
        if (isOmittable || member.getFlag(kGUITypeOmittable)) {
          m_omittables.insert(member.getName());
        }
      }
    } else if (isOmittable) {
      m_omittables.insert(parameter.name);
    }
  }
  m_tokens += members;
}

void TemplateLint::add(Rule rule, long message, int line, const QStringList& arguments) {
  m_report.add(rule, message, m_definition.file(), line, arguments);
}

void TemplateLint::check() {
  collectMacros();
  for (const DefinitionLine& line : m_definition.text().templateLines) {
    if (line.text.isEmpty()) {
      continue;
    }
    checkStatement(line);
    const LineTokens tokens = takeTokens(line);
    checkOutputs(tokens, line.number);
    checkOmittables(tokens, line);
  }
  checkUse();
}

void TemplateLint::collectMacros() {
  for (const DefinitionLine& line : m_definition.text().templateLines) {
    const QStringList words = line.text.split(QLatin1Char(' '), Qt::SkipEmptyParts);
    if (words.size() > 1 &&
        (words[0] == QLatin1String("MACRO") || words[0] == QLatin1String("DEFAULT_MACRO"))) {
      m_macros.insert(words[1]);
    }
  }
}

void TemplateLint::checkStatement(const DefinitionLine& line) {
  static const QRegularExpression keyword(QStringLiteral("^(#|[A-Za-z_][A-Za-z0-9_]*( |$))"));
  static const QRegularExpression secondFactory(QStringLiteral("\\sFACTORY_DEF\\s"));
  if (line.text.endsWith(QLatin1Char('\\'))) {
    add(Rule::BadStatement, messages::kStatementContinued, line.number);
  } else if (!keyword.match(line.text).hasMatch()) {
    add(Rule::BadStatement, messages::kStatementNoKeyword, line.number);
  } else if (secondFactory.match(line.text).hasMatch()) {
    add(Rule::BadStatement, messages::kSecondStatement, line.number, {kFactoryStatement});
  }
}

bool TemplateLint::takePortToken(const QString& token, int line, LineTokens& tokens) {
  if (token == kInputLinesToken) {
    m_usesAllInputs = true;
    tokens.hasInputs = true;
    return true;
  }
  const QString input = tagOf(token, kInputTokenStart, kInputTokenEnd);
  const QString featureType = tagOf(token, kOutputTokenStart, kFeatureTypeTokenEnd);
  const QString functions = tagOf(token, kOutputTokenStart, kFunctionsTokenEnd);
  const QString output = featureType.isEmpty() ? functions : featureType;
  if (!input.isEmpty()) {
    tokens.hasInputs = true;
    m_usedInputs.insert(input);
    if (!m_definition.isInput(input) && !m_definition.hasOwnClass()) {
      add(Rule::UnknownPort, messages::kNoSuchInput, line, {input});
    }
    return true;
  }
  if (output.isEmpty()) {
    return false;
  }
  (featureType.isEmpty() ? tokens.functions : tokens.featureTypes).insert(output);
  if (!featureType.isEmpty()) {
    m_routedOutputs.insert(output);
  }
  if (!m_definition.isOutput(output) && !m_definition.hasOwnClass()) {
    add(Rule::UnknownPort, messages::kNoSuchOutput, line, {output});
  }
  return true;
}

TemplateLint::LineTokens TemplateLint::takeTokens(const DefinitionLine& line) {
  LineTokens tokens;
  TokenScanner scanner(line.text);
  while (scanner.next()) {
    const QString token = scanner.name().toString();
    // A parameter may bear a name that looks like a port's.
    if (m_tokens.contains(token) && !isInstanceToken(token)) {
      tokens.parameters.insert(token);
      m_used.insert(token);
    } else if (token == kValueListToken) {
      m_usesAllParameters = true;
    } else if (!isInstanceToken(token) && !takePortToken(token, line.number, tokens) &&
               !m_macros.contains(token) && !isGlobalMacro(token)) {
      add(Rule::UnknownToken, messages::kNoSuchToken, line.number, {token});
    }
  }
  return tokens;
}

void TemplateLint::checkOutputs(const LineTokens& tokens, int line) {
  if (tokens.featureTypes.isEmpty() && tokens.functions.isEmpty()) {
    return;
  }
  const QSet<QString> half =
      (tokens.featureTypes - tokens.functions) + (tokens.functions - tokens.featureTypes);
  if (!half.isEmpty()) {
    add(Rule::OutputRoute, messages::kHalfRoute, line, {sortedList(half)});
  } else if (tokens.featureTypes.size() > 1) {
    add(Rule::OutputRoute, messages::kTwoRoutes, line, {sortedList(tokens.featureTypes)});
  } else if (tokens.hasInputs || !tokens.parameters.isEmpty()) {
    add(Rule::OutputRoute, messages::kMixedRoute, line, {sortedList(tokens.featureTypes)});
  }
}

void TemplateLint::checkOmittables(const LineTokens& tokens, const DefinitionLine& line) {
  const QSet<QString> omittables = tokens.parameters & m_omittables;
  if (omittables.isEmpty()) {
    return;
  }
  const bool isOwn = line.text.startsWith(kOption) && tokens.parameters.size() == 1 && !tokens.hasInputs &&
                     tokens.featureTypes.isEmpty() && tokens.functions.isEmpty();
  if (!isOwn) {
    add(Rule::OmittableLine, messages::kOmittableLine, line.number,
        {sortedList(omittables),
         kOption + QLatin1String("$(") + kEncodedNameToken + QLatin1String(") KEY VALUE")});
  }
}

void TemplateLint::checkUse() {
  if (m_definition.hasOwnClass()) {
    return;
  }
  const int line = m_definition.nameLine();
  for (const QString& tag : m_definition.inputs()) {
    if (!m_usesAllInputs && !m_usedInputs.contains(tag)) {
      add(Rule::UnusedPort, messages::kUnusedInput, line, {tag});
    }
  }
  for (const QString& tag : m_definition.outputs()) {
    if (!m_routedOutputs.contains(tag)) {
      add(Rule::UnusedPort, messages::kUnroutedOutput, line, {tag});
    }
  }
  if (m_usesAllParameters) {
    return;
  }
  for (const LintedParameter& parameter : m_definition.parameters()) {
    const bool isGroupBy = parameter.name == m_definition.fields().multiProcess;
    QStringList names(parameter.name);
    const MemberList members(parameter.type);
    if (parameter.type.getType() == kMultiParameterType) {
      names.clear();
      for (const GUIType& member : members.members()) {
        names.append(member.getName());
      }
    }
    for (const QString& name : std::as_const(names)) {
      if (needsUse(parameter.type) && !isGroupBy && !m_used.contains(name) && name != kIdentifierParameter) {
        add(Rule::UnplacedParameter, messages::kUnplacedParameter, parameter.line, {name});
      }
    }
  }
}
