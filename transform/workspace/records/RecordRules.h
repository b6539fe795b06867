// How the table of one record is put together; see RecordTables.h.
#pragma once

#include <transform/workspace/RecordList.h>
#include <transform/workspace/records/Vocabulary.h>

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <QString>

#include <array>
#include <tuple>
#include <variant>

enum class Emission { Always, UnlessEmpty, UnlessNull, Never };

// A value that no single field holds; `read` answers whether the text was well formed.
template <class R>
struct SpecialValue {
  bool (*read)(R&, const QString&);
  QString (*write)(const R&);
};

// One attribute of a record. The default is the field's own initial value.
template <class R>
struct AttributeRule {
  Word name;
  std::variant<QString R::*, bool R::*, int R::*, double R::*, QPointF R::*, QSizeF R::*, QRectF R::*,
               SpecialValue<R>>
      value;
  Emission emission = Emission::Always;  // only texts can be empty or null

  const QString* text(const R& record) const {
    const auto* const field = std::get_if<QString R::*>(&value);
    return field ? &(record.**field) : nullptr;
  }
};

template <class R, class T>
const T& valueOf(T R::*field, const R& record) {
  return record.*field;
}
template <class R>
QString valueOf(const SpecialValue<R>& value, const R& record) {
  return value.write(record);
}

// One kind of child element, kept in a list of the record. A wrapped kind stands inside an element of its own
// that has no attributes.
template <class R, class ChildTable>
struct ChildRule {
  using Table = ChildTable;
  RecordList<typename ChildTable::Record> R::*list;
  const Word* wrapper = nullptr;
  Emission emission = Emission::Always;
};

namespace rules {

template <class R, class T>
constexpr AttributeRule<R> attribute(Word name, T R::*field, Emission emission = Emission::Always) {
  return {name, field, emission};
}

template <class R>
constexpr AttributeRule<R> special(Word name, bool (*read)(R&, const QString&), QString (*write)(const R&)) {
  return {name, SpecialValue<R>{read, write}};
}

template <class... Rules>
constexpr auto inOrder(const Rules&... list) {
  using First = std::tuple_element_t<0, std::tuple<Rules...>>;
  return std::array<First, sizeof...(Rules)>{list...};
}

}  // namespace rules
