#include "data/text.h"

#include <set>

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

}  // namespace
}  // namespace marlowbeck
