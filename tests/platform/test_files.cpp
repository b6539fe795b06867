#include <tests/support/Files.h>
#include <transform/files/AtomicFile.h>
#include <transform/files/FolderListing.h>
#include <transform/files/LineReader.h>
#include <transform/files/TemporaryFile.h>

#include <QDir>
#include <QTemporaryDir>
#include <gtest/gtest.h>

#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

unsigned modeOf(const QString& name) {
  struct stat status {};
  return ::stat(name.toUtf8().constData(), &status) == 0 ? status.st_mode & 07777 : 0;
}

// Gives up the rights of the superuser, for whom nothing is unwritable.
class WithoutRights {
 public:
  WithoutRights() : m_user(::geteuid()) { m_given = m_user != 0 || ::seteuid(65534) == 0; }
  ~WithoutRights() {
    if (::geteuid() != m_user) {
      EXPECT_EQ(::seteuid(m_user), 0);
    }
  }
  bool given() const { return m_given; }

 private:
  uid_t m_user;
  bool m_given;
};

// Puts another descriptor in the place of standard output.
class StandardOutputAs {
 public:
  explicit StandardOutputAs(int descriptor) : m_before(::dup(STDOUT_FILENO)) {
    ::dup2(descriptor, STDOUT_FILENO);
  }
  ~StandardOutputAs() {
    ::dup2(m_before, STDOUT_FILENO);
    ::close(m_before);
  }

 private:
  int m_before;
};

class AtomicFiles : public testing::Test {
 protected:
  QString path(const char* name) const { return m_folder.filePath(QLatin1String(name)); }
  // What a writer may leave behind is hidden.
  QStringList entries() const {
    return QDir(m_folder.path())
        .entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
  }

  QTemporaryDir m_folder;
};

TEST_F(AtomicFiles, AppearsWhenCommittedAndNeverWithout) {
  put(path("old"), "old");
  for (const char* name : {"new", "old"}) {
    const QByteArray before = readAll(path(name));
    const QByteArray large(300 * 1000, 'x');
    for (const bool isCommitted : {false, true}) {
      AtomicFile file(path(name));
      ASSERT_TRUE(file.open()) << qPrintable(file.errorString());
      file.device().write("head\n");
      file.device().write(large);
      EXPECT_EQ(readAll(path(name)), before);
      EXPECT_TRUE(!isCommitted || (file.commit() && !file.commit()));
    }
    EXPECT_EQ(readAll(path(name)), "head\n" + large);
  }
  EXPECT_EQ(entries(), (QStringList{"new", "old"}));
}

TEST_F(AtomicFiles, LeavesAFileOfTheSameBytesAsItIs) {
  const QByteArray large(100 * 1000, 'x');
  const std::pair<QByteArray, bool> cases[] = {
      {large, true}, {large + 'x', false}, {large.mid(1) + 'y', false}, {"", false}};
  for (const auto& [written, isKept] : cases) {
    put(path("old"), large.constData());
    struct stat before {};
    struct stat after {};
    ASSERT_EQ(::stat(path("old").toUtf8().constData(), &before), 0);
    AtomicFile file(path("old"));
    ASSERT_TRUE(file.open());
    file.device().write(written);
    ASSERT_TRUE(file.commit());
    ASSERT_EQ(::stat(path("old").toUtf8().constData(), &after), 0);
    EXPECT_EQ(before.st_ino == after.st_ino, isKept) << written.size();
    EXPECT_EQ(readAll(path("old")), written);
  }
  EXPECT_EQ(entries(), QStringList{"old"});
}

TEST_F(AtomicFiles, KeepsPermissions) {
  const mode_t umaskBefore = ::umask(027);
  for (const unsigned mode : {0600u, 0644u, 0666u, 0751u}) {
    put(path("kept"), "old");
    ASSERT_EQ(::chmod(path("kept").toUtf8().constData(), mode), 0);
    AtomicFile file(path("kept"));
    ASSERT_TRUE(file.open());
    ASSERT_TRUE(file.commit());
    EXPECT_EQ(modeOf(path("kept")), mode);
    EXPECT_EQ(readAll(path("kept")), "");
  }
  AtomicFile fresh(path("fresh"));
  EXPECT_TRUE(fresh.open() && fresh.commit());
  EXPECT_EQ(modeOf(path("fresh")), 0640u);
  ::umask(umaskBefore);
}

TEST_F(AtomicFiles, FollowsLinksToFilesThatStandAndThatDoNot) {
  put(path("target"), "old");
  ASSERT_TRUE(QDir(m_folder.path()).mkdir("sub"));
  ASSERT_TRUE(QFile::link("target", path("link")));
  ASSERT_TRUE(QFile::link("../link", path("sub/chain")));
  ASSERT_TRUE(QFile::link("missing", path("dangling")));
  ASSERT_TRUE(QFile::link("loop", path("loop")));
  const std::tuple<const char*, const char*> cases[] = {
      {"link", "target"}, {"sub/chain", "target"}, {"dangling", "missing"}};
  for (const auto& [name, target] : cases) {
    AtomicFile file(path(name));
    ASSERT_TRUE(file.open()) << name;
    file.device().write(name);
    ASSERT_TRUE(file.commit()) << name;
    EXPECT_TRUE(QFileInfo(path(name)).isSymLink());
    EXPECT_EQ(readAll(path(target)), name);
  }
  AtomicFile loop(path("loop"));
  EXPECT_FALSE(loop.open());
}

TEST_F(AtomicFiles, NamesFileAndReasonWhenThePlaceIsNoGood) {
  put(path("file"), "x");
  const std::tuple<QString, int> cases[] = {{path("missing/out.txt"), ENOENT},
                                            {path("file/out.txt"), ENOTDIR},
                                            {m_folder.path(), EISDIR},
                                            {m_folder.path() + QLatin1Char('/'), EISDIR},
                                            {QString(), ENOENT},
                                            {path("nul") + QChar(0), EINVAL},
                                            {path("") + QString(300, QLatin1Char('n')), ENAMETOOLONG}};
  for (const auto& [name, reason] : cases) {
    AtomicFile file(name);
    EXPECT_FALSE(file.open()) << qPrintable(name);
    EXPECT_EQ(file.errorString(), name + QLatin1String(": ") + qt_error_string(reason));
    EXPECT_FALSE(file.commit());
    EXPECT_EQ(file.device().write("x"), -1);
  }
  EXPECT_EQ(entries(), QStringList{"file"});
}

TEST_F(AtomicFiles, RefusesWhatMayNotBeWritten) {
  put(path("readonly"), "old");
  ASSERT_EQ(::chmod(path("readonly").toUtf8().constData(), 0444), 0);
  ASSERT_TRUE(QDir(m_folder.path()).mkdir("closed"));
  ASSERT_EQ(::chmod(path("closed").toUtf8().constData(), 0555), 0);
  ASSERT_EQ(::chmod(m_folder.path().toUtf8().constData(), 0777), 0);
  {
    const WithoutRights guard;
    ASSERT_TRUE(guard.given());
    for (const char* name : {"readonly", "closed/out.txt"}) {
      AtomicFile file(path(name));
      EXPECT_FALSE(file.open()) << name;
      EXPECT_TRUE(file.errorString().endsWith(qt_error_string(EACCES))) << qPrintable(file.errorString());
    }
  }
  EXPECT_EQ(readAll(path("readonly")), "old");
}

TEST_F(AtomicFiles, ReportsAFullDeviceHoweverLittleWasWritten) {
  for (const int size : {1, 70 * 1000, 300 * 1000}) {
    AtomicFile file("/dev/full");
    ASSERT_TRUE(file.open()) << qPrintable(file.errorString());
    file.device().write(QByteArray(size, 'x'));
    file.device().write("more");  // a writer that does not look at results
    EXPECT_FALSE(file.commit()) << size;
    EXPECT_EQ(file.errorString(), QString("/dev/full: ") + qt_error_string(ENOSPC));
  }
  AtomicFile sink("/dev/null");
  EXPECT_TRUE(sink.open() && sink.device().write("x") == 1 && sink.commit());
  EXPECT_TRUE(QFileInfo("/dev/null").exists());
}

TEST_F(AtomicFiles, WritesToStandardOutputByEitherName) {
  put(path("redirected"), "before\n");
  const int descriptor = ::open(path("redirected").toUtf8().constData(), O_WRONLY | O_APPEND);
  struct stat before {};
  ASSERT_EQ(::fstat(descriptor, &before), 0);
  for (const char* name : {"-", "/dev/stdout", "/dev/fd/1", "/proc/self/fd/1"}) {
    const StandardOutputAs redirected(descriptor);
    AtomicFile file(QString::fromLatin1(name));
    EXPECT_TRUE(file.open() && file.device().write(QByteArray(name) + "\n") > 0 && file.commit());
  }
  EXPECT_EQ(readAll(path("redirected")), "before\n-\n/dev/stdout\n/dev/fd/1\n/proc/self/fd/1\n");
  struct stat after {};
  ASSERT_EQ(::stat(path("redirected").toUtf8().constData(), &after), 0);
  EXPECT_EQ(before.st_ino, after.st_ino);
  ::close(descriptor);
}

TEST_F(AtomicFiles, SeesAClosedPipeAndLivesOn) {
  int ends[2];
  ASSERT_EQ(::pipe(ends), 0);
  ::close(ends[0]);
  AtomicFile file("-");
  {
    const StandardOutputAs broken(ends[1]);
    EXPECT_TRUE(file.open());
    file.device().write("x");
  }
  ::close(ends[1]);
  EXPECT_FALSE(file.commit());
  EXPECT_EQ(file.errorString(), QString("standard output: ") + qt_error_string(EPIPE));
  sigset_t pending;
  ASSERT_EQ(::sigpending(&pending), 0);
  EXPECT_EQ(::sigismember(&pending, SIGPIPE), 0);
}

TEST_F(AtomicFiles, FindsItsPlaceAfterAChangeOfFolder) {
  const QString before = QDir::currentPath();
  ASSERT_TRUE(QDir::setCurrent(m_folder.path()));
  AtomicFile file("relative.txt");
  EXPECT_TRUE(file.open());
  file.device().write("here");
  ASSERT_TRUE(QDir::setCurrent(before));
  EXPECT_TRUE(file.commit()) << qPrintable(file.errorString());
  EXPECT_EQ(readAll(path("relative.txt")), "here");
}

TEST_F(AtomicFiles, ReportsAPlaceThatWasTakenMeanwhile) {
  AtomicFile file(path("taken"));
  ASSERT_TRUE(file.open());
  ASSERT_TRUE(QDir(m_folder.path()).mkdir("taken"));
  EXPECT_FALSE(file.commit());
  EXPECT_FALSE(file.errorString().isEmpty());
  EXPECT_EQ(entries(), QStringList{"taken"});
}

using FolderListings = AtomicFiles;

TEST_F(FolderListings, SortsByCodeAndTellsFailureFromEmpty) {
  for (const char* name : {"b.ort", "B.ort", "a.ort", "\xc3\xa4.ort", "a.txt", ".hidden.ort"}) {
    put(m_folder.filePath(QString::fromUtf8(name)), "x");
  }
  ASSERT_TRUE(QDir(m_folder.path()).mkdir("sub.ort"));
  ASSERT_TRUE(QFile::link("a.txt", path("link.ort")));
  ASSERT_TRUE(QFile::link("nowhere", path("dangling.ort")));
  EXPECT_EQ(FolderListing::files(m_folder.path(), ".ort").names(),
            (QStringList{"B.ort", "a.ort", "b.ort", "link.ort", "\xc3\xa4.ort"}));
  EXPECT_EQ(FolderListing::files(m_folder.path(), ".ort").unusableNames(), QStringList{"dangling.ort"});
  EXPECT_EQ(FolderListing::folders(m_folder.path()).names(), QStringList{"sub.ort"});
  const FolderListing empty = FolderListing::files(path("sub.ort"));
  EXPECT_TRUE(empty.names().isEmpty());
  EXPECT_FALSE(empty.failed());
  for (const char* name : {"missing", "a.txt"}) {
    const FolderListing failed = FolderListing::files(path(name));
    EXPECT_TRUE(failed.failed()) << name;
    EXPECT_TRUE(failed.errorString().startsWith(path(name) + QLatin1String(": ")));
  }
}

using LineReaders = AtomicFiles;

TEST_F(LineReaders, GivesLinesWithTheirPlaces) {
  put(path("lines"), QByteArray("one\r\n\n\xc3\xa4 \0x\nlast", 16));
  LineReader reader(path("lines"));
  ASSERT_TRUE(reader.open());
  const std::tuple<QByteArray, qint64> expected[] = {
      {"one", 0}, {"", 5}, {QByteArray("\xc3\xa4 \0x", 5), 6}, {"last", 12}};
  qint64 number = 0;
  for (const auto& [line, offset] : expected) {
    ASSERT_TRUE(reader.next());
    EXPECT_EQ(reader.line(), line);
    EXPECT_EQ(reader.offset(), offset);
    EXPECT_EQ(reader.number(), ++number);
  }
  EXPECT_FALSE(reader.next());
  EXPECT_FALSE(reader.failed());
}

TEST_F(LineReaders, BoundsTheLine) {
  const std::tuple<QByteArray, bool> cases[] = {{"12345678\n", true}, {"12345678\r\n", true},
                                                {"12345678", true},   {"123456789\n", false},
                                                {"123456789", false}, {"1234567890123\n", false}};
  for (const auto& [content, taken] : cases) {
    put(path("long"), content);
    LineReader reader(path("long"), 8);
    ASSERT_TRUE(reader.open());
    EXPECT_EQ(reader.next(), taken) << content.constData();
    EXPECT_EQ(reader.failed(), !taken);
    EXPECT_FALSE(reader.next());
  }
}

TEST_F(LineReaders, NamesAFileThatCannotBeRead) {
  for (const QString& name : {path("missing"), m_folder.path()}) {
    LineReader reader(name);
    EXPECT_FALSE(reader.open() && !reader.next() && !reader.failed()) << qPrintable(name);
    EXPECT_TRUE(reader.errorString().startsWith(name + QLatin1String(": ")));
    EXPECT_FALSE(reader.next());
  }
}

TEST(TemporaryFiles, ArePrivateAndGoAway) {
  QString name;
  {
    TemporaryFile file("orx-test-XXXXXX");
    ASSERT_TRUE(file.open());
    name = file.fileName();
    EXPECT_EQ(modeOf(name), 0600u);
  }
  EXPECT_FALSE(QFile::exists(name));
}

}  // namespace
