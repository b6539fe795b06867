#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>
#include <apps/orxt/console/FindingOptions.h>
#include <apps/orxt/console/ParameterOptions.h>

#include <QHash>
#include <QString>

#include <string>
#include <vector>

class RecordingSource;
class TransformerSource;

class GenerateCommand : public Command {
 public:
  GenerateCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  struct Job {
    QString workspace;
    QString output;
  };

  // What every workspace is judged with.
  struct Setting {
    QHash<QString, QString> values;
    orx::RuleSettings rules;
  };

  // False, with the reason on the console, when the options do not go together.
  bool planJobs(std::vector<Job>& jobs, Console& console) const;
  bool keepsDependenciesApart(const Job& job, Console& console) const;
  ExitStatus runJob(const Job& job, const Setting& setting, TransformerSource& source,
                    Console& console) const;
  bool writeDependencies(const Job& job, const RecordingSource& used, Console& console) const;
  ExitStatus runInProcesses(const std::vector<Job>& jobs, const Setting& setting, TransformerSource& source,
                            Console& console) const;

  std::vector<std::string> m_workspaces;
  std::string m_output;
  std::string m_directory;
  std::string m_dependencies;
  ParameterOptions m_parameters;
  FindingOptions m_findings;
  bool m_quiet = false;
  int m_jobs = 1;
  DefinitionOptions m_definitions;
};
