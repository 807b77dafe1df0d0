#include "stats/plain_reports.h"

#include <gtest/gtest.h>

#include "stats/random_competition.h"

namespace marlowbeck {
namespace {

constexpr int kCompetitions = 5000;

void ExpectPlainWeekly(const Competition& competition, const std::string& team, double date,
                       int& errors) {
  const plain::Weekly expected = plain::CalcWeekly(competition, team, date);
  const WeeklyResults weekly = Weekly(competition, team, date);
  EXPECT_EQ(weekly.Opposition(), expected.opposition);
  try {
    const auto rows = weekly.Rows();
    EXPECT_EQ(expected.error, 0);
    EXPECT_EQ(rows, expected.rows);
    SideFileWriter writer;
    WriteWeekly(writer, rows);
    EXPECT_EQ(writer.Content(), plain::WeeklyFile(expected.rows));
    SideFileReader reader(writer.Content());
    EXPECT_EQ(ReadWeekly(reader, static_cast<int>(rows.size())), rows);
  } catch (const RunTimeError& error) {
    EXPECT_EQ(error.Number(), expected.error);
    ++errors;
  }
}

void ExpectPlainProgressive(const Competition& competition, const std::string& team,
                            const std::string& grade, double until) {
  const auto expected = plain::CalcProg(competition, team, grade, until);
  const auto rows = Progressive(competition, team, grade, until);
  EXPECT_EQ(rows, expected);
  SideFileWriter writer;
  WriteProgressive(writer, rows);
  EXPECT_EQ(writer.Content(), plain::ProgressiveFile(expected));
}

void ExpectPlainDates(const Competition& competition, const std::string& team) {
  std::vector<double> days;
  for (const Date date : DatesOf(competition.results, team)) days.push_back(date.days);
  EXPECT_EQ(days, plain::GetDates(competition, team));
}

TEST(PlainReports, AreWhatTheComputationsAnswerForAnyCompetition) {
  int errors = 0;
  for (unsigned seed = 1; seed <= kCompetitions; ++seed) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    RandomCompetition chance(seed);
    const Competition competition = chance.Make();
    const std::string team = chance.Team();
    const std::string grade = chance.Grade();
    const double day = chance.Day();
    ExpectPlainWeekly(competition, team, day, errors);
    ExpectPlainProgressive(competition, team, grade, day);
    ExpectPlainDates(competition, team);
    if (::testing::Test::HasFailure()) return;
  }
  // Both ways have been gone.
  EXPECT_GT(errors, 0);
  EXPECT_LT(errors, kCompetitions / 2);
}

}  // namespace
}  // namespace marlowbeck
