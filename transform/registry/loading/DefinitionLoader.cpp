#include <transform/core/ConfiguredDefinition.h>
#include <transform/files/FolderListing.h>
#include <transform/registry/catalogue/CategoryTexts.h>
#include <transform/registry/catalogue/PrototypeTable.h>
#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionFileNames.h>
#include <transform/registry/loading/DefinitionLoader.h>
#include <transform/registry/loading/ExceptionList.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/XMLComponentReader.h>

#include <QStringList>

#include <map>
#include <utility>

namespace messages = orx::messages;

DefinitionLoader::DefinitionLoader(PrototypeTable& prototypes, CategoryTexts& categories,
                                   const ExceptionList& exceptions,
                                   std::shared_ptr<const DefinitionLoad> load,
                                   CustomTransformerLoad loadCustom)
    : m_prototypes(prototypes),
      m_categories(categories),
      m_exceptions(exceptions),
      m_load(std::move(load)),
      m_loadCustom(std::move(loadCustom)),
      m_file(DefinitionLines::kLargestFile) {}

void DefinitionLoader::loadFolder(const QString& folder) {
  const FolderListing listing = FolderListing::files(folder);
  if (listing.failed()) {
    note(QLatin1String("Error getting file list for folder ") + folder);
    return;
  }
  if (listing.names().isEmpty()) {
    note(QLatin1String("No transformers found in folder ") + folder);
    return;
  }
  const QString start = folder + QLatin1Char('/');
  const QString companionEnd = m_load ? QLatin1String("-localized.") + m_load->language : QString();
  const auto isWantedCompanion = [&](const QString& name) {
    return m_load && name.endsWith(companionEnd) && isCompanionFileName(name);
  };
  QStringList companions;
  for (const QString& name : listing.names()) {
    if (isDefinitionFileName(name)) {
      loadFile(start + name);
    } else if (isWantedCompanion(name)) {
      companions.append(start + name);
    }
  }
  // None of these is opened: a pipe would keep the reader waiting.
  for (const QString& name : listing.unusableNames()) {
    if (isWantedCompanion(name) || (m_load && isDefinitionFileName(name))) {
      noteUnreadable(start + name, QString());
    }
  }
  for (const QString& path : std::as_const(companions)) {
    loadCompanion(path);
  }
}

void DefinitionLoader::loadFile(const QString& path) {
  const bool isOpen = m_file.open(path);
  if (isOpen && XMLComponentReader::isXMLWorkspace(m_file.bytes())) {
    m_loadCustom(path);
    return;
  }
  if (!m_load) {
    return;
  }
  if (!isOpen) {
    noteUnreadable(path, QString());
    return;
  }
  if (!readAll(path)) {
    return;
  }
  m_index.read(m_file.bytes());
  for (const CategoryText& category : m_index.categories()) {
    m_categories.describe(category.name, category.texts());
  }
  noteLosses(path);
  for (IndexedDefinition& definition : m_index.definitions()) {
    define(definition, path);
  }
}

void DefinitionLoader::define(IndexedDefinition& definition, const QString& path) {
  const TransformerDefinition& facts = definition.facts;
  if (facts.name.isEmpty()) {
    return;
  }
  const bool isAllowed = m_exceptions.isAllowed(facts.name);
  const CatalogueEntry& entry = m_prototypes.add(
      {facts.name, facts.version, ConfiguredDefinition::tagsOf(facts.category), facts.visible && isAllowed,
       facts.aliases},
      CatalogueEntry(facts.version, {std::move(definition.bytes), path, isAllowed, m_load, {}}));
  // Its checks ask about the system as it is while loading.
  if (!facts.dependencyScripts.isEmpty()) {
    entry.prototype();
  }
}

void DefinitionLoader::loadCompanion(const QString& path) {
  CompanionFileParser parser;
  if (!m_file.open(path)) {
    noteUnreadable(path, QString());
    return;
  }
  if (!readAll(path)) {
    return;
  }
  parser.parse(m_file.bytes());
  for (CompanionEntry& entry : parser.takeEntries()) {
    m_prototypes.localize(std::make_shared<const CompanionEntry>(std::move(entry)));
  }
  for (const CategoryText& category : parser.categoryDescriptions()) {
    m_categories.describe(category.name, category.texts());
  }
  for (const CategoryName& category : parser.categoryNames()) {
    m_categories.setLocalizedName(category.name, category.localizedName);
  }
}

bool DefinitionLoader::readAll(const QString& path) {
  const bool isRead = m_file.readAll();
  if (!isRead) {
    noteUnreadable(path, m_file.isTooLarge() ? DefinitionLines::tooLargeMessage() : m_file.errorString());
  }
  return isRead;
}

void DefinitionLoader::noteLosses(const QString& path) {
  std::map<std::pair<QString, int>, int> counts;
  for (const IndexedDefinition& definition : m_index.definitions()) {
    const QString& name = definition.facts.name;
    const int version = definition.facts.version;
    if (name.isEmpty()) {
      note(TransformResString(messages::kNamelessDefinition, path));
    } else if (m_index.definitions().size() > 1 && ++counts[{name, version}] == 2) {
      note(TransformResString(messages::kDefinedTwice, {path, name, QString::number(version)}));
    }
  }
  if (m_index.endsUnfinished()) {
    const QString& name = m_index.unfinishedName();
    note(name.isEmpty() ? TransformResString(messages::kUnfinishedLines, path)
                        : TransformResString(messages::kUnfinishedDefinition, {path, name}));
  }
}

void DefinitionLoader::noteUnreadable(const QString& path, const QString& reason) {
  const QString error = QLatin1String("Could not open file ") + path;
  note(reason.isEmpty() ? error : error + QLatin1String(": ") + reason);
}

void DefinitionLoader::note(const QString& error) {
  // A file may give the same reason any number of times.
  if (m_errors.isEmpty() || m_errors.last() != error) {
    m_errors.append(error);
  }
}
