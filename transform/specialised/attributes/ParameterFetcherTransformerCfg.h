// Brings the values of workspace parameters onto features as attributes.
//
// Version 1 keeps one parameter of type PUBLISHED_PARAMETER for each value that it fetches. Later versions
// keep them all in the parameter ATTR_LIST: entries that are references "$(NAME)", bare or in quotes or
// braces, or names of built-in macros.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT ParameterFetcherTransformerCfg : public SpecialisedCfg<ParameterFetcherTransformerCfg> {
 public:
  // Version 1: a published parameter is shown by its bare name.
  QString getParameterDisplayValue(const QString& parameter,
                                   UnpackLevel level = UnpackLevel::Stored) const override;
  bool parameterSupportsAttributeReference(const QString& parameter) const override;
  bool canCreateGlobalParameter(const QString& parameter) const override;
  // From version 2 on, what is fetched stands behind the other lines.
  void getTooltipLines(QStringList& lines, bool asHtml) const override;
  QString getDefaultMacroLine(const QString& parameter) const override;
  // Version 1: a bare name becomes a reference; one that the workspace does not know becomes empty.
  bool applyParameterValue(const QString& parameter, const QString& value) override;
  bool validateParameter(const QString& parameter, QString& message) const override;
  QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                          MFBuffer& buffer) const override;
  // Gathers what an older instance fetches in ATTR_LIST. False when something of it has no place.
  bool upgradeTransformer(TransformerCfg* older) override;
  void transformAllAttrs(QStringList& incoming, QStringList& result, const QString& inputTag,
                         const QString& outputTag) const override;

  // What separates the entries of ATTR_LIST in this version.
  QString attrListSeparator() const;
  // The macro that an entry names; empty when it names none.
  QString macroNameFromMacroDef(const QString& entry) const;

 private:
  bool isPublishedParameter(const QString& parameter) const;
  bool holdsList(const QString& parameter) const;
  QStringList entries() const;
  // The attributes that the entries give.
  QStringList fetchedAttributes() const;
};
