// Another opposition for all that a team has entered on a date.

#include "data/text.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

class ChangeOpposition : public ScoreSheets {
 protected:
  /// Lays the results and opens the panel for a team.
  void Open(const std::vector<ResultRecord>& results, const std::string& team = "Hawks") {
    WriteResults(kAResults, results);
    OpenTeam(team);
    Do("click panChangeOpp");
  }
  /// Chooses an opposition and says yes.
  void SwapTo(const std::string& opposition) {
    DoAll({"pick cboReDoOpp =" + opposition, "answer yes", "click cmdSaveOp"});
  }
  /// The panel was opened on 24 March, where Cubs and Rovers were free, and is still open on the
  /// 31st, where the two have met.
  void OpenOnTheDateBefore() {
    WriteResults(kAResults, {Night(11, "Hawks", "Lions", 24), Night(11, "Hawks", "Lions"),
                             Night(1, "Rovers", "Cubs")});
    OpenTeam("Hawks");
    DoAll({"click cmdPrevDate", "click panChangeOpp", "click cmdNextDate"});
  }
  void ExpectClosed() {
    EXPECT_TRUE(Shown("fraTeams"));
    EXPECT_FALSE(Shown("fraReDoOpp"));
  }

  const std::vector<ResultRecord> entered = {
      Night(11, "Hawks", "Lions", 24), Night(11, "Hawks", "Lions"), Night(1, "Rovers", "Gone"),
      Night(12, "Hawks", "Lions")};
};

TEST_F(ChangeOpposition, ThePanelComesUpInThePlaceOfTheTeams) {
  Open(entered);
  EXPECT_TRUE(Shown("fraReDoOpp"));
  EXPECT_FALSE(Shown("fraTeams"));
  EXPECT_EQ(Caption("fraReDoOpp"), "Hawks");
  EXPECT_EQ(Caption("lblReDoOpp"),
            "Choose another Opposition Team other than Lions, from the drop down list below. "
            "Your selection will be changed for all results on: 31/03/2004");
}

TEST_F(ChangeOpposition, CaptionsOfTheCommands) {
  Open(entered);
  EXPECT_EQ(Caption("cmdSaveOp"), "Save");
  EXPECT_EQ(Caption("SSCommand3"), "Cancel");
}

TEST_F(ChangeOpposition, TheFreeTeamsAreOfferedAndTheFirstIsSelected) {
  Open({entered[1]});
  EXPECT_EQ(Lines("cboReDoOpp"), (TextList{"Cubs", "Rovers"}));
  EXPECT_EQ(Text("cboReDoOpp"), "Cubs");
}

TEST_F(ChangeOpposition, ATeamThatOnlyStandsAsTeamOnTheDateIsNotOffered) {
  Open(entered);  // Rovers met a team that is gone
  EXPECT_EQ(Lines("cboReDoOpp"), TextList{"Cubs"});
}

TEST_F(ChangeOpposition, OpenedAgainItOffersNoTeamTwice) {
  Open({entered[1]});
  DoAll({"click SSCommand3", "click panChangeOpp"});
  EXPECT_EQ(Lines("cboReDoOpp"), (TextList{"Cubs", "Rovers"}));
}

TEST_F(ChangeOpposition, WhatLiesBehindStaysWithinReach) {
  Open(entered);
  EXPECT_TRUE(Shown("fraResControls"));
  Do("click panAddNames");
  EXPECT_TRUE(Shown("fraReDoOpp"));
  EXPECT_TRUE(Shown("panResAddPlayer"));
  EXPECT_FALSE(Shown("fraResControls"));
}

TEST_F(ChangeOpposition, CancelBringsTheTeamsBack) {
  Open(entered);
  Do("click SSCommand3");
  ExpectClosed();
  EXPECT_EQ(File(kAResults), FileOf(entered));
}

TEST_F(ChangeOpposition, EscCancels) {
  Open(entered);
  Do("key Esc");
  ExpectClosed();
}

TEST_F(ChangeOpposition, TheSameOppositionClosesWithoutAWord) {
  OpenTeam("Hawks");
  // Nothing is entered yet, so that the opposition in hand is among those that are free.
  DoAll({"click panChangeOpp", "click cmdSaveOp"});
  EXPECT_TRUE(BoxTexts().empty());
  ExpectClosed();
}

TEST_F(ChangeOpposition, AsksInTheToldWords) {
  Open(entered);
  DoAll({"answer no", "click cmdSaveOp"});
  EXPECT_EQ(TheBox(),
            "You are about to swap Cubs for Lions\ras the opposition for Hawks on 31/03/2004\r\r"
            "Do you still want to make the change?");
  EXPECT_EQ(Boxes().front().style, 68);
}

TEST_F(ChangeOpposition, NoChangesNothing) {
  Open(entered);
  DoAll({"answer no", "click cmdSaveOp"});
  EXPECT_EQ(File(kAResults), FileOf(entered));
  ExpectClosed();
  EXPECT_EQ(Text("cboResTeam"), "Hawks");
  EXPECT_EQ(Text("cboOpp"), "Lions");
}

TEST_F(ChangeOpposition, OnNoTheResultsFileIsLeftOpen) {
  HOLDS_FOR_MODELS_ALONE("the count of file operations is that of one face");
  Open(entered);
  const auto still_open = [&] {
    return Faults().Done(FileOperation::Open) - Faults().Done(FileOperation::Close);
  };
  const long before = still_open();
  DoAll({"answer no", "click cmdSaveOp"});
  EXPECT_EQ(still_open(), before + 1);
  Do("pick cboResTeam =Hawks");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(still_open(), before);
}

TEST_F(ChangeOpposition, YesChangesTheResultsOfTheTeamAndDateAlone) {
  Open(entered);
  SwapTo("Cubs");
  std::vector<ResultRecord> expected = entered;
  expected[1].Opposition = "Cubs";
  expected[3].Opposition = "Cubs";
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(expected)));
  EXPECT_EQ(Count("sound"), 0);
}

TEST_F(ChangeOpposition, EveryOppositionOfTheTeamOnTheDateBecomesTheNewOne) {
  std::vector<ResultRecord> results = {entered[1], entered[3]};
  results[1].Opposition = "Eagles";
  Open(results);
  SwapTo("Rovers");
  for (ResultRecord& result : results) result.Opposition = "Rovers";
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(results)));
}

TEST_F(ChangeOpposition, NoOtherFileChanges) {
  WriteFile("Winter_A Grade.qzl", std::string(160, '\x01'));
  Open(entered);
  SwapTo("Cubs");
  EXPECT_EQ(File(kLeagueFile), FileOf(LeaguePlayers()));
  EXPECT_EQ(File("Winter_A Grade.qzl"), std::string(160, '\x01'));
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-31#\r\n");
  EXPECT_FALSE(HasFile("Winter_A Grade.qzr.new"));
}

TEST_F(ChangeOpposition, BytesBehindTheLastWholeRecordStay) {
  WriteFile(kAResults, FileOf(entered) + "half a record");
  OpenTeam("Hawks");
  Do("click panChangeOpp");
  SwapTo("Cubs");
  EXPECT_TRUE(File(kAResults).ends_with("half a record"));
}

TEST_F(ChangeOpposition, AfterwardsTheFirstTeamOfTheGradeIsPicked) {
  Open(entered);
  SwapTo("Cubs");
  ExpectClosed();
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_EQ(Text("cboResTeam"), "Cubs");
  EXPECT_EQ(Text("cboOpp"), "Hawks");
  EXPECT_FALSE(Enabled("cboOpp"));
  EXPECT_EQ(Caption("lblHeader(2)"), "CUBS  v's  HAWKS");
  Do("pick cboResTeam =Hawks");
  EXPECT_EQ(Text("cboOpp"), "Cubs");
  EXPECT_EQ(Lines("lstFinished"), (TextList{"Hill,  Al", "Hope,  Bo"}));
}

TEST_F(ChangeOpposition, AfterwardsTheDatesAreThoseOfTheWorkDateWhichIsKept) {
  WriteResults(kAResults, entered);
  OpenTeam("Hawks");
  DoAll({"click cmdPrevDate", "click panChangeOpp"});
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-31#\r\n");
  SwapTo("Cubs");
  EXPECT_EQ(Saved()[0].Opposition, FixedWidth("Cubs", 30));
  EXPECT_EQ(Saved()[1].Opposition, FixedWidth("Lions", 30));
  EXPECT_EQ(DateOf("Cal"), "2004-03-24");
  EXPECT_EQ(DateOf("EdCal"), "2004-03-24");
  // Listing the teams anew has blanked every box of the screen.
  EXPECT_EQ(Text("txtDayName"), "");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-24#\r\n");
}

TEST_F(ChangeOpposition, ADatePickedMeanwhileGivesWayToTheWorkDate) {
  Open(entered);
  DoAll({"click cmdChangeGrade", "date Cal 2004-04-07"});
  SwapTo("Cubs");
  EXPECT_EQ(Trim(Saved()[1].Opposition), "Cubs");
  EXPECT_EQ(DateOf("Cal"), "2004-03-31");
  EXPECT_EQ(DateOf("EdCal"), "2004-03-31");
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 31 March 2004");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-31#\r\n");
}

TEST_F(ChangeOpposition, WithNothingEnteredNothingIsWritten) {
  WriteResults(kAResults, {entered[0]});
  OpenTeam("Hawks");
  Do("click panChangeOpp");
  EXPECT_EQ(Lines("cboReDoOpp"), (TextList{"Cubs", "Lions", "Rovers"}));
  SwapTo("Rovers");
  EXPECT_EQ(TheBox(),
            "You are about to swap Rovers for Cubs\ras the opposition for Hawks on 31/03/2004\r\r"
            "Do you still want to make the change?");
  EXPECT_EQ(File(kAResults), FileOf(std::vector{entered[0]}));
}

TEST_F(ChangeOpposition, AnOppositionThatSomebodyElseMeetsIsRefused) {
  OpenOnTheDateBefore();
  const std::string before = File(kAResults);
  DoAll({"pick cboReDoOpp =Cubs", "click cmdSaveOp"});
  EXPECT_EQ(TheBox(), "Cubs and Rovers\rplayed on 31/03/2004. This change cannot be made.");
  EXPECT_EQ(Boxes().front().style, 48);
  EXPECT_EQ(File(kAResults), before);
  ExpectClosed();
}

TEST_F(ChangeOpposition, ARefusalNamesTheFirstTeamOfTheFile) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions", 24), Night(11, "Hawks", "Lions"),
                           Night(5, "Eagles", "Cubs"), Night(1, "Rovers", "Cubs")});
  OpenTeam("Hawks");
  DoAll({"click cmdPrevDate", "click panChangeOpp", "click cmdNextDate", "click cmdSaveOp"});
  EXPECT_EQ(TheBox(), "Cubs and Eagles\rplayed on 31/03/2004. This change cannot be made.");
}

TEST_F(ChangeOpposition, ASideThatOnlyStandsAsTeamIsNotRefused) {
  OpenOnTheDateBefore();
  SwapTo("Rovers");
  EXPECT_EQ(TheBox(),
            "You are about to swap Rovers for Lions\ras the opposition for Hawks on 31/03/2004\r\r"
            "Do you still want to make the change?");
  EXPECT_EQ(Trim(Saved()[1].Opposition), "Rovers");
  EXPECT_EQ(Trim(Saved()[2].Opposition), "Cubs");
}

TEST_F(ChangeOpposition, AnOppositionThatIsNoTeamOfTheGradeAnyMoreCanBeSwapped) {
  Open({Night(11, "Hawks", "Eagles")});
  EXPECT_EQ(Lines("cboReDoOpp"), (TextList{"Cubs", "Lions", "Rovers"}));
  SwapTo("Lions");
  EXPECT_EQ(Trim(Saved()[0].Opposition), "Lions");
}

TEST_F(ChangeOpposition, NamesOfThirtyCharactersWithCommasAndQuotesComeBackAsTheyAre) {
  const std::string longest = "The \"Long, Long\" Name of Teams";
  ASSERT_EQ(longest.size(), 30U);
  WritePlayers(kLeagueFile, {Player(11, "Hill", "Al", "Hawks", "A Grade"),
                             Player(1, "Reed", "Jo", "Lions", "A Grade"),
                             Player(2, "Rudd", "Jo", longest, "A Grade")});
  Open({entered[1]});
  SwapTo(longest);
  EXPECT_EQ(Saved()[0].Opposition, longest);
}

TEST_F(ChangeOpposition, AForfeitIsChangedToo) {
  std::vector<ResultRecord> results = {entered[1], entered[3]};
  results[1].Forfeit = "F";
  Open(results);
  SwapTo("Cubs");
  for (ResultRecord& result : results) result.Opposition = "Cubs";
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(results)));
}

TEST_F(ChangeOpposition, AnotherGradeMeanwhileShowsTheTeamsBesideThePanel) {
  Open(entered);
  DoAll({"click cmdChangeGrade", "pick cboResGrade =B Grade", "click cmdGotoResults"});
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Shown("fraReDoOpp"));
  // Both are worked.
  DoAll({"pick cboReDoOpp 0", "pick cboResTeam 1", "pick lstResPlayers 0", "click SSCommand3"});
  ExpectClosed();
  EXPECT_TRUE(Shown("fraResults"));
}

}  // namespace
}  // namespace marlowbeck
