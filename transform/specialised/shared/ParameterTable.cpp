#include <platform/qorxcore/Lists.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/Keywords.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformerCfg.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/shared/ParameterTable.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

namespace messages = orx::messages;

namespace {

const orx::Refusal kMissing{orx::Rule::MissingValue, messages::kMissingValue};

QString rowMessage(int row, const QString& reason) {
  return TransformResString(messages::kInRow, QStringList{QString::number(row + 1), reason});
}

}  // namespace

ParameterTable::ParameterTable(const TransformerCfg& cfg, const QString& parameter, int columns,
                               UnpackLevel level)
    : m_columns(columns) {
  read(cfg.getParameterByMacroName(parameter), cfg.getParameterValue(parameter, level));
}

ParameterTable::ParameterTable(const TransformParamCfg* record, const QString& value, int columns)
    : m_columns(columns) {
  read(record, value);
}

void ParameterTable::read(const TransformParamCfg* record, const QString& value) {
  m_value = value;
  if (!record || !record->isTable() || static_cast<int>(record->members().members().size()) != m_columns ||
      isUnsetValue(value) || value.startsWith(kConditionalPrefix)) {
    return;
  }
  m_record = record;
  m_cells = QORXSdfStringToList(value, record->members().separator());
}

void ParameterTable::setCell(int row, int column, const QString& text) {
  const int index = row * m_columns + column;
  if (index < m_cells.size() && m_cells[index] != text) {
    m_cells[index] = text;
    m_isChanged = true;
  }
}

const GUIType& ParameterTable::column(int index) const {
  return m_record ? m_record->members().members()[static_cast<std::size_t>(index)] : GUIType::kNullGuiType;
}

QString ParameterTable::prompt(int index) const {
  return column(index).getDescription();
}

bool ParameterTable::refuseMissing(QString& message, int column) const {
  return orx::refuse(message, kMissing, {prompt(column)});
}

bool ParameterTable::refuseMissing(QString& message, int row, int column) const {
  refuseMissing(message, column);
  message = rowMessage(row, message);
  return false;
}

bool ParameterTable::refuseRow(QString& message, int row, long reason, const QStringList& arguments) {
  orx::refuse(message, reason, arguments);
  message = rowMessage(row, message);
  return false;
}

QStringList ParameterTable::attributeNames(const IsUsed& isUsed) const {
  AttributeReferences references;
  for (int i = 0; i < m_cells.size(); ++i) {
    if (isUsed(i / m_columns, i % m_columns)) {
      references.addValue(column(i % m_columns), m_cells[i]);
    }
  }
  return references.names();
}

void ParameterTable::clearUnused(const IsUsed& isUsed) {
  for (int i = 0; i < m_cells.size(); ++i) {
    if (!isUsed(i / m_columns, i % m_columns)) {
      setCell(i / m_columns, i % m_columns, QString());
    }
  }
}

void ParameterTable::replaceAttributeMarks() {
  for (int i = 0; i < m_cells.size(); ++i) {
    const GUIType& type = column(i % m_columns);
    const bool isBareName =
        type.getType().startsWith(kAttributeType) && m_cells[i].startsWith(kAttributeMark);
    setCell(i / m_columns, i % m_columns,
            isBareName ? m_cells[i].mid(1) : withAttributeReference(type, m_cells[i]));
  }
}

QString ParameterTable::packed() const {
  return m_isChanged ? QORXListToSdfString(m_cells, m_record->members().separator()) : m_value;
}

void ParameterTable::upgrade(TransformerCfg& cfg, const QString& parameter) const {
  if (m_isChanged) {
    cfg.applyParameterValue(parameter, packed());
    cfg.setAutoUpgraded(true);
  }
}
