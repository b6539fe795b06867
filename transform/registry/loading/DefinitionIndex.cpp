#include <transform/registry/loading/DefinitionIndex.h>
#include <transform/registry/loading/DefinitionWalk.h>

#include <algorithm>
#include <iterator>

namespace {

const DefinitionKeyword* registrationKeyword(const DefinitionLines& lines) {
  static const std::vector<DefinitionKeyword> keywords = [] {
    std::vector<DefinitionKeyword> wanted;
    std::copy_if(definitionKeywords().begin(), definitionKeywords().end(), std::back_inserter(wanted),
                 [](const DefinitionKeyword& keyword) {
                   return (keyword.places & DefinitionKeyword::kRegistration) != 0;
                 });
    return wanted;
  }();
  for (const DefinitionKeyword& keyword : keywords) {
    if (lines.startsWith(keyword.word)) {
      return &keyword;
    }
  }
  return nullptr;
}

}  // namespace

// What the walk over a file's lines tells the index.
class DefinitionIndex::Visitor {
 public:
  Visitor(DefinitionIndex& index, const QByteArray& file) : m_index(index), m_file(file) {}

  void begin(const DefinitionLines& lines) {
    if (m_start < 0) {
      m_start = lines.offset();
    }
  }
  void header(const DefinitionLines& lines) {
    if (const DefinitionKeyword* keyword = registrationKeyword(lines)) {
      takeDefinitionValue(*keyword, lines.behind(keyword->word), m_current.facts);
    }
  }
  std::vector<DefinitionLine>* block(DefinitionBlock) { return nullptr; }
  void blockRead(DefinitionBlock, int) {}
  std::vector<DefinitionLine>* templateBlock() { return nullptr; }
  void templateRead(const DefinitionLines& lines) {
    m_current.bytes = QByteArray(m_file.constData() + m_start, static_cast<int>(lines.endOffset() - m_start));
    m_index.m_definitions.push_back(std::move(m_current));
    m_current = IndexedDefinition();
    m_start = -1;
  }
  std::vector<CategoryText>& categories() { return m_index.m_categories; }
  void open(int) {}
  void finish() {
    m_index.m_endsUnfinished = m_start >= 0;
    m_index.m_unfinishedName = m_current.facts.name;
  }

 private:
  DefinitionIndex& m_index;
  const QByteArray& m_file;
  IndexedDefinition m_current;
  qint64 m_start = -1;  // of the current definition's first line
};

void DefinitionIndex::read(const QByteArray& file) {
  m_definitions.clear();
  m_categories.clear();
  DefinitionLines lines;
  lines.open(file, true);
  Visitor visitor(*this, file);
  walkDefinitionLines(lines, DefinitionFileKind::Definitions, visitor);
  visitor.finish();
}
