#include "support/club.h"
#include "support/record_files.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

ResultRecord Sheet(int id, const char* team, const char* opposition, const char* date) {
  ResultRecord record;
  record.ID = id;
  record.Team = team;
  record.Opposition = opposition;
  record.GameDate = *DateFromIso(date);
  record.Aggregate = 900;
  record.Shots = 45;
  return record;
}

std::vector<ResultRecord> OutOfOrder() {
  return {Sheet(1, "Rovers", "Hawks", "2004-03-10"), Sheet(2, "Hawks", "Rovers", "2004-03-03"),
          Sheet(2, "Hawks", "Rovers", "2004-03-10"), Sheet(1, "Rovers", "Hawks", "2004-03-03")};
}

std::vector<ResultRecord> InOrder() {
  const auto season = OutOfOrder();
  return {season[1], season[3], season[0], season[2]};
}

void LaySeason(Club& club, const std::vector<ResultRecord>& results) {
  club.WritePlayers("Winter.qza", {Player(1, "Archer", "Jo", "Rovers", "A Grade"),
                                   Player(2, "Bull", "Ann", "Hawks", "A Grade")});
  club.WriteResults("Winter_A Grade.qzr", results);
  club.WriteFile("WkDate.qz3", "#2004-03-10#\r\n");
  club.NameOpenFile("Winter.qza");
}

const std::vector<std::string> kLeaveScoreSheets = {"click imgSheets", "click cmdGotoResults",
                                                    "click cmdLeaveResults"};

/// The sort pass, as it is met: on leaving the score sheets.
class SortOnLeaving : public ClubTest {};

TEST_F(SortOnLeaving, FileOutOfDateOrderIsPutInOrder) {
  LaySeason(*this, OutOfOrder());
  DoAll(kLeaveScoreSheets);
  EXPECT_TRUE(SameResults(File("Winter_A Grade.qzr"), FileOf(InOrder())));
  EXPECT_EQ(File("resfile.qz3"), '"' + FilePath("Winter_A Grade.qzr").string() + "\"\r\n");
  EXPECT_FALSE(HasFile("Winter_A Grade.qz3"));
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmSort"));
}

TEST_F(SortOnLeaving, TheFileOfAGradeWithAQuoteAndACommaIsPutInOrderToo) {
  const std::string grade = "\"First\", Last";
  LaySeason(*this, {});
  WritePlayers("Winter.qza", {Player(1, "Archer", "Jo", "Rovers", grade),
                              Player(2, "Bull", "Ann", "Hawks", grade)});
  WriteResults("Winter_" + grade + ".qzr", OutOfOrder());
  DoAll(kLeaveScoreSheets);
  EXPECT_TRUE(SameResults(File("Winter_" + grade + ".qzr"), FileOf(InOrder())));
  EXPECT_FALSE(HasFile("Winter_\"First"));
}

TEST_F(SortOnLeaving, FileInOrderIsNotSortedAgain) {
  LaySeason(*this, InOrder());
  DoAll(kLeaveScoreSheets);
  EXPECT_FALSE(HasFile("resfile.qz3"));
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(SortOnLeaving, EmptyFileNeverReachesTheSort) {
  LaySeason(*this, {});
  DoAll(kLeaveScoreSheets);
  EXPECT_FALSE(HasFile("resfile.qz3"));
  EXPECT_EQ(File("Winter_A Grade.qzr"), "");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(SortOnLeaving, OneRecordNeverReachesTheSort) {
  LaySeason(*this, {OutOfOrder()[0]});
  DoAll(kLeaveScoreSheets);
  EXPECT_FALSE(HasFile("resfile.qz3"));
}

TEST_F(SortOnLeaving, FailureLeavesTheResultsAndLeadsBack) {
  LaySeason(*this, OutOfOrder());
  DoAll({"click imgSheets", "click cmdGotoResults", "fault write 2 61", "click cmdLeaveResults"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"DISK FULL    "}));
  EXPECT_TRUE(SameResults(File("Winter_A Grade.qzr"), FileOf(OutOfOrder())));
  EXPECT_EQ(Front(), "frmDB");
}

void ExpectEitherOrder(Club& club) {
  const std::string results = club.File("Winter_A Grade.qzr");
  EXPECT_TRUE(results == FileOf(OutOfOrder()) || results == FileOf(InOrder()));
  club.DoAll({"fault off", "click mnuAbout", "click cmdOK"});
  EXPECT_EQ(club.Caption("frmDB.lblHMPlayers"), "2 Players Listed in File. ");
}

SweptWork Sorting() {
  return {[](Club& club) {
            LaySeason(club, OutOfOrder());
            club.DoAll({"click imgSheets", "click cmdGotoResults"});
          },
          {"click cmdLeaveResults"},
          ExpectEitherOrder};
}

/// After a failure the program may stand on the screen that could not be left.
void LeadBack(Club& club) {
  club.Do("fault off");
  if (club.Front() != "frmDB") club.Do("click cmdLeaveResults");
  ExpectEitherOrder(club);
}

TEST(SortSweep, EachFailureLeavesOneOrderOrTheOther) {
  SweptWork work = Sorting();
  work.check = LeadBack;
  EXPECT_GT(SweepFailures(work), 8);
}

TEST(SortSweep, EachWriteCutShortLeavesOneOrderOrTheOther) {
  SweptWork work = Sorting();
  work.check = LeadBack;
  EXPECT_GE(SweepCutWrites(work), 2);
}

TEST(SortSweep, EachPowerCutLeavesOneOrderOrTheOther) { EXPECT_GT(SweepPowerCuts(Sorting()), 8); }

}  // namespace
}  // namespace marlowbeck
