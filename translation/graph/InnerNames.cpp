#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MessageStrings.h>
#include <translation/graph/InnerNames.h>

#include <vector>

namespace {

// Calls for each of the custom transformers that `name` begins with, "_" behind, and for what is left.
template <class Call>
void eachBeginning(const QString& name, const std::set<int>& lengths,
                   const QHash<QString, InnerNames::Holder>& customTransformers, const Call& call) {
  for (const int length : lengths) {
    if (length + 1 >= name.size())
      return;
    if (name.at(length) != QLatin1Char('_'))
      continue;
    const auto found = customTransformers.constFind(name.left(length));
    if (found != customTransformers.constEnd())
      call(*found, name.left(length), name.mid(length + 1));
  }
}

constexpr long kReplacesParameter = 370875;

}  // namespace

QHash<QString, QString> InnerNames::findReplacedParameters(
    const QString& name, const TransformerCfg& cfg, const std::function<bool(const QString&)>& isAround) {
  QHash<QString, QString> messages;
  const CompoundTransformerNetwork* network = networkOf(&cfg);
  // A loop hands the values over without macros.
  if (!network || network->blockedLooping())
    return messages;
  for (const QString& parameter : cfg.getParameters()) {
    const QString around = name + QLatin1Char('_') + parameter;
    if (isAround(around) && MFBuffer::withOrdinaryMacros(cfg.getParameterValue(parameter)) !=
                                kMacroOpen + around + QLatin1Char(')'))
      messages.insert(parameter, TransformResString(kReplacesParameter, around));
  }
  return messages;
}

void InnerNames::add(const QString& name, int line, const TransformerCfg& cfg) {
  m_names.insert(name);
  const CompoundTransformerNetwork* network = networkOf(&cfg);
  if (!network)
    return;
  m_customTransformers.insert(name, {network, line});
  m_lengths.insert(name.size());
}

std::pair<QString, int> InnerNames::findHolder(const QString& name) {
  std::pair<QString, int> holder;
  eachBeginning(name, m_lengths, m_customTransformers,
                [&](const Holder& custom, const QString& outer, const QString& rest) {
                  if (holder.first.isEmpty() && holds(custom.network, rest))
                    holder = {outer, custom.line};
                });
  return holder;
}

const InnerNames& InnerNames::inside(const CompoundTransformerNetwork* network) {
  std::shared_ptr<InnerNames>& names = m_insides[network];
  if (!names) {
    names = std::make_shared<InnerNames>();
    for (const TransformerCfg* cfg : network->getTransformers())
      names->add(cfg->getIdentifier(), 0, *cfg);
  }
  return *names;
}

bool InnerNames::holds(const CompoundTransformerNetwork* network, const QString& rest) {
  using Place = QPair<const CompoundTransformerNetwork*, QString>;
  std::vector<Place> open{{network, rest}};
  QSet<Place> seen{open.front()};
  while (!open.empty()) {
    const Place place = open.back();
    open.pop_back();
    const InnerNames& names = inside(place.first);
    if (names.m_names.contains(place.second))
      return true;
    eachBeginning(place.second, names.m_lengths, names.m_customTransformers,
                  [&](const Holder& inner, const QString&, const QString& further) {
                    const Place next(inner.network, further);
                    if (seen.contains(next))
                      return;
                    seen.insert(next);
                    open.push_back(next);
                  });
  }
  return false;
}
