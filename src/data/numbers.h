#pragma once

#include <string>
#include <string_view>

#include "data/integer.h"

namespace marlowbeck {

/// The number that a text begins with: leading blanks skipped, the longest numeric prefix taken
/// (sign, digits, one point, exponent), 0 when there is none. Never fails.
[[nodiscard]] double Val(std::string_view text);

/// Reads a whole text as a number. Throws TypeMismatch for anything that is not a number alone
/// (blanks around it are passed over).
[[nodiscard]] double NumberOf(std::string_view text);

/// A whole text as a 16-bit number, halves to even. Throws TypeMismatch or Overflow.
[[nodiscard]] Integer CInt(std::string_view text);

/// The floor.
[[nodiscard]] double Int(double value);

/// A number as text with no more than 15 significant digits: 50, 47.5, -3.
[[nodiscard]] std::string NumberText(double value);

/// A number with two places and at least one digit before the point: 0.50, 47.61.
[[nodiscard]] std::string TwoPlaces(double value);

/// Points per shot cut to two places, the quotient formed first: Int(agg / shots * 100) / 100.
/// Used by the weekly table, the one-date lists and the score sheet. `shots` must not be 0.
[[nodiscard]] double AverageQuotientFirst(double aggregate, double shots);

/// Points per shot cut to two places: Int(100 * (agg / shots)) / 100, as the progressive reports
/// write it. The same number, since a product is the same either way round. `shots` must not be 0.
[[nodiscard]] double AverageHundredfold(double aggregate, double shots);

/// a / b; throws DivisionByZero for b = 0, whatever a is.
[[nodiscard]] double Divide(double a, double b);

}  // namespace marlowbeck
