#include <platform/qorxcore/qorxcore.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileWords.h>
#include <translation/mappingfile/MappingFileFunctions.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>
#include <translation/mappingfile/MappingFileScripts.h>

using orx::Rule;

namespace {

const QLatin1String kValue("Value");
const QLatin1String kCopyAttribute("CopyAttribute");
const QLatin1String kEvaluate("EvaluateExpression");
const QLatin1String kTcl("Tcl2");
const QLatin1String kChooseStart("@Choose(");
const QLatin1String kValueStart("@Value(");
const QLatin1String kFractionsMark("FDIV");
const QLatin1String kExpressionTypes[] = {QLatin1String("STRING"), QLatin1String("STRING_ENCODED"),
                                          QLatin1String("INT"), QLatin1String("FLOAT")};

const char* const kExpressionForm = "@EvaluateExpression([FDIV,]STRING|STRING_ENCODED|INT|FLOAT,NAME,BODY)";

const QStringList& functionNames() {
  static const QStringList names = {kCopyAttribute, kEvaluate, kTcl, kValue};
  return names;
}

// The characters that have a name in the word encoding, by that name.
const QStringList& characterNames() {
  static const QStringList names = [] {
    QStringList list;
    for (ushort code = 0x20; code <= 0xa0; ++code) {
      const QString name = QORXWwjdEncode(QString(QChar(code)));
      if (name.size() > 2 && !name.startsWith(QLatin1String("<u0")))
        list.append(name);
    }
    return list;
  }();
  return names;
}

}  // namespace

MappingFileFunctions::MappingFileFunctions(const MappingFileStatement& statement,
                                           const std::vector<MacroReference>& references,
                                           MappingFileReport& report)
    : m_statement(statement), m_text(blankReferences(statement.text, references)), m_report(report) {}

int MappingFileFunctions::find(QChar c, int begin, int end) const {
  for (int i = begin; i < end; ++i) {
    if (m_text.at(i) == c)
      return i;
  }
  return -1;
}

bool MappingFileFunctions::isEncoded(int begin, int end) const {
  return QORXWwjdIsWellFormed(m_text.mid(begin, end - begin));
}

void MappingFileFunctions::reportCall(int begin, int end, const char* form) {
  m_report.add(Rule::BadFunction, m_statement.lineAt(begin),
               {m_statement.text.mid(begin, end - begin), QLatin1String(form)});
}

void MappingFileFunctions::check(const MappingFileWord& word, bool isName) {
  const int begin = word.offset();
  const int end = begin + word.text.size();
  if (!word.isClosed && word.kind != MappingFileWord::Kind::Call)
    m_report.add(Rule::OpenQuote, m_statement.lineAt(begin), {word.text.toString()});
  else if (word.isGlued)
    m_report.add(Rule::GluedQuote, m_statement.lineAt(begin), {word.text.toString()});
  if (word.kind == MappingFileWord::Kind::Quoted)
    return;
  if (!isName || word.kind == MappingFileWord::Kind::Call)
    checkCalls(begin, end);
  if (word.kind == MappingFileWord::Kind::Bare)
    checkCharacterNames(begin, end);
}

void MappingFileFunctions::checkCalls(int begin, int end) {
  int i = begin;
  while ((i = find(QLatin1Char('@'), i, end)) >= 0) {
    const QStringRef name = mappingFileCallName(m_text, i, end);
    const bool isKnown = !name.isEmpty() && functionNames().contains(name.toString());
    if (!isKnown) {
      // Inside of a word an "@" may be one of an ordinary text.
      if (i == begin && !name.isEmpty())
        m_report.addMisspelt(Rule::UnknownFunction, m_statement.lineAt(i),
                             {name.toString(), QLatin1Char('@') + functionNames().join(QLatin1String(", @"))},
                             functionNames());
      ++i;
      continue;
    }
    const int close = endOfMappingFileCall(m_text, i + 1 + name.size(), end);
    if (close < 0) {
      m_report.add(Rule::OpenFunction, m_statement.lineAt(i), {m_statement.text.mid(i, end - i)});
      return;
    }
    checkCall(name, i, close);
    i = close;
  }
}

void MappingFileFunctions::checkCall(const QStringRef& name, int begin, int end) {
  const int inside = begin + name.size() + 2;
  if (name == kTcl) {
    MappingFileScripts::checkTcl(m_statement, inside, end - 1, m_report);
  } else if (name == kValue) {
    if (m_text.midRef(inside, end - 1 - inside).trimmed().isEmpty())
      reportCall(begin, end, "@Value(ATTRIBUTE)");
  } else if (name == kCopyAttribute) {
    if (hasPairs(inside, end - 1))
      checkEncodedList(inside, end - 1);
    else
      reportCall(begin, end, "@CopyAttribute(NEW,OLD,NEW,OLD...)");
  } else if (!checkExpression(inside, end - 1)) {
    reportCall(begin, end, kExpressionForm);
  }
}

// Whether pairs of arguments stand there, none of them empty.
bool MappingFileFunctions::hasPairs(int begin, int end) const {
  int count = 0;
  for (int comma = begin; comma >= 0; begin = comma + 1, ++count) {
    comma = find(QLatin1Char(','), begin, end);
    if ((comma < 0 ? end : comma) == begin)
      return false;
  }
  return count % 2 == 0;
}

// [FDIV,]TYPE,NAME,BODY
bool MappingFileFunctions::checkExpression(int begin, int end) {
  const auto takePiece = [&] {
    const int comma = find(QLatin1Char(','), begin, end);
    const QStringRef piece = comma < 0 ? QStringRef() : m_text.midRef(begin, comma - begin);
    begin = comma < 0 ? end + 1 : comma + 1;
    return piece;
  };
  QStringRef type = takePiece();
  if (type == kFractionsMark)
    type = takePiece();
  bool isKnown = false;
  for (const QLatin1String known : kExpressionTypes)
    isKnown = isKnown || type == known;
  const int nameBegin = begin;
  const QStringRef name = takePiece();
  if (!isKnown || name.isEmpty() || begin > end)
    return false;
  checkEncoded(nameBegin, nameBegin + name.size());
  if (m_text.midRef(begin, kChooseStart.size()) != kChooseStart)
    return checkExpressionText(begin, end);
  const int open = begin + kChooseStart.size() - 1;
  if (endOfMappingFileCall(m_text, open, end) != end)
    return false;
  for (int from = open + 1; from < end;) {
    const int comma = find(QLatin1Char(','), from, end - 1);
    const int to = comma < 0 ? end - 1 : comma;
    if (!checkExpressionText(from, to))
      return false;
    from = to + 1;
  }
  return true;
}

// Text in the word encoding, with "@Value(word)" in it.
bool MappingFileFunctions::checkExpressionText(int begin, int end) {
  while (begin < end) {
    const int at = find(QLatin1Char('@'), begin, end);
    checkEncoded(begin, at < 0 ? end : at);
    if (at < 0)
      return true;
    if (m_text.midRef(at, kValueStart.size()) != kValueStart)
      return false;
    const int inside = at + kValueStart.size();
    const int close = find(QLatin1Char(')'), inside, end);
    if (close <= inside)
      return false;
    checkEncoded(inside, close);
    begin = close + 1;
  }
  return true;
}

void MappingFileFunctions::checkEncoded(int begin, int end) {
  if (isEncoded(begin, end))
    return;
  const QString text = m_statement.text.mid(begin, end - begin);
  m_report.add(Rule::BadEncoding, m_statement.lineAt(begin),
               {text, QORXWwjdEncode(QORXWwjdDecode(m_text.mid(begin, end - begin)))});
}

void MappingFileFunctions::checkEncodedList(int begin, int end) {
  while (begin <= end) {
    const int comma = find(QLatin1Char(','), begin, end);
    const int to = comma < 0 ? end : comma;
    checkEncoded(begin, to);
    begin = to + 1;
  }
}

// Unknown names stand for themselves, so only those are worth a word that are like a known one.
void MappingFileFunctions::checkCharacterNames(int begin, int end) {
  int open = begin;
  while ((open = find(QLatin1Char('<'), open, end)) >= 0) {
    int close = open + 1;
    while (close < end && m_text.at(close) >= QLatin1Char('a') && m_text.at(close) <= QLatin1Char('z'))
      ++close;
    if (close < end && m_text.at(close) == QLatin1Char('>') && !isEncoded(open, close + 1)) {
      const QString name = m_text.mid(open, close + 1 - open);
      const QString meant = m_report.nearest(name, characterNames());
      if (!meant.isEmpty())
        m_report.add(Rule::MisspeltCharacter, m_statement.lineAt(open), {name, meant});
    }
    open = close;
  }
}
