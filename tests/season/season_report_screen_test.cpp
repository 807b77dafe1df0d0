// One player's season: picks, tables, forfeits, clipboard and printing.

#include "support/league.h"
#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr const char* kReportFile = "Winter_A Grade.qz3";

/// Hawks' Hill (11) has two nights and a forfeit, Hope (12) one night; Lions' player 21 one.
class SeasonReport : public ScoreSheets {
 protected:
  static std::vector<ResultRecord> Season() {
    ResultRecord forfeit = Night(11, "Hawks", "Rovers", 24);
    forfeit.Forfeit = "F";
    forfeit.Aggregate = 0;
    forfeit.Shots = 0;
    forfeit.HighScore = 0;
    forfeit.Centuries = 0;
    forfeit.Scores180 = 0;
    forfeit.Pegs = {};
    ResultRecord last = Figures(Night(11, "Hawks", "Lions", 31), 900, 45);
    last.Pegs = {57, 121, 0, 8, 0, 0};
    return {Figures(Night(11, "Hawks", "Cubs", 17), 1001, 50), forfeit, last,
            Figures(Night(12, "Hawks", "Lions", 31), 500, 40),
            Figures(Night(21, "Lions", "Hawks", 31), 700, 40)};
  }
  static ResultRecord Figures(ResultRecord night, int aggregate, int shots) {
    night.Aggregate = static_cast<std::int16_t>(aggregate);
    night.Shots = shots;
    night.HighScore = 100;
    night.Centuries = 1;
    night.Scores180 = 0;
    night.Pegs = {};
    return night;
  }
  void Lay() {
    WriteResults(kAResults, Season());
    WriteFile("Winter_A Grade.qzs", "\"Winter 2004\"\r\n");
    WriteFile("Winter_B Grade.qzs", "\"Winter B\"\r\n");
    WriteFile("Forfeits.qz3", "1\r\n");
    WriteFile("Association.qz3", "\"Mid Darts\"\r\n");
  }
  void Open(Here here = Here::current()) {
    Lay();
    DoAll({"click imgPrinter", "click Image7"}, here);
  }
  void OpenHill(Here here = Here::current()) {
    Open(here);
    DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0"}, here);
  }
  void OpenPrinting(Here here = Here::current()) {
    OpenHill(here);
    Do("click cmdPrinter", here);
  }
  TextList Totals(Here here = Here::current()) { return Row("grdTotals", 1, here); }
};

TEST_F(SeasonReport, OpensWithTheFirstGradeAndTeam) {
  Open();
  EXPECT_EQ(Front(), "frmAnnual");
  EXPECT_EQ(Title("frmAnnual"), "[Marlowbeck]  Season Report");
  EXPECT_EQ(Text("cboGrades"), "A Grade");
  EXPECT_EQ(Text("cboTeams"), "Cubs");
  EXPECT_EQ(InSession("ReportChoice"), 7);
  for (const char* control : {"grdAnnual", "grdTotals", "lblGrade", "lblPlayer", "lblToT"}) {
    EXPECT_FALSE(Shown(control)) << control;
  }
  EXPECT_FALSE(Enabled("cmdPrinter"));
  EXPECT_FALSE(Enabled("cmdClipAnnual"));
  EXPECT_FALSE(Shown("picPrinter"));
  EXPECT_EQ(Caption("lblAllAnnual"), "Print ALL 0 Players.");
}

TEST_F(SeasonReport, ATeamWithoutResultsListsNobodyAndSaysSo) {
  Open();
  EXPECT_TRUE(Lines("lstPlayers").empty());
  EXPECT_EQ(Caption("lblHmP"), "Players (0)");
  EXPECT_TRUE(Shown("lblNoneFound"));
  EXPECT_EQ(Caption("lblNoneFound"), "  No results found for: \r Cubs,  A Grade.  ");
}

TEST_F(SeasonReport, OnlyPlayersWithResultsAreListedInFileOrder) {
  Open();
  Do("pick cboTeams =Hawks");
  EXPECT_EQ(Lines("lstPlayers"), (TextList{"Hill,  Al", "Hope,  Bo"}));
  EXPECT_EQ(Caption("lblHmP"), "Players (2)");
  EXPECT_FALSE(Shown("lblNoneFound"));
}

TEST_F(SeasonReport, ANightIsARowInFileOrder) {
  OpenHill();
  EXPECT_EQ(Caption("lblGrade"), "Hawks  (A Grade)  -  Winter 2004");
  EXPECT_EQ(Caption("lblPlayer"), "Season Report:   Al Hill");
  EXPECT_EQ(Caption("lblToT"), "Totals");
  EXPECT_EQ(
      Cells("grdAnnual"),
      (std::vector<TextList>{
          {"Date", "Against", "Agg", "Sh", "180", "100", "H/Sc", "Triples", "Doubles", "Singles",
           "Avg"},
          {"17/03/2004", "Cubs", "1001", "50", "", "1", "100", "", "", "", "20.02"},
          {"24/03/2004", "Rovers *", "Forfeit", "Win", "", "", "", "", "", "", ""},
          {"31/03/2004", "Lions", "900", "45", "", "1", "100", "57, 121", "8", "", "20.00"}}));
}

TEST_F(SeasonReport, TotalsStandBelow) {
  OpenHill();
  EXPECT_EQ(Row("grdTotals", 0),
            (TextList{"Games", "Agg", "Shots", "180's", "100's", "Hi Scr", "Triples", "Doubles",
                      "Singles", "Tot.Pegs", "Hi Peg", "Avg"}));
  // 1901 over 95 is 20.0105.
  EXPECT_EQ(Totals(),
            (TextList{"3", "1901", "95", "0", "2", "100", "2", "1", "0", "3", "121", "20.01"}));
}

TEST_F(SeasonReport, ForfeitsCountAsGamesOrNotByChoice) {
  OpenHill();
  EXPECT_TRUE(Shown("fraFFYesNo"));
  EXPECT_TRUE(Shown("picFF"));
  EXPECT_EQ(Caption("fraFFYesNo"), "Include Forfeits in TOTAL GAMES PLAYED ?");
  EXPECT_TRUE(Ticked("optFFyes"));
  Do("click optFFno");
  EXPECT_EQ(Totals()[0], "2");
  EXPECT_EQ(File("Forfeits.qz3"), "0\r\n");
  Do("click optFFyes");
  EXPECT_EQ(Totals()[0], "3");
  EXPECT_EQ(File("Forfeits.qz3"), "1\r\n");
}

TEST_F(SeasonReport, TheQuestionAndItsFrameAreBothHiddenUntilThereIsAForfeit) {
  Open();
  const auto expect_asked = [this](bool asked) {
    for (const char* control : {"fraFFYesNo", "picFF"}) {
      EXPECT_EQ(Get(control)["visible"], asked) << control;
    }
  };
  expect_asked(false);
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0"});
  expect_asked(true);
  Do("pick lstPlayers 1");
  expect_asked(false);
  DoAll({"pick lstPlayers 0", "pick cboTeams =Cubs"});
  expect_asked(false);
}

TEST_F(SeasonReport, AnAnswerThatCannotBeKeptIsTakenBackAndCanBeGivenAgain) {
  OpenHill();
  Do("fault write 1 61");
  Do("click optFFno");
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 61);
  EXPECT_TRUE(Ticked("optFFyes"));
  EXPECT_FALSE(Ticked("optFFno"));
  EXPECT_EQ(Totals()[0], "3");
  Do("click optFFno");
  EXPECT_TRUE(Ticked("optFFno"));
  EXPECT_EQ(Totals()[0], "2");
  EXPECT_EQ(File("Forfeits.qz3"), "0\r\n");
}

TEST_F(SeasonReport, WithoutForfeitsNothingIsAsked) {
  OpenHill();
  Do("pick lstPlayers 1");
  EXPECT_EQ(Caption("lblPlayer"), "Season Report:   Bo Hope");
  EXPECT_FALSE(Shown("fraFFYesNo"));
  EXPECT_FALSE(Shown("picFF"));
  EXPECT_EQ(Cells("grdAnnual").size(), 2U);
}

TEST_F(SeasonReport, OnlyForfeitsMakeZerosAndNoAverage) {
  Open();
  ResultRecord forfeit = Season()[1];
  WriteResults(kAResults, {forfeit});
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0"});
  EXPECT_EQ(Row("grdAnnual", 1)[2], "Forfeit");
  EXPECT_EQ(Totals(), (TextList{"1", "0", "0", "0", "0", "0", "0", "0", "0", "0", "0", ""}));
}

TEST_F(SeasonReport, NightsOfAFileOutOfOrderStandAsTheyLie) {
  Open();
  auto season = Season();
  std::swap(season[0], season[2]);
  WriteResults(kAResults, season);
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0"});
  EXPECT_EQ(Row("grdAnnual", 1)[0], "31/03/2004");
  EXPECT_EQ(Row("grdAnnual", 3)[0], "17/03/2004");
}

TEST_F(SeasonReport, TheWorkFileIsTheLastPlayers) {
  OpenHill();
  Do("pick lstPlayers 1");
  EXPECT_EQ(File(kReportFile), "\"Bo Hope\"\r\n#2004-03-31#,1,\"Lions" + std::string(25, ' ') +
                                   "\"\r\n500,40,100,0,1\r\n0,0,0,0,0,0\r\n"
                                   "500,40,100,0,1,0,0,0,0,0\r\n");
}

TEST_F(SeasonReport, QuotesAndCommasInNamesAndOppositionsComeThrough) {
  Lay();
  WritePlayers("Winter.qza", {Player(11, "O\"Dea, B", "Al \"Arm\"", "Hawks", "A Grade"),
                              Player(21, "Ames", "Al", "Lions", "A Grade")});
  const std::string opposition = "The \"Cubs\", 2";
  WriteResults(kAResults, {Figures(Night(11, "Hawks", opposition, 31), 500, 40)});
  DoAll({"click imgPrinter", "click Image7", "pick lstPlayers 0"});
  EXPECT_EQ(Lines("lstPlayers"), TextList{"O\"Dea, B,  Al \"Arm\""});
  EXPECT_EQ(Caption("lblPlayer"), "Season Report:   Al \"Arm\" O\"Dea, B");
  EXPECT_EQ(Row("grdAnnual", 1),
            (TextList{"31/03/2004", opposition, "500", "40", "", "1", "100", "", "", "", "12.50"}));
  EXPECT_EQ(Totals()[1], "500");
  EXPECT_EQ(File(kReportFile), "\"Al \"Arm\" O\"Dea, B\"\r\n#2004-03-31#,1,\"" + opposition +
                                   std::string(30 - opposition.size(), ' ') +
                                   "\"\r\n500,40,100,0,1\r\n0,0,0,0,0,0\r\n"
                                   "500,40,100,0,1,0,0,0,0,0\r\n");
}

TEST_F(SeasonReport, AMissingTitleIsAskedForOnce) {
  Lay();
  DeleteFile("Winter_A Grade.qzs");
  DoAll({"click imgPrinter", "click Image7", "pick cboTeams =Hawks"});
  Do("input Summer");
  Do("pick lstPlayers 0");
  EXPECT_EQ(Count("input"), 1);
  EXPECT_EQ(Caption("lblGrade"), "Hawks  (A Grade)  -  Summer");
  Do("pick lstPlayers 1");
  EXPECT_EQ(Count("input"), 0);
}

TEST_F(SeasonReport, AnotherTeamHidesTheSeason) {
  OpenHill();
  Do("pick cboTeams =Lions");
  EXPECT_FALSE(Shown("grdAnnual"));
  EXPECT_FALSE(Enabled("cmdPrinter"));
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0"});
  EXPECT_TRUE(Shown("grdAnnual"));
  Do("pick cboGrades =B Grade");
  EXPECT_FALSE(Shown("grdAnnual"));
  EXPECT_EQ(Lines("cboTeams"), (TextList{"Bees", "Crows", "Ducks"}));
  EXPECT_EQ(InSession("Grade"), "B Grade");
}

TEST_F(SeasonReport, AGradeOrTeamThatCannotBeReadLeavesNobodyOfTheOneBefore) {
  HOLDS_FOR_MODELS_ALONE("the fault lies in one file system");
  for (const char* pick : {"pick cboGrades =B Grade", "pick cboTeams =Lions"}) {
    for (int operation = 1; operation <= 6; ++operation) {
      OpenHill();
      DoAll({"fault any " + std::to_string(operation) + " 57", pick});
      EXPECT_EQ(BoxTexts(), TextList{"DEVICE I/O ERROR    "}) << pick << ' ' << operation;
      EXPECT_TRUE(Lines("lstPlayers").empty()) << pick << ' ' << operation;
      EXPECT_EQ(Caption("lblHmP"), "Players (0)") << pick << ' ' << operation;
      EXPECT_FALSE(Shown("lblNoneFound")) << pick << ' ' << operation;
      EXPECT_FALSE(Shown("grdAnnual")) << pick << ' ' << operation;
      DoAll({"fault off", pick});
      EXPECT_TRUE(BoxTexts().empty());
      DoAll({"click cmdCancelAnn", "click Image10"});
    }
  }
}

TEST_F(SeasonReport, TheClipboardGetsSeasonAndTotals) {
  OpenHill();
  Do("click cmdClipAnnual");
  EXPECT_EQ(EventsNamed("clipboard").back(),
            "Mid Darts\r\nHawks  (A Grade)  -  Winter 2004\r\nSeason Report:   Al Hill\r\n"
            "Date\tAgainst\tAgg\tShots\t180's\t100's\tH/Scr\tTriples\tDoubles\tSingles\tAvg\r\n"
            "17/03/2004\tCubs\t1001\t50\t\t1\t100\t\t\t\t20.02\r\n"
            "24/03/2004\tRovers *\tForfeit\tWin\t\t\t\t\t\t\t\r\n"
            "31/03/2004\tLions\t900\t45\t\t1\t100\t57, 121\t8\t\t20.00\r\n"
            "SEASON TOTALS\r\n"
            "Games\tAgg\tShots\t180's\t100's\tH/Scr\tTriples\tDoubles\tSingles\tPegs\tHi/Peg\tAvg"
            "\r\n3\t1901\t95\t0\t2\t100\t2\t1\t0\t3\t121\t20.01\r\n");
  EXPECT_EQ(BoxTexts(), (TextList{"Annual report has been copied to the clipboard    \r"
                                  "and can now be pasted as text into your    \r"
                                  "favourite spreadsheet or wordprocessor.    \r\r"
                                  "Note: When you leave this section,    \r"
                                  "the Clipboard will be cleared !"}));
}

TEST_F(SeasonReport, LeavingDoesNotClearTheClipboardWhateverTheBoxSaid) {
  // KEPT: the box of the copy says that it is cleared.
  OpenHill();
  Do("click cmdClipAnnual");
  const auto copied = EventsNamed("clipboard").back();
  Do("click cmdCancelAnn");
  EXPECT_EQ(Count("clipboard"), 0);
  EXPECT_EQ(Do("clipboard")["text"], copied);
}

TEST_F(SeasonReport, ThePanelTellsThePrinterAndAsksForAll) {
  OpenPrinting();
  EXPECT_TRUE(Shown("picPrinter"));
  EXPECT_EQ(Caption("lblPrinterName"), "Test printer");
  EXPECT_EQ(Caption("lblOrient"), "Portrait");
  EXPECT_EQ(Text("txtNoC"), "1");
  EXPECT_TRUE(Shown("fraAllAnnual"));
  EXPECT_EQ(Caption("lblAllAnnual"), "Print BOTH Players.");
  EXPECT_TRUE(Ticked("optNoAnnual"));
  EXPECT_EQ(Caption("cmdBothOKHI"), "Printer");
  Do("click cmdBothCancelHI");
  EXPECT_FALSE(Shown("picPrinter"));
  EXPECT_TRUE(Shown("lstPlayers"));
}

TEST_F(SeasonReport, OnePlayerAloneIsNotAskedForAll) {
  Open();
  WriteResults(kAResults, {Season()[3]});
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0", "click cmdPrinter"});
  EXPECT_FALSE(Shown("fraAllAnnual"));
}

TEST_F(SeasonReport, ThreePlayersAreAll) {
  Open();
  auto season = Season();
  season.push_back(Figures(Night(13, "Hawks", "Lions", 31), 500, 40));
  WriteResults(kAResults, season);
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0", "click cmdPrinter"});
  EXPECT_EQ(Caption("lblAllAnnual"), "Print ALL 3 Players.");
}

TEST_F(SeasonReport, CopiesHaveToBeThere) {
  OpenPrinting();
  for (const char* copies : {"", "0", "abc", "-1"}) {
    Do(std::string("type txtNoC ") + copies);
    Do("click cmdBothOKHI");
    EXPECT_EQ(BoxTexts(), (TextList{"You must show NUMBER of COPIES to print!    "})) << copies;
    EXPECT_TRUE(Shown("picPrinter"));
  }
}

TEST_F(SeasonReport, PrintsTheSeasonFrom400Down) {
  OpenPrinting();
  Do("click cmdBothOKHI");
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 1U);
  const TextList words = pages[0].Words();
  EXPECT_EQ(words[0], "Hawks  (A Grade)  -  Winter 2004");
  EXPECT_EQ(words[1], "Season Report:   Al Hill");
  EXPECT_EQ(pages[0].texts[0].y, 400);
  const auto totals = std::find(words.begin(), words.end(), "SEASON TOTALS");
  ASSERT_NE(totals, words.end());
  EXPECT_EQ(TextList(totals + 1, totals + 13),
            (TextList{"Games", "Agg", "Shots", "180's", "100's", "Hi Scr", "Triples", "Doubles",
                      "Singles", "Pegs", "Hi Peg", "Avg"}));
  EXPECT_EQ(words.back(), "20.01");
  EXPECT_FALSE(Shown("picPrinter"));
}

TEST_F(SeasonReport, FiguresEndAtTheSameEdge) {
  OpenPrinting();
  Do("click cmdBothOKHI");
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 1U);
  // Letters of the 10 point font are 100 twips wide.
  EXPECT_EQ(pages[0].Find("1001").x + 400, pages[0].Find("900").x + 300);
  EXPECT_EQ(pages[0].Find("17/03/2004").x, pages[0].Find("31/03/2004").x);
}

TEST_F(SeasonReport, AllOfTheListArePrintedOneByOne) {
  OpenPrinting();
  DoAll({"click optYesAnnual", "click cmdBothOKHI"});
  const auto printed = EventsNamed("printed");
  ASSERT_EQ(printed.size(), 2U);
  EXPECT_EQ(PagesOf({printed[0]})[0].Words()[1], "Season Report:   Al Hill");
  EXPECT_EQ(PagesOf({printed[1]})[0].Words()[1], "Season Report:   Bo Hope");
  EXPECT_EQ(BoxTexts(), (TextList{"A L L    D O N E ! "}));
  EXPECT_EQ(Index("lstPlayers"), -1);
  EXPECT_FALSE(Shown("picPrinter"));
  EXPECT_TRUE(Shown("lstPlayers"));
}

// At 14 points a letter is 140 twips wide, and there is room for 11606 / 1.2 / 140 = 69 of them:
// the columns of totals take all 69, those of nights 57 and the longest opposition's.
TEST_F(SeasonReport, APlayerWhoCannotBePrintedHoldsNobodyElseUp) {
  WriteFile("FontName.qz3", "14,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  Open();
  auto season = Season();
  season[0].Opposition = std::string(13, 'W');
  WriteResults(kAResults, season);
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 1", "click cmdPrinter", "click optYesAnnual",
         "click cmdBothOKHI"});
  EXPECT_EQ(BoxTexts(),
            (TextList{"Font is too large, please re-select.    ", "A L L    D O N E ! "}));
  EXPECT_EQ(Count("killed"), 1);
  const auto printed = EventsNamed("printed");
  ASSERT_EQ(printed.size(), 1U);
  EXPECT_EQ(PagesOf({printed[0]})[0].Words()[1], "Season Report:   Bo Hope");
}

TEST_F(SeasonReport, ARunOfAllEndsInItsWordsEvenIfNobodyCouldBePrinted) {
  // KEPT: they say that all is done.
  WriteFile("FontName.qz3", "20,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  OpenPrinting();
  DoAll({"click optYesAnnual", "click cmdBothOKHI"});
  EXPECT_EQ(BoxTexts(),
            (TextList{"Font is too large, please re-select.    ",
                      "Font is too large, please re-select.    ", "A L L    D O N E ! "}));
  EXPECT_EQ(Count("printed"), 0);
  EXPECT_TRUE(Shown("lstPlayers"));
  EXPECT_EQ(Index("lstPlayers"), -1);
  EXPECT_FALSE(Shown("picPrinter"));
}

TEST_F(SeasonReport, ASingleFailureOfThePrinterCostsOnePlayerOfTheRun) {
  OpenPrinting();
  DoAll({"click optYesAnnual", "printer fail 5", "click cmdBothOKHI"});
  EXPECT_EQ(BoxTexts(), (TextList{"An unrecognised error occurred while trying to print.    ",
                                  "A L L    D O N E ! "}));
  const auto printed = EventsNamed("printed");
  ASSERT_EQ(printed.size(), 1U);
  EXPECT_EQ(PagesOf({printed[0]})[0].Words()[1], "Season Report:   Bo Hope");
}

TEST_F(SeasonReport, AFullPageIsRefused) {
  Open();
  WriteResults(kAResults, std::vector<ResultRecord>(60, Season()[0]));
  DoAll({"pick cboTeams =Hawks", "pick lstPlayers 0", "click cmdPrinter", "click cmdBothOKHI"});
  ASSERT_EQ(BoxTexts().size(), 1U);
  EXPECT_EQ(BoxTexts()[0].substr(0, 46), "Your selections will not fit on one page.   \rP");
  EXPECT_EQ(Count("killed"), 1);
}

TEST_F(SeasonReport, APrinterThatFailsIsTold) {
  for (int operation = 1; operation <= 60; operation += 7) {
    OpenPrinting();
    Do("printer fail " + std::to_string(operation));
    Do("click cmdBothOKHI");
    EXPECT_EQ(BoxTexts(), (TextList{"An unrecognised error occurred while trying to print.    "}))
        << operation;
    EXPECT_EQ(Count("killed"), 1);
    DoAll({"close frmAnnual", "close frmPMenu"});
  }
}

TEST_F(SeasonReport, LeavingWritesTheDateInHandAndClearsIt) {
  Lay();
  DoAll({"click imgPrinter", "click Image6", "pick cboResTeam =Hawks", "pick lstAllDates 0",
         "click cmdCancelWK", "click Image7"});
  EXPECT_EQ(InSession("WorkDate"), "2004-03-17");
  Do("click cmdCancelAnn");
  EXPECT_EQ(Front(), "frmPMenu");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-17#\r\n");
  EXPECT_EQ(InSession("WorkDate"), nullptr);
}

TEST_F(SeasonReport, EscLeavesThePanelFirst) {
  OpenPrinting();
  Do("key Esc");
  EXPECT_FALSE(Shown("picPrinter"));
  EXPECT_EQ(Front(), "frmAnnual");
  Do("key Esc");
  EXPECT_EQ(Front(), "frmPMenu");
}

TEST_F(SeasonReport, NoRecordIsWritten) {
  OpenPrinting();
  DoAll({"click optYesAnnual", "click cmdBothOKHI", "click cmdCancelAnn"});
  EXPECT_EQ(File(kLeagueFile), FileOf(LeaguePlayers()));
  EXPECT_EQ(File(kAResults), FileOf(Season()));
}

}  // namespace
}  // namespace marlowbeck
