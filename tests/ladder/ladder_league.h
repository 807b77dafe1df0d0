#pragma once

#include <string>
#include <vector>

#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {

inline constexpr const char* kLadderOfA = "Winter_A.qzl";
inline constexpr const char* kRulesOfA = "Winter_A.qzi";
inline constexpr const char* kUsualRules = " 2  0  1  4  11 \r\n";

/// A match on a day of March 2004.
[[nodiscard]] inline LadderRecord MatchOn(int day, std::string_view home, int home_score,
                                          std::string_view away, int away_score) {
  LadderRecord match;
  match.HomeTeam = home;
  match.AwayTeam = away;
  match.HomeScore = static_cast<std::int16_t>(home_score);
  match.AwayScore = static_cast<std::int16_t>(away_score);
  match.GameDate = *DateFromCivil({2004, 3, day});
  return match;
}

[[nodiscard]] inline LadderRecord Adjusted(LadderRecord match, int home, int away) {
  match.HomePenalty = static_cast<std::int16_t>(home);
  match.AwayPenalty = static_cast<std::int16_t>(away);
  return match;
}

/// A player for each team of a grade.
[[nodiscard]] inline std::vector<PlayerRecord> OnePlayerEach(const std::vector<std::string>& teams,
                                                             std::string_view grade = "A") {
  std::vector<PlayerRecord> players;
  for (const std::string& team : teams) {
    const int id = static_cast<int>(players.size()) + 1;
    players.push_back(Player(id, "Player" + std::to_string(id), "Jo", team, grade));
  }
  return players;
}

/// The four teams and six matches of the manual's example: three rounds on 3, 10 and 17 March, with
/// a point taken from Bravo on the last.
inline const std::vector<std::string> kFourTeams = {"Alpha", "Bravo", "Charlie", "Delta"};
[[nodiscard]] inline std::vector<LadderRecord> ThreeRounds() {
  return {
      MatchOn(3, "Alpha", 7, "Bravo", 4),    MatchOn(3, "Charlie", 5, "Delta", 5),
      MatchOn(10, "Bravo", 6, "Charlie", 5), MatchOn(10, "Delta", 8, "Alpha", 3),
      MatchOn(17, "Alpha", 6, "Charlie", 5), Adjusted(MatchOn(17, "Delta", 4, "Bravo", 7), 0, -1)};
}

/// Lays a grade "A" with its rules and its season's title, 17 March 2004 for the work date.
inline void LayGrade(Club& club, const std::vector<PlayerRecord>& players,
                     const std::vector<LadderRecord>& matches = {}) {
  club.WritePlayers("Winter.qza", players);
  club.NameOpenFile("Winter.qza");
  club.WriteFile("WkDate.qz3", "#2004-03-17#\r\n");
  club.WriteFile(kRulesOfA, kUsualRules);
  club.WriteFile("Winter_A.qzs", "\"Winter 2004\"\r\n");
  if (!matches.empty()) club.WriteFile(kLadderOfA, FileOf(matches));
}

/// A club with the ladder open.
class LadderTest : public ClubTest {
 protected:
  void Lay(const std::vector<std::string>& teams, const std::vector<LadderRecord>& matches = {}) {
    LayGrade(*this, OnePlayerEach(teams), matches);
  }
  /// Opens the Scores tab on the work date, or on another day of March.
  void OpenScores(int day = 17, Here here = Here::current()) {
    Do("click imgLadder", here);
    if (day != 17) Do("date Cal 2004-03-" + std::string(day < 10 ? "0" : "") + std::to_string(day));
    Do("click cmdGotoResults", here);
  }
  void OpenLadder(Here here = Here::current()) {
    OpenScores(17, here);
    Do("click cmdPL", here);
  }
  /// Types a match for two teams of the list.
  void TypeMatch(const std::string& home, const std::string& home_score, const std::string& away,
                 const std::string& away_score, Here here = Here::current()) {
    DoAll({"pick lstTeams =" + home, "pick lstTeams =" + away, "type txtHomeScore " + home_score,
           "type txtAwayScore " + away_score},
          here);
  }
  [[nodiscard]] std::vector<LadderRecord> Matches(Here here = Here::current()) const {
    return MatchesIn(File(kLadderOfA, here));
  }
  [[nodiscard]] ::testing::AssertionResult OnFile(const std::vector<LadderRecord>& matches) const {
    return SameMatches(File(kLadderOfA), FileOf(matches));
  }
  /// The error numbers that the last command told.
  [[nodiscard]] std::vector<int> Errors() const {
    std::vector<int> numbers;
    for (const Json& error : EventsNamed("error")) numbers.push_back(error["number"]);
    return numbers;
  }
};

}  // namespace marlowbeck
