#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/WrittenValues.h>

#include <typeinfo>

WrittenValues::WrittenValues(const TransformerCfg& cfg, bool bringsTokens)
    : m_cfg(cfg),
      m_compiled(cfg.definition() ? cfg.definition()->compiledTemplate.get() : nullptr),
      m_bringsTokens(bringsTokens) {}

bool WrittenValues::hasValue(const TransformParamCfg& record) {
  const QString& type = record.getType();
  return !type.contains(QLatin1String("GROUP")) && !type.contains(QLatin1String("DIVIDER")) &&
         !type.contains(QLatin1String("MESSAGE"));
}

// These values go into the statement that divides the work, whatever the template says.
bool WrittenValues::isMultiProcessSetting(const TransformParamCfg& record) const {
  const QString& groupBy = m_cfg.definition()->fields.multiProcess;
  const QString& name = record.getName();
  return !groupBy.isEmpty() &&
         (name == groupBy || name == kProcessCountParameter || name == kGroupsOrderedParameter);
}

bool WrittenValues::isToken(const TransformParamCfg& record) const {
  return m_compiled && m_compiled->slotOf(record.getName()) != CompiledTemplate::kNoSlot;
}

bool WrittenValues::isWord(const TransformParamCfg& record) const {
  return m_compiled &&
         (isMultiProcessSetting(record) ||
          (hasValue(record) && m_compiled->slotOf(kValueListToken) != CompiledTemplate::kNoSlot));
}

bool WrittenValues::isWrittenByRows(const TransformParamCfg& record) const {
  return record.isTable() && m_compiled && typeid(m_cfg) != typeid(TransformerCfg) && !isToken(record);
}

bool WrittenValues::mayEndLine(const TransformParamCfg& record) const {
  return !m_compiled || m_bringsTokens || record.isMultiParameter() ||
         (isToken(record) && m_compiled->endsLine(m_compiled->slotOf(record.getName())));
}

bool WrittenValues::contains(const TransformParamCfg& record) const {
  const auto holds = [this](const QString& token) {
    return m_compiled->slotOf(token) != CompiledTemplate::kNoSlot;
  };
  return !m_compiled || m_bringsTokens || record.isMultiParameter() || record.choices().hasLookup() ||
         isToken(record) || isWrittenByRows(record) || isMultiProcessSetting(record) ||
         // It stands in every name.
         record.getName() == kIdentifierParameter || (hasValue(record) && holds(kValueListToken));
}
