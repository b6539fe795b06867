// Checks the statements of a mapping file one by one and collects what holds between them.
#pragma once

#include <translation/mappingfile/MappingFileDefinitions.h>
#include <translation/mappingfile/MappingFileFlow.h>
#include <translation/mappingfile/MappingFileMacros.h>
#include <translation/mappingfile/MappingFileScripts.h>

#include <QString>

#include <functional>
#include <vector>

class MappingFileFunctions;
class MappingFileReport;
class MappingFileWords;
struct MappingFileStatement;

class MappingFileStatements {
 public:
  // Not owned.
  explicit MappingFileStatements(MappingFileReport& report);

  void check(const MappingFileStatement& statement);
  void addScriptLine(const MappingFileStatement& line);
  void beginBlock(const MappingFileStatement& opening);
  void endBlock();
  // That no more can be remembered: the rest of the file is to be left alone.
  bool isFull() const;
  // Reports what does not fit together in what was read.
  void finish(const std::function<bool(const QString&, int)>& isInstalled);

 private:
  struct Scope {
    MappingFileFlow flow;
    int block = -1;
    QString prefix;
  };
  struct Part;

  bool checkKnown(const QStringRef& keyword, Part& part);
  void checkFactory(Part& part);
  void checkOption(Part& part);
  void checkMacro(Part& part);
  void checkFeatureType(Part& part, bool isReader);
  void checkInclude(Part& part);
  void checkIncludeCustom(Part& part);
  void checkPrompt(Part& part);
  void checkTclStatement(Part& part);
  void checkUnknown(const QStringRef& keyword, Part& part);
  void checkScript(Part& part, int begin, int end);
  void refer(const Part& part, int from, int to, MappingFileMacros::Use use);
  void expect(const Part& part, const char* form);
  MappingFileFlow& flow() { return m_scopes.back().flow; }
  int block() const { return m_scopes.back().block; }
  MappingFileMacros::Use useOf(MappingFileMacros::Use use) const {
    return block() < 0 ? use : MappingFileMacros::Use::InBlock;
  }
  void endScript();

  MappingFileReport& m_report;
  MappingFileMacros m_macros;
  MappingFileDefinitions m_definitions;
  MappingFileScripts m_scripts;
  std::vector<Scope> m_scopes;
  bool m_isScript = false;
  bool m_hasStatements = false;  // outside of definitions
};
