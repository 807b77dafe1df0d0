#pragma once

#include <string>
#include <vector>

#include "print/print_job.h"

namespace marlowbeck {

using TextRows = std::vector<std::vector<std::string>>;

/// What the Premiership Ladder tab shows, as texts.
struct LadderTab {
  std::string grade;         ///< as picked
  std::string game_details;  ///< the heading of the results
  std::string ladder_title;  ///< the heading of the ladder
  std::vector<std::string> teams;
  TextRows results;  ///< five cells: a team, its score, a word, the other team, its score
  TextRows ladder;   ///< below the heading row; ten cells from the team to the adjustment
};

enum class LadderPrintout { Results, Ladder, Both };

/// Prints the results of the night, the ladder, or both on one page, once for each copy. What has
/// no room on one page is not printed at all, and that is told; a failure is told too.
void PrintLadderTab(const Context& context, const PrintOptions& options, LadderPrintout what,
                    const LadderTab& tab);

}  // namespace marlowbeck
