#include <transform/core/TokenScanner.h>
#include <transform/text/GlobalMacros.h>
#include <translation/mappingfile/MappingFileMacros.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>

#include <cstring>
#include <utility>

using orx::Rule;

namespace {

// What is longer is not remembered: it is no part of a name. So values inside values cannot grow without end.
constexpr int kLongestValue = 256;
constexpr int kLongestName = 1024;

bool endsScriptWord(QChar c) {
  return c.isSpace() ||
         (c.unicode() < 0x80 && c.unicode() != 0 && std::strchr("'\"{}[]()<>;,$\\", c.unicode()));
}

}  // namespace

QString MappingFileMacros::expanded(const QString& name) const {
  const std::vector<MacroReference> references = macroReferences(name);
  QString result;
  int done = 0;
  for (const MacroReference& reference : references) {
    const auto value = reference.isClosed && !reference.isInside ? m_values.constFind(reference.name(name))
                                                                 : m_values.constEnd();
    if (value != m_values.constEnd()) {
      result += name.midRef(done, reference.begin - done);
      result += value.value();
      done = reference.end;
      if (result.size() > kLongestName)
        return name;
    }
  }
  return done == 0 ? name : result + name.midRef(done);
}

void MappingFileMacros::set(const QString& name, const QString& value, int line) {
  const auto note = [&](const QString& text) {
    if (m_lines.contains(text))
      return;
    m_lines.insert(text, line);
    m_names.append(text);
  };
  note(name);
  const QString full = expanded(name);
  if (full != name)
    note(full);
  const QString known = value.size() <= kLongestValue ? expanded(value) : QString();
  if (known.size() <= kLongestValue)
    m_values.insert(full, known);
}

void MappingFileMacros::mention(const QString& script) {
  int begin = 0;
  for (int i = 0; i <= script.size(); ++i) {
    if (i < script.size() && !endsScriptWord(script.at(i)))
      continue;
    if (i > begin)
      m_mentioned.insert(script.mid(begin, i - begin));
    begin = i + 1;
  }
}

bool MappingFileMacros::isKnown(const QString& name) const {
  // What a script adds to a prefix is a name of its own behind the prefix.
  const int suffix = name.lastIndexOf(QLatin1Char(')')) + 1;
  return m_lines.contains(name) || isGlobalMacro(name) || m_mentioned.contains(name) ||
         (suffix > 0 && m_mentioned.contains(name.mid(suffix)));
}

void MappingFileMacros::refer(const MappingFileStatement& statement,
                              const std::vector<MacroReference>& references, int from, int to, Use use,
                              int block, MappingFileReport& report) {
  bool saidOpen = false;
  for (const MacroReference& reference : references) {
    if (reference.begin < from || reference.begin >= to)
      continue;
    const int line = statement.lineAt(reference.begin);
    const QString text = statement.text.mid(reference.begin, reference.end - reference.begin);
    if (reference.isDeferred && !reference.isClosed)
      continue;
    if (reference.isDeferred)
      report.add(Rule::DeferredReference, line, {text});
    else if (reference.isClosed)
      need(reference.name(statement.text), line, use, block);
    else if (!std::exchange(saidOpen, true))
      report.add(Rule::OpenReference, line, {text.trimmed()});
  }
}

void MappingFileMacros::need(const QString& name, int line, Use use, int block) {
  if (m_hasInclude || name == m_prefix || isKnown(name))
    return;
  const QString full = expanded(name);
  if (full == name || !isKnown(full))
    m_pending.push_back({name, full == name ? QString() : full, line, use, block});
}

int MappingFileMacros::lineOf(const Pending& reference) const {
  const int line = m_lines.value(reference.name);
  return line > 0 || reference.expanded.isEmpty() ? line : m_lines.value(reference.expanded);
}

void MappingFileMacros::finish(const QSet<int>& openBlocks, MappingFileReport& report) const {
  for (const Pending& reference : m_pending) {
    const int line = lineOf(reference);
    if (line > reference.line && reference.use == Use::Now)
      report.add(Rule::LateMacro, reference.line, {reference.name, QString::number(line)});
    if (line > 0)
      continue;
    if (isReservedToken(reference.name)) {
      report.add(Rule::LeftToken, reference.line, {reference.name});
    } else if (!openBlocks.contains(reference.block) &&
               (reference.use == Use::Now || !isKnown(reference.name))) {
      report.addMisspelt(Rule::UnknownReference, reference.line, {reference.name}, m_names);
    }
  }
}
