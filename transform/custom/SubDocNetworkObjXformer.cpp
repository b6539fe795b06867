#include <transform/core/TransformerCfg.h>
#include <transform/custom/SubDocNetworkObjXformer.h>

SubDocNetworkObjXformer::SubDocNetworkObjXformer(std::unique_ptr<TransformerCfg> cfg,
                                                 const QHash<QString, QStringList>& inputAttributes,
                                                 int number)
    : SubDocNetworkObj(number), m_cfg(std::move(cfg)), m_inputAttributes(inputAttributes) {}

SubDocNetworkObjXformer::~SubDocNetworkObjXformer() = default;

void SubDocNetworkObjXformer::compute(QHash<QString, QString>& origins) {
  QHash<QString, QStringList> byTag = m_inputAttributes;
  for (const auto& [port, links] : feeders()) {
    const QStringList arrived = collect(links, origins);
    const auto known = byTag.find(port);
    if (known == byTag.end() || known->isEmpty()) {
      byTag.insert(port, arrived);
    } else {
      *known += arrived;
      known->removeDuplicates();
    }
  }
  noteComputed(byTag != m_arrivedByTag);
  if (!hasChanged())
    return;
  m_arrivedByTag = byTag;
  m_leaving.clear();
  m_cfg->setInputAttributes(byTag);
}

QStringList SubDocNetworkObjXformer::getAttributes(const QString& port) const {
  if (!isComputed())
    return QStringList();
  const auto known = m_leaving.constFind(port);
  if (known != m_leaving.constEnd())
    return *known;
  QStringList leaving = m_cfg->getOutputAttributes(port);
  const auto exposed = m_exposed.constFind(port);
  if (exposed != m_exposed.constEnd()) {
    leaving += *exposed;
    leaving.removeDuplicates();
  }
  leaving = withCopies(port, leaving);
  m_leaving.insert(port, leaving);
  return leaving;
}

QString SubDocNetworkObjXformer::name() const {
  return m_cfg->getIdentifier();
}

TransformerCfg* SubDocNetworkObjXformer::getTransformer() const {
  return m_cfg.get();
}
