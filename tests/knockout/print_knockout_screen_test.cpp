// The table on paper. With the test's printer a letter of the 10 point font is 100 twips wide and a
// line 240 high, so that a row is 276; the middle of the page is 5953.

#include "knockout/knock_out.h"
#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr const char* kUneven =
    "The selected list is uneven. A BYE will\rautomatically be added to the last\r"
    "position when the list is printed.\r\rDo you wish to Continue?";
constexpr double kFoot = 16838 - 400;
constexpr double kPitch = 276;

class KnockOutPrinting : public KnockOutTest {
 protected:
  void SelectMany(int count, Here here = Here::current()) {
    Lay(ManyPlayers(count));
    OpenSelection(here);
    Do("click cmdALL", here);
  }
  void OpenPanel(int count, Here here = Here::current()) {
    SelectMany(count, here);
    if (count % 2 != 0) Do("answer yes", here);
    Do("click cmdPrnt", here);
  }
  std::vector<PrintedPage> Print(Here here = Here::current()) {
    Do("click cmdKOprint", here);
    return PagesOf(EventsNamed("printed"), here);
  }
};

TEST_F(KnockOutPrinting, NobodyCannotBePrinted) {
  OpenFive();
  Do("click cmdPrnt");
  EXPECT_EQ(BoxTexts(), (TextList{"Nothing to PRINT!"}));
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_FALSE(Shown("picPrint"));
}

TEST_F(KnockOutPrinting, ThePanelTakesThePlaceOfTheSelection) {
  SelectMany(2);
  DoAll({"printer orientation landscape", "printer name Old Laser", "click cmdPrnt"});
  EXPECT_TRUE(Events().empty());
  EXPECT_TRUE(Shown("picPrint"));
  EXPECT_TRUE(Shown("fraFontPick"));
  EXPECT_FALSE(Shown("fraKO"));
  EXPECT_EQ(Caption("lblPrinterName"), "Old Laser");
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
  EXPECT_EQ(Text("txtNoC"), "1");
  EXPECT_EQ(Caption("lblFont"), "MS Sans Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 10pts.");
  Do("type txtNoC 4");
  Do("click cmdBothCancel");
  EXPECT_FALSE(Shown("picPrint"));
  EXPECT_TRUE(Shown("fraKO"));
  Do("click cmdPrnt");
  EXPECT_EQ(Text("txtNoC"), "1");
}

TEST_F(KnockOutPrinting, AnUnevenListIsAskedAbout) {
  SelectMany(7);
  DoAll({"answer no", "click cmdPrnt"});
  EXPECT_EQ(BoxTexts(), (TextList{kUneven}));
  EXPECT_EQ(Boxes()[0].style, 68);
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_FALSE(Shown("picPrint"));
  DoAll({"answer yes", "click cmdPrnt"});
  EXPECT_TRUE(Shown("picPrint"));
}

TEST_F(KnockOutPrinting, AnEvenListStopsWithoutAWordAfterANoToSomethingElse) {
  // KEPT: the answer that is looked at is the last of all.
  SelectMany(4);
  DoAll({"answer no", "click cmdKOGrade"});
  EXPECT_EQ(InSession("MessageAnswer"), 7);
  Do("click cmdPrnt");
  EXPECT_TRUE(Events().empty());
  EXPECT_FALSE(Shown("picPrint"));
  // Any other box, and it goes on.
  Do("click cmdClipBoard");
  Do("click cmdPrnt");
  EXPECT_TRUE(Shown("picPrint"));
}

TEST_F(KnockOutPrinting, HeadingAndRowsStandInMeasuredColumns) {
  Lay(FivePlayers());
  OpenSelection();
  Select({"Archer, Jo : A Grade", "Dean, Di : B Grade"});
  Do("click cmdPrnt");
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  const PrintedPage& page = pages[0];
  const std::string heading = "KNOCK-OUT Competition : Wednesday 31 March 2004";
  EXPECT_EQ(page.Words(), (TextList{heading, "All Association Grades", "#", "Player", "Grade", "1",
                                    "Archer, Jo", "A Grade", "2", "Dean, Di", "B Grade"}));
  ExpectAt(page.Find(heading), 5953 - 47 * 50, 400);
  ExpectAt(page.Find("All Association Grades"), 5953 - 22 * 50, 640);
  // # 480, players 10 letters and 240, grades 7 letters and 240: 2660 in all.
  const double left = 5953 - 1330;
  const double top = 400 + 2 * 240 + 120;
  ASSERT_EQ(page.boxes.size(), 3U);
  ExpectStroke(page.boxes[0], {left, top, left + 2660, top + kPitch});
  ExpectStroke(page.boxes[2], {left, top + 2 * kPitch, left + 2660, top + 3 * kPitch});
  ASSERT_EQ(page.lines.size(), 6U);
  ExpectStroke(page.lines[2], {left + 480, top + kPitch, left + 480, top + 2 * kPitch});
  ExpectStroke(page.lines[3], {left + 1720, top + kPitch, left + 1720, top + 2 * kPitch});
  // Heads in the middle, numbers one digit from their rule, names behind half of the room.
  const double text = (kPitch - 240) / 2;
  ExpectAt(page.Find("#"), left + (480 - 100) / 2.0, top + text);
  ExpectAt(page.Find("Player"), left + 480 + (1240 - 600) / 2.0, top + text);
  ExpectAt(page.Find("Grade"), left + 1720 + (940 - 500) / 2.0, top + text);
  ExpectAt(page.Find("2"), left + 480 - 100 - 100, top + 2 * kPitch + text);
  ExpectAt(page.Find("Archer, Jo"), left + 480 + 120, top + kPitch + text);
  ExpectAt(page.Find("B Grade"), left + 1720 + 120, top + 2 * kPitch + text);
  EXPECT_FALSE(Shown("picPrint"));
  EXPECT_TRUE(Shown("fraKO"));
}

TEST_F(KnockOutPrinting, HeadingAndHeadsAreBoldAndTheRestAsTheFontIs) {
  OpenPanel(2);
  const PrintedPage page = Print().at(0);
  for (const PrintedText& text : page.texts) {
    const bool is_above = text.text.starts_with("KNOCK") || text.text.starts_with("All") ||
                          text.text == "#" || text.text == "Player" || text.text == "Grade";
    EXPECT_EQ(text.bold, is_above) << text.text;
    EXPECT_EQ(text.size, 10);
    EXPECT_EQ(text.font, "MS Sans Serif");
  }
}

TEST_F(KnockOutPrinting, ASingleGradeHasNoGradeColumn) {
  OpenFive();
  TakeGrade("B Grade");
  DoAll({"click cmdALL", "click cmdPrnt"});
  const PrintedPage page = Print().at(0);
  EXPECT_EQ(page.Words(), (TextList{"KNOCK-OUT Competition : Wednesday 31 March 2004", "B Grade",
                                    "#", "Player", "1", "Dean, Di", "2", "Ely, Bo"}));
  ASSERT_EQ(page.boxes.size(), 3U);
  EXPECT_NEAR(page.boxes[0].x2 - page.boxes[0].x1, 480 + 800 + 240, 0.01);
  EXPECT_EQ(page.lines.size(), 3U);
}

TEST_F(KnockOutPrinting, SevenPrintEightRowsWithTheByeInTheLast) {
  OpenPanel(7);
  const PrintedPage page = Print().at(0);
  ASSERT_EQ(page.boxes.size(), 9U);
  const TextList words = page.Words();
  EXPECT_EQ((TextList{words.end() - 5, words.end()}),
            (TextList{"7", "P7, X", "A Grade", "8", "--- bye ---"}));
  EXPECT_EQ(Players().size(), 7U);
}

TEST_F(KnockOutPrinting, TheByeTakesNoPartInTheMeasuring) {
  // # 480, players 8 letters and 240, grades 7 letters and 240, as without a bye.
  Lay(FivePlayers());
  OpenSelection();
  Select({"Dean, Di : B Grade"});
  DoAll({"answer yes", "click cmdPrnt"});
  const PrintedPage page = Print().at(0);
  EXPECT_NEAR(page.boxes[0].x2 - page.boxes[0].x1, 480 + 1040 + 940, 0.01);
}

TEST_F(KnockOutPrinting, EveryCopyHasTheBye) {
  OpenPanel(3);
  Do("type txtNoC 3");
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 3U);
  for (const PrintedPage& page : pages) EXPECT_EQ(page.Words().back(), "--- bye ---");
}

TEST_F(KnockOutPrinting, TheByeIsGoneOnceItIsPrinted) {
  OpenPanel(3);
  Print();
  DoAll({"dblcell grdKO 3 1", "click cmdPrnt"});
  EXPECT_EQ(Print().at(0).boxes.size(), 3U);
}

TEST_F(KnockOutPrinting, CopiesAreRoundedHalfToEven) {
  SelectMany(2);
  for (const auto& [typed, copies] : std::vector<std::pair<std::string, std::size_t>>{
           {"2", 2}, {"1.5", 2}, {"2.5", 2}, {"3 please", 3}}) {
    DoAll({"click cmdPrnt", "type txtNoC " + typed});
    EXPECT_EQ(Print().size(), copies) << typed;
  }
}

TEST_F(KnockOutPrinting, LessThanOneCopyIsRefusedWithABeep) {
  OpenPanel(2);
  for (const char* copies : {"", "0", "abc", "-1", "0.9", "&", "."}) {
    Do(std::string("type txtNoC ") + copies);
    Do("click cmdKOprint");
    EXPECT_EQ(BoxTexts(), (TextList{"You must show NUMBER of COPIES to print!    "})) << copies;
    EXPECT_EQ(Count("beep"), 1);
    EXPECT_EQ(Count("printed") + Count("killed"), 0);
    EXPECT_TRUE(Shown("picPrint"));
  }
}

TEST_F(KnockOutPrinting, MoreCopiesThanSixteenBitsOverflow) {
  OpenPanel(2);
  DoAll({"type txtNoC 32768", "click cmdKOprint"});
  EXPECT_EQ(BoxTexts(), (TextList{"OVERFLOW    "}));
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_TRUE(Shown("picPrint"));
}

// Letters of 200: 4 of them and a fifth, 6 and 7 of them with 480 each, in all 960 + 1200 + 480 +
// 1400 + 480.
TEST_F(KnockOutPrinting, AFontThatIsTooLargeIsToldInThisScreensWords) {
  WriteFile("FontName.qz3", "20,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  OpenPanel(2);
  Do("printer width 4819");
  Do("click cmdKOprint");
  EXPECT_EQ(BoxTexts(), (TextList{"Font is too large, please re-select."}));
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_TRUE(Shown("picPrint")) << "to select another one";
  Do("printer width 4820");
  EXPECT_EQ(Print().size(), 1U);
}

// 54 rows end at 1000 + 55 * 276 = 16180, a 55th would at 16456, beyond 16438.
TEST_F(KnockOutPrinting, ASecondPageIsAskedForAndRepeatsTheHeads) {
  OpenPanel(64);
  DoAll({"answer yes", "click cmdKOprint"});
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text,
            "Only 54 players of 64 will fit on one page.\rDo you wish to use another page ?\r\r"
            "By selecting NO, printing will be cancelled,\r"
            "allowing you to select a smaller font.");
  EXPECT_EQ(Boxes()[0].style, 68);
  EXPECT_EQ(Count("beep"), 1);
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 2U);
  EXPECT_EQ(pages[0].boxes.size(), 55U);
  EXPECT_LE(pages[0].boxes.back().y2, kFoot);
  EXPECT_GT(pages[0].boxes.back().y2 + kPitch, kFoot);
  const TextList words = pages[1].Words();
  EXPECT_EQ((TextList{words.begin(), words.begin() + 5}),
            (TextList{"#", "Player", "Grade", "55", "P55, X"}));
  EXPECT_EQ(pages[1].boxes.size(), 11U);
  EXPECT_EQ(pages[1].boxes[0].y1, 400);
  EXPECT_FALSE(Shown("picPrint"));
}

TEST_F(KnockOutPrinting, TheQuestionComesOnceForAllCopies) {
  OpenPanel(64);
  DoAll({"printer height 6000", "type txtNoC 2", "answer yes", "click cmdKOprint"});
  EXPECT_EQ(Boxes().size(), 1U);
  const auto pages = PagesOf(EventsNamed("printed"));
  std::size_t rows = 0;
  for (const PrintedPage& page : pages) rows += page.boxes.size() - 1;
  EXPECT_EQ(rows, 128U);
  EXPECT_GT(pages.size(), 6U);
}

TEST_F(KnockOutPrinting, NoToTheSecondPageEndsThePrinting) {
  OpenPanel(63);
  DoAll({"answer no", "click cmdKOprint"});
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
  EXPECT_TRUE(Shown("picPrint")) << "to select a smaller font";
  DoAll({"font 8 0 0 MS Sans Serif", "click lblFont"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].Words().back(), "--- bye ---") << "which is not forgotten";
}

// A blank at the measuring and one for the copy, two lines of heading, three rows each with a box,
// two rules and three texts, a new page, the end.
TEST_F(KnockOutPrinting, APrinterThatFailsAtAnyOperationIsTold) {
  OpenPanel(2);
  for (int operation = 1; operation <= 24; ++operation) {
    SCOPED_TRACE(operation);
    Do("printer fail " + std::to_string(operation));
    Do("click cmdKOprint");
    EXPECT_EQ(BoxTexts(), (TextList{"PRINTER OFF OR OUT OF PAPER    "}));
    EXPECT_EQ(Count("killed"), 1);
    EXPECT_EQ(Count("printed"), 0);
    EXPECT_EQ(InSession("ErrorNumber"), 27);
    EXPECT_TRUE(Shown("picPrint"));
  }
  Do("printer fail 25");
  EXPECT_EQ(Print().size(), 1U) << "that many there are not";
}

TEST_F(KnockOutPrinting, TheSetUpDialogAndHelpAreThere) {
  OpenPanel(2);
  DoAll({"setup landscape", "click cmdPrinterSetup"});
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
  Do("click cmdWeekHelp");
  EXPECT_EQ(EventsNamed("help").at(0)["topic"], 246);
}

TEST_F(KnockOutPrinting, AFontBeyondTwentyFourPointsIsWarnedOfWithABeep) {
  OpenPanel(2);
  DoAll({"font 25 0 0 Courier New", "click lblFont"});
  EXPECT_EQ(BoxTexts().size(), 1U);
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 10pts.");
}

}  // namespace
}  // namespace marlowbeck
