#include "stats/team_dates.h"

#include <utility>

#include "data/gap_sort.h"

namespace marlowbeck {

void TeamDates::AddResult(const ResultView& result) {
  if (result.Team() != team_) return;
  // Like dates cannot be told apart once sorted, so one of each is enough.
  if (seen_.insert(result.GameDate().days).second) dates_.push_back(result.GameDate());
}

std::vector<Date> TeamDates::Sorted() const {
  std::vector<Date> sorted = dates_;
  const auto at = [&](int place) -> Date& { return sorted[static_cast<std::size_t>(place - 1)]; };
  GapSort(
      static_cast<int>(sorted.size()), [&](int j, int k) { return at(j) < at(k); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
  // The place after the last one is empty, which is how date 0 reads.
  if (!sorted.empty() && sorted.back() == Date{}) sorted.pop_back();
  return sorted;
}

}  // namespace marlowbeck
