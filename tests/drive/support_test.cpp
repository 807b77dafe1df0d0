#include <fstream>
#include <set>

#include <gmock/gmock.h>
#include <gtest/gtest-spi.h>

#include "drive/workbench.h"
#include "support/record_files.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

TEST(RecordComparison, NamesTheRecordAndTheFieldThatDiffer) {
  std::vector<ResultRecord> records(8);
  const std::string expected = FileOf(records);
  records[6].Pegs[2] = 2;
  const auto result = SameResults(FileOf(records), expected);
  EXPECT_FALSE(result);
  EXPECT_STREQ(result.message(), "record 7, Peg3: 2, expected 0\n");
}

TEST(RecordComparison, TellsTextsDatesAndLengths) {
  std::vector<PlayerRecord> records = {Player(1, "Archer", "Jo", "Rovers", "A")};
  const std::string expected = FileOf(records);
  records[0].Surname = "Bowman";
  records[0].Reserved1 = Date{38077};
  records.push_back(Player(2, "Cook", "Al", "Rovers", "A"));
  const std::string words = SamePlayers(FileOf(records), expected).message();
  EXPECT_THAT(words, ::testing::HasSubstr("312 bytes, expected 156"));
  EXPECT_THAT(words, ::testing::HasSubstr("record 1, Surname: \"Bowman"));
  EXPECT_THAT(words, ::testing::HasSubstr("expected \"Archer"));
  EXPECT_THAT(words, ::testing::HasSubstr("record 1, Reserved1: 38077, expected 0"));
}

TEST(RecordComparison, HoldsForEqualFiles) {
  const std::string file = FileOf({Player(1, "Archer", "Jo", "Rovers", "A")});
  EXPECT_TRUE(SamePlayers(file, file));
}

class Sweeping : public ::testing::Test {
 protected:
  /// The club's one screen rewrites a file at a click, safely or in place.
  SweptWork Rewriting(Keeping keeping) {
    SweptWork work;
    work.prepare = [keeping](Club& club) {
      club.WriteFile("note.qz3", "\"old\"\r\n");
      club.registration = WithWorkbench([keeping](Workbench& bench) {
        bench.cmdDo.Click = [keeping, &context = bench.context] {
          context.GoToWorkingFolder();
          context.channels.OpenOutput(Channel::Side, "note.qz3", keeping);
          context.channels.Writer(Channel::Side).Text(std::string(200, 'n')).EndLine();
          context.channels.CloseAll();
        };
      });
    };
    work.lines = {"click cmdDo"};
    work.check = [this](Club& club) { left.insert(club.File("note.qz3").substr(0, 5)); };
    return work;
  }

  std::set<std::string> left;  ///< how the file began after each break
};

TEST_F(Sweeping, BreaksEveryOperationOnceAndEndsWhenNoneIsLeft) {
  EXPECT_EQ(SweepFailures(Rewriting(Keeping::Lasting)), 5);  // open, write, sync, close, rename
  EXPECT_THAT(left, ::testing::ElementsAre("\"nnnn", "\"old\""));
}

TEST_F(Sweeping, CutsThePowerAtEveryOperation) {
  EXPECT_EQ(SweepPowerCuts(Rewriting(Keeping::Lasting)), 5);
  EXPECT_THAT(left, ::testing::ElementsAre("\"nnnn", "\"old\""));
}

TEST_F(Sweeping, CutsEveryWriteShort) {
  EXPECT_EQ(SweepCutWrites(Rewriting(Keeping::Lasting)), 1);
  EXPECT_THAT(left, ::testing::ElementsAre("\"nnnn", "\"old\""));
}

TEST_F(Sweeping, FindsWhatIsNotSafe) {
  SweepPowerCuts(Rewriting(Keeping::Working));
  EXPECT_THAT(left, ::testing::ElementsAre("", "\"nnnn", "\"old\""));
}

TEST_F(Sweeping, OfWorkThatTouchesNoFileFails) {
  SweptWork work = Rewriting(Keeping::Lasting);
  work.lines = {"click cmdHelp"};
  EXPECT_NONFATAL_FAILURE(SweepFailures(work), "no file operation");
}

class ClubItself : public WorkbenchTest {};

TEST_F(ClubItself, FailsATestOnALineThatWasNotDone) {
  Start();
  EXPECT_NONFATAL_FAILURE(Do("click cmdGone"), "frmBench has no control cmdGone");
  EXPECT_NONFATAL_FAILURE(Refused("click cmdDo"), "was not refused");
  EXPECT_NONFATAL_FAILURE(Try("# nothing"), "has no answer");
}

TEST_F(ClubItself, KeepsItsFolderOverARestart) {
  WriteFile("a/b.txt", "{folder}");
  Restart();
  EXPECT_EQ(File("a/b.txt"), Folder().string());
}

/// Two faces of which the second sees another caption.
class TwoFaces : public ::testing::Test {
 protected:
  TwoFaces() {
    club.registration = WithWorkbench(
        [this](Workbench& bench) { bench.lblPlain.SetCaption("bench " + std::to_string(++made)); });
  }
  static std::vector<TestFace> Both() {
    std::vector<TestFace> faces = ModelFaceAlone();
    faces.push_back({"other", MakeModelFace});
    return faces;
  }

  Club club{Both()};
  int made = 0;
};

TEST_F(TwoFaces, MustAnswerTheSame) {
  EXPECT_NONFATAL_FAILURE(club.Do("get lblPlain"), "is answered differently");
}

TEST_F(TwoFaces, MustSeeTheSame) {
  EXPECT_NONFATAL_FAILURE(club.Do("click cmdDo"), "frmBench.lblPlain differs");
  club.Do("get lblPlain");  // told once
  std::ofstream(club.FilePath("only.txt")) << "x";
  EXPECT_NONFATAL_FAILURE(club.ExpectEqualFolders(), "hold different files");
}

}  // namespace
}  // namespace marlowbeck
