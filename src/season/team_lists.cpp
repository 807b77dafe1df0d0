#include "season/team_lists.h"

#include <utility>

#include "data/competition.h"
#include "data/runtime_error.h"
#include "data/text.h"
#include "stats/limits.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kRuleLength = 40;
constexpr std::size_t kLinesOfATeam = 3;  // its name, the rule, the empty line

}  // namespace

void TeamLists::Add(const PlayerView& player) {
  if (player.Grade() != grade_) return;
  if (names_.size() == kReportPlaces) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  const std::string_view team = player.Team();
  auto place = places_.find(team);
  if (place == places_.end()) {
    place = places_.try_emplace(std::string(team), teams_.size()).first;
    teams_.emplace_back(team);
    counts_.push_back(0);
  }
  ++counts_[place->second];
  team_of_.push_back(place->second);
  names_.push_back(player.FullName(", "));
  if (names_.back().ends_with(' ')) names_.back() = Trim(names_.back());
}

std::vector<std::string> TeamLists::TakeLines() {
  std::vector<std::string> lines(names_.size() + kLinesOfATeam * teams_.size());
  std::vector<std::size_t> next(teams_.size());  // line of a team's next player
  std::size_t line = 0;
  for (const std::string& team : SortedDistinct(teams_)) {
    const std::size_t place = places_.at(team);
    lines[line++] = team;
    lines[line++] = std::string(kRuleLength, '-');
    next[place] = line;
    line += counts_[place] + 1;
  }
  for (std::size_t i = 0; i < names_.size(); ++i) {
    lines[next[team_of_[i]]++] = std::move(names_[i]);
  }
  return lines;
}

}  // namespace marlowbeck
