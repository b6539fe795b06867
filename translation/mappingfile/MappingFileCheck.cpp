#include <translation/mappingfile/MappingFileCheck.h>

using Item = MappingFileReader::Item;
using orx::Rule;

void MappingFileCheck::run() {
  while (!m_isFull) {
    switch (m_reader.next()) {
      case Item::Statement:
        m_statements.check(m_reader.statement());
        break;
      case Item::ScriptLine:
        m_statements.addScriptLine(m_reader.statement());
        break;
      case Item::BlockBegin:
        m_statements.beginBlock(m_reader.statement());
        break;
      case Item::BlockEnd:
        m_statements.endBlock();
        break;
      case Item::More:
      case Item::End:
        return;
    }
    m_isFull = m_statements.isFull();
  }
}

void MappingFileCheck::finish(const CustomTransformerLookup& isInstalled) {
  if (m_isFull)
    m_report.add(Rule::TooManyNames, m_reader.lineNumber());
  m_statements.finish(isInstalled);
}
