// The header of one version of a custom transformer in its file: the line that opens the version, the lines
// of its definition.
//
// Text is UTF-8. The file's form is described at VersionStore.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

struct ORX_EXPORT CustomTransformerHeader {
  QStringList fields;           // trimmed, as they stand in the opening line
  QStringList definitionLines;  // without their prefix
  qint64 endLine = 0;           // lines of the file up to the end of the definition block
  qint64 byteOffset = 0;        // of the line that opens the version

  QString name() const { return fields.value(0); }
  int version() const;
  QString guid() const;

  // Reads the wanted version, or the first for a negative one. False when the file cannot be read or has no
  // such version; `error` is empty in the second case.
  bool read(const QString& fileName, int wantedVersion, QString& error);

  static QString openingLine(const QStringList& fields);
};
