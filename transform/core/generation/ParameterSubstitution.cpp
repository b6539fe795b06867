#include <platform/qorxcore/Lists.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/OrderedSubstitution.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/generation/TemplateExpansion.h>
#include <transform/text/TextHelpers.h>

namespace {

bool isUnset(const QString& value) {
  return value.isEmpty() || value == kUnusedValue;
}

bool isNeeded(const TransformParamCfg& record, const CompiledTemplate& compiled) {
  return record.isMultiParameter() || compiled.slotOf(record.getName()) != CompiledTemplate::kNoSlot ||
         compiled.slotOf(kValueListToken) != CompiledTemplate::kNoSlot || record.choices().hasLookup();
}

}  // namespace

bool ParameterSubstitution::hasValue(const TransformParamCfg& record) {
  const QString& type = record.getType();
  return !type.contains(QLatin1String("GROUP")) && !type.contains(QLatin1String("DIVIDER")) &&
         !type.contains(QLatin1String("MESSAGE"));
}

void ParameterSubstitution::collect(MFBuffer& buffer, const CompiledTemplate* needed) {
  m_entries.resize(m_records.size());
  for (std::size_t position = 0; position < m_records.size(); ++position) {
    if (!needed || isNeeded(m_records[position], *needed)) {
      collect(position, buffer);
    }
  }
}

void ParameterSubstitution::collectRest(MFBuffer& buffer) {
  for (std::size_t position = 0; position < m_records.size(); ++position) {
    if (!m_entries[position].isCollected) {
      collect(position, buffer);
    }
  }
}

void ParameterSubstitution::collect(std::size_t position, MFBuffer& buffer) {
  const TransformParamCfg& record = m_records[position];
  const QString name = record.getName();
  Entry& entry = m_entries[position];
  entry.isCollected = true;
  QString value = m_cfg.getParameterValueForMappingFile(name, &record, buffer);
  if (record.isMultiParameter()) {
    const QStringList parts = QORXSdfStringToList(value, record.members().separator());
    for (int i = 0; i + 1 < parts.size(); i += 2) {
      entry.tokens.push_back({parts.at(i), parts.at(i + 1), true});
      m_members.insert(parts.at(i));
    }
    return;
  }
  if (isUnset(value) && record.getFlag(kGUITypeOmittable)) {
    entry.removesLines = true;
    return;
  }
  const bool isListed = name != kIdentifierParameter && hasValue(record);
  entry.tokens.push_back({name, std::move(value), isListed});
}

bool ParameterSubstitution::isSubstituted(const QString& token) const {
  return m_cfg.hasParameter(token) || m_members.contains(token) || token.startsWith(kInputTokenStart) ||
         token.startsWith(kOutputTokenStart) || token == kUuidToken || token == kEncodedNameToken ||
         token == kSchemaToken || token == kValueListToken;
}

bool ParameterSubstitution::bringsTokens() const {
  for (const Entry& entry : m_entries) {
    for (const Token& token : entry.tokens) {
      if (!TemplateExpansion::isInert(token.value,
                                      [this](const QString& name) { return isSubstituted(name); })) {
        return true;
      }
    }
  }
  return false;
}

void ParameterSubstitution::apply(OrderedSubstitution& lines) const {
  for (std::size_t position = 0; position < m_entries.size(); ++position) {
    if (m_entries[position].removesLines) {
      lines.removeLinesWith(m_records[position].getName());
    }
  }
  std::vector<const Token*> deferred;
  const TransformerCfgListener* listener = m_cfg.listener();
  QHash<QString, const Token*> byName;
  for (const Entry& entry : m_entries) {
    for (const Token& token : entry.tokens) {
      lines.substitute(token.name, token.value);
      if (!byName.contains(token.name)) {
        byName.insert(token.name, &token);
      }
      if (listener && listener->isDeferredValue(m_cfg, token.value)) {
        deferred.push_back(&token);
      }
    }
  }
  // Once more, and then what the value itself refers to: that may have been substituted before it came in.
  for (const Token* token : deferred) {
    lines.substitute(token->name, token->value);
    TokenScanner scanner(token->value);
    while (scanner.next()) {
      const Token* inner = byName.value(scanner.name().toString());
      if (inner && inner->name != token->name) {
        lines.substitute(inner->name, inner->value);
      }
    }
  }
}

void ParameterSubstitution::apply(TemplateExpansion& expansion, const CompiledTemplate& compiled) const {
  for (std::size_t position = 0; position < m_entries.size(); ++position) {
    const Entry& entry = m_entries[position];
    if (entry.removesLines) {
      expansion.removeLinesOf(compiled.slotOf(m_records[position].getName()));
    }
    for (const Token& token : entry.tokens) {
      expansion.setValue(compiled.slotOf(token.name), token.value);
    }
  }
}

QString ParameterSubstitution::valueList() const {
  QString list;
  for (const Entry& entry : m_entries) {
    for (const Token& token : entry.tokens) {
      if (token.isListed) {
        list += QLatin1String("    ") + token.name + QLatin1Char(' ') + quotifyStringForMF(token.value) +
                QLatin1Char('\n');
      }
    }
  }
  return list;
}
