#include <transform/core/TransformerCfg.h>
#include <transform/custom/SubDocNetworkObj.h>
#include <transform/custom/SubDocNetworkObjXformer.h>

#include <algorithm>

SubDocNetworkObj::SubDocNetworkObj(Kind kind, int number, const QString& name)
    : m_kind(kind), m_number(number), m_name(name) {}

SubDocNetworkObj::~SubDocNetworkObj() = default;

QString SubDocNetworkObj::name() const {
  return m_kind == Kind::Transformer
             ? static_cast<const SubDocNetworkObjXformer*>(this)->getTransformer()->getIdentifier()
             : m_name;
}

// --- links -------------------------------------------------------------------------------------------------

void SubDocNetworkObj::addAttributeCopy(const QString& port, const QString& from, const QString& to) {
  m_copies[port].push_back({from, to});
  const auto fed = m_consumers.find(port);
  if (fed == m_consumers.end())
    return;
  for (const Link& link : fed->second)
    link.node->m_knowsSources = false;
}

void SubDocNetworkObj::addLink(SubDocNetworkObj& from, const QString& fromPort, SubDocNetworkObj& to,
                               const QString& toPort) {
  from.m_consumers[fromPort].push_back({&to, toPort});
  const auto port = to.m_feeders.try_emplace(toPort).first;
  port->second.push_back({&from, fromPort});
  if (std::next(port) != to.m_feeders.end())
    to.m_knowsSources = false;
  else if (to.m_knowsSources)
    to.m_sources.append(from.sourceAt(fromPort));
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
  m_knowsSources = false;
  for (const auto& [port, links] : feeders) {
    for (const Link& link : links)
      takeOut(link.node->m_consumers, link.port);
  }
  for (const auto& [port, links] : consumers) {
    for (const Link& link : links) {
      takeOut(link.node->m_feeders, link.port);
      link.node->m_knowsSources = false;
    }
  }
}

const SubDocNetworkObj::Sources& SubDocNetworkObj::sources() {
  if (!m_knowsSources) {
    m_knowsSources = true;
    m_sources.clear();
    for (const auto& [port, links] : m_feeders) {
      for (const Link& link : links)
        m_sources.append(link.node->sourceAt(link.port));
    }
  }
  return m_sources;
}

// --- computing ---------------------------------------------------------------------------------------------

SubDocNetworkObj::Outlet& SubDocNetworkObj::outlet(const QString& port) {
  if (m_kind != Kind::Transformer && m_copies.count(port) == 0)
    return m_common;
  PortOutlet& own = m_outlets[port];
  own.port = port;
  m_hasOutlets = true;
  return own;
}

void SubDocNetworkObj::forgetOutlets() {
  for (auto& [port, outlet] : m_outlets)
    outlet.isCurrent = false;
}

void SubDocNetworkObj::fill(Outlet& outlet, MetAttributes& met) {
  outlet.isCurrent = true;
  outlet.attributes = getAttributes(&outlet == &m_common ? QString() : static_cast<PortOutlet&>(outlet).port);
  noteOrigins(outlet.attributes, met);
}

void SubDocNetworkObj::setLeaving(const AttributeSet& attributes) {
  m_hasChanged = !m_isComputed || !(m_common.attributes == attributes);
  m_common.attributes = attributes;
  m_common.isCurrent = true;
  m_isComputed = true;
  if (m_hasOutlets)
    forgetOutlets();
}

void SubDocNetworkObj::noteComputed(bool changed) {
  m_hasChanged = changed;
  m_isComputed = true;
  if (changed)
    forgetOutlets();
}

void SubDocNetworkObj::noteOrigins(const AttributeSet& attributes, MetAttributes& met) const {
  if (met.origins) {
    for (const QString& attribute : attributes.missingIn(met.names))
      met.origins->insert(attribute, name());
  }
  met.names.add(attributes);
}

AttributeSet SubDocNetworkObj::collect(const Source* begin, const Source* end, MetAttributes& met) {
  AttributeSet all;
  for (const Source* source = begin; source != end; ++source) {
    if (!source->outlet->isCurrent)
      source->node->fill(*source->outlet, met);
    all.add(source->outlet->attributes);
  }
  return all;
}

AttributeSet SubDocNetworkObj::collect(MetAttributes& met) {
  const Sources& all = sources();
  return collect(all.begin(), all.end(), met);
}

AttributeSet SubDocNetworkObj::withCopies(const QString& port, const AttributeSet& attributes) const {
  AttributeSet all = attributes;
  const auto at = m_copies.find(port);
  if (at == m_copies.end())
    return all;
  for (const AttributeCopy& copy : at->second) {
    if (all.contains(copy.from))
      all.add(copy.to);
  }
  return all;
}
