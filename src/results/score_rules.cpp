#include "results/score_rules.h"

#include <cmath>

#include "data/numbers.h"
#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

/// Which of the three games are best of three. A code that is none of the known ones opens all.
std::array<bool, 3> BestOfThreeGames(int code) {
  switch (code) {
    case 330:
      return {true, true, false};
    case 303:
      return {true, false, true};
    case 33:
      return {false, true, true};
    case 300:
      return {true, false, false};
    case 30:
      return {false, true, false};
    case 3:
      return {false, false, true};
    case 111:
      return {false, false, false};
    default:
      return {true, true, true};
  }
}

}  // namespace

CenturiesCheck CheckScores(double high_score, double centuries, double scores_180) {
  if (high_score < 1 && scores_180 < 1 && centuries < 1) return CenturiesCheck::NothingScored;
  if (high_score > 180) return CenturiesCheck::HighScoreAbove180;
  if (centuries > 0 && high_score < 1) return CenturiesCheck::NoHighScore;
  if (high_score < 100 && centuries > 0) return CenturiesCheck::HighScoreBelow100;
  if (high_score > 99 && centuries < 1) return CenturiesCheck::NoCenturies;
  if (high_score == 180 && scores_180 < 1) return CenturiesCheck::No180s;
  if (scores_180 > 0 && high_score != 180) return CenturiesCheck::HighScoreNot180;
  if (scores_180 > centuries) return CenturiesCheck::FewerCenturiesThan180s;
  return CenturiesCheck::Passed;
}

double SheetAverage(double aggregate, double shots) {
  const double average = AverageQuotientFirst(aggregate, shots);
  if (!std::isfinite(average)) throw RunTimeError(ErrorNumber::Overflow);
  return average;
}

PegBoxes PegBoxesFor(int best_of_three, const std::array<std::string, 6>& game_names) {
  const std::array<bool, 3> games = BestOfThreeGames(best_of_three);
  PegBoxes boxes;
  for (std::size_t game = 0; game < games.size(); ++game) {
    const std::string& name = game_names[game];
    boxes.shown[2 * game] = true;
    boxes.shown[2 * game + 1] = games[game];
    boxes.captions[2 * game] = (games[game] ? " Peg 1:" : " Peg:") + name;
    boxes.captions[2 * game + 1] = " Peg 2:" + name;
  }
  return boxes;
}

}  // namespace marlowbeck
