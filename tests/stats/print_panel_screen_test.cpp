// The print panel and the printing of the two tables.

#include "stats/reports.h"
#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr const char* kNothing = "There are no print items selected - Nothing to print !    ";
constexpr const char* kCentimetres = "You must show CENTIMETRES from Top of Page!    ";
constexpr const char* kCopies = "You must show NUMBER of COPIES to print!    ";

class PrintPanelScreen : public ReportsTest {
 protected:
  void OpenPanel(Here here = Here::current()) {
    LayRovers();
    WriteFile("Association.qz3", "\"Marlow Darts\"\r\n");
    OpenWeekly(here);
    Do("click cmdPrintLad", here);
  }
  void ExpectOpen(bool open, Here here = Here::current()) {
    EXPECT_EQ(Shown("picPrint", here), open);
    EXPECT_EQ(Enabled("fraWeek", here), !open);
    EXPECT_EQ(Enabled("grdWeek", here), !open);
    EXPECT_EQ(Enabled("grdProg", here), !open);
  }
  /// Clicks Print and expects a warning, the panel staying open.
  void ExpectRefusal(const std::string& message, Here here = Here::current()) {
    Do("click cmdBothOK", here);
    EXPECT_EQ(BoxTexts(), std::vector<std::string>{message});
    EXPECT_EQ(Count("printed") + Count("killed"), 0);
    ExpectOpen(true, here);
  }
  /// Prints what an option names and answers the one page.
  PrintedPage Print(int option, Here here = Here::current()) {
    DoAll({"click optBoth(" + std::to_string(option) + ")", "click cmdBothOK"}, here);
    const auto pages = PagesOf(EventsNamed("printed"), here);
    EXPECT_EQ(pages.size(), 1U);
    return pages.empty() ? PrintedPage() : pages.front();
  }
};

TEST_F(PrintPanelScreen, OpensWithThePrinterOneCopyAndTheFirstDistance) {
  LayRovers();
  OpenWeekly();
  ExpectOpen(false);
  Do("click cmdPrintLad");
  EXPECT_EQ(Count("beep"), 1);
  ExpectOpen(true);
  EXPECT_EQ(Caption("picPrint"), "Print Options");
  EXPECT_EQ(Caption("lblPrinterName"), "Test printer");
  EXPECT_EQ(Caption("lblOrient"), "Portrait");
  EXPECT_EQ(Text("txtNoC"), "1");
  EXPECT_EQ(Text("cboFromTop"), "1");
  EXPECT_EQ(Get("cboFromTop")["locked"], false);
  const TextList lines = Lines("cboFromTop");
  ASSERT_EQ(lines.size(), 60U);
  EXPECT_EQ((TextList{lines.begin(), lines.begin() + 3}), (TextList{"1", "1.5", "2"}));
  EXPECT_EQ(lines.back(), "30.5");
  EXPECT_EQ(Caption("optBoth(0)"), "Weekly details ONLY");
  EXPECT_EQ(Caption("optBoth(1)"), "Progressive details ONLY");
  EXPECT_EQ(Caption("optBoth(2)"), "Weekly and Progressive details");
  for (int i = 0; i < 3; ++i) EXPECT_FALSE(Ticked("optBoth(" + std::to_string(i) + ")"));
}

TEST_F(PrintPanelScreen, TellsOfALandscapePrinter) {
  LayRovers();
  DoAll({"printer orientation landscape", "printer name Old Laser 5"});
  OpenWeekly();
  Do("click cmdPrintLad");
  EXPECT_EQ(Caption("lblPrinterName"), "Old Laser 5");
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
}

TEST_F(PrintPanelScreen, CancelPutsEverythingBack) {
  OpenPanel();
  Do("click cmdBothCancel");
  ExpectOpen(false);
  EXPECT_EQ(Count("printed") + Count("killed"), 0);
}

TEST_F(PrintPanelScreen, EscIsCancelAndTheReportStays) {
  OpenPanel();
  Do("key Esc");
  ExpectOpen(false);
  EXPECT_TRUE(Shown("fraWeek"));
}

TEST_F(PrintPanelScreen, ItsChoicesDoNotOutliveIt) {
  OpenPanel();
  DoAll({"type cboFromTop 12", "type txtNoC 7", "click cmdBothCancel", "click cmdPrintLad"});
  EXPECT_EQ(Text("cboFromTop"), "1");
  EXPECT_EQ(Text("txtNoC"), "1");
}

TEST_F(PrintPanelScreen, HelpIsThePageOnPrinting) {
  OpenPanel();
  Do("click cmdWeekHelp");
  EXPECT_EQ(EventsNamed("help"),
            std::vector<Json>{Json::parse(R"({"file": "qz1.HLP", "topic": 246})")});
}

TEST_F(PrintPanelScreen, NothingSelectedComesBeforeAllOtherChecks) {
  OpenPanel();
  DoAll({"type cboFromTop 0", "type txtNoC 0"});
  ExpectRefusal(kNothing);
  EXPECT_EQ(Boxes().at(0).style, 48);
}

TEST_F(PrintPanelScreen, DistancesBelowOneAreRefusedBeforeTheCopiesAreLookedAt) {
  OpenPanel();
  DoAll({"click optBoth(0)", "type txtNoC 0"});
  for (const char* text : {"", "0.9", "-2", "abc"}) {
    Do(std::string("type cboFromTop ") + text);
    ExpectRefusal(kCentimetres);
  }
}

TEST_F(PrintPanelScreen, CopiesThatReadBelowOneAreRefused) {
  OpenPanel();
  Do("click optBoth(0)");
  for (const char* text : {"", "0", "abc", "0.9", "-1"}) {
    Do(std::string("type txtNoC ") + text);
    ExpectRefusal(kCopies);
  }
}

TEST_F(PrintPanelScreen, NumbersAreReadFromTheBeginningOfTheText) {
  OpenPanel();
  DoAll({"click optBoth(0)", "type txtNoC 2x", "type cboFromTop 1 cm", "click cmdBothOK"});
  EXPECT_EQ(PagesOf(EventsNamed("printed")).size(), 2U);
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(PrintPanelScreen, AnyDistanceMayBeTyped) {
  OpenPanel();
  DoAll({"type cboFromTop 2.7", "answer yes"});
  const PrintedPage page = Print(0);
  EXPECT_TRUE(BoxTexts().at(0).starts_with("Printing will start 2.7 centimetres from the top"));
  ExpectAt(page.Find("Marlow Darts"), 5953 - 600, 2.7 * 567);
}

TEST_F(PrintPanelScreen, PrintingClosesThePanelFirst) {
  OpenPanel();
  DoAll({"type cboFromTop 2", "answer cancel", "click optBoth(0)", "click cmdBothOK"});
  EXPECT_EQ(Count("killed"), 1);
  ExpectOpen(false);
}

TEST_F(PrintPanelScreen, SetUpTurnsThePaperAndShowsIt) {
  OpenPanel();
  DoAll({"setup landscape", "click cmdPrinterSetup"});
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
  EXPECT_TRUE(Shown("picPrint"));
  // Centred on 16838 now, and it stays so.
  ExpectAt(Print(0).Find("Marlow Darts"), 8419 - 600, 567);
  Do("click cmdPrintLad");
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
  DoAll({"setup portrait", "click cmdPrinterSetup"});
  EXPECT_EQ(Caption("lblOrient"), "Portrait");
}

TEST_F(PrintPanelScreen, ACancelledSetUpLeavesThePrinterAsItWas) {
  OpenPanel();
  DoAll({"printer orientation landscape", "setup-cancel", "click cmdPrinterSetup"});
  EXPECT_EQ(Caption("lblOrient"), "Landscape");
  EXPECT_EQ(Caption("lblPrinterName"), "Test printer");
}

TEST_F(PrintPanelScreen, WeeklyTableIsTheGridWithShortHeads) {
  OpenPanel();
  const PrintedPage page = Print(0);
  // The game names are those that every installation begins with; the forfeit has no average.
  EXPECT_EQ(page.Words(),
            (TextList{"Marlow Darts", "Winter 2004", "Rovers  A  (v's  Swifts)  24/03/2004",
                      "Player",       "Agg",         "Sh",
                      "180",          "100",         "H/Sc",
                      "Triples",      "Doubles",     "Singles",
                      "Avg",          "Archer, Jo",  "505",
                      "20",           "25.25",       "Baker, Al *",
                      "Forfeit",      "Win"}));
  // 11 letters of a name, W5, W4 three times, W5, W8 three times, W7.
  const double width = 1320 + 600 + 3 * 480 + 600 + 3 * 960 + 840;
  ASSERT_EQ(page.boxes.size(), 3U);
  EXPECT_NEAR(page.boxes[0].x1, 5953 - width / 2, 0.01);
  EXPECT_NEAR(page.boxes[0].x2, 5953 + width / 2, 0.01);
  const std::vector<double> edges = {1320, 1920, 2400, 2880, 3360, 3960, 4920, 5880, 6840};
  for (std::size_t i = 0; i < edges.size(); ++i) {
    EXPECT_NEAR(page.lines.at(i).x1, 5953 - width / 2 + edges[i], 0.01) << i;
  }
}

TEST_F(PrintPanelScreen, ProgressiveTableIsTheGridWithShortHeads) {
  OpenPanel();
  const PrintedPage page = Print(1);
  EXPECT_EQ(page.Words(), (TextList{"Marlow Darts",
                                    "Winter 2004",
                                    "PROGRESSIVE details for: Rovers  A up to 24/03/2004",
                                    "Player",
                                    "Agg",
                                    "Sh",
                                    "180",
                                    "100",
                                    "H/Sc",
                                    "Pegs",
                                    "Hi/Pg",
                                    "Gms",
                                    "Avg",
                                    "Baker, Al",
                                    "300",
                                    "10",
                                    "2",
                                    "30.00",
                                    "Archer, Jo",
                                    "1005",
                                    "40",
                                    "2",
                                    "25.12"}));
  const double width = 1200 + 600 + 5 * 480 + 600 + 480 + 840;
  ASSERT_EQ(page.boxes.size(), 3U);
  EXPECT_NEAR(page.boxes[0].x1, 5953 - width / 2, 0.01);
  const std::vector<double> edges = {1200, 1800, 2280, 2760, 3240, 3720, 4200, 4800, 5280};
  for (std::size_t i = 0; i < edges.size(); ++i) {
    EXPECT_NEAR(page.lines.at(i).x1, 5953 - width / 2 + edges[i], 0.01) << i;
  }
}

TEST_F(PrintPanelScreen, BothTablesStandOnOnePage) {
  OpenPanel();
  const PrintedPage page = Print(2);
  EXPECT_EQ(page.boxes.size(), 6U);
  // Two heading lines and a title of 360 each, three rows, half a line.
  ExpectAt(page.Find("PROGRESSIVE details for: Rovers up to 24/03/2004"), 5953 - 48 * 50,
           567 + 3 * 360 + 3 * 288 + 120);
}

TEST_F(PrintPanelScreen, ATeamOfThirtyOnALargeFontHasNoRoomOnAPage) {
  std::vector<PlayerRecord> players;
  std::vector<ResultRecord> results;
  for (int id = 1; id <= 30; ++id) {
    players.push_back(Person(id, "P" + std::to_string(id), "A", "Rovers", "A"));
    results.push_back(Night(id, "Rovers", "Hawks", kFirstNight, 500, 20));
  }
  Lay(players, results);
  WriteFile("FontName.qz3", "20,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  OpenWeekly();
  DoAll({"printer width 20000", "click cmdPrintLad", "click optBoth(0)", "click cmdBothOK"});
  ASSERT_EQ(BoxTexts().size(), 1U);
  EXPECT_TRUE(BoxTexts().at(0).starts_with("Your selections will not fit on one page.   \r"));
  EXPECT_EQ(Count("printed"), 0);
  EXPECT_EQ(Count("killed"), 1);
}

TEST_F(PrintPanelScreen, AfterAFailedPrinterTheScreenGoesOn) {
  OpenPanel();
  Do("printer fail 5");
  DoAll({"click optBoth(0)", "click cmdBothOK"});
  EXPECT_EQ(BoxTexts(),
            std::vector<std::string>{"An unrecognised error occurred while trying to print.    "});
  ExpectOpen(false);
  Do("click cmdPrintLad");
  EXPECT_EQ(Print(0).boxes.size(), 3U);
}

}  // namespace
}  // namespace marlowbeck
