#include <platform/qorxcore/qorxcore.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/text/MappingFileKeywords.h>
#include <translation/generation/CopiedFlows.h>
#include <translation/generation/FlowNames.h>
#include <translation/graph/JoinedNames.h>

namespace {

// Calls with the length of each name that `text` begins with, "_" behind.
template <class Call>
void eachBeginning(const QString& text, const std::set<int>& lengths, const Call& call) {
  for (const int length : lengths) {
    if (length + 1 > text.size())
      return;
    if (text.at(length) == QLatin1Char('_'))
      call(length);
  }
}

}  // namespace

void JoinedNames::add(const QString& name, int line, CompoundTransformerNetwork* network) {
  const QString key = spelt(name);
  m_places.emplace(key, Place{network, name, line});
  m_lengths.insert(key.size());
}

QString JoinedNames::spelt(const QString& name) const {
  return m_kind == Kind::Factory || m_kind == Kind::Beginning ? QORXWwjdDecode(name) : name;
}

JoinedNames::Holder JoinedNames::findHolder(const QString& name) {
  Holder holder;
  eachBeginning(name, m_lengths, [&](int length) {
    const auto found = holder.name.isEmpty() ? m_places.find(name.left(length)) : m_places.end();
    if (found != m_places.end() && holds(found->second.network, name.mid(length + 1)))
      holder = {found->second.name, found->second.line};
  });
  return holder;
}

std::vector<JoinedNames::Clash> JoinedNames::findClashes() {
  std::vector<Clash> clashes;
  for (const auto& [name, place] : m_places) {
    eachBeginning(name, m_lengths, [&, &other = name, &otherPlace = place](int length) {
      const auto found = m_places.find(other.left(length));
      if (found == m_places.end())
        return;
      const QString before = found->first + QLatin1Char('_');
      const QString joined =
          meet({found->second.network, otherPlace.network, other.mid(length + 1) + QLatin1Char('_'), before});
      if (!joined.isEmpty())
        clashes.push_back({{found->second.name, found->second.line}, otherPlace.name, joined});
    });
  }
  return clashes;
}

const JoinedNames::Inside& JoinedNames::inside(CompoundTransformerNetwork* network) {
  std::shared_ptr<const Inside>& known = m_insides[network];
  if (!known)
    known = std::make_shared<Inside>(read(*network));
  return *known;
}

JoinedNames::Inside JoinedNames::read(CompoundTransformerNetwork& network) {
  Inside inside;
  network.forceLoad();
  for (const SubDocNetworkObj* node : network.nodes()) {
    const auto* transformer = dynamic_cast<const SubDocNetworkObjXformer*>(node);
    if (!transformer) {
      if (node->kind() != SubDocNetworkObj::Kind::Input)
        addCollector(node->name() + kCollectorName, inside);
      continue;
    }
    const TransformerCfg& cfg = *transformer->getTransformer();
    if (CompoundTransformerNetwork* inner = networkOf(&cfg)) {
      const QString key = spelt(transformer->name());
      inside.customTransformers.emplace(key, inner);
      inside.lengths.insert(key.size());
    }
    addNames(cfg, transformer->name(), inside);
  }
  if (m_kind == Kind::Flow)
    addFlows(network, inside);
  return inside;
}

void JoinedNames::addCollector(const QString& name, Inside& inside) const {
  if (m_kind == Kind::Factory)
    inside.names.insert(spelt(name));
  for (const QString& beginning :
       m_kind == Kind::Beginning ? StatementNames::beginnings(name) : QStringList())
    inside.names.insert(beginning);
}

void JoinedNames::addNames(const TransformerCfg& cfg, const QString& name, Inside& inside) {
  QStringList names;
  CompoundTransformerNetwork* inner = networkOf(&cfg);
  if (m_kind == Kind::Factory)
    names = m_statements.factories(cfg, name);
  else if (m_kind == Kind::Beginning)
    names = StatementNames::claimedBeginnings(cfg, name) + m_statements.beginnings(cfg, name);
  else if (m_kind == Kind::Macro && inner && !inner->blockedLooping())
    names = cfg.getParameters();
  for (QString& parameter : names) {
    if (m_kind == Kind::Macro)
      parameter.prepend(name + QLatin1Char('_'));
  }
  inside.names.insert(names.begin(), names.end());
}

// As the definition gives them out: what is fixed comes first.
void JoinedNames::addFlows(CompoundTransformerNetwork& network, Inside& inside) {
  FlowNames flows;
  for (const QString& port : network.getInputs() + network.getOutputs() + network.getLoops())
    flows.claim(port);
  if (!network.getLoops().isEmpty())
    flows.claim(network.getLoopOutput());
  const auto eachTransformer = [&](const auto& call) {
    for (const SubDocNetworkObj* node : network.nodes()) {
      if (const auto* transformer = dynamic_cast<const SubDocNetworkObjXformer*>(node))
        call(*transformer, *transformer->getTransformer());
    }
  };
  eachTransformer([&](const SubDocNetworkObjXformer& node, const TransformerCfg& cfg) {
    for (const QString& name : flows.fixedNames(cfg, node.name()))
      inside.names.insert(flows.claim(name));
  });
  QHash<const SubDocNetworkObj*, QHash<QString, QString>> named;
  eachTransformer([&](const SubDocNetworkObjXformer& node, const TransformerCfg& cfg) {
    for (const auto& [port, links] : node.consumers()) {
      if (!links.empty())
        named[&node].insert(port,
                            *inside.names.insert(flows.claim(outputFlowName(cfg, node.name(), port))).first);
    }
  });
  const auto flowAt = [&](const SubDocNetworkObj& node, const QString& port) {
    return node.kind() == SubDocNetworkObj::Kind::Transformer ? named.value(&node).value(port) : node.name();
  };
  CopiedFlows copied;
  addCopiedFlows(network, flowAt, copied);
  copied.nameRoutes(flows);
  for (const SubDocNetworkObj* node : network.nodes()) {
    for (const auto& [port, links] : node->consumers()) {
      for (const CopiedFlows::Route& route : copied.routes(flowAt(*node, port)))
        inside.names.insert(route.flow);
    }
  }
}

bool JoinedNames::holds(CompoundTransformerNetwork* network, const QString& name) {
  using Open = QPair<CompoundTransformerNetwork*, QString>;
  std::vector<Open> open{{network, name}};
  QSet<Open> seen{open.front()};
  while (!open.empty()) {
    const Open place = open.back();
    open.pop_back();
    const Inside& names = inside(place.first);
    if (names.names.count(place.second) != 0)
      return true;
    eachBeginning(place.second, names.lengths, [&](int length) {
      const auto inner = names.customTransformers.find(place.second.left(length));
      if (inner == names.customTransformers.end())
        return;
      const Open next(inner->second, place.second.mid(length + 1));
      if (!seen.contains(next)) {
        seen.insert(next);
        open.push_back(next);
      }
    });
  }
  return false;
}

QString JoinedNames::meet(const Meeting& start) {
  QSet<QString> seen;
  std::vector<Meeting> open;
  const auto enter = [&](const Meeting& meeting) {
    const QString key = QStringLiteral("%1 %2 %3")
                            .arg(reinterpret_cast<quintptr>(meeting.longer))
                            .arg(reinterpret_cast<quintptr>(meeting.shorter))
                            .arg(meeting.ahead);
    if (!seen.contains(key) && !m_apart.contains(key)) {
      seen.insert(key);
      open.push_back(meeting);
    }
  };
  enter(start);
  while (!open.empty()) {
    const Meeting at = open.back();
    open.pop_back();
    const Inside& longer = inside(at.longer);
    for (auto name = longer.names.lower_bound(at.ahead);
         name != longer.names.end() && name->startsWith(at.ahead); ++name) {
      if (holds(at.shorter, name->mid(at.ahead.size())))
        return at.before + *name;
    }
    // The nodes inside whose names end in what is ahead, and those that reach further.
    eachBeginning(at.ahead, longer.lengths, [&](int length) {
      const auto inner = longer.customTransformers.find(at.ahead.left(length));
      if (inner != longer.customTransformers.end())
        enter({inner->second, at.shorter, at.ahead.mid(length + 1), at.before + at.ahead.left(length + 1)});
    });
    for (auto inner = longer.customTransformers.lower_bound(at.ahead);
         inner != longer.customTransformers.end() && inner->first.startsWith(at.ahead); ++inner) {
      enter({at.shorter, inner->second, inner->first.mid(at.ahead.size()) + QLatin1Char('_'),
             at.before + at.ahead});
    }
  }
  m_apart += seen;
  return QString();
}
