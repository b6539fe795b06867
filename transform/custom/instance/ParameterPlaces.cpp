#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/CarriedReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/Keywords.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/instance/ParameterPlaces.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>
#include <typeinfo>

namespace messages = orx::messages;

namespace {

bool isOneCell(const QString& value, QChar separator) {
  return value.isEmpty() || QORXSdfStringToList(value, separator) == QStringList(value);
}

}  // namespace

ParameterPlaces::ParameterPlaces(CompoundTransformerNetwork& network) : m_words(nestedNetworks(network)) {
  const std::vector<CompoundTransformerNetwork*> networks = nestedNetworks(network);
  UsesByNetwork uses;
  for (const CompoundTransformerNetwork* nested : networks) {
    Uses& own = uses[nested];
    for (const TransformerCfg* cfg : nested->getTransformers()) {
      if (!isCustomTransformer(cfg))
        addStatements(*cfg, *nested, own);
    }
    m_hasFragment = m_hasFragment ||
                    std::any_of(own.begin(), own.end(), [](const Use& use) { return use.places & Fragment; });
  }
  // Innermost first, so that mostly one round suffices.
  for (bool isChanged = true; isChanged;) {
    isChanged = false;
    for (auto nested = networks.rbegin(); nested != networks.rend(); ++nested)
      isChanged = addFromWithin(**nested, uses) || isChanged;
  }
  m_uses = uses.value(&network);
}

// Notes the use for the parameters of the network that the value refers to; whether that is new.
bool ParameterPlaces::add(const QString& value, bool isReadDecoded, const CompoundTransformerNetwork& network,
                          const Use& use, Uses& uses) {
  if (!value.contains(QLatin1Char('$')))
    return false;
  bool isNew = false;
  anyParameterReference(MFBuffer::withOrdinaryMacros(value), [&](const QString& name) {
    if (network.hasParameter(name)) {
      const bool isReencoded = network.getParameterInfo(name)->type.valueIsEncoded() != isReadDecoded;
      const unsigned places = use.places | (isReencoded ? Reencoded : 0u);
      Use& known = uses[name];
      const QSet<QChar> separators = known.separators + use.separators;
      isNew = isNew || (known.places | places) != known.places || separators != known.separators;
      known = {known.places | places, separators};
    }
    return false;
  });
  return isNew;
}

// A part that holds tokens of the transformer's own parameters also brings what these refer to.
void ParameterPlaces::addPart(const TransformerCfg& cfg, const GUIType& type, const QString& part,
                              const CompoundTransformerNetwork& network, Use use, Uses& uses) {
  if (ExpressionWriter::needsWrapping(type, part))
    use.places |= Expression;
  const bool isDecoded = carried_references::isReadDecoded(type, part);
  add(part, isDecoded, network, use, uses);
  QStringList own{part};
  QSet<QString> seen;
  while (!own.isEmpty()) {
    anyParameterReference(MFBuffer::withOrdinaryMacros(own.takeLast()), [&](const QString& name) {
      const TransformParamCfg* record = cfg.getParameterByMacroName(name);
      if (record && !network.hasParameter(name) && !seen.contains(name)) {
        seen.insert(name);
        own.append(record->getValue());
        add(record->getValue(), isDecoded, network, use, uses);
      }
      return false;
    });
  }
}

void ParameterPlaces::addStatements(const TransformerCfg& cfg, const CompoundTransformerNetwork& network,
                                    Uses& uses) {
  for (const QString& parameter : cfg.getParameters()) {
    const TransformParamCfg* record = cfg.getParameterByMacroName(parameter);
    const QString& value = record->getValue();
    if (!value.contains(QLatin1Char('$')) || parameter == kIdentifierParameter)
      continue;
    Use use;
    if (record->choices().hasLookup())
      use.places = ORX_isListBoxType(*record) ? ListFragment : ChoiceFragment;
    // A class of its own writes a table cell by cell.
    if (record->isTable() && typeid(cfg) == typeid(TransformerCfg))
      use = {Cell, {record->members().separator()}};
    forEachPart(*record, value, [&](const GUIType& type, const QString& part) {
      addPart(cfg, type, part, network, use, uses);
    });
  }
}

// A parameter of a custom transformer further in has its places there: so have those that its value refers
// to.
bool ParameterPlaces::addFromWithin(const CompoundTransformerNetwork& network, UsesByNetwork& uses) {
  bool isNew = false;
  for (const TransformerCfg* cfg : network.getTransformers()) {
    const CompoundTransformerNetwork* inner = networkOf(cfg);
    const Uses within = inner ? uses.value(inner) : Uses();
    for (const QString& parameter : inner ? cfg->getParameters() : QStringList()) {
      isNew = add(cfg->getParameterValue(parameter), cfg->getParameterGUIType(parameter).valueIsEncoded(),
                  network, within.value(parameter), uses[&network]) ||
              isNew;
    }
  }
  return isNew;
}

bool ParameterPlaces::fits(const Use& use, const QString& value) {
  using carried_references::fitsExpression;
  return (!(use.places & Expression) || fitsExpression(value)) &&
         (!(use.places & Reencoded) || QORXWwjdDecode(value) == value) &&
         std::all_of(use.separators.begin(), use.separators.end(),
                     [&value](QChar separator) { return isOneCell(value, separator); });
}

long ParameterPlaces::refuse(const QString& parameter, const QString& value) const {
  const Use use = m_uses.value(parameter);
  if ((use.places & ChoiceFragment) && !lookup_checks::fitsFragment(value))
    return messages::kValueInScript;
  if ((use.places & ListFragment) && TextPlaces::refuse(TextPlace::TclBraces, value) != 0)
    return messages::kValueInScript;
  return fits(use, value) ? 0 : messages::kBreaksInside;
}

bool ParameterPlaces::fitsEverywhere(const QString& value) {
  const bool isPlain = std::all_of(value.begin(), value.end(), [](QChar c) {
    return c.isLetterOrNumber() || c == QLatin1Char('_') || c == QLatin1Char('.') || c == QLatin1Char('-');
  });
  if (isPlain)
    return true;
  static const Use all{Expression | Reencoded | Cell,
                       {QLatin1Char(','), QLatin1Char(';'), QLatin1Char(' '), QLatin1Char('|')}};
  return !value.contains(QLatin1Char('@')) && lookup_checks::fitsFragment(value) && fits(all, value);
}
