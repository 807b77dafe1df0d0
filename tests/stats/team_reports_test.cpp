#include "stats/team_reports.h"

#include <fstream>
#include <iterator>

#include <gtest/gtest.h>

#include "data/real_file_system.h"
#include "stats/plain_reports.h"
#include "stats/report_records.h"
#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

constexpr double kDay = 38063;

/// The reports over two files of a folder, with no screen.
class TeamReportsTest : public ::testing::Test {
 protected:
  TeamReportsTest() {
    files.ChangeFolder(folder.Path().string());
    session.PlayerFile = InFolder("W.qza");
    session.ResultsFile = InFolder("W_A.qzr");
    session.Grade = "A";
    session.Team = "Rovers";
    session.WorkDate = Date{kDay};
    Lay(competition);
  }
  void Lay(const Competition& laid) {
    std::ofstream(InFolder("W.qza"), std::ios::binary) << FileOf(laid.players);
    std::ofstream(InFolder("W_A.qzr"), std::ios::binary) << FileOf(laid.results);
  }
  [[nodiscard]] std::string InFolder(const std::string& name) const {
    return (folder.Path() / name).string();
  }
  [[nodiscard]] std::string SeasonFile() const {
    std::ifstream file(InFolder("progweek.qz3"), std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
  }

  Competition competition{
      {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A"),
       Person(3, "Clark", "Ed", "Hawks", "A")},
      {Night(1, "Rovers", "Hawks", kDay - 7, 500, 20), Night(1, "Rovers", "Hawks", kDay, 300, 10),
       Night(3, "Hawks", "Rovers", kDay, 90, 10), Night(2, "Rovers", "Owls", kDay + 7, 700, 10)}};
  TemporaryFolder folder;
  RealFileSystem files;
  Channels channels{files};
  Session session;
  TeamReports reports;
};

TEST_F(TeamReportsTest, ASeasonOfItsOwnReadsTheFilesItself) {
  const auto rows = reports.CalcProg(session, channels);
  const auto expected = plain::CalcProg(competition, "Rovers", "A", kDay);
  EXPECT_EQ(rows, expected);
  EXPECT_EQ(SeasonFile(), plain::ProgressiveFile(expected));
  EXPECT_EQ(session.RowCount, 2);
}

TEST_F(TeamReportsTest, ASeasonBehindItsNightIsTheSame) {
  reports.CalcWeekly(session, channels);
  EXPECT_EQ(reports.CalcProg(session, channels), plain::CalcProg(competition, "Rovers", "A", kDay));
}

TEST_F(TeamReportsTest, ASeasonBehindAnotherTeamsNightIsItsOwn) {
  session.Team = "Hawks";
  reports.CalcWeekly(session, channels);
  session.Team = "Rovers";
  EXPECT_EQ(reports.CalcProg(session, channels), plain::CalcProg(competition, "Rovers", "A", kDay));
}

TEST_F(TeamReportsTest, ASeasonAskedForAgainSeesWhatHasChanged) {
  reports.CalcWeekly(session, channels);
  (void)reports.CalcProg(session, channels);
  competition.results[1].Aggregate = 400;
  Lay(competition);
  EXPECT_EQ(reports.CalcProg(session, channels), plain::CalcProg(competition, "Rovers", "A", kDay));
}

TEST_F(TeamReportsTest, ANightThatFailedLeavesNothingToTheNextSeason) {
  reports.CalcWeekly(session, channels);
  competition.results.push_back(Night(1, "Rovers", "Hawks", kDay, 0, 0));
  Lay(competition);
  EXPECT_THROW(reports.CalcWeekly(session, channels), RunTimeError);
  channels.AbandonAll();
  EXPECT_EQ(reports.CalcProg(session, channels), plain::CalcProg(competition, "Rovers", "A", kDay));
}

}  // namespace
}  // namespace marlowbeck
