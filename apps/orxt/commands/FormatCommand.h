#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <QByteArray>
#include <QString>

#include <string>
#include <vector>

class WorkspaceDocument;

class FormatCommand : public Command {
 public:
  FormatCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  bool optionsFit(Console& console) const;
  ExitStatus format(const QString& fileName, Console& console) const;
  // Lists what would be lost; false when that forbids writing.
  bool mayLose(const WorkspaceDocument& document, const QString& shownName, Console& console) const;
  ExitStatus compare(const QByteArray& original, const QByteArray& bytes, const QString& shownName,
                     Console& console) const;
  ExitStatus write(const QByteArray& bytes, const QString& outputFile, Console& console) const;

  std::vector<std::string> m_workspaces;
  std::string m_output;
  bool m_inPlace = false;
  bool m_check = false;
  bool m_drop = false;
  DefinitionOptions m_language;
};
