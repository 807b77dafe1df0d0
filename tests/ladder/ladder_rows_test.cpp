#include "ladder/ladder_rows.h"

#include <random>

#include <gmock/gmock.h>

#include "data/runtime_error.h"
#include "ladder/ladder_league.h"
#include "ladder/plain_ladder.h"

namespace marlowbeck {
namespace {

using Matches = std::vector<LadderRecord>;
using Names = std::vector<std::string>;

Date March(int day) { return *DateFromCivil({2004, 3, day}); }

LadderRows Tallied(const Names& teams, const Matches& matches, const LadderRules& rules = {},
                   Date up_to = March(31)) {
  LadderTally tally(teams, rules, up_to);
  for (const LadderRecord& match : matches) tally.Add(LadderView(Encode(match)));
  return tally.Rows();
}

LadderRows Sorted(LadderRows rows) {
  SortLadder(rows);
  return rows;
}

Names TeamsOf(const LadderRows& rows) {
  Names teams;
  for (const LadderRow& row : rows) teams.push_back(row.Team);
  return teams;
}

int ErrorOf(const std::function<void()>& work) {
  try {
    work();
  } catch (const RunTimeError& error) {
    return error.Number();
  }
  return 0;
}

TEST(LadderRows, TheWorkedExample) {
  const std::vector<PlainRow> expected = {{"Alpha", 3, 2, 1, 0, 16, 17, 4, 94, 0},
                                          {"Bravo", 3, 2, 1, 0, 17, 16, 3, 106, -1},
                                          {"Charlie", 3, 0, 2, 1, 15, 17, 1, 88, 0},
                                          {"Delta", 3, 1, 1, 1, 17, 15, 3, 113, 0}};
  const LadderRows rows = Tallied(kFourTeams, ThreeRounds());
  EXPECT_EQ(PlainOf(rows), expected);
  EXPECT_EQ(TeamsOf(Sorted(rows)), (Names{"Alpha", "Delta", "Bravo", "Charlie"}));
}

TEST(LadderRows, TheWorkedExampleUpToTheSecondDate) {
  const std::vector<PlainRow> expected = {{"Alpha", 2, 1, 1, 0, 10, 12, 2, 83, 0},
                                          {"Bravo", 2, 1, 1, 0, 10, 12, 2, 83, 0},
                                          {"Charlie", 2, 0, 1, 1, 10, 11, 1, 91, 0},
                                          {"Delta", 2, 1, 0, 1, 13, 8, 3, 162, 0}};
  EXPECT_EQ(PlainOf(Tallied(kFourTeams, ThreeRounds(), {}, March(10))), expected);
}

TEST(LadderRows, ATeamWithoutAMatchKeepsZeros) {
  EXPECT_EQ(PlainOf(Tallied({"Alpha", "Idle"}, {MatchOn(3, "Alpha", 6, "Gone", 5)}))[1],
            (PlainRow{"Idle"}));
}

TEST(LadderRows, WithNothingAgainstItsPercentIsForAHundredfold) {
  const LadderRows rows = Tallied({"Alpha"}, {MatchOn(3, "Alpha", 6, "Gone", 0)});
  EXPECT_EQ(rows[0].Percent, 600);
  EXPECT_EQ(PercentText(rows[0].For, rows[0].Against), "600.00");
}

TEST(LadderRows, TeamsNobodyKnowsArePassedOver) {
  EXPECT_EQ(PlainOf(Tallied({"Alpha"}, {MatchOn(3, "Gone", 6, "Lost", 5)})),
            (std::vector<PlainRow>{{"Alpha"}}));
}

TEST(LadderRows, ABlankTeamIsNobodySoThatNoByeIsItsMatch) {
  const auto rows =
      PlainOf(Tallied({"", "Alpha"}, {MatchOn(3, "Alpha", 0, "", 0), MatchOn(3, "", 1, "", 0)}));
  EXPECT_EQ(rows[0], (PlainRow{""}));
  EXPECT_EQ(rows[1], (PlainRow{"Alpha", 1, 0, 0, 1, 0, 0, 1, 0, 0}));
}

TEST(LadderRows, NamesAreComparedTrimmedAndByCase) {
  const auto rows = PlainOf(
      Tallied({"Alpha", " ALPHA "}, {MatchOn(3, "  Alpha ", 6, "ALPHA", 5),
                                     MatchOn(3, " ALPHA", 4, std::string(20, ' ') + "Alpha", 7)}));
  EXPECT_EQ(rows[0], (PlainRow{"Alpha", 2, 2, 0, 0, 13, 9, 4, 144, 0}));
  EXPECT_EQ(rows[1], (PlainRow{"ALPHA", 2, 0, 2, 0, 9, 13, 0, 69, 0}));
}

TEST(LadderRows, ATeamAgainstItselfCountsForBothSides) {
  EXPECT_EQ(PlainOf(Tallied({"Alpha"}, {Adjusted(MatchOn(3, "Alpha", 6, "Alpha", 5), 1, 2)}))[0],
            (PlainRow{"Alpha", 2, 1, 1, 0, 11, 11, 5, 100, 3}));
}

TEST(LadderRows, HomeAndAwayPenaltyOfOneRecordAreSeparateValues) {
  const auto rows =
      Tallied({"Alpha", "Bravo"}, {Adjusted(MatchOn(3, "Alpha", 6, "Bravo", 5), 3, -2)});
  EXPECT_EQ(rows[0].Adjust, 3);
  EXPECT_EQ(rows[0].Points, 5);
  EXPECT_EQ(rows[1].Adjust, -2);
  EXPECT_EQ(rows[1].Points, -2);
}

TEST(LadderRows, PointsBelowZeroSortBelowZero) {
  const auto rows =
      Tallied({"Alpha", "Bravo", "Charlie"}, {Adjusted(MatchOn(3, "Alpha", 6, "Bravo", 5), -9, 0)});
  EXPECT_EQ(TeamsOf(Sorted(rows)), (Names{"Bravo", "Charlie", "Alpha"}));
  EXPECT_EQ(rows[0].Points, -7);
}

TEST(LadderRows, OtherRulesHoldForAllMatches) {
  LadderRules rules;
  rules.WinPoints = 4;
  rules.LossPoints = 1;
  rules.DrawPoints = 2;
  const auto rows = Tallied(kFourTeams, ThreeRounds(), rules);
  EXPECT_EQ(rows[0].Points, 2 * 4 + 1);
  EXPECT_EQ(rows[2].Points, 2 * 1 + 2);
}

TEST(LadderRows, HalvesOfAPercentGoToTheEvenNumber) {
  // 7 x 100 / 8 = 87.5 and 173 x 100 / 200 = 86.5.
  EXPECT_EQ(Tallied({"Alpha"}, {MatchOn(3, "Alpha", 7, "Gone", 8)})[0].Percent, 88);
  EXPECT_EQ(Tallied({"Alpha"}, {MatchOn(3, "Alpha", 173, "Gone", 200)})[0].Percent, 86);
}

TEST(LadderRows, KeptTheSortKeyIsTheWholeNumberSoThatCloseTeamsTie) {
  // 94.4 before 93.6 in the table, and both 94: the order of the passes stands.
  const LadderRows first = Tallied({"Alpha", "Bravo"}, {MatchOn(3, "Alpha", 44, "Gone", 47),
                                                        MatchOn(3, "Bravo", 17, "Gone", 18)});
  EXPECT_EQ(first[0].Percent, 94);
  EXPECT_EQ(first[1].Percent, 94);
  EXPECT_LT(PercentOf(44, 47), PercentOf(17, 18));
  EXPECT_EQ(TeamsOf(Sorted(first)), (Names{"Alpha", "Bravo"}));
}

TEST(LadderRows, KeptAHundredfoldOfForOverflowsAbove327) {
  EXPECT_EQ(Tallied({"Alpha"}, {MatchOn(3, "Alpha", 327, "Gone", 1)})[0].Percent, 32700);
  EXPECT_EQ(ErrorOf([] { (void)Tallied({"Alpha"}, {MatchOn(3, "Alpha", 328, "Gone", 1)}); }), 6);
  EXPECT_EQ(ErrorOf([] { (void)Tallied({"Alpha"}, {MatchOn(3, "Alpha", -328, "Gone", 1)}); }), 6);
}

TEST(LadderRows, AnOverflowOnTheWayCountsThoughTheEndWouldFit) {
  const Matches up_and_down = {MatchOn(3, "Alpha", 328, "Gone", 1),
                               MatchOn(3, "Alpha", -300, "Gone", 1)};
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, up_and_down); }), 6);
}

TEST(LadderRows, EveryFigureOverflowsAtSixteenBits) {
  const Matches penalties = {Adjusted(MatchOn(3, "Alpha", 1, "Gone", 1), 32767, 0),
                             Adjusted(MatchOn(3, "Alpha", 1, "Gone", 1), 1, 0)};
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, penalties); }), 6);
  const Matches against = {MatchOn(3, "Alpha", 1, "Gone", 32767),
                           MatchOn(3, "Alpha", 1, "Gone", 1)};
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, against); }), 6);
  LadderRules rich;
  rich.WinPoints = 32767;
  const Matches wins(2, MatchOn(3, "Alpha", 1, "Gone", 0));
  EXPECT_EQ(Tallied({"Alpha"}, {wins[0]}, rich)[0].Points, 32767);
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, wins, rich); }), 6);
}

TEST(LadderRows, AFigureThatLeavesSixteenBitsOnTheWayIsAnOverflowThoughItComesBack) {
  const auto points = [](int given) {
    return Adjusted(MatchOn(3, "Alpha", 1, "Gone", 0), given, 0);
  };
  const auto games = [](int own, int other) { return MatchOn(3, "Alpha", own, "Gone", other); };
  const std::vector<Matches> leave = {{games(328, 1), games(-10, 1)},
                                      {games(-328, 1), games(10, 1)},
                                      {games(0, 20000), games(0, 20000), games(0, -20000)},
                                      {games(0, -20000), games(0, -20000), games(0, 20000)},
                                      {points(30000), points(30000), points(-30000)},
                                      {points(-30000), points(-30000), points(30000)}};
  for (std::size_t i = 0; i < leave.size(); ++i) {
    SCOPED_TRACE(i);
    EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, leave[i]); }), 6);
    EXPECT_THROW((void)PlainLadder({"Alpha"}, leave[i], {}, March(31)), PlainOverflow);
  }
  const Matches stay = {games(327, 1), games(-654, 32000), games(0, 766), points(32763)};
  EXPECT_EQ(PlainOf(Tallied({"Alpha"}, stay)), PlainLadder({"Alpha"}, stay, {}, March(31)));
}

TEST(LadderRows, PointsThatLeaveSixteenBitsOnTheWayAreAnOverflowThoughTheyComeBack) {
  LadderRules rules;
  rules.WinPoints = 10000;
  const LadderRecord win = MatchOn(3, "Alpha", 1, "Gone", 0);
  const LadderRecord loss = MatchOn(3, "Alpha", 0, "Gone", 1);
  const Matches before = {win, win, win, Adjusted(loss, 2768, 0), Adjusted(loss, -2768, 0)};
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, before, rules); }), 6);
  const Matches within = {win, win, win, Adjusted(loss, 2767, 0), Adjusted(loss, -2767, 0)};
  EXPECT_EQ(Tallied({"Alpha"}, within, rules)[0].Points, 30000);
}

TEST(LadderRows, WhateverThePointsAreForTheyAreLookedAtAfterEachMatch) {
  const std::vector<std::pair<LadderRecord, Integer LadderRules::*>> kinds = {
      {MatchOn(3, "Alpha", 1, "Gone", 0), &LadderRules::WinPoints},
      {MatchOn(3, "Alpha", 0, "Gone", 1), &LadderRules::LossPoints},
      {MatchOn(3, "Alpha", 1, "Gone", 1), &LadderRules::DrawPoints}};
  for (std::size_t i = 0; i < kinds.size(); ++i) {
    SCOPED_TRACE(i);
    LadderRules rules;
    rules.WinPoints = rules.LossPoints = rules.DrawPoints = 0;
    rules.*kinds[i].second = -30000;
    const LadderRecord& other = kinds[(i + 1) % kinds.size()].first;
    const Matches beyond = {Adjusted(kinds[i].first, -2769, 0), Adjusted(other, 2769, 0)};
    EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, beyond, rules); }), 6);
    const Matches within = {Adjusted(kinds[i].first, -2768, 0), Adjusted(other, 2768, 0)};
    EXPECT_EQ(Tallied({"Alpha"}, within, rules)[0].Points, -30000);
  }
}

TEST(LadderRows, AdjustmentsThatLeaveSixteenBitsAreAnOverflowThoughThePointsDoNot) {
  LadderRules rules;
  rules.LossPoints = -10000;
  const LadderRecord loss = MatchOn(3, "Alpha", 0, "Gone", 1);
  // 32768 given in all, of which 10000 are lost and more will be taken.
  const Matches beyond = {Adjusted(loss, 20000, 0), Adjusted(loss, 12768, 0),
                          Adjusted(loss, -20000, 0)};
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, beyond, rules); }), 6);
  const Matches within = {Adjusted(loss, 20000, 0), Adjusted(loss, 12767, 0),
                          Adjusted(loss, -20000, 0)};
  EXPECT_EQ(Tallied({"Alpha"}, within, rules)[0].Points, 12767 - 30000);
}

TEST(LadderRows, MoreMatchesThanSixteenBitsCountAreAnOverflow) {
  // Against itself a team plays twice. Points for nothing, so that they stay at 0.
  LadderRules rules;
  rules.WinPoints = rules.LossPoints = rules.DrawPoints = 0;
  Matches matches(16384, MatchOn(3, "Alpha", 0, "Alpha", 0));
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, matches, rules); }), 6);
  matches.back().AwayTeam = "Gone";
  EXPECT_EQ(Tallied({"Alpha"}, matches, rules)[0].Played, 32767);
}

TEST(LadderRows, PointsForLossesAndDrawsOverflowAsThoseForWinsDo) {
  LadderRules rules;
  rules.WinPoints = 0;
  rules.LossPoints = -20000;
  rules.DrawPoints = 20000;
  const Matches losses(2, MatchOn(3, "Alpha", 0, "Gone", 1));
  const Matches draws(2, MatchOn(3, "Alpha", 1, "Gone", 1));
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, losses, rules); }), 6);
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, draws, rules); }), 6);
  // Each of the two is too much by itself, though together they are nothing.
  Matches both = losses;
  both.insert(both.end(), draws.begin(), draws.end());
  EXPECT_EQ(ErrorOf([&] { (void)Tallied({"Alpha"}, both, rules); }), 6);
  EXPECT_EQ(Tallied({"Alpha"}, {losses[0], draws[0]}, rules)[0].Points, 0);
}

TEST(LadderRows, AnOverflowAfterTheDateOrOfATeamNobodyKnowsIsNone) {
  const Matches matches = {MatchOn(4, "Alpha", 400, "Gone", 1), MatchOn(3, "Gone", 400, "Lost", 1)};
  EXPECT_EQ(Tallied({"Alpha"}, matches, {}, March(3))[0].Played, 0);
}

TEST(LadderRows, ADateThatIsNoNumberCountsNever) {
  LadderRecord match = MatchOn(3, "Alpha", 6, "Bravo", 5);
  match.GameDate.days = std::nan("");
  EXPECT_EQ(Tallied({"Alpha"}, {match})[0].Played, 0);
}

TEST(LadderRows, PercentTextHasTwoPlacesWithHalvesAwayFromZero) {
  EXPECT_EQ(PercentText(0, 0), "0.00");
  EXPECT_EQ(PercentText(16, 17), "94.12");
  EXPECT_EQ(PercentText(17, 15), "113.33");
  EXPECT_EQ(PercentText(97, 800), "12.13");    // 12.125
  EXPECT_EQ(PercentText(99, 800), "12.38");    // 12.375
  EXPECT_EQ(PercentText(201, 20000), "1.01");  // 1.005
  EXPECT_EQ(PercentText(1, 32767), "0.00");
  EXPECT_EQ(PercentText(-1, 8), "-12.50");
  EXPECT_EQ(PercentText(-1, 32767), "0.00");
  EXPECT_EQ(PercentText(3, -5), "300.00");
}

TEST(LadderRows, AdjustTextShowsWhatIsGivenByASign) {
  EXPECT_EQ(AdjustText(2), "+2");
  EXPECT_EQ(AdjustText(0), "0");
  EXPECT_EQ(AdjustText(-2), "-2");
}

/// A random league: names some of which hold others, some unknown, some byes, some dates late.
struct RandomLeague {
  explicit RandomLeague(unsigned seed) : chance(seed) {
    const int count = Up(20);
    for (int i = 0; i < count; ++i) teams.push_back("Team " + std::string(1, char('A' + i)));
    const int size = Up(60);
    for (int i = 0; i < size; ++i) matches.push_back(Match());
  }
  int Up(int most) { return std::uniform_int_distribution<int>(0, most)(chance); }
  std::string Name() {
    if (teams.empty() || Up(30) == 0) return Up(1) == 0 ? "" : "Gone";
    return teams[static_cast<std::size_t>(Up(static_cast<int>(teams.size()) - 1))];
  }
  LadderRecord Match() {
    // Few scores, so that there are many ties.
    LadderRecord match = MatchOn(1 + Up(30), Name(), Up(2), Name(), Up(2));
    if (Up(9) == 0) match.HomePenalty = static_cast<std::int16_t>(Up(6) - 3);
    if (Up(9) == 0) match.AwayPenalty = static_cast<std::int16_t>(Up(6) - 3);
    return match;
  }

  std::mt19937 chance;
  Names teams;
  Matches matches;
};

TEST(LadderRows, RandomLeaguesAreWhatThePlainLoopsMakeOfThem) {
  for (unsigned seed = 1; seed <= 400; ++seed) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    RandomLeague league(seed);
    LadderRules rules;
    const PlainRules plain = {league.Up(3), league.Up(2) - 1, league.Up(2)};
    rules.WinPoints = plain.win;
    rules.LossPoints = plain.loss;
    rules.DrawPoints = plain.draw;
    const Date up_to = March(1 + league.Up(30));
    auto expected = PlainLadder(league.teams, league.matches, plain, up_to);
    const LadderRows rows = Tallied(league.teams, league.matches, rules, up_to);
    ASSERT_EQ(PlainOf(rows), expected);
    PlainSort(expected);
    ASSERT_EQ(PlainOf(Sorted(rows)), expected);
    // Worked out a second time nothing moves.
    ASSERT_EQ(PlainOf(Sorted(Tallied(league.teams, league.matches, rules, up_to))), expected);
  }
}

TEST(LadderRows, RandomLeaguesOverflowJustWhereThePlainLoopsDo) {
  int overflows = 0;
  for (unsigned seed = 1; seed <= 300; ++seed) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    RandomLeague league(seed);
    for (LadderRecord& match : league.matches) {
      match.HomeScore = static_cast<std::int16_t>(league.Up(60) - 5);
      match.AwayScore = static_cast<std::int16_t>(league.Up(60) - 5);
    }
    bool expected = false;
    std::vector<PlainRow> rows;
    try {
      rows = PlainLadder(league.teams, league.matches, {}, March(31));
    } catch (const PlainOverflow&) {
      expected = true;
    }
    overflows += expected ? 1 : 0;
    LadderRows actual;
    ASSERT_EQ(ErrorOf([&] { actual = Tallied(league.teams, league.matches); }), expected ? 6 : 0);
    if (!expected) {
      ASSERT_EQ(PlainOf(actual), rows);
    }
  }
  EXPECT_GT(overflows, 30);
  EXPECT_LT(overflows, 270);
}

TEST(LadderRows, TheTotalsOfALeagueBalance) {
  for (unsigned seed = 1; seed <= 200; ++seed) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    RandomLeague league(seed);
    if (league.teams.empty()) continue;
    // Between teams of the league alone.
    std::erase_if(league.matches, [&](const LadderRecord& match) {
      const auto known = [&](const std::string& name) {
        return std::find(league.teams.begin(), league.teams.end(), name) != league.teams.end();
      };
      return !known(match.HomeTeam) || !known(match.AwayTeam);
    });
    PlainRow total;
    for (const PlainRow& row : PlainOf(Tallied(league.teams, league.matches))) {
      total.played += row.played;
      total.won += row.won;
      total.lost += row.lost;
      total.draw += row.draw;
      total.games_for += row.games_for;
      total.against += row.against;
    }
    EXPECT_EQ(total.played, 2 * static_cast<int>(league.matches.size()));
    EXPECT_EQ(total.won, total.lost);
    EXPECT_EQ(total.draw % 2, 0);
    EXPECT_EQ(total.games_for, total.against);
  }
}

// The first pass, at gap 2, brings Charlie to the top and Alpha below Bravo, and nothing brings
// Alpha back.
TEST(LadderRows, KeptTeamsLevelOnBothNeedNotStandByTheirNames) {
  LadderRows rows(4);
  rows[0].Team = "Alpha";
  rows[1].Team = "Bravo";
  rows[2].Team = "Charlie";
  rows[2].Points = 1;
  rows[3].Team = "Delta";
  EXPECT_EQ(TeamsOf(Sorted(rows)), (Names{"Charlie", "Bravo", "Alpha", "Delta"}));
}

TEST(LadderRows, EqualTeamsStayWhereThePassesLeaveThem) {
  for (int count = 0; count <= 12; ++count) {
    // Every way of giving each team one of two points and one of two percentages.
    for (unsigned mask = 0; mask < (1U << std::min(count, 9)); ++mask) {
      LadderRows rows(static_cast<std::size_t>(count));
      for (int i = 0; i < count; ++i) {
        LadderRow& row = rows[static_cast<std::size_t>(i)];
        row.Team = std::string(1, char('A' + i));
        row.Points = static_cast<int>((mask >> (i % 9)) & 1U);
        row.Percent = static_cast<int>((mask >> ((i + 4) % 9)) & 1U);
      }
      auto expected = PlainOf(rows);
      PlainSort(expected);
      ASSERT_EQ(PlainOf(Sorted(rows)), expected) << count << ' ' << mask;
    }
  }
}

TEST(LadderRows, NamesThatDifferInAnyOneLetterAreTwoTeams) {
  for (std::size_t letter = 0; letter < 30; ++letter) {
    const std::string one = "The Wandering Woolwich Wombats";
    std::string other = one;
    other[letter] = '~';
    const auto rows = Tallied({one, other}, {MatchOn(3, one, 6, other, 5)});
    EXPECT_EQ(rows[0].For, 6) << letter;
    EXPECT_EQ(rows[1].For, 5) << letter;
  }
}

TEST(LadderRows, ANameOfNothingButZerosIsNobody) {
  const std::string zeros(30, '\0');
  EXPECT_EQ(Tallied({"Alpha"}, {MatchOn(3, zeros, 6, "Alpha", 5)})[0].Played, 1);
}

TEST(LadderRows, ThousandsOfNamesThatNobodyKnowsDoNotMisleadIt) {
  // Names that share their places in whatever remembers them.
  Matches matches;
  for (int i = 0; i < 3000; ++i) {
    matches.push_back(
        MatchOn(3, "Gone " + std::to_string(i), 1, i % 3 == 0 ? "Alpha" : "Bravo", 0));
  }
  const auto rows = PlainOf(Tallied({"Alpha", "Bravo", "Gone 1234"}, matches));
  EXPECT_EQ(rows, PlainLadder({"Alpha", "Bravo", "Gone 1234"}, matches, {}, March(31)));
  EXPECT_EQ(rows[0].lost, 1000);
  EXPECT_EQ(rows[2].won, 1);
}

}  // namespace
}  // namespace marlowbeck
