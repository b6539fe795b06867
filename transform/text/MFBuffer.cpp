#include <platform/qorxcore/Local8Bit.h>
#include <platform/session/ORXString.h>
#include <transform/text/MFBuffer.h>

#include <QIODevice>
#include <QStringView>
#include <QTextCodec>

#include <algorithm>

namespace {

constexpr int kStatementWidth = 70;

// Pairs every "$[" with the first "]" behind it that is still free. Answers false when a "$[" is left without
// one. Each search goes on where the one before it ended, so that a text of nothing but brackets costs one
// walk.
bool pairDeferredMacros(QString& text) {
  static const QString kOpen = QStringLiteral("$[");
  static const QString kClose = QStringLiteral("]");
  int nextClose = 0;
  int open = text.indexOf(kOpen);
  while (open >= 0) {
    const int close = text.indexOf(kClose, std::max(open, nextClose));
    if (close < 0) {
      return false;
    }
    text[open + 1] = QLatin1Char('(');
    text[close] = QLatin1Char(')');
    nextClose = close + 1;
    open = text.indexOf(kOpen, open + 1);
  }
  return true;
}

}  // namespace

MFBuffer::MFBuffer() {
  // Found once: the search by name would cost more than most buffers hold.
  static QTextCodec* const utf8 = QTextCodec::codecForName("UTF-8");
  m_stream.setCodec(utf8);
}

MFBuffer::~MFBuffer() = default;

void MFBuffer::add(const IORXString& text) {
  add(ORXToQString(text));
}

void MFBuffer::add(const char* text) {
  add(QORXFromLocal8Bit(text));
}

void MFBuffer::addLines(const QStringList& lines) {
  m_lines.reserve(m_lines.size() + lines.size());
  for (const QString& line : lines) {
    add(line);
  }
}

void MFBuffer::add(const QString& text) {
  if (!m_replaceDeferredMacros || !text.contains(QLatin1String("$["))) {
    append(text);
    return;
  }
  QString replaced = text;
  while (!pairDeferredMacros(replaced)) {
  }
  append(replaced);
}

void MFBuffer::append(const QString& text) {
  int end = text.indexOf(QLatin1Char('\n'));
  if (end < 0) {
    if (!text.isEmpty()) {
      m_lines.append(text);
    }
    return;
  }
  int begin = 0;
  while (begin < text.size()) {
    if (end > begin) {
      m_lines.append(text.mid(begin, end - begin));
    }
    begin = end + 1;
    end = text.indexOf(QLatin1Char('\n'), begin);
    if (end < 0) {
      end = text.size();
    }
  }
}

QString MFBuffer::withOrdinaryMacros(const QString& text) {
  QString replaced = text;
  pairDeferredMacros(replaced);
  return replaced;
}

bool MFBuffer::closesDeferredMacros(const QString& text) {
  QString copy = text;
  return pairDeferredMacros(copy);
}

void MFBuffer::addRaw(const IORXString& text) {
  if (isWritable()) {
    m_stream << ORXToQString(text);
    m_stream.flush();
  }
}

void MFBuffer::flush() {
  if (!isWritable()) {
    m_lines.clear();
    return;
  }
  static const QString kPadding(kStatementWidth, QLatin1Char(' '));
  static const QString kContinuation = QStringLiteral(" \\\n");
  const int last = m_lines.size() - 1;
  for (int i = 0; i <= last; ++i) {
    const QString& line = m_lines.at(i);
    m_stream << line;
    if (m_isMangled) {
      if (i < last) {
        m_stream << QLatin1Char(' ');
      }
    } else if (i < last) {
      if (line.size() < kStatementWidth) {
        m_stream << QStringView(kPadding).left(kStatementWidth - line.size());
      }
      m_stream << kContinuation;
    } else {
      m_stream << QLatin1Char('\n');
    }
  }
  m_stream << QLatin1Char('\n');
  m_lines.clear();
  m_stream.flush();
}

// A stream on a device that is missing or never opened would complain on every write; what goes there is
// lost.
bool MFBuffer::isWritable() const {
  const QIODevice* device = m_stream.device();
  return device != nullptr && device->isWritable();
}

void MFBuffer::setDevice(QIODevice* device) {
  m_stream.setDevice(device);
  m_stream.setCodec("utf-8");
}
