#include "data/record_rewriting.h"

#include <functional>
#include <optional>
#include <string>

#include <gtest/gtest.h>

#include "data/fault_file_system.h"
#include "data/real_file_system.h"
#include "tests/data/expect_error.h"
#include "tests/data/killed.h"
#include "tests/data/temporary_folder.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kFourLetters = 4;
constexpr int kDiskFull = 61;

/// Files of records of four letters each.
class RecordRewritingTest : public testing::Test {
 protected:
  RecordRewritingTest() {
    real.ChangeFolder(folder.Path());
    files.Plan().kill = [] { throw Killed{}; };
  }

  /// Lets every operation of some work on the file "r" fail once: it is as before then, and the
  /// next try works.
  void FailEverywhere(const std::string& before, const std::string& after,
                      const std::function<void()>& work) {
    int nth = 1;
    for (bool failed = true; failed; ++nth) {
      ASSERT_LT(nth, 100);
      folder.Write("r", before);
      files.Plan().FailAt(std::nullopt, nth, kDiskFull, false);
      failed = ErrorOf(work) == kDiskFull;
      files.Plan().Off();
      channels.AbandonAll();
      EXPECT_EQ(folder.Read("r"), failed ? before : after) << "operation " << nth;
      if (!failed) break;
      EXPECT_EQ(ErrorOf(work), 0);
      EXPECT_EQ(folder.Read("r"), after) << "operation " << nth;
    }
    EXPECT_GT(nth, 5);
  }

  /// Lets the process be killed in the place of every operation.
  void KillEverywhere(const std::string& before, const std::string& after,
                      const std::function<void()>& work) {
    int nth = 1;
    for (bool killed = true; killed; ++nth) {
      ASSERT_LT(nth, 100);
      folder.Write("r", before);
      files.Plan().CrashAt(std::nullopt, nth);
      killed = false;
      try {
        work();
      } catch (const Killed&) {
        killed = true;
      }
      files.Plan().Off();
      channels.AbandonAll();
      EXPECT_EQ(folder.Read("r"), killed ? before : after) << "operation " << nth;
    }
    EXPECT_GT(nth, 5);
  }

  TemporaryFolder folder;
  RealFileSystem real;
  FaultFileSystem files{real};
  Channels channels{files};
};

/// Those that begin with an "x" are to go.
class RecordRemovalTest : public RecordRewritingTest {
 protected:
  void Remove(const std::string& name = "r") {
    channels.OpenRandom(Channel::Results, name, kFourLetters);
    RemoveRecords(channels, Channel::Results,
                  [](Bytes record, int) { return ReadText(record, 0, 1) == "x"; });
  }
  std::string After(const std::string& content) {
    folder.Write("r", content);
    Remove();
    return folder.Read("r");
  }
};

TEST_F(RecordRemovalTest, OthersMoveUpInTheirOrder) {
  EXPECT_EQ(After("aaaaxxxxbbbbx123cccc"), "aaaabbbbcccc");
  EXPECT_FALSE(folder.Has("TEMP.RES"));
}

TEST_F(RecordRemovalTest, TheLastOnesLeaveAnEmptyFile) {
  EXPECT_EQ(After("xxxx"), "");
  EXPECT_EQ(After(""), "");
}

TEST_F(RecordRemovalTest, BytesBehindTheLastWholeRecordGo) {
  EXPECT_EQ(After("aaaaxxxxbb"), "aaaa");
}

TEST_F(RecordRemovalTest, RecordsAreNumberedFromOne) {
  folder.Write("r", "aaaabbbbcccc");
  channels.OpenRandom(Channel::Players, "r", kFourLetters);
  RemoveRecords(channels, Channel::Players, [](Bytes, int number) { return number == 2; });
  EXPECT_EQ(folder.Read("r"), "aaaacccc");
}

TEST_F(RecordRemovalTest, AllChannelsAreClosed) {
  folder.Write("r", "aaaa");
  folder.Write("p", "pppp");
  channels.OpenRandom(Channel::Players, "p", kFourLetters);
  Remove();
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Players));
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Results));
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Side));
}

TEST_F(RecordRemovalTest, AStaleWorkFileLeavesItsRecordsBehindTheNewOnes) {
  folder.Write("TEMP.RES", "11112222333344");
  EXPECT_EQ(After("aaaaxxxxbbbb"), "aaaabbbb333344");
}

TEST_F(RecordRemovalTest, TheWorkFileLiesBesideTheFile) {
  real.MakeFolder("season");
  folder.Write("season/r", "aaaaxxxx");
  folder.Write("season/temp.res", "111122223333");
  Remove("season/r");
  EXPECT_EQ(folder.Read("season/r"), "aaaa22223333");
  EXPECT_FALSE(folder.Has("season/temp.res"));
}

TEST_F(RecordRemovalTest, ACopyThatCannotTakeItsPlaceIsLeftBehind) {
  folder.Write("r", "aaaaxxxxbbbb");
  files.Plan().FailAt(FileOperation::Rename, 1, 74, false);
  EXPECT_ERROR(74, Remove());
  EXPECT_EQ(folder.Read("r"), "aaaaxxxxbbbb");
  EXPECT_EQ(folder.Read("TEMP.RES"), "aaaabbbb");
}

TEST_F(RecordRemovalTest, ACopyThatIsCutShortIsNot) {
  folder.Write("r", "aaaaxxxxbbbb");
  files.Plan().CutAt(1, 6, kDiskFull);
  EXPECT_ERROR(kDiskFull, Remove());
  EXPECT_EQ(folder.Read("r"), "aaaaxxxxbbbb");
  EXPECT_FALSE(folder.Has("TEMP.RES"));
}

TEST_F(RecordRemovalTest, AFailureAnywhereLeavesTheOldFile) {
  FailEverywhere("aaaaxxxxbbbb", "aaaabbbb", [this] { Remove(); });
}

TEST_F(RecordRemovalTest, AKillAnywhereLeavesTheOldFileOrTheNewOne) {
  KillEverywhere("aaaaxxxxbbbb", "aaaabbbb", [this] { Remove(); });
}

/// A copy to a work file of a name of its own, without one record.
class RecordCopyTest : public RecordRewritingTest {
 protected:
  std::string CopyWithout(const std::string& content, int doomed,
                          std::size_t length = kFourLetters) {
    folder.Write("r", content);
    channels.OpenRandom(Channel::Results, "r", length);
    CopyRecordsWithout(
        channels, Channel::Results, [=](Bytes, int number) { return number == doomed; }, "copy");
    return folder.Read("copy");
  }
};

TEST_F(RecordCopyTest, LeavesOutEveryRecordInTurn) {
  const std::string records = "aaaabbbbccccddddeeee";
  for (int number = 1; number <= 5; ++number) {
    std::string others = records;
    others.erase((static_cast<std::size_t>(number) - 1) * kFourLetters, kFourLetters);
    folder.Write("copy", "");
    EXPECT_EQ(CopyWithout(records, number), others) << number;
  }
}

TEST_F(RecordCopyTest, OfOneRecordLeavesNone) { EXPECT_EQ(CopyWithout("aaaa", 1), ""); }

TEST_F(RecordCopyTest, LeavesTheFileItselfAsItIsAndAllClosed) {
  CopyWithout("aaaabbbbccc", 1);
  EXPECT_EQ(folder.Read("r"), "aaaabbbbccc");
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Results));
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Side));
}

TEST_F(RecordCopyTest, KeepsTheLastRecordsOfALongerWorkFile) {
  folder.Write("copy", "111122223333");
  EXPECT_EQ(CopyWithout("aaaabbbb", 2), "aaaa22223333");
}

TEST_F(RecordCopyTest, ThatIsCutShortIsDeleted) {
  files.Plan().CutAt(1, 6, kDiskFull);
  EXPECT_ERROR(kDiskFull, (void)CopyWithout("aaaabbbbcccc", 2));
  EXPECT_FALSE(folder.Has("copy"));
}

TEST_F(RecordCopyTest, WorksAtTheLimitOf32767Records) {
  std::string records(32767 * kResultLength, ' ');
  for (std::size_t at = 0; at < records.size(); ++at) records[at] = static_cast<char>(at / 148 * 7);
  const std::string others = CopyWithout(records, 20000, kResultLength);
  EXPECT_TRUE(others ==
              records.substr(0, 19999 * kResultLength) + records.substr(20000 * kResultLength));
}

/// Those that begin with an "x" become one of "y"s.
class RecordChangeTest : public RecordRewritingTest {
 protected:
  void ChangeThem() {
    channels.OpenRandom(Channel::Results, "r", kFourLetters);
    ChangeRecords(channels, Channel::Results, [](std::span<std::byte> record) {
      if (ReadText(record, 0, 1) != "x") return false;
      WriteText(record, {"", 0, kFourLetters, FieldKind::Text}, "yyyyy");
      return true;
    });
  }
  std::string After(const std::string& content) {
    folder.Write("r", content);
    ChangeThem();
    return folder.Read("r");
  }
};

TEST_F(RecordChangeTest, OthersStayAsTheyAre) {
  EXPECT_EQ(After("aaaaxxxxbbbbx123"), "aaaayyyybbbbyyyy");
  EXPECT_EQ(After("aaaa"), "aaaa");
  EXPECT_EQ(After(""), "");
}

TEST_F(RecordChangeTest, BytesBehindTheLastWholeRecordStay) {
  EXPECT_EQ(After("xxxxaaaaxx"), "yyyyaaaaxx");
  EXPECT_EQ(After("xx"), "xx");
}

TEST_F(RecordChangeTest, AFileWithoutAChangeIsNotWritten) {
  files.Plan().FailAt(FileOperation::Write, 1, kDiskFull, true);
  EXPECT_EQ(After("aaaabbbb"), "aaaabbbb");
}

TEST_F(RecordChangeTest, AFailureAnywhereLeavesTheOldFile) {
  FailEverywhere("aaaaxxxx", "aaaayyyy", [this] { ChangeThem(); });
}

TEST_F(RecordChangeTest, AKillAnywhereLeavesTheOldFileOrTheNewOne) {
  KillEverywhere("aaaaxxxx", "aaaayyyy", [this] { ChangeThem(); });
}

TEST_F(RecordChangeTest, AllChannelsAreClosed) {
  folder.Write("r", "aaaa");
  ChangeThem();
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Results));
}

}  // namespace
}  // namespace marlowbeck
