#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <string>

class CustomExtraction;
class QString;
class WorkspaceDocument;

class ExtractCommand : public Command {
 public:
  ExtractCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  // What the file will not hold, although the workspace does.
  void warn(const WorkspaceDocument& document, const CustomExtraction& extraction, const QString& shownName,
            Console& console) const;

  std::string m_workspace;
  std::string m_name;
  std::string m_output;
  int m_version = 0;
  DefinitionOptions m_definitions;
};
