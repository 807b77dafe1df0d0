#include "setup_test.h"

namespace marlowbeck {
namespace {

class FirstPlayerTest : public SetupTest {
 protected:
  FirstPlayerTest() { OpenSetupLater(); }

  void OpenSetupLater() {
    WritePlayers(kPlayerFile, {});
    NameOpenFile(kPlayerFile);
  }

  void Open() { Do("click imgPlayers"); }

  /// The ticks of the five boxes in a row: games, All, None.
  std::string Ticks() {
    std::string ticks;
    for (const char* box : {"chkTriples", "chkDoubles", "chkSingles", "chkAll", "chkNone"}) {
      ticks += Ticked(box) ? 'x' : '-';
    }
    return ticks;
  }

  void ExpectNothingSaved() {
    EXPECT_EQ(Count("sound"), 0);
    EXPECT_EQ(File(kPlayerFile), "");
    EXPECT_TRUE(Shown("panAddPlayer0"));
  }
};

TEST_F(FirstPlayerTest, AnEmptyFileOpensOnTheEntryOfItsFirstPlayer) {
  Open();
  EXPECT_TRUE(Shown("panAddPlayer0"));
  EXPECT_TRUE(Shown("fraNoP"));
  EXPECT_FALSE(Shown("panAddPlayer"));
  EXPECT_FALSE(Shown("fraNamesMenu"));
  EXPECT_EQ(Focus(), "frmNames.txtAddSn0");
  EXPECT_EQ(Caption("panAddPlayer0"), "ADD: Player, Team and Grade");
  EXPECT_EQ(Caption("fraNoP"), "Select BEST of THREE games");
  EXPECT_EQ(Caption("Label9"), "This is the entry section for the first player in your NEW FILE.");
}

TEST_F(FirstPlayerTest, TheBoxesOfTheGamesBearTheirNames) {
  WriteFile("GameName.qz3", "Teams\r\nPairs\r\nOnes\r\nTms\r\nPrs\r\n1s\r\n");
  Open();
  EXPECT_EQ(Caption("chkTriples"), "Teams");
  EXPECT_EQ(Caption("chkDoubles"), "Pairs");
  EXPECT_EQ(Caption("chkSingles"), "Ones");
  EXPECT_EQ(Caption("chkAll"), "All");
  EXPECT_EQ(Caption("chkNone"), "None");
}

TEST_F(FirstPlayerTest, SavingMakesTheFirstRecord) {
  Open();
  TypeFirstPlayer();
  Do("click chkNone");
  Do("click cmdAddSave0");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_TRUE(SamePlayers(File(kPlayerFile),
                          FileOf({Player(1, "Archer", "Jo", "Rovers", "A Grade", 111)})));
  EXPECT_EQ(InSession("Team"), "Rovers");
  EXPECT_EQ(InSession("Grade"), "A Grade");
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(FirstPlayerTest, SavingGoesOnWithTheLists) {
  Open();
  TypeFirstPlayer();
  Do("click chkTriples");
  Do("click cmdAddSave0");
  EXPECT_FALSE(Shown("panAddPlayer0"));
  EXPECT_TRUE(Shown("panAddPlayer"));
  EXPECT_FALSE(Shown("cmdClear"));
  EXPECT_EQ(Lines("lstPlayers"), TextList{"Archer, Jo"});
  EXPECT_EQ(Caption("lblHMP"), "Players: (1)  Select to Edit or Delete");
  EXPECT_EQ(Text("cboAddGrd"), "A Grade");
  EXPECT_EQ(Text("cboAddTm"), "Rovers");
  EXPECT_EQ(Caption("lblNoP"), "Triples Only");
  EXPECT_EQ(Focus(), "frmNames.txtAddSn");
}

TEST_F(FirstPlayerTest, TheTextsAreKeptAsTypedAndCutToWidth) {
  Open();
  Do("type txtAddSn0  Anderson-Featherstonehaugh-Ex");  // 30 with the blank in front
  Do("type txtAddFn0 Bartholomew Maximilian Alexander");
  Do("type txtAddTm0 Rovers, \"the\" Old");
  Do("type txtAddGrd0 A Grade of far too many letters");
  Do("click chkAll");
  Do("click cmdAddSave0");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Surname, " Anderson-Featherstonehaugh-Ex");
  EXPECT_EQ(Saved()[0].FirstName, "Bartholomew Maximilian Alexand");
  EXPECT_EQ(Saved()[0].Team, FixedWidth("Rovers, \"the\" Old", 30));
  EXPECT_EQ(Saved()[0].Grade, "A Grade of far too m");
  EXPECT_EQ(Saved()[0].BestOfThree, 333);
}

TEST_F(FirstPlayerTest, WithoutATickNothingIsSaved) {
  Open();
  TypeFirstPlayer();
  Do("focus txtAddTm0");
  Do("click cmdAddSave0");
  EXPECT_EQ(BoxTexts(), TextList{"You have not checked the Best of Three boxes.    \r"
                                 "This must be done before you can continue.    "});
  EXPECT_EQ(Focus(), "frmNames.txtAddSn0");
  ExpectNothingSaved();
}

TEST_F(FirstPlayerTest, ASurnameOfThirtyOneLettersIsRefusedAndOneOfThirtyIsNot) {
  Open();
  TypeFirstPlayer(std::string(31, 'a'));
  Do("click chkNone");
  Do("click cmdAddSave0");
  EXPECT_EQ(BoxTexts(), TextList{"Surname must be 30 characters or less.    "});
  EXPECT_EQ(Focus(), "frmNames.txtAddSn0");
  ExpectNothingSaved();
  Do("type txtAddSn0 " + std::string(30, 'a'));
  Do("click cmdAddSave0");
  EXPECT_EQ(Saved().at(0).Surname, std::string(30, 'a'));
}

TEST_F(FirstPlayerTest, AllFourEntriesMustBeThere) {
  Open();
  Do("click chkNone");
  for (const char* box : {"txtAddSn0", "txtAddFn0", "txtAddTm0", "txtAddGrd0"}) {
    TypeFirstPlayer();
    Do(std::string("type ") + box);
    Do("click cmdAddSave0");
    EXPECT_EQ(BoxTexts(), TextList{"All sections must be completed    \r"
                                   "before you can add to the file.    "});
    EXPECT_EQ(Focus(), "frmNames.txtAddSn0");
    ExpectNothingSaved();
  }
}

TEST_F(FirstPlayerTest, AllTicksTheGamesAndUnticksNone) {
  Open();
  Do("click chkNone");
  Do("click chkAll");
  EXPECT_EQ(Ticks(), "xxxx-");
}

TEST_F(FirstPlayerTest, NoneUnticksTheGamesAndAll) {
  Open();
  Do("click chkAll");
  Do("click chkNone");
  EXPECT_EQ(Ticks(), "----x");
}

TEST_F(FirstPlayerTest, AGameUnticksNone) {
  Open();
  Do("click chkNone");
  Do("click chkDoubles");
  EXPECT_EQ(Ticks(), "-x---");
}

TEST_F(FirstPlayerTest, TheThirdGameTicksAll) {
  Open();
  DoAll({"click chkSingles", "click chkTriples"});
  EXPECT_EQ(Ticks(), "x-x--");
  Do("click chkDoubles");
  EXPECT_EQ(Ticks(), "xxxx-");
}

TEST_F(FirstPlayerTest, AGameUntickedUnticksAll) {
  Open();
  DoAll({"click chkAll", "click chkSingles"});
  EXPECT_EQ(Ticks(), "xx---");
}

TEST_F(FirstPlayerTest, UntickingAllOrNoneChangesNothingElse) {
  Open();
  DoAll({"click chkAll", "click chkAll"});
  EXPECT_EQ(Ticks(), "xxx--");
  DoAll({"click chkNone", "click chkNone"});
  EXPECT_EQ(Ticks(), "-----");
}

TEST_F(FirstPlayerTest, TheGamesTickedMakeTheCode) {
  struct Case {
    std::vector<std::string> clicks;
    int code;
  };
  const std::vector<Case> cases = {
      {{"click chkTriples"}, 300},
      {{"click chkDoubles"}, 30},
      {{"click chkSingles"}, 3},
      {{"click chkTriples", "click chkDoubles"}, 330},
      {{"click chkTriples", "click chkSingles"}, 303},
      {{"click chkDoubles", "click chkSingles"}, 33},
      {{"click chkAll"}, 333},
      {{"click chkNone"}, 111},
      {{"click chkAll", "click chkAll"}, 333},
  };
  for (const Case& one : cases) {
    WritePlayers(kPlayerFile, {});
    Open();
    TypeFirstPlayer();
    DoAll(one.clicks);
    Do("click cmdAddSave0");
    EXPECT_EQ(Saved().at(0).BestOfThree, one.code);
    Do("close frmNames");
  }
}

TEST_F(FirstPlayerTest, ExitLeavesTheFileEmpty) {
  Open();
  for (const char* leave : {"click cmdAddCancel0", "key Esc", "close frmNames"}) {
    Do(leave);
    EXPECT_EQ(Front(), "frmDB");
    EXPECT_FALSE(Loaded("frmNames"));
    EXPECT_EQ(Caption("lblHMPlayers"), " Current File is Empty ");
    EXPECT_EQ(File(kPlayerFile), "");
    Open();
  }
}

TEST_F(FirstPlayerTest, EnterGoesFromBoxToBoxAndOnToTheChecks) {
  Open();
  for (const char* next : {"txtAddFn0", "txtAddTm0", "txtAddGrd0", "chkTriples"}) {
    Do("key Enter");
    EXPECT_EQ(Focus(), std::string("frmNames.") + next);
  }
}

TEST_F(FirstPlayerTest, ARecordThatIsNoneYetIsNoPlayer) {
  WriteFile(kPlayerFile, std::string(155, 'x'));
  Open();
  EXPECT_TRUE(Shown("panAddPlayer0"));
  TypeFirstPlayer();
  DoAll({"click chkNone", "click cmdAddSave0"});
  EXPECT_TRUE(SamePlayers(File(kPlayerFile),
                          FileOf({Player(1, "Archer", "Jo", "Rovers", "A Grade", 111)})));
}

}  // namespace
}  // namespace marlowbeck
