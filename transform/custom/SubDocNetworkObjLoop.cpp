#include <transform/custom/SubDocNetworkObjLoop.h>

SubDocNetworkObjLoop::SubDocNetworkObjLoop(const QString& name, int number)
    : SubDocNetworkObj(number), m_name(name) {}

void SubDocNetworkObjLoop::compute(QHash<QString, QString>& origins) {
  noteComputed(collectAll(origins));
}

QStringList SubDocNetworkObjLoop::getAttributes(const QString& port) const {
  return isComputed() ? withCopies(port, arrived()) : QStringList();
}
