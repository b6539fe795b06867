// Changes places of a document in XML or JSON by a table of updates.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT XMLUpdaterTransformerCfg : public SpecialisedCfg<XMLUpdaterTransformerCfg> {
 public:
  explicit XMLUpdaterTransformerCfg(bool isJson) : m_isJson(isJson) {}

  bool isJson() const { return m_isJson; }
  XMLUpdaterTransformerCfg* blank() const { return new XMLUpdaterTransformerCfg(m_isJson); }
  // Refuses documents and values that are not well formed, paths that cannot be understood, and updates that
  // lack a value.
  bool validateParameter(const QString& parameter, QString& message) const override;
  // Paths are written from the root on without its sign; what is removed has no value.
  QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                          MFBuffer& buffer) const override;

 private:
  bool validateDocument(QString& message) const;
  bool validateUpdates(QString& message) const;

  const bool m_isJson;
};
