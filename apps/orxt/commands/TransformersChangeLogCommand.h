#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <string>

class TransformersChangeLogCommand : public Command {
 public:
  TransformersChangeLogCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  std::string m_name;
  int m_fromVersion = -1;
  int m_version = -1;  // the newest
  bool m_json = false;
  std::string m_output = "-";
  DefinitionOptions m_definitions;
};
