// An inner transformer, as a node of a custom transformer's network. Owns its configuration.
#pragma once

#include <transform/custom/SubDocNetworkObj.h>
#include <transform/workspace/ParameterLines.h>

#include <memory>

class TransformerCfg;

class ORX_EXPORT SubDocNetworkObjXformer : public SubDocNetworkObj {
 public:
  // `inputAttributes` are known to reach an input beside what its links bring, by input tag.
  SubDocNetworkObjXformer(std::unique_ptr<TransformerCfg> cfg,
                          const QHash<QString, QStringList>& inputAttributes, int number);
  ~SubDocNetworkObjXformer() override;

  void compute(MetAttributes& met) override;
  // Asks the configuration.
  AttributeSet getAttributes(const QString& port) const override;
  virtual TransformerCfg* getTransformer() const;

  // Attributes that a user added to what leaves an output, by output tag.
  const QHash<QString, QStringList>& exposedAttributes() const { return m_exposed; }
  void setExposedAttributes(const QHash<QString, QStringList>& attributes) { m_exposed = attributes; }
  // In the file that the network was read from.
  const ParameterLines& parameterLines() const { return m_parameterLines; }
  void setParameterLines(ParameterLines lines) { m_parameterLines = std::move(lines); }

 private:
  // What reached a port at the last compute().
  struct Inlet {
    QString port;
    AttributeSet attributes;
  };

  QHash<QString, AttributeSet> arrivedByTag() const;

  std::unique_ptr<TransformerCfg> m_cfg;
  QHash<QString, AttributeSet> m_inputAttributes;
  QHash<QString, QStringList> m_exposed;
  ParameterLines m_parameterLines;
  std::vector<Inlet> m_inlets;
  QHash<QString, AttributeSet> m_arrivedByTag;  // what the configuration is given
};
