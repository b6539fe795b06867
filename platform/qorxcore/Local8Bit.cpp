#include <platform/qorxcore/Local8Bit.h>

QByteArray QORXToLocal8Bit(const QString& text) {
  return text.toUtf8();
}

QString QORXFromLocal8Bit(const QByteArray& bytes) {
  return QString::fromUtf8(bytes);
}

QString QORXFromLocal8Bit(const char* bytes) {
  return QString::fromUtf8(bytes);
}
