#include <transform/core/CarriedReferences.h>
#include <transform/core/FormulaChecks.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/findings/Refusal.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/ParameterLines.h>
#include <translation/graph/ReferencedNames.h>
#include <translation/validation/ValueChecks.h>

namespace messages = orx::messages;

using orx::Rule;
using orx::Severity;

namespace {

constexpr int kMostMissing = 20;  // named in one finding

}  // namespace

ValueChecks::ValueChecks(orx::Findings& diagnostics, const orx::RuleSettings& settings)
    : m_diagnostics(diagnostics), m_settings(settings) {}

QString ValueChecks::nearestName(const QString& name, const QStringList& candidates) {
  Suggestion& known = m_suggestions[name];
  if (known.candidates != candidates)
    known = {candidates, m_spelling.find(name, candidates)};
  return known.nearest;
}

QString ValueChecks::suggestion(const QString& name, const QStringList& candidates) {
  const QString nearest = nearestName(name, candidates);
  return nearest.isEmpty() ? QString() : TransformResString(messages::kSuggestion, {nearest, name});
}

QString ValueChecks::referenceText(const QString& name, const QStringList& names) {
  const QString text = TransformResString(messages::kUnknownReference, name);
  return (text + QLatin1Char(' ') + suggestion(name, names)).trimmed();
}

QString ValueChecks::missingText(const TransformerCfg& cfg, const QString& parameter) {
  QStringList missing;
  bool hasReferences = false;
  cfg.getMissingAttributeReferences(parameter, missing, hasReferences);
  const QStringList arriving = cfg.getInputAttributeUnion();
  QStringList quoted;
  QString suggestions;
  for (const QString& name : missing) {
    if (quoted.size() == kMostMissing) {
      quoted.append(QStringLiteral("\u2026"));
      break;
    }
    quoted.append(QLatin1Char('\'') + name + QLatin1Char('\''));
    const QString suggested = suggestion(name, arriving);
    if (!suggested.isEmpty())
      suggestions += QLatin1String(suggestions.isEmpty() ? ". " : " ") + suggested;
  }
  return TransformResString(messages::kMissingAttribute, quoted.join(QLatin1Char(' '))) + suggestions;
}

QString ValueChecks::shownName(const TransformerCfg& cfg, const QString& parameter) {
  const QString prompt = cfg.getParameterPrompt(parameter);
  return (prompt.isEmpty() ? parameter : prompt) + QLatin1String(": ");
}

void ValueChecks::check(const Node& node, const Knows& knows, const QStringList& names) {
  LooseReferences loose = looseReferences(node, knows);
  reportRefusals(node, loose, names);
  reportReferences(node, loose, names);
}

ValueChecks::LooseReferences ValueChecks::looseReferences(const Node& node, const Knows& knows) {
  LooseReferences loose;
  for (const QString& parameter : node.cfg.getParameters()) {
    const QString value = node.cfg.getParameterValue(parameter);
    if (!value.contains(QLatin1Char('$')))
      continue;
    // A custom transformer's own parameters have other macros, and are meant only where the type says so.
    const TransformParamCfg* record = node.cfg.getParameterByMacroName(parameter);
    const bool meansOwn =
        !isCustomTransformer(&node.cfg) || (record && record->getFlag(kGUITypeInstanceMacros));
    QStringList unknown;
    for (const QString& name : ReferencedNames::inValue(value)) {
      const bool isOwn =
          name == kIdentifierParameter || name == kEncodedNameToken || node.cfg.getParameterByMacroName(name);
      if (!knows(name) && !(meansOwn && isOwn))
        unknown.append(name);
    }
    if (!unknown.isEmpty())
      loose.insert(parameter, unknown);
  }
  return loose;
}

bool ValueChecks::standsForReferences(Rule rule) const {
  const std::optional<Severity> refusal = m_settings.severity(rule);
  return refusal && *refusal <= m_settings.severity(Rule::UnknownReference).value_or(Severity::Hint);
}

void ValueChecks::reportRefusals(const Node& node, LooseReferences& loose, const QStringList& names) {
  // Tokens of custom transformers are macros of what stands around them.
  const ExpandReferences expand = (isCustomTransformer(&node.cfg) ? carried_references::knownAround(node.cfg)
                                                                  : carried_references::knownWithin(node.cfg))
                                      .expand;
  for (const QString& parameter : node.cfg.getParameters()) {
    QString text;
    const orx::RefusalListener listener;
    const bool isValid = node.cfg.validateParameter(parameter, text);
    orx::Refusal refusal = listener.refusal();
    // What is on this machine says nothing of the formulas in the value.
    const bool isOfMachine =
        !isValid && (refusal.rule == Rule::MissingFile || refusal.rule == Rule::UnknownConnection);
    QString formulaText;
    if ((isValid || isOfMachine) &&
        !checkFormulas(*node.cfg.getParameterByMacroName(parameter), node.cfg.getParameterValue(parameter),
                       formulaText, expand)) {
      text = formulaText;
      refusal = listener.refusal();
    } else if (isValid || (isOfMachine && !node.isUsedHere)) {
      continue;
    }
    if (refusal.rule == Rule::MissingAttribute) {
      if (!node.knowsWhatArrives)
        continue;
      text = missingText(node.cfg, parameter);
    } else if (text.isEmpty()) {
      orx::refuse(text, {Rule::InvalidValue, messages::kInvalidValue});
      refusal = listener.refusal();
    }
    const bool tellsReferences = !loose.isEmpty() && standsForReferences(refusal.rule);
    for (const QString& name : tellsReferences ? ReferencedNames::inValue(text) : QStringList()) {
      // What the transformer itself says about the value need not be said again.
      if (loose[parameter].removeOne(name))
        text += QLatin1Char(' ') +
                (refusal.rule == Rule::InvalidValue ? suggestion(name, names) : referenceText(name, names));
    }
    const QString before = refusal.namesParameter ? QString() : shownName(node.cfg, parameter);
    m_diagnostics.reportParameter(refusal.rule, refusal.message, node.lines.of(parameter), node.title,
                                  parameter, before + text.trimmed());
  }
}

void ValueChecks::reportReferences(const Node& node, LooseReferences& loose, const QStringList& names) {
  if (loose.isEmpty())
    return;
  for (const QString& parameter : node.cfg.getParameters()) {
    for (const QString& name : loose.take(parameter)) {
      m_diagnostics.reportParameter(Rule::UnknownReference, messages::kUnknownReference,
                                    node.lines.of(parameter), node.title, parameter,
                                    shownName(node.cfg, parameter) + referenceText(name, names));
    }
  }
}
