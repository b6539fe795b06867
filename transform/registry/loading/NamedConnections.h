// The named connections that are there: one name a line, plain or word-encoded, in connections.list below the
// home and in the user's configuration folder ($XDG_CONFIG_HOME/orx, by default ~/.config/orx). UTF-8; empty
// lines and lines that begin with "#" are skipped.
#pragma once

#include <QSet>
#include <QString>
#include <QStringList>

class QIODevice;

class NamedConnections {
 public:
  // Adds the names of both files; a file that is not there adds nothing. Tells of each that could not be read
  // its path and the reason.
  QStringList readAll();
  bool contains(const QString& encodedName) const;

 private:
  // False, with the reason, when the device cannot be read or holds too much.
  bool read(QIODevice& device, QString& error);

  QSet<QString> m_names;  // encoded
};
