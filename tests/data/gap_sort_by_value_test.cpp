#include "data/gap_sort_by_value.h"

#include <numeric>
#include <random>

#include <gtest/gtest.h>

#include "data/gap_sort.h"

namespace marlowbeck {
namespace {

/// The pass itself, step by step.
std::vector<int> Passed(const std::vector<double>& values) {
  std::vector<int> order(values.size());
  std::iota(order.begin(), order.end(), 0);
  const auto at = [&](int place) -> int& { return order[static_cast<std::size_t>(place - 1)]; };
  const auto value = [&](int place) { return values[static_cast<std::size_t>(at(place))]; };
  GapSort(
      static_cast<int>(values.size()), [&](int j, int k) { return value(j) < value(k); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
  return order;
}

TEST(GapSortByValue, OfNoneAndOfOneIsWhatTheyAre) {
  EXPECT_EQ(GapSortByValue({}), std::vector<int>{});
  EXPECT_EQ(GapSortByValue({7}), std::vector<int>{0});
}

TEST(GapSortByValue, IsWhereThePassLeavesAnyFewEntries) {
  // All rows of up to seven entries with the values -1, 0 and 1.
  for (std::size_t count = 0; count <= 7; ++count) {
    int rows = 1;
    for (std::size_t i = 0; i < count; ++i) rows *= 3;
    for (int row = 0; row < rows; ++row) {
      std::vector<double> values;
      for (int rest = row; values.size() < count; rest /= 3) values.push_back(rest % 3 - 1);
      ASSERT_EQ(GapSortByValue(values), Passed(values)) << count << " entries, row " << row;
    }
  }
}

TEST(GapSortByValue, IsWhereThePassLeavesAnyManyEntries) {
  std::mt19937 chance(1);
  for (int round = 0; round < 2000; ++round) {
    const auto count = std::uniform_int_distribution<std::size_t>(0, 200)(chance);
    const int steps = std::uniform_int_distribution<int>(0, 60)(chance);
    std::uniform_int_distribution<int> value(-2, steps);
    std::vector<double> values;
    for (std::size_t i = 0; i < count; ++i) values.push_back(value(chance) / 4.0);
    ASSERT_EQ(GapSortByValue(values), Passed(values)) << "round " << round;
  }
}

TEST(GapSortByValue, IsWhereThePassLeavesAThousandEqualEntries) {
  const std::vector<double> values(1000, 180);
  EXPECT_EQ(GapSortByValue(values), Passed(values));
}

}  // namespace
}  // namespace marlowbeck
