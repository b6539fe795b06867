// Which texts may stand where in a mapping file, so that they are read there as what they are. Whoever
// writes, judges or checks a place asks here.
#pragma once

#include <platform/Export.h>

#include <QSet>
#include <QString>

enum class TextPlace {
  Word,             // quoted where it needs quotes, see MappingFileWords.h
  Name,             // of a node, port, feature type or attribute, as a document gives it: such a word without
                    // references, since it stands in several places, not all of which would expand them
  ParallelSetting,  // behind "KEY:"; such a word
  Port,             // between INPUT or OUTPUT and FEATURE_TYPE, as it is
  LoopSetting,      // behind "KEY:", as it is; may be empty
  QuotedName,       // inside double quotes that stand around it whatever it holds
  MacroName,        // in a MACRO statement and in references
  PrintedName,      // part of a macro's name in a statement that a script prints
  MacroValue,       // to the end of its statement
  TclBraces,        // inside the braces of a script
  TclQuotes,        // anywhere inside a script, quotes included
  HeaderField,      // between the commas of the line that opens a custom transformer
};

class ORX_EXPORT TextPlaces {
 public:
  // The number of the message that says why the text may not stand there; 0 when it may.
  static long refuse(TextPlace place, const QString& text);

  // The same for the value behind a key, which runs up to the next keyword. `keys` are those of the statement
  // beside INPUT and OUTPUT. A plain value is one word or several; function calls, where they are allowed,
  // belong to it.
  enum class Calls { Allowed, Refused };
  static long refusePlainValue(const QString& text, const QSet<QString>& keys, Calls calls);
  // Whether some word of the text is a function call, be it closed or not.
  static bool holdsCall(const QString& text);
  // A word-encoded value is one word.
  static long refuseEncodedValue(const QString& text);
  // A word-encoded value that is spelt like a keyword, spelt in another way that means the same; any other
  // value as it is.
  static QString withoutKeyword(const QString& encoded, const QSet<QString>& keys);

  // Characters that a line can carry: no line breaks, null characters, halves of surrogate pairs.
  static bool isOneLine(const QString& text);
  // Whether a setting can have that key: capital letters, digits and "_".
  static bool isKey(const QStringRef& word);
};
