#include <apps/orxt/commands/TransformersCategoriesCommand.h>
#include <apps/orxt/commands/TransformersChangeLogCommand.h>
#include <apps/orxt/commands/TransformersCommand.h>
#include <apps/orxt/commands/TransformersListCommand.h>
#include <apps/orxt/commands/TransformersSearchCommand.h>
#include <apps/orxt/commands/TransformersShowCommand.h>

#include <CLI/CLI.hpp>

namespace {

constexpr CommandFacts kFacts = {"transformers", "Look things up in the catalogue of transformers",
                                 "orxt transformers list --category Geometry\n"
                                 "orxt transformers search clip area\n"
                                 "orxt transformers show GeometryBufferer"};

}  // namespace

TransformersCommand::TransformersCommand() : Command(kFacts) {
  m_commands.push_back(std::make_unique<TransformersListCommand>());
  m_commands.push_back(std::make_unique<TransformersShowCommand>());
  m_commands.push_back(std::make_unique<TransformersSearchCommand>());
  m_commands.push_back(std::make_unique<TransformersCategoriesCommand>());
  m_commands.push_back(std::make_unique<TransformersChangeLogCommand>());
}

void TransformersCommand::declare(CLI::App& app) {
  m_app = &app;
  app.require_subcommand(1);
  for (const std::unique_ptr<Command>& command : m_commands)
    declareSubcommand(app, *command);
}

ExitStatus TransformersCommand::run(Console& console) {
  for (const std::unique_ptr<Command>& command : m_commands) {
    if (m_app->got_subcommand(command->facts().name))
      return command->run(console);
  }
  return kExitUsage;
}
