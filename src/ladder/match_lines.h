#pragma once

#include <array>
#include <string>

#include "data/records.h"

namespace marlowbeck {

/// A match as it was typed: the texts of its boxes, and the two numbers that they begin with.
struct TypedMatch {
  std::string home;
  std::string home_text;
  double home_score = 0;
  std::string away;
  std::string away_text;
  double away_score = 0;
};

/// The line of a match that has just been saved: "Lions (6) defeated  Hawks (5)  ".
[[nodiscard]] std::string LineOfTyped(const TypedMatch& match);

/// The line of a match on file, the winner first.
[[nodiscard]] std::string LineOfRecord(const LadderView& match);

/// The same as five cells: team, games, " def " or " drew ", team, games.
[[nodiscard]] std::array<std::string, 5> ResultCells(const LadderView& match);

}  // namespace marlowbeck
