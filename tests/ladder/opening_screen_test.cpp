#include "ladder/frmLadder.h"
#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

// The opening of the ladder, its tabs, and the panel for grade and date.
class LadderOpening : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams, ThreeRounds()); }
  std::vector<bool> TabsEnabled() { return {Enabled("cmdSC"), Enabled("cmdPL"), Enabled("cmdCF")}; }
};

using Tabs = std::vector<bool>;

TEST_F(LadderOpening, StandsOnGradeAndDateUntilTheyAreChosen) {
  Do("click imgLadder");
  EXPECT_EQ(Front(), "frmLadder");
  EXPECT_EQ(Title("frmLadder"), "[Marlowbeck]  Premiership Ladder");
  EXPECT_TRUE(Boxes().empty());
  for (const char* shown : {"fraButtons", "fraSC", "fraChangeGrade"})
    EXPECT_TRUE(Shown(shown)) << shown;
  for (const char* hidden : {"fraPL", "fraCF", "fraPO", "fraEdScore", "lstTeams", "lstDone"})
    EXPECT_FALSE(Shown(hidden)) << hidden;
  EXPECT_EQ(TabsEnabled(), (Tabs{false, false, false}));
  EXPECT_EQ(Lines("cboResGrade"), TextList{"A"});
  EXPECT_EQ(Text("cboResGrade"), "A");
  EXPECT_EQ(DateOf("Cal"), "2004-03-17");
  EXPECT_EQ(Text("txtDayName"), "Wednesday");
  EXPECT_EQ(InSession("DateCount"), 0);
  EXPECT_EQ(Caption("cmdCancelCal"), "Exit");
  EXPECT_EQ(Focus(), "frmLadder.cboResGrade");
}

TEST_F(LadderOpening, CaptionsAreTheirOwn) {
  Do("click imgLadder");
  const std::vector<std::pair<const char*, const char*>> captions = {
      {"cmdSC", "Scores"},
      {"cmdPL", "Premiership Ladder"},
      {"cmdCF", "Configuration"},
      {"fraChangeGrade", "Select grade and Game date"},
      {"cmdGotoResults", "OK"},
      {"fraScores", "Enter Scores"},
      {"fraScoresIn", "Score Entry"},
      {"lblHomeAway", "Select HOME TEAM"},
      {"cmdHomeBack", "<< Back"},
      {"cmdBackAway", "<< Back"},
      {"cmdRecord", "Save"},
      {"Frame3", " Recorded Scores - Click on Teams to Edit or Delete scores. "},
      {"Frame2", "Dates Played"},
      {"cmdFirst", "<<"},
      {"cmdPrevDate", "<"},
      {"cmdNextDate", ">"},
      {"cmdLast", ">>"},
      {"cmdChangeGrade", "Change Grade and Date"},
      {"cmdExit", "Exit"},
      {"SSCommand2", "Help"},
      {"fraEdScore", "Edit Scores"},
      {"fraEdCal", "Change Game Date"},
      {"cmdSaveEdit", "Save"},
      {"cmdDeleteEdit", "Delete"},
      {"cmdCancelEdit", "Cancel"},
      {"Label10", "Select Grade"},
      {"Label11", "Select Date"},
      {"cmdClipLadder", "Copy to Clipboard"},
      {"cmdPenalty", "Adjust Points"},
      {"cmdPrintLad", "Printer"},
      {"Command1", "Exit"},
      {"Command2", "Help"},
      {"fraPenalty", "Adjust Points"},
      {"cmdCancel2", "Cancel"},
      {"Label12", "Select Team"},
      {"cmdPenOK", "OK"},
      {"cmdPenCancel", "Cancel"},
      {"Label13", "Team:"},
      {"Label14", "Date:"},
      {"fraFontPick", "Printer Font"},
      {"lblFontInfo", " Click to change font. "},
      {"fraPO", "Printer Options"},
      {"optBoth(0)", "        Game Results ONLY"},
      {"optBoth(1)", "Premiership Ladder ONLY"},
      {"optBoth(2)", "  BOTH Results and Ladder"},
      {"Label8", "How many Centimeters from Top of Page ?"},
      {"lblCopies", "Number of Copies:"},
      {"lblPrinter", "Printer:"},
      {"Label15", "Orientation:"},
      {"cmdPrinterSetup", "Printer Setup"},
      {"SSCommand5", "Help"},
      {"cmdBothOK", "Print"},
      {"cmdBothCancel", "Cancel"},
      {"cmdHelp1", "Help"},
      {"fraPenPts", "Adjust Points"},
      {"fraConfig", "Configuration"},
      {"cmdCancel", "Cancel"},
      {"cmdSaveConfig", "Save"},
      {"cmdExitLadder", "Exit"}};
  for (const auto& [control, caption] : captions) EXPECT_EQ(Caption(control), caption) << control;
}

TEST_F(LadderOpening, BoxesHaveTheirLabels) {
  Do("click imgLadder");
  auto& screen = static_cast<frmLadder&>(*ScreensOf().Find("frmLadder"));
  const std::vector<std::pair<const Control*, const char*>> labels = {
      {&screen.cfgGrade, "Current Grade:"},
      {&screen.cfgGames, "Games played in a Match:"},
      {&screen.cfgWin, "Points for a Win:"},
      {&screen.cfgLoss, "Points for a Loss:"},
      {&screen.cfgDraw, "Points for a Draw:"},
      {&screen.cfgFinals, "Number of Teams to play in Finals:"},
      {&screen.txtEdHome, "Home Team:"},
      {&screen.txtEdAway, "Away Team:"},
      {&screen.EdCal, "Change the game date here before saving if required."}};
  for (const auto& [box, label] : labels) EXPECT_EQ(box->Caption(), label) << box->Name();
}

TEST_F(LadderOpening, WithoutAWorkDateTodayIsTaken) {
  DeleteFile("WkDate.qz3");
  Do("click imgLadder");
  EXPECT_EQ(DateOf("Cal"), "2004-03-31");
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(LadderOpening, WithNoFileOpenItSaysSoAndLeaves) {
  HOLDS_FOR_MODELS_ALONE("the main menu never opens it so");
  Start();
  WriteFile("FileName.qz3", "\"\"\r\n");
  ScreensOf().Show("frmLadder");
  Do("events");
  ASSERT_GE(BoxTexts().size(), 1U);
  EXPECT_EQ(BoxTexts()[0].substr(0, 27), "No Marlowbeck file is open.");
  EXPECT_FALSE(Loaded("frmLadder"));
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(LadderOpening, AnotherDateIsKeptAtOnceAndTheFocusGoesToOk) {
  DoAll({"click imgLadder", "date Cal 2004-03-25"});
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-25#\r\n");
  EXPECT_EQ(Text("txtDayName"), "Thursday");
  EXPECT_EQ(InSession("WorkDate"), "2004-03-25");
  EXPECT_EQ(Focus(), "frmLadder.cmdGotoResults");
}

TEST_F(LadderOpening, OkOpensTheScoresOfGradeAndDate) {
  OpenScores();
  EXPECT_EQ(InSession("Flag"), 1);
  EXPECT_EQ(InSession("Grade"), "A");
  EXPECT_EQ(TabsEnabled(), (Tabs{false, true, true}));
  EXPECT_FALSE(Shown("fraChangeGrade"));
  EXPECT_TRUE(Shown("fraScores"));
  EXPECT_TRUE(Shown("fraScoresIn"));
  EXPECT_EQ(Caption("lblHeader(0)"), "A");
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 17 March 2004");
  EXPECT_EQ(Focus(), "frmLadder.lstTeams");
}

TEST_F(LadderOpening, ExitLeadsBackToTheMainMenuFromEverywhere) {
  Do("click imgLadder");
  Do("click cmdCancelCal");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmLadder"));
  OpenScores();
  Do("click cmdExit");
  EXPECT_EQ(Front(), "frmDB");
  OpenLadder();
  Do("click Command1");
  EXPECT_EQ(Front(), "frmDB");
  OpenLadder();
  Do("click cmdExitLadder");
  EXPECT_EQ(Front(), "frmDB");
  OpenScores();
  Do("close frmLadder");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(LadderOpening, HelpOpensATopic) {
  Do("click imgLadder");
  Do("click cmdHelp1");
  EXPECT_EQ(Count("help"), 1);
  Do("click cmdGotoResults");
  Do("click SSCommand2");
  EXPECT_EQ(Count("help"), 1);
  DoAll({"click cmdPL", "click Command2"});
  EXPECT_EQ(EventsNamed("help"), (std::vector<Json>{{{"file", "qz1.HLP"}, {"topic", 161}}}));
  DoAll({"click cmdPenalty", "key F1"});
  EXPECT_EQ(EventsNamed("help"), (std::vector<Json>{{{"file", "qz1.HLP"}, {"topic", 161}}}));
  DoAll({"click cmdCancel2", "click cmdSC", "key F1"});
  EXPECT_EQ(EventsNamed("help"), (std::vector<Json>{{{"file", "qz1.HLP"}, {"topic", 160}}}));
}

TEST_F(LadderOpening, ChangeGradeAndDateStandsOverTheScores) {
  OpenScores();
  Do("click cmdChangeGrade");
  EXPECT_TRUE(Shown("fraChangeGrade"));
  EXPECT_FALSE(Shown("fraScoresIn"));
  EXPECT_EQ(Caption("cmdCancelCal"), "&Cancel");
  EXPECT_NE(Refused("click cmdFirst").find("cmdFirst"), std::string::npos);
}

TEST_F(LadderOpening, CancelGoesBackToTheScores) {
  OpenScores();
  DoAll({"click cmdChangeGrade", "click cmdCancelCal"});
  EXPECT_EQ(Caption("cmdCancelCal"), "&Main Menu");
  EXPECT_TRUE(Shown("fraScoresIn"));
  EXPECT_TRUE(Enabled("cmdFirst"));
  EXPECT_FALSE(Shown("fraChangeGrade"));
  EXPECT_EQ(Lines("lstDone").size(), 2U);
}

TEST_F(LadderOpening, KeptWhatStandsOnThePanelHoldsAlsoAfterCancel) {
  OpenScores();
  DoAll({"click cmdChangeGrade", "date Cal 2004-03-03", "click cmdCancelCal"});
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 3 March 2004");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-03#\r\n");
}

TEST_F(LadderOpening, ATabTakesThePanelForGradeAndDateAway) {
  OpenScores();
  DoAll({"click cmdChangeGrade", "click cmdPL", "click cmdSC"});
  EXPECT_FALSE(Shown("fraChangeGrade"));
  EXPECT_TRUE(Shown("fraScoresIn"));
  EXPECT_TRUE(Enabled("lstDone"));
}

TEST_F(LadderOpening, TheTabsTakeTurns) {
  OpenScores();
  Do("click cmdPL");
  EXPECT_EQ(TabsEnabled(), (Tabs{true, false, true}));
  EXPECT_TRUE(Shown("fraPL"));
  EXPECT_FALSE(Shown("fraSC"));
  Do("click cmdSC");
  EXPECT_EQ(TabsEnabled(), (Tabs{false, true, true}));
  EXPECT_TRUE(Shown("fraSC"));
  EXPECT_FALSE(Shown("fraPL"));
}

TEST_F(LadderOpening, BackOnTheScoresTheDateIsThatOfTheLadder) {
  OpenLadder();
  DoAll({"pick lstTableDates =10/03/2004", "click cmdSC"});
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 10 March 2004");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-10#\r\n");
  EXPECT_EQ(DateOf("Cal"), "2004-03-10");
}

TEST_F(LadderOpening, TheScoresKeepTheirOwnGrade) {
  std::vector<PlayerRecord> players = OnePlayerEach(kFourTeams, "B");
  for (const PlayerRecord& player : OnePlayerEach({"Xerxes", "Yankee"}, "A")) {
    players.push_back(player);
  }
  WritePlayers("Winter.qza", players);
  WriteFile("Winter_B.qzi", kUsualRules);
  WriteFile("Winter_B.qzs", "\"Winter B\"\r\n");
  WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(3, "Xerxes", 6, "Yankee", 5)}));
  DoAll({"click imgLadder", "pick cboResGrade =B", "click cmdGotoResults", "click cmdPL"});
  EXPECT_EQ(Text("cboTGrades"), "A");
  EXPECT_EQ(InSession("Grade"), "A");
  Do("click cmdSC");
  EXPECT_EQ(Caption("lblHeader(0)"), "B");
  EXPECT_EQ(InSession("Grade"), "B");
  EXPECT_EQ(Lines("lstTeams"), kFourTeams);
}

TEST_F(LadderOpening, AFileThatCannotBeReadEndsInTheErrorBoxAndTheWayOut) {
  Start();
  // The players, the name of the file written, and read.
  DoAll({"fault open 3 71", "click imgLadder"});
  EXPECT_EQ(Errors(), (std::vector<int>{71}));
  Do("fault off");
  EXPECT_EQ(Front(), "frmLadder");
  Do("click cmdCancelCal");
  EXPECT_EQ(Front(), "frmDB");
}

}  // namespace
}  // namespace marlowbeck
