// The mapping-file template of a definition, split at its tokens "$(NAME)" once for all instances.
//
// Every distinct token has a slot, numbered from 0 in the order of first appearance. Tokens that nobody
// substitutes (macros of the engine) have slots as well; they stay as they stand.
#pragma once

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <vector>

class CompiledTemplate {
 public:
  static constexpr int kNoSlot = -1;

  // A piece of a line: text as it stands, or a token.
  struct Piece {
    int begin;  // of the text in text(); of a token, with "$(" and ")"
    int size;
    int slot;  // kNoSlot for text
  };
  struct Line {
    int firstPiece;
    int endPiece;
    int textSize;    // what the pieces without slot take
    bool isBlank;    // nothing but white space, no token
    bool staysText;  // some piece without slot holds more than white space
  };

  explicit CompiledTemplate(const QStringList& lines);

  const QStringList& lines() const { return m_lines; }
  const std::vector<Line>& compiledLines() const { return m_compiled; }
  const std::vector<Piece>& pieces() const { return m_pieces; }
  // All lines behind one another.
  const QString& text() const { return m_text; }

  int slotCount() const { return m_slotNames.size(); }
  // kNoSlot when the token does not occur.
  int slotOf(const QString& name) const { return m_slots.value(name, kNoSlot); }
  // The lines that hold the token, in order, each once.
  const std::vector<int>& linesOf(int slot) const { return m_linesOf[static_cast<std::size_t>(slot)]; }

  // Whether text without "$" can be put in place of the tokens in any order with the same result: nothing in
  // the template could become a token by it.
  bool isPlain() const { return m_isPlain; }
  // Whether every line with a token "OUTPUT_<tag>_FTYPE" also has the tag's "OUTPUT_<tag>_FUNCS", so that the
  // clause of an output is exactly its own lines.
  bool hasOneLineClauses() const { return m_hasOneLineClauses; }
  // Whether values in brackets are meant by " {*} ".
  bool usesBracketValues() const { return m_usesBracketValues; }
  // The keys of the settings that the lines name themselves.
  const QSet<QString>& keys() const { return m_keys; }
  // Whether the token ends some line.
  bool endsLine(int slot) const { return m_endsLine[static_cast<std::size_t>(slot)]; }

 private:
  int addSlot(const QString& name);
  void compile(const QString& line);
  void addKeys(const QString& line);

  QStringList m_lines;
  QString m_text;
  std::vector<Piece> m_pieces;
  std::vector<Line> m_compiled;
  QHash<QString, int> m_slots;
  QStringList m_slotNames;
  std::vector<std::vector<int>> m_linesOf;
  std::vector<bool> m_endsLine;
  QSet<QString> m_keys;
  bool m_isPlain = true;
  bool m_hasOneLineClauses = true;
  bool m_usesBracketValues = false;
};
