#include <apps/orxt/commands/GenerateCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/DependencyFile.h>
#include <apps/orxt/console/ProcessPool.h>
#include <apps/orxt/facts/RecordingSource.h>
#include <transform/files/InputFile.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/WorkspaceTranslation.h>

#include <CLI/CLI.hpp>
#include <QDir>
#include <QFileInfo>

namespace messages = orx::messages;

namespace {

constexpr CommandFacts kFacts = {"generate", "Write the mapping file of a workspace",
                                 "orxt generate parcels.orw -o parcels.mf\n"
                                 "orxt generate - --param MAX_SPEED=80 <roads.orw >roads.mf\n"
                                 "orxt generate nightly/*.orw -d out --jobs 4"};

ExitStatus exitStatus(TranslationResult result) {
  switch (result) {
    case TranslationResult::Done:
      return kExitDone;
    case TranslationResult::Refused:
      return kExitRefused;
    case TranslationResult::Unreadable:
    case TranslationResult::Unwritable:
      break;
  }
  return kExitFile;
}

}  // namespace

GenerateCommand::GenerateCommand() : Command(kFacts) {}

void GenerateCommand::declare(CLI::App& app) {
  app.add_option("workspace", m_workspaces, "Workspace files")->type_name("WORKSPACE")->required();
  CLI::Option* output = app.add_option("-o,--output", m_output,
                                       "Mapping file to write; - is standard output, which is the default")
                            ->type_name("FILE");
  CLI::Option* directory = app.add_option("-d,--directory", m_directory,
                                          "Folder for the mapping files of several workspaces (NAME.mf)")
                               ->type_name("DIR")
                               ->excludes(output);
  app.add_option("--depfile", m_dependencies,
                 "File to list in what the mapping file is made from, as make and Ninja read it")
      ->type_name("FILE")
      ->needs(output)
      ->excludes(directory);
  m_parameters.declare(app);
  m_findings.declareRules(app);
  app.add_flag("-q,--quiet", m_quiet, "Errors only");
  app.add_option("-j,--jobs", m_jobs, "How many workspaces to work on at once")
      ->type_name("N")
      ->check(CLI::Range(1, 256))
      ->capture_default_str();
  m_definitions.declare(app);
}

bool GenerateCommand::planJobs(std::vector<Job>& jobs, Console& console) const {
  if (m_directory.empty()) {
    if (m_workspaces.size() > 1) {
      console.fail(messages::kNeedsFolder);
      return false;
    }
    jobs.push_back({QString::fromStdString(m_workspaces.front()),
                    m_output.empty() ? QStringLiteral("-") : QString::fromStdString(m_output)});
    return keepsDependenciesApart(jobs.front(), console);
  }
  const QString directory = QString::fromStdString(m_directory);
  QHash<QString, QString> claimed;
  for (const std::string& name : m_workspaces) {
    const QString workspace = QString::fromStdString(name);
    const QString base = workspace == QLatin1String("-") ? QStringLiteral("standard-input")
                                                         : QFileInfo(workspace).completeBaseName();
    const QString output = directory + QLatin1Char('/') + base + QLatin1String(".mf");
    if (claimed.contains(output)) {
      console.fail(messages::kSameOutput, {claimed.value(output), workspace, output});
      return false;
    }
    claimed.insert(output, workspace);
    jobs.push_back({workspace, output});
  }
  return true;
}

bool GenerateCommand::keepsDependenciesApart(const Job& job, Console& console) const {
  const QFileInfo dependencies(QString::fromStdString(m_dependencies));
  for (const QString& other : {job.workspace, job.output}) {
    const QFileInfo file(other);
    const bool isSame = file.exists() ? file.canonicalFilePath() == dependencies.canonicalFilePath()
                                      : file.absoluteFilePath() == dependencies.absoluteFilePath();
    if (m_dependencies.empty() || !isSame)
      continue;
    console.fail(messages::kSameOutput, {QStringLiteral("--depfile"), other, dependencies.filePath()});
    return false;
  }
  return true;
}

ExitStatus GenerateCommand::run(Console& console) {
  std::vector<Job> jobs;
  Setting setting;
  if (!planJobs(jobs, console) || !m_parameters.read(setting.values, console) ||
      !m_findings.readRules(setting.rules, console))
    return kExitUsage;
  if (!m_directory.empty()) {
    const QString directory = QString::fromStdString(m_directory);
    if (!QDir().mkpath(directory)) {
      console.failFile(directory, messages::kNoFolderMade);
      return kExitFile;
    }
  }
  TransformerMgr& registry = m_definitions.load(console);
  if (jobs.size() == 1)
    return runJob(jobs.front(), setting, registry, console);
  return runInProcesses(jobs, setting, registry, console);
}

ExitStatus GenerateCommand::runJob(const Job& job, const Setting& setting, TransformerSource& source,
                                   Console& console) const {
  const QString shownName = InputFile::shownName(job.workspace);
  orx::Findings diagnostics(shownName);
  QString error;
  RecordingSource recording(source);
  const TranslationResult result = translateWorkspace({job.workspace, job.output, setting.values}, recording,
                                                      diagnostics, error, setting.rules);
  for (const orx::Finding& finding : diagnostics.all()) {
    // Hints are for whoever tidies up, and asks for them by validation.
    if (finding.severity == orx::Severity::Error || (!m_quiet && finding.severity == orx::Severity::Warning))
      console.show(finding);
  }
  if (result == TranslationResult::Unreadable)
    console.failFile(shownName, error);
  else if (result == TranslationResult::Unwritable)
    console.fail(messages::kNotWritable, {error});
  else if (result == TranslationResult::Done && !writeDependencies(job, recording, console))
    return kExitFile;
  return exitStatus(result);
}

bool GenerateCommand::writeDependencies(const Job& job, const RecordingSource& used, Console& console) const {
  if (m_dependencies.empty())
    return true;
  QStringList files = used.files();
  if (job.workspace != QLatin1String("-"))
    files.prepend(job.workspace);
  QString error;
  if (dependency_file::write(QString::fromStdString(m_dependencies), job.output, files, error))
    return true;
  console.fail(error);
  return false;
}

ExitStatus GenerateCommand::runInProcesses(const std::vector<Job>& jobs, const Setting& setting,
                                           TransformerSource& source, Console& console) const {
  int worst = kExitDone;
  int done = 0;
  const int count = static_cast<int>(jobs.size());
  const auto work = [&](int job) {
    return static_cast<int>(runJob(jobs[static_cast<std::size_t>(job)], setting, source, console));
  };
  const auto finished = [&](int, int status) {
    worst = std::max(worst, status);
    console.showProgress(
        TransformResString(messages::kProgress, {QString::number(++done), QString::number(count)}));
  };
  if (!runInPool(count, m_jobs, work, finished)) {
    console.fail(messages::kNoProcess);
    return kExitFile;
  }
  console.endProgress();
  return static_cast<ExitStatus>(worst);
}
