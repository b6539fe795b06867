// The values of one instance's parameters on their way into its lines.
#pragma once

#include <transform/core/TransformParamCfg.h>

#include <QSet>
#include <QString>
#include <QStringList>

#include <vector>

class MFBuffer;
class OrderedSubstitution;
class TemplateExpansion;
class CompiledTemplate;
class TransformerCfg;

class ParameterSubstitution {
 public:
  // Neither is owned; both outlive this object.
  ParameterSubstitution(const TransformerCfg& cfg, const std::vector<TransformParamCfg>& records)
      : m_cfg(cfg), m_records(records) {}

  // Asks for the values, in the order of the parameters; values may write statements into the buffer. With
  // `needed`, only those are asked for whose token occurs in it, or that write statements.
  void collect(MFBuffer& buffer, const CompiledTemplate* needed = nullptr);
  // Asks for the values that were left out. They write nothing.
  void collectRest(MFBuffer& buffer);

  // Whether some value holds the token of a parameter, of a port or of the instance, or a part of a token.
  bool bringsTokens() const;
  bool isSubstituted(const QString& token) const;

  void apply(OrderedSubstitution& lines) const;
  void apply(TemplateExpansion& expansion, const CompiledTemplate& compiled) const;

  // Labels and frames of a dialog have none.
  static bool hasValue(const TransformParamCfg& record);

  // What "$(ORX_PARM_VAL_LIST)" stands for.
  QString valueList() const;

 private:
  struct Token {
    QString name;
    QString value;
    bool isListed;  // in the value list
  };
  struct Entry {
    bool isCollected = false;
    bool removesLines = false;
    std::vector<Token> tokens;
  };

  void collect(std::size_t position, MFBuffer& buffer);

  const TransformerCfg& m_cfg;
  const std::vector<TransformParamCfg>& m_records;
  std::vector<Entry> m_entries;
  QSet<QString> m_members;  // tokens that only multi-parameters bring
};
