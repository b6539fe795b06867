#include <transform/scripts/PythonSyntax.h>
#include <transform/scripts/TclSyntax.h>
#include <transform/text/MacroText.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>
#include <translation/mappingfile/MappingFileScripts.h>

#include <algorithm>

namespace messages = orx::messages;

using orx::Rule;

namespace {

// What is handed to one Python interpreter, in characters.
constexpr qint64 kMostPython = 64 * 1024 * 1024;
// A body of comments alone is fine.
const QLatin1String kFunctionStart("def block():\n");
const QLatin1String kFunctionEnd(" pass\n");

int lineOf(const std::vector<int>& lines, int line) {
  if (lines.empty())
    return 0;
  const int last = static_cast<int>(lines.size()) - 1;
  return lines[static_cast<std::size_t>(std::clamp(line - 1, 0, last))];
}

}  // namespace

void MappingFileScripts::checkTcl(const MappingFileStatement& statement, int begin, int end,
                                  MappingFileReport& report) {
  const QString part = statement.text.mid(begin, end - begin);
  const QString script = blankReferences(part, macroReferences(part));
  const TclFault fault = findTclFault(script);
  if (!fault.text.isEmpty()) {
    const int offset = QString::fromUtf8(script.toUtf8().left(fault.offset)).size();
    report.add(Rule::TclSyntax, statement.lineAt(begin + offset), {fault.text.simplified()});
  }
}

void MappingFileScripts::beginBlock(bool isPython) {
  m_isPython = isPython;
  m_block.clear();
  m_blockLines.clear();
}

void MappingFileScripts::addLine(const MappingFileStatement& line) {
  // The lines are the body of a function.
  if (m_isPython)
    m_block += QLatin1Char(' ');
  m_block += line.text + QLatin1Char('\n');
  m_blockLines.push_back(line.line());
}

void MappingFileScripts::endBlock(MappingFileReport& report) {
  if (m_blockLines.empty())
    return;
  if (!m_isPython) {
    const TclFault fault = findTclFault(m_block);
    if (!fault.text.isEmpty())
      report.add(Rule::TclSyntax, lineOf(m_blockLines, fault.line), {fault.text.simplified()});
  } else if (m_pythonSize + m_block.size() > kMostPython) {
    m_uncheckedLine = m_uncheckedLine == 0 ? m_blockLines.front() : m_uncheckedLine;
  } else {
    m_pythonSize += m_block.size();
    m_python.append(kFunctionStart + m_block + kFunctionEnd);
    m_pythonLines.push_back(m_blockLines);
  }
  m_block.clear();
  m_blockLines.clear();
}

void MappingFileScripts::finish(MappingFileReport& report) {
  PythonSyntax python;
  if (!python.check(m_python)) {
    report.add(Rule::UncheckedPython, m_pythonLines.front().front(), {python.errorString()});
  }
  for (const PythonFault& fault : python.faults()) {
    const std::vector<int>& lines = m_pythonLines[static_cast<std::size_t>(fault.script)];
    report.add(Rule::PythonSyntax, lineOf(lines, fault.line - 1), {fault.text});
  }
  if (m_uncheckedLine > 0)
    report.add(Rule::UncheckedPython, m_uncheckedLine, {TransformResString(messages::kTooMuchPython)});
}
