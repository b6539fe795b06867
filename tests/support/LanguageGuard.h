// Another language for as long as this lives.
#pragma once

#include <platform/qorxcore/Language.h>

#include <QString>

class LanguageGuard {
 public:
  explicit LanguageGuard(const QString& language) : m_before(QORXLanguage()) { QORXSetLanguage(language); }
  ~LanguageGuard() { QORXSetLanguage(m_before); }

 private:
  QString m_before;
};
