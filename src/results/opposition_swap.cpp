#include "results/opposition_swap.h"

#include <algorithm>

namespace marlowbeck {

bool IsTakenBy(const ResultView& result, const OppositionSwap& swap) {
  // KEPT: a swap is refused for a side that stands as opposition in a result of the date, and not
  // for one that stands as team alone; a repair would look at both.
  return result.GameDate() == swap.date && result.Opposition() == swap.opposition;
}

bool SwapOpposition(std::string& results, const OppositionSwap& swap) {
  const std::span<std::byte> bytes = std::as_writable_bytes(std::span(results));
  bool any = false;
  for (std::size_t at = 0; at + kResultLength <= bytes.size(); at += kResultLength) {
    const auto record = bytes.subspan(at, kResultLength);
    const ResultView result(record);
    if (result.GameDate() != swap.date || result.Team() != swap.team) continue;
    if (result.Opposition() == swap.opposition) continue;
    ResultRecord changed = DecodeResult(record);
    changed.Opposition = swap.opposition;
    std::ranges::copy(Encode(changed), record.begin());
    any = true;
  }
  return any;
}

}  // namespace marlowbeck
