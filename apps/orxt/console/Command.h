// One sub-command of orxt. Static facts stand in the constructor's CommandFacts; options are declared once,
// with their help, from which parsing, help and shell completion all come.
#pragma once

namespace CLI {
class App;
}
class Console;

enum ExitStatus {
  kExitDone = 0,
  kExitRefused = 1,  // the input was refused; diagnostics say why
  kExitUsage = 2,
  kExitFile = 3,  // a file could not be read or written
};

struct CommandFacts {
  const char* name;
  const char* purpose;  // one line
  const char* example;  // shown below the help
};

class Command {
 public:
  explicit Command(const CommandFacts& facts) : m_facts(facts) {}
  virtual ~Command() = default;
  Command(const Command&) = delete;
  Command& operator=(const Command&) = delete;

  const CommandFacts& facts() const { return m_facts; }
  // Declares options and arguments, bound to members of the command.
  virtual void declare(CLI::App& app) = 0;
  virtual ExitStatus run(Console& console) = 0;

 private:
  const CommandFacts m_facts;
};

// Adds the command, with its purpose, example and options, below `app`.
void declareSubcommand(CLI::App& app, Command& command);
// Puts the example below the help of `app`.
void setExample(CLI::App& app, const char* example);
