#include <platform/qorxcore/OrxHome.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/registry/DefinitionLines.h>
#include <transform/registry/NamedConnections.h>

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

bool NamedConnections::readAll() {
  bool isRead = true;
  const QString userFolder =
      QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation) + kUserFolder;
  for (const QString& folder : {QORXOrxHome(), userFolder}) {
    QFile file(folder + kFileName);
    if (!file.exists()) {
      continue;
    }
    if (!file.open(QIODevice::ReadOnly)) {
      m_error = file.fileName() + QLatin1String(": ") + file.errorString();
      isRead = false;
    } else if (!read(file)) {
      m_error = file.fileName() + QLatin1String(": ") + m_error;
      isRead = false;
    }
  }
  return isRead;
}

bool NamedConnections::read(QIODevice& device) {
  DefinitionLines lines;
  if (!lines.open(device)) {
    m_error = lines.errorString();
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
