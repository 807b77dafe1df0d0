// A saved result deleted from its sheet.

#include "data/text.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

constexpr const char* kWorkFile = "Winter_A Grade.qz3";

class DeleteScore : public ScoreSheets {
 protected:
  /// Lays the results and opens a line of the entered players of Hawks.
  void Open(const std::vector<ResultRecord>& results, const std::string& line = "Hill,  Al") {
    WriteResults(kAResults, results);
    OpenTeam("Hawks");
    Do("pick lstFinished =" + line);
  }
  void Delete() { DoAll({"answer yes", "click cmdEdDelete"}); }

  const std::vector<ResultRecord> four = {Night(31, "Cubs", "Rovers"), Night(11, "Hawks", "Lions"),
                                          Night(12, "Hawks", "Lions"),
                                          Night(11, "Hawks", "Cubs", 24)};
};

TEST_F(DeleteScore, AsksWithTeamDateAndTheTrimmedName) {
  Open(four);
  DoAll({"answer no", "click cmdEdDelete"});
  EXPECT_EQ(TheBox(),
            "W A R N I N G !\rYou are about to Delete results from\rHawks\r"
            "recorded on 31/03/2004\r\rPlayer:  Al Hill\r\rAre you Sure ?");
  EXPECT_EQ(Boxes().front().style, 68);
}

TEST_F(DeleteScore, NamesTheWorkDateAlsoWhenAnotherWasPickedOnTheSheet) {
  Open(four);
  DoAll({"date EdCal 2004-03-24", "answer no", "click cmdEdDelete"});
  EXPECT_NE(TheBox().find("recorded on 31/03/2004\r"), std::string::npos);
}

TEST_F(DeleteScore, NoGoesBackToTheListsAndChangesNothing) {
  Open(four);
  const std::string before = File(kAResults);
  DoAll({"answer no", "click cmdEdDelete"});
  EXPECT_EQ(File(kAResults), before);
  EXPECT_FALSE(HasFile(kWorkFile));
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_FALSE(Shown("fraEdButtons"));
  EXPECT_EQ(Focus(), "frmResults.lstResPlayers");
}

TEST_F(DeleteScore, YesTakesOutTheOneRecordAndKeepsTheOrderOfTheOthers) {
  Open(four);
  Delete();
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{four[0], four[2], four[3]})));
  EXPECT_FALSE(HasFile(kWorkFile));
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(Count("sound"), 0);
}

TEST_F(DeleteScore, YesGoesBackToTheListsWhereThePlayerIsToBeEnteredAgain) {
  Open(four);
  Delete();
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_FALSE(Shown("fraEdButtons"));
  EXPECT_EQ(Lines("lstFinished"), TextList{"Hope,  Bo"});
  EXPECT_EQ(Lines("lstResPlayers").front(), "Hill,  Al");
  EXPECT_EQ(Text("cboOpp"), "Lions");
  EXPECT_FALSE(Enabled("cboOpp"));
  EXPECT_TRUE(Enabled("cboResTeam"));
}

TEST_F(DeleteScore, TheOppositionIsFreeAgainAfterTheLastResultOfTheDate) {
  Open({Night(11, "Hawks", "Lions")});
  Delete();
  EXPECT_TRUE(Enabled("cboOpp"));
  EXPECT_EQ(Lines("cboOpp"), (TextList{"Cubs", "Lions", "Rovers"}));
}

TEST_F(DeleteScore, TheOnlyRecordLeavesAFileOfNoBytes) {
  Open({Night(11, "Hawks", "Lions")});
  Delete();
  EXPECT_EQ(File(kAResults), "");
  EXPECT_EQ(InSession("ResultCount"), 0);
}

TEST_F(DeleteScore, AForfeitGoesAsAnyRecord) {
  std::vector<ResultRecord> results = four;
  results[1].Forfeit = "F";
  Open(results);
  EXPECT_TRUE(Ticked("chkFF"));
  Delete();
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{four[0], four[2], four[3]})));
}

TEST_F(DeleteScore, OfTwoResultsOfAPlayerTheLastGoes) {
  ResultRecord second = four[1];
  second.Aggregate = 700;
  Open({four[1], second, four[2]});
  Delete();
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{four[1], four[2]})));
  EXPECT_EQ(Lines("lstFinished"), (TextList{"Hill,  Al", "Hope,  Bo"}));
}

TEST_F(DeleteScore, TheFirstAndTheLastRecordOfTheFileGoAsAnyOther) {
  Open({four[1], four[0], four[2]});
  Delete();
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{four[0], four[2]})));
  Do("pick lstFinished =Hope,  Bo");
  Delete();
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{four[0]})));
}

TEST_F(DeleteScore, NoOtherFileChanges) {
  WriteFile(kALadder, std::string(160, '\x01'));
  WriteResults(kBResults, {Night(41, "Bees", "Crows")});
  Open(four);
  Delete();
  EXPECT_EQ(File(kLeagueFile), FileOf(LeaguePlayers()));
  EXPECT_EQ(File(kALadder), std::string(160, '\x01'));
  EXPECT_EQ(File(kBResults), FileOf(std::vector{Night(41, "Bees", "Crows")}));
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-31#\r\n");
}

TEST_F(DeleteScore, RecordsOfNonsenseKeepTheirBytes) {
  const std::string nonsense = std::string(148, '\xFF') + std::string(148, '\0');
  WriteFile(kAResults, nonsense + FileOf(std::vector{four[1]}) + nonsense);
  OpenTeam("Hawks");
  Do("pick lstFinished 0");
  Delete();
  EXPECT_EQ(File(kAResults), nonsense + nonsense);
}

TEST_F(DeleteScore, BytesBehindTheLastWholeRecordGoWithIt) {
  WriteFile(kAResults, FileOf(four) + "half a record");
  OpenTeam("Hawks");
  Do("pick lstFinished 0");
  Delete();
  EXPECT_EQ(File(kAResults), FileOf(std::vector{four[0], four[2], four[3]}));
}

TEST_F(DeleteScore, ALongerWorkFileOfBeforeLeavesItsLastRecordsBehindTheOthers) {
  const ResultRecord stale = Night(99, "Old", "Gone", 3);
  WriteResults(kWorkFile, {stale, stale, stale, stale, stale});
  Open(four);
  Delete();
  EXPECT_TRUE(
      SameResults(File(kAResults), FileOf(std::vector{four[0], four[2], four[3], stale, stale})));
  EXPECT_EQ(InSession("ResultCount"), 5);
}

TEST_F(DeleteScore, NamesWithCommasAndQuotesStandInTheQuestionAsTheyAre) {
  WritePlayers(kLeagueFile, {Player(1, "O'Dea, Jr", "\"Ace\"", "Nags, Old", "A Grade"),
                             Player(2, "Hill", "Al", "Hawks", "A Grade")});
  WriteResults(kAResults, {Night(1, "Nags, Old", "Hawks")});
  OpenTeam("Nags, Old");
  DoAll({"pick lstFinished 0", "answer yes", "click cmdEdDelete"});
  EXPECT_EQ(TheBox(),
            "W A R N I N G !\rYou are about to Delete results from\rNags, Old\r"
            "recorded on 31/03/2004\r\rPlayer:  \"Ace\" O'Dea, Jr\r\rAre you Sure ?");
  EXPECT_EQ(File(kAResults), "");
}

TEST_F(DeleteScore, ANewSheetHasNothingToDelete) {
  OpenSheet();
  EXPECT_FALSE(Shown("cmdEdDelete"));
}

TEST_F(DeleteScore, AfterADeletionTheNextSheetIsANewRecord) {
  Open(four);
  Delete();
  SaveGoodSheet("Hill,  Al");
  const std::vector<ResultRecord> saved = Saved();
  ASSERT_EQ(saved.size(), 4U);
  EXPECT_EQ(saved[3].ID, 11);
  EXPECT_EQ(saved[3].Aggregate, 1000);
}

TEST_F(DeleteScore, AfterTheOnlyRecordTheNextOneTakesNothingOver) {
  ResultRecord only = Night(11, "Hawks", "Lions");
  only.Grade = "Old Name";
  Open({only});
  Delete();
  SaveGoodSheet("Hill,  Al");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Grade, std::string(20, ' '));
}

TEST_F(DeleteScore, AnUnansweredQuestionIsANo) {
  Open(four);
  const std::string before = File(kAResults);
  Do("click cmdEdDelete");
  EXPECT_TRUE(Boxes().front().unexpected);
  EXPECT_EQ(File(kAResults), before);
}

}  // namespace
}  // namespace marlowbeck
