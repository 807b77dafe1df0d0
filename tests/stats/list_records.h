#pragma once

#include <vector>

#include "stats/combined_list.h"
#include "stats/highest_list.h"
#include "stats/report_records.h"

namespace marlowbeck {

// The lists worked out over records as over files.

inline std::vector<HighestRow> OfDate(const Competition& competition, HighestOf list, double date) {
  HighestOfDate highest(list, Date{date});
  HandOver<ResultView>(competition.results, [&](ResultView view) { highest.AddResult(view); });
  HandOver<PlayerView>(competition.players, [&](PlayerView view) { highest.AddPlayer(view); });
  return highest.TakeRows();
}

inline std::vector<HighestRow> UpTo(const Competition& competition, HighestOf list, double until) {
  HighestUpToDate highest(list, Date{until});
  HandOver<PlayerView>(competition.players, [&](PlayerView view) { highest.AddPlayer(view); });
  HandOver<ResultView>(competition.results, [&](ResultView view) { highest.AddResult(view); });
  return highest.Rows();
}

inline std::vector<CombinedRow> OfAllGrades(const std::vector<PlayerRecord>& players,
                                            const std::vector<std::vector<ResultRecord>>& grades,
                                            double until) {
  CombinedAverages averages(Date{until});
  HandOver<PlayerView>(players, [&](PlayerView view) { averages.AddPlayer(view); });
  for (const auto& results : grades) {
    HandOver<ResultView>(results, [&](ResultView view) { averages.AddResult(view); });
    averages.EndGrade();
  }
  return averages.Rows();
}

}  // namespace marlowbeck
