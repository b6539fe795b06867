#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/generation/LookupDecision.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/validation/OwnTokens.h>

namespace {

using carried_references::Spelling;

constexpr int kDeepest = 64;
constexpr int kLargest = 1 << 18;

// The value of a token; where a fragment looks it up when the mapping file runs, what it will find.
QString lookedUp(const TransformerCfg& cfg, const ParameterSubstitution::Token& token) {
  const TransformParamCfg* record = cfg.getParameterByMacroName(token.name);
  QString stored = record ? record->getValue() : QString();
  const bool isLookedUp = record && lookupKind(cfg, *record, stored) == LookupKind::RunTime;
  return isLookedUp && carried_references::knownAround(cfg).expand(stored)
             ? single_choices::toStored(*record, stored)
             : token.value;
}

}  // namespace

OwnTokens::OwnTokens(const TransformerCfg& cfg, const ParameterSubstitution& values) : m_cfg(cfg) {
  for (const ParameterSubstitution::Token& token : values.tokens()) {
    if (m_values.contains(token.name))
      continue;
    const bool isCall = token.value.startsWith(kEvaluateCall) || token.value.startsWith(kProcedureCall) ||
                        (token.name == kIdentifierParameter && token.value.startsWith(QLatin1Char('"')));
    const Spelling own = token.type ? carried_references::spellingOf(*token.type) : Spelling::Plain;
    m_values.insert(token.name, {lookedUp(cfg, token), isCall ? Spelling::Call : own});
  }
}

// The value that is its own token refers to the parameter of that name around the transformer.
bool OwnTokens::leadsAround(const QString& token, const QString& value) const {
  return value == kMacroOpen + token + QLatin1Char(')') && carried_references::isAround(m_cfg, token);
}

Spelling OwnTokens::spellingOf(const QString& token) const {
  const auto own = m_values.constFind(token);
  return own == m_values.constEnd() || leadsAround(token, own->text) ? Spelling::Unknown : own->spelling;
}

bool OwnTokens::carryOut(QString& text) const {
  QStringList open;
  return carryOut(text, open);
}

bool OwnTokens::carryOut(QString& text, QStringList& open) const {
  bool ends = true;
  int size = text.size();
  text = replaceParameterReferences(text, [&](const QString& name, QString& value) {
    if (!ends || !m_values.contains(name))
      return false;
    Value own = m_values.value(name);
    value = own.text;
    if (leadsAround(name, value))
      return false;
    if (!own.isCarriedOut) {
      own.ends = open.size() < kDeepest && !open.contains(name);
      if (own.ends) {
        open.append(name);
        own.ends = carryOut(own.text, open);
        open.removeLast();
      }
      own.isCarriedOut = true;
      m_values.insert(name, own);
    }
    value = own.text;
    ends = own.ends;
    size += value.size();
    ends = ends && size <= kLargest;
    return ends;
  });
  return ends;
}
