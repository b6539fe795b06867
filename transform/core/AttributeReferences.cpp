#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/ValueReferences.h>

#include <vector>

namespace {

const QLatin1Char kSeparator(',');

bool namesOneAttribute(const GUIType& type) {
  const QString& word = type.getType();
  return (word.startsWith(kAttributeType) || word.startsWith(kNewAttributeType)) &&
         !word.contains(QLatin1String("_LIST"));
}

}  // namespace

QStringList listedAttributeNames(const GUIType& type, const QString& value) {
  if (isUnsetValue(value) || value.startsWith(kConditionalPrefix)) {
    return QStringList();
  }
  const QStringList pieces =
      namesOneAttribute(type) ? QStringList(value) : QORXSdfStringToList(value, kSeparator);
  const ReferenceForms forms = referenceForms(type, value);
  QStringList names;
  for (const QString& piece : pieces) {
    if (piece.isEmpty() || piece.contains(kMacroOpen) || beginsValueReference(piece, forms)) {
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
  if (isUnsetValue(value)) {
    return;
  }
  // The factories of templates and scripts read the references in them.
  const bool isText = type.getType().startsWith(kTextEditType);
  const std::vector<ValueReference> references =
      valueReferences(value, isText ? ReferenceForms::All : referenceForms(type, value));
  for (const ValueReference& reference : references) {
    // What a reference to a macro brings is only known when the mapping file runs.
    if (!reference.word.contains(kMacroOpen)) {
      add(reference.name, false);
    }
  }
  if (references.empty() && type.getType().startsWith(kAttributeType)) {
    const bool mayBeNew = type.getConfigToken().contains(kAllowNew);
    const QStringList names = listedAttributeNames(type, value);
    for (const QString& name : names) {
      add(name, mayBeNew);
    }
  }
}

void AttributeReferences::add(const QString& name, bool mayBeNew) {
  if (name.isEmpty()) {
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
