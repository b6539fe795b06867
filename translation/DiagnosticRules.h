// Everything that can be wrong with a workspace, as one table: the rule's name, how severe it is by default,
// and the number of its message.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>

#include <vector>

enum class Severity { Error, Warning, Hint };

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
};

struct DiagnosticRule {
  Rule rule;
  QLatin1String name;
  Severity severity;
  long message;
};

// In the order of the enumeration.
ORX_EXPORT const std::vector<DiagnosticRule>& diagnosticRules();
ORX_EXPORT const DiagnosticRule& diagnosticRule(Rule rule);
// By name; null when there is none.
ORX_EXPORT const DiagnosticRule* findDiagnosticRule(const QString& name);
