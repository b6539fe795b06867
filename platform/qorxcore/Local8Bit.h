// The one place that turns Unicode text into the system's 8-bit encoding and back: UTF-8, whatever the
// locale.
#pragma once

#include <platform/Export.h>

#include <QByteArray>
#include <QString>

ORX_EXPORT QByteArray QORXToLocal8Bit(const QString& text);
ORX_EXPORT QString QORXFromLocal8Bit(const QByteArray& bytes);
ORX_EXPORT QString QORXFromLocal8Bit(const char* bytes);
