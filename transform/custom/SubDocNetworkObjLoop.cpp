#include <transform/custom/SubDocNetworkObjLoop.h>

SubDocNetworkObjLoop::SubDocNetworkObjLoop(const QString& name, int number)
    : SubDocNetworkObj(Kind::Loop, number, name) {}

void SubDocNetworkObjLoop::compute(QHash<QString, QString>& origins) {
  QStringList merged;
  setLeaving(collect(merged, origins));
}

QStringList SubDocNetworkObjLoop::getAttributes(const QString& port) const {
  return isComputed() ? withCopies(port, leaving()) : QStringList();
}
