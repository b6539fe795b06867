#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/InnerTransformerListener.h>
#include <transform/custom/ParameterReferences.h>

namespace {

// Values refer to the parameters of the custom transformer around, whose values refer to the next one: what
// one question may cost, and how long a value may become on the way, is bounded. What is left over stays a
// reference.
constexpr int kMostReplacements = 1000;
constexpr int kLongestValue = 1 << 18;

struct Budget {
  int depth = 0;
  int replacements = 0;
};

Budget& budget() {
  static thread_local Budget budget;
  return budget;
}

}  // namespace

QString InnerTransformerListener::valueOf(const QString& parameter) const {
  const TransformerCfg* instance = m_network.attributeOwner();
  return instance ? instance->getParameterValue(parameter, UnpackLevel::Resolved)
                  : m_network.getParameterInfo(parameter)->defaultValue;
}

QString InnerTransformerListener::resolve(const QString& value) const {
  if (!value.contains(kMacroOpen))
    return value;
  Budget& left = budget();
  if (left.depth++ == 0)
    left.replacements = 0;
  int length = value.size();
  const QString resolved = replaceParameterReferences(value, [&](const QString& name, QString& replacement) {
    if (!m_network.hasParameter(name) || left.depth > CompoundTransformerNetwork::kDeepestNesting ||
        ++left.replacements > kMostReplacements)
      return false;
    replacement = valueOf(name);
    length += replacement.size();
    return length <= kLongestValue;
  });
  --left.depth;
  return resolved;
}

QString InnerTransformerListener::unpackValue(const TransformerCfg&, const QString& value, bool isEncoded,
                                              UnpackLevel level) const {
  if (level == UnpackLevel::Stored)
    return value;
  const QString resolved = resolve(value);
  return level == UnpackLevel::Decoded && isEncoded ? QORXWwjdDecode(resolved) : resolved;
}

bool InnerTransformerListener::isRunTimeValue(const TransformerCfg&, const QString& value) const {
  return anyParameterReference(value, [this](const QString& name) { return m_network.hasParameter(name); });
}

bool InnerTransformerListener::isDeferredValue(const TransformerCfg& cfg, const QString& value) const {
  return anyParameterReference(
      value, [&cfg](const QString& name) { return cfg.getParameterByMacroName(name) != nullptr; });
}

bool InnerTransformerListener::acceptsValue(const TransformerCfg& cfg, const QString&,
                                            const QString& value) const {
  return isRunTimeValue(cfg, value);
}

QString InnerTransformerListener::resolveUserTypedMacro(const TransformerCfg&, const QString& value,
                                                        UnpackLevel) const {
  return resolve(value);
}

QString InnerTransformerListener::resolveDefaultValue(const TransformerCfg&, const QString& value) const {
  return resolve(value);
}

bool InnerTransformerListener::expandMacros(const TransformerCfg& cfg, QString& text) const {
  return expandByUnpacking(cfg, text);
}
