#include "data/competition.h"

#include <algorithm>
#include <random>
#include <set>

#include <gtest/gtest.h>

#include "data/real_file_system.h"
#include "tests/data/expect_error.h"
#include "tests/data/temporary_folder.h"

namespace marlowbeck {
namespace {

using Names = std::vector<std::string>;

class Competition : public testing::Test {
 protected:
  Competition() {
    files.ChangeFolder(folder.Path());
    session.PlayerFile = folder.In("Winter.qza");
  }

  /// A player file of these grades, each with its number as team.
  void WritePlayers(const Names& grades, const std::string& team = "") {
    std::string content;
    for (std::size_t i = 0; i < grades.size(); ++i) {
      PlayerRecord player;
      player.ID = static_cast<std::int32_t>(i) + 1;
      player.Grade = grades[i];
      player.Team = team.empty() ? std::to_string(i) : team;
      const PlayerBytes bytes = Encode(player);
      content.append(reinterpret_cast<const char*>(bytes.data()), bytes.size());
    }
    folder.Write("Winter.qza", content);
    OpenFile(session, channels);
  }

  TemporaryFolder folder;
  RealFileSystem files;
  Channels channels{files};
  Session session;
};

TEST(GradeFileName, JoinsTheBaseAndTheTrimmedGrade) {
  EXPECT_EQ(GradeFileName("C:\\Data\\Winter.qza", "A Grade", ".qzr"),
            "C:\\Data\\Winter_A Grade.qzr");
  EXPECT_EQ(GradeFileName("/club/Winter.qza", "A Grade             ", ".qzl"),
            "/club/Winter_A Grade.qzl");
  EXPECT_EQ(GradeFileName("/club/Winter.qza", "  A  ", ".qzi"), "/club/Winter_A.qzi");
  EXPECT_EQ(GradeFileName("/club/Winter.qza", "", ".qzr"), "/club/Winter_.qzr");
  EXPECT_EQ(GradeFileName("a", "B", ".qzr"), "_B.qzr");
}

TEST(NameGradeFiles, NamesAllFilesOfTheGrade) {
  Session session;
  session.PlayerFile = "/club/Winter.QZA";
  session.Grade = "Premier";
  NameGradeFiles(session);
  EXPECT_EQ(session.ResultsFile, "/club/Winter_Premier.qzr");
  EXPECT_EQ(session.LadderFile, "/club/Winter_Premier.qzl");
  EXPECT_EQ(session.LadderConfigFile, "/club/Winter_Premier.qzi");
  EXPECT_EQ(session.SeasonFile, "/club/Winter_Premier.qzs");
  EXPECT_EQ(session.SeasonReportFile, "/club/Winter_Premier.qz3");
}

TEST(WithExtension, ReplacesTheLastFourCharactersWhateverTheyAre) {
  EXPECT_EQ(WithExtension("Winter_A.qzr", ".qz3"), "Winter_A.qz3");
  EXPECT_EQ(WithExtension("abcdef", ".qz3"), "ab.qz3");
  EXPECT_EQ(WithExtension("ab", ".qz3"), ".qz3");
}

TEST_F(Competition, OpeningCountsWholeRecords) {
  folder.Write("Winter.qza", std::string(156 * 3 + 155, ' '));
  OpenFile(session, channels);
  EXPECT_EQ(session.PlayerCount, 3);
  session.Grade = "A";
  NameGradeFiles(session);
  OpenResultSFile(session, channels);
  EXPECT_EQ(session.ResultCount, 0);
  EXPECT_TRUE(folder.Has("Winter_A.qzr"));
  OpenLadderFile(session, channels);
  EXPECT_EQ(session.LadderCount, 0);
  EXPECT_TRUE(folder.Has("Winter_A.qzl"));
}

TEST_F(Competition, WithNoFileNamedNothingIsOpened) {
  session.PlayerFile.clear();
  session.PlayerCount = 7;
  OpenFile(session, channels);
  OpenResultSFile(session, channels);
  EXPECT_EQ(session.PlayerCount, 7);
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Players));
}

TEST_F(Competition, TooManyRecordsLeaveTheCountAsItWas) {
  folder.Write("Winter.qza", std::string(std::size_t{156} * 32768, ' '));
  session.PlayerCount = 7;
  EXPECT_ERROR(6, OpenFile(session, channels));
  EXPECT_EQ(session.PlayerCount, 7);
}

TEST_F(Competition, GradesComeInRecordOrder) {
  WritePlayers({"B", "A", "  B  ", ""});
  EXPECT_EQ(GradesInFile(channels), (Names{"B", "A", "B", ""}));
}

TEST_F(Competition, TeamsAreThoseOfTheGradeComparedByCaseAndTrimmed) {
  WritePlayers({"A Grade", "a grade", "A Grade "});
  EXPECT_EQ(TeamsInFile(channels, " A Grade  "), (Names{"0", "2"}));
  EXPECT_EQ(TeamsInFile(channels, "C"), Names{});
}

TEST_F(Competition, TheListsHaveRoomFor999Names) {
  WritePlayers(Names(999, "A"));
  EXPECT_EQ(GradesInFile(channels).size(), 999U);
  EXPECT_EQ(TeamsInFile(channels, "A").size(), 999U);
  for (const std::size_t count : {1000U, 1001U}) {
    WritePlayers(Names(count, "A"));
    EXPECT_ERROR(9, (void)GradesInFile(channels)) << count;
    EXPECT_ERROR(9, (void)TeamsInFile(channels, "A")) << count;
    EXPECT_EQ(TeamsInFile(channels, "B").size(), 0U) << "only the grade's own names count";
  }
}

TEST(SortedDistinct, OrdersByBytesAndListsEachOnce) {
  EXPECT_EQ(SortedDistinct({"b", "B", "a", "B", "\xC9", "", "b"}),
            (Names{"", "B", "a", "b", "\xC9"}));
  EXPECT_EQ(SortedDistinct({"only"}), (Names{"only"}));
  EXPECT_EQ(SortedDistinct({}), Names{});
}

TEST(SortedDistinct, IsTheSetOfNames) {
  std::mt19937 chance(1);
  for (int round = 0; round < 300; ++round) {
    Names names(chance() % 40);
    for (std::string& name : names) name.assign(1, static_cast<char>('a' + chance() % 9));
    const std::set<std::string> expected(names.begin(), names.end());
    ASSERT_EQ(SortedDistinct(names), Names(expected.begin(), expected.end()));
  }
}

TEST_F(Competition, TheWorkDateComesBack) {
  WriteWorkDate(channels, Date{38077});
  EXPECT_EQ(folder.Read("WkDate.qz3"), "#2004-03-31#\r\n");
  EXPECT_EQ(ReadWorkDate(channels).days, 38077);
  for (const char* nonsense : {"", "31/03/2004", "\"2004-03-31\"", "#2004-03-"}) {
    folder.Write("WkDate.qz3", nonsense);
    EXPECT_NE(ErrorOf([&] { (void)ReadWorkDate(channels); }), 0) << nonsense;
  }
  folder.Write("WkDate.qz3", "#2004-03-31#\n");
  EXPECT_EQ(ReadWorkDate(channels).days, 38077) << "a line end of another system";
}

TEST_F(Competition, OneStringComesBackWithItsCommasAndQuotes) {
  WriteOneString(channels, "FileName.qz3", "/club/\"A\" and, B/Winter.qza");
  EXPECT_EQ(ReadOneString(channels, "filename.qz3"), "/club/\"A\" and, B/Winter.qza");
  WriteOneString(channels, "FileName.qz3", "/club/\"First\", and last/\",Winter\".qza");
  EXPECT_EQ(ReadOneString(channels, "FileName.qz3"), "/club/\"First\", and last/\",Winter\".qza");
  WriteOneString(channels, "FileName.qz3", "");
  EXPECT_EQ(ReadOneString(channels, "FileName.qz3"), "");
  EXPECT_EQ(folder.Read("FileName.qz3"), "\"\"\r\n");
}

}  // namespace
}  // namespace marlowbeck
