#include <platform/orxparameter/orxparameter.h>
#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/files/FolderListing.h>
#include <transform/registry/ChangeLogPage.h>
#include <transform/registry/CompanionFileParser.h>
#include <transform/registry/DefinitionFileParser.h>
#include <transform/registry/ExceptionList.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/TransformerCfgFactory.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/XMLComponentReader.h>

#include <QFile>
#include <QRegularExpression>
#include <QStandardPaths>
#include <QTextStream>

#include <algorithm>

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

TransformerMgr::TransformerMgr() : m_exceptions(std::make_unique<ExceptionList>()) {}
TransformerMgr::~TransformerMgr() = default;

void TransformerMgr::reset() {
  m_loaded = false;
  m_newest.clear();
  m_versions.clear();
  m_names.clear();
  m_visibleNames.clear();
  m_visibleNameSet.clear();
  m_iteration = 0;
  m_aliases.clear();
  m_categoryDescriptions.clear();
  m_lastError.clear();
  m_localizedCategories.clear();
  m_categoriesByLocalizedName.clear();
  m_categories.clear();
  m_categoryIndex.clear();
  m_connections.clear();
  m_ignored.clear();
  *m_exceptions = ExceptionList();
}

void TransformerMgr::loadTransformers(IORXSession* session) {
  reset();
  m_session = session;
  if (session)
    m_exceptions->readFromHome();
  loadConnections();
  for (const QString& folder : ORX_resourceDirectories(QStringLiteral("transformer")))
    loadFolder(folder);
  m_loaded = true;
}

void TransformerMgr::reloadCustomTransformers() {}

void TransformerMgr::loadFolder(const QString& folder) {
  static const QRegularExpression companion(QStringLiteral("^[^/\\\\.].*-localized\\.[a-zA-Z][a-zA-Z]$"));
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
    if (companion.match(name).hasMatch()) {
      if (name.endsWith(companionEnd))
        companions.append(path);
    } else if (name.endsWith(QLatin1String(".ort")) ||
               name.startsWith(QLatin1String("CategoryDefinitions"))) {
      loadDefinitionFile(path);
    }
  }
  for (const QString& path : companions)
    loadCompanionFile(path);
}

void TransformerMgr::loadDefinitionFile(const QString& path) {
  // Such a file holds a custom transformer, which its own loader reads.
  if (XMLComponentReader::IsFileXMLWorkspace(path))
    return;
  QFile file(path);
  if (!file.open(QIODevice::ReadOnly)) {
    m_lastError = QLatin1String("Could not open file ") + path;
    return;
  }
  DefinitionFileParser parser([this](TransformerDefinition&& definition) { define(definition); },
                              [this](const QString& category, const QStringList& lines) {
                                m_categoryDescriptions.insert(category, lines);
                              });
  parser.parse(file, path);
}

void TransformerMgr::loadCompanionFile(const QString& path) {
  QFile file(path);
  if (!file.open(QIODevice::ReadOnly)) {
    m_lastError = QLatin1String("Could not open file ") + path;
    return;
  }
  CompanionFileParser parser({[this](const CompanionEntry& entry) { localize(entry); },
                              [this](const QString& category, const QStringList& lines) {
                                m_categoryDescriptions.insert(category, lines);
                              },
                              [this](const QString& category, const QString& localizedName) {
                                m_localizedCategories.insert(category, localizedName);
                                m_categoriesByLocalizedName.insert(localizedName, category);
                              }});
  parser.parse(file);
}

void TransformerMgr::loadConnections() {
  const QStringList folders = {
      QORXOrxHome(),
      QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation) + QLatin1String("/orx")};
  for (const QString& folder : folders) {
    QFile file(folder + QLatin1String("/connections.list"));
    if (!file.open(QIODevice::ReadOnly))
      continue;
    QTextStream stream(&file);
    stream.setCodec("utf-8");
    QString line;
    while (stream.readLineInto(&line)) {
      line = line.trimmed();
      if (!line.isEmpty() && !line.startsWith(QLatin1Char('#')))
        m_connections.insert(line);
    }
  }
}

void TransformerMgr::define(const TransformerDefinition& definition) {
  TransformerDefinition fields = definition;
  fields.allowed = m_exceptions->isAllowed(definition.name);
  std::unique_ptr<TransformerCfg> prototype(createTransformerCfg(fields.name, fields.version));
  prototype->configure(fields, m_session);
  prototype->setDefinitionDirectory(this);
  if (fields.filePath.startsWith(QORXOrxHome() + QLatin1Char('/')))
    prototype->setTransformerType(TransformerCfg::kBuiltIn);
  const QStringList aliases = prototype->aliases();
  registerPrototype(std::move(prototype));
  for (const QString& alias : aliases) {
    if (!m_aliases.contains(alias))
      m_aliases.insert(alias, fields.name);
  }
}

bool TransformerMgr::registerPrototype(std::unique_ptr<TransformerCfg> prototype) {
  const QString name = prototype->getName();
  const int version = prototype->getVersion();
  const auto newest = m_newest.constFind(name);
  const bool isNewName = newest == m_newest.constEnd();
  if (isNewName) {
    m_names.append(name);
    if (prototype->isVisible()) {
      m_visibleNames.append(name);
      m_visibleNameSet.insert(name);
    }
  }
  const bool isNewest = isNewName || version >= newest.value()->getVersion();
  if (isNewest) {
    for (const QString& tag : prototype->tags()) {
      if (!m_categoryIndex.contains(tag))
        m_categories.append(tag);
      QStringList& listed = m_categoryIndex[tag];
      if (!listed.contains(name))
        listed.append(name);
    }
    m_newest.insert(name, prototype.get());
  }
  m_versions[name][version] = std::move(prototype);
  return isNewest;
}

void TransformerMgr::localize(const CompanionEntry& entry) {
  const auto versions = m_versions.constFind(entry.name);
  if (versions == m_versions.constEnd())
    return;
  for (auto version = versions->cbegin(); version != versions->cend(); ++version) {
    if (entry.hasVersion && entry.version != version.key())
      continue;
    TransformerCfg& prototype = *version.value();
    if (!entry.localizedName.isEmpty())
      prototype.setLocalizedName(entry.localizedName);
    for (const auto& [parameter, prompt] : entry.prompts) {
      if (!prompt.isEmpty())
        prototype.setParameterPrompt(parameter, prompt);
    }
    for (const auto& [tag, description] : entry.tagDescriptions)
      prototype.setTagDescription(tag, description);
    if (!entry.descriptionLines.isEmpty())
      prototype.setDescriptionLines(entry.descriptionLines);
    if (!entry.tooltipLines.isEmpty())
      prototype.setTooltipLines(entry.tooltipLines);
    if (!entry.changeLog.isEmpty())
      prototype.setChangeLog(entry.changeLog);
  }
}

void TransformerMgr::getDefinitionFileName(const IORXString& name, IORXString& fileName) const {
  const TransformerCfg* newest = m_newest.value(ORXToQString(name));
  ORXAssign(fileName, newest ? newest->getFileName() : QString());
}

ITransformerCfg* TransformerMgr::getTransformer(const IORXString& name, int version) {
  return getTransformer(ORXToQString(name), version);
}

const TransformerCfg* TransformerMgr::findPrototype(const QString& name, int version) const {
  if (version == NEWEST_VERSION)
    return m_newest.value(name);
  const auto versions = m_versions.constFind(name);
  if (versions == m_versions.constEnd())
    return nullptr;
  if (version == OLDEST_VERSION) {
    const TransformerCfg* oldest = nullptr;
    for (const std::shared_ptr<TransformerCfg>& prototype : *versions) {
      if (prototype->getVersion() >= 0 && (!oldest || prototype->getVersion() < oldest->getVersion()))
        oldest = prototype.get();
    }
    return oldest;
  }
  return versions->value(version).get();
}

std::unique_ptr<TransformerCfg> TransformerMgr::copyOf(const QString& name, int version) const {
  const TransformerCfg* prototype = findPrototype(name, version);
  if (!prototype)
    return nullptr;
  std::unique_ptr<TransformerCfg> copy(prototype->getCopy());
  copy->setIdentifier(copy->getLocalizedName());
  return copy;
}

std::unique_ptr<TransformerCfg> TransformerMgr::makeTransformer(const QString& name, int version) {
  std::unique_ptr<TransformerCfg> copy = copyOf(name, version);
  // An alias may lead to another alias; a circle of them leads nowhere.
  QSet<QString> followed;
  for (QString alias = name; !copy && m_aliases.contains(alias) && !followed.contains(alias);) {
    followed.insert(alias);
    alias = m_aliases.value(alias);
    copy = copyOf(alias, version);
    if (copy)
      copy->setRequestedAlias(name);
  }
  return copy;
}

TransformerCfg* TransformerMgr::getTransformer(const QString& name, int version) {
  return makeTransformer(name, version).release();
}

bool TransformerMgr::transformerExists(const QString& name, int version) const {
  QSet<QString> followed;
  QString asked = name;
  for (;;) {
    const bool anyVersion = version == NEWEST_VERSION || version == OLDEST_VERSION;
    if (anyVersion ? m_newest.contains(asked) : m_versions.value(asked).contains(version))
      return true;
    if (followed.contains(asked) || !m_aliases.contains(asked))
      return false;
    followed.insert(asked);
    asked = m_aliases.value(asked);
  }
}

int TransformerMgr::currentTransformerVersion(const QString& name) const {
  const TransformerCfg* newest = m_newest.value(name);
  return newest ? newest->getVersion() : -1;
}

TransformerCfg* TransformerMgr::getTransformerWithGUID(const QString& guid) const {
  // By name and version, so that the answer does not depend on a hash.
  for (const QString& name : m_names) {
    const auto& versions = *m_versions.constFind(name);
    QList<int> numbers = versions.keys();
    std::sort(numbers.begin(), numbers.end());
    for (const int number : numbers) {
      if (versions.value(number)->getGUID() == guid)
        return versions.value(number)->getCopy();
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
  return m_iteration < m_names.size() ? getTransformer(m_names.at(m_iteration++), NEWEST_VERSION) : nullptr;
}

bool TransformerMgr::isVisibleAlias(const QString& alias) const {
  if (m_visibleNameSet.contains(alias))
    return false;
  const auto target = m_aliases.constFind(alias);
  return target != m_aliases.constEnd() && m_visibleNameSet.contains(target.value());
}

QStringList TransformerMgr::getVisibleTransformerAliases() const {
  QStringList result;
  for (auto alias = m_aliases.cbegin(); alias != m_aliases.cend(); ++alias) {
    if (m_visibleNameSet.contains(alias.value()))
      result.append(alias.key());
  }
  result.sort();
  return result;
}

void TransformerMgr::getCategories(IORXStringArray& categories) const {
  ORXAssign(categories, m_categories);
}

QStringList TransformerMgr::getCategoryTransformers(const QString& category) const {
  return m_categoryIndex.value(getCategoryNameFromLocalizedCategoryName(category));
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
  const QString wanted = ORXToQString(name);
  return std::any_of(m_ignored.begin(), m_ignored.end(), [&](const IgnoredTransformer& ignored) {
    return ignored.name == wanted &&
           (version == NEWEST_VERSION || version == OLDEST_VERSION || ignored.version == version);
  });
}

void TransformerMgr::getChangeLog(ITransformerCfg* configuration, IORXString& page) const {
  ORXAssign(page, changeLog(dynamic_cast<TransformerCfg*>(configuration)));
}

QString TransformerMgr::changeLog(TransformerCfg* configuration) const {
  if (!configuration)
    return QString();
  const bool isReplaced = !configuration->isVisible() && !configuration->replacedBy().isEmpty();
  const TransformerCfg* target =
      m_newest.value(isReplaced ? configuration->replacedBy() : configuration->getName());
  if (!target)
    return QString();
  return changeLog(configuration->getName(), configuration->getVersion(), target->getName(),
                   target->getVersion())
      .join(QLatin1Char('\n'));
}

QStringList TransformerMgr::changeLog(const QString& name, int fromVersion, const QString& newName,
                                      int toVersion) const {
  ChangeLogPage page(
      TransformResString(370643, {name, QString::number(fromVersion), newName, QString::number(toVersion)}));
  // Newest first; the version that one comes from is not news, unless it is all there is.
  const int first = name == newName && toVersion > fromVersion ? fromVersion + 1
                    : name == newName                          ? toVersion
                                                               : 0;
  bool anything = false;
  const auto versions = m_versions.constFind(newName);
  if (versions != m_versions.constEnd()) {
    QList<int> numbers = versions->keys();
    std::sort(numbers.begin(), numbers.end(), std::greater<>());
    for (const int number : numbers) {
      const QStringList entries = versions->value(number)->getChangeLog();
      if (number < first || number > toVersion || entries.isEmpty())
        continue;
      page.addVersion(TransformResString(370644, QString::number(number)), entries);
      anything = true;
    }
  }
  if (!anything)
    page.addVersion(TransformResString(370642), {});
  return page.lines();
}

QString TransformerMgr::parameterNotSetDisplayString() const {
  return QStringLiteral("<not set>");
}

bool TransformerMgr::isConnectionKnown(const QString& encodedName) const {
  return m_connections.contains(encodedName);
}

std::vector<GUIType> TransformerMgr::memberDefinitions(const GUIType& type) const {
  return MemberList(type).members();
}
