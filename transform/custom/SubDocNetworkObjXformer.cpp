#include <transform/core/TransformerCfg.h>
#include <transform/custom/SubDocNetworkObjXformer.h>

SubDocNetworkObjXformer::SubDocNetworkObjXformer(std::unique_ptr<TransformerCfg> cfg,
                                                 const QHash<QString, QStringList>& inputAttributes,
                                                 int number)
    : SubDocNetworkObj(Kind::Transformer, number, QString()),
      m_cfg(std::move(cfg)),
      m_inputAttributes(inputAttributes),
      m_arrivedByTag(inputAttributes) {}

SubDocNetworkObjXformer::~SubDocNetworkObjXformer() = default;

void SubDocNetworkObjXformer::compute(QHash<QString, QString>& origins) {
  bool isOther = m_inlets.size() != feeders().size();
  m_inlets.resize(feeders().size());
  auto inlet = m_inlets.begin();
  const Source* source = sources().constData();
  for (const auto& [port, links] : feeders()) {
    QStringList merged;
    const QStringList& arriving = collect(source, source + links.size(), merged, origins);
    if (inlet->port != port || inlet->attributes != arriving) {
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
    m_cfg->setInputAttributes(m_arrivedByTag);
}

QHash<QString, QStringList> SubDocNetworkObjXformer::arrivedByTag() const {
  QHash<QString, QStringList> byTag = m_inputAttributes;
  for (const Inlet& inlet : m_inlets) {
    QStringList& all = byTag[inlet.port];
    all += inlet.attributes;
    if (all.size() > inlet.attributes.size())
      all.removeDuplicates();
  }
  return byTag;
}

QStringList SubDocNetworkObjXformer::getAttributes(const QString& port) const {
  if (!isComputed())
    return QStringList();
  QStringList leaving = m_cfg->getOutputAttributes(port);
  const auto exposed = m_exposed.constFind(port);
  if (exposed != m_exposed.constEnd()) {
    leaving += *exposed;
    leaving.removeDuplicates();
  }
  return withCopies(port, leaving);
}

TransformerCfg* SubDocNetworkObjXformer::getTransformer() const {
  return m_cfg.get();
}
