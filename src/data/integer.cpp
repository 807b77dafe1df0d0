#include "data/integer.h"

#include <cmath>

namespace marlowbeck {

double RoundHalfEven(double value) {
  const double below = std::floor(value);
  const double rest = value - below;
  if (rest < 0.5) return below;
  if (rest > 0.5) return below + 1;
  return std::fmod(below, 2.0) == 0.0 ? below : below + 1;
}

Integer Integer::Narrow(double value) {
  const double rounded = RoundHalfEven(value);
  if (!(rounded >= INT16_MIN && rounded <= INT16_MAX)) throw RunTimeError(ErrorNumber::Overflow);
  return Integer(static_cast<int>(rounded));
}

std::int32_t NarrowToLong(double value) {
  const double rounded = RoundHalfEven(value);
  if (!(rounded >= INT32_MIN && rounded <= INT32_MAX)) throw RunTimeError(ErrorNumber::Overflow);
  return static_cast<std::int32_t>(rounded);
}

}  // namespace marlowbeck
