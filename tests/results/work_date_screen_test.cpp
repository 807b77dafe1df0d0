// Stepping among a team's dates, keeping the work date, and leaving the screen.

#include "data/text.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

class WorkDate : public ScoreSheets {
 protected:
  void SetUp() override {
    ScoreSheets::SetUp();
    WriteResults(kAResults, {Night(11, "Hawks", "Lions", 3), Night(12, "Hawks", "Lions", 3),
                             Night(11, "Hawks", "Cubs", 10), Night(31, "Cubs", "Hawks", 17),
                             Night(11, "Hawks", "Rovers", 24)});
    OpenTeam("Hawks");
  }
  void ExpectAt(const std::string& date, const std::string& caption, int beeps) {
    EXPECT_EQ(DateOf("Cal"), date);
    EXPECT_EQ(DateOf("EdCal"), date);
    EXPECT_EQ(InSession("WorkDate"), date);
    EXPECT_EQ(Caption("cmdMakeWorkDate"), caption);
    EXPECT_EQ(Count("beep"), beeps);
  }
};

TEST_F(WorkDate, TheButtonsBearTheirSigns) {
  EXPECT_EQ(Caption("cmdFirst"), "<<");
  EXPECT_EQ(Caption("cmdPrevDate"), "<");
  EXPECT_EQ(Caption("cmdNextDate"), ">");
  EXPECT_EQ(Caption("cmdLast"), ">>");
}

TEST_F(WorkDate, FirstBeepsAndGoesToTheFirstDate) {
  Do("click cmdFirst");
  ExpectAt("2004-03-03", "Set 03/03/2004 as WorkDate", 1);
  EXPECT_EQ(Text("txtDayName"), "Wednesday");
  EXPECT_EQ(Text("cboOpp"), "Lions");
  EXPECT_EQ(Lines("lstFinished"), (TextList{"Hill,  Al", "Hope,  Bo"}));
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 3 March 2004");
}

TEST_F(WorkDate, LastBeepsAndGoesToTheLastDate) {
  Do("click cmdLast");
  ExpectAt("2004-03-24", "Set 24/03/2004 as WorkDate", 1);
  EXPECT_EQ(Text("cboOpp"), "Rovers");
}

TEST_F(WorkDate, BackGoesToTheDateBefore) {
  Do("click cmdPrevDate");
  ExpectAt("2004-03-24", "Set 24/03/2004 as WorkDate", 0);
  Do("click cmdPrevDate");
  // On the 17th the team stands only as opposition, which is no date of its own.
  ExpectAt("2004-03-10", "Set 10/03/2004 as WorkDate", 0);
  Do("click cmdPrevDate");
  ExpectAt("2004-03-03", "Set 03/03/2004 as WorkDate", 1);
  Do("click cmdPrevDate");
  ExpectAt("2004-03-03", "Set 03/03/2004 as WorkDate", 1);
}

TEST_F(WorkDate, ForwardAsksInOtherWords) {
  Do("click cmdFirst");
  Do("click cmdNextDate");
  ExpectAt("2004-03-10", "Set 10/03/2004 as Work Date?", 0);
}

TEST_F(WorkDate, ForwardOnTheLastDateBeepsAndStays) {
  DoAll({"click cmdLast", "click cmdNextDate"});
  ExpectAt("2004-03-24", "Set 24/03/2004 as Work Date?", 1);
}

TEST_F(WorkDate, ForwardFromBeyondTheLastDateGoesBackToIt) {
  Do("click cmdNextDate");
  ExpectAt("2004-03-24", "Set 24/03/2004 as Work Date?", 1);
}

TEST_F(WorkDate, ATeamWithoutResultsOnlyHearsTheBeepOfFirstAndLast) {
  Do("pick cboResTeam =Rovers");
  for (const auto& [button, beeps] :
       {std::pair{"cmdFirst", 1}, {"cmdLast", 1}, {"cmdNextDate", 0}, {"cmdPrevDate", 0}}) {
    Do(std::string("click ") + button);
    ExpectAt("2004-03-31", "Work Date: 31/03/2004", beeps);
  }
}

TEST_F(WorkDate, SteppingIsNotKept) {
  Do("click cmdFirst");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-31#\r\n");
}

TEST_F(WorkDate, IsKeptWhenAskedTo) {
  DoAll({"click cmdFirst", "click cmdMakeWorkDate"});
  ExpectAt("2004-03-03", "Work Date: 03/03/2004", 0);
  EXPECT_EQ(Text("txtDayName"), "Wednesday");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-03#\r\n");
}

TEST_F(WorkDate, ASheetIsSavedOnTheDateSteppedTo) {
  Do("click cmdFirst");
  SaveGoodSheet("Hunt,  Cy");
  ASSERT_EQ(Saved().size(), 6U);
  EXPECT_EQ(Saved()[5].GameDate, March(3));
  EXPECT_EQ(Trim(Saved()[5].Opposition), "Lions");
}

TEST_F(WorkDate, ADateBeyondTheCalendarEndsInTheErrorBoxAndMovesNothing) {
  ResultRecord odd = Night(11, "Hawks", "Lions");
  odd.GameDate = Date{1e300};
  WriteResults(kAResults, {Night(11, "Hawks", "Lions", 3), odd});
  Do("click cmdLast");
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
  EXPECT_EQ(DateOf("Cal"), "2004-03-31");
  EXPECT_EQ(InSession("WorkDate"), "2004-03-31");
  Do("click cmdFirst");
  EXPECT_EQ(DateOf("Cal"), "2004-03-03");
}

class LeavingTheScoreSheets : public ScoreSheets {};

TEST_F(LeavingTheScoreSheets, AFileInOrderLeadsToTheMainMenu) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions", 3), Night(12, "Hawks", "Lions", 3),
                           Night(11, "Hawks", "Cubs", 10)});
  OpenTeam("Hawks");
  Do("click cmdLeaveResults");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmResults"));
  EXPECT_FALSE(HasFile("resfile.qz3"));
}

TEST_F(LeavingTheScoreSheets, AFileOutOfOrderIsSortedFirst) {
  const std::vector<ResultRecord> results = {Night(11, "Hawks", "Lions", 10),
                                             Night(12, "Hawks", "Lions", 3),
                                             Night(13, "Hawks", "Lions", 10)};
  WriteResults(kAResults, results);
  OpenTeam("Hawks");
  Do("click cmdLeaveResults");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmSort"));
  EXPECT_EQ(File("resfile.qz3"), "\"" + FilePath(kAResults).string() + "\"\r\n");
  EXPECT_TRUE(
      SameResults(File(kAResults), FileOf(std::vector{results[1], results[0], results[2]})));
}

TEST_F(LeavingTheScoreSheets, TheWindowsCloseButtonIsTheSame) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions", 10), Night(12, "Hawks", "Lions", 3)});
  OpenTeam("Hawks");
  Do("close frmResults");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_EQ(Saved()[0].ID, 12);
}

TEST_F(LeavingTheScoreSheets, AnEmptyOrOneRecordFileIsNeverSorted) {
  WriteResults(kAResults, {Night(11, "Hawks", "Lions", 10)});
  OpenTeam("Hawks");
  Do("click cmdLeaveResults");
  EXPECT_FALSE(HasFile("resfile.qz3"));
}

TEST_F(LeavingTheScoreSheets, BeforeAGradeIsChosenMakesNoFile) {
  DoAll({"click imgSheets", "close frmResults"});
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(HasFile(kAResults));
}

TEST_F(LeavingTheScoreSheets, AFailureLeavesNobodyWithoutAScreen) {
  HOLDS_FOR_MODELS_ALONE("the faults of the disk are those of one face");
  OpenTeam("Hawks");
  Faults().FailAt(FileOperation::Open, 1, 57, false);
  Do("click cmdLeaveResults");
  EXPECT_EQ(TheBox(), "DEVICE I/O ERROR    ");
  EXPECT_EQ(Front(), "frmDB");
}

}  // namespace
}  // namespace marlowbeck
