#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

class TransformersCategoriesCommand : public Command {
 public:
  TransformersCategoriesCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  bool m_json = false;
  DefinitionOptions m_definitions;
};
