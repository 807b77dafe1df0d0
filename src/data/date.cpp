#include "data/date.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <chrono>
#include <cmath>
#include <cstdio>
#include <vector>

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

using std::chrono::sys_days;

constexpr sys_days kDayZero = sys_days(std::chrono::year(1899) / 12 / 30);
constexpr double kFirstDay = -657434;  // 1 January 100
constexpr double kLastDay = 2958465;   // 31 December 9999

constexpr std::array<const char*, 7> kDays = {"Sunday",   "Monday", "Tuesday", "Wednesday",
                                              "Thursday", "Friday", "Saturday"};
constexpr std::array<const char*, 12> kMonths = {"January",   "February", "March",    "April",
                                                 "May",       "June",     "July",     "August",
                                                 "September", "October",  "November", "December"};

sys_days SysDays(Date date) {
  const double day = std::floor(date.days);
  if (!(day >= kFirstDay && day <= kLastDay)) throw RunTimeError(ErrorNumber::Overflow);
  return kDayZero + std::chrono::days(static_cast<int>(day));
}

std::string Formatted(const char* format, int a, int b, int c) {
  std::array<char, 48> buffer{};
  std::snprintf(buffer.data(), buffer.size(), format, a, b, c);
  return buffer.data();
}

/// A run of digits as a number; nothing for anything else.
std::optional<int> WholeNumber(std::string_view text) {
  int value = 0;
  if (text.empty() || text.size() > 4) return std::nullopt;
  if (!std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; })) {
    return std::nullopt;
  }
  std::from_chars(text.data(), text.data() + text.size(), value);
  return value;
}

std::vector<std::string_view> Split(std::string_view text, char separator) {
  std::vector<std::string_view> pieces;
  for (;;) {
    const auto end = text.find(separator);
    pieces.push_back(text.substr(0, end));
    if (end == std::string_view::npos) return pieces;
    text.remove_prefix(end + 1);
  }
}

std::optional<Date> FromPieces(std::string_view year, std::string_view month,
                               std::string_view day) {
  const auto y = WholeNumber(year);
  const auto m = WholeNumber(month);
  const auto d = WholeNumber(day);
  if (!y || !m || !d) return std::nullopt;
  int full_year = *y;
  if (year.size() <= 2) full_year += full_year <= 29 ? 2000 : 1900;
  return DateFromCivil({full_year, *m, *d});
}

std::optional<Date> FromShort(std::string_view text) {
  const auto pieces = Split(text, '/');
  return pieces.size() == 3 ? FromPieces(pieces[2], pieces[1], pieces[0]) : std::nullopt;
}

/// "Wednesday, 31 March 2004", the day's name before the comma not looked at.
std::optional<Date> FromLong(std::string_view text) {
  const auto comma = text.find(", ");
  const auto pieces = Split(comma == std::string_view::npos ? text : text.substr(comma + 2), ' ');
  if (pieces.size() != 3) return std::nullopt;
  for (std::size_t month = 0; month < kMonths.size(); ++month) {
    if (EqualsIgnoringCase(pieces[1], kMonths[month])) {
      return FromPieces(pieces[2], std::to_string(month + 1), pieces[0]);
    }
  }
  return std::nullopt;
}

}  // namespace

std::optional<Date> DateFromCivil(CivilDate civil) {
  if (civil.year < 100 || civil.year > 9999 || civil.month < 1 || civil.day < 1) {
    return std::nullopt;
  }
  const std::chrono::year_month_day ymd{std::chrono::year(civil.year),
                                        std::chrono::month(static_cast<unsigned>(civil.month)),
                                        std::chrono::day(static_cast<unsigned>(civil.day))};
  if (!ymd.ok()) return std::nullopt;
  return Date{static_cast<double>((sys_days(ymd) - kDayZero).count())};
}

CivilDate CivilFromDate(Date date) {
  const std::chrono::year_month_day ymd{SysDays(date)};
  return {static_cast<int>(ymd.year()), static_cast<int>(static_cast<unsigned>(ymd.month())),
          static_cast<int>(static_cast<unsigned>(ymd.day()))};
}

std::string ShortDate(Date date) {
  const CivilDate civil = CivilFromDate(date);
  return Formatted("%02d/%02d/%04d", civil.day, civil.month, civil.year);
}

std::string LongDate(Date date) {
  const CivilDate civil = CivilFromDate(date);
  return DayName(date) + ", " + std::to_string(civil.day) + " " +
         kMonths[static_cast<std::size_t>(civil.month - 1)] + " " + std::to_string(civil.year);
}

std::string DayName(Date date) { return kDays[std::chrono::weekday(SysDays(date)).c_encoding()]; }

std::string IsoDate(Date date) {
  const CivilDate civil = CivilFromDate(date);
  return Formatted("%04d-%02d-%02d", civil.year, civil.month, civil.day);
}

std::optional<Date> DateFromIso(std::string_view text) {
  const auto pieces = Split(text, '-');
  if (pieces.size() != 3 || pieces[0].size() != 4) return std::nullopt;
  return FromPieces(pieces[0], pieces[1], pieces[2]);
}

Date DateFromText(std::string_view text) {
  const std::string_view body = Trimmed(text);
  for (const auto reader : {FromShort, DateFromIso, FromLong}) {
    if (const auto date = reader(body)) return *date;
  }
  throw RunTimeError(ErrorNumber::TypeMismatch);
}

}  // namespace marlowbeck
