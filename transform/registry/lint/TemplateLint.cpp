#include <platform/orxparameter/orxparameter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/TokenScanner.h>
#include <transform/registry/lint/TemplateLint.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MappingFileKeywords.h>

#include <QRegularExpression>

using orx::Rule;

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
    : m_definition(definition), m_report(report) {
  for (const LintedParameter& parameter : definition.parameters()) {
    if (parameter.type.getFlag(kGUITypeOmittable)) {
      m_omittables.insert(parameter.name);
    }
  }
}

void TemplateLint::add(Rule rule, int line, const QString& text) {
  m_report.add(rule, m_definition.file(), line, text);
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
    add(Rule::BadStatement, line.number,
        QStringLiteral("Each line is a whole statement; write it on one line"));
  } else if (!keyword.match(line.text).hasMatch()) {
    add(Rule::BadStatement, line.number,
        QStringLiteral("Each line is a whole statement and begins with its keyword"));
  } else if (secondFactory.match(line.text).hasMatch()) {
    add(Rule::BadStatement, line.number,
        QStringLiteral("A second %1 needs a line of its own").arg(kFactoryStatement));
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
      add(Rule::UnknownPort, line, QStringLiteral("There is no input '%1'").arg(input));
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
    add(Rule::UnknownPort, line, QStringLiteral("There is no output '%1'").arg(output));
  }
  return true;
}

TemplateLint::LineTokens TemplateLint::takeTokens(const DefinitionLine& line) {
  LineTokens tokens;
  TokenScanner scanner(line.text);
  while (scanner.next()) {
    const QString token = scanner.name().toString();
    // A parameter may bear a name that looks like a port's.
    if (m_definition.parameterNames().contains(token) && !isInstanceToken(token)) {
      tokens.parameters.insert(token);
      m_used.insert(token);
    } else if (token == kValueListToken) {
      m_usesAllParameters = true;
    } else if (!isInstanceToken(token) && !takePortToken(token, line.number, tokens) &&
               !m_macros.contains(token) && !isGlobalMacro(token)) {
      add(Rule::UnknownToken, line.number,
          QStringLiteral("$(%1) names neither a parameter nor a port").arg(token));
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
    add(Rule::OutputRoute, line,
        QStringLiteral("A statement that routes an output holds both its _FTYPE and its _FUNCS token: %1")
            .arg(sortedList(half)));
  } else if (tokens.featureTypes.size() > 1) {
    add(Rule::OutputRoute, line,
        QStringLiteral("Each output is routed in a statement of its own: %1")
            .arg(sortedList(tokens.featureTypes)));
  } else if (tokens.hasInputs || !tokens.parameters.isEmpty()) {
    add(Rule::OutputRoute, line,
        QStringLiteral(
            "While %1 is not connected, this whole line goes away; route the output in a statement of "
            "its own")
            .arg(sortedList(tokens.featureTypes)));
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
    add(Rule::OmittableLine, line.number,
        QStringLiteral(
            "While %1 has no value, this whole line goes away; write %2$(%3) KEY VALUE on a line of its own")
            .arg(sortedList(omittables), kOption, kEncodedNameToken));
  }
}

void TemplateLint::checkUse() {
  if (m_definition.hasOwnClass()) {
    return;
  }
  const int line = m_definition.nameLine();
  for (const QString& tag : m_definition.inputs()) {
    if (!m_usesAllInputs && !m_usedInputs.contains(tag)) {
      add(Rule::UnusedPort, line, QStringLiteral("The template does not use input '%1'").arg(tag));
    }
  }
  for (const QString& tag : m_definition.outputs()) {
    if (!m_routedOutputs.contains(tag)) {
      add(Rule::UnusedPort, line, QStringLiteral("The template does not route output '%1'").arg(tag));
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
        add(Rule::UnplacedParameter, parameter.line,
            QStringLiteral("The template does not use parameter '%1'").arg(name));
      }
    }
  }
}
