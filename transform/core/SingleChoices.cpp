#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/ValueReferences.h>
#include <transform/text/MacroText.h>

#include <QHash>

#include <algorithm>

namespace {

using single_choices::Replace;

const QLatin1Char kPartSeparator(';');
const QLatin1Char kBlank(' ');
const QLatin1Char kQuote('"');
const QLatin1String kCheckBoxType("CHECKBOX");

// A text whose references are out of the way while it is decoded and taken apart: what stands in their places
// means the same in every encoding.
class References {
 public:
  explicit References(const QString& text, ReferenceForms forms) : m_marked(text) {
    std::vector<std::pair<int, int>> places;
    for (const MacroReference& reference : macroReferences(text)) {
      if (reference.isClosed && !reference.isInside)
        places.emplace_back(reference.begin, reference.end);
    }
    for (const ValueReference& reference : valueReferences(text, forms))
      places.emplace_back(reference.begin, reference.end);
    if (places.empty() || text.contains(kMark))
      return;
    std::sort(places.begin(), places.end());
    m_marked.clear();
    int done = 0;
    for (const auto& [begin, end] : places) {
      if (begin < done)
        continue;
      m_marked += text.midRef(done, begin - done);
      m_marked += kMark + QString::number(m_texts.size()) + kMark;
      m_texts.append(text.mid(begin, end - begin));
      done = end;
    }
    m_marked += text.midRef(done);
  }

  const QString& marked() const { return m_marked; }
  static bool refers(const QString& marked) { return marked.contains(kMark); }
  QString restored(const QString& text) const {
    if (m_texts.isEmpty())
      return text;
    QStringList parts = text.split(kMark);
    for (int i = 1; i < parts.size(); i += 2)
      parts[i] = m_texts.value(parts.at(i).toInt());
    return parts.join(QString());
  }

 private:
  static constexpr QChar kMark = QChar(0xe0ff);

  QString m_marked;
  QStringList m_texts;
};

bool offersChoices(const GUIType& type) {
  return ORX_isChoiceType(type) || type.getType() == kCheckBoxType;
}

// Where the element of a list ends that begins at `begin`; blanks in quotes are part of it.
int endOfElement(const QString& list, int begin) {
  bool isQuoted = false;
  int at = begin;
  for (; at < list.size() && (isQuoted || list.at(at) != kBlank); ++at) {
    if (list.at(at) == kQuote)
      isQuoted = isQuoted ? false : at == begin || list.at(at - 1) == kQuote;
  }
  return at;
}

// A list box: each element is replaced where it stands. One that shows a text with blanks may be the whole.
QString inList(const ChoiceList& choices, const QString& list, const std::function<QString(QString)>& one) {
  const auto packed = [&](const QString& raw, const QString& choice) {
    const QString replaced = one(choice);
    return replaced == choice ? raw : QORXListToSdfString({replaced}, kBlank);
  };
  if (choices.contains(list))
    return packed(list, list);
  QString result;
  for (int at = 0; at < list.size();) {
    if (list.at(at) == kBlank) {
      result += list.at(at++);
      continue;
    }
    const QString raw = list.mid(at, endOfElement(list, at) - at);
    result += packed(raw, QORXSdfStringToList(raw, kBlank).value(0));
    at += raw.size();
  }
  return result;
}

QString inMarked(const GUIType& type, const ChoiceList& choices, const References& references,
                 const QString& marked, const Replace& replace) {
  const auto one = [&](const QString& choice) {
    const QString text = references.restored(choice);
    const QString replaced = replace({type, choices, text, References::refers(choice)});
    return replaced == text ? choice : replaced;
  };
  return ORX_isListBoxType(type) ? inList(choices, marked, one) : one(marked);
}

// Applies `inside` to each result of a condition, decoded.
QString inResults(const QString& value,
                  const std::function<QString(const References& references, const QString& text)>& inside) {
  QStringList parts = value.mid(kConditionalPrefix.size()).split(kPartSeparator);
  for (int i = 0; i < parts.size(); ++i) {
    if (i % 2 == 0 && i + 1 < parts.size())
      continue;
    const References references(parts.at(i), ReferenceForms::All);
    const QString result = QORXWwjdDecode(references.marked());
    const QString replaced = inside(references, result);
    if (replaced != result)
      parts[i] = references.restored(QORXWwjdEncode(replaced));
  }
  return kConditionalPrefix + parts.join(kPartSeparator);
}

QString storedSideOf(const single_choices::Choice& choice) {
  return choice.choices.toStored(choice.text);
}

}  // namespace

QString single_choices::replaceIn(const GUIType& type, const ChoiceList& choices, const QString& value,
                                  const Replace& replace) {
  if (!offersChoices(type))
    return value;
  if (value.startsWith(kConditionalPrefix)) {
    return inResults(value, [&](const References& references, const QString& text) {
      return inMarked(type, choices, references, text, replace);
    });
  }
  const References references(value, referenceForms(type, value));
  return references.restored(inMarked(type, choices, references, references.marked(), replace));
}

QString single_choices::replaceIn(const TransformParamCfg& parameter, const QString& value,
                                  const Replace& replace) {
  const MemberList& list = parameter.members();
  const std::vector<GUIType>& members = list.members();
  if (members.empty())
    return replaceIn(parameter, parameter.choices(), value, replace);
  if (std::none_of(members.begin(), members.end(), offersChoices))
    return value;
  QHash<const GUIType*, ChoiceList> choices;  // the rows of a table share the types of its columns
  const auto inPart = [&](const GUIType* type, QString& part, const References* references) {
    if (!type || !offersChoices(*type))
      return false;
    auto known = choices.constFind(type);
    if (known == choices.constEnd())
      known = choices.insert(type, ChoiceList(*type));
    const QString made = references ? inMarked(*type, *known, *references, part, replace)
                                    : replaceIn(*type, *known, part, replace);
    const bool isChanged = made != part;
    part = made;
    return isChanged;
  };
  const auto inParts = [&](const QString& packed, const References* references) {
    QStringList parts = QORXSdfStringToList(packed, list.separator());
    bool isChanged = false;
    for (int i = 0; i < parts.size(); ++i) {
      const int column = i % static_cast<int>(members.size());
      const GUIType* type = parameter.isTable() ? &members[static_cast<std::size_t>(column)]
                            : i % 2 == 1        ? list.find(parts.at(i - 1))
                                                : nullptr;
      isChanged = inPart(type, parts[i], references) || isChanged;
    }
    return isChanged ? QORXListToSdfString(parts, list.separator()) : packed;
  };
  if (!value.startsWith(kConditionalPrefix))
    return inParts(value, nullptr);
  return inResults(
      value, [&](const References& references, const QString& text) { return inParts(text, &references); });
}

QString single_choices::toStored(const TransformParamCfg& parameter, const QString& value) {
  return replaceIn(parameter, value, storedSideOf);
}

bool single_choices::refersToShownSide(const TransformParamCfg& parameter, const QString& value,
                                       const ExpandReferences& expand) {
  bool isShown = false;
  replaceIn(parameter, value, [&](const Choice& choice) {
    QString known = choice.text;
    if (choice.refers && choice.choices.hasLookup() && expand(known))
      isShown = isShown || replaceIn(choice.type, choice.choices, known, storedSideOf) != known;
    return choice.text;
  });
  return isShown;
}
