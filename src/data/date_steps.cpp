#include "data/date_steps.h"

#include <algorithm>

namespace marlowbeck {

std::vector<Date> WithoutRepeats(const std::vector<Date>& dates) {
  std::vector<Date> distinct;
  std::unique_copy(dates.begin(), dates.end(), std::back_inserter(distinct));
  return distinct;
}

// KEPT: a step back from before all dates goes ahead to the first of them, and one forward from
// behind all goes back to the last; a repair would stay.
std::optional<DateStep> StepForward(const std::vector<Date>& dates, Date from) {
  if (dates.empty()) return std::nullopt;
  const auto last = dates.end() - 1;
  const auto found = std::find_if(dates.begin(), last, [=](Date date) { return date > from; });
  return DateStep{*found, found == last};
}

std::optional<DateStep> StepBack(const std::vector<Date>& dates, Date from) {
  if (dates.empty()) return std::nullopt;
  const auto first = dates.rend() - 1;
  const auto found = std::find_if(dates.rbegin(), first, [=](Date date) { return date < from; });
  return DateStep{*found, found == first};
}

}  // namespace marlowbeck
