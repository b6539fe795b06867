// Texts by number, in the current language, with English as the base.
//
// The texts stand in UTF-8 files messages/<language>.msg below the product's home, one line each:
// number, tab, text. In a text "\n" stands for a line break and "\\" for a backslash. Empty lines and lines
// that begin with "#" are skipped, and so are lines without a text: a missing translation shows the English
// text. Of two lines with one number the later holds.
#pragma once

#include <platform/Export.h>
#include <platform/orxutil/QORXString.h>

#include <QHash>
#include <QString>

#include <map>
#include <mutex>

class ORX_EXPORT ORXLocalizedMessageDatabase {
 public:
  ORXLocalizedMessageDatabase() = default;
  // Reads from this folder instead of the home's messages folder.
  explicit ORXLocalizedMessageDatabase(const QString& folder) : m_folder(folder) {}

  // Fills `text` with the message of the current language, else the English one, else with nothing; answers
  // whether there was one. Follows a change of language; a language's file is read once. May
  // be asked by several threads at once.
  bool getMessage(long number, QORXString& text) const;
  // The same of another language, two lower-case letters.
  bool getMessage(long number, QORXString& text, const QString& language) const;

 private:
  using Table = QHash<long, QString>;
  const Table& table(const QString& language) const;

  QString m_folder;
  mutable std::mutex m_mutex;
  // Tables stay where they are once read.
  mutable std::map<QString, Table> m_tables;
};
