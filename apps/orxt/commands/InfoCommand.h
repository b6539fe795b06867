#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <QJsonArray>
#include <QString>

#include <string>
#include <vector>

class InfoCommand : public Command {
 public:
  InfoCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  ExitStatus describe(const QString& fileName, bool isFirst, QJsonArray& entries, Console& console) const;

  std::vector<std::string> m_workspaces;
  bool m_json = false;
  DefinitionOptions m_language;
};
