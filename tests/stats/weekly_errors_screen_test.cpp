#include "stats/reports.h"

namespace marlowbeck {
namespace {

// What cannot be worked out, read or written, and what the screen shows then.
using WeeklyErrors = ReportsTest;
using TextList = Club::TextList;

/// Two nights of the Rovers, of which the second has a row that cannot be put in order.
std::vector<ResultRecord> WithoutShotsOnTheSecondNight() {
  return {Night(1, "Rovers", "Hawks", kFirstNight, 100, 10),
          Night(2, "Rovers", "Hawks", kFirstNight, 90, 10),
          Night(1, "Rovers", "Swifts", kSecondNight, 0, 0),
          Night(2, "Rovers", "Swifts", kSecondNight, 90, 10)};
}

std::vector<PlayerRecord> TwoRovers() {
  return {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")};
}

TEST_F(WeeklyErrors, ARowWithoutShotsIsADivisionByZeroAndTheNextPickWorks) {
  Lay(TwoRovers(), WithoutShotsOnTheSecondNight());
  OpenWeekly();
  EXPECT_EQ(Errors(), (std::vector<int>{11}));
  EXPECT_EQ(BoxTexts(), (TextList{"DIVISION BY ZERO    "}));
  EXPECT_TRUE(Shown("fraWeek"));
  Do("pick lstAllDates 0");
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Row("grdWeek", 1)[0], "Archer, Jo");
}

TEST_F(WeeklyErrors, ADateThatCannotBeShownEndsInTheErrorBoxAndTheNextTeamWorks) {
  Lay({Person(1, "Archer", "Jo", "Hawks", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {Night(1, "Hawks", "Rovers", 1e300, 100, 10),
       Night(2, "Rovers", "Hawks", kFirstNight, 90, 10)});
  OpenWeekly();
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_FALSE(Shown("fraWkProg"));
  Do("pick cboResTeam =Rovers");
  EXPECT_EQ(Row("grdWeek", 1)[0], "Baker, Al");
}

TEST_F(WeeklyErrors, OverAThousandRowsAreASubscriptFailure) {
  HOLDS_FOR_MODELS_ALONE("a thousand rows take long to be read back from windows");
  Lay({Person(1, "Archer", "Jo", "Rovers", "A")},
      std::vector<ResultRecord>(1001, Night(1, "Rovers", "Hawks", kFirstNight, 100, 10)));
  OpenWeekly();
  EXPECT_EQ(Errors(), (std::vector<int>{9}));
}

TEST_F(WeeklyErrors, AFileCutInsideARecordReportsTheWholeOnes) {
  LayRovers();
  WriteFile("Winter_A.qzr", File("Winter_A.qzr").substr(0, 148 * 2 + 70));
  OpenWeekly();
  EXPECT_EQ(Lines("lstAllDates"), (TextList{"17/03/2004"}));
}

TEST_F(WeeklyErrors, AnEmptyResultsFileHasNoResults) {
  LayRovers();
  WriteFile("Winter_A.qzr", "");
  OpenWeekly();
  EXPECT_TRUE(Shown("lblNoneFound"));
}

TEST_F(WeeklyErrors, ResultsOverTheLimitAreAnOverflow) {
  HOLDS_FOR_MODELS_ALONE("the limit is a matter of files");
  LayRovers();
  WriteFile("Winter_A.qzr", std::string(std::size_t{148} * 32768, ' '));
  OpenWeekly();
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_EQ(Front(), "frmPMenu");
}

TEST_F(WeeklyErrors, NonsenseInEveryFieldEndsInNoWorseThanTheErrorBox) {
  HOLDS_FOR_MODELS_ALONE("the bytes are no concern of windows");
  LayRovers();
  const std::string players = File("Winter.qza");
  for (int byte = 0; byte < 256; byte += 15) {
    WriteFile("Winter_A.qzr", File("Winter_A.qzr") + std::string(148, static_cast<char>(byte)));
    WriteFile("Winter.qza", players + std::string(156, static_cast<char>(byte)));
    Do("input A title for the grade of that name");
    OpenWeekly();
    EXPECT_LE(Errors().size(), 1U) << byte;
    Do("forget");
    Do("click cmdCancelWK");
    Do("click Image10");
  }
}

TEST_F(WeeklyErrors, TheSeasonHasItsTitleWhateverBecameOfTheFirstNight) {
  Lay(TwoRovers(), WithoutShotsOnTheSecondNight());
  OpenWeekly();
  EXPECT_EQ(Errors(), (std::vector<int>{11}));
  EXPECT_EQ(Caption("lblSeason1"), "Winter 2004");
  EXPECT_EQ(Caption("lblSeason"), "Winter 2004");
  EXPECT_EQ(InSession("SeasonDescription"), "Winter 2004");
}

TEST_F(WeeklyErrors, ANightThatCannotBeWorkedOutLeavesBlankTables) {
  Lay(TwoRovers(), WithoutShotsOnTheSecondNight());
  OpenWeekly();
  Do("pick lstAllDates 0");
  ASSERT_EQ(Cells("grdWeek").size(), 3U);
  ASSERT_EQ(Cells("grdProg").size(), 3U);
  const TextList headings = Row("grdWeek", 0);
  Do("pick lstAllDates 1");
  EXPECT_EQ(Errors(), (std::vector<int>{11}));
  EXPECT_EQ(Cells("grdWeek"),
            (std::vector<TextList>{headings, TextList(10, ""), TextList(10, "")}));
  ASSERT_EQ(Cells("grdProg").size(), 3U);
  EXPECT_EQ(Row("grdProg", 1), TextList(10, " "));
  EXPECT_EQ(Row("grdProg", 2), TextList(10, " "));
  for (const char* grid : {"grdWeek", "grdProg"}) EXPECT_TRUE(Shown(grid)) << grid;
}

TEST_F(WeeklyErrors, NothingTellsOfTheNightBefore) {
  Lay(TwoRovers(), WithoutShotsOnTheSecondNight());
  OpenWeekly();
  Do("pick lstAllDates 0");
  EXPECT_EQ(Caption("lblDT"), "17/03/2004 (v's Hawks)");
  Do("pick lstAllDates 1");
  for (const char* label : {"lblOpp", "lblDT", "lblProgInfo"})
    EXPECT_EQ(Caption(label), "") << label;
  EXPECT_EQ(Caption("cmdChangeDate"), "Change Game Date : ");
}

TEST_F(WeeklyErrors, TheAnswerToTheQuestionBringsNoOtherTeamBack) {
  Lay({Person(1, "Archer", "Jo", "Hawks", "A"), Person(2, "Baker", "Al", "Rovers", "A"),
       Person(3, "Clark", "Ed", "Rovers", "A")},
      {Night(1, "Hawks", "Rovers", kFirstNight, 100, 10),
       ForfeitNight(1, "Hawks", "Owls", kSecondNight),
       Night(2, "Rovers", "Hawks", kFirstNight, 0, 0),
       Night(3, "Rovers", "Hawks", kFirstNight, 90, 10)});
  OpenWeekly();
  EXPECT_TRUE(Shown("fraFFYesNo"));
  EXPECT_EQ(Row("grdProg", 1)[0], "Archer, Jo");
  Do("pick cboResTeam =Rovers");
  EXPECT_EQ(Errors(), (std::vector<int>{11}));
  Do("click optFFno");
  EXPECT_FALSE(Shown("grdProg"));
  for (const TextList& row : Cells("grdProg")) EXPECT_NE(row[0], "Archer, Jo");
}

TEST_F(WeeklyErrors, AnOlderHandOverIsNotReadAfterAFailure) {
  Lay(TwoRovers(), WithoutShotsOnTheSecondNight());
  OpenWeekly();
  Do("pick lstAllDates 0");
  const std::string older =
      "\"Ghost, A\",505,20,0,0,0\r\n0,0,0,0,0,0\r\n\"Ghost, B\",1,1,0,0,0\r\n0,0,0,0,0,0\r\n";
  WriteFile("weekly.qz3", older);
  Do("pick lstAllDates 1");
  EXPECT_EQ(Errors(), (std::vector<int>{11}));
  EXPECT_EQ(File("weekly.qz3"), older);
  EXPECT_EQ(Row("grdWeek", 1), TextList(10, ""));
}

TEST_F(WeeklyErrors, ASeasonThatCannotBeWorkedOutLeavesTheNightStanding) {
  LayRovers();
  OpenWeekly();
  Do("pick lstAllDates 0");
  // Written in turn: weekly.qz3, progweek.qz3.
  Do("fault write 2 61");
  Do("pick lstAllDates 1");
  Do("fault off");
  EXPECT_EQ(Errors(), (std::vector<int>{61}));
  EXPECT_EQ(Caption("lblDT"), "24/03/2004 (v's Swifts)");
  EXPECT_EQ(Row("grdWeek", 1)[0], "Archer, Jo");
  EXPECT_EQ(Row("grdProg", 1), TextList(10, " "));
  EXPECT_EQ(Caption("lblProgInfo"), "");
  Do("pick lstAllDates 1");
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Row("grdProg", 1)[0], "Baker, Al");
}

}  // namespace
}  // namespace marlowbeck
