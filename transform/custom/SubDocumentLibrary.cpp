#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <transform/findings/Refusal.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/IXMLComponentReader.h>

#include <algorithm>

namespace messages = orx::messages;

struct SubDocumentLibrary::Entry {
  ExternalDocNetwork network;
  int depth = 1;  // levels of the document's own custom transformers, itself included
  bool isBuilt = false;
};

SubDocumentLibrary::SubDocumentLibrary(const IXMLComponentReader& reader, TransformerSource* others)
    : m_reader(&reader), m_others(others) {
  for (const QString& name : reader.GetSubDocList()) {
    if (!m_entries.contains(name))
      m_entries.insert(name, std::make_shared<Entry>());
  }
}

SubDocumentLibrary::~SubDocumentLibrary() = default;

void SubDocumentLibrary::forgetReader() {
  m_reader = nullptr;
}

SubDocumentLibrary::Entry* SubDocumentLibrary::find(const QString& name, QString* refusal) {
  const std::shared_ptr<Entry> entry = m_entries.value(name);
  if (!entry || entry->isBuilt)
    return entry.get();
  if (!m_reader)
    return nullptr;
  if (m_open.contains(name)) {
    const QStringList way = m_open.mid(m_open.indexOf(name)) << name;
    if (refusal)
      orx::refuse(*refusal, {orx::Rule::Nesting, messages::kContainsItself},
                  {name, way.join(QLatin1String(" > "))});
    return nullptr;
  }
  // Bounds the recursion; what is built already is judged by its depth.
  if (m_open.size() >= CompoundTransformerNetwork::kDeepestNesting)
    return entry.get();
  m_open.append(name);
  entry->network.build(*m_reader, name, *this);
  m_open.removeLast();
  entry->isBuilt = true;
  m_inOrder.push_back(&entry->network);
  return entry.get();
}

void SubDocumentLibrary::build(ExternalDocNetwork& network, const QString& name) {
  const bool isSubDocument = holds(name);
  if (isSubDocument)
    m_open.append(name);
  network.build(*m_reader, name, *this);
  if (isSubDocument)
    m_open.removeLast();
}

const DefinitionDirectory* SubDocumentLibrary::definitionDirectory() const {
  return m_others ? m_others->definitionDirectory() : nullptr;
}

ExternalDocNetwork* SubDocumentLibrary::network(const QString& name) {
  Entry* entry = find(name);
  return entry && entry->isBuilt ? &entry->network : nullptr;
}

std::unique_ptr<TransformerCfg> SubDocumentLibrary::makeTransformer(const QString& name, int version,
                                                                    QString* refusal) {
  if (!m_entries.contains(name)) {
    if (!m_others)
      return nullptr;
    std::unique_ptr<TransformerCfg> cfg = m_others->makeTransformer(name, version, refusal);
    const auto* linked = dynamic_cast<const ExternalTransformerNetwork*>(networkOf(cfg.get()));
    // Statements bear the name that the definition's file has, whatever language the name is shown in.
    if (linked && cfg->getLocalizedName() != cfg->getName())
      cfg->setLocalizedName(QString());
    const QString fault = linked ? linked->bodyFault() : QString();
    if (refusal && !fault.isEmpty())
      *refusal = fault;
    return fault.isEmpty() ? std::move(cfg) : nullptr;
  }
  Entry* entry = find(name, refusal);
  if (!entry)
    return nullptr;
  const int depth = m_open.size() + entry->depth;
  if (!entry->isBuilt || depth > CompoundTransformerNetwork::kDeepestNesting) {
    if (refusal)
      orx::refuse(*refusal, {orx::Rule::Nesting, messages::kNestedTooDeep},
                  {m_open.isEmpty() ? name : m_open.first(),
                   QString::number(CompoundTransformerNetwork::kDeepestNesting)});
    return nullptr;
  }
  if (!m_open.isEmpty()) {
    Entry& outer = *m_entries.value(m_open.last());
    outer.depth = std::max(outer.depth, entry->depth + 1);
  }
  auto instance = std::make_unique<CompoundTransformerCfg>(&entry->network);
  instance->setDefinitionDirectory(definitionDirectory());
  return instance;
}
