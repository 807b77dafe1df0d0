#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

// Putting right what was recorded.
class LadderEditing : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams, ThreeRounds()); }
  void OpenMatch(int line = 0, int day = 17) {
    OpenScores(day);
    Do("pick lstDone " + std::to_string(line));
  }
  TextList Boxed() {
    return {Text("txtEdHome"), Text("txtEdHomeScore"), Text("txtEdAway"), Text("txtEdAwayScore")};
  }
};

TEST_F(LadderEditing, AClickOnAMatchOpensIt) {
  OpenMatch(1);
  EXPECT_EQ(Boxed(), (TextList{"Delta", "4", "Bravo", "7"}));
  EXPECT_EQ(InSession("EditRecord"), 6);
  EXPECT_TRUE(Shown("fraEdScore"));
  EXPECT_FALSE(Shown("fraButtons"));
  EXPECT_EQ(DateOf("EdCal"), "2004-03-17");
  EXPECT_EQ(Caption("lblHeader(0)"), "A");
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 17 March 2004");
  EXPECT_EQ(Focus(), "frmLadder.txtEdHomeScore");
  EXPECT_NE(Refused("click cmdChangeGrade").find("cmdChangeGrade"), std::string::npos);
}

TEST_F(LadderEditing, AClickBesideTheMatchesOpensNone) {
  OpenScores();
  Do("click lstDone");
  EXPECT_FALSE(Shown("fraEdScore"));
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(LadderEditing, AClickBesideTheMatchesOpensNoneOfABlankHomeTeamEither) {
  WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(17, "", 0, "Alpha", 0)}));
  OpenScores();
  Do("click lstDone");
  EXPECT_FALSE(Shown("fraEdScore"));
  // Its name of nothing stands in every line.
  Do("pick lstDone 0");
  EXPECT_EQ(Boxed(), (TextList{"", "0", "Alpha", "0"}));
}

TEST_F(LadderEditing, AMatchJustSavedOpensByItsLine) {
  OpenScores(24);
  TypeMatch("Alpha", "B", "Bravo", "11");
  DoAll({"click cmdRecord", "pick lstDone 0"});
  EXPECT_EQ(Boxed(), (TextList{"Alpha", "0", "Bravo", "11"}));
}

TEST_F(LadderEditing, KeptAHomeTeamIsFoundAnywhereInTheLineAndTheLastMatchCounts) {
  LayGrade(*this, OnePlayerEach({"Red", "Redcliffe", "Kings", "Queens"}),
           {MatchOn(17, "Redcliffe", 6, "Kings", 5), MatchOn(17, "Red", 6, "Queens", 5)});
  OpenMatch(0);
  EXPECT_EQ(Boxed()[0], "Red");
  EXPECT_EQ(InSession("EditRecord"), 2);
  Do("click cmdCancelEdit");
  Do("pick lstDone 1");
  EXPECT_EQ(Boxed()[0], "Red");
}

TEST_F(LadderEditing, TheLineOfTheOtherTeamOpensTheRightMatchWhereTheLongerNameIsLast) {
  LayGrade(*this, OnePlayerEach({"Red", "Redcliffe", "Kings", "Queens"}),
           {MatchOn(17, "Red", 6, "Queens", 5), MatchOn(17, "Redcliffe", 6, "Kings", 5)});
  OpenMatch(1);
  EXPECT_EQ(Boxed()[0], "Redcliffe");
  DoAll({"click cmdCancelEdit", "pick lstDone 0"});
  EXPECT_EQ(Boxed()[0], "Red");
}

TEST_F(LadderEditing, ALineWhoseMatchIsGoneOpensNothing) {
  OpenScores();
  WriteFile(kLadderOfA, "");
  Do("pick lstDone 0");
  EXPECT_FALSE(Shown("fraEdScore"));
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(LadderEditing, CancelLeadsBackToTheScores) {
  OpenMatch();
  DoAll({"type txtEdHomeScore 9", "click cmdCancelEdit"});
  EXPECT_FALSE(Shown("fraEdScore"));
  EXPECT_TRUE(Shown("fraScoresIn"));
  EXPECT_TRUE(Shown("fraButtons"));
  EXPECT_TRUE(Enabled("cmdFirst"));
  EXPECT_EQ(Focus(), "frmLadder.cmdExit");
  EXPECT_TRUE(OnFile(ThreeRounds()));
}

TEST_F(LadderEditing, ScoresAreSavedListedAndHeard) {
  OpenMatch(0);
  DoAll({"type txtEdHomeScore 2", "type txtEdAwayScore 9", "click cmdSaveEdit"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_EQ(Matches()[4].HomeScore, 2);
  EXPECT_EQ(Matches()[4].AwayScore, 9);
  EXPECT_EQ(Lines("lstDone")[0], "Charlie (9) defeated  Alpha (2)  ");
  EXPECT_FALSE(Shown("fraEdScore"));
  EXPECT_TRUE(Shown("fraButtons"));
  EXPECT_TRUE(Shown("fraScoresIn"));
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(LadderEditing, KeptAnEditTakesOverThePenaltiesOfTheLastMatchOfTheFile) {
  std::vector<LadderRecord> matches = ThreeRounds();
  matches[0] = Adjusted(matches[0], 5, 6);
  matches[5] = Adjusted(matches[5], 3, -1);
  WriteFile(kLadderOfA, FileOf(matches));
  OpenMatch(0, 3);
  Do("click cmdSaveEdit");
  matches[0] = Adjusted(matches[0], 3, -1);
  EXPECT_TRUE(OnFile(matches));
}

TEST_F(LadderEditing, TheQuestionsAreThoseOfTheEntry) {
  OpenMatch(0);
  const std::vector<std::array<std::string, 3>> refused = {
      {"-1", "5", "Scores must be in the range from (0 to 11).    "},
      {"5", "12", "Scores must be in the range from (0 to 11).    "},
      {"7", "5", "Combined scores can't total more than 11"},
      {"5", "5", "Both scores are the same!    \rDo you wish to record a DRAW?    "},
      {"4", "3", "Scores don't add up to 11.   \rDo you still wish to record them?    "}};
  for (const auto& [home, away, box] : refused) {
    SCOPED_TRACE(home + " " + away);
    DoAll({"forget", "type txtEdHomeScore " + home, "type txtEdAwayScore " + away});
    if (box.find('?') != std::string::npos) Do("answer no");
    Do("click cmdSaveEdit");
    EXPECT_EQ(BoxTexts(), TextList{box});
    EXPECT_EQ(Boxed(), (TextList{"Alpha", "6", "Charlie", "5"}));
    EXPECT_EQ(Focus(), "frmLadder.txtEdHomeScore");
    EXPECT_TRUE(Shown("fraEdScore"));
    EXPECT_TRUE(OnFile(ThreeRounds()));
  }
}

TEST_F(LadderEditing, ARefusedEditLeavesTheLastMatchesPenaltiesToBeTakenOverAllTheSame) {
  OpenMatch(0, 3);
  DoAll({"type txtEdHomeScore 12", "click cmdSaveEdit", "type txtEdHomeScore 7",
         "click cmdSaveEdit"});
  EXPECT_EQ(Matches()[0].AwayPenalty, -1);
}

TEST_F(LadderEditing, AnsweredYesADrawIsSaved) {
  OpenMatch(0);
  DoAll({"type txtEdHomeScore 5.5", "type txtEdAwayScore 5.5", "answer yes", "click cmdSaveEdit"});
  EXPECT_EQ(Matches()[4].HomeScore, 6);
  EXPECT_EQ(Matches()[4].AwayScore, 6);
}

TEST_F(LadderEditing, AnotherDateMovesTheMatchAndLeavesTheWorkDateAlone) {
  OpenMatch(0);
  DoAll({"date EdCal 2004-03-24", "click cmdSaveEdit"});
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 17 March 2004");
  EXPECT_EQ(InSession("WorkDate"), "2004-03-17");
  EXPECT_EQ(Lines("lstDone"), TextList{"Bravo (7) defeated  Delta (4)  "});
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Alpha", "Charlie"}));
  EXPECT_EQ(Matches().back().HomeTeam.substr(0, 5), "Alpha");
  EXPECT_EQ(InSession("DateCount"), 4);
}

TEST_F(LadderEditing, APickedDatePutsTheFocusOnTheScore) {
  OpenMatch(0);
  DoAll({"focus cmdSaveEdit", "date EdCal 2004-03-24"});
  EXPECT_EQ(Focus(), "frmLadder.txtEdHomeScore");
}

TEST_F(LadderEditing, ATeamWithAMatchOnTheNewDateStaysWhereItIs) {
  OpenMatch(0);
  DoAll({"type txtEdHomeScore 7", "type txtEdAwayScore 4", "date EdCal 2004-03-10",
         "click cmdSaveEdit"});
  EXPECT_EQ(BoxTexts(), TextList{"Alpha and Charlie\r has scores recorded for 10/03/2004    \r\r"
                                 "Please select another date.    "});
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_TRUE(OnFile(ThreeRounds()));
  EXPECT_TRUE(Shown("fraEdScore"));
  EXPECT_EQ(Boxed()[1], "7");
}

TEST_F(LadderEditing, TheHomeTeamIsFoundOnEitherSideOfAnotherMatch) {
  WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(10, "Delta", 8, "Alpha", 3),
                                           MatchOn(17, "Alpha", 6, "Charlie", 5)}));
  OpenMatch(0);
  DoAll({"date EdCal 2004-03-10", "click cmdSaveEdit"});
  EXPECT_EQ(Boxes().size(), 1U);
  WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(10, "Alpha", 8, "Delta", 3),
                                           MatchOn(17, "Alpha", 6, "Charlie", 5)}));
  Do("click cmdSaveEdit");
  EXPECT_EQ(Boxes().size(), 1U);
}

TEST_F(LadderEditing, KeptTheAwayTeamIsNotLookedForOnTheNewDate) {
  const std::vector<LadderRecord> matches = {MatchOn(10, "Delta", 8, "Charlie", 3),
                                             MatchOn(17, "Alpha", 6, "Charlie", 5)};
  WriteFile(kLadderOfA, FileOf(matches));
  OpenMatch(0);
  DoAll({"date EdCal 2004-03-10", "click cmdSaveEdit"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Matches()[1].GameDate, *DateFromIso("2004-03-10"));
}

TEST_F(LadderEditing, OfTheSameDateNoMatchIsInTheWay) {
  WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(17, "Alpha", 6, "Charlie", 5),
                                           MatchOn(17, "Bravo", 6, "Alpha", 5)}));
  OpenMatch(0);
  DoAll({"type txtEdHomeScore 7", "type txtEdAwayScore 4", "click cmdSaveEdit"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Count("sound"), 1);
}

TEST_F(LadderEditing, AMatchIsDeletedOnceThatIsConfirmed) {
  OpenMatch(1);
  DoAll({"answer ok", "click cmdDeleteEdit"});
  EXPECT_EQ(BoxTexts(), TextList{"W A R N I N G !\r\rYou are about to Delete scores for    \r"
                                 "Delta v's Bravo    \rrecorded on 17/03/2004    "});
  EXPECT_EQ(Boxes()[0].style, 17);
  std::vector<LadderRecord> expected = ThreeRounds();
  expected.pop_back();
  EXPECT_TRUE(OnFile(expected));
  EXPECT_FALSE(Shown("fraEdScore"));
  EXPECT_TRUE(Shown("fraButtons"));
  EXPECT_EQ(Lines("lstTeams"), (TextList{"Bravo", "Delta"}));
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_FALSE(HasFile("TEMP.RES"));
}

TEST_F(LadderEditing, ADeletionThatIsNotMeantChangesNothing) {
  OpenMatch(1);
  DoAll({"answer cancel", "click cmdDeleteEdit"});
  EXPECT_TRUE(OnFile(ThreeRounds()));
  EXPECT_TRUE(Shown("fraEdScore"));
  EXPECT_EQ(Focus(), "frmLadder.txtEdHomeScore");
}

TEST_F(LadderEditing, TheLastMatchCanBeDeleted) {
  WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(17, "Alpha", 6, "Charlie", 5)}));
  OpenMatch(0);
  DoAll({"answer ok", "click cmdDeleteEdit"});
  EXPECT_EQ(File(kLadderOfA), "");
  EXPECT_EQ(InSession("DateCount"), 0);
}

TEST_F(LadderEditing, AByeCanBeOpenedAndSaved) {
  WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(17, "Alpha", 0, "", 0)}));
  OpenMatch(0);
  EXPECT_EQ(Boxed(), (TextList{"Alpha", "0", "", "0"}));
  DoAll({"answer yes", "click cmdSaveEdit"});
  EXPECT_TRUE(OnFile({MatchOn(17, "Alpha", 0, "", 0)}));
}

// The walk along the dates.
class LadderDates : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams, ThreeRounds()); }
  std::string Day() { return DateOf("Cal"); }
};

TEST_F(LadderDates, WithoutDatesOnlyTheFirstAndTheLastBeep) {
  DeleteFile(kLadderOfA);
  OpenScores();
  for (const auto& [button, beeps] : std::vector<std::pair<std::string, int>>{
           {"cmdFirst", 1}, {"cmdLast", 1}, {"cmdNextDate", 0}, {"cmdPrevDate", 0}}) {
    Do("click " + button);
    EXPECT_EQ(Count("beep"), beeps) << button;
    EXPECT_EQ(Day(), "2004-03-17");
  }
}

TEST_F(LadderDates, FirstAndLastBeepAndGoThere) {
  OpenScores(10);
  Do("click cmdFirst");
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(Day(), "2004-03-03");
  EXPECT_EQ(DateOf("EdCal"), "2004-03-03");
  EXPECT_EQ(Text("txtDayName"), "Wednesday");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-03#\r\n");
  EXPECT_EQ(Lines("lstDone").size(), 2U);
  Do("click cmdLast");
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(Day(), "2004-03-17");
}

TEST_F(LadderDates, LastOnTheLastDateBeepsAndDoesNothingMore) {
  OpenScores();
  WriteFile("WkDate.qz3", "#2004-01-01#\r\n");
  Do("click cmdLast");
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(File("WkDate.qz3"), "#2004-01-01#\r\n");
}

TEST_F(LadderDates, PlainStepsAreSilentAndTheEndsBeep) {
  OpenScores(3);
  Do("click cmdNextDate");
  EXPECT_EQ(Day(), "2004-03-10");
  EXPECT_EQ(Count("beep"), 0);
  Do("click cmdNextDate");
  EXPECT_EQ(Day(), "2004-03-17");
  EXPECT_EQ(Count("beep"), 1);
  WriteFile("WkDate.qz3", "#2004-01-01#\r\n");
  Do("click cmdNextDate");
  EXPECT_EQ(Day(), "2004-03-17");
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-17#\r\n");  // the panel is filled anew
  Do("click cmdPrevDate");
  EXPECT_EQ(Day(), "2004-03-10");
  EXPECT_EQ(Count("beep"), 0);
  Do("click cmdPrevDate");
  EXPECT_EQ(Day(), "2004-03-03");
  EXPECT_EQ(Count("beep"), 1);
}

TEST_F(LadderDates, ADateBetweenFindsTheNearestOnEitherSide) {
  OpenScores(12);
  Do("click cmdNextDate");
  EXPECT_EQ(Day(), "2004-03-17");
  DoAll({"click cmdChangeGrade", "date Cal 2004-03-12", "click cmdGotoResults"});
  Do("click cmdPrevDate");
  EXPECT_EQ(Day(), "2004-03-10");
}

TEST_F(LadderDates, ADateBeforeAllLandsOnTheFirstEitherWay) {
  OpenScores(1);
  Do("click cmdPrevDate");
  EXPECT_EQ(Day(), "2004-03-03");
  EXPECT_EQ(Count("beep"), 1);
  DoAll({"click cmdChangeGrade", "date Cal 2004-03-01", "click cmdGotoResults"});
  Do("click cmdNextDate");
  EXPECT_EQ(Day(), "2004-03-03");
  EXPECT_EQ(Count("beep"), 0);
}

}  // namespace
}  // namespace marlowbeck
