#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/MacroText.h>

#include <vector>

namespace {

const QLatin1String kFractionsMark("FDIV,");
const QLatin1String kChoose("@Choose(");
const QLatin1String kExpressionType("EXPRESSION");
const QLatin1String kIntegerTypes("INT");
const QLatin1String kFloatTypes("FLOAT");
const QLatin1String kSliderTypes("RANGE_SLIDER");
const QLatin1String kTextResult("STRING");
const QLatin1Char kPartSeparator(';');

struct Reference {
  int begin;
  int nameBegin;
  int nameEnd;
  int end;
  bool isEncoded;
};

bool standsAt(const QString& text, int position, QLatin1String word) {
  return text.midRef(position, word.size()) == word;
}

// The references of a text, in order. Brackets inside a name count when they are matched; of references
// inside one another only the innermost is one; one that is never closed is text.
std::vector<Reference> findReferences(const QString& text) {
  std::vector<Reference> references;
  struct Bracket {
    int begin;  // of the reference; -1 for a bracket that opens none
    int nameBegin;
    bool isEncoded;
  };
  std::vector<Bracket> open;
  const auto openReference = [&](int& position, QLatin1String mark, bool isEncoded) {
    for (auto outer = open.rbegin(); outer != open.rend() && outer->begin >= 0; ++outer) {
      outer->begin = -1;
    }
    open.push_back({position, position + mark.size(), isEncoded});
    position += mark.size() - 1;
  };
  for (int i = 0; i < text.size(); ++i) {
    switch (text.at(i).unicode()) {
      case u'@':
        if (standsAt(text, i, kValueReference)) {
          openReference(i, kValueReference, false);
        } else if (standsAt(text, i, kValueReferenceEncoded)) {
          openReference(i, kValueReferenceEncoded, true);
        }
        break;
      case u'(':
        open.push_back({-1, i, false});
        break;
      case u'<':
        if (standsAt(text, i, kValueReferenceWord)) {
          openReference(i, kValueReferenceWord, true);
        } else if (standsAt(text, i, kEncodedLeftParenthesis)) {
          open.push_back({-1, i, true});
        } else if (standsAt(text, i, kEncodedRightParenthesis) && !open.empty() && open.back().isEncoded) {
          if (open.back().begin >= 0) {
            references.push_back(
                {open.back().begin, open.back().nameBegin, i, i + kEncodedRightParenthesis.size(), true});
          }
          open.pop_back();
        }
        break;
      case u')':
        if (!open.empty() && !open.back().isEncoded) {
          if (open.back().begin >= 0) {
            references.push_back({open.back().begin, open.back().nameBegin, i, i + 1, false});
          }
          open.pop_back();
        }
        break;
      default:
        break;
    }
  }
  return references;
}

bool isWholeReference(const QString& value) {
  if (!value.startsWith(kValueReference) && !value.startsWith(kValueReferenceEncoded) &&
      !value.startsWith(kValueReferenceWord)) {
    return false;
  }
  const std::vector<Reference> references = findReferences(value);
  return references.size() == 1 && references.front().begin == 0 && references.front().end == value.size();
}

// Text with its references; everything else word-encoded, whatever it was before.
QString body(const QString& text, bool encoded) {
  const auto literal = [&](int begin, int end) {
    const QString part = text.mid(begin, end - begin);
    return encoded ? reencodeAroundReferences(part) : encodeAroundReferences(part);
  };
  QString result;
  int done = 0;
  for (const Reference& reference : findReferences(text)) {
    result += literal(done, reference.begin);
    QString name = text.mid(reference.nameBegin, reference.nameEnd - reference.nameBegin);
    if (reference.isEncoded) {
      name = QORXWwjdDecode(name);
    }
    if (name.size() >= 2 && name.startsWith(QLatin1Char('"')) && name.endsWith(QLatin1Char('"'))) {
      name = name.mid(1, name.size() - 2);
    }
    result += kValueReference + encodeAroundReferences(name) + QLatin1Char(')');
    done = reference.end;
  }
  return result + literal(done, text.size());
}

QString conditionalBody(const QString& value) {
  QString result = kChoose;
  const QString rest = value.mid(kConditionalPrefix.size());
  bool isFirst = true;
  for (const QString& part : rest.split(kPartSeparator)) {
    if (!isFirst) {
      result += QLatin1Char(',');
    }
    result += body(part, true);
    isFirst = false;
  }
  return result + QLatin1Char(')');
}

QLatin1String expressionType(const QString& type, bool encoded) {
  if (type.startsWith(kIntegerTypes)) {
    return QLatin1String("INT");
  }
  if (type.startsWith(kFloatTypes) || type.startsWith(kSliderTypes)) {
    return QLatin1String("FLOAT");
  }
  return encoded ? QLatin1String("STRING_ENCODED") : kTextResult;
}

}  // namespace

bool ExpressionWriter::holdsReference(const QString& value) {
  return value.contains(kValueReference) || value.contains(kValueReferenceEncoded) ||
         value.contains(kValueReferenceWord);
}

bool ExpressionWriter::isComputed(const GUIType& type) {
  return !expressionType(type.getType(), false).startsWith(kTextResult);
}

bool ExpressionWriter::needsWrapping(const GUIType& type, const QString& value) {
  if (value.startsWith(kConditionalPrefix)) {
    return true;
  }
  if (!holdsReference(value) || type.getType().startsWith(kExpressionType)) {
    return false;
  }
  return type.mayHoldAttributeReference() || isWholeReference(value);
}

QString ExpressionWriter::withStoredResults(const QString& value, const ChoiceList& choices) {
  if (!choices.hasLookup() || !value.startsWith(kConditionalPrefix)) {
    return value;
  }
  QStringList parts = value.mid(kConditionalPrefix.size()).split(kPartSeparator);
  for (int i = 0; i < parts.size(); ++i) {
    const bool isResult = i % 2 == 1 || i + 1 == parts.size();
    const QString result = QORXWwjdDecode(parts.at(i));
    if (isResult && choices.contains(result)) {
      parts[i] = QORXWwjdEncode(choices.toStored(result));
    }
  }
  return kConditionalPrefix + parts.join(kPartSeparator);
}

QString ExpressionWriter::wrap(const QString& value, const QString& name, const QString& type,
                               bool encoded) const {
  QString result = kEvaluateCall;
  if (m_fractions) {
    result += kFractionsMark;
  }
  result += expressionType(type, encoded);
  result += QLatin1Char(',') + encodeAroundReferences(name) + QLatin1Char(',');
  result += value.startsWith(kConditionalPrefix) ? conditionalBody(value) : body(value, encoded);
  return result + QLatin1Char(')');
}

QString ExpressionWriter::wrapMembers(const QString& value, const MemberList& members) const {
  QStringList parts = QORXSdfStringToList(value, members.separator());
  bool changed = false;
  for (int i = 0; i + 1 < parts.size(); i += 2) {
    const QString& name = parts.at(i);
    const GUIType* member = members.find(name);
    const GUIType& type = member ? *member : GUIType::kNullGuiType;
    if (name != kControllerQueryFile && needsWrapping(type, parts.at(i + 1))) {
      parts[i + 1] = wrap(parts.at(i + 1), name, type.getType(), type.valueIsEncoded());
      changed = true;
    }
  }
  return changed ? QORXListToSdfString(parts, members.separator()) : value;
}

QString ExpressionWriter::wrapCells(const QString& value, const QString& name,
                                    const MemberList& columns) const {
  const auto& types = columns.members();
  if (types.empty()) {
    return value;
  }
  QStringList cells = QORXSdfStringToList(value, columns.separator());
  bool changed = false;
  std::size_t column = 0;
  for (QString& cell : cells) {
    const GUIType& type = types[column];
    if (needsWrapping(type, cell)) {
      cell = wrap(cell, name + QLatin1Char('.') + type.getName(), type.getType(), type.valueIsEncoded());
      changed = true;
    }
    column = column + 1 == types.size() ? 0 : column + 1;
  }
  return changed ? QORXListToSdfString(cells, columns.separator()) : value;
}
