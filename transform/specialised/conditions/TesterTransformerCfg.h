// Sends features one way or the other by a table of tests, each of which compares two values. All of them
// have to pass, or any, or an expression over their numbers says so.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT TesterTransformerCfg : public SpecialisedCfg<TesterTransformerCfg> {
 public:
  // The expression is one over numbers of tests, not attributes.
  bool parameterSupportsAttributeReference(const QString& parameter) const override;
  // Attributes that are tested for being there may be missing, and values that a comparison does not take
  // need none.
  void getMissingAttributeReferences(const QString& parameter, QStringList& missing,
                                     bool& hasReferences) const override;
  bool validateParameter(const QString& parameter, QString& message) const override;
  // Comparisons are written by their names, values that they do not take are left out.
  QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                          MFBuffer& buffer) const override;
  // Earlier builds stored symbols for comparisons and "&NAME" for attributes.
  void autoUpgradeTransformer() override;

 private:
  bool validateTests(QString& message) const;
  bool validateExpression(QString& message) const;
};
