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

enum class Emission { Always, UnlessEmpty, UnlessNull, Never };

// One attribute of a record. The default is the field's own initial value. Exactly one of the members is set;
// `read` and `write` stand for a value that no single field holds, `read` answering whether the text was well
// formed.
template <class R>
struct AttributeRule {
  Word name;
  Emission emission = Emission::Always;
  QString R::*text = nullptr;
  bool R::*flag = nullptr;
  int R::*integer = nullptr;
  double R::*real = nullptr;
  QPointF R::*point = nullptr;
  QSizeF R::*size = nullptr;
  QRectF R::*rectangle = nullptr;
  bool (*read)(R&, const QString&) = nullptr;
  QString (*write)(const R&) = nullptr;
};

// Calls `visit` with the member of the rule that is set; not called for a special rule.
template <class R, class Visitor>
void visitField(const AttributeRule<R>& rule, Visitor&& visit) {
  if (rule.text)
    visit(rule.text);
  else if (rule.flag)
    visit(rule.flag);
  else if (rule.integer)
    visit(rule.integer);
  else if (rule.real)
    visit(rule.real);
  else if (rule.point)
    visit(rule.point);
  else if (rule.size)
    visit(rule.size);
  else if (rule.rectangle)
    visit(rule.rectangle);
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

template <class R>
constexpr AttributeRule<R> attribute(Word name, QString R::*field, Emission emission = Emission::Always) {
  AttributeRule<R> rule{name};
  rule.emission = emission;
  rule.text = field;
  return rule;
}

template <class R>
constexpr AttributeRule<R> attribute(Word name, bool R::*field, Emission emission = Emission::Always) {
  AttributeRule<R> rule{name};
  rule.emission = emission;
  rule.flag = field;
  return rule;
}

template <class R>
constexpr AttributeRule<R> attribute(Word name, int R::*field) {
  AttributeRule<R> rule{name};
  rule.integer = field;
  return rule;
}

template <class R>
constexpr AttributeRule<R> attribute(Word name, double R::*field) {
  AttributeRule<R> rule{name};
  rule.real = field;
  return rule;
}

template <class R>
constexpr AttributeRule<R> attribute(Word name, QPointF R::*field) {
  AttributeRule<R> rule{name};
  rule.point = field;
  return rule;
}

template <class R>
constexpr AttributeRule<R> attribute(Word name, QSizeF R::*field) {
  AttributeRule<R> rule{name};
  rule.size = field;
  return rule;
}

template <class R>
constexpr AttributeRule<R> attribute(Word name, QRectF R::*field) {
  AttributeRule<R> rule{name};
  rule.rectangle = field;
  return rule;
}

template <class R>
constexpr AttributeRule<R> special(Word name, bool (*read)(R&, const QString&), QString (*write)(const R&)) {
  AttributeRule<R> rule{name};
  rule.read = read;
  rule.write = write;
  return rule;
}

template <class... Rules>
constexpr auto inOrder(const Rules&... list) {
  using First = std::tuple_element_t<0, std::tuple<Rules...>>;
  return std::array<First, sizeof...(Rules)>{list...};
}

}  // namespace rules
