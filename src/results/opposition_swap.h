#pragma once

#include <string>
#include <string_view>

#include "data/records.h"

namespace marlowbeck {

/// Another opposition for a team on a date. Names are trimmed.
struct OppositionSwap {
  Date date;
  std::string team;
  std::string opposition;  ///< the one that it is to be
};

/// Whether a result of the date has that opposition already.
[[nodiscard]] bool IsTakenBy(const ResultView& result, const OppositionSwap& swap);

/// Gives every result of the team on the date the other opposition, in the bytes of a results file.
/// Answers whether that changed anything. Results of other teams stay as they are, those of the
/// opposition that was too.
[[nodiscard]] bool SwapOpposition(std::string& results, const OppositionSwap& swap);

}  // namespace marlowbeck
