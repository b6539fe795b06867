#include <transform/core/Keywords.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextPlaces.h>
#include <translation/mappingfile/MappingFileFactory.h>
#include <translation/mappingfile/MappingFileFunctions.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>

using orx::Rule;

namespace {

const QLatin1String kMetaParameters("FACTORY_META_PARAMS");
const QLatin1String kWorkerKind("TransformFact");
const QLatin1String kRunStatements("RUN:STATEMENTS");
const QLatin1String kParameterList("TRANSFORMER_PARAMS:");
const QLatin1String kRecurringInputs("RECURRING_INPUT_TAG:");

const char* const kForm = "FACTORY_DEF * KIND FACTORY_NAME NAME CLAUSE...";
const char* const kWorkerForm = "FACTORY_DEF * TransformFact:VERSION:TRANSFORMER FACTORY_NAME NAME";
const char* const kInputForm = "INPUT FEATURE_TYPE TYPE [FILTER], INPUT PORT FEATURE_TYPE TYPE [FILTER]";
const char* const kOutputForm =
    "OUTPUT FEATURE_TYPE TYPE FUNCTION..., OUTPUT PORT FEATURE_TYPE TYPE FUNCTION...";
const char* const kSettingForm = "KEY VALUE";
const char* const kWorkerSettingForm = "KEY:VALUE";

// What such a factory gives leaves the file or the definition.
bool isRoute(const QString& name) {
  return name.endsWith(kCollectorName) || name.endsWith(kOutputRenamerName);
}

}  // namespace

MappingFileFactory::MappingFileFactory(const MappingFileStatement& statement, MappingFileFlow& flow,
                                       MappingFileFunctions& functions, MappingFileReport& report)
    : m_statement(statement), m_flow(flow), m_functions(functions), m_report(report) {}

void MappingFileFactory::expect(const MappingFileWord& word, const char* form) {
  // What a macro brings is not known here.
  if (word.text.startsWith(kMacroOpen))
    return;
  m_report.add(Rule::BadClause, m_statement.lineAt(word.offset()),
               {word.text.toString(), QLatin1String(form)});
}

bool MappingFileFactory::nextWord(MappingFileWords& words, MappingFileWord& word, bool isName) {
  if (!words.next(word))
    return false;
  m_functions.check(word, isName);
  return true;
}

bool MappingFileFactory::readHead(MappingFileWords& words) {
  MappingFileWord domain;
  MappingFileWord kind;
  MappingFileWord keyword;
  MappingFileWord name;
  // The name of the transformer may be quoted inside of the word.
  words.setSettings(true);
  const bool isWhole = nextWord(words, domain) && domain.is(QLatin1String("*")) &&
                       nextWord(words, kind, true) && kind.kind == MappingFileWord::Kind::Bare &&
                       nextWord(words, keyword) && keyword.is(kFactoryNameKeyword) &&
                       nextWord(words, name, true);
  words.setSettings(false);
  if (!isWhole) {
    m_report.add(Rule::BadStatement, m_statement.line(), {QLatin1String(kForm)});
    return false;
  }
  m_name = name.value();
  if (kind.text.startsWith(kWorkerKind))
    readKind(kind);
  else if (isRoute(m_name))
    m_role = MappingFileFlow::Role::Route;
  m_flow.addFactory(m_name, m_role, m_statement.lineAt(name.offset()), m_report);
  return true;
}

// TransformFact:VERSION:TRANSFORMER
void MappingFileFactory::readKind(const MappingFileWord& kind) {
  m_role = MappingFileFlow::Role::Worker;
  const QString text = kind.text.toString();
  bool isNumber = false;
  const int version = text.section(QLatin1Char(':'), 1, 1).toInt(&isNumber);
  MappingFileWord transformer;
  const QString quoted = text.section(QLatin1Char(':'), 2);
  MappingFileWords parts(quoted);
  if (!isNumber || !parts.next(transformer)) {
    m_report.add(Rule::BadStatement, m_statement.line(), {QLatin1String(kWorkerForm)});
    return;
  }
  m_transformer = transformer.value();
  m_version = version;
}

void MappingFileFactory::readSetting(const MappingFileWord& setting) {
  const int colon = setting.text.indexOf(QLatin1Char(':'));
  const int begin = setting.offset() + colon + 1;
  const int end = setting.offset() + setting.text.size();
  if (colon <= 0 || !TextPlaces::isKey(setting.text.left(colon))) {
    expect(setting, kWorkerSettingForm);
  } else if (setting.is(kRunStatements)) {
    // The statements behind this one, not a definition.
    m_flow.addWorkerRun(m_name, m_statement.lineAt(setting.offset()));
    m_transformer.clear();
    m_version = 0;
  } else if (setting.text.startsWith(kParameterList) || setting.text.startsWith(kRecurringInputs)) {
    m_functions.checkEncodedList(begin, end);
  }
}

bool MappingFileFactory::readPort(bool isInput, MappingFileWords& words, MappingFileWord& word,
                                  bool& hasWord) {
  MappingFileWord type;
  bool isWhole = nextWord(words, word);
  if (isWhole && !word.is(kFeatureTypeKeyword))
    isWhole = nextWord(words, word) && word.is(kFeatureTypeKeyword);
  if (!isWhole || !nextWord(words, type, true)) {
    hasWord = false;
    return false;
  }
  const QString name = type.value();
  const int line = m_statement.lineAt(type.offset());
  // An output that is not connected may have an empty type.
  if (!name.isEmpty() && isInput)
    m_flow.take(name, line);
  else if (!name.isEmpty())
    m_flow.give(name, line, m_role);
  hasWord = nextWord(words, word);
  // The filter of an input; the functions of an output.
  while (hasWord && word.kind == MappingFileWord::Kind::Call) {
    hasWord = nextWord(words, word);
    if (isInput)
      break;
  }
  return true;
}

void MappingFileFactory::readClauses(MappingFileWords& words) {
  MappingFileWord word;
  bool hasWord = nextWord(words, word);
  bool hasOutputs = false;
  bool isSettings = false;  // of a worker
  bool isValue = false;     // behind a key
  while (hasWord) {
    const bool isInput = word.is(kInputKeyword);
    if (isInput || word.is(kOutputKeyword)) {
      const MappingFileWord keyword = word;
      words.setSettings(false);
      isSettings = false;
      isValue = false;
      if (isInput && hasOutputs)
        expect(keyword, kOutputForm);
      hasOutputs = hasOutputs || !isInput;
      if (!readPort(isInput, words, word, hasWord)) {
        expect(keyword, isInput ? kInputForm : kOutputForm);
        return;
      }
      continue;
    }
    if (isSettings) {
      readSetting(word);
    } else if (word.is(kMetaParameters)) {
      isSettings = m_role == MappingFileFlow::Role::Worker;
      words.setSettings(isSettings);
    } else if (hasOutputs && !isValue) {
      expect(word, kOutputForm);
      isValue = true;
    } else if (!isValue) {
      if (word.kind != MappingFileWord::Kind::Bare || !TextPlaces::isKey(word.text))
        expect(word, kSettingForm);
      isValue = true;
    }
    hasWord = nextWord(words, word, isSettings);
  }
}

void MappingFileFactory::read(MappingFileWords& words) {
  if (readHead(words))
    readClauses(words);
}
