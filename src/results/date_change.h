#pragma once

#include <string>

#include "data/records.h"

namespace marlowbeck {

/// A match moved from one date to another. Names are trimmed.
struct DateChange {
  std::string team;
  std::string opposition;
  Date from;
  Date to;
};

/// A date as it comes back from being written with a year of two digits: without a time of day, and
/// in the years 1930 to 2029.
[[nodiscard]] Date InTwoDigitYears(Date date);

/// Whether a result stands in the way of the change: the team has played on the new date.
[[nodiscard]] bool StandsInTheWay(const ResultView& result, const DateChange& change);

/// Gives every result of the match its new date, whichever of the two sides it is for, in the bytes
/// of a results file. Answers whether there was any.
[[nodiscard]] bool MoveMatch(std::string& results, const DateChange& change);

}  // namespace marlowbeck
