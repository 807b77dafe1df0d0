#pragma once

#include <string>
#include <vector>

#include "data/channels.h"
#include "data/session.h"
#include "stats/combined_list.h"
#include "stats/highest_list.h"

namespace marlowbeck {

// The lists over the files of the competition in hand. Side files lie in the current folder. All
// channels are closed at the end of each procedure.

/// Fills TeamDates and DateCount with the dates of the grade in hand, in the order in which its
/// records lie: a date that comes again after another one is there again.
void GetHiDates(Session& session, Channels& channels);

/// Works out the list of ReportChoice (0 to 5) for WorkDate alone into `Highest.qz3`; sets RowCount
/// and, where there is any result to list, HiLabel.
void CalcHi(Session& session, Channels& channels);
/// The same for everything up to WorkDate.
void CalcHiProg(Session& session, Channels& channels);
/// Reads the RowCount rows of `Highest.qz3`.
[[nodiscard]] std::vector<HighestRow> ReadHighestFile(const Session& session, Channels& channels);

/// Works out the averages of all of these grades up to WorkDate into `Combine.qz3`; sets RowCount.
/// ResultsFile stays that of the last grade.
void CombineAV(Session& session, Channels& channels, const std::vector<std::string>& grades);
/// Puts the RowCount rows of `Combine.qz3` in order.
void CombineSort(Session& session, Channels& channels, CombinedOrder order);
/// Reads the RowCount rows of `Combine.qz3`.
[[nodiscard]] std::vector<CombinedRow> ReadCombineFile(const Session& session, Channels& channels);

}  // namespace marlowbeck
