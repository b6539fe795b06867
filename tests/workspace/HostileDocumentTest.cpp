#include "DocumentContent.h"
#include <transform/workspace/WorkspaceLoaderException.h>

#include <QDir>
#include <QFile>
#include <gtest/gtest.h>

#include <sys/inotify.h>
#include <unistd.h>

namespace {

// Whether a file has been opened since this was made.
class OpenWatch {
 public:
  explicit OpenWatch(const QString& fileName) : m_descriptor(inotify_init1(IN_NONBLOCK)) {
    EXPECT_GE(inotify_add_watch(m_descriptor, fileName.toLocal8Bit().constData(), IN_OPEN), 0);
  }
  ~OpenWatch() { close(m_descriptor); }
  bool wasOpened() {
    char events[4096];
    return read(m_descriptor, events, sizeof events) > 0;
  }

 private:
  int m_descriptor;
};

QByteArray nested(int depth) {
  return QByteArray("<a>").repeated(depth) + QByteArray("</a>").repeated(depth);
}

QByteArray manyAttributes(int count) {
  QByteArray text = "<WORKSPACE";
  for (int i = 0; i < count; ++i)
    text += " a" + QByteArray::number(i) + "=''";
  return text + "/>";
}

constexpr int kLargest = 16 * 1024 * 1024;

}  // namespace

TEST(HostileDocument, EachIsRefusedWithItsMessage) {
  const QByteArray bomb =
      "<!DOCTYPE w [<!ENTITY a 'xxxxxxxxxx'><!ENTITY b '&a;&a;&a;&a;&a;&a;&a;&a;'>"
      "<!ENTITY c '&b;&b;&b;&b;&b;&b;&b;&b;'>]><WORKSPACE A='&c;'/>";
  // `message`: empty: accepted
  const std::tuple<const char*, QByteArray, const char*> cases[] = {
      {"document type", "\n<!DOCTYPE w>\n<WORKSPACE/>",
       "line 2 and column 9.\nError message is: A document type"},
      {"external subset", "<!DOCTYPE w SYSTEM 'http://x/y'><WORKSPACE/>",
       "A document type declaration is not allowed"},
      {"entity bomb", bomb, "A document type declaration is not allowed"},
      {"document type in UTF-16", QByteArray("\xff\xfe<\0!\0D\0O\0C\0T\0Y\0P\0E\0 \0a\0>\0<\0a\0/\0>\0", 32),
       "A document type declaration is not allowed"},
      {"such a text in a comment", "<!-- <!DOCTYPE w> --><WORKSPACE><![CDATA[<!DOCTYPE]]></WORKSPACE>", ""},
      {"unknown entity", "<WORKSPACE A='&a;'/>", "entity 'a' not found"},
      {"null character", QByteArray("<WORKSPACE A='\0'/>", 18),
       "line 1 and column 15.\nError message is: A null"},
      {"null reference", "<WORKSPACE A='&#0;'/>", "line 1 and column"},
      {"forbidden character", "<WORKSPACE A='\x01'/>", "line 1 and column"},
      {"invalid UTF-8", "<WORKSPACE A='\xc3('/>", "not valid in the document's encoding"},
      {"character cut off", "<WORKSPACE/>\xe2\x82", "not valid in the document's encoding"},
      {"invalid Shift_JIS", "<?xml version='1.0' encoding='Shift_JIS'?><WORKSPACE A='\x81\xff'/>",
       "not valid in"},
      {"declared UTF-16 in 8 bits", "<?xml version='1.0' encoding='UTF-16'?><WORKSPACE/>",
       "The encoding UTF-16"},
      {"allowed depth", nested(256), ""},
      {"too deep", nested(257),
       "line 1 and column 770.\nError message is: Elements are nested more than 256 deep"},
      {"very deep", QByteArray("<a>").repeated(500000), "Elements are nested more than 256 deep"},
      {"allowed attributes", manyAttributes(4096), ""},
      {"too many attributes", manyAttributes(4097), "more than 4096 attributes"},
      {"allowed value", "<WORKSPACE A='" + QByteArray(kLargest, 'x') + "'/>", ""},
      {"value too long", "<WORKSPACE A='" + QByteArray(kLargest + 1, 'x') + "'/>", "longer than 16777216"},
      {"value of entities", "<WORKSPACE A='" + QByteArray("&amp;").repeated(kLargest / 5 + 1) + "'/>",
       "longer than"},
      {"name too long", '<' + QByteArray(kLargest + 2, 'x') + "/>", "longer than 16777216"},
      {"comment too long", "<!--" + QByteArray(kLargest + 1, 'x') + "--><WORKSPACE/>",
       "longer than 16777216"},
      {"repeated attribute", "<WORKSPACE A='' A=''/>", "line 1 and column"},
      {"two roots", "<WORKSPACE/><WORKSPACE/>", "line 1 and column"},
      {"nothing", "", "line 1 and column 1."},
      {"no XML",
       "\x7f"
       "ELF\x02\x01",
       "line 1 and column"},
      {"fault in front of a document type", "<WORKSPACE A=1>\n<!DOCTYPE w>", "around line 1 and column 14."},
  };
  for (const auto& [name, bytes, wantedMessage] : cases) {
    const std::string message = readingError(bytes).toStdString();
    if (*wantedMessage == '\0') {
      EXPECT_EQ(message, "") << name;
    } else {
      EXPECT_NE(message.find(wantedMessage), std::string::npos) << name << ": " << message;
      EXPECT_EQ(message.rfind("General workspace parse error", 0), 0u) << name;
      EXPECT_NE(message.find("\n\nPlease contact"), std::string::npos) << name;
    }
  }
}

TEST(HostileDocument, EveryTruncationIsRefused) {
  const QByteArray bytes = written(randomContent(3, 1)).trimmed();
  for (int size = 0; size < bytes.size(); size += size < 3000 || size > bytes.size() - 300 ? 1 : 17)
    ASSERT_NE(readingError(bytes.left(size)).toStdString(), "") << size;
}

TEST(HostileDocument, NothingExternalIsOpened) {
  const ScratchFile secret("secret");
  OpenWatch watch(secret.name());
  const QByteArray url = "file://" + secret.name().toLocal8Bit();
  const QByteArray documents[] = {
      "<!DOCTYPE w SYSTEM '" + url + "'><WORKSPACE/>",
      "<!DOCTYPE w [<!ENTITY e SYSTEM '" + url + "'>]><WORKSPACE A='&e;'>&e;</WORKSPACE>",
      "<!DOCTYPE w [<!ENTITY % e SYSTEM '" + url + "'> %e;]><WORKSPACE/>",
      "<WORKSPACE xmlns:xi='http://www.w3.org/2001/XInclude'><xi:include href='" + url + "'/></WORKSPACE>",
      "<WORKSPACE xmlns:xsi='http://www.w3.org/2001/XMLSchema-instance' xsi:noNamespaceSchemaLocation='" +
          url + "'/>",
      "<?xml-stylesheet href='" + url + "'?><WORKSPACE/>",
  };
  for (const QByteArray& document : documents) {
    readingError(document);
    EXPECT_FALSE(watch.wasOpened()) << document.toStdString();
  }
  secret.content();
  EXPECT_TRUE(watch.wasOpened());
}

TEST(HostileDocument, FilesThatFailLeaveNoTemporaryFileAndNoDocument) {
  const auto temporaryFiles = [] {
    return QDir(QDir::tempPath()).entryList({QStringLiteral("kx-*")}, QDir::Files);
  };
  const QStringList before = temporaryFiles();
  const QByteArray broken = "#! <WORKSPACE>\n#! <X>\n#! </WORKSPACE>\n";
  const QByteArray longHeader = "#! <WORKSPACE/>\n#! START_HEADER\n" + QByteArray(kLargest + 1, 'x') + '\n';
  XMLComponentReader reader;
  QStringList header;
  for (const QByteArray& bytes : {broken, longHeader, QByteArray(), QByteArray("#! <!DOCTYPE x>\n#! <x/>")}) {
    reader.ReadBufferInput("<WORKSPACE><TRANSFORMERS><TRANSFORMER/></TRANSFORMERS></WORKSPACE>");
    const ScratchFile file(bytes);
    EXPECT_THROW(reader.ReadInput(file.name(), header), WorkspaceLoaderException);
    EXPECT_THROW(reader.StripAndReadInput(file.name(), 0), WorkspaceLoaderException)
        << bytes.left(99).toStdString();
    EXPECT_EQ(reader.getRootNode(), nullptr);
    EXPECT_TRUE(reader.GetTransformerList(QString()).isEmpty());
  }
  EXPECT_TRUE(header.isEmpty());
  for (const QString& name : {QStringLiteral("/nowhere/100% %1"), QDir::tempPath()}) {
    try {
      reader.ReadInput(name, header);
      ADD_FAILURE() << name.toStdString();
    } catch (const WorkspaceLoaderException& exception) {
      EXPECT_EQ(exception.getMessage(), QStringLiteral("File Error!\nCould not open file: ") + name);
    }
    EXPECT_THROW(reader.ReadInput(name), WorkspaceLoaderException);
  }
  EXPECT_EQ(temporaryFiles(), before);
}

TEST(HostileDocument, ErrorsOfAFileNameTheLineOfTheFile) {
  const ScratchFile file("one\ntwo\n#! <WORKSPACE>\nthree\n#! <X A=1/>\n#! </WORKSPACE>\n");
  XMLComponentReader reader;
  QStringList header;
  try {
    reader.ReadInput(file.name(), header);
    FAIL();
  } catch (const WorkspaceLoaderException& exception) {
    EXPECT_EQ(exception.line(), 5);
  }
}
