#include <transform/custom/SubDocNetworkObjOutput.h>

SubDocNetworkObjOutput::SubDocNetworkObjOutput(const QString& name, int number,
                                               OutgoingAttributePropogationMode mode,
                                               const QStringList& ownAttributes, int position)
    : SubDocNetworkObj(number),
      m_name(name),
      m_position(position),
      m_mode(mode),
      m_ownAttributes(ownAttributes) {}

void SubDocNetworkObjOutput::setMode(OutgoingAttributePropogationMode mode,
                                     const QStringList& ownAttributes) {
  m_mode = mode;
  m_ownAttributes = ownAttributes;
}

void SubDocNetworkObjOutput::compute(QHash<QString, QString>& origins) {
  noteComputed(collectAll(origins));
  m_computed = m_mode == kOutgoingOwnList ? m_ownAttributes : arrived();
  if (m_mode != kOutgoingOwnList)
    return;
  for (const QString& attribute : qAsConst(m_ownAttributes)) {
    if (!origins.contains(attribute))
      origins.insert(attribute, m_name);
  }
}

QStringList SubDocNetworkObjOutput::getAttributes(const QString&) const {
  return isComputed() ? m_computed : QStringList();
}
