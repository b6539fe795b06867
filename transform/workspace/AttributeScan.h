// Finds an attribute in XML that stands in comment lines, without parsing the document.
#pragma once

#include <QByteArray>

// The value of the last attribute of that name, in whatever form XML allows it; null when there is none, or
// when the text breaks off in the middle of a value. For encodings that contain ASCII.
QByteArray lastAttributeValue(const QByteArray& commentedXml, const QByteArray& name);
