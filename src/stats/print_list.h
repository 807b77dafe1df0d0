#pragma once

#include <string>
#include <vector>

#include "print/print_job.h"
#include "ui/controls.h"

namespace marlowbeck {

/// A list of the highest as the grid shows it, for paper.
struct ListOnPaper {
  std::string title;
  std::string subtitle;
  std::vector<std::string> headings;
  std::vector<std::vector<std::string>> rows;
};

/// The heading and the first `amount` rows of a list.
[[nodiscard]] ListOnPaper PrintedList(const Grid& grid, int amount, const std::string& title,
                                      const std::string& subtitle);

/// Prints a list on as many pages as it takes, each with the heading row; once in a copy it is
/// asked whether another page may be used.
void PrintList(const Context& context, const PrintOptions& options, const ListOnPaper& list);

}  // namespace marlowbeck
