// An output port of a custom transformer, as a node of its network.
#pragma once

#include <transform/custom/AttributePropogationMode.h>
#include <transform/custom/SubDocNetworkObj.h>

class ORX_EXPORT SubDocNetworkObjOutput : public SubDocNetworkObj {
 public:
  SubDocNetworkObjOutput(const QString& name, int number, OutgoingAttributePropogationMode mode,
                         const QStringList& ownAttributes, int position);

  void compute(MetAttributes& met) override;
  AttributeSet getAttributes(const QString& port) const override;

  using SubDocNetworkObj::setName;
  // Among the output ports, as the document has them.
  int position() const { return m_position; }
  OutgoingAttributePropogationMode mode() const { return m_mode; }
  const QStringList& ownAttributes() const { return m_ownAttributes; }
  void setMode(OutgoingAttributePropogationMode mode, const QStringList& ownAttributes);

 private:
  int m_position;
  OutgoingAttributePropogationMode m_mode;
  QStringList m_ownAttributes;
};
