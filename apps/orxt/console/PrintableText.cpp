#include <apps/orxt/console/PrintableText.h>

#include <algorithm>

namespace {

bool isControl(QChar character) {
  return character.category() == QChar::Other_Control || character.category() == QChar::Other_Format;
}

}  // namespace

QString withoutControls(const QString& text, int limit) {
  QString result = text.left(limit);
  if (text.size() > limit) {
    result.chop(1 + (text.at(limit - 2).isHighSurrogate() ? 1 : 0));
    result += QChar(0x2026);
  }
  std::replace_if(result.begin(), result.end(), isControl, QChar(QChar::ReplacementCharacter));
  return result;
}

QString onOneLine(const QString& text, int limit) {
  QString line;
  bool blankWaits = false;
  for (const QChar character : text) {
    if (character.isSpace()) {
      blankWaits = !line.isEmpty();
      continue;
    }
    if (isControl(character))
      continue;
    if (line.size() + (blankWaits ? 2 : 1) > limit) {
      line.truncate(limit - 1);
      if (line.endsWith(QLatin1Char(' ')) || (!line.isEmpty() && line.at(line.size() - 1).isHighSurrogate()))
        line.chop(1);
      return line + QChar(0x2026);
    }
    if (blankWaits)
      line += QLatin1Char(' ');
    blankWaits = false;
    line += character;
  }
  return line;
}

QStringList wrapped(const QString& line, int width) {
  QStringList lines;
  for (const QString& word : line.split(QLatin1Char(' '))) {
    if (lines.isEmpty() || lines.last().size() + 1 + word.size() > width)
      lines << word;
    else
      lines.last() += QLatin1Char(' ') + word;
  }
  return lines;
}
