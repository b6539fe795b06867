#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/ValueReferences.h>
#include <transform/text/MacroText.h>

namespace {

const QLatin1String kFractionsMark("FDIV,");
const QLatin1String kChoose("@Choose(");
const QLatin1String kIntegerTypes("INT");
const QLatin1String kFloatTypes("FLOAT");
const QLatin1String kSliderTypes("RANGE_SLIDER");
const QLatin1String kTextResult("STRING");
const QLatin1Char kPartSeparator(';');

// Text with its references; everything else word-encoded, whatever it was before.
QString body(const QString& text, bool encoded, ReferenceForms forms) {
  const auto literal = [&](int begin, int end) {
    const QString part = text.mid(begin, end - begin);
    return encoded ? reencodeAroundReferences(part) : encodeAroundReferences(part);
  };
  QString result;
  int done = 0;
  for (const ValueReference& reference : valueReferences(text, forms)) {
    result += literal(done, reference.begin) + kValueReference + reference.word + QLatin1Char(')');
    done = reference.end;
  }
  return result + literal(done, text.size());
}

// With `resultsAreFormulas`, attributes in the results stay references: whoever evaluates the formula looks
// them up.
QString conditionalBody(const QString& value, bool resultsAreFormulas) {
  QStringList parts = value.mid(kConditionalPrefix.size()).split(kPartSeparator);
  for (int i = 0; i < parts.size(); ++i) {
    const bool isResult = i % 2 == 1 || i + 1 == parts.size();
    parts[i] = isResult && resultsAreFormulas ? reencodeAroundReferences(parts.at(i))
                                              : body(parts.at(i), true, ReferenceForms::All);
  }
  return kChoose + parts.join(QLatin1Char(',')) + QLatin1Char(')');
}

ReferenceForms formsOf(const QString& type, bool encoded, const QString& value) {
  if (!encoded)
    return ReferenceForms::Plain;
  if (!beginsValueReference(value))
    return ReferenceForms::All;
  const GUIType bearer = GUIType::fromTransformerTypeString(type);
  return bearer.valueIsEncoded() ? referenceForms(bearer, value) : ReferenceForms::All;
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

bool ExpressionWriter::isComputed(const GUIType& type) {
  return !expressionType(type.getType(), false).startsWith(kTextResult);
}

bool ExpressionWriter::needsWrapping(const GUIType& type, const QString& value) {
  if (value.startsWith(kConditionalPrefix)) {
    return true;
  }
  const ReferenceForms forms = referenceForms(type, value);
  if (!beginsValueReference(value, forms) || type.getType().startsWith(kExpressionType)) {
    return false;
  }
  // Bare in a statement, even what only begins like a reference is no text; wrapped it is.
  return type.mayHoldAttributeReference() || isValueReference(value, forms) ||
         (!type.isNull() && !type.valueIsEncoded() && !valueReferences(value, forms).empty());
}

QString ExpressionWriter::wrap(const QString& value, const QString& name, const QString& type,
                               bool encoded) const {
  QString result = kEvaluateCall;
  if (m_fractions) {
    result += kFractionsMark;
  }
  result += expressionType(type, encoded);
  result += QLatin1Char(',') + encodeAroundReferences(name) + QLatin1Char(',');
  result += value.startsWith(kConditionalPrefix) ? conditionalBody(value, type.startsWith(kExpressionType))
                                                 : body(value, encoded, formsOf(type, encoded, value));
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
    if (cell == kUnusedValue) {
      // A cell that has no value is empty; this text would be one.
      cell.clear();
      changed = true;
    } else if (needsWrapping(type, cell)) {
      cell = wrap(cell, name + QLatin1Char('.') + type.getName(), type.getType(), type.valueIsEncoded());
      changed = true;
    }
    column = column + 1 == types.size() ? 0 : column + 1;
  }
  return changed ? QORXListToSdfString(cells, columns.separator()) : value;
}
