#pragma once

#include <string>
#include <vector>

#include "knockout/entrants.h"
#include "ui/context.h"

namespace marlowbeck {

/// A knock-out as it is printed.
struct KnockOutPrint {
  std::vector<std::string> heading;  ///< lines above the table
  std::array<std::string, 3> heads;  ///< of the columns
  std::vector<Entrant> entrants;     ///< at least one
  bool with_grades = false;          ///< a column for them
  bool with_bye = false;             ///< one more place, that nobody has
};

/// The words of a place that nobody has.
inline constexpr const char* kByeWords = "--- bye ---";

/// Prints the numbered table, once for each copy, on as many pages as it takes; whether another one
/// is wanted is asked once. Answers false when nothing came out, which has been told then. Throws
/// what goes wrong once the document is thrown away. `copies` is rounded half to even.
[[nodiscard]] bool PrintKnockOut(const Context& context, double copies, const KnockOutPrint& print);

}  // namespace marlowbeck
