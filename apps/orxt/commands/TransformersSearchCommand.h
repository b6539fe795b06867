#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <string>
#include <vector>

class TransformersSearchCommand : public Command {
 public:
  TransformersSearchCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  std::vector<std::string> m_words;
  bool m_all = false;
  bool m_json = false;
  DefinitionOptions m_definitions;
};
