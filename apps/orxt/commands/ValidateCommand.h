#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>
#include <apps/orxt/console/FindingOptions.h>
#include <apps/orxt/console/ParameterOptions.h>
#include <translation/WorkspaceValidation.h>

#include <string>
#include <vector>

class ValidateCommand : public Command {
 public:
  ValidateCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  void show(const ValidationReport& report, Console& console) const;
  void summarize(const std::vector<ValidationReport>& reports, Console& console) const;

  std::vector<std::string> m_workspaces;
  FindingOptions m_options;
  ParameterOptions m_parameters;
  bool m_quiet = false;
  DefinitionOptions m_definitions;
};
