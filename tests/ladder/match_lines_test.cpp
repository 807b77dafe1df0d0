#include "ladder/match_lines.h"

#include <gtest/gtest.h>

#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

using Cells = std::array<std::string, 5>;

std::string LineOf(const LadderRecord& match) {
  const LadderBytes bytes = Encode(match);
  return LineOfRecord(LadderView(bytes));
}

Cells CellsOf(const LadderRecord& match) {
  const LadderBytes bytes = Encode(match);
  return ResultCells(LadderView(bytes));
}

TEST(MatchLines, TheWinnerStandsFirst) {
  EXPECT_EQ(LineOf(MatchOn(3, "Alpha", 6, "Bravo", 5)), "Alpha (6) defeated  Bravo (5)  ");
  EXPECT_EQ(LineOf(MatchOn(3, "Alpha", 5, "Bravo", 6)), "Bravo (6) defeated  Alpha (5)  ");
  EXPECT_EQ(CellsOf(MatchOn(3, "Alpha", 6, "Bravo", 5)),
            (Cells{"Alpha", "6", " def ", "Bravo", "5"}));
  EXPECT_EQ(CellsOf(MatchOn(3, "Alpha", 5, "Bravo", 6)),
            (Cells{"Bravo", "6", " def ", "Alpha", "5"}));
}

TEST(MatchLines, KeptADrawHasTheAwayTeamFirstInTheListAndTheHomeTeamAmongTheResults) {
  EXPECT_EQ(LineOf(MatchOn(3, "Alpha", 5, "Bravo", 5)), "Bravo (5) drew with  Alpha (5)  ");
  EXPECT_EQ(CellsOf(MatchOn(3, "Alpha", 5, "Bravo", 5)),
            (Cells{"Alpha", "5", " drew ", "Bravo", "5"}));
}

TEST(MatchLines, KeptADrawJustSavedReadsOtherwise) {
  EXPECT_EQ(LineOfTyped({"Alpha", "5", 5, "Bravo", "5", 5}), "Alpha (5) drew  Bravo (5)  ");
}

TEST(MatchLines, ScoresJustSavedStandAsTheyWereTyped) {
  EXPECT_EQ(LineOfTyped({"Alpha", "6.0", 6, "Bravo", " 5", 5}),
            "Alpha (6.0) defeated  Bravo ( 5)  ");
  EXPECT_EQ(LineOfTyped({"Alpha", "5", 5, "Bravo", "6", 6}), "Bravo (6) defeated  Alpha (5)  ");
  EXPECT_EQ(LineOfTyped({"Alpha", "B", 0, "", "", 0}), "Alpha (B) drew   ()  ");
}

TEST(MatchLines, NamesOnFileAreTrimmed) {
  EXPECT_EQ(LineOf(MatchOn(3, "  Alpha ", 6, " Bravo", 5)), "Alpha (6) defeated  Bravo (5)  ");
}

}  // namespace
}  // namespace marlowbeck
