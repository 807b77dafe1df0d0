#pragma once

namespace marlowbeck {

/// Rows that a report's table has place for; one more is a subscript failure.
inline constexpr int kReportPlaces = 1000;

}  // namespace marlowbeck
