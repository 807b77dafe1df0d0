#include "data/fault_file_system.h"

#include <span>
#include <string>

#include <gtest/gtest.h>

#include "data/real_file_system.h"
#include "tests/data/expect_error.h"
#include "tests/data/killed.h"
#include "tests/data/temporary_folder.h"

namespace marlowbeck {
namespace {

class Faults : public testing::Test {
 protected:
  Faults() {
    real.ChangeFolder(folder.Path());
    files.Plan().kill = [] { throw Killed{}; };
  }

  static std::span<const std::byte> BytesOf(const std::string& text) {
    return std::as_bytes(std::span(text));
  }
  void Write(const std::string& name, const std::string& text) {
    const auto file = files.Open(name, OpenMode::Truncate);
    file->WriteAt(0, BytesOf(text));
    file->Sync();
    file->Close();
  }
  FaultPlan& Plan() { return files.Plan(); }

  TemporaryFolder folder;
  RealFileSystem real;
  FaultFileSystem files{real};
};

TEST_F(Faults, WithoutAPlanEverythingWorksAndIsCounted) {
  Write("a", "text");
  files.Copy("a", "b");
  files.Rename("b", "c");
  files.Replace("c", "a");
  files.Delete("a");
  files.MakeFolder("sub");
  files.RemoveFolder("sub");
  EXPECT_EQ(Plan().Done(FileOperation::Open), 1);
  EXPECT_EQ(Plan().Done(FileOperation::Write), 1);
  EXPECT_EQ(Plan().Done(FileOperation::Sync), 1);
  EXPECT_EQ(Plan().Done(FileOperation::Close), 1);
  EXPECT_EQ(Plan().Done(FileOperation::Copy), 1);
  EXPECT_EQ(Plan().Done(FileOperation::Rename), 2) << "a replacement is a rename";
  EXPECT_EQ(Plan().Done(FileOperation::Delete), 1);
  EXPECT_EQ(Plan().Done(FileOperation::MakeFolder), 1);
  EXPECT_EQ(Plan().Done(FileOperation::RemoveFolder), 1);
  EXPECT_EQ(Plan().Done(FileOperation::Read), 0);
  EXPECT_EQ(Plan().DoneInAll(), 10);
}

TEST_F(Faults, TheNthOperationFailsAndDoesNothing) {
  Plan().FailAt(FileOperation::Write, 2, 61, false);
  Write("a", "first");
  EXPECT_ERROR(61, Write("a", "second"));
  EXPECT_EQ(folder.Read("a"), "") << "emptied by the opening, not written";
  Write("a", "third");
  EXPECT_EQ(folder.Read("a"), "third");
}

TEST_F(Faults, TheNthAndAllAfterFailUntilItIsTakenBack) {
  Plan().FailAt(FileOperation::Delete, 1, 70, true);
  Write("a", "");
  EXPECT_ERROR(70, files.Delete("a"));
  EXPECT_ERROR(70, files.Delete("a"));
  Plan().Off();
  files.Delete("a");
  EXPECT_FALSE(folder.Has("a"));
}

TEST_F(Faults, AnyOperationCountsWhereNoneIsNamed) {
  Plan().FailAt(std::nullopt, 3, 57, false);
  EXPECT_ERROR(57, Write("a", "text")) << "open, write, sync";
  EXPECT_EQ(folder.Read("a"), "text");
}

TEST_F(Faults, CountingStartsWhenTheFaultIsSet) {
  Write("a", "1");
  Plan().FailAt(FileOperation::Open, 1, 70, false);
  EXPECT_ERROR(70, Write("a", "2"));
  EXPECT_EQ(folder.Read("a"), "1");
}

TEST_F(Faults, SeveralFaultsWaitSideBySide) {
  Plan().FailAt(FileOperation::Open, 1, 70, false);
  Plan().FailAt(FileOperation::Write, 1, 61, false);
  EXPECT_ERROR(70, Write("a", "1"));
  EXPECT_ERROR(61, Write("a", "2"));
  Write("a", "3");
  EXPECT_EQ(folder.Read("a"), "3");
}

TEST_F(Faults, ACutWriteLeavesItsFirstBytes) {
  Plan().CutAt(1, 3, 61);
  EXPECT_ERROR(61, Write("a", "abcdef"));
  EXPECT_EQ(folder.Read("a"), "abc");
  Plan().CutAt(1, 100, 61);
  EXPECT_ERROR(61, Write("a", "abcdef"));
  EXPECT_EQ(folder.Read("a"), "abcdef");
}

TEST_F(Faults, ACopyCountsAsAWriteThatCanBeCut) {
  Write("a", "abcdef");
  Plan().CutAt(1, 2, 61);
  EXPECT_ERROR(61, files.Copy("a", "b"));
  EXPECT_EQ(folder.Read("b"), "ab");
  Plan().CutAt(1, static_cast<std::size_t>(-1), 61);
  EXPECT_ERROR(61, files.Copy("a", "b"));
  EXPECT_EQ(folder.Read("b"), "abcdef");
}

TEST_F(Faults, ARunsReplacementsAndItsSyncAreCountedAndFail) {
  Write("a", "new");
  Write("b", "old");
  Plan().FailAt(FileOperation::Rename, 1, 57, false);
  Plan().FailAt(FileOperation::Sync, 1, 61, false);
  EXPECT_ERROR(57, files.ReplaceUnsynced("a", "b"));
  EXPECT_ERROR(61, files.SyncFolder("."));
  files.ReplaceUnsynced("a", "b");
  EXPECT_EQ(folder.Read("b"), "new");
  EXPECT_EQ(Plan().Done(FileOperation::Rename), 2);
}

TEST_F(Faults, AWorkFileThatCannotBeDiscardedStays) {
  Write("a.txt", "x");
  Plan().FailAt(FileOperation::Delete, 1, 75, false);
  files.Discard("a.txt");
  EXPECT_TRUE(files.Exists("a.txt"));
  files.Discard("a.txt");
  EXPECT_FALSE(files.Exists("a.txt"));
  EXPECT_EQ(Plan().Done(FileOperation::Delete), 2);
}

TEST_F(Faults, AKillComesInThePlaceOfTheOperation) {
  Write("a", "old");
  Plan().CrashAt(FileOperation::Rename, 1);
  Write("new", "new");
  EXPECT_THROW(files.Replace("new", "a"), Killed);
  EXPECT_EQ(folder.Read("a"), "old");
  EXPECT_EQ(folder.Read("new"), "new");
}

TEST_F(Faults, ReadsOfAnOpenFileFailToo) {
  Write("a", "text");
  const auto file = files.Open("a", OpenMode::Read);
  Plan().FailAt(FileOperation::Read, 1, 57, false);
  std::array<std::byte, 4> bytes{};
  EXPECT_ERROR(57, (void)file->ReadAt(0, bytes));
  EXPECT_EQ(file->ReadAt(0, bytes), 4U);
}

TEST_F(Faults, OperationsHaveWords) {
  for (const char* word :
       {"open", "read", "write", "sync", "close", "delete", "rename", "copy", "mkdir", "rmdir"}) {
    const auto operation = FileOperationFromWord(word);
    ASSERT_TRUE(operation) << word;
    EXPECT_EQ(WordOf(*operation), word);
  }
  EXPECT_FALSE(FileOperationFromWord("any"));
}

}  // namespace
}  // namespace marlowbeck
