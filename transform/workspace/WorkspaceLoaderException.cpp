#include <transform/workspace/WorkspaceLoaderException.h>

WorkspaceLoaderException::WorkspaceLoaderException(const QString& message, int line, int column)
    : m_message(message), m_what(message.toUtf8()), m_line(line), m_column(column) {}

WorkspaceLoaderException::~WorkspaceLoaderException() = default;

const char* WorkspaceLoaderException::what() const noexcept {
  return m_what.constData();
}
