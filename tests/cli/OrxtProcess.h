// Runs the command and gives back what it did.
#pragma once

#include <tests/support/Files.h>

#include <QDir>
#include <QProcess>
#include <QString>
#include <QStringList>
#include <gtest/gtest.h>

struct Outcome {
  int status;
  QString out;
  QString err;
};

// `outputFile` receives standard output when it is given; `input` is what stands on standard input.
inline Outcome orxt(const QStringList& arguments, const QString& folder = QString(),
                    const QString& outputFile = QString(), const QByteArray& input = QByteArray(),
                    const QString& locale = QStringLiteral("C.UTF-8")) {
  QProcess process;
  QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
  environment.insert("LC_ALL", locale);
  process.setProcessEnvironment(environment);
  if (!folder.isEmpty())
    process.setWorkingDirectory(folder);
  if (!outputFile.isEmpty())
    process.setStandardOutputFile(outputFile);
  process.start(QStringLiteral(ORX_BINARY_DIR) + "/bin/orxt", arguments);
  process.write(input);
  process.closeWriteChannel();
  EXPECT_TRUE(process.waitForFinished(120000)) << arguments.join(' ').toStdString();
  EXPECT_EQ(process.exitStatus(), QProcess::NormalExit) << arguments.join(' ').toStdString();
  return {process.exitCode(), QString::fromUtf8(process.readAllStandardOutput()),
          QString::fromUtf8(process.readAllStandardError())};
}

inline QString sample(const QString& name) {
  return QStringLiteral(ORX_SOURCE_DIR) + "/samples/" + name;
}

inline QStringList samples() {
  QStringList result;
  for (const QString& name : QDir(QStringLiteral(ORX_SOURCE_DIR) + "/samples").entryList({"*.orw"}))
    result << sample(name);
  return result;
}

// One command line: its exit status and a piece of each stream; an empty piece means that nothing may be
// said.
struct CommandCase {
  QStringList arguments;
  int status;
  const char* out;
  const char* err;
};

inline void expectOutcome(const CommandCase& test, const QString& folder) {
  const Outcome run = orxt(test.arguments, folder);
  const std::string line = test.arguments.join(' ').toStdString();
  EXPECT_EQ(run.status, test.status) << line << "\n" << run.err.toStdString();
  EXPECT_TRUE(*test.out ? run.out.contains(test.out) : run.out.isEmpty()) << line << "\n"
                                                                          << run.out.toStdString();
  EXPECT_TRUE(*test.err ? run.err.contains(test.err) : run.err.isEmpty()) << line << "\n"
                                                                          << run.err.toStdString();
}
