#include <apps/orxt/console/PrintableText.h>
#include <apps/orxt/console/TextTable.h>

#include <algorithm>

namespace {

constexpr int kLongestCell = 200;
constexpr int kWidestColumn = 36;
constexpr int kGap = 2;

}  // namespace

void TextTable::addRow(const QStringList& cells) {
  QStringList row;
  row.reserve(cells.size());
  for (const QString& cell : cells) {
    row << onOneLine(cell, kLongestCell);
    const std::size_t column = static_cast<std::size_t>(row.size()) - 1;
    if (column == m_widths.size())
      m_widths.push_back(0);
    m_widths[column] = std::max(m_widths[column], std::min(row.last().size(), kWidestColumn));
  }
  m_rows.push_back(row);
}

QString TextTable::text() const {
  QString text;
  for (const QStringList& row : m_rows) {
    QString line(m_indent, QLatin1Char(' '));
    for (int column = 0; column < row.size(); ++column) {
      const int width = m_widths[static_cast<std::size_t>(column)];
      if (width == 0)
        continue;
      line += column == m_rightColumn ? row[column].rightJustified(width) : row[column].leftJustified(width);
      line += QString(kGap, QLatin1Char(' '));
    }
    while (line.endsWith(QLatin1Char(' ')))
      line.chop(1);
    text += line + QLatin1Char('\n');
  }
  return text;
}
