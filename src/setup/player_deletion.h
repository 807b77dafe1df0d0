#pragma once

#include <string>
#include <string_view>

#include "data/channels.h"

namespace marlowbeck {

// What goes with a player. Each works on the file that is open on its channel.

/// How many results in the results file are those of a player.
[[nodiscard]] int CountResultsOf(Channels& channels, int id);
/// Whether there is any.
[[nodiscard]] bool HasResults(Channels& channels, int id);

/// Rewrites the results file without those of a player, and closes all.
void RemoveResultsOf(Channels& channels, int id);
/// Rewrites the player file without a player, and closes all.
void RemovePlayer(Channels& channels, int id);

/// What is asked before a player with so many results goes.
[[nodiscard]] std::string DeletionQuestion(std::string_view name, int results);

}  // namespace marlowbeck
