#pragma once

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

  void Add(const PlayerView& player);

  /// For each team in ascending order its name, a rule, its players in file order and an empty
  /// line. Throws SubscriptOutOfRange for more players than a list has places.
  [[nodiscard]] std::vector<std::string> Lines() const;

 private:
  std::string grade_;
  std::vector<std::string> teams_;  ///< of each player
  std::unordered_map<std::string, std::vector<std::string>> players_;
};

}  // namespace marlowbeck
