// Other values for global parameters, as the commands that judge or write workspaces take them.
#pragma once

#include <QHash>
#include <QString>

#include <string>
#include <vector>

namespace CLI {
class App;
}
class Console;

class ParameterOptions {
 public:
  void declare(CLI::App& app);
  // False, with the reason on the console, for what is not NAME=VALUE.
  bool read(QHash<QString, QString>& values, Console& console) const;

 private:
  std::vector<std::string> m_parameters;
};
