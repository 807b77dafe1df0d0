// The common print routine against arithmetic: with the metrics of the test's printer a letter of
// the 10 point font is 100 twips wide and a line 240 high, so that a row is 288.

#include "print/report.h"

#include "drive/workbench.h"
#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr double kLine = 240;
constexpr double kHalf = 120;
constexpr double kPitch = 288;
constexpr double kMiddle = 5953;  // of 11906
constexpr const char* kTooWide = "Font is too large, please re-select.    ";
constexpr const char* kTooLong =
    "Your selections will not fit on one page.   \r"
    "Printing will now be cancelled.    \r"
    "<<WARNING>> This may take some time    \r"
    "depending on printer status.    \r"
    "\r"
    "Note: Choose a smaller font to fit more   \r"
    "onto a page or limit your selections.    ";
constexpr const char* kFailed = "An unrecognised error occurred while trying to print.    ";

/// Two players, 10 and 9 letters long: columns of 1200 and 600 twips, 1800 in all.
ReportTable TwoPlayers() {
  return {" Rovers  A Grade ",
          {{"Player", ""}, {"Agg", "88888"}},
          {{"Archer, Jo ", " 505"}, {"Baker, Al", "Forfeit"}}};
}

/// As many rows as are asked for.
ReportTable LongTable(int rows) {
  ReportTable table = TwoPlayers();
  table.rows.assign(static_cast<std::size_t>(rows), {"Archer, Jo", "505"});
  return table;
}

/// A table exactly as wide as is asked for: the names are two thirds of the width.
ReportTable WideTable(int letters_of_name, const std::string& eights) {
  return {"Wide",
          {{"Player", ""}, {"Agg", eights}},
          {{std::string(static_cast<std::size_t>(letters_of_name), 'x'), "1"}}};
}

class Report : public WorkbenchTest {
 protected:
  Report() {
    WriteFile("S.qzs", "\"Winter 2004\"\r\n");
    OnDo([this](Workbench& bench) {
      Session& session = bench.context.session;
      session.SeasonFile = "S.qzs";
      session.AssociationName = association_;
      session.PrintFontBold = bold_;
      session.PrintFontSize = size_;
      PrintReport(bench.context, options_, tables_);
      bold_base_ = session.PrintBoldBase;
    });
  }

  void Print(Here here = Here::current()) { Do("click cmdDo", here); }
  std::vector<PrintedPage> Pages(Here here = Here::current()) {
    return PagesOf(EventsNamed("printed"), here);
  }
  /// Prints and answers the one page.
  PrintedPage OnePage(Here here = Here::current()) {
    Print(here);
    const auto pages = Pages(here);
    EXPECT_EQ(pages.size(), 1U);
    return pages.empty() ? PrintedPage() : pages.front();
  }
  /// The pages printed, without the blank that is printed in whatever font the printer had.
  Json WithoutTheFirstBlank() {
    Json pages = EventsNamed("printed").at(0)["pages"];
    pages[0].erase(0);
    return pages;
  }
  void ExpectThrownAway(const std::string& message, Here here = Here::current()) {
    const testing::ScopedTrace trace(here.file_name(), static_cast<int>(here.line()), "from here");
    EXPECT_EQ(BoxTexts(), std::vector<std::string>{message});
    EXPECT_EQ(Count("killed"), 1);
    EXPECT_EQ(Count("printed"), 0);
  }

  std::vector<ReportTable> tables_ = {TwoPlayers()};
  PrintOptions options_;
  std::string association_ = " Marlow Darts ";
  bool bold_ = false;
  int size_ = 10;
  bool bold_base_ = false;
};

TEST_F(Report, OneCentimetreFromTheTopAsksNothingAndPrintsTheHeading) {
  const PrintedPage page = OnePage();
  EXPECT_TRUE(Boxes().empty());
  ExpectAt(page.Find("Marlow Darts"), kMiddle - 600, 567);
  // Half a line further down than where the line before it ended.
  ExpectAt(page.Find("Winter 2004"), kMiddle - 550, 567 + kLine + kHalf);
  ExpectAt(page.Find("Rovers  A Grade"), kMiddle - 750, 567 + 2 * (kLine + kHalf));
}

TEST_F(Report, TableStandsCentredWithEveryEdgeInItsPlace) {
  const PrintedPage page = OnePage();
  const double top = 567 + 3 * (kLine + kHalf);
  const double left = kMiddle - 900;
  ASSERT_EQ(page.boxes.size(), 3U);
  ASSERT_EQ(page.lines.size(), 3U);
  for (int row = 0; row < 3; ++row) {
    const double row_top = top + row * kPitch;
    ExpectStroke(page.boxes[row], {left, row_top, left + 1800, row_top + kPitch});
    ExpectStroke(page.lines[row], {left + 1200, row_top, left + 1200, row_top + kPitch});
  }
}

TEST_F(Report, NamesStandFromTheLeftAndFiguresInTheMiddle) {
  const PrintedPage page = OnePage();
  const double first = 567 + 3 * (kLine + kHalf) + 24;  // half of what a row has besides its text
  const double left = kMiddle - 900;
  ExpectAt(page.Find("Player"), left + kHalf, first);
  ExpectAt(page.Find("Agg"), left + 1200 + (600 - 300) / 2, first);
  ExpectAt(page.Find("Archer, Jo"), left + kHalf, first + kPitch);
  ExpectAt(page.Find("505"), left + 1200 + (600 - 300) / 2, first + kPitch);
  ExpectAt(page.Find("Baker, Al"), left + kHalf, first + 2 * kPitch);
  ExpectAt(page.Find("Forfeit"), left + 1200 + (600 - 700) / 2, first + 2 * kPitch);
}

TEST_F(Report, TitleAndHeadingRowAloneAreBold) {
  const PrintedPage page = OnePage();
  for (const PrintedText& text : page.texts) {
    const bool bold = text.text == "Rovers  A Grade" || text.text == "Player" || text.text == "Agg";
    EXPECT_EQ(text.bold, bold) << text.text;
    EXPECT_EQ(text.font, "MS Sans Serif") << text.text;
    EXPECT_EQ(text.size, 10) << text.text;
    EXPECT_FALSE(text.underline) << text.text;
  }
  EXPECT_FALSE(bold_base_);
}

TEST_F(Report, InABoldFontEverythingIsBold) {
  bold_ = true;
  for (const PrintedText& text : OnePage().texts) EXPECT_TRUE(text.bold) << text.text;
  EXPECT_TRUE(bold_base_);
}

TEST_F(Report, ColumnsFollowTheFont) {
  size_ = 20;
  const PrintedPage page = OnePage();
  ASSERT_EQ(page.boxes.size(), 3U);
  EXPECT_NEAR(page.boxes[0].x2 - page.boxes[0].x1, 3600, 0.01);
  EXPECT_NEAR(page.boxes[0].y2 - page.boxes[0].y1, 576, 0.01);
  EXPECT_EQ(page.Find("505").size, 20);
}

TEST_F(Report, AnEmptyAssociationNameTakesNoLine) {
  association_ = "  ";
  const PrintedPage page = OnePage();
  ExpectAt(page.Find("Winter 2004"), kMiddle - 550, 567);
  ExpectAt(page.Find("Rovers  A Grade"), kMiddle - 750, 567 + kLine + kHalf);
}

TEST_F(Report, FurtherDownThanOneCentimetreAsksForTheHeading) {
  options_.centimetres = 2.7;
  Do("answer yes");
  const PrintedPage page = OnePage();
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes().at(0).style, 67);
  EXPECT_EQ(Boxes().at(0).text,
            "Printing will start 2.7 centimetres from the top of the page.    \r"
            "\r"
            "Do you want to print the Association name and season description ?    \r"
            "\r"
            "Selecting NO, will only print Grade and Date.    \r"
            "Selecting CANCEL, will cancel printing.    ");
  ExpectAt(page.Find("Marlow Darts"), kMiddle - 600, 2.7 * 567);
}

TEST_F(Report, NoDropsBothHeadingLinesAndPutsTheTitleAtTheTop) {
  options_.centimetres = 1.5;
  Do("answer no");
  const PrintedPage page = OnePage();
  EXPECT_EQ(page.Words().front(), "Rovers  A Grade");
  ExpectAt(page.Find("Rovers  A Grade"), kMiddle - 750, 850.5);
  EXPECT_NEAR(page.boxes.at(0).y1, 850.5 + kLine + kHalf, 0.01);
}

TEST_F(Report, NoHoldsForOnePrintoutOnly) {
  options_.centimetres = 1.5;
  DoAll({"answer no", "click cmdDo"});
  options_.centimetres = 1;
  EXPECT_EQ(OnePage().Words().front(), "Marlow Darts");
}

TEST_F(Report, CancelThrowsTheDocumentAway) {
  options_.centimetres = 1.5;
  DoAll({"answer cancel", "click cmdDo"});
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Count("killed"), 1);
  EXPECT_EQ(Count("printed"), 0);
}

TEST_F(Report, TableThatFillsTheWidthIsPrinted) {
  // 48 letters and 4 eights: 5760 + 480 twips; the page has 300 more than that.
  tables_ = {WideTable(48, "8888")};
  Do("printer width 6540");
  const PrintedPage page = OnePage();
  ASSERT_EQ(page.boxes.size(), 2U);
  EXPECT_NEAR(page.boxes[0].x1, 150, 0.01);
  EXPECT_NEAR(page.boxes[0].x2, 6390, 0.01);
}

TEST_F(Report, TableATwipWiderIsRefused) {
  tables_ = {WideTable(48, "8888")};
  Do("printer width 6539");
  Print();
  ExpectThrownAway(kTooWide);
}

TEST_F(Report, LandscapePaperHoldsWhatPortraitDoesNot) {
  tables_ = {WideTable(100, "8888")};
  Print();
  ExpectThrownAway(kTooWide);
  Do("printer orientation landscape");
  Print();
  ASSERT_EQ(Pages().size(), 1U);
}

TEST_F(Report, LastRowThatFitsIsPrinted) {
  // A page of 20 rows and the heading row below the heading, 400 and one row more.
  const double bottom = 567 + 3 * (kLine + kHalf) + 21 * kPitch;
  Do("printer height " + std::to_string(static_cast<int>(bottom + 400 + kPitch)));
  tables_ = {LongTable(20)};
  EXPECT_EQ(OnePage().boxes.size(), 21U);
}

TEST_F(Report, OneRowMoreIsRefused) {
  const double bottom = 567 + 3 * (kLine + kHalf) + 21 * kPitch;
  Do("printer height " + std::to_string(static_cast<int>(bottom + 400 + kPitch)));
  tables_ = {LongTable(21)};
  Print();
  ExpectThrownAway(kTooLong);
  // It is thrown away before anything is said.
  EXPECT_TRUE(Events().at(0).contains("killed"));
}

TEST_F(Report, HeadingRowThatDoesNotFitIsRefusedThoughThereAreNoOthers) {
  tables_ = {LongTable(0)};
  const int bottom = static_cast<int>(567 + 3 * (kLine + kHalf) + kPitch);
  Do("printer height " + std::to_string(bottom + 400 + static_cast<int>(kPitch)));
  EXPECT_EQ(OnePage().boxes.size(), 1U);
  Do("printer height " + std::to_string(bottom + 400 + static_cast<int>(kPitch) - 1));
  Print();
  ExpectThrownAway(kTooLong);
}

TEST_F(Report, ATableThatIsTooWideIsToldBeforeTheDocumentIsThrownAway) {
  tables_ = {WideTable(100, "8888")};
  Print();
  EXPECT_TRUE(Events().at(0).contains("box"));
  EXPECT_TRUE(Events().at(1).contains("killed"));
}

TEST_F(Report, ABlankPreparesThePrinterAtTheTopOfEachPage) {
  options_.copies = 2;
  Print();
  const Json pages = EventsNamed("printed").at(0)["pages"];
  ASSERT_EQ(pages.size(), 2U);
  for (const Json& page : pages) {
    EXPECT_EQ(page[0]["text"], " ");
    EXPECT_EQ(page[0]["y"], 0);
  }
}

TEST_F(Report, AllCopiesAreOneDocumentOfEqualPages) {
  options_.copies = 3;
  Print();
  ASSERT_EQ(Pages().size(), 3U);
  const Json pages = EventsNamed("printed").at(0)["pages"];
  EXPECT_EQ(pages[1], pages[2]);
  EXPECT_EQ(Pages()[0].Words(), Pages()[1].Words());
}

TEST_F(Report, CopiesAreRoundedHalvesToTheEvenNumber) {
  for (const auto& [copies, pages] : {std::pair{1.5, 2U}, {2.5, 2U}, {2.6, 3U}}) {
    options_.copies = copies;
    Print();
    EXPECT_EQ(Pages().size(), pages) << copies;
  }
}

TEST_F(Report, MoreCopiesThanCanBeCountedAreAFailure) {
  options_.copies = 40000;
  Print();
  ExpectThrownAway(kFailed);
}

TEST_F(Report, SecondTableStandsBelowTheFirstWithItsOwnWidth) {
  tables_ = {TwoPlayers(), WideTable(30, "8888")};
  const PrintedPage page = OnePage();
  const double bottom = 567 + 3 * (kLine + kHalf) + 3 * kPitch;
  ExpectAt(page.Find("Wide"), kMiddle - 200, bottom + kHalf);
  EXPECT_TRUE(page.Find("Wide").bold);
  ASSERT_EQ(page.boxes.size(), 5U);
  const double left = kMiddle - (3600 + 480) / 2;
  const double top = bottom + kHalf + kLine + kHalf;
  ExpectStroke(page.boxes[3], {left, top, left + 4080, top + kPitch});
}

TEST_F(Report, SecondTableThatIsTooWideLeavesNothingOfTheFirst) {
  tables_ = {TwoPlayers(), WideTable(100, "8888")};
  Print();
  ExpectThrownAway(kTooWide);
}

TEST_F(Report, SecondTableThatIsTooLongLeavesNothingOfTheFirst) {
  tables_ = {TwoPlayers(), LongTable(60)};
  Print();
  ExpectThrownAway(kTooLong);
}

TEST_F(Report, TopBelowThePageIsNoRoomForAnything) {
  for (const double centimetres : {40.0, 1e300}) {
    options_.centimetres = centimetres;
    DoAll({"answer no", "click cmdDo"});
    EXPECT_EQ(BoxTexts().back(), kTooLong) << centimetres;
    EXPECT_EQ(Count("killed"), 1);
  }
}

TEST_F(Report, WithoutASeasonTitleItIsAskedForFirst) {
  DeleteFile("S.qzs");
  Do("input Summer 2005");
  EXPECT_EQ(OnePage().Find("Summer 2005").text, "Summer 2005");
}

TEST_F(Report, PrinterThatFailsAtAnyOperationIsToldAndTheNextPrintoutIsWhole) {
  options_.copies = 2;
  tables_ = {TwoPlayers(), TwoPlayers()};
  Print();
  const Json whole = WithoutTheFirstBlank();
  int nth = 1;
  for (;; ++nth) {
    Do("printer fail " + std::to_string(nth));
    Print();
    if (Count("printed") == 1) break;
    ExpectThrownAway(kFailed);
    ASSERT_LT(nth, 1000);
    Print();
    ASSERT_EQ(WithoutTheFirstBlank(), whole) << "after a failure at " << nth;
  }
  // A blank to measure by; on each page a blank, two heading lines, and twice a title and three
  // rows of a box, a line and two texts; a new page; the end.
  EXPECT_EQ(nth - 1, 1 + 2 * (1 + 2 + 2 * (1 + 3 * 4) + 1) + 1);
}

TEST_F(Report, SeasonFileThatCannotBeReadIsAFailureOfThePrintout) {
  DeleteFile("S.qzs");
  DoAll({"input Summer", "fault write 1 61"});
  Print();
  ExpectThrownAway(kFailed);
}

}  // namespace
}  // namespace marlowbeck
