#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>
#include <apps/orxt/console/FindingOptions.h>
#include <transform/findings/Findings.h>

#include <QHash>
#include <QSet>
#include <QString>

#include <memory>
#include <string>
#include <utility>
#include <vector>

class DefinitionLint;
class InputFile;

class LintCommand : public Command {
 public:
  LintCommand();
  ~LintCommand() override;
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  // Each is false when something cannot be read.
  bool checkFolder(const QString& folder, Console& console);
  bool checkFile(const QString& path, Console& console);
  bool checkMappingFile(const QString& path, const QString& shownName, Console& console);
  bool failFile(const QString& shownName, const QString& reason, Console& console);
  void takeDefinitionFindings();
  void show(Console& console) const;

  std::vector<std::string> m_paths;
  FindingOptions m_options;
  DefinitionOptions m_definitionOptions;
  std::unique_ptr<DefinitionLint> m_definitions;
  std::vector<std::unique_ptr<InputFile>> m_copies;  // of streams that hold definitions
  QHash<QString, QString> m_shownNames;              // of those copies
  QSet<QString> m_checked;                           // mapping files, by their canonical paths
  std::vector<orx::Finding> m_findings;
  std::vector<std::pair<QString, QString>> m_unreadable;  // files, and why
};
