// The part of TransformerCfg that answers for attributes: what reaches the inputs, what leaves the outputs.
#include <transform/core/AttributeReferences.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/ValueReferences.h>
#include <transform/core/attributes/AttributePassage.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MacroText.h>

#include <QScopedValueRollback>
#include <QSet>

#include <algorithm>
#include <iterator>

namespace {

const QLatin1String kPublishedParameterType("PUBLISHED_PARAMETER");

}  // namespace

void TransformerCfg::setInputAttributes(const QString& tag, const QStringList& attributes) {
  m_ports.inputAttributes.insert(tag, AttributeSet(attributes));
}

void TransformerCfg::setInputAttributes(const QHash<QString, QStringList>& attributes) {
  m_ports.inputAttributes.clear();
  for (auto at = attributes.cbegin(); at != attributes.cend(); ++at) {
    m_ports.inputAttributes.insert(at.key(), AttributeSet(*at));
  }
}

QHash<QString, QStringList> TransformerCfg::getInputAttributes() const {
  QHash<QString, QStringList> lists;
  for (auto at = m_ports.inputAttributes.cbegin(); at != m_ports.inputAttributes.cend(); ++at) {
    lists.insert(at.key(), at->names());
  }
  return lists;
}

void TransformerCfg::setArrivingAttributes(const QHash<QString, AttributeSet>& attributes) {
  m_ports.inputAttributes = attributes;
  if (!passesByRules()) {
    setInputAttributes(getInputAttributes());
  }
}

QStringList TransformerCfg::getInputAttributeUnion() const {
  return attributeUnion().names();
}

// The tags on which attributes arrive, in the order of the ports; tags that are no ports come last, by name.
QStringList TransformerCfg::attributeTags() const {
  QStringList tags = allInputTags();
  const auto arrivesAt = [this](const QString& tag) { return m_ports.inputAttributes.contains(tag); };
  if (std::count_if(tags.cbegin(), tags.cend(), arrivesAt) == m_ports.inputAttributes.size()) {
    return tags;
  }
  const QSet<QString> known(tags.begin(), tags.end());
  QStringList others;
  for (auto at = m_ports.inputAttributes.keyBegin(); at != m_ports.inputAttributes.keyEnd(); ++at) {
    if (!known.contains(*at)) {
      others.append(*at);
    }
  }
  others.sort();
  return tags + others;
}

AttributeSet TransformerCfg::attributeUnion() const {
  AttributeSet all;
  const QStringList tags = attributeTags();
  for (const QString& tag : tags) {
    all.add(m_ports.inputAttributes.value(tag));
  }
  return all;
}

bool TransformerCfg::reaches(const QString& reference) const {
  return std::any_of(m_ports.inputAttributes.begin(), m_ports.inputAttributes.end(),
                     [&reference](const AttributeSet& attributes) { return attributes.holds(reference); });
}

const PreservedAttributes& TransformerCfg::preservedAttributes() const {
  return m_preserved ? *m_preserved : configured().attributeRules.preserved;
}

void TransformerCfg::updatePreservesAttributes(const QStringList& preserves) {
  m_preserved = std::make_shared<PreservedAttributes>(PreservedAttributes::parse(preserves));
}

AttributeSet TransformerCfg::passedByRules(const QString& outputTag) const {
  AttributeSet result;
  const QStringList inputTags = attributeTags();
  for (const QString& inputTag : inputTags) {
    AttributePassage(*this, preservedAttributes(), configured().attributeRules, inputTag, outputTag)
        .pass(m_ports.inputAttributes.value(inputTag), result);
  }
  QStringList added;
  addAdditionalAttrs(added, outputTag);
  result.add(added);
  return result;
}

AttributeSet TransformerCfg::leavingAttributes(const QString& tag) const {
  return passesByRules() ? passedByRules(tag) : AttributeSet(getOutputAttributes(tag));
}

QStringList TransformerCfg::getOutputAttributes(const QString& tag) const {
  if (passesByRules()) {
    return passedByRules(tag).names();
  }
  QStringList result;
  const QStringList inputTags = attributeTags();
  for (const QString& inputTag : inputTags) {
    QStringList incoming = m_ports.inputAttributes.value(inputTag).names();
    transformAllAttrs(incoming, result, inputTag, tag);
  }
  addAdditionalAttrs(result, tag);
  result.removeDuplicates();
  return result;
}

void TransformerCfg::transformAllAttrs(QStringList& incoming, QStringList& result, const QString& inputTag,
                                       const QString& outputTag) const {
  const AttributePassage passage(*this, preservedAttributes(), configured().attributeRules, inputTag,
                                 outputTag);
  const Call call{&passage};
  const QScopedValueRollback<const Call*> scope(m_call, &call);
  for (const QString& attribute : std::as_const(incoming)) {
    transformAttr(attribute, result, inputTag, outputTag);
  }
}

void TransformerCfg::transformAttr(const QString& attribute, QStringList& result, const QString& inputTag,
                                   const QString& outputTag) const {
  if (m_call && m_call->passage && m_call->passage->isBetween(inputTag, outputTag)) {
    m_call->passage->pass(attribute, result);
  } else {
    AttributePassage(*this, preservedAttributes(), configured().attributeRules, inputTag, outputTag)
        .pass(attribute, result);
  }
}

void TransformerCfg::addAdditionalAttrs(QStringList& result, const QString& outputTag) const {
  for (const AddedAttribute& attribute : configured().attributeRules.added) {
    if (!attribute.outputTag.isEmpty() && attribute.outputTag != outputTag) {
      continue;
    }
    const QString parameter = attribute.name.onlyParameter();
    const QStringList lists =
        attribute.list.isEmpty() ? QStringList(QString()) : expandParameterText(*this, attribute.list);
    for (const QString& list : lists) {
      if (!parameter.isEmpty()) {
        addAdditionalAttrsFromParameter(parameter, list, outputTag, result);
      } else {
        addAttributesToList({QString(), expandParameterText(*this, attribute.name), list}, result);
      }
    }
  }
}

void TransformerCfg::addAdditionalAttrsFromParameter(const QString& parameter, const QString& listName,
                                                     const QString&, QStringList& result) const {
  addAttributesToList({parameter, QStringList(), listName}, result);
}

void TransformerCfg::addAttributesToList(const AddAttributesInfo& info, QStringList& result) const {
  const QString list = info.listName.isEmpty() || info.listName.endsWith(kListMark)
                           ? info.listName
                           : info.listName + kListMark;
  const QString prefix = list.isEmpty() ? QString() : list + QLatin1Char('.');
  const QStringList listed = info.parameter.isEmpty() ? QStringList() : attributesListedBy(info.parameter);
  for (const QString& name : listed + info.attributes) {
    result.append(prefix + name);
  }
}

QStringList TransformerCfg::attributesListedBy(const QString& parameter) const {
  const QString value = getParameterValue(parameter, UnpackLevel::Resolved);
  if (value == kUnusedGroupBy && parameter == configured().fields.multiProcess) {
    return QStringList();
  }
  const GUIType& type = typeOfValue(parameter);
  if (type.getType().startsWith(kPublishedParameterType)) {
    // The attribute bears the name of the workspace's parameter, whatever that holds.
    const QString name = macroNamedBy(getParameterValue(parameter, UnpackLevel::Stored));
    return isMacroName(name) ? QStringList(name) : QStringList();
  }
  return listedAttributeNames(type, value);
}

bool TransformerCfg::parmValueAffectsOutputAttrs(const QString& parameter) const {
  const QSet<QString>& parameters = configured().attributeRules.parameters;
  if (parameters.contains(parameter)) {
    return true;
  }
  // A multi-parameter takes part through its members, a member through its multi-parameter.
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  if (!record || !record->isMultiParameter()) {
    return false;
  }
  if (record->getName() != parameter) {
    return parameters.contains(record->getName());
  }
  const QStringList& names = record->getMacroNames();
  return std::any_of(names.begin(), names.end(),
                     [&parameters](const QString& name) { return parameters.contains(name); });
}

QStringList TransformerCfg::getAttributeNamesInValue(const QString& parameter) const {
  AttributeReferences references;
  collectReferences(parameter, references);
  return references.names();
}

void TransformerCfg::collectReferences(const QString& parameter, AttributeReferences& references) const {
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  if (!record) {
    return;
  }
  const QString value = getParameterValue(parameter, UnpackLevel::Resolved);
  if (value == kUnusedGroupBy && parameter == configured().fields.multiProcess) {
    return;
  }
  if (record->getName() == parameter) {
    references.addParameter(*record, value);
  } else {
    references.addValue(typeOfValue(parameter), value);
  }
}

void TransformerCfg::getMissingAttributeReferences(const QString& parameter, QStringList& missing,
                                                   bool& hasReferences) const {
  missing.clear();
  const QStringList names = getAttributeNamesInValue(parameter);
  hasReferences = !names.isEmpty();
  if (!hasReferences) {
    return;
  }
  std::copy_if(names.begin(), names.end(), std::back_inserter(missing),
               [this](const QString& name) { return !reaches(name); });
  if (missing.isEmpty()) {
    return;
  }
  AttributeReferences references;
  collectReferences(parameter, references);
  missing.erase(std::remove_if(missing.begin(), missing.end(),
                               [&references](const QString& name) { return references.mayBeNew(name); }),
                missing.end());
}

void TransformerCfg::getAttributesByType(const QString& type, QStringList& attributes,
                                         bool onlyInputs) const {
  attributes.clear();
  const auto add = [&](const GUIType& valueType, const QString& value) {
    if (valueType.getType().startsWith(type)) {
      const std::vector<ValueReference> references = valueReferences(valueType, value);
      for (const ValueReference& reference : references) {
        attributes.append(reference.name);
      }
      if (references.empty()) {
        attributes += listedAttributeNames(valueType, value);
      }
    }
  };
  for (const TransformParamCfg& record : m_parameters.records()) {
    const QString value = getParameterValue(record.getName(), UnpackLevel::Resolved);
    if (value == kUnusedGroupBy && record.getName() == configured().fields.multiProcess) {
      continue;
    }
    forEachPart(record, value, add);
  }
  attributes.removeDuplicates();
  if (onlyInputs) {
    attributes.erase(std::remove_if(attributes.begin(), attributes.end(),
                                    [this](const QString& name) { return !reaches(name); }),
                     attributes.end());
  }
}
