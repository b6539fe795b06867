#include <platform/orxparameter/orxparameter.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MappingFileWords.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>
#include <translation/mappingfile/MappingFileFactory.h>
#include <translation/mappingfile/MappingFileFunctions.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>
#include <translation/mappingfile/MappingFileStatements.h>

using orx::Rule;

namespace {

using Use = MappingFileMacros::Use;

const QLatin1String kPromptLine("GUI");
// Macros, factories, feature types and definitions that are held in memory.
constexpr std::size_t kMostNames = 4 * 1000 * 1000;

const QStringList& keywords() {
  static const QStringList list = {
      kFactoryStatement,
      kFactoryOptionStatement,
      kMacroStatement.trimmed(),
      kDefaultMacroStatement.trimmed(),
      kIncludeStatement,
      kIncludeCustomStatement,
      kIncludeBuiltInStatement,
      kTclStatement,
      kReaderTypeStatement,
      kWriterTypeStatement,
      kPromptLine,
      kIncludeEnd,
  };
  return list;
}

}  // namespace

// A statement with what its checks share.
struct MappingFileStatements::Part {
  const MappingFileStatement& statement;
  const std::vector<MacroReference>& references;
  MappingFileWords& words;  // behind the keyword
  MappingFileFunctions& functions;

  int begin() const { return words.rest().isEmpty() ? statement.text.size() : words.rest().position(); }
  int end() const { return begin() + words.rest().size(); }
};

MappingFileStatements::MappingFileStatements(MappingFileReport& report) : m_report(report), m_scopes(1) {}

void MappingFileStatements::expect(const Part& part, const char* form) {
  m_report.add(Rule::BadStatement, part.statement.line(), {QLatin1String(form)});
}

void MappingFileStatements::refer(const Part& part, int from, int to, Use use) {
  m_macros.refer(part.statement, part.references, from, to, useOf(use), block(), m_report);
}

void MappingFileStatements::check(const MappingFileStatement& statement) {
  endScript();
  m_hasStatements = m_hasStatements || block() < 0;
  const std::vector<MacroReference> references = macroReferences(statement.text);
  MappingFileFunctions functions(statement, references, m_report);
  MappingFileWords words(statement.text);
  MappingFileWord keyword;
  if (!words.next(keyword))
    return;
  Part part{statement, references, words, functions};
  if (!checkKnown(keyword.text, part))
    checkUnknown(keyword.text, part);
}

bool MappingFileStatements::checkKnown(const QStringRef& keyword, Part& part) {
  if (keyword == kFactoryStatement)
    checkFactory(part);
  else if (keyword == kFactoryOptionStatement)
    checkOption(part);
  else if (keyword == kMacroStatement.trimmed() || keyword == kDefaultMacroStatement.trimmed())
    checkMacro(part);
  else if (keyword == kReaderTypeStatement || keyword == kWriterTypeStatement)
    checkFeatureType(part, keyword == kReaderTypeStatement);
  else if (keyword == kIncludeStatement)
    checkInclude(part);
  else if (keyword == kIncludeCustomStatement || keyword == kIncludeBuiltInStatement)
    checkIncludeCustom(part);
  else if (keyword == kTclStatement)
    checkTclStatement(part);
  else if (keyword == kPromptLine)
    checkPrompt(part);
  else
    return false;
  return true;
}

void MappingFileStatements::checkUnknown(const QStringRef& keyword, Part& part) {
  const int line = part.statement.line();
  if (keyword == kIncludeEnd) {
    // The end of a block of script lines comes here as well.
    if (!m_isScript)
      m_report.add(Rule::StrayEnd, line, {keyword.toString()});
    m_isScript = false;
    return;
  }
  const QString meant = m_report.nearest(keyword.toString(), keywords());
  if (meant.isEmpty())
    m_report.add(Rule::UnknownStatement, line, {keyword.toString()});
  else
    m_report.add(Rule::MisspeltStatement, line, {keyword.toString(), meant});
  refer(part, 0, part.statement.text.size(), Use::Later);
}

void MappingFileStatements::checkFactory(Part& part) {
  refer(part, 0, part.statement.text.size(), Use::Now);
  MappingFileFactory factory(part.statement, flow(), part.functions, m_report);
  factory.read(part.words);
  if (factory.runVersion() > 0)
    m_definitions.include(factory.runTransformer(), factory.runVersion(), block(), part.statement.line(),
                          true);
}

void MappingFileStatements::checkOption(Part& part) {
  refer(part, 0, part.statement.text.size(), Use::Now);
  MappingFileWord name;
  MappingFileWord key;
  if (!part.words.next(name) || !part.words.next(key) || !TextPlaces::isKey(key.text)) {
    expect(part, "FACTORY_OPTION NAME KEY VALUE");
    return;
  }
  part.functions.checkEncoded(name.offset(), name.offset() + name.text.size());
  flow().addOption(name.text.toString(), part.statement.lineAt(name.offset()));
  MappingFileWord value;
  while (part.words.next(value))
    part.functions.check(value);
}

void MappingFileStatements::checkMacro(Part& part) {
  const int begin = part.begin();
  const QString& text = part.statement.text;
  int end = begin;
  while (end < text.size() && text.at(end) != QLatin1Char(' ') && text.at(end) != QLatin1Char('\t'))
    ++end;
  const QString name = text.mid(begin, end - begin);
  const QString plain = blankReferences(text, part.references).mid(begin, end - begin);
  refer(part, begin, end, Use::Now);
  refer(part, end, text.size(), Use::Later);
  if (!isMacroName(plain))
    expect(part, "MACRO NAME VALUE");
  else
    m_macros.set(name, text.mid(end).trimmed(), part.statement.line());
}

void MappingFileStatements::checkFeatureType(Part& part, bool isReader) {
  refer(part, 0, part.statement.text.size(), Use::Now);
  QStringList values;
  MappingFileWord word;
  while (values.size() <= 3 && part.words.next(word)) {
    part.functions.check(word);
    values.append(word.value());
  }
  if (values.size() != 3)
    expect(part,
           isReader ? "READER_FEATURE_TYPE KEYWORD TYPE FLOW" : "WRITER_FEATURE_TYPE KEYWORD FLOW TYPE");
  else if (isReader)
    flow().give(values.at(2), part.statement.line(), MappingFileFlow::Role::Ordinary);
  else
    flow().write(values.at(1), part.statement.line());
}

void MappingFileStatements::checkInclude(Part& part) {
  const QStringRef rest = part.words.rest();
  if (rest.startsWith(QLatin1Char('['))) {
    const int close = part.statement.text.lastIndexOf(QLatin1Char(']'));
    if (close < rest.position())
      expect(part, "INCLUDE [ SCRIPT ]");
    else
      checkScript(part, rest.position() + 1, close);
    return;
  }
  const QString block = QStringLiteral("INCLUDE ") + rest;
  if (block == kIncludePython || block == kIncludeTcl) {
    m_isScript = true;
    m_scripts.beginBlock(block == kIncludePython);
    return;
  }
  refer(part, part.begin(), part.end(), Use::Now);
  if (rest.isEmpty())
    expect(part, "INCLUDE [ SCRIPT ], INCLUDE FILE, INCLUDE TCL, INCLUDE PYTHON");
  else
    m_macros.noteInclude();
}

void MappingFileStatements::checkIncludeCustom(Part& part) {
  const QString rest = part.words.rest().toString();
  refer(part, part.begin(), part.end(), Use::Now);
  const int colon = rest.lastIndexOf(QLatin1Char(':'));
  bool isNumber = false;
  const int version = rest.mid(colon + 1).toInt(&isNumber);
  const QString name = rest.left(colon);
  if (colon <= 0 || !isNumber || version <= 0) {
    expect(part, "INCLUDE_CUSTOM_TRANSFORMER_VER NAME:VERSION");
    return;
  }
  const int line = part.statement.line();
  m_definitions.include(name, version, block(), line, false);
  m_macros.need(makePrefixMacro(name), line, useOf(Use::Now), block());
}

void MappingFileStatements::checkPrompt(Part& part) {
  refer(part, 0, part.statement.text.size(), Use::Later);
  const GUIType type = GUIType::fromGuiLine(part.statement.text.trimmed());
  if (type.isNull())
    expect(part, "GUI TYPE NAME CONFIGURATION PROMPT");
  for (const QString& name : type.getMacroNames())
    m_macros.set(name, QString(), part.statement.line());
}

void MappingFileStatements::checkTclStatement(Part& part) {
  if (part.words.rest().isEmpty())
    expect(part, "Tcl2 SCRIPT");
  else
    checkScript(part, part.begin(), part.end());
}

void MappingFileStatements::checkScript(Part& part, int begin, int end) {
  m_macros.mention(
      blankReferences(part.statement.text, part.references, QLatin1Char(' ')).mid(begin, end - begin));
  for (const MacroReference& reference : part.references) {
    // Whatever is no reference belongs to the script.
    if (reference.isClosed && !reference.isDeferred)
      m_macros.need(reference.name(part.statement.text), part.statement.lineAt(reference.begin),
                    useOf(Use::Now), block());
  }
  MappingFileScripts::checkTcl(part.statement, begin, end, m_report);
}

void MappingFileStatements::addScriptLine(const MappingFileStatement& line) {
  m_macros.mention(line.text);
  m_scripts.addLine(line);
}

void MappingFileStatements::endScript() {
  if (m_isScript)
    m_scripts.endBlock(m_report);
}

void MappingFileStatements::beginBlock(const MappingFileStatement& opening) {
  endScript();
  m_isScript = false;
  Scope scope;
  scope.block = m_definitions.add(opening.text, block(), opening.line(), m_report);
  scope.prefix = m_definitions.prefixMacro(scope.block);
  m_macros.setPrefix(scope.prefix);
  m_scopes.push_back(std::move(scope));
}

void MappingFileStatements::endBlock() {
  endScript();
  m_isScript = false;
  flow().finish(m_report);
  m_scopes.pop_back();
  m_macros.setPrefix(m_scopes.back().prefix);
}

bool MappingFileStatements::isFull() const {
  std::size_t size = m_macros.size() + m_definitions.size();
  for (const Scope& scope : m_scopes)
    size += scope.flow.size();
  return size > kMostNames;
}

void MappingFileStatements::finish(const std::function<bool(const QString&, int)>& isInstalled) {
  endScript();
  flow().finish(m_report);
  m_macros.finish(m_definitions.open(), m_report);
  m_definitions.finish(!m_hasStatements, isInstalled, m_report);
  m_scripts.finish(m_report);
}
