// A workspace document with the file around it: read from a file of any form, written again in canonical
// form. Shared by all that look at a document or rewrite it without building its graph.
#pragma once

#include <platform/Export.h>
#include <transform/files/InputFile.h>
#include <transform/findings/Findings.h>
#include <transform/workspace/RawLines.h>
#include <transform/workspace/VersionInfo.h>
#include <transform/workspace/WorkspaceFile.h>
#include <transform/workspace/WorkspaceLossReport.h>
#include <transform/workspace/XMLComponentReader.h>

#include <QByteArray>
#include <QIODevice>
#include <QList>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>

class ORX_EXPORT WorkspaceDocument {
 public:
  enum class Reading {
    Done,
    Refused,     // diagnostics say why
    Unreadable,  // the file could not be read
  };
  // What is done with a file of versions: most have no use for one.
  enum class Versions { Refused, NewestRead };
  // Queues the records to write.
  using Fill = std::function<void(XMLComponentWriter&)>;

  // "-" is standard input. `error` receives why the file cannot be read.
  explicit WorkspaceDocument(const QString& fileName) : m_input(fileName), m_fileName(fileName) {}

  Reading read(orx::Findings& diagnostics, QString& error, Versions versions = Versions::Refused);

  // All below: valid after reading.
  const XMLComponentReader& reader() const { return m_reader; }
  WorkspaceFile::Form form() const { return m_form; }
  // The encoding in which the file would be written again.
  const QByteArray& encoding() const { return m_file.encoding(); }
  const QStringList& headerLines() const { return m_headerLines; }
  // Of a file of versions: all of them, in file order. The document is the newest one's.
  const QList<VersionInfo>& versions() const { return m_versions; }
  // Whether there is a file that can be replaced.
  bool isReplaceable() const { return !m_input.isCopy(); }
  // The bytes of the file as they are now. False when it cannot be read.
  bool originalBytes(QByteArray& bytes, QString& error) const;

  // What canonicalBytes() would leave out.
  std::vector<WorkspaceLossReport::Loss> losses() const;
  // A loss as a finding, under the rule that judges the same content, or else the one for all other losses.
  static orx::Finding findingOf(const WorkspaceLossReport::Loss& loss);
  // The file with every record of the document written again, and all around it as it was. False when
  // something that was read cannot be written; `error` says what. Not for a file of versions, of which none
  // is rewritten once it is stored.
  bool canonicalBytes(QByteArray& bytes, QString& error) const;
  // The same with other records.
  bool bytesWith(const Fill& fill, QByteArray& bytes, QString& error) const;

 private:
  Reading readOpened(orx::Findings& diagnostics, QString& error, Versions versions);

  InputFile m_input;
  QString m_fileName;
  XMLComponentReader m_reader;
  WorkspaceFile m_file;
  WorkspaceFile::Form m_form = WorkspaceFile::Form::Unknown;
  QStringList m_headerLines;
  QList<VersionInfo> m_versions;
  std::vector<RawLine> m_rawLines;
};
