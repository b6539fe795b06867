#include <platform/qorxcore/Lists.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/CarriedReferences.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/ValueReferences.h>
#include <transform/core/ValueShape.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/LookupDecision.h>
#include <transform/core/generation/LookupWriters.h>
#include <transform/core/generation/MultiProcessWriter.h>
#include <transform/core/validation/MappingFileChecks.h>
#include <transform/core/validation/OwnTokens.h>
#include <transform/text/MacroText.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/NullBuffer.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>
#include <typeinfo>

namespace messages = orx::messages;

namespace {

using namespace lookup_checks;

}  // namespace

namespace mapping_file_checks {

bool closesDeferredMacros(const ChoiceList& choices, const QStringList& texts) {
  return std::all_of(texts.cbegin(), texts.cend(), &MFBuffer::closesDeferredMacros) &&
         std::all_of(choices.entries().begin(), choices.entries().end(), [](const auto& entry) {
           return MFBuffer::closesDeferredMacros(entry.first) && MFBuffer::closesDeferredMacros(entry.second);
         });
}

}  // namespace mapping_file_checks

MappingFileChecks::MappingFileChecks(const TransformerCfg& cfg, const std::vector<TransformParamCfg>& records,
                                     const OwnTokens* tokens)
    : m_cfg(cfg),
      m_records(records),
      m_tokens(tokens),
      m_written(cfg, tokens != nullptr),
      m_around(carried_references::knownAround(cfg)) {}

QHash<QString, QString> MappingFileChecks::find() const {
  QHash<QString, QString> messages;
  for (const TransformParamCfg& record : m_records) {
    const QString stored = stripBasicStringInfo(m_cfg.getParameterValue(record.getName()));
    const QString fault = value_shape::fault(record, stored);
    if (!fault.isEmpty()) {
      messages.insert(record.getName(), fault);
    } else if (const long number = refuse(record, stored)) {
      messages.insert(record.getName(), TransformResString(number));
    }
  }
  return messages;
}

long MappingFileChecks::refuse(const TransformParamCfg& record, const QString& stored) const {
  const QString& name = record.getName();
  if (const long number = refuseParallelSetting(record, stored)) {
    return number;
  }
  if (const long number = refuseLookup(record, stored)) {
    return number;
  }
  if (!m_written.contains(record)) {
    return 0;
  }
  NullBuffer buffer;
  QString value = m_cfg.getParameterValueForMappingFile(name, &record, buffer);
  if (const long number = refuseReferences(record, stored, value)) {
    return number;
  }
  // Each member and each cell stands in a place of its own.
  QStringList parts = record.isMultiParameter() || m_written.isWrittenByRows(record)
                          ? QORXSdfStringToList(value, record.members().separator())
                          : QStringList(value);
  const auto insert = [this](QString& part) { return insertTokens(part); };
  if (!insert(value) || !std::all_of(parts.begin(), parts.end(), insert)) {
    return messages::kGrowsWithoutEnd;
  }
  if (!std::all_of(parts.cbegin(), parts.cend(), &TextPlaces::isOneLine)) {
    return messages::kBreaksLine;
  }
  if (!std::all_of(parts.cbegin(), parts.cend(), &closesDeferredReferences)) {
    return messages::kValueUnclosed;
  }
  const auto endsInBackslash = [](const QString& part) { return part.endsWith(QLatin1Char('\\')); };
  if (m_written.mayEndLine(record) && std::any_of(parts.cbegin(), parts.cend(), endsInBackslash)) {
    return messages::kEndsInBackslash;
  }
  if (name == kIdentifierParameter) {
    return refuseIdentifier(stored);
  }
  if (m_written.isWord(record)) {
    if (const long number = TextPlaces::refuse(TextPlace::Word, value)) {
      return number;
    }
  }
  if (record.isMultiParameter()) {
    return refuseMembers(record, stored, parts);
  }
  if (record.isTable()) {
    if (const long number = refuseCells(record, stored)) {
      return number;
    }
  }
  return m_written.isToken(record) ? refuseToken(record, stored, value) : 0;
}

long MappingFileChecks::refuseReferences(const TransformParamCfg& record, const QString& stored,
                                         const QString& written) const {
  using namespace carried_references;
  if (record.getName() == kIdentifierParameter) {
    return 0;
  }
  const Known known{[this](QString& text) { return expand(text); },
                    [this](const QString& name) {
                      const Spelling own = m_tokens ? m_tokens->spellingOf(name) : Spelling::Unknown;
                      return own != Spelling::Unknown ? own : m_around.spellingOf(name);
                    }};
  const bool isByRows = m_written.isWrittenByRows(record);
  if ((isByRows && holdsTokens(stored)) || defersOwn(stored)) {
    return messages::kOwnReferenceApart;
  }
  return carried_references::refuse(record, stored, written, isByRows ? TableForm::ByRows : TableForm::Packed,
                                    known);
}

long MappingFileChecks::refuseMembers(const TransformParamCfg& record, const QString& stored,
                                      const QStringList& written) const {
  const QStringList parts = QORXSdfStringToList(stored, record.members().separator());
  for (int i = 0; i + 1 < written.size() && i + 1 < parts.size(); i += 2) {
    const GUIType* member = record.members().find(parts.at(i));
    const long number = member ? refuseToken(*member, parts.at(i + 1), written.at(i + 1)) : 0;
    if (number != 0) {
      return number;
    }
  }
  return 0;
}

// What a class of its own makes of a table still reads the cells as they are stored.
long MappingFileChecks::refuseCells(const TransformParamCfg& record, const QString& stored) const {
  long number = 0;
  forEachPart(record, stored, [&](const GUIType& type, const QString& cell) {
    if (number != 0 || ExpressionWriter::needsWrapping(type, cell)) {
      return;
    }
    QString written = cell;
    if (!insertTokens(written)) {
      number = messages::kGrowsWithoutEnd;
    } else if (type.valueIsEncoded()) {
      number = refuseEncoding(type, written);
    } else if (TextPlaces::refusePlainValue(written, {}, TextPlaces::Calls::Refused) ==
               messages::kCallInValue) {
      // The list puts everything else that a plain value must not hold into quotes.
      number = messages::kCallInValue;
    }
  });
  return number;
}

long MappingFileChecks::refuseToken(const GUIType& type, const QString& stored,
                                    const QString& written) const {
  // Calls that were made for the value are sound, and so is what a class of its own makes of it.
  const bool isMade =
      written != stored && (typeid(m_cfg) != typeid(TransformerCfg) || written.startsWith(kProcedureCall));
  if (isMade || ExpressionWriter::needsWrapping(type, stored)) {
    return 0;
  }
  const ConfiguredDefinition* definition = m_cfg.definition();
  const CompiledTemplate* compiled = definition ? definition->compiledTemplate.get() : nullptr;
  static const QSet<QString> none;
  const QSet<QString>& keys = compiled ? compiled->keys() : none;
  const bool isExpression = type.getType().startsWith(kExpressionType);
  if (type.valueIsEncoded() && !isExpression) {
    // What would be read as an escape is no word, and beside a reference nobody else finds it.
    const bool hasEscapes = type.getType() == kTextEncodedType && encodeUserString(stored) != stored;
    return hasEscapes ? messages::kNotEncoded : refuseEncoding(type, written);
  }
  const bool mayCall = isExpression || type.getType() == kTableType;
  return TextPlaces::refusePlainValue(written, keys,
                                      mayCall ? TextPlaces::Calls::Allowed : TextPlaces::Calls::Refused);
}

long MappingFileChecks::refuseIdentifier(const QString& value) const {
  if (!value.contains(kMacroOpen)) {
    return TextPlaces::refuse(TextPlace::Word, value);
  }
  // Such a name is wrapped in quotes when it holds a blank itself, without a change to what stands inside.
  QString expanded = value;
  if (!expandMacros(expanded)) {
    return messages::kGrowsWithoutEnd;
  }
  const bool isSplit = !value.contains(QLatin1Char(' ')) && expanded.contains(QLatin1Char(' '));
  const bool isBroken = isSplit || expanded.contains(QLatin1Char('\t')) ||
                        expanded.contains(QLatin1Char('"')) || expanded.endsWith(QLatin1Char('\\'));
  return isBroken ? messages::kIdentifierInScript : 0;
}

long MappingFileChecks::refuseLookup(const TransformParamCfg& record, const QString& value) const {
  const LookupKind kind = lookupKind(m_cfg, record, value);
  if (kind != LookupKind::RunTime && kind != LookupKind::Procedure) {
    return refersToShownSide(record, value) ? messages::kShownSideReferred : 0;
  }
  const ChoiceList& choices = record.choices();
  const QString identifier = m_cfg.getIdentifier();
  if (!mapping_file_checks::closesDeferredMacros(choices, {value, record.getDescription(), identifier})) {
    return messages::kValueUnclosed;
  }
  if (const long number = refuseChoices(choices)) {
    return number;
  }
  BoxLookup lookup{value, record.getDescription(), QLatin1Char('x') + record.getName(), identifier,
                   record.getFlag(kGUITypeOptional)};
  if (kind == LookupKind::RunTime) {
    // The fragment stands ahead of the lines that tokens are substituted in: there they are macros.
    const bool isLoose = m_tokens && anyParameterReference(value, [this](const QString& name) {
                           return m_cfg.hasParameter(name) && !carried_references::isAround(m_cfg, name);
                         });
    if (isLoose) {
      return messages::kValueInScript;
    }
  } else if (!insertTokens(lookup.value)) {
    return messages::kGrowsWithoutEnd;
  } else if (lookup.value != value && lookup.value.contains(QLatin1Char('@'))) {
    return messages::kValueInScript;
  }
  for (QString* text : {&lookup.value, &lookup.prompt, &lookup.identifier}) {
    if (!expandMacros(*text)) {
      return messages::kGrowsWithoutEnd;
    }
  }
  if (kind == LookupKind::Procedure) {
    return refuseChoiceProcedure(choices, lookup.macro, lookup.value);
  }
  if (!ORX_isListBoxType(record)) {
    return refuseChoiceBox(choices, lookup);
  }
  // The fragment looks for what is shown as a list shows it: in quotes.
  const bool isBare = lookup.value.contains(QLatin1Char(' ')) && choices.contains(lookup.value);
  return isBare ? messages::kShownSideReferred : refuseListBox(choices, lookup);
}

bool MappingFileChecks::refersToShownSide(const TransformParamCfg& record, const QString& value) const {
  return single_choices::refersToShownSide(record, value, [this](QString& text) { return expand(text); });
}

// These values go into a statement of their own as they are stored. Nothing looks them up, and no tokens are
// replaced.
long MappingFileChecks::refuseParallelSetting(const TransformParamCfg& record, const QString& stored) const {
  if (!m_written.isMultiProcessSetting(record) || !multi_process_writer::settingsOf(m_cfg).isEnabled) {
    return 0;
  }
  if (stored.startsWith(kConditionalPrefix) || beginsValueReference(stored)) {
    return messages::kParallelByFeature;
  }
  if (holdsTokens(stored)) {
    return messages::kOwnReferenceApart;
  }
  return refersToShownSide(record, stored) ? messages::kShownSideReferred : 0;
}

// Choices may refer to macros as well; those that do must fit wherever they stand.
long MappingFileChecks::refuseChoices(const ChoiceList& choices) const {
  for (const auto& [shown, stored] : choices.entries()) {
    for (QString text : {shown, stored}) {
      const bool refers = text.contains(kMacroOpen) || text.contains(kDeferredOpen);
      if (refers && (!expandMacros(text) || !fitsFragment(text))) {
        return messages::kChoiceInScript;
      }
    }
  }
  return 0;
}

bool MappingFileChecks::holdsTokens(const QString& text) const {
  QString inserted = text;
  return !insertTokens(inserted) || inserted != text;
}

// Deferred references become ordinary ones when tokens have been replaced.
bool MappingFileChecks::defersOwn(const QString& stored) const {
  const std::vector<MacroReference> references = macroReferences(stored);
  return std::any_of(references.begin(), references.end(), [&](const MacroReference& reference) {
    return reference.isDeferred && reference.isClosed && m_cfg.hasParameter(reference.name(stored)) &&
           !carried_references::isAround(m_cfg, reference.name(stored));
  });
}

bool MappingFileChecks::insertTokens(QString& text) const {
  return !m_tokens || !text.contains(kMacroOpen) || m_tokens->carryOut(text);
}

bool MappingFileChecks::expandMacros(QString& text) const {
  return m_around.expand(text);
}
