#include "setup_test.h"

namespace marlowbeck {
namespace {

using PlayersTest = SetupTest;

TEST_F(PlayersTest, OpensOnTheFirstGradeAndTheFirstTeamOfTheFile) {
  OpenSetup(TwoGrades());
  EXPECT_TRUE(Shown("panAddPlayer"));
  EXPECT_FALSE(Shown("panAddPlayer0"));
  EXPECT_FALSE(Shown("fraNamesMenu"));
  EXPECT_FALSE(Shown("fraBoT"));
  EXPECT_FALSE(Shown("cmdClear"));
  EXPECT_EQ(Caption("panAddPlayer"), " Setup :    Teams, Grades and Players ");
  EXPECT_EQ(Caption("fraAddNames"), "Add New Players");
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"A Grade", "B Grade"}));
  EXPECT_EQ(Text("cboAddGrd"), "A Grade");
  EXPECT_EQ(Text("cboAddTm"), "Bulls");
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  EXPECT_FALSE(Enabled("cmdAddSave"));
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(PlayersTest, TheTeamsAreThoseOfAllGrades) {
  OpenSetup(TwoGrades());
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"Bulls", "Hawks", "Rovers"}));
}

TEST_F(PlayersTest, GradesAndTeamsAreInTheOrderOfTheirBytes) {
  OpenSetup({Player(1, "A", "B", "rovers", "b"), Player(2, "A", "B", "Rovers", "C"),
             Player(3, "A", "B", "Zebras", "\xe9"), Player(4, "A", "B", "1st", "B")});
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"1st", "Rovers", "Zebras", "rovers"}));
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"B", "C", "b", "é"}));
}

TEST_F(PlayersTest, PlayersAreListedInTheOrderOfTheRecords) {
  OpenSetup({Player(1, "Zoe", "Al", "Rovers", "A Grade"),
             Player(2, "Cole", "Di", "Hawks", "A Grade"),
             Player(3, "Archer", "Jo", "Rovers", "A Grade"),
             Player(4, "Archer", "Jo", "Rovers", "A Grade")});
  Do("pick cboAddTm =Rovers");
  EXPECT_EQ(Lines("lstPlayers"), (TextList{"Zoe, Al", "Archer, Jo", "Archer, Jo"}));
  EXPECT_EQ(Caption("lblHMP"), "Players: (3)  Select to Edit or Delete");
  EXPECT_EQ(Caption("panTM"), "Rovers");
  EXPECT_EQ(Caption("panGR"), "A Grade");
}

TEST_F(PlayersTest, ATeamIsPickedTogetherWithTheGrade) {
  OpenSetup(TwoGrades());
  EXPECT_TRUE(Lines("lstPlayers").empty());  // no Bulls in A Grade
  EXPECT_EQ(Caption("lblHMP"), "");
  Do("pick cboAddGrd =B Grade");
  EXPECT_EQ(Lines("lstPlayers"), TextList{"Dale, Ed"});
}

TEST_F(PlayersTest, ATeamWithoutPlayersKeepsTheNumberOfTheOneBefore) {
  OpenSetup({Player(1, "Zoe", "Al", "Rovers", "A Grade"),
             Player(2, "Cole", "Di", "Rovers", "A Grade"),
             Player(3, "Dale", "Ed", "Bulls", "B Grade")});
  Do("pick cboAddTm =Rovers");
  Do("pick cboAddTm =Bulls");
  EXPECT_TRUE(Lines("lstPlayers").empty());
  EXPECT_EQ(Caption("lblHMP"), "Players: (2)  Select to Edit or Delete");
  EXPECT_EQ(Caption("panTM"), "Bulls");
}

TEST_F(PlayersTest, APickOfAGradeShowsItsGamesAndGoesToTheNames) {
  OpenSetup(TwoGrades());
  EXPECT_EQ(Caption("lblNoP"), "Triples & Doubles");
  Do("pick cboAddGrd =B Grade");
  EXPECT_EQ(Caption("lblNoP"), " No games.");
  EXPECT_EQ(InSession("BestOfThree"), 111);
  EXPECT_EQ(InSession("BestOfThreeText"), " No games.");
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  Do("focus txtAddFn");
  Do("pick cboAddTm =Rovers");
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
}

TEST_F(PlayersTest, TypingInTheCombosListsThePlayersAndMovesNoFocus) {
  OpenSetup(TwoGrades());
  Do("type cboAddTm Rovers");
  EXPECT_EQ(Lines("lstPlayers"), (TextList{"Archer, Jo", "Baker, Al"}));
  EXPECT_EQ(Focus(), "frmNames.cboAddTm");
  Do("type cboAddGrd B Grade");
  EXPECT_EQ(Caption("lblNoP"), " No games.");
  EXPECT_EQ(Focus(), "frmNames.cboAddGrd");
}

TEST_F(PlayersTest, SaveIsThereWhileBothNamesHoldSomething) {
  OpenSetup(TwoGrades());
  EXPECT_FALSE(Enabled("cmdAddSave"));
  Do("type txtAddSn Evans");
  EXPECT_FALSE(Enabled("cmdAddSave"));
  Do("type txtAddFn Flo");
  EXPECT_TRUE(Enabled("cmdAddSave"));
  Do("type txtAddSn");
  EXPECT_TRUE(Enabled("cmdAddSave"));  // one name alone leaves it as it was
  Do("type txtAddFn");
  EXPECT_FALSE(Enabled("cmdAddSave"));
}

TEST_F(PlayersTest, AFurtherPlayerIsAppendedUnderTheNextId) {
  OpenSetup(TwoGrades());
  Do("pick cboAddTm =Rovers");
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_TRUE(Boxes().empty());
  std::vector<PlayerRecord> expected = TwoGrades();
  expected.push_back(Player(5, "Evans", "Flo", "Rovers", "A Grade", 330));
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(expected)));
  EXPECT_EQ(InSession("PlayerCount"), 5);
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(PlayersTest, ASavedPlayerSoundsTwice) {
  OpenSetup(TwoGrades());
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Count("sound"), 2);
}

TEST_F(PlayersTest, AfterASaveGradeAndTeamStayAndTheNamesAreEmpty) {
  OpenSetup(TwoGrades());
  Do("pick cboAddGrd =B Grade");
  Do("pick cboAddTm =Rovers");
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Text("cboAddGrd"), "B Grade");
  EXPECT_EQ(Text("cboAddTm"), "Rovers");
  EXPECT_EQ(Text("txtAddSn"), "");
  EXPECT_EQ(Text("txtAddFn"), "");
  EXPECT_FALSE(Enabled("cmdAddSave"));
  EXPECT_EQ(Lines("lstPlayers"), TextList{"Evans, Flo"});
  EXPECT_EQ(InSession("BestOfThree"), 111);
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
}

TEST_F(PlayersTest, TheNextIdFollowsTheHighestAndNotTheLast) {
  OpenSetup({Player(40000, "Archer", "Jo", "Rovers", "A Grade"),
             Player(7, "Baker", "Al", "Rovers", "A Grade")});
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(2).ID, 40001);
}

TEST_F(PlayersTest, AnIdBeyondTheLastIsToldAndNothingIsSaved) {
  const std::vector<PlayerRecord> players = {
      Player(2147483647, "Archer", "Jo", "Rovers", "A Grade")};
  OpenSetup(players);
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(BoxTexts(), TextList{"OVERFLOW    "});
  EXPECT_EQ(File(kPlayerFile), FileOf(players));
}

TEST_F(PlayersTest, NamesAreSavedAsTypedAndCutToWidthWithoutAWord) {
  OpenSetup(TwoGrades());
  Do("type cboAddTm Rovers");
  TypeNames("  Anderson-Featherstonehaugh-Wyc", "O'Hara, \"Flo\"");
  Do("click cmdAddSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Saved().at(4).Surname, "  Anderson-Featherstonehaugh-W");
  EXPECT_EQ(Saved().at(4).FirstName, FixedWidth("O'Hara, \"Flo\"", 30));
  EXPECT_EQ(Lines("lstPlayers").back(), "Anderson-Featherstonehaugh-W, O'Hara, \"Flo\"");
}

TEST_F(PlayersTest, ASavedPlayerTakesOverTheReservedDateOfTheLastRecord) {
  std::vector<PlayerRecord> players = TwoGrades();
  players[1].Reserved1 = Date{38000};
  players[3].Reserved1 = Date{37000.5};
  OpenSetup(players);
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(4).Reserved1.days, 37000.5);
  EXPECT_EQ(Saved().at(4).Reserved2, std::string(30, ' '));
}

TEST_F(PlayersTest, ANameOfBlanksIsRefusedWithoutASound) {
  OpenSetup(TwoGrades());
  for (const auto& [surname, first_name] : {std::pair{"  ", "Flo"}, std::pair{"Evans", "   "}}) {
    TypeNames(surname, first_name);
    Do("click cmdAddSave");
    EXPECT_EQ(BoxTexts(), TextList{"Surname & First Name       \rmust be completed.       "});
    EXPECT_EQ(Count("sound"), 0);
    EXPECT_EQ(Focus(), "frmNames.txtAddSn");
    EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  }
}

TEST_F(PlayersTest, APlayerWithoutATeamIsSavedWithABlankOne) {
  OpenSetup(TwoGrades());
  Do("type cboAddTm");
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(4).Team, std::string(30, ' '));
  EXPECT_EQ(Lines("lstPlayers"), TextList{"Evans, Flo"});
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"", "Bulls", "Hawks", "Rovers"}));
}

TEST_F(PlayersTest, ANameTypedStraightIntoTheTeamsIsAccepted) {
  OpenSetup(TwoGrades());
  Do("type cboAddTm Foxes");
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(4).Team, FixedWidth("Foxes", 30));
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"Bulls", "Foxes", "Hawks", "Rovers"}));
}

TEST_F(PlayersTest, TheEntryNeedsTheKeyboardAlone) {
  OpenSetup(TwoGrades());
  Do("type txtAddSn Evans");
  Do("key Enter");
  EXPECT_EQ(Focus(), "frmNames.txtAddFn");
  Do("type txtAddFn Flo");
  Do("key Enter");
  EXPECT_EQ(Focus(), "frmNames.cmdAddSave");
  Do("key Enter");
  EXPECT_EQ(Saved().size(), 5U);
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
}

TEST_F(PlayersTest, ANewGradeStandsInItsListUntilItHasAPlayer) {
  OpenSetup(TwoGrades());
  Do("input Ab");
  Do("click cmdNewGrd");
  EXPECT_EQ(EventsNamed("input").at(0)["prompt"], "Enter NEW grade name");
  EXPECT_EQ(EventsNamed("input").at(0)["title"], "Add NEW grade Name");
  EXPECT_EQ(Text("cboAddGrd"), "Ab");
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"A Grade", "Ab", "B Grade"}));
  EXPECT_EQ(Index("cboAddGrd"), 1);
  EXPECT_EQ(Caption("lblNoP"), " Not selected.");
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  EXPECT_TRUE(Enabled("cmdNewGrd"));
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  Do("pick cboAddGrd =A Grade");
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"A Grade", "B Grade"}));
}

TEST_F(PlayersTest, AGradeInUseIsRefusedInAnyCase) {
  OpenSetup(TwoGrades());
  Do("input  b gRADE ");
  Do("click cmdNewGrd");
  EXPECT_EQ(BoxTexts(), TextList{" b gRADE  is already in use.    "});
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"A Grade", "B Grade"}));
  EXPECT_EQ(Text("cboAddGrd"), "A Grade");
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  EXPECT_TRUE(Enabled("cmdEdBOT"));
}

TEST_F(PlayersTest, ABlankReplyAddsNoGrade) {
  OpenSetup(TwoGrades());
  for (const char* reply : {"input-cancel", "input", "input    "}) {
    Do(reply);
    Do("click cmdNewGrd");
    EXPECT_EQ(Lines("cboAddGrd"), (TextList{"A Grade", "B Grade"}));
    EXPECT_TRUE(Boxes().empty());
    EXPECT_TRUE(Enabled("cmdNewGrd"));
    EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  }
}

TEST_F(PlayersTest, ANewTeamIsAskedForInItsOwnWords) {
  OpenSetup(TwoGrades());
  Do("input Foxes");
  Do("click cmdNewTm");
  EXPECT_EQ(EventsNamed("input").at(0)["prompt"], "Enter NEW team name");
  EXPECT_EQ(EventsNamed("input").at(0)["title"], "Add NEW team Name");
  EXPECT_EQ(Text("cboAddTm"), "Foxes");
  EXPECT_TRUE(Lines("lstPlayers").empty());
  EXPECT_EQ(Caption("panTM"), "Foxes");
}

TEST_F(PlayersTest, ATeamOfAnyGradeIsInUse) {
  OpenSetup(TwoGrades());
  Do("input BULLS");
  Do("click cmdNewTm");
  EXPECT_EQ(BoxTexts(), TextList{"BULLS is already in use.    "});
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"Bulls", "Hawks", "Rovers"}));
}

TEST_F(PlayersTest, ANameAddedTwiceStandsInItsListOnce) {
  OpenSetup(TwoGrades());
  DoAll({"input Foxes", "click cmdNewTm", "input Foxes", "click cmdNewTm"});
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"Bulls", "Foxes", "Hawks", "Rovers"}));
}

TEST_F(PlayersTest, APickedPlayerAsksWhatToDo) {
  OpenSetup(TwoGrades());
  Do("pick cboAddTm =Rovers");
  TypeNames("Evans", "Flo");
  Do("pick lstPlayers 1");
  EXPECT_TRUE(Shown("fraNamesMenu"));
  EXPECT_EQ(Caption("fraNamesMenu"), "Edit or Delete a player from file");
  EXPECT_EQ(Caption("lblEdName"), "Baker, Al");
  EXPECT_EQ(Caption("lblEdTeam"), "Rovers");
  EXPECT_EQ(Caption("lblEdgrade"), "A Grade");
  EXPECT_EQ(Caption("fraAddNames"), " Edit Player ");
  EXPECT_TRUE(Shown("cmdClear"));
  EXPECT_EQ(Text("txtAddSn"), "");
  EXPECT_EQ(Text("txtAddFn"), "");
  for (const char* out_of_reach : {"txtAddSn", "lstPlayers", "cboAddTm", "cmdAddCancel",
                                   "cmdNewGrd", "cmdSearch", "cmdEdBOT", "cmdClear"}) {
    EXPECT_FALSE(Enabled(out_of_reach)) << out_of_reach;
  }
}

TEST_F(PlayersTest, TheArrowsWalkTheListAndEnterPicks) {
  OpenSetup(TwoGrades());
  Do("pick cboAddTm =Rovers");
  Do("focus lstPlayers");
  Do("key Down");
  EXPECT_FALSE(Shown("fraNamesMenu"));
  Do("key Enter");
  EXPECT_EQ(Caption("lblEdName"), "Baker, Al");
}

TEST_F(PlayersTest, CancelGoesBackToTheLists) {
  OpenSetup(TwoGrades());
  for (const char* cancel : {"click cmdCancelDel", "key Esc"}) {
    Do("pick cboAddTm =Rovers");
    Do("pick lstPlayers 1");
    Do(cancel);
    EXPECT_FALSE(Shown("fraNamesMenu"));
    EXPECT_FALSE(Shown("cmdClear"));
    EXPECT_EQ(Caption("fraAddNames"), "Add New Players");
    EXPECT_EQ(Caption("panAddPlayer"), " Setup :    Teams, Grades and Players ");
    EXPECT_TRUE(Enabled("cmdAddCancel"));
    EXPECT_TRUE(Enabled("lstPlayers"));
    EXPECT_EQ(InSession("Flag"), 0);
  }
}

TEST_F(PlayersTest, ABlankSearchOpensNothing) {
  OpenSetup(TwoGrades());
  for (const char* reply : {"input-cancel", "input   "}) {
    Do(reply);
    Do("click cmdSearch");
    EXPECT_EQ(EventsNamed("input").at(0)["prompt"], "Enter SURNAME to Search for.");
    EXPECT_EQ(EventsNamed("input").at(0)["title"], "Name Search");
    EXPECT_EQ(Front(), "frmNames");
    EXPECT_EQ(InSession("Flag"), 0);
  }
}

TEST_F(PlayersTest, LeavingGoesToTheMenuWhichCountsThePlayers) {
  OpenSetup(TwoGrades());
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  Do("click cmdAddCancel");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmNames"));
  EXPECT_EQ(Caption("lblHMPlayers"), "5 Players Listed in File. ");
  Do("click imgPlayers");
  Do("key Esc");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(PlayersTest, HelpOpensTheHelpFile) {
  OpenSetup(TwoGrades());
  Do("key F1");
  EXPECT_EQ(EventsNamed("help").at(0)["file"], "qz1.HLP");
  Do("click cmdHelpNames");
  EXPECT_EQ(Count("help"), 1);
}

// The way from the score sheet, in a grade of one team.
class FromTheScoreSheetTest : public SetupTest {
 protected:
  void OpenTheScoreSheet() {
    WritePlayers(kPlayerFile, {Player(1, "Archer", "Jo", "Rovers", "A Grade", 330),
                               Player(2, "Cole", "Di", "Hawks", "A Grade", 330),
                               Player(3, "Dale", "Ed", "Bulls", "B Grade", 111)});
    WriteFile("WkDate.qz3", "#2004-03-31#\r\n");
    NameOpenFile(kPlayerFile);
    Do("click imgSheets");
    Do("pick cboResGrade =B Grade");
  }

  void GoOnToSetup() {
    Do("answer yes");
    Do("click cmdGotoResults");
  }

  void ComeFromTheScoreSheet() {
    OpenTheScoreSheet();
    GoOnToSetup();
    ASSERT_EQ(Front(), "frmNames");
    ASSERT_EQ(InSession("Flag"), 1);
  }
};

TEST_F(FromTheScoreSheetTest, WithoutANamedFileItLeavesAtOnce) {
  OpenTheScoreSheet();
  WriteFile("FileName.qz3", "");
  GoOnToSetup();
  EXPECT_EQ(Boxes().size(), 1U);  // that of the score sheet
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmNames"));
  EXPECT_EQ(InSession("PlayerFile"), "");
}

TEST_F(FromTheScoreSheetTest, WithAnEmptyNameTheMenuTellsThatNoFileIsOpen) {
  OpenTheScoreSheet();
  WriteFile("FileName.qz3", "\"\"\r\n");
  GoOnToSetup();
  ASSERT_EQ(Boxes().size(), 2U);
  EXPECT_TRUE(Boxes()[1].text.starts_with("No Marlowbeck file is open."));
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_EQ(Caption("lblHMPlayers"), " No File Open ");
}

TEST_F(FromTheScoreSheetTest, ExitGoesBackToTheScoreSheet) {
  ComeFromTheScoreSheet();
  Do("click cmdAddCancel");
  EXPECT_EQ(Front(), "frmResults");
  EXPECT_FALSE(Loaded("frmNames"));
}

TEST_F(FromTheScoreSheetTest, AfterACancelledDeleteExitGoesToTheMenu) {
  ComeFromTheScoreSheet();
  DoAll({"pick cboAddTm =Rovers", "pick lstPlayers 0", "click cmdCancelDel"});
  EXPECT_EQ(InSession("Flag"), 0);
  Do("click cmdAddCancel");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(FromTheScoreSheetTest, AfterASaveExitGoesToTheMenu) {
  ComeFromTheScoreSheet();
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(InSession("Flag"), 0);
  Do("click cmdAddCancel");
  EXPECT_EQ(Front(), "frmDB");
}

}  // namespace
}  // namespace marlowbeck
