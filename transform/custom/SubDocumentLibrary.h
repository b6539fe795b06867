// The custom transformers that stand in one document, put before those of another source.
//
// Each is built once, when it is first asked for, and shared by all its instances: placing it again costs an
// instance, not a definition. One that stands inside itself, or too deep, is refused where it is placed.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerSource.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class ExternalDocNetwork;
class IXMLComponentReader;

class ORX_EXPORT SubDocumentLibrary : public TransformerSource {
 public:
  // Neither is owned. `others`, which may be null, is asked for what the document does not hold.
  SubDocumentLibrary(const IXMLComponentReader& reader, TransformerSource* others);
  ~SubDocumentLibrary() override;
  SubDocumentLibrary(const SubDocumentLibrary&) = delete;
  SubDocumentLibrary& operator=(const SubDocumentLibrary&) = delete;

  // The document's own custom transformers answer to any version.
  std::unique_ptr<TransformerCfg> makeTransformer(const QString& name, int version,
                                                  QString* refusal = nullptr) override;
  const DefinitionDirectory* definitionDirectory() const override;

  bool holds(const QString& name) const { return m_entries.contains(name); }
  // Null for a name that the document does not have, or when it is being built. Owned by the library.
  ExternalDocNetwork* network(const QString& name);
  // Builds a network of another owner from the document called `name`, so that whatever stands inside knows
  // that it stands in there.
  void build(ExternalDocNetwork& network, const QString& name);
  // Those that were asked for, each behind the ones that stand inside it.
  const std::vector<ExternalDocNetwork*>& networks() const { return m_inOrder; }
  // The reader is not used any more: only what was built so far is known.
  void forgetReader();

 private:
  struct Entry;
  Entry* find(const QString& name, QString* refusal = nullptr);

  const IXMLComponentReader* m_reader;
  TransformerSource* m_others;
  QHash<QString, std::shared_ptr<Entry>> m_entries;
  std::vector<ExternalDocNetwork*> m_inOrder;
  QStringList m_open;  // being built, outermost first
};
