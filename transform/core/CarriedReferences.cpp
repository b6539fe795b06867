#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/CarriedReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/ValueReferences.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileWords.h>
#include <transform/text/MessageNumbers.h>

#include <algorithm>

namespace messages = orx::messages;

namespace {

using namespace carried_references;

long refuseInExpression(const QString& part, bool isEncoded, const Expand& expand) {
  for (const MacroReference& reference : macroReferences(part)) {
    if (!reference.isClosed || reference.isInside)
      continue;
    QString brought = part.mid(reference.begin, reference.end - reference.begin);
    if (!expand(brought))
      return messages::kGrowsWithoutEnd;
    if (!fitsExpression(brought, isEncoded))
      return messages::kReferenceBreaks;
  }
  return 0;
}

// A function that only a reference brings.
bool bringsCall(const QString& part, const QString& expanded) {
  const auto holdsCall = [](const QString& text) {
    MappingFileWords words(text);
    for (MappingFileWord word; words.next(word);) {
      if (word.kind == MappingFileWord::Kind::Call)
        return true;
    }
    return false;
  };
  return expanded != part && holdsCall(expanded) && !holdsCall(part);
}

bool keepsCells(const TransformParamCfg& record, const QString& value, const Expand& expand) {
  const QChar separator = record.members().separator();
  QStringList cells = QORXSdfStringToList(value, separator);
  QString whole = value;
  const bool ends = expand(whole) && std::all_of(cells.begin(), cells.end(), expand);
  return ends && QORXSdfStringToList(whole, separator) == cells;
}

}  // namespace

namespace carried_references {

bool fitsExpression(const QString& text, bool isEncoded) {
  static const QString kActive = QStringLiteral(",()\"{}");
  const QString known = withoutReferences(text);
  const bool isActive = std::any_of(known.begin(), known.end(), [](QChar c) { return kActive.contains(c); });
  return !isActive && !beginsValueReference(known) && (isEncoded || QORXWwjdDecode(known) == known);
}

long refuse(const TransformParamCfg& record, const QString& stored, TableForm form, const Expand& expand) {
  if (!beginsMacroReference(stored) || !MFBuffer::closesDeferredMacros(stored))
    return 0;
  const QString value = MFBuffer::withOrdinaryMacros(stored);
  long number = 0;
  forEachPart(record, value, [&](const GUIType& type, const QString& part) {
    if (number != 0 || !part.contains(kMacroOpen))
      return;
    if (ExpressionWriter::needsWrapping(type, part)) {
      const bool isEncoded = type.valueIsEncoded() || part.startsWith(kConditionalPrefix);
      number = refuseInExpression(part, isEncoded, expand);
      return;
    }
    QString expanded = part;
    if (!expand(expanded))
      number = messages::kGrowsWithoutEnd;
    else if (!type.getType().startsWith(kExpressionType) && bringsCall(part, expanded))
      number = messages::kCallInValue;
  });
  if (number != 0 || form == TableForm::ByRows || !record.isTable() || value.startsWith(kConditionalPrefix))
    return number;
  return keepsCells(record, value, expand) ? 0 : messages::kReferenceBreaks;
}

bool fitsEncodedList(const QString& value, const Expand& expand) {
  QString meant = value;
  QString listed = encodeAroundReferences(value);
  if (!expand(meant) || !expand(listed))
    return false;
  const QStringList elements = QORXSdfStringToList(listed, QLatin1Char(','));
  return listed.isEmpty() || (elements.size() == 1 && QORXWwjdDecode(elements.first()) == meant);
}

}  // namespace carried_references
