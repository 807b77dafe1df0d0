#include "season/peg_ratios.h"

#include <random>

#include <gtest/gtest.h>

#include "support/record_files.h"

namespace marlowbeck {
namespace {

ResultRecord Made(int id, int legs, std::array<std::int16_t, 6> pegs) {
  ResultRecord result;
  result.ID = id;
  result.Legs = static_cast<std::int16_t>(legs);
  result.Pegs = pegs;
  return result;
}

PegRatios Fed(const std::vector<PlayerRecord>& players, const std::vector<ResultRecord>& results,
              std::string_view grade = "A Grade") {
  PegRatios ratios(grade);
  for (const PlayerRecord& player : players) {
    const PlayerBytes bytes = Encode(player);
    ratios.AddPlayer(PlayerView(bytes));
  }
  for (const ResultRecord& result : results) {
    const ResultBytes bytes = Encode(result);
    ratios.AddResult(ResultView(bytes));
  }
  return ratios;
}

const std::vector<PlayerRecord> kTwo = {Player(1, "Archer", "Jo", "Rovers", "A Grade"),
                                        Player(2, "Baker", "Al", "Cubs", "A Grade")};

TEST(PegRatios, CountPegsAndAddUpLegs) {
  const auto rows = Fed(kTwo, {Made(1, 5, {40, 0, 0, 170, 0, 2}), Made(2, 4, {1, 0, 0, 0, 0, 0}),
                               Made(1, 7, {0, 0, 0, 0, 0, 9})})
                        .Rows();
  EXPECT_EQ(rows, (std::vector<RatioRow>{{"Archer,  Jo", "Rovers", 12, 4},
                                         {"Baker,  Al", "Cubs", 4, 1}}));
}

TEST(PegRatios, APlayerWithLegsAndNoPegsIsLeftOut) {
  EXPECT_TRUE(Fed(kTwo, {Made(1, 9, {0, 0, 0, 0, 0, 0})}).Rows().empty());
}

TEST(PegRatios, APlayerWithPegsAndNoLegsIsLeftOut) {
  EXPECT_TRUE(Fed(kTwo, {Made(1, 0, {20, 0, 0, 0, 0, 0})}).Rows().empty());
}

TEST(PegRatios, PegsOfForfeitsCount) {
  ResultRecord forfeit = Made(1, 2, {8, 0, 0, 0, 0, 0});
  forfeit.Forfeit = "F";
  EXPECT_EQ(Fed(kTwo, {forfeit}).Rows().at(0).pegs, 1);
}

TEST(PegRatios, PlayersOfOtherGradesAndResultsOfNobodyAreLeftOut) {
  const auto rows = Fed({Player(1, "Archer", "Jo", "Rovers", "B Grade")},
                        {Made(1, 2, {8, 0, 0, 0, 0, 0}), Made(77, 2, {8, 0, 0, 0, 0, 0})})
                        .Rows();
  EXPECT_TRUE(rows.empty());
}

TEST(PegRatios, AnIdAbove32767Overflows) {
  EXPECT_THROW(Fed({Player(32768, "Archer", "Jo", "Rovers", "A Grade")}, {}), RunTimeError);
  EXPECT_NO_THROW(Fed({Player(32767, "Archer", "Jo", "Rovers", "A Grade")}, {}));
}

TEST(PegRatios, TheThousandAndFirstPlayerIsOneTooMany) {
  std::vector<PlayerRecord> players(1000, kTwo[0]);
  EXPECT_NO_THROW(Fed(players, {}));
  players.push_back(kTwo[1]);
  EXPECT_THROW(Fed(players, {}), RunTimeError);
}

TEST(PegRatios, RatiosHaveTwoPlacesRoundedAwayFromZero) {
  EXPECT_EQ(RatioText(5, 20), "25.00%");
  EXPECT_EQ(RatioText(1, 3), "33.33%");
  EXPECT_EQ(RatioText(2, 3), "66.67%");
  EXPECT_EQ(RatioText(1, 32), "3.13%") << "3.125";
  EXPECT_EQ(RatioText(3, 160), "1.88%") << "1.875";
  EXPECT_EQ(RatioText(1, 20000), "0.01%") << "0.005";
  EXPECT_EQ(RatioText(1, 20001), "0.00%");
}

TEST(PegRatios, ARatioCanPassAHundred) { EXPECT_EQ(RatioText(6, 5), "120.00%"); }

/// The same by the plain loops.
std::vector<RatioRow> PlainRows(const std::vector<PlayerRecord>& players,
                                const std::vector<ResultRecord>& results) {
  std::vector<RatioRow> rows;
  for (const PlayerRecord& player : players) {
    if (player.Grade != "A Grade") continue;
    RatioRow row{player.Surname + ",  " + player.FirstName, player.Team, 0, 0};
    for (const ResultRecord& result : results) {
      if (result.ID != player.ID) continue;
      row.legs += result.Legs;
      for (const auto peg : result.Pegs) row.pegs += peg > 0 ? 1 : 0;
    }
    if (row.legs > 0 && row.pegs > 0) rows.push_back(row);
  }
  return rows;
}

/// The pass written out, on the plain rows.
template <typename Stop>
void PlainSort(std::vector<RatioRow>& rows, Stop stop) {
  const int count = static_cast<int>(rows.size());
  for (int gap = count / 2; gap > 0; gap /= 2) {
    for (int i = gap; i <= count - 1; ++i) {
      int j = i - gap + 1;
      while (j >= 1) {
        RatioRow& upper = rows[static_cast<std::size_t>(j - 1)];
        RatioRow& lower = rows[static_cast<std::size_t>(j + gap - 1)];
        if (stop(upper, lower)) break;
        std::swap(upper, lower);
        j -= gap;
      }
    }
  }
}

TEST(PegRatios, EqualThePlainLoopsForAnyCompetition) {
  std::mt19937 chance(7272);
  const auto pick = [&](int from, int to) {
    return std::uniform_int_distribution<int>(from, to)(chance);
  };
  for (int round = 0; round < 2000; ++round) {
    std::vector<PlayerRecord> players;
    for (int count = pick(0, 25), i = 0; i < count; ++i) {
      players.push_back(Player(pick(1, 30), std::string(1, static_cast<char>('a' + pick(0, 5))),
                               pick(0, 3) == 0 ? "" : "F", "T" + std::to_string(pick(1, 4)),
                               pick(0, 3) == 0 ? "B Grade" : "A Grade"));
    }
    std::vector<ResultRecord> results;
    for (int count = pick(0, 60), i = 0; i < count; ++i) {
      std::array<std::int16_t, 6> pegs{};
      for (auto& peg : pegs) {
        peg = static_cast<std::int16_t>(pick(0, 2) == 0 ? pick(-1, 32767) : 0);
      }
      results.push_back(Made(pick(1, 32), pick(0, 20) == 0 ? 32767 : pick(-2, 6), pegs));
    }
    std::vector<RatioRow> rows = Fed(players, results).Rows();
    std::vector<RatioRow> plain = PlainRows(players, results);
    ASSERT_EQ(rows, plain) << "round " << round;
    SortRatios(rows, RatioOrder::Alphabetical);
    PlainSort(plain, [](const RatioRow& a, const RatioRow& b) { return a.name <= b.name; });
    ASSERT_EQ(rows, plain) << "round " << round;
    SortRatios(rows, RatioOrder::HighToLow);
    PlainSort(plain, [](const RatioRow& a, const RatioRow& b) {
      return static_cast<double>(b.pegs) / b.legs <= static_cast<double>(a.pegs) / a.legs;
    });
    ASSERT_EQ(rows, plain) << "round " << round;
  }
}

}  // namespace
}  // namespace marlowbeck
