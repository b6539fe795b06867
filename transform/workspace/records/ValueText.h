// Attribute values as text, and back. Each reading answers whether the text was well formed, and leaves the
// value alone when it was not. Blanks around a number are no fault.
#pragma once

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <QString>
#include <QStringView>

namespace valuetext {

inline bool read(QStringView text, QString& value) {
  value = text.toString();
  return true;
}
bool read(QStringView text, bool& value);
bool read(QStringView text, int& value);
// Infinities and "nan" are not well formed.
bool read(QStringView text, double& value);
bool read(QStringView text, QPointF& value);
bool read(QStringView text, QSizeF& value);
bool read(QStringView text, QRectF& value);

void append(QString& text, bool value);
void append(QString& text, int value);
// The shortest decimal text that reads back to the same value.
void append(QString& text, double value);
void append(QString& text, const QPointF& value);
void append(QString& text, const QSizeF& value);
void append(QString& text, const QRectF& value);

// The finite test of everything that append() takes.
bool isFinite(double value);
bool isFinite(const QPointF& value);
bool isFinite(const QSizeF& value);
bool isFinite(const QRectF& value);

}  // namespace valuetext
