// Configurations of parameter types: one token, made of pieces separated by "%" and ",".
//
// A piece that holds a blank, "%", "," or a quote stands in double quotes, inner quotes doubled. A quote
// opens only at the beginning of a piece; anywhere else, and when it is never closed, it stands for itself.
// Blanks are the ASCII white space characters. A line break inside quotes is kept as "<u000a>" or "<u000d>".
#pragma once

#include <platform/Export.h>

#include <QChar>
#include <QString>
#include <QStringList>

// The piece as it stands in a configuration: in quotes where it needs them, also when it is empty.
ORX_EXPORT QString ORX_quoteConfigPiece(const QString& piece);

// The pieces between the separators ("%" or ","), without their quotes. Empty pieces without quotes are
// dropped.
ORX_EXPORT QStringList ORX_splitConfig(const QString& config, QChar separator);

// Where a configuration ends that is read from the middle of a text.
enum class ConfigEnd {
  FirstBlank,  // at the first blank outside quotes
  EndOfText,   // with the text; pieces with blanks are given the quotes they lack
};

// Reads a configuration at `position`, which is moved behind it. The result is sound: read again in either
// way it gives itself. `""` alone gives the empty text.
QString ORX_readConfig(const QString& text, int& position, ConfigEnd end);

// The position of the quote that closes the one at `open`, doubled quotes skipped; -1 when there is none.
int ORX_closingQuote(const QString& text, int open);

bool ORX_isBlank(QChar c);

// The configuration of a member list: the separator's text first, then the members' prompt lines, all
// decoded.
QStringList ORX_readMemberConfig(const QString& config);

// Walks over the pieces of a configuration, both separators counting.
class ConfigPieceReader {
 public:
  explicit ConfigPieceReader(const QString& config) : m_config(config) {}

  // False behind the last piece. An empty configuration has no pieces.
  bool next();

  // Without its quotes.
  const QString& text() const { return m_text; }
  bool isQuoted() const { return m_quoted; }
  // The separator before the piece; null for the first.
  QChar before() const { return m_before; }

 private:
  const QString m_config;
  int m_position = 0;
  QString m_text;
  QChar m_before;
  QChar m_after;
  bool m_quoted = false;
  bool m_started = false;
};
