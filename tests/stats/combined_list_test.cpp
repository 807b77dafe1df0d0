#include "stats/combined_list.h"

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "stats/handicap.h"
#include "stats/list_records.h"

namespace marlowbeck {
namespace {

constexpr double kDay = 38063;

std::vector<PlayerRecord> Archer() { return {Person(1, "Archer", "Jo", "Rovers", "A")}; }

ResultRecord Played(std::int32_t id, std::int16_t aggregate, std::int32_t shots,
                    double date = kDay) {
  return Night(id, "Rovers", "Hawks", date, aggregate, shots);
}

TEST(CombinedList, KeepsTheAverageOfTheLastGradeAndTheGamesOfAll) {
  const auto rows =
      OfAllGrades(Archer(), {{Played(1, 500, 20), Played(1, 700, 20)}, {Played(1, 400, 10)}}, kDay);
  ASSERT_EQ(rows.size(), 1U);
  EXPECT_EQ(rows[0].avg, 40);
  EXPECT_EQ(rows[0].games, 3);
}

TEST(CombinedList, AGradeWithoutAnAverageLeavesThatOfTheOneBefore) {
  const auto rows = OfAllGrades(Archer(), {{Played(1, 500, 20)}, {Played(1, 0, 12)}}, kDay);
  ASSERT_EQ(rows.size(), 1U);
  EXPECT_EQ(rows[0].avg, 25);
  EXPECT_EQ(rows[0].games, 1);
}

TEST(CombinedList, PointsAndShotsAreNotCarriedFromGradeToGrade) {
  EXPECT_TRUE(OfAllGrades(Archer(), {{Played(1, 500, 0)}, {Played(1, 0, 20)}}, kDay).empty());
}

TEST(CombinedList, LaterNightsArePassedOver) {
  const auto rows =
      OfAllGrades(Archer(), {{Played(1, 500, 20), Played(1, 900, 20, kDay + 7)}}, kDay);
  EXPECT_EQ(rows.at(0).avg, 25);
  EXPECT_EQ(rows.at(0).games, 1);
}

TEST(CombinedList, RowsComeFromTheLastPlayerToTheFirst) {
  const auto rows = OfAllGrades(
      {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "B"),
       Person(3, "Clark", "Ed", "Rovers", "B")},
      {{Played(1, 500, 20), Played(3, 500, 20)}}, kDay);
  ASSERT_EQ(rows.size(), 2U);
  EXPECT_EQ(rows[0].name, "Clark, Ed");
  EXPECT_EQ(rows[0].grade, "B");
  EXPECT_EQ(rows[1].name, "Archer, Jo");
}

TEST(CombinedList, HasPlaceForAThousandPlayers) {
  std::vector<PlayerRecord> players(1000, Archer()[0]);
  EXPECT_EQ(OfAllGrades(players, {{Played(1, 500, 20)}}, kDay).size(), 1000U);
  players.push_back(players[0]);
  EXPECT_THROW(static_cast<void>(OfAllGrades(players, {}, kDay)), RunTimeError);
}

std::vector<CombinedRow> Named(const std::vector<std::string>& names) {
  std::vector<CombinedRow> rows;
  for (const std::string& name : names) rows.push_back({1, name, "Rovers", "A", 25, 1});
  return rows;
}

std::vector<std::string> NamesIn(const std::vector<CombinedRow>& rows) {
  std::vector<std::string> names;
  for (const CombinedRow& row : rows) names.push_back(row.name);
  return names;
}

TEST(CombinedOrders, LowerCaseNamesStandAfterAllUpperCaseOnes) {
  EXPECT_EQ(
      NamesIn(Ordered(Named({"baker", "Zorn", "Archer", "archer"}), CombinedOrder::Alphabetical)),
      (std::vector<std::string>{"Archer", "Zorn", "archer", "baker"}));
}

TEST(CombinedOrders, LettersWithAccentsStandBehindThePlainOnes) {
  EXPECT_EQ(NamesIn(Ordered(Named({"\xC9mile", "Zorn", "zorn"}), CombinedOrder::Alphabetical)),
            (std::vector<std::string>{"Zorn", "zorn", "\xC9mile"}));
}

// Equal names are in order, so that the pass leaves a, b, c, d and the turning makes d, c, b, a;
// equal averages are swapped as in any list of the highest.
TEST(CombinedOrders, EqualNamesAreTurnedRoundAndEqualAveragesSwapped) {
  std::vector<CombinedRow> rows = Named({"x", "x", "x", "x"});
  for (std::size_t i = 0; i < rows.size(); ++i) rows[i].id = static_cast<std::int32_t>(i) + 1;
  const auto ids = [](const std::vector<CombinedRow>& ordered) {
    std::vector<int> order;
    for (const CombinedRow& row : ordered) order.push_back(row.id);
    return order;
  };
  EXPECT_EQ(ids(Ordered(rows, CombinedOrder::Alphabetical)), (std::vector<int>{4, 3, 2, 1}));
  EXPECT_EQ(ids(Ordered(rows, CombinedOrder::ByAverage)), (std::vector<int>{3, 4, 1, 2}));
}

TEST(CombinedOrders, RowsWithoutAnAverageAreLeftOut) {
  std::vector<CombinedRow> rows = Named({"x", "y"});
  rows[0].avg = 0;
  EXPECT_EQ(NamesIn(Ordered(rows, CombinedOrder::ByAverage)), (std::vector<std::string>{"y"}));
}

TEST(CombineFile, HoldsALineARowAndComesBack) {
  const std::vector<CombinedRow> rows = {{7, "Cox \"Ace\", Al", "Rovers", "A Grade", 25.5, 3},
                                         {8, "", "", "", 1, 0}};
  SideFileWriter writer;
  WriteCombined(writer, rows);
  EXPECT_EQ(writer.Content(),
            "7,\"Cox \"Ace\", Al\",\"Rovers\",\"A Grade\",25.5,3\r\n8,\"\",\"\",\"\",1,0\r\n");
  SideFileReader reader(writer.Content());
  EXPECT_EQ(ReadCombined(reader, 2), rows);
}

TEST(CombineFile, ALineThatIsCutShortIsRefused) {
  for (const char* text :
       {"", "7", "7,\"x\",\"y\",25,3\r\n", "7,\"x\",\"y\",\"z\"", "7,\"x\",\"y\",\"z\",25",
        "7,\"x\",\"y\",\"z\",25,many\r\n", "seven,\"x\",\"y\",\"z\",25,3\r\n"}) {
    SideFileReader reader(text);
    EXPECT_THROW(static_cast<void>(ReadCombined(reader, 1)), RunTimeError) << text;
  }
}

TEST(CombinedCells, GamesStandBeforeTheAverage) {
  EXPECT_EQ(CombinedCells(4, {7, "Archer, Jo", "Rovers", "A", 25.5, 3}),
            (std::array<std::string, 6>{"4", "Archer, Jo", "Rovers", "A", "3", "25.50"}));
}

TEST(Handicap, IsNoneOnTheMeanAndBelowNoneAboveIt) {
  EXPECT_EQ(HandicapOf(20, 20), 0);
  EXPECT_EQ(HandicapOf(20, 22), -50);  // 501 - 551.1
  EXPECT_EQ(HandicapOf(20, 0), 501);
}

// Half of 501 leaves 250.5, three halves of it -250.5.
TEST(Handicap, HalvesGoToTheEvenNumber) {
  EXPECT_EQ(HandicapOf(20, 10), 250);
  EXPECT_EQ(HandicapOf(2, 1), 250);
  EXPECT_EQ(HandicapOf(2, 3), -250);  // 501 - 751.5
  EXPECT_EQ(HandicapOf(2, 1.98), 5);  // 501 - 495.99
}

TEST(Handicap, HasRoomForSixteenBits) {
  EXPECT_EQ(HandicapOf(1, 66), 501 - 33066);
  EXPECT_THROW(static_cast<void>(HandicapOf(1, 67)), RunTimeError);
}

}  // namespace
}  // namespace marlowbeck
