#include <transform/custom/SubDocNetworkObjInput.h>

SubDocNetworkObjInput::SubDocNetworkObjInput(const QString& name, int number, int position)
    : SubDocNetworkObj(number), m_name(name), m_position(position) {}

void SubDocNetworkObjInput::compute(QHash<QString, QString>& origins) {
  noteComputed(collectAll(origins));
  if (m_staticAttributes.isEmpty() && arrived().isEmpty()) {
    m_leaving = m_attributes;
    return;
  }
  m_leaving = m_staticAttributes + m_attributes + arrived();
  m_leaving.removeDuplicates();
}

QStringList SubDocNetworkObjInput::getAttributes(const QString& port) const {
  return isComputed() ? withCopies(port, m_leaving) : QStringList();
}
