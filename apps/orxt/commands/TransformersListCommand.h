#pragma once

#include <apps/orxt/Command.h>
#include <apps/orxt/DefinitionOptions.h>

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
