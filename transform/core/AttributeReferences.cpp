#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>

#include <algorithm>
#include <vector>

namespace {

const QLatin1Char kSeparator(',');
// Lists of lists go no deeper; every level of a name costs a copy of it.
constexpr int kDeepestList = 16;

// The two forms of a reference differ in how its brackets are written.
struct ReferenceForm {
  QLatin1String mark;  // up to and with the opening bracket
  QLatin1String open;
  QLatin1String close;
  bool isEncoded;
};

const ReferenceForm kPlainForm{kValueReference, QLatin1String("("), QLatin1String(")"), false};
const ReferenceForm kEncodedForm{kValueReferenceEncoded, kEncodedLeftParenthesis, kEncodedRightParenthesis,
                                 true};

struct OpenBracket {
  int nameStart;  // -1 for a bracket that opens no reference
};

QStringRef rest(const QString& text, int position) {
  return text.midRef(position);
}

QString referenceName(const QString& text, int start, int end, bool isEncoded) {
  QString name = text.mid(start, end - start);
  if (isEncoded) {
    name = QORXWwjdDecode(name);
  }
  if (name.size() >= 2 && name.startsWith(QLatin1Char('"')) && name.endsWith(QLatin1Char('"'))) {
    name = name.mid(1, name.size() - 2);
  }
  return name;
}

void collectReferences(const QString& text, const ReferenceForm& form, QStringList& names) {
  if (!text.contains(form.mark)) {
    return;
  }
  const QChar markStart = form.mark.at(0);
  const QChar openStart = form.open.at(0);
  const QChar closeStart = form.close.at(0);
  std::vector<OpenBracket> open;
  std::vector<int> closes;
  for (int i = 0; i < text.size();) {
    const QChar c = text.at(i);
    if (c == markStart && rest(text, i).startsWith(form.mark)) {
      if (!open.empty()) {
        open.back().nameStart = -1;
      }
      i += form.mark.size();
      open.push_back({i});
    } else if (c == openStart && rest(text, i).startsWith(form.open)) {
      open.push_back({-1});
      i += form.open.size();
    } else if (c == closeStart && rest(text, i).startsWith(form.close)) {
      if (!open.empty()) {
        if (open.back().nameStart >= 0) {
          names.append(referenceName(text, open.back().nameStart, i, form.isEncoded));
        }
        open.pop_back();
      }
      closes.push_back(i);
      i += form.close.size();
    } else {
      ++i;
    }
  }
  // A name with a bracket that is never closed ends at the first closing one.
  for (const OpenBracket& bracket : open) {
    const auto close = std::lower_bound(closes.begin(), closes.end(), bracket.nameStart);
    if (bracket.nameStart >= 0 && close != closes.end()) {
      names.append(referenceName(text, bracket.nameStart, *close, form.isEncoded));
    }
  }
}

bool isUnset(const QString& value) {
  return value.isEmpty() || value == kUnusedValue;
}

bool holdsReference(const QString& value) {
  return value.contains(kValueReference) || value.contains(kValueReferenceEncoded) ||
         value.contains(kValueReferenceWord);
}

bool namesOneAttribute(const GUIType& type) {
  const QString& word = type.getType();
  return (word.startsWith(kAttributeType) || word.startsWith(kNewAttributeType)) &&
         !word.contains(QLatin1String("_LIST"));
}

// "LIST{12}.NAME" with its indexes taken out.
QString withoutIndexes(const QString& name) {
  QString result;
  result.reserve(name.size());
  for (int i = 0; i < name.size(); ++i) {
    result.append(name.at(i));
    if (name.at(i) != QLatin1Char('{')) {
      continue;
    }
    int end = i + 1;
    while (end < name.size() && name.at(end).isDigit()) {
      ++end;
    }
    if (end < name.size() && name.at(end) == QLatin1Char('}')) {
      i = end - 1;
    }
  }
  return result;
}

}  // namespace

QStringList valueReferences(const QString& text) {
  QStringList names;
  collectReferences(text, kPlainForm, names);
  if (text.contains(kValueReferenceWord)) {
    collectReferences(QString(text).replace(kValueReferenceWord, kValueReferenceEncoded), kEncodedForm,
                      names);
  } else {
    collectReferences(text, kEncodedForm, names);
  }
  return names;
}

QStringList listedAttributeNames(const GUIType& type, const QString& value) {
  if (isUnset(value) || value.startsWith(kConditionalPrefix)) {
    return QStringList();
  }
  const QStringList pieces =
      namesOneAttribute(type) ? QStringList(value) : QORXSdfStringToList(value, kSeparator);
  QStringList names;
  for (const QString& piece : pieces) {
    if (piece.isEmpty() || piece.contains(kMacroOpen) || holdsReference(piece)) {
      continue;
    }
    const QString name = piece.startsWith(QLatin1Char('&')) ? piece.mid(1) : piece;
    names.append(type.valueIsEncoded() ? QORXWwjdDecode(name) : name);
  }
  return names;
}

void forEachPart(const TransformParamCfg& parameter, const QString& value,
                 const std::function<void(const GUIType& type, const QString& part)>& visit) {
  const MemberList& members = parameter.members();
  if (members.members().empty() || value.startsWith(kConditionalPrefix)) {
    visit(parameter, value);
    return;
  }
  const QStringList parts = QORXSdfStringToList(value, members.separator());
  if (parameter.isTable()) {
    const int columns = static_cast<int>(members.members().size());
    for (int i = 0; i < parts.size(); ++i) {
      visit(members.members()[static_cast<std::size_t>(i % columns)], parts[i]);
    }
    return;
  }
  for (int i = 0; i + 1 < parts.size(); i += 2) {
    const GUIType* member = members.find(parts[i]);
    visit(member ? *member : GUIType::kNullGuiType, parts[i + 1]);
  }
}

void AttributeReferences::addParameter(const TransformParamCfg& parameter, const QString& value) {
  forEachPart(parameter, value, [this](const GUIType& type, const QString& part) { addValue(type, part); });
}

void AttributeReferences::addValue(const GUIType& type, const QString& value) {
  if (isUnset(value)) {
    return;
  }
  const QStringList references = valueReferences(value);
  for (const QString& name : references) {
    add(name, false);
  }
  if (references.isEmpty() && type.getType().startsWith(kAttributeType)) {
    const bool mayBeNew = type.getConfigToken().contains(kAllowNew);
    const QStringList names = listedAttributeNames(type, value);
    for (const QString& name : names) {
      add(name, mayBeNew);
    }
  }
}

void AttributeReferences::add(const QString& name, bool mayBeNew) {
  // What the value names is only known when the mapping file runs.
  if (name.isEmpty() || name.contains(kMacroOpen)) {
    return;
  }
  if (!m_known.contains(name)) {
    m_known.insert(name);
    m_names.append(name);
  }
  if (!mayBeNew) {
    m_required.insert(name);
  }
}

void AttributeUnion::add(const QStringList& attributes) {
  for (const QString& name : attributes) {
    if (m_known.contains(name)) {
      continue;
    }
    m_known.insert(name);
    m_names.append(name);
    int mark = name.indexOf(kListMemberMark);
    for (int depth = 0; mark >= 0 && depth < kDeepestList; ++depth) {
      m_lists.insert(name.left(mark + kListMark.size()));
      mark = name.indexOf(kListMemberMark, mark + 1);
    }
  }
}

bool AttributeUnion::contains(const QString& reference) const {
  if (m_known.contains(reference) || m_lists.contains(reference)) {
    return true;
  }
  if (!reference.contains(QLatin1Char('{'))) {
    return false;
  }
  const QString name = withoutIndexes(reference);
  return m_known.contains(name) || m_lists.contains(name);
}
