// Every file operation of the lists failed once, cut once and killed once: the records are never
// touched, a list is the one that was asked for or none, and the next pick works.

#include <algorithm>

#include "stats/reports.h"
#include "support/record_files.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

using TextList = Club::TextList;

std::vector<PlayerRecord> Players() {
  return {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A"),
          Person(3, "Dean", "Di", "Bees", "B")};
}

std::vector<ResultRecord> NightsOfA() {
  return {Night(1, "Rovers", "Hawks", kFirstNight, 500, 20),
          Night(2, "Rovers", "Hawks", kFirstNight, 300, 10),
          Night(1, "Rovers", "Swifts", kSecondNight, 505, 10)};
}

std::vector<ResultRecord> NightsOfB() { return {Night(3, "Bees", "Crows", kFirstNight, 400, 20)}; }

/// The averages of the second night on the screen.
void LeadToList(Club& club) {
  club.WritePlayers("Winter.qza", Players());
  club.WriteResults("Winter_A.qzr", NightsOfA());
  club.WriteResults("Winter_B.qzr", NightsOfB());
  for (const char* grade : {"A", "B"}) {
    club.WriteFile(std::string("Winter_") + grade + ".qzs", "\"Winter 2004\"\r\n");
  }
  club.NameOpenFile("Winter.qza");
  club.DoAll({"click imgPrinter", "click Image1"});
}

void LeadToProgressive(Club& club) {
  LeadToList(club);
  club.Do("click cmdProgress");
}

void LeadToCombined(Club& club) {
  LeadToList(club);
  club.Do("click cmdCombine");
}

void ExpectRecordsUntouched(const Club& club) {
  EXPECT_EQ(club.File("Winter.qza"), FileOf(Players()));
  EXPECT_EQ(club.File("Winter_A.qzr"), FileOf(NightsOfA()));
  EXPECT_EQ(club.File("Winter_B.qzr"), FileOf(NightsOfB()));
}

TextList Names(Club& club) {
  TextList names;
  const auto cells = club.Cells("grdHI");
  for (std::size_t row = 1; row < cells.size(); ++row) names.push_back(cells[row][1]);
  return names;
}

/// From wherever the work ended, back to the lists, whose first date can be picked.
void ExpectNextPickWorks(Club& club) {
  if (!club.Loaded("frmPMenu")) club.Do("click imgPrinter");
  if (club.Shown("fraMenu")) club.Do("click Image1");
  if (club.Shown("cmdReDoAvgs")) club.Do("click cmdReDoAvgs");
  if (club.Index("cboHiGrade") != 0 || club.Lines("lstHiDates").empty()) {
    club.Do("pick cboHiGrade 0");
  }
  club.Do("pick lstHiDates 0");
  EXPECT_EQ(club.Count("error"), 0);
  EXPECT_TRUE(club.Shown("fraHi"));
  EXPECT_EQ(Names(club), (TextList{"Baker, Al", "Archer, Jo"}));
  EXPECT_EQ(club.Caption("lblHi(1)"), " A    played on:  17/03/2004 ");
}

/// A list that is seen is one of those allowed, and there was one error box at the most.
std::function<void(Club&)> ListIsOneOf(const std::vector<TextList>& allowed) {
  return [allowed](Club& club) {
    ExpectRecordsUntouched(club);
    if (club.Loaded("frmPMenu")) {
      EXPECT_LE(club.Count("error"), 1);
      EXPECT_EQ(club.InSession("Flag"), 0);
      if (club.Shown("fraHi")) {
        EXPECT_NE(std::find(allowed.begin(), allowed.end(), Names(club)), allowed.end());
      }
    }
    ExpectNextPickWorks(club);
  };
}

void BreakEverywhere(const SweptWork& work) {
  EXPECT_GT(SweepFailures(work), 5);
  EXPECT_GT(SweepFailures(work, 57), 5);
  EXPECT_GT(SweepCutWrites(work), 0);
  EXPECT_GT(SweepPowerCuts(work), 5);
}

TEST(ListFaults, APickShowsItsDateOrNone) {
  BreakEverywhere({LeadToList, {"pick lstHiDates 0"}, ListIsOneOf({{"Baker, Al", "Archer, Jo"}})});
}

TEST(ListFaults, AnotherGradeShowsItsListOrNone) {
  // As long as the dates could not be read the list of the grade before stands with its headings.
  BreakEverywhere(
      {LeadToList, {"pick cboHiGrade =B"}, ListIsOneOf({{"Dean, Di"}, {"Archer, Jo"}})});
}

TEST(ListFaults, AProgressiveListIsWholeOrNone) {
  BreakEverywhere({LeadToList, {"click cmdProgress"}, ListIsOneOf({{"Archer, Jo", "Baker, Al"}})});
}

TEST(ListFaults, BackToTheDateShowsItOrNone) {
  BreakEverywhere({LeadToProgressive, {"click cmdProgress"}, ListIsOneOf({{"Archer, Jo"}})});
}

TEST(ListFaults, ACombinedListIsWholeOrNone) {
  BreakEverywhere(
      {LeadToList, {"click cmdCombine"}, ListIsOneOf({{"Archer, Jo", "Baker, Al", "Dean, Di"}})});
}

TEST(ListFaults, AnotherOrderOfACombinedListIsWholeOrNone) {
  // Without the points of the two the first grade's best comes first in both orders.
  BreakEverywhere({LeadToCombined,
                   {"click optCombineAlpha"},
                   ListIsOneOf({{"Archer, Jo", "Baker, Al", "Dean, Di"}})});
}

TEST(ListFaults, BackFromACombinedListShowsTheLatestDateOrNone) {
  BreakEverywhere({LeadToCombined,
                   {"click cmdReDoAvgs"},
                   ListIsOneOf({{"Archer, Jo"}, {"Archer, Jo", "Baker, Al", "Dean, Di"}})});
}

}  // namespace
}  // namespace marlowbeck
