// Every file operation of a save failed once, cut once and killed once: the results file is the old
// or the new, and the next sheet can be saved.

#include "support/league.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

std::vector<ResultRecord> Before() {
  return {Night(31, "Cubs", "Rovers"), Night(11, "Hawks", "Lions"), Night(12, "Hawks", "Lions")};
}

ResultRecord NewOne() {
  ResultRecord saved = Night(13, "Hawks", "Lions");
  saved.Aggregate = 1000;
  saved.Shots = 50;
  return saved;
}

void TypeSheet(Club& club) {
  for (const auto& [box, text] : GoodSheet()) club.Do("type " + box + " " + text);
}

void LeadToNewSheet(Club& club) {
  LayLeague(club);
  club.WriteResults(kAResults, Before());
  club.DoAll(ToTeam("A Grade", "Hawks"));
  club.Do("pick lstResPlayers =Hunt,  Cy");
  TypeSheet(club);
}

void LeadToCorrection(Club& club) {
  LayLeague(club);
  club.WriteResults(kAResults, Before());
  club.DoAll(ToTeam("A Grade", "Hawks"));
  club.DoAll({"pick lstFinished =Hill,  Al", "type txtAgg 960", "focus cmdSave"});
}

/// The results file is one of the two, and what follows can be done.
void ExpectOldOrNew(Club& club, const std::vector<ResultRecord>& after) {
  const std::string file = club.File(kAResults);
  const std::string old_file = FileOf(Before());
  const std::size_t whole = file.size() / kResultLength * kResultLength;
  const bool is_old = file.substr(0, whole) == old_file;
  EXPECT_TRUE(is_old || SameResults(file, FileOf(after)));
  EXPECT_EQ(club.File(kLeagueFile), FileOf(LeaguePlayers()));
  EXPECT_EQ(club.File("WkDate.qz3"), "#2004-03-31#\r\n");
  club.Try("close frmResults");
  club.DoAll(ToTeam("A Grade", "Hawks"));
  club.Do("pick lstResPlayers =Hogg,  Ida");
  TypeSheet(club);
  club.Do("click cmdSave");
  EXPECT_EQ(club.Results(kAResults).size(), (is_old ? Before() : after).size() + 1);
}

SweptWork NewSheet() {
  return {LeadToNewSheet, {"click cmdSave"}, [](Club& club) {
            std::vector<ResultRecord> after = Before();
            after.push_back(NewOne());
            ExpectOldOrNew(club, after);
          }};
}

SweptWork Correction() {
  return {LeadToCorrection, {"click cmdSave"}, [](Club& club) {
            std::vector<ResultRecord> after = Before();
            after[1].Aggregate = 960;
            ExpectOldOrNew(club, after);
          }};
}

TEST(ScoreSheetFaults, ANewSheetIsWholeOrNotThereWhateverFails) {
  EXPECT_GT(SweepFailures(NewSheet()), 5);
  EXPECT_GT(SweepFailures(NewSheet(), 57), 5);
}

TEST(ScoreSheetFaults, ANewSheetIsWholeOrNotThereWhereAWriteIsCut) {
  EXPECT_GE(SweepCutWrites(NewSheet()), 1);
}

TEST(ScoreSheetFaults, ANewSheetIsWholeOrNotThereAfterAPowerCut) {
  EXPECT_GT(SweepPowerCuts(NewSheet()), 5);
}

TEST(ScoreSheetFaults, ASheetSavedAgainAfterItDidNotReachTheDiskStandsOnce) {
  Club club(ModelFaceAlone());
  LeadToNewSheet(club);
  club.DoAll({"fault sync 1 57", "click cmdSave"});
  EXPECT_EQ(club.Count("sound"), 0);
  EXPECT_EQ(club.Count("error"), 1);
  club.Do("click cmdSave");
  EXPECT_EQ(club.Count("sound"), 1);
  std::vector<ResultRecord> after = Before();
  after.push_back(NewOne());
  EXPECT_TRUE(SameResults(club.File(kAResults), FileOf(after)));
}

TEST(ScoreSheetFaults, ACorrectionIsOldOrNewWhateverFails) {
  EXPECT_GT(SweepFailures(Correction()), 5);
}

TEST(ScoreSheetFaults, ACorrectionIsOldOrNewWhereAWriteIsCut) {
  EXPECT_GE(SweepCutWrites(Correction()), 1);
}

TEST(ScoreSheetFaults, ACorrectionIsOldOrNewAfterAPowerCut) {
  EXPECT_GT(SweepPowerCuts(Correction()), 5);
}

TEST(ScoreSheetFaults, ASheetThatCannotBeReadIsNotLeftHalfOpen) {
  const SweptWork work = {[](Club& club) {
                            LayLeague(club);
                            club.WriteResults(kAResults, Before());
                            club.DoAll(ToTeam("A Grade", "Hawks"));
                            club.Do("focus lstFinished");
                          },
                          {"pick lstFinished =Hill,  Al"},
                          [](Club& club) {
                            const bool open = club.Shown("fraResults");
                            EXPECT_EQ(open, club.Shown("fraEdButtons"));
                            EXPECT_NE(open, club.Shown("fraTeams"));
                            EXPECT_NE(open, club.Shown("fraResControls"));
                            EXPECT_EQ(club.InSession("EditRecord"), open ? 2 : 0);
                            EXPECT_EQ(club.Text("txtAgg"), open ? "950" : "");
                            EXPECT_EQ(club.File(kAResults), FileOf(Before()));
                          }};
  EXPECT_GT(SweepFailures(work), 5);
}

TEST(ScoreSheetFaults, EnteringAGradeAndKeepingTheWorkDateLeaveAWholeDate) {
  const SweptWork work = {[](Club& club) {
                            LayLeague(club);
                            club.DoAll({"click imgSheets", "date Cal 2004-04-07"});
                          },
                          {"click cmdGotoResults"},
                          [](Club& club) {
                            const std::string date = club.File("WkDate.qz3");
                            EXPECT_TRUE(date == "#2004-03-31#\r\n" || date == "#2004-04-07#\r\n")
                                << date;
                            EXPECT_EQ(club.File(kLeagueFile), FileOf(LeaguePlayers()));
                          }};
  EXPECT_GT(SweepFailures(work), 5);
  EXPECT_GT(SweepPowerCuts(work), 5);
}

TEST(ScoreSheetFaults, LeavingAFileOutOfOrderNeverLosesARecord) {
  const SweptWork work = {[](Club& club) {
                            LayLeague(club);
                            club.WriteResults(kAResults, {Night(11, "Hawks", "Lions", 10),
                                                          Night(12, "Hawks", "Lions", 3)});
                            club.DoAll(ToTeam("A Grade", "Hawks"));
                          },
                          {"click cmdLeaveResults"},
                          [](Club& club) {
                            EXPECT_EQ(club.Results(kAResults).size(), 2U);
                            EXPECT_EQ(club.Front(), "frmDB");
                          }};
  EXPECT_GT(SweepFailures(work), 5);
  EXPECT_GT(SweepPowerCuts(work), 5);
}

}  // namespace
}  // namespace marlowbeck
