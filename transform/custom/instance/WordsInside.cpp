#include <transform/core/AttributeReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/instance/WordsInside.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>

namespace {

constexpr int kMostWords = 256;
constexpr int kLongestWord = 1024;
constexpr int kMostRounds = 8;

bool refersTo(const QString& text, const CompoundTransformerNetwork& network) {
  return anyParameterReference(text, [&](const QString& name) { return network.hasParameter(name); });
}

// The text with the values of the transformer's own parameters in the places of references to them, but for
// names that mean a parameter of `around`.
QString withOwnValues(QString text, const TransformerCfg& cfg, const CompoundTransformerNetwork* around) {
  for (int round = 0; round < kMostRounds && text.size() <= kLongestWord; ++round) {
    const QString before = text;
    text = replaceParameterReferences(text, [&](const QString& name, QString& value) {
      const bool isOwn = cfg.hasParameter(name) && !(around && around->hasParameter(name));
      value = isOwn ? MFBuffer::withOrdinaryMacros(cfg.getParameterValue(name)) : QString();
      return isOwn;
    });
    if (text == before)
      break;
  }
  return text;
}

}  // namespace

WordsInside::WordsInside(const std::vector<CompoundTransformerNetwork*>& networks) {
  WordsByNetwork words;
  for (const CompoundTransformerNetwork* network : networks) {
    for (const TransformerCfg* cfg : network->getTransformers()) {
      if (!isCustomTransformer(cfg))
        addValues(*cfg, *network, words[network]);
    }
  }
  // Innermost first, so that mostly one round suffices.
  for (bool isChanged = true; isChanged;) {
    isChanged = false;
    for (auto network = networks.rbegin(); network != networks.rend(); ++network)
      isChanged = addFromWithin(**network, words) || isChanged;
  }
  m_words = words.value(networks.front());
}

bool WordsInside::add(const QString& text, const CompoundTransformerNetwork& network, Words& words) {
  if (words.areTooMany || words.texts.contains(text) || !refersTo(text, network))
    return false;
  words.areTooMany = text.size() > kLongestWord || words.texts.size() == kMostWords;
  if (!words.areTooMany)
    words.texts.insert(text);
  return true;
}

void WordsInside::addValues(const TransformerCfg& cfg, const CompoundTransformerNetwork& network,
                            Words& words) {
  for (const QString& parameter : cfg.getParameters()) {
    const TransformParamCfg& record = *cfg.getParameterByMacroName(parameter);
    const QString& value = record.getValue();
    if (!value.contains(QLatin1Char('$')) || !MFBuffer::closesDeferredMacros(value))
      continue;
    forEachPart(record, MFBuffer::withOrdinaryMacros(value), [&](const GUIType& type, const QString& part) {
      if (!type.getType().startsWith(kExpressionType) && !ExpressionWriter::needsWrapping(type, part))
        add(withOwnValues(part, cfg, &network), network, words);
    });
  }
}

// A word in which a parameter of a custom transformer further in stands holds what its instance gives it.
bool WordsInside::addFromWithin(const CompoundTransformerNetwork& network, WordsByNetwork& words) {
  bool isNew = false;
  for (const TransformerCfg* cfg : network.getTransformers()) {
    const CompoundTransformerNetwork* inner = networkOf(cfg);
    const Words within = inner ? words.value(inner) : Words();
    Words& own = words[&network];
    if (within.areTooMany && !own.areTooMany) {
      own.areTooMany = true;
      isNew = true;
    }
    for (const QString& word : within.texts) {
      const QString given = replaceParameterReferences(word, [&](const QString& name, QString& value) {
        const TransformParamCfg* record = cfg->getParameterByMacroName(name);
        if (!record || !inner->hasParameter(name))
          return false;
        const QString stored = MFBuffer::withOrdinaryMacros(record->getValue());
        value = record->getFlag(kGUITypeInstanceMacros) ? withOwnValues(stored, *cfg, nullptr) : stored;
        return true;
      });
      isNew = add(given, network, own) || isNew;
    }
  }
  return isNew;
}

bool WordsInside::bringCall(const QString& parameter, const ExpandReferences& expand) const {
  QString value = kMacroOpen + parameter + QLatin1Char(')');
  const QString reference = value;
  if (m_words.areTooMany && expand(value) && value.contains(QLatin1Char('@')))
    return true;
  return std::any_of(m_words.texts.begin(), m_words.texts.end(), [&](const QString& word) {
    QString expanded = word;
    return word.contains(reference) && expand(expanded) && TextPlaces::holdsCall(expanded) &&
           !TextPlaces::holdsCall(word);
  });
}
