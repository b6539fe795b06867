#include <platform/orxparameter/orxparameter.h>
#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/files/ProductFiles.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/registry/catalogue/CategoryTexts.h>
#include <transform/registry/catalogue/PrototypeTable.h>
#include <transform/registry/loading/CustomTransformerFiles.h>
#include <transform/registry/loading/DefinitionLoader.h>
#include <transform/registry/loading/ExceptionList.h>
#include <transform/registry/loading/NamedConnections.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QHash>
#include <QSet>

#include <algorithm>
#include <utility>

namespace messages = orx::messages;

namespace {

const QString kResourceKind = QStringLiteral("transformer");

bool isAnyVersion(int version) {
  return version == ITransformerMgr::NEWEST_VERSION || version == ITransformerMgr::OLDEST_VERSION;
}

bool concerns(const TransformerMgr::IgnoredTransformer& ignored, const QString& name, int version) {
  return ignored.name == name && (isAnyVersion(version) || ignored.version == version);
}

}  // namespace

QString TransformerMgr::IgnoredTransformer::reason() const {
  return isDuplicate
             ? TransformResString(messages::kLoadedAlready, {name, QString::number(version), path, keptPath})
             : TransformResString(messages::kCustomOfNewerBuild, {name, QString::number(version), path});
}

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
      m_prototypes(std::make_unique<PrototypeTable>()),
      m_categories(std::make_unique<CategoryTexts>()),
      m_exceptions(std::make_unique<ExceptionList>()),
      m_connections(std::make_unique<NamedConnections>()) {}

TransformerMgr::~TransformerMgr() = default;

void TransformerMgr::reset() {
  m_loaded = false;
  *m_prototypes = PrototypeTable();
  m_customFiles->reset();
  m_iteration = 0;
  *m_categories = CategoryTexts();
  m_errors.clear();
  m_ignored.clear();
  m_notedRefusals.clear();
  *m_exceptions = ExceptionList();
  *m_connections = NamedConnections();
  m_members.clear();
}

void TransformerMgr::loadTransformers(IORXSession* session) {
  reset();
  if (session) {
    m_exceptions->readFromHome();
  }
  m_errors += m_connections->readAll();
  loadFolders(std::make_shared<const DefinitionLoad>(DefinitionLoad{session, this, QORXLanguage()}));
  m_loaded = true;
}

void TransformerMgr::reloadCustomTransformers() {
  loadFolders(nullptr);
}

void TransformerMgr::loadFolders(const std::shared_ptr<const DefinitionLoad>& load) {
  DefinitionLoader loader(*m_prototypes, *m_categories, *m_exceptions, load, [this](const QString& path) {
    loadCustomTransformer(path, NEWEST_VERSION, false);
  });
  for (const QString& folder :
       ORX_resourceDirectories(kResourceKind) + ORX_unreadableResourceDirectories(kResourceKind)) {
    loader.loadFolder(folder);
  }
  m_errors += loader.errors();
}

void TransformerMgr::loadRemoteTransformer(const QString& path, int version) {
  const QString file = QORXPrettyUpFileName(path);
  loadCustomTransformer(file, version, true);
  if (version == 0) {
    loadCustomTransformer(file, 1, true);
  }
}

void TransformerMgr::loadCustomTransformer(const QString& path, int version, bool replaces) {
  CustomTransformerFiles::Opened opened = CustomTransformerFiles::open(path, version, this);
  if (opened.needsNewerBuild)
    noteIgnored({path, opened.name, opened.version, QString(), false});
  if (!opened.network)
    return;
  const CatalogueEntry* kept = m_prototypes->find(opened.name, opened.version);
  if (kept && !replaces) {
    if (kept->fileName() != path)
      noteIgnored({path, opened.name, opened.version, kept->fileName(), true});
    return;
  }
  auto prototype = std::make_unique<CompoundTransformerCfg>(m_customFiles->keep(std::move(opened.network)),
                                                            CompoundTransformerCfg::Body::Deferred);
  prototype->setDefinitionDirectory(this);
  if (isProductFile(path))
    prototype->setTransformerType(TransformerCfg::kBuiltIn);
  const PrototypeTable::Place place{prototype->getName(), prototype->getVersion(), prototype->tags(),
                                    prototype->isVisible(), QStringList()};
  bool isNewest = false;
  m_prototypes->add(place, CatalogueEntry(std::move(prototype)), &isNewest);
  if (isNewest || m_customFiles->fileOf(opened.name).isEmpty())
    m_customFiles->noteFile(opened.name, path);
}

void TransformerMgr::noteIgnored(const IgnoredTransformer& ignored) {
  const QStringList key{ignored.path, ignored.name, QString::number(ignored.version), ignored.keptPath};
  if (!m_notedRefusals.contains(key)) {
    m_notedRefusals.insert(key);
    m_ignored.push_back(ignored);
  }
}

void TransformerMgr::loadOnDemand(const QString& name, int version) {
  const QString path = m_customFiles->fileOf(name);
  const CatalogueEntry* known = m_prototypes->find(name, version);
  if (path.isEmpty() || version == NEWEST_VERSION || (known && version != OLDEST_VERSION))
    return;
  if (version != OLDEST_VERSION) {
    loadCustomTransformer(path, version, false);
    if (version == 0 && !m_prototypes->find(name, 0))
      loadCustomTransformer(path, 1, false);
    return;
  }
  for (const int older : m_customFiles->versionsOf(name)) {
    if (older < 0)
      continue;
    if (known && older >= known->version())
      return;
    loadCustomTransformer(path, older, false);
    if (m_prototypes->find(name, older))
      return;
  }
}

void TransformerMgr::getDefinitionFileName(const IORXString& name, IORXString& fileName) const {
  const CatalogueEntry* newest = m_prototypes->find(ORXToQString(name), NEWEST_VERSION);
  ORXAssign(fileName, newest ? newest->fileName() : QString());
}

ITransformerCfg* TransformerMgr::getTransformer(const IORXString& name, int version) {
  return getTransformer(ORXToQString(name), version);
}

std::unique_ptr<TransformerCfg> TransformerMgr::copyOf(const QString& name, int version) const {
  const CatalogueEntry* entry = m_prototypes->find(name, version);
  if (!entry && version == 0 && !m_customFiles->fileOf(name).isEmpty())
    entry = m_prototypes->find(name, 1);  // the first version of a custom transformer is called either way
  if (!entry)
    return nullptr;
  std::unique_ptr<TransformerCfg> copy(entry->prototype().getCopy());
  copy->setIdentifier(copy->getLocalizedName());
  return copy;
}

std::unique_ptr<TransformerCfg> TransformerMgr::makeTransformer(const QString& name, int version,
                                                                QString* refusal) {
  std::unique_ptr<TransformerCfg> copy;
  m_prototypes->followAliases(name, [&](const QString& asked) {
    loadOnDemand(asked, version);
    copy = copyOf(asked, version);
    if (copy && asked != name)
      copy->setRequestedAlias(name);
    return copy != nullptr;
  });
  if (!copy && refusal) {
    const auto refused =
        std::find_if(m_ignored.begin(), m_ignored.end(), [&](const IgnoredTransformer& ignored) {
          return !ignored.isDuplicate && concerns(ignored, name, version);
        });
    if (refused != m_ignored.end())
      *refusal = refused->reason();
  }
  return copy;
}

TransformerCfg* TransformerMgr::getTransformer(const QString& name, int version) {
  return makeTransformer(name, version).release();
}

bool TransformerMgr::transformerExists(const QString& name, int version) const {
  return m_prototypes->followAliases(name, [&](const QString& asked) {
    return m_prototypes->find(asked, isAnyVersion(version) ? NEWEST_VERSION : version) != nullptr;
  });
}

int TransformerMgr::currentTransformerVersion(const QString& name) const {
  const CatalogueEntry* newest = m_prototypes->find(name, NEWEST_VERSION);
  return newest ? newest->version() : -1;
}

QList<int> TransformerMgr::transformerVersions(const QString& name) const {
  QList<int> result = m_customFiles->versionsOf(name);
  if (const PrototypeTable::Versions* versions = m_prototypes->versions(name)) {
    for (const auto& [version, entry] : *versions) {
      result.append(version);
    }
  }
  std::sort(result.begin(), result.end());
  result.erase(std::unique(result.begin(), result.end()), result.end());
  return result;
}

TransformerCfg* TransformerMgr::getTransformerWithGUID(const QString& guid) const {
  // By name and version, so that the answer does not depend on a hash.
  for (const QString& name : m_prototypes->names()) {
    for (const auto& [version, entry] : *m_prototypes->versions(name)) {
      if (entry.prototype().getGUID() == guid) {
        return entry.prototype().getCopy();
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
  const QStringList& names = m_prototypes->names();
  return m_iteration < names.size() ? getTransformer(names.at(m_iteration++), NEWEST_VERSION) : nullptr;
}

QString TransformerMgr::getTransformerNameFromAlias(const QString& alias) const {
  return m_prototypes->nameOfAlias(alias);
}

const QStringList& TransformerMgr::transformerNames() const {
  return m_prototypes->names();
}

const QStringList& TransformerMgr::visibleTransformerNames() const {
  return m_prototypes->visibleNames();
}

bool TransformerMgr::isVisibleAlias(const QString& alias) const {
  return m_prototypes->isVisibleAlias(alias);
}

QStringList TransformerMgr::getVisibleTransformerAliases() const {
  return m_prototypes->aliasesOfVisible();
}

QStringList TransformerMgr::getCategories() const {
  return m_prototypes->categories();
}

void TransformerMgr::getCategories(IORXStringArray& categories) const {
  ORXAssign(categories, m_prototypes->categories());
}

QStringList TransformerMgr::getCategoryTransformers(const QString& category) const {
  return m_prototypes->namesOf(getCategoryNameFromLocalizedCategoryName(category));
}

bool TransformerMgr::getCategoryDesc(const QString& category, QStringList& lines) const {
  return m_categories->description(category, lines);
}

QString TransformerMgr::getLocalizedCategoryName(const QString& category) const {
  return m_categories->localizedName(category);
}

QString TransformerMgr::getCategoryNameFromLocalizedCategoryName(const QString& localizedName) const {
  return m_categories->nameOf(localizedName);
}

bool TransformerMgr::isTransformerIgnored(const IORXString& name, int version) const {
  return isTransformerIgnored(ORXToQString(name), version);
}

bool TransformerMgr::isTransformerIgnored(const QString& name, int version) const {
  return std::any_of(m_ignored.begin(), m_ignored.end(),
                     [&](const IgnoredTransformer& ignored) { return concerns(ignored, name, version); });
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
