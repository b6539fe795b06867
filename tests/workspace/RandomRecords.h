// Records with random values in every field that a document can hold.
#pragma once

#include <transform/workspace/records/RecordTables.h>

#include <random>

class RandomRecords {
 public:
  explicit RandomRecords(unsigned seed) : m_engine(seed) {}

  int below(int bound) { return std::uniform_int_distribution<int>(0, bound - 1)(m_engine); }
  bool flag() { return below(2) == 1; }
  double real();
  // Any characters that XML allows.
  QString text();
  // A name of XML.
  QString name();

  template <class Table>
  typename Table::Record record() {
    using R = typename Table::Record;
    R record;
    for (const AttributeRule<R>& rule : Table::attributes) {
      if (rule.emission == Emission::Never)
        continue;
      std::visit(
          [&](const auto& field) {
            if constexpr (std::is_member_pointer_v<std::decay_t<decltype(field)>>)
              fill(record.*field);
          },
          rule.value);
    }
    std::apply([&](const auto&... rule) { (fillList(rule, record), ...); }, Table::children);
    fillSpecial(record);
    return record;
  }

 private:
  void fill(QString& value) { value = text(); }
  void fill(bool& value) { value = flag(); }
  void fill(int& value) { value = std::uniform_int_distribution<int>(INT_MIN, INT_MAX)(m_engine); }
  void fill(double& value) { value = real(); }
  void fill(QPointF& value) { value = QPointF(real(), real()); }
  void fill(QSizeF& value) { value = QSizeF(real(), real()); }
  void fill(QRectF& value) { value = QRectF(real(), real(), real(), real()); }

  template <class R, class Table>
  void fillList(const ChildRule<R, Table>& rule, R& record) {
    if (rule.emission == Emission::Never)
      return;
    for (int count = below(4); count > 0; --count)
      (record.*rule.list).append(this->record<Table>());
  }

  template <class R>
  void fillSpecial(R&) {}
  void fillSpecial(DatasetStruct& record) { record.role += QLatin1Char('R'); }
  void fillSpecial(FeatureTypeStruct& record);
  void fillSpecial(TransformerStruct& record) {
    fill(record.position);
    if (flag())
      record.boundingRect = QRectF();
  }
  void fillSpecial(GlobalParameterStruct& record);
  void fillSpecial(SubDocumentIOStruct& record);

  std::mt19937 m_engine;
};
