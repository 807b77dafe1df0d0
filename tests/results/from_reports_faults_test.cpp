// Every file operation of a correction from the weekly table, and of a change of date, failed once,
// cut once and killed once: the results are the old or the new, the Reports screen is within reach
// again, and what follows can be done.

#include "results/from_reports.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

std::vector<ResultRecord> Before() {
  return {Night(11, "Hawks", "Cubs", 10), Night(11, "Hawks", "Lions", 24),
          Night(12, "Hawks", "Lions", 24), Night(21, "Lions", "Hawks", 24),
          Night(31, "Cubs", "Rovers", 24)};
}

std::vector<ResultRecord> Corrected() {
  std::vector<ResultRecord> after = Before();
  after[1].Aggregate = 960;
  return after;
}

std::vector<ResultRecord> Moved() {
  std::vector<ResultRecord> after = Before();
  for (const std::size_t moved : {1U, 2U, 3U}) after[moved].GameDate = March(31);
  return after;
}

void BreakEverywhere(const SweptWork& work) {
  EXPECT_GT(SweepFailures(work), 10);
  EXPECT_GT(SweepFailures(work, 57), 10);
  EXPECT_GE(SweepCutWrites(work), 1);
  EXPECT_GT(SweepPowerCuts(work), 10);
}

/// Whole records only, and all of them: the old ones or the new.
bool ExpectOldOrNew(Club& club, const std::vector<ResultRecord>& after) {
  const std::string file = club.File(kAResults);
  const bool is_new = file == FileOf(after);
  EXPECT_TRUE(is_new || SameResults(file, FileOf(Before())));
  EXPECT_EQ(club.File(kLeagueFile), FileOf(LeaguePlayers()));
  return is_new;
}

/// What was told agrees with what was done: after a sound it is on the disk.
void ExpectSoundMeansSaved(Club& club, bool is_new) {
  if (club.Count("sound") > 0) {
    EXPECT_TRUE(is_new);
  }
}

void BackToWeekly(Club& club, const char* dialog) {
  if (club.Loaded(dialog)) club.Do(std::string("close ") + dialog);
  if (!club.Loaded("frmPMenu")) return static_cast<void>(club.DoAll(ToWeekly("Hawks")));
  EXPECT_EQ(club.Front(), "frmPMenu");
  club.Do("pick cboResTeam =Hawks");
  EXPECT_EQ(club.Count("error"), 0);
}

TEST(FromReportsFaults, ACorrectionIsOldOrNew) {
  BreakEverywhere({[](Club& club) {
                     LayLeagueForReports(club, Before());
                     club.DoAll(ToWeekly("Hawks"));
                     club.DoAll({"dblcell grdWeek 1 0", "type txtAgg 960", "focus cmdSave"});
                   },
                   {"click cmdSave"},
                   [](Club& club) {
                     const bool is_new = ExpectOldOrNew(club, Corrected());
                     ExpectSoundMeansSaved(club, is_new);
                     BackToWeekly(club, "frmEdScore");
                     EXPECT_EQ(club.Row("grdWeek", 1)[1], is_new ? "960" : "950");
                     club.DoAll({"dblcell grdWeek 1 0", "type txtAgg 970", "click cmdSave"});
                     EXPECT_EQ(club.Results(kAResults)[1].Aggregate, 970);
                   }});
}

TEST(FromReportsFaults, OpeningACorrectionTouchesNoRecord) {
  BreakEverywhere({[](Club& club) {
                     LayLeagueForReports(club, Before());
                     club.DoAll(ToWeekly("Hawks"));
                   },
                   {"dblcell grdWeek 1 0"},
                   [](Club& club) {
                     EXPECT_FALSE(ExpectOldOrNew(club, Corrected()));
                     if (club.Loaded("frmEdScore") && club.InSession("EditRecord") == 0) {
                       // Half opened, nothing can be written from it.
                       club.Try("click cmdSave");
                       EXPECT_EQ(club.File(kAResults), FileOf(Before()));
                     }
                     BackToWeekly(club, "frmEdScore");
                     club.Do("dblcell grdWeek 1 0");
                     EXPECT_EQ(club.Text("txtAgg"), "950");
                   }});
}

TEST(FromReportsFaults, AChangeOfDateIsWholeOrNotMade) {
  BreakEverywhere({[](Club& club) {
                     LayLeagueForReports(club, Before());
                     club.DoAll(ToWeekly("Hawks"));
                     club.DoAll({"click cmdChangeDate", "date NewCal 2004-03-31"});
                   },
                   {"click cmdOK"},
                   [](Club& club) {
                     const bool is_new = ExpectOldOrNew(club, Moved());
                     ExpectSoundMeansSaved(club, is_new);
                     BackToWeekly(club, "frmChangeDate");
                     EXPECT_EQ(club.Lines("lstAllDates").back(),
                               is_new ? "31/03/2004" : "24/03/2004");
                     club.DoAll({"click cmdChangeDate", "date NewCal 2004-04-07", "click cmdOK"});
                     EXPECT_EQ(club.Lines("lstAllDates").back(), "07/04/2004");
                   }});
}

TEST(FromReportsFaults, OpeningAChangeOfDateTouchesNoRecord) {
  BreakEverywhere({[](Club& club) {
                     LayLeagueForReports(club, Before());
                     club.DoAll(ToWeekly("Hawks"));
                   },
                   {"click cmdChangeDate"},
                   [](Club& club) {
                     EXPECT_FALSE(ExpectOldOrNew(club, Moved()));
                     BackToWeekly(club, "frmChangeDate");
                     club.Do("click cmdChangeDate");
                     EXPECT_EQ(club.DateOf("OldCal"), "2004-03-24");
                   }});
}

}  // namespace
}  // namespace marlowbeck
