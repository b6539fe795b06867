// The entries of one folder, by name; a folder that cannot be read is told apart from an empty one.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

class ORX_EXPORT FolderListing {
 public:
  // Regular files, also through symbolic links, whose name ends in `suffix` (all when it is empty). Hidden
  // entries are left out.
  static FolderListing files(const QString& folder, const QString& suffix = QString());
  // Sub-folders, also through symbolic links. Hidden ones are left out.
  static FolderListing folders(const QString& folder);

  // Sorted by character code, whatever the locale; without the folder's own name.
  const QStringList& names() const { return m_names; }
  // With such a suffix, what is neither a file nor a folder: links that lead nowhere, pipes, devices. Sorted.
  const QStringList& unusableNames() const { return m_unusableNames; }
  // Whether the folder could not be read; errorString() then names it and the reason.
  bool failed() const { return !m_error.isEmpty(); }
  const QString& errorString() const { return m_error; }

 private:
  static FolderListing list(const QString& folder, const QString& suffix, unsigned wantedType);

  QStringList m_names;
  QStringList m_unusableNames;
  QString m_error;
};
