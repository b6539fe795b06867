#include <platform/session/ORXString.h>
#include <tests/support/Files.h>
#include <transform/text/MFFileBuffer.h>

#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

class MFBufferTest : public testing::Test {
 protected:
  QString path() const { return m_folder.filePath("out.txt"); }

  QByteArray bytes() const { return readAll(path()); }

  // What a buffer writes for these texts and one flush.
  QByteArray written(const QStringList& texts, bool mangled = false, bool replaceDeferred = false) {
    MFFileBuffer buffer(path());
    buffer.setIsMangled(mangled);
    buffer.setReplaceDeferredMacros(replaceDeferred);
    buffer.addLines(texts);
    buffer.flush();
    return bytes();
  }

  static QByteArray continued(const QByteArray& line) { return line.leftJustified(70) + " \\\n"; }

 private:
  QTemporaryDir m_folder;
};

}  // namespace

TEST_F(MFBufferTest, WritesContinuedStatements) {
  const QByteArray wide70(70, 'x');
  const QByteArray wide99(99, 'y');
  EXPECT_EQ(written({"A", "B"}), continued("A") + "B\n\n");
  EXPECT_EQ(written({"only"}), "only\n\n");
  EXPECT_EQ(written({}), "\n");
  EXPECT_EQ(written({"", "\n", "\n\n"}), "\n");
  EXPECT_EQ(written({"a\n"}), "a\n\n");
  EXPECT_EQ(written({"a\n\nb"}), continued("a") + "b\n\n");
  EXPECT_EQ(written({"\na\nb\n\n", "  "}), continued("a") + continued("b") + "  \n\n");
  EXPECT_EQ(written({wide70, wide99, "z"}), wide70 + " \\\n" + wide99 + " \\\nz\n\n");
  // Width counts characters, output is UTF-8 without a mark.
  EXPECT_EQ(written({"ä€", "b"}), "ä€" + QByteArray(68, ' ') + " \\\nb\n\n");
}

TEST_F(MFBufferTest, WritesMangledStatementsOnOneLine) {
  EXPECT_EQ(written({"A", "B\nC"}, true), "A B C\n");
  EXPECT_EQ(written({}, true), "\n");
}

TEST_F(MFBufferTest, TurnsDeferredMacrosIntoMacros) {
  EXPECT_EQ(written({"x $[A] $[B]"}, false, true), "x $(A) $(B)\n\n");
  EXPECT_EQ(written({"x $[A] $[B]"}, false, false), "x $[A] $[B]\n\n");
  EXPECT_EQ(written({"] $[A $[B] c]"}, false, true), "] $(A $(B) c)\n\n");
  EXPECT_EQ(written({"$[A\nB] [c] $x]"}, false, true), continued("$(A") + "B) [c] $x]\n\n");
  struct {
    const char* text;
    bool closes;
  } const cases[] = {{"", true},          {"$[A]", true},      {"]$[A", false},
                     {"$[A $[B]", false}, {"$[A $[B]]", true}, {"[", true}};
  for (const auto& c : cases) {
    EXPECT_EQ(MFBuffer::closesDeferredMacros(c.text), c.closes) << c.text;
  }
  EXPECT_TRUE(MFBuffer::closesDeferredMacros(QString("$[").repeated(200000) + QString("]").repeated(200000)));
}

TEST_F(MFBufferTest, RawTextOvertakesPendingLines) {
  MFFileBuffer buffer(path());
  buffer.add(QStringLiteral("pending"));
  buffer.addRaw(ORXString("raw ü"));
  EXPECT_EQ(bytes(), "raw ü");
  buffer.add("8-bit ü");
  buffer.add(ORXString("closed\nstring"));
  buffer.flush();
  EXPECT_EQ(bytes(), "raw ü" + continued("pending") + "8-bit ü" + QByteArray(63, ' ') + " \\\n" +
                         continued("closed") + "string\n\n");
  buffer.write("\xff\n");
  buffer.file().flush();
  EXPECT_TRUE(bytes().endsWith("string\n\n\xff\n"));
}

TEST_F(MFBufferTest, LivesBehindTheInterface) {
  IMFBuffer* buffer = IMFBuffer::create(path().toLatin1().constData(), true);
  buffer->add(ORXString("A\nB"));
  buffer->flush();
  buffer->add(ORXString("lost: never flushed"));
  IMFBuffer::destroy(buffer);
  EXPECT_EQ(buffer, nullptr);
  EXPECT_EQ(bytes(), "A B\n");
  IMFBuffer::destroy(buffer);
  EXPECT_EQ(buffer, nullptr);

  IMFBuffer* again = IMFBuffer::create(path().toLatin1().constData(), false);
  IMFBuffer::destroy(again);
  EXPECT_EQ(bytes(), "");
}

TEST_F(MFBufferTest, AFileThatCannotBeOpenedLosesQuietly) {
  testing::internal::CaptureStderr();
  {
    MFFileBuffer buffer(path() + "/no/such/folder");
    buffer.add("A");
    buffer.addRaw(ORXString("B"));
    buffer.flush();
    buffer.write("C");
    EXPECT_FALSE(buffer.file().isOpen());
  }
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}
