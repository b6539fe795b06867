// The part of TransformerMgr that tells what changed from one version of a transformer to another.
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/registry/catalogue/ChangeLogPage.h>
#include <transform/registry/catalogue/PrototypeTable.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <algorithm>

namespace messages = orx::messages;

void TransformerMgr::getChangeLog(ITransformerCfg* configuration, IORXString& page) const {
  ORXAssign(page, changeLog(dynamic_cast<TransformerCfg*>(configuration)));
}

QString TransformerMgr::changeLog(TransformerCfg* configuration) const {
  if (!configuration) {
    return QString();
  }
  const bool isReplaced = !configuration->isVisible() && !configuration->replacedBy().isEmpty();
  const QString target = isReplaced ? configuration->replacedBy() : configuration->getName();
  const CatalogueEntry* newest = m_prototypes->find(target, NEWEST_VERSION);
  if (!newest) {
    return QString();
  }
  return changeLog(configuration->getName(), configuration->getVersion(), target, newest->version())
      .join(QLatin1Char('\n'));
}

void TransformerMgr::addChanges(std::vector<VersionChanges>& changes, const QString& name, qint64 first,
                                int last) const {
  const PrototypeTable::Versions* versions = m_prototypes->versions(name);
  if (!versions) {
    return;
  }
  for (auto entry = versions->rbegin(); entry != versions->rend(); ++entry) {
    const int version = entry->first;
    if (version < first || version > last) {
      continue;
    }
    const TransformerCfg& prototype = entry->second.prototype();
    QStringList entries = prototype.getChangeLog();
    entries.erase(std::remove_if(entries.begin(), entries.end(),
                                 [](const QString& line) { return line.trimmed().isEmpty(); }),
                  entries.end());
    if (!entries.isEmpty()) {
      changes.push_back({name, prototype.getLocalizedName(), version, entries});
    }
  }
}

std::vector<TransformerMgr::VersionChanges> TransformerMgr::changes(const QString& name, int fromVersion,
                                                                    const QString& newName,
                                                                    int toVersion) const {
  const int last = toVersion == NEWEST_VERSION ? currentTransformerVersion(newName) : toVersion;
  const qint64 next = std::max<qint64>(fromVersion, -1) + 1;
  std::vector<VersionChanges> result;
  if (name != newName) {
    addChanges(result, newName, 0, last);
    addChanges(result, name, next, currentTransformerVersion(name));
  } else {
    addChanges(result, name, fromVersion == last ? last : next, last);
  }
  return result;
}

QStringList TransformerMgr::changeLog(const QString& name, int fromVersion, const QString& newName,
                                      int toVersion) const {
  const auto shownName = [this](const QString& asked) {
    const CatalogueEntry* newest = m_prototypes->find(asked, NEWEST_VERSION);
    return newest ? newest->prototype().getLocalizedName() : asked;
  };
  const QString lastText =
      QString::number(toVersion == NEWEST_VERSION ? currentTransformerVersion(newName) : toVersion);
  ChangeLogPage page(
      fromVersion < 0 ? TransformResString(messages::kAllChanges, {shownName(newName), lastText})
                      : TransformResString(messages::kChanges, {shownName(name), QString::number(fromVersion),
                                                                shownName(newName), lastText}));
  for (const VersionChanges& version : changes(name, fromVersion, newName, toVersion)) {
    const QString number = QString::number(version.version);
    page.addVersion(name == newName
                        ? TransformResString(messages::kVersionHeading, number)
                        : TransformResString(messages::kNamedVersion, {version.localizedName, number}),
                    version.entries);
  }
  if (page.isEmpty()) {
    page.addText(m_prototypes->find(newName, NEWEST_VERSION)
                     ? TransformResString(messages::kNoChanges)
                     : TransformResString(messages::kUnknownTransformerName, newName));
  }
  return page.lines();
}
