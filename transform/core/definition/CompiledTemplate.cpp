#include <transform/core/GenerationKeywords.h>
#include <transform/core/TokenScanner.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MappingFileWords.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>

namespace {

bool isBlank(QStringView text) {
  return std::all_of(text.begin(), text.end(), [](QChar c) { return c.isSpace(); });
}

}  // namespace

CompiledTemplate::CompiledTemplate(const QStringList& lines) : m_lines(lines) {
  int size = 0;
  for (const QString& line : lines) {
    size += line.size();
  }
  m_text.reserve(size);
  m_compiled.reserve(static_cast<std::size_t>(lines.size()));
  for (const QString& line : lines) {
    compile(line);
    addKeys(line);
    m_usesBracketValues = m_usesBracketValues || line.contains(kBracketValueMark);
  }
  for (int slot = 0; slot < slotCount() && m_hasOneLineClauses; ++slot) {
    QString name = m_slotNames.at(slot);
    if (name.startsWith(kOutputTokenStart) && name.endsWith(kFeatureTypeTokenEnd)) {
      name.chop(kFeatureTypeTokenEnd.size());
      const int end = slotOf(name + kFunctionsTokenEnd);
      const std::vector<int> none;
      const std::vector<int>& ends = end == kNoSlot ? none : linesOf(end);
      const std::vector<int>& starts = linesOf(slot);
      m_hasOneLineClauses = std::includes(ends.begin(), ends.end(), starts.begin(), starts.end());
    }
  }
}

int CompiledTemplate::addSlot(const QString& name) {
  const int next = slotCount();
  const int slot = m_slots.value(name, next);
  if (slot == next) {
    m_slots.insert(name, slot);
    m_slotNames.append(name);
    m_linesOf.emplace_back();
    m_endsLine.push_back(false);
  }
  return slot;
}

// FACTORY_DEF * KIND FACTORY_NAME NAME CLAUSE..., FACTORY_OPTION NAME KEY VALUE. A template writes tokens and
// single words, so keys and values take turns.
void CompiledTemplate::addKeys(const QString& line) {
  MappingFileWords words(line);
  MappingFileWord word;
  const auto skip = [&](int count) {
    while (count-- > 0) {
      words.next(word);
    }
  };
  if (!words.next(word)) {
    return;
  }
  const bool isOption = word.is(kFactoryOptionStatement);
  if (!isOption && !word.is(kFactoryStatement)) {
    return;
  }
  skip(isOption ? 1 : 4);
  while (words.next(word)) {
    if (word.is(kInputKeyword) || word.is(kOutputKeyword)) {
      // A port may stand between, a type behind.
      while (!word.is(kFeatureTypeKeyword) && words.next(word)) {
      }
      skip(1);
    } else if (word.kind == MappingFileWord::Kind::Bare && TextPlaces::isKey(word.text)) {
      m_keys.insert(word.text.toString());
      if (isOption) {
        return;
      }
      skip(1);
    }
  }
}

void CompiledTemplate::compile(const QString& line) {
  const int number = static_cast<int>(m_compiled.size());
  const int base = m_text.size();
  m_text += line;
  Line compiled{static_cast<int>(m_pieces.size()), 0, 0, isBlank(line), false};
  const auto addText = [&](int begin, int end) {
    if (begin == end) {
      return;
    }
    m_pieces.push_back({base + begin, end - begin, kNoSlot});
    compiled.textSize += end - begin;
    compiled.staysText = compiled.staysText || !isBlank(QStringView(line).mid(begin, end - begin));
  };
  TokenScanner scanner(line);
  int done = 0;
  while (scanner.next()) {
    addText(done, scanner.begin());
    const int slot = addSlot(scanner.name().toString());
    m_pieces.push_back({base + scanner.begin(), scanner.end() - scanner.begin(), slot});
    std::vector<int>& where = m_linesOf[static_cast<std::size_t>(slot)];
    if (where.empty() || where.back() != number) {
      where.push_back(number);
    }
    done = scanner.end();
  }
  if (done == line.size() && done > 0) {
    m_endsLine[static_cast<std::size_t>(m_pieces.back().slot)] = true;
  }
  addText(done, line.size());
  m_isPlain = m_isPlain && !scanner.isNested() && !scanner.endsOpen();
  compiled.endPiece = static_cast<int>(m_pieces.size());
  m_compiled.push_back(compiled);
}
