// A text in XML or JSON that features fill in: "@Value(NAME)" stands for an attribute, "@Template(NAME)" for
// what another template gives. Both may stand wherever text may, in JSON also in the place of a value.
#pragma once

#include <QString>
#include <QStringList>

class TemplateText {
 public:
  enum class Language { Xml, Json };
  // A whole document has one root; a fragment is what may stand inside another text.
  enum class Extent { Document, Fragment };

  static Language languageOf(bool isJson) { return isJson ? Language::Json : Language::Xml; }
  // `encoded` is as parameters store it.
  TemplateText(const QString& encoded, Language language);

  // Whether it can be well formed, whatever the features bring. `line`, from 1, tells where it is not.
  bool isWellFormed(Extent extent, int& line) const;
  // The templates that it asks for, in order, each as often as it stands there.
  const QStringList& insertedTemplates() const { return m_inserted; }

 private:
  bool isWellFormedXml(Extent extent, int& line) const;
  bool isWellFormedJson(int& line) const;

  Language m_language;
  QString m_text;  // with placeholders for what features and macros bring
  QStringList m_inserted;
};
