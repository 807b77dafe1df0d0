#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "data/records.h"

namespace marlowbeck {

/// The players of one grade, team by team, as lines for a list. Fed with the records of the player
/// file, each once and in order.
class TeamLists {
 public:
  /// `grade` is trimmed.
  explicit TeamLists(std::string_view grade) : grade_(grade) {}

  /// Throws SubscriptOutOfRange for more players of the grade than a list has places.
  void Add(const PlayerView& player);

  /// For each team in ascending order its name, a rule, its players in file order and an empty
  /// line. Leaves nobody behind.
  [[nodiscard]] std::vector<std::string> TakeLines();

 private:
  struct Hash {
    using is_transparent = void;
    std::size_t operator()(std::string_view team) const {
      return std::hash<std::string_view>()(team);
    }
  };

  std::string grade_;
  std::vector<std::string> names_;    ///< of the players of the grade
  std::vector<std::size_t> team_of_;  ///< each player's, a place in the two below
  std::vector<std::string> teams_;
  std::vector<std::size_t> counts_;  ///< of each team's players
  std::unordered_map<std::string, std::size_t, Hash, std::equal_to<>> places_;
};

}  // namespace marlowbeck
