#include "session/sort_pass.h"

#include <filesystem>
#include <limits>
#include <random>

#include <gtest/gtest.h>

#include "data/channels.h"
#include "data/real_file_system.h"
#include "data/runtime_error.h"
#include "support/club.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

using Records = std::vector<ResultBytes>;

/// A results file and its work file in a folder of their own.
class SortPass : public ::testing::Test {
 protected:
  SortPass() { files_.ChangeFolder(TextOfPath(folder_.Path())); }

  void Write(const std::string& name, const Records& records) {
    Channels channels(files_);
    channels.OpenRandom(Channel::Results, name, kResultLength);
    for (std::size_t i = 0; i < records.size(); ++i) {
      channels.Put(Channel::Results, static_cast<int>(i) + 1, records[i]);
    }
    channels.CloseAll();
  }

  Records Read(const std::string& name) {
    Channels channels(files_);
    channels.OpenRandom(Channel::Results, name, kResultLength);
    Records records;
    channels.ForEachRecord(Channel::Results, [&](Bytes bytes, int) {
      std::copy(bytes.begin(), bytes.end(), records.emplace_back().begin());
    });
    channels.CloseAll();
    return records;
  }

  void Sort() {
    Channels channels(files_);
    SortResults(channels, "S_A.qzr", "S_A.qz3", [](int) {});
  }

  RealFileSystem files_;
  TemporaryFolder folder_;
};

ResultBytes Sheet(int id, double date) {
  ResultRecord record;
  record.ID = id;
  record.GameDate = Date{date};
  return Encode(record);
}

double DateOf(const ResultBytes& record) { return ResultView(record).GameDate().days; }

/// The pass written out plainly: the sorted, squeezed table of dates, then one walk through all
/// records for each date.
Records PlainPasses(const Records& records) {
  const int count = static_cast<int>(records.size());
  std::vector<double> table(records.size() + 10, 0.0);
  for (int i = 1; i <= count; ++i)
    table[static_cast<std::size_t>(i)] = DateOf(records[static_cast<std::size_t>(i - 1)]);
  for (int gap = count / 2; gap > 0; gap /= 2) {
    for (int i = gap; i <= count - 1; ++i) {
      int j = i - gap + 1;
      while (j > 0) {
        double& low = table[static_cast<std::size_t>(j)];
        double& high = table[static_cast<std::size_t>(j + gap)];
        if (!(low > high)) break;
        std::swap(low, high);
        j -= gap;
      }
    }
  }
  std::vector<double> distinct;
  for (int i = 1; i <= count; ++i) {
    const double next = i == count ? 0.0 : table[static_cast<std::size_t>(i + 1)];
    if (table[static_cast<std::size_t>(i)] != next)
      distinct.push_back(table[static_cast<std::size_t>(i)]);
  }
  Records sorted;
  for (const double date : distinct) {
    for (const ResultBytes& record : records) {
      if (DateOf(record) == date) sorted.push_back(record);
    }
  }
  return sorted;
}

TEST_F(SortPass, PutsDatesInOrderAndKeepsTheOrderOfEntryWithinOne) {
  Write("S_A.qzr", {Sheet(1, 38000), Sheet(2, 37993), Sheet(3, 38000), Sheet(4, 37993)});
  Sort();
  EXPECT_EQ(Read("S_A.qzr"),
            (Records{Sheet(2, 37993), Sheet(4, 37993), Sheet(1, 38000), Sheet(3, 38000)}));
}

TEST_F(SortPass, LeavesNoWorkFile) {
  Write("S_A.qzr", {Sheet(1, 38000), Sheet(2, 37993)});
  Sort();
  EXPECT_FALSE(files_.Exists("S_A.qz3"));
}

TEST_F(SortPass, TellsOfEveryRecordRead) {
  Write("S_A.qzr", {Sheet(1, 38000), Sheet(2, 37993), Sheet(3, 37990)});
  Channels channels(files_);
  std::vector<int> told;
  SortResults(channels, "S_A.qzr", "S_A.qz3", [&](int record) { told.push_back(record); });
  EXPECT_EQ(told, (std::vector<int>{1, 2, 3}));
}

TEST_F(SortPass, StaleWorkFileLeavesItsSurplusRecordsInTheResults) {
  Write("S_A.qz3", {Sheet(91, 1), Sheet(92, 1), Sheet(93, 1), Sheet(94, 1)});
  Write("S_A.qzr", {Sheet(1, 38000), Sheet(2, 37993)});
  Sort();
  EXPECT_EQ(Read("S_A.qzr"),
            (Records{Sheet(2, 37993), Sheet(1, 38000), Sheet(93, 1), Sheet(94, 1)}));
}

TEST_F(SortPass, BytesBehindTheLastWholeRecordAreDropped) {
  Write("S_A.qzr", {Sheet(1, 38000), Sheet(2, 37993)});
  files_.Open("S_A.qzr", OpenMode::ReadWrite)
      ->WriteAt(2 * kResultLength, Bytes(Sheet(3, 1)).first(40));
  Sort();
  EXPECT_EQ(fs::file_size(folder_.Path() / "S_A.qzr"), 2 * kResultLength);
}

TEST_F(SortPass, DateThatIsNoNumberLosesNoRecord) {
  const Records season = {Sheet(1, 38000), Sheet(2, std::numeric_limits<double>::quiet_NaN()),
                          Sheet(3, 37993)};
  Write("S_A.qzr", season);
  EXPECT_THROW(Sort(), RunTimeError);
  EXPECT_EQ(Read("S_A.qzr"), season);
}

TEST_F(SortPass, RandomSeasonsComeOutAsThePlainPassesLeaveThem) {
  std::mt19937 random(1804);
  for (int season = 0; season < 200; ++season) {
    Records records;
    const int count = static_cast<int>(random() % 60);
    for (int i = 0; i < count; ++i)
      records.push_back(Sheet(i, 37990.0 + static_cast<double>(random() % 8)));
    fs::remove(folder_.Path() / "S_A.qzr");
    Write("S_A.qzr", records);
    Sort();
    ASSERT_EQ(Read("S_A.qzr"), PlainPasses(records)) << "season " << season;
  }
}

}  // namespace
}  // namespace marlowbeck
