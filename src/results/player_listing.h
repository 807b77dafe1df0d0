#pragma once

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "data/channels.h"
#include "data/integer.h"
#include "data/records.h"
#include "data/session.h"
#include "data/table.h"

namespace marlowbeck {

/// What stands between surname and first name in the lines of the score sheet's lists.
inline constexpr std::string_view kSheetNameSeparator = ",  ";

/// Who of a team is still to be entered against an opposition on a date, and who has been. Fed with
/// the records of both files, each once and in order, players first.
class PlayerListing {
 public:
  /// `team`, `grade` and `opposition` are trimmed; `player_count` is that of the player file.
  PlayerListing(std::string_view team, std::string_view grade, std::string_view opposition,
                Date date, int player_count);

  /// Throws Overflow for an id outside 16 bits and SubscriptOutOfRange for the 1001st of a team.
  void AddPlayer(const PlayerView& player);
  /// The side that a result is for plays no part: player, date and opposition say who it is.
  void AddResult(const ResultView& result);

  /// Lines of the players to be entered, in the order of the player file.
  [[nodiscard]] std::vector<std::string> ToEnter() const;
  /// Lines of the players entered, in the order of the player file; one for each of their results.
  [[nodiscard]] std::vector<std::string> Entered() const;

 private:
  std::string team_;
  std::string grade_;
  std::string opposition_;
  Date date_;
  int count_ = 0;
  Table<Integer> ids_;
  Table<std::string> names_;
  std::unordered_map<int, std::vector<int>> places_;  ///< where in the tables an id stands
  std::vector<int> results_;                          ///< how many each listed player has
};

/// The listing of the team, grade and work date in hand, from one reading of each file. Leaves all
/// channels closed.
[[nodiscard]] PlayerListing ReadPlayerListing(Session& session, Channels& channels,
                                              std::string_view opposition);

}  // namespace marlowbeck
