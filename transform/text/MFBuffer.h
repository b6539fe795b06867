// Collects the logical lines of a mapping-file statement and writes them on flush: continued over physical
// lines with a backslash in column 72 (further right behind a longer line), or, mangled, joined by blanks on
// one line. Every flush writes one more line end, so that an empty line stands behind a continued statement;
// a flush with nothing pending writes that line end alone. Output is UTF-8.
//
// No operation reports an error: what goes to a device that is missing or not open is lost. Used by one
// thread at a time.
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
  // Writes bytes unchanged into the output, past the stream and the pending lines.
  virtual void write(const QByteArray& bytes) = 0;

  // One logical text; it is split at line feeds, empty parts are dropped (a part of blanks alone is kept).
  // With deferred macros on, every "$[" becomes "$(" and the first "]" behind it ")", whatever stands between
  // them. The caller sees to it that every "$[" is closed: with one that is not, this does not return.
  void add(const QString& text);
  // In the system's 8-bit encoding; null is the empty text.
  void add(const char* text);
  void addLines(const QStringList& lines);

  // The text with its deferred macro references made ordinary, as add() does it; a "$[" that is not closed
  // stays.
  static QString withOrdinaryMacros(const QString& text);

  // False when add() would not come to an end with deferred macros on: a "$[" has no "]" of its own behind
  // it.
  static bool closesDeferredMacros(const QString& text);

  bool getReplaceDeferredMacros() const { return m_replaceDeferredMacros; }
  void setReplaceDeferredMacros(bool replace) { m_replaceDeferredMacros = replace; }
  void setIsMangled(bool isMangled) { m_isMangled = isMangled; }

 protected:
  MFBuffer();
  // Attaches the output; null detaches. The device is not owned and outlives the buffer or its detaching.
  void setDevice(QIODevice* device);

 private:
  void append(const QString& text);
  bool isWritable() const;

  QTextStream m_stream;
  QStringList m_lines;
  bool m_isMangled = false;
  bool m_replaceDeferredMacros = false;
};
