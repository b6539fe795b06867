// The entries of a choice or list box: what is shown and what is stored.
//
// CHOICE and LISTBOX configurations hold values separated by "%". LOOKUP_CHOICE and LOOKUP_LISTBOX
// configurations hold entries `shown,stored`, the stored part word-encoded. A piece that holds blanks, "%" or
// "," stands in double quotes, inner quotes doubled (ConfigToken.h). Empty entries without quotes are no
// entries; a lookup entry without a stored part stores what it shows. Of several entries that show the same
// the first stands.
//
// A value class: copies share their entries until one is changed.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <memory>
#include <utility>
#include <vector>

class GUIType;
struct ChoiceListData;

class ORX_EXPORT ChoiceList {
 public:
  ChoiceList() = default;
  // Reads the configuration of a choice type; empty for any other type.
  explicit ChoiceList(const GUIType& type);

  // Adds entries of the form `KEY,MAPPED%KEY,MAPPED...`, which give a plain choice a lookup table; the mapped
  // part is word-encoded. A key that is already shown is given the new stored side; a key whose mapped part
  // is a plain choice so far becomes the shown name of that; any other is a further entry.
  void addLookup(const QString& lookupLine);

  bool isEmpty() const { return entries().empty(); }
  // Whether shown and stored sides are told apart.
  bool hasLookup() const;
  // In the order of the configuration: shown, stored (decoded).
  const std::vector<std::pair<QString, QString>>& entries() const;

  // A value may be given by either side.
  bool contains(const QString& value) const;
  // The stored side of a value given by either side; the value itself when it is no choice. A text that is
  // both shown by one entry and stored by another counts as shown.
  QString toStored(const QString& value) const;
  // The shown side of a value given by either side; the value itself when it is no choice. A text that is
  // both counts as stored. Of several entries that store the same the first is shown.
  QString toShown(const QString& value) const;

 private:
  ChoiceListData& detach();

  std::shared_ptr<ChoiceListData> d;
};

// Whether the type is one of CHOICE, LISTBOX, LOOKUP_CHOICE, LOOKUP_LISTBOX and their variants.
ORX_EXPORT bool ORX_isChoiceType(const GUIType& type);
ORX_EXPORT bool ORX_isListBoxType(const GUIType& type);
