#pragma once

#include <algorithm>
#include <cmath>
#include <stdexcept>
#include <string>
#include <vector>

#include "data/text.h"
#include "ladder/ladder_rows.h"
#include "support/record_files.h"

namespace marlowbeck {

/// What plain arithmetic may not leave.
struct PlainOverflow : std::runtime_error {
  PlainOverflow() : std::runtime_error("overflow") {}
};

/// A line of the ladder in plain numbers.
struct PlainRow {
  std::string team;
  int played = 0;
  int won = 0;
  int lost = 0;
  int draw = 0;
  int games_for = 0;
  int against = 0;
  int points = 0;
  int percent = 0;
  int adjust = 0;

  friend bool operator==(const PlainRow&, const PlainRow&) = default;
};

struct PlainRules {
  int win = 2;
  int loss = 0;
  int draw = 1;
};

inline int In16(long value) {
  if (value < -32768 || value > 32767) throw PlainOverflow();
  return static_cast<int>(value);
}

/// Halves to the even number.
inline int RoundedEven(double value) {
  const double below = std::floor(value);
  const double rest = value - below;
  const bool even = std::fmod(below, 2) == 0;
  return static_cast<int>(rest > 0.5 || (rest == 0.5 && !even) ? below + 1 : below);
}

inline void PlainCount(PlainRow& row, int own, int other, int penalty) {
  row.played = In16(row.played + 1);
  if (own > other) row.won = In16(row.won + 1);
  if (own < other) row.lost = In16(row.lost + 1);
  if (own == other) row.draw = In16(row.draw + 1);
  row.games_for = In16(row.games_for + own);
  row.against = In16(row.against + other);
  row.adjust = In16(row.adjust + penalty);
}

inline void PlainFigures(PlainRow& row, const PlainRules& rules) {
  const int wins = In16(long{row.won} * rules.win);
  const int losses = In16(long{row.lost} * rules.loss);
  const int draws = In16(long{row.draw} * rules.draw);
  row.points = In16(In16(In16(long{wins} + losses) + long{draws}) + long{row.adjust});
  const int hundredfold = In16(long{row.games_for} * 100);
  row.percent = RoundedEven(double(hundredfold) / (row.against >= 1 ? row.against : 1));
}

/// The table by the plain loops: for every team every record of the file.
inline std::vector<PlainRow> PlainLadder(const std::vector<std::string>& teams,
                                         const std::vector<LadderRecord>& matches,
                                         const PlainRules& rules, Date up_to) {
  std::vector<PlainRow> rows;
  for (const std::string& name : teams) {
    PlainRow row;
    row.team = Trim(name);
    for (const LadderRecord& match : matches) {
      if (row.team.empty() || !(match.GameDate <= up_to)) continue;
      const bool home = Trim(match.HomeTeam) == row.team;
      const bool away = Trim(match.AwayTeam) == row.team;
      if (home) PlainCount(row, match.HomeScore, match.AwayScore, match.HomePenalty);
      if (home) PlainFigures(row, rules);
      if (away) PlainCount(row, match.AwayScore, match.HomeScore, match.AwayPenalty);
      if (away) PlainFigures(row, rules);
    }
    rows.push_back(row);
  }
  return rows;
}

/// Both passes, written out step by step over places from 1.
inline void PlainSort(std::vector<PlainRow>& rows) {
  const int count = static_cast<int>(rows.size());
  const auto at = [&](int place) -> PlainRow& { return rows[static_cast<std::size_t>(place - 1)]; };
  for (int gap = count / 2; gap > 0; gap = gap / 2) {
    for (int i = gap; i <= count - 1; ++i) {
      int j = i - gap + 1;
      while (j >= 1) {
        if (at(j).points >= at(j + gap).points) break;
        std::swap(at(j), at(j + gap));
        j = j - gap;
      }
    }
  }
  for (int gap = count / 2; gap > 0; gap = gap / 2) {
    for (int i = gap; i <= count - 1; ++i) {
      int j = i - gap + 1;
      while (j >= 1) {
        if (at(j).points > at(j + gap).points) break;
        if (at(j).percent >= at(j + gap).percent) break;
        std::swap(at(j), at(j + gap));
        j = j - gap;
      }
    }
  }
}

inline std::vector<PlainRow> PlainOf(const LadderRows& rows) {
  std::vector<PlainRow> plain;
  for (const LadderRow& row : rows) {
    plain.push_back({row.Team, row.Played, row.Won, row.Lost, row.Draw, row.For, row.Against,
                     row.Points, row.Percent, row.Adjust});
  }
  return plain;
}

inline void PrintTo(const PlainRow& row, std::ostream* out) {
  *out << row.team << ' ' << row.played << ' ' << row.won << ' ' << row.lost << ' ' << row.draw
       << ' ' << row.games_for << ' ' << row.against << ' ' << row.points << ' ' << row.percent
       << ' ' << row.adjust;
}

}  // namespace marlowbeck
