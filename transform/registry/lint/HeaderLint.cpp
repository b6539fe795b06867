#include <transform/core/AttributeRules.h>
#include <transform/core/Keywords.h>
#include <transform/core/RenameMapping.h>
#include <transform/registry/lint/HeaderLint.h>
#include <transform/registry/loading/DefinitionKeywords.h>
#include <transform/text/MessageNumbers.h>

#include <QRegularExpression>

#include <algorithm>

using orx::Rule;
namespace messages = orx::messages;

namespace {

const QLatin1Char kColon(':');
const QLatin1String kEveryOutput("<ALL>");

bool isBlankText(const QStringList& lines) {
  return std::all_of(lines.begin(), lines.end(), [](const QString& line) { return line.isEmpty(); });
}

// The version before the first colon of a mapping, or -1.
int mappedVersion(const QString& token, int& end) {
  end = 0;
  const int colon = token.indexOf(kColon);
  bool isNumber = false;
  const int version = token.left(std::max(colon, 0)).toInt(&isNumber);
  if (!isNumber || version < 0) {
    return -1;
  }
  end = colon + 1;
  return version;
}

}  // namespace

void HeaderLint::add(Rule rule, long message, int line, const QStringList& arguments) {
  m_report.add(rule, message, m_definition.file(), line, arguments);
}

void HeaderLint::check() {
  QHash<QString, int> seen;
  for (const LintedDefinition::HeaderLine& line : m_definition.header()) {
    if (!line.keyword) {
      add(Rule::UnknownKeyword, messages::kNoKeyword, line.line.number, {line.line.text});
      continue;
    }
    const KeywordKind kind = line.keyword->kind;
    if (kind == KeywordKind::Text || kind == KeywordKind::Number || kind == KeywordKind::Flag) {
      int& first = seen[line.keyword->word];
      if (first != 0) {
        add(Rule::RepeatedKeyword, messages::kRepeatedKeyword, line.line.number,
            {line.keyword->word, QString::number(first)});
      }
      first = line.line.number;
    }
    checkValue(line);
    checkReferences(line);
  }
  if (m_definition.fields().name.isEmpty()) {
    add(Rule::BadValue, messages::kNamelessTransformer, m_definition.line());
  }
  checkTexts();
}

void HeaderLint::checkValue(const LintedDefinition::HeaderLine& line) {
  const int number = line.line.number;
  const QString word = line.keyword->word;
  switch (line.keyword->kind) {
    case KeywordKind::Number: {
      bool isNumber = false;
      if (line.value.toInt(&isNumber) < 0 || !isNumber) {
        add(Rule::BadValue, messages::kNeedsNumber, number, {word, line.value});
      }
      break;
    }
    case KeywordKind::Flag:
      if (flagValue(line.value) < 0) {
        add(Rule::BadValue, messages::kNeedsTruth, number, {word, line.value});
      }
      break;
    case KeywordKind::Modes:
      for (const QString& mode : splitDefinitionList(line.value)) {
        if (featureHoldingBit(mode) == 0) {
          add(Rule::BadValue, messages::kNeedsMode, number, {word, mode});
        }
      }
      break;
    case KeywordKind::Lookup:
      if (line.value.isEmpty()) {
        add(Rule::BadValue, messages::kNeedsLookup, number, {word});
      }
      break;
    case KeywordKind::TagDescription: {
      QString tag;
      QString description;
      if (!splitTagDescription(line.value, tag, description)) {
        add(Rule::BadValue, messages::kNeedsTagText, number, {word});
      } else if (!m_definition.isInput(tag) && !m_definition.isOutput(tag)) {
        add(Rule::UnknownPort, messages::kNoSuchPort, number, {tag});
      }
      break;
    }
    default:
      break;
  }
}

void HeaderLint::checkReferences(const LintedDefinition::HeaderLine& line) {
  using Fields = TransformerDefinition;
  const DefinitionKeyword& keyword = *line.keyword;
  const int number = line.line.number;
  if (keyword.text == &Fields::multiProcess) {
    if (!m_definition.parameterNames().contains(line.value)) {
      add(Rule::UndeclaredParameter, messages::kNoParameterToGroupBy, number, {line.value});
    }
  } else if (keyword.list == &Fields::listActions) {
    checkListAction(line.value, number);
  } else if (keyword.kind == KeywordKind::List) {
    for (const QString& token : splitDefinitionList(line.value)) {
      if (keyword.list == &Fields::preservesAttributes) {
        checkPreserved(token, number);
      } else if (keyword.list == &Fields::attributesAdded) {
        checkAdded(token, number);
      } else if (keyword.list == &Fields::parameterMapping) {
        checkParameterMapping(token, number);
      } else if (keyword.list == &Fields::tagMapping && token != QLatin1String(":")) {
        checkTagMapping(token, number);
      }
    }
  }
}

void HeaderLint::checkInput(const QString& tag, int line) {
  if (!m_definition.isInput(tag)) {
    add(Rule::UnknownPort, messages::kNoSuchInput, line, {tag});
  }
}

void HeaderLint::checkOutput(const QString& tag, int line) {
  if (!m_definition.isOutput(tag)) {
    add(Rule::UnknownPort, messages::kNoSuchOutput, line, {tag});
  }
}

void HeaderLint::checkParametersOf(const QString& text, int line) {
  const ParameterText parsed(text);
  for (const ParameterText::Piece& piece : parsed.pieces()) {
    if (piece.isParameter && !m_definition.parameterNames().contains(piece.text)) {
      add(Rule::UndeclaredParameter, messages::kNoSuchParameter, line, {piece.text});
    }
  }
}

void HeaderLint::checkPreserved(const QString& token, int line) {
  if (token == kAllToken || token == kNoneToken || token.startsWith(QLatin1Char('='))) {
    return;
  }
  const int colon = token.indexOf(kColon);
  checkOutput(token.left(colon), line);
  if (colon >= 0) {
    checkInput(token.mid(colon + 1), line);
  }
}

void HeaderLint::checkAdded(const QString& token, int line) {
  // What looks like a port before the colon is meant as one; names of attributes may hold a colon as well.
  static const QRegularExpression looksLikePort(QStringLiteral("^[A-Z][A-Z0-9_]*$"));
  const int colon = token.indexOf(kColon);
  if (colon > 0 && looksLikePort.match(token.left(colon)).hasMatch()) {
    checkOutput(token.left(colon), line);
  }
  checkParametersOf(token, line);
}

void HeaderLint::checkListAction(const QString& action, int line) {
  AttributeRules rules;
  if (!rules.addListAction(action)) {
    add(Rule::BadListAction, messages::kBadListAction, line, {action});
    return;
  }
  const QStringList words = action.split(QLatin1Char(' '), Qt::SkipEmptyParts);
  if (words[0] != kEveryOutput) {
    checkOutput(words[0], line);
  }
  const ListAction& parsed = rules.listActions.begin().value().front();
  if (parsed.kind == ListAction::Kind::Collect) {
    checkInput(parsed.inputTag, line);
  }
  checkParametersOf(words.last(), line);
}

void HeaderLint::checkMappedVersion(const QString& token, int line) {
  int end = 0;
  const int version = mappedVersion(token, end);
  if (version > m_definition.fields().version || version == 0) {
    add(Rule::BadMapping, messages::kBadMappedVersion, line, {token});
  }
}

void HeaderLint::checkParameterMapping(const QString& token, int line) {
  RenameMapping mapping;
  if (!mapping.add(token)) {
    add(Rule::BadMapping, messages::kBadParameterMapping, line, {token});
    return;
  }
  checkMappedVersion(token, line);
  const QString name = token.mid(token.indexOf(QLatin1Char('=')) + 1);
  if (!m_definition.parameterNames().contains(name)) {
    add(Rule::UndeclaredParameter, messages::kNoSuchParameter, line, {name});
  }
}

void HeaderLint::checkTagMapping(const QString& token, int line) {
  int end = 0;
  mappedVersion(token, end);
  const QString mapping = token.mid(end);
  const bool isInput = mapping.startsWith(QLatin1String("I:"));
  const QString renaming = mapping.mid(2);
  if ((!isInput && !mapping.startsWith(QLatin1String("O:"))) || !RenameMapping().add(renaming)) {
    add(Rule::BadMapping, messages::kBadTagMapping, line, {token});
    return;
  }
  checkMappedVersion(token, line);
  const QString tag = renaming.mid(renaming.indexOf(QLatin1Char('=')) + 1);
  if (isInput) {
    checkInput(tag, line);
  } else {
    checkOutput(tag, line);
  }
}

void HeaderLint::checkTexts() {
  const TransformerDefinition& fields = m_definition.fields();
  const int line = m_definition.nameLine();
  const auto need = [&](bool isThere, long message, const QStringList& further = {}) {
    if (!isThere) {
      add(Rule::MissingText, message, line, QStringList(fields.name) + further);
    }
  };
  need(!fields.category.isEmpty(), messages::kNoCategory);
  need(!isBlankText(fields.descriptionLines), messages::kNoDescription);
  need(!isBlankText(fields.tooltipLines), messages::kNoTooltip);
  need(!isBlankText(fields.changeLog), messages::kNoChangeLog);
  const QStringList ports = m_definition.inputs() + m_definition.outputs();
  for (const QString& tag : ports) {
    need(!fields.tagDescriptions.value(tag).isEmpty(), messages::kNoTagDescription, {tag});
  }
  if (m_definition.hasOwnClass()) {
    return;
  }
  for (const DefinitionLine& tooltip : m_definition.text().tooltip) {
    checkParametersOf(tooltip.text, tooltip.number);
  }
}
