// One transformer of one version in the registry. Its prototype is made from the definition's bytes, which
// are held until then, when somebody first asks for it; what is then made is what would have been made while
// loading, whatever became of the file.
#pragma once

#include <QByteArray>
#include <QString>

#include <memory>
#include <vector>

class DefinitionDirectory;
class IORXSession;
class TransformerCfg;
struct CompanionEntry;

// What all definitions of one load are configured with.
struct DefinitionLoad {
  IORXSession* session = nullptr;
  const DefinitionDirectory* directory = nullptr;
  QString language;  // of the texts that configuring adds
};

class CatalogueEntry {
 public:
  // A definition that has not been read yet.
  struct Unread {
    QByteArray bytes;  // as DefinitionFileParser::definitionAlone() takes them
    QString path;
    bool isAllowed = true;
    std::shared_ptr<const DefinitionLoad> load;
    std::vector<std::shared_ptr<const CompanionEntry>> companions;  // in the order in which they came
  };

  CatalogueEntry(int version, Unread definition);
  explicit CatalogueEntry(std::unique_ptr<TransformerCfg> prototype);
  ~CatalogueEntry();
  CatalogueEntry(CatalogueEntry&&) noexcept;
  CatalogueEntry& operator=(CatalogueEntry&&) noexcept;

  // Both are known without the prototype.
  int version() const { return m_version; }
  QString fileName() const;
  // Owned by this object.
  TransformerCfg& prototype() const;
  // Puts a companion's texts in the place of the definition's.
  void localize(const std::shared_ptr<const CompanionEntry>& companion);

 private:
  int m_version;
  // One of the two is there.
  mutable std::unique_ptr<Unread> m_unread;
  mutable std::unique_ptr<TransformerCfg> m_prototype;
};
