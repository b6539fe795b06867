#include <platform/orxparameter/orxparameter.h>
#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/files/FolderListing.h>
#include <transform/registry/CompanionFileParser.h>
#include <transform/registry/CustomTransformerFiles.h>
#include <transform/registry/DefinitionFileParser.h>
#include <transform/registry/ExceptionList.h>
#include <transform/registry/NamedConnections.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/TransformerCfgFactory.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/XMLComponentReader.h>

#include <QFile>
#include <QRegularExpression>
#include <QSet>

#include <algorithm>
#include <utility>

namespace {

const QString kResourceKind = QStringLiteral("transformer");

constexpr long kNamelessDefinition = 370742;
constexpr long kNewerBuild = 370745;

}  // namespace

ITransformerMgr::~ITransformerMgr() = default;

ITransformerMgr& ITransformerMgr::getTransformerMgr() {
  return TransformerMgr::getTransformerMgr();
}

ITransformerCfg* ITransformerMgr::getNextTransformer() {
  return TransformerMgr::getTransformerMgr().getNextTransformer();
}

TransformerMgr& TransformerMgr::getTransformerMgr() {
  static TransformerMgr registry;
  return registry;
}

TransformerMgr::TransformerMgr()
    : m_customFiles(std::make_unique<CustomTransformerFiles>()),
      m_exceptions(std::make_unique<ExceptionList>()),
      m_connections(std::make_unique<NamedConnections>()) {}

TransformerMgr::~TransformerMgr() = default;

void TransformerMgr::reset() {
  m_loaded = false;
  m_prototypes = PrototypeTable();
  m_customFiles->reset();
  m_iteration = 0;
  m_aliases.clear();
  m_categoryDescriptions.clear();
  m_lastError.clear();
  m_localizedCategories.clear();
  m_categoriesByLocalizedName.clear();
  m_session = nullptr;
  m_ignored.clear();
  *m_exceptions = ExceptionList();
  *m_connections = NamedConnections();
  m_members.clear();
}

void TransformerMgr::loadTransformers(IORXSession* session) {
  reset();
  if (session) {
    m_session = session;
    m_exceptions->readFromHome();
  }
  if (!m_connections->readAll()) {
    m_lastError = m_connections->errorString();
  }
  for (const QString& folder : ORX_resourceDirectories(kResourceKind)) {
    loadFolder(folder, false);
  }
  m_loaded = true;
}

void TransformerMgr::reloadCustomTransformers() {
  for (const QString& folder : ORX_resourceDirectories(kResourceKind)) {
    loadFolder(folder, true);
  }
}

void TransformerMgr::loadRemoteTransformer(const QString& path, int version) {
  const QString file = QORXPrettyUpFileName(path);
  loadCustomTransformer(file, version, true);
  if (version == 0) {
    loadCustomTransformer(file, 1, true);
  }
}

void TransformerMgr::loadFolder(const QString& folder, bool onlyCustomTransformers) {
  static const QRegularExpression anyCompanion(QStringLiteral("^[^/\\\\.].*-localized\\.[a-zA-Z][a-zA-Z]$"));
  const FolderListing listing = FolderListing::files(folder);
  if (listing.failed()) {
    m_lastError = QLatin1String("Error getting file list for folder ") + folder;
    return;
  }
  if (listing.names().isEmpty()) {
    m_lastError = QLatin1String("No transformers found in folder ") + folder;
    return;
  }
  const QString companionEnd = QLatin1String("-localized.") + QORXLanguage();
  QStringList companions;
  for (const QString& name : listing.names()) {
    const QString path = folder + QLatin1Char('/') + name;
    if (anyCompanion.match(name).hasMatch()) {
      if (name.endsWith(companionEnd)) {
        companions.append(path);
      }
    } else if (name.endsWith(QLatin1String(".ort")) ||
               name.startsWith(QLatin1String("CategoryDefinitions"))) {
      loadDefinitionFile(path, onlyCustomTransformers);
    }
  }
  if (!onlyCustomTransformers) {
    for (const QString& path : std::as_const(companions)) {
      loadCompanionFile(path);
    }
  }
}

void TransformerMgr::noteUnreadable(const QString& path, const QString& reason) {
  m_lastError = QLatin1String("Could not open file ") + path;
  if (!reason.isEmpty()) {
    m_lastError += QLatin1String(": ") + reason;
  }
}

void TransformerMgr::loadDefinitionFile(const QString& path, bool onlyCustomTransformers) {
  QFile file(path);
  const bool isOpen = file.open(QIODevice::ReadOnly);
  if (isOpen && XMLComponentReader::isXMLWorkspace(file)) {
    file.close();
    loadCustomTransformer(path, NEWEST_VERSION, false);
    return;
  }
  if (onlyCustomTransformers) {
    return;
  }
  if (!isOpen) {
    noteUnreadable(path, QString());
    return;
  }
  DefinitionFileParser parser;
  if (!parser.parse(file, path)) {
    noteUnreadable(path, parser.errorString());
    return;
  }
  for (const CategoryText& category : parser.categories()) {
    m_categoryDescriptions.insert(category.name, category.texts());
  }
  for (const DefinitionText& text : parser.definitions()) {
    define(DefinitionFileParser::interpret(text));
  }
}

void TransformerMgr::loadCustomTransformer(const QString& path, int version, bool replaces) {
  CustomTransformerFiles::Opened opened = CustomTransformerFiles::open(path, version, this);
  if (opened.needsNewerBuild)
    noteIgnored({path, opened.name, opened.version, QString(), false});
  if (!opened.network)
    return;
  const TransformerCfg* kept = m_prototypes.find(opened.name, opened.version);
  if (kept && !replaces) {
    if (kept->getFileName() != path)
      noteIgnored({path, opened.name, opened.version, kept->getFileName(), true});
    return;
  }
  auto prototype = std::make_unique<CompoundTransformerCfg>(m_customFiles->keep(std::move(opened.network)),
                                                            CompoundTransformerCfg::Body::Deferred);
  prototype->setDefinitionDirectory(this);
  if (QORXPrettyUpFileName(path).startsWith(QORXOrxHome() + QLatin1Char('/')))
    prototype->setTransformerType(TransformerCfg::kBuiltIn);
  const bool isNewest = m_prototypes.add(std::move(prototype));
  if (isNewest || m_customFiles->fileOf(opened.name).isEmpty())
    m_customFiles->noteFile(opened.name, path);
}

void TransformerMgr::noteIgnored(const IgnoredTransformer& ignored) {
  const bool isNoted = std::any_of(m_ignored.begin(), m_ignored.end(), [&](const IgnoredTransformer& other) {
    return other.path == ignored.path && other.name == ignored.name && other.version == ignored.version &&
           other.isDuplicate == ignored.isDuplicate;
  });
  if (!isNoted)
    m_ignored.push_back(ignored);
}

void TransformerMgr::loadOnDemand(const QString& name, int version) {
  const QString path = m_customFiles->fileOf(name);
  if (path.isEmpty() || version == NEWEST_VERSION)
    return;
  if (version != OLDEST_VERSION) {
    loadCustomTransformer(path, version, false);
    if (version == 0 && !m_prototypes.find(name, 0))
      loadCustomTransformer(path, 1, false);
    return;
  }
  const TransformerCfg* oldest = m_prototypes.oldest(name);
  for (const int older : CustomTransformerFiles::versions(path)) {
    if (older < 0)
      continue;
    if (oldest && older >= oldest->getVersion())
      return;
    loadCustomTransformer(path, older, false);
    if (m_prototypes.find(name, older))
      return;
  }
}

void TransformerMgr::loadCompanionFile(const QString& path) {
  QFile file(path);
  if (!file.open(QIODevice::ReadOnly)) {
    noteUnreadable(path, QString());
    return;
  }
  CompanionFileParser parser;
  if (!parser.parse(file)) {
    noteUnreadable(path, parser.errorString());
    return;
  }
  for (const CompanionEntry& entry : parser.entries()) {
    localize(entry);
  }
  for (const CategoryText& category : parser.categoryDescriptions()) {
    m_categoryDescriptions.insert(category.name, category.texts());
  }
  for (const CategoryName& category : parser.categoryNames()) {
    localizeCategory(category.name, category.localizedName);
  }
}

void TransformerMgr::define(const TransformerDefinition& definition) {
  if (definition.name.isEmpty()) {
    m_lastError = TransformResString(kNamelessDefinition, definition.filePath);
    return;
  }
  TransformerDefinition fields = definition;
  fields.allowed = m_exceptions->isAllowed(definition.name);
  std::unique_ptr<TransformerCfg> prototype(createTransformerCfg(fields.name, fields.version));
  prototype->configure(fields, m_session);
  prototype->setDefinitionDirectory(this);
  m_prototypes.add(std::move(prototype));
  for (const QString& alias : std::as_const(fields.aliases)) {
    if (!m_aliases.contains(alias)) {
      m_aliases.insert(alias, fields.name);
    }
  }
}

void TransformerMgr::localize(const CompanionEntry& entry) {
  const PrototypeTable::Versions* versions = m_prototypes.versions(entry.name);
  if (!versions) {
    return;
  }
  for (const auto& [version, prototype] : *versions) {
    if (entry.hasVersion && entry.version != version) {
      continue;
    }
    if (!entry.localizedName.isEmpty()) {
      prototype->setLocalizedName(entry.localizedName);
    }
    for (const CompanionEntry::Text& prompt : entry.prompts) {
      if (!prompt.text.isEmpty() && prototype->hasParameter(prompt.name)) {
        prototype->setParameterPrompt(prompt.name, prompt.text);
      }
    }
    for (const CompanionEntry::Text& tag : entry.tagDescriptions) {
      prototype->setTagDescription(tag.name, tag.text);
    }
    if (!entry.descriptionLines.isEmpty()) {
      prototype->setDescriptionLines(entry.descriptionLines);
    }
    if (!entry.tooltipLines.isEmpty()) {
      prototype->setTooltipLines(entry.tooltipLines);
    }
    if (!entry.changeLog.isEmpty()) {
      prototype->setChangeLog(entry.changeLog);
    }
  }
}

void TransformerMgr::localizeCategory(const QString& category, const QString& localizedName) {
  const QString before = m_localizedCategories.value(category);
  if (m_categoriesByLocalizedName.value(before) == category) {
    m_categoriesByLocalizedName.remove(before);
  }
  m_localizedCategories.insert(category, localizedName);
  m_categoriesByLocalizedName.insert(localizedName, category);
}

void TransformerMgr::getDefinitionFileName(const IORXString& name, IORXString& fileName) const {
  const TransformerCfg* newest = m_prototypes.newest(ORXToQString(name));
  ORXAssign(fileName, newest ? newest->getFileName() : QString());
}

ITransformerCfg* TransformerMgr::getTransformer(const IORXString& name, int version) {
  return getTransformer(ORXToQString(name), version);
}

const TransformerCfg* TransformerMgr::findPrototype(const QString& name, int version) const {
  return version == NEWEST_VERSION   ? m_prototypes.newest(name)
         : version == OLDEST_VERSION ? m_prototypes.oldest(name)
                                     : m_prototypes.find(name, version);
}

std::unique_ptr<TransformerCfg> TransformerMgr::copyOf(const QString& name, int version) const {
  const TransformerCfg* prototype = findPrototype(name, version);
  if (!prototype && version == 0 && !m_customFiles->fileOf(name).isEmpty())
    prototype = m_prototypes.find(name, 1);  // the first version of a custom transformer is called either way
  if (!prototype)
    return nullptr;
  std::unique_ptr<TransformerCfg> copy(prototype->getCopy());
  copy->setIdentifier(copy->getLocalizedName());
  return copy;
}

QString TransformerMgr::refusalReason() const {
  return m_refusal;
}

std::unique_ptr<TransformerCfg> TransformerMgr::makeTransformer(const QString& name, int version) {
  m_refusal.clear();
  if (version == OLDEST_VERSION || !findPrototype(name, version))
    loadOnDemand(name, version);
  std::unique_ptr<TransformerCfg> copy = copyOf(name, version);
  // An alias may lead to another alias; a circle of them leads nowhere.
  QSet<QString> followed;
  for (QString alias = name; !copy && m_aliases.contains(alias) && !followed.contains(alias);) {
    followed.insert(alias);
    alias = m_aliases.value(alias);
    if (version == OLDEST_VERSION || !findPrototype(alias, version))
      loadOnDemand(alias, version);
    copy = copyOf(alias, version);
    if (copy)
      copy->setRequestedAlias(name);
  }
  if (!copy && isTransformerIgnored(name, version)) {
    const auto refused = std::find_if(
        m_ignored.begin(), m_ignored.end(),
        [&](const IgnoredTransformer& ignored) { return ignored.name == name && !ignored.isDuplicate; });
    if (refused != m_ignored.end())
      m_refusal = TransformResString(kNewerBuild, {name, QString::number(refused->version), refused->path});
  }
  return copy;
}

TransformerCfg* TransformerMgr::getTransformer(const QString& name, int version) {
  return makeTransformer(name, version).release();
}

bool TransformerMgr::transformerExists(const QString& name, int version) const {
  const bool anyVersion = version == NEWEST_VERSION || version == OLDEST_VERSION;
  QSet<QString> followed;
  for (QString asked = name;; asked = m_aliases.value(asked)) {
    if (anyVersion ? m_prototypes.contains(asked) : m_prototypes.find(asked, version) != nullptr) {
      return true;
    }
    if (followed.contains(asked) || !m_aliases.contains(asked)) {
      return false;
    }
    followed.insert(asked);
  }
}

int TransformerMgr::currentTransformerVersion(const QString& name) const {
  const TransformerCfg* newest = m_prototypes.newest(name);
  return newest ? newest->getVersion() : -1;
}

QList<int> TransformerMgr::transformerVersions(const QString& name) const {
  QList<int> result;
  if (const PrototypeTable::Versions* versions = m_prototypes.versions(name)) {
    for (const auto& [version, prototype] : *versions) {
      result.append(version);
    }
  }
  return result;
}

TransformerCfg* TransformerMgr::getTransformerWithGUID(const QString& guid) const {
  // By name and version, so that the answer does not depend on a hash.
  for (const QString& name : m_prototypes.names()) {
    for (const auto& [version, prototype] : *m_prototypes.versions(name)) {
      if (prototype->getGUID() == guid) {
        return prototype->getCopy();
      }
    }
  }
  return nullptr;
}

TransformerCfg* TransformerMgr::deserialize(const QString& text) {
  const QStringList pieces = QORXSdfStringToList(text, QLatin1Char(','));
  QHash<QString, QString> fields;
  for (int i = 0; i + 1 < pieces.size(); i += 2)
    fields.insert(pieces.at(i), pieces.at(i + 1));
  std::unique_ptr<TransformerCfg> copy =
      makeTransformer(fields.value(QStringLiteral("NAME")), fields.value(QStringLiteral("VERSION")).toInt());
  if (copy)
    copy->deserialize(fields);
  return copy.release();
}

TransformerCfg* TransformerMgr::getNextTransformer() {
  const QStringList& names = m_prototypes.names();
  return m_iteration < names.size() ? getTransformer(names.at(m_iteration++), NEWEST_VERSION) : nullptr;
}

bool TransformerMgr::isVisibleAlias(const QString& alias) const {
  if (m_prototypes.isVisible(alias))
    return false;
  const auto target = m_aliases.constFind(alias);
  return target != m_aliases.constEnd() && m_prototypes.isVisible(target.value());
}

QStringList TransformerMgr::getVisibleTransformerAliases() const {
  QStringList result;
  for (auto alias = m_aliases.cbegin(); alias != m_aliases.cend(); ++alias) {
    if (m_prototypes.isVisible(alias.value()))
      result.append(alias.key());
  }
  result.sort();
  return result;
}

void TransformerMgr::getCategories(IORXStringArray& categories) const {
  ORXAssign(categories, m_prototypes.categories());
}

QStringList TransformerMgr::getCategoryTransformers(const QString& category) const {
  return m_prototypes.namesOf(getCategoryNameFromLocalizedCategoryName(category));
}

bool TransformerMgr::getCategoryDesc(const QString& category, QStringList& lines) const {
  const auto description = m_categoryDescriptions.constFind(category);
  if (description == m_categoryDescriptions.constEnd())
    return false;
  lines = description.value();
  return true;
}

QString TransformerMgr::getLocalizedCategoryName(const QString& category) const {
  return m_localizedCategories.value(category, category);
}

QString TransformerMgr::getCategoryNameFromLocalizedCategoryName(const QString& localizedName) const {
  return m_categoriesByLocalizedName.value(localizedName, localizedName);
}

bool TransformerMgr::isTransformerIgnored(const IORXString& name, int version) const {
  return isTransformerIgnored(ORXToQString(name), version);
}

bool TransformerMgr::isTransformerIgnored(const QString& name, int version) const {
  const bool anyVersion = version == NEWEST_VERSION || version == OLDEST_VERSION;
  return std::any_of(m_ignored.begin(), m_ignored.end(), [&](const IgnoredTransformer& ignored) {
    return ignored.name == name && (anyVersion || ignored.version == version);
  });
}

QString TransformerMgr::parameterNotSetDisplayString() const {
  return QStringLiteral("<not set>");
}

bool TransformerMgr::isConnectionKnown(const QString& encodedName) const {
  return m_connections->contains(encodedName);
}

const MemberList* TransformerMgr::memberDefinitions(const GUIType& type) const {
  std::shared_ptr<const MemberList>& members = m_members[type.getConfigToken()];
  if (!members) {
    members = std::make_shared<MemberList>(type);
  }
  return members.get();
}
