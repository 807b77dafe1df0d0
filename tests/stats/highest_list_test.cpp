#include "stats/highest_list.h"

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "stats/list_records.h"
#include "stats/quoted_texts.h"

namespace marlowbeck {
namespace {

constexpr double kDay = 38063;

Competition Four(const std::vector<int>& aggregates) {
  Competition competition;
  std::int32_t id = 0;
  for (const int aggregate : aggregates) {
    ++id;
    competition.players.push_back(
        Person(id, std::string(1, static_cast<char>('A' + id - 1)), "x", "Rovers", "A"));
    competition.results.push_back(
        Night(id, "Rovers", "Hawks", kDay, static_cast<std::int16_t>(aggregate), 10));
  }
  return competition;
}

std::string Initials(const std::vector<HighestRow>& rows) {
  std::string initials;
  for (const HighestRow& row : rows) initials += row.name.empty() ? '?' : row.name.front();
  return initials;
}

// Four equal values: gap 2 swaps 1 with 3 and 2 with 4, then gap 1 goes CDAB, DCAB, DACB, ADCB,
// ADBC, ABDC, BADC; the last comes first.
TEST(HighestList, EqualValuesAreSwappedByTheSort) {
  const Competition competition = Four({250, 250, 250, 250});
  EXPECT_EQ(Initials(OfDate(competition, HighestOf::Averages, kDay)), "CDAB");
  EXPECT_EQ(Initials(UpTo(competition, HighestOf::Averages, kDay)), "CDAB");
}

TEST(HighestList, TwoEqualValuesStayInTheOrderOfTheRecords) {
  EXPECT_EQ(Initials(OfDate(Four({250, 250}), HighestOf::Averages, kDay)), "AB");
}

TEST(HighestList, ANightOfOnePlayerHasOneRow) {
  EXPECT_EQ(Initials(OfDate(Four({250}), HighestOf::Averages, kDay)), "A");
}

TEST(HighestList, AveragesAreCutAndNeverRounded) {
  Competition competition = Four({0});
  competition.results = {Night(1, "Rovers", "Hawks", kDay, 24999, 1000)};
  EXPECT_EQ(OfDate(competition, HighestOf::Averages, kDay).at(0).value, 24.99);
  EXPECT_EQ(UpTo(competition, HighestOf::Averages, kDay).at(0).value, 24.99);
}

TEST(HighestList, ANightOfForfeitsIsEmpty) {
  Competition competition = Four({0});
  competition.results = {ForfeitNight(1, "Rovers", "Hawks", kDay)};
  competition.results[0].Scores180 = 3;
  EXPECT_TRUE(OfDate(competition, HighestOf::Scores180, kDay).empty());
}

TEST(HighestList, NeitherPointsNorShotsAloneEnterAListOfOneDate) {
  Competition competition = Four({0, 0});
  competition.results = {Night(1, "Rovers", "Hawks", kDay, 300, 0),
                         Night(2, "Rovers", "Hawks", kDay, 0, 12)};
  for (ResultRecord& result : competition.results) result.HighScore = 100;
  EXPECT_TRUE(OfDate(competition, HighestOf::HighScores, kDay).empty());
  // Up to a date they count for everything but the games.
  const auto rows = UpTo(competition, HighestOf::HighScores, kDay);
  ASSERT_EQ(rows.size(), 2U);
  EXPECT_EQ(rows[0].games, 0);
}

TEST(HighestList, PointsAndShotsOfDifferentNightsMakeAnAverage) {
  Competition competition = Four({0});
  competition.results = {Night(1, "Rovers", "Hawks", kDay, 300, 0),
                         Night(1, "Rovers", "Hawks", kDay + 7, 0, 12)};
  EXPECT_TRUE(UpTo(competition, HighestOf::Averages, kDay).empty());
  EXPECT_EQ(UpTo(competition, HighestOf::Averages, kDay + 7).at(0).value, 25);
}

TEST(HighestList, AValueOfNoneIsLeftOut) {
  Competition competition = Four({250, 250});
  competition.results[1].Scores180 = 1;
  EXPECT_EQ(Initials(OfDate(competition, HighestOf::Scores180, kDay)), "B");
  EXPECT_EQ(Initials(UpTo(competition, HighestOf::Scores180, kDay)), "B");
  competition.results[1].Scores180 = 0;
  EXPECT_TRUE(OfDate(competition, HighestOf::Scores180, kDay).empty());
}

TEST(HighestList, ValuesOfEachList) {
  Competition competition = Four({250});
  ResultRecord& night = competition.results[0];
  night.Pegs = {40, 0, 121, 0, 8, 0};
  night.HighScore = 140;
  night.Centuries = 4;
  night.Scores180 = 2;
  competition.results.push_back(night);
  competition.results[1].GameDate.days = kDay + 7;
  competition.results[1].Pegs = {0, 0, 0, 0, 0, 170};
  const std::vector<std::pair<HighestOf, std::pair<double, double>>> expected = {
      {HighestOf::Averages, {25, 25}},     {HighestOf::HighPegs, {121, 170}},
      {HighestOf::HighScores, {140, 140}}, {HighestOf::Pegs, {3, 4}},
      {HighestOf::Centuries, {4, 8}},      {HighestOf::Scores180, {2, 4}}};
  for (const auto& [list, values] : expected) {
    EXPECT_EQ(OfDate(competition, list, kDay).at(0).value, values.first);
    const auto so_far = UpTo(competition, list, kDay + 7);
    EXPECT_EQ(so_far.at(0).value, values.second);
    EXPECT_EQ(so_far.at(0).games, 2);
  }
}

TEST(HighestList, HeadingsTellPegByDateAndHiPegUpToIt) {
  EXPECT_EQ(HeadingOf(HighestOf::HighPegs, ListSpan::OneDate), "Peg");
  EXPECT_EQ(HeadingOf(HighestOf::HighPegs, ListSpan::UpToDate), "Hi Peg");
  for (const ListSpan span : {ListSpan::OneDate, ListSpan::UpToDate}) {
    EXPECT_EQ(HeadingOf(HighestOf::Averages, span), "Avg");
    EXPECT_EQ(HeadingOf(HighestOf::HighScores, span), "Score");
    EXPECT_EQ(HeadingOf(HighestOf::Pegs, span), "Pegs");
    EXPECT_EQ(HeadingOf(HighestOf::Centuries, span), "100's");
    EXPECT_EQ(HeadingOf(HighestOf::Scores180, span), "180's");
  }
}

TEST(HighestList, KeepAPlayerWhoIsGoneWithoutANameOnTheDateAlone) {
  Competition competition = Four({250, 300});
  competition.players.pop_back();
  EXPECT_EQ(Initials(OfDate(competition, HighestOf::Averages, kDay)), "?A");
  EXPECT_EQ(Initials(UpTo(competition, HighestOf::Averages, kDay)), "A");
}

TEST(HighestList, KeepAPlayerWhoMovedToAnotherGradeWithTheNewTeam) {
  Competition competition = Four({250});
  competition.players[0].Team = "Owls";
  competition.players[0].Grade = "B";
  EXPECT_EQ(UpTo(competition, HighestOf::Averages, kDay).at(0).team, "Owls");
  EXPECT_EQ(OfDate(competition, HighestOf::Averages, kDay).at(0).team, "Rovers");
}

TEST(HighestList, SumsHoldMoreThanSixteenBits) {
  Competition competition = Four({0});
  competition.results.assign(3, Night(1, "Rovers", "Hawks", kDay, 32767, 100));
  for (ResultRecord& result : competition.results) result.Centuries = 32767;
  EXPECT_EQ(UpTo(competition, HighestOf::Centuries, kDay).at(0).value, 98301);
  EXPECT_EQ(UpTo(competition, HighestOf::Averages, kDay).at(0).value, 327.67);
}

TEST(HighestList, HasPlaceForAThousandResultsOfADate) {
  Competition competition = Four({250});
  competition.results.assign(1000, competition.results[0]);
  EXPECT_EQ(OfDate(competition, HighestOf::Averages, kDay).size(), 1000U);
  competition.results.push_back(competition.results[0]);
  EXPECT_THROW(static_cast<void>(OfDate(competition, HighestOf::Averages, kDay)), RunTimeError);
  EXPECT_EQ(OfDate(competition, HighestOf::Averages, kDay + 1).size(), 0U);
}

TEST(HighestList, HasPlaceForAThousandPlayersListedOrNot) {
  Competition competition = Four({250});
  competition.players.assign(1000, competition.players[0]);
  EXPECT_EQ(UpTo(competition, HighestOf::Averages, kDay).size(), 1000U);
  competition.players.push_back(Person(99, "Z", "x", "Rovers", "A"));
  EXPECT_THROW(static_cast<void>(UpTo(competition, HighestOf::Averages, kDay)), RunTimeError);
}

TEST(HighestList, IdsOfMoreThanSixteenBitsAreListed) {
  Competition competition = Four({250});
  competition.players[0].ID = 70000;
  competition.results[0].ID = 70000;
  EXPECT_EQ(OfDate(competition, HighestOf::Averages, kDay).at(0).id, 70000);
  EXPECT_EQ(UpTo(competition, HighestOf::Averages, kDay).at(0).id, 70000);
}

TEST(HighestFile, HoldsALineARow) {
  SideFileWriter writer;
  WriteHighest(writer, {{7, "Archer, Jo", "Rovers", 25.5, 3}, {8, "", "Hawks", 25, 0}});
  EXPECT_EQ(writer.Content(), "7,\"Archer, Jo\",\"Rovers\",25.5,3\r\n8,\"\",\"Hawks\",25,0\r\n");
}

TEST(HighestFile, NamesWithQuotesAndCommasComeThrough) {
  const std::vector<HighestRow> rows = {{1, "Cox \"Ace\", Al", "O\"x\"", 1, 0},
                                        {2, "\"\", ", "\"", 2, 0},
                                        {3, "", "", 3, 0},
                                        {4, "Both\",\"ways, x", "Rovers", 4, 0}};
  SideFileWriter writer;
  WriteHighest(writer, rows);
  SideFileReader reader(writer.Content());
  EXPECT_EQ(ReadHighest(reader, 4), rows);
}

TEST(HighestFile, ALineThatIsCutShortIsRefused) {
  for (const char* text : {"", "7", "7,\"Archer, Jo\"", "7,\"Archer, Jo\",\"Rovers\"",
                           "7,\"Archer, Jo\",\"Rovers\",25", "x,\"Archer, Jo\",\"Rovers\",25,0\r\n",
                           "7,\"Archer, Jo\",\"Rovers\",high,0\r\n",
                           "99999999999,\"Archer, Jo\",\"Rovers\",25,0\r\n"}) {
    SideFileReader reader(text);
    EXPECT_THROW(static_cast<void>(ReadHighest(reader, 1)), RunTimeError) << text;
  }
}

TEST(HighestCells, AveragesHaveTwoPlacesAndOtherValuesStandAsTheyAre) {
  const HighestRow row{7, "Archer, Jo", "Rovers", 25.5, 3};
  EXPECT_EQ(HighestCells(2, row, HighestOf::Averages),
            (std::array<std::string, 5>{"2", "Archer, Jo", "Rovers", "25.50", "3"}));
  EXPECT_EQ(HighestCells(1, {7, "Archer, Jo", "Rovers", 180, 0}, HighestOf::HighScores)[3], "180");
}

}  // namespace
}  // namespace marlowbeck
