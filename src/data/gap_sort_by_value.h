#pragma once

#include <vector>

namespace marlowbeck {

/// Where GapSort leaves entries with these values when a pair of them is in order only as long as
/// the first is below the second, so that equal ones are swapped: the entries, counted from 0,
/// place by place. The pass itself swaps equal entries time and again, a step for each; here no
/// round of it takes longer for them. No value may be a NaN.
[[nodiscard]] std::vector<int> GapSortByValue(const std::vector<double>& values);

}  // namespace marlowbeck
