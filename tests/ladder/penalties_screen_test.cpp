#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

// Points given to a team, and taken from it.
class LadderPenalties : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams, ThreeRounds()); }
  void OpenFor(const std::string& team) {
    OpenLadder();
    DoAll({"click cmdPenalty", "pick lstPenalty =" + team});
  }
  static constexpr const char* kWords =
      "To ADD points, enter the number\ronly. This box can't be left blank.\r\r"
      "To DEDUCT points, enter a MINUS\rsign in front of the number.";
  static constexpr const char* kErase = "\r\rEnter a  ZERO to erase existing adjustment.";

  void ExpectClosed() {
    for (const char* hidden : {"fraPenalty", "fraPenPts"}) EXPECT_FALSE(Shown(hidden)) << hidden;
    for (const char* shown : {"fraButtons", "fraCmds", "fraHelpExit"})
      EXPECT_TRUE(Shown(shown)) << shown;
    EXPECT_TRUE(Enabled("lstTableDates"));
  }
};

TEST_F(LadderPenalties, ThePanelListsTheTeams) {
  OpenLadder();
  Do("click cmdPenalty");
  EXPECT_TRUE(Shown("fraPenalty"));
  for (const char* hidden : {"fraButtons", "fraCmds", "fraHelpExit", "fraPenPts"})
    EXPECT_FALSE(Shown(hidden)) << hidden;
  EXPECT_EQ(Lines("lstPenalty"), kFourTeams);
  EXPECT_FALSE(Enabled("lstTableDates"));
}

TEST_F(LadderPenalties, ATeamComesUpWithItsDateAndNoPoints) {
  OpenFor("Alpha");
  EXPECT_TRUE(Shown("fraPenPts"));
  EXPECT_EQ(Caption("lblPen2"), "Alpha");
  EXPECT_EQ(Caption("lblPen3"), "17/03/2004");
  EXPECT_EQ(Text("txtPenPts"), "");
  EXPECT_EQ(Caption("lblPen1"), kWords);
  EXPECT_EQ(Focus(), "frmLadder.txtPenPts");
  EXPECT_EQ(InSession("Team"), "Alpha");
}

TEST_F(LadderPenalties, PointsThatThereAreComeUpAndCanBeErased) {
  OpenFor("Bravo");
  EXPECT_EQ(Text("txtPenPts"), "-1");
  EXPECT_EQ(Caption("lblPen1"), std::string(kWords) + kErase);
  DoAll({"type txtPenPts 0", "click cmdPenOK"});
  EXPECT_EQ(Matches()[5].AwayPenalty, 0);
  EXPECT_EQ(Row("grdLad", 1),
            (TextList{"Bravo", "3", "2", "1", "0", "17", "16", "106.25", "4", "0"}));
  ExpectClosed();
}

TEST_F(LadderPenalties, PointsOfTheHomeSideGoToTheHomeSide) {
  OpenFor("Delta");
  DoAll({"type txtPenPts 3", "click cmdPenOK"});
  std::vector<LadderRecord> expected = ThreeRounds();
  expected[5].HomePenalty = 3;
  EXPECT_TRUE(OnFile(expected));
  EXPECT_EQ(Row("grdLad", 1),
            (TextList{"Delta", "3", "1", "1", "1", "17", "15", "113.33", "6", "+3"}));
  EXPECT_EQ(Count("sound"), 0);
}

TEST_F(LadderPenalties, EnterInTheBoxSavesToo) {
  OpenFor("Charlie");
  DoAll({"type txtPenPts -2", "key Enter"});
  EXPECT_EQ(Matches()[4].AwayPenalty, -2);
  ExpectClosed();
}

TEST_F(LadderPenalties, ANewValueReplacesTheOld) {
  OpenFor("Bravo");
  DoAll({"type txtPenPts -4", "click cmdPenOK"});
  EXPECT_EQ(Matches()[5].AwayPenalty, -4);
}

TEST_F(LadderPenalties, AnEmptyBoxGetsTheFocusAndNothingElseHappens) {
  OpenFor("Alpha");
  Do("click cmdPenOK");
  EXPECT_EQ(Focus(), "frmLadder.txtPenPts");
  EXPECT_TRUE(Shown("fraPenPts"));
  EXPECT_TRUE(OnFile(ThreeRounds()));
}

TEST_F(LadderPenalties, KeptMorePointsThanGamesAreDroppedWithoutAWordAndFewerHaveNoLimit) {
  OpenFor("Alpha");
  DoAll({"type txtPenPts 12", "click cmdPenOK"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_TRUE(Shown("fraPenPts"));
  EXPECT_TRUE(OnFile(ThreeRounds()));
  DoAll({"type txtPenPts 11", "click cmdPenOK"});
  EXPECT_EQ(Matches()[4].HomePenalty, 11);
  DoAll({"click cmdPenalty", "pick lstPenalty =Alpha", "type txtPenPts -500", "click cmdPenOK"});
  EXPECT_EQ(Matches()[4].HomePenalty, -500);
  EXPECT_EQ(Row("grdLad", 4)[9], "-500");
}

TEST_F(LadderPenalties, DecimalsAreRoundedToTheEvenNumberAndWordsAreZero) {
  OpenFor("Alpha");
  DoAll({"type txtPenPts 2.5", "click cmdPenOK"});
  EXPECT_EQ(Matches()[4].HomePenalty, 2);
  DoAll({"click cmdPenalty", "pick lstPenalty =Alpha", "type txtPenPts none", "click cmdPenOK"});
  EXPECT_EQ(Matches()[4].HomePenalty, 0);
}

TEST_F(LadderPenalties, PointsBelowSixteenBitsAreAnOverflow) {
  OpenFor("Alpha");
  DoAll({"type txtPenPts -40000", "click cmdPenOK"});
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_TRUE(OnFile(ThreeRounds()));
}

TEST_F(LadderPenalties, KeptATeamWithoutAMatchOnTheDateGetsNoneWithoutAWord) {
  LayGrade(*this, OnePlayerEach({"Alpha", "Bravo", "Charlie", "Delta", "Idle"}), ThreeRounds());
  OpenFor("Idle");
  const auto before = Cells("grdLad");
  DoAll({"type txtPenPts -2", "click cmdPenOK"});
  EXPECT_TRUE(OnFile(ThreeRounds()));
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Cells("grdLad"), before);
  ExpectClosed();
}

TEST_F(LadderPenalties, ATeamTwiceOnADateHoldsItsPointsInItsFirstMatch) {
  LayGrade(*this, OnePlayerEach(kFourTeams),
           {MatchOn(17, "Bravo", 6, "Alpha", 5), MatchOn(17, "Alpha", 6, "Charlie", 5)});
  OpenFor("Alpha");
  DoAll({"type txtPenPts 1", "click cmdPenOK"});
  EXPECT_EQ(Matches()[0].AwayPenalty, 1);
  EXPECT_EQ(Matches()[1].HomePenalty, 0);
}

TEST_F(LadderPenalties, OfATeamTwiceOnADateThePointsOfItsFirstMatchComeUp) {
  LayGrade(
      *this, OnePlayerEach(kFourTeams),
      {MatchOn(17, "Bravo", 6, "Alpha", 5), Adjusted(MatchOn(17, "Alpha", 6, "Charlie", 5), 4, 0)});
  OpenFor("Alpha");
  EXPECT_EQ(Text("txtPenPts"), "");
  EXPECT_EQ(Caption("lblPen1"), kWords);
}

TEST_F(LadderPenalties, ABlankTeamHasNoPartInABye) {
  LayGrade(*this, OnePlayerEach({"", "Alpha"}), {Adjusted(MatchOn(17, "Alpha", 0, "", 0), 0, 3)});
  OpenLadder();
  DoAll({"click cmdPenalty", "pick lstPenalty 0"});
  EXPECT_EQ(Text("txtPenPts"), "");
  DoAll({"type txtPenPts 2", "click cmdPenOK"});
  EXPECT_TRUE(OnFile({Adjusted(MatchOn(17, "Alpha", 0, "", 0), 0, 3)}));
}

TEST_F(LadderPenalties, OnlyTheMatchOfTheShownDateIsLookedAt) {
  OpenLadder();
  DoAll({"pick lstTableDates =03/03/2004", "click cmdPenalty", "pick lstPenalty =Bravo"});
  EXPECT_EQ(Text("txtPenPts"), "");
  DoAll({"type txtPenPts 2", "click cmdPenOK"});
  EXPECT_EQ(Matches()[0].AwayPenalty, 2);
  EXPECT_EQ(Matches()[5].AwayPenalty, -1);
  EXPECT_EQ(Caption("lblLadHeader"), "A PREMIERSHIP LADDER up to: Wednesday, 3 March 2004 ");
}

TEST_F(LadderPenalties, BothCancelsChangeNothing) {
  OpenFor("Alpha");
  DoAll({"type txtPenPts 2", "click cmdPenCancel"});
  ExpectClosed();
  DoAll({"click cmdPenalty", "click cmdCancel2"});
  ExpectClosed();
  EXPECT_TRUE(OnFile(ThreeRounds()));
}

}  // namespace
}  // namespace marlowbeck
