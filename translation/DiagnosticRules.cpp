#include <translation/DiagnosticRules.h>

const std::vector<DiagnosticRule>& diagnosticRules() {
  static const std::vector<DiagnosticRule> rules = {
      // The reader's own message is the text.
      {Rule::MalformedDocument, QLatin1String("malformed-document"), Severity::Error, 0},
      {Rule::NoDocument, QLatin1String("no-document"), Severity::Error, 370780},
      {Rule::UnknownTransformer, QLatin1String("unknown-transformer"), Severity::Error, 370781},
      {Rule::UnknownVersion, QLatin1String("unknown-version"), Severity::Error, 370782},
      {Rule::CustomTransformer, QLatin1String("custom-transformer"), Severity::Error, 370783},
      {Rule::UnknownParameter, QLatin1String("unknown-parameter"), Severity::Error, 370784},
      {Rule::DuplicateName, QLatin1String("duplicate-name"), Severity::Error, 370785},
      {Rule::DuplicateNumber, QLatin1String("duplicate-number"), Severity::Error, 370786},
      {Rule::DanglingLink, QLatin1String("dangling-link"), Severity::Error, 370787},
      {Rule::BadPort, QLatin1String("bad-port"), Severity::Error, 370788},
      {Rule::UnknownInput, QLatin1String("unknown-input"), Severity::Error, 370789},
      {Rule::UnknownOutput, QLatin1String("unknown-output"), Severity::Error, 370790},
      {Rule::Cycle, QLatin1String("cycle"), Severity::Error, 370791},
      {Rule::UnwritableValue, QLatin1String("unwritable-value"), Severity::Error, 370792},
      {Rule::UnclosedReference, QLatin1String("unclosed-reference"), Severity::Error, 370793},
      {Rule::LineBreak, QLatin1String("line-break"), Severity::Error, 370794},
      {Rule::UnknownGlobalParameter, QLatin1String("unknown-global-parameter"), Severity::Error, 370795},
      {Rule::BadPromptLine, QLatin1String("bad-prompt-line"), Severity::Error, 370796},
      {Rule::UnmetDependency, QLatin1String("unmet-dependency"), Severity::Warning, 370797},
      {Rule::Upgraded, QLatin1String("upgraded"), Severity::Hint, 370798},
      {Rule::TakenName, QLatin1String("taken-name"), Severity::Error, 370799},
      // The texts of these come from the custom transformer.
      {Rule::Nesting, QLatin1String("nesting"), Severity::Error, 0},
      {Rule::CustomTransformerFault, QLatin1String("custom-transformer-fault"), Severity::Error, 0},
      {Rule::NotWritten, QLatin1String("not-written"), Severity::Error, 370853},
      {Rule::MissingAttribute, QLatin1String("missing-attribute"), Severity::Error, 370607},
      {Rule::MissingValue, QLatin1String("missing-value"), Severity::Error, 370608},
      {Rule::MissingFile, QLatin1String("missing-file"), Severity::Error, 370612},
      {Rule::UnknownConnection, QLatin1String("unknown-connection"), Severity::Error, 370636},
      // The text comes from the transformer, when it has one.
      {Rule::InvalidValue, QLatin1String("invalid-value"), Severity::Error, 370855},
      {Rule::UnfedInput, QLatin1String("unfed-input"), Severity::Warning, 370856},
      {Rule::UnfedWriter, QLatin1String("unfed-writer"), Severity::Warning, 370857},
      {Rule::DroppedOutput, QLatin1String("dropped-output"), Severity::Hint, 370858},
      {Rule::UnusedReader, QLatin1String("unused-reader"), Severity::Hint, 370859},
      {Rule::Deprecated, QLatin1String("deprecated"), Severity::Warning, 370860},
      {Rule::NewerVersion, QLatin1String("newer-version"), Severity::Hint, 370862},
      {Rule::NewerBuild, QLatin1String("newer-build"), Severity::Warning, 370863},
      {Rule::UnusedParameter, QLatin1String("unused-parameter"), Severity::Hint, 370864},
      {Rule::UnknownReference, QLatin1String("unknown-reference"), Severity::Warning, 370865},
  };
  return rules;
}

const DiagnosticRule& diagnosticRule(Rule rule) {
  return diagnosticRules()[static_cast<std::size_t>(rule)];
}

const DiagnosticRule* findDiagnosticRule(const QString& name) {
  for (const DiagnosticRule& rule : diagnosticRules()) {
    if (rule.name == name)
      return &rule;
  }
  return nullptr;
}
