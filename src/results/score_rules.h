#pragma once

#include <array>
#include <string>

#include "data/session.h"

namespace marlowbeck {

inline constexpr double kHighestAggregate = 7000;
inline constexpr double kHighestAverage = 200;  ///< points per shot
inline constexpr double kHighestPeg = 170;
inline constexpr int kPlayersOfATeam = 6;

/// What the check of high score, centuries and 180s finds.
enum class CenturiesCheck {
  NothingScored,  ///< all three are below 1
  HighScoreAbove180,
  NoHighScore,
  HighScoreBelow100,
  NoCenturies,
  No180s,
  HighScoreNot180,
  FewerCenturiesThan180s,
  Passed,
};

/// The rules in their order: the first that holds decides.
[[nodiscard]] CenturiesCheck CheckScores(double high_score, double centuries, double scores_180);

/// Points per shot as the sheet shows them: cut to two places, never rounded. Both figures must be
/// above 0. Throws Overflow for what no number can hold.
[[nodiscard]] double SheetAverage(double aggregate, double shots);

/// How the six peg boxes stand for a Best of Three code: two boxes to each game, the second only
/// where the game is best of three.
struct PegBoxes {
  std::array<bool, 6> shown{};
  std::array<std::string, 6> captions;
};
[[nodiscard]] PegBoxes PegBoxesFor(int best_of_three, const std::array<std::string, 6>& game_names);

}  // namespace marlowbeck
