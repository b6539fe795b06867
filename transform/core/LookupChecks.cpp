#include <platform/qorxcore/Lists.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/generation/LookupWriters.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TclText.h>
#include <transform/text/TextPlaces.h>

#include <QSet>

#include <algorithm>
#include <cstring>

namespace messages = orx::messages;

namespace {

using namespace lookup_checks;

bool fitsBraces(const QString& text) {
  return TextPlaces::refuse(TextPlace::TclBraces, text) == 0;
}

bool fitsQuotes(const QString& text) {
  return TextPlaces::refuse(TextPlace::TclQuotes, text) == 0;
}

// A name that is one word of a macro line, of a reference and of a script.
bool isPlainWord(const QString& name) {
  return !name.isEmpty() && std::all_of(name.begin(), name.end(), [](QChar c) {
    const ushort code = c.unicode();
    return code >= 0x80 ? code > 0xa0 && !c.isSpace() && !c.isSurrogate()
                        : c.isLetterOrNumber() || (code != 0 && std::strchr("_-.:+=", code) != nullptr);
  });
}

long refuseMessage(const BoxLookup& lookup) {
  if (lookup.isOptional) {
    return 0;
  }
  if (!fitsQuotes(lookup.prompt)) {
    return messages::kPromptInScript;
  }
  return fitsQuotes(lookup.identifier) ? 0 : messages::kIdentifierInScript;
}

// What "string map" makes of a text: at each place the first key that fits is replaced.
class StringMap {
 public:
  explicit StringMap(const QStringList& list) {
    for (int i = 0; i + 1 < list.size(); i += 2) {
      if (!list.at(i).isEmpty()) {
        m_byFirst[list.at(i).at(0)].push_back({list.at(i), list.at(i + 1)});
      }
    }
  }

  QString apply(const QString& text) const {
    QString result;
    for (int i = 0; i < text.size();) {
      const auto keys = m_byFirst.constFind(text.at(i));
      const std::pair<QString, QString>* found = nullptr;
      if (keys != m_byFirst.constEnd()) {
        const auto fits = std::find_if(keys->begin(), keys->end(), [&](const auto& entry) {
          return text.midRef(i, entry.first.size()) == entry.first;
        });
        found = fits == keys->end() ? nullptr : &*fits;
      }
      if (found) {
        result += found->second;
        i += found->first.size();
      } else {
        result += text.at(i++);
      }
    }
    return result;
  }

 private:
  QHash<QChar, std::vector<std::pair<QString, QString>>> m_byFirst;
};

const QLatin1Char kBlank(' ');

// Whether a selection of several entries could hold the key across the blanks between them.
class SpanningKeys {
 public:
  explicit SpanningKeys(const lookup_writers::Entries& entries) {
    for (const auto& entry : entries) {
      const QString packed = QORXListToSdfString({entry.first}, kBlank);
      m_sorted.push_back(packed);
      m_packed.insert(packed);
    }
    std::sort(m_sorted.begin(), m_sorted.end());
  }

  bool contains(const QString& key) const {
    const QStringList pieces = key.split(kBlank);
    if (pieces.size() < 2) {
      return false;
    }
    // The first piece may be empty: the key then begins with the blank between two entries.
    for (int i = 0; i + 1 < pieces.size(); ++i) {
      if (!m_packed.contains(pieces.at(i)) && !(i == 0 && pieces.at(i).isEmpty())) {
        return false;
      }
    }
    const auto at = std::lower_bound(m_sorted.begin(), m_sorted.end(), pieces.last());
    return at != m_sorted.end() && at->startsWith(pieces.last());
  }

 private:
  std::vector<QString> m_sorted;
  QSet<QString> m_packed;
};

// Whether every selection of entries comes out as their stored sides.
bool mapsEverySelection(const ChoiceList& choices) {
  const lookup_writers::Entries entries = lookup_writers::listBoxOrder(choices);
  QString list;
  for (const auto& [shown, stored] : entries) {
    if (!fitsBraces(lookup_writers::listElement(shown)) || !fitsBraces(lookup_writers::listElement(stored))) {
      return false;
    }
    list += (list.isEmpty() ? QString() : QString(kBlank)) + lookup_writers::listElement(shown) + kBlank +
            lookup_writers::listElement(stored);
  }
  QStringList elements;
  if (!tcl_text::splitList(list, elements) || elements.size() != static_cast<int>(entries.size()) * 2) {
    return false;
  }
  const StringMap map(elements);
  const SpanningKeys spanning(entries);
  return std::all_of(entries.begin(), entries.end(), [&](const auto& entry) {
    const QString mapped = map.apply(QORXListToSdfString({entry.first}, kBlank));
    return QORXSdfStringToList(mapped, kBlank) == QStringList(entry.second) &&
           !spanning.contains(entry.first);
  });
}

}  // namespace

namespace lookup_checks {

bool fitsFragment(const QString& text) {
  return fitsQuotes(text);
}

long refuseChoiceBox(const ChoiceList& choices, const BoxLookup& lookup) {
  if (!isPlainWord(lookup.macro)) {
    return messages::kNameInMacro;
  }
  if (!fitsQuotes(lookup.value)) {
    return messages::kValueInScript;
  }
  for (const auto& [shown, stored] : choices.entries()) {
    if (!fitsBraces(shown) || !fitsQuotes(stored)) {
      return messages::kChoiceInScript;
    }
  }
  return refuseMessage(lookup);
}

long refuseListBox(const ChoiceList& choices, const BoxLookup& lookup) {
  if (!isPlainWord(lookup.macro)) {
    return messages::kNameInMacro;
  }
  if (!fitsBraces(lookup.value)) {
    return messages::kValueInScript;
  }
  return mapsEverySelection(choices) ? refuseMessage(lookup) : messages::kChoiceInScript;
}

long refuseChoiceProcedure(const ChoiceList& choices, const QString& procedure, const QString& value) {
  if (!isPlainWord(procedure)) {
    return messages::kNameInMacro;
  }
  if (!fitsBraces(value)) {
    return messages::kValueInScript;
  }
  const lookup_writers::Entries& entries = choices.entries();
  // Alone, this name would stand for every value.
  if (entries.size() == 1 && entries.front().first == QLatin1String("default")) {
    return messages::kChoiceInScript;
  }
  const bool fits = std::all_of(entries.begin(), entries.end(), [](const auto& entry) {
    return fitsBraces(entry.first) && fitsBraces(entry.second);
  });
  return fits ? 0 : messages::kChoiceInScript;
}

}  // namespace lookup_checks
