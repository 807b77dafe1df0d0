#pragma once

#include <numeric>
#include <utility>
#include <vector>

#include "data/gap_sort.h"

namespace marlowbeck {

/// Rows as the sorting pass leaves them, handed over from the last to the first: an ascending test
/// gives the highest first. `in_order(a, b)` is the pass's test of two rows.
template <typename Row, typename InOrder>
std::vector<Row> SortedFromTheLast(std::vector<Row> rows, InOrder in_order) {
  std::vector<std::size_t> order(rows.size());
  std::iota(order.begin(), order.end(), std::size_t{0});
  const auto at = [&](int place) -> std::size_t& {
    return order[static_cast<std::size_t>(place - 1)];
  };
  GapSort(
      static_cast<int>(rows.size()),
      [&](int j, int k) { return in_order(rows[at(j)], rows[at(k)]); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
  std::vector<Row> sorted;
  sorted.reserve(rows.size());
  for (auto place = order.rbegin(); place != order.rend(); ++place) {
    sorted.push_back(std::move(rows[*place]));
  }
  return sorted;
}

}  // namespace marlowbeck
