#include "setup_test.h"

namespace marlowbeck {
namespace {

using BadPlayerFileTest = SetupTest;

TEST_F(BadPlayerFileTest, AFileCutInARecordShowsItsWholeRecords) {
  OpenSetupOf(FileOf(TwoGrades()).substr(0, 4 * kPlayerLength - 10));
  EXPECT_EQ(Lines("cboAddGrd"), TextList{"A Grade"});
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_TRUE(Boxes().empty());
  std::vector<PlayerRecord> expected = TwoGrades();
  expected[3] = Player(4, "Evans", "Flo", "Hawks", "A Grade", 330);
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(expected)));
}

TEST_F(BadPlayerFileTest, NonsenseInTheTextsIsListedAndKept) {
  std::string file = FileOf({Player(1, "Archer", "Jo", "Rovers", "A Grade", 333)});
  std::string nonsense(kPlayerLength, '\0');
  for (std::size_t i = 4; i < 114; ++i) nonsense[i] = static_cast<char>(0x80 + i);
  nonsense.replace(152, 4, std::string("\x4d\x01\0\0", 4));
  file += nonsense;
  OpenSetupOf(file);
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Lines("cboAddGrd").size(), 2U);
  Do("pick cboAddGrd 1");
  Do("pick cboAddTm 1");
  EXPECT_EQ(Lines("lstPlayers").size(), 1U);
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(File(kPlayerFile).substr(0, file.size()), file);
  EXPECT_EQ(File(kPlayerFile).size(), 3 * kPlayerLength);
}

TEST_F(BadPlayerFileTest, ACodeThatIsNoneDescribesNothing) {
  OpenSetup({Player(1, "Archer", "Jo", "Rovers", "A Grade", 12)});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Caption("lblNoP"), "");
  EXPECT_EQ(InSession("BestOfThree"), 12);
}

TEST_F(BadPlayerFileTest, ACodeBeyondSixteenBitsIsToldAsOverflow) {
  OpenSetup({Player(1, "Archer", "Jo", "Rovers", "A Grade", 40000)});
  EXPECT_EQ(BoxTexts().at(0), "OVERFLOW    ");
  EXPECT_EQ(Front(), "frmNames");
  Do("close frmNames");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(BadPlayerFileTest, ABlankFirstGradeIsListedAndLosesNothing) {
  const std::vector<PlayerRecord> players = {Player(1, "Archer", "Jo", "", "", 111),
                                             Player(2, "Baker", "Al", "Rovers", "A Grade", 330)};
  OpenSetup(players);
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"", "A Grade"}));
  EXPECT_EQ(Lines("lstPlayers"), TextList{"Archer, Jo"});
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().size(), 3U);
  EXPECT_EQ(Saved()[2].Grade, std::string(20, ' '));
  EXPECT_EQ(Saved()[2].BestOfThree, 111);
}

TEST_F(BadPlayerFileTest, IdsBelowZeroDoNotCount) {
  OpenSetup({Player(-5, "Archer", "Jo", "Rovers", "A Grade")});
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(1).ID, 1);
}

TEST_F(BadPlayerFileTest, AThousandPlayersAndMoreAreSetUpAsAnyOthers) {
  std::vector<PlayerRecord> players;
  for (int id = 1; id <= 1000; ++id) {
    players.push_back(
        Player(id, "S" + std::to_string(id), "F", "T" + std::to_string(id % 50), "A"));
  }
  OpenSetup(players);
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Lines("cboAddTm").size(), 50U);
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Saved().size(), 1001U);
}

TEST_F(BadPlayerFileTest, AFileOfTooManyRecordsIsToldAsOverflow) {
  const std::string file(32768 * kPlayerLength, ' ');
  OpenSetup(TwoGrades());
  WriteFile(kPlayerFile, file);
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(BoxTexts(), TextList{"OVERFLOW    "});
  Do("close frmNames");
  EXPECT_EQ(File(kPlayerFile), file);
}

TEST_F(BadPlayerFileTest, TheLastRecordThereCanBeIsNotFollowedByAnother) {
  const std::string file =
      FileOf({Player(1, "A", "B", "Rovers", "A Grade")}) + std::string(32766 * kPlayerLength, ' ');
  OpenSetupOf(file);
  Do("type cboAddGrd A Grade");
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(BoxTexts(), TextList{"OVERFLOW    "});
  EXPECT_EQ(File(kPlayerFile), file);
}

}  // namespace
}  // namespace marlowbeck
