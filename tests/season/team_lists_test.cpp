#include "season/team_lists.h"

#include <random>
#include <set>

#include <gtest/gtest.h>

#include "support/record_files.h"

namespace marlowbeck {
namespace {

std::vector<std::string> LinesOf(const std::vector<PlayerRecord>& players, std::string_view grade) {
  TeamLists lists(grade);
  for (const PlayerRecord& player : players) {
    const PlayerBytes bytes = Encode(player);
    lists.Add(PlayerView(bytes));
  }
  return lists.TakeLines();
}

/// The same by a loop over all players for each team.
std::vector<std::string> PlainLines(const std::vector<PlayerRecord>& players,
                                    const std::string& grade) {
  std::set<std::string> teams;
  for (const PlayerRecord& player : players) {
    if (player.Grade == grade) teams.insert(player.Team);
  }
  std::vector<std::string> lines;
  for (const std::string& team : teams) {
    lines.push_back(team);
    lines.emplace_back("----------------------------------------");
    for (const PlayerRecord& player : players) {
      if (player.Grade != grade || player.Team != team) continue;
      lines.push_back(player.Surname + ", " + player.FirstName);
    }
    lines.emplace_back();
  }
  return lines;
}

TEST(TeamLists, EqualThePlainLoopsForAnyFile) {
  std::mt19937 chance(20040331);
  const auto pick = [&](int count) {
    return std::uniform_int_distribution<int>(0, count - 1)(chance);
  };
  for (int round = 0; round < 500; ++round) {
    std::vector<PlayerRecord> players;
    for (int count = pick(60), id = 1; id <= count; ++id) {
      players.push_back(Player(id, "S" + std::to_string(pick(9)), "F" + std::to_string(id),
                               "Team " + std::to_string(pick(7)),
                               "Grade " + std::to_string(pick(3))));
    }
    EXPECT_EQ(LinesOf(players, "Grade 1"), PlainLines(players, "Grade 1")) << "round " << round;
  }
}

TEST(TeamLists, WithoutPlayersOfTheGradeThereIsNoLine) {
  EXPECT_TRUE(LinesOf({Player(1, "A", "B", "Rovers", "A Grade")}, "B Grade").empty());
}

}  // namespace
}  // namespace marlowbeck
