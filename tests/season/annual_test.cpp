#include "season/annual.h"

#include <cmath>
#include <cstdio>
#include <random>

#include <gtest/gtest.h>

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

ResultRecord Night(int aggregate, int shots, std::array<std::int16_t, 6> pegs = {}) {
  ResultRecord result;
  result.Opposition = "Cubs";
  result.GameDate = *DateFromIso("2004-03-31");
  result.Aggregate = static_cast<std::int16_t>(aggregate);
  result.Shots = shots;
  result.Pegs = pegs;
  return result;
}

AnnualReport Fed(const std::vector<ResultRecord>& results) {
  AnnualReport report;
  for (const ResultRecord& result : results) {
    const ResultBytes bytes = Encode(result);
    report.Add(ResultView(bytes));
  }
  return report;
}

std::array<std::string, 11> CellsOf(const ResultRecord& result) {
  return AnnualCells(Fed({result}).Games().at(0));
}

TEST(Annual, AGameAsItsRow) {
  ResultRecord night = Night(905, 47, {57, 121, 0, 8, 2, 0});
  night.Scores180 = 2;
  night.Centuries = 3;
  night.HighScore = 140;
  EXPECT_EQ(CellsOf(night),
            (std::array<std::string, 11>{"31/03/2004", "Cubs", "905", "47", "2", "3", "140",
                                         "57, 121", "8", "2", "19.25"}));
}

TEST(Annual, AForfeitHasAStarAndWords) {
  const auto cells = CellsOf(Night(0, 0));
  EXPECT_EQ(cells[1], "Cubs *");
  EXPECT_EQ(cells[2], "Forfeit");
  EXPECT_EQ(cells[3], "Win");
  EXPECT_EQ(cells[10], "");
  EXPECT_TRUE(IsForfeitRow(cells));
}

TEST(Annual, OneCountsAsNothingInTheRowAndInTheTotals) {
  EXPECT_TRUE(IsForfeitRow(CellsOf(Night(1, 1))));
  const auto cells = CellsOf(Night(1, 40));
  EXPECT_EQ(cells[2], "");
  EXPECT_EQ(cells[3], "40");
  EXPECT_FALSE(IsForfeitRow(cells));
  const AnnualReport report = Fed({Night(1, 1), Night(2, 2)});
  EXPECT_EQ(report.Totals().aggregate, 2);
  EXPECT_EQ(report.Totals().shots, 2);
}

TEST(Annual, AMarkedForfeitWithFiguresKeepsThem) {
  ResultRecord night = Night(500, 40);
  night.Forfeit = "F";
  EXPECT_EQ(CellsOf(night)[2], "500");
  EXPECT_EQ(CellsOf(night)[10], "12.50");
  EXPECT_FALSE(IsForfeitRow(CellsOf(night)));
}

TEST(Annual, ATeamWhoseNameEndsWithAStarLooksLikeAForfeit) {
  ResultRecord night = Night(500, 40);
  night.Opposition = "All *";
  EXPECT_EQ(CellsOf(night)[2], "Forfeit");
  EXPECT_TRUE(IsForfeitRow(CellsOf(night)));
}

TEST(Annual, APegOfOneIsCountedAndNotShown) {
  const ResultRecord night = Night(500, 40, {1, 40, 1, 0, 1, 1});
  EXPECT_EQ(CellsOf(night)[7], "40");
  EXPECT_EQ(CellsOf(night)[8], "");
  EXPECT_EQ(CellsOf(night)[9], "");
  EXPECT_EQ(Fed({night}).Totals().pegs, 5);
}

TEST(Annual, PegsAreCountedNotAddedUp) {
  const AnnualTotals totals =
      Fed({Night(500, 40, {10, 20, 30, 0, 0, 0}), Night(500, 40, {0, 0, 0, 0, 0, 170})}).Totals();
  EXPECT_EQ(totals.pegs_by_game, (std::array<std::int32_t, 3>{2, 1, 1}));
  EXPECT_EQ(totals.pegs, 4);
  EXPECT_EQ(totals.high_peg, 170);
}

TEST(Annual, ATotalThatMakesNoAverageShowsNone) {
  const auto cells = TotalsCells(Fed({Night(0, 0)}).Totals(), 1);
  EXPECT_EQ(cells, (std::array<std::string, 12>{"1", "0", "0", "0", "0", "0", "0", "0", "0", "0",
                                                "0", ""}));
}

TEST(Annual, TotalsPassSixteenBits) {
  const AnnualReport report = Fed(std::vector<ResultRecord>(4, Night(32767, 2000)));
  const auto cells = TotalsCells(report.Totals(), 4);
  EXPECT_EQ(cells[1], "131068");
  EXPECT_EQ(cells[11], "16.38");
}

TEST(Annual, FiveThousandGamesAreTheMost) {
  std::vector<ResultRecord> nights(5000, Night(500, 40));
  EXPECT_EQ(Fed(nights).Games().size(), 5000U);
  nights.push_back(nights[0]);
  EXPECT_THROW(Fed(nights), RunTimeError);
}

TEST(Annual, TheWorkFileLeavesOutWhatAForfeitLacks) {
  ResultRecord night = Night(905, 47, {57, 121, 0, 8, 2, 1});
  night.Scores180 = 2;
  night.Centuries = 3;
  night.HighScore = 140;
  SideFileWriter writer;
  WriteAnnual(writer, "Jo Archer", Fed({night, Night(0, 0)}));
  const std::string cubs = "Cubs" + std::string(26, ' ');
  EXPECT_EQ(writer.Content(),
            "\"Jo Archer\"\r\n"
            "#2004-03-31#,1,\"" +
                cubs +
                "\"\r\n"
                "905,47,140,2,3\r\n"
                "57,121,0,8,2,1\r\n"
                "#2004-03-31#,2,\"" +
                cubs +
                "\"\r\n"
                ",,0,0,0\r\n"
                "0,0,0,0,0,0\r\n"
                "905,47,140,2,3,2,1,2,5,121\r\n");
}

/// Totals by the plain words, over the records.
TEST(Annual, TotalsEqualThePlainLoopForAnySeason) {
  std::mt19937 chance(71);
  const auto pick = [&](int from, int to) {
    return static_cast<std::int16_t>(std::uniform_int_distribution<int>(from, to)(chance));
  };
  for (int round = 0; round < 3000; ++round) {
    std::vector<ResultRecord> nights;
    for (int count = pick(0, 12), i = 0; i < count; ++i) {
      ResultRecord night = Night(pick(0, 5) == 0 ? pick(-3, 2) : pick(0, 32767),
                                 pick(0, 5) == 0 ? pick(-3, 2) : pick(0, 300));
      night.HighScore = pick(-1, 180);
      night.Scores180 = pick(-2, 4);
      night.Centuries = pick(-2, 9);
      for (auto& peg : night.Pegs) peg = pick(0, 1) == 0 ? std::int16_t{0} : pick(-1, 170);
      nights.push_back(night);
    }
    double aggregate = 0;
    double shots = 0;
    int c180 = 0;
    int c100 = 0;
    int hs = 0;
    int hipeg = 0;
    std::array<int, 3> games{};
    for (const ResultRecord& night : nights) {
      if (night.Aggregate > 1) aggregate += night.Aggregate;
      if (night.Shots > 1) shots += night.Shots;
      if (night.Scores180 > 0) c180 += night.Scores180;
      if (night.Centuries > 0) c100 += night.Centuries;
      if (night.HighScore > hs) hs = night.HighScore;
      for (int peg = 0; peg < 6; ++peg) {
        const int value = night.Pegs[static_cast<std::size_t>(peg)];
        if (value > 0) ++games[static_cast<std::size_t>(peg / 2)];
        if (value > hipeg) hipeg = value;
      }
    }
    const auto whole = [](double value) { return std::to_string(static_cast<long>(value)); };
    std::string average;
    if (aggregate > 0 && shots > 0) {
      char text[40];
      std::snprintf(text, sizeof text, "%.2f", std::floor(aggregate / shots * 100) / 100);
      average = text;
    }
    const std::array<std::string, 12> expected = {
        whole(7),        whole(aggregate),
        whole(shots),    whole(c180),
        whole(c100),     whole(hs),
        whole(games[0]), whole(games[1]),
        whole(games[2]), whole(games[0] + games[1] + games[2]),
        whole(hipeg),    average};
    ASSERT_EQ(TotalsCells(Fed(nights).Totals(), 7), expected) << "round " << round;
  }
}

}  // namespace
}  // namespace marlowbeck
