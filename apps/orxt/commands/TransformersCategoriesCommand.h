#pragma once

#include <apps/orxt/Command.h>
#include <apps/orxt/DefinitionOptions.h>

class TransformersCategoriesCommand : public Command {
 public:
  TransformersCategoriesCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  bool m_json = false;
  DefinitionOptions m_definitions;
};
