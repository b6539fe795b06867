#include <transform/custom/AttributeFlow.h>
#include <transform/custom/CompoundTransformerCfg.h>

#include <typeinfo>

namespace attribute_flow {

void enter(TransformerCfg& cfg, const QHash<QString, AttributeSet>& attributes) {
  if (typeid(cfg) == typeid(CompoundTransformerCfg))
    static_cast<CompoundTransformerCfg&>(cfg).setArrivingAttributes(attributes);
  else
    cfg.setArrivingAttributes(attributes);
}

AttributeSet leaving(const TransformerCfg& cfg, const QString& tag) {
  return typeid(cfg) == typeid(CompoundTransformerCfg)
             ? static_cast<const CompoundTransformerCfg&>(cfg).leavingAttributes(tag)
             : cfg.leavingAttributes(tag);
}

}  // namespace attribute_flow
