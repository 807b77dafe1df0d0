#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

// The entry panel: teams picked off the list and put back, and when a match can be saved.
class LadderEntry : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams, ThreeRounds()); }
};

TEST_F(LadderEntry, ListsTheMatchesOfTheDateAndTheTeamsWithoutOne) {
  std::vector<LadderRecord> matches = ThreeRounds();
  matches.pop_back();
  WriteFile(kLadderOfA, FileOf(matches));
  OpenScores();
  EXPECT_EQ(Lines("lstDone"), TextList{"Alpha (6) defeated  Charlie (5)  "});
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Bravo", "Delta"}));
  EXPECT_EQ(Caption("lblHomeAway"), "Select HOME TEAM");
  EXPECT_EQ(InSession("TeamCount"), 4);
  EXPECT_EQ(InSession("LadderDate"), "2004-03-17");
}

TEST_F(LadderEntry, ADrawOnFileNamesTheAwayTeamFirst) {
  OpenScores(3);
  EXPECT_EQ(Lines("lstDone"),
            (TextList{"Alpha (7) defeated  Bravo (4)  ", "Delta (5) drew with  Charlie (5)  "}));
}

TEST_F(LadderEntry, WithAMatchForEveryTeamThereIsNoneToEnter) {
  OpenScores();
  EXPECT_TRUE(Lines("lstTeams").empty());
  EXPECT_EQ(Caption("lblHomeAway"), "No Teams to Enter");
  EXPECT_FALSE(Enabled("cmdRecord"));
}

TEST_F(LadderEntry, TheDatesOfTheFileAreLearned) {
  OpenScores(24);
  EXPECT_EQ(InSession("DateCount"), 3);
  EXPECT_EQ(InSession("DateList"), (Json::array({"2004-03-03", "2004-03-10", "2004-03-17"})));
}

TEST_F(LadderEntry, ANewGradeStartsWithAnEmptyFileAndAllTeams) {
  DeleteFile(kLadderOfA);
  OpenScores();
  EXPECT_EQ(Lines("lstTeams"), kFourTeams);
  EXPECT_TRUE(Lines("lstDone").empty());
  EXPECT_EQ(File(kLadderOfA), "");
  EXPECT_EQ(InSession("DateCount"), 0);
}

TEST_F(LadderEntry, TwoClicksPickHomeAndAway) {
  OpenScores(24);
  Do("pick lstTeams =Charlie");
  EXPECT_EQ(Text("txtHome"), "Charlie");
  EXPECT_EQ(InSession("SelectedHome"), "Charlie");
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Alpha", "Bravo", "Delta"}));
  EXPECT_EQ(Caption("lblHomeAway"), "Select AWAY TEAM");
  EXPECT_TRUE(Enabled("cmdHomeBack"));
  EXPECT_FALSE(Enabled("cmdBackAway"));
  Do("pick lstTeams =Alpha");
  EXPECT_EQ(Text("txtAway"), "Alpha");
  EXPECT_EQ(InSession("SelectedAway"), "Alpha");
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Bravo", "Delta"}));
  EXPECT_EQ(Caption("lblHomeAway"), "");
  EXPECT_FALSE(Enabled("lstTeams"));
  EXPECT_TRUE(Enabled("cmdBackAway"));
  EXPECT_EQ(Focus(), "frmLadder.txtHomeScore");
}

TEST_F(LadderEntry, KeysPickAsTheMouseDoes) {
  OpenScores(24);
  DoAll({"focus lstTeams", "key Enter", "key Enter"});
  EXPECT_EQ(Text("txtHome"), "Alpha");
  EXPECT_EQ(Text("txtAway"), "Bravo");
  EXPECT_EQ(Focus(), "frmLadder.txtHomeScore");
  EXPECT_FALSE(Enabled("lstTeams"));
}

TEST_F(LadderEntry, EnterInAScoreBoxMovesOn) {
  OpenScores(24);
  TypeMatch("Alpha", "6", "Bravo", "5");
  DoAll({"focus txtHomeScore", "key Enter"});
  EXPECT_EQ(Focus(), "frmLadder.txtAwayScore");
  Do("key Enter");
  EXPECT_EQ(Focus(), "frmLadder.cmdRecord");
}

TEST_F(LadderEntry, TheHomeTeamGoesBackIntoTheListWithBothScores) {
  OpenScores(24);
  DoAll(
      {"pick lstTeams =Alpha", "type txtHomeScore 6", "type txtAwayScore 5", "click cmdHomeBack"});
  for (const char* box : {"txtHome", "txtHomeScore", "txtAwayScore"}) EXPECT_EQ(Text(box), "");
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Bravo", "Charlie", "Delta", "Alpha"}));
  EXPECT_EQ(Caption("lblHomeAway"), "Select HOME TEAM");
  EXPECT_FALSE(Enabled("cmdHomeBack"));
  EXPECT_EQ(Focus(), "frmLadder.lstTeams");
}

TEST_F(LadderEntry, TheHomeTeamGoesBackAndLeavesTheAwayTeamWithItsScore) {
  OpenScores(24);
  TypeMatch("Alpha", "6", "Bravo", "5");
  Do("click cmdHomeBack");
  EXPECT_EQ(Text("txtHome") + Text("txtHomeScore"), "");
  EXPECT_EQ(Text("txtAway"), "Bravo");
  EXPECT_EQ(Text("txtAwayScore"), "5");
  EXPECT_TRUE(Enabled("lstTeams"));
  EXPECT_FALSE(Enabled("cmdRecord"));
  Do("pick lstTeams =Delta");
  EXPECT_EQ(Text("txtHome"), "Delta");
  EXPECT_EQ(Caption("lblHomeAway"), "");
  EXPECT_EQ(Focus(), "frmLadder.txtHomeScore");
}

TEST_F(LadderEntry, TheAwayTeamGoesBackAndLeavesTheHomeTeamWithItsScore) {
  OpenScores(24);
  TypeMatch("Alpha", "6", "Bravo", "5");
  Do("click cmdBackAway");
  EXPECT_EQ(Text("txtAway") + Text("txtAwayScore"), "");
  EXPECT_EQ(Text("txtHomeScore"), "6");
  EXPECT_EQ(Caption("lblHomeAway"), "Select AWAY TEAM");
  EXPECT_EQ(Lines("lstTeams").back(), "Bravo");
  EXPECT_FALSE(Enabled("cmdBackAway"));
  EXPECT_EQ(Focus(), "frmLadder.lstTeams");
}

TEST_F(LadderEntry, TheAwayTeamGoesBackBehindTheHomeTeam) {
  OpenScores(24);
  TypeMatch("Alpha", "6", "Bravo", "5");
  DoAll({"click cmdHomeBack", "click cmdBackAway"});
  for (const char* box : {"txtHome", "txtAway", "txtHomeScore", "txtAwayScore"})
    EXPECT_EQ(Text(box), "") << box;
  EXPECT_EQ(Caption("lblHomeAway"), "Select HOME TEAM");
  EXPECT_EQ(Lines("lstTeams").size(), 4U);
}

TEST_F(LadderEntry, TheAwayTeamTakesAHomeScoreWithoutATeamAlong) {
  OpenScores(24);
  TypeMatch("Alpha", "6", "Bravo", "5");
  DoAll({"click cmdHomeBack", "type txtHomeScore 3", "click cmdBackAway"});
  EXPECT_EQ(Text("txtHomeScore"), "");
}

TEST_F(LadderEntry, AMatchCanBeSavedOnceAllFourBoxesHoldSomething) {
  OpenScores(24);
  DoAll({"pick lstTeams =Alpha", "pick lstTeams =Bravo"});
  EXPECT_FALSE(Enabled("cmdRecord"));
  Do("type txtHomeScore 6");
  EXPECT_FALSE(Enabled("cmdRecord"));
  Do("type txtAwayScore 5");
  EXPECT_TRUE(Enabled("cmdRecord"));
  Do("type txtHomeScore");
  EXPECT_FALSE(Enabled("cmdRecord"));
}

TEST_F(LadderEntry, AByeCanBeSavedWithBAndNothingOnTheAwaySide) {
  OpenScores(24);
  DoAll({"pick lstTeams =Alpha", "type txtHomeScore b"});
  EXPECT_TRUE(Enabled("cmdRecord"));
  Do("type txtHomeScore B");
  EXPECT_TRUE(Enabled("cmdRecord"));
  Do("type txtAwayScore 1");
  EXPECT_FALSE(Enabled("cmdRecord"));
  Do("type txtAwayScore");
  EXPECT_TRUE(Enabled("cmdRecord"));
  Do("type txtHomeScore BB");
  EXPECT_FALSE(Enabled("cmdRecord"));
  DoAll({"type txtHomeScore B", "pick lstTeams =Bravo"});
  EXPECT_FALSE(Enabled("cmdRecord"));
}

TEST_F(LadderEntry, AClickBesideTheTeamsPicksNone) {
  OpenScores(24);
  Do("click lstTeams");
  EXPECT_EQ(Text("txtHome"), "");
  EXPECT_TRUE(Enabled("lstTeams"));
  EXPECT_EQ(Caption("lblHomeAway"), "Select HOME TEAM");
}

TEST_F(LadderEntry, ABlankTeamStaysInTheListThoughThereIsABye) {
  LayGrade(*this, OnePlayerEach({"", "Alpha", "Bravo"}), {MatchOn(24, "Alpha", 0, "", 0)});
  OpenScores(24);
  EXPECT_EQ(Lines("lstTeams"), (TextList{"", "Bravo"}));
}

TEST_F(LadderEntry, TeamsThatNobodyKnowsTakeNoneOutOfTheList) {
  LayGrade(*this, OnePlayerEach(kFourTeams), {MatchOn(24, "Gone", 6, "Bravo", 5)});
  OpenScores(24);
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Alpha", "Charlie", "Delta"}));
}

}  // namespace
}  // namespace marlowbeck
