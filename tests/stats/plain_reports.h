#pragma once

#include <cmath>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

#include "data/runtime_error.h"
#include "stats/report_records.h"

namespace marlowbeck::plain {

// The reports as plain nested loops over whole files, with a gap sort of their own: slow, and all
// that the computations have to answer.

inline std::string Bare(std::string text) {
  while (!text.empty() && text.back() == ' ') text.pop_back();
  while (!text.empty() && text.front() == ' ') text.erase(text.begin());
  return text;
}

inline std::string NameOf(const PlayerRecord& player) {
  return Bare(player.Surname) + ", " + Bare(player.FirstName);
}

template <typename Row, typename InOrder>
void Sort(std::vector<Row>& rows, InOrder in_order) {
  const int n = static_cast<int>(rows.size());
  const auto at = [&](int place) -> Row& { return rows[static_cast<std::size_t>(place - 1)]; };
  int gap = n / 2;
  while (gap >= 1) {
    for (int i = gap; i <= n - 1; i = i + 1) {
      int j = i - gap + 1;
      while (j >= 1) {
        if (in_order(at(j), at(j + gap))) break;
        const Row kept = at(j);
        at(j) = at(j + gap);
        at(j + gap) = kept;
        j = j - gap;
      }
    }
    gap = gap / 2;
  }
}

struct Weekly {
  std::vector<WeeklyRow> rows;
  std::optional<std::string> opposition;
  int error = 0;
};

inline std::optional<std::string> FirstNameFor(const Competition& competition, std::int32_t id) {
  for (const PlayerRecord& player : competition.players) {
    if (player.ID == id) return NameOf(player);
  }
  return std::nullopt;
}

inline Weekly CalcWeekly(const Competition& competition, const std::string& team, double date) {
  Weekly answer;
  const auto wanted = [&](const ResultRecord& result) {
    return Bare(result.Team) == team && result.GameDate.days == date;
  };
  for (const ResultRecord& result : competition.results) {
    if (!wanted(result)) continue;
    answer.opposition = "";
    if (FirstNameFor(competition, result.ID)) answer.opposition = Bare(result.Opposition);
  }
  for (const ResultRecord& result : competition.results) {
    if (!wanted(result)) continue;
    const auto name = FirstNameFor(competition, result.ID);
    if (!name) continue;
    const bool forfeit = Bare(result.Forfeit) == "F";
    WeeklyRow row{*name + (forfeit ? " *" : ""),
                  forfeit ? std::int16_t{1} : result.Aggregate,
                  forfeit ? 1 : result.Shots,
                  result.Scores180,
                  result.Centuries,
                  result.HighScore,
                  result.Pegs};
    answer.rows.push_back(row);
  }
  const auto average = [&](const WeeklyRow& row) {
    if (row.shots == 0) answer.error = 11;
    return row.shots == 0 ? 0.0 : static_cast<double>(row.agg) / static_cast<double>(row.shots);
  };
  Sort(answer.rows,
       [&](const WeeklyRow& a, const WeeklyRow& b) { return average(b) <= average(a); });
  return answer;
}

inline ProgressiveRow SumsOf(const Competition& competition, const PlayerRecord& player,
                             double until) {
  ProgressiveRow row;
  row.name = NameOf(player);
  row.id = player.ID;
  for (const ResultRecord& result : competition.results) {
    if (result.ID != player.ID || result.GameDate.days > until) continue;
    row.agg += result.Aggregate;
    row.shots += result.Shots;
    if (result.HighScore > row.hs) row.hs = result.HighScore;
    row.c180 += result.Scores180;
    row.c100 += result.Centuries;
    for (const std::int16_t peg : result.Pegs) {
      if (peg > 0) row.pegs += 1;
      if (peg > row.hipeg) row.hipeg = peg;
    }
    if (row.agg > 0 && row.shots > 0) {
      row.avg =
          std::floor(100 * (static_cast<double>(row.agg) / static_cast<double>(row.shots))) / 100;
    }
    row.games += 1;
    if (Bare(result.Forfeit) == "F") row.forfeits += 1;
  }
  return row;
}

inline std::vector<ProgressiveRow> CalcProg(const Competition& competition, const std::string& team,
                                            const std::string& grade, double until) {
  std::vector<ProgressiveRow> rows;
  for (const PlayerRecord& player : competition.players) {
    if (Bare(player.Team) == team && Bare(player.Grade) == grade) {
      rows.push_back(SumsOf(competition, player, until));
    }
  }
  Sort(rows, [](const ProgressiveRow& a, const ProgressiveRow& b) { return !(a.avg < b.avg); });
  return rows;
}

inline std::vector<double> GetDates(const Competition& competition, const std::string& team) {
  std::vector<double> dates;
  for (const ResultRecord& result : competition.results) {
    if (Bare(result.Team) == team) dates.push_back(result.GameDate.days);
  }
  Sort(dates, [](double a, double b) { return a < b; });
  dates.push_back(0);
  std::vector<double> kept;
  for (std::size_t i = 0; i + 1 < dates.size(); ++i) {
    if (dates[i] != dates[i + 1]) kept.push_back(dates[i]);
  }
  return kept;
}

inline std::string WeeklyFile(const std::vector<WeeklyRow>& rows) {
  std::ostringstream text;
  for (const WeeklyRow& row : rows) {
    text << '"' << row.name << "\"," << row.agg << ',' << row.shots << ',' << row.c180 << ','
         << row.c100 << ',' << row.hs << "\r\n";
    const char* comma = "";
    for (const std::int16_t peg : row.pegs) {
      text << comma << peg;
      comma = ",";
    }
    text << "\r\n";
  }
  return text.str();
}

inline std::string ProgressiveFile(const std::vector<ProgressiveRow>& rows) {
  std::ostringstream text;
  text.precision(15);
  for (const ProgressiveRow& row : rows) {
    text << '"' << row.name << "\"," << row.agg << ',' << row.shots << ',' << row.hs << ','
         << row.c180 << ',' << row.c100 << ',' << row.pegs << ',' << row.hipeg << ',' << row.games
         << ',' << row.avg << "\r\n";
  }
  return text.str();
}

}  // namespace marlowbeck::plain
