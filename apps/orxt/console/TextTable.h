// Rows of cells printed as aligned columns.
#pragma once

#include <QString>
#include <QStringList>

#include <vector>

class TextTable {
 public:
  // Every line begins with this many blanks.
  explicit TextTable(int indent) : m_indent(indent) {}

  // Numbers: this column ends at one edge.
  void alignRight(int column) { m_rightColumn = column; }

  // Cells are made fit to be printed. A cell that is longer than its column may be pushes the others on.
  void addRow(const QStringList& cells);
  bool isEmpty() const { return m_rows.empty(); }
  // Each row on a line of its own; trailing empty cells leave no blanks. Columns empty in all rows are left
  // out.
  QString text() const;

 private:
  int m_indent;
  int m_rightColumn = -1;
  std::vector<QStringList> m_rows;
  std::vector<int> m_widths;
};
