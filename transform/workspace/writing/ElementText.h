// Elements as text in the layout of workspace documents, appended to one string.
#pragma once

#include <transform/workspace/records/RecordTables.h>
#include <transform/workspace/records/ValueText.h>

#include <QTextCodec>

class ElementText {
 public:
  // `codec` is what the text will be written in; null stands for one that can hold every character. What it
  // cannot hold is written as a character reference inside values.
  explicit ElementText(const QTextCodec* codec = nullptr);

  const QString& text() const { return m_text; }
  void clear() { m_text.resize(0); }

  // A tag without attributes, on a line of its own.
  void openSection(const Word& name);
  void closeElement(const Word& name);
  // An opening tag whose attributes follow, each on its own line.
  void beginElement(const Word& name);
  void attribute(QStringView name, const QString& value);
  void endAttributes(bool childrenFollow);

  // The whole element, its children included.
  template <class Table>
  void element(const typename Table::Record& record);
  // The children alone.
  template <class Table>
  void children(const typename Table::Record& record);

  // Escapes a value; QTextCodec's part is only for what the codec cannot hold.
  void escaped(const QString& value);

 private:
  template <class R>
  void attributes(const AttributeRule<R>* begin, const AttributeRule<R>* end, const R& record, Layout layout);
  template <class R, class Table>
  void childList(const ChildRule<R, Table>& rule, const R& record);
  void value(const QString& text) { escaped(text); }
  template <class T>
  void value(const T& value) {
    valuetext::append(m_text, value);
  }
  void word(const Word& word) { m_text.append(word.chars(), word.size); }
  void escapedSpan(const ushort* begin, const ushort* end);

  QString m_text;
  const QTextCodec* m_codec;
};

template <class R>
void ElementText::attributes(const AttributeRule<R>* begin, const AttributeRule<R>* end, const R& record,
                             Layout layout) {
  for (const AttributeRule<R>* rule = begin; rule != end; ++rule) {
    if (rule->emission == Emission::Never)
      continue;
    if (rule->emission == Emission::UnlessEmpty && rule->text(record)->isEmpty())
      continue;
    if (rule->emission == Emission::UnlessNull && rule->text(record)->isNull())
      continue;
    if (layout == Layout::Lines)
      m_text += QLatin1String("  ");
    else
      m_text += QLatin1Char(' ');
    word(rule->name);
    m_text += QLatin1String("=\"");
    std::visit([&](const auto& field) { value(valueOf(field, record)); }, rule->value);
    m_text += layout == Layout::Lines ? QLatin1String("\"\n") : QLatin1String("\"");
  }
}

template <class R, class Table>
void ElementText::childList(const ChildRule<R, Table>& rule, const R& record) {
  if (rule.emission == Emission::Never)
    return;
  if (rule.wrapper)
    openSection(*rule.wrapper);
  for (const auto& child : record.*rule.list)
    element<Table>(child);
  if (rule.wrapper)
    closeElement(*rule.wrapper);
}

template <class Table>
void ElementText::children(const typename Table::Record& record) {
  std::apply([&](const auto&... rule) { (childList(rule, record), ...); }, Table::children);
}

template <class Table>
void ElementText::element(const typename Table::Record& record) {
  const auto* const begin = Table::attributes.data();
  const auto* const end = begin + Table::attributes.size();
  if constexpr (Table::layout == Layout::OneLine) {
    m_text += QLatin1String("    <");
    word(Table::element);
    attributes(begin, end, record, Layout::OneLine);
    m_text += QLatin1String("/>\n");
  } else {
    beginElement(Table::element);
    attributes(begin, end, record, Layout::Lines);
    // A wrapper is written even when nothing stands in it.
    const bool childrenFollow = std::apply(
        [&](const auto&... rule) {
          return ((rule.emission != Emission::Never &&
                   (rule.wrapper != nullptr || !(record.*rule.list).isEmpty())) ||
                  ...);
        },
        Table::children);
    endAttributes(childrenFollow);
    if (childrenFollow) {
      children<Table>(record);
      closeElement(Table::element);
    }
  }
}
