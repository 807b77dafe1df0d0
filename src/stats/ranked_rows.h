#pragma once

#include <numeric>
#include <utility>
#include <vector>

#include "data/gap_sort.h"
#include "data/gap_sort_by_value.h"

namespace marlowbeck {

/// Rows in the order of their places, from the last to the first.
template <typename Row>
std::vector<Row> FromTheLast(std::vector<Row> rows, const std::vector<int>& places) {
  std::vector<Row> turned;
  turned.reserve(rows.size());
  for (auto place = places.rbegin(); place != places.rend(); ++place) {
    turned.push_back(std::move(rows[static_cast<std::size_t>(*place)]));
  }
  return turned;
}

// KEPT: the sort swaps equal values, so that rows of one value need not stand as they came; a
// repair would leave them so.
/// Rows with the highest value first: as the sorting pass leaves them when it swaps equal ones, and
/// turned round.
template <typename Row, typename ValueOf>
std::vector<Row> HighestFirst(std::vector<Row> rows, ValueOf value_of) {
  std::vector<double> values;
  values.reserve(rows.size());
  for (const Row& row : rows) values.push_back(value_of(row));
  return FromTheLast(std::move(rows), GapSortByValue(values));
}

// KEPT: names are compared by their letters' codes, so that one in lower case stands behind all in
// upper case; a repair would fold case.
/// Rows with names from A to Z by their bytes: as the sorting pass leaves them descending, equal
/// ones in order, and turned round.
template <typename Row>
std::vector<Row> AToZ(std::vector<Row> rows) {
  std::vector<int> places(rows.size());
  std::iota(places.begin(), places.end(), 0);
  const auto at = [&](int place) -> int& { return places[static_cast<std::size_t>(place - 1)]; };
  const auto name = [&](int place) -> const std::string& {
    return rows[static_cast<std::size_t>(at(place))].name;
  };
  GapSort(
      static_cast<int>(rows.size()), [&](int j, int k) { return name(j) >= name(k); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
  return FromTheLast(std::move(rows), places);
}

}  // namespace marlowbeck
