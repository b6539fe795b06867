// The entries of a choice or list box: what is shown and what is stored.
//
// CHOICE and LISTBOX configurations hold values separated by "%". LOOKUP_CHOICE and LOOKUP_LISTBOX
// configurations hold entries `shown,stored`, the stored part word-encoded. A piece that holds blanks, "%" or
// "," stands in double quotes, inner quotes doubled.
#pragma once

#include <platform/Export.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <utility>
#include <vector>

class GUIType;

class ORX_EXPORT ChoiceList {
 public:
  ChoiceList() = default;
  // Reads the configuration of a choice type; empty for any other type.
  explicit ChoiceList(const GUIType& type);

  // Adds entries of the form `KEY,MAPPED%KEY,MAPPED...`, which give a plain choice a lookup table.
  void addLookup(const QString& lookupLine);

  bool isEmpty() const { return m_entries.empty(); }
  // Whether shown and stored sides are told apart.
  bool hasLookup() const { return m_hasLookup; }
  // In the order of the configuration: shown, stored (decoded).
  const std::vector<std::pair<QString, QString>>& entries() const { return m_entries; }

  // A value may be given by either side.
  bool contains(const QString& value) const;
  // The stored side of a value given by either side; the value itself when it is no choice.
  QString toStored(const QString& value) const;
  QString toShown(const QString& value) const;

 private:
  void add(const QString& shown, const QString& stored);

  std::vector<std::pair<QString, QString>> m_entries;
  QHash<QString, int> m_byShown;
  QHash<QString, int> m_byStored;
  bool m_hasLookup = false;
};

// Whether the type is one of CHOICE, LISTBOX, LOOKUP_CHOICE, LOOKUP_LISTBOX and their variants.
ORX_EXPORT bool ORX_isChoiceType(const GUIType& type);
ORX_EXPORT bool ORX_isListBoxType(const GUIType& type);
