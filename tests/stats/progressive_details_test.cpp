#include "stats/progressive_details.h"

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "stats/report_records.h"

namespace marlowbeck {
namespace {

constexpr double kFirst = 38063;  // 17 March 2004
constexpr double kSecond = kFirst + 7;

PlayerRecord Jo() { return Person(1, "Archer", "Jo", "Rovers", "A"); }

TEST(ProgressiveDetails, AddUpAPlayersNights) {
  ResultRecord first = Night(1, "Rovers", "Swifts", kFirst, 500, 20);
  first.HighScore = 140;
  first.Scores180 = 1;
  first.Centuries = 2;
  first.Pegs = {40, 0, 0, 0, 0, 12};
  ResultRecord second = Night(1, "Rovers", "Hawks", kSecond, 300, 15);
  second.HighScore = 100;
  second.Centuries = 1;
  second.Pegs = {0, 121, 0, 0, 0, 0};
  const auto rows = Progressive({{Jo()}, {first, second}}, "Rovers", "A", kSecond);
  ASSERT_EQ(rows.size(), 1U);
  const ProgressiveRow expected{"Archer, Jo", 1, 800, 35, 140, 1, 3, 3, 121, 2, 0, 22.85};
  EXPECT_EQ(rows[0], expected);
}

TEST(ProgressiveDetails, OnTheTeamsFirstDateEqualThatNight) {
  const auto rows = Progressive({{Jo()},
                                 {Night(1, "Rovers", "Swifts", kFirst, 500, 20),
                                  Night(1, "Rovers", "Hawks", kSecond, 300, 15)}},
                                "Rovers", "A", kFirst);
  ASSERT_EQ(rows.size(), 1U);
  EXPECT_EQ(rows[0].agg, 500);
  EXPECT_EQ(rows[0].shots, 20);
  EXPECT_EQ(rows[0].games, 1);
  EXPECT_EQ(rows[0].avg, 25);
}

TEST(ProgressiveDetails, PassOverNightsAfterTheDate) {
  const Competition club{{Jo()},
                         {Night(1, "Rovers", "Hawks", kSecond, 300, 15),
                          Night(1, "Rovers", "Swifts", kFirst, 500, 20)}};
  EXPECT_EQ(Progressive(club, "Rovers", "A", kFirst)[0].agg, 500);
  EXPECT_EQ(Progressive(club, "Rovers", "A", kSecond)[0].agg, 800);
  EXPECT_EQ(Progressive(club, "Rovers", "A", kFirst - 1)[0].games, 0);
}

TEST(ProgressiveDetails, HaveNoRowForAPlayerWhoChangedTeam) {
  const Competition club{{Person(1, "Archer", "Jo", "Hawks", "A")},
                         {Night(1, "Rovers", "Swifts", kFirst, 500, 20)}};
  EXPECT_TRUE(Progressive(club, "Rovers", "A", kFirst).empty());
  EXPECT_EQ(Progressive(club, "Hawks", "A", kFirst)[0].agg, 500);
}

TEST(ProgressiveDetails, LeaveOutTheSameTeamOfAnotherGrade) {
  const Competition club{{Jo(), Person(2, "Baker", "Al", "Rovers", "B")}, {}};
  EXPECT_EQ(Progressive(club, "Rovers", "A", kFirst).size(), 1U);
}

TEST(ProgressiveDetails, CountAForfeitAsAGameAndAddWhatItHolds) {
  ResultRecord forfeit = ForfeitNight(1, "Rovers", "Hawks", kSecond);
  const Competition club{{Jo()}, {Night(1, "Rovers", "Swifts", kFirst, 500, 20), forfeit}};
  const ProgressiveRow row = Progressive(club, "Rovers", "A", kSecond)[0];
  EXPECT_EQ(row.games, 2);
  EXPECT_EQ(row.forfeits, 1);
  EXPECT_EQ(row.avg, 25);
  forfeit.Aggregate = 100;
  const Competition odd{{Jo()}, {club.results[0], forfeit}};
  EXPECT_EQ(Progressive(odd, "Rovers", "A", kSecond)[0].agg, 600);
}

TEST(ProgressiveDetails, GiveEachRecordOfADoubledIdTheSums) {
  const Competition club{{Jo(), Person(1, "Archer", "Joan", "Rovers", "A")},
                         {Night(1, "Rovers", "Swifts", kFirst, 500, 20)}};
  const auto rows = Progressive(club, "Rovers", "A", kFirst);
  ASSERT_EQ(rows.size(), 2U);
  EXPECT_EQ(rows[0].name, "Archer, Jo");
  EXPECT_EQ(rows[0].agg, 500);
  EXPECT_EQ(rows[1].name, "Archer, Joan");
  EXPECT_EQ(rows[1].agg, 500);
}

TEST(ProgressiveDetails, PutTheBestAverageFirstEqualOnesAsTheyWereAndNoneLast) {
  const Competition club{
      {Person(1, "None", "A", "Rovers", "A"), Person(2, "Equal", "B", "Rovers", "A"),
       Person(3, "Equal", "C", "Rovers", "A"), Person(4, "Best", "D", "Rovers", "A")},
      {Night(2, "Rovers", "Swifts", kFirst, 200, 10), Night(3, "Rovers", "Swifts", kFirst, 100, 5),
       Night(4, "Rovers", "Swifts", kFirst, 210, 10)}};
  std::vector<std::string> names;
  for (const auto& row : Progressive(club, "Rovers", "A", kFirst)) names.push_back(row.name);
  // The pass of the larger gap changes 1 and 3, 2 and 4; then neighbours.
  EXPECT_EQ(names, (std::vector<std::string>{"Best, D", "Equal, C", "Equal, B", "None, A"}));
}

TEST(ProgressiveDetails, SumsGoOnPastSixteenAndThirtyTwoBits) {
  Competition club{{Jo()}, {}};
  club.results.assign(3, Night(1, "Rovers", "Swifts", kFirst, 32767, 2147483647));
  const ProgressiveRow row = Progressive(club, "Rovers", "A", kFirst)[0];
  EXPECT_EQ(row.agg, 98301);
  EXPECT_EQ(row.shots, 6442450941);
}

TEST(ProgressiveDetails, KeepTheAverageOfWhenBothWereLastAboveZero) {
  const Competition club{{Jo()},
                         {Night(1, "Rovers", "Swifts", kFirst, 100, 4),
                          Night(1, "Rovers", "Swifts", kFirst, -200, 4)}};
  EXPECT_EQ(Progressive(club, "Rovers", "A", kFirst)[0].avg, 25);
}

TEST(ProgressiveDetails, TheThousandthPlayerHasAPlaceAndTheNextHasNone) {
  Competition club;
  club.players.assign(1000, Jo());
  EXPECT_EQ(Progressive(club, "Rovers", "A", kFirst).size(), 1000U);
  club.players.push_back(Jo());
  try {
    static_cast<void>(Progressive(club, "Rovers", "A", kFirst));
    FAIL() << "a 1001st row";
  } catch (const RunTimeError& error) {
    EXPECT_EQ(error.Number(), 9);
  }
}

TEST(ProgressiveFile, HoldsALineForEveryPlayerAlsoWithoutAResult) {
  const Competition club{{Jo(), Person(2, "Baker", "Al", "Rovers", "A")},
                         {Night(1, "Rovers", "Swifts", kFirst, 505, 20)}};
  SideFileWriter writer;
  WriteProgressive(writer, Progressive(club, "Rovers", "A", kFirst));
  EXPECT_EQ(writer.Content(),
            "\"Archer, Jo\",505,20,0,0,0,0,0,1,25.25\r\n"
            "\"Baker, Al\",0,0,0,0,0,0,0,0,0\r\n");
}

TEST(ProgressiveCells, ShowASeason) {
  const ProgressiveRow row{"Archer, Jo", 1, 800, 35, 140, 1, 3, 4, 121, 5, 1, 22.85};
  EXPECT_EQ(ProgressiveCells(row, Forfeits::Counted),
            (std::array<std::string, 10>{"Archer, Jo", "800", "35", "1", "3", "140", "4", "121",
                                         "5", "22.85"}));
}

TEST(ProgressiveCells, ShowFourGamesOfFiveWhereAForfeitIsLeftOut) {
  const ProgressiveRow row{"Archer, Jo", 1, 800, 35, 140, 1, 3, 4, 121, 5, 1, 22.85};
  EXPECT_EQ(ProgressiveCells(row, Forfeits::LeftOut)[8], "4");
}

TEST(ProgressiveCells, LeaveBlankWhatIsNotAboveZero) {
  ProgressiveRow row;
  row.name = "Archer, Jo";
  row.agg = 5;
  row.c100 = -1;
  EXPECT_EQ(ProgressiveCells(row, Forfeits::Counted),
            (std::array<std::string, 10>{"Archer, Jo", "5", "0", "", "", "", "", "", "0", ""}));
}

}  // namespace
}  // namespace marlowbeck
