#include "results/opposition_finder.h"

#include <random>

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

using Names = std::vector<std::string>;

struct Answer {
  Names free;
  std::optional<std::string> met;
  int others = 0;

  friend bool operator==(const Answer&, const Answer&) = default;
};

constexpr Date kNight{38077};

ResultRecord Match(std::string_view team, std::string_view opposition, Date date = kNight) {
  ResultRecord result;
  result.ID = 1;
  result.Team = team;
  result.Opposition = opposition;
  result.GameDate = date;
  return result;
}

Answer Found(const Names& teams, const std::string& team,
             const std::vector<ResultRecord>& results) {
  OppositionFinder finder(teams, team, kNight);
  for (const ResultRecord& result : results) {
    const ResultBytes bytes = Encode(result);
    finder.AddResult(ResultView(bytes));
  }
  return {finder.Free(), finder.Met(), finder.OtherTeams()};
}

/// The same by the plain loops: the whole file looked through for every other team, then once more
/// for the team in hand.
Answer FoundPlainly(const Names& teams, const std::string& team,
                    const std::vector<ResultRecord>& results) {
  Names others;
  for (const std::string& other : teams) {
    if (other != team) others.push_back(Trim(other));
  }
  Answer answer;
  answer.others = static_cast<int>(others.size());
  for (std::string& other : others) {
    for (const ResultRecord& result : results) {
      if (result.GameDate != kNight) continue;
      if (Trim(result.Team) == other || Trim(result.Opposition) == other) {
        other = "NO";
        break;
      }
    }
  }
  for (const std::string& other : others) {
    if (other != "NO") answer.free.push_back(other);
  }
  for (const ResultRecord& result : results) {
    if (result.GameDate != kNight) continue;
    if (Trim(result.Team) == team) {
      answer.met = Trim(result.Opposition);
      break;
    }
    if (Trim(result.Opposition) == team) {
      answer.met = Trim(result.Team);
      break;
    }
  }
  return answer;
}

const Names kTeams = {"Cubs", "Hawks", "Lions", "Rovers"};

TEST(OppositionFinder, OnAnEmptyDateEveryOtherTeamIsFree) {
  const Answer answer = Found(kTeams, "Hawks", {Match("Hawks", "Lions", Date{38070})});
  EXPECT_EQ(answer.free, (Names{"Cubs", "Lions", "Rovers"}));
  EXPECT_FALSE(answer.met);
  EXPECT_EQ(answer.others, 3);
}

TEST(OppositionFinder, ATeamThatAResultNamesOnEitherSideIsNotFree) {
  const Answer answer = Found(kTeams, "Hawks", {Match("Cubs", "Rovers")});
  EXPECT_EQ(answer.free, Names{"Lions"});
  EXPECT_FALSE(answer.met);
}

TEST(OppositionFinder, TheSideMetAlreadyIsToldFromEitherSide) {
  EXPECT_EQ(Found(kTeams, "Hawks", {Match("Hawks", "Lions")}).met, "Lions");
  EXPECT_EQ(Found(kTeams, "Hawks", {Match("Lions", "Hawks")}).met, "Lions");
}

TEST(OppositionFinder, TheFirstResultThatNamesTheTeamWins) {
  const std::vector<ResultRecord> results = {Match("Cubs", "Hawks"), Match("Hawks", "Lions")};
  EXPECT_EQ(Found(kTeams, "Hawks", results).met, "Cubs");
}

TEST(OppositionFinder, ABlankOppositionIsMetToo) {
  EXPECT_EQ(Found(kTeams, "Hawks", {Match("Hawks", "")}).met, "");
}

TEST(OppositionFinder, ATeamNamedNoIsNeverFree) {
  const Answer answer = Found({"Hawks", "Lions", "NO", "No"}, "Hawks", {});
  EXPECT_EQ(answer.free, (Names{"Lions", "No"}));
  EXPECT_EQ(answer.others, 3);
}

TEST(OppositionFinder, TwoHundredOtherTeamsAreTheMost) {
  Names teams = {"Team in hand"};
  for (int i = 1; i <= 200; ++i) teams.push_back("Team " + std::to_string(i));
  EXPECT_EQ(Found(teams, "Team in hand", {}).others, 200);
  teams.push_back("Team 201");
  try {
    (void)Found(teams, "Team in hand", {});
    FAIL() << "201 other teams were taken";
  } catch (const RunTimeError& error) {
    EXPECT_EQ(error.Number(), 9);
  }
}

TEST(OppositionFinder, AnswersWhatThePlainLoopsAnswer) {
  const unsigned seed = 20040407;
  std::mt19937 chance(seed);
  const auto any = [&](std::size_t last) {
    return std::uniform_int_distribution<std::size_t>(0, last)(chance);
  };
  const Names pool = {"", "Cubs", "Hawks", "Lions", "NO", "Rovers", "hawks", "Gone"};
  for (int round = 0; round < 4000; ++round) {
    const Names teams(pool.begin(), pool.begin() + static_cast<std::ptrdiff_t>(2 + any(5)));
    std::vector<ResultRecord> results;
    for (std::size_t i = any(6); i > 0; --i) {
      const Date date = any(3) == 0 ? Date{38070} : kNight;
      results.push_back(Match(pool[any(7)], pool[any(7)], date));
    }
    const std::string& team = teams[any(teams.size() - 1)];
    ASSERT_EQ(Found(teams, team, results), FoundPlainly(teams, team, results))
        << "round " << round << ", seed " << seed;
  }
}

bool Conflicts(const ResultRecord& result) {
  const ResultBytes bytes = Encode(result);
  return IsConflict(ResultView(bytes), kNight, "Hawks", "Lions");
}

TEST(Conflict, IsTheTeamAgainstAnybodyElseOnTheDate) {
  EXPECT_TRUE(Conflicts(Match("Hawks", "Cubs")));
  EXPECT_TRUE(Conflicts(Match("Cubs", "Hawks")));
  EXPECT_FALSE(Conflicts(Match("Hawks", "Lions")));
  EXPECT_FALSE(Conflicts(Match("Lions", "Hawks")));
  EXPECT_FALSE(Conflicts(Match("Cubs", "Lions")));
  EXPECT_FALSE(Conflicts(Match("Hawks", "Cubs", Date{38070})));
}

}  // namespace
}  // namespace marlowbeck
