// Workspaces with custom transformers that live in files of their own.
#include <platform/orxutil/Decipher.h>
#include <platform/qorxcore/qorxcore.h>
#include <tests/registry/RegistryFolders.h>
#include <tests/support/QtPrinters.h>
#include <tests/translation/TranslatedWorkspace.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceFile.h>

#include <QDir>

namespace {

const QByteArray kSecret = QByteArrayLiteral("ORW-SECRET ");

QByteArray enciphered(const QByteArray& plain) {
  return kSecret + plain.toBase64();
}

bool decipher(const QString& fileName, const QString& plainCopy) {
  const QByteArray text = readAll(fileName).trimmed();
  if (text.startsWith(kSecret))
    put(plainCopy, QByteArray::fromBase64(text.mid(kSecret.size())));
  return text.startsWith(kSecret);
}

class LinkedTranslation : public testing::Test {
 protected:
  LinkedTranslation() {
    folders.define("Other.ort", definitionText("Other", 1, "PRESERVES_ATTRIBUTES: <ALL>\n"));
    file = folders.path("extra/Tidy.ort");
  }
  ~LinkedTranslation() override { ORW_setDecipherRoutine({}); }

  void store(const QByteArray& document, const QString& name = "Tidy") {
    folders.write("extra/unused.txt", "");
    QString error;
    EXPECT_TRUE(VersionStore(folders.path("extra/" + name + ".ort"))
                    .insert({name, "1", "Mine", "G"},
                            {"FACTORY_DEF * TeeFactory FACTORY_NAME C INPUT FEATURE_TYPE a"}, document,
                            error))
        << error.toStdString();
  }
  void storeBody(const QByteArray& behind, const QByteArray& between = QByteArray()) {
    folders.write("extra/Tidy.ort", "# ORW custom transformers\n# TRANSFORMER_BEGIN Tidy,1,Mine,G\n" +
                                        between + "# TRANSFORMER_END\n" + behind);
  }

  // A workspace with an instance of Tidy; `isInside` puts it into an embedded custom transformer.
  static SmallWorkspace workspace(bool isInside = false, const QString& version = "1") {
    SmallWorkspace workspace;
    workspace.reader(1, "Parcels", {"id"}).writer(2, "Flooded");
    const auto place = [&] {
      workspace.transformer(3, "Tidy", {"XFORMER_NAME", "T", "LIMIT", "7"}, {"VERSION", version});
      workspace.link(1, "fo 0", 3, "fi 0 IN").link(3, "fo 0 OUT", 2, "fi 0");
    };
    if (!isInside) {
      place();
      return workspace;
    }
    workspace.transformer(3, "SubDocumentTransformer", {"SUB_DOC_NAME", "Around", "XFORMER_NAME", "A"});
    workspace.link(1, "fo 0", 3, "fi 0 IN").link(3, "fo 0 OUT", 2, "fi 0");
    workspace.beginCustom("Around").port(1, "IN", "true").port(2, "OUT", "false");
    place();
    workspace.endCustom();
    return workspace;
  }

  RegistryFolders folders;
  QString file;
};

// One that stands inside a linked one, and one that the document embeds.
TEST_F(LinkedTranslation, EqualNamesMeanEqualDefinitions) {
  store(tidyDocument()
            .replace("TYPE=\"Other\" VERSION=\"1\"/>",
                     "TYPE=\"SubDocumentTransformer\" VERSION=\"1\"><XFORM_PARM PARM_NAME=\"SUB_DOC_NAME\" "
                     "PARM_VALUE=\"Inner\"/></TRANSFORMER>")
            .replace("</SUBDOCUMENTS>",
                     "<SUBDOCUMENT NAME=\"Inner\"><TRANSFORMERS><TRANSFORMER IDENTIFIER=\"3\" TYPE=\"Other\" "
                     "VERSION=\"1\"><XFORM_PARM PARM_NAME=\"XFORMER_NAME\" PARM_VALUE=\"N\"/></TRANSFORMER>"
                     "</TRANSFORMERS></SUBDOCUMENT></SUBDOCUMENTS>"));
  for (const char* node : {"N", "M"}) {
    SmallWorkspace document = workspace();
    document.transformer(8, "SubDocumentTransformer", {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "I"});
    document.beginCustom("Inner")
        .transformer(3, "Other", {"XFORMER_NAME", node}, {"VERSION", "1"})
        .endCustom();
    const Outcome outcome = translate(document, folders.load());
    EXPECT_EQ(outcome.diagnostics,
              *node == 'N' ? QStringList() : QStringList("custom-transformer-fault Inner"))
        << outcome.texts.join('\n').toStdString();
    EXPECT_TRUE(*node == 'N' || outcome.texts.value(0).contains(file))
        << outcome.texts.value(0).toStdString();
  }
}

TEST_F(LinkedTranslation, TellsWhatDoesNotFit) {
  const QString all = folders.path("home/transformers");
  using Make = std::function<void()>;
  const auto changed = [&](const char* from, const char* to) -> Make {
    return [=] { store(tidyDocument().replace(from, to)); };
  };
  const auto build = [&](int number) -> Make { return [=] { store(tidyDocument(number)); }; };
  const Make broken = [&] { store("<?xml version=\"1.0\"?>\n<TRANSFORMER>\n"); };
  const Make hollow = [&] { storeBody({}); };
  const Make secret = [&] { storeBody(enciphered(tidyDocument())); };
  const Make circle = [&] {
    store(tidyDocument().replace("TYPE=\"Other\"", "TYPE=\"Mess\""));
    store(tidyDocument().replace("TYPE=\"Other\"", "TYPE=\"Tidy\"").replace("\"Tidy\" L", "\"Mess\" L"),
          "Mess");
  };
  const Make chain = [&] {
    for (int level = 0; level < 66; ++level) {
      const QString name = level == 0 ? QString("Tidy") : QString("Link%1").arg(level);
      const QString next = level == 65 ? "TYPE=\"Other\"" : QString("TYPE=\"Link%1\"").arg(level + 1);
      store(QString(tidyDocument())
                .replace("TYPE=\"Other\"", next)
                .replace("\"Tidy\"", '"' + name + '"')
                .toUtf8(),
            name);
    }
  };
  const struct {
    const char* promise;
    Make make;
    const char* version;
    const char* diagnostic;  // inside an embedded one it is a fault of that, at the node AROUND/T
    QStringList inText;      // of the first
  } cases[] = {
      {"fits", build(1), "1", "", {}},
      {"missing", [] {}, "4", "unknown-transformer T", {"'Tidy'", "4", all, folders.path("extra")}},
      {"version missing", build(1), "2", "unknown-version T", {"'Tidy'", "2", "1"}},
      {"newer build", build(18287), "1", "custom-transformer-fault T", {"'Tidy'", file}},
      {"input", changed("=\"IN\"", "=\"INTO\""), "1", "unknown-input T", {file, "'IN'", "INTO"}},
      {"output", changed("=\"OUT\"", "=\"DONE\""), "1", "unknown-output T", {file, "'OUT'", "DONE"}},
      {"parameter", changed("LIMIT", "BOUND"), "1", "unknown-parameter T", {file, "'LIMIT'"}},
      {"inside", changed("=\"Other\"", "=\"Gone\""), "1", "unknown-transformer Tidy/Gone_3", {"'Gone'"}},
      {"body broken", broken, "1", "custom-transformer-fault T", {"'Tidy'", file}},
      {"body missing", hollow, "1", "custom-transformer-fault T", {"'Tidy'", file}},
      {"enciphered", secret, "1", "custom-transformer-fault T", {"'Tidy'", file, "decipher"}},
      {"inside itself", changed("=\"Other\"", "=\"Tidy\""), "1", "nesting Tidy/Tidy_3", {"Tidy > Tidy"}},
      {"by way of another file", circle, "1", "nesting T", {"Tidy > Mess > Tidy"}},
      {"a chain of files", chain, "1", "nesting T", {"64"}},
  };
  for (const auto& test : cases) {
    for (const bool isInside : {false, true}) {
      QDir extra(folders.path("extra"));
      for (const QString& linked : extra.entryList({"*.ort"}))
        extra.remove(linked);
      test.make();
      const Outcome outcome = translate(workspace(isInside, test.version), folders.load());
      QStringList expected = QString(test.diagnostic).split('|', Qt::SkipEmptyParts);
      if (isInside && !QString(test.diagnostic).contains('/'))
        expected.replaceInStrings(" T", expected.contains("nesting T") ? " A" : " Around/T");
      EXPECT_EQ(outcome.diagnostics, expected) << test.promise << isInside;
      EXPECT_EQ(outcome.result, expected.isEmpty() ? TranslationResult::Done : TranslationResult::Refused);
      for (const QString& part : test.inText)
        EXPECT_TRUE(outcome.texts.value(0).contains(part))
            << test.promise << isInside << outcome.texts.value(0).toStdString();
      EXPECT_EQ(outcome.text.count("INCLUDE_CUSTOM_TRANSFORMER_VER Tidy:1\n"), expected.isEmpty() ? 1 : 0);
    }
  }
}

TEST_F(LinkedTranslation, StatementsAreTheSameInEveryLanguage) {
  store(tidyDocument());
  folders.write("extra/Tidy-localized.de", "TRANSFORMER_NAME: Tidy\nLOCALIZED_NAME: Ordner\n");
  for (const bool isInside : {false, true}) {
    QStringList texts;
    for (const char* language : {"en", "de"}) {
      QORXSetLanguage(language);
      TransformerMgr& registry = folders.load();
      const std::unique_ptr<TransformerCfg> shown(registry.getTransformer("Tidy", 1));
      ASSERT_TRUE(shown);
      EXPECT_EQ(shown->getLocalizedName(), QString(texts.isEmpty() ? "Tidy" : "Ordner"));
      texts << translate(workspace(isInside), registry).text;
    }
    QORXSetLanguage("en");
    EXPECT_TRUE(texts.first().contains("MACRO Tidy_WORKSPACE_NAME ")) << texts.first().toStdString();
    EXPECT_EQ(texts.first(), texts.last());
  }
}

// Whatever form the enciphered text takes: it is read as soon as there is a routine, also by a registry that
// met it before.
TEST_F(LinkedTranslation, EncipheredOnesAreReadByARoutine) {
  QByteArray comments;
  for (const QByteArray& line : tidyDocument().split('\n'))
    comments += "#! " + line + '\n';
  store(tidyDocument());
  const QByteArray plainFile = readAll(file);
  const struct {
    const char* promise;
    std::function<void()> make;
    bool isSeenBefore;
    bool isRead;
  } cases[] = {
      {"a document behind the definition", [&] { storeBody(enciphered(tidyDocument())); }, true, true},
      {"its lines prefixed", [&] { storeBody(enciphered(comments) + "\n"); }, true, true},
      {"in place of the definition", [&] { storeBody({}, "# " + enciphered(tidyDocument()) + "\n"); }, true,
       true},
      {"one of a newer build", [&] { storeBody(enciphered(tidyDocument(18287))); }, true, false},
      {"the whole file", [&] { folders.write("extra/Tidy.ort", enciphered(plainFile)); }, false, true},
  };
  for (const auto& test : cases) {
    ORW_setDecipherRoutine({});
    test.make();
    TransformerMgr& registry = folders.load();
    EXPECT_EQ(translate(workspace(), registry).diagnostics,
              QStringList(test.isSeenBefore ? "custom-transformer-fault T" : "unknown-transformer T"))
        << test.promise;
    ORW_setDecipherRoutine(decipher);
    if (!test.isSeenBefore || !test.isRead)
      folders.load();
    const Outcome outcome = translate(workspace(), registry);
    EXPECT_EQ(outcome.diagnostics, test.isRead ? QStringList() : QStringList("custom-transformer-fault T"))
        << test.promise << outcome.texts.join('\n').toStdString();
    EXPECT_EQ(outcome.text.contains("INCLUDE_CUSTOM_TRANSFORMER_VER Tidy:1\n"), test.isRead);
  }
}

TEST_F(LinkedTranslation, AnEncipheredWorkspaceIsReadByARoutine) {
  store(tidyDocument());
  TransformerMgr& registry = folders.load();
  const QString path = folders.write("w.orw", enciphered(workspace().text().toUtf8()));
  const QString output = folders.path("w.mf");
  for (const bool hasRoutine : {false, true}) {
    ORW_setDecipherRoutine(hasRoutine ? ORWDecipherRoutine(decipher) : ORWDecipherRoutine());
    orx::Findings diagnostics(path);
    QString error;
    const TranslationResult result =
        translateWorkspace({path, output, {}}, registry, diagnostics, error, withoutLooseEnds());
    EXPECT_EQ(result, hasRoutine ? TranslationResult::Done : TranslationResult::Refused);
    EXPECT_EQ(describe(diagnostics), hasRoutine ? QStringList() : QStringList("no-document "));
    EXPECT_EQ(WorkspaceFile::recognise(path) == WorkspaceFile::Form::Workspace, hasRoutine);
    EXPECT_EQ(readAll(output).contains("INCLUDE_CUSTOM_TRANSFORMER_VER Tidy:1"), hasRoutine);
  }
}

}  // namespace
