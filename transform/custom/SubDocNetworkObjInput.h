// An input port of a custom transformer, as a node of its network.
#pragma once

#include <transform/custom/SubDocNetworkObj.h>

class ORX_EXPORT SubDocNetworkObjInput : public SubDocNetworkObj {
 public:
  SubDocNetworkObjInput(const QString& name, int number, int position);

  void compute(QHash<QString, QString>& origins) override;
  // The static attributes, those that were set, then those that links send back, each name once.
  QStringList getAttributes(const QString& port) const override;

  using SubDocNetworkObj::setName;
  // Among the input ports, as the document has them.
  int position() const { return m_position; }
  const QStringList& setAttributes() const { return m_attributes; }
  void setAttributes(const QStringList& attributes) { m_attributes = attributes; }
  const QStringList& staticAttributes() const { return m_staticAttributes; }
  void setStaticAttributes(const QStringList& attributes) { m_staticAttributes = attributes; }

 private:
  int m_position;
  QStringList m_attributes;
  QStringList m_staticAttributes;  // what the port's author declared
};
