#include <platform/qorxcore/Lists.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/LookupWriters.h>
#include <transform/core/generation/OrderedSubstitution.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/validation/MappingFileChecks.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>

#include <algorithm>
#include <typeinfo>

namespace {

using namespace lookup_checks;

const QLatin1String kChoiceType("CHOICE");

// Takes statements that nobody wants.
class NullBuffer : public MFBuffer {
 public:
  void write(const QByteArray&) override {}
};

bool isSelfClosed(const QString& text) {
  return MFBuffer::closesDeferredMacros(text);
}

}  // namespace

namespace mapping_file_checks {

bool closesDeferredMacros(const ChoiceList& choices, const QStringList& texts) {
  return std::all_of(texts.cbegin(), texts.cend(), isSelfClosed) &&
         std::all_of(choices.entries().begin(), choices.entries().end(), [](const auto& entry) {
           return isSelfClosed(entry.first) && isSelfClosed(entry.second);
         });
}

}  // namespace mapping_file_checks

MappingFileChecks::MappingFileChecks(const TransformerCfg& cfg, const std::vector<TransformParamCfg>& records)
    : m_cfg(cfg), m_records(records) {
  NullBuffer buffer;
  ParameterSubstitution values(cfg, records);
  m_bringsTokens = std::any_of(records.begin(), records.end(),
                               [](const auto& record) { return record.getValue().contains(kMacroOpen); });
  if (m_bringsTokens) {
    values.collect(buffer);
    m_bringsTokens = values.bringsTokens();
  }
}

QHash<QString, QString> MappingFileChecks::find() const {
  QHash<QString, QString> messages;
  const ConfiguredDefinition* definition = m_cfg.definition();
  const CompiledTemplate* compiled = definition ? definition->compiledTemplate.get() : nullptr;
  const TransformParamCfg* withReference = nullptr;
  for (const TransformParamCfg& record : m_records) {
    if (const long number = refuse(record, compiled)) {
      messages.insert(record.getName(), TransformResString(number));
    }
    if (!withReference && record.getValue().contains(kMacroOpen)) {
      withReference = &record;
    }
  }
  if (m_bringsTokens && withReference && growsWithoutEnd()) {
    messages.insert(withReference->getName(), TransformResString(kGrowsWithoutEnd));
  }
  return messages;
}

bool MappingFileChecks::growsWithoutEnd() const {
  NullBuffer buffer;
  ParameterSubstitution values(m_cfg, m_records);
  values.collect(buffer);
  OrderedSubstitution lines(m_cfg.getTemplateLines());
  values.apply(lines);
  return lines.isTooLarge();
}

// These values go into the statement that divides the work, whatever the template says.
bool MappingFileChecks::isMultiProcessSetting(const QString& name) const {
  const ConfiguredDefinition* definition = m_cfg.definition();
  return definition && !definition->fields.multiProcess.isEmpty() &&
         (name == definition->fields.multiProcess || name == kProcessCountParameter ||
          name == kGroupsOrderedParameter);
}

// A class of its own writes the tables that the template leaves out, in statements behind it.
bool MappingFileChecks::isWrittenByRows(const TransformParamCfg& record,
                                        const CompiledTemplate* compiled) const {
  return record.isTable() && compiled && typeid(m_cfg) != typeid(TransformerCfg) &&
         compiled->slotOf(record.getName()) == CompiledTemplate::kNoSlot;
}

bool MappingFileChecks::isReached(const TransformParamCfg& record, const CompiledTemplate* compiled) const {
  // Without a template the values are written as macros.
  return !compiled || m_bringsTokens || record.isMultiParameter() || isWrittenByRows(record, compiled) ||
         isMultiProcessSetting(record.getName()) ||
         compiled->slotOf(record.getName()) != CompiledTemplate::kNoSlot ||
         (record.getName() == kIdentifierParameter &&
          compiled->slotOf(kEncodedNameToken) != CompiledTemplate::kNoSlot) ||
         (ParameterSubstitution::hasValue(record) &&
          compiled->slotOf(kValueListToken) != CompiledTemplate::kNoSlot);
}

long MappingFileChecks::refuse(const TransformParamCfg& record, const CompiledTemplate* compiled) const {
  const QString& name = record.getName();
  const QString stored = stripBasicStringInfo(m_cfg.getParameterValue(name));
  if (record.choices().hasLookup()) {
    if (const long number = refuseLookup(record, stored)) {
      return number;
    }
  }
  if (!isReached(record, compiled)) {
    return 0;
  }
  NullBuffer buffer;
  const QString value = m_cfg.getParameterValueForMappingFile(name, &record, buffer);
  // Each member and each cell stands in a place of its own.
  const QStringList parts = record.isMultiParameter() || isWrittenByRows(record, compiled)
                                ? QORXSdfStringToList(value, record.members().separator())
                                : QStringList(value);
  if (!std::all_of(parts.cbegin(), parts.cend(), isOneLine)) {
    return kBreaksLine;
  }
  if (!std::all_of(parts.cbegin(), parts.cend(), isSelfClosed)) {
    return kUnclosedReference;
  }
  const int slot = compiled ? compiled->slotOf(name) : CompiledTemplate::kNoSlot;
  const bool endsLine = !compiled || m_bringsTokens || record.isMultiParameter() ||
                        (slot != CompiledTemplate::kNoSlot && compiled->endsLine(slot));
  const auto endsInBackslash = [](const QString& part) { return part.endsWith(QLatin1Char('\\')); };
  if (endsLine && std::any_of(parts.cbegin(), parts.cend(), endsInBackslash)) {
    return kEndsInBackslash;
  }
  return name == kIdentifierParameter ? refuseIdentifier(stored) : 0;
}

long MappingFileChecks::refuseIdentifier(const QString& value) const {
  if (!value.contains(kMacroOpen)) {
    return 0;
  }
  // Such a name is wrapped in quotes when it holds a blank itself, without a change to what stands inside.
  QString expanded = value;
  if (!expandMacros(expanded)) {
    return kGrowsWithoutEnd;
  }
  const bool isSplit = !value.contains(QLatin1Char(' ')) && expanded.contains(QLatin1Char(' '));
  const bool isBroken = isSplit || expanded.contains(QLatin1Char('\t')) ||
                        expanded.contains(QLatin1Char('"')) || expanded.endsWith(QLatin1Char('\\'));
  return isBroken ? kIdentifierInScript : 0;
}

long MappingFileChecks::refuseLookup(const TransformParamCfg& record, const QString& value) const {
  if (((value.isEmpty() || value == kUnusedValue) && record.getFlag(kGUITypeOmittable)) ||
      ExpressionWriter::needsWrapping(record, value)) {
    return 0;
  }
  const ChoiceList& choices = record.choices();
  const bool isRunTime = m_cfg.listener() && m_cfg.listener()->isRunTimeValue(m_cfg, value);
  const bool isProcedure =
      !isRunTime && record.getType().startsWith(kChoiceType) && !ExpressionWriter::holdsReference(value);
  if (!isRunTime && !isProcedure) {
    return 0;
  }
  const QString identifier = m_cfg.getIdentifier();
  if (!mapping_file_checks::closesDeferredMacros(choices, {value, record.getDescription(), identifier})) {
    return kUnclosedReference;
  }
  if (const long number = refuseChoices(choices)) {
    return number;
  }
  BoxLookup lookup{value, record.getDescription(), QLatin1Char('x') + record.getName(), identifier,
                   record.getFlag(kGUITypeOptional)};
  for (QString* text : {&lookup.value, &lookup.prompt, &lookup.identifier}) {
    if (!expandMacros(*text)) {
      return kGrowsWithoutEnd;
    }
  }
  if (isProcedure) {
    return refuseChoiceProcedure(choices, lookup.macro, lookup.value);
  }
  return ORX_isListBoxType(record) ? refuseListBox(choices, lookup) : refuseChoiceBox(choices, lookup);
}

// Choices may refer to macros as well; those that do must fit wherever they stand.
long MappingFileChecks::refuseChoices(const ChoiceList& choices) const {
  for (const auto& [shown, stored] : choices.entries()) {
    for (QString text : {shown, stored}) {
      const bool refers = text.contains(kMacroOpen) || text.contains(kDeferredOpen);
      if (refers && (!expandMacros(text) || !fitsFragment(text))) {
        return kChoiceInScript;
      }
    }
  }
  return 0;
}

bool MappingFileChecks::expandMacros(QString& text) const {
  text = MFBuffer::withOrdinaryMacros(text);
  return !m_cfg.listener() || m_cfg.listener()->expandMacros(m_cfg, text);
}
