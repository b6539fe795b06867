#include <platform/qorxcore/Lists.h>
#include <transform/core/CarriedReferences.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/generation/Substitution.h>
#include <transform/core/generation/TemplateExpansion.h>
#include <transform/core/generation/WrittenValues.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>

namespace {

constexpr int kMostRounds = 64;

QStringList partsOf(const TransformParamCfg& record, const QString& value) {
  return QORXSdfStringToList(value, record.members().separator());
}

}  // namespace

ParameterSubstitution::ParameterSubstitution(const TransformerCfg& cfg,
                                             const std::vector<TransformParamCfg>& records)
    : m_cfg(cfg), m_records(records) {
  for (const TransformParamCfg& record : records) {
    if (record.isMultiParameter()) {
      const QStringList parts =
          partsOf(record, stripBasicStringInfo(cfg.getParameterValue(record.getName())));
      for (int i = 0; i + 1 < parts.size(); i += 2) {
        m_members.insert(parts.at(i));
      }
    }
  }
}

bool ParameterSubstitution::isSubstituted(const QString& token) const {
  return m_cfg.hasParameter(token) || m_members.contains(token) || token.startsWith(kInputTokenStart) ||
         token.startsWith(kOutputTokenStart) || token == kUuidToken || token == kEncodedNameToken ||
         token == kSchemaToken || token == kValueListToken;
}

bool ParameterSubstitution::isInert(const QString& text) const {
  return TemplateExpansion::isInert(text, [this](const QString& name) { return isSubstituted(name); });
}

bool ParameterSubstitution::isInert(const TransformParamCfg& record) const {
  const QString& name = record.getName();
  const QString stored = m_cfg.getParameterValue(name);
  if (!stored.contains(QLatin1Char('$')) && !record.choices().hasLookup() && name != kIdentifierParameter) {
    return true;
  }
  const QString value = stripBasicStringInfo(stored);
  // The identifier is also written decoded.
  if (name == kIdentifierParameter && !isInert(m_cfg.getParameterValue(name, UnpackLevel::Decoded))) {
    return false;
  }
  QStringList parts(value);
  if (record.isMultiParameter()) {
    parts += partsOf(record, single_choices::toStored(record, value));
  } else if (record.choices().hasLookup()) {
    parts += single_choices::toStored(record, value);
  }
  return std::all_of(parts.cbegin(), parts.cend(), [this](const QString& part) { return isInert(part); });
}

QString ParameterSubstitution::firstWithTokens() const {
  const auto found = std::find_if(m_records.begin(), m_records.end(),
                                  [this](const TransformParamCfg& record) { return !isInert(record); });
  return found == m_records.end() ? QString() : found->getName();
}

bool ParameterSubstitution::bringsTokens() const {
  return !firstWithTokens().isEmpty();
}

void ParameterSubstitution::collect(MFBuffer& buffer, bool onlyWritten) {
  const WrittenValues written(m_cfg, /*bringsTokens=*/!onlyWritten);
  m_entries.assign(m_records.size(), {});
  for (std::size_t position = 0; position < m_records.size(); ++position) {
    if (written.contains(m_records[position])) {
      collect(position, buffer);
    }
  }
}

void ParameterSubstitution::collect(std::size_t position, MFBuffer& buffer) {
  const TransformParamCfg& record = m_records[position];
  const QString name = record.getName();
  Entry& entry = m_entries[position];
  const ConfiguredDefinition* definition = m_cfg.definition();
  const CompiledTemplate* compiled = definition ? definition->compiledTemplate.get() : nullptr;
  const auto add = [&](const QString& token, const QString& value, const GUIType* type, bool isListed) {
    const bool isWord = compiled && type && type->valueIsEncoded();
    entry.tokens.push_back(
        {token, isWord ? TextPlaces::withoutKeyword(value, compiled->keys()) : value, type, isListed});
  };
  const QString value = m_cfg.getParameterValueForMappingFile(name, &record, buffer);
  if (record.isMultiParameter()) {
    const QStringList parts = partsOf(record, value);
    QHash<QString, QString> given;
    for (int i = 0; i + 1 < parts.size(); i += 2) {
      if (!given.contains(parts.at(i))) {
        add(parts.at(i), parts.at(i + 1), record.members().find(parts.at(i)), true);
        given.insert(parts.at(i), parts.at(i + 1));
      }
    }
    const bool isOmitted = isUnsetValue(value) && record.getFlag(kGUITypeOmittable);
    for (const GUIType& member : record.members().members()) {
      const QString& token = member.getName();
      if (isOmitted || (member.getFlag(kGUITypeOmittable) && isUnsetValue(given.value(token)))) {
        entry.removed << token;
      }
      if (!given.contains(token)) {
        add(token, QString(), nullptr, false);
      }
    }
    return;
  }
  if (isUnsetValue(value) && record.getFlag(kGUITypeOmittable)) {
    entry.removed << name;
    return;
  }
  add(name, value, &record, name != kIdentifierParameter && WrittenValues::hasValue(record));
}

std::vector<ParameterSubstitution::Token> ParameterSubstitution::tokens() const {
  std::vector<Token> tokens;
  for (const Entry& entry : m_entries) {
    tokens.insert(tokens.end(), entry.tokens.begin(), entry.tokens.end());
    for (const QString& token : entry.removed) {
      if (!carried_references::isAround(m_cfg, token)) {
        tokens.push_back({token, QString(), nullptr, false});
      }
    }
  }
  return tokens;
}

void ParameterSubstitution::putInto(Substitution& lines) const {
  const bool wantsList = lines.contains(kValueListToken);
  for (const Entry& entry : m_entries) {
    for (const QString& token : entry.removed) {
      lines.removeLinesWith(token);
    }
  }
  for (const Entry& entry : m_entries) {
    for (const Token& token : entry.tokens) {
      lines.substitute(token.name, token.value);
    }
  }
  if (m_cfg.listener()) {
    putDeferred(lines);
  }
  for (const Token& token : tokens()) {
    if (!token.type && lines.contains(token.name)) {
      lines.substitute(token.name, token.value);
    }
  }
  if (wantsList) {
    lines.substitute(kValueListToken, valueList());
  }
}

// Once more, and then what the value itself refers to: that may have been substituted before it came in, and
// may in turn refer to what was.
void ParameterSubstitution::putDeferred(Substitution& lines) const {
  std::vector<const Token*> deferred;
  for (const Entry& entry : m_entries) {
    for (const Token& token : entry.tokens) {
      if (m_cfg.listener()->isDeferredValue(m_cfg, token.value)) {
        deferred.push_back(&token);
      }
    }
  }
  if (deferred.empty()) {
    return;
  }
  QHash<QString, QString> byName;
  for (const Token& token : tokens()) {
    if (!byName.contains(token.name)) {
      byName.insert(token.name, token.value);
    }
  }
  bool isLeft = true;
  for (int round = 0; isLeft && round < kMostRounds; ++round) {
    isLeft = false;
    for (const Token* token : deferred) {
      if (round == 0) {
        lines.substitute(token->name, token->value);
      }
      TokenScanner scanner(token->value);
      while (scanner.next()) {
        const auto inner = byName.constFind(scanner.name().toString());
        if (inner != byName.constEnd() && inner.key() != token->name && lines.contains(inner.key())) {
          lines.substitute(inner.key(), inner.value());
          isLeft = true;
        }
      }
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
