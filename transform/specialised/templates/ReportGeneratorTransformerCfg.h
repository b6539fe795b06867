// Writes a page in HTML from a table of its parts: headings, texts, pictures, links, tables of features.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT ReportGeneratorTransformerCfg : public SpecialisedCfg<ReportGeneratorTransformerCfg> {
 public:
  // Of the parts, what their kinds make use of.
  QStringList getAttributeNamesInValue(const QString& parameter) const override;
  // Refuses parts that lack what their kind needs, and addresses that are none.
  bool validateParameter(const QString& parameter, QString& message) const override;
  // What a part does not use is left out.
  QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                          MFBuffer& buffer) const override;
  // Earlier builds stored "&NAME" for attributes, and other names for some kinds.
  void autoUpgradeTransformer() override;

 private:
  bool validateParts(QString& message) const;
};
