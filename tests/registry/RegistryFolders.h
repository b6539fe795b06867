// A home with definition files, made for one test; the registry sees nothing else.
#pragma once

#include <platform/session/ORXSession.h>
#include <transform/registry/TransformerMgr.h>

#include <QByteArray>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <map>

class RegistryFolders {
 public:
  RegistryFolders();
  ~RegistryFolders();
  RegistryFolders(const RegistryFolders&) = delete;
  RegistryFolders& operator=(const RegistryFolders&) = delete;

  // `name` is relative to the temporary folder: "home/transformers/a.ort", "user/orx/connections.list",
  // "extra/b.ort". Answers the whole path.
  QString write(const QString& name, const QByteArray& content);
  // A file in the home's folder of definitions.
  QString define(const QString& name, const QByteArray& content) {
    return write(QStringLiteral("home/transformers/") + name, content);
  }
  QString path(const QString& name) const { return m_folder.filePath(name); }

  TransformerMgr& load();

 private:
  void set(const char* variable, const QString& value);

  QTemporaryDir m_folder;
  ORXSession m_session;
  std::map<QByteArray, QByteArray> m_before;
};

// The document of the custom transformer "Tidy": IN, OUT, LIMIT, inside "Other".
QByteArray tidyDocument(int build = 1);
// A definition with one input, one output and, between the two, the given header lines.
QByteArray definitionText(const char* name, int version, const QByteArray& header = QByteArray());
