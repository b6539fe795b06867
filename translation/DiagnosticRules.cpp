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
      {Rule::RepeatedDeclaration, QLatin1String("repeated-declaration"), Severity::Warning, 370868},
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
      {Rule::UnusedCustomTransformer, QLatin1String("unused-custom-transformer"), Severity::Hint, 370870},
      {Rule::UnknownReference, QLatin1String("unknown-reference"), Severity::Warning, 370865},
      {Rule::NotUtf8, QLatin1String("not-utf8"), Severity::Error, 370800},
      {Rule::BadCharacter, QLatin1String("bad-character"), Severity::Error, 370801},
      {Rule::LongStatement, QLatin1String("long-statement"), Severity::Error, 370802},
      {Rule::CutContinuation, QLatin1String("cut-continuation"), Severity::Error, 370803},
      {Rule::ContinuedComment, QLatin1String("continued-comment"), Severity::Warning, 370804},
      {Rule::MisspeltStatement, QLatin1String("misspelt-statement"), Severity::Warning, 370805},
      {Rule::UnknownStatement, QLatin1String("unknown-statement"), Severity::Hint, 370806},
      {Rule::BadStatement, QLatin1String("bad-statement"), Severity::Error, 370807},
      {Rule::BadClause, QLatin1String("bad-clause"), Severity::Error, 370808},
      {Rule::OpenQuote, QLatin1String("open-quote"), Severity::Error, 370809},
      {Rule::GluedQuote, QLatin1String("glued-quote"), Severity::Error, 370810},
      {Rule::OpenFunction, QLatin1String("open-function"), Severity::Error, 370811},
      {Rule::UnknownFunction, QLatin1String("unknown-function"), Severity::Warning, 370812},
      {Rule::BadFunction, QLatin1String("bad-function"), Severity::Error, 370813},
      {Rule::BadEncoding, QLatin1String("bad-encoding"), Severity::Error, 370814},
      {Rule::MisspeltCharacter, QLatin1String("misspelt-character"), Severity::Warning, 370815},
      {Rule::OpenReference, QLatin1String("open-reference"), Severity::Warning, 370816},
      {Rule::DeferredReference, QLatin1String("deferred-reference"), Severity::Warning, 370817},
      {Rule::LeftToken, QLatin1String("left-token"), Severity::Error, 370818},
      {Rule::LateMacro, QLatin1String("late-macro"), Severity::Warning, 370819},
      {Rule::OpenBlock, QLatin1String("open-block"), Severity::Error, 370820},
      {Rule::StrayEnd, QLatin1String("stray-end"), Severity::Error, 370821},
      {Rule::DeepBlock, QLatin1String("deep-block"), Severity::Error, 370822},
      {Rule::BadHeader, QLatin1String("bad-header"), Severity::Error, 370823},
      {Rule::RepeatedDefinition, QLatin1String("repeated-definition"), Severity::Error, 370824},
      {Rule::UnusedDefinition, QLatin1String("unused-definition"), Severity::Hint, 370825},
      {Rule::MissingDefinition, QLatin1String("missing-definition"), Severity::Error, 370826},
      {Rule::DefinitionCycle, QLatin1String("definition-cycle"), Severity::Error, 370827},
      {Rule::RepeatedFactory, QLatin1String("repeated-factory"), Severity::Error, 370828},
      {Rule::UnknownFactory, QLatin1String("unknown-factory"), Severity::Error, 370829},
      {Rule::UnfedType, QLatin1String("unfed-type"), Severity::Warning, 370830},
      {Rule::LateType, QLatin1String("late-type"), Severity::Warning, 370831},
      {Rule::DroppedType, QLatin1String("dropped-type"), Severity::Hint, 370832},
      {Rule::TclSyntax, QLatin1String("tcl-syntax"), Severity::Error, 370833},
      {Rule::PythonSyntax, QLatin1String("python-syntax"), Severity::Error, 370834},
      {Rule::UncheckedPython, QLatin1String("unchecked-python"), Severity::Hint, 370835},
      {Rule::TooManyFindings, QLatin1String("too-many-findings"), Severity::Warning, 370836},
      {Rule::TooManyNames, QLatin1String("too-many-names"), Severity::Error, 370838},
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
