// A workspace file as a whole: its XML in comment lines, its header, and all other lines around them.
//
// Saving keeps everything but the XML as it was: encoding, byte order mark, line ends, lines in front of the
// XML, header lines, and what follows the header. The file appears whole or not at all.
#pragma once

#include <platform/Export.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/VersionInfo.h>
#include <transform/workspace/XMLComponentWriter.h>

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <functional>

class PlainFile;

class ORX_EXPORT WorkspaceFile {
 public:
  enum class Form {
    Unknown,    // none of the others, or not readable
    Workspace,  // XML in comment lines
    PlainXml,   // XML alone
    Versioned,  // several versions of a custom transformer
  };

  // By the first line that tells it, however far down it stands.
  static Form recognise(const QString& fileName);
  static Form recognise(PlainFile& file);
  // Reads a file of any form with the reader's operation for it; of several versions the one with the
  // highest number. Throws WorkspaceLoaderException, also for a file of no known form.
  static void read(IXMLComponentReader& reader, const QString& fileName, QStringList& headerLines);
  // One version of a file of several. Throws as above, also when the document is none of a workspace.
  static void readVersion(IXMLComponentReader& reader, const QString& fileName, const VersionInfo& version,
                          QStringList& headerLines);

  // A new workspace file: UTF-8, line feeds, no header.
  WorkspaceFile() = default;
  // Takes up what surrounds the XML of an existing file, of the forms Workspace and PlainXml. Throws
  // WorkspaceLoaderException.
  explicit WorkspaceFile(const QString& fileName);
  // Of a file that was opened, recognised, and split, which gave its header lines.
  WorkspaceFile(PlainFile& file, Form form, const QStringList& headerLines);

  Form form() const { return m_form; }
  // The codec's name.
  const QByteArray& encoding() const { return m_encoding; }
  // An encoding that contains ASCII, or UTF-16LE or UTF-16BE; false for a name that is not known.
  bool setEncoding(const QByteArray& name);
  const QStringList& headerLines() const { return m_headerLines; }
  // A file whose header lines are set has a header, be it empty.
  void setHeaderLines(const QStringList& lines);

  // Writes the file: `fill` queues the records. False when the writer refuses, a header line holds a line
  // break or is the header's end mark, the file is of plain XML and has header lines, or the place cannot be
  // written; `error` says why, and what stood there is untouched.
  bool save(const QString& fileName, DocumentType type, const std::function<void(XMLComponentWriter&)>& fill,
            QString& error) const;
  // The same file to a device that is open for writing. False when the writer or the header is refused;
  // failures of the device show in the device.
  bool write(QIODevice& device, DocumentType type, const std::function<void(XMLComponentWriter&)>& fill,
             QString& error) const;

 private:
  void takeSurroundings(PlainFile& file);
  bool isWide() const;
  QByteArray encodedAscii(const QByteArray& ascii) const;
  QByteArray encodedHeader(QString& error) const;
  bool writeXml(QIODevice& device, DocumentType type, const std::function<void(XMLComponentWriter&)>& fill,
                QString& error) const;

  Form m_form = Form::Workspace;
  QByteArray m_encoding = "UTF-8";
  QByteArray m_mark;
  QByteArray m_lineEnd = "\n";  // in ASCII
  bool m_hasHeader = false;
  QStringList m_headerLines;
  QByteArray m_rawHeader;  // with its marks, as read; empty once lines or encoding are others
  // Raw lines: in front of the first line of XML, between the XML and the header, behind the header.
  QByteArray m_before;
  QByteArray m_between;
  QByteArray m_behind;
};
