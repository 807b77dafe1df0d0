// The print panel of the lists, and what comes out of the printer.

#include "stats/lists.h"
#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr const char* kAmount = "You must show AMOUNT to print!    ";
constexpr const char* kNoCopies = "You must show NUMBER of COPIES to print!    ";

class ListPrinting : public ListsTest {
 protected:
  /// The panel over the averages of the first night: Baker, Archer, Clark.
  void OpenPanel(Here here = Here::current()) {
    LayClub();
    OpenList("Image1", here);
    DoAll({"pick lstHiDates 0", "click cmdHiPrint"}, here);
  }
  void ExpectOpen(bool open, Here here = Here::current()) {
    EXPECT_EQ(Shown("picPrintHI", here), open);
    EXPECT_EQ(Enabled("fraPikHi", here), !open);
    EXPECT_EQ(Enabled("cmdProgress", here), !open);
    EXPECT_EQ(Get("cmdProgress", here)["enabled"], !open);
    EXPECT_EQ(Enabled("grdHI", here), !open);
  }
  void ExpectRefusal(const std::string& message, Here here = Here::current()) {
    Do("click cmdBothOKHI", here);
    EXPECT_EQ(BoxTexts(), std::vector<std::string>{message});
    ASSERT_EQ(Boxes().size(), 1U);
    EXPECT_EQ(Boxes()[0].style, 48);
    EXPECT_EQ(Count("printed") + Count("killed"), 0);
    ExpectOpen(true, here);
  }
  std::vector<PrintedPage> Print(Here here = Here::current()) {
    Do("click cmdBothOKHI", here);
    return PagesOf(EventsNamed("printed"), here);
  }
};

TEST_F(ListPrinting, OpensWithTheWholeListAndOneCopy) {
  LayClub();
  OpenList();
  DoAll({"pick lstHiDates 0", "click cmdHiPrint"});
  EXPECT_EQ(Count("beep"), 1);
  ExpectOpen(true);
  EXPECT_EQ(Caption("picPrintHI"), "Print Options");
  EXPECT_EQ(Caption("lblPrinterNameHI"), "Test printer");
  EXPECT_EQ(Caption("lblOrientHI"), "Portrait");
  EXPECT_EQ(Caption("optHI(0)"), "Print Entire List of Highest Averages");
  EXPECT_EQ(Caption("optHI(1)"), "Enter another amount to Print");
  EXPECT_TRUE(Ticked("optHI(0)"));
  EXPECT_EQ(Caption("lblHMPrint"), "Highest Averages");
  EXPECT_EQ(Text("txtHI"), "3");
  EXPECT_EQ(Text("txtNoCHI"), "1");
  EXPECT_EQ(Caption("cmdBothOKHI"), "Print");
  EXPECT_EQ(Caption("cmdBothCancelHI"), "Cancel");
  EXPECT_EQ(Caption("cmdPrinterSetupHI"), "Printer Setup");
}

TEST_F(ListPrinting, CancelAndEscPutEverythingBack) {
  OpenPanel();
  for (const char* way : {"click cmdBothCancelHI", "key Esc"}) {
    Do(way);
    ExpectOpen(false);
    EXPECT_EQ(Count("printed") + Count("killed"), 0) << way;
    EXPECT_TRUE(Shown("fraHi")) << way;
    Do("click cmdHiPrint");
  }
}

TEST_F(ListPrinting, ItsChoicesDoNotOutliveIt) {
  OpenPanel();
  DoAll({"click optHI(1)", "type txtHI 2", "type txtNoCHI 7", "click cmdBothCancelHI",
         "click cmdHiPrint"});
  EXPECT_TRUE(Ticked("optHI(0)"));
  EXPECT_EQ(Text("txtHI"), "3");
  EXPECT_EQ(Text("txtNoCHI"), "1");
}

TEST_F(ListPrinting, TheAmountOfTheWholeListCannotBeChanged) {
  OpenPanel();
  for (const char* amount : {"1", "", "99", "abc"}) {
    Do(std::string("type txtHI ") + amount);
    EXPECT_EQ(Text("txtHI"), "3") << amount;
  }
}

TEST_F(ListPrinting, AnotherAmountIsAtMostTheList) {
  OpenPanel();
  Do("click optHI(1)");
  EXPECT_EQ(Text("txtHI"), "");
  EXPECT_EQ(Focus(), "frmPMenu.txtHI");
  Do("type txtHI 2");
  EXPECT_EQ(Text("txtHI"), "2");
  for (const char* amount : {"4", "3.5", "1e9", "32768"}) {
    Do(std::string("type txtHI ") + amount);
    EXPECT_EQ(Text("txtHI"), "3") << amount;
  }
  Do("click optHI(0)");
  EXPECT_EQ(Text("txtHI"), "3");
}

TEST_F(ListPrinting, AmountsThatReadBelowOneAreRefusedBeforeTheCopiesAreLookedAt) {
  OpenPanel();
  DoAll({"click optHI(1)", "type txtNoCHI 0"});
  for (const char* amount : {"", "0", "many", "-2", "0.9", "&H3"}) {
    Do(std::string("type txtHI ") + amount);
    ExpectRefusal(kAmount);
  }
}

TEST_F(ListPrinting, CopiesThatReadBelowOneAreRefused) {
  OpenPanel();
  for (const char* copies : {"", "0", "abc", "0.9", "-1"}) {
    Do(std::string("type txtNoCHI ") + copies);
    ExpectRefusal(kNoCopies);
  }
}

TEST_F(ListPrinting, MoreCopiesThanAnybodyWantsAreAFailureThatIsTold) {
  OpenPanel();
  DoAll({"type txtNoCHI 99999", "click cmdBothOKHI"});
  EXPECT_EQ(BoxTexts(), (TextList{"An unrecognised error occurred while trying to print.    "}));
  EXPECT_EQ(Count("killed"), 1);
  ExpectOpen(false);
}

TEST_F(ListPrinting, AmountsAreWholeNumbersHalvesToTheEvenOne) {
  OpenPanel();
  DoAll({"click optHI(1)", "type txtHI 2.5"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].boxes.size(), 3U);
}

// With the test's printer a letter of the 10 point font is 100 twips wide and a line 240 high.
TEST_F(ListPrinting, PrintsHeadingLinesAndRowsInMeasuredColumns) {
  OpenPanel();
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  const PrintedPage& page = pages[0];
  EXPECT_EQ(page.Words(), (TextList{"Marlow Darts",
                                    "Winter 2004",
                                    "Highest Averages",
                                    "A    played on:  17/03/2004",
                                    "No.",
                                    "Player",
                                    "Team",
                                    "Avg",
                                    "1",
                                    "Baker, Al",
                                    "Rovers",
                                    "30.00",
                                    "2",
                                    "Archer, Jo",
                                    "Rovers",
                                    "25.00",
                                    "3",
                                    "Clark, Ed",
                                    "Hawks",
                                    "25.00"}));
  // Lines one and a half line heights apart from 400 on; the middle is 5953.
  ExpectAt(page.Find("Marlow Darts"), 5953 - 600, 400);
  ExpectAt(page.Find("Winter 2004"), 5953 - 550, 760);
  ExpectAt(page.Find("Highest Averages"), 5953 - 800, 1120);
  ExpectAt(page.Find("A    played on:  17/03/2004"), 5953 - 1350, 1480);
  EXPECT_FALSE(page.Find("Winter 2004").bold);
  EXPECT_TRUE(page.Find("Highest Averages").bold);
  EXPECT_FALSE(page.Find("A    played on:  17/03/2004").bold);
  EXPECT_TRUE(page.Find("Player").bold);
  EXPECT_FALSE(page.Find("Baker, Al").bold);
  // Number 480, names 1000 + 240, teams 600 + 240, values 500 + 240: 3300 in all.
  const double left = 5953 - 1650;
  ASSERT_EQ(page.boxes.size(), 4U);
  ExpectStroke(page.boxes[0], {left, 1840, left + 3300, 2128});
  ExpectStroke(page.boxes[3], {left, 2704, left + 3300, 2992});
  ASSERT_EQ(page.lines.size(), 12U);
  ExpectStroke(page.lines[3], {left + 480, 2128, left + 480, 2416});
  ExpectStroke(page.lines[4], {left + 1720, 2128, left + 1720, 2416});
  ExpectStroke(page.lines[5], {left + 2560, 2128, left + 2560, 2416});
  ExpectAt(page.Find("1"), left + (480 - 100) / 2.0, 2128 + 24);
  ExpectAt(page.Find("Baker, Al"), left + 480 + 100, 2128 + 24);
  ExpectAt(page.Find("30.00"), left + 2560 + (740 - 500) / 2.0, 2128 + 24);
  ExpectOpen(false);
}

TEST_F(ListPrinting, OnlyTheRowsThatArePrintedAreMeasured) {
  OpenPanel();
  DoAll({"click optHI(1)", "type txtHI 1"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  ASSERT_EQ(pages[0].boxes.size(), 2U);
  // "Baker, Al" alone: 480 + 1140 + 840 + 740.
  EXPECT_NEAR(pages[0].boxes[0].x2 - pages[0].boxes[0].x1, 3200, 0.01);
}

TEST_F(ListPrinting, HeadingsAreNotMeasuredAndStandWhole) {
  LayClub();
  OpenList("Image9");
  DoAll({"pick lstHiDates 0", "click cmdHiPrint"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  // The value "1": 100 + 240, less than the 500 of its heading. 480 + 1240 + 840 + 340 in all.
  EXPECT_NEAR(pages[0].boxes[0].x2 - pages[0].boxes[0].x1, 2900, 0.01);
  ExpectAt(pages[0].Find("180's"), 5953 - 1450 + 2560 + (340 - 500) / 2.0, 1840 + 24);
}

TEST_F(ListPrinting, AProgressiveListHasItsGames) {
  LayClub();
  OpenList();
  DoAll({"click cmdProgress", "click cmdHiPrint"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].Find("Gms").text, "Gms");
  EXPECT_EQ(pages[0].Words()[2], "PROGRESSIVE Highest Averages");
  EXPECT_NEAR(pages[0].boxes[0].x2 - pages[0].boxes[0].x1, 3300 + 480, 0.01);
  EXPECT_EQ(pages[0].lines.size(), 16U);
}

TEST_F(ListPrinting, HandicapsStandInAColumnAsWideAsTheAverages) {
  LayClub();
  OpenList();
  DoAll({"click cmdProgress", "input 30", "click cmdHcap", "click cmdHiPrint"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].Words()[2], "PROGRESSIVE Highest Averages (With Handicaps)");
  EXPECT_NEAR(pages[0].boxes[0].x2 - pages[0].boxes[0].x1, 3300 + 480 + 740, 0.01);
  const double last = pages[0].boxes[0].x2 - 740;
  ExpectStroke(pages[0].lines[4], {last, 1840, last, 2128});
  ExpectAt(pages[0].Find("46"), last + (740 - 200) / 2.0, 2416 + 24);
}

TEST_F(ListPrinting, AllGradesTogetherHaveTheGradeInTheMeasuredColumn) {
  LayClub();
  OpenList();
  DoAll({"click cmdCombine", "click cmdHiPrint"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  const TextList words = pages[0].Words();
  EXPECT_EQ((TextList{words.begin(), words.begin() + 10}),
            (TextList{"Marlow Darts", "Winter 2004", "Averages for All Grades up to", "24/03/2004",
                      "No.", "Player", "Team", "Grade", "Gms", "Avg"}));
  // Grades of one letter: 100 + 240, and the averages take the same.
  EXPECT_NEAR(pages[0].boxes[0].x2 - pages[0].boxes[0].x1, 2 * 480 + 1240 + 840 + 2 * 340, 0.01);
}

TEST_F(ListPrinting, AListThatHasGoneBehindThePanelPrintsNothing) {
  LayClub();
  WriteResults("Winter_A.qzr", {Night(1, "Rovers", "Hawks", kFirstNight, 500, 20),
                                ForfeitNight(1, "Rovers", "Hawks", kSecondNight)});
  OpenList();
  DoAll({"pick lstHiDates 0", "click cmdCombine", "click cmdHiPrint", "click cmdReDoAvgs"});
  EXPECT_FALSE(Shown("fraHi"));
  Do("click cmdBothOKHI");
  EXPECT_EQ(Count("printed") + Count("killed"), 0);
  ExpectOpen(false);
}

TEST_F(ListPrinting, TheSeasonsTitleIsReadAgain) {
  OpenPanel();
  WriteFile("Winter_A.qzs", "\"Autumn 2004\"\r\n");
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].Words()[1], "Autumn 2004");
}

TEST_F(ListPrinting, AListThatIsTooWideIsRefusedBeforeItsSeasonIsAskedFor) {
  OpenPanel();
  DeleteFile("Winter_A.qzs");
  DoAll({"printer width 3599", "click cmdBothOKHI"});
  EXPECT_EQ(Count("input"), 0);
  EXPECT_EQ(BoxTexts(), (TextList{"Font is too large, please re-select.    "}));
  EXPECT_EQ(Count("killed"), 1);
}

TEST_F(ListPrinting, EachCopyIsAPageOfItsOwn) {
  OpenPanel();
  Do("type txtNoCHI 2");
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 2U);
  EXPECT_EQ(pages[0].Words(), pages[1].Words());
  EXPECT_TRUE(Boxes().empty());
}

// A copy is the printer's starting blank, four lines of heading and four rows, each of a box, three
// rules and four cells; before the first copy the printer is prepared once more.
TEST_F(ListPrinting, ThePageIsTurnedBetweenCopiesAndNotAfterTheLast) {
  constexpr int kCopy = 1 + 4 + 4 * (1 + 3 + 4);
  OpenPanel();
  for (const int copies : {1, 2}) {
    const int end = 1 + copies * kCopy + (copies - 1) + 1;
    for (const int fails : {end, end + 1}) {
      DoAll({"type txtNoCHI " + std::to_string(copies), "printer fail " + std::to_string(fails),
             "click cmdBothOKHI"});
      EXPECT_EQ(Count("killed"), fails == end ? 1 : 0) << copies << " copies, operation " << fails;
      EXPECT_EQ(Count("printed"), fails == end ? 0 : 1) << copies << " copies, operation " << fails;
      Do("click cmdHiPrint");
    }
  }
}

TEST_F(ListPrinting, ATableThatTakesTheWholeWidthStillFitsAndOneTwipMoreDoesNot) {
  OpenPanel();
  Do("printer width 3600");
  EXPECT_EQ(Print().size(), 1U);
  DoAll({"click cmdHiPrint", "printer width 3599", "click cmdBothOKHI"});
  EXPECT_EQ(BoxTexts(), (TextList{"Font is too large, please re-select.    "}));
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
  ExpectOpen(false);
}

TEST_F(ListPrinting, ARowThatEndsAtTheFootFitsAndOneTwipMoreAsksForAnotherPage) {
  OpenPanel();
  // Row 2 ends at 2704, which is 688 above the foot of a page of 3392.
  Do("printer height 3392");
  EXPECT_EQ(Print().size(), 1U);
  EXPECT_TRUE(Boxes().empty());
  DoAll({"click cmdHiPrint", "printer height 3391", "answer yes"});
  const auto pages = Print();
  EXPECT_EQ(pages.size(), 2U);
  ASSERT_EQ(BoxTexts().size(), 1U);
  EXPECT_TRUE(BoxTexts()[0].starts_with("Only 2 players of 3 will fit on one page.   \r"));
}

TEST_F(ListPrinting, SetUpTurnsThePaperAndShowsIt) {
  OpenPanel();
  DoAll({"setup landscape", "click cmdPrinterSetupHI"});
  EXPECT_EQ(Caption("lblOrientHI"), "Landscape");
  EXPECT_TRUE(Shown("picPrintHI"));
  EXPECT_FALSE(Shown("picPrint"));
}

TEST_F(ListPrinting, APrinterThatFailsIsToldAndTheScreenGoesOn) {
  OpenPanel();
  DoAll({"printer fail 7", "click cmdBothOKHI"});
  EXPECT_EQ(BoxTexts(), (TextList{"An unrecognised error occurred while trying to print.    "}));
  EXPECT_EQ(Count("killed"), 1);
  ExpectOpen(false);
  Do("click cmdHiPrint");
  EXPECT_EQ(Print().size(), 1U);
}

/// 16838 high less 400 and a row of 288 leaves room down to 16150: for 49 rows on the first page,
/// whose heading row ends at 2128, and for 54 on each further one, whose heading row ends at 688.
class LongListPrinting : public ListPrinting {
 protected:
  void OpenLong(int rows) {
    LayClub();
    std::vector<PlayerRecord> players;
    std::vector<ResultRecord> results;
    for (int id = 1; id <= rows; ++id) {
      players.push_back(Person(id, "P" + std::to_string(1000 + id), "A", "Rovers", "A"));
      results.push_back(
          Night(id, "Rovers", "Hawks", kFirstNight, static_cast<std::int16_t>(3000 - id), 10));
    }
    WritePlayers("Winter.qza", players);
    WriteResults("Winter_A.qzr", results);
    OpenList();
    Do("click cmdHiPrint");
  }
};

TEST_F(LongListPrinting, AnotherPageIsAskedForOnceAndEachHasTheHeadingRow) {
  OpenLong(120);
  Do("answer yes");
  const auto pages = Print();
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(
      Boxes()[0].text,
      "Only 49 players of 120 will fit on one page.   \rDo you wish to use another page ?    \r"
      "\rBy selecting NO, printing will be cancelled,    \r"
      "allowing you to select a smaller font.    ");
  ASSERT_EQ(pages.size(), 3U);
  EXPECT_EQ(pages[0].boxes.size(), 50U);
  EXPECT_EQ(pages[1].boxes.size(), 55U);
  EXPECT_EQ(pages[2].boxes.size(), 18U);
  for (const std::size_t page : {1U, 2U}) {
    EXPECT_EQ(pages[page].Words()[0], "No.");
    EXPECT_TRUE(pages[page].texts[0].bold);
    ExpectStroke(pages[page].boxes[0], {pages[0].boxes[0].x1, 400, pages[0].boxes[0].x2, 688});
  }
  EXPECT_EQ(pages[1].Words()[4], "50");
  EXPECT_EQ(pages[2].Words()[4], "104");
}

TEST_F(LongListPrinting, NoCancelsThePrintingAndClosesThePanel) {
  OpenLong(60);
  DoAll({"answer no", "click cmdBothOKHI"});
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
  ExpectOpen(false);
}

TEST_F(LongListPrinting, EachCopyAsksAgain) {
  OpenLong(60);
  DoAll({"type txtNoCHI 2", "answer yes", "answer yes"});
  EXPECT_EQ(Print().size(), 4U);
  EXPECT_EQ(Boxes().size(), 2U);
  DoAll({"click cmdHiPrint", "type txtNoCHI 2", "answer yes", "answer no", "click cmdBothOKHI"});
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
}

TEST_F(LongListPrinting, AnAmountOfThreeOfFortyPrintsThreeRowsAndTheHeading) {
  OpenLong(40);
  DoAll({"click optHI(1)", "type txtHI 3"});
  const auto pages = Print();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_EQ(pages[0].boxes.size(), 4U);
  EXPECT_EQ(pages[0].Words().back(), "299.70");
}

TEST_F(LongListPrinting, ThirtyOnALargeFontAskForAnotherPage) {
  LayClub();
  WriteFile("FontName.qz3", "20,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  OpenLong(30);
  Do("answer no");
  Do("click cmdBothOKHI");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_TRUE(Boxes()[0].text.starts_with("Only "));
}

TEST_F(LongListPrinting, AListThatEndsWithThePageAsksNothing) {
  OpenLong(49);
  EXPECT_EQ(Print().size(), 1U);
  EXPECT_TRUE(Boxes().empty());
}

}  // namespace
}  // namespace marlowbeck
