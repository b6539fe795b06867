#include <transform/core/AttributeRules.h>
#include <transform/core/Keywords.h>
#include <transform/core/RenameMapping.h>
#include <transform/registry/lint/HeaderLint.h>
#include <transform/registry/loading/DefinitionKeywords.h>

#include <QRegularExpression>

#include <algorithm>

using orx::Rule;

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

void HeaderLint::add(Rule rule, int line, const QString& text) {
  m_report.add(rule, m_definition.file(), line, text);
}

void HeaderLint::check() {
  QHash<QString, int> seen;
  for (const LintedDefinition::HeaderLine& line : m_definition.header()) {
    if (!line.keyword) {
      add(Rule::UnknownKeyword, line.line.number,
          QLatin1String("No keyword begins like this: ") + line.line.text);
      continue;
    }
    const KeywordKind kind = line.keyword->kind;
    if (kind == KeywordKind::Text || kind == KeywordKind::Number || kind == KeywordKind::Flag) {
      int& first = seen[line.keyword->word];
      if (first != 0) {
        add(Rule::RepeatedKeyword, line.line.number,
            QStringLiteral("%1 stands on line %2 already; this line replaces it")
                .arg(line.keyword->word)
                .arg(first));
      }
      first = line.line.number;
    }
    checkValue(line);
    checkReferences(line);
  }
  if (m_definition.fields().name.isEmpty()) {
    add(Rule::BadValue, m_definition.line(), QStringLiteral("The definition has no TRANSFORMER_NAME"));
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
        add(Rule::BadValue, number,
            QStringLiteral("%1 needs a whole number from 0 up, not '%2'").arg(word, line.value));
      }
      break;
    }
    case KeywordKind::Flag:
      if (flagValue(line.value) < 0) {
        add(Rule::BadValue, number,
            QStringLiteral("%1 needs yes, true, no or false, not '%2'").arg(word, line.value));
      }
      break;
    case KeywordKind::Modes:
      for (const QString& mode : splitDefinitionList(line.value)) {
        if (featureHoldingBit(mode) == 0) {
          add(Rule::BadValue, number,
              QStringLiteral("%1 knows NONE, GROUPED and ALL, not '%2'").arg(word, mode));
        }
      }
      break;
    case KeywordKind::Lookup:
      if (line.value.isEmpty()) {
        add(Rule::BadValue, number, QStringLiteral("%1 needs entries KEY,MAPPED separated by %").arg(word));
      }
      break;
    case KeywordKind::TagDescription: {
      QString tag;
      QString description;
      if (!splitTagDescription(line.value, tag, description)) {
        add(Rule::BadValue, number, QStringLiteral("%1 needs a tag and its description").arg(word));
      } else if (!m_definition.isInput(tag) && !m_definition.isOutput(tag)) {
        add(Rule::UnknownPort, number, QStringLiteral("There is no port '%1'").arg(tag));
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
      add(Rule::UndeclaredParameter, number,
          QStringLiteral("There is no parameter '%1' to group by").arg(line.value));
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
    add(Rule::UnknownPort, line, QStringLiteral("There is no input '%1'").arg(tag));
  }
}

void HeaderLint::checkOutput(const QString& tag, int line) {
  if (!m_definition.isOutput(tag)) {
    add(Rule::UnknownPort, line, QStringLiteral("There is no output '%1'").arg(tag));
  }
}

void HeaderLint::checkParametersOf(const QString& text, int line) {
  const ParameterText parsed(text);
  for (const ParameterText::Piece& piece : parsed.pieces()) {
    if (piece.isParameter && !m_definition.parameterNames().contains(piece.text)) {
      add(Rule::UndeclaredParameter, line, QStringLiteral("There is no parameter '%1'").arg(piece.text));
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
    add(Rule::BadListAction, line,
        QStringLiteral("Needs OUT KEEP, OUT DROP, OUT COLLECT IN LIST or OUT EXPLODE LIST, not '%1'")
            .arg(action));
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
    add(Rule::BadMapping, line,
        QStringLiteral("Version %1 in '%2' is not one that could have brought the change")
            .arg(version)
            .arg(token));
  }
}

void HeaderLint::checkParameterMapping(const QString& token, int line) {
  RenameMapping mapping;
  if (!mapping.add(token)) {
    add(Rule::BadMapping, line, QStringLiteral("Needs [VERSION:]OLD=NEW, not '%1'").arg(token));
    return;
  }
  checkMappedVersion(token, line);
  const QString name = token.mid(token.indexOf(QLatin1Char('=')) + 1);
  if (!m_definition.parameterNames().contains(name)) {
    add(Rule::UndeclaredParameter, line, QStringLiteral("There is no parameter '%1'").arg(name));
  }
}

void HeaderLint::checkTagMapping(const QString& token, int line) {
  int end = 0;
  mappedVersion(token, end);
  const QString mapping = token.mid(end);
  const bool isInput = mapping.startsWith(QLatin1String("I:"));
  const QString renaming = mapping.mid(2);
  if ((!isInput && !mapping.startsWith(QLatin1String("O:"))) || !RenameMapping().add(renaming)) {
    add(Rule::BadMapping, line,
        QStringLiteral("Needs [VERSION:]I:OLD=NEW or [VERSION:]O:OLD=NEW, not '%1'").arg(token));
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
  const auto need = [&](bool isThere, const QString& what) {
    if (!isThere) {
      add(Rule::MissingText, line, QStringLiteral("%1 has no %2").arg(fields.name, what));
    }
  };
  need(!fields.category.isEmpty(), QStringLiteral("category"));
  need(!isBlankText(fields.descriptionLines), QStringLiteral("description"));
  need(!isBlankText(fields.tooltipLines), QStringLiteral("tooltip"));
  need(!isBlankText(fields.changeLog), QStringLiteral("change log"));
  const QStringList ports = m_definition.inputs() + m_definition.outputs();
  for (const QString& tag : ports) {
    need(!fields.tagDescriptions.value(tag).isEmpty(), QLatin1String("TAG_DESCRIPTION of ") + tag);
  }
  if (m_definition.hasOwnClass()) {
    return;
  }
  for (const DefinitionLine& tooltip : m_definition.text().tooltip) {
    checkParametersOf(tooltip.text, tooltip.number);
  }
}
