// Computes a number from an expression.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT ExpressionEvaluatorCfg : public SpecialisedCfg<ExpressionEvaluatorCfg> {
 public:
  // Refuses an expression that cannot be understood, as far as it is known before the mapping file runs.
  bool validateParameter(const QString& parameter, QString& message) const override;
  // The expression is evaluated before the factory sees it, so that what divides with fractions is settled by
  // the build that edited it last.
  QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                          MFBuffer& buffer) const override;
  // Earlier builds took the operators of programming languages.
  void autoUpgradeTransformer() override;
};
