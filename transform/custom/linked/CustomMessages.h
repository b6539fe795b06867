// Numbers of the messages of custom transformers.
#pragma once

namespace custom_messages {

// Shared with workspace documents.
constexpr long kUnknownTransformer = 370781;
constexpr long kUnknownVersion = 370782;
constexpr long kUnknownParameter = 370784;
constexpr long kDuplicateName = 370785;
constexpr long kDuplicateNumber = 370786;
constexpr long kDanglingLink = 370787;
constexpr long kBadPort = 370788;
constexpr long kUnknownInput = 370789;
constexpr long kUnknownOutput = 370790;
constexpr long kUnclosedReference = 370793;
constexpr long kLineBreak = 370794;
constexpr long kBadPromptLine = 370796;
constexpr long kUnmetDependency = 370797;
constexpr long kUpgraded = 370798;

constexpr long kSamePrefix = 370839;
constexpr long kContainsItself = 370840;
constexpr long kNestedTooDeep = 370841;
constexpr long kNoFileOfItsOwn = 370842;
constexpr long kEnciphered = 370843;
constexpr long kFileChanged = 370844;
constexpr long kNoBody = 370845;
constexpr long kNoSubDocumentName = 370846;
constexpr long kSamePortName = 370847;
constexpr long kPromptMaxIterations = 370848;
constexpr long kPromptIterationCount = 370849;
constexpr long kPromptGroupBy = 370850;
constexpr long kNoInstance = 370851;
constexpr long kNoMacroName = 370852;
constexpr long kEncipheredBody = 370854;
constexpr long kNoLoop = 370878;
constexpr long kLostLoop = 370900;
constexpr long kIdleLoop = 370901;
constexpr long kSecondLoop = 370902;
constexpr long kBadMaximum = 370903;
constexpr long kScriptForWorkers = 370904;
constexpr long kOwnReferenceForWorkers = 370905;
constexpr long kBlankAtEnd = 370909;
constexpr long kConditionInMacro = 370910;
constexpr long kLoopInProcesses = 370911;
constexpr long kSameLoopName = 370912;

}  // namespace custom_messages
