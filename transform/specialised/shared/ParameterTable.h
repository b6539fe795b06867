// The cells of a table-valued parameter, row by row, to read and to change.
#pragma once

#include <transform/core/UnpackLevel.h>

#include <QString>
#include <QStringList>

#include <functional>

class GUIType;
class TransformerCfg;
class TransformParamCfg;

class ParameterTable {
 public:
  // Empty, and not valid, unless the parameter is a table of that many columns with rows of its own: a value
  // that is unset or conditional has none. A last row that lacks cells has empty ones.
  ParameterTable(const TransformerCfg& cfg, const QString& parameter, int columns,
                 UnpackLevel level = UnpackLevel::Stored);
  // Of a packed value.
  ParameterTable(const TransformParamCfg* record, const QString& value, int columns);

  bool isValid() const { return m_record != nullptr; }
  int rowCount() const { return (m_cells.size() + m_columns - 1) / m_columns; }
  QString cell(int row, int column) const { return m_cells.value(row * m_columns + column); }
  // A cell that is not there stays so.
  void setCell(int row, int column, const QString& text);
  QString prompt(int index) const;  // of a column

  // Refusals, always false: a cell of the column needs a value, in a row counted from 0 or somewhere; a row
  // is refused for a reason, one of orx::messages.
  bool refuseMissing(QString& message, int column) const;
  bool refuseMissing(QString& message, int row, int column) const;
  static bool refuseRow(QString& message, int row, long reason, const QStringList& arguments = {});

  using IsUsed = std::function<bool(int row, int column)>;
  // The attributes that the cells refer to, each once; of those cells alone that are used.
  QStringList attributeNames(const IsUsed& isUsed) const;
  void clearUnused(const IsUsed& isUsed);
  // "&NAME" becomes the name, or a reference to the attribute, as the column takes it.
  void replaceAttributeMarks();
  // Puts changed cells into the parameter, which counts as upgraded then.
  void upgrade(TransformerCfg& cfg, const QString& parameter) const;
  // As it was given, unless cells have changed.
  QString packed() const;

 private:
  const GUIType& column(int index) const;
  void read(const TransformParamCfg* record, const QString& value);

  const TransformParamCfg* m_record = nullptr;
  int m_columns;
  QString m_value;
  QStringList m_cells;
  bool m_isChanged = false;
};
