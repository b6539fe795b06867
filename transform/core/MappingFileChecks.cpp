#include <transform/core/CompiledTemplate.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/MappingFileChecks.h>
#include <transform/core/OrderedSubstitution.h>
#include <transform/core/ParameterSubstitution.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>

#include <algorithm>

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

bool MappingFileChecks::isReached(const TransformParamCfg& record, const CompiledTemplate* compiled) const {
  // Without a template the values are written as macros.
  return !compiled || m_bringsTokens || record.isMultiParameter() ||
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
  if (!isOneLine(value)) {
    return kBreaksLine;
  }
  if (!isSelfClosed(value)) {
    return kUnclosedReference;
  }
  const int slot = compiled ? compiled->slotOf(name) : CompiledTemplate::kNoSlot;
  const bool endsLine = !compiled || m_bringsTokens || record.isMultiParameter() ||
                        (slot != CompiledTemplate::kNoSlot && compiled->endsLine(slot));
  if (endsLine && value.endsWith(QLatin1Char('\\'))) {
    return kEndsInBackslash;
  }
  return name == kIdentifierParameter ? refuseIdentifier(stored) : 0;
}

long MappingFileChecks::refuseIdentifier(const QString& value) const {
  // Such a name is wrapped in quotes without a change to what stands inside.
  const bool isBroken =
      value.contains(kMacroOpen) && (value.contains(QLatin1Char('"')) || value.endsWith(QLatin1Char('\\')));
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
  const QString own = QLatin1Char('x') + record.getName();
  if (isProcedure) {
    return refuseChoiceProcedure(choices, own, value);
  }
  const BoxLookup lookup{value, record.getDescription(), own, identifier, record.getFlag(kGUITypeOptional)};
  return ORX_isListBoxType(record) ? refuseListBox(choices, lookup) : refuseChoiceBox(choices, lookup);
}
