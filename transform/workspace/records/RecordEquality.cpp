// Comparison of records, field by field as their tables list them.
#include <transform/workspace/records/RecordTables.h>

namespace {

template <class T>
bool same(const T& left, const T& right) {
  return left == right;
}
// Exact: what is written reads back to the same value.
bool same(double left, double right) {
  return !(left < right) && !(left > right);
}
bool same(const QPointF& left, const QPointF& right) {
  return same(left.x(), right.x()) && same(left.y(), right.y());
}
bool same(const QSizeF& left, const QSizeF& right) {
  return same(left.width(), right.width()) && same(left.height(), right.height());
}
bool same(const QRectF& left, const QRectF& right) {
  return same(left.topLeft(), right.topLeft()) && same(left.size(), right.size());
}

template <class R>
bool sameAttribute(const AttributeRule<R>& rule, const R& left, const R& right) {
  // A text that is missing differs from an empty one only where a document can tell the two apart.
  if (rule.emission == Emission::UnlessNull && rule.text(left)->isNull() != rule.text(right)->isNull())
    return false;
  return std::visit([&](const auto& value) { return same(valueOf(value, left), valueOf(value, right)); },
                    rule.value);
}

template <class Table>
bool sameRecord(const typename Table::Record& left, const typename Table::Record& right) {
  for (const auto& rule : Table::attributes) {
    if (!sameAttribute(rule, left, right))
      return false;
  }
  return std::apply(
      [&](const auto&... child) {
        return (std::equal((left.*child.list).begin(), (left.*child.list).end(), (right.*child.list).begin(),
                           (right.*child.list).end(),
                           sameRecord<typename std::decay_t<decltype(child)>::Table>) &&
                ...);
      },
      Table::children);
}

}  // namespace

#define ORX_RECORD_EQUALITY(Record, Table)                   \
  bool operator==(const Record& left, const Record& right) { \
    return sameRecord<tables::Table>(left, right);           \
  }

ORX_RECORD_EQUALITY(DatasetStruct, Dataset)
ORX_RECORD_EQUALITY(DataTypeStruct, DataType)
ORX_RECORD_EQUALITY(GeomTypeStruct, GeomType)
ORX_RECORD_EQUALITY(FeatureTypeStruct, FeatureType)
ORX_RECORD_EQUALITY(GlobalParameterStruct, GlobalParameter)
ORX_RECORD_EQUALITY(ConstantStruct, Constant)
ORX_RECORD_EQUALITY(CommentStruct, Comment)
ORX_RECORD_EQUALITY(BookmarkStruct, Bookmark)
ORX_RECORD_EQUALITY(TransformerStruct, Transformer)
ORX_RECORD_EQUALITY(SubDocumentIOStruct, SubDocumentIO)
ORX_RECORD_EQUALITY(LinkStruct, FeatLink)
ORX_RECORD_EQUALITY(BreakpointStruct, Breakpoint)
ORX_RECORD_EQUALITY(ServerParameterStruct, ServerParameter)
