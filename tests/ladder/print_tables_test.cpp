// The printouts of the ladder against arithmetic: with the metrics of the test's printer a letter
// of the 10 point font is 100 twips wide and a line 240 high, so that a row is 288.

#include "ladder/print_tables.h"

#include "drive/workbench.h"
#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr double kLine = 240;
constexpr double kSpaced = 300;  // from one heading line to the next
constexpr double kHalf = 120;
constexpr double kPitch = 288;
constexpr double kMiddle = 5953;  // of 11906
constexpr double kTitle = 567 + 3 * kSpaced;
constexpr double kTable = kTitle + kLine + kHalf;
constexpr double kInRow = 24;  // half of what a row has besides its text

constexpr const char* kTooWide = "Font is too large, please re-select.    ";
constexpr const char* kTooLong =
    "Your selections will not fit on one page.   \r"
    "Printing will now be cancelled.    \r"
    "<<WARNING>> This may take some time    \r"
    "depending on printer status.    \r"
    "\r"
    "Note: Choose a smaller font to fit more   \r"
    "onto a page.    ";
constexpr const char* kFailed = "An unrecognised error occurred while trying to print.    ";

/// Four teams of whom one has lost a point. The longest name has seven letters.
LadderTab FourTeams() {
  return {"A Grade",
          "A Grade    Wednesday, 17 March 2004 ",
          "A Grade PREMIERSHIP LADDER up to: Wednesday, 17 March 2004 ",
          {"Alpha", "Bravo", " Charlie ", "Delta"},
          {{"Alpha", "6", " def ", "Charlie", "5"}, {"Bravo", "0", " drew ", "Delta", "0"}},
          {{"Alpha", "3", "2", "1", "0", "16", "17", "94.12", "4", "0"},
           {"Delta", "3", "1", "1", "1", "17", "15", "113.33", "3", "0"},
           {"Bravo", "3", "2", "1", "0", "17", "16", "106.25", "3", "-1"},
           {"Charlie", "0", "0", "0", "0", "0", "0", "0.00", "0", "0"}}};
}

LadderTab WithoutAdjustments() {
  LadderTab tab = FourTeams();
  tab.ladder[2][9] = "0";
  return tab;
}

class LadderPaper : public WorkbenchTest {
 protected:
  LadderPaper() {
    WriteFile("S.qzs", "\"Winter 2004\"\r\n");
    OnDo([this](Workbench& bench) {
      Session& session = bench.context.session;
      session.SeasonFile = "S.qzs";
      session.AssociationName = association_;
      session.PrintFontBold = bold_;
      session.PrintFontSize = size_;
      PrintLadderTab(bench.context, options_, what_, tab_);
    });
  }

  PrintedPage OnePage(Here here = Here::current()) {
    Do("click cmdDo", here);
    const auto pages = PagesOf(EventsNamed("printed"), here);
    EXPECT_EQ(pages.size(), 1U);
    return pages.empty() ? PrintedPage() : pages.front();
  }
  void ExpectThrownAway(const std::string& message, Here here = Here::current()) {
    const testing::ScopedTrace trace(here.file_name(), static_cast<int>(here.line()), "from here");
    Do("click cmdDo", here);
    EXPECT_EQ(BoxTexts(), std::vector<std::string>{message});
    EXPECT_EQ(Count("killed"), 1);
    EXPECT_EQ(Count("printed"), 0);
  }

  LadderPrintout what_ = LadderPrintout::Ladder;
  LadderTab tab_ = FourTeams();
  PrintOptions options_;
  std::string association_ = "Marlow Darts";
  bool bold_ = false;
  int size_ = 10;
};

/// Expects one row: its box, its upright lines at these distances from the left edge, the last of
/// which is the right edge.
void ExpectRow(const PrintedPage& page, std::size_t row, double left, double top,
               const std::vector<double>& edges, Here here = Here::current()) {
  const testing::ScopedTrace trace(here.file_name(), static_cast<int>(here.line()), "from here");
  ASSERT_LT(row, page.boxes.size());
  ExpectStroke(page.boxes[row], {left, top, left + edges.back(), top + kPitch});
  const std::size_t uprights = edges.size() - 1;
  for (std::size_t i = 0; i < uprights; ++i) {
    const PrintedStroke& line = page.lines.at(row * uprights + i);
    ExpectStroke(line, {left + edges[i], top, left + edges[i], top + kPitch});
  }
}

TEST_F(LadderPaper, HeadingLinesStandAQuarterOfALineApart) {
  const PrintedPage page = OnePage();
  ExpectAt(page.Find("Marlow Darts"), kMiddle - 600, 567);
  ExpectAt(page.Find("Winter 2004"), kMiddle - 550, 567 + kSpaced);
  ExpectAt(page.Find("A Grade"), kMiddle - 350, 567 + 2 * kSpaced);
  const char* const title = "A Grade PREMIERSHIP LADDER up to: Wednesday, 17 March 2004 ";
  ExpectAt(page.Find(title), kMiddle - 59 * 50, kTitle);
}

TEST_F(LadderPaper, GradeAndTitleAloneAreBold) {
  for (const PrintedText& text : OnePage().texts) {
    EXPECT_EQ(text.bold, text.text.starts_with("A Grade")) << text.text;
  }
}

TEST_F(LadderPaper, TableOfABoldFontIsNotBold) {
  bold_ = true;
  const PrintedPage page = OnePage();
  EXPECT_TRUE(page.Find("Marlow Darts").bold);
  EXPECT_TRUE(page.Find("A Grade").bold);
  EXPECT_FALSE(page.Find("Pts").bold);
  EXPECT_FALSE(page.Find("Charlie").bold);
}

TEST_F(LadderPaper, EveryColumnEdgeOfTheLadderFollowsFromTheFont) {
  const PrintedPage page = OnePage();
  const std::vector<double> edges = {840, 1200, 1560, 1920, 2280, 2760, 3240, 4080, 4560, 4920};
  ASSERT_EQ(page.boxes.size(), 5U);
  ASSERT_EQ(page.lines.size(), 45U);
  for (std::size_t row = 0; row < 5; ++row) {
    ExpectRow(page, row, kMiddle - 2460, kTable + static_cast<double>(row) * kPitch, edges);
  }
}

TEST_F(LadderPaper, WithoutAdjustmentsTheirColumnGoesAndTheTableIsCentredAnew) {
  tab_ = WithoutAdjustments();
  const PrintedPage page = OnePage();
  const std::vector<double> edges = {840, 1200, 1560, 1920, 2280, 2760, 3240, 4080, 4560};
  ASSERT_EQ(page.boxes.size(), 5U);
  ASSERT_EQ(page.lines.size(), 40U);
  for (std::size_t row = 0; row < 5; ++row) {
    ExpectRow(page, row, kMiddle - 2280, kTable + static_cast<double>(row) * kPitch, edges);
  }
  const std::vector<std::string> words = page.Words();
  EXPECT_EQ(std::count(words.begin(), words.end(), "Adj"), 0);
}

TEST_F(LadderPaper, HeadsAreShortAndStandInTheMiddle) {
  const PrintedPage page = OnePage();
  const double left = kMiddle - 2460;
  const std::vector<std::pair<const char*, double>> heads = {
      {"Team", 420}, {"P", 1020}, {"W", 1380}, {"L", 1740},   {"D", 2100},
      {"F", 2520},   {"A", 3000}, {"%", 3660}, {"Pts", 4320}, {"Adj", 4740}};
  for (const auto& [head, centre] : heads) {
    const double half = static_cast<double>(std::string(head).size()) * 50;
    ExpectAt(page.Find(head), left + centre - half, kTable + kInRow);
  }
}

TEST_F(LadderPaper, TeamNamesStandTwentyTwipsInAndFiguresInTheMiddle) {
  const PrintedPage page = OnePage();
  const double left = kMiddle - 2460;
  const double y = kTable + kPitch + kInRow;
  ExpectAt(page.Find("Alpha"), left + 20, y);
  ExpectAt(page.Find("94.12"), left + 3660 - 250, y);
  ExpectAt(page.Find("4"), left + 4320 - 50, y);
  ExpectAt(page.Find("Charlie"), left + 20, y + 3 * kPitch);
}

TEST_F(LadderPaper, NoughtsOfTheLadderAreDashesAndNothingElseIs) {
  tab_.ladder[1][9] = "+2";
  const auto words = OnePage().Words();
  const std::vector<std::string> rows(words.begin() + 14, words.end());
  EXPECT_EQ(rows, (std::vector<std::string>{
                      "Alpha",   "3", "2", "1", "-", "16", "17", "94.12",  "4", "-",
                      "Delta",   "3", "1", "1", "1", "17", "15", "113.33", "3", "+2",
                      "Bravo",   "3", "2", "1", "-", "17", "16", "106.25", "3", "-1",
                      "Charlie", "-", "-", "-", "-", "-",  "-",  "0.00",   "-", "-"}));
}

TEST_F(LadderPaper, ResultsAreFiveColumnsWithoutAHeadingRow) {
  what_ = LadderPrintout::Results;
  const PrintedPage page = OnePage();
  const double left = kMiddle - 1800;
  ExpectAt(page.Find("A Grade    Wednesday, 17 March 2004 "), kMiddle - 36 * 50, kTitle);
  EXPECT_TRUE(page.Find("A Grade    Wednesday, 17 March 2004 ").bold);
  const std::vector<double> edges = {840, 1200, 2400, 3240, 3600};
  ASSERT_EQ(page.boxes.size(), 2U);
  ExpectRow(page, 0, left, kTable, edges);
  ExpectRow(page, 1, left, kTable + kPitch, edges);
  const double y = kTable + kInRow;
  ExpectAt(page.Find("Alpha"), left + 20, y);
  ExpectAt(page.Find("6"), left + 1020 - 50, y);
  ExpectAt(page.Find("defeated"), left + 1800 - 400, y);
  ExpectAt(page.Find("Charlie"), left + 2420, y);
  ExpectAt(page.Find("5"), left + 3420 - 50, y);
}

TEST_F(LadderPaper, NoughtsOfResultsStayAsTheyAre) {
  what_ = LadderPrintout::Results;
  const auto words = OnePage().Words();
  EXPECT_EQ(std::vector<std::string>(words.end() - 5, words.end()),
            (std::vector<std::string>{"Bravo", "0", "drew", "Delta", "0"}));
}

TEST_F(LadderPaper, BothStandBelowEachOther) {
  what_ = LadderPrintout::Both;
  const PrintedPage page = OnePage();
  ExpectAt(page.Find("A Grade    Wednesday, 17 March 2004 "), kMiddle - 36 * 50, kTitle);
  ASSERT_EQ(page.boxes.size(), 7U);
  EXPECT_NEAR(page.boxes[0].x1, kMiddle - 1800, 0.01);
  const double second = kTable + 2 * kPitch + kHalf;
  const PrintedText title =
      page.Find("A Grade PREMIERSHIP LADDER up to: Wednesday, 17 March 2004 ");
  ExpectAt(title, kMiddle - 59 * 50, second);
  EXPECT_TRUE(title.bold);
  EXPECT_FALSE(page.Find("Pts").bold);
  ExpectStroke(page.boxes[2], {kMiddle - 2460, second + kLine + kHalf, kMiddle + 2460,
                               second + kLine + kHalf + kPitch});
}

TEST_F(LadderPaper, BlankTeamOfAByeLeavesItsCellEmpty) {
  what_ = LadderPrintout::Results;
  tab_.results = {{"Alpha", "0", " drew ", "", "0"}};
  const PrintedPage page = OnePage();
  EXPECT_EQ(page.boxes.size(), 1U);
  EXPECT_EQ(page.lines.size(), 4U);
  EXPECT_EQ(page.texts.size(), 8U);
}

TEST_F(LadderPaper, AnEmptyAssociationNameTakesNoLine) {
  association_ = "";
  const PrintedPage page = OnePage();
  ExpectAt(page.Find("Winter 2004"), kMiddle - 550, 567);
  ExpectAt(page.Find("A Grade"), kMiddle - 350, 567 + kSpaced);
}

TEST_F(LadderPaper, ShortHeadingBeginsWithTheGrade) {
  options_.centimetres = 2.5;
  Do("answer no");
  const PrintedPage page = OnePage();
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_TRUE(Boxes().at(0).text.starts_with(
      "Printing will start 2.5 centimetres from the top of the page.    \r\r"));
  EXPECT_EQ(page.Words().front(), "A Grade");
  ExpectAt(page.Find("A Grade"), kMiddle - 350, 1417.5);
  EXPECT_NEAR(page.boxes.at(0).y1, 1417.5 + kSpaced + kLine + kHalf, 0.01);
}

TEST_F(LadderPaper, CancelThrowsTheDocumentAway) {
  options_.centimetres = 2.5;
  DoAll({"answer cancel", "click cmdDo"});
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
}

TEST_F(LadderPaper, TableMayLeaveThreeHundredTwipsOfTheWidth) {
  Do("printer width 5220");
  EXPECT_EQ(OnePage().boxes.size(), 5U);
  Do("printer width 5219");
  ExpectThrownAway(kTooWide);
  tab_ = WithoutAdjustments();
  EXPECT_EQ(OnePage().boxes.size(), 5U);
}

TEST_F(LadderPaper, ResultsAloneAreNotMeasuredByTheLadder) {
  Do("printer width 3900");
  what_ = LadderPrintout::Results;
  EXPECT_EQ(OnePage().boxes.size(), 2U);
  what_ = LadderPrintout::Both;
  ExpectThrownAway(kTooWide);
}

TEST_F(LadderPaper, LastRowMustEndAboveTheFoot) {
  const int bottom = static_cast<int>(kTable + 5 * kPitch);
  const auto height = [](int twips) { return "printer height " + std::to_string(twips); };
  Do(height(bottom + 400 + 288 + 1));
  EXPECT_EQ(OnePage().boxes.size(), 5U);
  Do(height(bottom + 400 + 288));
  ExpectThrownAway(kTooLong);
}

TEST_F(LadderPaper, ALongTableIsRefusedOnceItIsComposed) {
  tab_.ladder.assign(60, tab_.ladder[0]);
  ExpectThrownAway(kTooLong);
  EXPECT_TRUE(Events().at(0).contains("killed"));
  // An operation in the last row fails: so the last row is reached.
  Do("printer fail " + std::to_string(2 + 4 + 61 * (1 + 8 + 9)));
  ExpectThrownAway(kFailed);
}

TEST_F(LadderPaper, CopiesAreSeparatePagesOfOneDocument) {
  options_.copies = 2;
  Do("click cmdDo");
  const auto pages = PagesOf(EventsNamed("printed"));
  ASSERT_EQ(pages.size(), 2U);
  EXPECT_EQ(pages[0].Words(), pages[1].Words());
  ExpectAt(pages[1].Find("Marlow Darts"), kMiddle - 600, 567);
}

TEST_F(LadderPaper, PrinterThatFailsAtAnyOperationIsTold) {
  options_.copies = 2;
  for (const auto what : {LadderPrintout::Results, LadderPrintout::Ladder, LadderPrintout::Both}) {
    what_ = what;
    Do("click cmdDo");
    const Json whole = EventsNamed("printed").at(0)["pages"];
    // A blank to measure by, all that was printed, a new page behind each, and the end.
    const int operations = static_cast<int>(1 + whole[0].size() - 1 + whole[1].size() + 2 + 1);
    for (int nth = 1; nth <= operations; ++nth) {
      Do("printer fail " + std::to_string(nth));
      ExpectThrownAway(kFailed);
    }
    Do("click cmdDo");
    EXPECT_EQ(EventsNamed("printed").at(0)["pages"][1], whole[1]);
  }
}

}  // namespace
}  // namespace marlowbeck
