#include "results/date_change.h"

#include <gtest/gtest.h>

#include "support/league.h"

namespace marlowbeck {
namespace {

const DateChange kChange{"Hawks", "Lions", March(24), March(31)};

bool Blocks(const ResultRecord& result) {
  const auto bytes = Encode(result);
  return StandsInTheWay(ResultView(bytes), kChange);
}

Date On(int year, int month, int day) { return *DateFromCivil({year, month, day}); }

TEST(DateChange, AYearOfTwoDigitsIsOneOf1930To2029) {
  EXPECT_EQ(InTwoDigitYears(On(2004, 3, 31)), On(2004, 3, 31));
  EXPECT_EQ(InTwoDigitYears(On(2000, 1, 1)), On(2000, 1, 1));
  EXPECT_EQ(InTwoDigitYears(On(2029, 12, 31)), On(2029, 12, 31));
  EXPECT_EQ(InTwoDigitYears(On(2030, 1, 1)), On(1930, 1, 1));
  EXPECT_EQ(InTwoDigitYears(On(1999, 12, 31)), On(1999, 12, 31));
  EXPECT_EQ(InTwoDigitYears(On(1929, 6, 1)), On(2029, 6, 1));
  EXPECT_EQ(InTwoDigitYears(On(2104, 3, 31)), On(2004, 3, 31));
}

TEST(DateChange, ATimeOfDayIsDropped) {
  EXPECT_EQ(InTwoDigitYears(Date{March(31).days + 0.75}), March(31));
}

TEST(DateChange, ALeapDayComesBack) {
  EXPECT_EQ(InTwoDigitYears(On(2000, 2, 29)), On(2000, 2, 29));
  EXPECT_EQ(InTwoDigitYears(On(2096, 2, 29)), On(1996, 2, 29));
}

TEST(DateChange, AResultOfTheTeamOnTheNewDateStandsInTheWayOnEitherSide) {
  EXPECT_TRUE(Blocks(Night(11, "Hawks", "Rovers", 31)));
  EXPECT_TRUE(Blocks(Night(31, "Cubs", "Hawks", 31)));
  EXPECT_TRUE(Blocks(Night(11, "Hawks", "Lions", 31)));
}

TEST(DateChange, TheOppositionAloneOnTheNewDateDoesNotStandInTheWay) {
  EXPECT_FALSE(Blocks(Night(21, "Lions", "Cubs", 31)));
  EXPECT_FALSE(Blocks(Night(31, "Cubs", "Lions", 31)));
}

TEST(DateChange, OtherDatesDoNotStandInTheWay) {
  EXPECT_FALSE(Blocks(Night(11, "Hawks", "Lions", 24)));
  EXPECT_FALSE(Blocks(Night(11, "Hawks", "Lions", 17)));
}

TEST(DateChange, MovesTheResultsOfBothSidesAndNoOthers) {
  std::vector<ResultRecord> results = {
      Night(11, "Hawks", "Lions", 24), Night(21, "Lions", "Hawks", 24),
      Night(12, "Hawks", "Cubs", 24),  Night(31, "Cubs", "Lions", 24),
      Night(11, "Hawks", "Lions", 17), Night(21, "Lions", "Rovers", 24),
      Night(12, "Hawks", "Lions", 24)};
  std::string file = FileOf(results);
  EXPECT_TRUE(MoveMatch(file, kChange));
  for (const std::size_t moved : {0U, 1U, 6U}) results[moved].GameDate = March(31);
  EXPECT_TRUE(SameResults(file, FileOf(results)));
}

TEST(DateChange, ChangesNoOtherByteOfARecord) {
  std::string file(kResultLength, '\0');
  for (std::size_t i = 0; i < file.size(); ++i) file[i] = static_cast<char>(i * 7 + 1);
  const ResultRecord match = Night(11, "Hawks", "Lions", 24);
  const auto bytes = Encode(match);
  // The names and the date are the match's, all else is nonsense.
  for (std::size_t i = 4; i < 64; ++i) file[i] = static_cast<char>(bytes[i]);
  for (std::size_t i = 84; i < 92; ++i) file[i] = static_cast<char>(bytes[i]);
  file += "a record cut short";
  const std::string before = file;
  EXPECT_TRUE(MoveMatch(file, kChange));
  EXPECT_EQ(file.size(), before.size());
  for (std::size_t i = 0; i < file.size(); ++i) {
    if (i >= 84 && i < 92) continue;
    EXPECT_EQ(file[i], before[i]) << "byte " << i;
  }
  EXPECT_EQ(ResultsIn(file)[0].GameDate, March(31));
}

TEST(DateChange, WithoutAResultOfTheMatchNothingChanges) {
  std::string file = FileOf({Night(11, "Hawks", "Cubs", 24)});
  const std::string before = file;
  EXPECT_FALSE(MoveMatch(file, kChange));
  EXPECT_EQ(file, before);
  std::string empty;
  EXPECT_FALSE(MoveMatch(empty, kChange));
}

}  // namespace
}  // namespace marlowbeck
