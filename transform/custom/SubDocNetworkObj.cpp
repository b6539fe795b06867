#include <transform/custom/SubDocNetworkObj.h>

#include <QSet>

#include <algorithm>

SubDocNetworkObj::~SubDocNetworkObj() = default;

void SubDocNetworkObj::addAttributeCopy(const QString& port, const QString& from, const QString& to) {
  m_copies[port].push_back({from, to});
}

void SubDocNetworkObj::addLink(SubDocNetworkObj& from, const QString& fromPort, SubDocNetworkObj& to,
                               const QString& toPort) {
  from.m_consumers[fromPort].push_back({&to, toPort});
  to.m_feeders[toPort].push_back({&from, fromPort});
}

void SubDocNetworkObj::removeLinks() {
  const auto takeOut = [this](Ports& ports, const QString& port) {
    const auto at = ports.find(port);
    if (at == ports.end())
      return;
    auto& links = at->second;
    links.erase(
        std::remove_if(links.begin(), links.end(), [this](const Link& link) { return link.node == this; }),
        links.end());
    if (links.empty())
      ports.erase(at);
  };
  const Ports feeders = std::move(m_feeders);
  const Ports consumers = std::move(m_consumers);
  m_feeders.clear();
  m_consumers.clear();
  for (const auto& [port, links] : feeders) {
    for (const Link& link : links)
      takeOut(link.node->m_consumers, link.port);
  }
  for (const auto& [port, links] : consumers) {
    for (const Link& link : links)
      takeOut(link.node->m_feeders, link.port);
  }
}

void SubDocNetworkObj::beginQuery() {
  m_arrived.clear();
  m_isComputed = false;
  m_hasChanged = true;
}

void SubDocNetworkObj::noteComputed(const QStringList& arrived) {
  m_hasChanged = !m_isComputed || m_arrived != arrived;
  m_arrived = arrived;
  m_isComputed = true;
}

void SubDocNetworkObj::noteComputed(bool changed) {
  m_hasChanged = !m_isComputed || changed;
  m_isComputed = true;
}

namespace {

void noteOrigins(const QStringList& attributes, const SubDocNetworkObj& node,
                 QHash<QString, QString>& origins) {
  QString name;
  for (const QString& attribute : attributes) {
    QString& origin = origins[attribute];
    if (!origin.isNull())
      continue;
    if (name.isNull()) {
      name = node.name();
      if (name.isNull())
        name = QLatin1String("");
    }
    origin = name;
  }
}

}  // namespace

QStringList SubDocNetworkObj::collect(const std::vector<Link>& links,
                                      QHash<QString, QString>& origins) const {
  if (links.size() == 1) {
    const QStringList attributes = links.front().node->getAttributes(links.front().port);
    noteOrigins(attributes, *links.front().node, origins);
    return attributes;
  }
  QStringList collected;
  QSet<QString> seen;
  for (const Link& link : links) {
    const QStringList attributes = link.node->getAttributes(link.port);
    noteOrigins(attributes, *link.node, origins);
    for (const QString& attribute : attributes) {
      const int before = seen.size();
      seen.insert(attribute);
      if (seen.size() != before)
        collected.append(attribute);
    }
  }
  return collected;
}

QStringList SubDocNetworkObj::collectAll(QHash<QString, QString>& origins) const {
  if (m_feeders.size() == 1)
    return collect(m_feeders.begin()->second, origins);
  std::vector<Link> all;
  for (const auto& [port, links] : m_feeders)
    all.insert(all.end(), links.begin(), links.end());
  return all.empty() ? QStringList() : collect(all, origins);
}

QStringList SubDocNetworkObj::withCopies(const QString& port, const QStringList& attributes) const {
  const auto at = m_copies.find(port);
  if (at == m_copies.end())
    return attributes;
  QStringList all = attributes;
  QSet<QString> seen(attributes.begin(), attributes.end());
  for (const AttributeCopy& copy : at->second) {
    if (seen.contains(copy.from) && !seen.contains(copy.to)) {
      seen.insert(copy.to);
      all.append(copy.to);
    }
  }
  return all;
}
