// Whether a record can be written so that the reader takes it: finite numbers, characters that XML allows,
// values of a permitted length.
#pragma once

#include <transform/workspace/records/RecordTables.h>
#include <transform/workspace/records/ValueText.h>

inline const QLatin1String kNotFinite("a number is not finite");

// Why a value cannot be written; empty when it can.
QString valueRefusal(const QString& value);

template <class T>
QString valueRefusal(const T& value) {
  return valuetext::isFinite(value) ? QString() : QString(kNotFinite);
}

template <class R, class T>
QString fieldRefusal(T R::*field, const R& record) {
  return valueRefusal(record.*field);
}
// What no single field holds must be taken by the reader as it is written.
template <class R>
QString fieldRefusal(const SpecialValue<R>& value, const R& record) {
  const QString text = value.write(record);
  R read;
  const QString refusal = valueRefusal(text);
  return refusal.isEmpty() && !value.read(read, text) ? QString(kNotFinite) : refusal;
}

template <class Table>
QString recordRefusal(const typename Table::Record& record) {
  using R = typename Table::Record;
  for (const AttributeRule<R>& rule : Table::attributes) {
    if (rule.emission == Emission::Never)
      continue;
    const QString refusal =
        std::visit([&](const auto& value) { return fieldRefusal(value, record); }, rule.value);
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
