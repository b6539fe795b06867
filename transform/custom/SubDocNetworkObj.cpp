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

void SubDocNetworkObj::addAttributeCopy(const QString& port, SubDocNetworkObj& target,
                                        const QString& targetPort, const QString& from, const QString& to) {
  m_copies[{port, &target, targetPort}].add(from, to);
  target.m_knowsSources = false;
}

const AttributeCopies& SubDocNetworkObj::attributeCopies(const QString& port, const SubDocNetworkObj& target,
                                                         const QString& targetPort) const {
  static const AttributeCopies none;
  const auto at = m_copies.empty() ? m_copies.end() : m_copies.find({port, &target, targetPort});
  return at == m_copies.end() ? none : at->second;
}

void SubDocNetworkObj::addLink(SubDocNetworkObj& from, const QString& fromPort, SubDocNetworkObj& to,
                               const QString& toPort) {
  from.m_consumers[fromPort].push_back({&to, toPort});
  const auto port = to.m_feeders.try_emplace(toPort).first;
  port->second.push_back({&from, fromPort});
  if (std::next(port) != to.m_feeders.end())
    to.m_knowsSources = false;
  else if (to.m_knowsSources)
    to.m_sources.append(from.sourceAt(fromPort, to, toPort));
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
  m_copies.clear();
  for (const auto& [port, links] : feeders) {
    for (const Link& link : links)
      link.node->m_copies.erase({link.port, this, port});
  }
}

const SubDocNetworkObj::Sources& SubDocNetworkObj::sources() {
  if (!m_knowsSources) {
    m_knowsSources = true;
    m_sources.clear();
    for (const auto& [port, links] : m_feeders) {
      for (const Link& link : links)
        m_sources.append(link.node->sourceAt(link.port, *this, port));
    }
  }
  return m_sources;
}

// --- computing ---------------------------------------------------------------------------------------------

SubDocNetworkObj::Outlet& SubDocNetworkObj::outlet(const LinkEnds& ends) {
  const QString& port = std::get<0>(ends);
  const auto copies = m_copies.empty() ? m_copies.end() : m_copies.find(ends);
  const bool isCopying = copies != m_copies.end();
  if (m_kind != Kind::Transformer && !isCopying)
    return m_common;
  PortOutlet& own = m_outlets[isCopying ? ends : LinkEnds{port, nullptr, QString()}];
  own.port = port;
  own.copies = isCopying ? &copies->second : nullptr;
  m_hasOutlets = true;
  return own;
}

void SubDocNetworkObj::forgetOutlets() {
  for (auto& [port, outlet] : m_outlets)
    outlet.isCurrent = false;
}

void SubDocNetworkObj::fill(Outlet& outlet, MetAttributes& met) {
  outlet.isCurrent = true;
  if (&outlet == &m_common) {
    outlet.attributes = getAttributes(QString());
  } else {
    const auto& own = static_cast<const PortOutlet&>(outlet);
    const AttributeSet attributes = getAttributes(own.port);
    outlet.attributes = own.copies ? own.copies->applied(attributes) : attributes;
  }
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
