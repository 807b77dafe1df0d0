#pragma once

#include <string>
#include <vector>

#include "support/club.h"
#include "support/league.h"
#include "support/record_files.h"

namespace marlowbeck {

inline constexpr const char* kPlayerFile = "Winter.qza";

/// The setup screen of a competition in Winter.qza.
class SetupTest : public ClubTest {
 protected:
  void OpenSetup(const std::vector<PlayerRecord>& players) {
    WritePlayers(kPlayerFile, players);
    NameOpenFile(kPlayerFile);
    Do("click imgPlayers");
  }

  void OpenSetupOf(std::string_view player_file) {
    WriteFile(kPlayerFile, player_file);
    NameOpenFile(kPlayerFile);
    Do("click imgPlayers");
  }

  void TypeNames(const std::string& surname, const std::string& first_name) {
    Do("type txtAddSn " + surname);
    Do("type txtAddFn " + first_name);
  }

  /// Fills the entry of the first player, but for its Best of Three boxes.
  void TypeFirstPlayer(const std::string& surname = "Archer") {
    Do("type txtAddSn0 " + surname);
    Do("type txtAddFn0 Jo");
    Do("type txtAddTm0 Rovers");
    Do("type txtAddGrd0 A Grade");
  }

  [[nodiscard]] std::vector<PlayerRecord> Saved() const { return Players(kPlayerFile); }
};

/// A match as the ladder holds it.
inline LadderRecord Match(std::string_view home, std::string_view away, int home_score = 7,
                          int away_score = 4) {
  LadderRecord match;
  match.HomeTeam = home;
  match.AwayTeam = away;
  match.HomeScore = static_cast<std::int16_t>(home_score);
  match.AwayScore = static_cast<std::int16_t>(away_score);
  match.GameDate = March(31);
  return match;
}

/// Two grades of two teams, the way a club has them after its first evening.
inline std::vector<PlayerRecord> TwoGrades() {
  return {Player(1, "Archer", "Jo", "Rovers", "A Grade", 330),
          Player(2, "Baker", "Al", "Rovers", "A Grade", 330),
          Player(3, "Cole", "Di", "Hawks", "A Grade", 330),
          Player(4, "Dale", "Ed", "Bulls", "B Grade", 111)};
}

}  // namespace marlowbeck
