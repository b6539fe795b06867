// Whether a record can be written so that the reader takes it: finite numbers, characters that XML allows,
// values of a permitted length.
#pragma once

#include <transform/workspace/records/RecordTables.h>
#include <transform/workspace/records/ValueText.h>

// Why a value cannot be written; empty when it can.
QString valueRefusal(const QString& value);

// Whether the reader takes what is written of a value that no single field holds.
template <class R>
bool isReadBack(const AttributeRule<R>& rule, const R& record) {
  R read;
  return rule.read(read, rule.write(record));
}

template <class Table>
QString recordRefusal(const typename Table::Record& record) {
  using R = typename Table::Record;
  for (const AttributeRule<R>& rule : Table::attributes) {
    if (rule.emission == Emission::Never)
      continue;
    QString refusal;
    if (rule.text)
      refusal = valueRefusal(record.*rule.text);
    else if (rule.write)
      refusal = valueRefusal(rule.write(record));
    bool finite = true;
    if (rule.real)
      finite = valuetext::isFinite(record.*rule.real);
    else if (rule.point)
      finite = valuetext::isFinite(record.*rule.point);
    else if (rule.size)
      finite = valuetext::isFinite(record.*rule.size);
    else if (rule.rectangle)
      finite = valuetext::isFinite(record.*rule.rectangle);
    else if (rule.write && refusal.isEmpty())
      finite = isReadBack(rule, record);
    if (!finite)
      refusal = QStringLiteral("a number is not finite");
    if (!refusal.isEmpty())
      return QStringLiteral("%1, attribute %2: %3")
          .arg(Table::element.toQString(), rule.name.toQString(), refusal);
  }
  QString refusal;
  std::apply(
      [&](const auto&... rule) {
        const auto checkList = [&](const auto& child) {
          using Child = typename std::decay_t<decltype(child)>::Table;
          if (child.emission == Emission::Never)
            return;
          for (const auto& item : record.*child.list) {
            if (refusal.isEmpty())
              refusal = recordRefusal<Child>(item);
          }
        };
        static_cast<void>(checkList);
        (checkList(rule), ...);
      },
      Table::children);
  return refusal;
}
