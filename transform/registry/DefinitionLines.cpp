#include <transform/registry/DefinitionKeywords.h>
#include <transform/registry/DefinitionLines.h>

namespace {

QString withoutTrailingSpace(const QString& line) {
  int end = line.size();
  while (end > 0 && line.at(end - 1).isSpace())
    --end;
  return line.left(end);
}

}  // namespace

DefinitionLines::DefinitionLines(QIODevice& device) : m_stream(&device) {
  m_stream.setCodec("utf-8");
  m_stream.setAutoDetectUnicode(false);
}

bool DefinitionLines::next() {
  if (!m_stream.readLineInto(&m_line))
    return false;
  ++m_number;
  m_trimmed = m_line.trimmed();
  return true;
}

bool DefinitionLines::readBlock(QLatin1String end, QStringList& lines) {
  while (next()) {
    if (m_trimmed == end)
      return true;
    lines.append(m_trimmed);
  }
  return false;
}

bool DefinitionLines::readTemplate(QStringList& lines) {
  while (next()) {
    const QString line = withoutTrailingSpace(m_line);
    if (line == kTemplateEnd)
      return true;
    lines.append(line);
  }
  return false;
}
