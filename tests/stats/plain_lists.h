#pragma once

#include <sstream>
#include <string>
#include <vector>

#include "stats/combined_list.h"
#include "stats/highest_list.h"
#include "stats/plain_reports.h"

namespace marlowbeck::plain {

// The lists as plain nested loops over whole files: slow, and all that the computations have to
// answer. `choice` is the number of the list, 0 to 5.

inline double Cut(double value) { return std::floor(value) / 100; }

inline double ValueOf(const ResultRecord& result, int choice) {
  if (choice == 0) {
    return Cut(static_cast<double>(result.Aggregate) / static_cast<double>(result.Shots) * 100);
  }
  if (choice == 2) return result.HighScore;
  if (choice == 4) return result.Centuries;
  if (choice == 5) return result.Scores180;
  double highest = result.Pegs[0];
  double count = 0;
  for (const std::int16_t peg : result.Pegs) {
    if (peg > highest) highest = peg;
    if (peg > 0) count = count + 1;
  }
  return choice == 1 ? highest : count;
}

/// From the last row to the first, those with a value.
template <typename Row, typename Value>
std::vector<Row> TurnedRound(const std::vector<Row>& rows, Value value) {
  std::vector<Row> turned;
  for (std::size_t i = rows.size(); i > 0; --i) {
    if (value(rows[i - 1]) > 0) turned.push_back(rows[i - 1]);
  }
  return turned;
}

inline std::vector<HighestRow> HighestLast(std::vector<HighestRow> rows) {
  Sort(rows, [](const HighestRow& a, const HighestRow& b) { return a.value < b.value; });
  return TurnedRound(rows, [](const HighestRow& row) { return row.value; });
}

inline std::vector<HighestRow> CalcHi(const Competition& competition, int choice, double date) {
  std::vector<HighestRow> rows;
  for (const ResultRecord& result : competition.results) {
    if (result.GameDate.days != date || result.Aggregate < 1 || result.Shots <= 0) continue;
    HighestRow row{result.ID, "", Bare(result.Team), ValueOf(result, choice), 0};
    for (const PlayerRecord& player : competition.players) {
      if (player.ID != result.ID) continue;
      row.name = NameOf(player);
      break;
    }
    rows.push_back(row);
  }
  return HighestLast(rows);
}

inline HighestRow ProgressiveRowOf(const PlayerRecord& player,
                                   const std::vector<ResultRecord>& results, int choice,
                                   double until) {
  HighestRow row{player.ID, NameOf(player), Bare(player.Team), 0, 0};
  double agg = 0;
  double shots = 0;
  for (const ResultRecord& result : results) {
    if (result.GameDate.days > until || result.ID != player.ID) continue;
    if (choice == 0) {
      if (result.Aggregate > 0) agg = agg + result.Aggregate;
      if (result.Shots > 0) shots = shots + result.Shots;
      if (agg > 0 && shots > 0) row.value = Cut(100 * (agg / shots));
    }
    for (const std::int16_t peg : result.Pegs) {
      if (choice == 1 && peg > row.value) row.value = peg;
      if (choice == 3 && peg > 0) row.value = row.value + 1;
    }
    if (choice == 2 && result.HighScore > row.value) row.value = result.HighScore;
    if (choice == 4) row.value = row.value + result.Centuries;
    if (choice == 5) row.value = row.value + result.Scores180;
    if (result.Aggregate > 0 && result.Shots > 0) row.games = row.games + 1;
  }
  return row;
}

inline std::vector<HighestRow> CalcHiProg(const Competition& competition, int choice,
                                          double until) {
  std::vector<HighestRow> rows;
  for (const PlayerRecord& player : competition.players) {
    const HighestRow row = ProgressiveRowOf(player, competition.results, choice, until);
    if (row.value > 0) rows.push_back(row);
  }
  return HighestLast(rows);
}

inline std::vector<double> GetHiDates(const Competition& competition) {
  std::vector<double> dates;
  for (const ResultRecord& result : competition.results) dates.push_back(result.GameDate.days);
  dates.push_back(0);
  std::vector<double> kept;
  for (std::size_t i = 0; i + 1 < dates.size(); ++i) {
    if (dates[i] != dates[i + 1]) kept.push_back(dates[i]);
  }
  return kept;
}

inline std::vector<CombinedRow> CombineAV(const std::vector<PlayerRecord>& players,
                                          const std::vector<std::vector<ResultRecord>>& grades,
                                          double until) {
  std::vector<CombinedRow> rows(players.size());
  for (const auto& results : grades) {
    for (std::size_t i = 0; i < players.size(); ++i) {
      rows[i].id = players[i].ID;
      rows[i].name = NameOf(players[i]);
      rows[i].team = Bare(players[i].Team);
      rows[i].grade = Bare(players[i].Grade);
      double agg = 0;
      double shots = 0;
      for (const ResultRecord& result : results) {
        if (result.GameDate.days > until || result.ID != players[i].ID) continue;
        if (result.Aggregate > 0) agg = agg + result.Aggregate;
        if (result.Shots > 0) shots = shots + result.Shots;
        if (agg > 0 && shots > 0) rows[i].avg = Cut(100 * (agg / shots));
        if (result.Aggregate > 0 && result.Shots > 0) rows[i].games = rows[i].games + 1;
      }
    }
  }
  return TurnedRound(rows, [](const CombinedRow& row) { return row.avg; });
}

/// Whether a text stands before another by the codes of its characters.
inline bool Before(const std::string& a, const std::string& b) {
  for (std::size_t i = 0; i < a.size() && i < b.size(); ++i) {
    const auto left = static_cast<unsigned char>(a[i]);
    const auto right = static_cast<unsigned char>(b[i]);
    if (left != right) return left < right;
  }
  return a.size() < b.size();
}

inline std::vector<CombinedRow> CombineSort(std::vector<CombinedRow> rows, bool by_average) {
  if (by_average) {
    Sort(rows, [](const CombinedRow& a, const CombinedRow& b) { return a.avg < b.avg; });
  } else {
    Sort(rows, [](const CombinedRow& a, const CombinedRow& b) { return !Before(a.name, b.name); });
  }
  return TurnedRound(rows, [](const CombinedRow& row) { return row.avg; });
}

inline std::string HighestFile(const std::vector<HighestRow>& rows) {
  std::ostringstream text;
  text.precision(15);
  for (const HighestRow& row : rows) {
    text << row.id << ",\"" << row.name << "\",\"" << row.team << "\"," << row.value << ','
         << row.games << "\r\n";
  }
  return text.str();
}

inline std::string CombineFile(const std::vector<CombinedRow>& rows) {
  std::ostringstream text;
  text.precision(15);
  for (const CombinedRow& row : rows) {
    text << row.id << ",\"" << row.name << "\",\"" << row.team << "\",\"" << row.grade << "\","
         << row.avg << ',' << row.games << "\r\n";
  }
  return text.str();
}

}  // namespace marlowbeck::plain
