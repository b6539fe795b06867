#include <apps/orxt/facts/RecordingSource.h>
#include <transform/core/TransformerCfg.h>

#include <QDir>
#include <QFileInfo>

std::unique_ptr<TransformerCfg> RecordingSource::makeTransformer(const QString& name, int version,
                                                                 QString* refusal) {
  std::unique_ptr<TransformerCfg> cfg = m_source.makeTransformer(name, version, refusal);
  if (cfg && !cfg->getFileName().isEmpty())
    m_files.insert(cfg->getFileName());
  return cfg;
}

QStringList RecordingSource::files() const {
  QStringList files;
  for (const QString& file : m_files) {
    files.append(file);
    const QFileInfo info(file);
    const QStringList companions =
        info.dir().entryList({info.completeBaseName() + QLatin1String("-localized.??")}, QDir::Files);
    for (const QString& companion : companions)
      files.append(info.dir().filePath(companion));
  }
  files.sort();
  return files;
}
