#include <platform/orxparameter/ConfigToken.h>
#include <platform/orxparameter/MemberList.h>
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>

namespace {

const QLatin1String kMultiParameter("MULTIPARAMETER");
const QLatin1String kGuiLineTable("GUI_LINE_TABLE");
const QLatin1Char kQuote('"');

struct Range {
  int start = -1;
  int end = -1;
};

// Where the element of this index stands in a packed list.
Range elementRange(const QString& packed, QChar separator, int index) {
  Range range;
  range.start = 0;
  for (int i = 0;; ++i) {
    int from = range.start;
    while (from < packed.size() && ORX_isBlank(packed.at(from)) && packed.at(from) != separator) {
      ++from;
    }
    if (from < packed.size() && packed.at(from) == kQuote && separator != kQuote) {
      const int close = ORX_closingQuote(packed, from);
      from = close < 0 ? packed.size() : close + 1;
    }
    range.end = packed.indexOf(separator, from);
    if (range.end < 0) {
      range.end = packed.size();
    }
    if (i == index || range.end == packed.size()) {
      return i == index ? range : Range();
    }
    range.start = range.end + 1;
  }
}

// The index of the name in a list name, value, name, value; -1 when the list does not have it.
int indexOfName(const QStringList& list, const QString& name) {
  for (int i = 0; i < list.size(); i += 2) {
    if (list.at(i) == name) {
      return i;
    }
  }
  return -1;
}

}  // namespace

MemberList::MemberList(const GUIType& type) {
  if (type.getType() != kMultiParameter && type.getType() != kGuiLineTable) {
    return;
  }
  const QStringList parts = ORX_readMemberConfig(type.getConfigToken());
  if (parts.first().size() == 1) {
    m_separator = parts.first().front();
  }
  for (int i = 1; i < parts.size(); ++i) {
    GUIType member = GUIType::fromGuiLine(parts.at(i));
    if (member.isNull()) {
      continue;
    }
    if (!m_byName.contains(member.getName())) {
      m_byName.insert(member.getName(), int(m_members.size()));
    }
    m_members.push_back(std::move(member));
  }
}

const GUIType* MemberList::find(const QString& name) const {
  const int index = m_byName.value(name, -1);
  return index < 0 ? nullptr : &m_members[size_t(index)];
}

QString MemberList::memberValue(const QString& value, const QString& member) const {
  const QStringList list = QORXSdfStringToList(value, m_separator);
  const int index = indexOfName(list, member);
  return index < 0 ? QString() : list.value(index + 1);
}

QString MemberList::withMemberValue(const QString& value, const QString& member, const QString& part) const {
  QStringList list = QORXSdfStringToList(value, m_separator);
  const auto pack = [this](const QStringList& elements) {
    return QORXListToSdfString(elements, m_separator);
  };
  const int index = indexOfName(list, member);
  QString packed = value;
  if (index >= 0 && index + 1 < list.size()) {
    const Range range = elementRange(value, m_separator, index + 1);
    list[index + 1] = part;
    if (range.start >= 0) {
      packed.replace(range.start, range.end - range.start, pack({part}));
    }
  } else {
    QStringList added;
    if (index < 0) {
      if (list.size() % 2 != 0) {
        added << QString();  // the value that the last name lacks
      }
      added << member;
    }
    added << part;
    if (!list.isEmpty()) {
      packed += m_separator;
    }
    packed += pack(added);
    list += added;
  }
  return QORXSdfStringToList(packed, m_separator) == list ? packed : pack(list);
}

QString MemberList::configToken(QChar separator, const std::vector<GUIType>& members) {
  QString token = QORXWwjdEncode(QString(separator));
  for (const GUIType& member : members) {
    if (!member.isNull()) {
      token += QLatin1Char(',') + QORXWwjdEncode(member.getAsString());
    }
  }
  return token;
}
