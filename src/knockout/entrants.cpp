#include "knockout/entrants.h"

#include <algorithm>

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kMostPlayers = 1000;
constexpr std::string_view kBetween = " : ";

}  // namespace

std::string LineOf(const Entrant& entrant) {
  return entrant.name + std::string(kBetween) + entrant.grade;
}

const Entrant& Available::Add(const PlayerView& player) {
  if (players_.size() == kMostPlayers) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  players_.push_back({Trim(player.FullName(", ")), std::string(player.Grade())});
  lines_.push_back(LineOf(players_.back()));
  return players_.back();
}

void Available::Clear() {
  players_.clear();
  lines_.clear();
}

Entrant Available::Behind(std::string_view line) const {
  const auto place = std::find(lines_.begin(), lines_.end(), line);
  if (place != lines_.end()) return players_[static_cast<std::size_t>(place - lines_.begin())];
  const std::size_t cut = std::min(line.rfind(kBetween), line.size());
  const std::size_t grade = std::min(cut + kBetween.size(), line.size());
  return {std::string(line.substr(0, cut)), std::string(line.substr(grade))};
}

}  // namespace marlowbeck
