// Custom transformers as files of their own.
#include <tests/cli/OrxtProcess.h>
#include <tests/support/QtPrinters.h>

#include <QRegularExpression>
#include <QTemporaryDir>

namespace {

const QString kCustom = QStringLiteral("Tidy Area");

QString text(const QString& path) {
  return QString::fromUtf8(readAll(path));
}

// The sample with links in place of its embedded custom transformers.
QByteArray linkedWorkspace() {
  QString workspace = text(sample("land_cover.orw"));
  workspace.remove(QRegularExpression("#! <SUBDOCUMENT\\n.*#! </SUBDOCUMENT>\\n",
                                      QRegularExpression::DotMatchesEverythingOption));
  workspace.remove(QRegularExpression("#! +<XFORM_PARM PARM_NAME=\"SUB_DOC_NAME\"[^\\n]*\\n"));
  return workspace.replace("TYPE=\"SubDocumentTransformer\"", "TYPE=\"" + kCustom + "\"").toUtf8();
}

// Between the two marks, blanks at line ends aside.
QStringList linesBetween(const QString& all, const QString& begin, const QString& end) {
  QStringList lines = all.mid(all.indexOf(begin)).split('\n').mid(1);
  lines = lines.mid(0, lines.indexOf(end));
  for (QString& line : lines) {
    while (line.endsWith(' '))
      line.chop(1);
  }
  return lines;
}

TEST(ExtractCommand, AFileTranslatesToWhatTheEmbeddedOneDid) {
  QTemporaryDir folder;
  const QString file = folder.filePath("shared/tidy.ort");
  ASSERT_TRUE(QDir(folder.path()).mkdir("shared"));
  const Outcome extracted = orxt({"extract", sample("land_cover.orw"), kCustom, "-o", file});
  ASSERT_EQ(extracted.status, 0) << extracted.err.toStdString();
  EXPECT_EQ(extracted.err, QString());

  put(folder.filePath("linked.orw"), linkedWorkspace());
  const Outcome linked = orxt({"generate", "linked.orw", "--resources", "shared"}, folder.path());
  EXPECT_EQ(linked.status, 0) << linked.err.toStdString();
  const QString embedded = text(sample("land_cover.mf"));
  const int firstBlock = embedded.indexOf("# TRANSFORMER_BEGIN");
  const QString lastMark = "# TRANSFORMER_END\n\n";
  const int behind = embedded.lastIndexOf(lastMark) + lastMark.size();
  ASSERT_GT(firstBlock, 0);
  EXPECT_EQ(linked.out, embedded.left(firstBlock) + embedded.mid(behind));

  // The file's definition: the one inside as a block, then the lines of its own.
  QStringList wanted{"# TRANSFORMER_BEGIN Repair Geometry,1,Samples,c2f1d9e4-88ab-4c57-a1b3-0d6e94f7b5a2"};
  wanted += linesBetween(embedded, wanted.first(), "# TRANSFORMER_END");
  wanted.append("# TRANSFORMER_END");
  for (QString& line : wanted)
    line.prepend("# ");
  wanted.append("#");
  wanted += linesBetween(embedded, "# TRANSFORMER_BEGIN Tidy Area", "# TRANSFORMER_END");
  EXPECT_EQ(linesBetween(text(file), "# TRANSFORMER_BEGIN Tidy Area", "# TRANSFORMER_END"), wanted);
}

TEST(ExtractCommand, ANewVersionGoesInFrontAndLeavesTheOthersAlone) {
  QTemporaryDir folder;
  const QString file = folder.filePath("tidy.ort");
  const QStringList command = {"extract", sample("land_cover.orw"), kCustom, "-o", file};
  ASSERT_EQ(orxt(command).status, 0);
  const QByteArray first = readAll(file);
  EXPECT_TRUE(orxt(command).err.contains("version 1 is there already"));
  EXPECT_EQ(readAll(file), first);
  ASSERT_EQ(orxt(command + QStringList{"--version", "2"}).status, 0);
  const QByteArray behind = first.mid(first.indexOf('\n') + 1);
  EXPECT_TRUE(readAll(file).endsWith(behind));
  EXPECT_TRUE(readAll(file).contains("\n# TRANSFORMER_BEGIN Tidy Area,2,"));
}

TEST(ExtractCommand, SaysWhatItCannotDo) {
  QTemporaryDir folder;
  put(folder.filePath("other.ort"), "TRANSFORMER_NAME: Other\n");
  QByteArray comma = readAll(sample("land_cover.orw"));
  put(folder.filePath("comma.orw"), comma.replace("Tidy Area", "Tidy, Area"));
  QByteArray global = readAll(sample("land_cover.orw"));
  put(folder.filePath("global.orw"), global.replace("VALUE=\"0.05\"", "VALUE=\"$(SURVEY_YEAR)\""));
  QByteArray unknown = readAll(sample("land_cover.orw"));
  put(folder.filePath("unknown.orw"), unknown.replace("TYPE=\"VertexThinner\"", "TYPE=\"Nothing\""));
  const QString good = sample("land_cover.orw");
  const struct {
    QStringList arguments;
    int status;
    QString message;
  } cases[] = {
      {{good, "Tidy", "-o", "a.ort"}, 1, "there are: Tidy Area, Repair Geometry"},
      {{sample("road_network.orw"), "Tidy", "-o", "a.ort"}, 1, "embeds no custom transformers"},
      {{"comma.orw", "Tidy, Area", "-o", "a.ort"}, 1, "a comma"},
      {{"unknown.orw", kCustom, "-o", "a.ort"}, 1, "Tidy Area/Thin vertices: "},
      {{good, kCustom, "-o", "other.ort"}, 1, "no file of custom transformers"},
      {{good, kCustom, "-o", "no/such/a.ort"}, 3, "a.ort"},
      {{"missing.orw", kCustom, "-o", "a.ort"}, 3, "missing.orw"},
      {{good, kCustom}, 2, "--output"},
      {{good, kCustom, "-o", "-"}, 2, "-o"},
      {{good, kCustom, "-o", "a.ort", "--version", "0"}, 2, "--version"},
      {{"global.orw", kCustom, "-o", "b.ort"}, 0, "warning: The inside refers to $(SURVEY_YEAR)"},
  };
  for (const auto& test : cases) {
    const Outcome run = orxt(QStringList{"extract"} + test.arguments, folder.path());
    const std::string line = test.arguments.join(' ').toStdString();
    EXPECT_EQ(run.status, test.status) << line;
    EXPECT_TRUE(run.err.contains(test.message)) << line << "\n" << run.err.toStdString();
  }
  EXPECT_FALSE(QFile::exists(folder.filePath("a.ort")));
  EXPECT_EQ(readAll(folder.filePath("other.ort")), QByteArray("TRANSFORMER_NAME: Other\n"));
}

}  // namespace
