#pragma once

#include <cstdint>

#include "data/runtime_error.h"

namespace marlowbeck {

/// Rounds to the nearest whole number, halves to the even neighbour.
[[nodiscard]] double RoundHalfEven(double value);

/// A signed 16-bit number whose every result is checked: one outside -32768 to 32767 throws
/// Overflow instead of wrapping.
class Integer {
 public:
  constexpr Integer() = default;
  constexpr Integer(int value) : value_(Checked(value)) {}  // NOLINT(google-explicit-constructor)

  /// Narrows a double, halves to even. Throws Overflow outside the range and for a NaN.
  [[nodiscard]] static Integer Narrow(double value);

  constexpr operator int() const { return value_; }  // NOLINT(google-explicit-constructor)

  Integer& operator+=(int other) { return *this = Integer(Sum(value_, other)); }
  Integer& operator-=(int other) { return *this = Integer(Sum(value_, -std::int64_t{other})); }
  Integer& operator++() { return *this += 1; }

 private:
  static constexpr int Sum(std::int64_t a, std::int64_t b) { return Checked(a + b); }
  static constexpr std::int16_t Checked(std::int64_t value) {
    if (value < INT16_MIN || value > INT16_MAX) throw RunTimeError(ErrorNumber::Overflow);
    return static_cast<std::int16_t>(value);
  }

  std::int16_t value_ = 0;
};

/// Narrows a double to a signed 32-bit number, halves to even. Throws Overflow outside the range.
[[nodiscard]] std::int32_t NarrowToLong(double value);

}  // namespace marlowbeck
