// What a definition says about attributes on their way from inputs to outputs, read once per definition.
#pragma once

#include <platform/Export.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <vector>

// A text with references "$(NAME)" to parameters of the same transformer.
class ParameterText {
 public:
  struct Piece {
    bool isParameter;
    QString text;  // the literal text, or the parameter's name
  };

  ParameterText() = default;
  explicit ParameterText(const QString& text);

  const std::vector<Piece>& pieces() const { return m_pieces; }
  bool isEmpty() const { return m_pieces.empty(); }
  // The name of the parameter when the text is one reference and nothing else; otherwise empty.
  QString onlyParameter() const;

 private:
  std::vector<Piece> m_pieces;
};

// Which attributes pass through unchanged: PRESERVES_ATTRIBUTES.
struct ORX_EXPORT PreservedAttributes {
  bool everything = false;
  QSet<QString> outputs;                   // what reaches any input passes
  QHash<QString, QSet<QString>> inputsOf;  // output to the inputs whose attributes pass
  QSet<QString> names;                     // pass to every output

  // Tokens <NONE>, <ALL>, OUT, OUT:IN, =NAME. <NONE> beside others says nothing.
  static PreservedAttributes parse(const QStringList& tokens);

  // Whether all that reaches the input leaves the output, whatever its name.
  bool passesAll(const QString& inputTag, const QString& outputTag) const;
  bool passes(const QString& attribute, const QString& inputTag, const QString& outputTag) const;
};

// What becomes of list attributes: one LIST_ACTION line.
struct ListAction {
  enum class Kind { Keep, Drop, Collect, Explode };
  Kind kind = Kind::Keep;
  QString inputTag;    // of Collect
  ParameterText list;  // of Collect and Explode, without "{}"
};

// One token of ATTRIBUTES_ADDED.
struct AddedAttribute {
  QString outputTag;   // empty: every output
  ParameterText list;  // empty unless the attribute is a member of a list
  ParameterText name;
};

struct ORX_EXPORT AttributeRules {
  PreservedAttributes preserved;
  // Actions by output tag, and under "<ALL>" those of every output, which come first.
  QHash<QString, std::vector<ListAction>> listActions;
  std::vector<AddedAttribute> added;
  // The parameters that any of this refers to.
  QSet<QString> parameters;

  // False when the line cannot be understood; nothing is taken in then.
  bool addListAction(const QString& line);
  // `outputTags` tells an output before the first ":" from a part of the name.
  void addAttribute(const QString& token, const QSet<QString>& outputTags);

 private:
  void noteParameters(const ParameterText& text);
};
