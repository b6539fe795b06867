#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedQuestion.h>
#include <transform/custom/ScriptParameters.h>
#include <transform/custom/instance/InnerTransformerListener.h>

namespace {

// Values refer to the parameters of the custom transformer around, whose values refer to the next one: what
// one question may cost, and how long a value may become on the way, is bounded. What is left over stays a
// reference, which is told.
constexpr int kMostReplacements = 1000;
constexpr int kLongestValue = 1 << 18;

constexpr auto kKind = NestedQuestion::Kind::Value;

}  // namespace

QString InnerTransformerListener::valueOf(const QString& parameter) const {
  const TransformerCfg* instance = m_network.attributeOwner();
  const QString value = instance ? instance->getParameterValue(parameter, UnpackLevel::Resolved)
                                 : m_network.getParameterInfo(parameter)->defaultValue;
  const GUIType& type = m_network.getParameterInfo(parameter)->type;
  return ORX_isChoiceType(type) ? single_choices::toStored(TransformParamCfg(type), value) : value;
}

QString InnerTransformerListener::resolve(const QString& value) const {
  if (!value.contains(kMacroOpen))
    return value;
  const NestedQuestion question(kKind);
  int length = value.size();
  return replaceParameterReferences(value, [&](const QString& name, QString& replacement) {
    if (!m_network.hasParameter(name) || isScript(name) ||
        NestedQuestion::depth(kKind) > CompoundTransformerNetwork::kDeepestNesting ||
        !NestedQuestion::spend(kKind, 1, kMostReplacements))
      return false;
    replacement = valueOf(name);
    length += replacement.size();
    return length <= kLongestValue || NestedQuestion::spend(kKind, kMostReplacements, 0);
  });
}

// What a script gives is known when it has run, not before.
bool InnerTransformerListener::isScript(const QString& parameter) const {
  return scriptLanguage(m_network.getParameterInfo(parameter)->type) != ScriptLanguage::None;
}

GUIType InnerTransformerListener::typeOf(const QString& parameter) const {
  return m_network.hasParameter(parameter) ? m_network.getParameterInfo(parameter)->type
                                           : GUIType::kNullGuiType;
}

bool InnerTransformerListener::isScopeParameter(const QString& name) const {
  return m_network.hasParameter(name);
}
