#include <transform/findings/Rules.h>

namespace orx {

const std::vector<RuleRow>& ruleTable() {
  static const std::vector<RuleRow> rules = {
      // The reader's own message is the text.
      {Rule::MalformedDocument, QLatin1String("malformed-document"), Severity::Error, RuleKind::Writing, 0},
      {Rule::NoDocument, QLatin1String("no-document"), Severity::Error, RuleKind::Writing, 370780},
      {Rule::UnknownTransformer, QLatin1String("unknown-transformer"), Severity::Error, RuleKind::Writing,
       370781},
      {Rule::UnknownVersion, QLatin1String("unknown-version"), Severity::Error, RuleKind::Writing, 370782},
      {Rule::CustomTransformer, QLatin1String("custom-transformer"), Severity::Error, RuleKind::Writing,
       370783},
      {Rule::UnknownParameter, QLatin1String("unknown-parameter"), Severity::Error, RuleKind::Judgement,
       370784},
      {Rule::DuplicateName, QLatin1String("duplicate-name"), Severity::Error, RuleKind::Writing, 370785},
      {Rule::DuplicateNumber, QLatin1String("duplicate-number"), Severity::Error, RuleKind::Writing, 370786},
      {Rule::RepeatedDeclaration, QLatin1String("repeated-declaration"), Severity::Warning,
       RuleKind::Judgement, 370868},
      {Rule::DanglingLink, QLatin1String("dangling-link"), Severity::Error, RuleKind::Judgement, 370787},
      {Rule::BadPort, QLatin1String("bad-port"), Severity::Error, RuleKind::Judgement, 370788},
      {Rule::UnknownInput, QLatin1String("unknown-input"), Severity::Error, RuleKind::Judgement, 370789},
      {Rule::UnknownOutput, QLatin1String("unknown-output"), Severity::Error, RuleKind::Judgement, 370790},
      {Rule::Cycle, QLatin1String("cycle"), Severity::Error, RuleKind::Writing, 370791},
      {Rule::UnwritableValue, QLatin1String("unwritable-value"), Severity::Error, RuleKind::Writing, 370792},
      {Rule::UnclosedReference, QLatin1String("unclosed-reference"), Severity::Error, RuleKind::Writing,
       370793},
      {Rule::LineBreak, QLatin1String("line-break"), Severity::Error, RuleKind::Writing, 370794},
      {Rule::UnknownGlobalParameter, QLatin1String("unknown-global-parameter"), Severity::Error,
       RuleKind::Judgement, 370795},
      {Rule::BadPromptLine, QLatin1String("bad-prompt-line"), Severity::Error, RuleKind::Judgement, 370796},
      {Rule::UnmetDependency, QLatin1String("unmet-dependency"), Severity::Warning, RuleKind::Machine,
       370797},
      {Rule::Upgraded, QLatin1String("upgraded"), Severity::Hint, RuleKind::Judgement, 370798},
      {Rule::TakenName, QLatin1String("taken-name"), Severity::Error, RuleKind::Writing, 370799},
      // The texts of these come from the custom transformer.
      {Rule::Nesting, QLatin1String("nesting"), Severity::Error, RuleKind::Writing, 0},
      {Rule::CustomTransformerFault, QLatin1String("custom-transformer-fault"), Severity::Error,
       RuleKind::Writing, 0},
      {Rule::LoopPoint, QLatin1String("loop-point"), Severity::Warning, RuleKind::Judgement, 0},
      {Rule::NotWritten, QLatin1String("not-written"), Severity::Error, RuleKind::Writing, 370853},
      {Rule::MissingAttribute, QLatin1String("missing-attribute"), Severity::Error, RuleKind::Judgement,
       370607},
      {Rule::MissingValue, QLatin1String("missing-value"), Severity::Error, RuleKind::Judgement, 370608},
      {Rule::MissingFile, QLatin1String("missing-file"), Severity::Warning, RuleKind::Machine, 370612},
      {Rule::UnknownConnection, QLatin1String("unknown-connection"), Severity::Warning, RuleKind::Machine,
       370636},
      // The text comes from the transformer, when it has one.
      {Rule::InvalidValue, QLatin1String("invalid-value"), Severity::Error, RuleKind::Judgement, 370855},
      {Rule::UnfedInput, QLatin1String("unfed-input"), Severity::Warning, RuleKind::Judgement, 370856},
      {Rule::UnfedWriter, QLatin1String("unfed-writer"), Severity::Warning, RuleKind::Judgement, 370857},
      {Rule::DroppedOutput, QLatin1String("dropped-output"), Severity::Hint, RuleKind::Judgement, 370858},
      {Rule::UnusedReader, QLatin1String("unused-reader"), Severity::Hint, RuleKind::Judgement, 370859},
      {Rule::Deprecated, QLatin1String("deprecated"), Severity::Warning, RuleKind::Judgement, 370860},
      {Rule::NewerVersion, QLatin1String("newer-version"), Severity::Hint, RuleKind::Judgement, 370862},
      {Rule::NewerBuild, QLatin1String("newer-build"), Severity::Warning, RuleKind::Judgement, 370863},
      {Rule::UnusedParameter, QLatin1String("unused-parameter"), Severity::Hint, RuleKind::Judgement, 370864},
      {Rule::UnusedCustomTransformer, QLatin1String("unused-custom-transformer"), Severity::Hint,
       RuleKind::Judgement, 370870},
      {Rule::UnknownReference, QLatin1String("unknown-reference"), Severity::Error, RuleKind::Judgement,
       370865},
      {Rule::ConflictMark, QLatin1String("conflict-mark"), Severity::Error, RuleKind::Judgement, 371314},
      {Rule::MalformedValue, QLatin1String("malformed-value"), Severity::Error, RuleKind::Judgement, 371317},
      {Rule::ContradictingParameter, QLatin1String("contradicting-parameter"), Severity::Error,
       RuleKind::Judgement, 371315},
      {Rule::RepeatedParameter, QLatin1String("repeated-parameter"), Severity::Warning, RuleKind::Judgement,
       371316},
      {Rule::UnknownElement, QLatin1String("unknown-element"), Severity::Warning, RuleKind::Judgement,
       371319},
      {Rule::UnknownAttribute, QLatin1String("unknown-attribute"), Severity::Warning, RuleKind::Judgement,
       371318},
      {Rule::StrayLine, QLatin1String("stray-line"), Severity::Warning, RuleKind::Judgement, 371320},
      {Rule::UnfitChoice, QLatin1String("unfit-choice"), Severity::Error, RuleKind::Judgement, 371310},
      {Rule::UnfitNumber, QLatin1String("unfit-number"), Severity::Error, RuleKind::Judgement, 371311},
      {Rule::NotUtf8, QLatin1String("not-utf8"), Severity::Error, RuleKind::Judgement, 370800},
      {Rule::BadCharacter, QLatin1String("bad-character"), Severity::Error, RuleKind::Judgement, 370801},
      {Rule::LongStatement, QLatin1String("long-statement"), Severity::Error, RuleKind::Judgement, 370802},
      {Rule::CutContinuation, QLatin1String("cut-continuation"), Severity::Error, RuleKind::Judgement,
       370803},
      {Rule::ContinuedComment, QLatin1String("continued-comment"), Severity::Warning, RuleKind::Judgement,
       370804},
      {Rule::MisspeltStatement, QLatin1String("misspelt-statement"), Severity::Warning, RuleKind::Judgement,
       370805},
      {Rule::UnknownStatement, QLatin1String("unknown-statement"), Severity::Hint, RuleKind::Judgement,
       370806},
      {Rule::BadStatement, QLatin1String("bad-statement"), Severity::Error, RuleKind::Judgement, 370807},
      {Rule::BadClause, QLatin1String("bad-clause"), Severity::Error, RuleKind::Judgement, 370808},
      {Rule::OpenQuote, QLatin1String("open-quote"), Severity::Error, RuleKind::Judgement, 370809},
      {Rule::GluedQuote, QLatin1String("glued-quote"), Severity::Error, RuleKind::Judgement, 370810},
      {Rule::OpenFunction, QLatin1String("open-function"), Severity::Error, RuleKind::Judgement, 370811},
      {Rule::UnknownFunction, QLatin1String("unknown-function"), Severity::Warning, RuleKind::Judgement,
       370812},
      {Rule::BadFunction, QLatin1String("bad-function"), Severity::Error, RuleKind::Judgement, 370813},
      {Rule::BadEncoding, QLatin1String("bad-encoding"), Severity::Error, RuleKind::Judgement, 370814},
      {Rule::MisspeltCharacter, QLatin1String("misspelt-character"), Severity::Warning, RuleKind::Judgement,
       370815},
      {Rule::OpenReference, QLatin1String("open-reference"), Severity::Warning, RuleKind::Judgement, 370816},
      {Rule::DeferredReference, QLatin1String("deferred-reference"), Severity::Warning, RuleKind::Judgement,
       370817},
      {Rule::LeftToken, QLatin1String("left-token"), Severity::Error, RuleKind::Judgement, 370818},
      {Rule::LateMacro, QLatin1String("late-macro"), Severity::Warning, RuleKind::Judgement, 370819},
      {Rule::OpenBlock, QLatin1String("open-block"), Severity::Error, RuleKind::Judgement, 370820},
      {Rule::StrayEnd, QLatin1String("stray-end"), Severity::Error, RuleKind::Judgement, 370821},
      {Rule::DeepBlock, QLatin1String("deep-block"), Severity::Error, RuleKind::Judgement, 370822},
      {Rule::BadHeader, QLatin1String("bad-header"), Severity::Error, RuleKind::Judgement, 370823},
      {Rule::RepeatedDefinition, QLatin1String("repeated-definition"), Severity::Error, RuleKind::Judgement,
       370824},
      {Rule::UnusedDefinition, QLatin1String("unused-definition"), Severity::Hint, RuleKind::Judgement,
       370825},
      {Rule::MissingDefinition, QLatin1String("missing-definition"), Severity::Error, RuleKind::Judgement,
       370826},
      {Rule::DefinitionCycle, QLatin1String("definition-cycle"), Severity::Error, RuleKind::Judgement,
       370827},
      {Rule::RepeatedFactory, QLatin1String("repeated-factory"), Severity::Error, RuleKind::Judgement,
       370828},
      {Rule::UnknownFactory, QLatin1String("unknown-factory"), Severity::Error, RuleKind::Judgement, 370829},
      {Rule::UnfedType, QLatin1String("unfed-type"), Severity::Warning, RuleKind::Judgement, 370830},
      {Rule::LateType, QLatin1String("late-type"), Severity::Warning, RuleKind::Judgement, 370831},
      {Rule::DroppedType, QLatin1String("dropped-type"), Severity::Hint, RuleKind::Judgement, 370832},
      {Rule::TclSyntax, QLatin1String("tcl-syntax"), Severity::Error, RuleKind::Judgement, 370833},
      {Rule::PythonSyntax, QLatin1String("python-syntax"), Severity::Error, RuleKind::Judgement, 370834},
      {Rule::UncheckedPython, QLatin1String("unchecked-python"), Severity::Warning, RuleKind::Machine,
       370835},
      {Rule::TooManyFindings, QLatin1String("too-many-findings"), Severity::Warning, RuleKind::Judgement,
       370836},
      {Rule::TooManyNames, QLatin1String("too-many-names"), Severity::Error, RuleKind::Judgement, 370838},
      {Rule::UnreadableFile, QLatin1String("unreadable-file"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::WorkspaceMark, QLatin1String("workspace-mark"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::UnfinishedDefinition, QLatin1String("unfinished-definition"), Severity::Error,
       RuleKind::Judgement, 0},
      {Rule::UnknownKeyword, QLatin1String("unknown-keyword"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::RepeatedKeyword, QLatin1String("repeated-keyword"), Severity::Warning, RuleKind::Judgement, 0},
      {Rule::BadValue, QLatin1String("bad-value"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::DuplicateDefinition, QLatin1String("duplicate-definition"), Severity::Error, RuleKind::Judgement,
       0},
      {Rule::MissingText, QLatin1String("missing-text"), Severity::Warning, RuleKind::Judgement, 0},
      {Rule::UnknownPort, QLatin1String("unknown-port"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::BadListAction, QLatin1String("bad-list-action"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::BadMapping, QLatin1String("bad-mapping"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::ParameterLines, QLatin1String("parameter-lines"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::DuplicateParameter, QLatin1String("duplicate-parameter"), Severity::Error, RuleKind::Judgement,
       0},
      {Rule::UndeclaredParameter, QLatin1String("undeclared-parameter"), Severity::Error, RuleKind::Judgement,
       0},
      {Rule::UnknownType, QLatin1String("unknown-type"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::PlainTextType, QLatin1String("plain-text-type"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::BadDefault, QLatin1String("bad-default"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::UnknownToken, QLatin1String("unknown-token"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::OutputRoute, QLatin1String("output-route"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::OmittableLine, QLatin1String("omittable-line"), Severity::Error, RuleKind::Judgement, 0},
      {Rule::UnusedPort, QLatin1String("unused-port"), Severity::Warning, RuleKind::Judgement, 0},
      {Rule::UnplacedParameter, QLatin1String("unplaced-parameter"), Severity::Warning, RuleKind::Judgement,
       0},
      {Rule::UnknownInCompanion, QLatin1String("unknown-in-companion"), Severity::Error, RuleKind::Judgement,
       0},
      {Rule::MissingTranslation, QLatin1String("missing-translation"), Severity::Warning, RuleKind::Judgement,
       0},
  };
  return rules;
}

QString severityName(Severity severity) {
  switch (severity) {
    case Severity::Error:
      return QStringLiteral("error");
    case Severity::Warning:
      return QStringLiteral("warning");
    case Severity::Hint:
      break;
  }
  return QStringLiteral("hint");
}

const RuleRow& ruleRow(Rule rule) {
  return ruleTable()[static_cast<std::size_t>(rule)];
}

const RuleRow* findRule(const QString& name) {
  for (const RuleRow& rule : ruleTable()) {
    if (rule.name == name)
      return &rule;
  }
  return nullptr;
}

}  // namespace orx
