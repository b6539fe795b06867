#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <memory>
#include <string>
#include <vector>

// The catalogue; each way to ask it is a small command of its own.
class TransformersCommand : public Command {
 public:
  TransformersCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  std::vector<std::unique_ptr<Command>> m_commands;
  CLI::App* m_app = nullptr;
};
