#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/PrintableText.h>
#include <transform/text/MessageStrings.h>

#include <cstdio>
#include <cstdlib>
#include <unistd.h>

using orx::Severity;

namespace {

constexpr int kLongestMessage = 12000;  // two long paths have room

// Without the message files, under a wrong home, the arguments still tell what is meant.
QString textOf(long message, const QStringList& arguments) {
  const QString text = TransformResString(message, arguments);
  return text.isEmpty() ? arguments.join(QLatin1Char(' ')) : text;
}

}  // namespace

Console::Console()
    : m_colours(isatty(STDERR_FILENO) != 0 && std::getenv("NO_COLOR") == nullptr),
      m_progress(isatty(STDERR_FILENO) != 0) {}

bool Console::print(const QString& text) {
  const QByteArray bytes = text.toUtf8();
  return std::fwrite(bytes.constData(), 1, static_cast<std::size_t>(bytes.size()), stdout) ==
         static_cast<std::size_t>(bytes.size());
}

bool Console::flush() {
  return std::fflush(stdout) == 0 && std::ferror(stdout) == 0;
}

void Console::writeError(const QString& text) {
  endProgress();
  const QByteArray bytes = text.toUtf8() + '\n';
  std::fwrite(bytes.constData(), 1, static_cast<std::size_t>(bytes.size()), stderr);
}

void Console::fail(const QString& text) {
  writeError(QLatin1String("orxt: ") + withoutControls(text, kLongestMessage));
}

void Console::fail(long message, const QStringList& arguments) {
  fail(textOf(message, arguments));
}

void Console::failFile(const QString& file, long message, const QStringList& arguments) {
  failFile(file, textOf(message, arguments));
}

void Console::failFile(const QString& file, const QString& reason) {
  writeError(file + QLatin1String(": error: ") + reason);
}

void Console::show(const orx::Findings& findings) {
  for (const orx::Finding& finding : findings.all())
    show(finding);
}

void Console::show(const orx::Finding& finding) {
  showFinding(
      finding.file, finding.line, finding.severity,
      orx::textWithNode(finding) + QLatin1String(" [") + orx::ruleRow(finding.rule).name + QLatin1Char(']'));
}

void Console::showFinding(const QString& file, int line, Severity severity, const QString& text) {
  QString word = orx::severityName(severity);
  if (m_colours) {
    const char* colour = severity == Severity::Error     ? "\x1b[1;31m"
                         : severity == Severity::Warning ? "\x1b[1;33m"
                                                         : "\x1b[1;36m";
    word = QLatin1String(colour) + word + QLatin1String("\x1b[0m");
  }
  writeError(orx::formatFinding(file, line, word, text));
}

void Console::showProgress(const QString& text) {
  if (!m_progress)
    return;
  const QByteArray bytes = "\r\x1b[K" + text.toUtf8();
  std::fwrite(bytes.constData(), 1, static_cast<std::size_t>(bytes.size()), stderr);
  std::fflush(stderr);
  m_progressShown = true;
}

void Console::endProgress() {
  if (!m_progressShown)
    return;
  std::fputs("\r\x1b[K", stderr);
  m_progressShown = false;
}
