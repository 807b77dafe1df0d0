// The second layer: a team, its players, and the side that it meets.

#include "support/league.h"

namespace marlowbeck {
namespace {

class TeamsAndPlayers : public ScoreSheets {};

TEST_F(TeamsAndPlayers, ATeamPickedListsItsPlayersInTheOrderOfTheFile) {
  OpenTeam("Rovers");
  EXPECT_EQ(Lines("lstResPlayers"), (TextList{"Reed,  Jo", "Rudd,  Ann"}));
  EXPECT_TRUE(Lines("lstFinished").empty());
  EXPECT_EQ(Caption("lblPlayerList"), "Rovers\rPlayers");
  EXPECT_EQ(Caption("lblEntered"), "");
  EXPECT_EQ(Caption("lblHeader(2)"), "ROVERS  v's  CUBS");
}

TEST_F(TeamsAndPlayers, TheFirstFreeOppositionComesUp) {
  OpenTeam("Hawks");
  EXPECT_EQ(Lines("cboOpp"), (TextList{"Cubs", "Lions", "Rovers"}));
  EXPECT_EQ(Text("cboOpp"), "Cubs");
  EXPECT_TRUE(Enabled("cboOpp"));
}

TEST_F(TeamsAndPlayers, AnotherOppositionChangesTheHeading) {
  OpenTeam("Hawks");
  Do("pick cboOpp =Rovers");
  EXPECT_EQ(Caption("lblHeader(2)"), "HAWKS  v's  ROVERS");
  EXPECT_EQ(Caption("panChangeOpp"), " Change Opposition from Rovers ");
}

TEST_F(TeamsAndPlayers, ATeamWithAResultOfTheDateShowsItsOppositionGreyed) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions")});
  OpenTeam("Hawks");
  EXPECT_EQ(Text("cboOpp"), "Lions");
  EXPECT_FALSE(Enabled("cboOpp"));
  EXPECT_EQ(Lines("cboOpp"), (TextList{"Cubs", "Rovers"}));
  EXPECT_EQ(Caption("lblHeader(2)"), "HAWKS  v's  LIONS");
}

TEST_F(TeamsAndPlayers, TheOtherSideShowsItGreyedToo) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions")});
  OpenTeam("Lions");
  EXPECT_EQ(Text("cboOpp"), "Hawks");
  EXPECT_FALSE(Enabled("cboOpp"));
}

TEST_F(TeamsAndPlayers, AResultOfAnotherDateBindsNobody) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions", 24)});
  OpenTeam("Hawks");
  EXPECT_EQ(Text("cboOpp"), "Cubs");
  EXPECT_TRUE(Enabled("cboOpp"));
}

TEST_F(TeamsAndPlayers, TheSwapIsOfferedOnTheSideThatEnteredWhileATeamIsFree) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions")});
  OpenTeam("Hawks");
  EXPECT_TRUE(Shown("panChangeOpp"));
  EXPECT_EQ(Caption("panChangeOpp"), " Change Opposition from Lions ");
  EXPECT_EQ(Caption("panAddNames"), " Add Players to Hawks ");
  Do("pick cboResTeam =Lions");
  EXPECT_FALSE(Shown("panChangeOpp"));
  EXPECT_EQ(Caption("panAddNames"), " Add Players to Lions ");
}

TEST_F(TeamsAndPlayers, TheSwapIsNotOfferedWhereNoTeamIsFree) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions"), Night(31, "Cubs", "Rovers")});
  OpenTeam("Hawks");
  EXPECT_EQ(Text("cboOpp"), "Lions");
  EXPECT_FALSE(Shown("panChangeOpp"));
}

TEST_F(TeamsAndPlayers, EnteredPlayersStandInTheOtherList) {
  WriteResults(kAResults, {Night(12, "Hawks", "Lions"), Night(11, "Hawks", "Lions")});
  OpenTeam("Hawks");
  EXPECT_EQ(Lines("lstFinished"), (TextList{"Hill,  Al", "Hope,  Bo"}));
  EXPECT_EQ(Caption("lblEntered"), "Entered Players = 2  [Click to Edit]");
  EXPECT_EQ(Lines("lstResPlayers").size(), 6U);
}

TEST_F(TeamsAndPlayers, APlayerWithTwoResultsStandsTwiceAmongTheEntered) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions"), Night(11, "Hawks", "Lions")});
  OpenTeam("Hawks");
  EXPECT_EQ(Lines("lstFinished"), (TextList{"Hill,  Al", "Hill,  Al"}));
  EXPECT_EQ(Caption("lblEntered"), "Entered Players = 2  [Click to Edit]");
}

TEST_F(TeamsAndPlayers, InAnOddGradeTheLastTeamOfAFullDateCannotPlay) {
  WriteResults(kBResults, {Night(41, "Bees", "Crows")});
  OpenTeam("Ducks", "B Grade");
  EXPECT_EQ(TheBox(), "Ducks Team cannot play.\r\rNo available opposition teams.");
  EXPECT_EQ(Boxes().front().style, 48);
  EXPECT_FALSE(Enabled("lstResPlayers"));
  EXPECT_EQ(Text("cboOpp"), "");
  EXPECT_EQ(Caption("lblHeader(2)"), "");
  EXPECT_FALSE(Shown("panChangeOpp"));
}

TEST_F(TeamsAndPlayers, ATeamThatCanPlayEnablesTheListAgain) {
  WriteResults(kBResults, {Night(41, "Bees", "Crows")});
  OpenTeam("Ducks", "B Grade");
  Do("pick cboResTeam =Bees");
  EXPECT_TRUE(Enabled("lstResPlayers"));
  EXPECT_EQ(Text("cboOpp"), "Crows");
}

TEST_F(TeamsAndPlayers, InAnEvenGradeTheListStaysAsItWasAndABlankOppositionIsSaved) {
  // Three teams of the grade are named by the date, so that the fourth finds nobody.
  WriteResults(kAResults, {Night(31, "Cubs", "Lions"), Night(1, "Rovers", "Gone")});
  OpenTeam("Hawks");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Text("cboOpp"), "");
  EXPECT_EQ(Caption("lblHeader(2)"), "");
  EXPECT_TRUE(Enabled("lstResPlayers"));
  SaveGoodSheet("Hill,  Al");
  ASSERT_EQ(Saved().size(), 3U);
  EXPECT_EQ(Trim(Saved()[2].Opposition), "");
}

TEST_F(TeamsAndPlayers, AnOppositionThatIsNoTeamOfTheGradeAnyMoreIsStillShown) {
  WriteResults(kAResults, {Night(11, "Hawks", "Eagles")});
  OpenTeam("Hawks");
  EXPECT_EQ(Text("cboOpp"), "Eagles");
  EXPECT_FALSE(Enabled("cboOpp"));
  EXPECT_EQ(Lines("lstFinished"), TextList{"Hill,  Al"});
}

TEST_F(TeamsAndPlayers, NamesWithCommasAndQuotesComeBackAsTheyAre) {
  WritePlayers(kLeagueFile, {Player(1, "O'Dea, Jr", "\"Ace\"", "Nags, Old", "A Grade"),
                             Player(2, "Hill", "Al", "The \"Hawks\"", "A Grade")});
  OpenTeam("Nags, Old");
  SaveGoodSheet("O'Dea, Jr,  \"Ace\"");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Trim(Saved()[0].Team), "Nags, Old");
  EXPECT_EQ(Trim(Saved()[0].Opposition), "The \"Hawks\"");
  EXPECT_EQ(Lines("lstFinished"), TextList{"O'Dea, Jr,  \"Ace\""});
}

class SixPlayers : public ScoreSheets {
 protected:
  void Enter(int players) {
    std::vector<ResultRecord> results;
    for (int i = 0; i < players; ++i) results.push_back(Night(11 + i, "Hawks", "Lions"));
    WriteResults(kAResults, results);
    OpenTeam("Hawks");
  }
  const std::string words =
      "6 Players have been entered.\rAre you sure you need to\renter more than 6 results?";
};

TEST_F(SixPlayers, TheSixthGoesOnUnasked) {
  Enter(5);
  Do("pick lstResPlayers 0");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_TRUE(Shown("fraResults"));
}

TEST_F(SixPlayers, TheSeventhIsAskedForAndNoEndsThere) {
  Enter(6);
  DoAll({"answer no", "pick lstResPlayers 0"});
  EXPECT_EQ(TheBox(), words);
  EXPECT_EQ(Boxes().front().style, 68);
  EXPECT_FALSE(Shown("fraResults"));
}

TEST_F(SixPlayers, AYesGoesOnAndTheEighthIsAskedForAgain) {
  Enter(6);
  DoAll({"answer yes", "pick lstResPlayers 0"});
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
  TypeInto(GoodSheet());
  Do("click cmdSave");
  EXPECT_EQ(Lines("lstFinished").size(), 7U);
  DoAll({"answer no", "pick lstResPlayers 0"});
  EXPECT_EQ(TheBox(), words);
}

TEST_F(SixPlayers, ForfeitsCountToo) {
  std::vector<ResultRecord> results;
  for (int i = 0; i < 6; ++i) {
    results.push_back(Night(11 + i, "Hawks", "Lions"));
    results.back().Forfeit = "F";
  }
  WriteResults(kAResults, results);
  OpenTeam("Hawks");
  DoAll({"answer no", "pick lstResPlayers 0"});
  EXPECT_EQ(TheBox(), words);
}

class ConflictOnTheDate : public ScoreSheets {};

TEST_F(ConflictOnTheDate, InTheMiddleOfTheFileEndsInTheErrorBox) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions"), Night(12, "Hawks", "Rovers"),
                           Night(31, "Cubs", "Gone")});
  OpenTeam("Hawks");
  Do("pick lstResPlayers 1");
  EXPECT_EQ(TheBox(), "BAD FILE NAME OR NUMBER    ");
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_EQ(InSession("Quiet"), false);
}

TEST_F(ConflictOnTheDate, InTheLastRecordOnlyRefreshesTheLists) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions"), Night(12, "Hawks", "Rovers")});
  OpenTeam("Hawks");
  Do("pick lstResPlayers 1");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_EQ(Text("cboOpp"), "Lions");
}

class ManyTeams : public ScoreSheets {
 protected:
  void Teams(int others) {
    std::vector<PlayerRecord> players = {Player(1, "Reed", "Jo", "AA", "A Grade")};
    for (int i = 1; i <= others; ++i) {
      players.push_back(Player(1 + i, "P", "Q", "Team " + std::to_string(1000 + i), "A Grade"));
    }
    WritePlayers(kLeagueFile, players);
  }
};

TEST_F(ManyTeams, TwoHundredOtherTeamsCanBeMet) {
  Teams(200);
  OpenGrade();
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Lines("cboOpp").size(), 200U);
}

TEST_F(ManyTeams, TwoHundredAndOneAreOutOfBounds) {
  Teams(201);
  OpenGrade();
  EXPECT_EQ(TheBox(), "SUBSCRIPT OUT OF RANGE    ");
}

TEST_F(TeamsAndPlayers, AnIdBeyondSixteenBitsEndsInTheErrorBox) {
  WritePlayers(kLeagueFile, {Player(32768, "Reed", "Jo", "Rovers", "A Grade"),
                             Player(2, "Hill", "Al", "Hawks", "A Grade")});
  OpenGrade();
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
}

TEST_F(TeamsAndPlayers, OfTwoPlayersOfOneNameTheFirstInTheFileIsOpened) {
  WritePlayers(kLeagueFile, {Player(7, "Hill", "Al", "Hawks", "A Grade"),
                             Player(8, "Hill", "Al", "Hawks", "A Grade"),
                             Player(1, "Reed", "Jo", "Rovers", "A Grade")});
  OpenTeam("Hawks");
  EXPECT_EQ(Lines("lstResPlayers"), (TextList{"Hill,  Al", "Hill,  Al"}));
  Do("pick lstResPlayers 1");
  EXPECT_EQ(Caption("panPlrID"), "7");
}

class BadResultsFile : public ScoreSheets {};

TEST_F(BadResultsFile, OfLengthZeroIsAnEmptySeason) {
  WriteFile(kAResults, "");
  OpenTeam("Hawks");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Lines("lstResPlayers").size(), 8U);
}

TEST_F(BadResultsFile, CutInARecordCountsWholeRecordsAndTheNextSaveTakesThePlace) {
  const std::string file = FileOf(std::vector{Night(11, "Hawks", "Lions"), Night(12, "X", "Y")});
  WriteFile(kAResults, file.substr(0, 148 + 70));
  OpenTeam("Hawks");
  EXPECT_EQ(Lines("lstFinished"), TextList{"Hill,  Al"});
  SaveGoodSheet("Hope,  Bo");
  ASSERT_EQ(Saved().size(), 2U);
  EXPECT_EQ(File(kAResults).size(), 2 * 148U);
  EXPECT_EQ(File(kAResults).substr(0, 148), file.substr(0, 148));
  EXPECT_EQ(Saved()[1].ID, 12);
}

TEST_F(BadResultsFile, OfOver32767RecordsIsAnOverflow) {
  WriteFile(kAResults, std::string(32768 * 148, ' '));
  OpenGrade();
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
}

TEST_F(BadResultsFile, OfNonsenseIsPassedOver) {
  WriteFile(kAResults, std::string(20 * 148, '\xFF') + std::string(20 * 148, '\0'));
  OpenTeam("Hawks");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Text("cboOpp"), "Cubs");
  const std::string before = File(kAResults);
  SaveGoodSheet("Hill,  Al");
  EXPECT_EQ(File(kAResults).substr(0, before.size()), before);
  EXPECT_EQ(Saved().size(), 41U);
}

}  // namespace
}  // namespace marlowbeck
