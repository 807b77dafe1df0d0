// The boxes of a new score sheet and the checks of each as it is left.

#include "support/league.h"

namespace marlowbeck {
namespace {

class ScoreBoxes : public ScoreSheets {
 protected:
  void SetUp() override {
    ScoreSheets::SetUp();
    OpenSheet();
  }
};

TEST_F(ScoreBoxes, ASheetOpensOnTheFirstBoxWithThePlayerAtItsHead) {
  EXPECT_EQ(Caption("fraResults"), "Enter Player's Scores");
  EXPECT_EQ(Get("fraResults")["color"], "black");
  EXPECT_EQ(Caption("panFirstName"), "Al" + std::string(28, ' ') + " ");
  EXPECT_EQ(Caption("panSurname"), "Hill" + std::string(26, ' ') + " ");
  EXPECT_EQ(Caption("panPlrID"), "11");
  EXPECT_EQ(Caption("lblPlrID"), "Player ID");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(ScoreBoxes, TheTeamsStayInSightBesideIt) {
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Shown("fraResults"));
  EXPECT_FALSE(Shown("fraResControls"));
  EXPECT_FALSE(Shown("fraEdButtons"));
}

TEST_F(ScoreBoxes, EnterGoesThroughTheBoxesInTheOrderOfThePaperSheet) {
  for (const char* next : {"txtShots", "txtHS", "txtCent", "txtHowMany180s", "txtP1", "txtP2",
                           "txtP3", "txtP4", "txtP5", "txtP6", "txtLegs", "cmdSave"}) {
    Do("key Enter");
    EXPECT_EQ(Focus(), std::string("frmResults.") + next);
  }
}

TEST_F(ScoreBoxes, TabGoesTheSameWayAndShiftTabBack) {
  DoAll({"key Tab", "key Tab"});
  EXPECT_EQ(Focus(), "frmResults.txtHS");
  DoAll({"key Shift+Tab", "key Shift+Tab"});
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(ScoreBoxes, TheAverageCannotBeTyped) {
  EXPECT_TRUE(Get("txtAvg")["locked"]);
  Refused("type txtAvg 50");
}

TEST_F(ScoreBoxes, TheAverageIsCutNeverRounded) {
  TypeInto({{"txtAgg", "1000"}, {"txtShots", "21"}});
  EXPECT_EQ(Text("txtAvg"), "");
  Do("key Enter");
  EXPECT_EQ(Text("txtAvg"), "47.61");
}

TEST_F(ScoreBoxes, TheAverageFormsTheQuotientFirst) {
  TypeInto({{"txtAgg", "179"}, {"txtShots", "10"}, {"txtHS", "60"}});
  EXPECT_EQ(Text("txtAvg"), "17.89");
}

TEST_F(ScoreBoxes, TheAverageFollowsAChangeOfEitherFigure) {
  TypeInto({{"txtAgg", "1000"}, {"txtShots", "20"}, {"txtAgg", "950"}, {"txtHS", "60"}});
  EXPECT_EQ(Text("txtAvg"), "47.50");
  TypeInto({{"txtShots", "0"}, {"txtHS", "60"}});
  EXPECT_EQ(Text("txtAvg"), "");
}

TEST_F(ScoreBoxes, AnAggregateWithoutShotsShowsNoAverage) {
  TypeInto({{"txtAgg", "300"}, {"txtShots", "0"}});
  Do("key Enter");
  EXPECT_EQ(Text("txtAvg"), "");
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
}

TEST_F(ScoreBoxes, AnAggregateOf7000Passes) {
  Do("type txtAgg 7000");
  Do("key Enter");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Focus(), "frmResults.txtShots");
}

TEST_F(ScoreBoxes, AnAggregateAbove7000IsRefusedAndStaysInTheBox) {
  Do("type txtAgg 7001");
  Do("key Enter");
  EXPECT_EQ(TheBox(), "Score is too high !");
  EXPECT_EQ(Boxes().front().title, "Marlowbeck Message");
  EXPECT_EQ(Boxes().front().style, 48);
  EXPECT_EQ(Text("txtAgg"), "7001");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(ScoreBoxes, AClickThatLeavesARefusedAggregateIsLost) {
  Do("type txtAgg 7000.5");
  const Json answer = Do("click cmdSave");
  EXPECT_EQ(answer.value("lost", false), true);
  EXPECT_EQ(TheBox(), "Score is too high !");
}

TEST_F(ScoreBoxes, EscLeavesASheetWithoutAWord) {
  DoAll({"type txtAgg 9999", "key Esc"});
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_EQ(Focus(), "frmResults.lstResPlayers");
}

TEST_F(ScoreBoxes, AnythingCanBeTypedAndReadsByItsLeadingNumber) {
  TypeInto({{"txtAgg", "  95x"}, {"txtShots", "2 darts"}, {"txtHS", "none"}});
  EXPECT_EQ(Text("txtAvg"), "47.50");
}

TEST_F(ScoreBoxes, APegOf170Passes) {
  Do("type txtP1 170");
  Do("key Enter");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Text("txtP1"), "170");
}

TEST_F(ScoreBoxes, APegAbove170IsBlankedAndKeepsTheFocus) {
  for (int peg = 1; peg <= 6; ++peg) {
    const std::string box = "txtP" + std::to_string(peg);
    Do("type " + box + " 171");
    Do("key Enter");
    EXPECT_EQ(TheBox(),
              "What a Peg !!!\r\rUnfortunately, the maximum peg\ris only 170, please re-enter.");
    EXPECT_EQ(Text(box), "");
    EXPECT_EQ(Focus(), "frmResults." + box);
  }
}

TEST_F(ScoreBoxes, ClearScoresEmptiesAllAndStartsAgain) {
  TypeInto(GoodSheet());
  DoAll({"type txtP6 40", "click chkFF", "click cmdClearRes"});
  for (const char* box : {"txtAgg", "txtShots", "txtAvg", "txtHS", "txtCent", "txtHowMany180s",
                          "txtP1", "txtP6", "txtLegs"}) {
    EXPECT_EQ(Text(box), "") << box;
    EXPECT_TRUE(Enabled(box)) << box;
  }
  EXPECT_FALSE(Ticked("chkFF"));
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(ScoreBoxes, CancelGoesBackToTheListsAndSavesNothing) {
  TypeInto(GoodSheet());
  Do("click cmdResultsCancel");
  EXPECT_FALSE(Shown("fraResults"));
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_TRUE(Enabled("cboOpp"));
  EXPECT_EQ(Focus(), "frmResults.lstResPlayers");
  EXPECT_TRUE(Saved().empty());
}

TEST_F(ScoreBoxes, ANextSheetComesUpEmpty) {
  TypeInto(GoodSheet());
  DoAll({"click cmdResultsCancel", "pick lstResPlayers 1"});
  EXPECT_EQ(Text("txtAgg"), "");
  EXPECT_EQ(Text("txtLegs"), "");
  EXPECT_EQ(Caption("panPlrID"), "12");
}

TEST_F(ScoreBoxes, EnterInTheListOpensTheSheetOfThePlayerUnderTheCursor) {
  DoAll({"click cmdResultsCancel", "key Down", "key Enter"});
  EXPECT_EQ(Caption("panPlrID"), "12");
  EXPECT_EQ(Focus(), "frmResults.txtAgg");
}

TEST_F(ScoreBoxes, AForfeitBlanksAndClosesAllBoxes) {
  TypeInto(GoodSheet());
  Do("click chkFF");
  for (const char* box : {"txtAgg", "txtShots", "txtAvg", "txtHS", "txtCent", "txtHowMany180s",
                          "txtP1", "txtP2", "txtP3", "txtP4", "txtP5", "txtP6", "txtLegs"}) {
    EXPECT_EQ(Text(box), "") << box;
    EXPECT_FALSE(Enabled(box)) << box;
  }
  Do("click chkFF");
  EXPECT_TRUE(Enabled("txtAgg"));
  EXPECT_EQ(Text("txtAgg"), "");
}

TEST_F(ScoreBoxes, TheControlsOfOtherTasksAreThere) {
  EXPECT_EQ(Caption("cmdSave"), "Save");
  EXPECT_EQ(Caption("cmdClearRes"), "Clear Scores");
  EXPECT_EQ(Caption("cmdResultsCancel"), "Cancel");
  EXPECT_EQ(Caption("chkFF"), "Register a Forfeit Only");
  EXPECT_EQ(Caption("cmdEdDelete"), "Delete Scores");
  EXPECT_EQ(Caption("fraEdButtons"), "Edit Options");
  EXPECT_EQ(Caption("panResAddPlayer"), "Add Player");
  EXPECT_EQ(Caption("lblLegs"), "Total Legs played:");
  for (const char* hidden : {"fraReDoOpp", "panResAddPlayer"}) EXPECT_FALSE(Shown(hidden));
}

// High score, centuries and 180s, as the 180s are left.

struct CenturiesCase {
  const char* name;
  Entries typed;
  const char* words;  ///< none when all is well
  const char* focus;  ///< where it goes; from the 180s Enter would lead to txtP1
  Entries after;
};

class LeavingThe180s : public ScoreBoxes, public ::testing::WithParamInterface<CenturiesCase> {};

TEST_P(LeavingThe180s, ChecksHighScoreAndCenturies) {
  const CenturiesCase& given = GetParam();
  TypeInto(given.typed);
  DoAll({"focus txtHowMany180s", "key Enter"});
  EXPECT_EQ(BoxTexts(), *given.words == '\0' ? TextList{} : TextList{given.words});
  EXPECT_EQ(Focus(), std::string("frmResults.") + given.focus);
  for (const auto& [box, text] : given.after) EXPECT_EQ(Text(box), text) << box;
}

INSTANTIATE_TEST_SUITE_P(
    Rules, LeavingThe180s,
    ::testing::Values(
        CenturiesCase{"NothingPasses", {}, "", "txtP1", {}},
        CenturiesCase{"HighScore180WithOneOfEachPasses",
                      {{"txtHS", "180"}, {"txtCent", "1"}, {"txtHowMany180s", "1"}},
                      "",
                      "txtP1",
                      {{"txtHS", "180"}}},
        CenturiesCase{"HighScore181",
                      {{"txtHS", "181"}, {"txtCent", "1"}},
                      "Highest score cannot be more than 180!",
                      "txtHS",
                      {{"txtHS", ""}, {"txtCent", "1"}}},
        CenturiesCase{"CenturiesWithoutHighScore",
                      {{"txtCent", "2"}},
                      "Highest score has not been entered.\rTotal Centuries will be set to zero.",
                      "txtHS",
                      {{"txtCent", ""}}},
        CenturiesCase{"HighScore99WithCenturies",
                      {{"txtHS", "99"}, {"txtCent", "2"}},
                      "Highest score is less than 100.\rTotal Centuries will be set to zero.",
                      "txtHS",
                      {{"txtHS", "99"}, {"txtCent", ""}}},
        CenturiesCase{"HighScore100WithoutCenturiesLeavesTheFocus",
                      {{"txtHS", "100"}},
                      "Please enter Total Centuries scored!",
                      "txtP1",
                      {{"txtHS", "100"}}},
        CenturiesCase{"HighScore180Without180s",
                      {{"txtHS", "180"}, {"txtCent", "2"}},
                      "Please enter number of 180's scored!",
                      "txtHowMany180s",
                      {{"txtHS", "180"}, {"txtCent", "2"}}},
        CenturiesCase{"More180sThanCenturies",
                      {{"txtHS", "180"}, {"txtCent", "1"}, {"txtHowMany180s", "2"}},
                      "Number of Centuries MUST be EQUAL to\ror GREATER than the number of 180's.",
                      "txtCent",
                      {{"txtCent", ""}, {"txtHowMany180s", "2"}}}),
    [](const auto& given) { return std::string(given.param.name); });

TEST_F(ScoreBoxes, A180WithAnotherHighScoreIsAskedAboutAndYesSetsIt) {
  TypeInto({{"txtHS", "120"}, {"txtCent", "2"}, {"txtHowMany180s", "2"}});
  DoAll({"answer yes", "key Enter"});
  EXPECT_EQ(TheBox(), "180's = 2. Do you want the Highest Score updated to 180 ?");
  EXPECT_EQ(Boxes().front().style, 68);
  EXPECT_EQ(Text("txtHS"), "180");
  EXPECT_EQ(Focus(), "frmResults.txtHowMany180s");
  EXPECT_EQ(InSession("Flag"), 1);
  Do("key Enter");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(ScoreBoxes, A180WithAnotherHighScoreIsBlankedOnNo) {
  TypeInto({{"txtHS", "120"}, {"txtCent", "2"}, {"txtHowMany180s", "2"}});
  DoAll({"answer no", "key Enter"});
  EXPECT_EQ(Text("txtHowMany180s"), "");
  EXPECT_EQ(Text("txtHS"), "120");
  EXPECT_EQ(Focus(), "frmResults.txtHowMany180s");
}

// Which peg boxes there are.

struct PegBoxCase {
  int code;
  std::vector<const char*> hidden;
  std::vector<const char*> single;  ///< labels of a game that is played once
};

class BestOfThreeOf : public ScoreSheets, public ::testing::WithParamInterface<PegBoxCase> {};

TEST_P(BestOfThreeOf, TheGradeGivesThePegBoxes) {
  WritePlayers(kLeagueFile, {Player(1, "Reed", "Jo", "Rovers", "A Grade", GetParam().code),
                             Player(11, "Hill", "Al", "Hawks", "A Grade", 330)});
  OpenSheet();
  const std::vector<const char*>& hidden = GetParam().hidden;
  const std::vector<const char*>& single = GetParam().single;
  const TextList games = {"Triples", "Doubles", "Singles"};
  for (std::size_t peg = 1; peg <= 6; ++peg) {
    const std::string number = std::to_string(peg);
    const bool is_hidden = std::count(hidden.begin(), hidden.end(), "txtP" + number) > 0;
    EXPECT_EQ(Shown("txtP" + number), !is_hidden) << peg;
    EXPECT_EQ(Shown("lblP" + number), !is_hidden) << peg;
    if (is_hidden) continue;
    const bool is_single = std::count(single.begin(), single.end(), "lblP" + number) > 0;
    const std::string begin = is_single ? " Peg:" : peg % 2 == 1 ? " Peg 1:" : " Peg 2:";
    EXPECT_EQ(Caption("lblP" + number), begin + games[(peg - 1) / 2]);
  }
  EXPECT_EQ(Text("txtLegs"), GetParam().code == 111 ? "3" : "");
}

INSTANTIATE_TEST_SUITE_P(
    Codes, BestOfThreeOf,
    ::testing::Values(PegBoxCase{333, {}, {}}, PegBoxCase{0, {}, {}},
                      PegBoxCase{330, {"txtP6"}, {"lblP5"}}, PegBoxCase{303, {"txtP4"}, {"lblP3"}},
                      PegBoxCase{33, {"txtP2"}, {"lblP1"}},
                      PegBoxCase{300, {"txtP4", "txtP6"}, {"lblP3", "lblP5"}},
                      PegBoxCase{30, {"txtP2", "txtP6"}, {"lblP1", "lblP5"}},
                      PegBoxCase{3, {"txtP2", "txtP4"}, {"lblP1", "lblP3"}},
                      PegBoxCase{111, {"txtP2", "txtP4", "txtP6"}, {"lblP1", "lblP3", "lblP5"}}),
    [](const auto& given) { return "Code" + std::to_string(given.param.code); });

TEST_F(ScoreSheets, ACodeBeyondSixteenBitsEndsInTheErrorBox) {
  WritePlayers(kLeagueFile, {Player(1, "Reed", "Jo", "Rovers", "A Grade", 70000),
                             Player(11, "Hill", "Al", "Hawks", "A Grade", 330)});
  OpenSheet();
  EXPECT_EQ(TheBox(), "OVERFLOW    ");
}

TEST_F(ScoreSheets, ThePegBoxesBearTheNamesOfTheGames) {
  WriteFile("GameName.qz3", "Teams\r\nPairs\r\nSolo\r\nTms\r\nPrs\r\nSol\r\n");
  OpenSheet();
  EXPECT_EQ(Caption("lblP1"), " Peg 1:Teams");
  EXPECT_EQ(Caption("lblP4"), " Peg 2:Pairs");
  EXPECT_EQ(Caption("lblP6"), " Peg 2:Solo");
}

TEST_F(ScoreSheets, ANewSheetOfAGradeWithoutBestOfThreeHasThreeLegs) {
  OpenTeam("Bees", "B Grade");
  Do("pick lstResPlayers 0");
  EXPECT_EQ(Text("txtLegs"), "3");
  EXPECT_TRUE(Shown("txtP1"));
  EXPECT_FALSE(Shown("txtP2"));
}

}  // namespace
}  // namespace marlowbeck
