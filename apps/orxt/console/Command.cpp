#include <apps/orxt/console/Command.h>

#include <CLI/CLI.hpp>

#include <sstream>

void setExample(CLI::App& app, const char* example) {
  std::istringstream lines(example);
  std::string footer = "Example:\n";
  for (std::string line; std::getline(lines, line);)
    footer += "  " + line + "\n";
  app.footer(footer);
}

void declareSubcommand(CLI::App& app, Command& command) {
  CLI::App* sub = app.add_subcommand(command.facts().name, command.facts().purpose);
  setExample(*sub, command.facts().example);
  command.declare(*sub);
}
