// A player added to the team in hand from the score sheets.

#include "data/text.h"
#include "support/league.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

class AddPlayer : public ScoreSheets {
 protected:
  void Open(const std::string& team = "Hawks", const std::string& grade = "A Grade") {
    OpenTeam(team, grade);
    Do("click panAddNames");
  }
  void Add(const std::string& surname = "Hall", const std::string& first_name = "Joy") {
    DoAll({"type txtAddSn0 " + surname, "type txtAddFn0 " + first_name, "click cmdAddSave0"});
  }
  [[nodiscard]] std::vector<PlayerRecord> League() const { return Players(kLeagueFile); }
  /// A Grade's two teams, and behind them one player of another grade.
  void LayPlayersEndingWith(const PlayerRecord& last) {
    WritePlayers(kLeagueFile, {Player(11, "Hill", "Al", "Hawks", "A Grade", 303),
                               Player(1, "Reed", "Jo", "Lions", "A Grade", 303), last});
  }
  void ExpectOpen() {
    EXPECT_TRUE(Shown("panResAddPlayer"));
    EXPECT_FALSE(Shown("fraResControls"));
  }
  void ExpectClosed() {
    EXPECT_FALSE(Shown("panResAddPlayer"));
    EXPECT_TRUE(Shown("fraResControls"));
    EXPECT_TRUE(Enabled("fraTeams"));
  }
};

TEST_F(AddPlayer, ThePanelComesUpWithTheGradeAndTheTeamInHand) {
  Open();
  ExpectOpen();
  EXPECT_FALSE(Enabled("fraTeams"));
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_EQ(Text("txtAddSn0"), "");
  EXPECT_EQ(Text("txtAddFn0"), "");
  EXPECT_EQ(Text("txtAddTm0"), "Hawks");
  EXPECT_EQ(Text("txtAddGrd0"), "A Grade");
  EXPECT_EQ(Focus(), "frmResults.txtAddSn0");
}

TEST_F(AddPlayer, CaptionsOfThePanel) {
  Open();
  const Entries expected = {{"txtAddSn0", "Surname"}, {"txtAddFn0", "First Name"},
                            {"txtAddTm0", "Team"},    {"txtAddGrd0", "Grade"},
                            {"cmdAddSave0", "Save"},  {"cmdAddCancel0", "Cancel"},
                            {"SSCommand1", "Help"},   {"panResAddPlayer", "Add Player"}};
  for (const auto& [control, caption] : expected) {
    EXPECT_EQ(ScreensOf().Find("frmResults")->Find(control)->Caption(), caption) << control;
  }
}

TEST_F(AddPlayer, TheTeamsAreOutOfReachMeanwhile) {
  Open();
  EXPECT_NE(Refused("pick lstResPlayers 0").find("lstResPlayers"), std::string::npos);
}

TEST_F(AddPlayer, IsWrittenAsTheLastRecordWithTheNextId) {
  Open();
  Add();
  std::vector<PlayerRecord> expected = LeaguePlayers();
  expected.push_back(Player(52, "Hall", "Joy", "Hawks", "A Grade", 333));
  EXPECT_TRUE(SamePlayers(File(kLeagueFile), FileOf(expected)));
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(InSession("PlayerCount"), 17);
}

TEST_F(AddPlayer, ShowsAtOnceAsTheLastOfTheTeam) {
  Open();
  Add("Aas");
  ExpectClosed();
  const TextList players = Lines("lstResPlayers");
  ASSERT_EQ(players.size(), 9U);
  EXPECT_EQ(players.back(), "Aas,  Joy");
}

TEST_F(AddPlayer, CanBeGivenASheetAtOnce) {
  Open();
  Add();
  SaveGoodSheet("Hall,  Joy");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].ID, 52);
}

TEST_F(AddPlayer, ThePanelIsBlankForTheNextOne) {
  Open();
  Add();
  Do("click panAddNames");
  EXPECT_EQ(Text("txtAddSn0"), "");
  EXPECT_EQ(Text("txtAddFn0"), "");
  Add("Hewitt");
  EXPECT_EQ(League().size(), 18U);
  EXPECT_EQ(League().back().ID, 53);
}

TEST_F(AddPlayer, TheIdFollowsTheHighestWhereverThatStands) {
  LayPlayersEndingWith(Player(3, "Bell", "Di", "Bees", "B Grade"));
  Open();
  Add();
  EXPECT_EQ(League().back().ID, 12);
}

TEST_F(AddPlayer, AnIdOf32766IsFollowedByTheLastOne) {
  LayPlayersEndingWith(Player(32766, "Bell", "Di", "Bees", "B Grade"));
  Open();
  Add();
  EXPECT_EQ(League().back().ID, 32767);
}

TEST_F(AddPlayer, AnIdOf32767AsTheHighestIsAnOverflowAndNobodyIsAdded) {
  LayPlayersEndingWith(Player(32767, "Bell", "Di", "Bees", "B Grade"));
  Open();
  const std::string before = File(kLeagueFile);
  Add();
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
  EXPECT_EQ(Count("sound"), 0);
  EXPECT_EQ(File(kLeagueFile), before);
  ExpectOpen();
}

TEST_F(AddPlayer, AnIdBeyondSixteenBitsIsAnOverflowToo) {
  LayPlayersEndingWith(Player(40000, "Bell", "Di", "Bees", "B Grade"));
  Open();
  Add();
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
  EXPECT_EQ(League().size(), 3U);
}

TEST_F(AddPlayer, NegativeIdsOfNonsenseCountForNothing) {
  LayPlayersEndingWith(Player(-40000, "Bell", "Di", "Bees", "B Grade"));
  Open();
  Add();
  EXPECT_EQ(League().back().ID, 12);
}

TEST_F(AddPlayer, TheReservedDateOfTheLastRecordIsTakenOver) {
  PlayerRecord last = Player(3, "Bell", "Di", "Bees", "B Grade");
  last.Reserved1 = March(17);
  LayPlayersEndingWith(last);
  Open();
  Add();
  EXPECT_EQ(League().back().Reserved1, March(17));
}

TEST_F(AddPlayer, TheBestOfThreeCodeIsThatOfTheGrade) {
  LayPlayersEndingWith(Player(3, "Bell", "Di", "Bees", "B Grade", 111));
  Open();
  Add();
  EXPECT_EQ(League().back().BestOfThree, 303);
}

TEST_F(AddPlayer, AnotherGradeTypedGetsTheCodeOfTheOneInHand) {
  LayPlayersEndingWith(Player(3, "Bell", "Di", "Bees", "B Grade", 111));
  Open();
  Do("type txtAddGrd0 B Grade");
  Add();
  EXPECT_EQ(Trim(League().back().Grade), "B Grade");
  EXPECT_EQ(League().back().BestOfThree, 303);
}

TEST_F(AddPlayer, AnotherTeamTypedIsNotAmongThePlayersOfThisOne) {
  Open();
  Do("type txtAddTm0 Lions");
  Add();
  EXPECT_EQ(Lines("lstResPlayers").size(), 8U);
  Do("pick cboResTeam =Lions");
  EXPECT_EQ(Lines("lstResPlayers"), (TextList{"Lamb,  Max", "Hall,  Joy"}));
}

TEST_F(AddPlayer, ANameThatIsThereAlreadyIsTaken) {
  Open();
  Add("Hill", "Al");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(League().size(), 17U);
}

TEST_F(AddPlayer, EachOfTheFourBoxesMustHoldSomething) {
  Open();
  const std::string before = File(kLeagueFile);
  for (const char* empty : {"txtAddSn0", "txtAddFn0", "txtAddTm0", "txtAddGrd0"}) {
    SCOPED_TRACE(empty);
    TypeInto({{"txtAddSn0", "Hall"},
              {"txtAddFn0", "Joy"},
              {"txtAddTm0", "Hawks"},
              {"txtAddGrd0", "A Grade"}});
    DoAll({"type " + std::string(empty) + " ", "click cmdAddSave0"});
    EXPECT_EQ(TheBox(), "Surname & First name\rmust be completed.");
    EXPECT_EQ(Boxes().front().style, 48);
    EXPECT_EQ(Focus(), "frmResults.txtAddSn0");
  }
  EXPECT_EQ(File(kLeagueFile), before);
  EXPECT_EQ(Count("sound"), 0);
}

TEST_F(AddPlayer, ARefusalLeavesTheTeamsWithinReachBesideThePanel) {
  Open();
  Do("click cmdAddSave0");
  ExpectOpen();
  EXPECT_TRUE(Enabled("fraTeams"));
  Do("pick lstResPlayers =Hill,  Al");
  EXPECT_TRUE(Shown("fraResults"));
  EXPECT_TRUE(Shown("panResAddPlayer"));
}

TEST_F(AddPlayer, ARefusedPanelIsWorkedOnBesideTheSheetOfAPickedPlayer) {
  Open();
  DoAll({"click cmdAddSave0", "pick lstResPlayers =Hill,  Al"});
  TypeInto({{"txtAgg", "300"},
            {"txtAddSn0", "Hall"},
            {"txtAddFn0", "Joy"},
            {"txtAddTm0", "Hawks"},
            {"txtAddGrd0", "A Grade"}});
  EXPECT_EQ(Focus(), "frmResults.txtAddGrd0");
  Do("click cmdAddSave0");
  EXPECT_EQ(League().size(), 17U);
  EXPECT_FALSE(Shown("panResAddPlayer"));
  // The sheet stays, and beside it what the panel had taken the place of.
  EXPECT_TRUE(Shown("fraResults"));
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_EQ(Text("txtAgg"), "300");
  DoAll({"click chkFF", "click cmdMakeWorkDate", "click cmdSave"});
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].ID, 11);
}

TEST_F(AddPlayer, BlanksAreTakenForANameAsTyped) {
  Open();
  Add("  ", " Joy");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(League().back().Surname, std::string(30, ' '));
  EXPECT_EQ(League().back().FirstName, FixedWidth(" Joy", 30));
}

TEST_F(AddPlayer, NamesOf31CharactersAreCutTo30) {
  Open();
  Add(std::string(30, 'S') + "x", std::string(30, 'F') + "x");
  EXPECT_EQ(League().back().Surname, std::string(30, 'S'));
  EXPECT_EQ(League().back().FirstName, std::string(30, 'F'));
  EXPECT_EQ(Trim(League().back().Team), "Hawks");
}

TEST_F(AddPlayer, NamesWithCommasAndQuotesComeBackAsTheyAre) {
  Open();
  Add("O'Dea, Jr", "\"Ace\"");
  EXPECT_EQ(Lines("lstResPlayers").back(), "O'Dea, Jr,  \"Ace\"");
}

TEST_F(AddPlayer, AHalfRecordAtTheEndOfTheFileIsWrittenOver) {
  WriteFile(kLeagueFile, FileOf(LeaguePlayers()) + std::string(70, 'x'));
  Open();
  Add();
  std::vector<PlayerRecord> expected = LeaguePlayers();
  expected.push_back(Player(52, "Hall", "Joy", "Hawks", "A Grade", 333));
  EXPECT_TRUE(SamePlayers(File(kLeagueFile), FileOf(expected)));
}

TEST_F(AddPlayer, CancelAddsNobody) {
  Open();
  DoAll({"type txtAddSn0 Hall", "type txtAddFn0 Joy", "click cmdAddCancel0"});
  ExpectClosed();
  EXPECT_EQ(File(kLeagueFile), FileOf(LeaguePlayers()));
}

TEST_F(AddPlayer, EscCancels) {
  Open();
  Do("key Esc");
  ExpectClosed();
}

TEST_F(AddPlayer, HelpOpensItsTopic) {
  Open();
  Do("click SSCommand1");
  ASSERT_EQ(Count("help"), 1);
  EXPECT_EQ(EventsNamed("help").front(), Json::parse(R"({"file":"qz1.HLP","topic":255})"));
  Do("key F1");
  EXPECT_EQ(EventsNamed("help").front(), Json::parse(R"({"file":"qz1.HLP","topic":255})"));
  DoAll({"click cmdAddCancel0", "key F1"});
  EXPECT_EQ(EventsNamed("help").front(), Json::parse(R"({"file":"qz1.HLP","topic":140})"));
}

TEST_F(AddPlayer, EnterGoesThroughTheBoxesToSave) {
  Open();
  DoAll({"type txtAddSn0 Hall", "key Enter", "type txtAddFn0 Joy", "key Enter"});
  EXPECT_EQ(Focus(), "frmResults.txtAddTm0");
  DoAll({"key Enter", "key Enter"});
  EXPECT_EQ(Focus(), "frmResults.cmdAddSave0");
  Do("key Enter");
  EXPECT_EQ(League().size(), 17U);
}

TEST_F(AddPlayer, NoResultsFileChanges) {
  const std::vector<ResultRecord> results = {Night(11, "Hawks", "Lions")};
  WriteResults(kAResults, results);
  Open();
  Add();
  EXPECT_EQ(File(kAResults), FileOf(results));
  EXPECT_EQ(Lines("lstFinished"), TextList{"Hill,  Al"});
}

}  // namespace
}  // namespace marlowbeck
