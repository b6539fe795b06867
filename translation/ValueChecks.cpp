#include <transform/core/TransformerCfg.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/WorkspaceRecords.h>
#include <translation/ReferencedNames.h>
#include <translation/ValueChecks.h>

namespace {

constexpr long kSuggestion = 370866;
constexpr int kMostMissing = 20;  // named in one finding
const QLatin1String kInstanceNames("XFORMER_NAME");

}  // namespace

ValueChecks::ValueChecks(Diagnostics& diagnostics) : m_diagnostics(diagnostics) {
  const QChar mark(0xfffc);
  for (const Rule rule :
       {Rule::MissingAttribute, Rule::MissingValue, Rule::MissingFile, Rule::UnknownConnection}) {
    const QString text = TransformResString(diagnosticRule(rule).message, QString(mark));
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
    const QString nearest = nearestName(name, arriving);
    if (!nearest.isEmpty())
      suggestions += QLatin1String(suggestions.isEmpty() ? ". " : " ") +
                     TransformResString(kSuggestion, {nearest, name});
  }
  return TransformResString(diagnosticRule(Rule::MissingAttribute).message, quoted.join(QLatin1Char(' '))) +
         suggestions;
}

void ValueChecks::checkValues(const TransformerCfg& cfg, const TransformerStruct& record,
                              const QString& title, bool knowsWhatArrives) {
  QHash<QString, int> lines;
  for (const QString& parameter : cfg.getParameters()) {
    QString text;
    if (cfg.validateParameter(parameter, text))
      continue;
    if (lines.isEmpty()) {
      for (const XformParmStruct& given : record.parameters)
        lines.insert(given.parmName, given.line);
    }
    const Rule rule = ruleOf(text);
    if (rule == Rule::MissingAttribute) {
      if (!knowsWhatArrives)
        continue;
      text = missingText(cfg, parameter);
    } else if (text.isEmpty()) {
      text = TransformResString(diagnosticRule(Rule::InvalidValue).message);
    }
    QString prompt = cfg.getParameterPrompt(parameter);
    if (prompt.isEmpty())
      prompt = parameter;
    if (!text.contains(QLatin1Char('\'') + prompt + QLatin1Char('\'')))
      text = prompt + QLatin1String(": ") + text;
    m_diagnostics.reportParameter(rule, lines.value(parameter, record.line), title, parameter, text);
  }
}

void ValueChecks::checkReferences(const TransformerCfg& cfg, const TransformerStruct& record,
                                  const QString& title, const Knows& knows, const QStringList& names) {
  for (const XformParmStruct& given : record.parameters) {
    if (!given.parmValue.contains(QLatin1Char('$')))
      continue;
    for (const QString& name : ReferencedNames::inValue(given.parmValue)) {
      if (knows(name) || name.startsWith(kInstanceNames) || cfg.getParameterByMacroName(name))
        continue;
      QString text = TransformResString(diagnosticRule(Rule::UnknownReference).message, name);
      const QString nearest = nearestName(name, names);
      if (!nearest.isEmpty())
        text += QLatin1Char(' ') + TransformResString(kSuggestion, {nearest, name});
      const QString& prompt = cfg.getParameterPrompt(given.parmName);
      m_diagnostics.reportParameter(
          Rule::UnknownReference, given.line, title, given.parmName,
          (prompt.isEmpty() ? given.parmName : prompt) + QLatin1String(": ") + text);
    }
  }
}
