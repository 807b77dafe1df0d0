// The save of a new score sheet.

#include "data/text.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

class SaveSheet : public ScoreSheets {
 protected:
  void SetUp() override {
    ScoreSheets::SetUp();
    WriteResults(kAResults, {});
  }
  /// Types a good sheet with some boxes changed, and saves.
  void Save(const Entries& changed = {}) {
    TypeInto(GoodSheet());
    TypeInto(changed);
    Do("click cmdSave");
  }
};

TEST_F(SaveSheet, WritesOneRecordWithEveryFieldInItsPlace) {
  OpenSheet();
  Do("pick cboOpp =Lions");
  Save({{"txtHS", "180"},
        {"txtCent", "4"},
        {"txtHowMany180s", "1"},
        {"txtP1", "11"},
        {"txtP2", "22"},
        {"txtP3", "33"},
        {"txtP4", "44"},
        {"txtP5", "55"},
        {"txtP6", "170"}});
  ResultRecord expected;
  expected.ID = 11;
  expected.Team = "Hawks";
  expected.Opposition = "Lions";
  expected.GameDate = March(31);
  expected.Legs = 9;
  expected.Aggregate = 1000;
  expected.Shots = 50;
  expected.HighScore = 180;
  expected.Centuries = 4;
  expected.Scores180 = 1;
  expected.Pegs = {11, 22, 33, 44, 55, 170};
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{expected})));
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_TRUE(BoxTexts().empty());
}

TEST_F(SaveSheet, GoesBackToTheListWithTheNextPlayerUnderTheCursor) {
  OpenSheet("Hope,  Bo");
  Save();
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_EQ(Lines("lstFinished"), TextList{"Hope,  Bo"});
  EXPECT_EQ(Focus(), "frmResults.lstResPlayers");
  Do("key Enter");
  EXPECT_EQ(Caption("panPlrID"), "13");  // Hunt, who stands behind Hope
}

TEST_F(SaveSheet, ANightIsTypedFromTheKeyboardAlone) {
  OpenTeam("Hawks");
  Do("focus lstResPlayers");
  for (int player = 0; player < 3; ++player) {
    Do("key Enter");
    TypeInto(GoodSheet());
    DoAll({"key Enter", "key Enter"});  // to Save, and on it
  }
  ASSERT_EQ(Saved().size(), 3U);
  EXPECT_EQ(Saved()[0].ID, 11);
  EXPECT_EQ(Saved()[1].ID, 12);
  EXPECT_EQ(Saved()[2].ID, 13);
}

TEST_F(SaveSheet, BindsTheOppositionOfTheDate) {
  OpenTeam("Hawks");
  Do("pick cboOpp =Rovers");
  SaveGoodSheet("Hill,  Al");
  EXPECT_EQ(Text("cboOpp"), "Rovers");
  EXPECT_FALSE(Enabled("cboOpp"));
  SaveGoodSheet("Hope,  Bo");
  ASSERT_EQ(Saved().size(), 2U);
  EXPECT_EQ(Trim(Saved()[1].Opposition), "Rovers");
}

TEST_F(SaveSheet, AppendsAtTheEndWhateverTheDate) {
  WriteResults(kAResults, {Night(31, "Cubs", "Lions", 10)});
  const std::string before = File(kAResults);
  OpenSheet();
  Save();
  EXPECT_EQ(Saved().size(), 2U);
  EXPECT_EQ(File(kAResults).substr(0, 148), before);
}

TEST_F(SaveSheet, TouchesNoOtherFile) {
  OpenSheet();
  const std::string players = File(kLeagueFile);
  const std::string work_date = File("WkDate.qz3");
  Save();
  EXPECT_EQ(File(kLeagueFile), players);
  EXPECT_EQ(File("WkDate.qz3"), work_date);
  EXPECT_FALSE(HasFile("Winter_A Grade.qzl"));
}

TEST_F(SaveSheet, HiddenPegBoxesAreSavedAsZero) {
  OpenTeam("Bees", "B Grade");
  Do("pick lstResPlayers 0");
  Save({{"txtP1", "40"}, {"txtP3", "60"}, {"txtP5", "80"}});
  const std::vector<ResultRecord> saved = Results(kBResults);
  ASSERT_EQ(saved.size(), 1U);
  EXPECT_EQ(saved[0].Pegs, (std::array<std::int16_t, 6>{40, 0, 60, 0, 80, 0}));
}

TEST_F(SaveSheet, NeedsAnAggregate) {
  OpenSheet();
  Save({{"txtAgg", "0.9"}});
  EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
  EXPECT_TRUE(Saved().empty());
}

TEST_F(SaveSheet, NeedsShots) {
  OpenSheet();
  Save({{"txtShots", ""}});
  EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
  EXPECT_TRUE(Saved().empty());
}

TEST_F(SaveSheet, AnAverageOfExactly200Passes) {
  OpenSheet();
  Save({{"txtAgg", "2000"}, {"txtShots", "10"}});
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Saved().size(), 1U);
}

TEST_F(SaveSheet, AnAverageAbove200IsRefused) {
  OpenSheet();
  Save({{"txtAgg", "4001"}, {"txtShots", "20"}});
  EXPECT_EQ(TheBox(), "Some entries seem too high !");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
  EXPECT_EQ(Text("txtAgg"), "4001");
  EXPECT_TRUE(Saved().empty());
}

TEST_F(SaveSheet, HasNoLimitOnShots) {
  OpenSheet();
  Save({{"txtShots", "2000000"}});
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Shots, 2000000);
}

TEST_F(SaveSheet, NeedsLegs) {
  OpenSheet();
  Save({{"txtLegs", "0"}});
  EXPECT_EQ(TheBox(), "You must enter Legs before saving !");
  EXPECT_EQ(Text("txtLegs"), "");
  EXPECT_EQ(Focus(), "frmResults.txtLegs");
  EXPECT_TRUE(Saved().empty());
  DoAll({"type txtLegs 1", "click cmdSave"});
  EXPECT_EQ(Saved().size(), 1U);
}

TEST_F(SaveSheet, AskingForLegsLeavesTheResultsFileOpen) {
  HOLDS_FOR_MODELS_ALONE("the count of file operations is that of one face");
  OpenSheet();
  TypeInto(GoodSheet());
  Do("type txtLegs 0");
  Do("focus cmdSave");
  const auto still_open = [&] {
    return Faults().Done(FileOperation::Open) - Faults().Done(FileOperation::Close);
  };
  const long before = still_open();
  Do("click cmdSave");
  EXPECT_EQ(still_open(), before + 1);
}

TEST_F(SaveSheet, ChecksTheCenturiesOnceMore) {
  OpenSheet();
  TypeInto(GoodSheet());
  // The high score was changed after the 180s had been left.
  Do("type txtHS 181");
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Highest score cannot be more than 180!");
  EXPECT_TRUE(Saved().empty());
}

TEST_F(SaveSheet, With120And1And2TheQuestionComesFirstAndThenTheCenturiesAreTooFew) {
  OpenSheet();
  TypeInto(GoodSheet());
  TypeInto({{"txtHS", "120"}, {"txtCent", "1"}, {"txtHowMany180s", "2"}});
  DoAll({"answer yes", "click cmdSave"});
  EXPECT_EQ(TheBox(), "180's = 2. Do you want the Highest Score updated to 180 ?");
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Number of Centuries MUST be EQUAL to\ror GREATER than the number of 180's.");
  EXPECT_EQ(Focus(), "frmResults.txtCent");
  EXPECT_TRUE(Saved().empty());
}

TEST_F(SaveSheet, AfterAYesTheSaveStopsOnceAndTheNextGoesThrough) {
  OpenSheet();
  TypeInto(GoodSheet());
  TypeInto({{"txtHowMany180s", "2"}});
  DoAll({"answer yes", "click cmdSave"});
  EXPECT_EQ(TheBox(), "180's = 2. Do you want the Highest Score updated to 180 ?");
  EXPECT_TRUE(Saved().empty());
  Do("click cmdSave");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].HighScore, 180);
}

TEST_F(SaveSheet, AfterAFailedCheckAllEmptyStopsWithoutAWord) {
  OpenSheet();
  TypeInto({{"txtAgg", "900"}, {"txtShots", "20"}, {"txtLegs", "9"}, {"txtCent", "2"}});
  DoAll({"focus txtHowMany180s", "key Enter"});
  EXPECT_EQ(TheBox(), "Highest score has not been entered.\rTotal Centuries will be set to zero.");
  Do("click cmdSave");
  EXPECT_TRUE(Events().empty());
  EXPECT_TRUE(Saved().empty());
  TypeInto({{"txtHS", "60"}});
  Do("click cmdSave");
  EXPECT_EQ(Saved().size(), 1U);
}

TEST_F(SaveSheet, AForfeitIsSavedWithAllNumbersZeroAndTheMark) {
  OpenSheet();
  DoAll({"click chkFF", "click cmdSave"});
  EXPECT_TRUE(BoxTexts().empty());
  ResultRecord expected;
  expected.ID = 11;
  expected.Team = "Hawks";
  expected.Opposition = "Cubs";
  expected.GameDate = March(31);
  expected.Forfeit = "F";
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(std::vector{expected})));
  EXPECT_EQ(Lines("lstFinished"), TextList{"Hill,  Al"});
}

TEST_F(SaveSheet, AForfeitSkipsACheckThatHasFailed) {
  OpenSheet();
  TypeInto({{"txtCent", "2"}, {"txtHowMany180s", ""}});
  DoAll({"focus txtP1", "click chkFF", "click cmdSave"});
  EXPECT_EQ(Saved().size(), 1U);
}

TEST_F(SaveSheet, TheNextSheetIsNoForfeit) {
  OpenSheet();
  DoAll({"click chkFF", "click cmdSave", "pick lstResPlayers 0"});
  EXPECT_FALSE(Ticked("chkFF"));
  EXPECT_TRUE(Enabled("txtAgg"));
}

TEST_F(SaveSheet, TheGradeStaysWhatTheRecordBufferLastHeld) {
  ResultRecord other = Night(31, "Cubs", "Lions", 24);
  other.Grade = "Old Name";
  WriteResults(kAResults, {other});
  OpenSheet();
  Save();
  ASSERT_EQ(Saved().size(), 2U);
  EXPECT_EQ(Trim(Saved()[1].Grade), "Old Name");
}

TEST_F(SaveSheet, TheGradeIsBlankInAnEmptyFileAfterAnotherGradesFile) {
  ResultRecord other = Night(41, "Bees", "Crows");
  other.Grade = "Old Name";
  WriteResults(kBResults, {other});
  OpenTeam("Bees", "B Grade");
  DoAll({"click cmdChangeGrade", "pick cboResGrade =A Grade", "click cmdGotoResults",
         "pick cboResTeam =Hawks"});
  SaveGoodSheet("Hill,  Al");
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Grade, std::string(20, ' '));
}

TEST_F(SaveSheet, TheGradeIsBlankInAFreshFile) {
  OpenSheet();
  Save();
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Grade, std::string(20, ' '));
}

TEST_F(SaveSheet, FiguresAreRoundedToTheEvenNeighbour) {
  OpenSheet();
  Save({{"txtAgg", "1000.5"},
        {"txtShots", "51.5"},
        {"txtP1", "2.5"},
        {"txtP2", "3.5"},
        {"txtLegs", "1.5"}});
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Aggregate, 1000);
  EXPECT_EQ(Saved()[0].Shots, 52);
  EXPECT_EQ(Saved()[0].Pegs[0], 2);
  EXPECT_EQ(Saved()[0].Pegs[1], 4);
  EXPECT_EQ(Saved()[0].Legs, 2);
}

TEST_F(SaveSheet, AFigureOf32767IsTheLargest) {
  OpenSheet();
  Save({{"txtCent", "32767"}});
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Saved()[0].Centuries, 32767);
}

TEST_F(SaveSheet, ALargerFigureIsAnOverflowBeforeAnythingIsWritten) {
  OpenSheet();
  Save({{"txtCent", "32768"}});
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
  EXPECT_EQ(Boxes().front().title, "Marlowbeck Error!");
  EXPECT_TRUE(File(kAResults).empty());
  EXPECT_EQ(Count("sound"), 0);
  // The sheet stands, to be mended and saved.
  DoAll({"type txtCent 3", "click cmdSave"});
  EXPECT_EQ(Saved().size(), 1U);
}

TEST_F(SaveSheet, ShotsBeyondThirtyTwoBitsAreAnOverflow) {
  OpenSheet();
  Save({{"txtShots", "2147483648"}});
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
  EXPECT_TRUE(File(kAResults).empty());
}

TEST_F(SaveSheet, ANumberBeyondAllNumbersIsAnOverflow) {
  OpenSheet();
  Save({{"txtShots", "1e999"}});
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
  EXPECT_TRUE(File(kAResults).empty());
}

TEST_F(SaveSheet, AfterTheFileIsFullIsAnOverflow) {
  WriteFile(kAResults, std::string(32767 * 148, ' '));
  OpenSheet();
  Save();
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
  EXPECT_EQ(File(kAResults).size(), 32767U * 148U);
}

TEST_F(SaveSheet, TheOppositionCanBeChangedWhileTheSheetIsOpen) {
  OpenSheet();
  TypeInto(GoodSheet());
  DoAll({"pick cboOpp =Rovers", "click cmdSave"});
  ASSERT_EQ(Saved().size(), 1U);
  EXPECT_EQ(Trim(Saved()[0].Opposition), "Rovers");
}

TEST_F(SaveSheet, AnotherTeamClosesTheSheet) {
  OpenSheet();
  Do("pick cboResTeam =Rovers");
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_EQ(Caption("panPlrID"), "");
}

}  // namespace
}  // namespace marlowbeck
