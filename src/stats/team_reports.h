#pragma once

#include <optional>
#include <vector>

#include "data/channels.h"
#include "data/session.h"
#include "stats/progressive_details.h"
#include "stats/weekly_results.h"

namespace marlowbeck {

/// The two reports of the team in hand over the files of the competition in hand. Side files lie in
/// the current folder. All channels are closed at the end of each procedure.
class TeamReports {
 public:
  /// Works out Team's results on WorkDate into `weekly.qz3`; sets Opposition and RowCount. On the
  /// way it gathers what CalcProg asks for, so that the results file is read once for both.
  void CalcWeekly(Session& session, Channels& channels);
  /// Works out the season of Team up to WorkDate into `progweek.qz3` and answers it; sets RowCount.
  /// Where CalcWeekly has not just run for the same team and date it reads the files itself.
  [[nodiscard]] std::vector<ProgressiveRow> CalcProg(Session& session, Channels& channels);

 private:
  std::optional<ProgressiveDetails> season_;  ///< from CalcWeekly to the CalcProg that follows it
};

/// Reads the RowCount rows of `weekly.qz3`.
[[nodiscard]] std::vector<WeeklyRow> ReadWeeklyFile(const Session& session, Channels& channels);

/// Fills TeamDates and DateCount with the dates of Team.
void GetDates(Session& session, Channels& channels);

}  // namespace marlowbeck
