#include <transform/core/ParameterReferences.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <translation/GlobalParameters.h>
#include <translation/graph/FlowOrder.h>

#include <algorithm>

namespace {

// Values that refer to values that refer to values can grow without end; what goes beyond these stays as it
// stands.
constexpr int kMaximumNesting = 32;
constexpr int kMaximumReplacements = 10000;
constexpr int kMaximumLength = 1 << 20;

QString withStoredSides(const QString& promptLine, const QString& value) {
  return promptLine.isEmpty()
             ? value
             : single_choices::toStored(TransformParamCfg(GUIType::fromGuiLine(promptLine)), value);
}

QString referencedName(const QString& reference) {
  if (!reference.startsWith(QLatin1String("$(")) || !reference.endsWith(QLatin1Char(')')))
    return QString();
  return reference.mid(2, reference.size() - 3);
}

// Deferred references are ordinary ones in what is written.
QString asWritten(const QString& value) {
  const bool isDeferred = value.contains(QLatin1String("$[")) && MFBuffer::closesDeferredMacros(value);
  return isDeferred ? MFBuffer::withOrdinaryMacros(value) : value;
}

// The first word of a trimmed text, which loses it and the blanks behind it.
QString takeWord(QString& text) {
  const auto end = std::find_if(text.cbegin(), text.cend(), [](QChar c) { return c.isSpace(); });
  const QString word = text.left(static_cast<int>(end - text.cbegin()));
  text = text.mid(word.size()).trimmed();
  return word;
}

}  // namespace

void GlobalParameters::readHeaderLine(const QString& line, int lineNumber) {
  QString rest = line.trimmed();
  const QString keyword = takeWord(rest) + QLatin1Char(' ');
  const bool isSetting = keyword == kMacroStatement;
  if (!isSetting && keyword != kDefaultMacroStatement)
    return;
  // The engine expands what it knows when it reads the statement.
  const QString name = resolve(takeWord(rest));
  if (name.isEmpty())
    return;
  rest = resolve(rest);
  const bool isNew = !m_index.contains(name);
  Parameter& parameter = entry(name);
  // An earlier setting stands against a default.
  if (isNew || isSetting)
    parameter.value = rest;
  parameter.setInHeader = true;
  parameter.line = lineNumber;
}

void GlobalParameters::declare(const QString& name, const QString& value, int lineNumber,
                               const QString& promptLine) {
  Parameter& parameter = entry(name);
  parameter.isPublished = true;
  parameter.promptLine = promptLine;
  parameter.language = scriptLanguage(GUIType::fromGuiLine(promptLine));
  if (!parameter.setInHeader) {
    parameter.value = asWritten(withStoredSides(promptLine, value));
    parameter.line = lineNumber;
  }
}

QString GlobalParameters::asStated(const QString& promptLine, const QString& value) const {
  return resolve(asWritten(withStoredSides(promptLine, value)).trimmed());
}

bool GlobalParameters::override(const QString& name, const QString& value) {
  if (!m_index.contains(name))
    return false;
  Parameter& parameter = entry(name);
  parameter.overridingValue = asWritten(withStoredSides(parameter.promptLine, value));
  parameter.isOverridden = true;
  return true;
}

GlobalParameters::Parameter& GlobalParameters::entry(const QString& name) {
  const auto found = m_index.constFind(name);
  if (found != m_index.constEnd())
    return m_parameters[static_cast<std::size_t>(found.value())];
  m_index.insert(name, static_cast<int>(m_parameters.size()));
  m_parameters.emplace_back();
  m_parameters.back().name = name;
  return m_parameters.back();
}

const GlobalParameters::Parameter* GlobalParameters::find(const QString& name) const {
  const auto found = m_index.constFind(name);
  return found == m_index.constEnd() ? nullptr : &m_parameters[static_cast<std::size_t>(found.value())];
}

GUIType GlobalParameters::typeOf(const QString& name) const {
  const Parameter* parameter = find(name);
  return parameter && parameter->isPublished ? GUIType::fromGuiLine(parameter->promptLine)
                                             : GUIType::kNullGuiType;
}

std::vector<std::vector<const GlobalParameters::Parameter*>> GlobalParameters::circles() const {
  std::vector<std::pair<int, int>> edges;
  int budget = kMaximumReplacements;
  for (std::size_t from = 0; from < m_parameters.size(); ++from) {
    const QString& value = m_parameters[from].currentValue();
    if (!value.contains(QLatin1Char('$')) || m_parameters[from].isComputed())
      continue;
    for (const MacroReference& reference : macroReferences(value)) {
      if (!reference.isClosed || reference.isDeferred)
        continue;
      QString name = reference.name(value);
      if (reference.hasInner) {
        QStringList open;
        name = resolve(name, open, budget);
      }
      const auto to = m_index.constFind(name);
      if (to != m_index.constEnd())
        edges.emplace_back(static_cast<int>(from), to.value());
    }
  }
  std::vector<std::vector<const Parameter*>> found;
  for (const std::vector<int>& cycle : flowOrder(static_cast<int>(m_parameters.size()), edges).cycles) {
    found.emplace_back();
    for (const int member : cycle)
      found.back().push_back(&m_parameters[static_cast<std::size_t>(member)]);
  }
  return found;
}

const GlobalParameters::Parameter* GlobalParameters::findReference(const QString& reference) const {
  return find(referencedName(reference));
}

bool GlobalParameters::isPublishedParameter(const QString& reference) const {
  const Parameter* parameter = findReference(reference);
  return parameter && parameter->isPublished;
}

bool GlobalParameters::isPrivateParameter(const QString& reference) const {
  const Parameter* parameter = findReference(reference);
  return parameter && !parameter->isPublished;
}

bool GlobalParameters::isBuiltInParameter(const QString& reference) const {
  return isGlobalMacro(referencedName(reference));
}

QString GlobalParameters::resolve(const QString& text) const {
  if (!text.contains(QLatin1Char('$')))
    return text;
  QStringList open;
  int budget = kMaximumReplacements;
  return resolve(text, open, budget);
}

QString GlobalParameters::resolve(const QString& text, QStringList& open, int& budget) const {
  int length = text.size();
  QString resolved = replaceParameterReferences(text, [&](const QString& name, QString& replacement) {
    const Parameter* parameter = find(name);
    if (!parameter || parameter->isComputed() || open.contains(parameter->name) ||
        open.size() >= kMaximumNesting || --budget < 0)
      return false;
    open.append(parameter->name);
    replacement = resolve(parameter->currentValue(), open, budget);
    open.removeLast();
    length += replacement.size();
    if (length > kMaximumLength)
      budget = 0;
    return length <= kMaximumLength;
  });
  return resolved;
}
