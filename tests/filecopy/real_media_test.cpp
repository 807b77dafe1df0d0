// Small disks of their own that fill up, cannot be written to or go: where the machine lets a test
// mount them. Faults set on purpose stand for them everywhere in copier_faults_test.

#include <sys/mount.h>

#include <filesystem>
#include <fstream>

#include "copier.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

/// A disk of some kilobytes in memory, mounted for as long as it lives.
class SmallDisk {
 public:
  explicit SmallDisk(const char* options = "size=128k")
      : mounted_(mount("tmpfs", Path().c_str(), "tmpfs", 0, options) == 0) {}
  SmallDisk(const SmallDisk&) = delete;
  SmallDisk& operator=(const SmallDisk&) = delete;
  ~SmallDisk() { Unmount(); }

  [[nodiscard]] bool Mounted() const { return mounted_; }
  [[nodiscard]] std::string Path() const { return folder_.Path().string(); }
  [[nodiscard]] bool MakeReadOnly() const {
    return mount(nullptr, Path().c_str(), nullptr, MS_REMOUNT | MS_RDONLY, nullptr) == 0;
  }
  void Unmount() {
    if (mounted_) umount2(Path().c_str(), MNT_DETACH);
    mounted_ = false;
  }
  /// Empty, where it was.
  void Return() { mounted_ = mount("tmpfs", Path().c_str(), "tmpfs", 0, "size=128k") == 0; }
  void Go() {
    Unmount();
    fs::remove(Path());
  }

 private:
  TemporaryFolder folder_;
  bool mounted_;
};

class RealMedia : public testing::Test {
 protected:
  void SetUp() override {
    if (!disk.Mounted()) GTEST_SKIP() << "no disk can be mounted on this machine";
    for (const char* name : {"a.qza", "b.qzr", "c.qzl"}) {
      club.WriteFile(name, std::string(50000, name[0]));
    }
    club.Do("click imgbackup");
    club.Do("pick BuDriveD =" + disk.Path());
  }
  std::vector<std::string> OnDisk() const {
    std::vector<std::string> names;
    for (const auto& entry : fs::directory_iterator(disk.Path())) {
      names.push_back(entry.path().filename().string());
    }
    std::sort(names.begin(), names.end());
    return names;
  }
  using Names = std::vector<std::string>;

  SmallDisk disk;
  Club club{ModelFaceAlone()};
};

TEST_F(RealMedia, AMountedDiskIsADrive) {
  EXPECT_EQ(club.Caption("lblPathD"), disk.Path());
  EXPECT_EQ(club.Get("BuDirD")["path"], disk.Path());
  EXPECT_EQ(club.Lines("BuFileD"), Names{});
}

TEST_F(RealMedia, AFullDiskHoldsWholeFilesAlone) {
  club.DoAll({"click cmdAllS", "answer yes", "answer no", "click cmdBuS"});
  EXPECT_EQ(club.BoxTexts().at(1).substr(0, 19), "Your disk is full !");
  EXPECT_EQ(OnDisk(), (Names{"a.qza", "b.qzr"}));
  for (const std::string& name : OnDisk()) {
    EXPECT_EQ(fs::file_size(fs::path(disk.Path()) / name), 50000U);
  }
}

TEST_F(RealMedia, AFullDiskGoesOnOnceThereIsRoom) {
  std::ofstream(fs::path(disk.Path()) / "filler.txt") << std::string(60000, 'x');
  club.DoAll({"click cmdAllS", "answer yes", "answer yes", "answer no", "click cmdBuS"});
  EXPECT_EQ(club.BoxTexts().size(), 3U) << "it is still full";
  EXPECT_EQ(OnDisk(), (Names{"a.qza", "filler.txt"}));
  fs::remove(fs::path(disk.Path()) / "filler.txt");
  club.DoAll({"select BuFileS 1", "answer yes", "click cmdBuS"});
  EXPECT_EQ(OnDisk(), (Names{"a.qza", "b.qzr"}));
}

TEST_F(RealMedia, ADiskThatCannotBeWrittenRefusesTheCopy) {
  if (!disk.MakeReadOnly()) GTEST_SKIP() << "no disk can be made read-only here";
  club.DoAll({"pick BuFileS 0", "answer yes", "click cmdBuS"});
  EXPECT_EQ(club.EventsNamed("error").at(0)["number"], 70);
  EXPECT_EQ(OnDisk(), Names{});
  club.DoAll({"input x", "click cmdNewD"});
  EXPECT_EQ(club.EventsNamed("error").at(0)["number"], 70);
}

TEST_F(RealMedia, ADiskThatIsPulledOutIsAnErrorAndThePaneStandsElsewhere) {
  club.Do("pick BuFileS 0");
  disk.Go();
  club.DoAll({"answer yes", "click cmdBuS"});
  EXPECT_EQ(club.EventsNamed("error").at(0)["number"], 76);
  club.DoAll({"pick BuFileS 1", "click cmdUSS"});
  EXPECT_TRUE(fs::is_directory(club.Caption("lblPathD")));
}

TEST_F(RealMedia, ADriveThatIsNotReadyIsWarnedOfAndTheLastGoodOneComesBack) {
  club.Do("pick BuDriveD =/");
  club.Do("focus BuDriveD");
  const std::string gone = disk.Path();
  disk.Go();
  club.Do("pick BuDriveD =" + gone);
  EXPECT_EQ(club.BoxTexts(), Names{"Drive " + gone + " is not available!    "});
  EXPECT_EQ(club.Boxes()[0].style, kWarningStyle);
  EXPECT_EQ(club.Lines("BuDriveD").at(static_cast<std::size_t>(club.Index("BuDriveD"))), "/");
  EXPECT_EQ(club.Caption("lblPathD"), "/");
}

TEST_F(RealMedia, ADriveThatWentBehindTheListIsWarnedOfAtTheFirstClick) {
  club.DoAll({"pick BuDriveD =/", "focus BuDirS"});
  const std::string gone = disk.Path();
  disk.Go();
  club.Do("pick BuDriveD =" + gone);
  EXPECT_EQ(club.BoxTexts(), Names{"Drive " + gone + " is not available!    "});
  EXPECT_EQ(club.Lines("BuDriveD").at(static_cast<std::size_t>(club.Index("BuDriveD"))), "/");
  EXPECT_EQ(club.Caption("lblPathD"), "/");
}

TEST_F(RealMedia, ADriveIsWarnedOfAtEachClickWhileItIsOutAndOpensOnceItIsBack) {
  club.DoAll({"pick BuDriveD =/", "focus BuDirS"});
  disk.Unmount();
  const std::string pick = "pick BuDriveD =" + disk.Path();
  for (int i = 0; i < 2; ++i) {
    club.Do(pick);
    EXPECT_EQ(club.BoxTexts(), Names{"Drive " + disk.Path() + " is not available!    "});
  }
  disk.Return();
  club.Do(pick);
  EXPECT_EQ(club.BoxTexts(), Names{});
  EXPECT_EQ(club.Caption("lblPathD"), disk.Path());
}

TEST_F(RealMedia, ADriveWhoseFolderIsLeftIsNotReadyEither) {
  club.DoAll({"pick BuDriveD =/", "focus BuDriveD"});
  disk.Unmount();
  club.Do("pick BuDriveD =" + disk.Path());
  EXPECT_EQ(club.BoxTexts(), Names{"Drive " + disk.Path() + " is not available!    "});
  EXPECT_EQ(club.Caption("lblPathD"), "/");
}

TEST_F(RealMedia, NoDriveComesToStandInTheLineOfAnother) {
  club.DoAll({"pick BuDriveD =/", "focus BuDirS"});
  Names drives = club.Lines("BuDriveD");
  const SmallDisk other;
  disk.Unmount();
  club.Do("focus BuDriveD");
  drives.push_back(other.Path());
  EXPECT_EQ(club.Lines("BuDriveD"), drives);
}

TEST_F(RealMedia, AnotherMountOfTheSameFolderIsTheSameFolder) {
  const TemporaryFolder twin;
  if (mount(disk.Path().c_str(), twin.Path().c_str(), nullptr, MS_BIND, nullptr) != 0) {
    GTEST_SKIP() << "no folder can be mounted twice here";
  }
  std::ofstream(fs::path(disk.Path()) / "a.qza") << "kept";
  club.Do("focus BuDriveS");
  club.DoAll({"pick BuDriveS =" + twin.Path().string(), "pick BuFileS 0", "click cmdBuS"});
  EXPECT_EQ(club.BoxTexts(), Names{"You cannot copy a file to itself !"});
  umount2(twin.Path().c_str(), MNT_DETACH);
  EXPECT_EQ(OnDisk(), Names{"a.qza"});
}

TEST_F(RealMedia, ThousandsOfFilesGoAcross) {
  constexpr int kFiles = 2000;
  const SmallDisk large("size=32m,nr_inodes=10k");
  ASSERT_TRUE(large.Mounted());
  for (int i = 0; i < kFiles; ++i) club.WriteFile("Many/" + std::to_string(i) + ".qza", "x");
  club.DoAll({"click opt(0)", "focus BuDriveD", "pick BuDriveD =" + large.Path()});
  club.DoAll({"dblpick BuDirS =..", "dblpick BuDirS =" + club.Folder().filename().string()});
  club.Do("dblpick BuDirS =Many");
  club.DoAll({"click cmdAllS", "answer yes", "click cmdBuS"});
  EXPECT_EQ(club.BoxTexts().back(), "2000 files have been copied.");
  EXPECT_EQ(club.Lines("BuFileD").size(), 2000U);
  EXPECT_EQ(club.Text("txtNumFileD"), "File List = 2000");
}

}  // namespace
}  // namespace marlowbeck
