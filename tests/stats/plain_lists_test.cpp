#include "stats/plain_lists.h"

#include <gtest/gtest.h>

#include "stats/list_records.h"
#include "stats/random_competition.h"

namespace marlowbeck {
namespace {

constexpr int kCompetitions = 5000;

void ExpectPlainFile(const std::vector<HighestRow>& rows, const std::vector<HighestRow>& expected) {
  EXPECT_EQ(rows, expected);
  SideFileWriter writer;
  WriteHighest(writer, rows);
  EXPECT_EQ(writer.Content(), plain::HighestFile(expected));
  SideFileReader reader(writer.Content());
  EXPECT_EQ(ReadHighest(reader, static_cast<int>(rows.size())), rows);
  EXPECT_TRUE(reader.AtEnd());
}

void ExpectPlainFile(const std::vector<CombinedRow>& rows,
                     const std::vector<CombinedRow>& expected) {
  EXPECT_EQ(rows, expected);
  SideFileWriter writer;
  WriteCombined(writer, rows);
  EXPECT_EQ(writer.Content(), plain::CombineFile(expected));
  SideFileReader reader(writer.Content());
  EXPECT_EQ(ReadCombined(reader, static_cast<int>(rows.size())), rows);
  EXPECT_TRUE(reader.AtEnd());
}

TEST(PlainLists, AreWhatTheSixListsAnswerForAnyCompetition) {
  std::size_t listed = 0;
  for (unsigned seed = 1; seed <= kCompetitions; ++seed) {
    RandomCompetition chance(seed);
    const Competition competition = chance.Make();
    const double day = chance.Day();
    for (int choice = 0; choice <= 5; ++choice) {
      SCOPED_TRACE("seed " + std::to_string(seed) + ", list " + std::to_string(choice));
      const auto list = static_cast<HighestOf>(choice);
      const auto expected = plain::CalcHi(competition, choice, day);
      ExpectPlainFile(OfDate(competition, list, day), expected);
      ExpectPlainFile(UpTo(competition, list, day), plain::CalcHiProg(competition, choice, day));
      if (::testing::Test::HasFailure()) return;
      listed += expected.size();
    }
  }
  EXPECT_GT(listed, std::size_t{kCompetitions});
}

TEST(PlainLists, AreWhatTheCombinedListAnswersInAnyOrderOfPresses) {
  std::size_t of_several_grades = 0;
  for (unsigned seed = 1; seed <= kCompetitions; ++seed) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    RandomCompetition chance(seed);
    const auto players = chance.Make().players;
    const auto grades = chance.MakeResultsOfGrades();
    const double day = chance.Day();
    auto expected = plain::CombineAV(players, grades, day);
    auto rows = OfAllGrades(players, grades, day);
    ExpectPlainFile(rows, expected);
    for (const bool by_average : {true, false, true, true, false}) {
      expected = plain::CombineSort(expected, by_average);
      rows = Ordered(rows, by_average ? CombinedOrder::ByAverage : CombinedOrder::Alphabetical);
      ExpectPlainFile(rows, expected);
    }
    if (::testing::Test::HasFailure()) return;
    if (grades.size() > 1) of_several_grades += rows.size();
  }
  EXPECT_GT(of_several_grades, std::size_t{kCompetitions});
}

}  // namespace
}  // namespace marlowbeck
