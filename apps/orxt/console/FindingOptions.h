// What every command that lists findings takes: their form, and how severe each rule counts.
#pragma once

#include <transform/findings/RuleSettings.h>

#include <string>
#include <vector>

namespace CLI {
class App;
}
class Console;

class FindingOptions {
 public:
  // `jsonHelp` tells what the JSON holds.
  void declare(CLI::App& app, const char* jsonHelp);
  // For a command whose findings are no results: how severe each rule counts, and nothing of the form.
  void declareRules(CLI::App& app);
  // Call once the language is set. False, with the reason on the console, for a setting that is none.
  bool readRules(orx::RuleSettings& settings, Console& console) const;

  bool isJson() const { return m_json; }
  bool isSarif() const { return m_sarif; }

 private:
  std::vector<std::string> m_rules;
  bool m_json = false;
  bool m_sarif = false;
};
