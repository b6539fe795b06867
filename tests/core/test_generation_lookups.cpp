// Every Tcl fragment that the lookup writers emit is run through a real interpreter. A text is refused
// exactly when some run of its fragment gives anything but the stored side.
#include "GenerationSetup.h"
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/generation/LookupWriters.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextPlaces.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>

namespace {

using Entry = QPair<QString, QString>;

const QStringList kTexts =
    QString(
        "plain~two words~{~}~{}~}{~a}b{c~{a}~\"~a\"b~\"q\"~$~$x~$(Q)~$5~[~]~[x]~[exit]~;~a;b~#~#{"
        "~a\\~\\{~\\~\\\\~a\\nb~C:\\dir~a\nb~a\r~-exact~--~-~default~~ lead~trail ~'~%1~é €~a\tb"
        "~}} ; exit ; {~$finalVal~B~Bb~aB~b2~B c d~aB c~e B~ B~c~x)~(x~a b\\~$(~$()~*~?~\"a b")
        .split('~')
    << QString(QChar(0xd800));

ChoiceList choicesOf(const QVector<Entry>& entries) {
  ChoiceList choices;
  for (const Entry& entry : entries) {
    QString shown = entry.first;
    choices.addLookup('"' + shown.replace("\"", "\"\"") + "\"," + QORXWwjdEncode(entry.second));
  }
  return choices;
}

// The macros of a run: what the parameter refers to, and one that any text may.
QMap<QString, QString> macrosOf(const QString& given) {
  return {{"G", given}, {"Q", "q"}};
}

QString expanded(const QString& text) {
  return expandMacros(text, {{"Q", "q"}});
}

// The entries as the configuration gives them: a line break in a shown side is kept as its word there.
QVector<Entry> entriesOf(const QVector<Entry>& given) {
  QVector<Entry> entries;
  const ChoiceList choices = choicesOf(given);
  for (const auto& entry : choices.entries()) {
    entries.append({entry.first, entry.second});
  }
  return entries;
}

// What no entry shows stays as it is; in the file, a broken surrogate pair would look like this.
bool showsQuestionMark(const QVector<Entry>& entries) {
  return std::any_of(entries.begin(), entries.end(), [](const Entry& entry) { return entry.first == "?"; });
}

struct Counts {
  int refused = 0;
  int written = 0;
  void expectEqual(bool isRefused, bool isRight, const QString& what) {
    EXPECT_EQ(isRefused, !isRight) << what.toStdString();
    ++(isRefused ? refused : written);
  }
};

// What a writer leaves behind: the statement, and the call for the value when the statement does not define
// the macro itself.
class Fragment {
 public:
  explicit Fragment(const std::function<QString(MFBuffer&)>& write) {
    TextBuffer buffer;
    m_call = write(buffer);
    m_statements = readStatements(buffer.text());
  }
  bool isOneStatement() const {
    return m_statements.size() == 1 && !m_call.contains('\n') && !m_call.contains('\r');
  }
  // Whether a run gives this value and touches nothing else; blanks around a macro's value do not count.
  bool gives(const QString& given, const QString& expected) const {
    TestEngine engine(macrosOf(given));
    engine.run(m_statements);
    if (!m_call.isEmpty())
      return engine.call(m_call) == expanded(expected) && engine.error.isEmpty();
    return engine.error.isEmpty() && engine.macros.value("mac", "?") == expanded(expected).trimmed() &&
           engine.macros.size() == 3;
  }
  bool givesAll(const QVector<Entry>& entries) const {
    return std::all_of(entries.begin(), entries.end(),
                       [&](const Entry& entry) { return gives(entry.first, entry.second); });
  }
  bool givesList(const QVector<Entry>& entries) const {
    QStringList shown;
    QStringList stored;
    for (const Entry& entry : entries) {
      shown << entry.first;
      stored << expanded(entry.second);
    }
    TestEngine engine(macrosOf(QORXListToSdfString(shown, ' ')));
    engine.run(m_statements);
    return engine.error.isEmpty() && engine.macros.size() == 3 &&
           QORXSdfStringToList(engine.macros.value("mac"), ' ') == stored;
  }
  // Whether no value is taken as the parameter says: as one, or with a complaint.
  bool knowsEmpty(const BoxLookup& lookup) const {
    if (lookup.isOptional)
      return gives("", "");
    TestEngine engine(macrosOf(""));
    engine.run(m_statements);
    return engine.error == "exit" && !engine.macros.contains("mac") &&
           engine.messages ==
               QStringList(expanded(lookup.identifier + " - '" + lookup.prompt + "' must be given a value."));
  }

 private:
  QString m_call;
  QStringList m_statements;
};

bool choiceBoxIsRight(const QVector<Entry>& given, const BoxLookup& lookup) {
  const QVector<Entry> entries = entriesOf(given);
  const Fragment fragment([&](MFBuffer& buffer) {
    lookup_writers::writeChoiceBox(buffer, choicesOf(entries), lookup);
    return QString();
  });
  const auto valueFor = [&](const char* text) { return QString(lookup.value).replace("$(G)", text); };
  const bool isPlain = lookup.value == "$(G)";
  const bool emptyIsChoice =
      std::any_of(entries.begin(), entries.end(), [](const Entry& entry) { return entry.first.isEmpty(); });
  return fragment.isOneStatement() && (!isPlain || fragment.givesAll(entries)) &&
         fragment.gives("other", valueFor("other")) &&
         (showsQuestionMark(entries) || fragment.gives("?", valueFor("?"))) &&
         (!isPlain || emptyIsChoice || fragment.knowsEmpty(lookup));
}

TEST(Lookups, ChoiceBoxRefusesExactlyWhatGoesWrong) {
  Counts counts;
  for (const bool optional : {false, true}) {
    for (const QString& text : kTexts) {
      const BoxLookup lookup{"$(G)", "Size", "mac", "My Name", optional};
      const auto check = [&](const QVector<Entry>& entries, const BoxLookup& about, const char* what) {
        counts.expectEqual(lookup_checks::refuseChoiceBox(choicesOf(entries), about) != 0,
                           choiceBoxIsRight(entries, about), QString(what) + ": " + text);
      };
      check({{text, "stored"}, {"Bx", "b2"}}, lookup, "shown");
      check({{"shown", text}, {"Bx", "b2"}}, lookup, "stored");
      BoxLookup about = lookup;
      about.value = text + "$(G)";
      check({{"Bx", "b2"}}, about, "value");
      if (!optional && !text.contains("$(G)")) {
        about = lookup;
        about.prompt = text;
        check({{"Bx", "b2"}}, about, "prompt");
        about = lookup;
        about.identifier = text;
        check({{"Bx", "b2"}}, about, "identifier");
      }
    }
  }
  EXPECT_GT(counts.refused, 100);
  EXPECT_GT(counts.written, 200);
}

bool listBoxIsRight(const QVector<Entry>& given, const BoxLookup& lookup) {
  const QVector<Entry> entries = entriesOf(given);
  const Fragment fragment([&](MFBuffer& buffer) {
    lookup_writers::writeListBox(buffer, choicesOf(entries), lookup);
    return QString();
  });
  bool right = fragment.isOneStatement() && fragment.knowsEmpty(lookup) &&
               (showsQuestionMark(entries) || fragment.givesList({{"?", "?"}}));
  QVector<QVector<Entry>> lists{{}};
  for (int i = 0; right && i < lists.size(); ++i) {
    const QVector<Entry> list = lists.at(i);
    right = list.isEmpty() || fragment.givesList(list);
    for (const Entry& entry : list.size() < 3 ? entries : QVector<Entry>())
      lists.append(list + QVector<Entry>{entry});
  }
  return right;
}

TEST(Lookups, ListBoxRefusesExactlyWhatGoesWrong) {
  Counts counts;
  for (const bool optional : {false, true}) {
    for (const QString& text : kTexts) {
      const BoxLookup lookup{"$(G)", "Size", "mac", "My Name", optional};
      for (const QVector<Entry>& entries :
           {QVector<Entry>{{"aa", "1"}, {text, "stored"}, {"Bx", "b2"}},
            QVector<Entry>{{"aa", "1"}, {"shown", text}, {"two words", "b2"}},
            QVector<Entry>{{"B", "1"}, {text, "2"}, {text + "z", "3"}, {"c", "4"}}}) {
        if (choicesOf(entries).entries().size() != std::size_t(entries.size())) {
          continue;
        }
        counts.expectEqual(
            lookup_checks::refuseListBox(choicesOf(entries), lookup) != 0, listBoxIsRight(entries, lookup),
            entries[1].first + "=" + entries[1].second + ", " + entries[2].first + ": " + text);
      }
    }
  }
  EXPECT_GT(counts.refused, 100);
  EXPECT_GT(counts.written, 100);
}

bool procedureIsRight(const QVector<Entry>& given, const QString& value) {
  const QVector<Entry> entries = entriesOf(given);
  const ChoiceList choices = choicesOf(entries);
  const Fragment fragment(
      [&](MFBuffer& buffer) { return lookup_writers::writeChoiceProcedure(buffer, choices, "g1_P", value); });
  if (value != "$(G)")
    return fragment.isOneStatement() &&
           fragment.gives("other", choices.toStored(QString(value).replace("$(G)", "other")));
  return fragment.isOneStatement() && fragment.gives("other", "other") && fragment.givesAll(entries) &&
         (showsQuestionMark(entries) || fragment.gives("?", "?"));
}

TEST(Lookups, ChoiceProcedureRefusesExactlyWhatGoesWrong) {
  Counts counts;
  for (const QString& text : kTexts) {
    const auto check = [&](const QVector<Entry>& entries, const QString& value) {
      counts.expectEqual(lookup_checks::refuseChoiceProcedure(choicesOf(entries), "g1_P", value) != 0,
                         procedureIsRight(entries, value), value + ": " + text);
    };
    check({{text, "stored"}, {"Bx", "b2"}}, "$(G)");
    check({{"Bx", "b2"}, {text, "stored"}}, "$(G)");
    check({{text, "stored"}}, "$(G)");
    check({{"shown", text}}, "$(G)");
    check({{"shown", "b2"}}, text);
  }
  EXPECT_GT(counts.refused, 50);
  EXPECT_GT(counts.written, 100);
}

TEST(Lookups, WhichFormAValueTakes) {
  struct Case {
    const char* type;
    QStringList lookup;
    QString value;
    QString written;
    int statements;  // ahead of the template's own
  };
  const Case cases[] = {
      {"LOOKUP_CHOICE Red,r%\"Pale Blue\",b", {}, "Pale Blue", "b", 0},
      {"LOOKUP_CHOICE Red,r%\"Pale Blue\",b", {}, "r", "r", 0},
      {"LOOKUP_CHOICE Red,r%\"Pale Blue\",b", {}, "else", "else", 0},
      {"LOOKUP_CHOICE Red,r%\"Pale Blue\",b", {}, "$(G)", "$(g1P)", 1},
      {"LOOKUP_LISTBOX Red,r%\"Pale Blue\",b", {}, "\"Pale Blue\" Red r", "b r r", 0},
      {"LOOKUP_LISTBOX Red,r%\"Pale Blue\",b", {}, "$(G)", "$(g1P)", 1},
      {"LISTBOX Red%Green", {}, "Red  Green", "Red  Green", 0},
      {"CHOICE Red%Green", {}, "Green", "Green", 0},
      {"CHOICE Red%Green", {}, "$(G)", "$(G)", 0},
      {"CHOICE Red%Green", {"Red,r"}, "Red", "@Tcl2(g1P {Red} )", 1},
      {"CHOICE_OR_ATTR Red%Green", {"Red,r"}, "@Value(x)", "@EvaluateExpression(FDIV,STRING,P,@Value(x))", 0},
      {"LOOKUP_CHOICE Red,r",
       {},
       "ORX_CONDITIONAL:@Value(x)=1;Red;Red",
       "@EvaluateExpression(FDIV,STRING,P,@Choose(@Value(x)=1,r,r))",
       0},
      {"OMITTABLE LOOKUP_CHOICE Red,r", {}, "<Unused>", "", -1},
  };
  RunTimeListener listener;
  for (const Case& c : cases) {
    const auto cfg = makeCfg({{}, {}, {{"P", c.type, c.value, "Colour", c.lookup}}, {"K $(P)"}});
    cfg->setListener(&listener);
    EXPECT_TRUE(cfg->findUnwritableValues().isEmpty());
    const QStringList statements = statementsOf(*cfg);
    ASSERT_EQ(statements.size(), c.statements + 1) << c.value.toStdString();
    if (c.statements >= 0) {
      EXPECT_EQ(statements.last().toStdString(), "K " + c.written.toStdString());
    }
  }
}

TEST(Lookups, FaultsAreFoundBeforeWriting) {
  using namespace orx::messages;
  struct Case {
    TestParameter parameter;
    QString line;
    long number;  // 0: fine
    QStringList arguments = {};
  };
  const QString members =
      "MULTIPARAMETER " + MemberList::configToken(',', {GUIType::fromGuiLine("GUI TEXT A a"),
                                                        GUIType::fromGuiLine("GUI TEXT B b")});
  const QString encoded =
      "MULTIPARAMETER " + MemberList::configToken(',', {GUIType::fromGuiLine("GUI TEXT_ENCODED A a"),
                                                        GUIType::fromGuiLine("GUI TEXT B b")});
  const QString table =
      "GUI_LINE_TABLE " + MemberList::configToken(';', {GUIType::fromGuiLine("GUI TEXT A a"),
                                                        GUIType::fromGuiLine("GUI TEXT B b")});
  const QString encodedTable = QString(table).replace("TEXT", "TEXT_ENCODED");
  const Case cases[] = {
      {{"P", "TEXT", "a\nb"}, "K $(P)", kBreaksLine},
      {{"P", "TEXT", "a\nb"}, "K $(Q)", 0},
      {{"P", "TEXT", "a\nb"}, "K $(ORX_PARM_VAL_LIST)", kBreaksLine},
      {{"P", "TEXT_ENCODED", "a\\nb"}, "K $(P)", kBreaksLine},  // the escape becomes a line feed
      {{"P", "TEXT_ENCODED", "a<u000a>b"}, "K $(P)", 0},
      {{"P", "TEXT_ENCODED", "a\\\\$(G)"}, "K $(P)", kNotEncoded},
      {{"P", "TEXT", "a\\"}, "K $(P)", kEndsInBackslash},
      {{"P", "TEXT", "a\\"}, "K $(P) x", 0},
      {{"P", "TEXT", "$[x"}, "K $(P)", kValueUnclosed},
      {{"P", "TEXT", "$[x] {\"[;"}, "K $(P)", 0},
      {{"P", members, "A,x\\,B,y"}, "K $(A)", kEndsInBackslash},
      {{"P", members, "A,$[x,B,]"}, "K $(A)", kValueUnclosed},
      {{"P", members, "A,\"x\ny\",B,]"}, "K $(A)", kBreaksLine},
      {{"P", members, "A,x,B,y"}, "K $(A)", 0},
      {{"P", "TEXT_OR_ATTR", "@Value(a)$[x\n"}, "K $(P)", 0},  // the wrapped text is one word
      {{"P", "LOOKUP_CHOICE A,a", "$(G) $["}, "K $(P)", kValueUnclosed},
      {{"P", "LOOKUP_CHOICE A,a", "$(G)\""}, "K", kValueInScript},
      {{"P", "LOOKUP_CHOICE A,a<quotationmark>", "$(G)"}, "K", kChoiceInScript},
      {{"P", "LOOKUP_CHOICE A,a<quotationmark>", "A"}, "K $(P)", 0},
      {{"P", "LOOKUP_LISTBOX A,a<space>b", "$(G)"}, "K", kChoiceInScript},
      {{"P", "LOOKUP_CHOICE A,a", "$(G)", "Size [m]"}, "K", kPromptInScript},
      {{"P", "OPTIONAL LOOKUP_CHOICE A,a", "$(G)", "Size [m]"}, "K", 0},
      {{"P Q", "LOOKUP_CHOICE A,a", "$(G)"}, "K", kNameInMacro},
      {{"XFORMER_NAME", "TEXT", "a\"$(G)"}, "K $(XFORMER_NAME)", kIdentifierInScript},
      {{"XFORMER_NAME", "TEXT", "a\" b\\"}, "K $(XFORMER_NAME)", 0},
      {{"XFORMER_NAME", "TEXT", "a\\\" b"}, "K $(XFORMER_NAME)", kNoWord},
      {{"P", "TEXT", "a\\\" b"}, "K $(ORX_PARM_VAL_LIST)", kNoWord},
      {{"P", "TEXT", "a\\\" b"}, "K $(P)", 0},
      {{"P", "INT", "1 OUTPUT X"}, "K $(P)", kKeywordInValue},
      {{"P", "TEXT", "KEY"}, "FACTORY_DEF * F FACTORY_NAME n KEY $(P)", kKeywordInValue},
      {{"P", "TEXT", "F n"}, "FACTORY_DEF * F FACTORY_NAME n KEY $(P)", 0},
      {{"P", "TEXT_OR_ATTR", "\""}, "K $(P)", kOpenInValue},
      {{"P", "TEXT", "@EvaluateExpression("}, "K $(P)", kCallInValue},
      {{"P", "TEXT_OR_ATTR", "@Value(a(b)"}, "K $(P)", 0},
      {{"P", "TEXT_ENCODED", "two words"}, "K $(P)", kNotEncoded},
      {{"P", members, "A,\"1 OUTPUT X\",B,y"}, "K $(A)", kKeywordInValue},
      // Its own token.
      {{"P", "TEXT", "$(P)"}, "K $(P)", kGrowsWithoutEnd},
      {{"G", "TEXT", "$(G)"}, "K $(G)", 0},  // there is one around it
      {{"G", "TEXT", "x$(G)"}, "K $(G)", kGrowsWithoutEnd},
      {{"G", "TEXT_OR_ATTR", "$(G)@Value(a)"}, "K $(G)", kGrowsWithoutEnd},
      {{"P", members, "A,$(B),B,$(A)"}, "K $(A)", kGrowsWithoutEnd},
      {{"P", members, "A,in $(B),B,OUTPUT"}, "K $(A)", kKeywordInValue},
      {{"P", members, "A,$(B)@Value(a),B,@Value(b)"}, "K $(A)", kReferenceToCall},
      {{"P", members, "A,x$(B),B,@Value(b)"}, "K $(A)", kReferenceToCall},
      {{"P", members, "A,$(B)@Value(a),B,\"b,c\""}, "K $(A)", kReferenceBreaks},
      {{"P", encoded, "A,x$(B),B,y"}, "K $(A)", 0},
      {{"P", encoded, "A,x$(B),B,<space>"}, "K $(A)", kReferenceReencoded},
      {{"P", encoded, "A,x,B,$(A)y"}, "K $(A)", 0},
      {{"P", encoded, "A,x<space>y,B,$(A)"}, "K $(A)", kReferenceReencoded},
      {{"P", members, "A,$(B)@Value(a),B,b c"}, "K $(A)", 0},
      {{"P", members, "A,x"}, "K $(A)", kMemberLeftOut, {"B"}},
      {{"P", members, "A,x,B"}, "K $(A)", kMemberLeftOut, {"B"}},
      {{"P", members, "A,x,B,y,C"}, "K $(A)", kNoSuchPart, {"C", "A, B"}},
      {{"P", members, "@Value(a)"}, "K $(A)", kNoSuchPart, {"@Value(a)", "A, B"}},
      {{"P", members, "A,x,B,y,A,x"}, "K $(A)", kPartTwice, {"A"}},
      {{"P", members, "A,x,B,y,ORX_CONTROLLER_QUERY_FILE,z"}, "K $(A)", 0},
      {{"P", members, "ORX_CONDITIONAL:1;A<comma>x<comma>B<comma>y"}, "K $(A)", kConditionForParts},
      {{"P", members, "A,<Unused>,B,y"}, "K $(A)", kPartNeeded, {"a"}},
      {{"P", table, "a;b;c"}, "K $(P)", kRowBreaksOff, {"2", "a", "a, b"}},
      {{"P", table, "a;b;c;<Unused>"}, "K $(P)", kCellNeeded, {"2", "b"}},
      {{"P", "TEXT", "<Unused>", "Prompt"}, "K", kValueNeeded},
      {{"P", "OMITTABLE TEXT", "<Unused>", "Prompt"}, "K $(P)", 0},
      {{"P", "OPTIONAL TEXT", "<Unused>"}, "K $(P)", 0},
      // What the listener knows.
      {{"P", "TEXT_OR_ATTR", "$(Gabc)@Value(a)"}, "K $(P)", 0},
      {{"P", "TEXT_OR_ATTR", "$(Ga,b)@Value(a)"}, "K $(P)", kReferenceBreaks},
      {{"P", "TEXT_OR_ATTR", "$(Ga<space>b)@Value(a)"}, "K $(P)", kReferenceReencoded},
      {{"P", "TEXT_OR_ATTR_ENCODED", "$(Ga<space>b)@Value<leftparenthesis>a<rightparenthesis>"}, "K $(P)", 0},
      {{"P", "TEXT_OR_ATTR", "@Value($(Ga\"b))"}, "K $(P)", kReferenceBreaks},
      {{"P", "TEXT", "ORX_CONDITIONAL:1;$(Ga,b)"}, "K $(P)", kReferenceBreaks},
      {{"P", "TEXT", "ORX_CONDITIONAL:1;$(Ga;b)"}, "K $(P)", 0},
      {{"P", "TEXT", "$(Ga,b)"}, "K $(P)", 0},
      {{"P", "TEXT", "$(G@Value[a])"}, "K $(P)", 0},
      {{"P", table, "$(Ga,b);x"}, "K $(P)", 0},
      {{"P", table, "$(Ga;b);x"}, "K $(P)", kRowBreaksOff, {"2", "a", "a, b"}},
      {{"P", table, "$(G\"b);x"}, "K $(P)", kReferenceBreaks},
      // Each cell is a value of its own.
      {{"P", table, "x;5\" y"}, "K $(P)", 0},
      {{"P", table, "x;@Tcl2(exit)"}, "K $(P)", kCallInValue},
      {{"P", table, "ORX_CONDITIONAL:1;x<semicolon>y"}, "K $(P)", kConditionForParts},
      {{"P", encodedTable, "a<space>b;@Value<leftparenthesis>a<rightparenthesis>"}, "K $(P)", 0},
      {{"P", encodedTable, "x;a b"}, "K $(P)", kNotEncoded},
      {{"P", encodedTable, " x;y"}, "K $(P)", kNotEncoded},
      {{"P", encodedTable, "x;a\"b"}, "K $(P)", kNotEncoded},
      {{"P", encodedTable, "@EvaluateExpression(STRING,a,b);y"}, "K $(P)", kNotEncoded},
  };
  RunTimeListener listener;
  for (const Case& c : cases) {
    const auto cfg = makeCfg({{}, {}, {c.parameter}, {c.line}});
    cfg->setListener(&listener);
    QHash<QString, QString> expected;
    if (c.number != 0) {
      ASSERT_FALSE(TransformResString(c.number).isEmpty());
      expected.insert(c.parameter.name, TransformResString(c.number, c.arguments));
    }
    EXPECT_EQ(cfg->findUnwritableValues(), expected)
        << c.parameter.type.toStdString() << ' ' << c.parameter.value.toStdString() << ' '
        << cfg->findUnwritableValues().values().join('|').toStdString();
    if (c.number == kValueUnclosed) {
      TextBuffer buffer;  // comes to an end all the same
      EXPECT_FALSE(cfg->instantiate(buffer, QString()));
    }
  }
}

}  // namespace
