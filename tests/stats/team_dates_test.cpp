#include "stats/team_dates.h"

#include <cmath>

#include <gtest/gtest.h>

#include "stats/report_records.h"

namespace marlowbeck {
namespace {

std::vector<double> DaysOf(const std::vector<ResultRecord>& results) {
  std::vector<double> days;
  for (const Date date : DatesOf(results, "Rovers")) days.push_back(date.days);
  return days;
}

TEST(TeamDates, AreEachListedOnceAscendingWhateverTheOrderOfTheRecords) {
  EXPECT_EQ(
      DaysOf({Night(1, "Rovers", "Swifts", 300, 1, 1), Night(1, "Rovers", "Swifts", 100, 1, 1),
              Night(2, "Rovers", "Swifts", 300, 1, 1), Night(2, "Rovers", "Swifts", 200, 1, 1)}),
      (std::vector<double>{100, 200, 300}));
}

TEST(TeamDates, AreThoseOfTheTeamAlone) {
  EXPECT_EQ(
      DaysOf({Night(1, "Swifts", "Rovers", 300, 1, 1), Night(1, " Rovers ", "Swifts", 100, 1, 1),
              Night(2, "rovers", "Swifts", 200, 1, 1)}),
      (std::vector<double>{100}));
}

TEST(TeamDates, AreNoneWithoutResults) { EXPECT_TRUE(DaysOf({}).empty()); }

TEST(TeamDates, LeaveOutADateOfZeroThatNoOtherFollows) {
  EXPECT_TRUE(DaysOf({Night(1, "Rovers", "Swifts", 0, 1, 1)}).empty());
  EXPECT_EQ(DaysOf({Night(1, "Rovers", "Swifts", 5, 1, 1), Night(1, "Rovers", "Swifts", 0, 1, 1)}),
            (std::vector<double>{0, 5}));
}

TEST(TeamDates, OfNonsenseAreListedWithoutHarm) {
  EXPECT_EQ(DaysOf({Night(1, "Rovers", "Swifts", std::nan(""), 1, 1),
                    Night(1, "Rovers", "Swifts", 1e300, 1, 1),
                    Night(1, "Rovers", "Swifts", std::nan(""), 1, 1)})
                .size(),
            3U);
}

}  // namespace
}  // namespace marlowbeck
