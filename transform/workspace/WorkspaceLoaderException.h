// Thrown by the reader: one message for the user with its number, and where it is known, the place in the
// file.
#pragma once

#include <platform/Export.h>

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <exception>

class ORX_EXPORT WorkspaceLoaderException : public std::exception {
 public:
  // The text is that of the numbered message; a `remark` stands behind it as it is.
  explicit WorkspaceLoaderException(long number, const QStringList& arguments = QStringList(), int line = 0,
                                    int column = 0, const QString& remark = QString());
  ~WorkspaceLoaderException() override;

  const QString& getMessage() const { return m_message; }
  long number() const { return m_number; }
  // The message in UTF-8.
  const char* what() const noexcept override;
  // Line of the file and column of the XML, both from 1; 0 when the failure has no place.
  int line() const { return m_line; }
  int column() const { return m_column; }

 private:
  long m_number;
  QString m_message;
  QByteArray m_what;
  int m_line;
  int m_column;
};
