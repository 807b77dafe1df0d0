#include "season/team_lists.h"

#include "data/competition.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kRuleLength = 40;

}  // namespace

void TeamLists::Add(const PlayerView& player) {
  if (player.Grade() != grade_) return;
  teams_.emplace_back(player.Team());
  players_[teams_.back()].push_back(Trim(player.FullName(", ")));
}

std::vector<std::string> TeamLists::Lines() const {
  std::vector<std::string> lines;
  for (const std::string& team : SortedDistinct(teams_)) {
    lines.push_back(team);
    lines.emplace_back(kRuleLength, '-');
    const auto& players = players_.at(team);
    lines.insert(lines.end(), players.begin(), players.end());
    lines.emplace_back();
  }
  return lines;
}

}  // namespace marlowbeck
