#include "stats/print_tables.h"

namespace marlowbeck {
namespace {

/// The rows below the heading; none of a grid that is not seen.
std::vector<std::vector<std::string>> RowsOf(const Grid& grid) {
  std::vector<std::vector<std::string>> rows;
  if (!grid.Visible()) return rows;
  for (int row = 1; row < grid.Rows(); ++row) {
    auto& cells = rows.emplace_back();
    for (int col = 0; col < grid.Cols(); ++col) cells.push_back(grid.Cell(row, col));
  }
  return rows;
}

}  // namespace

ReportTable WeeklyPrintTable(const Session& session, const Grid& grid) {
  const auto& games = session.GameNames;
  return {session.Team + "  " + session.Grade + "  (v's  " + session.Opposition + ")  " +
              ShortDate(session.WorkDate),
          {{"Player", ""},
           {"Agg", "88888"},
           {"Sh", "8888"},
           {"180", "8888"},
           {"100", "8888"},
           {"H/Sc", "88888"},
           {games[0], "88888888"},
           {games[1], "88888888"},
           {games[2], "88888888"},
           {"Avg", "8888888"}},
          RowsOf(grid)};
}

ReportTable ProgressivePrintTable(const Session& session, const Grid& grid, TitleOfSeason title) {
  const std::string grade = title == TitleOfSeason::WithGrade ? "  " + session.Grade : "";
  return {
      "PROGRESSIVE details for: " + session.Team + grade + " up to " + ShortDate(session.WorkDate),
      {{"Player", ""},
       {"Agg", "88888"},
       {"Sh", "8888"},
       {"180", "8888"},
       {"100", "8888"},
       {"H/Sc", "8888"},
       {"Pegs", "8888"},
       {"Hi/Pg", "88888"},
       {"Gms", "8888"},
       {"Avg", "8888888"}},
      RowsOf(grid)};
}

}  // namespace marlowbeck
