#include "stats/plain_reports.h"

#include <random>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

constexpr int kCompetitions = 5000;

/// Makes small competitions in which everything that can go together does: ties, forfeits, players
/// gone and moved, doubled ids, blank names, figures at the ends of their range, dates out of
/// order.
class Chance {
 public:
  explicit Chance(unsigned seed) : engine_(seed) {}

  Competition Make() {
    Competition competition;
    const int players = Below(14);
    for (int i = 0; i < players; ++i) competition.players.push_back(MakePlayer());
    const int results = Below(60);
    for (int i = 0; i < results; ++i) competition.results.push_back(MakeResult());
    return competition;
  }

  int Below(int end) { return std::uniform_int_distribution<int>(0, end - 1)(engine_); }
  std::string Team() { return OneOf({"Rovers", "Swifts", "", "rovers"}); }
  std::string Grade() { return OneOf({"A", "B"}); }
  double Day() { return 38063 + 7 * Below(4); }

 private:
  std::string OneOf(const std::vector<std::string>& words) {
    return words[static_cast<std::size_t>(Below(static_cast<int>(words.size())))];
  }

  PlayerRecord MakePlayer() {
    return Person(Below(10), OneOf({"Archer", "Baker", "", "O\"Brien", "Day, Lee", " Low "}),
                  OneOf({"Jo", "", "A.*", "Al \"Ace\""}), Team(), Grade());
  }

  /// Mostly the figures of a night, so that averages meet; now and then the end of the range.
  std::int16_t Figure() {
    switch (Below(12)) {
      case 0:
        return 32767;
      case 1:
        return -32768;
      case 2:
        return 0;
      default:
        return static_cast<std::int16_t>(10 * (1 + Below(3)));
    }
  }

  ResultRecord MakeResult() {
    ResultRecord result = Night(Below(12), Team(), OneOf({"Hawks", "Swifts", ""}), Day(), Figure(),
                                Below(9) == 0 ? Figure() : 1 + Below(4));
    if (Below(6) == 0) result.Forfeit = OneOf({"F", " F", "f"});
    result.HighScore = Figure();
    result.Centuries = Figure();
    result.Scores180 = Figure();
    for (std::int16_t& peg : result.Pegs) peg = Below(2) == 0 ? Figure() : std::int16_t{0};
    return result;
  }

  std::mt19937 engine_;
};

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
    Chance chance(seed);
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
