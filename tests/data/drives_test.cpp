#include "data/drives.h"

#include <sstream>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

std::vector<std::string> PointsOf(const std::string& table) {
  std::istringstream mounts(table);
  return MountPointsIn(mounts);
}

TEST(MountPoints, AreThoseThatSomebodyMayKeepFilesAtTheRootFirst) {
  EXPECT_THAT(
      PointsOf("/dev/sda2 /media/jo/STICK vfat rw 0 0\n"
               "proc /proc proc rw 0 0\n"
               "tmpfs /run/user/1000 tmpfs rw 0 0\n"
               "/dev/sdb1 /run/media/jo/DISK ext4 rw 0 0\n"
               "/dev/sda1 / ext4 rw 0 0\n"
               "udev /dev devtmpfs rw 0 0\n"
               "/dev/sda3 /Home ext4 rw 0 0\n"
               "/dev/sda4 /develop ext4 rw 0 0\n"),
      ::testing::ElementsAre("/", "/develop", "/Home", "/media/jo/STICK", "/run/media/jo/DISK"));
}

TEST(MountPoints, AreNamedOnceWhateverIsMountedOverThem) {
  EXPECT_THAT(PointsOf("a /mnt/x ext4 rw 0 0\nb /mnt/x ext4 rw 0 0\n"),
              ::testing::ElementsAre("/", "/mnt/x"));
}

TEST(MountPoints, HaveTheirBlanksBack) {
  EXPECT_THAT(PointsOf("a /media/MY\\040STICK\\134 vfat rw 0 0\n"),
              ::testing::ElementsAre("/", "/media/MY STICK\\"));
}

TEST(MountPoints, AreNamedWhateverTheirLetters) {
  EXPECT_THAT(PointsOf("a /mnt/\xD0\x9A ext4 rw 0 0\nb /mnt/\xC3\xA4 ext4 rw 0 0\n"),
              ::testing::ElementsAre("/",
                                     "/mnt/\x81"
                                     "00041A",
                                     "/mnt/\xE4"));
}

TEST(MountPoints, OfATableThatCannotBeReadAreTheRoot) {
  EXPECT_THAT(PointsOf(""), ::testing::ElementsAre("/"));
  EXPECT_THAT(PointsOf("nonsense\n\n"), ::testing::ElementsAre("/"));
}

}  // namespace
}  // namespace marlowbeck
