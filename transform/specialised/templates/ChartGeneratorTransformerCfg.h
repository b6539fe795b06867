// Draws the values of features as a chart of one or several series.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT ChartGeneratorTransformerCfg : public SpecialisedCfg<ChartGeneratorTransformerCfg> {
 public:
  // Of the series, those alone that charts of the kind make use of.
  QStringList getAttributeNamesInValue(const QString& parameter) const override;
  // Refuses series that lack what the kind of chart needs, and sizes that no picture can have.
  bool validateParameter(const QString& parameter, QString& message) const override;
  // A series without a label gets that of its values; what the chart does not use is left out.
  QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                          MFBuffer& buffer) const override;
  // Earlier builds stored "&NAME" for attributes, and columns for bars.
  void autoUpgradeTransformer() override;

 private:
  bool isKind(const QString& kind, UnpackLevel level) const;
  // A histogram counts values wherever they stand.
  bool usesPositions(UnpackLevel level) const;
  bool validateSeries(QString& message) const;
  bool validateSize(const QString& parameter, QString& message) const;
};
