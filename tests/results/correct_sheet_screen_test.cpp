// A saved result opened again for correction.

#include "data/text.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

class CorrectSheet : public ScoreSheets {
 protected:
  /// Lays the results and opens the first line of the entered players of Hawks.
  void Open(const std::vector<ResultRecord>& results) {
    WriteResults(kAResults, results);
    OpenTeam("Hawks");
    Do("pick lstFinished 0");
  }
  static ResultRecord Full() {
    ResultRecord result = Night(11, "Hawks", "Lions");
    result.HighScore = 180;
    result.Scores180 = 1;
    result.Pegs = {11, 0, 33, 44, 55, 66};
    return result;
  }
  static ResultRecord Forfeit() {
    ResultRecord result;
    result.ID = 11;
    result.Team = "Hawks";
    result.Opposition = "Lions";
    result.GameDate = March(31);
    result.Forfeit = "F";
    return result;
  }
};

TEST_F(CorrectSheet, ShowsTheSavedFiguresInRed) {
  Open({Full()});
  EXPECT_EQ(Caption("fraResults"), "EDIT Player's Score");
  EXPECT_EQ(Get("fraResults")["color"], "red");
  EXPECT_EQ(Caption("panPlrID"), "11");
  EXPECT_EQ(Text("txtAgg"), "950");
  EXPECT_EQ(Text("txtShots"), "20");
  EXPECT_EQ(Text("txtAvg"), "47.50");
  EXPECT_EQ(Text("txtHS"), "180");
  EXPECT_EQ(Text("txtCent"), "2");
  EXPECT_EQ(Text("txtHowMany180s"), "1");
  EXPECT_EQ(Text("txtP1"), "11");
  EXPECT_EQ(Text("txtP2"), "");
  EXPECT_EQ(Text("txtP6"), "66");
  EXPECT_EQ(Text("txtLegs"), "9");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(CorrectSheet, ShowsTheEditOptionsInThePlaceOfTheTeams) {
  Open({Full()});
  EXPECT_TRUE(Shown("fraResults"));
  EXPECT_TRUE(Shown("fraEdButtons"));
  EXPECT_FALSE(Shown("fraTeams"));
  EXPECT_FALSE(Shown("fraResControls"));
  EXPECT_EQ(DateOf("EdCal"), "2004-03-31");
  EXPECT_FALSE(Enabled("cboResTeam"));
}

TEST_F(CorrectSheet, IsWrittenOverItsOwnRecord) {
  const std::vector<ResultRecord> results = {Night(31, "Cubs", "Rovers"), Full(),
                                             Night(12, "Hawks", "Lions")};
  Open(results);
  DoAll({"type txtAgg 960", "click cmdSave"});
  std::vector<ResultRecord> expected = results;
  expected[1].Aggregate = 960;
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(expected)));
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(CorrectSheet, KeepsItsOwnGradeField) {
  ResultRecord mine = Full();
  mine.Grade = "Mine";
  ResultRecord last = Night(12, "Hawks", "Lions");
  last.Grade = "Last";
  Open({mine, last});
  DoAll({"type txtAgg 960", "click cmdSave"});
  EXPECT_EQ(Trim(Saved()[0].Grade), "Mine");
}

TEST_F(CorrectSheet, TheLastOfTwoResultsIsTheOneCorrected) {
  ResultRecord second = Full();
  second.Aggregate = 700;
  Open({Full(), second});
  EXPECT_EQ(Text("txtAgg"), "700");
  EXPECT_EQ(InSession("EditRecord"), 2);
}

TEST_F(CorrectSheet, OldPegsInHiddenBoxesSurvive) {
  WritePlayers(kLeagueFile, {Player(1, "Reed", "Jo", "Lions", "A Grade", 111),
                             Player(11, "Hill", "Al", "Hawks", "A Grade", 111)});
  ResultRecord result = Full();
  result.Pegs = {11, 22, 33, 44, 55, 66};
  Open({result});
  EXPECT_FALSE(Shown("txtP2"));
  EXPECT_EQ(Text("txtLegs"), "9");  // those of the record, not three
  DoAll({"type txtAgg 960", "click cmdSave"});
  EXPECT_EQ(Saved()[0].Pegs, (std::array<std::int16_t, 6>{11, 22, 33, 44, 55, 66}));
}

TEST_F(CorrectSheet, CancelChangesNothing) {
  Open({Full()});
  const std::string before = File(kAResults);
  DoAll({"type txtAgg 1", "click cmdResultsCancel"});
  EXPECT_EQ(File(kAResults), before);
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Enabled("cboResTeam"));
  DoAll({"pick lstResPlayers 0"});
  EXPECT_EQ(Caption("fraResults"), "Enter Player's Scores");
  EXPECT_EQ(Get("fraResults")["color"], "black");
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(CorrectSheet, ATooHighAggregateBringsTheOldFiguresBack) {
  Open({Full()});
  TypeInto({{"txtShots", "30"}, {"txtP1", "99"}, {"txtLegs", "5"}, {"txtAgg", "7001"}});
  Do("key Enter");
  EXPECT_EQ(TheBox(), "Score is too high !");
  EXPECT_EQ(Text("txtAgg"), "950");
  EXPECT_EQ(Text("txtShots"), "20");
  EXPECT_EQ(Text("txtP1"), "11");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(CorrectSheet, ARestoredAverageIsAPlainNumber) {
  Open({Full()});
  DoAll({"type txtAgg 7001", "key Enter"});
  EXPECT_EQ(Text("txtAvg"), "47.5");
}

TEST_F(CorrectSheet, TheLegsAreNotRestored) {
  Open({Full()});
  TypeInto({{"txtLegs", "5"}, {"txtAgg", "7001"}});
  Do("key Enter");
  EXPECT_EQ(Text("txtLegs"), "5");
}

TEST_F(CorrectSheet, AFigureThatWasNothingIsNotRestored) {
  Open({Full()});
  TypeInto({{"txtP2", "22"}, {"txtAgg", "7001"}});
  Do("key Enter");
  EXPECT_EQ(Text("txtP2"), "22");
}

TEST_F(CorrectSheet, ATooHighAverageBringsTheOldFiguresBack) {
  Open({Full()});
  TypeInto({{"txtAgg", "5000"}, {"txtShots", "10"}});
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Some entries seem too high !");
  EXPECT_EQ(Text("txtAgg"), "950");
  EXPECT_EQ(Text("txtShots"), "20");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(CorrectSheet, AnotherDateIsSavedWithIt) {
  Open({Full()});
  Do("date EdCal 2004-03-24");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
  // The heading stays that of the date in hand.
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 31 March 2004");
  Do("click cmdSave");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].GameDate, March(24));
  EXPECT_EQ(DateOf("EdCal"), "2004-03-31");
  EXPECT_TRUE(Lines("lstFinished").empty());
}

TEST_F(CorrectSheet, ADateOnWhichThePlayerHasAResultIsRefused) {
  Open({Night(11, "Hawks", "Cubs", 24), Full()});
  const std::string before = File(kAResults);
  DoAll({"type txtAgg 900", "date EdCal 2004-03-24", "click cmdSave"});
  EXPECT_EQ(TheBox(),
            "Player has already had results entered on 24/03/2004.\r"
            "To make this change possible you must first delete, or\r"
            "change the date of results previously entered on 24/03/2004.");
  EXPECT_EQ(File(kAResults), before);
  EXPECT_TRUE(Shown("fraEdButtons"));
  EXPECT_EQ(DateOf("EdCal"), "2004-03-31");
  EXPECT_EQ(Text("txtAgg"), "950");
  Do("click cmdSave");
  EXPECT_EQ(Saved()[1].GameDate, March(31));
}

TEST_F(CorrectSheet, ADateOnWhichOnlyTheTeamHasResultsIsTaken) {
  Open({Night(12, "Hawks", "Cubs", 24), Full()});
  DoAll({"date EdCal 2004-03-24", "click cmdSave"});
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Saved()[1].GameDate, March(24));
}

TEST_F(CorrectSheet, AnotherDateBringsTheGradeOfTheLastRecordAlong) {
  ResultRecord last = Night(12, "Hawks", "Lions");
  last.Grade = "Last";
  Open({Full(), last});
  DoAll({"date EdCal 2004-03-24", "click cmdSave"});
  EXPECT_EQ(Trim(Saved()[0].Grade), "Last");
}

TEST_F(CorrectSheet, AForfeitComesUpTickedAndClosed) {
  Open({Forfeit()});
  EXPECT_TRUE(Ticked("chkFF"));
  EXPECT_FALSE(Enabled("txtAgg"));
  EXPECT_EQ(Text("txtAgg"), "0");
  EXPECT_EQ(Text("txtAvg"), "");
  EXPECT_EQ(Text("txtHS"), "");
}

TEST_F(CorrectSheet, AForfeitUntickedMeetsAllChecks) {
  Open({Forfeit()});
  DoAll({"click chkFF", "click cmdSave"});
  EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
  TypeInto(GoodSheet());
  Do("click cmdSave");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Forfeit, std::string(30, ' '));
  EXPECT_EQ(Saved()[0].Aggregate, 1000);
}

TEST_F(CorrectSheet, AForfeitUntickedLeavesTheBoxesBlank) {
  ResultRecord forfeit = Forfeit();
  forfeit.HighScore = 60;
  forfeit.Pegs = {0, 0, 0, 0, 40, 0};
  Open({forfeit});
  Do("click chkFF");
  for (const char* box : {"txtAgg", "txtShots", "txtAvg", "txtHS", "txtCent", "txtHowMany180s",
                          "txtP1", "txtP2", "txtP3", "txtP4", "txtP5", "txtP6", "txtLegs"}) {
    EXPECT_EQ(Text(box), "") << box;
    EXPECT_TRUE(Enabled(box)) << box;
  }
}

TEST_F(CorrectSheet, ANightCanBecomeAForfeit) {
  Open({Full()});
  DoAll({"click chkFF", "click cmdSave"});
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{Forfeit()})));
}

TEST_F(CorrectSheet, AnotherDateOfAForfeitIgnoresTheClosedBoxAndIsSaved) {
  Open({Forfeit()});
  Do("date EdCal 2004-03-24");
  EXPECT_NE(Focus(), "frmResults.txtAgg");
  EXPECT_EQ(InSession("WorkDate"), "2004-03-31");
  Do("click cmdSave");
  EXPECT_EQ(Saved()[0].GameDate, March(24));
}

TEST_F(CorrectSheet, TheSecondOfTwoPlayersOfOneNameCannotBeReached) {
  WritePlayers(kLeagueFile, {Player(7, "Hill", "Al", "Hawks", "A Grade"),
                             Player(8, "Hill", "Al", "Hawks", "A Grade"),
                             Player(1, "Reed", "Jo", "Lions", "A Grade")});
  Open({Night(8, "Hawks", "Lions")});
  EXPECT_EQ(Caption("panPlrID"), "7");
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(Text("txtAgg"), "");
}

TEST_F(CorrectSheet, ASheetWhoseRecordIsNotFoundTakesTheGradeOfTheFirstOneAlong) {
  WritePlayers(kLeagueFile, {Player(7, "Hill", "Al", "Hawks", "A Grade"),
                             Player(8, "Hill", "Al", "Hawks", "A Grade"),
                             Player(1, "Reed", "Jo", "Lions", "A Grade")});
  ResultRecord first = Night(8, "Hawks", "Lions");
  first.Grade = "First";
  ResultRecord last = Night(1, "Lions", "Hawks");
  last.Grade = "Last";
  // The search for a record of player 7 goes from the last one back to the first.
  Open({first, last});
  TypeInto(GoodSheet());
  Do("click cmdSave");
  ASSERT_EQ(Saved().size(), 3U);
  EXPECT_EQ(Saved()[2].ID, 7);
  EXPECT_EQ(Trim(Saved()[2].Grade), "First");
}

TEST_F(CorrectSheet, NegativeFiguresAreLeftOutOfTheBoxes) {
  ResultRecord result = Full();
  result.HighScore = -5;
  result.Legs = -1;
  Open({result});
  EXPECT_EQ(Text("txtHS"), "");
  EXPECT_EQ(Text("txtLegs"), "");
}

}  // namespace
}  // namespace marlowbeck
