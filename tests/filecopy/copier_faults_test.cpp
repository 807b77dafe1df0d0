// Every file operation of the copier's work, failed and killed once: under the name of a file lies
// the old one whole or the new one whole, and the next copy goes through.

#include <map>

#include "support/record_files.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

void Lay(Club& club) {
  club.WriteFile("Winter.qza", "the players of the winter");
  club.WriteFile("Winter_A.qzr", "the results of the winter");
  club.WriteFile("Stick/Winter.qza", "the players of an older copy");
  club.WriteFile("QzCopy.qz3", "YES\r\n");
}

void OpenWithStick(Club& club) { club.DoAll({"click imgbackup", "dblpick BuDirD =Stick"}); }

void ExpectOneOf(const std::string& actual, const std::vector<std::string>& allowed) {
  EXPECT_NE(std::find(allowed.begin(), allowed.end(), actual), allowed.end()) << actual;
}

/// The season is as it was, and what lies in the other folder is whole.
void ExpectWholeFiles(Club& club) {
  EXPECT_EQ(club.File("Winter.qza"), "the players of the winter");
  EXPECT_EQ(club.File("Winter_A.qzr"), "the results of the winter");
  ExpectOneOf(club.File("Stick/Winter.qza"),
              {"the players of an older copy", "the players of the winter"});
  if (club.HasFile("Stick/Winter_A.qzr")) {
    EXPECT_EQ(club.File("Stick/Winter_A.qzr"), "the results of the winter");
  }
}

void ExpectNextCopyDone(Club& club) {
  club.Try("click cmdCancel");
  club.Try("answer yes");
  OpenWithStick(club);
  club.DoAll({"forget", "click cmdAllS", "answer yes", "answer yes", "answer yes", "click cmdBuS"});
  EXPECT_EQ(club.BoxTexts().back(), "2 files have been copied.");
  EXPECT_EQ(club.File("Stick/Winter.qza"), "the players of the winter");
  EXPECT_EQ(club.File("Stick/Winter_A.qzr"), "the results of the winter");
}

SweptWork CopyOfASeason() {
  return {[](Club& club) {
            Lay(club);
            OpenWithStick(club);
            club.DoAll({"click cmdAllS", "answer yes", "answer no"});
          },
          {"click cmdBuS"},
          [](Club& club) {
            ExpectWholeFiles(club);
            ExpectNextCopyDone(club);
          }};
}

TEST(CopierFaults, ACopyOfASeason) {
  for (const int number : {57, 61, 71}) EXPECT_GT(SweepFailures(CopyOfASeason(), number), 3);
  EXPECT_GT(SweepCutWrites(CopyOfASeason()), 1);
  EXPECT_GT(SweepPowerCuts(CopyOfASeason()), 3);
}

TEST(CopierFaults, TheDeletionOfFilesTakesNoOther) {
  const SweptWork work = {[](Club& club) {
                            Lay(club);
                            OpenWithStick(club);
                            club.DoAll({"click cmdAllD", "answer yes"});
                          },
                          {"click cmdDeleteD"},
                          [](Club& club) {
                            EXPECT_EQ(club.File("Winter.qza"), "the players of the winter");
                            EXPECT_EQ(club.File("Winter_A.qzr"), "the results of the winter");
                            ExpectNextCopyDone(club);
                          }};
  EXPECT_EQ(SweepFailures(work, 70), 1);
  EXPECT_EQ(SweepPowerCuts(work), 1);
}

TEST(CopierFaults, TheDeletionOfAFolderTakesNothingThatHoldsSomething) {
  const SweptWork work = {[](Club& club) {
                            Lay(club);
                            club.WriteFile("Empty.qza", "");
                            club.WriteFile("Old/x", "");
                            club.DeleteFile("Old/x");
                            club.DoAll({"click imgbackup", "dblpick BuDirD =Old", "answer yes"});
                          },
                          {"click cmdDelFolderD"},
                          [](Club& club) {
                            ExpectWholeFiles(club);
                            if (club.HasFile("Old")) {
                              EXPECT_TRUE(club.HasFile("Empty.qza"));
                            }
                          }};
  EXPECT_GE(SweepFailures(work, 70), 2);
  EXPECT_GE(SweepPowerCuts(work), 2);
}

TEST(CopierFaults, TheChoiceToOverwriteIsTheOldOrTheNew) {
  const SweptWork work = {[](Club& club) {
                            Lay(club);
                            club.Do("click imgbackup");
                          },
                          {"click chkReplace"},
                          [](Club& club) {
                            ExpectOneOf(club.File("QzCopy.qz3"), {"YES\r\n", "NO\r\n"});
                            ExpectWholeFiles(club);
                          }};
  EXPECT_GT(SweepFailures(work), 3);
  EXPECT_GT(SweepCutWrites(work), 0);
  EXPECT_GT(SweepPowerCuts(work), 3);
}

}  // namespace
}  // namespace marlowbeck
