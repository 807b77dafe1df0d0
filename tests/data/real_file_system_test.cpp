#include "data/real_file_system.h"

#include <sys/stat.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <span>

#include <gtest/gtest.h>

#include "data/text.h"
#include "tests/data/expect_error.h"
#include "tests/data/temporary_folder.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

class RealFiles : public testing::Test {
 protected:
  RealFiles() { files.ChangeFolder(folder.Path()); }

  static std::span<const std::byte> BytesOf(const std::string& text) {
    return std::as_bytes(std::span(text));
  }
  void Write(const std::string& path, const std::string& text) {
    const auto file = files.Open(path, OpenMode::Truncate);
    file->WriteAt(0, BytesOf(text));
    file->Close();
  }
  std::string Read(const std::string& path) {
    const auto file = files.Open(path, OpenMode::Read);
    std::string text(static_cast<std::size_t>(file->Length()), '\0');
    EXPECT_EQ(file->ReadAt(0, std::as_writable_bytes(std::span(text))), text.size());
    return text;
  }
  void Open(const std::string& path, OpenMode mode) { (void)files.Open(path, mode); }

  TemporaryFolder folder;
  RealFileSystem files;
};

/// Somebody with no rights of their own for as long as it lives, where the tests run as root.
class Nobody {
 public:
  Nobody() : was_root_(geteuid() == 0) {
    if (was_root_ && seteuid(65534) != 0) was_root_ = false;
  }
  Nobody(const Nobody&) = delete;
  Nobody& operator=(const Nobody&) = delete;
  ~Nobody() {
    if (was_root_) (void)!seteuid(0);
  }

 private:
  bool was_root_;
};

TEST_F(RealFiles, ReadsAndWritesAtPositions) {
  const auto file = files.Open("a.bin", OpenMode::ReadWrite);
  EXPECT_EQ(file->Length(), 0U);
  file->WriteAt(3, BytesOf("xyz"));
  file->WriteAt(0, BytesOf("ab"));
  file->Sync();
  EXPECT_EQ(file->Length(), 6U);
  std::string text(10, '?');
  EXPECT_EQ(file->ReadAt(0, std::as_writable_bytes(std::span(text))), 6U);
  EXPECT_EQ(text.substr(0, 6), std::string("ab\0xyz", 6));
  EXPECT_EQ(file->ReadAt(6, std::as_writable_bytes(std::span(text))), 0U);
  file->Close();
}

TEST_F(RealFiles, ReadWriteKeepsWhatIsThereAndTruncateDoesNot) {
  Write("a.txt", "old");
  Open("a.txt", OpenMode::ReadWrite);
  EXPECT_EQ(Read("a.txt"), "old");
  Open("a.txt", OpenMode::Truncate);
  EXPECT_EQ(Read("a.txt"), "");
}

TEST_F(RealFiles, NamesAreFoundInAnyCase) {
  Write("WkDate.qz3", "date");
  EXPECT_EQ(Read("WKDATE.QZ3"), "date");
  EXPECT_TRUE(files.Exists("wkdate.qz3"));
  Write("wkdate.QZ3", "other");
  EXPECT_EQ(files.List(folder.Path()).size(), 1U) << "all spellings are the one file";
  files.MakeFolder("Club");
  Write("CLUB/Winter.qza", "players");
  EXPECT_EQ(Read(folder.Path() + "/club/WINTER.QZA"), "players");
  files.Delete("cLUB/winter.qza");
  EXPECT_FALSE(files.Exists("Club/Winter.qza"));
}

TEST_F(RealFiles, LettersOfTheCodePageAreFoundInAnyCaseToo) {
  Write("\xC9quipe.qza", "players");
  EXPECT_EQ(Read("\xE9QUIPE.QZA"), "players");
  EXPECT_TRUE(folder.Has("\u00C9quipe.qza")) << "as Unicode on the disk";
}

TEST_F(RealFiles, TheSpellingAskedForComesFirstWhereTheDiskHoldsSeveral) {
  folder.Write("A.txt", "upper");
  folder.Write("a.txt", "lower");
  EXPECT_EQ(Read("a.txt"), "lower");
  EXPECT_EQ(Read("A.txt"), "upper");
}

TEST_F(RealFiles, ANameBeyondTheCodePageIsFoundUnderItsOwnTextAlone) {
  folder.Write("\u0142.txt", "first");
  folder.Write("\u0143.txt", "second");
  folder.Write("\xFF.txt", "third");
  const auto listed = files.List(folder.Path());
  ASSERT_EQ(listed.size(), 3U);
  EXPECT_EQ(Read(listed[0].name), "first");
  EXPECT_EQ(Read(listed[1].name), "second");
  EXPECT_EQ(Read(listed[2].name), "third");
  EXPECT_ERROR(53, Open("?.txt", OpenMode::Read));
  Write("?.txt", "fourth");
  EXPECT_EQ(folder.Read("\u0142.txt"), "first");
}

TEST_F(RealFiles, LettersBeyondTheCodePageDoNotHideTheCaseOfOthers) {
  folder.Write("\u0141OD.qza", "players");
  EXPECT_EQ(Read(TextOfName("\u0141od.QZA")), "players");
  EXPECT_ERROR(53, Open(TextOfName("\u0142OD.qza"), OpenMode::Read));
}

TEST_F(RealFiles, AMissingFileIsNotFoundAndAMissingFolderIsNoPath) {
  EXPECT_ERROR(53, Open("none.txt", OpenMode::Read));
  EXPECT_ERROR(76, Open("nowhere/none.txt", OpenMode::Read));
  EXPECT_ERROR(76, Open("nowhere/none.txt", OpenMode::ReadWrite));
  EXPECT_ERROR(76, Open("nowhere/none.txt", OpenMode::Truncate));
  EXPECT_ERROR(53, files.Delete("none.txt"));
  EXPECT_ERROR(76, files.Delete("nowhere/none.txt"));
  EXPECT_ERROR(53, files.Rename("none.txt", "b.txt"));
  EXPECT_ERROR(53, files.Replace("none.txt", "b.txt"));
  EXPECT_ERROR(53, files.Copy("none.txt", "b.txt"));
  EXPECT_ERROR(76, files.ChangeFolder("nowhere"));
  EXPECT_ERROR(76, files.RemoveFolder("nowhere"));
  Write("a.txt", "a");
  EXPECT_ERROR(76, files.Copy("a.txt", "nowhere/b.txt"));
  EXPECT_ERROR(76, Open("a.txt/b.txt", OpenMode::Read)) << "a file in the place of a folder";
}

TEST_F(RealFiles, NamesThatAreNoneAreBad) {
  EXPECT_ERROR(52, Open("", OpenMode::Read));
  EXPECT_ERROR(52, Open(std::string("a\0b", 3), OpenMode::Read));
  EXPECT_ERROR(52, Open(std::string(300, 'x'), OpenMode::ReadWrite));
}

TEST_F(RealFiles, ADeviceIsNoFile) { EXPECT_ERROR(52, Open("/dev/full", OpenMode::ReadWrite)); }

TEST_F(RealFiles, APipeIsNotWaitedForByACopy) {
  ASSERT_EQ(mkfifo(folder.In("pipe").c_str(), 0600), 0);
  EXPECT_ERROR(52, files.Copy("pipe", "copy"));
  EXPECT_FALSE(folder.Has("copy"));
}

TEST_F(RealFiles, AFolderInThePlaceOfAFileIsAnAccessError) {
  files.MakeFolder("Winter.qza");
  Write("a.txt", "a");
  EXPECT_ERROR(75, Open("Winter.qza", OpenMode::Read));
  EXPECT_ERROR(75, Open("Winter.qza", OpenMode::ReadWrite));
  EXPECT_ERROR(75, Open("Winter.qza", OpenMode::Truncate));
  EXPECT_ERROR(75, files.Delete("Winter.qza"));
  EXPECT_ERROR(75, files.Copy("a.txt", "Winter.qza"));
  EXPECT_ERROR(75, files.Copy("Winter.qza", "b"));
  EXPECT_ERROR(75, files.Replace("a.txt", "Winter.qza"));
  EXPECT_TRUE(fs::is_directory(folder.In("Winter.qza")));
}

TEST_F(RealFiles, RenamesButNeverOntoAFileThatIsThere) {
  Write("a.txt", "a");
  files.Rename("A.TXT", "b.txt");
  EXPECT_EQ(Read("b.txt"), "a");
  EXPECT_FALSE(files.Exists("a.txt"));
  Write("a.txt", "other");
  EXPECT_ERROR(58, files.Rename("a.txt", "B.txt"));
  EXPECT_EQ(Read("b.txt"), "a");
  EXPECT_EQ(Read("a.txt"), "other");
}

TEST_F(RealFiles, ReplacesAFileThatIsThereAndOneThatIsNot) {
  Write("new", "1");
  files.Replace("new", "file");
  EXPECT_EQ(Read("file"), "1");
  Write("new", "2");
  files.Replace("new", "FILE");
  EXPECT_EQ(Read("file"), "2");
  EXPECT_EQ(files.List(folder.Path()).size(), 1U);
}

TEST_F(RealFiles, ReplacesWithoutWaitingForTheFolderToo) {
  Write("a.txt", "new");
  Write("b.txt", "old");
  files.ReplaceUnsynced("a.txt", "B.TXT");
  EXPECT_EQ(Read("b.txt"), "new");
  EXPECT_FALSE(files.Exists("a.txt"));
  EXPECT_ERROR(53, files.ReplaceUnsynced("a.txt", "b.txt"));
  files.SyncFolder(folder.Path());
  EXPECT_ERROR(76, files.SyncFolder(folder.In("none")));
}

TEST_F(RealFiles, ReplacingKeepsThePermissionsOfTheFile) {
  Write("file", "old");
  fs::permissions(folder.In("file"), fs::perms(0640));
  Write("new", "new");
  files.Replace("new", "file");
  EXPECT_EQ(fs::status(folder.In("file")).permissions(), fs::perms(0640));
}

TEST_F(RealFiles, ReplacingALinkReplacesWhatItStandsFor) {
  files.MakeFolder("cloud");
  Write("cloud/Winter.qza", "old");
  fs::create_symlink(folder.In("cloud/Winter.qza"), folder.In("Winter.qza"));
  Write("TEMP.RES", "new");
  files.Replace("TEMP.RES", "Winter.qza");
  EXPECT_TRUE(fs::is_symlink(folder.In("Winter.qza")));
  EXPECT_EQ(folder.Read("cloud/Winter.qza"), "new");
  EXPECT_FALSE(folder.Has("TEMP.RES"));
}

TEST_F(RealFiles, ReplacingALinkToAnotherVolumeWorksToo) {
  std::string pattern = "/dev/shm/marlowbeck-XXXXXX";
  if (mkdtemp(pattern.data()) == nullptr) GTEST_SKIP() << "no second volume on this machine";
  const fs::path other = pattern;
  Write("probe", "");
  std::error_code error;
  fs::rename(folder.In("probe"), other / "probe", error);
  if (error != std::errc::cross_device_link) {
    fs::remove_all(other);
    GTEST_SKIP() << "no second volume on this machine";
  }
  files.Copy("probe", (other / "Winter.qza").string());
  fs::create_symlink(other / "Winter.qza", folder.In("Winter.qza"));
  Write("TEMP.RES", "new");
  files.Replace("TEMP.RES", "Winter.qza");
  EXPECT_EQ(Read((other / "Winter.qza").string()), "new");
  EXPECT_FALSE(folder.Has("TEMP.RES"));
  EXPECT_FALSE(fs::exists(other / "Winter.qza.new"));
  Write("a.txt", "a");
  EXPECT_ERROR(74, files.Rename("a.txt", (other / "a.txt").string()));
  fs::remove_all(other);
}

TEST_F(RealFiles, AProtectedFileIsNeitherReplacedNorDeleted) {
  Write("file", "old");
  fs::permissions(folder.In("file"), fs::perms(0444));
  Write("new", "new");
  EXPECT_ERROR(70, files.Replace("new", "file"));
  EXPECT_ERROR(70, files.Delete("file"));
  EXPECT_EQ(Read("file"), "old");
  EXPECT_EQ(Read("new"), "new");
}

TEST_F(RealFiles, AProtectedFileCanBeLookedAtAndOnlyAWriteToItFails) {
  Write("file", "old");
  fs::permissions(folder.In("file"), fs::perms(0444));
  fs::permissions(folder.Path(), fs::perms(0755));
  const Nobody nobody;
  const auto file = files.Open("file", OpenMode::ReadWrite);
  EXPECT_EQ(file->Length(), 3U);
  EXPECT_ERROR(70, file->WriteAt(0, BytesOf("new")));
  EXPECT_ERROR(70, Open("file", OpenMode::Truncate));
}

TEST_F(RealFiles, AFolderThatCannotBeWrittenRefusesNewFiles) {
  Write("file", "old");
  fs::permissions(folder.Path(), fs::perms(0555));
  {
    const Nobody nobody;
    if (access(folder.Path().c_str(), W_OK) == 0 && geteuid() == 0) {
      GTEST_SKIP() << "every folder can be written";
    }
    EXPECT_ERROR(70, Open("fresh", OpenMode::ReadWrite));
    EXPECT_ERROR(70, Open("fresh", OpenMode::Truncate));
    EXPECT_ERROR(70, files.Delete("file"));
    EXPECT_ERROR(70, files.Rename("file", "other"));
    EXPECT_ERROR(70, files.MakeFolder("sub"));
  }
  fs::permissions(folder.Path(), fs::perms(0755));
  EXPECT_EQ(Read("file"), "old");
}

TEST_F(RealFiles, CopiesOverAnOldFileAndNeverOntoItself) {
  Write("a.txt", "content");
  Write("b.txt", "much longer content");
  files.Copy("a.txt", "b.txt");
  EXPECT_EQ(Read("b.txt"), "content");
  EXPECT_NE(ErrorOf([&] { files.Copy("a.txt", "A.TXT"); }), 0);
  EXPECT_EQ(Read("a.txt"), "content");
}

TEST_F(RealFiles, ACopyHasTheTimeOfTheLastChange) {
  Write("a.txt", "new");
  Write("b.txt", "older still");
  const auto changed = fs::last_write_time(folder.In("a.txt")) - std::chrono::hours(50);
  fs::last_write_time(folder.In("a.txt"), changed);
  files.Copy("a.txt", "b.txt");
  EXPECT_EQ(fs::last_write_time(folder.In("b.txt")), changed);
  EXPECT_EQ(Read("b.txt"), "new");
}

TEST_F(RealFiles, ACopyHasTheProtectionOfItsSource) {
  Write("a.txt", "text");
  fs::permissions(folder.In("a.txt"), fs::perms::owner_read);
  files.Copy("a.txt", "b.txt");
  EXPECT_EQ(fs::status(folder.In("b.txt")).permissions(), fs::perms::owner_read);
}

TEST_F(RealFiles, CopiesFilesOfAnyLength) {
  for (const std::size_t length : {std::size_t{0}, std::size_t{1}, std::size_t{256} * 1024,
                                   std::size_t{256} * 1024 + 1, std::size_t{3000000}}) {
    std::string text(length, 'x');
    for (std::size_t i = 0; i < length; i += 251) text[i] = static_cast<char>('a' + i % 26);
    Write("a.txt", text);
    files.Copy("a.txt", "b.txt");
    EXPECT_TRUE(Read("b.txt") == text) << length;
  }
}

TEST_F(RealFiles, TellsTheLengthOfAFileThatIsThere) {
  Write("a.txt", "");
  Write("b.txt", "three");
  EXPECT_EQ(files.LengthOf("a.txt"), 0U);
  EXPECT_EQ(files.LengthOf("B.TXT"), 5U);
  EXPECT_ERROR(53, (void)files.LengthOf("c.txt"));
}

TEST_F(RealFiles, AWorkFileIsDiscardedWhateverItsProtection) {
  Write("a.txt", "x");
  fs::permissions(folder.In("a.txt"), fs::perms::owner_read);
  files.Discard("a.txt");
  EXPECT_FALSE(files.Exists("a.txt"));
  files.Discard("a.txt");
  files.MakeFolder("b");
  files.Discard("b");
  EXPECT_TRUE(files.Exists("b"));
}

TEST_F(RealFiles, AFolderIsTheSameByAnySpellingAndLink) {
  files.MakeFolder("one");
  files.MakeFolder("two");
  fs::create_directory_symlink(folder.In("one"), folder.In("link"));
  EXPECT_TRUE(files.AreSameFolder("one", "ONE"));
  EXPECT_TRUE(files.AreSameFolder("one", folder.In("two/../one")));
  EXPECT_TRUE(files.AreSameFolder("link", "one"));
  EXPECT_FALSE(files.AreSameFolder("one", "two"));
  EXPECT_ERROR(76, (void)files.AreSameFolder("one", "three"));
}

TEST_F(RealFiles, MakesListsAndRemovesFolders) {
  files.MakeFolder("sub");
  Write("Zeta", "");
  Write("alpha", "");
  Write("sub/x", "");
  const auto list = files.List(folder.Path());
  ASSERT_EQ(list.size(), 3U);
  EXPECT_EQ(list[0].name, "alpha");
  EXPECT_EQ(list[1].name, "sub");
  EXPECT_TRUE(list[1].is_folder);
  EXPECT_EQ(list[2].name, "Zeta");
  EXPECT_ERROR(75, files.MakeFolder("SUB"));
  EXPECT_ERROR(75, files.MakeFolder("alpha"));
  EXPECT_ERROR(75, files.RemoveFolder("sub")) << "it is not empty";
  files.Delete("sub/x");
  files.RemoveFolder("sub");
  EXPECT_FALSE(folder.Has("sub"));
  EXPECT_ERROR(76, files.MakeFolder("nowhere/sub"));
  EXPECT_ERROR(53, (void)files.List("gone"));
}

TEST_F(RealFiles, BareNamesLieInTheCurrentFolder) {
  files.MakeFolder("Club");
  files.ChangeFolder("club");
  Write("a.txt", "a");
  EXPECT_EQ(folder.Read("Club/a.txt"), "a");
  EXPECT_EQ(files.CurrentFolder(), folder.In("Club"));
  EXPECT_EQ(Read("../Club/a.txt"), "a");
}

TEST_F(RealFiles, TheFolderAboveHasNoSeparatorAtItsEnd) {
  files.MakeFolder("Club");
  files.ChangeFolder("Club");
  files.ChangeFolder("..");
  EXPECT_EQ(files.CurrentFolder(), folder.Path());
  files.ChangeFolder("club/");
  EXPECT_EQ(files.CurrentFolder(), folder.In("Club"));
  files.ChangeFolder("/");
  EXPECT_EQ(files.CurrentFolder(), "/");
  files.ChangeFolder("..");
  EXPECT_EQ(files.CurrentFolder(), "/");
}

TEST_F(RealFiles, AWholePathIsSpelledAsItLiesOnTheDisk) {
  files.MakeFolder("Club");
  files.MakeFolder("Club/Old");
  EXPECT_EQ(files.WholePath("CLUB/old/"), folder.In("Club/Old"));
  EXPECT_EQ(files.WholePath("club/old/.."), folder.In("Club"));
  EXPECT_EQ(files.WholePath("."), folder.Path());
  EXPECT_EQ(files.WholePath("/.."), "/");
  Write("a.txt", "");
  EXPECT_ERROR(76, (void)files.WholePath("a.txt"));
  EXPECT_ERROR(76, (void)files.WholePath("gone"));
  EXPECT_ERROR(52, (void)files.WholePath(""));
}

TEST_F(RealFiles, DrivesAreFoldersTheRootBeingTheFirst) {
  const auto drives = files.Drives();
  ASSERT_FALSE(drives.empty());
  EXPECT_EQ(drives[0], "/");
  for (const std::string& drive : drives) EXPECT_EQ(files.WholePath(drive), drive);
}

TEST(PathIn, HasOneSeparatorBetweenFolderAndName) {
  EXPECT_EQ(PathIn("/home/club", "a.txt"), "/home/club/a.txt");
  EXPECT_EQ(PathIn("/home/club/", "a.txt"), "/home/club/a.txt");
  EXPECT_EQ(PathIn("/", "a.txt"), "/a.txt");
  EXPECT_EQ(PathIn("", "a.txt"), "a.txt");
}

TEST(FileNameOf, IsWhatFollowsTheLastSeparator) {
  EXPECT_EQ(FileNameOf("/home/club/Winter.qza"), "Winter.qza");
  EXPECT_EQ(FileNameOf("Winter.qza"), "Winter.qza");
  EXPECT_EQ(FileNameOf("/"), "");
}

}  // namespace
}  // namespace marlowbeck
