// Names that changed between versions of a transformer, read from tokens [VERSION:]OLD=NEW.
//
// VERSION is the version that brought the change: it serves instances of earlier versions. Without a version
// it serves instances of every earlier version than the definition's own.
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

#include <vector>

class RenameMapping {
 public:
  // Takes in one token; false when it is none.
  bool add(const QString& token);

  // The name that `name` of an instance of this version has today; renames apply one after the other.
  QString renamed(const QString& name, int fromVersion) const;
  // Every name of that version that is another today.
  QHash<QString, QString> renamedFrom(int fromVersion) const;

 private:
  struct Rename {
    int version;  // -1 when the token gave none
    QString oldName;
    QString newName;
  };
  std::vector<Rename> m_renames;
};
