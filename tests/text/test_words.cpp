#include <platform/qorxcore/WordEncoding.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileWords.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>

#include <QRegularExpression>
#include <gtest/gtest.h>
#include <tcl.h>

#include <functional>
#include <random>

namespace {

// The words as the reference of the mapping file tells an engine to read them; `raw` leaves them as they
// stand.
QStringList readWords(const QString& statement, bool raw = false) {
  static const QRegularExpression word(
      QStringLiteral("\"((?:[^\"\\\\]|\\\\.)*)\"(?![^ \t])|([^ \t\"][^ \t]*)"),
      QRegularExpression::DotMatchesEverythingOption);
  static const QRegularExpression doubled(QStringLiteral("(\\\\+)\\1$"));
  QStringList words;
  auto all = word.globalMatch(statement);
  while (all.hasNext()) {
    const auto match = all.next();
    QString inside = match.captured(1);
    words << (raw || match.capturedStart(1) < 0 ? match.captured(0)
                                                : inside.replace(doubled, "\\1").replace("\\\"", "\""));
  }
  return words;
}

QString randomText(std::mt19937& random) {
  static const QStringList pieces{"\\", "\"",      "\\\"", " ",    "\t", "(", ")",
                                  "a",  "@Value(", "{",    "$(M)", "é",  "#"};
  QString text;
  for (unsigned left = random() % 8; left > 0; --left)
    text += pieces.at(int(random() % unsigned(pieces.size())));
  return text;
}

TEST(Words, AreReadBackAsTheyWereWritten) {
  std::mt19937 random(11);
  int carried = 0;
  for (int round = 0; round < 20000; ++round) {
    const QStringList texts{randomText(random), randomText(random), randomText(random)};
    QStringList expected{"KEY"};
    QString statement("KEY");
    for (const QString& text : texts) {
      if (!canBeWord(text))
        continue;
      ++carried;
      expected << text;
      statement += QString(random() % 2 ? " " : "\t ") + quotifyStringForMF(text);
      EXPECT_EQ(textOfWord(quotifyStringForMF(text)), text) << text.toStdString();
    }
    EXPECT_EQ(readWords(statement), expected) << statement.toStdString();
    MappingFileWords scanner(statement);
    QStringList scanned;
    for (MappingFileWord word; scanner.next(word); scanned << word.value())
      EXPECT_TRUE(word.isClosed && !word.isGlued) << statement.toStdString();
    EXPECT_EQ(scanned, expected) << statement.toStdString();
  }
  EXPECT_GT(carried, 30000);
  // What is refused would be read as something else.
  for (const QString text : {"a\\\" b", "\\\"", "x\\\" OUTPUT"})
    EXPECT_TRUE(!canBeWord(text) && readWords(quotifyStringForMF(text)) != QStringList(text))
        << text.toStdString();
}

// Writes a text at a place with harmless words around it, and reads it back as the reference of the mapping
// file says, or with the Tcl library.
struct Placed {
  TextPlace place;
  const char* name;
  std::function<QString(const QString& text)> write;
  std::function<QString(const QString& line)> read;
};

std::function<QString(const QString&)> between(const QString& before, const QString& behind) {
  return [=](const QString& text) { return before + text + behind; };
}

std::function<QString(const QString&)> word(int number, int dropped = 0) {
  return [=](const QString& line) { return readWords(line).value(number).mid(dropped); };
}

std::function<QString(const QString&)> matched(const QString& pattern) {
  return [=](const QString& line) { return QRegularExpression(pattern).match(line).captured(1); };
}

QString tclValue(const QString& script) {
  Tcl_Interp* interp = Tcl_CreateInterp();
  const QByteArray bytes = script.toUtf8();
  const bool isFine = Tcl_EvalEx(interp, bytes.constData(), bytes.size(), TCL_EVAL_GLOBAL) == TCL_OK;
  const QString value = isFine ? QString::fromUtf8(Tcl_GetStringResult(interp)) : QString("failed");
  Tcl_DeleteInterp(interp);
  return value;
}

QString randomPlacedText(std::mt19937& random) {
  static const QStringList pieces{
      " ",   "\t",     "\n",    "\"",    "\\",           "(", ")",   "{", "}", "[x", "]", "$", ",", ":", "#",
      "@F(", "OUTPUT", "INPUT", " KEY ", "FEATURE_TYPE", "a", "b c", "é", "1"};
  QString text;
  for (unsigned left = random() % 5; left > 0; --left)
    text += pieces.at(int(random() % unsigned(pieces.size())));
  return text;
}

TEST(TextPlaces, WhatMayStandThereIsReadBack) {
  const auto quoted = [](const QString& before, const QString& behind) {
    return [=](const QString& text) { return before + quotifyStringForMF(text) + behind; };
  };
  const Placed places[] = {
      {TextPlace::Word, "word", quoted("K ", " N"), word(1)},
      {TextPlace::Name, "name", quoted("INPUT FEATURE_TYPE ", " OUTPUT"), word(2)},
      {TextPlace::ParallelSetting, "parallel setting", quoted("", " RUN:x"), word(0)},
      {TextPlace::Port, "port", between("INPUT ", " FEATURE_TYPE t"), word(1)},
      {TextPlace::LoopSetting, "loop setting", between("A:", " B:1"), word(0, 2)},
      {TextPlace::QuotedName, "quoted name", between("N \"id ", " Collector\" INPUT"),
       matched("^N \"id ([^\"]*) Collector\" INPUT$")},
      {TextPlace::MacroName, "macro name", between("MACRO ", " v"), word(1)},
      {TextPlace::PrintedName, "printed name", between("MACRO ", "_P v"), matched("^MACRO ([^ \t]*)_P v$")},
      {TextPlace::MacroValue, "macro value", between("MACRO n |", ""), matched("^MACRO n \\|(.*[^\\\\]|)$")},
      {TextPlace::TclBraces, "braces", between("set x {", "}"), tclValue},
      {TextPlace::TclQuotes, "quotes", between("set x \"", "\""), tclValue},
      {TextPlace::HeaderField, "header field", between("# TRANSFORMER_BEGIN ", ",1,c"),
       [](const QString& line) { return line.mid(20).split(',').first().trimmed(); }},
  };
  std::mt19937 random(17);
  for (const Placed& placed : places) {
    int accepted = 0;
    int refused = 0;
    for (int round = 0; round < 4000; ++round) {
      const QString text = randomPlacedText(random);
      if (TextPlaces::refuse(placed.place, text) != 0) {
        ++refused;
        continue;
      }
      ++accepted;
      const QString line = placed.write(text);
      EXPECT_FALSE(line.contains('\n')) << placed.name;
      EXPECT_EQ(placed.read(line).toStdString(), text.toStdString()) << placed.name;
    }
    EXPECT_GT(accepted, 400) << placed.name;
    EXPECT_GT(refused, 100) << placed.name;
  }
}

// The innermost reference is expanded first, and what it gives may be part of another one's name.
QString expandFromInside(QString text) {
  static const QRegularExpression innermost("\\$\\(([^ \t\n$()]+)\\)");
  while (text.contains(innermost))
    text.replace(innermost, "x");
  return text;
}

TEST(MacroText, ReferencesAreFoundAsAnEngineExpandsThem) {
  static const QStringList pieces{"$(", "$(", ")", ")", "$", "(", "[", "]", " ", "a", "<b>", "{}", "\n"};
  std::mt19937 random(23);
  int references = 0;
  for (int round = 0; round < 20000; ++round) {
    QString text;
    for (unsigned left = random() % 12; left > 0; --left)
      text += pieces.at(int(random() % unsigned(pieces.size())));
    if (text.contains("$["))
      continue;
    EXPECT_EQ(withoutReferences(text), expandFromInside(text)) << text.toStdString();
    EXPECT_EQ(blankReferences(text, macroReferences(text)).size(), text.size());
    references += expandFromInside(text) != text;
    // Deferred ones are the same in other brackets.
    QString deferred = text;
    deferred.replace("$(", "$[").replace(')', ']');
    const QString closed = withoutReferences(text);
    if (!text.contains(']')) {
      EXPECT_EQ(closesDeferredReferences(deferred), !closed.contains("$(")) << text.toStdString();
    }
  }
  EXPECT_GT(references, 800);
}

TEST(TextPlaces, PlainValuesBringNoClauses) {
  const QSet<QString> keys{"KEY", "NEXT"};
  std::mt19937 random(19);
  int accepted = 0;
  for (int round = 0; round < 20000; ++round) {
    const QString text = randomPlacedText(random);
    if (TextPlaces::refusePlainValue(text, keys, TextPlaces::Calls::Refused) != 0)
      continue;
    ++accepted;
    const QStringList words = readWords(text);
    const QStringList all = readWords("KEY " + text + " NEXT 1 INPUT FEATURE_TYPE t");
    EXPECT_EQ(all, QStringList("KEY") + words + QStringList({"NEXT", "1", "INPUT", "FEATURE_TYPE", "t"}))
        << text.toStdString();
    for (const QString& raw : readWords(text, true)) {
      EXPECT_FALSE(keys.contains(raw) || raw == "INPUT" || raw == "OUTPUT") << text.toStdString();
      EXPECT_FALSE(QRegularExpression("^@\\w+\\(").match(raw).hasMatch()) << text.toStdString();
    }
  }
  EXPECT_GT(accepted, 4000);
  for (const QString text :
       {"1 OUTPUT X", "a OUTPUT x FEATURE_TYPE y", "@EvaluateExpression(", "\"", "x @Tcl2(y)", "KEY"})
    EXPECT_NE(TextPlaces::refusePlainValue(text, keys, TextPlaces::Calls::Refused), 0) << text.toStdString();
  for (const QString text : {"OUTPUT", "KEY", "INPUT", "OTHER", "", "<space>"}) {
    const QString spelt = TextPlaces::withoutKeyword(text, keys);
    EXPECT_EQ(QORXWwjdDecode(spelt), QORXWwjdDecode(text));
    EXPECT_TRUE(QORXWwjdIsWellFormed(spelt) && !keys.contains(spelt) && spelt != "INPUT" &&
                spelt != "OUTPUT");
  }
  EXPECT_EQ(TextPlaces::refuseEncodedValue("a<space>b,c"), 0);
  for (const QString text : {"a b", "\"a\"", "@F(", "a@F("})
    EXPECT_NE(TextPlaces::refuseEncodedValue(text), 0) << text.toStdString();
}

}  // namespace
