#pragma once

#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

#include "data/channels.h"
#include "data/session.h"
#include "season/annual.h"

namespace marlowbeck {

/// All players of the competition and all results of a grade, read once, to be asked player by
/// player.
class SeasonResults {
 public:
  /// Reads both files; leaves all channels closed.
  SeasonResults(Session& session, Channels& channels);

  [[nodiscard]] bool HasAny(std::int32_t id) const { return places_.contains(id); }
  /// First name and surname of the first player with that id, of whatever grade; empty for none.
  [[nodiscard]] std::string NameOf(std::int32_t id) const;
  /// Throws SubscriptOutOfRange past 5000 games.
  [[nodiscard]] AnnualReport ReportOf(std::int32_t id) const;

  struct Listed {
    std::int32_t id = 0;
    std::string line;  ///< "Surname,  First name"
  };
  /// The players of a team and grade who have any result, in file order. Names are trimmed.
  [[nodiscard]] std::vector<Listed> PlayersOf(std::string_view grade, std::string_view team) const;

 private:
  struct Somebody {
    std::int32_t id = 0;
    std::string first_name;
    std::string surname;
    std::string team;
    std::string grade;
  };

  std::vector<Somebody> players_;
  std::vector<std::byte> records_;
  std::unordered_map<std::int32_t, std::vector<std::size_t>>
      places_;  ///< where an id's results lie
};

}  // namespace marlowbeck
