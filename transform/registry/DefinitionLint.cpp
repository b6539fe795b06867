#include <platform/qorxcore/OrxHome.h>
#include <transform/files/FolderListing.h>
#include <transform/registry/DefinitionLint.h>
#include <transform/registry/lint/CompanionLint.h>
#include <transform/registry/lint/HeaderLint.h>
#include <transform/registry/lint/LintedDefinition.h>
#include <transform/registry/lint/ParameterLint.h>
#include <transform/registry/lint/ScriptLint.h>
#include <transform/registry/lint/TemplateLint.h>
#include <transform/registry/loading/DefinitionFileNames.h>
#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/XMLComponentReader.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>

using orx::Rule;
namespace messages = orx::messages;

namespace {

const QLatin1String kShippedLanguages[] = {QLatin1String("de")};
constexpr int kDeepestFolder = 32;

bool isShipped(const QString& path) {
  return path.startsWith(QDir(QORXOrxHome()).absolutePath() + QLatin1Char('/'));
}

QString entryKey(const QString& place, const QString& name, int version) {
  return place + QLatin1Char('\n') + name + QLatin1Char('\n') + QString::number(version);
}

}  // namespace

DefinitionLint::DefinitionLint()
    : m_catalogue(std::make_unique<LintedCatalogue>()), m_scripts(std::make_unique<ScriptLint>()) {}

DefinitionLint::~DefinitionLint() = default;

void DefinitionLint::checkPath(const QString& path) {
  // Folders below folders, without recursion; links that lead in a circle end at the bound.
  if (!QFileInfo(path).isDir()) {
    addFile(path);
    return;
  }
  std::vector<std::pair<QString, int>> pending = {{QDir::cleanPath(path), 0}};
  while (!pending.empty()) {
    const auto [folder, depth] = pending.back();
    pending.pop_back();
    const FolderListing folders = FolderListing::folders(folder);
    for (const QString& name : folders.names()) {
      if (depth < kDeepestFolder) {
        pending.emplace_back(folder + QLatin1Char('/') + name, depth + 1);
      }
    }
    addFolder(folder);
  }
}

void DefinitionLint::addFolder(const QString& folder) {
  const FolderListing listing = FolderListing::files(folder);
  if (listing.failed()) {
    m_report.add(Rule::UnreadableFile, messages::kDefinitionUnreadable, folder, 0, {listing.errorString()});
  }
  for (const QString& name : listing.names()) {
    if (isDefinitionFileName(name) || isCompanionFileName(name)) {
      addFile(folder + QLatin1Char('/') + name);
    }
  }
  for (const QString& name : listing.unusableNames()) {
    if (isDefinitionFileName(name) || isCompanionFileName(name)) {
      m_report.add(Rule::UnreadableFile, messages::kNoReadableFile, folder + QLatin1Char('/') + name, 0);
    }
  }
}

void DefinitionLint::addFile(const QString& path) {
  const QString real = QFileInfo(path).canonicalFilePath();
  if (!real.isEmpty() && m_given.contains(real)) {
    return;
  }
  m_given.insert(real);
  if (isCompanionFileName(QFileInfo(path).fileName())) {
    m_companions.append(path);
  } else {
    readDefinitions(path, true);
  }
}

void DefinitionLint::readDefinitions(const QString& path, bool isGiven) {
  const QString real = QFileInfo(path).canonicalFilePath();
  const bool isNew = real.isEmpty() || !m_readFiles.contains(real);
  m_readFiles.insert(real);
  if (!isNew && !isGiven) {
    return;
  }
  LintReport ignored;
  LintReport& report = isGiven ? m_report : ignored;
  QFile file(path);
  DefinitionFileParser parser;
  if (!file.open(QIODevice::ReadOnly)) {
    report.add(Rule::UnreadableFile, messages::kDefinitionUnreadable, path, 0, {file.errorString()});
    return;
  }
  if (!parser.parse(file, path)) {
    report.add(Rule::UnreadableFile, messages::kDefinitionUnreadable, path, 0, {parser.errorString()});
    return;
  }
  if (XMLComponentReader::IsFileXMLWorkspace(path)) {
    if (parser.definitions().empty()) {
      return;
    }
    report.add(Rule::WorkspaceMark, messages::kTakenForWorkspace, path, 1);
  }
  if (!parser.isSoundUtf8()) {
    report.add(Rule::NotUtf8, messages::kFileNotUtf8, path, 0);
  }
  if (parser.openBlockLine() != 0) {
    report.add(Rule::OpenBlock, messages::kBlockWithoutEnd, path, parser.openBlockLine());
  }
  if (!parser.unfinished().isEmpty()) {
    report.add(Rule::UnfinishedDefinition, messages::kLostLines, path, parser.unfinished().firstLine());
  }
  for (const CategoryText& category : parser.categories()) {
    if (category.name.isEmpty()) {
      report.add(Rule::BadValue, messages::kNamelessCategory, path, category.line);
    }
    m_catalogue->addCategory(category.name);
  }
  for (const DefinitionText& text : parser.definitions()) {
    const auto definition = std::make_shared<const LintedDefinition>(text);
    if (isNew) {
      m_catalogue->add(definition);
    }
    if (isGiven) {
      m_definitions.push_back(definition);
    }
  }
}

// A companion speaks of the definitions beside it, whether they are to be checked or not.
void DefinitionLint::readFolderOf(const QString& companion) {
  const QString folder = QFileInfo(companion).path();
  const FolderListing listing = FolderListing::files(folder);
  for (const QString& name : listing.names()) {
    if (isDefinitionFileName(name)) {
      readDefinitions(folder + QLatin1Char('/') + name, false);
    }
  }
}

void DefinitionLint::checkDefinition(const LintedDefinition& definition) {
  const TransformerDefinition& fields = definition.fields();
  const QString key = entryKey(QFileInfo(definition.file()).absolutePath(), fields.name, fields.version);
  if (m_defined.contains(key)) {
    m_report.add(Rule::DuplicateDefinition, messages::kDuplicateDefinition, definition.file(),
                 definition.nameLine(), {fields.name, QString::number(fields.version)});
  }
  m_defined.insert(key);
  HeaderLint(definition, m_report).check();
  if (ParameterLint(definition, m_report).check()) {
    TemplateLint(definition, m_report).check();
    m_scripts->check(definition, m_report);
  }
}

void DefinitionLint::checkCompanion(const QString& path) {
  QFile file(path);
  if (!file.open(QIODevice::ReadOnly)) {
    m_report.add(Rule::UnreadableFile, messages::kDefinitionUnreadable, path, 0, {file.errorString()});
    return;
  }
  CompanionLint lint(path, *m_catalogue, m_report);
  lint.check(file, isShipped(QFileInfo(path).absoluteFilePath()));
  noteTranslated(path, lint);
}

// A shipped definition that was given alone has its companions beside it.
void DefinitionLint::readTranslations() {
  LintReport ignored;
  QSet<QString> folders;
  for (const auto& definition : m_shipped) {
    folders.insert(QFileInfo(definition->file()).path());
  }
  for (const QString& folder : std::as_const(folders)) {
    const FolderListing listing = FolderListing::files(folder);
    for (const QString& name : listing.names()) {
      const QString path = folder + QLatin1Char('/') + name;
      QFile file(path);
      if (isCompanionFileName(name) && !m_given.contains(QFileInfo(path).canonicalFilePath()) &&
          file.open(QIODevice::ReadOnly)) {
        CompanionLint lint(path, *m_catalogue, ignored);
        lint.check(file, false);
        noteTranslated(path, lint);
      }
    }
  }
}

void DefinitionLint::noteTranslated(const QString& path, const CompanionLint& lint) {
  const QString language = path.right(2).toLower();
  for (const auto& [name, version] : lint.translated()) {
    m_translated.insert(entryKey(language, name, version));
  }
}

void DefinitionLint::checkShipped() {
  readTranslations();
  for (const auto& definition : m_shipped) {
    for (const QLatin1String language : kShippedLanguages) {
      const TransformerDefinition& fields = definition->fields();
      if (!m_translated.contains(entryKey(language, fields.name, fields.version))) {
        m_report.add(Rule::MissingTranslation, messages::kNoTranslation, definition->file(),
                     definition->nameLine(), {fields.name, QString::number(fields.version), language});
      }
    }
  }
  m_shipped.clear();
}

const std::vector<orx::Finding>& DefinitionLint::findings() {
  for (const auto& definition : m_definitions) {
    checkDefinition(*definition);
    if (isShipped(QFileInfo(definition->file()).absoluteFilePath())) {
      m_shipped.push_back(definition);
    }
  }
  m_definitions.clear();
  for (const QString& path : std::as_const(m_companions)) {
    readFolderOf(path);
  }
  for (const QString& path : std::as_const(m_companions)) {
    checkCompanion(path);
  }
  checkShipped();
  m_companions.clear();
  m_scripts->checkPython(m_report);
  m_report.sort();
  return m_report.findings();
}
