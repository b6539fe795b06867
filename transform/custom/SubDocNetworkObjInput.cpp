#include <transform/custom/SubDocNetworkObjInput.h>

SubDocNetworkObjInput::SubDocNetworkObjInput(const QString& name, int number, int position)
    : SubDocNetworkObj(Kind::Input, number, name), m_position(position) {}

void SubDocNetworkObjInput::compute(QHash<QString, QString>& origins) {
  QStringList merged;
  const QStringList& arriving = collect(merged, origins);
  if (m_staticAttributes.isEmpty() && arriving.isEmpty()) {
    setLeaving(m_attributes);
  } else {
    QStringList all = m_staticAttributes + m_attributes + arriving;
    all.removeDuplicates();
    setLeaving(all);
  }
  noteOrigins(leaving(), origins);
}

QStringList SubDocNetworkObjInput::getAttributes(const QString& port) const {
  return isComputed() ? withCopies(port, leaving()) : QStringList();
}
