// An input port of a custom transformer, as a node of its network.
#pragma once

#include <transform/custom/SubDocNetworkObj.h>

class ORX_EXPORT SubDocNetworkObjInput : public SubDocNetworkObj {
 public:
  SubDocNetworkObjInput(const QString& name, int number, int position);

  void compute(MetAttributes& met) override;
  // The static attributes, those that were set, then those that links send back, each name once.
  AttributeSet getAttributes(const QString& port) const override;

  using SubDocNetworkObj::setName;
  // Among the input ports, as the document has them.
  int position() const { return m_position; }
  const AttributeSet& setAttributes() const { return m_attributes; }
  void setAttributes(const AttributeSet& attributes) { m_attributes = attributes; }
  const AttributeSet& staticAttributes() const { return m_staticAttributes; }
  void setStaticAttributes(const AttributeSet& attributes) { m_staticAttributes = attributes; }
  // Both, the static ones in front.
  AttributeSet ownAttributes() const;

 private:
  int m_position;
  AttributeSet m_attributes;
  AttributeSet m_staticAttributes;  // what the port's author declared
};
