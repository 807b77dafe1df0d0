#include "ladder/match_lines.h"

#include <string_view>

namespace marlowbeck {
namespace {

struct LineSide {
  std::string_view team;
  std::string games;
};

std::string Line(const LineSide& first, std::string_view verb, const LineSide& second) {
  std::string line(first.team);
  line.append(" (").append(first.games).append(") ").append(verb).append("  ");
  return line.append(second.team).append(" (").append(second.games).append(")  ");
}

LineSide HomeOf(const LadderView& match) {
  return {match.HomeTeam(), std::to_string(match.HomeScore())};
}

LineSide AwayOf(const LadderView& match) {
  return {match.AwayTeam(), std::to_string(match.AwayScore())};
}

std::array<std::string, 5> Cells(const LineSide& first, const char* word, const LineSide& second) {
  return {std::string(first.team), first.games, word, std::string(second.team), second.games};
}

}  // namespace

// KEPT: a draw that has just been saved reads "drew" with the home team first, and "drew with" with
// the away team first once the list is filled anew; a repair would choose one of them.
std::string LineOfTyped(const TypedMatch& match) {
  const LineSide home = {match.home, match.home_text};
  const LineSide away = {match.away, match.away_text};
  if (match.home_score == match.away_score) return Line(home, "drew", away);
  return match.home_score > match.away_score ? Line(home, "defeated", away)
                                             : Line(away, "defeated", home);
}

std::string LineOfRecord(const LadderView& match) {
  if (match.HomeScore() > match.AwayScore()) return Line(HomeOf(match), "defeated", AwayOf(match));
  const bool drawn = match.HomeScore() == match.AwayScore();
  return Line(AwayOf(match), drawn ? "drew with" : "defeated", HomeOf(match));
}

// KEPT: among the results of the ladder tab a draw has the home team first, in the list of recorded
// scores the away team; a repair would choose one of them.
std::array<std::string, 5> ResultCells(const LadderView& match) {
  if (match.HomeScore() == match.AwayScore()) return Cells(HomeOf(match), " drew ", AwayOf(match));
  return match.HomeScore() > match.AwayScore() ? Cells(HomeOf(match), " def ", AwayOf(match))
                                               : Cells(AwayOf(match), " def ", HomeOf(match));
}

}  // namespace marlowbeck
