#include <platform/qorxcore/Lists.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/ValueShape.h>
#include <transform/core/generation/WrittenValues.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QSet>

namespace messages = orx::messages;

namespace {

const QLatin1String kComma(", ");

// As the contract has it, what nobody is asked for is never refused, nor what may be left out.
bool isNeeded(const GUIType& type) {
  return !type.getFlag(kGUITypeOptional) && !type.getFlag(kGUITypeOmittable) &&
         !type.getDescription().isEmpty();
}

QString nameOf(const GUIType& type) {
  return type.getDescription().isEmpty() ? type.getName() : type.getDescription();
}

// The tokens of members stand for the parts of the value that bear their names, so that a part of another
// name would be lost, and one that is missing would leave its token empty.
QString faultOfParts(const QString& value, const MemberList& members) {
  const QStringList parts = QORXSdfStringToList(value, members.separator());
  QSet<QString> given;
  for (int i = 0; i < parts.size(); i += 2) {
    const QString& name = parts.at(i);
    const GUIType* member = members.find(name);
    if (!member && name != kControllerQueryFile) {
      QStringList known;
      for (const GUIType& each : members.members()) {
        known << each.getName();
      }
      return TransformResString(messages::kNoSuchPart, {name, known.join(kComma)});
    }
    if (given.contains(name)) {
      return TransformResString(messages::kPartTwice, name);
    }
    if (i + 1 < parts.size()) {
      given.insert(name);
      if (member && isNeeded(*member) && parts.at(i + 1) == kUnusedValue) {
        return TransformResString(messages::kPartNeeded, nameOf(*member));
      }
    }
  }
  for (const GUIType& member : members.members()) {
    const QString& name = member.getName();
    if (!member.getFlag(kGUITypeOptional) && name != kControllerQueryFile && !given.contains(name)) {
      return TransformResString(messages::kMemberLeftOut, name);
    }
  }
  return QString();
}

// Cells are told apart by their number alone: one that is missing would shift all that follow.
QString faultOfRows(const QString& value, const MemberList& columns) {
  const QStringList cells = QORXSdfStringToList(value, columns.separator());
  const auto count = static_cast<int>(columns.members().size());
  if (count == 0) {
    return QString();
  }
  for (int i = 0; i < cells.size(); ++i) {
    const GUIType& column = columns.members()[static_cast<std::size_t>(i % count)];
    if (isNeeded(column) && cells.at(i) == kUnusedValue) {
      return TransformResString(messages::kCellNeeded, {QString::number(i / count + 1), nameOf(column)});
    }
  }
  if (cells.size() % count == 0) {
    return QString();
  }
  QStringList names;
  for (const GUIType& column : columns.members()) {
    names << nameOf(column);
  }
  return TransformResString(
      messages::kRowBreaksOff,
      {QString::number(cells.size() / count + 1), names.at(cells.size() % count - 1), names.join(kComma)});
}

}  // namespace

QString value_shape::fault(const TransformParamCfg& record, const QString& stored) {
  const QString& name = record.getName();
  if (stored == kUnusedValue && isNeeded(record) && WrittenValues::hasValue(record) &&
      name != kIdentifierParameter && name != kProcessCountDisplayParameter) {
    return TransformResString(messages::kValueNeeded);
  }
  if (isUnsetValue(stored)) {
    return QString();
  }
  if ((record.isMultiParameter() || record.isTable()) && stored.startsWith(kConditionalPrefix)) {
    return TransformResString(messages::kConditionForParts);
  }
  if (record.isMultiParameter()) {
    return faultOfParts(stored, record.members());
  }
  return record.isTable() ? faultOfRows(stored, record.members()) : QString();
}
