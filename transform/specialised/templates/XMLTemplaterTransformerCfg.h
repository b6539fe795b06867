// Fills a template in XML or JSON with attributes. Sub-templates have inputs of their own, whose features
// fill them in where another template asks for them.
#pragma once

#include <platform/Export.h>
#include <transform/specialised/shared/SpecialisedCfg.h>

class ORX_EXPORT XMLTemplaterTransformerCfg : public SpecialisedCfg<XMLTemplaterTransformerCfg> {
 public:
  explicit XMLTemplaterTransformerCfg(bool isJson) : m_isJson(isJson) {}

  bool isJson() const { return m_isJson; }
  XMLTemplaterTransformerCfg* blank() const { return new XMLTemplaterTransformerCfg(m_isJson); }
  // The definition's, and one for each sub-template, by its name.
  void getInputTags(QStringList& tags, QHash<QString, QString>* shownNames = nullptr) const override;
  // Refuses templates that are not well formed, ask for each other in a circle or for one that there is not,
  // and names that cannot be those of inputs.
  bool validateParameter(const QString& parameter, QString& message) const override;
  // Writes one statement for each sub-template behind those of the definition's template.
  bool doInstantiate(MFBuffer& buffer, bool inlineFlag) override;

 private:
  bool validateRoot(QString& message) const;
  bool validateSubTemplates(QString& message) const;

  const QStringList& subTemplateTags() const;

  const bool m_isJson;
  // Every link asks for the inputs: the names that this value gives.
  mutable QString m_tagsOf;
  mutable QStringList m_tags;
};
