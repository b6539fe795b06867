// Removes all attributes whose names match a regular expression, or all others.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

#include <QRegularExpression>

class ORX_EXPORT AttributeExpressionRemoverTransformerCfg
    : public SpecialisedCfg<AttributeExpressionRemoverTransformerCfg> {
 public:
  bool parmValueAffectsOutputAttrs(const QString& parameter) const override;
  // Refuses an expression that is none, as far as it is known before the mapping file runs.
  bool validateParameter(const QString& parameter, QString& message) const override;
  // An expression that is not known yet, or is none, removes nothing.
  void transformAttr(const QString& attribute, QStringList& result, const QString& inputTag,
                     const QString& outputTag) const override;

 private:
  // Of the present values; false when it is not known or none.
  bool findExpression(QRegularExpression& expression) const;
  bool isRemoved(const QString& attribute) const;

  // The expression last used: every attribute asks for it.
  mutable QRegularExpression m_expression;
};
