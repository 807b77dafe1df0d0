// The lists over files of a folder, with no screen: the dates, the side files and what is counted.

#include "stats/grade_reports.h"

#include <fstream>
#include <iterator>

#include <gtest/gtest.h>

#include "data/real_file_system.h"
#include "stats/plain_lists.h"
#include "stats/random_competition.h"
#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

class GradeReportsTest : public ::testing::Test {
 protected:
  GradeReportsTest() {
    files.ChangeFolder(folder.Path().string());
    session.PlayerFile = InFolder("W.qza");
    session.ResultsFile = InFolder("W_A.qzr");
  }
  void Lay(const Competition& laid) {
    std::ofstream(InFolder("W.qza"), std::ios::binary) << FileOf(laid.players);
    std::ofstream(InFolder("W_A.qzr"), std::ios::binary) << FileOf(laid.results);
  }
  [[nodiscard]] std::string InFolder(const std::string& name) const {
    return (folder.Path() / name).string();
  }
  [[nodiscard]] std::string Written() const {
    std::ifstream file(InFolder("Highest.qz3"), std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
  }
  std::vector<double> Dates() {
    GetHiDates(session, channels);
    EXPECT_EQ(session.DateCount, static_cast<int>(session.TeamDates.size()));
    std::vector<double> days;
    for (const Date date : session.TeamDates) days.push_back(date.days);
    return days;
  }

  TemporaryFolder folder;
  RealFileSystem files;
  Channels channels{files};
  Session session;
};

TEST_F(GradeReportsTest, DatesAndSideFilesAreThoseOfThePlainLoopsForAnyFiles) {
  for (unsigned seed = 1; seed <= 500; ++seed) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    RandomCompetition chance(seed);
    Competition competition = chance.Make();
    for (ResultRecord& result : competition.results) {
      if (chance.Below(5) == 0) result.GameDate = Date{};
    }
    Lay(competition);
    EXPECT_EQ(Dates(), plain::GetHiDates(competition));
    session.WorkDate = Date{chance.Day()};
    for (session.ReportChoice = 0; session.ReportChoice <= 5; ++session.ReportChoice) {
      const double day = session.WorkDate.days;
      CalcHi(session, channels);
      const auto of_date = plain::CalcHi(competition, session.ReportChoice, day);
      EXPECT_EQ(Written(), plain::HighestFile(of_date));
      EXPECT_EQ(session.RowCount, static_cast<int>(of_date.size()));
      CalcHiProg(session, channels);
      const auto up_to_date = plain::CalcHiProg(competition, session.ReportChoice, day);
      EXPECT_EQ(Written(), plain::HighestFile(up_to_date));
      EXPECT_EQ(ReadHighestFile(session, channels), up_to_date);
    }
    if (::testing::Test::HasFailure()) return;
  }
}

TEST_F(GradeReportsTest, ADateOfNoneIsLeftOutAtTheEndAlone) {
  Lay({{}, {Night(1, "Rovers", "Hawks", 38063, 500, 20), Night(1, "Rovers", "Hawks", 0, 500, 20)}});
  EXPECT_EQ(Dates(), (std::vector<double>{38063}));
  Lay({{}, {Night(1, "Rovers", "Hawks", 0, 500, 20), Night(1, "Rovers", "Hawks", 38063, 500, 20)}});
  EXPECT_EQ(Dates(), (std::vector<double>{0, 38063}));
}

}  // namespace
}  // namespace marlowbeck
