#pragma once

#include <string>
#include <vector>

#include "print/print_job.h"
#include "season/peg_ratios.h"

namespace marlowbeck {

/// Prints the heading lines and the first rows of a list, one row to a line, on as many pages as it
/// takes: whether another one is wanted is asked at every page's foot.
void PrintRatios(const Context& context, double copies, const std::vector<std::string>& heading,
                 const std::vector<RatioRow>& rows);

}  // namespace marlowbeck
