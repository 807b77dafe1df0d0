// A whole season typed through the screen: ten teams, everybody against everybody, home and away.

#include <random>

#include "ladder/ladder_league.h"
#include "ladder/plain_ladder.h"

namespace marlowbeck {
namespace {

struct Fixture {
  int round = 0;
  std::string home;
  std::string away;
};

/// The usual round robin: the first team stays, the others go round it. The second half of the
/// season is the first with the sides changed.
std::vector<Fixture> RoundRobin(const std::vector<std::string>& teams) {
  const int count = static_cast<int>(teams.size());
  const auto team = [&](int place) { return teams[static_cast<std::size_t>(place)]; };
  std::vector<Fixture> fixtures;
  for (int round = 0; round < count - 1; ++round) {
    const auto turning = [&](int place) { return team(1 + (round + place) % (count - 1)); };
    fixtures.push_back(
        {round, round % 2 == 0 ? team(0) : turning(0), round % 2 == 0 ? turning(0) : team(0)});
    for (int pair = 1; pair < count / 2; ++pair) {
      fixtures.push_back({round, turning(pair), turning(count - 1 - pair)});
    }
  }
  const std::size_t half = fixtures.size();
  for (std::size_t i = 0; i < half; ++i) {
    const Fixture first = fixtures[i];
    fixtures.push_back({first.round + count - 1, first.away, first.home});
  }
  return fixtures;
}

class LadderSeason : public LadderTest {
 protected:
  static constexpr int kRounds = 18;
  static Date DayOf(int round) { return Date{DateFromCivil({2004, 1, 7})->days + 7 * round}; }

  void SetUp() override {
    Lay(kTeams);
    std::mt19937 chance(2004);
    for (const Fixture& fixture : RoundRobin(kTeams)) {
      LadderRecord match;
      match.HomeTeam = fixture.home;
      match.AwayTeam = fixture.away;
      match.HomeScore = std::uniform_int_distribution<std::int16_t>(0, 11)(chance);
      match.AwayScore = static_cast<std::int16_t>(11 - match.HomeScore);
      // A match in six was broken off.
      if (chance() % 6 == 0) match.AwayScore = static_cast<std::int16_t>(match.AwayScore / 2);
      match.GameDate = DayOf(fixture.round);
      matches_.push_back(match);
    }
  }

  void TypeRound(int round) {
    DoAll({"click cmdChangeGrade", "date Cal " + IsoDate(DayOf(round)), "click cmdGotoResults"});
    for (const LadderRecord& match : matches_) {
      if (match.GameDate != DayOf(round)) continue;
      TypeMatch(Trim(match.HomeTeam), std::to_string(match.HomeScore), Trim(match.AwayTeam),
                std::to_string(match.AwayScore));
      Do("forget");
      if (match.HomeScore + match.AwayScore != 11 || match.HomeScore == match.AwayScore) {
        Do("answer yes");
      }
      Do("click cmdRecord");
      ASSERT_EQ(Count("sound"), 1);
    }
    EXPECT_EQ(Caption("lblHomeAway"), "No Teams to Enter");
  }

  /// The rows of the grid that the plain loops make.
  std::vector<TextList> PlainRows(Date up_to) {
    auto rows = PlainLadder(kTeams, matches_, {}, up_to);
    PlainSort(rows);
    std::vector<TextList> cells;
    for (const PlainRow& row : rows) {
      char percent[32];
      std::snprintf(percent, sizeof percent, "%.2f",
                    row.games_for * 100.0 / (row.against >= 1 ? row.against : 1));
      cells.push_back({row.team, std::to_string(row.played), std::to_string(row.won),
                       std::to_string(row.lost), std::to_string(row.draw),
                       std::to_string(row.games_for), std::to_string(row.against), percent,
                       std::to_string(row.points), std::to_string(row.adjust)});
    }
    return cells;
  }

  const std::vector<std::string> kTeams = {"Anchors",   "Bluebells", "Cricketers", "Drovers",
                                           "Engineers", "Foresters", "Gardeners",  "Hussars",
                                           "Ironmen",   "Jesters"};
  std::vector<LadderRecord> matches_;
};

TEST_F(LadderSeason, TheFixturesLetEverybodyMeetEverybodyHomeAndAway) {
  ASSERT_EQ(matches_.size(), 90U);
  std::map<std::pair<std::string, std::string>, int> met;
  std::map<std::pair<double, std::string>, int> nights;
  for (const LadderRecord& match : matches_) {
    ++met[{match.HomeTeam, match.AwayTeam}];
    ++nights[{match.GameDate.days, match.HomeTeam}];
    ++nights[{match.GameDate.days, match.AwayTeam}];
  }
  EXPECT_EQ(met.size(), 90U);
  EXPECT_EQ(nights.size(), 180U);
}

TEST_F(LadderSeason, TypedMatchByMatchEveryFigureIsThatOfThePlainModel) {
  HOLDS_FOR_MODELS_ALONE("the windows type the first rounds of it in another test");
  Do("click imgLadder");
  Do("click cmdGotoResults");
  // Not in the order of the dates, so that the file has to be sorted.
  for (int round = kRounds - 1; round >= 0; --round) TypeRound((round * 7) % kRounds);
  EXPECT_TRUE(OnFile(matches_)) << "the file is in date order, and each night in order of entry";
  Do("click cmdPL");
  ASSERT_EQ(Lines("lstTableDates").size(), static_cast<std::size_t>(kRounds));
  for (int round = 0; round < kRounds; ++round) {
    SCOPED_TRACE("round " + std::to_string(round));
    Do("pick lstTableDates " + std::to_string(round));
    auto cells = Cells("grdLad");
    cells.erase(cells.begin());
    EXPECT_EQ(cells, PlainRows(DayOf(round)));
    EXPECT_EQ(Cells("grdWk").size(), 5U);
  }
}

TEST_F(LadderSeason, TheFirstRoundsInBothFaces) {
  Do("click imgLadder");
  Do("click cmdGotoResults");
  TypeRound(1);
  TypeRound(0);
  Do("click cmdPL");
  auto cells = Cells("grdLad");
  cells.erase(cells.begin());
  EXPECT_EQ(cells, PlainRows(DayOf(1)));
}

}  // namespace
}  // namespace marlowbeck
