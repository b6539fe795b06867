// The structure of a formula, as docs/mapping-file.md describes it: numbers, texts, attributes and function
// calls, joined by operators and brackets. What the functions do and which attributes there are is not
// looked at.
#pragma once

#include <QString>

#include <vector>

class Formula {
 public:
  enum class Kind { Number, Text, Attribute, Function, Operator, Sign, Open, Close, Comma };
  struct Token {
    Kind kind;
    QString text;
    int position;
  };

  // `text` is decoded.
  explicit Formula(const QString& text);

  // The tokens up to the end, or to what cannot be understood.
  const std::vector<Token>& tokens() const { return m_tokens; }
  bool isValid() const { return m_fault < 0; }
  // Where it cannot be understood any more: a position in the text, its size when something is missing at
  // the end; -1 when all is well.
  int fault() const { return m_fault; }

  // Tells the user about the fault; always false.
  bool refuse(QString& message) const;
  // Where a number is wanted: false, and told to the user, when it is a text alone that does not read as one.
  bool mayGiveNumber(QString& message) const;

  // The text with "==", "<>", "&&", "||" and "!" as the operators that formulas have for them. Texts and
  // attributes stay as they are.
  static QString withOwnOperators(const QString& text);

 private:
  bool take(int& position, bool wantsOperand, Token& token) const;
  void parse();
  // What makes every calculation fail: a text among its operands, a division by 0.
  void judgeOperands();
  bool refuseNumber(QString& message, const QString& piece) const;

  QString m_text;
  std::vector<Token> m_tokens;
  int m_fault = -1;
  QString m_noNumber;  // the piece at the fault, when it spoils every calculation
};
