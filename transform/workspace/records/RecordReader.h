// Builds records from elements, as their tables say.
#pragma once

#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/records/ElementTable.h>
#include <transform/workspace/records/RecordTables.h>
#include <transform/workspace/records/ValueText.h>
#include <transform/workspace/writing/XmlText.h>

#include <xercesc/dom/DOMAttr.hpp>
#include <xercesc/dom/DOMNamedNodeMap.hpp>

// The rules of a table in ascending order of name, which is the order in which the DOM keeps attributes.
template <class Table>
class SortedRules {
 public:
  using Rule = AttributeRule<typename Table::Record>;
  static constexpr std::size_t kCount = Table::attributes.size();

  static const SortedRules& get() {
    static const SortedRules rules;
    return rules;
  }

  // The rule of that name, or null. `hint` is where the search begins: behind the rule found last.
  const Rule* find(const XMLCh* name, std::size_t& hint) const {
    for (std::size_t tried = 0; tried < kCount; ++tried) {
      if (hint >= kCount)
        hint = 0;
      const Rule* const rule = m_rules[hint++];
      if (XERCES_CPP_NAMESPACE::XMLString::equals(name, rule->name.text))
        return rule;
    }
    return nullptr;
  }

 private:
  SortedRules() {
    for (std::size_t i = 0; i < kCount; ++i)
      m_rules[i] = &Table::attributes[i];
    std::sort(m_rules.begin(), m_rules.end(),
              [](const Rule* left, const Rule* right) { return left->name.view() < right->name.view(); });
  }

  std::array<const Rule*, kCount> m_rules{};
};

class RecordReader {
 public:
  using Element = ElementTable::Element;

  // Elements and source outlive the reader.
  RecordReader(const ElementTable& elements, const PromptDefinitionSource& prompts)
      : m_elements(elements), m_prompts(prompts) {}

  template <class Table>
  typename Table::Record read(std::size_t index) const {
    typename Table::Record record;
    record.line = m_elements.line(index);
    readAttributes<Table>(m_elements.element(index), record);
    m_elements.eachChild(index, [&](std::size_t child) { readChild<Table>(child, record); });
    finish(record);
    return record;
  }

  // One attribute; false when the text is not well formed and the default stands.
  template <class R>
  static bool readValue(const AttributeRule<R>& rule, R& record, const XMLCh* text) {
    return std::visit([&](const auto& value) { return readValue(value, record, QStringView(text)); },
                      rule.value);
  }

 private:
  template <class R, class T>
  static bool readValue(T R::*field, R& record, QStringView text) {
    return valuetext::read(text, record.*field);
  }
  template <class R>
  static bool readValue(const SpecialValue<R>& value, R& record, QStringView text) {
    return value.read(record, text.toString());
  }
  template <class Table>
  static void readAttributes(const Element& element, typename Table::Record& record) {
    const auto& rules = SortedRules<Table>::get();
    const XERCES_CPP_NAMESPACE::DOMNamedNodeMap* const attributes = element.getAttributes();
    const XMLSize_t count = attributes->getLength();
    std::size_t hint = 0;
    for (XMLSize_t i = 0; i < count; ++i) {
      const auto* const attribute = static_cast<const XERCES_CPP_NAMESPACE::DOMAttr*>(attributes->item(i));
      if (const auto* const rule = rules.find(attribute->getName(), hint))
        readValue(*rule, record, attribute->getValue());
    }
  }

  template <class Table>
  void readChild(std::size_t child, typename Table::Record& record) const {
    std::apply([&](const auto&... rule) { static_cast<void>((readInto(rule, child, record) || ...)); },
               Table::children);
  }

  // Whether the element is one of that kind, or the wrapper of that kind.
  template <class R, class Table>
  bool readInto(const ChildRule<R, Table>& rule, std::size_t child, R& record) const {
    const auto isNamed = [this](std::size_t index, const Word& name) {
      return XERCES_CPP_NAMESPACE::XMLString::equals(m_elements.element(index).getTagName(), name.text);
    };
    if (!isNamed(child, rule.wrapper ? *rule.wrapper : Table::element))
      return false;
    if (rule.wrapper) {
      m_elements.eachChild(child, [&](std::size_t inner) {
        if (isNamed(inner, Table::element))
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
