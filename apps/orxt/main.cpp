// orxt: the library from the command line.
#include <apps/orxt/commands/ExtractCommand.h>
#include <apps/orxt/commands/FormatCommand.h>
#include <apps/orxt/commands/GenerateCommand.h>
#include <apps/orxt/commands/InfoCommand.h>
#include <apps/orxt/commands/LintCommand.h>
#include <apps/orxt/commands/TransformersCommand.h>
#include <apps/orxt/commands/ValidateCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/DefinitionOptions.h>
#include <transform/text/MessageNumbers.h>
#include <translation/ProgramVersion.h>

#include <CLI/CLI.hpp>

#include <csignal>
#include <exception>
#include <iostream>
#include <memory>
#include <vector>

namespace messages = orx::messages;

namespace {

std::vector<std::unique_ptr<Command>> makeCommands() {
  std::vector<std::unique_ptr<Command>> commands;
  commands.push_back(std::make_unique<GenerateCommand>());
  commands.push_back(std::make_unique<ValidateCommand>());
  commands.push_back(std::make_unique<InfoCommand>());
  commands.push_back(std::make_unique<FormatCommand>());
  commands.push_back(std::make_unique<ExtractCommand>());
  commands.push_back(std::make_unique<LintCommand>());
  commands.push_back(std::make_unique<TransformersCommand>());
  return commands;
}

int runCommandLine(int argc, char** argv) {
  CLI::App app("Transformer workspaces from the command line.", "orxt");
  app.set_version_flag("--version", programVersion().toStdString(), "Print the version and end");
  app.require_subcommand(0, 1);
  setExample(app, "orxt generate parcels.orw -o parcels.mf\norxt transformers list");

  const std::vector<std::unique_ptr<Command>> commands = makeCommands();
  for (const std::unique_ptr<Command>& command : commands)
    declareSubcommand(app, *command);
  try {
    app.parse(argc, argv);
  } catch (const CLI::ParseError& error) {
    return app.exit(error) == 0 ? kExitDone : kExitUsage;
  }
  if (app.get_subcommands().empty()) {
    std::cerr << app.help();
    return kExitUsage;
  }
  Console console;
  for (const std::unique_ptr<Command>& command : commands) {
    if (app.got_subcommand(command->facts().name)) {
      DefinitionOptions::checkLanguage(console);
      const int status = command->run(console);
      if (!console.flush()) {
        console.failFile(QStringLiteral("standard output"), messages::kCannotBeWritten);
        return kExitFile;
      }
      return status;
    }
  }
  return kExitUsage;
}

}  // namespace

int main(int argc, char** argv) {
  // A closed pipe is an error to report, not a reason to die without a word.
  std::signal(SIGPIPE, SIG_IGN);
  try {
    return runCommandLine(argc, argv);
  } catch (const std::exception& error) {
    Console().fail(messages::kUnexpectedEnd, {QString::fromLocal8Bit(error.what())});
    return kExitFile;
  }
}
