// Texts of the XML parser as QString, and back. Both are UTF-16.
#pragma once

#include <QString>
#include <QStringView>
#include <xercesc/util/XMLString.hpp>

inline QString fromXml(const XMLCh* text) {
  return text ? QString(reinterpret_cast<const QChar*>(text),
                        static_cast<int>(XERCES_CPP_NAMESPACE::XMLString::stringLen(text)))
              : QString();
}

// Valid while `text` is neither changed nor destroyed.
inline const XMLCh* toXml(const QString& text) {
  return reinterpret_cast<const XMLCh*>(text.utf16());
}

// A name of XML 1.0.
bool isXmlName(const QString& text);

// Position of the first character that a document cannot hold: a control character other than tab, line feed
// and carriage return, a lone surrogate, U+FFFE or U+FFFF. -1: none.
int firstForbidden(QStringView text);
