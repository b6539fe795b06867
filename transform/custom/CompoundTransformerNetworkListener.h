// Observer of a custom transformer's network, told of every change of it. Registered and removed by the
// observer itself; the network does not own it.
#pragma once

#include <platform/Export.h>

#include <QString>

class ORX_EXPORT CompoundTransformerNetworkListener {
 public:
  virtual ~CompoundTransformerNetworkListener();

  // Ports, nodes or links changed; `parametersChanged` tells whether the published parameters may have too.
  virtual void networkChanged(bool parametersChanged) = 0;
  // The network is going away: it must not be used any more, not even to remove the listener.
  virtual void networkDeleted() = 0;
  // A port has a new name. networkChanged() follows.
  virtual void renameIONode(bool isInput, const QString& oldName, const QString& newName) = 0;
};
