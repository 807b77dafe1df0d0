#include "setup/renames.h"

#include <gtest/gtest.h>

#include "data/expect_error.h"
#include "data/real_file_system.h"
#include "setup_test.h"

namespace marlowbeck {
namespace {

/// The files of a competition in a folder of their own.
class RenamesTest : public ::testing::Test {
 protected:
  RenamesTest() { files.ChangeFolder(folder.Path().string()); }

  void Write(const std::string& name, std::string_view bytes) {
    const auto file = files.Open(name, OpenMode::Truncate);
    file->WriteAt(0, std::as_bytes(std::span(bytes)));
    file->Close();
  }
  std::string Read(const std::string& name) { return channels.ReadWhole(name); }

  std::string AfterTeam(const std::vector<PlayerRecord>& players, const Renaming& team) {
    Write("p", FileOf(players));
    channels.OpenRandom(Channel::Players, "p", kPlayerLength);
    RenameTeamOfPlayers(channels, "A Grade", team);
    return Read("p");
  }
  std::string AfterTeam(const std::vector<ResultRecord>& results, const Renaming& team) {
    Write("r", FileOf(results));
    channels.OpenRandom(Channel::Results, "r", kResultLength);
    RenameTeamInResults(channels, team);
    return Read("r");
  }
  std::string AfterTeam(const std::vector<LadderRecord>& matches, const Renaming& team) {
    Write("l", FileOf(matches));
    channels.OpenRandom(Channel::Ladder, "l", kLadderLength);
    RenameTeamInMatches(channels, team);
    return Read("l");
  }

  void WriteGradeFiles(const std::string& grade) {
    for (const char* extension : {".qzr", ".qzl", ".qzi", ".qzs"}) {
      Write("W_" + grade + extension, grade + extension);
    }
  }
  int RenameFiles(std::string_view from, std::string_view to) {
    return ErrorOf([&] { RenameGradeFiles(files, "W.qza", {from, to}); });
  }
  /// Names and contents of all files.
  std::vector<std::string> AllFiles() {
    std::vector<std::string> all;
    for (const FolderEntry& entry : files.List(".")) {
      all.push_back(entry.name + ": " + Read(entry.name));
    }
    return all;
  }

  TemporaryFolder folder;
  RealFileSystem files;
  Channels channels{files};
};

using Texts = std::vector<std::string>;

TEST_F(RenamesTest, PlayersOfTheTeamInTheGradeAreRenamedAndNoOthers) {
  std::vector<PlayerRecord> players = {
      Player(1, "A", "B", "Rovers", "A Grade"), Player(2, "A", "B", "rovers", "A Grade"),
      Player(3, "A", "B", "Rovers", "B Grade"), Player(4, "Rovers", "Rovers", "Hawks", "A Grade"),
      Player(5, "A", "B", " Rovers", "A Grade")};
  const std::string after = AfterTeam(players, {"Rovers", "Rangers"});
  players[0].Team = "Rangers";
  players[4].Team = "Rangers";
  EXPECT_TRUE(SamePlayers(after, FileOf(players)));
}

TEST_F(RenamesTest, AResultHasTheNameInBothFieldsOfTeams) {
  std::vector<ResultRecord> results = {Night(1, "Rovers", "Hawks"), Night(2, "Hawks", "Rovers"),
                                       Night(3, "Rovers", "Rovers"), Night(4, "Hawks", "Lions")};
  results[3].Grade = "Rovers";
  const std::string after = AfterTeam(results, {"Rovers", "Rangers"});
  results[0].Team = "Rangers";
  results[1].Opposition = "Rangers";
  results[2].Team = "Rangers";
  results[2].Opposition = "Rangers";
  EXPECT_TRUE(SameResults(after, FileOf(results)));
}

TEST_F(RenamesTest, AMatchHasItAtHomeAndAway) {
  const std::string after =
      AfterTeam(std::vector<LadderRecord>{Match("Hawks", "Rovers"), Match("Rovers", "Lions", 3, 8),
                                          Match("Hawks", "Lions"), Match("Rovers", "Rovers")},
                {"Rovers", "Rangers"});
  EXPECT_TRUE(SameMatches(after, FileOf(std::vector<LadderRecord>{
                                     Match("Hawks", "Rangers"), Match("Rangers", "Lions", 3, 8),
                                     Match("Hawks", "Lions"), Match("Rangers", "Rangers")})));
}

TEST_F(RenamesTest, ATeamThatStandsAtHomeAloneIsRenamedThereAlone) {
  const std::string after =
      AfterTeam(std::vector<LadderRecord>{Match("Rovers", "Rovers II")}, {"Rovers", "Rangers"});
  EXPECT_TRUE(SameMatches(after, FileOf(std::vector<LadderRecord>{Match("Rangers", "Rovers II")})));
}

TEST_F(RenamesTest, ANameIsWrittenAsItStandsAndCutToTheField) {
  const std::string thirty = "123456789012345678901234567890";
  EXPECT_TRUE(
      SamePlayers(AfterTeam({Player(1, "A", "B", "Rovers", "A Grade")}, {"Rovers", thirty + "1"}),
                  FileOf({Player(1, "A", "B", thirty, "A Grade")})));
  EXPECT_TRUE(SamePlayers(
      AfterTeam({Player(1, "A", "B", "Rovers", "A Grade")}, {"Rovers", "  \"O'Hara\", 2/3  "}),
      FileOf({Player(1, "A", "B", "  \"O'Hara\", 2/3", "A Grade")})));
}

TEST_F(RenamesTest, BytesBehindTheLastWholeRecordStay) {
  const std::string rest = FileOf({Player(2, "A", "B", "Rovers", "A Grade")}).substr(0, 100);
  Write("p", FileOf({Player(1, "A", "B", "Rovers", "A Grade")}) + rest);
  channels.OpenRandom(Channel::Players, "p", kPlayerLength);
  RenameGradeOfPlayers(channels, {"A Grade", "Premier"});
  EXPECT_EQ(Read("p"), FileOf({Player(1, "A", "B", "Rovers", "Premier")}) + rest);
}

TEST_F(RenamesTest, NonsenseKeepsAllItsBytesBesidesTheName) {
  std::string nonsense(kPlayerLength, '\xfe');
  nonsense.replace(94, 20, FixedWidth("A Grade", 20));
  Write("p", nonsense);
  channels.OpenRandom(Channel::Players, "p", kPlayerLength);
  RenameGradeOfPlayers(channels, {"A Grade", "Premier"});
  nonsense.replace(94, 20, FixedWidth("Premier", 20));
  EXPECT_EQ(Read("p"), nonsense);
}

TEST_F(RenamesTest, AllFilesOfAGradeAreRenamed) {
  WriteGradeFiles("A Grade");
  Write("W_A Grade.qz3", "work");
  Write("W_B Grade.qzr", "other");
  EXPECT_EQ(RenameFiles("A Grade", "Premier"), 0);
  EXPECT_EQ(AllFiles(), (Texts{"W_A Grade.qz3: work", "W_B Grade.qzr: other",
                               "W_Premier.qzi: A Grade.qzi", "W_Premier.qzl: A Grade.qzl",
                               "W_Premier.qzr: A Grade.qzr", "W_Premier.qzs: A Grade.qzs"}));
}

TEST_F(RenamesTest, TheFirstFileThatIsMissingEndsTheChain) {
  WriteGradeFiles("A");
  files.Delete("W_A.qzl");
  EXPECT_EQ(RenameFiles("A", "B"), 53);
  EXPECT_EQ(AllFiles(), (Texts{"W_A.qzi: A.qzi", "W_A.qzs: A.qzs", "W_B.qzr: A.qzr"}));
}

TEST_F(RenamesTest, AGradeWithoutResultsKeepsItsLadderUnderTheOldName) {
  WriteGradeFiles("A");
  files.Delete("W_A.qzr");
  EXPECT_EQ(RenameFiles("A", "B"), 53);
  EXPECT_EQ(AllFiles(), (Texts{"W_A.qzi: A.qzi", "W_A.qzl: A.qzl", "W_A.qzs: A.qzs"}));
}

TEST_F(RenamesTest, AFileOfTheNewNameEndsTheChainAndIsNotOverwritten) {
  WriteGradeFiles("A");
  Write("w_b.QZL", "older");
  EXPECT_EQ(RenameFiles("A", "B"), 58);
  EXPECT_EQ(AllFiles(), (Texts{"W_A.qzi: A.qzi", "W_A.qzl: A.qzl", "W_A.qzs: A.qzs",
                               "w_b.QZL: older", "W_B.qzr: A.qzr"}));
}

TEST_F(RenamesTest, AGradesFilesAreNamedByWhatItsFieldHolds) {
  WriteGradeFiles("A");
  EXPECT_EQ(RenameFiles("A", "  Twenty letters and more"), 0);
  EXPECT_TRUE(files.Exists("W_Twenty letters and.qzr")) << "two blanks and eighteen letters";
  EXPECT_EQ(AsGrade("123456789012345678901"), "12345678901234567890");
  EXPECT_EQ(AsTeam("1234567890123456789012345678901"), "123456789012345678901234567890");
}

TEST_F(RenamesTest, ANameThatNoFileCanHaveEndsTheChainAtOnce) {
  WriteGradeFiles("A");
  const Texts before = AllFiles();
  EXPECT_EQ(RenameFiles("A", "B/C"), 76);
  EXPECT_EQ(RenameFiles("A", std::string_view("B\0C", 3)), 52);
  EXPECT_EQ(AllFiles(), before);
}

}  // namespace
}  // namespace marlowbeck
