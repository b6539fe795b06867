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

void SubDocNetworkObjOutput::compute(QHash<QString, QString>& origins) {
  QStringList merged;
  const QStringList& arriving = collect(merged, origins);
  if (m_mode == kOutgoingOwnList) {
    setLeaving(m_ownAttributes);
    noteOrigins(m_ownAttributes, origins);
  } else {
    setLeaving(arriving);
  }
}

QStringList SubDocNetworkObjOutput::getAttributes(const QString&) const {
  return isComputed() ? leaving() : QStringList();
}
