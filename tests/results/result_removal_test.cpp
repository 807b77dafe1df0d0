#include "results/result_removal.h"

#include "data/real_file_system.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

/// A results file and its copy in a folder of their own.
class ResultRemoval : public ::testing::Test {
 protected:
  ResultRemoval() { files_.ChangeFolder(TextOfPath(folder_.Path())); }

  std::string CopyWithout(const std::string& results, int number) {
    channels_.ReplaceWhole("S_A.qzr", results);
    channels_.OpenRandom(Channel::Results, "S_A.qzr", kResultLength);
    CopyResultsWithout(channels_, number, "S_A.qz3");
    return channels_.ReadWhole("S_A.qz3");
  }

  RealFileSystem files_;
  TemporaryFolder folder_;
  Channels channels_{files_};
};

TEST_F(ResultRemoval, LeavesOutEveryRecordInTurn) {
  std::vector<ResultRecord> results;
  for (int id = 1; id <= 5; ++id) results.push_back(Night(id, "Hawks", "Lions"));
  for (int number = 1; number <= 5; ++number) {
    std::vector<ResultRecord> others = results;
    others.erase(others.begin() + number - 1);
    channels_.ReplaceWhole("S_A.qz3", "");
    EXPECT_TRUE(SameResults(CopyWithout(FileOf(results), number), FileOf(others))) << number;
  }
}

TEST_F(ResultRemoval, OfOneRecordLeavesNone) {
  EXPECT_EQ(CopyWithout(FileOf(std::vector{Night(1, "Hawks", "Lions")}), 1), "");
}

TEST_F(ResultRemoval, LeavesTheResultsThemselvesAsTheyAreAndAllClosed) {
  const std::string results = FileOf(std::vector{Night(1, "Hawks", "Lions")}) + "rest";
  CopyWithout(results, 1);
  EXPECT_EQ(channels_.ReadWhole("S_A.qzr"), results);
  EXPECT_THROW(static_cast<void>(channels_.RecordCount(Channel::Results)), RunTimeError);
  EXPECT_THROW(static_cast<void>(channels_.RecordCount(Channel::Side)), RunTimeError);
}

TEST_F(ResultRemoval, KeepsTheLastRecordsOfALongerWorkFile) {
  const std::string stale(3 * kResultLength, 'x');
  channels_.ReplaceWhole("S_A.qz3", stale);
  const std::string one = FileOf(std::vector{Night(1, "Hawks", "Lions")});
  EXPECT_EQ(CopyWithout(one + one, 2), one + stale.substr(kResultLength));
}

TEST_F(ResultRemoval, WorksAtTheLimitOf32767Records) {
  std::string results(32767 * kResultLength, ' ');
  for (std::size_t at = 0; at < results.size(); ++at) results[at] = static_cast<char>(at / 148 * 7);
  const std::string others = CopyWithout(results, 20000);
  EXPECT_TRUE(others ==
              results.substr(0, 19999 * kResultLength) + results.substr(20000 * kResultLength));
}

}  // namespace
}  // namespace marlowbeck
