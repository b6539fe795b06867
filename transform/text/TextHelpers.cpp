#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/Quoting.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/text/TextHelpers.h>

#include <QLatin1String>

#include <algorithm>

namespace {

const QLatin1Char kQuote('"');
const QLatin1Char kBackslash('\\');
const QLatin1String kBasicStringMark("orx_basicstring:");

// What stands behind the backslash for the characters bell (7) to carriage return (13).
constexpr char kControlEscapes[] = "abtnvfr";
constexpr ushort kFirstControl = 7;
constexpr ushort kLastControl = 13;

// The character that an escape stands for; a null character when it stands for none.
QChar escapedCharacter(QChar letter) {
  if (letter == kBackslash) {
    return kBackslash;
  }
  for (ushort code = kFirstControl; code <= kLastControl; ++code) {
    if (letter == QLatin1Char(kControlEscapes[code - kFirstControl])) {
      return QChar(code);
    }
  }
  return QChar();
}

bool isWrappedInQuotes(const QString& text) {
  return text.startsWith(kQuote) && text.endsWith(kQuote);
}

bool readNumber(const QStringList& pieces, int index, unsigned& number) {
  if (index >= pieces.size()) {
    return true;
  }
  bool ok = false;
  const unsigned value = pieces[index].toUInt(&ok);
  if (ok) {
    number = value;
  }
  return ok;
}

}  // namespace

QString safeMacroName(const QString& text) {
  QString name = text;
  for (QChar& character : name) {
    switch (character.unicode()) {
      case u' ':
      case u'&':
      case u',':
      case u'@':
      case u'\\':
      case u'/':
        character = QLatin1Char('_');
        break;
      default:
        break;
    }
  }
  return name;
}

QString makePrefixMacro(const QString& text) {
  return safeMacroName(text) + QLatin1String("_WORKSPACE_NAME");
}

QString makeColumnString(const QString& left, const QString& right, int width) {
  return left.leftJustified(width) + QLatin1Char(' ') + right;
}

QString quotifyString(const QString& text, const QString& specials) {
  return QORXQuotifyString(text, specials);
}

QString quotifyDefAttrName(const QString& name) {
  if (name.size() == 1 && name[0] == kQuote) {
    return QStringLiteral("\"\\\"\"");
  }
  QString quoted = quotifyStringForMF(name);
  if (name.size() > 1 && isWrappedInQuotes(name)) {
    quoted.chop(1);
    return kBackslash + quoted + QLatin1String("\\\"");
  }
  return quoted.contains(QLatin1Char(' ')) ? kQuote + quoted + kQuote : quoted;
}

QString decodeUserString(const QString& text) {
  QString escaped;
  escaped.reserve(text.size());
  for (const QChar character : text) {
    const ushort code = character.unicode();
    if (character == kBackslash) {
      escaped += QLatin1String("\\\\");
    } else if (code >= kFirstControl && code <= kLastControl) {
      escaped += kBackslash;
      escaped += QLatin1Char(kControlEscapes[code - kFirstControl]);
    } else {
      escaped += character;
    }
  }
  return escaped;
}

QString encodeUserString(const QString& text) {
  QString plain;
  plain.reserve(text.size());
  for (int i = 0; i < text.size(); ++i) {
    if (text[i] == kBackslash && i + 1 < text.size()) {
      const QChar character = escapedCharacter(text[i + 1]);
      if (!character.isNull()) {
        plain += character;
        ++i;
        continue;
      }
    }
    plain += text[i];
  }
  return QORXFromLocal8Bit(QORXToLocal8Bit(plain));
}

void stringToList(const QString& text, QStringList& out, char separator) {
  stringToList(text, out, QChar(QLatin1Char(separator)));
}

void stringToList(const QString& text, QStringList& out, QChar separator) {
  out = text.split(separator, Qt::SkipEmptyParts);
}

QString stripBasicStringInfo(const QString& text) {
  if (!text.contains(kBasicStringMark)) {
    return text;
  }
  // Taking a mark out may join its neighbours into another one, so a mark is looked for at the end of what is
  // kept whenever a colon arrives there: the same result as searching from the start each time, in one walk.
  QString kept;
  kept.reserve(text.size());
  for (int i = 0; i < text.size(); ++i) {
    kept += text[i];
    if (text[i] == QLatin1Char(':') && kept.endsWith(kBasicStringMark)) {
      kept.chop(kBasicStringMark.size());
      const int close = text.indexOf(QLatin1Char(':'), i + 1);
      if (close < 0) {
        return kept + text.midRef(i + 1);
      }
      i = close;
    }
  }
  return kept;
}

bool decodePortDescription(const QString& description, bool& isFeaturePort, bool& isOutput, unsigned& first,
                           unsigned& second, QString& name) {
  const QStringList pieces = description.split(QLatin1Char(' '), Qt::SkipEmptyParts);
  if (pieces.size() < 2 || pieces[0].size() < 2) {
    return false;
  }
  const QChar kind = pieces[0][0];
  const QChar direction = pieces[0][1];
  const bool isFeature = kind == QLatin1Char('f');
  const bool isOut = direction == QLatin1Char('o');
  if ((!isFeature && kind != QLatin1Char('a')) || (!isOut && direction != QLatin1Char('i'))) {
    return false;
  }
  unsigned firstRead = first;
  unsigned secondRead = second;
  if (!readNumber(pieces, 1, firstRead) || (!isFeature && !readNumber(pieces, 2, secondRead))) {
    return false;
  }
  isFeaturePort = isFeature;
  isOutput = isOut;
  first = firstRead;
  second = secondRead;
  const int nameIndex = isFeature ? 2 : 3;
  if (pieces.size() > nameIndex) {
    name = QORXWwjdDecode(pieces[nameIndex]);
  }
  return true;
}
