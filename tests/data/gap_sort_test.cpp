#include "data/gap_sort.h"

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "data/table.h"
#include "tests/data/expect_error.h"

namespace marlowbeck {
namespace {

/// A key and where the entry stood at first.
struct Entry {
  int key = 0;
  int origin = 0;
  friend bool operator==(const Entry&, const Entry&) = default;
};

bool NotLater(const Entry& a, const Entry& b) { return a.key <= b.key; }
bool Earlier(const Entry& a, const Entry& b) { return a.key < b.key; }

template <typename Test>
std::vector<Entry> Sorted(std::vector<Entry> entries, Test in_order) {
  const auto at = [&](int place) -> Entry& { return entries[static_cast<std::size_t>(place - 1)]; };
  GapSort(
      static_cast<int>(entries.size()), [&](int j, int k) { return in_order(at(j), at(k)); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
  return entries;
}

/// The same pass as a list would write it out for itself, with a place 0 that is never used.
template <typename Test>
std::vector<Entry> SortedByThePlainLoop(std::vector<Entry> entries, Test in_order) {
  const std::size_t n = entries.size();
  entries.insert(entries.begin(), Entry{});
  std::size_t gap = n / 2;
  while (gap > 0) {
    std::size_t i = gap;
    while (i + 1 <= n) {
      std::size_t j = i - gap + 1;
      bool walking = true;
      while (walking) {
        if (in_order(entries[j], entries[j + gap])) break;
        std::swap(entries[j], entries[j + gap]);
        walking = j > gap;
        if (walking) j -= gap;
      }
      ++i;
    }
    gap /= 2;
  }
  entries.erase(entries.begin());
  return entries;
}

/// Every list of `n` keys from 0 to `keys` - 1.
template <typename Visit>
void ForEveryList(int n, int keys, Visit visit) {
  std::vector<Entry> entries(static_cast<std::size_t>(n));
  for (int place = 0; place < n; ++place) entries[static_cast<std::size_t>(place)].origin = place;
  for (;;) {
    visit(entries);
    int place = 0;
    while (place < n && ++entries[static_cast<std::size_t>(place)].key == keys) {
      entries[static_cast<std::size_t>(place++)].key = 0;
    }
    if (place == n) return;
  }
}

std::string Origins(const std::vector<Entry>& entries) {
  std::string text;
  for (const Entry& entry : entries) text += static_cast<char>('a' + entry.origin);
  return text;
}

TEST(GapSort, IsThePlainLoopForEverySmallListTiesIncluded) {
  for (int n = 0; n <= 8; ++n) {
    ForEveryList(n, 3, [&](const std::vector<Entry>& entries) {
      ASSERT_EQ(Sorted(entries, NotLater), SortedByThePlainLoop(entries, NotLater));
      ASSERT_EQ(Sorted(entries, Earlier), SortedByThePlainLoop(entries, Earlier));
    });
  }
}

TEST(GapSort, PutsEverySmallListInOrder) {
  for (int n = 0; n <= 7; ++n) {
    ForEveryList(n, 4, [&](const std::vector<Entry>& entries) {
      const auto sorted = Sorted(entries, NotLater);
      ASSERT_TRUE(std::is_sorted(sorted.begin(), sorted.end(), Earlier));
      ASSERT_TRUE(std::is_permutation(sorted.begin(), sorted.end(), entries.begin()));
    });
  }
}

// Keys 2 2 1 2: the first pass compares places 1 and 3, and 2 and 4.
TEST(GapSort, LeavesTiesWhereItsStepsPutThem) {
  const std::vector<Entry> entries = {{2, 0}, {2, 1}, {1, 2}, {2, 3}};
  EXPECT_EQ(Origins(Sorted(entries, NotLater)), "cbad");
  EXPECT_EQ(Origins(Sorted(entries, Earlier)), "cbad");
}

TEST(GapSort, OfThreeWithATestThatCallsTiesInOrderKeepsThem) {
  EXPECT_EQ(Origins(Sorted({{1, 0}, {1, 1}, {0, 2}}, NotLater)), "cab");
}

TEST(Table, EndsAtItsBounds) {
  Table<int> table(1, 1000);
  table[1] = 5;
  table[1000] = 6;
  table.Swap(1, 1000);
  EXPECT_EQ(table[1], 6);
  EXPECT_EQ(table.Last(), 1000);
  EXPECT_ERROR(9, table[0] = 1);
  EXPECT_ERROR(9, table[1001] = 1);
  EXPECT_ERROR(9, table.Swap(1, 1001));
}

TEST(Table, MayBeginAtZeroOrBeEmpty) {
  Table<int> from_zero(0, 2);
  from_zero[0] = 1;
  EXPECT_ERROR(9, from_zero[3] = 1);
  EXPECT_ERROR(9, from_zero[-1] = 1);
  Table<int> empty(1, 0);
  EXPECT_ERROR(9, empty[1] = 1);
}

}  // namespace
}  // namespace marlowbeck
