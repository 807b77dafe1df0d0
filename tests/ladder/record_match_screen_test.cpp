#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

// The save of a match.
class LadderRecording : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams); }
  static constexpr const char* kRange = "Scores must be in the range from (0 to 11).    ";
  static constexpr const char* kDraw =
      "Both scores are the same!    \rDo you wish to record a DRAW?    ";
  static constexpr const char* kTotal =
      "Scores don't add up to 11.   \rDo you still wish to record them?    ";

  void ExpectAskedAgain() {
    EXPECT_EQ(Text("txtHomeScore"), "");
    EXPECT_EQ(Text("txtAwayScore"), "");
    EXPECT_EQ(Text("txtHome"), "Alpha");
    EXPECT_EQ(Focus(), "frmLadder.txtHomeScore");
    EXPECT_TRUE(Matches().empty());
    EXPECT_TRUE(Lines("lstDone").empty());
  }
};

TEST_F(LadderRecording, AMatchIsSavedListedAndHeard) {
  OpenScores();
  TypeMatch("Charlie", "5", "Alpha", "6");
  Do("click cmdRecord");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_TRUE(OnFile({MatchOn(17, "Charlie", 5, "Alpha", 6)}));
  EXPECT_EQ(Lines("lstDone"), TextList{"Alpha (6) defeated  Charlie (5)  "});
  for (const char* box : {"txtHome", "txtAway", "txtHomeScore", "txtAwayScore"})
    EXPECT_EQ(Text(box), "") << box;
  EXPECT_TRUE(Enabled("lstTeams"));
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Bravo", "Delta"}));
  EXPECT_EQ(Caption("lblHomeAway"), "Select HOME TEAM");
  EXPECT_EQ(Focus(), "frmLadder.lstTeams");
  EXPECT_FALSE(Enabled("cmdRecord"));
  EXPECT_EQ(InSession("LadderCount"), 1);
}

TEST_F(LadderRecording, AfterTheLastPairThereIsNoneToEnter) {
  OpenScores();
  TypeMatch("Alpha", "6", "Bravo", "5");
  Do("click cmdRecord");
  TypeMatch("Delta", "6", "Charlie", "5");
  Do("click cmdRecord");
  EXPECT_EQ(Caption("lblHomeAway"), "No Teams to Enter");
  EXPECT_TRUE(Enabled("lstTeams"));
}

TEST_F(LadderRecording, ScoresOutOfRangeAreRefused) {
  OpenScores();
  for (const auto& [home, away] :
       std::vector<std::pair<std::string, std::string>>{{"-1", "5"},
                                                        {"12", "0"},
                                                        {"5", "-0.5"},
                                                        {"0", "11.5"},
                                                        {"99999999999", "1"},
                                                        {"1e300", "1"}}) {
    SCOPED_TRACE(home + " " + away);
    if (Text("txtHome").empty()) DoAll({"pick lstTeams =Alpha", "pick lstTeams =Bravo"});
    DoAll({"type txtHomeScore " + home, "type txtAwayScore " + away, "click cmdRecord"});
    EXPECT_EQ(BoxTexts(), TextList{kRange});
    EXPECT_EQ(Boxes()[0].style, 48);
    ExpectAskedAgain();
  }
}

TEST_F(LadderRecording, MoreGamesThanAMatchHasAreRefused) {
  OpenScores();
  TypeMatch("Alpha", "7", "Bravo", "5");
  Do("click cmdRecord");
  EXPECT_EQ(BoxTexts(), TextList{"Combined scores can't total more than 11"});
  ExpectAskedAgain();
}

TEST_F(LadderRecording, ADrawIsAskedAboutAndItsTotalIsNot) {
  OpenScores();
  TypeMatch("Alpha", "5", "Bravo", "5");
  DoAll({"answer yes", "click cmdRecord"});
  EXPECT_EQ(BoxTexts(), TextList{kDraw});
  EXPECT_EQ(Boxes()[0].style, 68);
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 5, "Bravo", 5)}));
}

TEST_F(LadderRecording, KeptADrawReadsOtherwiseUntilThePanelIsFilledAnew) {
  OpenScores();
  TypeMatch("Alpha", "5", "Bravo", "5");
  DoAll({"answer yes", "click cmdRecord"});
  EXPECT_EQ(Lines("lstDone"), TextList{"Alpha (5) drew  Bravo (5)  "});
  DoAll({"click cmdPL", "click cmdSC"});
  EXPECT_EQ(Lines("lstDone"), TextList{"Bravo (5) drew with  Alpha (5)  "});
}

TEST_F(LadderRecording, ADrawThatIsNotMeantIsNotSaved) {
  OpenScores();
  TypeMatch("Alpha", "5", "Bravo", "5");
  DoAll({"answer no", "click cmdRecord"});
  ExpectAskedAgain();
}

TEST_F(LadderRecording, AShortTotalIsAskedAbout) {
  OpenScores();
  TypeMatch("Alpha", "4", "Bravo", "3");
  DoAll({"answer no", "click cmdRecord"});
  EXPECT_EQ(BoxTexts(), TextList{kTotal});
  EXPECT_EQ(Boxes()[0].style, 68);
  ExpectAskedAgain();
  DoAll({"type txtHomeScore 4", "type txtAwayScore 3", "answer yes", "click cmdRecord"});
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 4, "Bravo", 3)}));
}

TEST_F(LadderRecording, DecimalScoresAreRoundedToTheEvenNumber) {
  OpenScores();
  TypeMatch("Alpha", "5.5", "Bravo", "5.5");
  DoAll({"answer yes", "click cmdRecord"});
  EXPECT_EQ(BoxTexts(), TextList{kDraw});
  TypeMatch("Charlie", "4.5", "Delta", "6.5");
  Do("click cmdRecord");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 6, "Bravo", 6), MatchOn(17, "Charlie", 4, "Delta", 6)}));
  EXPECT_EQ(Lines("lstDone"),
            (TextList{"Alpha (5.5) drew  Bravo (5.5)  ", "Delta (6.5) defeated  Charlie (4.5)  "}));
}

TEST_F(LadderRecording, ATextIsReadByTheNumberThatItBeginsWith) {
  OpenScores();
  TypeMatch("Alpha", "6 games", "Bravo", "5x");
  Do("click cmdRecord");
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 6, "Bravo", 5)}));
  TypeMatch("Charlie", "won", "Delta", "lost");
  DoAll({"answer yes", "click cmdRecord"});
  EXPECT_EQ(BoxTexts(), TextList{kDraw});
  EXPECT_EQ(Matches()[1].HomeScore, 0);
}

TEST_F(LadderRecording, KeptAByeIsADrawOfNothingAgainstNobody) {
  OpenScores();
  DoAll({"pick lstTeams =Alpha", "type txtHomeScore B", "answer yes", "click cmdRecord"});
  EXPECT_EQ(BoxTexts(), TextList{kDraw});
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 0, "", 0)}));
  EXPECT_EQ(Lines("lstDone"), TextList{"Alpha (B) drew   ()  "});
}

TEST_F(LadderRecording, AnAwayTeamThatWentBackIsNotTheByesOpponent) {
  OpenScores();
  DoAll({"pick lstTeams =Alpha", "pick lstTeams =Bravo", "click cmdBackAway", "type txtHomeScore B",
         "answer yes", "click cmdRecord"});
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 0, "", 0)}));
}

TEST_F(LadderRecording, AByeWithAnAwayTeamIsAMatchOfNoneToTheScore) {
  OpenScores();
  TypeMatch("Alpha", "B", "Bravo", "11");
  Do("click cmdRecord");
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 0, "Bravo", 11)}));
}

TEST_F(LadderRecording, KeptTheOddTeamCanHaveItsByeOnceThePanelIsFilledAnew) {
  LayGrade(*this, OnePlayerEach({"Alpha", "Bravo", "Charlie"}),
           {MatchOn(10, "Alpha", 6, "Bravo", 5)});
  OpenScores();
  TypeMatch("Alpha", "6", "Bravo", "5");
  Do("click cmdRecord");
  EXPECT_EQ(Lines("lstTeams"), TextList{"Charlie"});
  EXPECT_FALSE(Enabled("lstTeams"));
  EXPECT_EQ(Caption("lblHomeAway"), "Select HOME TEAM");
  DoAll({"click cmdPrevDate", "click cmdNextDate"});
  EXPECT_EQ(Lines("lstTeams"), TextList{"Charlie"});
  EXPECT_TRUE(Enabled("lstTeams"));
  Do("pick lstTeams =Charlie");
  EXPECT_EQ(Caption("lblHomeAway"), "");
  EXPECT_EQ(Focus(), "frmLadder.txtHomeScore");
  DoAll({"type txtHomeScore B", "answer yes", "click cmdRecord"});
  EXPECT_EQ(Caption("lblHomeAway"), "No Teams to Enter");
  EXPECT_EQ(Matches().size(), 3U);
}

TEST_F(LadderRecording, TheFileIsKeptInDateOrderAndWithinADateInTheOrderOfEntry) {
  LayGrade(*this, OnePlayerEach(kFourTeams), ThreeRounds());
  OpenScores(10);
  DoAll({"click cmdChangeGrade", "date Cal 2004-03-05", "click cmdGotoResults"});
  TypeMatch("Delta", "6", "Alpha", "5");
  Do("click cmdRecord");
  TypeMatch("Bravo", "6", "Charlie", "5");
  Do("click cmdRecord");
  std::vector<LadderRecord> expected = ThreeRounds();
  expected.insert(expected.begin() + 2,
                  {MatchOn(5, "Delta", 6, "Alpha", 5), MatchOn(5, "Bravo", 6, "Charlie", 5)});
  EXPECT_TRUE(OnFile(expected));
  EXPECT_FALSE(HasFile("dates.qz3"));
}

TEST_F(LadderRecording, PenaltiesOnFileAreNotTouched) {
  LayGrade(*this, OnePlayerEach(kFourTeams), ThreeRounds());
  OpenScores(24);
  TypeMatch("Delta", "6", "Alpha", "5");
  Do("click cmdRecord");
  EXPECT_EQ(Matches()[5].AwayPenalty, -1);
  EXPECT_EQ(Matches()[6].AwayPenalty, 0);
}

TEST_F(LadderRecording, TheDateButtonsLearnOfANewDateWhenThePanelIsNextFilled) {
  LayGrade(*this, OnePlayerEach(kFourTeams), ThreeRounds());
  OpenScores(24);
  TypeMatch("Delta", "6", "Alpha", "5");
  Do("click cmdRecord");
  EXPECT_EQ(InSession("DateCount"), 3);
  Do("click cmdLast");
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 17 March 2004");
  EXPECT_EQ(InSession("DateCount"), 4);
}

TEST_F(LadderRecording, AMatchThatDidNotReachTheDiskIsNotSavedTwice) {
  HOLDS_FOR_MODELS_ALONE("the fault is one of files");
  OpenScores();
  TypeMatch("Alpha", "6", "Bravo", "5");
  DoAll({"fault sync 1 57", "click cmdRecord"});
  EXPECT_EQ(Errors(), (std::vector<int>{57}));
  EXPECT_EQ(Count("sound"), 0);
  EXPECT_TRUE(Lines("lstDone").empty());
  EXPECT_EQ(Text("txtHome"), "Alpha");
  Do("click cmdRecord");
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 6, "Bravo", 5)}));
}

TEST_F(LadderRecording, AMatchThatIsSavedStandsThereNoMoreThoughTheSortFails) {
  HOLDS_FOR_MODELS_ALONE("the fault is one of files");
  OpenScores();
  TypeMatch("Alpha", "6", "Bravo", "5");
  DoAll({"fault rename 1 75", "click cmdRecord"});
  EXPECT_EQ(Errors(), (std::vector<int>{75}));
  EXPECT_EQ(Text("txtHome"), "");
  EXPECT_EQ(Lines("lstDone").size(), 1U);
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 6, "Bravo", 5)}));
  EXPECT_FALSE(HasFile("dates.qz3"));
}

TEST_F(LadderRecording, KeptRecordsOfALongerWorkFileEndUpBehindTheMatches) {
  const LadderRecord stray = MatchOn(1, "Stray", 6, "Other", 5);
  WriteFile("dates.qz3", FileOf(std::vector<LadderRecord>(3, stray)));
  OpenScores();
  TypeMatch("Alpha", "6", "Bravo", "5");
  Do("click cmdRecord");
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 6, "Bravo", 5), stray, stray}));
}

}  // namespace
}  // namespace marlowbeck
