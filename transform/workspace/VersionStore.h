// A file that holds several versions of one custom transformer.
//
//   # ORW custom transformers
//   # TRANSFORMER_BEGIN name,version,category,GUID,...      (newest first)
//   # ...the definition's lines...
//   # TRANSFORMER_END
//   #! <?xml version="1.0" ... ?>                           (the version's document)
//   #! ...
//
// Text is UTF-8. A version reaches from its first line to the end of its document. An enciphered document
// stands behind the end mark or between the two marks; enciphered files and documents are read as their plain
// text.
#pragma once

#include <platform/Export.h>
#include <transform/workspace/VersionInfo.h>

#include <QByteArray>
#include <QList>
#include <QString>
#include <QStringList>

class ORX_EXPORT VersionStore {
 public:
  static const char* const kFirstLine;
  static const char* const kBegin;
  static const char* const kEnd;
  static const char* const kDocument;

  explicit VersionStore(const QString& fileName) : m_fileName(fileName) {}

  // In file order. `error` is empty unless the file could not be read. A line that opens a version with fewer
  // than three fields is no version.
  QList<VersionInfo> versions(QString& error) const;
  // The one with the highest number, of several such the first. There must be one.
  static VersionInfo newest(const QList<VersionInfo>& versions);

  struct Piece {
    QByteArray before;
    QByteArray document;   // comment lines; without a document of its own, the definition's lines
    int documentLine = 1;  // file line at which the document begins
    bool isUnreadable =
        false;  // there is something in its place: an enciphered document, or no document at all
    QByteArray behind;
  };
  // The version of `length` bytes at `offset`. Throws WorkspaceLoaderException when the file cannot be read,
  // the place lies outside it, or holds no document.
  Piece read(qint64 offset, qint64 length) const;

  // Puts a further version in front of the others, whose bytes stay as they are; makes the file when there is
  // none. `fields` are those of the opening line: name, version, category and so on. `definition` are the
  // definition's mapping-file lines. `document` is XML text in UTF-8 as XMLComponentWriter writes it. False
  // when a field holds a comma or a line break, a definition line a line break or the end mark, or the file
  // could not be written; `error` says why, and the file is untouched. `isRefused` receives whether the
  // version itself is the reason, or the file that is there.
  bool insert(const QStringList& fields, const QStringList& definition, const QByteArray& document,
              QString& error, bool* isRefused = nullptr) const;

 private:
  QString m_fileName;
};
