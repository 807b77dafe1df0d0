#include "setup_test.h"

namespace marlowbeck {
namespace {

constexpr const char* kFileB = "Winter_B Grade.qzs";

class SeasonTest : public SetupTest {
 protected:
  void OpenSeason() {
    WritePlayers(kPlayerFile, TwoGrades());
    NameOpenFile(kPlayerFile);
    Do("click mnuSeason");
  }
};

TEST_F(SeasonTest, OpensOnTheGradesWithNonePicked) {
  OpenSeason();
  EXPECT_EQ(Title("frmSeason"), "[Marlowbeck]  Change Season Description");
  EXPECT_TRUE(Shown("fraGrade"));
  EXPECT_FALSE(Shown("fraEdit"));
  EXPECT_EQ(Lines("cboGrades"), (TextList{"A Grade", "B Grade"}));
  EXPECT_EQ(Index("cboGrades"), 0);
  EXPECT_EQ(Focus(), "frmSeason.cboGrades");
  EXPECT_EQ(Caption("fraGrade"), "Select Grade to change Season Description");
}

TEST_F(SeasonTest, AGradeWithoutATitleIsToldAndCanBeGivenItsFirst) {
  OpenSeason();
  Do("pick cboGrades =B Grade");
  EXPECT_EQ(BoxTexts(), TextList{"The Season Description file was not found.    \r\r"
                                 "Enter a title that describes the Year and    \r"
                                 "Season Name of the competition for B Grade.    \r\r"
                                 "eg: MEN'S WINTER COMP 2004    \r\r"
                                 "(This will appear on most printed output).    "});
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_FALSE(Shown("fraGrade"));
  EXPECT_TRUE(Shown("fraEdit"));
  EXPECT_FALSE(Shown("Label1"));
  EXPECT_FALSE(Shown("lblOldSeason"));
  EXPECT_FALSE(Shown("SSCommand1"));
  EXPECT_EQ(Caption("lblGradeName"), "B Grade");
  EXPECT_FALSE(Enabled("cmdLicSave"));
  EXPECT_EQ(Focus(), "frmSeason.txtNewSeason");
  EXPECT_FALSE(HasFile(kFileB));

  Do("type txtNewSeason MEN'S WINTER COMP 2004");
  EXPECT_TRUE(Enabled("cmdLicSave"));
  Do("click cmdLicSave");
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_EQ(File(kFileB), "\"MEN'S WINTER COMP 2004\"\r\n");
  EXPECT_EQ(InSession("SeasonDescription"), "MEN'S WINTER COMP 2004");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(SeasonTest, ThePresentTitleIsShownAndCanBePastedForChanging) {
  WriteFile(kFileB, "\"Winter 2003\"\r\n");
  OpenSeason();
  Do("pick cboGrades 1");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_TRUE(Shown("Label1"));
  EXPECT_EQ(Caption("Label1"), "Current Season Description");
  EXPECT_EQ(Caption("lblOldSeason"), "Winter 2003");
  EXPECT_EQ(Text("txtNewSeason"), "");
  Do("click SSCommand1");
  EXPECT_EQ(Text("txtNewSeason"), "Winter 2003");
  Do("type txtNewSeason Winter 2004");
  Do("click cmdLicSave");
  EXPECT_EQ(File(kFileB), "\"Winter 2004\"\r\n");
}

TEST_F(SeasonTest, AFailedPickLeavesNothingOfTheGradeBefore) {
  WriteFile("Winter_A Grade.qzs", "\"Winter of A\"\r\n");
  WriteFile(kFileB, "\"Winter of B\"\r\n");
  OpenSeason();
  DoAll({"pick cboGrades =A Grade", "click SSCommand1", "click cmdGrade", "fault close 1 57",
         "pick cboGrades =B Grade"});
  EXPECT_EQ(BoxTexts(), TextList{"DEVICE I/O ERROR    "});
  EXPECT_EQ(Caption("lblGradeName"), "B Grade");
  EXPECT_EQ(Caption("lblOldSeason"), "");
  EXPECT_EQ(Text("txtNewSeason"), "");
  EXPECT_FALSE(Enabled("cmdLicSave"));
}

TEST_F(SeasonTest, TheLineThatIsCurrentAlreadyCanBePicked) {
  OpenSeason();
  Do("pick cboGrades 0");
  EXPECT_TRUE(Shown("fraEdit"));
  EXPECT_EQ(Caption("lblGradeName"), "A Grade");
}

TEST_F(SeasonTest, TheFilesOfTheGradeAreNamed) {
  OpenSeason();
  Do("pick cboGrades 1");
  const std::string base = (Folder() / "Winter_B Grade").string();
  EXPECT_EQ(InSession("Grade"), "B Grade");
  EXPECT_TRUE(File("FileName.qz3").starts_with('"'));
  EXPECT_EQ(InSession("ResultsFile"), base + ".qzr");
  EXPECT_EQ(InSession("SeasonFile"), base + ".qzs");
  EXPECT_EQ(InSession("SeasonReportFile"), base + ".qz3");
}

TEST_F(SeasonTest, SaveIsOnlyThereWhileSomethingIsTyped) {
  OpenSeason();
  Do("pick cboGrades 1");
  Do("type txtNewSeason W");
  EXPECT_TRUE(Enabled("cmdLicSave"));
  Do("type txtNewSeason");
  EXPECT_FALSE(Enabled("cmdLicSave"));
  Refused("click cmdLicSave");
}

TEST_F(SeasonTest, ABlankTitleIsNotSaved) {
  WriteFile(kFileB, "\"Winter 2003\"\r\n");
  OpenSeason();
  Do("pick cboGrades 1");
  Do("type txtNewSeason    ");
  Do("click cmdLicSave");
  EXPECT_EQ(Count("sound"), 0);
  EXPECT_EQ(File(kFileB), "\"Winter 2003\"\r\n");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(SeasonTest, ChangeGradeGoesBackToTheGrades) {
  WriteFile(kFileB, "\"Winter 2003\"\r\n");
  OpenSeason();
  Do("pick cboGrades 1");
  Do("type txtNewSeason half a tit");
  Do("click cmdGrade");
  EXPECT_TRUE(Shown("fraGrade"));
  EXPECT_FALSE(Shown("fraEdit"));
  Do("pick cboGrades 0");
  EXPECT_EQ(Text("txtNewSeason"), "");
  EXPECT_FALSE(Shown("lblOldSeason"));
  Do("click cmdGrade");
  Do("pick cboGrades 1");
  EXPECT_TRUE(Shown("lblOldSeason"));
  EXPECT_TRUE(Shown("SSCommand1"));
}

TEST_F(SeasonTest, EveryWayOutGoesToTheMenuAndSavesNothing) {
  OpenSeason();
  for (const char* leave : {"click cmdCancel", "key Esc", "close frmSeason"}) {
    Do(leave);
    EXPECT_EQ(Front(), "frmDB");
    Do("click mnuSeason");
  }
  for (const char* leave : {"click cmdLicCancel", "key Esc"}) {
    Do("pick cboGrades 1");
    Do("type txtNewSeason Winter 2004");
    Do(leave);
    EXPECT_EQ(Front(), "frmDB");
    EXPECT_FALSE(HasFile(kFileB));
    Do("click mnuSeason");
  }
}

TEST_F(SeasonTest, ATitleWithAQuoteDoesNotComeBackWhole) {
  OpenSeason();
  Do("pick cboGrades 1");
  Do("type txtNewSeason The \"Old\" Cup, 2004");
  Do("click cmdLicSave");
  EXPECT_EQ(File(kFileB), "\"The \"Old\" Cup, 2004\"\r\n");
  Do("click mnuSeason");
  Do("pick cboGrades 1");
  EXPECT_EQ(Caption("lblOldSeason"), "The ");
}

TEST_F(SeasonTest, ACommaInATitleStays) {
  OpenSeason();
  Do("pick cboGrades 1");
  Do("type txtNewSeason Winter, 2004");
  Do("click cmdLicSave");
  Do("click mnuSeason");
  Do("pick cboGrades 1");
  EXPECT_EQ(Caption("lblOldSeason"), "Winter, 2004");
}

TEST_F(SeasonTest, AnEmptyFileOfTheGradeCountsAsNone) {
  WriteFile(kFileB, "");
  OpenSeason();
  Do("pick cboGrades 1");
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_FALSE(Shown("SSCommand1"));
}

TEST_F(SeasonTest, ACompetitionWithoutPlayersHasNoGradeToPick) {
  WritePlayers(kPlayerFile, {});
  NameOpenFile(kPlayerFile);
  Do("click mnuSeason");
  EXPECT_EQ(Front(), "frmSeason");
  EXPECT_TRUE(Lines("cboGrades").empty());
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(SeasonTest, AThousandPlayersRunOffTheListOfGrades) {
  std::vector<PlayerRecord> players;
  for (int id = 1; id <= 999; ++id) players.push_back(Player(id, "S", "F", "T", "A Grade"));
  WritePlayers(kPlayerFile, players);
  NameOpenFile(kPlayerFile);
  Do("click mnuSeason");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Lines("cboGrades"), TextList{"A Grade"});
  Do("click cmdCancel");
  players.push_back(Player(1000, "S", "F", "T", "A Grade"));
  WritePlayers(kPlayerFile, players);
  Do("click mnuSeason");
  EXPECT_EQ(BoxTexts(), TextList{"SUBSCRIPT OUT OF RANGE    "});
}

}  // namespace
}  // namespace marlowbeck
