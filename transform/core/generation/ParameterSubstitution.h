// The values of one instance's parameters on their way into its lines.
#pragma once

#include <transform/core/TransformParamCfg.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <vector>

class MFBuffer;
class Substitution;
class TransformerCfg;

class ParameterSubstitution {
 public:
  // Neither is owned; both outlive this object.
  ParameterSubstitution(const TransformerCfg& cfg, const std::vector<TransformParamCfg>& records);

  // Whether some value will hold the token of a parameter, of a port or of the instance, or a part of a
  // token. Told from the stored values, the stored sides of choices included, before anything is written.
  bool bringsTokens() const;
  // The first parameter with such a value; empty when there is none.
  QString firstWithTokens() const;
  // Whether the text holds no such token.
  bool isInert(const QString& text) const;

  // Asks for the values, in the order of the parameters; values may write statements into the buffer. With
  // `onlyWritten`, only those are asked for that reach the statements of a template without inserted tokens.
  void collect(MFBuffer& buffer, bool onlyWritten = false);

  struct Token {
    QString name;
    QString value;
    const GUIType* type;  // null where nothing was given
    bool isListed;        // in the value list
  };
  // What was collected. Where several bear one name, the first counts. One whose lines go away is empty: it
  // may stand in other values.
  std::vector<Token> tokens() const;

  // All values, and the list of them.
  void putInto(Substitution& lines) const;

 private:
  struct Entry {
    QStringList removed;  // tokens whose lines go away
    std::vector<Token> tokens;
  };

  bool isSubstituted(const QString& token) const;
  bool isInert(const TransformParamCfg& record) const;
  void collect(std::size_t position, MFBuffer& buffer);
  void putDeferred(Substitution& lines) const;
  QString valueList() const;

  const TransformerCfg& m_cfg;
  const std::vector<TransformParamCfg>& m_records;
  std::vector<Entry> m_entries;
  QSet<QString> m_members;  // tokens that only multi-parameters bring
};
