// Everything that can be wrong with what people write, as one table: the rule's name, how severe it is by
// default, what it is about, and the number of its message.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>
#include <QString>

#include <vector>

namespace orx {

enum class Severity { Error, Warning, Hint };

// What a rule is about, which decides how far settings may change its severity.
enum class RuleKind {
  Judgement,  // they may do as they like
  Writing,    // whether something can be written at all: they cannot lower it
  Machine,    // what this machine has: a warning, until somebody wants more
};

enum class Rule {
  MalformedDocument,
  NoDocument,
  UnknownTransformer,
  UnknownVersion,
  CustomTransformer,
  UnknownParameter,
  DuplicateName,
  DuplicateNumber,
  RepeatedDeclaration,
  DanglingLink,
  BadPort,
  AttributeLink,
  IdleLink,
  UnknownInput,
  UnknownOutput,
  Cycle,
  UnwritableValue,
  UnclosedReference,
  LineBreak,
  UnknownGlobalParameter,
  BadPromptLine,
  UnmetDependency,
  Upgraded,
  TakenName,
  Nesting,
  CustomTransformerFault,
  LoopPoint,
  NotWritten,
  MissingAttribute,
  MissingValue,
  MissingFile,
  UnknownConnection,
  InvalidValue,
  UnfedInput,
  UnfedWriter,
  DroppedOutput,
  UnusedReader,
  Deprecated,
  NewerVersion,
  NewerBuild,
  UnusedParameter,
  UnusedCustomTransformer,
  UnknownReference,
  ConflictMark,
  MalformedValue,
  ContradictingParameter,
  RepeatedParameter,
  UnknownElement,
  UnknownAttribute,
  StrayLine,
  LostContent,
  UnfitChoice,
  UnfitNumber,
  // Of mapping files.
  NotUtf8,
  BadCharacter,
  LongStatement,
  CutContinuation,
  ContinuedComment,
  MisspeltStatement,
  UnknownStatement,
  BadStatement,
  BadClause,
  OpenQuote,
  GluedQuote,
  OpenFunction,
  UnknownFunction,
  BadFunction,
  BadEncoding,
  MisspeltCharacter,
  OpenReference,
  DeferredReference,
  LeftToken,
  LateMacro,
  OpenBlock,
  StrayEnd,
  DeepBlock,
  BadHeader,
  RepeatedDefinition,
  UnusedDefinition,
  MissingDefinition,
  DefinitionCycle,
  RepeatedFactory,
  UnknownFactory,
  UnfedType,
  LateType,
  DroppedType,
  TclSyntax,
  PythonSyntax,
  UncheckedPython,
  TooManyFindings,
  TooManyNames,
  // Of definition files; some of those above are told of them as well.
  UnreadableFile,
  WorkspaceMark,
  UnfinishedDefinition,
  UnknownKeyword,
  RepeatedKeyword,
  BadValue,
  DuplicateDefinition,
  MissingText,
  UnknownPort,
  BadListAction,
  BadMapping,
  ParameterLines,
  DuplicateParameter,
  UndeclaredParameter,
  UnknownType,
  PlainTextType,
  BadDefault,
  UnknownToken,
  OutputRoute,
  OmittableLine,
  UnusedPort,
  UnplacedParameter,
  UnknownInCompanion,
  MissingTranslation,
};

struct RuleRow {
  Rule rule;
  QLatin1String name;
  Severity severity;
  RuleKind kind;
  long message;  // 0 when the text comes from where the finding arises
};

// In the order of the enumeration.
ORX_EXPORT const std::vector<RuleRow>& ruleTable();
ORX_EXPORT const RuleRow& ruleRow(Rule rule);
// By name; null when there is none.
ORX_EXPORT const RuleRow* findRule(const QString& name);

// "error", "warning" or "hint".
ORX_EXPORT QString severityName(Severity severity);

}  // namespace orx
