// What becomes of the attributes of one input on their way to one output.
#pragma once

#include <QString>
#include <QStringList>

class AttributeSet;
struct AttributeRules;
class ParameterText;
class TransformerCfg;
struct PreservedAttributes;

// The texts that a text with references to parameters stands for: with one reference, one text per name that
// the parameter's value lists; nothing while a parameter is unset.
QStringList expandParameterText(const TransformerCfg& cfg, const ParameterText& text);

// Made for one pass: the parameters that the rules refer to are read once, not per attribute.
class AttributePassage {
 public:
  AttributePassage(const TransformerCfg& cfg, const PreservedAttributes& preserved,
                   const AttributeRules& rules, const QString& inputTag, const QString& outputTag);

  bool isBetween(const QString& inputTag, const QString& outputTag) const {
    return m_inputTag == inputTag && m_outputTag == outputTag;
  }
  // Appends what leaves the output for the attribute.
  void pass(const QString& attribute, QStringList& result) const;
  // Adds what leaves for the attributes of a set: at once where nothing gets another name.
  void pass(const AttributeSet& attributes, AttributeSet& result) const;

 private:
  void apply(const TransformerCfg& cfg, const AttributeRules& rules, const QString& key);
  static QStringList listNames(const TransformerCfg& cfg, const ParameterText& text);

  const PreservedAttributes& m_preserved;
  QString m_inputTag;
  QString m_outputTag;
  bool m_dropsLists = false;
  QStringList m_collectingLists;  // each ends in "{}."
  QStringList m_explodedLists;    // likewise
};
