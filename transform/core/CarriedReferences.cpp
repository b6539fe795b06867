#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/CarriedReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/ValueReferences.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>

namespace messages = orx::messages;

namespace {

using namespace carried_references;

struct Place {
  bool isEncoded;     // as the value is stored
  bool isExpression;  // decoded by the engine, whatever it was before
};

bool isStoredEncoded(const GUIType& type, const QString& part) {
  return type.valueIsEncoded() || part.startsWith(kConditionalPrefix);
}

// Compares what people see of a text and the values that it refers to with what the engine reads.
long refuseIn(const Place& place, const QString& part, const Known& known) {
  QString seen;
  QString stood;
  int done = 0;
  const auto addText = [&](int end) {
    const QString text = part.mid(done, end - done);
    seen += place.isEncoded ? QORXWwjdDecode(text) : text;
    stood += place.isExpression && !place.isEncoded ? QORXWwjdEncode(text) : text;
  };
  for (const MacroReference& reference : macroReferences(part)) {
    if (!reference.isClosed || reference.isInside)
      continue;
    QString name = reference.name(part);
    QString brought = part.mid(reference.begin, reference.end - reference.begin);
    if ((reference.hasInner && !known.expand(name)) || !known.expand(brought))
      return messages::kGrowsWithoutEnd;
    const Spelling spelling = known.spellingOf(name);
    if (spelling == Spelling::Call)
      return messages::kReferenceToCall;
    if (place.isExpression && !fitsExpression(brought))
      return messages::kReferenceBreaks;
    addText(reference.begin);
    const bool isWord = spelling == Spelling::Unknown ? place.isEncoded : spelling == Spelling::Word;
    seen += isWord ? QORXWwjdDecode(brought) : brought;
    stood += brought;
    done = reference.end;
  }
  addText(part.size());
  const bool isDecoded = place.isEncoded || place.isExpression;
  return seen == (isDecoded ? QORXWwjdDecode(stood) : stood) ? 0 : messages::kReferenceReencoded;
}

// A function that only a reference brings.
bool bringsCall(const QString& part, const QString& expanded) {
  return expanded != part && TextPlaces::holdsCall(expanded) && !TextPlaces::holdsCall(part);
}

bool keepsCells(const TransformParamCfg& record, const QString& value, const ExpandReferences& expand) {
  const QChar separator = record.members().separator();
  QStringList cells = QORXSdfStringToList(value, separator);
  QString whole = value;
  const bool ends = expand(whole) && std::all_of(cells.begin(), cells.end(), expand);
  return ends && QORXSdfStringToList(whole, separator) == cells;
}

bool isJudged(const QString& stored) {
  return beginsMacroReference(stored) && MFBuffer::closesDeferredMacros(stored);
}

}  // namespace

namespace carried_references {

ScopeTypes::~ScopeTypes() = default;

Spelling spellingOf(const GUIType& type) {
  return type.isNull() ? Spelling::Unknown : type.valueIsEncoded() ? Spelling::Word : Spelling::Plain;
}

Known knownAround(const TransformerCfg& cfg) {
  const auto expand = [&cfg](QString& text) {
    text = MFBuffer::withOrdinaryMacros(text);
    return !cfg.listener() || cfg.listener()->expandMacros(cfg, text);
  };
  const auto* types = dynamic_cast<const ScopeTypes*>(cfg.listener());
  return {expand, [types](const QString& name) {
            return types ? spellingOf(types->typeOf(name)) : Spelling::Unknown;
          }};
}

Known knownWithin(const TransformerCfg& cfg) {
  constexpr int kMostRounds = 8;
  const Known around = knownAround(cfg);
  const auto isOwn = [&cfg](const QString& name) { return cfg.getParameterByMacroName(name) != nullptr; };
  const auto expand = [&cfg, around, isOwn](QString& text) {
    for (int round = 0; round < kMostRounds && anyParameterReference(text, isOwn); ++round) {
      text = replaceParameterReferences(text, [&](const QString& name, QString& value) {
        const TransformParamCfg* record = cfg.getParameterByMacroName(name);
        if (record && !record->isUnset())
          value = single_choices::toStored(*record, record->getValue());
        return record != nullptr;
      });
    }
    return around.expand(text);
  };
  return {expand, [&cfg, around, isOwn](const QString& name) {
            return isOwn(name) ? spellingOf(*cfg.getParameterByMacroName(name)) : around.spellingOf(name);
          }};
}

bool isAround(const TransformerCfg& cfg, const QString& parameter) {
  return cfg.listener() && cfg.listener()->isRunTimeValue(cfg, kMacroOpen + parameter + QLatin1Char(')'));
}

bool isReadDecoded(const GUIType& type, const QString& part) {
  return type.valueIsEncoded() || ExpressionWriter::needsWrapping(type, part);
}

bool fitsExpression(const QString& text) {
  static const QString kActive = QStringLiteral(",()\"{}");
  const QString known = withoutReferences(text);
  return std::none_of(known.begin(), known.end(), [](QChar c) { return kActive.contains(c); }) &&
         !beginsValueReference(known);
}

long refuse(const TransformParamCfg& record, const QString& stored, const QString& written, TableForm form,
            const Known& known) {
  if (!isJudged(stored))
    return 0;
  const QString value = MFBuffer::withOrdinaryMacros(stored);
  // Some classes wrap what is no reference to an attribute.
  const bool isMadeCall = record.members().members().empty() && written.startsWith(kEvaluateCall);
  long number = 0;
  forEachPart(record, value, [&](const GUIType& type, const QString& part) {
    if (number != 0 || !part.contains(kMacroOpen))
      return;
    const bool isExpression = isMadeCall || ExpressionWriter::needsWrapping(type, part);
    number = refuseIn({isStoredEncoded(type, part), isExpression}, part, known);
    QString expanded = part;
    if (number == 0 && !isExpression && !type.getType().startsWith(kExpressionType) &&
        known.expand(expanded) && bringsCall(part, expanded))
      number = messages::kCallInValue;
  });
  if (number != 0 || form == TableForm::ByRows || !record.isTable() || value.startsWith(kConditionalPrefix))
    return number;
  return keepsCells(record, value, known.expand) ? 0 : messages::kReferenceBreaks;
}

long refuseInMacro(const GUIType& type, const QString& stored, const Known& known) {
  return isJudged(stored)
             ? refuseIn({isStoredEncoded(type, stored), false}, MFBuffer::withOrdinaryMacros(stored), known)
             : 0;
}

}  // namespace carried_references
