#pragma once

#include <string>
#include <vector>

#include "print/print_job.h"

namespace marlowbeck {

/// A season as it stands on the screen, to be printed: texts of all cells, heading rows included.
struct AnnualPrint {
  std::string grade_line;
  std::string player_line;
  std::vector<std::vector<std::string>> games;
  std::vector<std::vector<std::string>> totals;
};

/// Prints a season on one page, as many copies as are asked for. What has no room is not printed at
/// all, and that is told.
void PrintAnnual(const Context& context, double copies, const AnnualPrint& season);

}  // namespace marlowbeck
