#include <transform/core/GenerationKeywords.h>
#include <transform/core/generation/LookupWriters.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/TextHelpers.h>

#include <algorithm>
#include <vector>

namespace {

// A pattern of this name stands for every value when it is the last of a switch.
const QLatin1String kDefaultPattern("default");

QString missingValue(const BoxLookup& lookup) {
  return QLatin1String("{ puts_real \"") + lookup.identifier + QLatin1String(" - '") + lookup.prompt +
         QLatin1String("' must be given a value.\"; exit 1; }");
}

QString braced(const QString& text) {
  return QLatin1Char('{') + text + QLatin1Char('}');
}

// Whether a key begins with one that stands before it.
bool hidesAnEntry(const lookup_writers::Entries& entries) {
  std::vector<std::pair<QString, int>> keys;
  keys.reserve(entries.size());
  for (const auto& entry : entries) {
    keys.emplace_back(entry.first, static_cast<int>(keys.size()));
  }
  std::sort(keys.begin(), keys.end());
  // In this order what a key begins with stands before it, with nothing else between but further such keys.
  std::vector<std::pair<QString, int>> beginnings;  // with the least position up to here
  for (const auto& [key, position] : keys) {
    while (!beginnings.empty() && !key.startsWith(beginnings.back().first)) {
      beginnings.pop_back();
    }
    int least = position;
    if (!beginnings.empty()) {
      if (beginnings.back().second < position) {
        return true;
      }
      least = std::min(least, beginnings.back().second);
    }
    if (!key.isEmpty()) {
      beginnings.emplace_back(key, least);
    }
  }
  return false;
}

}  // namespace

namespace lookup_writers {

QString listElement(const QString& text) {
  static const QString kBlanks = QStringLiteral(" \t");
  return quotifyString(text, kBlanks);
}

Entries listBoxOrder(const ChoiceList& choices) {
  Entries entries = choices.entries();
  // The first key that fits is replaced, so a longer one must stand before what it begins with.
  if (hidesAnEntry(entries)) {
    std::stable_sort(entries.begin(), entries.end(), [](const auto& left, const auto& right) {
      return left.first.size() > right.first.size();
    });
  }
  return entries;
}

Entries procedureOrder(const ChoiceList& choices) {
  Entries entries = choices.entries();
  if (!entries.empty() && entries.back().first == kDefaultPattern) {
    std::rotate(entries.begin(), entries.end() - 1, entries.end());
  }
  return entries;
}

void writeChoiceBox(MFBuffer& buffer, const ChoiceList& choices, const BoxLookup& lookup) {
  const QString define = QLatin1String(" { puts \"MACRO ") + lookup.macro + QLatin1Char(' ');
  const QLatin1String end("\"; }");
  buffer.add(QLatin1String("INCLUDE [ switch ") + braced(lookup.value) + QLatin1String(" {"));
  for (const auto& [shown, stored] : choices.entries()) {
    buffer.add(QLatin1String("  ") + braced(shown) + define + stored + end);
  }
  buffer.add(lookup.isOptional ? QLatin1String("  {}") + define + end
                               : QLatin1String("  {} ") + missingValue(lookup));
  buffer.add(QLatin1String("  {default}") + define + lookup.value + end);
  buffer.add(QStringLiteral("} ]"));
  buffer.flush();
}

void writeListBox(MFBuffer& buffer, const ChoiceList& choices, const BoxLookup& lookup) {
  const QString value = braced(lookup.value);
  buffer.add(QStringLiteral("INCLUDE [ set lookupMap {}; "));
  QLatin1String start("append lookupMap ");
  for (const auto& [shown, stored] : listBoxOrder(choices)) {
    buffer.add(start + braced(listElement(shown)) + QLatin1String(" { } ") + braced(listElement(stored)) +
               QLatin1Char(';'));
    start = QLatin1String("append lookupMap { } ");
  }
  if (!lookup.isOptional) {
    buffer.add(QLatin1String(" if { ") + value + QLatin1String(" == {} } ") + missingValue(lookup) +
               QLatin1Char(';'));
  }
  buffer.add(QLatin1String(" set finalVal [string map $lookupMap ") + value + QLatin1String("];"));
  buffer.add(QLatin1String(" puts \"MACRO ") + lookup.macro + QLatin1String(" $finalVal \";"));
  buffer.add(QStringLiteral("]"));
  buffer.flush();
}

QString writeChoiceProcedure(MFBuffer& buffer, const ChoiceList& choices, const QString& procedure,
                             const QString& value) {
  buffer.add(QLatin1String("Tcl2 proc ") + procedure + QLatin1String(" { curAttrValue } { "));
  buffer.add(QStringLiteral("  switch $curAttrValue { "));
  for (const auto& [shown, stored] : procedureOrder(choices)) {
    buffer.add(QLatin1String("  ") + braced(shown) + QLatin1String(" { return ") + braced(stored) +
               QLatin1String("; }"));
  }
  buffer.add(QStringLiteral("};"));
  buffer.add(QStringLiteral("return $curAttrValue;"));
  buffer.add(QStringLiteral("}"));
  buffer.flush();
  return kProcedureCall + procedure + QLatin1Char(' ') + braced(value) + QLatin1String(" )");
}

}  // namespace lookup_writers
