#include "setup/player_deletion.h"

#include <gtest/gtest.h>

#include "data/expect_error.h"
#include "data/real_file_system.h"
#include "setup/player_names.h"
#include "setup_test.h"

namespace marlowbeck {
namespace {

class PlayerDeletionTest : public ::testing::Test {
 protected:
  PlayerDeletionTest() { files.ChangeFolder(folder.Path().string()); }

  void Open(const std::vector<PlayerRecord>& players) {
    Write("p", FileOf(players));
    channels.OpenRandom(Channel::Players, "p", kPlayerLength);
  }
  void Open(const std::vector<ResultRecord>& results) {
    Write("r", FileOf(results));
    channels.OpenRandom(Channel::Results, "r", kResultLength);
  }
  std::string Read(const std::string& name) { return channels.ReadWhole(name); }

  TemporaryFolder folder;
  RealFileSystem files;
  Channels channels{files};

 private:
  void Write(const std::string& name, std::string_view bytes) {
    const auto file = files.Open(name, OpenMode::Truncate);
    file->WriteAt(0, std::as_bytes(std::span(bytes)));
    file->Close();
  }
};

using Results = std::vector<ResultRecord>;

TEST_F(PlayerDeletionTest, ResultsAreCountedByTheId) {
  Open(Results{Night(7, "Rovers", "Hawks"), Night(70, "Rovers", "Hawks"),
               Night(7, "Lions", "Hawks", 3), Night(-7, "Rovers", "Hawks")});
  EXPECT_EQ(CountResultsOf(channels, 7), 2);
  EXPECT_EQ(CountResultsOf(channels, 8), 0);
  EXPECT_TRUE(HasResults(channels, 70));
  EXPECT_FALSE(HasResults(channels, 0));
}

TEST_F(PlayerDeletionTest, ResultsOfOthersMoveUpInTheirOrder) {
  Open(Results{Night(7, "Rovers", "Hawks"), Night(2, "Rovers", "Hawks"), Night(7, "R", "H", 3),
               Night(1, "Hawks", "Rovers")});
  RemoveResultsOf(channels, 7);
  EXPECT_TRUE(SameResults(
      Read("r"), FileOf(Results{Night(2, "Rovers", "Hawks"), Night(1, "Hawks", "Rovers")})));
}

TEST_F(PlayerDeletionTest, PlayersKeepTheirIds) {
  Open({Player(7, "A", "B", "Rovers", "A"), Player(3, "C", "D", "Rovers", "A"),
        Player(9, "E", "F", "Rovers", "A")});
  RemovePlayer(channels, 3);
  EXPECT_TRUE(SamePlayers(
      Read("p"), FileOf({Player(7, "A", "B", "Rovers", "A"), Player(9, "E", "F", "Rovers", "A")})));
}

TEST_F(PlayerDeletionTest, TheQuestionCountsTheGames) {
  const std::string before =
      "You are about to permanently erase the following player from your file.    \r\r";
  const std::string after = "\r\rDo you wish to proceed ?    ";
  EXPECT_EQ(DeletionQuestion(" Archer, Jo ", 0),
            before + "Archer, Jo\r   (No results were found for this player)    " + after);
  EXPECT_EQ(DeletionQuestion("Archer, Jo", 1),
            before + "Archer, Jo\r   (This includes results found for 1 game.)    " + after);
  EXPECT_EQ(DeletionQuestion("Archer, Jo", 2),
            before + "Archer, Jo\r   (This includes results found for 2 games.)    " + after);
}

TEST_F(PlayerDeletionTest, OfEqualLinesTheLastIsEditedAndTheFirstDeleted) {
  Open({Player(1, "Cole", "Di", "Hawks", "A"), Player(2, "Cole", "Di", "Rovers", "A"),
        Player(3, " Cole", "Di ", "Rovers", "A"), Player(4, "Cole", "Di", "Rovers", "A"),
        Player(5, "Cole", "Di", "Rovers", "B")});
  const ListedLine at{"Rovers", " A ", "Cole, Di"};
  const auto last = LastListed(channels, at);
  ASSERT_TRUE(last);
  EXPECT_EQ(last->record, 4);
  EXPECT_EQ(last->id, 4);
  const auto first = FirstListed(channels, at);
  ASSERT_TRUE(first);
  EXPECT_EQ(first->record, 2);
  EXPECT_EQ(first->id, 2);
  EXPECT_EQ(first->surname, "Cole");
  EXPECT_EQ(first->first_name, "Di");
  EXPECT_FALSE(LastListed(channels, {"Rovers", "A", "cole, di"}));
  EXPECT_FALSE(FirstListed(channels, {"Lions", "A", "Cole, Di"}));
}

TEST_F(PlayerDeletionTest, NamesWithCommasAreToldApartByTheWholeLineAlone) {
  Open({Player(1, "Cole, Di", "Jo", "Rovers", "A"), Player(2, "Cole", "Di, Jo", "Rovers", "A")});
  EXPECT_EQ(FirstListed(channels, {"Rovers", "A", "Cole, Di, Jo"})->id, 1);
  EXPECT_EQ(LastListed(channels, {"Rovers", "A", "Cole, Di, Jo"})->id, 2);
}

TEST_F(PlayerDeletionTest, IdsAreHandedOverInSixteenBits) {
  for (const int id : {32767, -32768}) {
    Open({Player(id, "Cole", "Di", "Rovers", "A")});
    EXPECT_EQ(FirstListed(channels, {"Rovers", "A", "Cole, Di"})->id, id);
  }
  for (const int id : {32768, -32769, 2147483647}) {
    Open({Player(id, "Cole", "Di", "Rovers", "A")});
    EXPECT_EQ(ErrorOf([&] { (void)FirstListed(channels, {"Rovers", "A", "Cole, Di"}); }), 6);
    EXPECT_EQ(ErrorOf([&] { (void)LastListed(channels, {"Rovers", "A", "Cole, Di"}); }), 6);
  }
}

TEST_F(PlayerDeletionTest, AnIdTooHighIsMetByTheLastMatchAndNotByTheFirst) {
  Open({Player(1, "Cole", "Di", "Rovers", "A"), Player(40000, "Cole", "Di", "Rovers", "A"),
        Player(2, "Cole", "Di", "Rovers", "A")});
  EXPECT_EQ(FirstListed(channels, {"Rovers", "A", "Cole, Di"})->id, 1);
  EXPECT_EQ(ErrorOf([&] { (void)LastListed(channels, {"Rovers", "A", "Cole, Di"}); }), 6);
}

}  // namespace
}  // namespace marlowbeck
