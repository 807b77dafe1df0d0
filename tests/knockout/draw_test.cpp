// The draw: that it is fair, and that it ends.

#include "knockout/draw.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

std::vector<Entrant> People(int count) {
  std::vector<Entrant> people;
  for (int i = 0; i < count; ++i) {
    people.push_back({"P" + std::to_string(i), "G" + std::to_string(i % 5)});
  }
  return people;
}

std::vector<Entrant> DrawnBySeed(int count, std::uint64_t seed) {
  Chance chance(seed);
  return Draw(People(count), [&] { return chance.Next(); });
}

/// How far counts lie from what each of them is expected to be.
double ChiSquared(const std::vector<int>& counts, double expected) {
  double sum = 0;
  for (const int count : counts) sum += (count - expected) * (count - expected) / expected;
  return sum;
}

/// What a fair draw exceeds once in a thousand, by Wilson and Hilferty's approximation.
double Limit(double degrees) {
  constexpr double kOnceInAThousand = 3.0902;
  const double part = 2 / (9 * degrees);
  return degrees * std::pow(1 - part + kOnceInAThousand * std::sqrt(part), 3);
}

/// How often each of some people comes to each place, over the seeds from 1 on.
std::vector<int> Standings(int people, int draws) {
  const auto at = [&](int person, int place) {
    return static_cast<std::size_t>(person * people + place);
  };
  std::vector<int> counts(static_cast<std::size_t>(people * people));
  for (int seed = 1; seed <= draws; ++seed) {
    int place = 0;
    for (const Entrant& entrant : DrawnBySeed(people, static_cast<std::uint64_t>(seed))) {
      ++counts[at(std::stoi(entrant.name.substr(1)), place++)];
    }
  }
  return counts;
}

TEST(TheDraw, BringsEveryPlayerToEveryPlaceAlike) {
  for (const auto& [people, draws] : std::vector<std::pair<int, int>>{
           {2, 4000}, {3, 6000}, {7, 7000}, {8, 8000}, {33, 3300}, {64, 6400}}) {
    const double degrees = (people - 1.0) * (people - 1.0);
    const double expected = static_cast<double>(draws) / people;
    EXPECT_LT(ChiSquared(Standings(people, draws), expected), Limit(degrees)) << people;
  }
}

TEST(TheDraw, BringsEveryOrderAlike) {
  std::map<std::string, int> orders;
  for (std::uint64_t seed = 1; seed <= 24000; ++seed) {
    std::string order;
    for (const Entrant& entrant : DrawnBySeed(4, seed)) order += entrant.name;
    ++orders[order];
  }
  ASSERT_EQ(orders.size(), 24U);
  std::vector<int> counts;
  for (const auto& [order, count] : orders) counts.push_back(count);
  EXPECT_LT(ChiSquared(counts, 1000), Limit(23));
}

TEST(TheDraw, EachPlayerComesOnceAndKeepsTheGrade) {
  for (const int people : {0, 1, 2, 3, 31, 63, 64}) {
    for (std::uint64_t seed = 1; seed <= 50; ++seed) {
      std::vector<Entrant> drawn = DrawnBySeed(people, seed);
      const auto number = [](const Entrant& a) { return std::stoi(a.name.substr(1)); };
      std::sort(drawn.begin(), drawn.end(),
                [&](const Entrant& a, const Entrant& b) { return number(a) < number(b); });
      EXPECT_EQ(drawn, People(people)) << people << " people, seed " << seed;
    }
  }
}

TEST(TheDraw, TwoOfOneNameAreBothDrawn) {
  const std::vector<Entrant> twins = {{"A, B", "1"}, {"A, B", "1"}, {"A, B", "2"}};
  Chance chance(3);
  std::vector<Entrant> drawn = Draw(twins, [&] { return chance.Next(); });
  std::sort(drawn.begin(), drawn.end(),
            [](const Entrant& a, const Entrant& b) { return a.grade < b.grade; });
  EXPECT_EQ(drawn, twins);
}

TEST(TheDraw, AnotherSeedIsAnotherOrder) {
  EXPECT_NE(DrawnBySeed(64, 1), DrawnBySeed(64, 2));
  EXPECT_EQ(DrawnBySeed(64, 1), DrawnBySeed(64, 1));
}

/// A sequence of numbers instead of chance.
std::function<float()> Sequence(std::vector<float> numbers) {
  return [numbers = std::move(numbers), next = std::size_t{0}]() mutable {
    return numbers.at(next++);
  };
}

TEST(TheDraw, APlaceThatIsTakenIsDrawnAnew) {
  // Of three: the second, the second again and again, the first, the third.
  const auto drawn = Draw(People(3), Sequence({0.5F, 0.5F, 0.34F, 0.0F, 0.99F}));
  EXPECT_EQ(drawn, (std::vector<Entrant>{People(3)[1], People(3)[0], People(3)[2]}));
}

TEST(TheDraw, TheIndexIsReckonedInSinglePrecision) {
  constexpr float kGreatest = 1.0F - 0x1p-24F;
  EXPECT_EQ(DrawnPlace(0.0F, 64), 1);
  EXPECT_EQ(DrawnPlace(0.5F, 64), 33);
  EXPECT_EQ(DrawnPlace(kGreatest, 3), 3);
  // 65 - 2^-18 lies half-way between two numbers of 24 bits, and the even one is 65.
  EXPECT_EQ(DrawnPlace(kGreatest, 64), 65);
  EXPECT_EQ(DrawnPlace(kGreatest, 1), 2);
}

TEST(TheDraw, APlaceBeyondTheLastIsDrawnAnew) {
  constexpr float kGreatest = 1.0F - 0x1p-24F;
  EXPECT_EQ(Draw(People(1), Sequence({kGreatest, kGreatest, 0.0F})), People(1));
}

TEST(Chance, IsFromZeroToJustBelowOne) {
  Chance chance(1);
  float least = 1;
  float greatest = 0;
  for (int i = 0; i < 100000; ++i) {
    const float number = chance.Next();
    ASSERT_GE(number, 0.0F);
    ASSERT_LT(number, 1.0F);
    least = std::min(least, number);
    greatest = std::max(greatest, number);
  }
  EXPECT_LT(least, 0.001F);
  EXPECT_GT(greatest, 0.999F);
}

}  // namespace
}  // namespace marlowbeck
