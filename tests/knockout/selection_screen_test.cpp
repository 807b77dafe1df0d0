// Who is in the knock-out: its date, its grade, players into the table and back.

#include "knockout/knock_out.h"

namespace marlowbeck {
namespace {

const TextList kFive = {"Moss, Cy : A Grade", "Dean, Di : B Grade", "Archer, Jo : A Grade",
                        "Young, Al : A Grade", "Ely, Bo : B Grade"};
constexpr const char* kTooMany =
    "The MAXIMUM players allowed is 64.\rYou can REMOVE players from the selected\r"
    "list to make room for other players.";
constexpr const char* kDeleted =
    "There are players in the Knock-Out list.\rIf you select another grade, the current\r"
    "list will be deleted!\r\rDo you wish to continue?";

class KnockOutSelection : public KnockOutTest {};

TEST_F(KnockOutSelection, BeginsWithTheDate) {
  Lay(FivePlayers());
  Open();
  EXPECT_EQ(Front(), "frmKnockOut");
  EXPECT_EQ(Title("frmKnockOut"), "[Marlowbeck] KNOCK-OUT: Filename: WINTER");
  EXPECT_TRUE(Shown("fraKODate"));
  for (const char* panel : {"fraKO", "fraKOGrade", "fraKODC", "picPrint", "fraFontPick"}) {
    EXPECT_FALSE(Shown(panel)) << panel;
  }
  EXPECT_EQ(DateOf("NewCal"), "2004-03-31");
  EXPECT_EQ(Text("txtKODate"), "Wednesday");
  EXPECT_EQ(Get("txtKODate")["locked"], true);
  Do("date NewCal 2004-04-03");
  EXPECT_EQ(Text("txtKODate"), "Saturday");
}

TEST_F(KnockOutSelection, CaptionsOfItsControls) {
  Lay(FivePlayers());
  Open();
  const std::vector<std::pair<std::string, std::string>> captions = {
      {"fraKODate", "Date and Grade Selection for Knock-Out"},
      {"cmdOK", "&OK"},
      {"cmdNewDateHelp", "&Help"},
      {"cmdCancel", "&Cancel"},
      {"fraKO", "Players Selections"},
      {"lblKOC", "KNOCK-OUT Competition"},
      {"cmdADD", "Add > Selection"},
      {"cmdREMOVE", "< Remove Selection"},
      {"cmdALL", "Select All Players"},
      {"cmdSaveKO", "Save Current List"},
      {"cmdOpen", "Open a List"},
      {"cmdCD", "Change Date"},
      {"cmdKOGrade", "Select Grade"},
      {"cmdReRun", "Re-Start"},
      {"cmdScramble", "Scramble"},
      {"cmdPrnt", "Print Setup"},
      {"cmdClipBoard", "Copy to Clipboard"},
      {"cmdCancelKO", "&Cancel"},
      {"cmdKOHelp", "&Help"},
      {"fraKOGrade", "Select Grade"},
      {"cmdGradeOK", "OK"},
      {"cmdSelAll", "Select ALL Grades"},
      {"Command2", "&Cancel"},
      {"fraKODC", "Date Selection for Knock-Out"},
      {"cmdKOChangeDate", "&OK"},
      {"cmdKOCancelDC", "&Cancel"},
      {"picPrint", "Print Options"},
      {"cmdPrinterSetup", "Printer Setup"},
      {"cmdKOprint", "Print"},
      {"cmdBothCancel", "Cancel"},
      {"cmdWeekHelp", "Help"}};
  for (const auto& [control, caption] : captions) EXPECT_EQ(Caption(control), caption) << control;
}

TEST_F(KnockOutSelection, OkListsAllPlayersInTheOrderOfTheFile) {
  Lay(FivePlayers());
  Open();
  DoAll({"date NewCal 2004-04-03", "click cmdOK"});
  EXPECT_FALSE(Shown("fraKODate"));
  EXPECT_TRUE(Shown("fraKO"));
  EXPECT_EQ(Focus(), "frmKnockOut.lstAllPlayers");
  EXPECT_EQ(Caption("lblKODate"), "Saturday 3 April 2004");
  EXPECT_EQ(Caption("lblGrade"), "All Association Grades");
  EXPECT_EQ(Available(), kFive);
  EXPECT_EQ(Caption("lblKONOP(0)"), "Players NOT Selected");
  EXPECT_EQ(Caption("lblKONOP(2)"), "Players Selected");
  EXPECT_EQ(Counts(), (TextList{"5", "0", "5"}));
  EXPECT_FALSE(Enabled("cmdADD"));
  EXPECT_FALSE(Enabled("cmdREMOVE"));
  EXPECT_TRUE(Enabled("cmdALL"));
}

TEST_F(KnockOutSelection, TheTableHasSixtyFourNumberedPlaces) {
  OpenFive();
  const auto cells = Cells("grdKO");
  ASSERT_EQ(cells.size(), 65U);
  EXPECT_EQ(cells[0], (TextList{"#", "Player", "Grade"}));
  for (std::size_t row = 1; row < cells.size(); ++row) {
    EXPECT_EQ(cells[row], (TextList{std::to_string(row), "", ""}));
  }
}

TEST_F(KnockOutSelection, APickAllowsToAddACellToRemove) {
  OpenFive();
  Do("pick lstAllPlayers 0");
  EXPECT_TRUE(Enabled("cmdADD"));
  EXPECT_FALSE(Enabled("cmdREMOVE"));
  Do("cell grdKO 1 1");
  EXPECT_FALSE(Enabled("cmdADD"));
  EXPECT_TRUE(Enabled("cmdREMOVE"));
}

TEST_F(KnockOutSelection, AddMovesTheMarkedPlayerToTheFirstFreePlace) {
  OpenFive();
  Select({kFive[2], kFive[1]});
  EXPECT_EQ(Players(), (TextList{"Archer, Jo", "Dean, Di"}));
  EXPECT_EQ(Grades(), (TextList{"A Grade", "B Grade"}));
  EXPECT_EQ(Available(), (TextList{kFive[0], kFive[3], kFive[4]}));
  EXPECT_EQ(Counts(), (TextList{"3", "2", "5"}));
  EXPECT_FALSE(Enabled("cmdADD"));
  EXPECT_FALSE(Enabled("cmdREMOVE"));
  EXPECT_EQ(Index("lstAllPlayers"), -1);
}

TEST_F(KnockOutSelection, ADoubleClickAndEnterAddToo) {
  OpenFive();
  Do("dblpick lstAllPlayers 1");
  DoAll({"pick lstAllPlayers 0", "key Enter"});
  EXPECT_EQ(Players(), (TextList{"Dean, Di", "Moss, Cy"}));
  EXPECT_FALSE(Enabled("cmdADD"));
}

TEST_F(KnockOutSelection, EnterWithoutAMarkedPlayerAddsNobody) {
  OpenFive();
  Do("key Enter");
  EXPECT_TRUE(Players().empty());
  DoAll({"pick lstAllPlayers 0", "key Enter", "key Enter"});
  EXPECT_EQ(Players().size(), 1U);
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(KnockOutSelection, TheArrowsGoOnWhereTheLastPlayerWasTaken) {
  OpenFive();
  DoAll({"pick lstAllPlayers 2", "key Enter", "key Down"});
  EXPECT_EQ(Index("lstAllPlayers"), 2) << "who came after";
  DoAll({"key Enter", "key Up", "key Enter"});
  EXPECT_EQ(Players(), (TextList{"Archer, Jo", "Young, Al", "Ely, Bo"}));
}

TEST_F(KnockOutSelection, RemoveClosesTheGapAndPutsThePlayerLast) {
  OpenFive();
  Select({kFive[2], kFive[1], kFive[4]});
  DoAll({"cell grdKO 1 1", "click cmdREMOVE"});
  EXPECT_EQ(Players(), (TextList{"Dean, Di", "Ely, Bo"}));
  EXPECT_EQ(Grades(), (TextList{"B Grade", "B Grade"}));
  EXPECT_EQ(Available(), (TextList{kFive[0], kFive[3], kFive[2]}));
  EXPECT_EQ(Counts(), (TextList{"3", "2", "5"}));
  EXPECT_FALSE(Enabled("cmdREMOVE"));
}

TEST_F(KnockOutSelection, RemovingRowOneOfThreeMovesTheOthersUpAndNoNumber) {
  OpenFive();
  Select({kFive[0], kFive[1], kFive[2]});
  Do("dblcell grdKO 1 1");
  EXPECT_EQ(Players(), (TextList{"Dean, Di", "Archer, Jo"}));
  EXPECT_EQ(Row("grdKO", 1), (TextList{"1", "Dean, Di", "B Grade"}));
  EXPECT_EQ(Row("grdKO", 3), (TextList{"3", "", ""}));
}

TEST_F(KnockOutSelection, APlayerRemovedGoesToTheEndOfTheListWhateverItsOrder) {
  OpenFive();
  Select({kFive[0]});
  DoAll({"cell grdKO 1 1", "key Enter"});
  EXPECT_EQ(Available().back(), kFive[0]);
  EXPECT_EQ(Available().front(), kFive[1]);
}

TEST_F(KnockOutSelection, OnlyTheColumnOfThePlayersRemoves) {
  OpenFive();
  Select({kFive[0]});
  for (const char* cell : {"cell grdKO 1 0", "cell grdKO 1 2", "cell grdKO 2 1", "cell grdKO 0 1",
                           "cell grdKO 0 0", "cell grdKO 64 1"}) {
    DoAll({cell, "click cmdREMOVE"});
    EXPECT_EQ(Players(), (TextList{"Moss, Cy"})) << cell;
    EXPECT_EQ(Available().size(), 4U) << cell;
    EXPECT_EQ(Row("grdKO", 0)[1], "Player") << cell;
  }
  EXPECT_FALSE(HasFile("KO.qz3"));
}

TEST_F(KnockOutSelection, TheWorkFileHoldsTheTableWithItsGap) {
  OpenFive();
  Select({kFive[0], kFive[1], kFive[2]});
  DoAll({"cell grdKO 2 1", "click cmdREMOVE"});
  std::string expected = "\"Moss, Cy\",\"A Grade\"\r\n\"\",\"\"\r\n\"Archer, Jo\",\"A Grade\"\r\n";
  for (int row = 4; row <= 64; ++row) expected += "\"\",\"\"\r\n";
  EXPECT_EQ(File("KO.qz3"), expected + "\"All Association Grades\"\r\n");
}

TEST_F(KnockOutSelection, ARemovalKeepsTheGrade) {
  OpenFive();
  TakeGrade("B Grade");
  DoAll({"click cmdALL", "dblcell grdKO 1 1", "dblcell grdKO 1 1"});
  EXPECT_TRUE(File("KO.qz3").ends_with("\"B Grade\"\r\n"));
}

TEST_F(KnockOutSelection, QuotesAndCommasInNamesComeThroughARemoval) {
  Lay({Player(1, "Smith \"Ace\"", "A, B", "Rovers", "A \"1\", Grade"),
       Player(2, "x\", \"y", "z", "Cubs", "A \"1\", Grade")});
  OpenSelection();
  Do("click cmdALL");
  Do("dblcell grdKO 2 1");
  EXPECT_EQ(Players(), (TextList{"Smith \"Ace\", A, B"}));
  EXPECT_EQ(Grades(), (TextList{"A \"1\", Grade"}));
  EXPECT_EQ(Available(), (TextList{"x\", \"y, z : A \"1\", Grade"}));
}

TEST_F(KnockOutSelection, AllFillsThePlacesInOrder) {
  OpenFive();
  Do("click cmdALL");
  EXPECT_EQ(Players(), (TextList{"Moss, Cy", "Dean, Di", "Archer, Jo", "Young, Al", "Ely, Bo"}));
  EXPECT_EQ(Grades(), (TextList{"A Grade", "B Grade", "A Grade", "A Grade", "B Grade"}));
  EXPECT_TRUE(Available().empty());
  EXPECT_EQ(Counts(), (TextList{"0", "5", "5"}));
}

TEST_F(KnockOutSelection, AllDoesNothingWhereSomebodyIsSelected) {
  OpenFive();
  Select({kFive[3]});
  Do("click cmdALL");
  EXPECT_EQ(Players(), (TextList{"Young, Al"}));
  EXPECT_EQ(Available().size(), 4U);
}

TEST_F(KnockOutSelection, WithSixtyFourAvailableAllFillsAllPlaces) {
  Lay(ManyPlayers(64));
  OpenSelection();
  EXPECT_TRUE(Enabled("cmdALL"));
  Do("click cmdALL");
  EXPECT_EQ(Players().size(), 64U);
  EXPECT_EQ(Players().back(), "P64, X");
  EXPECT_EQ(Counts(), (TextList{"0", "64", "64"}));
}

TEST_F(KnockOutSelection, WithSixtyFiveAvailableAllIsDisabled) {
  Lay(ManyPlayers(65));
  OpenSelection();
  EXPECT_FALSE(Enabled("cmdALL"));
  EXPECT_EQ(Counts(), (TextList{"65", "0", "65"}));
  DoAll({"dblpick lstAllPlayers 0"});
  EXPECT_FALSE(Enabled("cmdALL")) << "though one fewer is left";
}

TEST_F(KnockOutSelection, TheSixtyFourthPlayerIsAddedAndThenNoMore) {
  Lay(ManyPlayers(66));
  OpenSelection();
  for (int player = 1; player <= 63; ++player) Do("dblpick lstAllPlayers 0");
  Do("pick lstAllPlayers 0");
  EXPECT_TRUE(Enabled("cmdADD"));
  Do("click cmdADD");
  EXPECT_EQ(Players().size(), 64U);
  Do("pick lstAllPlayers 0");
  EXPECT_FALSE(Enabled("cmdADD"));
  Do("dblpick lstAllPlayers 0");
  EXPECT_TRUE(Boxes().empty()) << "a double click does nothing";
  Do("key Enter");
  EXPECT_EQ(BoxTexts(), (TextList{kTooMany}));
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(Available().size(), 2U);
}

TEST_F(KnockOutSelection, TwoPlayersOfOneNameAndGradeAreTwoLines) {
  Lay({Player(1, "Hill", "Al", "Rovers", "A Grade"), Player(2, "Hill", "Al", "Cubs", "A Grade")});
  OpenSelection();
  EXPECT_EQ(Available(), TextList(2, "Hill, Al : A Grade"));
  Do("dblpick lstAllPlayers 1");
  EXPECT_EQ(Available().size(), 1U);
  Do("dblpick lstAllPlayers 0");
  EXPECT_EQ(Players(), TextList(2, "Hill, Al"));
}

TEST_F(KnockOutSelection, ABlankGradeIsAGradeLikeAnother) {
  Lay({Player(1, "Hill", "Al", "Rovers", ""), Player(2, "Lee", "Bo", "Cubs", ""),
       Player(3, "May", "Cy", "Bees", "B Grade")});
  OpenSelection();
  EXPECT_EQ(Available()[0], "Hill, Al : ");
  Do("dblpick lstAllPlayers 0");
  EXPECT_EQ(Row("grdKO", 1), (TextList{"1", "Hill, Al", ""}));
  Do("dblcell grdKO 1 1");
  EXPECT_EQ(Available().back(), "Hill, Al : ");
  TakeGrade("");
  EXPECT_EQ(Available(), (TextList{"Hill, Al : ", "Lee, Bo : "}));
  EXPECT_EQ(Caption("lblGrade"), "");
}

TEST_F(KnockOutSelection, AGradeListsItsPlayersAlone) {
  OpenFive();
  Do("click cmdKOGrade");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_TRUE(Shown("fraKOGrade"));
  EXPECT_FALSE(Enabled("cmdSaveKO"));
  EXPECT_EQ(Lines("cboResGrade"), (TextList{"A Grade", "B Grade"}));
  EXPECT_EQ(Text("cboResGrade"), "A Grade");
  DoAll({"pick cboResGrade =B Grade", "click cmdGradeOK"});
  EXPECT_FALSE(Shown("fraKOGrade"));
  EXPECT_TRUE(Enabled("cmdSaveKO"));
  EXPECT_EQ(Caption("lblGrade"), "B Grade");
  EXPECT_EQ(Available(), (TextList{kFive[1], kFive[4]}));
  EXPECT_EQ(Counts(), (TextList{"2", "0", "2"}));
  DoAll({"click cmdKOGrade", "click cmdSelAll"});
  EXPECT_EQ(Caption("lblGrade"), "All Association Grades");
  EXPECT_EQ(Available(), kFive);
}

TEST_F(KnockOutSelection, AnotherGradeDeletesTheListOnlyWhenThatIsWanted) {
  OpenFive();
  Select({kFive[0]});
  DoAll({"answer no", "click cmdKOGrade"});
  EXPECT_EQ(BoxTexts(), (TextList{kDeleted}));
  EXPECT_EQ(Boxes()[0].style, 68);
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_FALSE(Shown("fraKOGrade"));
  EXPECT_TRUE(Enabled("cmdSaveKO"));
  DoAll({"answer yes", "click cmdKOGrade"});
  EXPECT_TRUE(Shown("fraKOGrade"));
  EXPECT_EQ(Players().size(), 1U) << "not yet";
  Do("click cmdGradeOK");
  EXPECT_TRUE(Players().empty());
  EXPECT_EQ(Available().size(), 3U);
}

TEST_F(KnockOutSelection, CancelOfTheGradeChangesNothing) {
  OpenFive();
  Select({kFive[0]});
  DoAll({"answer yes", "click cmdKOGrade", "pick cboResGrade =B Grade", "click Command2"});
  EXPECT_FALSE(Shown("fraKOGrade"));
  EXPECT_TRUE(Enabled("cmdSaveKO"));
  EXPECT_EQ(Caption("lblGrade"), "All Association Grades");
  EXPECT_EQ(Players(), (TextList{"Moss, Cy"}));
  EXPECT_EQ(Available().size(), 4U);
}

TEST_F(KnockOutSelection, AnotherDateLeavesTheSelection) {
  OpenFive();
  Select({kFive[0]});
  Do("click cmdCD");
  EXPECT_TRUE(Shown("fraKODC"));
  EXPECT_FALSE(Enabled("cmdSaveKO"));
  EXPECT_EQ(DateOf("ChDate"), "2004-03-31");
  EXPECT_EQ(Text("txtKOdateChange"), "Wednesday");
  Do("date ChDate 2004-05-02");
  EXPECT_EQ(Text("txtKOdateChange"), "Sunday");
  EXPECT_EQ(Caption("lblKODate"), "Wednesday 31 March 2004");
  Do("click cmdKOChangeDate");
  EXPECT_FALSE(Shown("fraKODC"));
  EXPECT_TRUE(Enabled("cmdSaveKO"));
  EXPECT_EQ(Caption("lblKODate"), "Sunday 2 May 2004");
  EXPECT_EQ(Players(), (TextList{"Moss, Cy"}));
}

TEST_F(KnockOutSelection, CancelOfTheDateKeepsTheOldOne) {
  OpenFive();
  DoAll({"click cmdCD", "date ChDate 2004-05-02", "click cmdKOCancelDC"});
  EXPECT_EQ(Caption("lblKODate"), "Wednesday 31 March 2004");
  EXPECT_FALSE(Shown("fraKODC"));
  Do("click cmdCD");
  EXPECT_EQ(DateOf("ChDate"), "2004-03-31");
  EXPECT_EQ(Text("txtKOdateChange"), "Wednesday");
}

TEST_F(KnockOutSelection, ReStartComesBackToTheDate) {
  OpenFive();
  DoAll({"click cmdALL", "click cmdReRun"});
  EXPECT_EQ(Front(), "frmKnockOut");
  EXPECT_FALSE(Shown("frmDB.imgKO"));
  EXPECT_TRUE(Shown("fraKODate"));
  EXPECT_FALSE(Shown("fraKO"));
  Do("click cmdOK");
  EXPECT_TRUE(Players().empty());
  EXPECT_EQ(Available(), kFive);
  Do("click cmdCancelKO");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(KnockOutSelection, CancelLeadsBackToTheMainMenu) {
  Lay(FivePlayers());
  for (const char* way : {"click cmdCancel", "key Esc", "close frmKnockOut"}) {
    Open();
    Do(way);
    EXPECT_EQ(Front(), "frmDB") << way;
    EXPECT_TRUE(Enabled("imgKO")) << way;
  }
  for (const char* way : {"click cmdCancelKO", "key Esc", "key Alt+C"}) {
    OpenSelection();
    Do(way);
    EXPECT_EQ(Front(), "frmDB") << way;
    EXPECT_FALSE(Loaded("frmKnockOut")) << way;
  }
}

TEST_F(KnockOutSelection, EscLeavesThePanelThatStandsOverTheOthers) {
  OpenFive();
  DoAll({"click cmdCD", "key Esc"});
  EXPECT_FALSE(Shown("fraKODC"));
  DoAll({"click cmdKOGrade", "key Esc"});
  EXPECT_FALSE(Shown("fraKOGrade"));
  EXPECT_EQ(Front(), "frmKnockOut");
  EXPECT_TRUE(Enabled("cmdSaveKO"));
}

TEST_F(KnockOutSelection, HelpOpensItsTopic) {
  Lay(FivePlayers());
  Open();
  Do("click cmdNewDateHelp");
  EXPECT_EQ(EventsNamed("help").at(0)["topic"], 170);
  Do("click cmdOK");
  Do("key F1");
  EXPECT_EQ(EventsNamed("help").at(0)["topic"], 170);
  EXPECT_EQ(EventsNamed("help").at(0)["file"], "qz1.HLP");
}

TEST_F(KnockOutSelection, APlayerFileOfAThousandIsListedAndOneMoreIsToldOf) {
  Lay(ManyPlayers(1000));
  OpenSelection();
  EXPECT_EQ(Counts(), (TextList{"1000", "0", "1000"}));
  // The list of grades has no room for so many.
  Do("click cmdKOGrade");
  EXPECT_EQ(BoxTexts(), (TextList{"SUBSCRIPT OUT OF RANGE    "}));
  Do("click cmdGradeOK");
  EXPECT_TRUE(Shown("fraKOGrade"));
  Do("click cmdSelAll");
  EXPECT_EQ(Available().size(), 1000U);
  Do("click cmdCancelKO");
  WritePlayers("Winter.qza", ManyPlayers(1001));
  OpenSelection();
  EXPECT_EQ(BoxTexts(), (TextList{"SUBSCRIPT OUT OF RANGE    "}));
  EXPECT_EQ(Front(), "frmKnockOut");
  Do("click cmdCancelKO");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(KnockOutSelection, NoFileOfTheCompetitionIsTouched) {
  OpenFive();
  DoAll({"click cmdALL", "click cmdScramble", "dblcell grdKO 1 1"});
  EXPECT_EQ(File("Winter.qza"), FileOf(FivePlayers()));
}

}  // namespace
}  // namespace marlowbeck
