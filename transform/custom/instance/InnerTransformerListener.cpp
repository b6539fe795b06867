#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/ScriptParameters.h>
#include <transform/custom/instance/InnerTransformerListener.h>

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
    if (!m_network.hasParameter(name) || isScript(name) ||
        left.depth > CompoundTransformerNetwork::kDeepestNesting || ++left.replacements > kMostReplacements)
      return false;
    replacement = valueOf(name);
    length += replacement.size();
    return length <= kLongestValue;
  });
  --left.depth;
  return resolved;
}

// What a script gives is known when it has run, not before.
bool InnerTransformerListener::isScript(const QString& parameter) const {
  return scriptLanguage(m_network.getParameterInfo(parameter)->type) != ScriptLanguage::None;
}

bool InnerTransformerListener::isScopeParameter(const QString& name) const {
  return m_network.hasParameter(name);
}
