#include "drive/options.h"

#include <initializer_list>
#include <vector>

#include "support/club.h"

namespace marlowbeck {
namespace {

class DriveOptionsRead : public ::testing::Test {
 protected:
  std::optional<DriveOptions> Read(std::initializer_list<std::string> words) {
    const std::vector<std::string> all(words);
    std::vector<const char*> argv = {"marlowbeck-drive"};
    for (const std::string& word : all) argv.push_back(word.c_str());
    return ReadOptions(static_cast<int>(argv.size()), argv.data(), exit_status);
  }
  [[nodiscard]] std::string Folder() const { return (scratch.Path() / "club").string(); }

  TemporaryFolder scratch;
  int exit_status = -1;
};

TEST_F(DriveOptionsRead, HaveDefaults) {
  const auto options = Read({Folder()});
  ASSERT_TRUE(options);
  EXPECT_EQ(options->world.folder, Folder());
  EXPECT_EQ(IsoDate(options->world.today), "2004-03-31");
  EXPECT_EQ(options->world.seed, 1U);
  EXPECT_EQ(options->world.screen_width, 15360);
  EXPECT_FALSE(options->window);
}

TEST_F(DriveOptionsRead, TakeWhatIsGiven) {
  const auto options = Read({"--today", "2005-12-24", "--seed", "18446744073709551615",
                             "--screen-width", "10999", "--window", Folder() + "/a/../b/"});
  ASSERT_TRUE(options);
  EXPECT_EQ(options->world.folder, Folder() + "/b");
  EXPECT_EQ(IsoDate(options->world.today), "2005-12-24");
  EXPECT_EQ(options->world.seed, 18446744073709551615U);
  EXPECT_EQ(options->world.screen_width, 10999);
  EXPECT_TRUE(options->window);
}

TEST_F(DriveOptionsRead, TakeAFolderForPdfFilesWithWindowsAlone) {
  const auto options = Read({"--window", "--pdf", scratch.Path().string(), Folder()});
  ASSERT_TRUE(options);
  EXPECT_EQ(options->world.pdf_folder, scratch.Path().string());
  EXPECT_FALSE(Read({"--pdf", scratch.Path().string(), Folder()}));
  EXPECT_EQ(exit_status, 2);
  EXPECT_FALSE(Read({"--window", "--pdf", scratch.Path().string() + "/none", Folder()}));
  EXPECT_EQ(exit_status, 2);
}

TEST_F(DriveOptionsRead, NameTheFolderInTheProgramsPage) {
  const auto options = Read({scratch.Path().string() + "/M\xC3\xBCller"});
  ASSERT_TRUE(options);
  EXPECT_EQ(FileNameOf(options->world.folder), "M\xFCller");
  EXPECT_TRUE(std::filesystem::is_directory(scratch.Path() / "M\xC3\xBCller"));
}

TEST_F(DriveOptionsRead, EndAtOnceWithZeroAfterHelp) {
  EXPECT_FALSE(Read({"--help"}));
  EXPECT_EQ(exit_status, 0);
}

TEST_F(DriveOptionsRead, EndAtOnceWithTwoWithoutAFolder) {
  EXPECT_FALSE(Read({"--window"}));
  EXPECT_EQ(exit_status, 2);
}

TEST_F(DriveOptionsRead, EndAtOnceWithTwoForAFolderWithoutAName) {
  EXPECT_FALSE(Read({""}));
  EXPECT_EQ(exit_status, 2);
}

}  // namespace
}  // namespace marlowbeck
