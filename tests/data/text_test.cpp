#include "data/text.h"

#include <set>
#include <vector>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

std::string AllBytes() {
  std::string bytes;
  for (int byte = 0; byte < 256; ++byte) bytes += static_cast<char>(byte);
  return bytes;
}

TEST(CodePage, EveryByteComesBack) {
  EXPECT_EQ(Cp1252FromUtf8(Utf8FromCp1252(AllBytes())), AllBytes());
}

TEST(CodePage, NoTwoBytesAreTheSameCharacter) {
  std::set<std::string> characters;
  for (const char byte : AllBytes()) characters.insert(Utf8FromCp1252(std::string(1, byte)));
  EXPECT_EQ(characters.size(), 256U);
}

TEST(CodePage, HasTheEuroSignAndItsNeighboursInTheirPlaces) {
  EXPECT_EQ(Utf8FromCp1252("\x80"), "\u20AC");
  EXPECT_EQ(Utf8FromCp1252("\x8A\x9A"), "\u0160\u0161");
  EXPECT_EQ(Utf8FromCp1252("\x92"), "\u2019");
  EXPECT_EQ(Utf8FromCp1252("\xE9\xFF"), "\u00E9\u00FF");
  EXPECT_EQ(Cp1252FromUtf8("Zo\u00EB \u2013 5\u20AC"), "Zo\xEB \x96 5\x80");
}

TEST(CodePage, WhatHasNoPlaceInItBecomesAQuestionMark) {
  EXPECT_EQ(Cp1252FromUtf8("\u0142\u65E5\U0001F3AF"), "???");
}

TEST(CodePage, GarbledUtf8BecomesQuestionMarks) {
  EXPECT_EQ(Cp1252FromUtf8("a\xFF"
                           "b"),
            "a?b");
  EXPECT_EQ(Cp1252FromUtf8("\xC3"), "?");
  EXPECT_EQ(Cp1252FromUtf8("\xE2\x82"), "??");
  EXPECT_EQ(Cp1252FromUtf8("\x80"), "?");
  EXPECT_EQ(Cp1252FromUtf8("\xC3("), "?(");
}

// Longer forms of "/" that some decoders let pass.
TEST(CodePage, OverlongUtf8IsGarbled) {
  EXPECT_EQ(Cp1252FromUtf8("\xC0\xAF"), "??");
  EXPECT_EQ(Cp1252FromUtf8("\xE0\x80\xAF"), "???");
  EXPECT_EQ(Cp1252FromUtf8("\xF0\x80\x80\xAF"), "????");
}

TEST(Trim, TakesBlanksOffBothEndsAndNothingElse) {
  EXPECT_EQ(Trim("  A Grade  "), "A Grade");
  EXPECT_EQ(Trim("\tA "), "\tA");
  EXPECT_EQ(Trim("    "), "");
  EXPECT_EQ(Trim(""), "");
}

TEST(UpperCase, RaisesTheLettersOfTheCodePage) {
  EXPECT_EQ(UpperCase("abc xyz 1{"), "ABC XYZ 1{");
  EXPECT_EQ(UpperCase("\xE0\xE9\xFE\x9A\x9C\x9E\xFF"), "\xC0\xC9\xDE\x8A\x8C\x8E\x9F");
  EXPECT_EQ(UpperCase("\xF7\xDF\xB5\x83"), "\xF7\xDF\xB5\x83") << "these have no capital";
}

TEST(UpperCase, OfWhatIsUpperCaseChangesNothing) {
  const std::string once = UpperCase(AllBytes());
  EXPECT_EQ(UpperCase(once), once);
}

TEST(EqualsIgnoringCase, FoldsLettersOnly) {
  EXPECT_TRUE(EqualsIgnoringCase("WkDate.qz3", "WKDATE.QZ3"));
  EXPECT_TRUE(EqualsIgnoringCase("\xE9", "\xC9"));
  EXPECT_FALSE(EqualsIgnoringCase("ab", "abc"));
  EXPECT_FALSE(EqualsIgnoringCase("[", "{"));
}

TEST(FixedWidth, CutsOrFills) {
  EXPECT_EQ(FixedWidth("abcd", 3), "abc");
  EXPECT_EQ(FixedWidth("ab", 4), "ab  ");
  EXPECT_EQ(FixedWidth("", 2), "  ");
}

TEST(WithoutLast, IsEmptyWhereThereAreNoMore) {
  EXPECT_EQ(WithoutLast("Winter.qza", 4), "Winter");
  EXPECT_EQ(WithoutLast(".qza", 4), "");
  EXPECT_EQ(WithoutLast("a", 4), "");
}

TEST(Lines, AreJoinedByOneCarriageReturn) {
  EXPECT_EQ(Lines({"a", "", "b"}), "a\r\rb");
  EXPECT_EQ(Lines({"a"}), "a");
  EXPECT_EQ(Lines({"", "a"}), "\ra");
}

TEST(ComesBefore, GoesByLettersInAnyCaseAndThenByBytes) {
  EXPECT_TRUE(ComesBefore("a", "B"));
  EXPECT_TRUE(ComesBefore("B", "c"));
  EXPECT_FALSE(ComesBefore("B", "a"));
  EXPECT_TRUE(ComesBefore("A", "a"));
  EXPECT_FALSE(ComesBefore("a", "A"));
  EXPECT_FALSE(ComesBefore("a", "a"));
  EXPECT_TRUE(ComesBefore("a", "A.x"));
  EXPECT_TRUE(ComesBefore("a_", "ab") == ComesBefore("A_", "AB"));
  EXPECT_TRUE(ComesBefore("z", "\xE9")) << "letters beyond ASCII follow";
  EXPECT_TRUE(ComesBefore("\xE9", "\xC9t")) << "in any case too";
}

TEST(Names, OfTheCodePageAreTheirText) {
  EXPECT_EQ(TextOfName("Pr\xC3\xA9-\xE2\x82\xAC [1]?.qza"), "Pr\xE9-\x80 [1]?.qza");
  EXPECT_EQ(NameOfText("Pr\xE9-\x80 [1]?.qza"), "Pr\xC3\xA9-\xE2\x82\xAC [1]?.qza");
}

TEST(Names, HaveAnEscapeForWhatTheCodePageHasNoPlaceFor) {
  EXPECT_EQ(TextOfName("\xC5\x81\xC3\xB3"),
            "\x81"
            "000141"
            "\xF3");
  EXPECT_EQ(TextOfName("\xF0\x9F\x8E\xAF"),
            "\x81"
            "01F3AF");
  EXPECT_EQ(TextOfName("a\xFF"),
            "a\x81"
            "1100FF")
      << "no UTF-8";
}

TEST(Names, ComeBackWhateverTheyAre) {
  const std::vector<std::string> names = {
      "\xC5\x81\xC3\xB3"
      "d\xC5\xBA.qza",
      "\xE6\x97\xA5\xE6\x9C\xAC",
      "\xF0\x9F\x8E\xAF",
      "\xFF\xFE",
      "\xC3",
      "\xE2\x82.txt",
      "\xED\xA0\x80",
      "\xF4\x90\x80\x80",
      "\xC0\xAF",
      "\xC2\x81",
      "\xC2\x81"
      "000041",
      "\xC2\x81"
      "000081000081",
      "\xC2\x81"
      "00041",
      "??",
      ""};
  std::set<std::string> texts;
  for (const std::string& name : names) {
    EXPECT_EQ(NameOfText(TextOfName(name)), name);
    texts.insert(TextOfName(name));
  }
  EXPECT_EQ(texts.size(), names.size());
  EXPECT_EQ(NameOfText(AllBytes()), Utf8FromCp1252(AllBytes()));
}

TEST(Names, AreTheSameTextInCapitals) {
  const std::string text = TextOfName("\xC5\x82\xE6\x97\xA5");
  EXPECT_EQ(UpperCase(text), text);
}

TEST(Names, AreSeenAsTheyAre) {
  EXPECT_EQ(ShownText(TextOfName("\xC5\x81\xC3\xB3"
                                 "d")),
            "\xC5\x81\xC3\xB3"
            "d");
  EXPECT_EQ(ShownText(TextOfName("a\xFF")), "a\xEF\xBF\xBD");
  EXPECT_EQ(ShownText(TextOfName("\xED\xA0\x80")), "\xEF\xBF\xBD") << "half of a pair";
  EXPECT_EQ(ShownText(AllBytes()), Utf8FromCp1252(AllBytes()));
}

TEST(Names, WithoutEscapesHaveQuestionMarks) {
  EXPECT_EQ(WithoutEscapes(TextOfName("\xC5\x81\xC3\xB3"
                                      "d\xFF")),
            "?\xF3"
            "d?");
  EXPECT_EQ(WithoutEscapes("plain \xE9"), "plain \xE9");
}

TEST(Names, HaveACharacterForAnEscape) {
  EXPECT_EQ(CharactersOf(TextOfName("a\xC5\x81"
                                    "b"))
                .size(),
            3U);
  EXPECT_EQ(CharactersOf("\x81"
                         "00")
                .size(),
            3U)
      << "no escape";
  EXPECT_EQ(CharactersOf("").size(), 0U);
}

}  // namespace
}  // namespace marlowbeck
