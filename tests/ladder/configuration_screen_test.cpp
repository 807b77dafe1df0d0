#include "ladder/ladder_league.h"

namespace marlowbeck {
namespace {

// The rules of a grade, on file and on the Configuration tab.
class LadderConfiguration : public LadderTest {
 protected:
  void SetUp() override { Lay(kFourTeams, ThreeRounds()); }
  void OpenConfiguration() {
    OpenScores();
    Do("click cmdCF");
  }
  TextList Boxed() {
    TextList texts;
    for (const char* box : {"cfgGrade", "cfgGames", "cfgWin", "cfgLoss", "cfgDraw", "cfgFinals"})
      texts.push_back(Text(box));
    return texts;
  }
  static constexpr const char* kMade =
      "The Marlowbeck LADDER configuration file was not found.    \r"
      "A default file has been created for you which    \r"
      "may be edited by selecting the Configuration Tab.    ";
};

TEST_F(LadderConfiguration, ShowsTheRulesOfTheGrade) {
  WriteFile(kRulesOfA, " 3  1  2  6  9 \r\n");
  OpenConfiguration();
  EXPECT_EQ(Boxed(), (TextList{"A", "9", "3", "1", "2", "6"}));
  EXPECT_TRUE(Shown("fraCF"));
  EXPECT_FALSE(Shown("fraButtons"));
  EXPECT_NE(Refused("type cfgGrade B").find("cfgGrade"), std::string::npos);
  EXPECT_NE(Refused("click cmdFirst").find("cmdFirst"), std::string::npos);
}

TEST_F(LadderConfiguration, SaveKeepsFiveNumbersOnOneLine) {
  OpenConfiguration();
  DoAll({"type cfgGames 9", "type cfgWin 3", "type cfgLoss 1", "type cfgDraw 2", "type cfgFinals 6",
         "click cmdSaveConfig"});
  EXPECT_EQ(File(kRulesOfA), " 3  1  2  6  9 \r\n");
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_FALSE(Shown("fraCF"));
  EXPECT_TRUE(Shown("fraButtons"));
  EXPECT_TRUE(Enabled("cmdPL"));
  EXPECT_TRUE(Enabled("cmdCF"));
  EXPECT_FALSE(Enabled("cmdSC"));
  EXPECT_TRUE(Enabled("lstDone"));
  EXPECT_EQ(InSession("GamesPerMatch"), 9);
  EXPECT_EQ(InSession("FinalsTeams"), 6);
}

TEST_F(LadderConfiguration, FromTheLadderItLeadsBackToTheLadder) {
  OpenLadder();
  DoAll({"click cmdCF", "click cmdSaveConfig"});
  EXPECT_TRUE(Shown("fraPL"));
  EXPECT_TRUE(Enabled("lstTableDates"));
  EXPECT_TRUE(Enabled("cmdSC"));
  EXPECT_TRUE(Enabled("cmdCF"));
  EXPECT_FALSE(Enabled("cmdPL"));
}

TEST_F(LadderConfiguration, CancelWritesNothing) {
  OpenConfiguration();
  DoAll({"type cfgWin 9", "click cmdCancel"});
  EXPECT_EQ(File(kRulesOfA), kUsualRules);
  EXPECT_EQ(InSession("WinPoints"), 2);
  EXPECT_FALSE(Shown("fraCF"));
  EXPECT_TRUE(Shown("fraButtons"));
  EXPECT_FALSE(Enabled("cmdSC"));
  Do("click cmdCF");
  EXPECT_EQ(Text("cfgWin"), "2");
}

TEST_F(LadderConfiguration, AnEmptyBoxIsRefusedAndNothingElseHappens) {
  OpenConfiguration();
  for (const char* box : {"cfgGames", "cfgWin", "cfgLoss", "cfgDraw", "cfgFinals"}) {
    SCOPED_TRACE(box);
    const std::string before = Text(box);
    DoAll({std::string("type ") + box, "click cmdSaveConfig"});
    EXPECT_EQ(BoxTexts(), TextList{"All boxes must be completed - including zeros.    "});
    EXPECT_EQ(Boxes()[0].style, 48);
    EXPECT_TRUE(Shown("fraCF"));
    EXPECT_EQ(File(kRulesOfA), kUsualRules);
    Do(std::string("type ") + box + " " + before);
  }
}

TEST_F(LadderConfiguration, NumbersAreReadByWhatTheyBeginWithAndRoundedToTheEven) {
  OpenConfiguration();
  DoAll({"type cfgGames 11 games", "type cfgWin 2.5", "type cfgLoss x", "type cfgDraw -1",
         "click cmdSaveConfig"});
  EXPECT_EQ(File(kRulesOfA), " 2  0 -1  4  11 \r\n");
}

TEST_F(LadderConfiguration, FinalsThatAreNoNumberAreARunTimeErrorAndNothingIsSaved) {
  OpenConfiguration();
  DoAll({"type cfgWin 9", "type cfgFinals four", "click cmdSaveConfig"});
  EXPECT_EQ(Errors(), (std::vector<int>{13}));
  EXPECT_EQ(File(kRulesOfA), kUsualRules);
  EXPECT_EQ(InSession("WinPoints"), 2);
  EXPECT_TRUE(Shown("fraCF"));
}

TEST_F(LadderConfiguration, NumbersBeyondSixteenBitsAreAnOverflowAndNothingIsSaved) {
  OpenConfiguration();
  for (const char* box : {"cfgGames", "cfgWin", "cfgLoss", "cfgDraw", "cfgFinals"}) {
    SCOPED_TRACE(box);
    const std::string before = Text(box);
    DoAll({std::string("type ") + box + " 40000", "click cmdSaveConfig"});
    EXPECT_EQ(Errors(), (std::vector<int>{6}));
    EXPECT_EQ(File(kRulesOfA), kUsualRules);
    Do(std::string("type ") + box + " " + before);
  }
}

TEST_F(LadderConfiguration, AFileThatCannotBeReadIsMadeAnewAndTold) {
  for (const char* text : {"", "\r\n", " 2  0  1 \r\n", "rules\r\n", " 2  0  1  4  99999 \r\n"}) {
    SCOPED_TRACE(text);
    WriteFile(kRulesOfA, text);
    OpenScores();
    EXPECT_EQ(BoxTexts(), TextList{kMade});
    EXPECT_EQ(Boxes()[0].style, 48);
    EXPECT_EQ(File(kRulesOfA), kUsualRules);
    EXPECT_EQ(InSession("GamesPerMatch"), 11);
    EXPECT_EQ(Lines("lstDone").size(), 2U);  // the work goes on
    Do("click cmdExit");
  }
}

TEST_F(LadderConfiguration, AMissingFileIsMadeAndToldOnce) {
  DeleteFile(kRulesOfA);
  OpenScores();
  EXPECT_EQ(BoxTexts(), TextList{kMade});
  Do("click cmdPL");
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(LadderConfiguration, TheTableRecoversFromAMissingFileToo) {
  OpenScores();
  DeleteFile(kRulesOfA);
  Do("click cmdPL");
  EXPECT_EQ(BoxTexts(), TextList{kMade});
  EXPECT_EQ(Row("grdLad", 1)[0], "Alpha");
  EXPECT_EQ(File(kRulesOfA), kUsualRules);
}

TEST_F(LadderConfiguration, AReadThatFailsForAnyReasonCountsAsMissing) {
  HOLDS_FOR_MODELS_ALONE("the fault is one of files");
  WriteFile(kRulesOfA, " 3  1  2  6  9 \r\n");
  // The work date, the players, the rules.
  DoAll({"click imgLadder", "fault open 3 71", "click cmdGotoResults"});
  EXPECT_EQ(BoxTexts(), TextList{kMade});
  EXPECT_EQ(File(kRulesOfA), kUsualRules);
}

TEST_F(LadderConfiguration, OtherRulesHoldForAllMatchesTheNextTimeTheTableIsWorkedOut) {
  OpenLadder();
  EXPECT_EQ(Row("grdLad", 1)[8], "4");
  DoAll({"click cmdCF", "type cfgWin 10", "click cmdSaveConfig"});
  EXPECT_EQ(Row("grdLad", 1)[8], "4");
  Do("pick lstTableDates 2");
  EXPECT_EQ(Row("grdLad", 1)[8], "20");
}

TEST_F(LadderConfiguration, AnotherNumberOfGamesHoldsForLaterEntriesOnly) {
  WriteFile(kRulesOfA, " 2  0  1  4  9 \r\n");
  OpenScores(24);
  EXPECT_TRUE(OnFile(ThreeRounds()));
  TypeMatch("Alpha", "6", "Bravo", "5");
  Do("click cmdRecord");
  EXPECT_EQ(BoxTexts(), TextList{"Combined scores can't total more than 9"});
  EXPECT_TRUE(OnFile(ThreeRounds()));
}

TEST_F(LadderConfiguration, KeptTeamsInTheFinalsHaveNoOtherEffect) {
  OpenLadder();
  const auto before = Cells("grdLad");
  DoAll({"click cmdCF", "type cfgFinals 2", "click cmdSaveConfig", "pick lstTableDates 2"});
  EXPECT_EQ(Cells("grdLad"), before);
  EXPECT_EQ(InSession("FinalsTeams"), 2);
}

}  // namespace
}  // namespace marlowbeck
