#include <apps/orxt/commands/FormatCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/PrintableText.h>
#include <apps/orxt/facts/DocumentReading.h>
#include <transform/files/AtomicFile.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/WorkspaceDocument.h>

#include <CLI/CLI.hpp>

#include <algorithm>

namespace messages = orx::messages;

using orx::Severity;

namespace {

constexpr CommandFacts kFacts = {"format", "Rewrite workspaces in canonical form",
                                 "orxt format parcels.orw -o tidy.orw\n"
                                 "orxt format -i nightly/*.orw\n"
                                 "orxt format --check nightly/*.orw"};

constexpr int kLongestFinding = 300;

// The first line, from 1, in which the texts differ.
int firstDifference(const QByteArray& left, const QByteArray& right) {
  const auto at = std::mismatch(left.begin(), left.end(), right.begin(), right.end()).first;
  return 1 + static_cast<int>(std::count(left.begin(), at, '\n'));
}

}  // namespace

FormatCommand::FormatCommand() : Command(kFacts) {}

void FormatCommand::declare(CLI::App& app) {
  app.add_option("workspace", m_workspaces, "Workspace files; - is standard input")
      ->type_name("WORKSPACE")
      ->required();
  CLI::Option* inPlace = app.add_flag("-i,--in-place", m_inPlace, "Replace each file that is not canonical");
  CLI::Option* output =
      app.add_option("-o,--output", m_output, "File to write; - is standard output, which is the default")
          ->type_name("FILE")
          ->excludes(inPlace);
  app.add_flag("--check", m_check, "Write nothing; name each file that would change, and end with 1 if any")
      ->excludes(inPlace)
      ->excludes(output);
  app.add_flag("--drop", m_drop, "Write also when something of the document would be lost");
  m_language.declareLanguage(app);
  app.footer(
      app.get_footer() +
      "Header lines, line ends, encoding and all lines around the document are kept. What the\n"
      "canonical form does not hold (constants, unknown elements and attributes, comments) is listed,\n"
      "and nothing is written, unless --drop is given.\n");
}

ExitStatus FormatCommand::run(Console& console) {
  if (!optionsFit(console))
    return kExitUsage;
  int worst = kExitDone;
  for (const std::string& name : m_workspaces)
    worst = std::max<int>(worst, format(QString::fromStdString(name), console));
  return static_cast<ExitStatus>(worst);
}

bool FormatCommand::optionsFit(Console& console) const {
  if (m_workspaces.size() > 1 && !m_inPlace && !m_check) {
    console.fail(messages::kNoOnePlace);
    return false;
  }
  const auto isStream = [](const std::string& name) {
    return InputFile::isStandardInput(QString::fromStdString(name));
  };
  if (m_inPlace && std::any_of(m_workspaces.begin(), m_workspaces.end(), isStream)) {
    console.fail(messages::kStreamInPlace);
    return false;
  }
  return true;
}

ExitStatus FormatCommand::format(const QString& fileName, Console& console) const {
  const QString shownName = InputFile::shownName(fileName);
  WorkspaceDocument document(fileName);
  const ExitStatus status = readDocument(document, fileName, console);
  if (status != kExitDone)
    return status;
  QByteArray bytes;
  QByteArray original;
  QString error;
  if (!mayLose(document, shownName, console))
    return kExitRefused;
  if (!document.canonicalBytes(bytes, error)) {
    console.showFinding(shownName, 0, Severity::Error, onOneLine(error, kLongestFinding));
    return kExitRefused;
  }
  if (!m_check && !m_inPlace)
    return write(bytes, m_output.empty() ? QStringLiteral("-") : QString::fromStdString(m_output), console);
  if (!document.originalBytes(original, error)) {
    console.failFile(shownName, error);
    return kExitFile;
  }
  if (m_check)
    return compare(original, bytes, shownName, console);
  if (!document.isReplaceable()) {
    console.failFile(shownName, messages::kNotReplaceable);
    return kExitFile;
  }
  return original == bytes ? kExitDone : write(bytes, fileName, console);
}

bool FormatCommand::mayLose(const WorkspaceDocument& document, const QString& shownName,
                            Console& console) const {
  const std::vector<WorkspaceLossReport::Loss> losses = document.losses();
  for (const WorkspaceLossReport::Loss& loss : losses) {
    orx::Finding finding = WorkspaceDocument::findingOf(loss);
    finding.file = shownName;
    finding.severity = m_drop ? Severity::Warning : Severity::Error;
    finding.text = onOneLine(finding.text, kLongestFinding);
    console.show(finding);
  }
  if (losses.empty() || m_drop)
    return true;
  if (losses.size() == 1)
    console.failFile(shownName, messages::kOneLoss);
  else
    console.failFile(shownName, messages::kLosses, {QString::number(losses.size())});
  return false;
}

ExitStatus FormatCommand::compare(const QByteArray& original, const QByteArray& bytes,
                                  const QString& shownName, Console& console) const {
  if (original == bytes)
    return kExitDone;
  console.showFinding(shownName, firstDifference(original, bytes), Severity::Error,
                      TransformResString(messages::kNotCanonical));
  return kExitRefused;
}

ExitStatus FormatCommand::write(const QByteArray& bytes, const QString& outputFile, Console& console) const {
  AtomicFile output(outputFile);
  if (output.open()) {
    output.device().write(bytes);
    if (output.commit())
      return kExitDone;
  }
  console.fail(messages::kNotWritable, {output.errorString()});
  return kExitFile;
}
