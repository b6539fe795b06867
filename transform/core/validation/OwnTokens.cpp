#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/validation/OwnTokens.h>

namespace {

using carried_references::Spelling;

constexpr int kDeepest = 64;
constexpr int kLargest = 1 << 18;

}  // namespace

OwnTokens::OwnTokens(const TransformerCfg& cfg, const ParameterSubstitution& values) : m_cfg(cfg) {
  for (const ParameterSubstitution::Token& token : values.tokens()) {
    if (m_values.contains(token.name))
      continue;
    const bool isCall = token.value.startsWith(kEvaluateCall) || token.value.startsWith(kProcedureCall) ||
                        (token.name == kIdentifierParameter && token.value.startsWith(QLatin1Char('"')));
    const Spelling own = token.type ? carried_references::spellingOf(*token.type) : Spelling::Plain;
    m_values.insert(token.name, {token.value, isCall ? Spelling::Call : own});
  }
}

// The value that is its own token refers to the parameter of that name around the transformer.
bool OwnTokens::leadsAround(const QString& token, const QString& value) const {
  const TransformerCfgListener* listener = m_cfg.listener();
  return value == kMacroOpen + token + QLatin1Char(')') && listener && listener->isRunTimeValue(m_cfg, value);
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
