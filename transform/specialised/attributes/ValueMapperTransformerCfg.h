// Gives an attribute the value that a table maps another attribute's value to.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT ValueMapperTransformerCfg : public SpecialisedCfg<ValueMapperTransformerCfg> {
 public:
  // Cells of the table may refer to attributes while they are not what is looked up.
  bool parameterSupportsAttributeReference(const QString& parameter) const override;
  // The direction has to be known when the statements are written.
  bool canCreateGlobalParameter(const QString& parameter) const override;
  // The table is written row by row, so it cannot be an expression as a whole.
  QStringList getSupportedValueTypes(const QString& parameter) const override;
  // Refuses what is looked up twice or differs by feature.
  bool validateParameter(const QString& parameter, QString& message) const override;
  // Earlier builds stored "&NAME" for attributes.
  void autoUpgradeTransformer() override;
  // Writes one statement for each row behind those of the template.
  bool doInstantiate(MFBuffer& buffer, bool inlineFlag) override;

 private:
  bool looksUpRight() const;
};
