// Reads along with the XML parser, a little ahead of it, and stops what the parser would take without limit:
// a document type declaration, deep nesting, too many attributes, over-long values, undecodable bytes. It
// also notes where each element begins, which the parser no longer knows when it reports one.
//
// It knows just enough of XML to tell tags, quoted values, comments and the like apart; whether the document
// is well formed is the parser's business, so on a malformed document it may be wrong about everything behind
// the fault.
#pragma once

#include <QString>

#include <vector>

class DocumentGuard {
 public:
  // How many of the units may be passed on; fewer than `size` once something is refused, and then nothing
  // more.
  int check(const ushort* units, int size);
  // A unit that stands for bytes which the encoding does not know, beside U+0000 which always does.
  void setReplacementUnit(ushort unit) { m_replacement = unit; }

  bool hasRefused() const { return !m_refusal.isEmpty(); }
  const QString& refusal() const { return m_refusal; }
  int line() const { return m_line; }
  int column() const { return m_column; }
  // The line of each element's "<", in document order.
  const std::vector<int>& elementLines() const { return m_elementLines; }

 private:
  enum class State {
    Text,
    Open,
    Tag,
    EndTag,
    DoubleQuoted,
    SingleQuoted,
    Bang,
    Comment,
    CharacterData,
    Instruction
  };

  int skipPlain(const ushort* units, int size);
  bool take(ushort unit);
  bool takeOpen(ushort unit);
  bool takeTag(ushort unit);
  bool takeBang(ushort unit);
  bool enter(State state);
  bool refuse(const QString& message);

  State m_state = State::Text;
  qint64 m_runLength = 0;  // of the value, text or piece of markup that is being read
  QString m_bang;          // what stands behind "<!" so far
  ushort m_previous = 0;   // the last two units of a comment or the like, to find its end
  ushort m_beforePrevious = 0;
  int m_depth = 0;
  int m_attributes = 0;
  int m_line = 1;
  int m_column = 1;
  bool m_afterReturn = false;
  ushort m_replacement = 0;
  std::vector<int> m_elementLines;
  QString m_refusal;
};
