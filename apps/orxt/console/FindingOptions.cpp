#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/FindingOptions.h>
#include <transform/text/MessageNumbers.h>

#include <CLI/CLI.hpp>

namespace messages = orx::messages;

void FindingOptions::declare(CLI::App& app, const char* jsonHelp) {
  CLI::Option* json = app.add_flag("--json", m_json, jsonHelp);
  app.add_flag("--sarif", m_sarif, "As a SARIF 2.1.0 log")->excludes(json);
  declareRules(app);
}

void FindingOptions::declareRules(CLI::App& app) {
  app.add_option("--rule", m_rules, "Turns a rule off, or gives it another severity (repeatable)")
      ->type_name("NAME=off|warning|error|hint")
      ->expected(1)
      ->allow_extra_args(false)
      ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
}

bool FindingOptions::readRules(orx::RuleSettings& settings, Console& console) const {
  for (const std::string& rule : m_rules) {
    QString reason;
    if (!settings.set(QString::fromStdString(rule), reason)) {
      console.fail(messages::kOptionRefused, {QStringLiteral("--rule"), reason});
      return false;
    }
  }
  return true;
}
