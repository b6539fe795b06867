#include <platform/qorxcore/Local8Bit.h>
#include <platform/session/ORXStringArray.h>

IORXStringArray::~IORXStringArray() = default;

ORXStringArray::ORXStringArray(const QStringList& texts) {
  ORXAssign(*this, texts);
}

std::size_t ORXStringArray::entries() const {
  return m_texts.size();
}

const IORXString& ORXStringArray::elementAt(std::size_t index) const {
  static const ORXString empty;
  return index < m_texts.size() ? m_texts[index] : empty;
}

void ORXStringArray::append(const char* bytes, std::size_t length) {
  m_texts.emplace_back().set(bytes, length);
}

void ORXStringArray::clear() {
  m_texts.clear();
}

QStringList ORXToQStringList(const IORXStringArray& texts) {
  QStringList list;
  const std::size_t count = texts.entries();
  list.reserve(static_cast<int>(count));
  for (std::size_t index = 0; index < count; ++index) {
    list.append(ORXToQString(texts.elementAt(index)));
  }
  return list;
}

void ORXAssign(IORXStringArray& target, const QStringList& texts) {
  target.clear();
  for (const QString& text : texts) {
    const QByteArray bytes = QORXToLocal8Bit(text);
    target.append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
  }
}
