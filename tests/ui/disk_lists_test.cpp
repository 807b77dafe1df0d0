#include "ui/disk_lists.h"

#include <gtest/gtest.h>

#include "fuzz/memory_file_system.h"
#include "tests/ui/workbench.h"

namespace marlowbeck {
namespace {

TEST(Patterns, FitNamesWithoutRegardToCase) {
  EXPECT_TRUE(MatchesPattern("WINTER.qza", "*.QZA"));
  EXPECT_FALSE(MatchesPattern("Winter.qzab", "*.qza"));
  EXPECT_FALSE(MatchesPattern("Winter", "*.qza"));
  EXPECT_TRUE(MatchesPattern("Winter", "*"));
}

TEST(Patterns, OfStarDotStarFitNamesWithoutADotToo) {
  EXPECT_TRUE(MatchesPattern("Winter", "*.*"));
  EXPECT_TRUE(MatchesPattern(".profile", "*.*"));
}

TEST(Patterns, AreTriedOneAfterTheOther) {
  constexpr const char* kSeason = "*.qza; *.qzi;*.qzl";
  EXPECT_TRUE(MatchesPattern("a.qza", kSeason));
  EXPECT_TRUE(MatchesPattern("a.qzi", kSeason));
  EXPECT_TRUE(MatchesPattern("a.qzl", kSeason));
  EXPECT_FALSE(MatchesPattern("a.qzr", kSeason));
  EXPECT_FALSE(MatchesPattern("a.qza", ""));
  EXPECT_FALSE(MatchesPattern("a.qza", ";"));
}

TEST(Patterns, TakeAnyCharacterForAQuestionMark) {
  EXPECT_TRUE(MatchesPattern("a1.txt", "a?.txt"));
  EXPECT_FALSE(MatchesPattern("a.txt", "a?.txt"));
  EXPECT_TRUE(MatchesPattern("aXbXc", "a*b*c"));
  EXPECT_TRUE(MatchesPattern("ababc", "*abc"));
  EXPECT_FALSE(MatchesPattern("ababd", "*abc"));
  EXPECT_TRUE(MatchesPattern("abc", "abc**"));
}

TEST(Patterns, OfManyStarsTakeNoTime) {
  EXPECT_FALSE(MatchesPattern(std::string(250, 'a'), "*a*a*a*a*a*a*a*a*a*a*a*a*a*a*b"));
}

/// Drives that come and go.
class ChangingDrives : public fuzz::MemoryFileSystem {
 public:
  std::vector<std::string> drives = {"/", "/media/stick", "/media"};
  std::vector<std::string> Drives() override { return drives; }
};

struct DriveScreen : Screen {
  DriveScreen(Screens& in, FileSystem& files)
      : Screen(in, "frmDrives", ""), list(*this, "d", files) {
    list.Refresh();
  }
  DriveList list;
};

class DriveListTest : public testing::Test {
 protected:
  ChangingDrives disk;
  Screens screens{[](int) {}};
  DriveScreen screen{screens, disk};
  DriveList& list = screen.list;
};

TEST_F(DriveListTest, APathLiesOnTheInnermostDrive) {
  list.SetDrive("/media/stick/club");
  EXPECT_EQ(list.Drive(), "/media/stick");
  list.SetDrive("/media/sticky");
  EXPECT_EQ(list.Drive(), "/media");
  list.SetDrive("/home");
  EXPECT_EQ(list.Drive(), "/");
  EXPECT_EQ(list.Index(), 0);
}

TEST_F(DriveListTest, LettersAreFoundWithoutRegardToCase) {
  disk.drives = {"A:", "C:"};
  list.Refresh();
  list.SetDrive("c:\\club");
  EXPECT_EQ(list.Drive(), "C:");
  EXPECT_THROW(list.SetDrive("D:\\"), RunTimeError);
  EXPECT_EQ(list.Drive(), "C:");
}

TEST_F(DriveListTest, AnotherDriveIsAChangeTheSameOneIsNot) {
  int changes = 0;
  list.Change = [&] { ++changes; };
  list.SetDrive("/media/x");
  list.SetDrive("/media/y");
  EXPECT_EQ(changes, 1);
  list.SetIndex(-1);
  EXPECT_EQ(changes, 1);
  EXPECT_EQ(list.Drive(), "");
}

TEST_F(DriveListTest, AScreenCanGoBackToTheDriveBefore) {
  std::vector<std::string> seen;
  list.SetDrive("/media/x");
  list.Change = [&] {
    seen.push_back(list.Drive());
    if (list.Drive() == "/media/stick") list.SetDrive("/media");
  };
  list.SetIndex(list.Find("/media/stick"));
  EXPECT_EQ(list.Drive(), "/media");
  EXPECT_EQ(list.Index(), 2);
  EXPECT_EQ(seen, (std::vector<std::string>{"/media/stick", "/media"}));
}

TEST_F(DriveListTest, ADriveThatIsStillThereStaysCurrentWhereverItStands) {
  list.SetDrive("/media/stick");
  disk.drives = {"/", "/home", "/media/stick"};
  int changes = 0;
  list.Change = [&] { ++changes; };
  list.Refresh();
  EXPECT_EQ(list.Index(), 2);
  disk.drives = {"/"};
  list.Refresh();
  EXPECT_EQ(list.Index(), -1);
  EXPECT_EQ(list.Drive(), "");
  EXPECT_EQ(changes, 0);
}

TEST_F(DriveListTest, NewDrivesComeBelowAndNoneMovesForOneThatHasGone) {
  list.SetDrive("/media/stick");
  const std::vector<std::string> before = list.Lines();
  const int line = list.Index();
  int changes = 0;
  list.Change = [&] { ++changes; };
  disk.drives = {"/", "/a", "/media/stick"};
  list.TakeNew();
  std::vector<std::string> lines = before;
  lines.emplace_back("/a");
  EXPECT_EQ(list.Lines(), lines);
  EXPECT_EQ(list.Index(), line);
  list.TakeNew();
  EXPECT_EQ(list.Lines(), lines) << "each once";
  EXPECT_EQ(changes, 0);
}

TEST_F(DriveListTest, TheDriveOfWhatIsOnShowBecomesCurrentInSilence) {
  int told = 0;
  list.Change = [&] { ++told; };
  list.Click = [&] { ++told; };
  list.ShowDriveOf("/media/stick/club");
  EXPECT_EQ(list.Drive(), "/media/stick");
  EXPECT_EQ(list.Index(), 1);
  EXPECT_EQ(told, 0);
  list.SetIndex(1);
  EXPECT_EQ(told, 1) << "picked again it is no other drive";
  disk.drives = {"C:"};
  list.Refresh();
  list.ShowDriveOf("D:\\club");
  EXPECT_EQ(list.Index(), -1);
}

/// A folder whose files a test names.
class NamedFiles : public fuzz::MemoryFileSystem {
 public:
  std::vector<FolderEntry> entries;
  std::vector<FolderEntry> List(const std::string&) override { return entries; }
};

TEST(FileListTest, IncludesANameWhereARefreshWouldListIt) {
  NamedFiles disk;
  disk.entries = {{"b.qza"}, {"D.qza"}};
  Screens screens{[](int) {}};
  Screen screen(screens, "frmFiles", "");
  FileList list(screen, "f", disk);
  list.SetMulti(true);
  list.SetPattern("*.qza");
  list.SetPath("/");
  list.SetMarked(0, true);
  for (const char* name : {"C.qza", "a.QZA", "e.qza", "b.qza", "c.txt", "c.qza"}) {
    list.Include(name);
  }
  EXPECT_EQ(list.Lines(),
            (std::vector<std::string>{"a.QZA", "b.qza", "C.qza", "c.qza", "D.qza", "e.qza"}));
  EXPECT_TRUE(list.Marked().empty());
}

}  // namespace
}  // namespace marlowbeck
