#include <transform/core/RenameMapping.h>

namespace {

constexpr int kAnyVersion = -1;

}  // namespace

bool RenameMapping::add(const QString& token) {
  Rename rename{kAnyVersion, QString(), QString()};
  int start = 0;
  const int colon = token.indexOf(QLatin1Char(':'));
  if (colon > 0) {
    bool isNumber = false;
    const int version = token.left(colon).toInt(&isNumber);
    if (isNumber && version >= 0) {
      rename.version = version;
      start = colon + 1;
    }
  }
  const int equals = token.indexOf(QLatin1Char('='), start);
  if (equals < 0) {
    return false;
  }
  rename.oldName = token.mid(start, equals - start);
  rename.newName = token.mid(equals + 1);
  if (rename.oldName.isEmpty() || rename.newName.isEmpty()) {
    return false;
  }
  m_renames.push_back(std::move(rename));
  return true;
}

QString RenameMapping::renamed(const QString& name, int fromVersion) const {
  QString current = name;
  for (const Rename& rename : m_renames) {
    if ((rename.version == kAnyVersion || fromVersion < rename.version) && rename.oldName == current) {
      current = rename.newName;
    }
  }
  return current;
}

QHash<QString, QString> RenameMapping::renamedFrom(int fromVersion) const {
  QHash<QString, QString> result;
  for (const Rename& rename : m_renames) {
    if (!result.contains(rename.oldName)) {
      const QString today = renamed(rename.oldName, fromVersion);
      if (today != rename.oldName) {
        result.insert(rename.oldName, today);
      }
    }
  }
  return result;
}
