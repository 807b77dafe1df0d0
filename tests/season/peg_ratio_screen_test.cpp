// Peg ratios: the list, its two orders, its printing and copying.

#include "support/paper.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

class PegRatioScreen : public ClubTest {
 protected:
  static ResultRecord Made(int id, int legs, std::array<std::int16_t, 6> pegs) {
    ResultRecord result;
    result.ID = id;
    result.Team = "Rovers";
    result.Opposition = "Cubs";
    result.GameDate = *DateFromIso("2004-03-03");
    result.Legs = static_cast<std::int16_t>(legs);
    result.Pegs = pegs;
    return result;
  }
  void SetUp() override {
    WritePlayers("Winter.qza", {Player(1, "Young", "Al", "Rovers", "A Grade"),
                                Player(2, "Archer", "Bo", "Cubs", "A Grade"),
                                Player(3, "Moss", "Cy", "Cubs", "A Grade"),
                                Player(4, "Dean", "Di", "Bees", "B Grade")});
    // Young 3 of 12, Archer 1 of 10, Moss 2 of 8: 25, 10 and 25 of a hundred.
    WriteResults("Winter_A Grade.qzr",
                 {Made(1, 12, {40, 0, 8, 0, 0, 2}), Made(2, 10, {0, 0, 0, 0, 0, 170}),
                  Made(3, 8, {10, 20, 0, 0, 0, 0})});
    WriteResults("Winter_B Grade.qzr", {Made(4, 12, {0, 0, 0, 0, 0, 0})});
    WriteFile("Winter_A Grade.qzs", "\"Winter 2004 \"\r\n");
    WriteFile("Association.qz3", "\"Mid Darts\"\r\n");
    NameOpenFile("Winter.qza");
  }
  void Open(Here here = Here::current()) { DoAll({"click imgPrinter", "click Image8"}, here); }
  void OpenList(Here here = Here::current()) {
    Open(here);
    Do("pick cboResGrade =A Grade", here);
  }
  void OpenPrinting(Here here = Here::current()) {
    OpenList(here);
    Do("click cmdHiPrint", here);
  }
  TextList Names(Here here = Here::current()) {
    TextList names;
    for (int row = 1; row <= 3; ++row) names.push_back(Row("grdRatio", row, here)[1]);
    return names;
  }
};

TEST_F(PegRatioScreen, NothingIsWorkedOutBeforeAGradeIsPicked) {
  DeleteFile("Winter_A Grade.qzs");
  Open();
  EXPECT_EQ(Front(), "frmPegRatio");
  EXPECT_EQ(Title("frmPegRatio"), "[Marlowbeck]  Peg Ratios");
  EXPECT_EQ(InSession("ReportChoice"), 8);
  EXPECT_EQ(Lines("cboResGrade"), (TextList{"A Grade", "B Grade"}));
  EXPECT_FALSE(Shown("fraGrid"));
  EXPECT_FALSE(Shown("picPrinter"));
  EXPECT_FALSE(Shown("pbRatio"));
  EXPECT_EQ(Count("input"), 0);
  EXPECT_FALSE(HasFile("LegPegs.qz3"));
  Do("click optRatio");
  EXPECT_TRUE(Events().empty());
  EXPECT_FALSE(Shown("fraGrid"));
}

TEST_F(PegRatioScreen, CaptionsOfItsControls) {
  OpenPrinting();
  const std::vector<std::pair<std::string, std::string>> captions = {
      {"fraPegRatio", "Select Grade"},
      {"SSframe1", "Sort by ..."},
      {"optRatio", "Percentage Ratio"},
      {"optAlfa", "Alphabetical"},
      {"cmdHelp", "Help"},
      {"cmdClipRatio", "Copy to Clipboard"},
      {"fraPrinter", "Options"},
      {"cmdCancel", "Exit"},
      {"cmdHiPrint", "Print"},
      {"picPrinter", "Print Options"},
      {"lblHMPrint", "Peg Ratios"},
      {"Label6", "Print"},
      {"Label2", "Orientation:"},
      {"Label3", "Printer:"},
      {"cmdPrintRatios", "Print"},
      {"cmdPrinterSetup", "Printer Setup"},
      {"cmdBothCancelHI", "Cancel"},
      {"fraFontPick", "Printer Font"},
      {"optHI(1)", "Enter another amount to Print"}};
  for (const auto& [control, caption] : captions) EXPECT_EQ(Caption(control), caption) << control;
}

TEST_F(PegRatioScreen, TheListIsAlphabeticalAtFirst) {
  OpenList();
  EXPECT_TRUE(Shown("fraGrid"));
  EXPECT_TRUE(Ticked("optAlfa"));
  EXPECT_EQ(Caption("lblHi(0)"), "A Grade   Player Peg Ratios");
  EXPECT_EQ(Caption("lblHi(1)"), "Winter 2004 ");
  EXPECT_EQ(Cells("grdRatio"),
            (std::vector<TextList>{{"No.", "Player", "Team", "Legs", "Pegs", "Ratio"},
                                   {"1", "Archer,  Bo", "Cubs", "10", "1", "10.00%"},
                                   {"2", "Moss,  Cy", "Cubs", "8", "2", "25.00%"},
                                   {"3", "Young,  Al", "Rovers", "12", "3", "25.00%"}}));
}

TEST_F(PegRatioScreen, EqualRatiosStandAsTheSortLeavesThem) {
  OpenList();
  Do("click optRatio");
  // From file order Young, Archer, Moss: gap 1 takes Moss past Archer and stops at Young.
  EXPECT_EQ(Names(), (TextList{"Young,  Al", "Moss,  Cy", "Archer,  Bo"}));
  Do("click optAlfa");
  EXPECT_EQ(Names(), (TextList{"Archer,  Bo", "Moss,  Cy", "Young,  Al"}));
}

TEST_F(PegRatioScreen, AChangeOfOrderWorksEverythingOutAgain) {
  OpenList();
  WriteResults("Winter_A Grade.qzr", {Made(2, 4, {8, 8, 8, 8, 8, 0})});
  Do("click optAlfa");
  EXPECT_EQ(Names()[2], "Young,  Al") << "it was in that order already";
  Do("click optRatio");
  EXPECT_EQ(Row("grdRatio", 1), (TextList{"1", "Archer,  Bo", "Cubs", "4", "5", "125.00%"}));
}

TEST_F(PegRatioScreen, TheWorkFileHoldsTheListAsSorted) {
  OpenList();
  Do("click optRatio");
  EXPECT_EQ(File("LegPegs.qz3"),
            "\"Young,  Al\",\"Rovers\",12,3\r\n\"Moss,  Cy\",\"Cubs\",8,2\r\n"
            "\"Archer,  Bo\",\"Cubs\",10,1\r\n");
}

TEST_F(PegRatioScreen, QuotesAndCommasInNamesComeThrough) {
  WritePlayers("Winter.qza", {Player(1, "O\"Neil\"", "A, B", "x\", \"y", "A Grade")});
  OpenList();
  EXPECT_EQ(Row("grdRatio", 1),
            (TextList{"1", "O\"Neil\",  A, B", "x\", \"y", "12", "3", "25.00%"}));
}

TEST_F(PegRatioScreen, AGradeWithoutAnyPegIsTold) {
  OpenList();
  Do("pick cboResGrade =B Grade");
  EXPECT_EQ(BoxTexts(), (TextList{"No pegs found for B Grade.   "}));
  EXPECT_FALSE(Shown("fraGrid"));
  EXPECT_FALSE(Enabled("cmdHiPrint"));
  EXPECT_FALSE(Enabled("cmdClipRatio"));
  Do("pick cboResGrade =A Grade");
  EXPECT_TRUE(Enabled("cmdHiPrint"));
  EXPECT_TRUE(Enabled("cmdClipRatio"));
}

TEST_F(PegRatioScreen, PegsOfPlayersThatAreGoneMakeNoList) {
  WriteResults("Winter_A Grade.qzr", {Made(99, 12, {40, 0, 0, 0, 0, 0})});
  OpenList();
  EXPECT_EQ(BoxTexts(), (TextList{"No players found for A Grade    "}));
  EXPECT_EQ(Cells("grdRatio").size(), 2U);
}

TEST_F(PegRatioScreen, AListOfNobodyHasNothingToPrint) {
  WriteResults("Winter_A Grade.qzr", {Made(99, 12, {40, 0, 0, 0, 0, 0})});
  OpenPrinting();
  EXPECT_EQ(Caption("optHI(0)"), "Print Entire List of 0 Peg Ratios");
  EXPECT_EQ(Text("txtHI"), "0");
  Do("click cmdPrintRatios");
  EXPECT_EQ(BoxTexts(), (TextList{"You must show AMOUNT to print!    "}));
  EXPECT_EQ(Count("printed"), 0);
}

TEST_F(PegRatioScreen, TheBarComesAlongWithTheResults) {
  HOLDS_FOR_MODELS_ALONE("a fault stops the faces at different reads");
  std::vector<ResultRecord> results(9000, Made(1, 5, {1, 0, 0, 0, 0, 0}));
  WriteResults("Winter_A Grade.qzr", results);
  Open();
  bool part_of_it = false;
  for (int read = 1; read <= 40 && !part_of_it; ++read) {
    // A title that cannot be read is asked for.
    DoAll({"forget", "input Winter 2004", "fault off", "fault read " + std::to_string(read) + " 57",
           "pick cboResGrade =A Grade"});
    const Json bar = Get("pbRatio");
    EXPECT_FALSE(bar["visible"]);
    part_of_it = bar["max"] == 3 && bar["value"] > 0 && bar["value"] < 3;
  }
  EXPECT_TRUE(part_of_it);
  DoAll({"fault off", "pick cboResGrade =A Grade"});
  EXPECT_EQ(Get("pbRatio")["value"], 3);
}

TEST_F(PegRatioScreen, AListThatCannotBeWrittenIsNotPrintedUnderTheHeadingBefore) {
  WriteResults("Winter_B Grade.qzr", {Made(4, 12, {8, 0, 0, 0, 0, 0})});
  WriteFile("Winter_B Grade.qzs", "\"Winter B\"\r\n");
  OpenPrinting();
  DoAll({"fault write 1 61", "pick cboResGrade =B Grade"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 61);
  Do("click cmdPrintRatios");
  EXPECT_EQ(Count("printed"), 0);
  EXPECT_EQ(BoxTexts(), (TextList{"You must show AMOUNT to print!    "}));
}

TEST_F(PegRatioScreen, AnOpenPanelTakesTheAmountOfAnotherGradesList) {
  WriteResults("Winter_B Grade.qzr", {Made(4, 12, {8, 0, 0, 0, 0, 0})});
  WriteFile("Winter_B Grade.qzs", "\"Winter B\"\r\n");
  Open();
  DoAll({"pick cboResGrade =B Grade", "click cmdHiPrint", "pick cboResGrade =A Grade"});
  EXPECT_EQ(Caption("optHI(0)"), "Print Entire List of 3 Peg Ratios");
  EXPECT_EQ(Text("txtHI"), "3");
  Do("click cmdPrintRatios");
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].boxes.size(), 4U);
}

TEST_F(PegRatioScreen, AnOpenPanelOffersNothingOfAGradeWithoutPegs) {
  OpenPrinting();
  EXPECT_EQ(Text("txtHI"), "3");
  Do("pick cboResGrade =B Grade");
  EXPECT_EQ(BoxTexts(), (TextList{"No pegs found for B Grade.   "}));
  EXPECT_EQ(Caption("optHI(0)"), "Print Entire List of 0 Peg Ratios");
  EXPECT_EQ(Text("txtHI"), "0");
  Do("click cmdPrintRatios");
  EXPECT_EQ(BoxTexts(), (TextList{"You must show AMOUNT to print!    "}));
}

TEST_F(PegRatioScreen, AListThatCannotBeWrittenIsNotOffered) {
  OpenList();
  Do("fault write 1 61");
  Do("pick cboResGrade =A Grade");
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 61);
  for (const char* control : {"fraGrid", "pbRatio"}) EXPECT_FALSE(Shown(control)) << control;
  for (const char* control : {"cmdHiPrint", "cmdClipRatio"}) {
    EXPECT_FALSE(Enabled(control)) << control;
  }
  Do("fault off");
  Do("pick cboResGrade =A Grade");
  EXPECT_TRUE(Shown("fraGrid"));
  EXPECT_TRUE(Enabled("cmdHiPrint"));
}

TEST_F(PegRatioScreen, AMissingTitleIsAskedFor) {
  DeleteFile("Winter_A Grade.qzs");
  Open();
  Do("input Summer");
  Do("pick cboResGrade 0");
  EXPECT_EQ(EventsNamed("input").at(0)["title"], "Competition Name");
  EXPECT_EQ(Caption("lblHi(1)"), "Summer");
}

TEST_F(PegRatioScreen, TheClipboardGetsHeadingDateAndRows) {
  OpenList();
  Do("click cmdClipRatio");
  EXPECT_EQ(EventsNamed("clipboard").back(),
            "Mid Darts\r\nWinter 2004\r\nA Grade   Player Peg Ratios\r\nPrint Date:  31/03/2004\r\n"
            "No.\tPlayer\tTeam\tLegs\tPegs\tRatio\t\r\n"
            "1\tArcher,  Bo\tCubs\t10\t1\t10.00%\t\r\n"
            "2\tMoss,  Cy\tCubs\t8\t2\t25.00%\t\r\n"
            "3\tYoung,  Al\tRovers\t12\t3\t25.00%\t\r\n");
  EXPECT_EQ(BoxTexts(), (TextList{"A Grade   Player Peg Ratios    \rWinter 2004    \r"
                                  "has been copied to the clipboard    \r"
                                  "and can now be pasted as text into your    \r"
                                  "favourite spreadsheet or wordprocessor.    "}));
}

TEST_F(PegRatioScreen, ThePrintPanelTakesThePlaceOfTheCommands) {
  OpenPrinting();
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_TRUE(Shown("picPrinter"));
  EXPECT_FALSE(Shown("fraPik"));
  EXPECT_EQ(Caption("lblOrient"), "Portrait");
  EXPECT_EQ(Caption("lblPrinterName"), "Test printer");
  EXPECT_EQ(Caption("lblCopies"), "Number of copies:  1");
  EXPECT_EQ(Text("txtNoC"), "1");
  EXPECT_EQ(Caption("optHI(0)"), "Print Entire List of 3 Peg Ratios");
  EXPECT_TRUE(Ticked("optHI(0)"));
  EXPECT_EQ(Text("txtHI"), "3");
  EXPECT_FALSE(Enabled("txtHI"));
  Do("click cmdBothCancelHI");
  EXPECT_FALSE(Shown("picPrinter"));
  EXPECT_TRUE(Shown("fraPik"));
}

TEST_F(PegRatioScreen, AnotherAmountIsAtMostTheList) {
  OpenPrinting();
  Do("click optHI(1)");
  EXPECT_EQ(Text("txtHI"), "");
  EXPECT_TRUE(Enabled("txtHI"));
  EXPECT_EQ(Focus(), "frmPegRatio.txtHI");
  Do("type txtHI 4");
  EXPECT_EQ(Text("txtHI"), "3");
  Do("type txtHI 2");
  EXPECT_EQ(Text("txtHI"), "2");
  Do("click optHI(0)");
  EXPECT_EQ(Text("txtHI"), "3");
  EXPECT_FALSE(Enabled("txtHI"));
}

TEST_F(PegRatioScreen, AmountAndCopiesHaveToBeThere) {
  OpenPrinting();
  Do("click optHI(1)");
  for (const char* amount : {"", "0", "many", "-2"}) {
    Do(std::string("type txtHI ") + amount);
    Do("click cmdPrintRatios");
    EXPECT_EQ(BoxTexts(), (TextList{"You must show AMOUNT to print!    "})) << amount;
  }
  Do("type txtHI 1");
  for (const char* copies : {"", "0", "abc"}) {
    Do(std::string("type txtNoC ") + copies);
    Do("click cmdPrintRatios");
    EXPECT_EQ(BoxTexts(), (TextList{"You must show NUMBER of COPIES to print!    "})) << copies;
  }
  EXPECT_TRUE(Shown("picPrinter"));
}

// With the test's printer a letter of the 10 point font is 100 twips wide and a line 240 high.
TEST_F(PegRatioScreen, PrintsHeadingAndRowsInMeasuredColumns) {
  OpenPrinting();
  DoAll({"click optHI(1)", "type txtHI 2", "click cmdPrintRatios"});
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 1U);
  const PrintedPage& page = pages[0];
  EXPECT_EQ(page.Words(), (TextList{"Mid Darts",   "A Grade   Player Peg Ratios (Alphabetical)",
                                    "Winter 2004", "Num",
                                    "Player",      "Team",
                                    "Legs",        "Pegs",
                                    "Ratio",       "1",
                                    "Archer,  Bo", "Cubs",
                                    "10",          "1",
                                    "10.00%",      "2",
                                    "Moss,  Cy",   "Cubs",
                                    "8",           "2",
                                    "25.00%"}));
  // Lines 1.25 line heights apart from 400 on; the middle is 5953.
  ExpectAt(page.Find("Mid Darts"), 5953 - 450, 400);
  ExpectAt(page.Find("Winter 2004"), 5953 - 550, 1000);
  // Num 360, names 1100 + 240, teams 400 + 240, legs and pegs 600 each, ratio 840: 4380 in all.
  const double left = 5953 - 2190;
  ASSERT_EQ(page.boxes.size(), 3U);
  ExpectStroke(page.boxes[0], {left, 1300, left + 4380, 1588});
  ExpectStroke(page.boxes[2], {left, 1876, left + 4380, 2164});
  ASSERT_EQ(page.lines.size(), 15U);
  ExpectStroke(page.lines[5], {left + 360, 1588, left + 360, 1876});
  ExpectStroke(page.lines[6], {left + 1700, 1588, left + 1700, 1876});
  ExpectStroke(page.lines[7], {left + 2340, 1588, left + 2340, 1876});
  ExpectStroke(page.lines[9], {left + 3540, 1588, left + 3540, 1876});
  ExpectAt(page.Find("Archer,  Bo"), left + 360 + 100, 1588 + 24);
  ExpectAt(page.Find("10.00%"), left + 3540 + (840 - 600) / 2.0, 1588 + 24);
  EXPECT_FALSE(Shown("picPrinter"));
  EXPECT_TRUE(Shown("fraPik"));
}

TEST_F(PegRatioScreen, TheTitleTellsTheOrder) {
  OpenList();
  DoAll({"click optRatio", "click cmdHiPrint", "click cmdPrintRatios"});
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].Words()[1], "A Grade   Player Peg Ratios  (High to Low)");
}

TEST_F(PegRatioScreen, EachCopyIsAPageOfItsOwn) {
  OpenPrinting();
  DoAll({"type txtNoC 2", "click cmdPrintRatios"});
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 2U);
  EXPECT_EQ(pages[0].Words(), pages[1].Words());
}

TEST_F(PegRatioScreen, AFontThatIsTooLargeIsRefused) {
  WritePlayers("Winter.qza", {Player(1, std::string(30, 'W'), std::string(30, 'W'),
                                     std::string(30, 'T'), "A Grade")});
  WriteFile("FontName.qz3", "20,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  OpenPrinting();
  Do("click cmdPrintRatios");
  EXPECT_EQ(BoxTexts(), (TextList{"Font is too large, please re-select.    "}));
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
}

// Num 360, names 1100 + 240, teams 600 + 240, legs and pegs 600 each, ratio 840: 4580 in all.
TEST_F(PegRatioScreen, ATableThatLeavesJust300BesideItIsTooWide) {
  OpenPrinting();
  DoAll({"printer width 4880", "click cmdPrintRatios"});
  EXPECT_EQ(BoxTexts(), (TextList{"Font is too large, please re-select.    "}));
  EXPECT_EQ(Count("killed"), 1);
  DoAll({"click cmdHiPrint", "printer width 4881", "click cmdPrintRatios"});
  EXPECT_TRUE(BoxTexts().empty());
  EXPECT_EQ(Count("printed"), 1);
}

TEST_F(PegRatioScreen, APrinterThatFailsIsTold) {
  OpenPrinting();
  Do("printer fail 3");
  Do("click cmdPrintRatios");
  EXPECT_EQ(BoxTexts(), (TextList{"An unrecognised error occurred while trying to print.    "}));
  EXPECT_EQ(Count("killed"), 1);
}

/// More than one page: 16838 high less 400 and a row of 288 leaves room down to 16150, that is for
/// the heading row and 50 more on the first page, since row 50 ends at 15988 and row 51 beyond.
class LongRatios : public PegRatioScreen {
 protected:
  void SetUp() override {
    PegRatioScreen::SetUp();
    std::vector<PlayerRecord> players;
    std::vector<ResultRecord> results;
    for (int id = 1; id <= 60; ++id) {
      players.push_back(Player(id, "P" + std::to_string(100 + id), "A", "Cubs", "A Grade"));
      results.push_back(Made(id, 5, {1, 0, 0, 0, 0, 0}));
    }
    WritePlayers("Winter.qza", players);
    WriteResults("Winter_A Grade.qzr", results);
    OpenPrinting();
  }
};

TEST_F(LongRatios, AnotherPageIsAskedForAndGoesOnWithoutHeading) {
  DoAll({"answer yes", "click cmdPrintRatios"});
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(
      Boxes()[0].text,
      "Only 51 players of 60 will fit on one page.   \rDo you wish to use another page ?    \r"
      "\rBy selecting NO, printing will be cancelled,    \r"
      "allowing you to select a smaller font.    ");
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 2U);
  EXPECT_EQ(pages[1].Words()[0], "52");
  ExpectStroke(pages[1].boxes[0], {pages[0].boxes[0].x1, 400, pages[0].boxes[0].x2, 688});
  EXPECT_EQ(pages[1].boxes.size(), 9U);
}

TEST_F(LongRatios, NoCancelsThePrinting) {
  DoAll({"answer no", "click cmdPrintRatios"});
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
}

TEST_F(LongRatios, TheFirstRowsOfTheSortArePrinted) {
  DoAll({"click optHI(1)", "type txtHI 10", "click cmdPrintRatios"});
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].boxes.size(), 11U);
}

TEST_F(PegRatioScreen, ExitLeadsBackToTheReports) {
  for (const char* way : {"click cmdCancel", "key Esc", "close frmPegRatio"}) {
    Open();
    Do(way);
    EXPECT_EQ(Front(), "frmPMenu") << way;
    Do("close frmPMenu");
  }
}

}  // namespace
}  // namespace marlowbeck
