#include <transform/custom/SubDocNetworkObjOutput.h>

SubDocNetworkObjOutput::SubDocNetworkObjOutput(const QString& name, int number,
                                               OutgoingAttributePropogationMode mode,
                                               const QStringList& ownAttributes, int position)
    : SubDocNetworkObj(Kind::Output, number, name),
      m_position(position),
      m_mode(mode),
      m_ownAttributes(ownAttributes) {}

void SubDocNetworkObjOutput::setMode(OutgoingAttributePropogationMode mode,
                                     const QStringList& ownAttributes) {
  m_mode = mode;
  m_ownAttributes = ownAttributes;
}

void SubDocNetworkObjOutput::compute(MetAttributes& met) {
  const AttributeSet arriving = collect(met);
  setLeaving(m_mode == kOutgoingOwnList ? AttributeSet(m_ownAttributes) : arriving);
  noteOrigins(leaving(), met);
}

AttributeSet SubDocNetworkObjOutput::getAttributes(const QString&) const {
  return isComputed() ? leaving() : AttributeSet();
}
