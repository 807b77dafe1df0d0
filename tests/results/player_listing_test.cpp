#include "results/player_listing.h"

#include <optional>
#include <random>

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

struct Lists {
  std::vector<std::string> to_enter;
  std::vector<std::string> entered;
  int error = 0;

  friend bool operator==(const Lists&, const Lists&) = default;
};

struct Question {
  std::string team;
  std::string grade;
  std::string opposition;
  Date date;
};

PlayerRecord Player(int id, std::string_view surname, std::string_view team = "Rovers") {
  PlayerRecord player;
  player.ID = id;
  player.Surname = surname;
  player.FirstName = "Jo";
  player.Team = team;
  player.Grade = "A Grade";
  return player;
}

ResultRecord Result(int id, std::string_view opposition = "Hawks", double day = 38077) {
  ResultRecord result;
  result.ID = id;
  result.Team = "Rovers";
  result.Opposition = opposition;
  result.GameDate = Date{day};
  return result;
}

const Question kRoversAgainstHawks = {"Rovers", "A Grade", "Hawks", Date{38077}};

Lists Listed(const std::vector<PlayerRecord>& players, const std::vector<ResultRecord>& results,
             const Question& question = kRoversAgainstHawks) {
  try {
    PlayerListing listing(question.team, question.grade, question.opposition, question.date,
                          static_cast<int>(players.size()));
    for (const PlayerRecord& player : players) {
      const PlayerBytes bytes = Encode(player);
      listing.AddPlayer(PlayerView(bytes));
    }
    for (const ResultRecord& result : results) {
      const ResultBytes bytes = Encode(result);
      listing.AddResult(ResultView(bytes));
    }
    return {listing.ToEnter(), listing.Entered(), 0};
  } catch (const RunTimeError& error) {
    return {{}, {}, error.Number()};
  }
}

/// The same by the plain loops: every result looked at for every player of the team.
Lists ListedPlainly(const std::vector<PlayerRecord>& players,
                    const std::vector<ResultRecord>& results, const Question& question) {
  std::vector<int> ids;
  std::vector<std::string> names;
  Lists lists;
  for (const PlayerRecord& player : players) {
    if (Trim(player.Team) != question.team || Trim(player.Grade) != question.grade) continue;
    if (player.ID < -32768 || player.ID > 32767) return {{}, {}, 6};
    ids.push_back(player.ID);
    names.push_back(Trim(player.Surname) + ",  " + Trim(player.FirstName));
    if (names.size() > 1000) return {{}, {}, 9};
    lists.to_enter.push_back(names.back());
  }
  for (std::size_t i = 0; i < ids.size(); ++i) {
    for (const ResultRecord& result : results) {
      if (result.ID != ids[i] || result.GameDate != question.date) continue;
      if (Trim(result.Opposition) != question.opposition) continue;
      lists.entered.push_back(names[i]);
      for (auto line = lists.to_enter.begin(); line != lists.to_enter.end(); ++line) {
        if (*line != names[i]) continue;
        lists.to_enter.erase(line);
        break;
      }
    }
  }
  return lists;
}

TEST(PlayerListing, ListsATeamInTheOrderOfTheFile) {
  const Lists lists =
      Listed({Player(3, "Young"), Player(1, "Other", "Hawks"), Player(2, "Archer")}, {});
  EXPECT_EQ(lists.to_enter, (std::vector<std::string>{"Young,  Jo", "Archer,  Jo"}));
  EXPECT_TRUE(lists.entered.empty());
}

TEST(PlayerListing, MovesAPlayerWithAResultToTheOtherList) {
  const Lists lists = Listed({Player(1, "Archer"), Player(2, "Young")}, {Result(1)});
  EXPECT_EQ(lists.to_enter, std::vector<std::string>{"Young,  Jo"});
  EXPECT_EQ(lists.entered, std::vector<std::string>{"Archer,  Jo"});
}

TEST(PlayerListing, PassesOverResultsOfAnotherDateOrOpposition) {
  const Lists lists =
      Listed({Player(1, "Archer")}, {Result(1, "Hawks", 38084), Result(1, "Lions")});
  EXPECT_EQ(lists.to_enter, std::vector<std::string>{"Archer,  Jo"});
  EXPECT_TRUE(lists.entered.empty());
}

TEST(PlayerListing, APlayerWithTwoResultsStandsTwiceAmongTheEntered) {
  const Lists lists = Listed({Player(1, "Archer")}, {Result(1), Result(1)});
  EXPECT_TRUE(lists.to_enter.empty());
  EXPECT_EQ(lists.entered, (std::vector<std::string>{"Archer,  Jo", "Archer,  Jo"}));
}

TEST(PlayerListing, OfTwoPlayersOfOneNameOneIsLeftAfterOneResult) {
  const Lists lists = Listed({Player(1, "Archer"), Player(2, "Archer")}, {Result(2)});
  EXPECT_EQ(lists.to_enter, std::vector<std::string>{"Archer,  Jo"});
  EXPECT_EQ(lists.entered, std::vector<std::string>{"Archer,  Jo"});
}

TEST(PlayerListing, AnIdBeyondSixteenBitsIsAnOverflow) {
  EXPECT_EQ(Listed({Player(32767, "Archer")}, {}).error, 0);
  EXPECT_EQ(Listed({Player(32768, "Archer")}, {}).error, 6);
  EXPECT_EQ(Listed({Player(32768, "Archer", "Hawks")}, {}).error, 0);
}

TEST(PlayerListing, TheThousandAndFirstPlayerOfATeamIsOutOfBounds) {
  std::vector<PlayerRecord> players;
  for (int id = 1; id <= 1000; ++id) players.push_back(Player(id, "P" + std::to_string(id)));
  EXPECT_EQ(Listed(players, {}).error, 0);
  players.push_back(Player(1001, "P1001"));
  EXPECT_EQ(Listed(players, {}).error, 9);
}

TEST(PlayerListing, AnswersWhatThePlainLoopsAnswer) {
  const unsigned seed = 20040331;
  std::mt19937 chance(seed);
  const auto any = [&](int last) { return std::uniform_int_distribution<int>(0, last)(chance); };
  const std::vector<std::string> teams = {"Rovers", "rovers", "", "Hawks", "Lions"};
  for (int round = 0; round < 4000; ++round) {
    std::vector<PlayerRecord> players;
    for (int i = any(14); i > 0; --i) {
      PlayerRecord player = Player(any(11) - 1, std::string(1, static_cast<char>('A' + any(4))));
      if (any(60) == 0) player.ID += 65536;  // the same number in 16 bits that wrap
      if (any(3) == 0) player.Team = teams[static_cast<std::size_t>(any(4))];
      if (any(5) == 0) player.Grade = any(1) == 0 ? "B Grade" : "a grade";
      players.push_back(player);
    }
    std::vector<ResultRecord> results;
    for (int i = any(25); i > 0; --i) {
      ResultRecord result = Result(any(11) - 1, teams[static_cast<std::size_t>(any(4))]);
      if (any(60) == 0) result.ID += 65536;
      if (any(4) == 0) result.GameDate = Date{any(1) == 0 ? 38084.0 : 38077.5};
      results.push_back(result);
    }
    const Question question = {teams[static_cast<std::size_t>(any(2))], "A Grade",
                               teams[static_cast<std::size_t>(any(4))], Date{38077}};
    ASSERT_EQ(Listed(players, results, question), ListedPlainly(players, results, question))
        << "round " << round << ", seed " << seed;
  }
}

}  // namespace
}  // namespace marlowbeck
