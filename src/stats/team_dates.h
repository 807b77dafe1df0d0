#pragma once

#include <string_view>
#include <unordered_set>
#include <vector>

#include "data/records.h"

namespace marlowbeck {

/// The dates on which one team has results. It is handed the result records of the grade and
/// answers each date once, ascending.
class TeamDates {
 public:
  /// `team` must outlive this.
  explicit TeamDates(std::string_view team) : team_(team) {}

  void AddResult(const ResultView& result);
  [[nodiscard]] std::vector<Date> Sorted() const;

 private:
  std::string_view team_;
  std::vector<Date> dates_;
  std::unordered_set<double> seen_;
};

}  // namespace marlowbeck
