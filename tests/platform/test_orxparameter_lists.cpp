#include <platform/orxparameter/ChoiceList.h>
#include <platform/orxparameter/GUIType.h>
#include <platform/orxparameter/MemberList.h>
#include <platform/qorxcore/WordEncoding.h>

#include <gtest/gtest.h>

namespace {

// `shown=stored` of every entry, separated by "|".
QString entriesOf(const ChoiceList& choices) {
  QStringList texts;
  for (const auto& entry : choices.entries()) {
    texts << entry.first + QLatin1Char('=') + entry.second;
  }
  return texts.join(QLatin1Char('|'));
}

GUIType typeOf(const QString& text) {
  return GUIType::fromTransformerTypeString(text);
}

GUIType multiParameter(QChar separator, const char* line1, const char* line2) {
  const std::vector<GUIType> members = {GUIType::fromGuiLine(line1), GUIType::kNullGuiType,
                                        GUIType::fromGuiLine(line2)};
  return GUIType::fromTransformerTypeString(
      QLatin1String("MULTIPARAMETER ") + MemberList::configToken(separator, members), "MULTI", "Both");
}

}  // namespace

TEST(ChoiceList, ReadsConfigurations) {
  const std::tuple<const char*, const char*, bool> cases[] = {
      {"CHOICE \"No Parallelism\"%Minimal", "No Parallelism=No Parallelism|Minimal=Minimal", false},
      {"LISTBOX a,b%\"50%\"%%5\"%\"\"", "a,b=a,b|50%=50%|5\"=5\"|=", false},
      {"CHOICE a%a%b", "a=a|b=b", false},
      {"CHOICE <space>", "<space>=<space>", false},
      {"CHOICE", "", false},
      {"LOOKUP_CHOICE No,no<space>way%Yes,<quotationmark>", "No=no way|Yes=\"", true},
      {"LOOKUP_CHOICE \"No, never\",0%\"say \"\"yes\"\"\",1", "No, never=0|say \"yes\"=1", true},
      {"LOOKUP_LISTBOX_OR_ATTR bare%empty,%a,b,c%,only%<Unused>,<Unused>",
       "bare=bare|empty=|a=b,c|=only|<Unused>=<Unused>", true},
      {"LOOKUP_CHOICE", "", false},
      {"TEXT a%b", "", false},
      {"ATTR ALLOW_NEW", "", false},
  };
  for (const auto& [type, entries, lookup] : cases) {
    SCOPED_TRACE(type);
    const ChoiceList choices(typeOf(type));
    EXPECT_EQ(entriesOf(choices), entries);
    EXPECT_EQ(choices.hasLookup(), lookup);
    EXPECT_EQ(choices.isEmpty(), choices.entries().empty());
  }
}

TEST(ChoiceList, LookupLinesMapAPlainChoice) {
  ChoiceList choices(typeOf("CHOICE \"No Parallelism\"%A%B"));
  const ChoiceList before = choices;
  choices.addLookup("\"No Parallelism\",NO_PARALLELISM%B,A");
  choices.addLookup("A,1%Extra one,two<space>words");
  EXPECT_EQ(entriesOf(choices), "No Parallelism=NO_PARALLELISM|A=1|B=A|Extra one=two words");
  EXPECT_TRUE(choices.hasLookup());
  EXPECT_FALSE(before.hasLookup());
  EXPECT_EQ(before.entries().size(), 3u);

  const std::tuple<const char*, bool, const char*, const char*> cases[] = {
      {"No Parallelism", true, "NO_PARALLELISM", "No Parallelism"},
      {"NO_PARALLELISM", true, "NO_PARALLELISM", "No Parallelism"},
      {"A", true, "1", "B"},
      {"two words", true, "two words", "Extra one"},
      {"no parallelism", false, "no parallelism", "no parallelism"},
      {"", false, "", ""},
  };
  for (const auto& [value, contained, stored, shown] : cases) {
    SCOPED_TRACE(value);
    EXPECT_EQ(choices.contains(value), contained);
    EXPECT_EQ(choices.toStored(value), stored);
    EXPECT_EQ(choices.toShown(value), shown);
  }

  // A new stored side takes the old one out of use; the next entry that stores the same steps in.
  ChoiceList same(typeOf("LOOKUP_CHOICE A,1%B,1"));
  EXPECT_EQ(same.toShown("1"), "A");
  same.addLookup("A,2");
  EXPECT_EQ(same.toShown("1"), "B");
}

TEST(ChoiceList, TellsChoiceTypes) {
  const std::tuple<const char*, bool, bool> cases[] = {{"CHOICE", true, false},
                                                       {"LOOKUP_CHOICE_OR_ATTR", true, false},
                                                       {"LISTBOX", true, true},
                                                       {"LOOKUP_LISTBOX", true, true},
                                                       {"LISTBOX_OR_ATTR", true, true},
                                                       {"CHOICES", false, false},
                                                       {"LOOKUP_", false, false},
                                                       {"TEXT", false, false},
                                                       {"", false, false}};
  for (const auto& [type, isChoice, isListBox] : cases) {
    EXPECT_EQ(ORX_isChoiceType(typeOf(type)), isChoice) << type;
    EXPECT_EQ(ORX_isListBoxType(typeOf(type)), isListBox) << type;
  }
}

TEST(MemberList, ConfigurationIsOneTokenAndComesBack) {
  for (const char* separator : {",", " ", ";", "\"", "%", "<", "\n"}) {
    SCOPED_TRACE(separator);
    const GUIType type =
        multiParameter(QString(separator).front(), "GUI OPTIONAL CHOICE A \"x y\"%z First, \"100%\"",
                       "GUI TEXT_ENCODED B Second\nline");
    EXPECT_FALSE(type.getConfigToken().contains(QLatin1Char(' ')));
    const GUIType read = GUIType::fromGuiLine(type.getAsString());
    EXPECT_EQ(read, type);
    EXPECT_EQ(read.getMacroNames(), (QStringList{"MULTI", "A", "B"}));

    const MemberList list(read);
    EXPECT_EQ(list.separator(), QString(separator).front());
    ASSERT_EQ(list.members().size(), 2u);
    EXPECT_EQ(list.members()[0].getConfigToken(), "\"x y\"%z");
    ASSERT_NE(list.find("B"), nullptr);
    EXPECT_EQ(list.find("B")->getDescription(), "Second\nline");
    EXPECT_EQ(list.find("C"), nullptr);
    EXPECT_EQ(MemberList::configToken(list.separator(), list.members()), type.getConfigToken());
  }
}

TEST(MemberList, FaultyConfigurations) {
  const std::tuple<const char*, QChar, int> cases[] = {
      {"MULTIPARAMETER", QLatin1Char(','), 0},
      {"MULTIPARAMETER ;", QLatin1Char(';'), 0},
      {"MULTIPARAMETER ;;,GUI<space>TEXT<space>A", QLatin1Char(','), 1},
      {"GUI_LINE_TABLE ,GUI<space>TEXT<space>A,,rubbish,GUI<space>TEXT<space>A", QLatin1Char(','), 2},
      {"GUI_LINE_TABLE \",\",GUI<space>TEXT<space>A", QLatin1Char(','), 1},
      {"GUI_LINE_TABLE <space>,GUI TEXT A 5% each", QLatin1Char(' '), 1},
      {"CHOICE ;,GUI<space>TEXT<space>A", QLatin1Char(','), 0},
  };
  for (const auto& [type, separator, members] : cases) {
    SCOPED_TRACE(type);
    const MemberList list(typeOf(type));
    EXPECT_EQ(list.separator(), separator);
    EXPECT_EQ(int(list.members().size()), members);
  }
}

TEST(MemberList, SettingOnePartLeavesTheOthersAlone) {
  const std::tuple<const char*, const char*, const char*, const char*> cases[] = {
      {"", "A", "1", "A;1"},
      {"A;1;B;2", "A", "x;y", "A;\"x;y\";B;2"},
      {"A;1;B;2", "B", "", "A;1;B;\"\""},
      {"A;\"1\";B;2", "B", "3", "A;\"1\";B;3"},  // quotes without need stay
      {"A; \"p;\"\"q\" ;B;2;C;\"\"", "B", "3", "A; \"p;\"\"q\" ;B;3;C;\"\""},
      {"A; \"p;q\" ;B;2", "A", "3", "A;3;B;2"},
      {"\"A\";1;A;2", "A", "3", "\"A\";3;A;2"},  // the first of two
      {"A;B;B;2", "B", "3", "A;B;B;3"},          // a value that looks like the name
      {"A;1", "B", "2", "A;1;B;2"},
      {"A;1;B", "B", "2", "A;1;B;2"},  // a name without a value
      {"A;1;B", "C", "2", "A;1;B;\"\";C;2"},
      {"A;\"open", "B", "2", "A;open;B;2"},  // would be swallowed
      {"A;\"open;B;2", "A", "1", "A;1"},
      {"A;1", "A", " two\nlines\" ", "A;\" two\nlines\"\" \""},
  };
  const MemberList list(multiParameter(QLatin1Char(';'), "GUI TEXT A a", "GUI TEXT B b"));
  for (const auto& [value, member, part, wantedResult] : cases) {
    SCOPED_TRACE(value);
    const QString result = list.withMemberValue(value, member, part);
    EXPECT_EQ(result, wantedResult);
    EXPECT_EQ(list.memberValue(result, member), part);
  }
  EXPECT_EQ(list.memberValue("A;1;B;2", "1"), QString());
  EXPECT_EQ(list.memberValue("A;1;B", "B"), QString());
}
