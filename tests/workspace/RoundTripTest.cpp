#include "DocumentContent.h"
#include <transform/workspace/DocumentCopy.h>
#include <transform/workspace/WorkspaceLossReport.h>

#include <QProcess>
#include <QStandardPaths>
#include <gtest/gtest.h>

TEST(RoundTrip, RandomDocumentsReadBackEqualAndWriteTheSameBytes) {
  for (unsigned seed = 0; seed < 40; ++seed) {
    SCOPED_TRACE(seed);
    const DocumentContent content = randomContent(seed, seed % 5);
    const QByteArray bytes = written(content);
    const auto reader = readBytes(bytes);
    expectSame(content, contentOf(*reader));
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    XMLComponentWriter writer(&buffer, reader->GetDocumentType());
    copyDocument(*reader, writer);
    writer.writeDocument();
    EXPECT_TRUE(buffer.data() == bytes);
    const WorkspaceLossReport report(*reader);
    EXPECT_TRUE(report.isEmpty()) << report.losses().front().describe().toStdString();
  }
}

TEST(RoundTrip, EveryEncodingKeepsEveryCharacter) {
  const DocumentContent content = randomContent(7, 3);
  DocumentContent ascii;
  ascii.documents[QString()];
  CommentStruct comment;
  comment.commentValue = QString::fromUtf8("\xe4\xb8\xad \xf0\x9f\x98\x80 \xe2\x82\xac \xc3\xa9");
  ascii.documents[QString()].comments.push_back(comment);
  for (const char* const encoding : {"UTF-8", "UTF-16", "UTF-16LE", "UTF-16BE", "GB18030"}) {
    SCOPED_TRACE(encoding);
    expectSame(content, contentOf(*readBytes(written(content, encoding))));
  }
  // What these cannot hold becomes character references.
  for (const char* const encoding : {"ISO-8859-1", "windows-1252", "US-ASCII", "Shift_JIS"}) {
    SCOPED_TRACE(encoding);
    expectSame(ascii, contentOf(*readBytes(written(ascii, encoding))));
  }
}

TEST(RoundTrip, AnIndependentParserAcceptsWhatIsWritten) {
  const QString tool = QStandardPaths::findExecutable(QStringLiteral("xmllint"));
  if (tool.isEmpty())
    GTEST_SKIP() << "xmllint is not installed";
  for (const char* const encoding : {"UTF-8", "UTF-16", "ISO-8859-1"}) {
    for (unsigned seed = 100; seed < 104; ++seed) {
      const ScratchFile file(written(randomContent(seed, 3), encoding));
      QProcess process;
      process.start(tool, {QStringLiteral("--noout"), file.name()});
      ASSERT_TRUE(process.waitForFinished());
      EXPECT_EQ(process.exitCode(), 0) << encoding << seed << process.readAllStandardError().toStdString();
    }
  }
}
