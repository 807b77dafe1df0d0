#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

// The table up to a date, and the matches of that date.
class LadderTable : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams, ThreeRounds()); }
};

using Table = std::vector<Club::TextList>;

TEST_F(LadderTable, TheWorkedExample) {
  OpenLadder();
  EXPECT_EQ(Cells("grdLad"),
            (Table{{"Team", "Played", "Won", "Loss", "Draw", "For", "Against", "Percent", "Points",
                    "Adjust"},
                   {"Alpha", "3", "2", "1", "0", "16", "17", "94.12", "4", "0"},
                   {"Delta", "3", "1", "1", "1", "17", "15", "113.33", "3", "0"},
                   {"Bravo", "3", "2", "1", "0", "17", "16", "106.25", "3", "-1"},
                   {"Charlie", "3", "0", "2", "1", "15", "17", "88.24", "1", "0"}}));
  EXPECT_EQ(Caption("lblLadHeader"), "A PREMIERSHIP LADDER up to: Wednesday, 17 March 2004 ");
}

TEST_F(LadderTable, TheWorkedExampleUpToTheSecondDate) {
  OpenLadder();
  Do("pick lstTableDates =10/03/2004");
  EXPECT_EQ(Cells("grdLad"),
            (Table{{"Team", "Played", "Won", "Loss", "Draw", "For", "Against", "Percent", "Points",
                    "Adjust"},
                   {"Delta", "2", "1", "0", "1", "13", "8", "162.50", "3", "0"},
                   {"Alpha", "2", "1", "1", "0", "10", "12", "83.33", "2", "0"},
                   {"Bravo", "2", "1", "1", "0", "10", "12", "83.33", "2", "0"},
                   {"Charlie", "2", "0", "1", "1", "10", "11", "90.91", "1", "0"}}));
  EXPECT_EQ(InSession("LadderDate"), "2004-03-10");
  EXPECT_EQ(InSession("WorkDate"), "2004-03-10");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-17#\r\n");  // saved where the scores are entered
}

TEST_F(LadderTable, TheDatesAreListedAndTheLatestSelected) {
  OpenLadder();
  EXPECT_EQ(Lines("lstTableDates"), (TextList{"03/03/2004", "10/03/2004", "17/03/2004"}));
  EXPECT_EQ(Index("lstTableDates"), 2);
  EXPECT_EQ(Lines("cboTGrades"), TextList{"A"});
  EXPECT_EQ(Caption("lblSeason"), "Winter 2004");
  for (const char* shown : {"fraCmds", "grdLad", "grdWk", "lblLadHeader", "lblGameDetails"})
    EXPECT_TRUE(Shown(shown)) << shown;
}

TEST_F(LadderTable, TheMatchesOfTheDateStandBesideIt) {
  OpenLadder();
  EXPECT_EQ(Cells("grdWk"), (Table{{"Alpha", "6", " def ", "Charlie", "5"},
                                   {"Bravo", "7", " def ", "Delta", "4"}}));
  EXPECT_EQ(Caption("lblGameDetails"), "A    Wednesday, 17 March 2004 ");
  Do("pick lstTableDates 0");
  EXPECT_EQ(Cells("grdWk"), (Table{{"Alpha", "7", " def ", "Bravo", "4"},
                                   {"Charlie", "5", " drew ", "Delta", "5"}}));
}

TEST_F(LadderTable, TheTableIsWrittenToItsWorkFileInTheOrderOfTheLadder) {
  OpenLadder();
  EXPECT_EQ(File("ladder.qz3"),
            "\"Alpha\",3,2,1,0,16,17\r\n4,94,0\r\n"
            "\"Delta\",3,1,1,1,17,15\r\n3,113,0\r\n"
            "\"Bravo\",3,2,1,0,17,16\r\n3,106,-1\r\n"
            "\"Charlie\",3,0,2,1,15,17\r\n1,88,0\r\n");
}

TEST_F(LadderTable, AGradeWithoutMatchesShowsNoTable) {
  DeleteFile(kLadderOfA);
  OpenLadder();
  EXPECT_TRUE(Lines("lstTableDates").empty());
  for (const char* hidden : {"fraCmds", "grdLad", "grdWk", "lblLadHeader", "lblGameDetails"})
    EXPECT_FALSE(Shown(hidden)) << hidden;
  EXPECT_TRUE(Shown("fraHelpExit"));
}

TEST_F(LadderTable, AnotherGradeWithoutMatchesTakesTheTableAway) {
  std::vector<PlayerRecord> players = OnePlayerEach(kFourTeams);
  players.push_back(Player(9, "Archer", "Al", "Xerxes", "B"));
  WritePlayers("Winter.qza", players);
  WriteFile("Winter_B.qzs", "\"Winter B\"\r\n");
  OpenLadder();
  EXPECT_TRUE(Shown("fraCmds"));
  Do("pick cboTGrades =B");
  EXPECT_TRUE(Lines("lstTableDates").empty());
  for (const char* hidden : {"fraCmds", "grdLad", "grdWk", "lblLadHeader", "lblGameDetails"})
    EXPECT_FALSE(Shown(hidden)) << hidden;
}

TEST_F(LadderTable, ATeamThatHasNotPlayedStandsAtTheEndWithZeros) {
  LayGrade(*this, OnePlayerEach({"Alpha", "Bravo", "Idle"}), {MatchOn(3, "Bravo", 6, "Alpha", 0)});
  OpenLadder();
  EXPECT_EQ(Row("grdLad", 1),
            (TextList{"Bravo", "1", "1", "0", "0", "6", "0", "600.00", "2", "0"}));
  EXPECT_EQ(Row("grdLad", 3), (TextList{"Idle", "0", "0", "0", "0", "0", "0", "0.00", "0", "0"}));
}

TEST_F(LadderTable, PointsGivenStandWithAPlusSign) {
  LayGrade(*this, OnePlayerEach({"Alpha", "Bravo"}),
           {Adjusted(MatchOn(3, "Alpha", 6, "Bravo", 5), 2, -3)});
  OpenLadder();
  EXPECT_EQ(Row("grdLad", 1)[9], "+2");
  EXPECT_EQ(Row("grdLad", 2)[9], "-3");
  EXPECT_EQ(Row("grdLad", 2)[8], "-3");
}

TEST_F(LadderTable, AGradeIsPickedByItsName) {
  std::vector<PlayerRecord> players = OnePlayerEach(kFourTeams, "A");
  for (const PlayerRecord& player : OnePlayerEach({"Xerxes", "Yankee"}, "B")) {
    players.push_back(player);
  }
  WritePlayers("Winter.qza", players);
  WriteFile("Winter_B.qzi", kUsualRules);
  WriteFile("Winter_B.qzs", "\"Winter B\"\r\n");
  WriteFile("Winter_B.qzl", FileOf(std::vector{MatchOn(4, "Xerxes", 6, "Yankee", 5)}));
  OpenLadder();
  Do("pick cboTGrades =B");
  EXPECT_EQ(InSession("Grade"), "B");
  EXPECT_EQ(Caption("lblSeason"), "Winter B");
  EXPECT_EQ(Lines("lstTableDates"), TextList{"04/03/2004"});
  EXPECT_EQ(Caption("lblLadHeader"), "B PREMIERSHIP LADDER up to: Thursday, 4 March 2004 ");
  EXPECT_EQ(Cells("grdLad").size(), 3U);
}

TEST_F(LadderTable, AGradeWithoutATitleIsAskedForIt) {
  DeleteFile("Winter_A.qzs");
  OpenScores();
  DoAll({"input Winter Comp", "click cmdPL"});
  EXPECT_EQ(Count("input"), 1);
  EXPECT_EQ(Caption("lblSeason"), "Winter Comp");
  EXPECT_EQ(File("Winter_A.qzs"), "\"Winter Comp\"\r\n");
  EXPECT_EQ(Row("grdLad", 1)[0], "Alpha");
}

TEST_F(LadderTable, ATeamWithoutPlayersIsNotOnTheLadder) {
  LayGrade(*this, OnePlayerEach({"Alpha", "Bravo", "Charlie"}), ThreeRounds());
  OpenLadder();
  EXPECT_EQ(Cells("grdLad").size(), 4U);
  EXPECT_EQ(Row("grdWk", 1)[3], "Delta");
}

TEST_F(LadderTable, KeptATeamWithMoreThan327GamesIsAnOverflowAndNoTableShows) {
  LayGrade(*this, OnePlayerEach({"Alpha", "Bravo"}),
           {MatchOn(3, "Alpha", 327, "Bravo", 5), MatchOn(10, "Alpha", 1, "Bravo", 0)});
  OpenLadder();
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_FALSE(Shown("grdLad"));
  EXPECT_FALSE(Shown("lblLadHeader"));
  EXPECT_TRUE(Shown("grdWk"));
  Do("pick lstTableDates 0");
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Row("grdLad", 1)[7], "6540.00");
}

TEST_F(LadderTable, TheFontOfThePrinterIsRead) {
  WriteFile("FontName.qz3", "12,\"Liberation Serif\",#TRUE#,#FALSE#\r\n");
  OpenLadder();
  EXPECT_EQ(Caption("lblFont"), "Liberation Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 12pts.");
}

// What no program of ours wrote.
class LadderBadFiles : public LadderTable {};

TEST_F(LadderBadFiles, AFileCutInARecordHasItsWholeRecords) {
  WriteFile(kLadderOfA, FileOf(ThreeRounds()).substr(0, 80 * 4 + 33));
  OpenLadder();
  EXPECT_EQ(Lines("lstTableDates"), (TextList{"03/03/2004", "10/03/2004"}));
}

TEST_F(LadderBadFiles, DatesOutOfOrderAreListedAsTheyStandUntilTheFileIsSorted) {
  std::vector<LadderRecord> mixed = ThreeRounds();
  std::swap(mixed[1], mixed[4]);
  WriteFile(kLadderOfA, FileOf(mixed));
  OpenLadder();
  EXPECT_EQ(Lines("lstTableDates"),
            (TextList{"03/03/2004", "17/03/2004", "10/03/2004", "03/03/2004", "17/03/2004"}));
  DoAll({"click cmdSC", "click cmdPL"});
  EXPECT_EQ(Lines("lstTableDates"), (TextList{"03/03/2004", "10/03/2004", "17/03/2004"}));
  EXPECT_EQ(Row("grdLad", 1)[0], "Alpha");
}

TEST_F(LadderBadFiles, MatchesWithATimeOfDayAreNoneOfTheirDay) {
  LadderRecord match = MatchOn(17, "Alpha", 6, "Bravo", 5);
  match.GameDate.days += 0.75;
  WriteFile(kLadderOfA, FileOf(std::vector{match}));
  OpenLadder();
  EXPECT_EQ(Lines("lstTableDates"), TextList{"17/03/2004"});
  EXPECT_FALSE(Shown("grdWk")) << "no frame round nothing";
  EXPECT_EQ(Row("grdLad", 1)[1], "0");
}

TEST_F(LadderBadFiles, ADateOfNoCalendarEndsInTheErrorBox) {
  LadderRecord odd = MatchOn(17, "Alpha", 6, "Bravo", 5);
  odd.GameDate.days = 1e300;
  WriteFile(kLadderOfA, FileOf(std::vector{odd}));
  OpenLadder();
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  Do("click Command1");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(LadderBadFiles, NonsenseInEveryFieldEndsInNoWorseThanTheErrorBox) {
  HOLDS_FOR_MODELS_ALONE("the bytes are no concern of windows");
  for (int byte = 0; byte < 256; byte += 15) {
    SCOPED_TRACE(byte);
    WriteFile(kLadderOfA, FileOf(ThreeRounds()) + std::string(80, static_cast<char>(byte)));
    OpenScores();
    for (const char* line : {"pick lstDone 0", "click cmdCancelEdit", "click cmdPL", "click cmdSC",
                             "click cmdLast", "click cmdPrevDate", "click cmdFirst"}) {
      Try(line);
      EXPECT_LE(Errors().size(), 1U) << line;
    }
    Do("close frmLadder");
    EXPECT_EQ(Front(), "frmDB");
    // Whatever the bytes, no match of the file is lost.
    EXPECT_EQ(File(kLadderOfA).size(), 80U * 7);
  }
}

TEST_F(LadderBadFiles, RecordsOverTheLimitAreAnOverflow) {
  HOLDS_FOR_MODELS_ALONE("the limit is a matter of files");
  WriteFile(kLadderOfA, std::string(std::size_t{80} * 32768, ' '));
  OpenScores();
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_EQ(Front(), "frmLadder");
}

}  // namespace
}  // namespace marlowbeck
