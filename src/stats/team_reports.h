#pragma once

#include <vector>

#include "data/channels.h"
#include "data/session.h"
#include "stats/progressive_details.h"
#include "stats/weekly_results.h"

namespace marlowbeck {

// The reports of the team in hand over the files of the competition in hand, each file read once.
// Side files lie in the current folder. All channels are closed at the end.

/// Works out Team's results on WorkDate into `weekly.qz3`; sets Opposition and RowCount.
void CalcWeekly(Session& session, Channels& channels);
/// Reads the RowCount rows of `weekly.qz3`.
[[nodiscard]] std::vector<WeeklyRow> ReadWeeklyFile(const Session& session, Channels& channels);

/// Works out the season of Team up to WorkDate into `progweek.qz3` and answers it; sets RowCount.
[[nodiscard]] std::vector<ProgressiveRow> CalcProg(Session& session, Channels& channels);

/// Fills TeamDates and DateCount with the dates of Team.
void GetDates(Session& session, Channels& channels);

}  // namespace marlowbeck
