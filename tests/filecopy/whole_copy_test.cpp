#include "filecopy/whole_copy.h"

#include <chrono>
#include <filesystem>
#include <fstream>
#include <iterator>

#include <gtest/gtest.h>

#include "data/expect_error.h"
#include "data/fault_file_system.h"
#include "data/real_file_system.h"
#include "data/runtime_error.h"
#include "data/text.h"
#include "support/club.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

/// Stands for the end of the process.
struct Killed {};

class FilledFolder {
 public:
  [[nodiscard]] std::string Path() const { return folder_.Path().string(); }
  [[nodiscard]] std::string In(const std::string& name) const {
    return (folder_.Path() / name).string();
  }
  void Write(const std::string& name, const std::string& content) const {
    std::ofstream(folder_.Path() / name, std::ios::binary) << content;
  }
  /// The bytes of a file; "(none)" when it is not there.
  [[nodiscard]] std::string Read(const std::string& name) const {
    std::ifstream file(folder_.Path() / name, std::ios::binary);
    if (!file) return "(none)";
    return {std::istreambuf_iterator<char>(file), {}};
  }

 private:
  TemporaryFolder folder_;
};

class WholeCopy : public testing::Test {
 protected:
  WholeCopy() {
    fs::create_directory(folder.In("from"));
    fs::create_directory(folder.In("to"));
    files.Plan().kill = [] { throw Killed{}; };
  }
  void Copy(const std::string& name) {
    CopyWhole(files, folder.In("from/" + name), folder.In("to"));
  }
  std::vector<std::string> Target() {
    std::vector<std::string> names;
    for (const FolderEntry& entry : real.List(folder.In("to"))) names.push_back(entry.name);
    return names;
  }
  using Names = std::vector<std::string>;

  FilledFolder folder;
  RealFileSystem real;
  FaultFileSystem files{real};
};

TEST_F(WholeCopy, HasTheBytesTheNameAndTheTime) {
  folder.Write("from/Winter.qza", "players");
  const auto changed = fs::last_write_time(folder.In("from/Winter.qza")) - std::chrono::hours(99);
  fs::last_write_time(folder.In("from/Winter.qza"), changed);
  Copy("Winter.qza");
  EXPECT_EQ(Target(), Names{"Winter.qza"});
  EXPECT_EQ(folder.Read("to/Winter.qza"), "players");
  EXPECT_EQ(fs::last_write_time(folder.In("to/Winter.qza")), changed);
}

TEST_F(WholeCopy, TakesThePlaceOfAShorterAndOfALongerFile) {
  folder.Write("from/a", "seven..");
  for (const char* before : {"", "a longer one than that"}) {
    folder.Write("to/a", before);
    Copy("a");
    EXPECT_EQ(folder.Read("to/a"), "seven..");
  }
}

/// Whatever fails, and wherever, the file before is there whole, or none.
TEST_F(WholeCopy, ThatFailsLeavesWhatWasThere) {
  folder.Write("from/a", "the new one");
  for (const bool was_there : {false, true}) {
    for (const auto operation : {FileOperation::Copy, FileOperation::Rename}) {
      fs::remove(folder.In("to/a"));
      if (was_there) folder.Write("to/a", "old");
      files.Plan().FailAt(operation, 1, 57, false);
      EXPECT_ERROR(57, Copy("a"));
      EXPECT_EQ(folder.Read("to/a"), was_there ? "old" : "(none)");
      EXPECT_EQ(Target(), was_there ? Names{"a"} : Names{}) << WordOf(operation);
    }
  }
}

TEST_F(WholeCopy, ThatIsCutShortLeavesNoPartOfIt) {
  folder.Write("from/a", "the new one");
  folder.Write("to/a", "old");
  for (const std::size_t bytes : {0U, 1U, 5U, 11U}) {
    files.Plan().CutAt(1, bytes, 61);
    EXPECT_ERROR(61, Copy("a"));
    EXPECT_EQ(folder.Read("to/a"), "old");
    EXPECT_EQ(Target(), Names{"a"});
  }
}

TEST_F(WholeCopy, EndedByAPowerCutLeavesTheOldOrTheNewUnderItsName) {
  folder.Write("from/a", "the new one");
  for (const auto operation : {FileOperation::Copy, FileOperation::Rename}) {
    folder.Write("to/a", "old");
    files.Plan().CrashAt(operation, 1);
    EXPECT_THROW(Copy("a"), Killed);
    EXPECT_EQ(folder.Read("to/a"), "old");
  }
  Copy("a");
  EXPECT_EQ(folder.Read("to/a"), "the new one");
}

TEST_F(WholeCopy, TouchesNoFileThatHasTheNameOfItsWorkFile) {
  folder.Write("from/a", "new");
  folder.Write("from/QzCopy.tmp", "somebody's");
  folder.Write("to/qzcopy.TMP", "mine");
  folder.Write("to/QzCopy1.tmp", "mine too");
  Copy("a");
  EXPECT_EQ(folder.Read("to/qzcopy.TMP"), "mine");
  EXPECT_EQ(folder.Read("to/QzCopy1.tmp"), "mine too");
  EXPECT_EQ(Target().size(), 3U);
  Copy("QzCopy.tmp");
  EXPECT_EQ(folder.Read("to/qzcopy.TMP"), "somebody's") << "one name, in whatever capitals";
  EXPECT_EQ(Target().size(), 3U);
}

TEST_F(WholeCopy, OfAReadOnlyFileIsMadeAndCleanedUpLikeAnyOther) {
  folder.Write("from/a", "new");
  fs::permissions(folder.In("from/a"), fs::perms::owner_read);
  files.Plan().FailAt(FileOperation::Rename, 1, 57, false);
  EXPECT_ERROR(57, Copy("a"));
  EXPECT_EQ(Target(), Names{});
  Copy("a");
  EXPECT_EQ(folder.Read("to/a"), "new");
}

TEST_F(WholeCopy, NeverTakesThePlaceOfAReadOnlyFile) {
  folder.Write("from/a", "new");
  folder.Write("to/a", "kept");
  fs::permissions(folder.In("to/a"), fs::perms::owner_read);
  EXPECT_ERROR(70, Copy("a"));
  EXPECT_EQ(folder.Read("to/a"), "kept");
  EXPECT_EQ(Target(), Names{"a"});
}

TEST_F(WholeCopy, OntoAFolderIsAnAccessError) {
  folder.Write("from/a", "new");
  fs::create_directory(folder.In("to/a"));
  EXPECT_ERROR(75, Copy("a"));
  EXPECT_EQ(Target(), Names{"a"});
}

TEST_F(WholeCopy, OfAFileThatHasGoneIsNotFound) {
  EXPECT_ERROR(53, Copy("gone"));
  EXPECT_EQ(Target(), Names{});
}

TEST_F(WholeCopy, IntoAFolderThatHasGoneHasNoPath) {
  folder.Write("from/a", "new");
  fs::remove(folder.In("to"));
  EXPECT_ERROR(76, Copy("a"));
}

TEST_F(WholeCopy, WorksWithNamesOfEveryKind) {
  const std::string longest = std::string(251, 'x') + ".qza";
  for (const std::string& name :
       {longest, std::string("two words [1] (copy) 100%.qza"),
        std::string("Pr\xC3\xA9-\xC3\x9C.qza"), std::string("\u0141\u00F3d\u017A \u65E5\u672C.qza"),
        std::string("no UTF-8 \xFF.qza")}) {
    folder.Write("from/" + name, name);
    CopyWhole(files, folder.In("from/") + TextOfName(name), folder.In("to"));
    EXPECT_EQ(folder.Read("to/" + name), name);
  }
  EXPECT_EQ(Target().size(), 5U);
}

TEST_F(WholeCopy, OfALinkIsAFileOfItsOwn) {
  folder.Write("from/a", "text");
  fs::create_symlink(folder.In("from/a"), folder.In("from/link"));
  Copy("link");
  EXPECT_FALSE(fs::is_symlink(folder.In("to/link")));
  EXPECT_EQ(folder.Read("to/link"), "text");
}

TEST_F(WholeCopy, OntoALinkToItsOwnSourceLosesNothing) {
  folder.Write("from/a", "text");
  fs::create_symlink(folder.In("from/a"), folder.In("to/a"));
  Copy("a");
  EXPECT_EQ(folder.Read("from/a"), "text");
  EXPECT_EQ(folder.Read("to/a"), "text");
}

class EmptyFiles : public WholeCopy {};

TEST_F(EmptyFiles, AloneAreDeletedAndThoseThatAreNamed) {
  for (const char* name : {"a", "b", "c"}) folder.Write(std::string("to/") + name, "");
  folder.Write("to/full", "x");
  fs::create_symlink(folder.In("nowhere"), folder.In("to/dangling"));
  DeleteEmptyFiles(files, folder.In("to"), {"a", "c", "dangling", "full", "gone"});
  EXPECT_EQ(Target(), (Names{"b", "dangling", "full"}));
}

TEST_F(EmptyFiles, ThatCannotBeDeletedAreTold) {
  folder.Write("to/a", "");
  files.Plan().FailAt(FileOperation::Delete, 1, 70, false);
  EXPECT_ERROR(70, DeleteEmptyFiles(files, folder.In("to"), {"a"}));
}

TEST_F(WholeCopy, NearestFolderIsTheFirstThatIsThereOnTheWayUp) {
  EXPECT_EQ(NearestFolder(files, folder.In("to")), folder.In("to"));
  EXPECT_EQ(NearestFolder(files, folder.In("to/x")), folder.In("to"));
  EXPECT_EQ(NearestFolder(files, folder.In("x/y/z")), folder.Path());
  EXPECT_EQ(NearestFolder(files, "/no such/folder"), "/");
}

}  // namespace
}  // namespace marlowbeck
