#include "results/opposition_finder.h"

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kOppositionPlaces = 200;
constexpr std::string_view kPlayed = "NO";

}  // namespace

OppositionFinder::OppositionFinder(const std::vector<std::string>& teams, std::string_view team,
                                   Date date)
    : team_(team), date_(date) {
  for (const std::string& other : teams) {
    if (Trimmed(other) == team_) continue;
    others_.push_back(Trim(other));
    if (others_.size() > kOppositionPlaces) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  }
}

void OppositionFinder::AddResult(const ResultView& result) {
  if (result.GameDate() != date_) return;
  const std::string team(result.Team());
  const std::string opposition(result.Opposition());
  if (!met_ && team == team_) met_ = opposition;
  if (!met_ && opposition == team_) met_ = team;
  played_.insert(team);
  played_.insert(opposition);
}

std::vector<std::string> OppositionFinder::Free() const {
  std::vector<std::string> free;
  for (const std::string& other : others_) {
    // KEPT: a team named NO, the mark of one that has played, is never offered as an opposition; a
    // repair would keep the mark apart from the names.
    if (other != kPlayed && !played_.contains(other)) free.push_back(other);
  }
  return free;
}

bool IsConflict(const ResultView& result, Date date, std::string_view team,
                std::string_view opposition) {
  if (result.GameDate() != date) return false;
  return (result.Team() == team && result.Opposition() != opposition) ||
         (result.Opposition() == team && result.Team() != opposition);
}

}  // namespace marlowbeck
