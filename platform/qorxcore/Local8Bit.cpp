#include <platform/qorxcore/Local8Bit.h>

QByteArray QORXToLocal8Bit(const QString& text) {
  return text.toUtf8();
}

QString QORXFromLocal8Bit(const QByteArray& bytes) {
  // With the size given, null characters do not end the text.
  return QString::fromUtf8(bytes.constData(), bytes.size());
}

QString QORXFromLocal8Bit(const char* bytes) {
  return QString::fromUtf8(bytes);
}
