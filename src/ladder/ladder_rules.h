#pragma once

#include <string>

#include "data/channels.h"
#include "data/session.h"

namespace marlowbeck {

/// The rules of a grade's ladder, as its configuration file holds them.
struct LadderRules {
  Integer WinPoints = 2;
  Integer LossPoints = 0;
  Integer DrawPoints = 1;
  Integer FinalsTeams = 4;  ///< kept and shown, and of no other effect
  Integer GamesPerMatch = 11;
};

/// Reads the five numbers of a configuration file, parted by blanks, commas or line ends. Throws
/// when they are not all there or one is no whole number of 16 bits.
[[nodiscard]] LadderRules ReadLadderRules(Channels& channels, const std::string& path);

/// Writes them as the one line of the file.
void WriteLadderRules(Channels& channels, const std::string& path, const LadderRules& rules);

/// The rules in hand.
[[nodiscard]] LadderRules RulesInHand(const Session& session);
void TakeInHand(Session& session, const LadderRules& rules);

}  // namespace marlowbeck
