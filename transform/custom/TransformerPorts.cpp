#include <transform/core/TransformerCfg.h>
#include <transform/custom/TransformerPorts.h>
#include <transform/workspace/TransformerRecords.h>
#include <transform/workspace/WorkspaceRecords.h>

TransformerPorts::TransformerPorts(const TransformerStruct& record, const TransformerCfg& cfg) {
  for (const QStringList& port : readPortOrder(record.inputFtOrder))
    m_inputs.listed.append(port.value(0));
  cfg.getInputTags(m_inputs.tags);
  m_inputs.tags += cfg.getDynamicInputTags();
  addNames(m_inputs, cfg.getInputTagAliases(), cfg.renamedInputTags(record.version, nullptr));
  for (const OutputFeatStruct& output : record.outputFeats)
    m_outputs.listed.append(output.name);
  cfg.getOutputTags(m_outputs.tags);
  addNames(m_outputs, {}, cfg.renamedOutputTags(record.version, nullptr));
}

void TransformerPorts::addNames(Side& side, const QHash<QString, QString>& aliases,
                                const QHash<QString, QString>& renamed) {
  QHash<QString, QString>& names = side.names;
  for (const QString& tag : qAsConst(side.tags))
    names.insert(tag, tag);
  for (const QString& tag : qAsConst(side.tags)) {
    const QString alias = aliases.value(tag);
    if (!alias.isEmpty() && !names.contains(alias))
      names.insert(alias, tag);
  }
  for (auto old = renamed.cbegin(); old != renamed.cend(); ++old) {
    if (!names.contains(old.key()) && names.value(old.value()) == old.value())
      names.insert(old.key(), old.value());
  }
}

QString TransformerPorts::Side::find(unsigned number, const QString& name) const {
  if (!name.isEmpty())
    return names.value(name);
  return number < static_cast<unsigned>(counted().size())
             ? names.value(counted().at(static_cast<int>(number)))
             : QString();
}

QHash<QString, QStringList> TransformerPorts::exposedAttributes(const TransformerStruct& record) const {
  QHash<QString, QStringList> exposed;
  for (const XformAttrStruct& attribute : record.attributes) {
    if (!attribute.isUserCreated || !attribute.attrIsEnabled)
      continue;
    const QString tag =
        attribute.featIndex < 0 ? QString() : output(static_cast<unsigned>(attribute.featIndex), QString());
    for (const QString& port : tag.isNull() ? m_outputs.tags : QStringList(tag))
      exposed[port].append(attribute.attrName);
  }
  return exposed;
}
