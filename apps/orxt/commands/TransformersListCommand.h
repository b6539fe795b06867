#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <string>

class TransformersListCommand : public Command {
 public:
  TransformersListCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  std::string m_category;
  bool m_all = false;
  bool m_json = false;
  DefinitionOptions m_definitions;
};
