#include <transform/custom/SubDocNetworkObjLoop.h>

SubDocNetworkObjLoop::SubDocNetworkObjLoop(const QString& name, int number)
    : SubDocNetworkObj(Kind::Loop, number, name) {}

void SubDocNetworkObjLoop::compute(MetAttributes& met) {
  setLeaving(collect(met));
}

AttributeSet SubDocNetworkObjLoop::getAttributes(const QString&) const {
  return isComputed() ? leaving() : AttributeSet();
}
