// Plain implementation of the closed string array, and the conversions between it and QStringList.
#pragma once

#include <platform/session/IORXStringArray.h>
#include <platform/session/ORXString.h>

#include <QStringList>

#include <deque>

class ORX_EXPORT ORXStringArray : public IORXStringArray {
 public:
  ORXStringArray() = default;
  explicit ORXStringArray(const QStringList& texts);

  std::size_t entries() const override;
  const IORXString& elementAt(std::size_t index) const override;
  void append(const char* bytes, std::size_t length) override;
  void clear() override;

 private:
  std::deque<ORXString> m_texts;  // addresses stay put while texts are appended
};

ORX_EXPORT QStringList ORXToQStringList(const IORXStringArray& texts);
// Replaces what the array held.
ORX_EXPORT void ORXAssign(IORXStringArray& target, const QStringList& texts);
