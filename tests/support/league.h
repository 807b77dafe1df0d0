#pragma once

#include <initializer_list>
#include <string>
#include <utility>
#include <vector>

#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {

inline constexpr const char* kLeagueFile = "Winter.qza";
inline constexpr const char* kAResults = "Winter_A Grade.qzr";
inline constexpr const char* kALadder = "Winter_A Grade.qzl";
inline constexpr const char* kBResults = "Winter_B Grade.qzr";

/// Three grades. A Grade: Cubs, Hawks (eight players, ids 11 to 18), Lions, Rovers. B Grade: Bees,
/// Crows, Ducks, without any best of three. C Grade: one team alone.
[[nodiscard]] std::vector<PlayerRecord> LeaguePlayers();

/// A saved night; `night` is a day of March 2004, all Wednesdays from 3 to 31 in use.
[[nodiscard]] ResultRecord Night(int id, std::string_view team, std::string_view opposition,
                                 int night = 31);
[[nodiscard]] Date March(int day);

/// Lays the league into a club, with 31 March 2004 for the work date.
void LayLeague(Club& club);

/// Lines that bring a club to the lists of a team.
[[nodiscard]] std::vector<std::string> ToTeam(const std::string& grade, const std::string& team);

using Entries = std::vector<std::pair<std::string, std::string>>;

/// Figures that every check lets pass: 1000 in 50 shots, a high score of 140, 2 centuries, 9 legs.
[[nodiscard]] Entries GoodSheet();

/// The score sheets opened over the league.
class ScoreSheets : public ClubTest {
 protected:
  void SetUp() override { LayLeague(*this); }

  void OpenGrade(const std::string& grade = "A Grade");
  void OpenTeam(const std::string& team, const std::string& grade = "A Grade");
  /// Opens the sheet of a player of Hawks by the line of the list.
  void OpenSheet(const std::string& line = "Hill,  Al");
  void TypeInto(const Entries& entries);
  /// Types a good sheet for a line of the list and saves it.
  void SaveGoodSheet(const std::string& line);

  /// The one box that the last command showed; empty, and a failure, when it was not one.
  [[nodiscard]] std::string TheBox();
  [[nodiscard]] std::vector<ResultRecord> Saved() const { return Results(kAResults); }
};

}  // namespace marlowbeck
