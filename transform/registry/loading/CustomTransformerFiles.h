// The custom transformers of the registry that live in files of their own: the networks made from them, and
// which file serves which name.
#pragma once

#include <QHash>
#include <QList>
#include <QString>

#include <memory>
#include <vector>

class ExternalTransformerNetwork;
class TransformerSource;

class CustomTransformerFiles {
 public:
  struct Opened {
    std::unique_ptr<ExternalTransformerNetwork>
        network;                   // null: the file has nothing that this build can load
    bool needsNewerBuild = false;  // name and version then say what was refused
    QString name;
    int version = 0;
  };

  CustomTransformerFiles();
  ~CustomTransformerFiles();

  // Reads the wanted version of a file; the first for ITransformerMgr::NEWEST_VERSION, or the next lower one
  // that this build can load. `source` makes the transformers inside and is not owned.
  static Opened open(const QString& path, int version, TransformerSource* source);
  // Takes a network over.
  ExternalTransformerNetwork* keep(std::unique_ptr<ExternalTransformerNetwork> network);
  // Empty for a name that no file serves.
  QString fileOf(const QString& name) const { return m_files.value(name); }
  // The versions of the name that its file holds, from the lowest up.
  QList<int> versionsOf(const QString& name) const;
  void noteFile(const QString& name, const QString& path) { m_files.insert(name, path); }
  // Forgets the files, and the networks that nobody listens to any more.
  void reset();

 private:
  std::vector<std::unique_ptr<ExternalTransformerNetwork>> m_networks;
  QHash<QString, QString> m_files;
};
