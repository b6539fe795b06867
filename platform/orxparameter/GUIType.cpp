#include <platform/orxparameter/ConfigToken.h>
#include <platform/orxparameter/GUIType.h>
#include <platform/orxparameter/GUITypeTable.h>

#include <algorithm>

struct GUITypeData {
  unsigned flags = 0;
  const GUITypeEntry* entry = nullptr;  // null for a type that is not in the table
  QString type;
  QString name;
  QString description;
  QString config;
  QStringList macroNames;
};

namespace {

const QLatin1String kGuiPrefix("GUI ");
const QLatin1String kEmptyConfig("\"\"");
const QLatin1String kOrAttr("_OR_ATTR");
const QLatin1String kEncodedSuffix("_ENCODED");
const QLatin1String kMultiParameter("MULTIPARAMETER");
// The one type of two words is told from its neighbour by the second word.
const QLatin1String kNamedGroup("NAMEDGROUP");
const QLatin1String kNoEdit("NO_EDIT");
const QLatin1Char kBlank(' ');
const QLatin1Char kQuote('"');

struct FlagWord {
  unsigned flag;
  QLatin1String word;
};
// In the order in which they are written.
const FlagWord kFlagWords[] = {
    {kGUITypeOptional, QLatin1String("OPTIONAL")},
    {kGUITypeOmittable, QLatin1String("OMITTABLE")},
    {kGUITypeInstanceMacros, QLatin1String("INSTANCE_MACROS")},
};

// How line breaks, and texts that look like their escapes, stand in a prompt line.
struct LineEscape {
  QChar character;
  QLatin1String written;
};
const LineEscape kLineEscapes[] = {
    {QLatin1Char('\n'), QLatin1String("<u000a>")},
    {QLatin1Char('\r'), QLatin1String("<u000d>")},
    {QLatin1Char('<'), QLatin1String("<lessthansign>")},
};

const LineEscape* escapeAt(const QString& text, int position) {
  for (const LineEscape& escape : kLineEscapes) {
    if (text.midRef(position, escape.written.size()) == escape.written) {
      return &escape;
    }
  }
  return nullptr;
}

QString escapeForLine(const QString& text) {
  QString result;
  result.reserve(text.size());
  for (int i = 0; i < text.size(); ++i) {
    const QChar c = text.at(i);
    if (c == QLatin1Char('<') ? escapeAt(text, i) != nullptr
                              : c == QLatin1Char('\n') || c == QLatin1Char('\r')) {
      const auto* escape = std::find_if(std::begin(kLineEscapes), std::end(kLineEscapes),
                                        [c](const LineEscape& e) { return e.character == c; });
      result += escape->written;
    } else {
      result += c;
    }
  }
  return result;
}

QString unescapeFromLine(const QString& text) {
  int at = text.indexOf(QLatin1Char('<'));
  if (at < 0) {
    return text;
  }
  QString result = text.left(at);
  result.reserve(text.size());
  while (at < text.size()) {
    const LineEscape* escape = text.at(at) == QLatin1Char('<') ? escapeAt(text, at) : nullptr;
    result += escape ? escape->character : text.at(at);
    at += escape ? escape->written.size() : 1;
  }
  return result;
}

// Reads the words of a text from left to right.
class WordReader {
 public:
  explicit WordReader(const QString& text, int position = 0) : m_text(text), m_position(position) {}

  bool skipBlanks() {
    while (m_position < m_text.size() && ORX_isBlank(m_text.at(m_position))) {
      ++m_position;
    }
    return m_position < m_text.size();
  }

  QString word() {
    skipBlanks();
    const int start = m_position;
    while (m_position < m_text.size() && !ORX_isBlank(m_text.at(m_position))) {
      ++m_position;
    }
    return m_text.mid(start, m_position - start);
  }

  // A word, or a text in quotes that a blank or the end follows.
  QString name() {
    if (skipBlanks() && m_text.at(m_position) == kQuote) {
      const int close = ORX_closingQuote(m_text, m_position);
      if (close >= 0 && (close + 1 == m_text.size() || ORX_isBlank(m_text.at(close + 1)))) {
        QString quoted = m_text.mid(m_position + 1, close - m_position - 1);
        m_position = close + 1;
        return quoted.replace(QLatin1String("\"\""), QLatin1String("\""));
      }
    }
    return word();
  }

  QString config(ConfigEnd end) {
    skipBlanks();
    return ORX_readConfig(m_text, m_position, end);
  }

  // What follows the one blank behind the last word.
  QString rest() const { return m_text.mid(m_position + 1); }

  int position() const { return m_position; }
  void moveTo(int position) { m_position = position; }

 private:
  const QString& m_text;
  int m_position;
};

bool readTypeWords(WordReader& reader, GUITypeData& data) {
  for (;;) {
    QString word = reader.word();
    const auto* flag = std::find_if(std::begin(kFlagWords), std::end(kFlagWords),
                                    [&](const FlagWord& f) { return word == f.word; });
    if (flag == std::end(kFlagWords)) {
      data.type = word;
      break;
    }
    data.flags |= flag->flag;
  }
  if (data.type == kNamedGroup) {
    const int behind = reader.position();
    if (reader.word() == kNoEdit) {
      data.type += kBlank + kNoEdit;
    } else {
      reader.moveTo(behind);
    }
  }
  data.entry = ORX_findGuiType(data.type);
  return !data.type.isEmpty();
}

void setConfig(GUITypeData& data, const QString& config) {
  // Without quotes it would be the type's second word in a type text.
  data.config = data.type == kNamedGroup && config == kNoEdit ? kQuote + config + kQuote : config;
}

// Leaves the macro names alone: those of a member's own members are nobody's business, and reading them would
// let the input choose the depth.
bool readGuiLine(const QString& line, GUITypeData& data) {
  if (!line.startsWith(kGuiPrefix)) {
    return false;
  }
  int end = line.size();
  while (end > 0 && (line.at(end - 1) == QLatin1Char('\n') || line.at(end - 1) == QLatin1Char('\r'))) {
    --end;
  }
  const QString text = line.left(end);
  WordReader reader(text, kGuiPrefix.size());
  if (!readTypeWords(reader, data) || !reader.skipBlanks()) {
    return false;
  }
  data.name = unescapeFromLine(reader.name());
  if (data.entry && data.entry->takesConfig) {
    setConfig(data, reader.config(ConfigEnd::FirstBlank));
  }
  data.description = unescapeFromLine(reader.rest());
  return true;
}

void collectMacroNames(GUITypeData& data) {
  data.macroNames.clear();
  if (!data.name.isEmpty()) {
    data.macroNames.append(data.name);
  }
  if (data.type != kMultiParameter) {
    return;
  }
  const QStringList parts = ORX_readMemberConfig(data.config);
  for (int i = 1; i < parts.size(); ++i) {
    GUITypeData member;
    if (readGuiLine(parts.at(i), member) && !member.name.isEmpty()) {
      data.macroNames.append(member.name);
    }
  }
}

QString writtenName(const GUITypeData& data) {
  QString name = escapeForLine(data.name);
  if (name.isEmpty() || name.startsWith(kQuote) || std::any_of(name.cbegin(), name.cend(), ORX_isBlank) ||
      (data.type == kNamedGroup && name == kNoEdit)) {
    name.replace(QLatin1String("\""), QLatin1String("\"\""));
    return kQuote + name + kQuote;
  }
  return name;
}

void appendTypeWords(const GUITypeData& data, QString& text) {
  for (const FlagWord& flag : kFlagWords) {
    if (data.flags & flag.flag) {
      text += flag.word + kBlank;
    }
  }
  text += data.type;
}

const GUITypeData& nullData() {
  static const GUITypeData data;
  return data;
}

const GUITypeData& read(const std::shared_ptr<const GUITypeData>& d) {
  return d ? *d : nullData();
}

std::shared_ptr<GUITypeData> copyOf(const std::shared_ptr<const GUITypeData>& d) {
  return std::make_shared<GUITypeData>(read(d));
}

const GUIType nullGuiType;

}  // namespace

const GUIType& GUIType::kNullGuiType = nullGuiType;

GUIType GUIType::fromGuiLine(const QString& line) {
  const auto data = std::make_shared<GUITypeData>();
  GUIType result;
  if (readGuiLine(line, *data)) {
    collectMacroNames(*data);
    result.d = data;
  }
  return result;
}

GUIType GUIType::fromTransformerTypeString(const QString& typeText, const QString& name,
                                           const QString& description) {
  int end = typeText.size();
  while (end > 0 && ORX_isBlank(typeText.at(end - 1))) {
    --end;
  }
  const QString text = typeText.left(end);
  const auto data = std::make_shared<GUITypeData>();
  WordReader reader(text);
  GUIType result;
  if (readTypeWords(reader, *data)) {
    setConfig(*data, reader.config(ConfigEnd::EndOfText));
    data->name = name;
    data->description = description;
    collectMacroNames(*data);
    result.d = data;
  }
  return result;
}

bool GUIType::isNull() const {
  return read(d).type.isEmpty();
}

bool GUIType::isKnown() const {
  return read(d).entry != nullptr;
}

const QString& GUIType::getType() const {
  return read(d).type;
}

const QString& GUIType::getName() const {
  return read(d).name;
}

const QString& GUIType::getDescription() const {
  return read(d).description;
}

const QString& GUIType::getConfigToken() const {
  return read(d).config;
}

bool GUIType::getFlag(unsigned flag) const {
  return (read(d).flags & flag) == flag;
}

unsigned GUIType::getFlags() const {
  return read(d).flags;
}

bool GUIType::valueIsEncoded() const {
  const GUITypeData& data = read(d);
  return data.entry ? data.entry->valueIsEncoded : data.type.endsWith(kEncodedSuffix);
}

bool GUIType::mayHoldAttributeReference() const {
  return read(d).type.contains(kOrAttr);
}

const QStringList& GUIType::getMacroNames() const {
  return read(d).macroNames;
}

QString GUIType::getTypeText() const {
  const GUITypeData& data = read(d);
  QString text;
  appendTypeWords(data, text);
  if (!data.config.isEmpty()) {
    text += kBlank + data.config;
  }
  return text;
}

QString GUIType::getAsString() const {
  if (isNull()) {
    return QString();
  }
  const GUITypeData& data = read(d);
  QString line = kGuiPrefix;
  appendTypeWords(data, line);
  line += kBlank + writtenName(data);
  if (data.entry ? data.entry->takesConfig : !data.config.isEmpty()) {
    line += kBlank;
    line += data.config.isEmpty() ? QString(kEmptyConfig) : data.config;
  }
  if (!data.description.isEmpty()) {
    line += kBlank + escapeForLine(data.description);
  }
  return line;
}

void GUIType::setName(const QString& name) {
  const auto data = copyOf(d);
  data->name = name;
  collectMacroNames(*data);
  d = data;
}

void GUIType::setDescription(const QString& description) {
  const auto data = copyOf(d);
  data->description = description;
  d = data;
}

void GUIType::setFlag(unsigned flag, bool on) {
  const auto data = copyOf(d);
  data->flags = on ? data->flags | flag : data->flags & ~flag;
  d = data;
}

bool GUIType::operator==(const GUIType& other) const {
  if (d == other.d) {
    return true;
  }
  const GUITypeData& a = read(d);
  const GUITypeData& b = read(other.d);
  return a.flags == b.flags && a.type == b.type && a.name == b.name && a.config == b.config &&
         a.description == b.description;
}
