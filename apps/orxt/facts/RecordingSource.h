// Hands on what another source makes, and notes the files that it was made from.
#pragma once

#include <transform/core/TransformerSource.h>

#include <QSet>
#include <QStringList>

class RecordingSource : public TransformerSource {
 public:
  // `source` is not owned.
  explicit RecordingSource(TransformerSource& source) : m_source(source) {}

  std::unique_ptr<TransformerCfg> makeTransformer(const QString& name, int version,
                                                  QString* refusal = nullptr) override;
  const DefinitionDirectory* definitionDirectory() const override { return m_source.definitionDirectory(); }

  // Definition files, files of custom transformers, and the companions beside them; in ascending order.
  QStringList files() const;

 private:
  TransformerSource& m_source;
  QSet<QString> m_files;
};
