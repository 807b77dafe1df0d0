// The first layer of the score sheets: grade and date.

#include "support/league.h"

namespace marlowbeck {
namespace {

constexpr const char* kNoFileWords =
    "No Marlowbeck file is open.\r"
    "To Open an existing file, select       \r"
    "Open from the File Menu.\r"
    "\r"
    "To Create a NEW file, select\r"
    "NEW from the File Menu.";

std::string OneTeamWords(const std::string& grade) {
  return "There is only one team listed for " + grade +
         ".\r\rBefore you can enter results, there must be at least TWO teams\r"
         "in the one grade. This allows the opposition team to be recorded.\r\r"
         "You can return to Results Entry from the Main Menu after adding\r"
         "more teams, or you can click NO to select another grade.\r\r"
         "Do you wish to add more teams now ?";
}

class GradeAndDate : public ScoreSheets {};

TEST_F(GradeAndDate, OpensOnGradesAndTheWorkDate) {
  Do("click imgSheets");
  EXPECT_EQ(Title("frmResults"), "[Marlowbeck]  Results Entry");
  EXPECT_EQ(Caption("fraChangeGrade"), "Select Grade and Game Date");
  EXPECT_EQ(Lines("cboResGrade"), (TextList{"A Grade", "B Grade", "C Grade"}));
  EXPECT_EQ(Text("cboResGrade"), "A Grade");
  EXPECT_EQ(DateOf("Cal"), "2004-03-31");
  EXPECT_EQ(DateOf("EdCal"), "2004-03-31");
  EXPECT_EQ(Text("txtDayName"), "Wednesday");
  EXPECT_EQ(Focus(), "frmResults.cmdGotoResults");
  EXPECT_EQ(Caption("cmdGotoResults"), "OK");
  EXPECT_EQ(Caption("cmdExit"), "Cancel");
  EXPECT_EQ(Caption("cmdHelp1"), "Help");
}

TEST_F(GradeAndDate, ShowsNoOtherLayerAtFirst) {
  Do("click imgSheets");
  for (const char* panel : {"fraTeams", "fraResControls", "fraResults", "fraEdButtons",
                            "fraReDoOpp", "panResAddPlayer", "lblHeader(0)", "lblHeader(2)"}) {
    EXPECT_FALSE(Shown(panel)) << panel;
  }
  EXPECT_TRUE(Shown("fraChangeGrade"));
}

TEST_F(GradeAndDate, HidesTheMainMenuMeanwhile) {
  Do("click imgSheets");
  EXPECT_FALSE(Shown("frmDB.imgSheets"));
}

TEST_F(GradeAndDate, ADatePickedTellsItsDayAndLeadsOn) {
  DoAll({"click imgSheets", "date Cal 2004-03-27"});
  EXPECT_EQ(Text("txtDayName"), "Saturday");
  EXPECT_EQ(Focus(), "frmResults.cmdGotoResults");
}

TEST_F(GradeAndDate, AGradePickedLeadsOn) {
  DoAll({"click imgSheets", "focus Cal", "pick cboResGrade 1"});
  EXPECT_EQ(Focus(), "frmResults.cmdGotoResults");
}

TEST_F(GradeAndDate, OkShowsTheTeamsWithTheHeading) {
  OpenGrade();
  EXPECT_FALSE(Shown("fraChangeGrade"));
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_EQ(Caption("fraTeams"), "Teams Selection");
  EXPECT_EQ(Caption("fraResControls"), " Selections: ");
  EXPECT_EQ(Caption("lblHeader(0)"), "A Grade");
  EXPECT_EQ(Caption("lblHeader(1)"), "Wednesday, 31 March 2004");
  EXPECT_EQ(Caption("lblHeader(2)"), "CUBS  v's  HAWKS");
  EXPECT_EQ(Caption("cmdMakeWorkDate"), "Work Date: 31/03/2004");
  EXPECT_EQ(Caption("cmdChangeGrade"), "Change Grade / Date");
  EXPECT_EQ(Caption("cmdLeaveResults"), "Exit");
}

TEST_F(GradeAndDate, TheDatePickedIsWrittenForOtherScreens) {
  DoAll({"click imgSheets", "date Cal 2004-04-07"});
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-31#\r\n");
  Do("click cmdGotoResults");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-04-07#\r\n");
  EXPECT_EQ(Caption("cmdMakeWorkDate"), "Work Date: 07/04/2004");
  EXPECT_EQ(InSession("WorkDate"), "2004-04-07");
}

TEST_F(GradeAndDate, NoFalseCannotPlayComesUpForTheDateBefore) {
  // On the old work date Bees cannot play: the other two met.
  WriteResults(kBResults, {Night(42, "Crows", "Ducks")});
  DoAll({"click imgSheets", "pick cboResGrade =B Grade", "date Cal 2004-04-07"});
  Do("click cmdGotoResults");
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Text("cboOpp"), "Crows");
}

TEST_F(GradeAndDate, ATeamThatCannotPlayIsToldOnceOnEntry) {
  WriteResults(kBResults, {Night(42, "Crows", "Ducks")});
  OpenGrade("B Grade");
  EXPECT_EQ(TheBox(), "Bees Team cannot play.\r\rNo available opposition teams.");
}

TEST_F(GradeAndDate, AGradeOfOneTeamIsRefusedAndNoStays) {
  DoAll({"click imgSheets", "pick cboResGrade =C Grade", "answer no", "click cmdGotoResults"});
  EXPECT_EQ(TheBox(), OneTeamWords("C Grade"));
  EXPECT_EQ(Boxes().front().style, 68);
  EXPECT_TRUE(Shown("fraChangeGrade"));
  EXPECT_FALSE(Shown("fraTeams"));
  DoAll({"pick cboResGrade =A Grade", "click cmdGotoResults"});
  EXPECT_TRUE(Shown("fraTeams"));
}

TEST_F(GradeAndDate, AGradeOfOneTeamLeadsToTheSetupOnYes) {
  DoAll({"click imgSheets", "pick cboResGrade =C Grade", "answer yes", "click cmdGotoResults"});
  EXPECT_EQ(Front(), "frmNames");
  EXPECT_EQ(InSession("Flag"), 1);
}

TEST_F(GradeAndDate, AFlagOfAnotherScreenIsNoFailedCheck) {
  DoAll({"click imgSheets", "pick cboResGrade =C Grade", "answer yes", "click cmdGotoResults"});
  DoAll({"click cmdAddCancel"});
  EXPECT_EQ(Front(), "frmResults");
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(GradeAndDate, TeamsThatCannotBeListedLeaveGradeAndDateToBePickedAgain) {
  for (const bool over_teams : {false, true}) {
    int stopped = 0;
    for (int open = 1; open <= 12; ++open) {
      Do("click imgSheets");
      if (over_teams) DoAll({"click cmdGotoResults", "click cmdChangeGrade"});
      DoAll({"fault open " + std::to_string(open) + " 75", "click cmdGotoResults", "fault off"});
      if (Shown("fraChangeGrade")) {
        ++stopped;
        EXPECT_FALSE(Shown("fraResControls")) << open;
        EXPECT_EQ(Shown("fraTeams"), over_teams) << open;
        EXPECT_EQ(Shown("fraTeams") && Enabled("fraTeams"), false) << open;
        DoAll({"click cmdHelp1", "click cmdGotoResults"});
      }
      EXPECT_TRUE(Shown("fraTeams") && Enabled("fraTeams") && Shown("fraResControls")) << open;
      Do("click cmdLeaveResults");
    }
    EXPECT_GT(stopped, 1);
  }
}

class AwayInSetup : public GradeAndDate {
 protected:
  void GoThere() {
    DoAll({"click imgSheets", "date Cal 2004-04-08", "pick cboResGrade =C Grade", "answer yes",
           "click cmdGotoResults"});
    ASSERT_EQ(Front(), "frmNames");
  }
  void AddSecondTeam() {
    DoAll({"pick cboAddGrd =C Grade", "type cboAddTm Bears", "type txtAddSn Oak",
           "type txtAddFn Ida", "click cmdAddSave"});
  }
};

TEST_F(AwayInSetup, TheGradeAndDatePickedStandAsTheyWere) {
  GoThere();
  Do("click cmdAddCancel");
  EXPECT_EQ(Front(), "frmResults");
  EXPECT_EQ(Text("cboResGrade"), "C Grade");
  EXPECT_EQ(DateOf("Cal"), "2004-04-08");
  EXPECT_EQ(Text("txtDayName"), "Thursday");
  EXPECT_EQ(Focus(), "frmResults.cmdGotoResults");
}

TEST_F(AwayInSetup, TheGradeLeadsOnOnceItHasASecondTeam) {
  GoThere();
  AddSecondTeam();
  DoAll({"click cmdAddCancel", "click imgSheets", "click cmdGotoResults"});
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Caption("lblHeader(0)"), "C Grade");
  EXPECT_EQ(Lines("cboResTeam"), (TextList{"Alone", "Bears"}));
  EXPECT_EQ(InSession("WorkDate"), "2004-04-08");
}

TEST_F(AwayInSetup, AGradeAddedMeanwhileIsListed) {
  GoThere();
  DoAll({"input D Grade", "click cmdNewGrd", "focus cboAddGrd", "key Tab", "click chkNun",
         "click cmdNoPOK", "type cboAddTm Deers", "type txtAddSn Elm", "type txtAddFn Uma",
         "click cmdAddSave", "click cmdAddCancel", "click imgSheets"});
  EXPECT_EQ(Lines("cboResGrade"), (TextList{"A Grade", "B Grade", "C Grade", "D Grade"}));
  EXPECT_EQ(Text("cboResGrade"), "C Grade");
}

TEST_F(AwayInSetup, AGradeThatHasGoneGivesWayToTheFirst) {
  GoThere();
  DoAll({"pick cboAddGrd =C Grade", "pick cboAddTm =Alone", "pick lstPlayers 0", "answer ok",
         "click cmdDelName", "click cmdAddCancel", "click imgSheets"});
  EXPECT_EQ(Text("cboResGrade"), "A Grade");
  EXPECT_EQ(DateOf("Cal"), "2004-04-08");
}

TEST_F(AwayInSetup, AnotherCompetitionStartsAfresh) {
  WritePlayers("Other.qza", {Player(1, "Reed", "Jo", "Rovers", "B Grade"),
                             Player(2, "Hill", "Al", "Hawks", "B Grade"),
                             Player(3, "Vale", "Su", "Hawks", "C Grade")});
  GoThere();
  DoAll({"close frmNames", "file Other.qza", "click mnuOpen", "click imgSheets"});
  EXPECT_EQ(Lines("cboResGrade"), (TextList{"B Grade", "C Grade"}));
  EXPECT_EQ(Text("cboResGrade"), "B Grade");
  EXPECT_EQ(DateOf("Cal"), "2004-03-31");
}

TEST_F(GradeAndDate, CancelAtFirstGoesBackToTheMainMenu) {
  DoAll({"click imgSheets", "click cmdExit"});
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmResults"));
}

TEST_F(GradeAndDate, EscIsCancel) {
  DoAll({"click imgSheets", "key Esc"});
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(GradeAndDate, EnterIsOk) {
  DoAll({"click imgSheets", "focus Cal", "key Enter"});
  EXPECT_TRUE(Shown("fraTeams"));
}

TEST_F(GradeAndDate, ChangeGradeComesBackOverTheTeams) {
  OpenGrade("B Grade");
  Do("click cmdChangeGrade");
  EXPECT_TRUE(Shown("fraChangeGrade"));
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_FALSE(Enabled("fraTeams"));
  EXPECT_FALSE(Shown("fraResControls"));
  EXPECT_EQ(Text("txtDayName"), "Wednesday");
}

TEST_F(GradeAndDate, CancelOverTheTeamsGoesOnWithTheGradeThatStandsThere) {
  OpenGrade("B Grade");
  DoAll({"click cmdChangeGrade", "click cmdExit"});
  EXPECT_TRUE(Shown("fraTeams"));
  EXPECT_TRUE(Enabled("fraTeams"));
  EXPECT_TRUE(Shown("fraResControls"));
  // The grades were listed anew, with the first one picked.
  EXPECT_EQ(Caption("lblHeader(0)"), "A Grade");
}

TEST_F(GradeAndDate, HelpAndF1OpenTheTopic) {
  Do("click imgSheets");
  Do("click cmdHelp1");
  const std::vector<Json> by_button = EventsNamed("help");
  ASSERT_EQ(by_button.size(), 1U);
  EXPECT_EQ(by_button.front(), (Json{{"file", "qz1.HLP"}, {"topic", 140}}));
  Do("click cmdGotoResults");
  EXPECT_EQ(Caption("lblPressF1"), "  Press F1 for Help  ");
  Do("key F1");
  EXPECT_EQ(EventsNamed("help"), by_button);
}

TEST_F(GradeAndDate, NoFileNamedIsTold) {
  Start();
  // The name goes while the main menu stands; the way in writes it again, so it goes from there.
  Do("click imgSheets");
  Do("click cmdGotoResults");
  WriteFile("FileName.qz3", "\"\"\r\n");
  Do("click cmdChangeGrade");
  EXPECT_EQ(TheBox(), kNoFileWords);
  EXPECT_EQ(Boxes().front().style, 48);
}

TEST_F(GradeAndDate, AMissingFileNameIsAnError) {
  OpenGrade();
  DeleteFile("FileName.qz3");
  Do("click cmdChangeGrade");
  EXPECT_EQ(TheBox(), "FILE NOT FOUND OR READ ONLY    ");
}

TEST_F(GradeAndDate, AGradeThatHasGoneMeanwhileIsNotFound) {
  Do("click imgSheets");
  WritePlayers(kLeagueFile, {Player(1, "Reed", "Jo", "Rovers", "Other")});
  DoAll({"answer no", "click cmdGotoResults"});
  EXPECT_EQ(TheBox(), OneTeamWords("A Grade"));
}

class BadWorkDate : public GradeAndDate {
 protected:
  void ExpectStopped() {
    Do("click imgSheets");
    EXPECT_EQ(TheBox(), kNoFileWords);
    EXPECT_TRUE(Lines("cboResGrade").empty());
    EXPECT_EQ(Front(), "frmResults");
  }
};

TEST_F(BadWorkDate, MissingStopsTheScreenWithTheBox) {
  DeleteFile("WkDate.qz3");
  ExpectStopped();
}

TEST_F(BadWorkDate, EmptyStopsTheScreenWithTheBox) {
  WriteFile("WkDate.qz3", "");
  ExpectStopped();
}

TEST_F(BadWorkDate, GarbledStopsTheScreenWithTheBox) {
  WriteFile("WkDate.qz3", "\xFF\x00#2004");
  ExpectStopped();
}

TEST_F(BadWorkDate, ATextForADateStopsTheScreenWithTheBox) {
  WriteFile("WkDate.qz3", "\"31/03/2004\"\r\n");
  ExpectStopped();
}

TEST_F(BadWorkDate, ADayThatDoesNotExistStopsTheScreenWithTheBox) {
  WriteFile("WkDate.qz3", "#2004-02-30#\r\n");
  ExpectStopped();
}

TEST_F(BadWorkDate, UnixLineEndsAreRead) {
  WriteFile("WkDate.qz3", "#2004-03-24#\n");
  Do("click imgSheets");
  EXPECT_EQ(DateOf("Cal"), "2004-03-24");
}

TEST_F(BadWorkDate, GoesOnWithTheDateInHandWhenThereIsOne) {
  OpenGrade();
  DeleteFile("WkDate.qz3");
  Do("click cmdChangeGrade");
  EXPECT_EQ(TheBox(), kNoFileWords);
  EXPECT_EQ(DateOf("Cal"), "2004-03-31");
  EXPECT_EQ(Lines("cboResGrade").size(), 3U);
}

TEST_F(GradeAndDate, ABlankGradeHasItsOwnFile) {
  WritePlayers(kLeagueFile,
               {Player(1, "Reed", "Jo", "Rovers", ""), Player(2, "Hill", "Al", "Hawks", "")});
  DoAll({"click imgSheets", "click cmdGotoResults"});
  EXPECT_EQ(Caption("lblHeader(0)"), "");
  SaveGoodSheet("Hill,  Al");
  EXPECT_EQ(Results("Winter_.qzr").size(), 1U);
}

TEST_F(GradeAndDate, ABlankTeamHidesTheSelectionsAndCanPlay) {
  WritePlayers(kLeagueFile, {Player(1, "Reed", "Jo", "", "A Grade"),
                             Player(2, "Hill", "Al", "Hawks", "A Grade")});
  DoAll({"click imgSheets", "click cmdGotoResults"});
  EXPECT_FALSE(Shown("fraResControls"));
  EXPECT_EQ(Lines("cboResTeam"), (TextList{"", "Hawks"}));
  EXPECT_EQ(Caption("lblHeader(2)"), "v's  HAWKS");
  SaveGoodSheet("Reed,  Jo");
  EXPECT_TRUE(Shown("fraResControls"));
  EXPECT_EQ(Saved().size(), 1U);
}

TEST_F(GradeAndDate, GradesAreToldApartByCase) {
  WritePlayers(kLeagueFile, {Player(1, "Reed", "Jo", "Rovers", "a grade"),
                             Player(2, "Hill", "Al", "Hawks", "a grade"),
                             Player(3, "Hope", "Bo", "Hawks", "A Grade")});
  DoAll({"click imgSheets", "pick cboResGrade =A Grade", "answer no", "click cmdGotoResults"});
  EXPECT_EQ(TheBox(), OneTeamWords("A Grade"));
}

}  // namespace
}  // namespace marlowbeck
