// The box that shows the printer font and lets it be chosen.

#include "stats/reports.h"

namespace marlowbeck {
namespace {

constexpr const char* kTooLarge =
    "The font size you selected is to large. Please select    \r"
    "fonts 24 points or less. If you select a font size too    \r"
    "large for printing, the print job will automatically be    \r"
    "cancelled and a message will advise you to alter the    \r"
    "font size.   ";

class FontBoxScreen : public ReportsTest {
 protected:
  void Open(const std::string& kept = "10,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n") {
    LayRovers();
    WriteFile("FontName.qz3", kept);
    OpenWeekly();
  }
  /// Answers the font dialog and clicks on the font.
  void Choose(const std::string& answer, Here here = Here::current()) {
    DoAll({"font " + answer, "click lblFont"}, here);
    EXPECT_EQ(EventsNamed("font").size(), 1U);
  }
  void ExpectKept(const std::string& line, Here here = Here::current()) {
    EXPECT_EQ(File("FontName.qz3", here), line + "\r\n");
  }
};

TEST_F(FontBoxScreen, ShowsNameAndSize) {
  Open();
  EXPECT_TRUE(Shown("fraFontPick"));
  EXPECT_EQ(Caption("fraFontPick"), "Printer Font");
  EXPECT_EQ(Caption("lblFont"), "MS Sans Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 10pts.");
}

TEST_F(FontBoxScreen, HintIsSeenWhileThePointerIsOverTheFont) {
  Open();
  EXPECT_FALSE(Shown("lblFontInfo"));
  EXPECT_EQ(Caption("lblFontInfo"), " Click to change font. ");
  Do("hover lblFont");
  EXPECT_TRUE(Shown("lblFontInfo"));
  Do("hover fraFontPick");
  EXPECT_FALSE(Shown("lblFontInfo"));
}

TEST_F(FontBoxScreen, ClickOpensTheDialogWithTheFontAsItIsAndHidesTheHint) {
  Open("12,\"Liberation Serif\",#TRUE#,#FALSE#\r\n");
  Do("hover lblFont");
  Choose("14 0 1 Liberation Sans");
  EXPECT_FALSE(Shown("lblFontInfo"));
  EXPECT_EQ(EventsNamed("font").at(0), Json::parse(R"({"size": 12, "name": "Liberation Serif",
      "bold": true, "italic": false, "answer": {"size": 14, "name": "Liberation Sans",
      "bold": false, "italic": true}})"));
}

TEST_F(FontBoxScreen, WhatIsChosenIsShownHoldsAndIsKept) {
  Open();
  Choose("14 1 1 Liberation Serif");
  EXPECT_EQ(Caption("lblFont"), "Liberation Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 14pts.");
  EXPECT_EQ(InSession("PrintFontName"), "Liberation Serif");
  EXPECT_EQ(InSession("PrintFontSize"), 14);
  EXPECT_EQ(InSession("PrintFontBold"), true);
  EXPECT_EQ(InSession("PrintFontItalic"), true);
  ExpectKept("14,\"Liberation Serif\",#TRUE#,#TRUE#");
  Restart();
  OpenWeekly();
  EXPECT_EQ(Caption("lblFont"), "Liberation Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 14pts.");
}

TEST_F(FontBoxScreen, SizeSevenKeepsTheSizeAsItWasWithoutAWord) {
  Open();
  Choose("7 1 0 Liberation Serif");
  EXPECT_TRUE(Boxes().empty());
  ExpectKept("10,\"Liberation Serif\",#TRUE#,#FALSE#");
}

TEST_F(FontBoxScreen, SizeEightIsTaken) {
  Open();
  Choose("8 0 0 Liberation Serif");
  ExpectKept("8,\"Liberation Serif\",#FALSE#,#FALSE#");
}

TEST_F(FontBoxScreen, SizeTwentyFourIsTaken) {
  Open();
  Choose("24 0 0 Liberation Serif");
  EXPECT_TRUE(Boxes().empty());
  ExpectKept("24,\"Liberation Serif\",#FALSE#,#FALSE#");
}

TEST_F(FontBoxScreen, SizeTwentyFiveIsRefusedAndTheOldOneComesBack) {
  Open("12,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  Choose("25 1 0 Liberation Serif");
  EXPECT_EQ(BoxTexts(), std::vector<std::string>{kTooLarge});
  EXPECT_EQ(Boxes().at(0).style, 48);
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 12pts.");
  // Only the size is refused.
  ExpectKept("12,\"Liberation Serif\",#TRUE#,#FALSE#");
}

TEST_F(FontBoxScreen, ACancelledDialogChangesNothing) {
  Open("12,\"Liberation Serif\",#TRUE#,#FALSE#\r\n");
  DoAll({"font-cancel", "click lblFont"});
  EXPECT_EQ(Caption("lblFont"), "Liberation Serif");
  ExpectKept("12,\"Liberation Serif\",#TRUE#,#FALSE#");
}

TEST_F(FontBoxScreen, AChoiceThatCannotBeKeptHoldsAndIsShown) {
  HOLDS_FOR_MODELS_ALONE("the fault is one of files");
  Open();
  DoAll({"font 14 0 1 Liberation Serif", "fault write 1 61", "click lblFont"});
  EXPECT_EQ(Count("error"), 1);
  EXPECT_EQ(InSession("PrintFontSize"), 14);
  EXPECT_EQ(Caption("lblFont"), "Liberation Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 14pts.");
}

TEST_F(FontBoxScreen, AFontFileThatNamesNoFontIsWrittenAnew) {
  for (const char* bad : {"0,\"Sans\",#FALSE#,#FALSE#\r\n", "-3,\"Sans\",#FALSE#,#FALSE#\r\n",
                          "10,\"\",#FALSE#,#FALSE#\r\n"}) {
    Open(bad);
    ExpectKept("10,\"MS Sans Serif\",#FALSE#,#FALSE#");
    EXPECT_EQ(Caption("lblPrFont"), "Font size = 10pts.") << bad;
    DoAll({"click cmdCancelWK", "click Image10"});
  }
}

TEST_F(FontBoxScreen, PaperIsPrintedInTheFontThatIsShown) {
  Open();
  Choose("12 0 1 Liberation Serif");
  DoAll({"click cmdPrintLad", "click optBoth(0)", "click cmdBothOK"});
  const Json page = EventsNamed("printed").at(0)["pages"][0];
  for (const Json& operation : page) {
    if (!operation.contains("text") || operation["text"] == " ") continue;
    EXPECT_EQ(operation["font"], "Liberation Serif");
    EXPECT_EQ(operation["size"], 12);
    EXPECT_EQ(operation["italic"], true);
  }
}

}  // namespace
}  // namespace marlowbeck
