// Builds records from elements, as their tables say.
#pragma once

#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/records/ElementTable.h>
#include <transform/workspace/records/RecordTables.h>
#include <transform/workspace/records/ValueText.h>

// The rule of that name, or null. `hint` is where the search begins: behind the rule found last, for
// attributes mostly stand in the order of the table.
template <class Table>
const AttributeRule<typename Table::Record>* findRule(QStringView name, std::size_t& hint) {
  constexpr std::size_t kCount = Table::attributes.size();
  for (std::size_t tried = 0; tried < kCount; ++tried) {
    if (hint >= kCount)
      hint = 0;
    const auto& rule = Table::attributes[hint++];
    if (rule.name.view() == name)
      return &rule;
  }
  return nullptr;
}

class RecordReader {
 public:
  // Elements and source outlive the reader.
  RecordReader(const ElementTable& elements, const PromptDefinitionSource& prompts)
      : m_elements(elements), m_prompts(prompts) {}

  template <class Table>
  typename Table::Record read(std::size_t index) const {
    typename Table::Record record;
    record.line = m_elements.line(index);
    readAttributes<Table>(index, record);
    m_elements.eachChild(index, [&](std::size_t child) { readChild<Table>(child, record); });
    finish(record);
    return record;
  }

  // One attribute; false when the text is not well formed and the default stands.
  template <class R>
  static bool readValue(const AttributeRule<R>& rule, R& record, const QString& text) {
    return std::visit([&](const auto& value) { return readValue(value, record, text); }, rule.value);
  }

 private:
  template <class R, class T>
  static bool readValue(T R::*field, R& record, const QString& text) {
    return valuetext::read(text, record.*field);
  }
  template <class R>
  static bool readValue(QString R::*field, R& record, const QString& text) {
    record.*field = text;
    return true;
  }
  template <class R>
  static bool readValue(const SpecialValue<R>& value, R& record, const QString& text) {
    return value.read(record, text);
  }
  template <class Table>
  void readAttributes(std::size_t index, typename Table::Record& record) const {
    std::size_t hint = 0;
    m_elements.eachAttribute(index, [&](const ElementTable::Attribute& attribute) {
      if (const auto* const rule = findRule<Table>(attribute.name, hint))
        readValue(*rule, record, attribute.value);
    });
  }

  template <class Table>
  void readChild(std::size_t child, typename Table::Record& record) const {
    std::apply([&](const auto&... rule) { static_cast<void>((readInto(rule, child, record) || ...)); },
               Table::children);
  }

  // Whether the element is one of that kind, or the wrapper of that kind.
  template <class R, class Table>
  bool readInto(const ChildRule<R, Table>& rule, std::size_t child, R& record) const {
    if (!m_elements.isNamed(child, rule.wrapper ? *rule.wrapper : Table::element))
      return false;
    if (rule.wrapper) {
      m_elements.eachChild(child, [&](std::size_t inner) {
        if (m_elements.isNamed(inner, Table::element))
          (record.*rule.list).append(read<Table>(inner));
      });
    } else {
      (record.*rule.list).append(read<Table>(child));
    }
    return true;
  }

  template <class R>
  static void finish(R&) {}
  static void finish(DatasetStruct& record);
  static void finish(XformAttrStruct& record);
  static void finish(XformParmStruct& record);
  void finish(TransformerStruct& record) const;

  const ElementTable& m_elements;
  const PromptDefinitionSource& m_prompts;
};
