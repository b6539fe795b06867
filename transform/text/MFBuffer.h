// Collects the logical lines of a mapping-file statement and writes them on flush: continued over physical lines
// with a backslash in column 72, or (mangled) joined by blanks on one line. Output is UTF-8.
//
// Used by one thread at a time.
#pragma once

#include <transform/text/IMFBuffer.h>

#include <QByteArray>
#include <QString>
#include <QStringList>
#include <QTextStream>

class QIODevice;

class ORX_EXPORT MFBuffer : public IMFBuffer {
 public:
  void add(const IORXString& text) override;
  void addRaw(const IORXString& text) override;
  void flush() override;
  ~MFBuffer() override;
  // Writes bytes straight into the output.
  virtual void write(const QByteArray& bytes) = 0;

  // One logical text; it is split at line feeds, blank parts are dropped. With deferred macros on, every "$[NAME]"
  // becomes "$(NAME)". The caller sees to it that every "$[" is closed: one without "]" behind it never ends.
  void add(const QString& text);
  void add(const char* text);
  void addLines(const QStringList& lines);

  bool getReplaceDeferredMacros() const { return m_replaceDeferredMacros; }
  void setReplaceDeferredMacros(bool replace) { m_replaceDeferredMacros = replace; }
  void setIsMangled(bool isMangled) { m_isMangled = isMangled; }

 protected:
  MFBuffer();
  // Attaches the output; null detaches. The device is not owned.
  void setDevice(QIODevice* device);

 private:
  QTextStream m_stream;
  QStringList m_lines;
  bool m_isMangled = false;
  bool m_replaceDeferredMacros = false;
};
