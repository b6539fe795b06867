#include <transform/workspace/writing/XmlText.h>

#include <xercesc/util/XMLChar.hpp>

bool isXmlName(const QString& text) {
  return !text.isEmpty() && !text.contains(QChar(0)) &&
         XERCES_CPP_NAMESPACE::XMLChar1_0::isValidName(toXml(text), static_cast<XMLSize_t>(text.size()));
}

int firstForbidden(QStringView text) {
  const auto* const begin = text.utf16();
  const auto* const end = begin + text.size();
  for (const auto* at = begin; at != end; ++at) {
    const ushort unit = *at;
    if (unit >= 0x20 && unit < 0xd800)
      continue;
    if (unit == '\t' || unit == '\n' || unit == '\r' || (unit >= 0xe000 && unit < 0xfffe))
      continue;
    if (QChar::isHighSurrogate(unit) && at + 1 != end && QChar::isLowSurrogate(at[1])) {
      ++at;
      continue;
    }
    return static_cast<int>(at - begin);
  }
  return -1;
}
