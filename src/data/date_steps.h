#pragma once

#include <optional>
#include <vector>

#include "data/date.h"

namespace marlowbeck {

/// Where a step among a team's dates ends.
struct DateStep {
  Date date;
  bool at_end = false;  ///< there is no further date that way
};

/// The dates without those that equal the one before them.
[[nodiscard]] std::vector<Date> WithoutRepeats(const std::vector<Date>& dates);

/// The first of the dates later than `from`; the last one when none before it is. Nothing when
/// there are no dates.
[[nodiscard]] std::optional<DateStep> StepForward(const std::vector<Date>& dates, Date from);

/// The same backward: the first, from the end, earlier than `from`; else the first one.
[[nodiscard]] std::optional<DateStep> StepBack(const std::vector<Date>& dates, Date from);

}  // namespace marlowbeck
