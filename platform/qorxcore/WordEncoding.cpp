#include <platform/qorxcore/WordEncoding.h>

#include <QLatin1String>
#include <QStringView>

#include <algorithm>
#include <array>
#include <iterator>
#include <string_view>

namespace {

struct NamedCharacter {
  ushort code;
  std::string_view name;

  QLatin1String latin1Name() const { return QLatin1String(name.data(), static_cast<int>(name.size())); }
};

// The one table of both directions: every named character that does not stand for itself, by code.
constexpr NamedCharacter kNamed[] = {
    {0x0020, "space"},
    {0x0022, "quotationmark"},
    {0x0024, "dollarsign"},
    {0x0025, "percentsign"},
    {0x0026, "ampersand"},
    {0x0027, "apostrophe"},
    {0x0028, "leftparenthesis"},
    {0x0029, "rightparenthesis"},
    {0x002c, "comma"},
    {0x002f, "solidus"},
    {0x003b, "semicolon"},
    {0x003c, "lessthansign"},
    {0x003e, "greaterthansign"},
    {0x0040, "commercialat"},
    {0x005b, "leftsquarebracket"},
    {0x005c, "reversesolidus"},
    {0x005d, "rightsquarebracket"},
    {0x0060, "graveaccent"},
    {0x007b, "leftcurlybracket"},
    {0x007d, "rightcurlybracket"},
    {0x00a0, "nobreakspace"},
    {0x1680, "oghamspacemark"},
    {0x2000, "enquad"},
    {0x2001, "emquad"},
    {0x2002, "enspace"},
    {0x2003, "emspace"},
    {0x2004, "threeperemspace"},
    {0x2005, "fourperemspace"},
    {0x2006, "sixperemspace"},
    {0x2007, "figurespace"},
    {0x2008, "punctuationspace"},
    {0x2009, "thinspace"},
    {0x200a, "hairspace"},
    {0x2028, "lineseparator"},
    {0x2029, "paragraphseparator"},
    {0x202f, "narrownobreakspace"},
    {0x205f, "mediummathematicalspace"},
    {0x3000, "ideographicspace"},
};

constexpr int longestName() {
  std::size_t longest = 0;
  for (const NamedCharacter& entry : kNamed) {
    longest = entry.name.size() > longest ? entry.name.size() : longest;
  }
  return static_cast<int>(longest);
}
constexpr int kLongestName = longestName();

// Null for a character without a name here.
const NamedCharacter* findByCode(ushort code) {
  const auto* found =
      std::lower_bound(std::begin(kNamed), std::end(kNamed), code,
                       [](const NamedCharacter& entry, ushort wanted) { return entry.code < wanted; });
  return found != std::end(kNamed) && found->code == code ? found : nullptr;
}

const NamedCharacter* findByName(QStringView name) {
  using Index = std::array<const NamedCharacter*, std::size(kNamed)>;
  static const Index byName = [] {
    Index index{};
    std::transform(std::begin(kNamed), std::end(kNamed), index.begin(),
                   [](const NamedCharacter& entry) { return &entry; });
    std::sort(index.begin(), index.end(), [](const auto* a, const auto* b) { return a->name < b->name; });
    return index;
  }();
  const auto found = std::lower_bound(
      byName.begin(), byName.end(), name,
      [](const auto* entry, QStringView wanted) { return wanted.compare(entry->latin1Name()) > 0; });
  return found != byName.end() && name.compare((*found)->latin1Name()) == 0 ? *found : nullptr;
}

bool isAsciiLetterOrDigit(ushort code) {
  const ushort lower = code | 0x20;
  return (lower >= 'a' && lower <= 'z') || (code >= '0' && code <= '9');
}

// Whether the character stands for itself. Surrogates are the business of the caller.
bool passes(ushort code) {
  if (code < 0x80) {
    switch (code) {
      case '-':
      case '_':
      case '.':
      case ':':
      case '+':
      case '*':
      case '=':
      case '!':
      case '?':
      case '~':
      case '^':
      case '|':
      case '#':
        return true;
      default:
        return isAsciiLetterOrDigit(code);
    }
  }
  if (code <= 0xa0) {
    return false;
  }
  return code < 0x1680 || code > 0x3000 || findByCode(code) == nullptr;
}

// How many code units from `position` on stand for themselves as one character: 0, 1, or 2 for a surrogate
// pair.
int passingUnits(const QString& text, int position) {
  const QChar unit = text.at(position);
  if (!unit.isSurrogate()) {
    return passes(unit.unicode()) ? 1 : 0;
  }
  const bool pair =
      unit.isHighSurrogate() && position + 1 < text.size() && text.at(position + 1).isLowSurrogate();
  return pair ? 2 : 0;
}

int firstToEncode(const QString& text) {
  int position = 0;
  while (position < text.size()) {
    const int units = passingUnits(text, position);
    if (units == 0) {
      break;
    }
    position += units;
  }
  return position;
}

void appendEncoded(QString& out, ushort code) {
  out += QLatin1Char('<');
  if (const NamedCharacter* entry = findByCode(code)) {
    out += entry->latin1Name();
  } else {
    static const char kDigits[] = "0123456789abcdef";
    out += QLatin1Char('u');
    for (int shift = 12; shift >= 0; shift -= 4) {
      out += QLatin1Char(kDigits[(code >> shift) & 0xf]);
    }
  }
  out += QLatin1Char('>');
}

constexpr uint kNoCharacter = 0xffffffffu;

uint characterOfNumber(QStringView digits) {
  if (digits.size() < 4 || digits.size() > 6) {
    return kNoCharacter;
  }
  uint code = 0;
  for (const QChar digit : digits) {
    const ushort unit = digit.unicode();
    if (unit >= '0' && unit <= '9') {
      code = code * 16 + (unit - '0');
    } else if (unit >= 'a' && unit <= 'f') {
      code = code * 16 + (unit - 'a' + 10u);
    } else {
      return kNoCharacter;
    }
  }
  return code <= QChar::LastValidCodePoint ? code : kNoCharacter;
}

struct Reference {
  uint character = kNoCharacter;
  int length = 0;  // code units from "<" to ">"
};

// The known `<...>` that begins at `position`; its character is kNoCharacter when there is none.
Reference referenceAt(const QString& text, int position) {
  const int limit = std::min(text.size(), position + kLongestName + 2);
  int close = position + 1;
  while (close < limit && isAsciiLetterOrDigit(text.at(close).unicode())) {
    ++close;
  }
  if (close >= limit || text.at(close) != QLatin1Char('>')) {
    return {};
  }
  const QStringView name = QStringView(text).mid(position + 1, close - position - 1);
  const int length = close - position + 1;
  if (const NamedCharacter* entry = findByName(name)) {
    return {entry->code, length};
  }
  if (name.startsWith(QLatin1Char('u'))) {
    return {characterOfNumber(name.mid(1)), length};
  }
  return {};
}

// Length of the macro reference "$(NAME)" at `position`, 0 when there is none. NAME holds characters that
// pass.
int macroReferenceLength(const QString& text, int position) {
  if (position + 1 >= text.size() || text.at(position + 1) != QLatin1Char('(')) {
    return 0;
  }
  int end = position + 2;
  while (end < text.size()) {
    const int units = passingUnits(text, end);
    if (units == 0) {
      break;
    }
    end += units;
  }
  const bool closed = end > position + 2 && end < text.size() && text.at(end) == QLatin1Char(')');
  return closed ? end + 1 - position : 0;
}

}  // namespace

QString QORXWwjdEncode(const QString& text) {
  int position = firstToEncode(text);
  if (position == text.size()) {
    return text;
  }
  QString out;
  out.reserve(text.size() + text.size() / 2 + 16);
  out.append(text.constData(), position);
  while (position < text.size()) {
    const int units = passingUnits(text, position);
    if (units == 0) {
      appendEncoded(out, text.at(position).unicode());
      ++position;
    } else {
      out.append(text.constData() + position, units);
      position += units;
    }
  }
  return out;
}

QString QORXWwjdDecode(const QString& encoded) {
  int open = encoded.indexOf(QLatin1Char('<'));
  if (open < 0) {
    return encoded;
  }
  QString out;
  out.reserve(encoded.size());
  int copied = 0;
  while (open >= 0) {
    const Reference reference = referenceAt(encoded, open);
    if (reference.character == kNoCharacter) {
      open = encoded.indexOf(QLatin1Char('<'), open + 1);
      continue;
    }
    out.append(encoded.constData() + copied, open - copied);
    if (QChar::requiresSurrogates(reference.character)) {
      out += QChar(QChar::highSurrogate(reference.character));
      out += QChar(QChar::lowSurrogate(reference.character));
    } else {
      out += QChar(static_cast<ushort>(reference.character));
    }
    copied = open + reference.length;
    open = encoded.indexOf(QLatin1Char('<'), copied);
  }
  if (copied == 0) {
    return encoded;
  }
  out.append(encoded.constData() + copied, encoded.size() - copied);
  return out;
}

bool QORXWwjdIsWellFormed(const QString& encoded) {
  int position = 0;
  while (position < encoded.size()) {
    int units = passingUnits(encoded, position);
    if (units == 0 && encoded.at(position) == QLatin1Char('<')) {
      const Reference reference = referenceAt(encoded, position);
      units = reference.character == kNoCharacter ? 0 : reference.length;
    } else if (units == 0 && encoded.at(position) == QLatin1Char('$')) {
      units = macroReferenceLength(encoded, position);
    }
    if (units == 0) {
      return false;
    }
    position += units;
  }
  return true;
}
