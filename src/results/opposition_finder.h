#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <unordered_set>
#include <vector>

#include "data/records.h"

namespace marlowbeck {

/// Whom a team can play on a date: one team meets one opposition. Fed with the results of the
/// grade, each once and in order.
class OppositionFinder {
 public:
  /// `teams` are all teams of the grade, `team` is the one in hand, trimmed. Throws
  /// SubscriptOutOfRange for more than 200 other teams.
  OppositionFinder(const std::vector<std::string>& teams, std::string_view team, Date date);

  void AddResult(const ResultView& result);

  /// How many other teams the grade has.
  [[nodiscard]] int OtherTeams() const { return static_cast<int>(others_.size()); }
  /// The other teams that no result of the date names, in the order of the team list.
  [[nodiscard]] std::vector<std::string> Free() const;
  /// The side that the team in hand has met already, by the first result of the date that names
  /// it; nothing when there is none.
  [[nodiscard]] const std::optional<std::string>& Met() const { return met_; }

 private:
  std::string team_;
  Date date_;
  std::vector<std::string> others_;
  std::unordered_set<std::string> played_;
  std::optional<std::string> met_;
};

/// True when a result of the date has `team` against anybody but `opposition`, on either side.
[[nodiscard]] bool IsConflict(const ResultView& result, Date date, std::string_view team,
                              std::string_view opposition);

}  // namespace marlowbeck
