// Plain implementation of the closed string, and the conversions between it and QString.
#pragma once

#include <platform/session/IORXString.h>

#include <QByteArray>
#include <QString>

class ORX_EXPORT ORXString : public IORXString {
 public:
  ORXString() = default;
  explicit ORXString(const char* text) : m_bytes(text) {}
  explicit ORXString(const QString& text);

  const char* data() const override;
  std::size_t length() const override;
  void set(const char* bytes, std::size_t length) override;

 private:
  QByteArray m_bytes;
};

// Conversions in the system's 8-bit encoding.
ORX_EXPORT QString ORXToQString(const IORXString& text);
ORX_EXPORT void ORXAssign(IORXString& target, const QString& text);
