#include <transform/text/MessageNumbers.h>
#include <transform/workspace/reading/DocumentGuard.h>
#include <transform/workspace/reading/DocumentLimits.h>
#include <transform/workspace/reading/DocumentMessages.h>

#include <algorithm>

namespace messages = orx::messages;

bool DocumentGuard::refuse(const QString& message) {
  m_refusal = message;
  return false;
}

bool DocumentGuard::enter(State state) {
  m_state = state;
  m_runLength = 0;
  m_previous = 0;
  m_beforePrevious = 0;
  return true;
}

// Passes over units that mean nothing in the present state; answers how many.
int DocumentGuard::skipPlain(const ushort* units, int size) {
  const auto bit = [](char unit) { return Q_UINT64_C(1) << unit; };
  quint64 stops = bit('\0') | bit('\n') | bit('\r');
  switch (m_state) {
    case State::Text:
      stops |= bit('<');
      break;
    case State::DoubleQuoted:
      stops |= bit('"');
      break;
    case State::SingleQuoted:
      stops |= bit('\'');
      break;
    case State::Tag:
      stops |= bit('"') | bit('\'') | bit('/') | bit('>');
      break;
    case State::EndTag:
      stops |= bit('>');
      break;
    default:
      return 0;
  }
  // The last unit that the limit allows is looked at in full.
  const int end = static_cast<int>(std::min<qint64>(size, limits::kValueLength - m_runLength));
  int at = 0;
  while (at < end && (units[at] >= 64 || (stops >> units[at] & 1) == 0) &&
         (m_replacement == 0 || units[at] != m_replacement))
    ++at;
  if (at > 0) {
    m_runLength += at;
    m_column += at;
    m_afterReturn = false;
    m_previous = 0;
  }
  return at;
}

int DocumentGuard::check(const ushort* units, int size) {
  if (hasRefused())
    return 0;
  for (int i = 0; i < size; ++i) {
    i += skipPlain(units + i, size - i);
    if (i == size)
      break;
    const ushort unit = units[i];
    if (unit == 0 || (m_replacement != 0 && unit == m_replacement)) {
      refuse(documentText(messages::kUndecodable));
      return i;
    }
    // What ends a value is counted with it.
    if (++m_runLength > limits::kValueLength + 1) {
      refuse(documentText(messages::kValueTooLong, {QString::number(limits::kValueLength)}));
      return i;
    }
    if (!take(unit))
      return i;
    if (unit == '\n') {
      // The line feed of a pair was counted with its carriage return.
      if (!m_afterReturn)
        ++m_line;
      m_column = 1;
    } else if (unit == '\r') {
      ++m_line;
      m_column = 1;
    } else {
      ++m_column;
    }
    m_afterReturn = unit == '\r';
  }
  return size;
}

bool DocumentGuard::take(ushort unit) {
  switch (m_state) {
    case State::Text:
      return unit == '<' ? enter(State::Open) : true;
    case State::DoubleQuoted:
      return unit == '"' ? enter(State::Tag) : true;
    case State::SingleQuoted:
      return unit == '\'' ? enter(State::Tag) : true;
    case State::Tag:
      return takeTag(unit);
    case State::EndTag:
      if (unit == '>') {
        --m_depth;
        return enter(State::Text);
      }
      return true;
    case State::Open:
      return takeOpen(unit);
    case State::Bang:
      return takeBang(unit);
    case State::Comment:
      if (unit == '>' && m_previous == '-' && m_beforePrevious == '-')
        return enter(State::Text);
      break;
    case State::CharacterData:
      if (unit == '>' && m_previous == ']' && m_beforePrevious == ']')
        return enter(State::Text);
      break;
    case State::Instruction:
      if (unit == '>' && m_previous == '?')
        return enter(State::Text);
      break;
  }
  m_beforePrevious = m_previous;
  m_previous = unit;
  return true;
}

bool DocumentGuard::takeOpen(ushort unit) {
  if (unit == '/')
    return enter(State::EndTag);
  if (unit == '?')
    return enter(State::Instruction);
  if (unit == '!') {
    m_bang.clear();
    return enter(State::Bang);
  }
  m_elementLines.push_back(m_line);
  m_attributes = 0;
  if (++m_depth > limits::kNesting)
    return refuse(documentText(messages::kElementsTooDeep, {QString::number(limits::kNesting)}));
  return enter(State::Tag) && takeTag(unit);
}

bool DocumentGuard::takeTag(ushort unit) {
  if (unit == '"' || unit == '\'') {
    if (++m_attributes > limits::kAttributesPerElement)
      return refuse(
          documentText(messages::kTooManyAttributes, {QString::number(limits::kAttributesPerElement)}));
    return enter(unit == '"' ? State::DoubleQuoted : State::SingleQuoted);
  }
  if (unit == '>') {
    if (m_previous == '/')
      --m_depth;
    return enter(State::Text);
  }
  m_previous = unit;
  return true;
}

bool DocumentGuard::takeBang(ushort unit) {
  m_bang += QChar(unit);
  if (m_bang == QLatin1String("--"))
    return enter(State::Comment);
  if (m_bang == QLatin1String("[CDATA["))
    return enter(State::CharacterData);
  if (m_bang.size() >= 7)
    return refuse(documentText(messages::kDocumentType));
  return true;
}
