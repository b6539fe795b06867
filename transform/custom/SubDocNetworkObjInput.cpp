#include <transform/custom/SubDocNetworkObjInput.h>

SubDocNetworkObjInput::SubDocNetworkObjInput(const QString& name, int number, int position)
    : SubDocNetworkObj(Kind::Input, number, name), m_position(position) {}

AttributeSet SubDocNetworkObjInput::ownAttributes() const {
  AttributeSet own = m_staticAttributes;
  own.add(m_attributes);
  return own;
}

void SubDocNetworkObjInput::compute(MetAttributes& met) {
  AttributeSet all = ownAttributes();
  all.add(collect(met));
  setLeaving(all);
  noteOrigins(leaving(), met);
}

AttributeSet SubDocNetworkObjInput::getAttributes(const QString&) const {
  return isComputed() ? leaving() : AttributeSet();
}
