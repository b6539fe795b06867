#include <platform/qorxcore/OrxHome.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/registry/loading/DefinitionLines.h>
#include <transform/registry/loading/NamedConnections.h>

#include <QFile>
#include <QStandardPaths>

namespace {

const QLatin1String kFileName("/connections.list");
const QLatin1String kUserFolder("/orx");

// The same name for every way of writing it.
QString canonical(const QString& name) {
  return QORXWwjdEncode(QORXWwjdDecode(name));
}

}  // namespace

QStringList NamedConnections::readAll() {
  QStringList errors;
  const QString userFolder =
      QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation) + kUserFolder;
  for (const QString& folder : {QORXOrxHome(), userFolder}) {
    QFile file(folder + kFileName);
    if (!file.exists()) {
      continue;
    }
    QString error;
    if (!file.open(QIODevice::ReadOnly)) {
      error = file.errorString();
    } else {
      read(file, error);
    }
    if (!error.isEmpty()) {
      errors.append(file.fileName() + QLatin1String(": ") + error);
    }
  }
  return errors;
}

bool NamedConnections::read(QIODevice& device, QString& error) {
  DefinitionLines lines;
  if (!lines.open(device)) {
    error = lines.errorString();
    return false;
  }
  while (lines.next()) {
    if (!lines.isSkipped()) {
      m_names.insert(canonical(lines.trimmed()));
    }
  }
  return true;
}

bool NamedConnections::contains(const QString& encodedName) const {
  return m_names.contains(canonical(encodedName));
}
