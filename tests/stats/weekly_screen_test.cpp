#include "stats/reports.h"

namespace marlowbeck {
namespace {

using WeeklyReport = ReportsTest;
using TextList = Club::TextList;

TEST_F(WeeklyReport, OpensOnTheFirstTeamsLatestNight) {
  LayRovers();
  OpenWeekly();
  EXPECT_EQ(Title("frmPMenu"), "[Marlowbeck] Weekly Results");
  EXPECT_EQ(Caption("fraWeek"), "Team Results");
  EXPECT_FALSE(Shown("fraMenu"));
  for (const char* shown : {"fraWeek", "fraWkProg", "fraFontPick", "cmdChangeDate"}) {
    EXPECT_TRUE(Shown(shown)) << shown;
  }
  EXPECT_EQ(Text("cboResGrade"), "A");
  EXPECT_EQ(Text("cboResTeam"), "Rovers");
  EXPECT_EQ(Lines("lstAllDates"), (TextList{"17/03/2004", "24/03/2004"}));
  EXPECT_EQ(Index("lstAllDates"), 1);
  EXPECT_EQ(Caption("lblSeason1"), "Winter 2004");
  EXPECT_EQ(Caption("lblOpp"), "Rovers  (A)");
  EXPECT_EQ(Caption("lblDT"), "24/03/2004 (v's Swifts)");
  EXPECT_EQ(Caption("cmdChangeDate"), "Change Game Date: 24/03/2004");
  EXPECT_EQ(InSession("ReportChoice"), 6);
  EXPECT_EQ(InSession("WorkDate"), "2004-03-24");
  EXPECT_EQ(InSession("DateCount"), 2);
  EXPECT_TRUE(Enabled("cmdPrintLad"));
  EXPECT_TRUE(Enabled("cmdClipWeek"));
  EXPECT_FALSE(Shown("lblNoneFound"));
}

TEST_F(WeeklyReport, ComputesTheFirstNightOnlyOnce) {
  HOLDS_FOR_MODELS_ALONE("counts the files of one face");
  LayRovers();
  OpenReports();
  Do("fault count");
  const int before = Do("fault count")["operations"]["open"];
  Do("click Image6");
  // Grades; teams; dates; the night's results and players, its file written and read; the season's
  // players and results, its file; the forfeits choice read, written; the season's title.
  const int opened = Do("fault count")["operations"]["open"].get<int>() - before;
  EXPECT_LE(opened, 15);
}

TEST_F(WeeklyReport, HeadingsStandOnTwoLinesWithTheGamesNames) {
  LayRovers();
  WriteFile("GameName.qz3", "Teams\r\nPairs\r\nAlone\r\nTms\r\nPrs\r\nAln\r\n");
  OpenWeekly();
  EXPECT_EQ(Row("grdWeek", 0),
            (TextList{"\rPlayer", "\rAgg", "\rShots", "\r180's", "\r100's", "High\rScore",
                      "Teams\rPegs", "Pairs\rPegs", "Alone\rPegs", "\rAvg"}));
  EXPECT_EQ(Row("grdProg", 0), (TextList{"\rPlayer", "\rAgg", "\rShots", "\r180's", "\r100's",
                                         "High\rScore", "\rPegs", "High\rPeg", "\rGms", "\rAvg"}));
}

TEST_F(WeeklyReport, ANightWithOnePlayerHasOneRow) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A")},
      {Night(1, "Rovers", "Hawks", kFirstNight, 24999, 1000)});
  OpenWeekly();
  ASSERT_EQ(Cells("grdWeek").size(), 2U);
  EXPECT_EQ(Row("grdWeek", 1),
            (TextList{"Archer, Jo", "24999", "1000", "", "", "", "", "", "", "24.99"}));
}

TEST_F(WeeklyReport, AForfeitShowsItsStarAndWhateverItsRecordHolds) {
  ResultRecord forfeit = ForfeitNight(2, "Rovers", "Hawks", kFirstNight);
  forfeit.Scores180 = 1;
  forfeit.Centuries = 2;
  forfeit.HighScore = 90;
  forfeit.Pegs = {57, 121, 0, 121, 8, 0};
  Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {forfeit, Night(1, "Rovers", "Hawks", kFirstNight, 11, 10)});
  OpenWeekly();
  EXPECT_EQ(Row("grdWeek", 1)[0], "Archer, Jo");
  EXPECT_EQ(Row("grdWeek", 2),
            (TextList{"Baker, Al *", "Forfeit", "Win", "1", "2", "90", "57, 121", "121", "8", ""}));
  // The record itself is as it was.
  EXPECT_EQ(Results("Winter_A.qzr")[0].Aggregate, 0);
}

TEST_F(WeeklyReport, AnAggregateOfOneHasNoAverage) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A")},
      {Night(1, "Rovers", "Hawks", kFirstNight, 1, 30)});
  OpenWeekly();
  EXPECT_EQ(Row("grdWeek", 1), (TextList{"Archer, Jo", "1", "30", "", "", "", "", "", "", ""}));
}

TEST_F(WeeklyReport, AResultWhosePlayerIsGoneDoesNotStopTheReport) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A")},
      {Night(1, "Rovers", "Hawks", kFirstNight, 100, 10),
       Night(9, "Rovers", "Hawks", kFirstNight, 100, 10)});
  OpenWeekly();
  EXPECT_EQ(Cells("grdWeek").size(), 2U);
  EXPECT_EQ(InSession("Opposition"), "");
  EXPECT_EQ(Caption("lblDT"), "17/03/2004 (v's )");
}

TEST_F(WeeklyReport, NamesWithQuotesAndCommasAreShownWhole) {
  Lay({Person(1, "O\"Brien", "Al \"Ace\", Jr", "Rovers", "A"), Person(2, "", "", "Rovers", "A")},
      {Night(1, "Rovers", "Hawks", kFirstNight, 100, 10),
       Night(2, "Rovers", "Hawks", kFirstNight, 50, 10)});
  OpenWeekly();
  EXPECT_EQ(Row("grdWeek", 1)[0], "O\"Brien, Al \"Ace\", Jr");
  EXPECT_EQ(Row("grdWeek", 2)[0], ", ");
}

TEST_F(WeeklyReport, AStarAtTheEndOfANameStaysTakenForAForfeit) {
  Lay({Person(1, "Archer", "Jo*", "Rovers", "A")},
      {Night(1, "Rovers", "Hawks", kFirstNight, 100, 10)});
  OpenWeekly();
  EXPECT_EQ(Row("grdWeek", 1)[1], "Forfeit");
}

TEST_F(WeeklyReport, TheHandOverHoldsTwoLinesARow) {
  LayRovers();
  OpenWeekly();
  EXPECT_EQ(File("weekly.qz3"),
            "\"Archer, Jo\",505,20,0,0,0\r\n0,0,0,0,0,0\r\n"
            "\"Baker, Al *\",1,1,0,0,0\r\n0,0,0,0,0,0\r\n");
}

TEST_F(WeeklyReport, AnotherDateShowsAnotherNight) {
  LayRovers();
  OpenWeekly();
  Do("pick lstAllDates 0");
  EXPECT_EQ(Caption("lblDT"), "17/03/2004 (v's Hawks)");
  EXPECT_EQ(Row("grdWeek", 1)[0], "Baker, Al");
  EXPECT_EQ(Row("grdWeek", 2)[0], "Archer, Jo");
  Do("focus lstAllDates");
  Do("key Down");
  EXPECT_EQ(Caption("lblDT"), "24/03/2004 (v's Swifts)");
}

TEST_F(WeeklyReport, TheDatePickedIsTheWorkDateAfterLeaving) {
  LayRovers();
  OpenWeekly();
  Do("pick lstAllDates 0");
  Do("click cmdCancelWK");
  EXPECT_EQ(Title("frmPMenu"), "[Marlowbeck] Reports");
  Do("click Image10");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-17#\r\n");
}

TEST_F(WeeklyReport, ATeamWithoutResultsSaysSoUntilOneWithResultsIsPicked) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Hawks", "A")},
      {Night(1, "Rovers", "Swifts", kFirstNight, 100, 10)});
  OpenWeekly();
  EXPECT_EQ(Text("cboResTeam"), "Hawks");
  EXPECT_TRUE(Shown("lblNoneFound"));
  EXPECT_EQ(Caption("lblNoneFound"), "  No results found for: \r Hawks,  A.  ");
  for (const char* shown : {"fraWeek", "fraWkProg", "fraFontPick"})
    EXPECT_TRUE(Shown(shown)) << shown;
  EXPECT_FALSE(Shown("cmdChangeDate"));
  EXPECT_FALSE(Enabled("cmdPrintLad"));
  EXPECT_FALSE(Enabled("cmdClipWeek"));
  Do("pick cboResTeam 1");
  EXPECT_FALSE(Shown("lblNoneFound"));
  EXPECT_TRUE(Shown("fraWkProg"));
  EXPECT_TRUE(Enabled("cmdPrintLad"));
  Do("pick cboResTeam 0");
  EXPECT_TRUE(Shown("lblNoneFound"));
  EXPECT_FALSE(Shown("fraWkProg")) << "only the way in shows empty tables";
}

TEST_F(WeeklyReport, AnotherGradeReadsItsOwnFiles) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Hawks", "B")},
      {Night(1, "Rovers", "Swifts", kFirstNight, 100, 10)});
  WriteResults("Winter_B.qzr", {Night(2, "Hawks", "Owls", kSecondNight, 90, 10)});
  OpenWeekly();
  Do("pick cboResGrade =B");
  EXPECT_EQ(Lines("cboResTeam"), (TextList{"Hawks"}));
  EXPECT_EQ(Caption("lblOpp"), "Hawks  (B)");
  EXPECT_EQ(Row("grdWeek", 1)[0], "Baker, Al");
}

TEST_F(WeeklyReport, AnEmptyGradeAndABlankTeamAreReportedLikeAnyOther) {
  WritePlayers("Winter.qza", {Person(1, "Archer", "Jo", "", "")});
  WriteResults("Winter_.qzr", {Night(1, "", "Hawks", kFirstNight, 100, 10)});
  WriteFile("Winter_.qzs", "\"Winter\"\r\n");
  NameOpenFile("Winter.qza");
  OpenWeekly();
  EXPECT_EQ(Caption("lblOpp"), "  ()");
  EXPECT_EQ(Row("grdWeek", 1)[0], "Archer, Jo");
}

TEST_F(WeeklyReport, ASeasonWithoutATitleIsAskedForOne) {
  LayRovers();
  DeleteFile("Winter_A.qzs");
  OpenReports();
  Do("input Summer 2005");
  Do("click Image6");
  EXPECT_EQ(Caption("lblSeason1"), "Summer 2005");
  EXPECT_EQ(File("Winter_A.qzs"), "\"Summer 2005\"\r\n");
}

TEST_F(WeeklyReport, TheTitleStaysThatOfTheFirstGradeWhenAnotherIsPicked) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Hawks", "B")}, {});
  WriteFile("Winter_B.qzs", "\"Winter of the others\"\r\n");
  OpenWeekly();
  EXPECT_EQ(Caption("lblSeason"), "Winter 2004");
  Do("pick cboResGrade =B");
  EXPECT_EQ(Caption("lblSeason1"), "Winter 2004");
  EXPECT_EQ(InSession("SeasonDescription"), "Winter 2004");
}

TEST_F(WeeklyReport, AnyKeyThatComesUpInTheListOfDatesShowsTheNightAgain) {
  LayRovers();
  OpenWeekly();
  Do("focus lstAllDates");
  EXPECT_EQ(Row("grdWeek", 1)[1], "505");
  for (const auto& [key, aggregate] : {std::pair{"Down", 510}, {"Enter", 520}, {"F1", 530}}) {
    // On the last line already, so that the key moves nothing.
    WriteResults("Winter_A.qzr", {Night(1, "Rovers", "Hawks", kFirstNight, 500, 20),
                                  Night(1, "Rovers", "Swifts", kSecondNight,
                                        static_cast<std::int16_t>(aggregate), 20)});
    Do(std::string("key ") + key);
    EXPECT_EQ(Index("lstAllDates"), 1) << key;
    EXPECT_EQ(Row("grdWeek", 1)[1], std::to_string(aggregate)) << key;
  }
}

TEST_F(WeeklyReport, WithoutAGradeNothingIsListed) {
  LayRovers();
  OpenReports();
  WriteFile("Winter.qza", "");
  Do("click Image6");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_TRUE(EventsNamed("input").empty()) << "there is no season to ask for a title of";
  for (const char* list : {"cboResGrade", "cboResTeam", "lstAllDates"}) {
    EXPECT_EQ(Lines(list), TextList{}) << list;
  }
  EXPECT_EQ(Caption("lblSeason1"), "");
  for (const char* hidden : {"cmdChangeDate", "lblNoneFound"})
    EXPECT_FALSE(Shown(hidden)) << hidden;
  EXPECT_FALSE(Enabled("cmdPrintLad"));
  EXPECT_FALSE(Enabled("cmdClipWeek"));
}

TEST_F(WeeklyReport, WhenTheLastGradeHasGoneNothingOfItIsListedAnyMore) {
  LayRovers();
  OpenWeekly();
  Do("click cmdCancelWK");
  WriteFile("Winter.qza", "");
  Do("click Image6");
  for (const char* list : {"cboResGrade", "cboResTeam", "lstAllDates"}) {
    EXPECT_EQ(Lines(list), TextList{}) << list;
  }
  EXPECT_EQ(Text("cboResTeam"), "");
  EXPECT_FALSE(Shown("cmdChangeDate"));
  EXPECT_TRUE(Shown("fraWkProg"));
  EXPECT_EQ(Cells("grdWeek").at(1).at(0), "");
  EXPECT_EQ(Caption("lblOpp"), "");
  EXPECT_FALSE(Enabled("cmdPrintLad"));
  EXPECT_FALSE(Enabled("cmdClipWeek"));
}

TEST_F(WeeklyReport, ADoubleClickOnANameHandsTheScoreOver) {
  LayRovers();
  OpenWeekly();
  Do("dblcell grdWeek 1 0");
  EXPECT_EQ(File("qzEdScor.qz3"),
            "\"A\"\r\n\"Rovers\"\r\n\"Swifts\"\r\n\"24/03/2004\"\r\n\"Archer, Jo\"\r\n");
  EXPECT_EQ(Front(), "frmEdScore");
}

TEST_F(WeeklyReport, ADoubleClickElsewhereDoesNothing) {
  LayRovers();
  OpenWeekly();
  Do("dblcell grdWeek 1 1");
  Do("dblcell grdWeek 0 0");
  EXPECT_FALSE(HasFile("qzEdScor.qz3"));
}

TEST_F(WeeklyReport, ChangeGameDateHandsDateAndTeamOver) {
  LayRovers();
  OpenWeekly();
  Do("pick lstAllDates 0");
  Do("click cmdChangeDate");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-17#\r\n");
  EXPECT_EQ(File("dc.qz3"), "\"Rovers\"\r\n");
  EXPECT_EQ(Front(), "frmChangeDate");
}

TEST_F(WeeklyReport, HelpOpensItsTopic) {
  LayRovers();
  OpenWeekly();
  Do("click cmdPlrResExit");
  EXPECT_EQ(EventsNamed("help")[0], (Json{{"file", "qz1.HLP"}, {"topic", 245}}));
}

TEST_F(WeeklyReport, CaptionsOfTheCommands) {
  LayRovers();
  OpenReports();
  EXPECT_EQ(Caption("cmdChangeDate"), "Change Game Date : ");
  EXPECT_EQ(Caption("cmdPrintLad"), "Print");
  EXPECT_EQ(Caption("cmdClipWeek"), "Copy to Clipboard");
  EXPECT_EQ(Caption("cmdPlrResExit"), "Help");
  EXPECT_EQ(Caption("cmdCancelWK"), "Exit");
  EXPECT_EQ(Caption("Label13"), "Include Forfeits in All Games Played in Progressive Details ?");
}

}  // namespace
}  // namespace marlowbeck
