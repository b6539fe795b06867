#include <platform/orxparameter/ChoiceList.h>
#include <platform/orxparameter/ConfigToken.h>
#include <platform/orxparameter/GUIType.h>
#include <platform/qorxcore/WordEncoding.h>

#include <QHash>

#include <atomic>
#include <set>

struct ChoiceListData {
  // The one place that changes the entries, so that the indexes stay true to them.
  void set(const QString& shown, const QString& stored, bool replace);
  // With `lookup`, entries are `shown,stored`.
  void read(const QString& config, bool lookup, bool replace);

  std::vector<std::pair<QString, QString>> entries;
  QHash<QString, int> byShown;
  // Several entries may store the same.
  std::set<std::pair<QString, int>> byStored;
  bool hasLookup = false;
};

namespace {

const QLatin1String kLookupPrefix("LOOKUP_");
const QLatin1String kChoice("CHOICE");
const QLatin1String kListBox("LISTBOX");

const ChoiceListData& read(const std::shared_ptr<ChoiceListData>& d) {
  static const ChoiceListData none;
  return d ? *d : none;
}

int indexOfStored(const ChoiceListData& data, const QString& value) {
  const auto at = data.byStored.lower_bound({value, 0});
  return at != data.byStored.end() && at->first == value ? at->second : -1;
}

bool isTypeOrVariant(const GUIType& type, QLatin1String word) {
  const int start = type.getType().startsWith(kLookupPrefix) ? kLookupPrefix.size() : 0;
  const QStringRef base = type.getType().midRef(start);
  return base.startsWith(word) && (base.size() == word.size() || base.at(word.size()) == QLatin1Char('_'));
}

}  // namespace

void ChoiceListData::set(const QString& shown, const QString& stored, bool replace) {
  const int next = int(entries.size());
  const int index = byShown.value(shown, next);
  const int plain = replace && index == next ? byShown.value(stored, -1) : -1;
  if (plain >= 0 && entries[size_t(plain)].second == stored) {
    byShown.remove(stored);
    byShown.insert(shown, plain);
    entries[size_t(plain)].first = shown;
    return;
  }
  if (index == next) {
    entries.emplace_back(shown, stored);
    byShown.insert(shown, index);
  } else if (replace) {
    byStored.erase({entries[size_t(index)].second, index});
    entries[size_t(index)].second = stored;
  } else {
    return;
  }
  byStored.insert({stored, index});
}

void ChoiceListData::read(const QString& config, bool lookup, bool replace) {
  hasLookup = hasLookup || lookup;
  QString shown;
  QString stored;
  bool given = false;   // anything but an empty piece without quotes
  bool mapped = false;  // a stored part was given
  const auto finish = [&] {
    if (given) {
      set(shown, mapped ? QORXWwjdDecode(stored) : shown, replace);
    }
    shown.clear();
    stored.clear();
    given = mapped = false;
  };
  ConfigPieceReader reader(config);
  while (reader.next()) {
    if (reader.before() == QLatin1Char('%')) {
      finish();
    }
    const bool comma = reader.before() == QLatin1Char(',');
    QString& side = lookup && (mapped || comma) ? stored : shown;
    if (comma && (!lookup || mapped)) {
      side += QLatin1Char(',');
    }
    mapped = lookup && (mapped || comma);
    side += reader.text();
    given = given || reader.isQuoted() || comma || !reader.text().isEmpty();
  }
  finish();
}

ChoiceList::ChoiceList(const GUIType& type) {
  if (ORX_isChoiceType(type) && !type.getConfigToken().isEmpty()) {
    detach().read(type.getConfigToken(), type.getType().startsWith(kLookupPrefix), false);
  }
}

void ChoiceList::addLookup(const QString& lookupLine) {
  int position = 0;
  detach().read(ORX_readConfig(lookupLine, position, ConfigEnd::EndOfText), true, true);
}

bool ChoiceList::hasLookup() const {
  return read(d).hasLookup;
}

const std::vector<std::pair<QString, QString>>& ChoiceList::entries() const {
  return read(d).entries;
}

bool ChoiceList::contains(const QString& value) const {
  return read(d).byShown.contains(value) || indexOfStored(read(d), value) >= 0;
}

QString ChoiceList::toStored(const QString& value) const {
  const int index = read(d).byShown.value(value, -1);
  return index < 0 ? value : entries()[size_t(index)].second;
}

QString ChoiceList::toShown(const QString& value) const {
  const int index = indexOfStored(read(d), value);
  return index < 0 ? value : entries()[size_t(index)].first;
}

ChoiceListData& ChoiceList::detach() {
  if (!d) {
    d = std::make_shared<ChoiceListData>();
  } else if (d.use_count() > 1) {
    d = std::make_shared<ChoiceListData>(*d);
  } else {
    // What another thread did with the copy that it has just dropped comes before the change made here.
    std::atomic_thread_fence(std::memory_order_acquire);
  }
  return *d;
}

bool ORX_isChoiceType(const GUIType& type) {
  return isTypeOrVariant(type, kChoice) || ORX_isListBoxType(type);
}

bool ORX_isListBoxType(const GUIType& type) {
  return isTypeOrVariant(type, kListBox);
}
