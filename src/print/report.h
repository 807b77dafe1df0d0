#pragma once

#include <string>
#include <vector>

#include "print/print_job.h"

namespace marlowbeck {

// The common print routine: tables of names and figures, one or more below each other on one page.

struct ReportColumn {
  std::string heading;
  /// The text, a string of eights, that fixes the column's width; empty for the names, which take
  /// that of the widest cell below the heading.
  std::string eights;
};

struct ReportTable {
  std::string title;
  std::vector<ReportColumn> columns;
  std::vector<std::vector<std::string>> rows;  ///< below the heading; one cell to a column
};

/// Prints the association's name, the season's title and the tables, each below its own title, once
/// for each copy. What has no room on one page is not printed at all, and that is told; a failure
/// is told too, and the screen goes on.
void PrintReport(const Context& context, const PrintOptions& options,
                 const std::vector<ReportTable>& tables);

}  // namespace marlowbeck
