#pragma once

#include "data/integer.h"

namespace marlowbeck {

/// What a player on an average is given in a game of 501 by one on the mean average: none on the
/// mean itself, fewer than none above it. Halves go to the even number. `mean` must not be 0.
/// Throws Overflow outside 16 bits.
[[nodiscard]] Integer HandicapOf(double mean, double average);

}  // namespace marlowbeck
