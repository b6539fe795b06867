// Documents made to harm: the command ends with a diagnostic within bounded memory, far less than the
// document's size asks for.
#include <tests/cli/OrxtProcess.h>

#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

constexpr int kMegabyte = 1024 * 1024;

// Writes a document of about 100 MB piece by piece.
void writeLarge(const QString& path, const QByteArray& head, const QByteArray& piece) {
  QFile file(path);
  ASSERT_TRUE(file.open(QIODevice::WriteOnly));
  file.write(head);
  const QByteArray block = piece.repeated(kMegabyte / piece.size());
  for (int i = 0; i < 100; ++i)
    ASSERT_EQ(file.write(block), block.size());
}

Outcome validateWithin(int megabytes, const QString& path) {
  QProcess process;
  process.start("sh",
                {"-c", QString("ulimit -v %1; exec \"$0\" validate --lang en \"$1\"").arg(megabytes * 1024),
                 QStringLiteral(ORX_BINARY_DIR) + "/bin/orxt", path});
  EXPECT_TRUE(process.waitForFinished(120000));
  EXPECT_EQ(process.exitStatus(), QProcess::NormalExit);
  return {process.exitCode(), QString::fromUtf8(process.readAllStandardOutput()),
          QString::fromUtf8(process.readAllStandardError())};
}

}  // namespace

TEST(HostileFile, IsRefusedWithinBoundedMemory) {
#ifdef __SANITIZE_ADDRESS__
  GTEST_SKIP() << "the sanitizer itself takes more than the limit";
#endif
  const struct {
    const char* name;
    QByteArray head;
    QByteArray piece;
    const char* message;
  } cases[] = {
      {"one attribute", "<WORKSPACE A='", "x", "longer than 16777216"},
      {"nesting", "<WORKSPACE>", "<a>", "nested more than 256 deep"},
      {"attributes", "<WORKSPACE ", "a='' ", "line 1 and column"},
      {"one text", "<WORKSPACE>", "text ", "longer than 16777216"},
      {"one element name", "<WORKSPACE><", "n", "longer than 16777216"},
      {"one comment", "<WORKSPACE><!--", "c ", "longer than 16777216"},
      {"one comment line", "#! <?xml version=\"1.0\"?>\n#! <WORKSPACE A='", "y", "longer than 16777216"},
  };
  QTemporaryDir folder;
  const QString path = folder.filePath("w.orw");
  for (const auto& test : cases) {
    writeLarge(path, test.head, test.piece);
    const Outcome run = validateWithin(400, path);
    EXPECT_EQ(run.status, 1) << test.name << run.err.left(500).toStdString();
    EXPECT_TRUE(run.err.contains(test.message)) << test.name << ": " << run.err.left(500).toStdString();
    EXPECT_LT(run.err.size(), 2000) << test.name;
  }
}
