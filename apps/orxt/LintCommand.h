#pragma once

#include <apps/orxt/Command.h>
#include <apps/orxt/DefinitionOptions.h>

#include <string>
#include <vector>

class LintCommand : public Command {
 public:
  LintCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  std::vector<std::string> m_paths;
  bool m_json = false;
};
