#include <apps/orxt/commands/LintCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/FindingJson.h>
#include <apps/orxt/console/SarifLog.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/files/InputFile.h>
#include <transform/registry/DefinitionLint.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/workspace/VersionStore.h>
#include <translation/MappingFileLint.h>

#include <CLI/CLI.hpp>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>

#include <algorithm>
#include <tuple>

using orx::Severity;

namespace {

constexpr CommandFacts kFacts = {"lint",
                                 "Check definition files and mapping files: grammar, references, scripts",
                                 "orxt lint resources/transformers samples\n"
                                 "orxt lint --json MyTransformer.ort\n"
                                 "orxt lint --rule dropped-type=off --sarif samples >samples.sarif\n"
                                 "orxt generate parcels.orw | orxt lint -"};

const QString kMappingFileSuffix = QStringLiteral(".mf");
const QString kDefinitionFileSuffix = QStringLiteral(".ort");
// What is read of a file to tell its kind.
constexpr qint64 kBeginning = 64 * 1024;

bool startsLike(const QByteArray& text, const char* word) {
  return text.startsWith(word) || text.contains(QByteArray("\n") + word);
}

bool isDefinitionFile(const QByteArray& beginning) {
  return startsLike(beginning, "TRANSFORMER_NAME:") || startsLike(beginning, "TEMPLATE_START") ||
         startsLike(beginning, "CATEGORY_DESCRIPTION_START");
}

// The name decides, as far as it can. Custom transformers are written as mapping files are.
bool isMappingFile(const QString& path, const QString& shownName) {
  if (shownName.endsWith(kMappingFileSuffix))
    return true;
  QFile file(path);
  const QByteArray beginning = file.open(QIODevice::ReadOnly) ? file.read(kBeginning) : QByteArray();
  if (beginning.startsWith(VersionStore::kFirstLine))
    return true;
  const QString name = QFileInfo(shownName).fileName();
  return !name.endsWith(kDefinitionFileSuffix) && !name.contains(QLatin1String("-localized.")) &&
         !name.startsWith(QLatin1String("CategoryDefinitions")) && !isDefinitionFile(beginning);
}

}  // namespace

LintCommand::LintCommand() : Command(kFacts) {}

LintCommand::~LintCommand() = default;

void LintCommand::declare(CLI::App& app) {
  app.add_option("path", m_paths, "Definition files, mapping files, or folders of them; - is standard input")
      ->type_name("PATH")
      ->required();
  m_options.declare(app, "As JSON");
  m_definitionOptions.declare(app);
}

ExitStatus LintCommand::run(Console& console) {
  orx::RuleSettings settings;
  if (!m_options.readRules(settings, console))
    return kExitUsage;
  m_definitions = std::make_unique<DefinitionLint>();
  bool isReadable = true;
  for (const std::string& text : m_paths) {
    const QString path = QString::fromStdString(text);
    const bool isRead = QFileInfo(path).isDir() ? checkFolder(path, console) : checkFile(path, console);
    isReadable = isRead && isReadable;
  }
  takeDefinitionFindings();
  m_findings = settings.apply(std::move(m_findings));
  show(console);
  if (!isReadable)
    return kExitFile;
  const bool hasErrors = std::any_of(m_findings.begin(), m_findings.end(), [](const orx::Finding& finding) {
    return finding.severity == Severity::Error;
  });
  return hasErrors ? kExitRefused : kExitDone;
}

bool LintCommand::checkFolder(const QString& folder, Console& console) {
  m_definitions->checkPath(folder);
  QStringList paths;
  QDirIterator entries(QDir::cleanPath(folder),
                       {QLatin1Char('*') + kMappingFileSuffix, QLatin1Char('*') + kDefinitionFileSuffix},
                       QDir::Files, QDirIterator::Subdirectories);
  while (entries.hasNext())
    paths.append(entries.next());
  paths.sort();
  bool isReadable = true;
  for (const QString& path : qAsConst(paths)) {
    if (isMappingFile(path, path))
      isReadable = checkMappingFile(path, path, console) && isReadable;
  }
  return isReadable;
}

bool LintCommand::checkFile(const QString& path, Console& console) {
  auto input = std::make_unique<InputFile>(path);
  const QString shownName = InputFile::shownName(path);
  if (!input->open()) {
    return failFile(shownName, input->errorString(), console);
  }
  const QString readable = input->path();
  if (isMappingFile(readable, shownName))
    return checkMappingFile(readable, shownName, console);
  m_definitions->checkPath(readable);
  if (input->isCopy()) {
    m_shownNames.insert(readable, shownName);
    m_copies.push_back(std::move(input));
  }
  return true;
}

bool LintCommand::checkMappingFile(const QString& path, const QString& shownName, Console& console) {
  const QString real = QFileInfo(path).canonicalFilePath();
  if (m_checked.contains(real))
    return true;
  m_checked.insert(real);
  const MappingFileFindings result = lintMappingFile(path, shownName, [&](const QString& name, int version) {
    return isCustomTransformer(m_definitionOptions.load(console).makeTransformer(name, version).get());
  });
  m_findings.insert(m_findings.end(), result.findings.begin(), result.findings.end());
  if (!result.readError.isEmpty())
    return failFile(shownName, result.readError, console);
  return true;
}

bool LintCommand::failFile(const QString& shownName, const QString& reason, Console& console) {
  console.failFile(shownName, reason);
  m_unreadable.emplace_back(shownName, reason);
  return false;
}

void LintCommand::takeDefinitionFindings() {
  for (orx::Finding finding : m_definitions->findings()) {
    finding.file = m_shownNames.value(finding.file, finding.file);
    m_findings.push_back(std::move(finding));
  }
  std::stable_sort(m_findings.begin(), m_findings.end(), [](const orx::Finding& a, const orx::Finding& b) {
    return std::tie(a.file, a.line) < std::tie(b.file, b.line);
  });
}

void LintCommand::show(Console& console) const {
  if (m_options.isSarif()) {
    SarifLog log;
    for (const orx::Finding& finding : m_findings)
      log.add(finding);
    for (const auto& [file, reason] : m_unreadable)
      log.addUnreadable(file, reason);
    console.print(log.text());
  } else if (m_options.isJson()) {
    console.print(QString::fromUtf8(QJsonDocument(toJson(m_findings)).toJson()));
  } else {
    for (const orx::Finding& finding : m_findings)
      console.show(finding);
  }
}
