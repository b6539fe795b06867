#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/mappingfile/MappingFileReport.h>

namespace messages = orx::messages;

using orx::Rule;

namespace {

constexpr int kMostFindings = 20000;
// Findings quote what stands in the file, which may be of any length.
constexpr int kLongestQuote = 120;

QStringList shortened(QStringList arguments) {
  for (QString& argument : arguments) {
    if (argument.size() > kLongestQuote)
      argument = argument.left(kLongestQuote) + QLatin1String("...");
    argument.replace(QChar(0), QChar(QChar::ReplacementCharacter));
  }
  return arguments;
}

}  // namespace

bool MappingFileReport::takesMore(int line) {
  if (m_count == kMostFindings)
    m_diagnostics.report(Rule::TooManyFindings, line, QString(), {QString::number(kMostFindings)});
  return m_count++ < kMostFindings;
}

void MappingFileReport::add(Rule rule, int line, const QStringList& arguments) {
  if (takesMore(line))
    m_diagnostics.report(rule, line, QString(), shortened(arguments));
}

void MappingFileReport::addMisspelt(Rule rule, int line, const QStringList& arguments,
                                    const QStringList& candidates) {
  const QString meant = nearest(arguments.first(), candidates);
  // The same name in another place is no misspelling.
  if (meant.isEmpty() || meant == arguments.first()) {
    add(rule, line, arguments);
  } else if (takesMore(line)) {
    m_diagnostics.report(rule, line, QString(), shortened(arguments),
                         TransformResString(messages::kSuggestion, shortened({meant, arguments.first()})));
  }
}

QString MappingFileReport::nearest(const QString& name, const QStringList& candidates) {
  return m_spelling.find(name, candidates);
}
