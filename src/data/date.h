#pragma once

#include <compare>
#include <optional>
#include <string>
#include <string_view>

namespace marlowbeck {

/// A date as the records hold it: days since 30 December 1899, a game date without time of day.
/// 0 stands for no date. A record may hold any bits; a value outside the years 100 to 9999 can be
/// compared and carried along but not shown.
struct Date {
  double days = 0;

  [[nodiscard]] bool IsSet() const { return days > 0; }
  friend bool operator==(Date a, Date b) { return a.days == b.days; }
  friend std::partial_ordering operator<=>(Date a, Date b) { return a.days <=> b.days; }
};

struct CivilDate {
  int year = 0;
  int month = 0;
  int day = 0;
};

/// The day number of a date of the Gregorian calendar; nothing for a day that does not exist or
/// lies outside the years 100 to 9999.
[[nodiscard]] std::optional<Date> DateFromCivil(CivilDate civil);

/// Throws Overflow for a day number outside the years 100 to 9999.
[[nodiscard]] CivilDate CivilFromDate(Date date);

[[nodiscard]] std::string ShortDate(Date date);  ///< 31/03/2004; throws as CivilFromDate
[[nodiscard]] std::string LongDate(Date date);   ///< Wednesday, 31 March 2004
[[nodiscard]] std::string DayName(Date date);    ///< Wednesday
[[nodiscard]] std::string IsoDate(Date date);    ///< 2004-03-31

/// Reads yyyy-mm-dd.
[[nodiscard]] std::optional<Date> DateFromIso(std::string_view text);

/// Reads a date in the short, the long or the yyyy-mm-dd form; a two-digit year reads 00 to 29 as
/// 2000 to 2029. Throws TypeMismatch for anything else.
[[nodiscard]] Date DateFromText(std::string_view text);

}  // namespace marlowbeck
