#include "setup_test.h"

namespace marlowbeck {
namespace {

/// A player picked in the list and taken up for a change.
class EditPlayerTest : public SetupTest {
 protected:
  void PickPlayer(const std::string& team, const std::string& line) {
    Do("pick cboAddTm =" + team);
    Do("pick lstPlayers =" + line);
  }
  void Edit(const std::string& team, const std::string& line) {
    PickPlayer(team, line);
    Do("click cmdEdName");
  }
};

TEST_F(EditPlayerTest, WhatCanBeDoneWithAPickedPlayer) {
  OpenSetup(TwoGrades());
  PickPlayer("Rovers", "Baker, Al");
  EXPECT_EQ(Caption("fraNamesMenu"), "Edit or Delete a player from file");
  EXPECT_EQ(Caption("lblEdName"), "Baker, Al");
  EXPECT_EQ(Caption("cmdEdName"), "Edit");
  EXPECT_EQ(Caption("cmdDelName"), "Delete");
  EXPECT_EQ(Caption("cmdCancelDel"), "Cancel");
}

TEST_F(EditPlayerTest, ThePlayersNamesComeIntoTheBoxes) {
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Text("txtAddSn"), "Baker");
  EXPECT_EQ(Text("txtAddFn"), "Al");
  EXPECT_EQ(InSession("EditRecord"), 2);
  EXPECT_EQ(InSession("Flag"), 2);
  EXPECT_FALSE(Shown("fraNamesMenu"));
  EXPECT_EQ(Caption("panAddPlayer"), "EDIT: Teams, Grades And Players");
  EXPECT_EQ(Caption("fraAddNames"), " Edit Player ");
  EXPECT_TRUE(Enabled("txtAddSn"));
  EXPECT_TRUE(Enabled("cmdAddSave"));
  EXPECT_TRUE(Shown("cmdClear"));
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  for (const char* away : {"cmdEdGradeName", "cmdEdTeamName", "cmdNewGrd", "cmdNewTm", "cmdEdBOT",
                           "cmdAddCancel", "cmdSearch"}) {
    EXPECT_FALSE(Enabled(away)) << away;
  }
}

TEST_F(EditPlayerTest, ASavedChangeGoesIntoThePlayersRecordUnderHisId) {
  std::vector<PlayerRecord> players = TwoGrades();
  players[1].ID = 77;
  OpenSetup(players);
  Edit("Rovers", "Baker, Al");
  EXPECT_EQ(InSession("Flag"), 77);
  TypeNames("Barker", "Alan");
  Do("click cmdAddSave");
  players[1].Surname = "Barker";
  players[1].FirstName = "Alan";
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
  EXPECT_EQ(Text("cboAddTm"), "Rovers");
  EXPECT_EQ(Text("cboAddGrd"), "A Grade");
  EXPECT_EQ(Lines("lstPlayers"), (TextList{"Archer, Jo", "Barker, Alan"}));
  EXPECT_EQ(Caption("panAddPlayer"), " Setup :    Teams, Grades and Players ");
  EXPECT_FALSE(Shown("cmdClear"));
  EXPECT_EQ(Text("txtAddSn"), "");
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_EQ(Count("sound"), 2);
  EXPECT_TRUE(Enabled("cmdAddCancel"));
}

TEST_F(EditPlayerTest, WithoutResultsThePlayerMovesToAnotherTeamAndGrade) {
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  EXPECT_FALSE(Get("cboAddTm")["locked"]);
  EXPECT_FALSE(Get("cboAddGrd")["locked"]);
  Do("pick cboAddGrd =B Grade");
  Do("pick cboAddTm =Bulls");
  Do("click cmdAddSave");
  std::vector<PlayerRecord> players = TwoGrades();
  players[1].Team = "Bulls";
  players[1].Grade = "B Grade";
  players[1].BestOfThree = 111;  // the grade's
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
  EXPECT_EQ(Lines("lstPlayers"), (TextList{"Baker, Al", "Dale, Ed"}));
}

TEST_F(EditPlayerTest, WithResultsTeamAndGradeAreLocked) {
  WriteResults(kAResults, {Night(3, "Hawks", "Rovers"), Night(2, "Rovers", "Hawks")});
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  for (const std::string combo : {"cboAddTm", "cboAddGrd"}) {
    EXPECT_TRUE(Get(combo)["locked"]) << combo;
    Refused("type " + combo + " Hawks");
    Refused("pick " + combo + " 0");
    Do("focus " + combo);
    Do("key Down");
    Do("key Up");
  }
  EXPECT_EQ(Text("cboAddTm"), "Rovers");
  EXPECT_EQ(Text("cboAddGrd"), "A Grade");
  TypeNames("Barker", "Al");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(1).Surname, FixedWidth("Barker", 30));
  for (const std::string combo : {"cboAddTm", "cboAddGrd"}) EXPECT_FALSE(Get(combo)["locked"]);
}

TEST_F(EditPlayerTest, ResultsOfOthersLockNothing) {
  WriteResults(kAResults, {Night(3, "Hawks", "Rovers"), Night(22, "Rovers", "Hawks")});
  WriteResults("Winter_B Grade.qzr", {Night(2, "Rovers", "Hawks")});
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  EXPECT_FALSE(Get("cboAddTm")["locked"]);
}

TEST_F(EditPlayerTest, WhileItCannotBeKnownWhetherThereAreResultsNobodyMoves) {
  OpenSetup({Player(1, "Archer", "Jo", "Rovers", "A/B", 111)});
  Edit("Rovers", "Archer, Jo");
  EXPECT_EQ(BoxTexts(), TextList{"PATH NOT FOUND    "});
  EXPECT_TRUE(Get("cboAddTm")["locked"]);
  EXPECT_EQ(Text("txtAddSn"), "Archer");
  TypeNames("Fletcher", "Jo");
  Do("click cmdAddSave");
  EXPECT_TRUE(
      SamePlayers(File(kPlayerFile), FileOf({Player(1, "Fletcher", "Jo", "Rovers", "A/B", 111)})));
}

TEST_F(EditPlayerTest, CancelEditFreesAndForgets) {
  WriteResults(kAResults, {Night(2, "Rovers", "Hawks")});
  OpenSetup(TwoGrades());
  for (const char* cancel : {"click cmdClear", "key Esc"}) {
    Edit("Rovers", "Baker, Al");
    Do("type txtAddSn Barker");
    Do(cancel);
    EXPECT_EQ(InSession("EditRecord"), 0);
    EXPECT_EQ(InSession("Flag"), 0);
    EXPECT_FALSE(Get("cboAddTm")["locked"]);
    EXPECT_EQ(Text("cboAddTm"), "Rovers");
    EXPECT_EQ(Text("txtAddSn"), "");
    EXPECT_EQ(Caption("fraAddNames"), "Add New Players");
    EXPECT_EQ(Caption("panAddPlayer"), " Setup :    Teams, Grades and Players ");
    EXPECT_TRUE(Enabled("cmdAddCancel"));
    EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  }
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(EditPlayerTest, OfTwoPlayersAlikeTheLastOneIsEdited) {
  std::vector<PlayerRecord> players = {Player(5, "Cole", "Di", "Rovers", "A Grade"),
                                       Player(9, "Cole", "Di", "Rovers", "A Grade"),
                                       Player(7, "Cole", "Di", "Hawks", "A Grade")};
  OpenSetup(players);
  Do("pick cboAddTm =Rovers");
  Do("pick lstPlayers 0");
  Do("click cmdEdName");
  EXPECT_EQ(InSession("EditRecord"), 2);
  EXPECT_EQ(InSession("Flag"), 9);
  TypeNames("Cole", "Diana");
  Do("click cmdAddSave");
  players[1].FirstName = "Diana";
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
}

TEST_F(EditPlayerTest, AnIdAboveSixteenBitsIsToldAndNothingChanges) {
  const std::vector<PlayerRecord> players = {Player(32768, "Archer", "Jo", "Rovers", "A Grade")};
  OpenSetup(players);
  Edit("Rovers", "Archer, Jo");
  EXPECT_EQ(BoxTexts(), TextList{"OVERFLOW    "});
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_TRUE(Shown("fraNamesMenu"));
  EXPECT_EQ(Text("txtAddSn"), "");
  Do("click cmdCancelDel");
  EXPECT_TRUE(Enabled("cmdAddCancel"));
  EXPECT_EQ(File(kPlayerFile), FileOf(players));
  EXPECT_FALSE(HasFile(kAResults));
}

TEST_F(EditPlayerTest, TheHighestIdOfSixteenBitsIsEdited) {
  OpenSetup({Player(32767, "Archer", "Jo", "Rovers", "A Grade")});
  Edit("Rovers", "Archer, Jo");
  TypeNames("Fletcher", "Jo");
  Do("click cmdAddSave");
  EXPECT_TRUE(SamePlayers(File(kPlayerFile),
                          FileOf({Player(32767, "Fletcher", "Jo", "Rovers", "A Grade")})));
}

TEST_F(EditPlayerTest, APlayerMovedIntoANewGradeStaysWhereHeWasAndIsAddedThere) {
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  Do("type cboAddGrd C Grade");
  Do("focus txtAddSn");
  ASSERT_TRUE(Shown("fraBoT"));
  Do("click chkEvery");
  Do("click cmdNoPOK");
  EXPECT_EQ(InSession("EditRecord"), 0);
  Do("click cmdAddSave");
  std::vector<PlayerRecord> players = TwoGrades();
  players.push_back(Player(5, "Baker", "Al", "Rovers", "C Grade", 333));
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
}

TEST_F(EditPlayerTest, AResultsFileComesAboutWithTheLookIntoIt) {
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  EXPECT_EQ(File(kAResults), "");
}

TEST_F(EditPlayerTest, NamesOfThirtyLettersComeBackWhole) {
  const std::string thirty = "Anderson-Featherstonehaugh-Wyc";
  OpenSetup({Player(1, thirty, thirty, "Rovers", "A Grade")});
  Edit("Rovers", thirty + ", " + thirty);
  EXPECT_EQ(Text("txtAddSn"), thirty);
  Do("type txtAddSn " + thirty + "h");
  Do("click cmdAddSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_TRUE(
      SamePlayers(File(kPlayerFile), FileOf({Player(1, thirty, thirty, "Rovers", "A Grade")})));
}

TEST_F(EditPlayerTest, CommasAndQuotesInNamesAreFoundAgain) {
  OpenSetup({Player(1, "O'Hara, \"Flo\"", "A/B, C", "\"The\" Rovers, II", "A, \"Grade\"", 111)});
  Do("pick lstPlayers 0");
  Do("click cmdEdName");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Text("txtAddSn"), "O'Hara, \"Flo\"");
  EXPECT_EQ(Text("txtAddFn"), "A/B, C");
  EXPECT_EQ(InSession("EditRecord"), 1);
}

TEST_F(EditPlayerTest, BlankNamesAreRefusedAndTheEditGoesOn) {
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  Do("type txtAddSn    ");
  Do("click cmdAddSave");
  EXPECT_EQ(BoxTexts(), TextList{"Surname & First Name       \rmust be completed.       "});
  EXPECT_EQ(InSession("EditRecord"), 2);
  EXPECT_EQ(InSession("Flag"), 2);
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(EditPlayerTest, ACutResultsFileIsReadByItsWholeRecords) {
  WriteFile(kAResults, FileOf(std::vector<ResultRecord>{Night(3, "Hawks", "Rovers"),
                                                        Night(2, "Rovers", "Hawks")})
                           .substr(0, 2 * kResultLength - 1));
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_FALSE(Get("cboAddTm")["locked"]);
}

TEST_F(EditPlayerTest, APlayerWhoHasGoneInTheMeantimeIsNobody) {
  OpenSetup(TwoGrades());
  PickPlayer("Rovers", "Baker, Al");
  std::vector<PlayerRecord> players = TwoGrades();
  players[1].Surname = "Other";
  WritePlayers(kPlayerFile, players);
  Do("click cmdEdName");
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_EQ(Text("txtAddSn"), "");
  EXPECT_FALSE(Enabled("cmdAddSave"));
}

TEST_F(EditPlayerTest, WhenTheListFailsAfterASaveTheNextNamesAreANewPlayers) {
  HOLDS_FOR_MODELS_ALONE("one face's disk fails");
  OpenSetup(TwoGrades());
  Edit("Rovers", "Baker, Al");
  TypeNames("Barker", "Al");
  // The look for the highest id, then the record itself, are read; the list's look is the third.
  Do("fault read 3 57");
  Do("click cmdAddSave");
  EXPECT_EQ(BoxTexts().size(), 1U);
  Do("fault off");
  EXPECT_EQ(InSession("EditRecord"), 0);
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  std::vector<PlayerRecord> players = TwoGrades();
  players[1].Surname = "Barker";
  players.push_back(Player(5, "Evans", "Flo", "Rovers", "A Grade", 330));
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
}

}  // namespace
}  // namespace marlowbeck
