// The process-wide registry of transformer definitions: one prototype per name and version, read from the
// definition files of the resource folders. Hands out copies.
//
// Loading reads every file once and keeps each definition as the bytes that it is; its prototype is made from
// them when somebody first asks for something of the definition itself. Nobody can tell this from making all
// of them while loading: a file that is changed or removed afterwards, another language and another home
// change nothing before the next load, and definitions with dependency checks, which ask about the system,
// are read while loading.
//
// Loading never fails as a whole: a file or folder that cannot be read, and a definition that a file loses,
// is recorded in errors() and passed over. Lookups answer null, false, -1 or an empty value. Used by one
// thread at a time.
//
// Copies handed out keep the session and ask this object about connections and member types, so that both
// must outlive them.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerSource.h>
#include <transform/registry/ITransformerMgr.h>

#include <QList>
#include <QSet>
#include <QString>
#include <QStringList>

#include <list>
#include <memory>
#include <vector>

class CatalogueEntry;
class CategoryTexts;
class CustomTransformerFiles;
class ExceptionList;
class IORXStringArray;
class NamedConnections;
class PrototypeTable;
class TransformerCfg;
struct DefinitionLoad;

class ORX_EXPORT TransformerMgr : public ITransformerMgr,
                                  public TransformerSource,
                                  public DefinitionDirectory {
 public:
  struct IgnoredTransformer {
    QString path;  // of the refused file
    QString name;
    int version = 0;
    QString keptPath;          // of the file whose definition was kept; empty unless this is a duplicate
    bool isDuplicate = false;  // clear: the file needs a newer build

    // For people, in the current language.
    QString reason() const;
  };

  // What one version changed.
  struct VersionChanges {
    QString name;
    QString localizedName;
    int version = 0;
    QStringList entries;  // never empty, and none of them blank
  };

  static TransformerMgr& getTransformerMgr();

  bool isLoaded() const override { return m_loaded; }
  void loadTransformers(IORXSession* session) override;
  void reloadCustomTransformers() override;
  void getDefinitionFileName(const IORXString& name, IORXString& fileName) const override;
  ITransformerCfg* getTransformer(const IORXString& name, int version) override;
  void resetIteration() override { m_iteration = 0; }
  void getChangeLog(ITransformerCfg* configuration, IORXString& page) const override;
  bool isTransformerIgnored(const IORXString& name, int version) const override;

  // Reads one custom-transformer file, of version 0 also version 1. Unlike the load of a folder it replaces
  // what is there under the same name and version.
  void loadRemoteTransformer(const QString& path, int version);

  // A new copy, owned by the caller, with its localised name as identifier; null when name (or alias) or
  // version is unknown.
  TransformerCfg* getTransformer(const QString& name, int version);
  bool transformerExists(const QString& name, int version) const;
  // -1 for an unknown name; aliases are not followed.
  int currentTransformerVersion(const QString& name) const;
  // The identifier of the copy is not set. Owned by the caller; null when there is none.
  TransformerCfg* getTransformerWithGUID(const QString& guid) const;
  // A new copy restored from its serialised form; null when it names no known transformer.
  TransformerCfg* deserialize(const QString& text);
  // By order of first registration, newest version each; null after the last. Owned by the caller.
  TransformerCfg* getNextTransformer();

  QString getTransformerNameFromAlias(const QString& alias) const;
  bool isVisibleAlias(const QString& alias) const;
  QStringList getVisibleTransformerAliases() const;
  // In order of first appearance.
  QStringList getCategories() const;
  void getCategories(IORXStringArray& categories) const;
  // `category` may be the localised name.
  QStringList getCategoryTransformers(const QString& category) const;
  bool getCategoryDesc(const QString& category, QStringList& lines) const;
  QString getLocalizedCategoryName(const QString& category) const;
  QString getCategoryNameFromLocalizedCategoryName(const QString& localizedName) const;

  const std::list<IgnoredTransformer>& ignoredTransformers() const { return m_ignored; }
  // In order of first registration.
  const QStringList& transformerNames() const;
  const QStringList& visibleTransformerNames() const;
  // From the lowest up; empty for an unknown name. Aliases are not followed. Those that stand in a custom
  // transformer's file and are loaded on demand count, also when they need a newer build.
  QList<int> transformerVersions(const QString& name) const;
  bool isTransformerIgnored(const QString& name, int version) const;
  // The failures since the load began, in the order in which they were met, each with the file or folder that
  // it is about; the last of them, empty when there was none.
  const QStringList& errors() const { return m_errors; }
  QString lastError() const { return m_errors.isEmpty() ? QString() : m_errors.last(); }
  // A whole HTML page that leads from the configuration to the newest version of the transformer, or of the
  // one that replaces it; empty when neither is known.
  QString changeLog(TransformerCfg* configuration) const;
  // The same page as lines, of the changes below.
  QStringList changeLog(const QString& name, int fromVersion, const QString& newName, int toVersion) const;
  // What came after `fromVersion` up to `toVersion`, newest first. Under another new name the later versions
  // of the old name follow those of the new one. With a negative `fromVersion` all versions count; where both
  // versions are the same one, it alone does. `toVersion` may be NEWEST_VERSION.
  std::vector<VersionChanges> changes(const QString& name, int fromVersion, const QString& newName,
                                      int toVersion) const;
  // The text shown for a parameter that has no value.
  QString parameterNotSetDisplayString() const;

  // What the lower floors ask.
  // Refused is a custom transformer whose file was saved by a newer build.
  std::unique_ptr<TransformerCfg> makeTransformer(const QString& name, int version,
                                                  QString* refusal = nullptr) override;
  bool isConnectionKnown(const QString& encodedName) const override;
  const MemberList* memberDefinitions(const GUIType& type) const override;
  const DefinitionDirectory* definitionDirectory() const override { return this; }

 private:
  TransformerMgr();
  ~TransformerMgr() override;

  void reset();
  void loadFolders(const std::shared_ptr<const DefinitionLoad>& load);
  // `replaces` lets it take the place of a definition of the same name and version.
  void loadCustomTransformer(const QString& path, int version, bool replaces);
  // Each refusal is listed once, however often it is met.
  void noteIgnored(const IgnoredTransformer& ignored);
  // Reads a further version of a custom transformer whose file is known.
  void loadOnDemand(const QString& name, int version);
  std::unique_ptr<TransformerCfg> copyOf(const QString& name, int version) const;
  void addChanges(std::vector<VersionChanges>& changes, const QString& name, qint64 first, int last) const;

  std::unique_ptr<CustomTransformerFiles> m_customFiles;  // outlives the prototypes, which listen to networks
  std::unique_ptr<PrototypeTable> m_prototypes;
  int m_iteration = 0;
  std::unique_ptr<CategoryTexts> m_categories;
  QStringList m_errors;
  bool m_loaded = false;
  std::list<IgnoredTransformer> m_ignored;
  QSet<QStringList> m_notedRefusals;
  std::unique_ptr<ExceptionList> m_exceptions;
  std::unique_ptr<NamedConnections> m_connections;
  mutable QHash<QString, std::shared_ptr<const MemberList>> m_members;  // by configuration, as asked for
};
