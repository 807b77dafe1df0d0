#include "setup_test.h"

namespace marlowbeck {
namespace {

class BestOfThreeTest : public SetupTest {
 protected:
  /// Types a grade that has no player and leaves the box.
  void LeaveNewGrade(const std::string& grade = "C Grade") {
    Do("type cboAddGrd " + grade);
    Do("key Enter");
  }

  std::string Ticks() {
    std::string ticks;
    for (const char* box : {"chkTrip", "chkDoub", "chkSing", "chkEvery", "chkNun"}) {
      ticks += Ticked(box) ? 'x' : '-';
    }
    return ticks;
  }

  void ExpectListsBack() {
    EXPECT_FALSE(Shown("fraBoT"));
    EXPECT_TRUE(Shown("fraGT3"));
    EXPECT_TRUE(Shown("fraPList"));
    EXPECT_TRUE(Enabled("cmdAddSave"));
    EXPECT_TRUE(Enabled("cmdEdBOT"));
    EXPECT_TRUE(Enabled("cmdAddCancel"));
    EXPECT_EQ(Focus(), "frmNames.txtAddSn");
    EXPECT_EQ(InSession("Flag"), 0);
  }

  std::vector<int> Codes() {
    std::vector<int> codes;
    for (const PlayerRecord& player : Saved()) codes.push_back(player.BestOfThree);
    return codes;
  }
};

TEST_F(BestOfThreeTest, LeavingANewGradeAsksForItsGames) {
  OpenSetup(TwoGrades());
  LeaveNewGrade();
  EXPECT_TRUE(Shown("fraBoT"));
  EXPECT_FALSE(Shown("fraGT3"));
  EXPECT_FALSE(Shown("fraPList"));
  EXPECT_FALSE(Enabled("cmdAddSave"));
  EXPECT_EQ(Ticks(), "-----");
  EXPECT_EQ(Caption("fraBoT"), "BEST of THREE games");
  EXPECT_EQ(Caption("lblNoP"), " Not selected.");
  EXPECT_EQ(Focus(), "frmNames.cmdNoPOK");
}

TEST_F(BestOfThreeTest, AFailedLookAtTheSettingLeavesItAndTheScreenAsTheyWere) {
  OpenSetup(TwoGrades());
  const auto code = InSession("BestOfThree");
  DoAll({"fault any 2 57", "click cmdEdBOT"});
  EXPECT_EQ(Count("error"), 1);
  EXPECT_EQ(InSession("BestOfThree"), code);
  ExpectListsBack();
}

TEST_F(BestOfThreeTest, AFailedLookAtTheNamesInUseGivesTheCommandsBack) {
  OpenSetup(TwoGrades());
  DoAll({"input Kings", "fault open 1 57", "click cmdNewTm"});
  EXPECT_EQ(Count("error"), 1);
  EXPECT_TRUE(Enabled("cmdAddCancel"));
  DoAll({"input Kings", "click cmdNewTm"});
  EXPECT_EQ(Text("cboAddTm"), "Kings");
}

TEST_F(BestOfThreeTest, AClickAwayFromANewGradeIsLostToThePanel) {
  OpenSetup(TwoGrades());
  TypeNames("Evans", "Flo");
  Do("type cboAddGrd C Grade");
  EXPECT_EQ(Do("click cmdAddSave")["lost"], true);
  EXPECT_TRUE(Shown("fraBoT"));
  EXPECT_EQ(Saved().size(), 4U);
}

TEST_F(BestOfThreeTest, LeavingAGradeThatHasPlayersAsksNothing) {
  OpenSetup(TwoGrades());
  Do("type cboAddGrd B Grade");
  Do("key Tab");
  EXPECT_FALSE(Shown("fraBoT"));
  EXPECT_EQ(Focus(), "frmNames.cboAddTm");
}

TEST_F(BestOfThreeTest, AGradeWhosePlayersHaveNoCodeIsNotNew) {
  OpenSetup({Player(1, "Archer", "Jo", "Rovers", "A Grade", 0)});
  TypeNames("Evans", "Flo");
  Do("focus cboAddGrd");
  Do("focus txtAddSn");
  EXPECT_FALSE(Shown("fraBoT"));
  EXPECT_EQ(Caption("lblNoP"), " Not selected.");
  EXPECT_FALSE(Enabled("cmdAddSave"));
}

TEST_F(BestOfThreeTest, TheBoxesBearTheNamesOfTheGames) {
  WriteFile("GameName.qz3", "Teams\r\nPairs\r\nOnes\r\nTms\r\nPrs\r\n1s\r\n");
  OpenSetup(TwoGrades());
  EXPECT_EQ(Caption("lblNoP"), "Teams & Pairs");
  LeaveNewGrade();
  EXPECT_EQ(Caption("chkTrip"), "Teams");
  EXPECT_EQ(Caption("chkDoub"), "Pairs");
  EXPECT_EQ(Caption("chkSing"), "Ones");
  EXPECT_EQ(Caption("chkEvery"), "All");
  EXPECT_EQ(Caption("chkNun"), "None");
}

TEST_F(BestOfThreeTest, TheDescriptionFollowsTheBoxes) {
  OpenSetup(TwoGrades());
  LeaveNewGrade();
  const std::vector<std::pair<std::string, std::string>> steps = {
      {"chkTrip", "Triples Only"}, {"chkDoub", "Triples & Doubles"},
      {"chkSing", " All games."},  {"chkTrip", "Doubles & Singles"},
      {"chkDoub", "Singles Only"}, {"chkTrip", "Triples & Singles"},
      {"chkNun", " No games."},    {"chkDoub", "Doubles Only"},
      {"chkEvery", " All games."}, {"chkEvery", " All games."},
      {"chkNun", " No games."},    {"chkNun", " Not selected."},
  };
  for (const auto& [box, words] : steps) {
    Do("click " + box);
    EXPECT_EQ(Caption("lblNoP"), words) << box;
    EXPECT_EQ(Focus(), "frmNames.cmdNoPOK");
  }
}

TEST_F(BestOfThreeTest, TheCodeGoesIntoTheFirstPlayerOfTheNewGrade) {
  OpenSetup(TwoGrades());
  Do("input C Grade");
  Do("click cmdNewGrd");
  Do("focus cboAddGrd");
  Do("key Enter");
  EXPECT_TRUE(Shown("fraBoT"));
  DoAll({"click chkSing", "click chkTrip", "click cmdNoPOK"});
  EXPECT_TRUE(Boxes().empty());
  ExpectListsBack();
  EXPECT_EQ(Caption("lblNoP"), "Triples & Singles");
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(4).Grade, FixedWidth("C Grade", 20));
  EXPECT_EQ(Saved().at(4).BestOfThree, 303);
  EXPECT_EQ(Caption("lblNoP"), "Triples & Singles");
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"A Grade", "B Grade", "C Grade"}));
}

TEST_F(BestOfThreeTest, WithNoBoxTickedANewGradeStaysWithoutAndIsAskedAgain) {
  OpenSetup(TwoGrades());
  LeaveNewGrade();
  Do("click cmdNoPOK");
  EXPECT_EQ(BoxTexts(), TextList{"You have not checked any BEST OF THREE boxes.    \r"
                                 "This must be done before you can continue.    "});
  ExpectListsBack();
  EXPECT_EQ(Caption("lblNoP"), " Not selected.");
  Do("focus cboAddGrd");
  Do("key Enter");
  EXPECT_TRUE(Shown("fraBoT"));
}

TEST_F(BestOfThreeTest, CancelLeavesANewGradeWithoutACodeAndAPlayerCanBeSavedAnyway) {
  OpenSetup(TwoGrades());
  for (const char* cancel : {"click cmdCancelBo3", "key Esc"}) {
    LeaveNewGrade();
    Do("click chkTrip");
    Do(cancel);
    EXPECT_TRUE(Boxes().empty());
    ExpectListsBack();
    EXPECT_EQ(InSession("BestOfThree"), 0);
  }
  TypeNames("Evans", "Flo");
  Do("click cmdAddSave");
  EXPECT_EQ(Saved().at(4).BestOfThree, 0);
}

TEST_F(BestOfThreeTest, SaveAfterTheCancelledPanelAsksForNames) {
  OpenSetup(TwoGrades());
  LeaveNewGrade();
  Do("click cmdCancelBo3");
  Do("click cmdAddSave");
  EXPECT_EQ(BoxTexts(), TextList{"Surname & First Name       \rmust be completed.       "});
}

TEST_F(BestOfThreeTest, ChangingShowsTheSettingOfTheGrade) {
  OpenSetup(TwoGrades());
  Do("click cmdEdBOT");
  EXPECT_TRUE(Shown("fraBoT"));
  EXPECT_FALSE(Shown("fraGT3"));
  EXPECT_FALSE(Shown("fraPList"));
  EXPECT_EQ(Ticks(), "xx---");
  EXPECT_EQ(InSession("Flag"), 1);
  for (const char* button : {"cmdEdBOT", "cmdEdGradeName", "cmdEdTeamName", "cmdAddCancel",
                             "cmdNewGrd", "cmdNewTm", "cmdSearch"}) {
    EXPECT_FALSE(Enabled(button)) << button;
  }
  EXPECT_TRUE(Enabled("cmdHelpNames"));
}

TEST_F(BestOfThreeTest, AChangeIsStampedOnEveryPlayerOfTheGradeInTheCombo) {
  OpenSetup(TwoGrades());
  DoAll({"click cmdEdBOT", "click chkSing", "click cmdNoPOK"});
  ExpectListsBack();
  EXPECT_EQ(Codes(), (std::vector<int>{333, 333, 333, 111}));
  EXPECT_EQ(Caption("lblNoP"), " All games.");
  Do("pick cboAddGrd =B Grade");
  DoAll({"click cmdEdBOT", "click chkDoub", "click cmdNoPOK"});
  EXPECT_EQ(Codes(), (std::vector<int>{333, 333, 333, 30}));
  std::vector<PlayerRecord> expected = TwoGrades();
  for (std::size_t i = 0; i < 4; ++i) expected[i].BestOfThree = i < 3 ? 333 : 30;
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(expected)));
}

TEST_F(BestOfThreeTest, AChangeWithNothingTickedKeepsThePreviousSetting) {
  OpenSetup(TwoGrades());
  DoAll({"click cmdEdBOT", "click chkTrip", "click chkDoub", "click cmdNoPOK"});
  EXPECT_EQ(BoxTexts(), TextList{"You have not checked any BEST OF THREE boxes.    \r"
                                 "Previous setting will be retained.    "});
  ExpectListsBack();
  EXPECT_EQ(Caption("lblNoP"), "Triples & Doubles");
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(BestOfThreeTest, ACancelledChangeKeepsThePreviousSetting) {
  OpenSetup(TwoGrades());
  for (const char* cancel : {"click cmdCancelBo3", "key Esc"}) {
    DoAll({"click cmdEdBOT", "click chkNun", cancel});
    ExpectListsBack();
    EXPECT_EQ(Caption("lblNoP"), "Triples & Doubles");
    EXPECT_EQ(InSession("BestOfThree"), 330);
    EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  }
}

TEST_F(BestOfThreeTest, EnterOnABoxPressesOk) {
  OpenSetup(TwoGrades());
  DoAll({"click cmdEdBOT", "click chkNun", "focus chkNun", "key Enter"});
  EXPECT_EQ(Codes(), (std::vector<int>{111, 111, 111, 111}));
}

TEST_F(BestOfThreeTest, AChangeLeavesTheBytesBehindTheLastRecord) {
  OpenSetupOf(FileOf(TwoGrades()) + "half a record");
  DoAll({"click cmdEdBOT", "click chkEvery", "click cmdNoPOK"});
  EXPECT_TRUE(File(kPlayerFile).ends_with("half a record"));
  EXPECT_EQ(Codes(), (std::vector<int>{333, 333, 333, 111}));
}

TEST_F(BestOfThreeTest, AFailedChangeCanBeTriedAgain) {
  HOLDS_FOR_MODELS_ALONE("the disk of one face alone fails");
  OpenSetup(TwoGrades());
  DoAll({"click cmdEdBOT", "click chkNun", "fault write 1 61", "click cmdNoPOK"});
  EXPECT_EQ(BoxTexts(), TextList{"DISK FULL    "});
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  Do("click cmdNoPOK");
  ExpectListsBack();
  EXPECT_EQ(Codes(), (std::vector<int>{111, 111, 111, 111}));
}

}  // namespace
}  // namespace marlowbeck
