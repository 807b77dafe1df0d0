#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

/// The path that every failure takes to the error box.
class ErrorPath : public ClubTest {
 protected:
  void SetUp() override {
    WritePlayers("Winter.qza", {Player(1, "Archer", "Jo", "Rovers", "A Grade"),
                                Player(2, "Bull", "Ann", "Hawks", "A Grade")});
    NameOpenFile("Winter.qza");
    Start();
  }
};

TEST_F(ErrorPath, BoxTellsTheWordsInCapitalsAndTheProgramGoesOn) {
  DoAll({"fault open 1 71", "click imgLadder"});
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text, "DISK NOT READY - CHECK DRIVE    ");
  EXPECT_EQ(Boxes()[0].title, "Marlowbeck Error!");
  EXPECT_EQ(Boxes()[0].style, 16);
  EXPECT_EQ(InSession("ErrorNumber"), 71);
  EXPECT_EQ(Front(), "frmDB");
  Do("click imgLadder");
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(ErrorPath, FailureWhileAFileIsReadThroughLeavesItToBeOpenedAgain) {
  DoAll({"fault read 1 57", "click imgLadder"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"DEVICE I/O ERROR    "}));
  EXPECT_EQ(Front(), "frmDB");
  Do("click imgLadder");
  EXPECT_EQ(Front(), "frmLadder");
  EXPECT_EQ(Count("error"), 0);
}

TEST_F(ErrorPath, UnknownNumberHasWordsOfItsOwn) {
  DoAll({"fault open 1 1234", "click imgLadder"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"AN UNRECOGNISED ERROR HAS OCCURED!    "}));
}

TEST_F(ErrorPath, NumberIsNarrowedToSixteenBits) {
  DoAll({"fault open 1 65542", "click imgLadder"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"OVERFLOW    "}));
  EXPECT_EQ(InSession("ErrorNumber"), 6);
}

TEST_F(ErrorPath, SpellingStaysAsItIs) {
  DoAll({"fault open 1 18", "click imgLadder"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"USER INTERUPRT OCCURED    "}));
}

TEST_F(ErrorPath, ErrorBoxActivatesNothingBehindIt) {
  // Every read fails: if the box's going activated the main menu, it would go round for ever.
  DoAll({"fault read 1+ 57", "click imgLadder"});
  EXPECT_EQ(Count("error"), 1);
  Do("fault off");
}

TEST_F(ErrorPath, ErrorIsToldBeforeItsBox) {
  DoAll({"fault open 1 76", "click imgLadder"});
  ASSERT_EQ(Events().size(), 2U);
  EXPECT_TRUE(Events()[0].contains("error"));
  EXPECT_TRUE(Events()[1].contains("box"));
}

TEST_F(ErrorPath, FileOfTooManyRecordsOverflows) {
  WriteFile("Winter.qza", std::string(32768 * kPlayerLength, ' '));
  DoAll({"click mnuAbout", "click cmdOK"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"OVERFLOW    "}));
  EXPECT_EQ(InSession("PlayerCount"), 2);
}

TEST_F(ErrorPath, FileOfTheMostRecordsOpens) {
  WriteFile("Winter.qza", std::string(32767 * kPlayerLength, ' '));
  DoAll({"click mnuAbout", "click cmdOK"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Caption("lblHMPlayers"), "32767 Players Listed in File. ");
}

TEST_F(ErrorPath, NonsenseInEveryFieldHurtsNothing) {
  std::string nonsense;
  for (std::size_t i = 0; i < 10 * kPlayerLength; ++i) nonsense += static_cast<char>(i * 37 + 11);
  WriteFile("Winter.qza", nonsense);
  DoAll({"click mnuAbout", "click cmdOK", "click imgLadder"});
  EXPECT_EQ(Count("error"), 0);
  EXPECT_EQ(Caption("lblHMPlayers"), "10 Players Listed in File. ");
  EXPECT_EQ(File("Winter.qza"), nonsense);
}

}  // namespace
}  // namespace marlowbeck
