// The checks of one mapping file, whether it is read from its place or judged while it is written.
#pragma once

#include <translation/MappingFileLint.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>
#include <translation/mappingfile/MappingFileStatements.h>

class MappingFileCheck {
 public:
  // `diagnostics` is not owned.
  MappingFileCheck(const QString& path, orx::Findings& diagnostics)
      : m_report(diagnostics), m_reader(path, m_report), m_statements(m_report) {}
  // Of a text that is fed to the reader.
  explicit MappingFileCheck(orx::Findings& diagnostics)
      : m_report(diagnostics), m_reader(m_report), m_statements(m_report) {}

  MappingFileReader& reader() { return m_reader; }
  // Checks what there is to be read.
  void run();
  // What holds between the statements; once, when all is read.
  void finish(const CustomTransformerLookup& isInstalled);

 private:
  MappingFileReport m_report;
  MappingFileReader m_reader;
  MappingFileStatements m_statements;
  bool m_isFull = false;
};
