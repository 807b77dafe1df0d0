#include "data/numbers.h"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <system_error>

namespace marlowbeck {
namespace {

constexpr double kMostDigits = 1e15;  // whole numbers below it have no more than 15

std::string_view WithoutLeadingBlanks(std::string_view text) {
  const auto first = text.find_first_not_of(" \t");
  return first == std::string_view::npos ? std::string_view{} : text.substr(first);
}

struct NumericPrefix {
  double value = 0;
  std::size_t length = 0;
};

/// Of a number that no double can hold: it is too close to 0, not too large.
bool IsTiny(std::string_view number) {
  return number.find("e-") != std::string_view::npos ||
         number.find("E-") != std::string_view::npos || number.front() == '.' ||
         number.front() == '0';
}

/// The longest numeric prefix of a text without leading blanks; length 0 when there is none.
/// An exponent too large to hold counts as a number with Overflow to follow where it is narrowed.
NumericPrefix ReadPrefix(std::string_view text) {
  std::size_t sign = 0;
  if (!text.empty() && text.front() == '+') sign = 1;
  const std::string_view digits = text.substr(sign);
  if (sign == 1 && !digits.empty() && digits.front() == '-') return {};
  const std::size_t first = (!digits.empty() && digits.front() == '-') ? 1 : 0;
  // "inf" and "nan" are words here, not numbers.
  if (digits.size() <= first) return {};
  const char lead = digits[first];
  if (lead != '.' && (lead < '0' || lead > '9')) return {};
  NumericPrefix result;
  const auto [end, error] =
      std::from_chars(digits.data(), digits.data() + digits.size(), result.value);
  if (error == std::errc::invalid_argument) return {};
  const auto length = static_cast<std::size_t>(end - digits.data());
  if (error == std::errc::result_out_of_range && !IsTiny(digits.substr(first, length - first))) {
    result.value = first == 1 ? -HUGE_VAL : HUGE_VAL;
  }
  result.length = sign + length;
  return result;
}

/// With a point for the decimals whatever the machine's own habit, which printf would follow.
std::string Written(double value, std::chars_format format, int precision) {
  std::array<char, 400> buffer{};
  const auto [end, error] =
      std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, format, precision);
  return {buffer.data(), end};
}

}  // namespace

double Val(std::string_view text) { return ReadPrefix(WithoutLeadingBlanks(text)).value; }

double NumberOf(std::string_view text) {
  const std::string_view body = WithoutLeadingBlanks(text);
  const NumericPrefix prefix = ReadPrefix(body);
  const std::string_view rest = WithoutLeadingBlanks(body.substr(prefix.length));
  if (prefix.length == 0 || !rest.empty()) throw RunTimeError(ErrorNumber::TypeMismatch);
  return prefix.value;
}

Integer CInt(std::string_view text) { return Integer::Narrow(NumberOf(text)); }

double Int(double value) { return std::floor(value); }

std::string NumberText(double value) {
  if (std::abs(value) < kMostDigits && value == std::floor(value)) {
    return std::to_string(static_cast<std::int64_t>(value));  // "0" for -0 too
  }
  return Written(value, std::chars_format::general, 15);
}

std::string TwoPlaces(double value) {
  return Written(value == 0 ? 0 : value, std::chars_format::fixed, 2);  // no -0.00
}

double AverageQuotientFirst(double aggregate, double shots) {
  return Int(aggregate / shots * 100) / 100;
}

double AverageHundredfold(double aggregate, double shots) {
  return AverageQuotientFirst(aggregate, shots);
}

double Divide(double a, double b) {
  if (b == 0) throw RunTimeError(ErrorNumber::DivisionByZero);
  return a / b;
}

}  // namespace marlowbeck
