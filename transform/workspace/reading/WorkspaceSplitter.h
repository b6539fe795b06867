// Takes a workspace file apart: the XML in comment lines ("#! "), then the header between its two markers,
// then whatever follows.
#pragma once

#include <transform/workspace/reading/LineMap.h>

#include <QHash>
#include <QIODevice>
#include <QString>
#include <QStringList>

class FileLines;

class WorkspaceSplitter {
 public:
  static const char* const kStartHeader;
  static const char* const kEndHeader;
  // What stands in front of each line of XML when a file is written.
  static const char* const kPrefix;

  // Reads from where `input` stands up to the end of the header (or of the file) and appends the XML to
  // `xml`. Both devices are open and belong to the caller. Throws WorkspaceLoaderException when writing or
  // reading fails, or when a header line is longer than any value may be.
  void split(QIODevice& input, QIODevice& xml, const QString& fileName);
  // Lines are counted from this one.
  void setFirstLine(int line) { m_firstLine = line; }

  // Without line ends, decoded: UTF-8 when all are valid UTF-8, otherwise in the encoding that the XML
  // declares.
  const QStringList& headerLines() const { return m_headerLines; }
  // File line of the first header line; 0 when there is no header.
  int firstHeaderLine() const { return m_firstHeaderLine; }
  const LineMap& lineMap() const { return m_lineMap; }

  // From the header lines: prompt lines by parameter name, and macro values by macro name.
  static void collectPrompts(const QStringList& headerLines, QHash<QString, QString>& prompts);
  static void collectMacros(const QStringList& headerLines, QHash<QString, QString>& macros);

 private:
  void readXml(FileLines& lines, QIODevice& xml, const QString& fileName);
  void readHeader(FileLines& lines);
  void decodeHeader(const FileLines& lines);

  int m_firstLine = 1;
  QByteArray m_xmlStart;  // the beginning of the XML, for its declaration
  QList<QByteArray> m_rawHeader;
  QStringList m_headerLines;
  int m_firstHeaderLine = 0;
  LineMap m_lineMap;
};

// The encoding that the XML declaration in these bytes names; empty when there is none. For 8-bit encodings.
QByteArray declaredEncoding(const QByteArray& xmlStart);
