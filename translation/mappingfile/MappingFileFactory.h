// Reads one FACTORY_DEF statement word by word.
#pragma once

#include <transform/text/MappingFileWords.h>
#include <translation/mappingfile/MappingFileFlow.h>

#include <QString>

class MappingFileFunctions;
class MappingFileReport;
struct MappingFileStatement;

class MappingFileFactory {
 public:
  // None is owned.
  MappingFileFactory(const MappingFileStatement& statement, MappingFileFlow& flow,
                     MappingFileFunctions& functions, MappingFileReport& report);

  // Checks the statement and hands factory and feature types on to the flow. `words` stand behind the
  // keyword.
  void read(MappingFileWords& words);

  // Of a worker that runs a definition or is a loop of one: its name and version; 0 for any other factory.
  const QString& runTransformer() const { return m_transformer; }
  int runVersion() const { return m_version; }

 private:
  bool nextWord(MappingFileWords& words, MappingFileWord& word, bool isName = false);
  bool readHead(MappingFileWords& words);
  void readKind(const MappingFileWord& kind);
  void readSetting(const MappingFileWord& setting);
  // From behind INPUT or OUTPUT; `word` is the next word then.
  bool readPort(bool isInput, MappingFileWords& words, MappingFileWord& word, bool& hasWord);
  void readClauses(MappingFileWords& words);
  void expect(const MappingFileWord& word, const char* form);

  const MappingFileStatement& m_statement;
  MappingFileFlow& m_flow;
  MappingFileFunctions& m_functions;
  MappingFileReport& m_report;
  QString m_name;
  MappingFileFlow::Role m_role = MappingFileFlow::Role::Ordinary;
  QString m_transformer;
  int m_version = 0;
};
