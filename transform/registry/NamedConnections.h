// The named connections that are there: one name a line, plain or word-encoded, in connections.list below the
// home and in the user's configuration folder ($XDG_CONFIG_HOME/orx, by default ~/.config/orx). UTF-8; empty
// lines and lines that begin with "#" are skipped.
#pragma once

#include <platform/Export.h>

#include <QSet>
#include <QString>

class QIODevice;

class ORX_EXPORT NamedConnections {
 public:
  // Adds the names of both files; a file that is not there adds nothing. False when one could not be read:
  // errorString() then tells why, and the others count.
  bool readAll();
  bool read(QIODevice& device);
  QString errorString() const { return m_error; }

  bool contains(const QString& encodedName) const;

 private:
  QSet<QString> m_names;  // encoded
  QString m_error;
};
