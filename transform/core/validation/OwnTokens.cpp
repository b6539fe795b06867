#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/validation/OwnTokens.h>

namespace {

constexpr int kDeepest = 64;
constexpr int kLargest = 1 << 18;

}  // namespace

OwnTokens::OwnTokens(const TransformerCfg& cfg, const ParameterSubstitution& values) : m_cfg(cfg) {
  const QHash<QString, QString> texts = values.byToken();
  for (auto text = texts.cbegin(); text != texts.cend(); ++text)
    m_values.insert(text.key(), {text.value()});
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
    const TransformerCfgListener* listener = m_cfg.listener();
    if (value == kMacroOpen + name + QLatin1Char(')') && listener && listener->isRunTimeValue(m_cfg, value))
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
