#include "setup_test.h"

namespace marlowbeck {
namespace {

constexpr const char* kLeftResults = "TEMP.RES";

const std::string kAbout =
    "You are about to permanently erase the following player from your file.    \r\r";
const std::string kProceed = "\r\rDo you wish to proceed ?    ";
const std::string kNoResults = "   (No results were found for this player)    ";

class DeletePlayerTest : public SetupTest {
 protected:
  void Pick(const std::string& team, const std::string& line) {
    Do("pick cboAddTm =" + team);
    Do("pick lstPlayers =" + line);
  }
  void Delete(const std::string& team, const std::string& line, const std::string& answer = "ok") {
    Pick(team, line);
    Do("answer " + answer);
    Do("click cmdDelName");
  }
};

std::vector<ResultRecord> SomeResults() {
  return {Night(2, "Rovers", "Hawks", 24), Night(1, "Rovers", "Hawks", 24),
          Night(3, "Hawks", "Rovers", 24), Night(2, "Rovers", "Hawks", 31),
          Night(3, "Hawks", "Rovers", 31)};
}

TEST_F(DeletePlayerTest, APlayerWithoutResultsGoesAfterAQuestion) {
  OpenSetup(TwoGrades());
  Delete("Rovers", "Baker, Al");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text, kAbout + "Baker, Al\r" + kNoResults + kProceed);
  EXPECT_EQ(Boxes()[0].style, 17);
  EXPECT_EQ(Boxes()[0].title, "Marlowbeck Message");
  std::vector<PlayerRecord> players = TwoGrades();
  players.erase(players.begin() + 1);
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
  EXPECT_EQ(File(kAResults), "");
  EXPECT_FALSE(HasFile(kLeftResults));
}

TEST_F(DeletePlayerTest, ThenTheScreenIsAsAtItsStart) {
  OpenSetup(TwoGrades());
  Do("pick cboAddGrd =B Grade");
  Delete("Bulls", "Dale, Ed");
  EXPECT_FALSE(Shown("fraNamesMenu"));
  EXPECT_TRUE(Enabled("panAddPlayer"));
  EXPECT_EQ(Caption("panAddPlayer"), " Setup :    Teams, Grades and Players ");
  EXPECT_EQ(Caption("fraAddNames"), "Add New Players");
  EXPECT_FALSE(Shown("cmdClear"));
  EXPECT_EQ(Lines("cboAddGrd"), TextList{"A Grade"});
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"Hawks", "Rovers"}));
  EXPECT_TRUE(Enabled("cmdAddCancel"));
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(InSession("PlayerCount"), 3);
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  EXPECT_EQ(Count("sound"), 0);
}

TEST_F(DeletePlayerTest, ThePlayersResultsGoToo) {
  WriteResults(kAResults, SomeResults());
  WriteResults("Winter_B Grade.qzr", {Night(2, "Rovers", "Hawks")});
  OpenSetup(TwoGrades());
  Delete("Rovers", "Baker, Al");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text,
            kAbout + "Baker, Al\r   (This includes results found for 2 games.)    " + kProceed);
  EXPECT_EQ(Boxes()[0].style, 17);
  const std::vector<ResultRecord> all = SomeResults();
  EXPECT_TRUE(
      SameResults(File(kAResults), FileOf(std::vector<ResultRecord>{all[1], all[2], all[4]})));
  EXPECT_EQ(Saved().size(), 3U);
  EXPECT_EQ(Results("Winter_B Grade.qzr").size(), 1U);  // no more than the grade's file
  EXPECT_FALSE(HasFile(kLeftResults));
}

TEST_F(DeletePlayerTest, OneGameIsOneGame) {
  WriteResults(kAResults, SomeResults());
  OpenSetup(TwoGrades());
  Delete("Rovers", "Archer, Jo");
  EXPECT_EQ(Boxes().at(0).text,
            kAbout + "Archer, Jo\r   (This includes results found for 1 game.)    " + kProceed);
}

TEST_F(DeletePlayerTest, ACancelKeepsAllAndGoesBackToTheTeam) {
  WriteResults(kAResults, SomeResults());
  OpenSetup(TwoGrades());
  for (const char* player : {"Baker, Al", "Archer, Jo"}) {
    Delete("Rovers", player, "cancel");
    EXPECT_EQ(Text("cboAddGrd"), "A Grade");
    EXPECT_EQ(Text("cboAddTm"), "Rovers");
    EXPECT_EQ(Lines("lstPlayers"), (TextList{"Archer, Jo", "Baker, Al"}));
    EXPECT_FALSE(Shown("fraNamesMenu"));
    EXPECT_FALSE(Shown("cmdClear"));
    EXPECT_TRUE(Enabled("cmdAddCancel"));
    EXPECT_EQ(InSession("Flag"), 0);
    EXPECT_EQ(Focus(), "frmNames.txtAddSn");
  }
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  EXPECT_EQ(File(kAResults), FileOf(SomeResults()));
}

TEST_F(DeletePlayerTest, ACancelOfAPlayerWithoutResultsToo) {
  OpenSetup(TwoGrades());
  Delete("Hawks", "Cole, Di", "cancel");
  EXPECT_EQ(Boxes().at(0).text, kAbout + "Cole, Di\r" + kNoResults + kProceed);
  EXPECT_EQ(Text("cboAddTm"), "Hawks");
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(DeletePlayerTest, OfTwoPlayersAlikeTheFirstOneIsDeleted) {
  const std::vector<PlayerRecord> players = {Player(7, "Cole", "Di", "Hawks", "A Grade"),
                                             Player(5, "Cole", "Di", "Rovers", "A Grade"),
                                             Player(9, "Cole", "Di", "Rovers", "A Grade")};
  WriteResults(kAResults, {Night(5, "Rovers", "Hawks"), Night(9, "Rovers", "Hawks")});
  OpenSetup(players);
  Do("pick cboAddTm =Rovers");
  Do("pick lstPlayers 1");
  Do("answer ok");
  Do("click cmdDelName");
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf({players[0], players[2]})));
  ASSERT_EQ(Results(kAResults).size(), 1U);
  EXPECT_EQ(Results(kAResults)[0].ID, 9);
}

TEST_F(DeletePlayerTest, TheLastPlayerLeavesAnEmptyFileAndTheFirstPlayersFace) {
  OpenSetup({Player(1, "Archer", "Jo", "Rovers", "A Grade", 330)});
  Delete("Rovers", "Archer, Jo");
  EXPECT_EQ(File(kPlayerFile), "");
  EXPECT_TRUE(Shown("panAddPlayer0"));
  EXPECT_FALSE(Shown("panAddPlayer"));
  EXPECT_FALSE(Shown("fraNamesMenu"));
  EXPECT_EQ(InSession("PlayerCount"), 0);
  EXPECT_EQ(Focus(), "frmNames.txtAddSn0");
  TypeFirstPlayer("Fletcher");
  Do("click chkNone");
  Do("click cmdAddSave0");
  EXPECT_TRUE(SamePlayers(File(kPlayerFile),
                          FileOf({Player(1, "Fletcher", "Jo", "Rovers", "A Grade", 111)})));
  EXPECT_TRUE(Enabled("cmdAddCancel"));
}

TEST_F(DeletePlayerTest, TheFilesOfAGradeThatIsGoneArePickedUpAgain) {
  const std::string ladder = FileOf(std::vector<LadderRecord>{Match("Bulls", "Bears")});
  WriteFile("Winter_B Grade.qzl", ladder);
  WriteResults("Winter_B Grade.qzr", {Night(4, "Bulls", "Bears"), Night(8, "Bears", "Bulls")});
  OpenSetup({Player(7, "Archer", "Jo", "Rovers", "A Grade", 330),
             Player(4, "Dale", "Ed", "Bulls", "B Grade", 111)});
  Do("pick cboAddGrd =B Grade");
  Delete("Bulls", "Dale, Ed");
  EXPECT_EQ(Lines("cboAddGrd"), TextList{"A Grade"});
  EXPECT_EQ(File("Winter_B Grade.qzl"), ladder);
  ASSERT_EQ(Results("Winter_B Grade.qzr").size(), 1U);
  // The next player is number 8, whose result lies there.
  DoAll({"type cboAddGrd B Grade", "focus txtAddSn", "click chkNun", "click cmdNoPOK",
         "type cboAddTm Bears"});
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  Pick("Bears", "Evans, Flo");
  Do("click cmdEdName");
  EXPECT_EQ(InSession("Flag"), 8);
  EXPECT_TRUE(Get("cboAddTm")["locked"]);
}

TEST_F(DeletePlayerTest, TheHighestIdIsGivenAgain) {
  OpenSetup(TwoGrades());
  Do("pick cboAddGrd =B Grade");
  Delete("Bulls", "Dale, Ed");
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().back().ID, 4);
}

TEST_F(DeletePlayerTest, AnIdAboveSixteenBitsIsToldAndNothingChanges) {
  const std::vector<PlayerRecord> players = {Player(40000, "Archer", "Jo", "Rovers", "A Grade")};
  OpenSetup(players);
  Pick("Rovers", "Archer, Jo");
  Do("click cmdDelName");
  EXPECT_EQ(BoxTexts(), TextList{"OVERFLOW    "});
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_TRUE(Shown("fraNamesMenu"));
  EXPECT_EQ(File(kPlayerFile), FileOf(players));
  EXPECT_FALSE(HasFile(kAResults));
  Do("key Esc");
  EXPECT_TRUE(Enabled("cmdAddCancel"));
}

TEST_F(DeletePlayerTest, AStaleWorkFileLeavesItsRecordsBehindTheNewOnes) {
  const std::vector<PlayerRecord> stale = {
      Player(91, "Old", "One", "T", "G"), Player(92, "Old", "Two", "T", "G"),
      Player(93, "Old", "Three", "T", "G"), Player(94, "Old", "Four", "T", "G")};
  WritePlayers(kLeftResults, stale);
  OpenSetup(TwoGrades());
  Delete("Rovers", "Baker, Al");
  std::vector<PlayerRecord> players = TwoGrades();
  players.erase(players.begin() + 1);
  players.push_back(stale[3]);
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
  EXPECT_FALSE(HasFile(kLeftResults));
}

TEST_F(DeletePlayerTest, AStaleWorkFileIsUsedUpByTheResults) {
  const std::vector<ResultRecord> stale(4, Night(99, "Old", "Older"));
  WriteResults(kLeftResults, stale);
  WriteResults(kAResults, SomeResults());
  OpenSetup(TwoGrades());
  Delete("Rovers", "Baker, Al");
  const std::vector<ResultRecord> all = SomeResults();
  EXPECT_TRUE(SameResults(File(kAResults),
                          FileOf(std::vector<ResultRecord>{all[1], all[2], all[4], stale[3]})));
  EXPECT_EQ(Saved().size(), 3U);
}

TEST_F(DeletePlayerTest, ACopyThatCannotTakeItsPlaceIsOverwrittenByTheNextDeletion) {
  HOLDS_FOR_MODELS_ALONE("one face's disk fails");
  OpenSetup(TwoGrades());
  Pick("Rovers", "Baker, Al");
  Do("answer ok");
  Do("fault rename 1 74");
  Do("click cmdDelName");
  EXPECT_EQ(BoxTexts().at(1), "CAN'T RENAME WITH DIFFERENT DRIVE    ");
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  EXPECT_EQ(Players(kLeftResults).size(), 3U);
  Do("click cmdCancelDel");
  Delete("Rovers", "Baker, Al");
  EXPECT_EQ(Saved().size(), 3U);
  EXPECT_FALSE(HasFile(kLeftResults));
}

TEST_F(DeletePlayerTest, AGradeThatNoFileCanBeNamedForKeepsItsPlayers) {
  const std::vector<PlayerRecord> players = {Player(1, "Archer", "Jo", "Rovers", "A/B", 111)};
  OpenSetup(players);
  Pick("Rovers", "Archer, Jo");
  Do("click cmdDelName");
  EXPECT_EQ(BoxTexts(), TextList{"PATH NOT FOUND    "});
  EXPECT_EQ(File(kPlayerFile), FileOf(players));
  Do("click cmdCancelDel");
  EXPECT_TRUE(Enabled("cmdAddCancel"));
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(DeletePlayerTest, AFileCutInARecordLosesTheBytesBehindItsWholeRecords) {
  const std::string players = FileOf(TwoGrades());
  OpenSetupOf(players.substr(0, 4 * kPlayerLength - 10));
  Delete("Rovers", "Baker, Al");
  EXPECT_EQ(File(kPlayerFile),
            players.substr(0, kPlayerLength) + players.substr(2 * kPlayerLength, kPlayerLength));
}

TEST_F(DeletePlayerTest, NonsenseIsCarriedOver) {
  std::string nonsense(2 * kPlayerLength, '\0');
  for (std::size_t i = 0; i < nonsense.size(); ++i) {
    nonsense[i] = static_cast<char>(0x80 + i * 7 % 0x80);
  }
  OpenSetupOf(nonsense + FileOf({Player(1, "Archer", "Jo", "Rovers", "A Grade", 330)}));
  Do("type cboAddGrd A Grade");
  Delete("Rovers", "Archer, Jo");
  EXPECT_EQ(File(kPlayerFile), nonsense);
}

TEST_F(DeletePlayerTest, TooManyResultsAreToldAndNobodyGoes) {
  const std::string results(32768 * kResultLength, ' ');
  WriteFile(kAResults, results);
  OpenSetup(TwoGrades());
  Pick("Rovers", "Baker, Al");
  Do("click cmdDelName");
  EXPECT_EQ(BoxTexts(), TextList{"OVERFLOW    "});
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  EXPECT_EQ(File(kAResults), results);
}

}  // namespace
}  // namespace marlowbeck
