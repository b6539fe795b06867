#include <platform/qorxcore/Local8Bit.h>
#include <platform/session/ORXString.h>

#include <limits>
#include <stdexcept>

IORXString::~IORXString() = default;

ORXString::ORXString(const QString& text) : m_bytes(QORXToLocal8Bit(text)) {}

const char* ORXString::data() const {
  return m_bytes.constData();
}

std::size_t ORXString::length() const {
  return static_cast<std::size_t>(m_bytes.size());
}

void ORXString::set(const char* bytes, std::size_t length) {
  if (length > static_cast<std::size_t>(std::numeric_limits<int>::max() / 2)) {
    throw std::length_error("ORXString: text too long");
  }
  m_bytes = QByteArray(bytes, static_cast<int>(length));
}

QString ORXToQString(const IORXString& text) {
  // Borrowed for the conversion alone, which copies.
  return QORXFromLocal8Bit(QByteArray::fromRawData(text.data(), static_cast<int>(text.length())));
}

void ORXAssign(IORXString& target, const QString& text) {
  const QByteArray bytes = QORXToLocal8Bit(text);
  target.set(bytes.constData(), static_cast<std::size_t>(bytes.size()));
}
