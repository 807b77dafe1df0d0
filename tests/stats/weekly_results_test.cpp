#include "stats/weekly_results.h"

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "stats/report_records.h"

namespace marlowbeck {
namespace {

constexpr double kNight = 38077;  // 31 March 2004

std::vector<std::string> NamesOf(const std::vector<WeeklyRow>& rows) {
  std::vector<std::string> names;
  for (const WeeklyRow& row : rows) names.push_back(row.name);
  return names;
}

int ErrorOf(const WeeklyResults& weekly) {
  try {
    static_cast<void>(weekly.Rows());
  } catch (const RunTimeError& error) {
    return error.Number();
  }
  return 0;
}

TEST(WeeklyResults, OnePlayerOfANightGivesOneRow) {
  const Competition club{{Person(7, "Archer", "Jo", "Rovers", "A")},
                         {Night(7, "Rovers", "Swifts", kNight, 505, 20)}};
  const auto rows = Weekly(club, "Rovers", kNight).Rows();
  ASSERT_EQ(rows.size(), 1U);
  EXPECT_EQ(rows[0].name, "Archer, Jo");
  EXPECT_EQ(rows[0].agg, 505);
  EXPECT_EQ(rows[0].shots, 20);
}

TEST(WeeklyResults, ARowHoldsTheFieldsOfTheRecord) {
  ResultRecord night = Night(7, "Rovers", "Swifts", kNight, 505, 20);
  night.Scores180 = 1;
  night.Centuries = 2;
  night.HighScore = 180;
  night.Pegs = {1, 2, 3, 4, 5, 6};
  const auto rows =
      Weekly({{Person(7, "Archer", "Jo", "Rovers", "A")}, {night}}, "Rovers", kNight).Rows();
  ASSERT_EQ(rows.size(), 1U);
  EXPECT_EQ(rows[0].c180, 1);
  EXPECT_EQ(rows[0].c100, 2);
  EXPECT_EQ(rows[0].hs, 180);
  EXPECT_EQ(rows[0].pegs, (std::array<std::int16_t, 6>{1, 2, 3, 4, 5, 6}));
}

TEST(WeeklyResults, TheBestAverageComesFirst) {
  const Competition club{
      {Person(1, "Low", "A", "Rovers", "A"), Person(2, "High", "B", "Rovers", "A"),
       Person(3, "Mid", "C", "Rovers", "A")},
      {Night(1, "Rovers", "Swifts", kNight, 100, 10), Night(2, "Rovers", "Swifts", kNight, 300, 10),
       Night(3, "Rovers", "Swifts", kNight, 200, 10)}};
  EXPECT_EQ(NamesOf(Weekly(club, "Rovers", kNight).Rows()),
            (std::vector<std::string>{"High, B", "Mid, C", "Low, A"}));
}

TEST(WeeklyResults, EqualAveragesStayInTheOrderOfTheRecords) {
  const Competition club{
      {Person(1, "First", "A", "Rovers", "A"), Person(2, "Second", "B", "Rovers", "A")},
      {Night(1, "Rovers", "Swifts", kNight, 100, 10),
       Night(2, "Rovers", "Swifts", kNight, 200, 20)}};
  EXPECT_EQ(NamesOf(Weekly(club, "Rovers", kNight).Rows()),
            (std::vector<std::string>{"First, A", "Second, B"}));
}

TEST(WeeklyResults, AveragesAreComparedUncut) {
  // 1000 / 30 is 33.333..., 3333 / 100 is 33.33: both are shown as 33.33.
  const Competition club{
      {Person(1, "Less", "A", "Rovers", "A"), Person(2, "More", "B", "Rovers", "A")},
      {Night(1, "Rovers", "Swifts", kNight, 3333, 100),
       Night(2, "Rovers", "Swifts", kNight, 1000, 30)}};
  const auto rows = Weekly(club, "Rovers", kNight).Rows();
  EXPECT_EQ(NamesOf(rows), (std::vector<std::string>{"More, B", "Less, A"}));
  EXPECT_EQ(WeeklyCells(rows[0])[9], "33.33");
  EXPECT_EQ(WeeklyCells(rows[1])[9], "33.33");
}

TEST(WeeklyResults, AForfeitIsOneOverOneAndStandsBelowEveryAverageAboveOne) {
  Competition club{
      {Person(1, "Absent", "A", "Rovers", "A"), Person(2, "Poor", "B", "Rovers", "A")},
      {ForfeitNight(1, "Rovers", "Swifts", kNight), Night(2, "Rovers", "Swifts", kNight, 11, 10)}};
  club.results[0].Scores180 = 3;
  club.results[0].Pegs[1] = 40;
  const auto rows = Weekly(club, "Rovers", kNight).Rows();
  EXPECT_EQ(NamesOf(rows), (std::vector<std::string>{"Poor, B", "Absent, A *"}));
  EXPECT_EQ(rows[1].agg, 1);
  EXPECT_EQ(rows[1].shots, 1);
  EXPECT_EQ(rows[1].c180, 3);
  EXPECT_EQ(rows[1].pegs[1], 40);
}

TEST(WeeklyResults, OnlyAnFAloneMarksAForfeit) {
  Competition club{{Person(1, "Archer", "Jo", "Rovers", "A")},
                   {Night(1, "Rovers", "Swifts", kNight, 50, 5)}};
  club.results[0].Forfeit = "f";
  EXPECT_EQ(Weekly(club, "Rovers", kNight).Rows()[0].name, "Archer, Jo");
  club.results[0].Forfeit = "  F";
  EXPECT_EQ(Weekly(club, "Rovers", kNight).Rows()[0].name, "Archer, Jo *");
}

TEST(WeeklyResults, AResultWhosePlayerIsGoneGivesNoRow) {
  const Competition club{{Person(2, "Here", "B", "Rovers", "A")},
                         {Night(1, "Rovers", "Swifts", kNight, 100, 10),
                          Night(2, "Rovers", "Swifts", kNight, 100, 10)}};
  EXPECT_EQ(NamesOf(Weekly(club, "Rovers", kNight).Rows()), (std::vector<std::string>{"Here, B"}));
}

TEST(WeeklyResults, OtherTeamsAndOtherDatesAreLeftOut) {
  const Competition club{{Person(1, "Archer", "Jo", "Rovers", "A")},
                         {Night(1, "Swifts", "Rovers", kNight, 100, 10),
                          Night(1, "Rovers", "Swifts", kNight + 7, 100, 10)}};
  const WeeklyResults weekly = Weekly(club, "Rovers", kNight);
  EXPECT_TRUE(weekly.Rows().empty());
  EXPECT_EQ(weekly.Opposition(), std::nullopt);
}

TEST(WeeklyResults, TheFirstPlayerRecordOfAnIdGivesTheName) {
  const Competition club{
      {Person(1, "First", "A", "Swifts", "B"), Person(1, "Second", "B", "Rovers", "A")},
      {Night(1, "Rovers", "Swifts", kNight, 100, 10)}};
  EXPECT_EQ(NamesOf(Weekly(club, "Rovers", kNight).Rows()), (std::vector<std::string>{"First, A"}));
}

TEST(WeeklyResults, TheOppositionIsThatOfTheLastResult) {
  const Competition club{
      {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {Night(1, "Rovers", "Swifts", kNight, 100, 10), Night(2, "Rovers", "Hawks", kNight, 1, 1)}};
  EXPECT_EQ(Weekly(club, "Rovers", kNight).Opposition(), "Hawks");
}

TEST(WeeklyResults, ALastResultWithoutItsPlayerLeavesTheOppositionEmpty) {
  const Competition club{{Person(1, "Archer", "Jo", "Rovers", "A")},
                         {Night(1, "Rovers", "Swifts", kNight, 100, 10),
                          Night(2, "Rovers", "Swifts", kNight, 100, 10)}};
  EXPECT_EQ(Weekly(club, "Rovers", kNight).Opposition(), "");
}

TEST(WeeklyResults, ShotsOfZeroAreADivisionByZero) {
  Competition club{
      {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {Night(1, "Rovers", "Swifts", kNight, 100, 10), Night(2, "Rovers", "Swifts", kNight, 5, 0)}};
  EXPECT_EQ(ErrorOf(Weekly(club, "Rovers", kNight)), 11);
  club.results[1].Aggregate = 0;
  EXPECT_EQ(ErrorOf(Weekly(club, "Rovers", kNight)), 11);
}

TEST(WeeklyResults, OneRowWithoutShotsAloneIsDividedByNothing) {
  const Competition club{{Person(1, "Archer", "Jo", "Rovers", "A")},
                         {Night(1, "Rovers", "Swifts", kNight, 5, 0)}};
  EXPECT_EQ(ErrorOf(Weekly(club, "Rovers", kNight)), 0);
}

TEST(WeeklyResults, TheThousandthRowHasAPlaceAndTheNextHasNone) {
  Competition club{{Person(1, "Archer", "Jo", "Rovers", "A")}, {}};
  club.results.assign(1000, Night(1, "Rovers", "Swifts", kNight, 100, 10));
  EXPECT_EQ(Weekly(club, "Rovers", kNight).Rows().size(), 1000U);
  club.results.push_back(club.results[0]);
  EXPECT_EQ(ErrorOf(Weekly(club, "Rovers", kNight)), 9);
}

std::string Written(const std::vector<WeeklyRow>& rows) {
  SideFileWriter writer;
  WriteWeekly(writer, rows);
  return writer.Content();
}

TEST(WeeklyFile, HoldsTwoLinesARowInQuotedForm) {
  const WeeklyRow row{"Archer, Jo", 505, 20, 1, 2, 180, {57, 121, 0, 0, -3, 6}};
  EXPECT_EQ(Written({row, row}),
            "\"Archer, Jo\",505,20,1,2,180\r\n57,121,0,0,-3,6\r\n"
            "\"Archer, Jo\",505,20,1,2,180\r\n57,121,0,0,-3,6\r\n");
}

TEST(WeeklyFile, ReadsBackWhatWasWritten) {
  const std::vector<WeeklyRow> rows = {
      {"Archer, Jo", 32767, 2147483647, -32768, 2, 180, {57, 121, 0, 0, -3, 6}},
      {", ", 0, 0, 0, 0, 0, {}},
      {"O\"Brien \"Ace\", Jo, \"the\" *", 1, 1, 0, 0, 0, {}}};
  SideFileReader reader(Written(rows));
  EXPECT_EQ(ReadWeekly(reader, 3), rows);
}

TEST(WeeklyFile, CutShortIsAReadPastItsEnd) {
  SideFileReader reader("\"Archer, Jo\",505,20,1,2,180\r\n57,121");
  EXPECT_THROW(static_cast<void>(ReadWeekly(reader, 1)), RunTimeError);
}

WeeklyRow Row(std::string_view name, std::int16_t agg, std::int32_t shots) {
  WeeklyRow row;
  row.name = name;
  row.agg = agg;
  row.shots = shots;
  return row;
}

TEST(WeeklyCells, ShowAPlayersNight) {
  const WeeklyRow row{"Archer, Jo", 505, 20, 1, 2, 180, {57, 121, 0, 32, 40, 0}};
  EXPECT_EQ(WeeklyCells(row), (std::array<std::string, 10>{"Archer, Jo", "505", "20", "1", "2",
                                                           "180", "57, 121", "32", "40", "25.25"}));
}

TEST(WeeklyCells, LeaveBlankWhatIsNotAboveZero) {
  WeeklyRow row = Row("Archer, Jo", -5, -1);
  row.c180 = -1;
  row.pegs = {-57, 0, 0, -1, 0, 0};
  EXPECT_EQ(WeeklyCells(row),
            (std::array<std::string, 10>{"Archer, Jo", "-5", "-1", "", "", "", "", "", "", ""}));
}

TEST(WeeklyCells, ShowAForfeitWithoutAnAverageWhateverElseItHolds) {
  const WeeklyRow row{"Absent, A *", 1, 1, 1, 2, 90, {40, 0, 0, 0, 0, 0}};
  EXPECT_EQ(WeeklyCells(row), (std::array<std::string, 10>{"Absent, A *", "Forfeit", "Win", "1",
                                                           "2", "90", "40", "", "", ""}));
}

TEST(WeeklyCells, KeepTakingAStarAtTheEndOfANameForAForfeit) {
  const auto cells = WeeklyCells(Row("Star, Jo*", 50, 10));
  EXPECT_EQ(cells[1], "Forfeit");
  EXPECT_EQ(cells[2], "Win");
  EXPECT_EQ(cells[9], "5.00");
}

TEST(WeeklyCells, TellNoAverageOfAnAggregateOrShotsOfOne) {
  EXPECT_EQ(WeeklyCells(Row("Archer, Jo", 1, 10))[9], "");
  EXPECT_EQ(WeeklyCells(Row("Archer, Jo", 1, 10))[1], "1");
  EXPECT_EQ(WeeklyCells(Row("Archer, Jo", 10, 1))[9], "");
  EXPECT_EQ(WeeklyCells(Row("Archer, Jo", 2, 2))[9], "1.00");
}

TEST(WeeklyCells, CutTheAverageAndNeverRoundIt) {
  EXPECT_EQ(WeeklyCells(Row("Archer, Jo", 24999, 1000))[9], "24.99");
  EXPECT_EQ(WeeklyCells(Row("Archer, Jo", 2, 3))[9], "0.66");
  // The quotient is formed first: 17.9 as a double, times 100, is 1789.9999999999998.
  EXPECT_EQ(WeeklyCells(Row("Archer, Jo", 179, 10))[9], "17.89");
}

TEST(PegText, JoinsTwoPegsAndShowsOneAlone) {
  EXPECT_EQ(PegText(57, 121), "57, 121");
  EXPECT_EQ(PegText(57, 0), "57");
  EXPECT_EQ(PegText(0, 121), "121");
  EXPECT_EQ(PegText(-1, 0), "");
}

}  // namespace
}  // namespace marlowbeck
