// The number of every text that users see, under a name that tells what it says. The texts stand in
// resources/messages/.
#pragma once

namespace orx::messages {

// Configuration and validation.
constexpr long kIdentifierPrompt = 370605;
constexpr long kProcessCountPrompt = 370606;
constexpr long kMissingAttribute = 370607;
constexpr long kMissingValue = 370608;
constexpr long kBadPattern = 370611;
constexpr long kMissingFile = 370612;
constexpr long kScriptRefused = 370613;
constexpr long kEmbeddedTransformer = 370615;
constexpr long kLinkedTransformer = 370616;
constexpr long kUnknownWorkspaceParameter = 370617;
constexpr long kGroupsOrderedPrompt = 370635;
constexpr long kUnknownConnection = 370636;
constexpr long kUnknownTransformerName = 370640;

// Pages about changes.
constexpr long kNoChanges = 370642;
constexpr long kChanges = 370643;
constexpr long kVersionHeading = 370644;
constexpr long kNotSet = 370649;
constexpr long kGroupTitle = 370663;
constexpr long kNo = 370664;
constexpr long kYes = 370665;

// Values of transformers with a class of their own.
constexpr long kNotUnderstood = 370701;
constexpr long kIncomplete = 370702;
constexpr long kUnknownComparison = 370703;
constexpr long kNoTestNumber = 370704;
constexpr long kUnknownTest = 370705;
constexpr long kMappedTwice = 370706;
constexpr long kDiffersByFeature = 370707;
constexpr long kNotWellFormed = 370708;
constexpr long kBadInputName = 370709;
constexpr long kInputNameTwice = 370710;
constexpr long kNoSubTemplate = 370711;
constexpr long kTemplateCircle = 370712;
constexpr long kBadPath = 370713;
constexpr long kInRow = 370714;
constexpr long kOutOfRange = 370715;
constexpr long kOneSeries = 370716;
constexpr long kLabelTwice = 370717;
constexpr long kUnknownKind = 370718;
constexpr long kNoAddress = 370719;

// Why a value cannot be written.
constexpr long kBreaksLine = 370720;
constexpr long kValueUnclosed = 370721;
constexpr long kEndsInBackslash = 370722;
constexpr long kValueInScript = 370723;
constexpr long kChoiceInScript = 370724;
constexpr long kPromptInScript = 370725;
constexpr long kIdentifierInScript = 370726;
constexpr long kGrowsWithoutEnd = 370727;
constexpr long kNameInMacro = 370728;
constexpr long kNoWord = 370749;
constexpr long kKeywordInValue = 370750;
constexpr long kOpenInValue = 370751;
constexpr long kCallInValue = 370752;
constexpr long kNotEncoded = 370753;
constexpr long kNoPort = 370754;
constexpr long kNoQuotedName = 370755;
constexpr long kNoLoopSetting = 370756;
constexpr long kNoPrintedName = 370757;
constexpr long kNoHeaderField = 370758;
constexpr long kReferenceBreaks = 370759;
constexpr long kReferenceReencoded = 371331;
constexpr long kReferenceToCall = 371332;
constexpr long kOwnReferenceApart = 371333;

// Why a script cannot be written.
constexpr long kScriptTooManyBrackets = 370729;
constexpr long kScriptName = 370730;
constexpr long kScriptEmpty = 370731;
constexpr long kScriptCharacter = 370732;
constexpr long kScriptBlockEnd = 370733;
constexpr long kScriptContinuation = 370734;
constexpr long kScriptTextOfSeveralLines = 370735;
constexpr long kScriptUnbalanced = 370736;
constexpr long kScriptResultInsideStatement = 370737;
constexpr long kScriptResultNoValue = 370738;
constexpr long kScriptLookup = 370739;

// The registry.
constexpr long kFileTooLarge = 370740;
constexpr long kUnfinishedDefinition = 370741;
constexpr long kNamelessDefinition = 370742;
constexpr long kNamedVersion = 370743;
constexpr long kAllChanges = 370744;
constexpr long kCustomOfNewerBuild = 370745;
constexpr long kUnfinishedLines = 370746;
constexpr long kDefinedTwice = 370747;
constexpr long kLoadedAlready = 370748;

// Workspace documents.
constexpr long kUndecodable = 370760;
constexpr long kValueTooLong = 370761;
constexpr long kElementsTooDeep = 370762;
constexpr long kTooManyAttributes = 370763;
constexpr long kDocumentType = 370764;
constexpr long kUnknownEncoding = 370765;
constexpr long kContactSupport = 370766;
constexpr long kNoWorkspaceFile = 370767;
constexpr long kLostRoot = 370768;
constexpr long kLostConstant = 370769;
constexpr long kReadOnlyAttribute = 370770;
constexpr long kUnknownAttribute = 370771;
constexpr long kMalformedValue = 370772;
constexpr long kUnknownElement = 370773;
constexpr long kRepeatedElement = 370774;
constexpr long kNamelessSubDocument = 370775;
constexpr long kRepeatedSubDocument = 370776;
constexpr long kLostText = 370777;
constexpr long kLostComment = 370778;
constexpr long kLostInstruction = 370779;
constexpr long kLostDeclaration = 371300;
constexpr long kChangedValue = 371301;
constexpr long kMovedLine = 371302;

// Workspaces and custom transformers.
constexpr long kNoDocument = 370780;
constexpr long kUnknownTransformer = 370781;
constexpr long kUnknownVersion = 370782;
constexpr long kNoCustomTransformerNamed = 370783;
constexpr long kUnknownParameter = 370784;
constexpr long kDuplicateName = 370785;
constexpr long kDuplicateNumber = 370786;
constexpr long kDanglingLink = 370787;
constexpr long kBadPort = 370788;
constexpr long kUnknownInput = 370789;
constexpr long kUnknownOutput = 370790;
constexpr long kCycle = 370791;
constexpr long kUnwritableValue = 370792;
constexpr long kUnclosedReference = 370793;
constexpr long kLineBreak = 370794;
constexpr long kUnknownGlobalParameter = 370795;
constexpr long kBadPromptLine = 370796;
constexpr long kUnmetDependency = 370797;
constexpr long kUpgraded = 370798;
constexpr long kTakenName = 370799;

// Mapping files.
constexpr long kNotUtf8 = 370800;
constexpr long kBadCharacter = 370801;
constexpr long kLongStatement = 370802;
constexpr long kCutContinuation = 370803;
constexpr long kContinuedComment = 370804;
constexpr long kMisspeltStatement = 370805;
constexpr long kUnknownStatement = 370806;
constexpr long kBadStatement = 370807;
constexpr long kBadClause = 370808;
constexpr long kOpenQuote = 370809;
constexpr long kGluedQuote = 370810;
constexpr long kOpenFunction = 370811;
constexpr long kUnknownFunction = 370812;
constexpr long kBadFunction = 370813;
constexpr long kBadEncoding = 370814;
constexpr long kMisspeltCharacter = 370815;
constexpr long kOpenReference = 370816;
constexpr long kDeferredReference = 370817;
constexpr long kLeftToken = 370818;
constexpr long kLateMacro = 370819;
constexpr long kOpenBlock = 370820;
constexpr long kStrayEnd = 370821;
constexpr long kDeepBlock = 370822;
constexpr long kBadHeader = 370823;
constexpr long kRepeatedDefinition = 370824;
constexpr long kUnusedDefinition = 370825;
constexpr long kMissingDefinition = 370826;
constexpr long kDefinitionCycle = 370827;
constexpr long kRepeatedFactory = 370828;
constexpr long kUnknownFactory = 370829;
constexpr long kUnfedType = 370830;
constexpr long kLateType = 370831;
constexpr long kDroppedType = 370832;
constexpr long kTclSyntax = 370833;
constexpr long kPythonSyntax = 370834;
constexpr long kUncheckedPython = 370835;
constexpr long kTooManyFindings = 370836;
constexpr long kTooMuchPython = 370837;
constexpr long kTooManyNames = 370838;

// Custom transformers.
constexpr long kSamePrefix = 370839;
constexpr long kContainsItself = 370840;
constexpr long kNestedTooDeep = 370841;
constexpr long kNestedTooCostly = 370846;
constexpr long kNoFileOfItsOwn = 370842;
constexpr long kEnciphered = 370843;
constexpr long kFileChanged = 370844;
constexpr long kNoBody = 370845;
constexpr long kSamePortName = 370847;
constexpr long kPromptMaxIterations = 370848;
constexpr long kPromptIterationCount = 370849;
constexpr long kPromptGroupBy = 370850;
constexpr long kNoInstance = 370851;
constexpr long kNoMacroName = 370852;
constexpr long kNotWritten = 370853;
constexpr long kEncipheredBody = 370854;

// Validation.
constexpr long kInvalidValue = 370855;
constexpr long kUnfedInput = 370856;
constexpr long kUnfedWriter = 370857;
constexpr long kDroppedOutput = 370858;
constexpr long kUnusedReader = 370859;
constexpr long kDeprecated = 370860;
constexpr long kDeprecatedOnly = 370861;
constexpr long kNewerVersion = 370862;
constexpr long kNewerBuild = 370863;
constexpr long kUnusedParameter = 370864;
constexpr long kUnknownReference = 370865;
constexpr long kSuggestion = 370866;
constexpr long kOnlyCustomTransformers = 370867;
constexpr long kRepeatedDeclaration = 370868;
constexpr long kRepeatedCustomTransformer = 370869;
constexpr long kUnusedCustomTransformer = 370870;
constexpr long kSummary = 370871;
constexpr long kUnreadableCount = 370872;
constexpr long kNoRule = 370873;
constexpr long kNoSeverity = 370874;
constexpr long kReplacesParameter = 370875;
constexpr long kUnfedOutputPort = 370876;
constexpr long kUnusedInputPort = 370877;
constexpr long kNoLoop = 370878;

// The catalogue.
constexpr long kHeadline = 370880;
constexpr long kCustomFile = 370881;
constexpr long kOtherVersions = 370882;
constexpr long kReplaced = 370883;
constexpr long kMayNotRun = 370884;
constexpr long kInputs = 370885;
constexpr long kOutputs = 370886;
constexpr long kParameters = 370887;
constexpr long kChangesTitle = 370888;
constexpr long kOneOf = 370889;
constexpr long kMadeOf = 370890;
constexpr long kOptional = 370891;
constexpr long kDefault = 370892;

// Loops and names of custom transformers.
constexpr long kLostLoop = 370900;
constexpr long kIdleLoop = 370901;
constexpr long kSecondLoop = 370902;
constexpr long kBadMaximum = 370903;
constexpr long kScriptForWorkers = 370904;
constexpr long kOwnReferenceForWorkers = 370905;
constexpr long kUnequalTwins = 370906;
constexpr long kSameInnerName = 370907;
constexpr long kInnerParameter = 370908;
constexpr long kNameOfTheSystem = 371404;
constexpr long kPrefixMacroTaken = 371405;
constexpr long kTypeTwice = 371406;
constexpr long kBlankAtEnd = 370909;
constexpr long kConditionInMacro = 370910;
constexpr long kLoopInProcesses = 370911;
constexpr long kSameLoopName = 370912;
constexpr long kAttributeInMacro = 370913;
constexpr long kBreaksInside = 370915;

// Checks of definition files.
constexpr long kDefinitionUnreadable = 371000;
constexpr long kNoReadableFile = 371001;
constexpr long kFileNotUtf8 = 371002;
constexpr long kTakenForWorkspace = 371003;
constexpr long kBlockWithoutEnd = 371004;
constexpr long kLostLines = 371005;
constexpr long kNoKeyword = 371006;
constexpr long kLineMeansNothing = 371007;
constexpr long kRepeatedKeyword = 371008;
constexpr long kRepeatedText = 371009;
constexpr long kNeedsNumber = 371010;
constexpr long kNeedsTruth = 371011;
constexpr long kNeedsMode = 371012;
constexpr long kNeedsLookup = 371013;
constexpr long kNeedsTagText = 371014;
constexpr long kNamelessCategory = 371015;
constexpr long kNamelessTransformer = 371016;
constexpr long kNamelessParameter = 371017;
constexpr long kDuplicateDefinition = 371018;
constexpr long kNoCategory = 371019;
constexpr long kNoDescription = 371020;
constexpr long kNoTooltip = 371021;
constexpr long kNoChangeLog = 371022;
constexpr long kNoTagDescription = 371023;
constexpr long kNoPrompt = 371024;
constexpr long kNoSuchPort = 371025;
constexpr long kNoSuchInput = 371026;
constexpr long kNoSuchOutput = 371027;
constexpr long kBadListAction = 371028;
constexpr long kBadParameterMapping = 371029;
constexpr long kBadTagMapping = 371030;
constexpr long kBadMappedVersion = 371031;
constexpr long kLineAboveParameters = 371032;
constexpr long kLineWithoutParameter = 371033;
constexpr long kLineTwice = 371034;
constexpr long kShiftedLine = 371035;
constexpr long kNoType = 371036;
constexpr long kDuplicateParameter = 371037;
constexpr long kNoSuchParameter = 371038;
constexpr long kNoParameterToGroupBy = 371039;
constexpr long kNoParameterToFrame = 371040;
constexpr long kNoSuchMember = 371041;
constexpr long kNoSuchType = 371042;
constexpr long kPlainTextType = 371043;
constexpr long kDefaultUnfit = 371044;
constexpr long kDefaultNoReference = 371045;
constexpr long kDefaultNotEncoded = 371047;
constexpr long kStatementContinued = 371048;
constexpr long kStatementNoKeyword = 371049;
constexpr long kSecondStatement = 371050;
constexpr long kNoSuchToken = 371051;
constexpr long kHalfRoute = 371052;
constexpr long kTwoRoutes = 371053;
constexpr long kMixedRoute = 371054;
constexpr long kOmittableLine = 371055;
constexpr long kUnusedInput = 371056;
constexpr long kUnroutedOutput = 371057;
constexpr long kUnplacedParameter = 371058;
constexpr long kNoSuchCategory = 371059;
constexpr long kVersionHasNoParameter = 371060;
constexpr long kVersionHasNoPort = 371061;
constexpr long kNoSuchVersion = 371062;
constexpr long kNoTranslation = 371064;
constexpr long kNameNotTranslated = 371065;
constexpr long kDescriptionNotTranslated = 371066;
constexpr long kTooltipNotTranslated = 371067;
constexpr long kChangeLogNotTranslated = 371068;
constexpr long kPromptNotTranslated = 371069;
constexpr long kPortNotTranslated = 371070;
constexpr long kTclFaultOf = 371071;
constexpr long kPythonFaultOf = 371072;
constexpr long kNoPython = 371073;
constexpr long kPythonSilent = 371074;
constexpr long kPythonStopped = 371075;
constexpr long kTclTooManyBrackets = 371076;
constexpr long kTclNotParsed = 371077;

// Settings of rules.
constexpr long kCannotBeLowered = 371080;

// Commands.
constexpr long kNoLanguage = 371100;
constexpr long kOptionRefused = 371101;
constexpr long kNeedsFolder = 371102;
constexpr long kSameOutput = 371103;
constexpr long kNeedsNameAndValue = 371104;
constexpr long kNoFolderMade = 371105;
constexpr long kProgress = 371106;
constexpr long kNoProcess = 371107;
constexpr long kNoOnePlace = 371108;
constexpr long kStreamInPlace = 371109;
constexpr long kNotReplaceable = 371110;
constexpr long kOneLoss = 371111;
constexpr long kLosses = 371112;
constexpr long kNotCanonical = 371113;
constexpr long kNeedsFile = 371114;
constexpr long kEmbedsNone = 371115;
constexpr long kEmbedsOthers = 371116;
constexpr long kRefersToWorkspace = 371117;
constexpr long kNotInFile = 371118;
constexpr long kNoTransformers = 371119;
constexpr long kCannotBeWritten = 371120;
constexpr long kNeedsWord = 371121;
constexpr long kWordUnknown = 371122;
constexpr long kWordOr = 371123;
constexpr long kWordMisspelt = 371124;
constexpr long kSomeWordsOnly = 371125;
constexpr long kNoVersionOf = 371126;
constexpr long kNoVersionAmong = 371127;
constexpr long kNoTransformerNamed = 371128;
constexpr long kNoCategoryNamed = 371129;
constexpr long kListNamesAll = 371130;
constexpr long kThereAre = 371131;
constexpr long kDidYouMean = 371132;
constexpr long kCustomMark = 371133;
constexpr long kUnexpectedEnd = 371134;
constexpr long kStreamClosed = 371142;
constexpr long kNoTemporaryCopy = 371143;
constexpr long kStreamTooLarge = 371144;
constexpr long kLineTooLong = 371145;
constexpr long kCannotBeRead = 371146;
constexpr long kNotWritable = 371147;

// What documents hold.
constexpr long kInfoInComments = 371180;
constexpr long kInfoNewestVersion = 371181;
constexpr long kInfoPlainXml = 371182;
constexpr long kInfoDocument = 371183;
constexpr long kInfoReader = 371184;
constexpr long kInfoWriter = 371185;
constexpr long kInfoDisabled = 371186;
constexpr long kInfoDisabledCount = 371187;
constexpr long kInfoLine = 371188;
constexpr long kInfoAttributes = 371189;
constexpr long kInfoVersion = 371190;
constexpr long kInfoVersionNumbers = 371191;
constexpr long kInfoService = 371192;
constexpr long kInfoRepository = 371193;
constexpr long kInfoItem = 371194;
constexpr long kInfoServer = 371195;
constexpr long kInfoNoPrompt = 371196;
constexpr long kInfoCustom = 371197;
constexpr long kInfoOfFeatures = 371198;
constexpr long kInfoOfAttributes = 371199;
constexpr long kInfoOnLink = 371200;
constexpr long kInfoInput = 371201;
constexpr long kInfoOutput = 371202;
constexpr long kInfoLoop = 371203;
constexpr long kInfoNotPublished = 371204;
constexpr long kInfoCustomTitle = 371205;
constexpr long kInfoCustomTitleVersion = 371206;
constexpr long kInfoVersions = 371207;
constexpr long kInfoDatasets = 371208;
constexpr long kInfoFeatureTypes = 371209;
constexpr long kInfoParameters = 371210;
constexpr long kInfoTransformers = 371211;
constexpr long kInfoLinks = 371212;
constexpr long kInfoComments = 371213;
constexpr long kInfoBookmarks = 371214;
constexpr long kInfoBreakpoints = 371215;
constexpr long kInfoConstants = 371216;
constexpr long kInfoPorts = 371217;

// Workspace documents and files of versions.
constexpr long kFileNotRead = 371150;
constexpr long kNoPlainCopy = 371151;
constexpr long kHeaderLineTooLong = 371152;
constexpr long kBadHeaderLine = 371153;
constexpr long kNoHeaderInXml = 371154;
constexpr long kWorkspaceNotWritten = 371155;
constexpr long kForbiddenCharacter = 371156;
constexpr long kLongDocumentValue = 371157;
constexpr long kNoVersionAtByte = 371158;
constexpr long kVersionWithoutDocument = 371159;
constexpr long kVersionNeedsFields = 371160;
constexpr long kNoVersionNumber = 371161;
constexpr long kFieldBreaks = 371162;
constexpr long kDefinitionLineBreaks = 371163;
constexpr long kDefinitionLineEnds = 371164;
constexpr long kNoXmlDeclaration = 371165;
constexpr long kVersionNotWritten = 371166;
constexpr long kVersionThere = 371167;
constexpr long kNoVersionFile = 371168;
constexpr long kDocumentParameters = 371169;
constexpr long kSubDocumentParameters = 371170;
constexpr long kParameterRefused = 371171;
constexpr long kTooManyParameters = 371172;
constexpr long kNoXmlName = 371173;
constexpr long kNameNotEncoded = 371174;
constexpr long kOutOfMemory = 371175;

// Values and documents.
constexpr long kRefersToNothing = 371303;
constexpr long kNeverNumber = 371304;
constexpr long kUnfitChoice = 371310;
constexpr long kUnfitNumber = 371311;
constexpr long kNoWholeNumber = 371312;
constexpr long kUnfitRange = 371313;
constexpr long kConflictMark = 371314;
constexpr long kContradictingParameter = 371315;
constexpr long kRepeatedParameter = 371316;
constexpr long kMalformedWorkspaceValue = 371317;
constexpr long kUnknownDocumentAttribute = 371318;
constexpr long kUnknownDocumentElement = 371319;
constexpr long kStrayLine = 371320;

// Judgement.
constexpr long kParameterCircle = 371400;
constexpr long kFaultyStatements = 371401;
constexpr long kFaultyValue = 371402;
constexpr long kFaultyHeaderLine = 371403;

// What custom transformers and names need.
constexpr long kStatementNameTaken = 371470;
constexpr long kFactoryTaken = 371471;
constexpr long kTakenAlong = 371472;
constexpr long kBadVersion = 371473;
constexpr long kFieldCannotHold = 371474;
constexpr long kBodyOfOther = 371475;
constexpr long kNoProcessSetting = 371476;
constexpr long kOutputNotThere = 371477;
constexpr long kPortsInMain = 371478;
constexpr long kIncludedInHeader = 371479;
constexpr long kSubDocumentOfNewerBuild = 371480;
constexpr long kOpenHeader = 371481;
constexpr long kBehindHeader = 371482;
constexpr long kNameReadsEncoded = 371483;

// Links.
constexpr long kContradictingLink = 371450;
constexpr long kRepeatedLink = 371451;
constexpr long kIdleAttributeLink = 371452;
constexpr long kLinkedAttributeMissing = 371453;
constexpr long kLinkedAttributeUnlisted = 371454;

// What documents and the files around them are refused for.
constexpr long kFileNotOpened = 371455;
constexpr long kParseErrorAt = 371456;
constexpr long kParseError = 371457;
constexpr long kHeaderNotText = 371458;
constexpr long kUnknownPromptType = 371459;
constexpr long kEmptyDefinition = 371460;
constexpr long kTakenByLookup = 371461;

// Names.
constexpr long kReferenceInName = 370940;
constexpr long kShownSideReferred = 371321;
constexpr long kShownSideWritten = 371322;
constexpr long kParallelByFeature = 371323;
constexpr long kNoParallelLevel = 371324;
constexpr long kScriptReadsUnknown = 371325;
constexpr long kScriptReadsLater = 371326;
constexpr long kMemberLeftOut = 371327;
constexpr long kNoSuchPart = 371328;
constexpr long kPartTwice = 371329;
constexpr long kConditionForParts = 371330;
constexpr long kValueNeeded = 371340;
constexpr long kPartNeeded = 371341;
constexpr long kCellNeeded = 371342;
constexpr long kRowBreaksOff = 371343;
constexpr long kConditionInTemplate = 371345;
constexpr long kResultBreaksLine = 371346;

}  // namespace orx::messages
