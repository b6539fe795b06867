#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/ParameterOptions.h>
#include <transform/text/MessageNumbers.h>

#include <CLI/CLI.hpp>

namespace messages = orx::messages;

void ParameterOptions::declare(CLI::App& app) {
  app.add_option("--param", m_parameters, "Gives a global parameter another value (repeatable)")
      ->type_name("NAME=VALUE")
      ->expected(1)
      ->allow_extra_args(false)
      ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
}

bool ParameterOptions::read(QHash<QString, QString>& values, Console& console) const {
  for (const std::string& text : m_parameters) {
    const QString setting = QString::fromStdString(text);
    const int equals = setting.indexOf(QLatin1Char('='));
    if (equals <= 0) {
      console.fail(messages::kNeedsNameAndValue, {setting});
      return false;
    }
    values.insert(setting.left(equals), setting.mid(equals + 1));
  }
  return true;
}
