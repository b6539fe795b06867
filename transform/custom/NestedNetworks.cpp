#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/findings/Refusal.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>

#include <QHash>
#include <QSet>

#include <algorithm>

namespace messages = orx::messages;

bool isCustomTransformer(const TransformerCfg* cfg) {
  return dynamic_cast<const CompoundTransformerCfg*>(cfg) != nullptr;
}

CompoundTransformerNetwork* networkOf(const TransformerCfg* cfg) {
  const auto* custom = dynamic_cast<const CompoundTransformerCfg*>(cfg);
  return custom ? custom->getNetwork() : nullptr;
}

QString nameWithFile(const TransformerCfg& cfg) {
  const auto* linked = dynamic_cast<const ExternalTransformerNetwork*>(networkOf(&cfg));
  return linked ? cfg.getName() + QLatin1String(" (") + linked->getFileName() + QLatin1Char(')')
                : cfg.getName();
}

std::vector<CompoundTransformerNetwork*> nestedNetworks(CompoundTransformerNetwork& root) {
  return nestedNetworks(std::vector<CompoundTransformerNetwork*>{&root});
}

std::vector<CompoundTransformerNetwork*> nestedNetworks(
    const std::vector<CompoundTransformerNetwork*>& roots) {
  std::vector<CompoundTransformerNetwork*> found;
  QSet<const CompoundTransformerNetwork*> seen;
  const auto enter = [&](CompoundTransformerNetwork* network) {
    if (!network || seen.contains(network))
      return;
    seen.insert(network);
    found.push_back(network);
  };
  for (CompoundTransformerNetwork* root : roots)
    enter(root);
  for (std::size_t at = 0; at < found.size(); ++at) {
    found[at]->forceLoad();
    for (const TransformerCfg* cfg : found[at]->customTransformers())
      enter(networkOf(cfg));
  }
  return found;
}

namespace {

// A walk over the nested networks of one network that can be interrupted.
struct OpenNetwork {
  CompoundTransformerNetwork* network;
  std::vector<CompoundTransformerNetwork*> inner;
  std::size_t next = 0;
};

OpenNetwork openNetwork(CompoundTransformerNetwork& network) {
  OpenNetwork opened{&network, {}};
  network.forceLoad();
  QSet<const CompoundTransformerNetwork*> seen;
  for (const TransformerCfg* cfg : network.customTransformers()) {
    CompoundTransformerNetwork* inner = networkOf(cfg);
    if (!inner || seen.contains(inner))
      continue;
    seen.insert(inner);
    opened.inner.push_back(inner);
  }
  return opened;
}

QString circle(const std::vector<OpenNetwork>& open, const CompoundTransformerNetwork* repeated) {
  QStringList names;
  bool inside = false;
  for (const OpenNetwork& level : open) {
    inside = inside || level.network == repeated;
    if (inside)
      names.append(level.network->getName());
  }
  names.append(repeated->getName());
  return names.join(QLatin1String(" > "));
}

QString nestingFault(long message, const QStringList& arguments) {
  QString fault;
  orx::refuse(fault, {orx::Rule::Nesting, message}, arguments);
  return fault;
}

}  // namespace

QString findNameFault(const QString& name) {
  // It is part of the prefix macro, and a field of the definition's opening line.
  const bool fits = TextPlaces::refuse(TextPlace::MacroName, makePrefixMacro(name)) == 0 &&
                    TextPlaces::refuse(TextPlace::HeaderField, name) == 0 &&
                    TextPlaces::refuse(TextPlace::Word, name) == 0;
  return fits ? QString() : nestingFault(messages::kNoMacroName, {name});
}

QString findNestingFault(CompoundTransformerNetwork& root) {
  constexpr int kOpen = 0;
  QHash<const CompoundTransformerNetwork*, int> depths{{&root, kOpen}};  // kOpen while it is being worked out
  std::vector<OpenNetwork> open{openNetwork(root)};
  while (!open.empty()) {
    OpenNetwork& level = open.back();
    if (level.next == level.inner.size()) {
      int depth = 1;
      for (const CompoundTransformerNetwork* inner : level.inner)
        depth = std::max(depth, depths.value(inner) + 1);
      if (depth > CompoundTransformerNetwork::kDeepestNesting) {
        return nestingFault(messages::kNestedTooDeep,
                            {root.getName(), QString::number(CompoundTransformerNetwork::kDeepestNesting)});
      }
      depths.insert(level.network, depth);
      open.pop_back();
      continue;
    }
    CompoundTransformerNetwork* inner = level.inner[level.next++];
    const auto known = depths.constFind(inner);
    if (known == depths.constEnd()) {
      depths.insert(inner, kOpen);
      open.push_back(openNetwork(*inner));
    } else if (*known == kOpen) {
      return nestingFault(messages::kContainsItself, {inner->getName(), circle(open, inner)});
    }
  }
  return QString();
}

// An instance sets the prefix macro for everything behind it: what the outer one still has to say would be
// said in the name of the inner one.
QString findPrefixFault(CompoundTransformerNetwork& root) {
  const std::vector<CompoundTransformerNetwork*> networks = nestedNetworks(root);
  QHash<QString, int> users;
  for (const CompoundTransformerNetwork* network : networks)
    ++users[makePrefixMacro(network->getName())];
  if (users.size() == static_cast<int>(networks.size()))
    return QString();
  for (CompoundTransformerNetwork* outer : networks) {
    const QString prefix = makePrefixMacro(outer->getName());
    if (users.value(prefix) == 1)
      continue;
    for (const CompoundTransformerNetwork* inner : nestedNetworks(*outer)) {
      if (inner != outer && makePrefixMacro(inner->getName()) == prefix) {
        return nestingFault(messages::kSamePrefix, {outer->getName(), inner->getName(), prefix});
      }
    }
  }
  return QString();
}
