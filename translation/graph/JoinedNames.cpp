#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
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
  m_places.emplace(name, Place{network, line});
  m_lengths.insert(name.size());
}

JoinedNames::Holder JoinedNames::findHolder(const QString& name) {
  Holder holder;
  eachBeginning(name, m_lengths, [&](int length) {
    const auto found = holder.name.isEmpty() ? m_places.find(name.left(length)) : m_places.end();
    if (found != m_places.end() && holds(found->second.network, name.mid(length + 1)))
      holder = {found->first, found->second.line};
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
        clashes.push_back({{found->first, found->second.line}, other, joined});
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

JoinedNames::Inside JoinedNames::read(CompoundTransformerNetwork& network) const {
  Inside inside;
  network.forceLoad();
  // As the definition gives them out: what is fixed comes first.
  FlowNames flows;
  QStringList wanted;
  for (const QString& port : network.getInputs() + network.getOutputs() + network.getLoops())
    flows.claim(port);
  if (!network.getLoops().isEmpty())
    flows.claim(network.getLoopOutput());
  for (const SubDocNetworkObj* node : network.nodes()) {
    const auto* transformer = dynamic_cast<const SubDocNetworkObjXformer*>(node);
    if (!transformer)
      continue;
    const QString name = transformer->name();
    const QString beginning = name + QLatin1Char('_');
    const TransformerCfg& cfg = *transformer->getTransformer();
    CompoundTransformerNetwork* inner = networkOf(&cfg);
    if (inner) {
      inside.customTransformers.emplace(name, inner);
      inside.lengths.insert(name.size());
    }
    if (m_kind == Kind::Node)
      inside.names.insert(name);
    if (m_kind == Kind::Macro && inner && !inner->blockedLooping()) {
      for (const QString& parameter : cfg.getParameters())
        inside.names.insert(beginning + parameter);
    }
    if (m_kind != Kind::Flow)
      continue;
    for (const QString& port : inner ? inner->getInputs() + inner->getOutputs() : QStringList())
      inside.names.insert(flows.claim(beginning + port));
    for (const auto& [port, links] : transformer->consumers()) {
      if (!links.empty())
        wanted.append(outputFlowName(cfg, name, port));
    }
  }
  for (const QString& flow : qAsConst(wanted))
    inside.names.insert(flows.claim(flow));
  return inside;
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
