#include <transform/core/FormulaChecks.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/ParameterLines.h>
#include <translation/graph/ReferencedNames.h>
#include <translation/validation/ValueChecks.h>

using orx::Rule;
using orx::Severity;

namespace {

constexpr long kSuggestion = 370866;
constexpr int kMostMissing = 20;  // named in one finding
const QLatin1String kInstanceNames("XFORMER_NAME");

}  // namespace

ValueChecks::ValueChecks(orx::Findings& diagnostics, const orx::RuleSettings& settings)
    : m_diagnostics(diagnostics), m_settings(settings) {
  const QChar mark(0xfffc);
  for (const Rule rule :
       {Rule::MissingAttribute, Rule::MissingValue, Rule::MissingFile, Rule::UnknownConnection}) {
    const QString text = TransformResString(orx::ruleRow(rule).message, QString(mark));
    const int place = text.indexOf(mark);
    if (place >= 0)
      m_forms.push_back({rule, text.left(place), text.mid(place + 1)});
  }
}

Rule ValueChecks::ruleOf(const QString& message) const {
  for (const Form& form : m_forms) {
    if (message.startsWith(form.before) && message.endsWith(form.behind))
      return form.rule;
  }
  return Rule::InvalidValue;
}

QString ValueChecks::nearestName(const QString& name, const QStringList& candidates) {
  Suggestion& known = m_suggestions[name];
  if (known.candidates != candidates)
    known = {candidates, m_spelling.find(name, candidates)};
  return known.nearest;
}

QString ValueChecks::suggestion(const QString& name, const QStringList& candidates) {
  const QString nearest = nearestName(name, candidates);
  return nearest.isEmpty() ? QString() : TransformResString(kSuggestion, {nearest, name});
}

QString ValueChecks::referenceText(const QString& name, const QStringList& names) {
  const QString text = TransformResString(orx::ruleRow(Rule::UnknownReference).message, name);
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
  return TransformResString(orx::ruleRow(Rule::MissingAttribute).message, quoted.join(QLatin1Char(' '))) +
         suggestions;
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
      const bool isOwn = name.startsWith(kInstanceNames) || node.cfg.getParameterByMacroName(name);
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
  for (const QString& parameter : node.cfg.getParameters()) {
    QString text;
    if (node.cfg.validateParameter(parameter, text)) {
      text = findFormulaFault(*node.cfg.getParameterByMacroName(parameter),
                              node.cfg.getParameterValue(parameter, UnpackLevel::Resolved));
      if (text.isEmpty())
        continue;
    }
    const Rule rule = ruleOf(text);
    if (!node.isUsedHere && (rule == Rule::MissingFile || rule == Rule::UnknownConnection))
      continue;
    if (rule == Rule::MissingAttribute) {
      if (!node.knowsWhatArrives)
        continue;
      text = missingText(node.cfg, parameter);
    } else if (text.isEmpty()) {
      text = TransformResString(orx::ruleRow(Rule::InvalidValue).message);
    }
    const bool tellsReferences = !loose.isEmpty() && standsForReferences(rule);
    for (const QString& name : tellsReferences ? ReferencedNames::inValue(text) : QStringList()) {
      // What the transformer itself says about the value need not be said again.
      if (loose[parameter].removeOne(name))
        text += QLatin1Char(' ') +
                (rule == Rule::InvalidValue ? suggestion(name, names) : referenceText(name, names));
    }
    QString prompt = node.cfg.getParameterPrompt(parameter);
    if (prompt.isEmpty())
      prompt = parameter;
    if (!text.contains(QLatin1Char('\'') + prompt + QLatin1Char('\'')))
      text = prompt + QLatin1String(": ") + text;
    m_diagnostics.reportParameter(rule, node.lines.of(parameter), node.title, parameter, text.trimmed());
  }
}

void ValueChecks::reportReferences(const Node& node, LooseReferences& loose, const QStringList& names) {
  if (loose.isEmpty())
    return;
  for (const QString& parameter : node.cfg.getParameters()) {
    const QString& prompt = node.cfg.getParameterPrompt(parameter);
    for (const QString& name : loose.take(parameter)) {
      m_diagnostics.reportParameter(
          Rule::UnknownReference, node.lines.of(parameter), node.title, parameter,
          (prompt.isEmpty() ? parameter : prompt) + QLatin1String(": ") + referenceText(name, names));
    }
  }
}
