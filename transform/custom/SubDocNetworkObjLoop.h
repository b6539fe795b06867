// A loop point of a custom transformer, to which features are sent back, as a node of its network.
#pragma once

#include <transform/custom/SubDocNetworkObj.h>

class ORX_EXPORT SubDocNetworkObjLoop : public SubDocNetworkObj {
 public:
  SubDocNetworkObjLoop(const QString& name, int number);

  void compute(MetAttributes& met) override;
  // What reaches the loop point passes on.
  AttributeSet getAttributes(const QString& port) const override;
};
