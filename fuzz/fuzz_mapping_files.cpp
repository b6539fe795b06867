// Mapping files: every one ends in findings, which are the same each time and lie within the file.
#include <translation/MappingFileLint.h>

#include <QTemporaryFile>

#include <fuzz/FuzzTarget.h>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  // Python scripts would mostly wait for their interpreter.
  static const bool kWithoutPython = qputenv("PATH", "/nowhere");
  require(kWithoutPython, "the environment can be set");
  QTemporaryFile file;
  const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<int>(size));
  require(file.open() && file.write(bytes) == bytes.size() && file.flush(), "there is room for the input");
  const auto isInstalled = [](const QString& name, int version) { return name.size() == version; };
  const MappingFileFindings result = lintMappingFile(file.fileName(), QStringLiteral("fuzz.mf"), isInstalled);
  require(result.readError.isEmpty(), "the file is read");
  const int lines = 1 + bytes.count('\n') + bytes.count('\r');
  int line = 0;
  for (const orx::Finding& finding : result.findings) {
    require(finding.line >= line && finding.line <= lines, "findings stand in the order of the lines");
    require(!finding.text.isEmpty() && finding.text.size() < 1000, "findings have texts of bounded length");
    line = finding.line;
  }
  const MappingFileFindings again = lintMappingFile(file.fileName(), QStringLiteral("fuzz.mf"), isInstalled);
  require(again.findings.size() == result.findings.size(), "the same is found again");
  for (std::size_t i = 0; i < result.findings.size(); ++i)
    require(again.findings[i].text == result.findings[i].text, "the same is said again");
  return 0;
}
