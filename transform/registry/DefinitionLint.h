// Checks definition files and localised companions: grammar, references, templates, script fragments. What
// the rules mean stands in docs/definition-files.md.
//
// A companion is checked against the definitions of its folder and of everything else that was given. A
// custom-transformer file or workspace under a definition file's name is passed over. Files below the
// product's home are shipped: each of their definitions needs a complete entry in every language that a
// shipped product has to speak, which is German beside English.
#pragma once

#include <platform/Export.h>
#include <transform/registry/LintReport.h>

#include <QSet>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class CompanionLint;
class LintedCatalogue;
class LintedDefinition;
class ScriptLint;

class ORX_EXPORT DefinitionLint {
 public:
  DefinitionLint();
  ~DefinitionLint();
  DefinitionLint(const DefinitionLint&) = delete;
  DefinitionLint& operator=(const DefinitionLint&) = delete;

  // A file, or a folder with all definition files and companions in it and below it. A path is checked once.
  void checkPath(const QString& path);
  // By file and line. Everything given so far is checked before the answer; runs python3 when there are
  // Python scripts.
  const std::vector<orx::Finding>& findings();

 private:
  void addFolder(const QString& folder);
  void addFile(const QString& path);
  void readDefinitions(const QString& path, bool isGiven);
  void readFolderOf(const QString& companion);
  void checkDefinition(const LintedDefinition& definition);
  void checkCompanion(const QString& path);
  void checkShipped();
  void readTranslations();
  void noteTranslated(const QString& path, const CompanionLint& lint);

  LintReport m_report;
  std::unique_ptr<LintedCatalogue> m_catalogue;
  std::unique_ptr<ScriptLint> m_scripts;
  std::vector<std::shared_ptr<const LintedDefinition>> m_definitions;  // to be checked
  std::vector<std::shared_ptr<const LintedDefinition>> m_shipped;
  QStringList m_companions;  // to be checked
  QSet<QString> m_given;
  QSet<QString> m_readFiles;
  QSet<QString> m_translated;  // language, name and version of every companion's entries
  QSet<QString> m_defined;     // folder, name and version
};
