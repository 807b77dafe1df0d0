#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "data/channels.h"

namespace marlowbeck {

// What the setup screen reads from the open player file. Names are trimmed; unlike the lists of
// the other screens these have no bounds.

/// The distinct grades of all players, ascending by their bytes.
[[nodiscard]] std::vector<std::string> AllGrades(Channels& channels);
/// The distinct teams of all grades, ascending by their bytes.
[[nodiscard]] std::vector<std::string> AllTeams(Channels& channels);

/// "Surname, First name" of the players of a team in a grade, in the order of the records.
[[nodiscard]] std::vector<std::string> PlayersOf(Channels& channels, std::string_view team,
                                                 std::string_view grade);

/// A player found by the line of the list.
struct ListedPlayer {
  Integer record;
  Integer id;
  std::string surname;
  std::string first_name;
};

/// Where a line of the list stands: among the players of a team in a grade.
struct ListedLine {
  std::string_view team;
  std::string_view grade;
  std::string_view line;
};

// Both throw Overflow where a player is met whose id is above 32767.
//
// KEPT: an id is handed over as a number of 16 bits, so that players above 32767 can be neither
// edited nor deleted; a repair would hand over 32 bits.

/// The player to be edited.
///
/// KEPT: of players with the same line the last one is edited; a repair would ask which is meant.
[[nodiscard]] std::optional<ListedPlayer> LastListed(Channels& channels, const ListedLine& at);
/// The player to be deleted.
///
/// KEPT: of players with the same line the first one is deleted; a repair would ask which is meant.
[[nodiscard]] std::optional<ListedPlayer> FirstListed(Channels& channels, const ListedLine& at);

/// Whether a player has this grade, in any case.
[[nodiscard]] bool GradeInUse(Channels& channels, std::string_view grade);
/// Whether a player of any grade has this team, in any case.
[[nodiscard]] bool TeamInUse(Channels& channels, std::string_view team);

/// The Best of Three code of a grade's first player; nothing while the grade has none. Throws
/// Overflow for a number that no 16 bits hold.
[[nodiscard]] std::optional<Integer> BestOfThreeOf(Channels& channels, std::string_view grade);

/// What a new player takes over from the records before it.
struct RecordsBefore {
  std::int32_t highest_id = 0;
  Date last_reserved1;
};
[[nodiscard]] RecordsBefore LookThroughPlayers(Channels& channels);

}  // namespace marlowbeck
