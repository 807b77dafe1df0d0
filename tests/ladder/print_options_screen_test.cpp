// The print panel of the ladder, its printouts and the clipboard, over a small league.

#include "support/league.h"
#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr const char* kLadderFile = "Winter_A Grade.qzl";

LadderRecord Played(int day, std::string_view home, int home_score, std::string_view away,
                    int away_score, int away_penalty = 0) {
  LadderRecord match;
  match.HomeTeam = home;
  match.AwayTeam = away;
  match.HomeScore = static_cast<std::int16_t>(home_score);
  match.AwayScore = static_cast<std::int16_t>(away_score);
  match.AwayPenalty = static_cast<std::int16_t>(away_penalty);
  match.GameDate = March(day);
  return match;
}

class LadderPrinting : public ClubTest {
 protected:
  void Lay(int bravos_penalty = -1) {
    std::vector<PlayerRecord> players;
    for (const char* team : {"Alpha", "Bravo", "Charlie", "Delta"}) {
      players.push_back(
          Player(static_cast<int>(players.size()) + 1, "Archer", "Jo", team, "A Grade"));
    }
    WritePlayers("Winter.qza", players);
    WriteFile(kLadderFile,
              FileOf(std::vector<LadderRecord>{
                  Played(3, "Alpha", 7, "Bravo", 4), Played(3, "Charlie", 5, "Delta", 5),
                  Played(10, "Bravo", 6, "Charlie", 5), Played(10, "Delta", 8, "Alpha", 3),
                  Played(17, "Alpha", 6, "Charlie", 5),
                  Played(17, "Delta", 4, "Bravo", 7, bravos_penalty)}));
    WriteFile("Winter_A Grade.qzi", " 2  0  1  4  11 \r\n");
    WriteFile("Winter_A Grade.qzs", "\"Winter 2004\"\r\n");
    WriteFile("Association.qz3", "\"Marlow Darts\"\r\n");
    NameOpenFile("Winter.qza");
  }
  void OpenTab(Here here = Here::current()) {
    DoAll({"click imgLadder", "pick cboResGrade 0", "click cmdGotoResults", "click cmdPL"}, here);
  }
  void OpenPanel(Here here = Here::current()) {
    Lay();
    OpenTab(here);
    Do("click cmdPrintLad", here);
  }
  void ExpectOpen(bool open, Here here = Here::current()) {
    EXPECT_EQ(Shown("fraPO", here), open);
    for (const char* panel : {"fraButtons", "fraCmds", "fraHelpExit"}) {
      EXPECT_EQ(Shown(panel, here), !open) << panel;
    }
    for (const char* control : {"lstTableDates", "cboTGrades", "grdLad", "grdWk"}) {
      EXPECT_EQ(Enabled(control, here), !open) << control;
    }
  }
  void ExpectRefusal(const std::string& message, Here here = Here::current()) {
    Do("click cmdBothOK", here);
    EXPECT_EQ(BoxTexts(), std::vector<std::string>{message});
    EXPECT_EQ(Count("printed") + Count("killed"), 0);
    ExpectOpen(true, here);
  }
  PrintedPage Print(int option, Here here = Here::current()) {
    DoAll({"click optBoth(" + std::to_string(option) + ")", "click cmdBothOK"}, here);
    const auto pages = PagesOf(EventsNamed("printed"), here);
    EXPECT_EQ(pages.size(), 1U);
    return pages.empty() ? PrintedPage() : pages.front();
  }
};

TEST_F(LadderPrinting, PanelOpensWithThePrinterOneCopyAndTheFirstDistance) {
  Lay();
  Do("printer orientation landscape");
  OpenTab();
  ExpectOpen(false);
  Do("click cmdPrintLad");
  EXPECT_EQ(Count("beep"), 1);
  ExpectOpen(true);
  EXPECT_EQ(Caption("lblPrinterName"), "Test printer");
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
  EXPECT_EQ(Text("txtNoC"), "1");
  EXPECT_EQ(Text("cboFromTop"), "1");
  EXPECT_EQ(Lines("cboFromTop").size(), 60U);
  EXPECT_EQ(Lines("cboFromTop").back(), "30.5");
}

TEST_F(LadderPrinting, CancelAndEscPutTheButtonsBack) {
  OpenPanel();
  Do("click cmdBothCancel");
  ExpectOpen(false);
  DoAll({"click cmdPrintLad", "key Esc"});
  ExpectOpen(false);
}

TEST_F(LadderPrinting, ChecksComeInTheirOrderAndLeaveThePanelOpen) {
  OpenPanel();
  DoAll({"type cboFromTop 0.5", "type txtNoC abc"});
  ExpectRefusal("Please select Results, Ladder or Both before printing.    ");
  Do("click optBoth(0)");
  ExpectRefusal("You must show CENTIMETRES from Top of Page!    ");
  Do("type cboFromTop 1");
  ExpectRefusal("You must show NUMBER of COPIES to print!    ");
}

TEST_F(LadderPrinting, AnythingMayStandInTheBoxes) {
  OpenPanel();
  Do("click optBoth(2)");
  const std::vector<std::string> texts = {"",    " ",   "x",     "1e400", "-1e400", "1e9",
                                          "0x7", "1,5", "32768", "+",     ".",      "nan"};
  for (const std::string& text : texts) {
    for (const char* box : {"cboFromTop", "txtNoC"}) {
      if (!Shown("fraPO")) Do("click cmdPrintLad");
      DoAll({"type cboFromTop 1", "type txtNoC 1", std::string("type ") + box + " " + text,
             "forget", "answer no"});
      Do("click cmdBothOK");
      // A page, a document thrown away, or a refusal: never an error, and never nothing.
      EXPECT_EQ(Count("error"), 0) << box << " " << text;
      EXPECT_EQ(Count("printed") + Count("killed") + (Shown("fraPO") ? 1 : 0), 1)
          << box << " " << text;
    }
  }
}

TEST_F(LadderPrinting, ButtonsComeBackAfterPrinting) {
  OpenPanel();
  Print(1);
  ExpectOpen(false);
}

TEST_F(LadderPrinting, ChoicesAreSetAfreshOnEachOpening) {
  OpenPanel();
  DoAll({"type cboFromTop 12.5", "type txtNoC 3", "click cmdBothCancel", "click cmdPrintLad"});
  EXPECT_EQ(Text("cboFromTop"), "1");
  EXPECT_EQ(Text("txtNoC"), "1");
}

TEST_F(LadderPrinting, HelpIsThePageOnPrintingWhileThePanelIsOpen) {
  OpenPanel();
  const std::vector<Json> page = {Json::parse(R"({"file": "qz1.HLP", "topic": 246})")};
  Do("click SSCommand5");
  EXPECT_EQ(EventsNamed("help"), page);
  Do("key F1");
  EXPECT_EQ(EventsNamed("help"), page);
  DoAll({"click cmdBothCancel", "key F1"});
  EXPECT_NE(EventsNamed("help"), page);
}

TEST_F(LadderPrinting, SetUpTurnsThePaper) {
  OpenPanel();
  DoAll({"setup landscape", "click cmdPrinterSetup"});
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
  ExpectAt(Print(1).Find("Marlow Darts"), 8419 - 600, 567);
}

TEST_F(LadderPrinting, LadderIsTheTableThatIsShown) {
  OpenPanel();
  EXPECT_EQ(Print(1).Words(),
            (TextList{"Marlow Darts",
                      "Winter 2004",
                      "A Grade",
                      "A Grade PREMIERSHIP LADDER up to: Wednesday, 17 March 2004 ",
                      "Team",
                      "P",
                      "W",
                      "L",
                      "D",
                      "F",
                      "A",
                      "%",
                      "Pts",
                      "Adj",
                      "Alpha",
                      "3",
                      "2",
                      "1",
                      "-",
                      "16",
                      "17",
                      "94.12",
                      "4",
                      "-",
                      "Delta",
                      "3",
                      "1",
                      "1",
                      "1",
                      "17",
                      "15",
                      "113.33",
                      "3",
                      "-",
                      "Bravo",
                      "3",
                      "2",
                      "1",
                      "-",
                      "17",
                      "16",
                      "106.25",
                      "3",
                      "-1",
                      "Charlie",
                      "3",
                      "-",
                      "2",
                      "1",
                      "15",
                      "17",
                      "88.24",
                      "1",
                      "-"}));
}

TEST_F(LadderPrinting, LadderOfAnEarlierDateHasNoAdjustments) {
  Lay();
  OpenTab();
  DoAll({"pick lstTableDates 1", "click cmdPrintLad"});
  const PrintedPage page = Print(1);
  const TextList words = page.Words();
  EXPECT_EQ(words[3], "A Grade PREMIERSHIP LADDER up to: Wednesday, 10 March 2004 ");
  EXPECT_EQ(words[12], "Pts");
  EXPECT_EQ(words[13], "Delta");
  // Four teams of seven letters at most, three eights four times, four three times, seven once.
  EXPECT_NEAR(page.boxes.at(0).x2 - page.boxes.at(0).x1, 840 + 4 * 360 + 3 * 480 + 840, 0.01);
}

TEST_F(LadderPrinting, ResultsAreThoseOfTheDate) {
  OpenPanel();
  EXPECT_EQ(
      Print(0).Words(),
      (TextList{"Marlow Darts", "Winter 2004", "A Grade", "A Grade    Wednesday, 17 March 2004 ",
                "Alpha", "6", "defeated", "Charlie", "5", "Bravo", "7", "defeated", "Delta", "4"}));
}

TEST_F(LadderPrinting, ADrawIsToldAsOne) {
  Lay();
  OpenTab();
  DoAll({"pick lstTableDates 0", "click cmdPrintLad"});
  const TextList words = Print(0).Words();
  EXPECT_EQ(TextList(words.end() - 5, words.end()),
            (TextList{"Charlie", "5", "drew", "Delta", "5"}));
}

TEST_F(LadderPrinting, BothAreOnOnePage) {
  OpenPanel();
  const PrintedPage page = Print(2);
  EXPECT_EQ(page.boxes.size(), 7U);
  const double results = 567 + 3 * 300 + 360;
  EXPECT_NEAR(page.boxes[0].y1, results, 0.01);
  ExpectAt(page.Find("A Grade PREMIERSHIP LADDER up to: Wednesday, 17 March 2004 "), 5953 - 59 * 50,
           results + 2 * 288 + 120);
}

TEST_F(LadderPrinting, NoPrintsGradeAndDateAlone) {
  OpenPanel();
  DoAll({"type cboFromTop 6", "answer no"});
  const PrintedPage page = Print(0);
  EXPECT_EQ(page.Words().front(), "A Grade");
  ExpectAt(page.Find("A Grade"), 5953 - 350, 6 * 567);
}

TEST_F(LadderPrinting, CancelOfTheQuestionPrintsNothing) {
  OpenPanel();
  DoAll({"type cboFromTop 6", "answer cancel", "click optBoth(2)", "click cmdBothOK"});
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
  ExpectOpen(false);
}

TEST_F(LadderPrinting, CopiesAreSeparatePagesOfOneDocument) {
  OpenPanel();
  DoAll({"type txtNoC 3", "click optBoth(2)", "click cmdBothOK"});
  EXPECT_EQ(PagesOf(EventsNamed("printed")).size(), 3U);
}

TEST_F(LadderPrinting, AFontTooLargeIsToldAndAnotherMayBeChosenWithThePanelOpen) {
  Lay();
  WriteFile("FontName.qz3", "24,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  OpenTab();
  DoAll({"click cmdPrintLad", "click optBoth(1)", "click cmdBothOK"});
  EXPECT_EQ(BoxTexts(), TextList{"Font is too large, please re-select.    "});
  EXPECT_EQ(Count("killed"), 1);
  DoAll({"click cmdPrintLad", "font 12 0 0 MS Sans Serif", "click lblFont"});
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 12pts.");
  EXPECT_EQ(Print(1).Find("Alpha").size, 12);
}

TEST_F(LadderPrinting, AFailedPrinterIsToldAndTheScreenGoesOn) {
  OpenPanel();
  DoAll({"printer fail 9", "click optBoth(2)", "click cmdBothOK"});
  EXPECT_EQ(BoxTexts(), TextList{"An unrecognised error occurred while trying to print.    "});
  EXPECT_EQ(Count("killed"), 1);
  ExpectOpen(false);
  Do("click cmdPrintLad");
  EXPECT_EQ(Print(2).boxes.size(), 7U);
}

TEST_F(LadderPrinting, PrinterFontIsThatOfAllScreens) {
  Lay();
  WriteFile("FontName.qz3", "14,\"Liberation Serif\",#FALSE#,#TRUE#\r\n");
  OpenTab();
  EXPECT_EQ(Caption("lblFont"), "Liberation Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 14pts.");
  EXPECT_FALSE(Shown("lblFontInfo"));
  Do("hover lblFont");
  EXPECT_TRUE(Shown("lblFontInfo"));
}

TEST_F(LadderPrinting, ATableThatCouldNotBeWorkedOutIsNotPrintedFromTheDateBefore) {
  Lay();
  // The last night takes Alpha's games past what can be counted.
  std::string file = File(kLadderFile);
  WriteFile(kLadderFile,
            file + FileOf(std::vector<LadderRecord>{Played(24, "Alpha", 320, "Bravo", 1)}));
  OpenTab();
  DoAll({"pick lstTableDates 0", "pick lstTableDates 3"});
  ASSERT_EQ(EventsNamed("error").size(), 1U);
  Do("click cmdPrintLad");
  const PrintedPage page = Print(1);
  EXPECT_EQ(page.boxes.size(), 1U) << "its heads alone";
}

TEST_F(LadderPrinting, ClipboardHoldsResultsAndLadderAsTabbedText) {
  Lay();
  OpenTab();
  Do("click cmdClipLadder");
  EXPECT_EQ(EventsNamed("clipboard").size(), 2U);
  EXPECT_EQ(EventsNamed("clipboard").at(0), "");
  EXPECT_EQ(EventsNamed("clipboard").at(1),
            "Marlow Darts\r\n"
            "Winter 2004\r\n"
            "A Grade    Wednesday, 17 March 2004\r\n"
            "Alpha\t6\t def \tCharlie\t5\t\r\n"
            "Bravo\t7\t def \tDelta\t4\t\r\n"
            "PREMIERSHIP LADDER  -  up to  17/03/2004\r\n"
            "Team\tPlayed\tWon\tLost\tDraw\tFor\tAgainst\tPercent\tPoints\tAdjust\r\n"
            "Alpha\t3\t2\t1\t0\t16\t17\t94.12\t4\t0\t\r\n"
            "Delta\t3\t1\t1\t1\t17\t15\t113.33\t3\t0\t\r\n"
            "Bravo\t3\t2\t1\t0\t17\t16\t106.25\t3\t-1\t\r\n"
            "Charlie\t3\t0\t2\t1\t15\t17\t88.24\t1\t0\t\r\n");
  EXPECT_EQ(BoxTexts(), TextList{"The Game results and Premiership Ladder    \r"
                                 "have been copied to the clipboard and   \r"
                                 "can now be pasted as text into your    \r"
                                 "favourite spreadsheet or wordprocessor.    \r"
                                 "\r"
                                 "Note: When you leave this section,    \r"
                                 "the Clipboard will be cleared !"});
  EXPECT_EQ(Boxes().at(0).style, 64);
}

TEST_F(LadderPrinting, TheSeasonsTitleIsReadForTheClipboard) {
  Lay();
  OpenTab();
  WriteFile("Winter_A Grade.qzs", "\" Summer 2005 \"\r\n");
  Do("click cmdClipLadder");
  const std::string text = EventsNamed("clipboard").at(1);
  EXPECT_TRUE(text.starts_with("Marlow Darts\r\nSummer 2005\r\nA Grade    Wednesday"));
}

TEST_F(LadderPrinting, KeptLeavingDoesNotClearTheClipboardWhateverTheBoxSaid) {
  Lay();
  OpenTab();
  Do("click cmdClipLadder");
  const Json copied = Do("clipboard")["text"];
  ASSERT_NE(copied, "");
  for (const char* way : {"click cmdSC", "click cmdExit"}) {
    Do(way);
    EXPECT_EQ(Count("clipboard"), 0) << way;
  }
  EXPECT_EQ(Do("clipboard")["text"], copied);
}

}  // namespace
}  // namespace marlowbeck
