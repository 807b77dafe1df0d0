#include "desktop/encoding.h"

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

TEST(Encoding, EveryByteComesBack) {
  for (int byte = 1; byte < 256; ++byte) {
    if (byte == '\n') continue;  // no text of the program holds one
    const std::string text(1, static_cast<char>(byte));
    EXPECT_EQ(FromQt(ToQt(text)), text) << byte;
  }
}

TEST(Encoding, ALineBreakIsANewLineOnTheScreen) {
  EXPECT_EQ(ToQt("a\rb"), QString("a\nb"));
  EXPECT_EQ(FromQt("a\nb"), "a\rb");
}

TEST(Encoding, LettersBeyondAsciiAreTheirOwn) {
  EXPECT_EQ(ToQt("\x80\xE9"), QString::fromUtf8("€é"));
  EXPECT_EQ(FromQt(QString::fromUtf8("Zoë Žáček €")), "Zo\xEB \x8E\xE1?ek \x80");
}

TEST(Encoding, NamesAreSeenAsTheyAreAndReadBack) {
  const QString name = QString::fromUtf8("Žáček 日本.qza");
  EXPECT_EQ(ToQt(NameFromQt(name)), name);
  EXPECT_EQ(NameFromQt("plain"), "plain");
}

TEST(Captions, AMnemonicKeepsItsMark) {
  EXPECT_EQ(ToMnemonicText("&Open"), QString("&Open"));
  EXPECT_EQ(ToMnemonicText("E&xit"), QString("E&xit"));
}

TEST(Captions, AnAmpersandThatMarksNothingIsSeen) {
  EXPECT_EQ(ToMnemonicText("Dog & Duck"), QString("Dog && Duck"));
  EXPECT_EQ(ToMnemonicText("Rovers &"), QString("Rovers &&"));
}

TEST(Captions, AreReadBackAsTheyWere) {
  for (const char* caption : {"&Open", "E&xit", "Dog & Duck", "Rovers &", "plain", "", "A&&B"}) {
    EXPECT_EQ(FromMnemonicText(ToMnemonicText(caption)), caption);
  }
}

TEST(Captions, AreSpokenWithoutMarksAndColon) {
  EXPECT_EQ(Spoken("All &Grades:"), QString("All Grades"));
  EXPECT_EQ(Spoken(" Dog & Duck "), QString("Dog & Duck"));
}

TEST(Dates, TheFirstAndTheLastAreShown) {
  EXPECT_EQ(ToQt(Date{-1e9}), QDate(100, 1, 1));
  EXPECT_EQ(ToQt(Date{1e9}), QDate(9999, 12, 31));
  EXPECT_EQ(ToQt(Date{38077}), QDate(2004, 3, 31));
  EXPECT_EQ(FromQt(QDate(2004, 3, 31)), Date{38077});
}

}  // namespace
}  // namespace marlowbeck
