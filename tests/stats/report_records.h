#pragma once

#include <string_view>
#include <vector>

#include "data/records.h"
#include "stats/progressive_details.h"
#include "stats/team_dates.h"
#include "stats/weekly_results.h"

namespace marlowbeck {

// Records of report tests, and the computations run over them as over two files.

struct Competition {
  std::vector<PlayerRecord> players;
  std::vector<ResultRecord> results;
};

inline PlayerRecord Person(std::int32_t id, std::string_view surname, std::string_view first_name,
                           std::string_view team, std::string_view grade) {
  PlayerRecord player;
  player.ID = id;
  player.Surname = surname;
  player.FirstName = first_name;
  player.Team = team;
  player.Grade = grade;
  player.BestOfThree = 333;
  return player;
}

/// A night of a player with an aggregate and shots; all else is 0.
inline ResultRecord Night(std::int32_t id, std::string_view team, std::string_view opposition,
                          double date, std::int16_t aggregate, std::int32_t shots) {
  ResultRecord result;
  result.ID = id;
  result.Team = team;
  result.Opposition = opposition;
  result.GameDate = Date{date};
  result.Aggregate = aggregate;
  result.Shots = shots;
  return result;
}

inline ResultRecord ForfeitNight(std::int32_t id, std::string_view team,
                                 std::string_view opposition, double date) {
  ResultRecord result = Night(id, team, opposition, date, 0, 0);
  result.Forfeit = "F";
  return result;
}

/// Hands every record to `take`, as the view that the computations read.
template <typename View, typename Record, typename Take>
void HandOver(const std::vector<Record>& records, Take take) {
  for (const Record& record : records) {
    const auto bytes = Encode(record);
    take(View(bytes));
  }
}

inline WeeklyResults Weekly(const Competition& competition, std::string_view team, double date) {
  WeeklyResults weekly(team, Date{date});
  HandOver<ResultView>(competition.results, [&](ResultView view) { weekly.AddResult(view); });
  HandOver<PlayerView>(competition.players, [&](PlayerView view) { weekly.AddPlayer(view); });
  return weekly;
}

inline std::vector<ProgressiveRow> Progressive(const Competition& competition,
                                               std::string_view team, std::string_view grade,
                                               double until) {
  ProgressiveDetails details(team, grade, Date{until});
  HandOver<PlayerView>(competition.players, [&](PlayerView view) { details.AddPlayer(view); });
  HandOver<ResultView>(competition.results, [&](ResultView view) { details.AddResult(view); });
  return details.Rows();
}

inline std::vector<Date> DatesOf(const std::vector<ResultRecord>& results, std::string_view team) {
  TeamDates dates(team);
  HandOver<ResultView>(results, [&](ResultView view) { dates.AddResult(view); });
  return dates.Sorted();
}

}  // namespace marlowbeck
