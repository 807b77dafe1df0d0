// Every file operation of a pick, of an answer and of both hand-overs failed once, cut once and
// killed once: the records are never touched, an answer is the old or the new, the tables show a
// night or nothing, and the next pick works.

#include <algorithm>

#include "stats/reports.h"
#include "support/record_files.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

using TextList = Club::TextList;

std::vector<PlayerRecord> Rovers() {
  return {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")};
}

/// Two nights with two rows each, so that what is blank and what is left over can be told apart.
std::vector<ResultRecord> TwoNights() {
  return {Night(1, "Rovers", "Hawks", kFirstNight, 500, 20),
          Night(2, "Rovers", "Hawks", kFirstNight, 300, 10),
          Night(1, "Rovers", "Swifts", kSecondNight, 505, 20),
          ForfeitNight(2, "Rovers", "Swifts", kSecondNight)};
}

/// The second night on the screen.
void LeadToWeekly(Club& club) {
  club.WritePlayers("Winter.qza", Rovers());
  club.WriteResults("Winter_A.qzr", TwoNights());
  club.WriteFile("Winter_A.qzs", "\"Winter 2004\"\r\n");
  club.WriteFile("WkDate.qz3", "#2004-03-31#\r\n");
  club.WriteFile("Forfeits.qz3", "0\r\n");
  club.WriteFile("dc.qz3", "\"Owls\"\r\n");
  club.WriteFile("qzEdScor.qz3", "\"old\"\r\n");
  club.NameOpenFile("Winter.qza");
  club.DoAll({"click imgPrinter", "click Image6"});
}

void ExpectOneOf(const std::string& actual, const std::vector<std::string>& allowed) {
  EXPECT_NE(std::find(allowed.begin(), allowed.end(), actual), allowed.end()) << actual;
}

void ExpectRecordsUntouched(const Club& club) {
  EXPECT_EQ(club.File("Winter.qza"), FileOf(Rovers()));
  EXPECT_EQ(club.File("Winter_A.qzr"), FileOf(TwoNights()));
}

/// From wherever the work ended, back to the weekly report, whose first night can be picked.
void ExpectNextPickWorks(Club& club) {
  club.Try("close frmEdScore");
  club.Try("close frmChangeDate");
  if (!club.Loaded("frmPMenu")) club.DoAll({"click imgPrinter", "click Image6"});
  club.Do("pick lstAllDates 0");
  EXPECT_EQ(club.Count("error"), 0);
  EXPECT_EQ(club.Caption("lblDT"), "17/03/2004 (v's Hawks)");
  EXPECT_EQ(club.Row("grdWeek", 1)[1], "300");
  EXPECT_EQ(club.Row("grdProg", 1)[1], "300");
}

void BreakEverywhere(const SweptWork& work) {
  EXPECT_GT(SweepFailures(work), 3);
  EXPECT_GT(SweepFailures(work, 57), 3);
  EXPECT_GT(SweepCutWrites(work), 0);
  EXPECT_GT(SweepPowerCuts(work), 3);
}

TEST(ReportFaults, APickShowsItsNightOrBlanks) {
  BreakEverywhere({LeadToWeekly, {"pick lstAllDates 0"}, [](Club& club) {
                     ExpectRecordsUntouched(club);
                     EXPECT_EQ(club.File("Forfeits.qz3"), "0\r\n");
                     if (club.Loaded("frmPMenu")) {
                       EXPECT_LE(club.Count("error"), 1);
                       ExpectOneOf(club.Row("grdWeek", 1)[0], {"", "Baker, Al"});
                       ExpectOneOf(club.Row("grdWeek", 2)[1], {"", "500"});
                       ExpectOneOf(club.Row("grdProg", 2)[1], {" ", "500"});
                       ExpectOneOf(club.Caption("lblDT"), {"", "17/03/2004 (v's Hawks)"});
                     }
                     ExpectNextPickWorks(club);
                   }});
}

TEST(ReportFaults, AFailedPickLeavesTheOlderHandOverUnread) {
  const std::string older = "\"Ghost, A\",9,9,9,9,9\r\n0,0,0,0,0,0\r\n";
  const SweptWork work = {[&](Club& club) {
                            LeadToWeekly(club);
                            club.WriteFile("weekly.qz3", older + older);
                          },
                          {"pick lstAllDates 0"},
                          [](Club& club) {
                            for (const TextList& row : club.Cells("grdWeek")) {
                              EXPECT_NE(row[0], "Ghost, A");
                            }
                            ExpectNextPickWorks(club);
                          }};
  EXPECT_GT(SweepFailures(work), 3);
  EXPECT_GT(SweepCutWrites(work), 1);
}

TEST(ReportFaults, AnAnswerIsTheOldOneOrTheNew) {
  BreakEverywhere({LeadToWeekly, {"click optFFyes"}, [](Club& club) {
                     ExpectRecordsUntouched(club);
                     ExpectOneOf(club.File("Forfeits.qz3"), {"0\r\n", "1\r\n"});
                     ExpectNextPickWorks(club);
                   }});
}

TEST(ReportFaults, APlayerHandedOverIsTheOldOneOrTheNew) {
  BreakEverywhere(
      {LeadToWeekly, {"dblcell grdWeek 1 0"}, [](Club& club) {
         ExpectRecordsUntouched(club);
         ExpectOneOf(club.File("qzEdScor.qz3"),
                     {"\"old\"\r\n",
                      "\"A\"\r\n\"Rovers\"\r\n\"Swifts\"\r\n\"24/03/2004\"\r\n\"Archer, Jo\"\r\n"});
         ExpectNextPickWorks(club);
       }});
}

TEST(ReportFaults, ADateAndATeamHandedOverAreTheOldOnesOrTheNew) {
  BreakEverywhere({LeadToWeekly, {"click cmdChangeDate"}, [](Club& club) {
                     ExpectRecordsUntouched(club);
                     ExpectOneOf(club.File("WkDate.qz3"), {"#2004-03-31#\r\n", "#2004-03-24#\r\n"});
                     ExpectOneOf(club.File("dc.qz3"), {"\"Owls\"\r\n", "\"Rovers\"\r\n"});
                     ExpectNextPickWorks(club);
                   }});
}

}  // namespace
}  // namespace marlowbeck
