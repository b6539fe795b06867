// The process-wide registry of transformer definitions: one prototype per name and version, read from the
// definition files of the resource folders. Hands out copies.
//
// Loading never fails as a whole: a file or folder that cannot be read is recorded in lastError() and passed
// over. Lookups answer null, false, -1 or an empty value. Used by one thread at a time.
//
// Named connections are one encoded name a line, in connections.list below the home and in the user's
// configuration folder ($XDG_CONFIG_HOME/orx, by default ~/.config/orx); empty lines and lines that begin
// with "#" are skipped.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerSource.h>
#include <transform/registry/ITransformerMgr.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <list>
#include <memory>

class ChangeLogPage;
class ExceptionList;
class IORXStringArray;
class TransformerCfg;
struct CompanionEntry;
struct TransformerDefinition;

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

  // A new copy, owned by the caller; null when name (or alias) or version is unknown.
  TransformerCfg* getTransformer(const QString& name, int version);
  bool transformerExists(const QString& name, int version) const;
  // -1 for an unknown name; aliases are not followed.
  int currentTransformerVersion(const QString& name) const;
  TransformerCfg* getTransformerWithGUID(const QString& guid) const;
  // A new copy restored from its serialised form; null when it names no known transformer.
  TransformerCfg* deserialize(const QString& text);
  // By order of first registration, newest version each; null after the last. Owned by the caller.
  TransformerCfg* getNextTransformer();

  QString getTransformerNameFromAlias(const QString& alias) const { return m_aliases.value(alias); }
  bool isVisibleAlias(const QString& alias) const;
  QStringList getVisibleTransformerAliases() const;
  // In order of first appearance.
  QStringList getCategories() const { return m_categories; }
  void getCategories(IORXStringArray& categories) const;
  // `category` may be the localised name.
  QStringList getCategoryTransformers(const QString& category) const;
  bool getCategoryDesc(const QString& category, QStringList& lines) const;
  QString getLocalizedCategoryName(const QString& category) const;
  QString getCategoryNameFromLocalizedCategoryName(const QString& localizedName) const;

  const std::list<IgnoredTransformer>& ignoredTransformers() const { return m_ignored; }
  const QString& lastError() const { return m_lastError; }
  // A whole HTML page; empty when there is nothing newer to compare with.
  QString changeLog(TransformerCfg* configuration) const;
  QStringList changeLog(const QString& name, int fromVersion, const QString& newName, int toVersion) const;
  // The text shown for a parameter that has no value.
  QString parameterNotSetDisplayString() const;

  // What the lower floors ask.
  std::unique_ptr<TransformerCfg> makeTransformer(const QString& name, int version) override;
  bool isConnectionKnown(const QString& encodedName) const override;
  std::vector<GUIType> memberDefinitions(const GUIType& type) const override;

 private:
  TransformerMgr();
  ~TransformerMgr() override;

  void reset();
  void loadFolder(const QString& folder);
  void loadDefinitionFile(const QString& path);
  void loadCompanionFile(const QString& path);
  void loadConnections();
  void define(const TransformerDefinition& definition);
  // Takes the prototype over. True when it is the newest of its name.
  bool registerPrototype(std::unique_ptr<TransformerCfg> prototype);
  void localize(const CompanionEntry& entry);
  // Null when there is none; aliases are not followed.
  const TransformerCfg* findPrototype(const QString& name, int version) const;
  std::unique_ptr<TransformerCfg> copyOf(const QString& name, int version) const;

  // The version table owns; the newest table points into it.
  QHash<QString, QHash<int, std::shared_ptr<TransformerCfg>>> m_versions;
  QHash<QString, TransformerCfg*> m_newest;
  QStringList m_names;
  QStringList m_visibleNames;
  QSet<QString> m_visibleNameSet;
  int m_iteration = 0;
  QHash<QString, QString> m_aliases;
  QHash<QString, QStringList> m_categoryDescriptions;
  QString m_lastError;
  QHash<QString, QString> m_localizedCategories;
  QHash<QString, QString> m_categoriesByLocalizedName;
  QStringList m_categories;
  QHash<QString, QStringList> m_categoryIndex;
  QSet<QString> m_connections;
  IORXSession* m_session = nullptr;
  bool m_loaded = false;
  std::list<IgnoredTransformer> m_ignored;
  std::unique_ptr<ExceptionList> m_exceptions;
};
