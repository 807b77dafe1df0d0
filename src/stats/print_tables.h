#pragma once

#include "data/session.h"
#include "print/report.h"
#include "ui/controls.h"

namespace marlowbeck {

/// The weekly table as the grid shows it, for paper.
[[nodiscard]] ReportTable WeeklyPrintTable(const Session& session, const Grid& grid);

/// Whether the title of the progressive table names the grade too.
enum class TitleOfSeason { WithGrade, WithoutGrade };

/// The progressive table as the grid shows it, for paper.
[[nodiscard]] ReportTable ProgressivePrintTable(const Session& session, const Grid& grid,
                                                TitleOfSeason title);

}  // namespace marlowbeck
