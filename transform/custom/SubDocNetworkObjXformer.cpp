#include <transform/core/TransformerCfg.h>
#include <transform/custom/AttributeFlow.h>
#include <transform/custom/SubDocNetworkObjXformer.h>

SubDocNetworkObjXformer::SubDocNetworkObjXformer(std::unique_ptr<TransformerCfg> cfg,
                                                 const QHash<QString, QStringList>& inputAttributes,
                                                 int number)
    : SubDocNetworkObj(Kind::Transformer, number, QString()), m_cfg(std::move(cfg)) {
  for (auto at = inputAttributes.cbegin(); at != inputAttributes.cend(); ++at)
    m_inputAttributes.insert(at.key(), AttributeSet(*at));
  m_arrivedByTag = m_inputAttributes;
}

SubDocNetworkObjXformer::~SubDocNetworkObjXformer() = default;

void SubDocNetworkObjXformer::compute(MetAttributes& met) {
  bool isOther = m_inlets.size() != feeders().size();
  m_inlets.resize(feeders().size());
  auto inlet = m_inlets.begin();
  const Source* source = sources().constData();
  for (const auto& [port, links] : feeders()) {
    const AttributeSet arriving = collect(source, source + links.size(), met);
    if (inlet->port != port || !(inlet->attributes == arriving)) {
      *inlet = {port, arriving};
      isOther = true;
    }
    ++inlet;
    source += links.size();
  }
  if (isOther)
    m_arrivedByTag = arrivedByTag();
  noteComputed(isOther || !isComputed());
  if (hasChanged())
    attribute_flow::enter(*m_cfg, m_arrivedByTag);
}

QHash<QString, AttributeSet> SubDocNetworkObjXformer::arrivedByTag() const {
  QHash<QString, AttributeSet> byTag = m_inputAttributes;
  for (const Inlet& inlet : m_inlets)
    byTag[inlet.port].add(inlet.attributes);
  return byTag;
}

AttributeSet SubDocNetworkObjXformer::getAttributes(const QString& port) const {
  if (!isComputed())
    return AttributeSet();
  AttributeSet leaving = attribute_flow::leaving(*m_cfg, port);
  leaving.add(m_exposed.value(port));
  return leaving;
}

TransformerCfg* SubDocNetworkObjXformer::getTransformer() const {
  return m_cfg.get();
}
