#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/reading/DocumentMessages.h>

WorkspaceLoaderException::WorkspaceLoaderException(long number, const QStringList& arguments, int line,
                                                   int column, const QString& remark)
    : m_number(number),
      m_message(documentText(number, arguments) + remark),
      m_what(m_message.toUtf8()),
      m_line(line),
      m_column(column) {}

WorkspaceLoaderException::~WorkspaceLoaderException() = default;

const char* WorkspaceLoaderException::what() const noexcept {
  return m_what.constData();
}
