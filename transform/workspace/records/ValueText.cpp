#include <transform/workspace/records/ValueText.h>
#include <transform/workspace/records/Vocabulary.h>

#include <array>
#include <charconv>
#include <cmath>

namespace valuetext {

namespace {

// The longest number that is looked at; a double in decimal needs at most 1,077 characters.
constexpr int kNumberLength = 1100;

template <class Number>
bool readNumber(QStringView text, Number& value) {
  text = text.trimmed();
  if (!text.isEmpty() && text.front() == QLatin1Char('+')) {
    text = text.mid(1);
    if (!text.isEmpty() && text.front() == QLatin1Char('-'))
      return false;
  }
  if (text.isEmpty() || text.size() > kNumberLength)
    return false;
  std::array<char, kNumberLength> digits;
  const auto size = static_cast<std::size_t>(text.size());
  for (std::size_t i = 0; i < size; ++i) {
    const ushort unit = text[static_cast<qsizetype>(i)].unicode();
    if (unit > 0x7f)
      return false;
    digits[i] = static_cast<char>(unit);
  }
  Number number{};
  const auto result = std::from_chars(digits.data(), digits.data() + size, number);
  if (result.ec != std::errc() || result.ptr != digits.data() + size)
    return false;
  value = number;
  return true;
}

template <std::size_t N>
bool readNumbers(QStringView text, std::array<double, N>& values) {
  text = text.trimmed();
  for (std::size_t i = 0; i < N; ++i) {
    qsizetype end = 0;
    while (end < text.size() && !text[end].isSpace())
      ++end;
    if (!read(text.left(end), values[i]))
      return false;
    text = text.mid(end).trimmed();
  }
  return text.isEmpty();
}

template <std::size_t N>
void appendNumbers(QString& text, const std::array<double, N>& values) {
  for (std::size_t i = 0; i < N; ++i) {
    if (i > 0)
      text += QLatin1Char(' ');
    append(text, values[i]);
  }
}

void appendAscii(QString& text, const char* begin, const char* end) {
  text.append(QLatin1String(begin, static_cast<int>(end - begin)));
}

}  // namespace

bool read(QStringView text, bool& value) {
  const bool yes = text == words::kTrue.view();
  if (!yes && text != words::kFalse.view())
    return false;
  value = yes;
  return true;
}

bool read(QStringView text, int& value) {
  return readNumber(text, value);
}

bool read(QStringView text, double& value) {
  double number = 0;
  if (!readNumber(text, number) || !std::isfinite(number))
    return false;
  value = number;
  return true;
}

bool read(QStringView text, QPointF& value) {
  std::array<double, 2> numbers{};
  if (!readNumbers(text, numbers))
    return false;
  value = QPointF(numbers[0], numbers[1]);
  return true;
}

bool read(QStringView text, QSizeF& value) {
  std::array<double, 2> numbers{};
  if (!readNumbers(text, numbers))
    return false;
  value = QSizeF(numbers[0], numbers[1]);
  return true;
}

bool read(QStringView text, QRectF& value) {
  std::array<double, 4> numbers{};
  if (!readNumbers(text, numbers))
    return false;
  value = QRectF(numbers[0], numbers[1], numbers[2], numbers[3]);
  return true;
}

void append(QString& text, bool value) {
  const Word& word = value ? words::kTrue : words::kFalse;
  text.append(word.chars(), word.size);
}

void append(QString& text, int value) {
  std::array<char, 16> digits;
  const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), value);
  appendAscii(text, digits.data(), result.ptr);
}

void append(QString& text, double value) {
  std::array<char, kNumberLength> digits;
  const auto result =
      std::to_chars(digits.data(), digits.data() + digits.size(), value, std::chars_format::fixed);
  appendAscii(text, digits.data(), result.ptr);
}

void append(QString& text, const QPointF& value) {
  appendNumbers(text, std::array<double, 2>{value.x(), value.y()});
}

void append(QString& text, const QSizeF& value) {
  appendNumbers(text, std::array<double, 2>{value.width(), value.height()});
}

void append(QString& text, const QRectF& value) {
  appendNumbers(text, std::array<double, 4>{value.x(), value.y(), value.width(), value.height()});
}

bool isFinite(double value) {
  return std::isfinite(value);
}
bool isFinite(const QPointF& value) {
  return isFinite(value.x()) && isFinite(value.y());
}
bool isFinite(const QSizeF& value) {
  return isFinite(value.width()) && isFinite(value.height());
}
bool isFinite(const QRectF& value) {
  return isFinite(value.topLeft()) && isFinite(value.size());
}

}  // namespace valuetext
