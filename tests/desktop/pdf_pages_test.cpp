// Printouts as they come out: PDF files turned into pictures, in which a twip and its place are
// looked for again.

#include "tests/desktop/pdf_pages.h"

#include <QAction>
#include <QApplication>
#include <QPrintPreviewDialog>
#include <QPrintPreviewWidget>
#include <QTimer>

#include "ladder/print_tables.h"
#include "print/report.h"

namespace marlowbeck {
namespace {

LadderTab ATab() {
  return {
      "A Grade",
      "A Grade    Wednesday, 17 March 2004 ",
      "A Grade PREMIERSHIP LADDER up to: Wednesday, 17 March 2004 ",
      {"Wanderers of the Western Wards", "Ivy", "Rovers"},
      {{"Wanderers of the Western Wards", "11", " def ", "Ivy", "0"},
       {"Rovers", "0", " drew ", "", "0"}},
      {{"Wanderers of the Western Wards", "14", "12", "1", "1", "888", "777", "114.29", "25", "+2"},
       {"Rovers", "14", "7", "7", "0", "88", "77", "100.00", "14", "0"},
       {"Ivy", "14", "0", "14", "0", "8", "120", "6.67", "-2", "-2"}}};
}

class PdfPages : public PdfDocuments {
 protected:
  void PrintTab(LadderPrintout what, const PrintOptions& options = {}) {
    PrintLadderTab(context_, options, what, ATab());
  }
  static void KeepUpperPart(const PagePicture& page, const QString& name) {
    const QString folder = qEnvironmentVariable("MARLOWBECK_PICTURES");
    if (folder.isEmpty()) return;
    const QImage part = page.Image().copy(0, 0, page.Size().width(), page.Size().width() * 2 / 5);
    part.scaledToWidth(800, Qt::SmoothTransformation).save(QDir(folder).filePath(name));
  }
  /// Distances of the ladder's column edges from its left one, measured anew.
  std::vector<double> LadderEdges() {
    std::vector<double> edges = {0, 1.2 * WidestOf(ATab().teams)};
    for (const char* eights :
         {"888", "888", "888", "888", "8888", "8888", "8888888", "8888", "888"}) {
      edges.push_back(edges.back() + 1.2 * printer_.TextWidth(eights));
    }
    return edges;
  }
};

TEST_F(PdfPages, LadderOnPaperHasItsRulesWhereTheyWereMeasured) {
  PrintTab(LadderPrintout::Ladder);
  const auto pages = Pictures();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_NEAR(pages[0].Size().width(), 1190, 2);
  EXPECT_NEAR(pages[0].Size().height(), 1684, 2);
  const double line = printer_.TextHeight("x");
  const std::vector<double> edges = LadderEdges();
  const double left = (printer_.PageWidth() - edges.back()) / 2;
  const double top = 567 + 3 * 1.25 * line + 1.5 * line;
  for (int row = 0; row <= 4; ++row) {
    const double y = top + row * 1.2 * line;
    EXPECT_TRUE(pages[0].HasRule(left, y, left + edges.back(), y)) << "above row " << row;
  }
  for (const double edge : edges) {
    EXPECT_TRUE(pages[0].HasRule(left + edge, top, left + edge, top + 4 * 1.2 * line)) << edge;
  }
  EXPECT_FALSE(pages[0].HasInk(0, top - line / 4, left - 30, top + 6 * line)) << "left of it";
  EXPECT_FALSE(pages[0].HasInk(left + edges.back() + 30, top - line / 4, printer_.PageWidth(),
                               top + 6 * line))
      << "right of it";
}

TEST_F(PdfPages, NoTextTouchesARuleInAnyFont) {
  for (const char* name : {"MS Sans Serif", "DejaVu Sans Mono", "Liberation Serif"}) {
    for (const int size : {8, 10, 13}) {
      session_.PrintFontName = name;
      session_.PrintFontSize = size;
      if (std::string(name) == "DejaVu Sans Mono" && size > 8) continue;  // has no room on A4
      PrintTab(LadderPrintout::Ladder);
      const auto pages = Pictures();
      ASSERT_EQ(pages.size(), 1U) << name << size;
      const double line = printer_.TextHeight("x");
      const std::vector<double> edges = LadderEdges();
      const double left = (printer_.PageWidth() - edges.back()) / 2;
      const double top = 567 + 3 * 1.25 * line + 1.5 * line;
      for (std::size_t i = 1; i < edges.size(); ++i) {
        for (int row = 0; row < 4; ++row) {
          const double y = top + row * 1.2 * line;
          // Just before the rule, between the row's upper and lower one.
          EXPECT_FALSE(pages[0].HasInk(left + edges[i] - 25, y + 25, left + edges[i] - 20,
                                       y + 1.2 * line - 25))
              << name << size << " row " << row << " column " << i;
        }
      }
    }
  }
}

TEST_F(PdfPages, BothTablesAndTheirCopiesComeOut) {
  PrintTab(LadderPrintout::Both, {1, 2});
  EXPECT_EQ(Pictures().size(), 2U);
}

/// The upper part of a page, for the manual.
TEST_F(PdfPages, TheManualShowsSuchAPage) {
  session_.AssociationName = "Millbrook and District Darts Association";
  PrintLadderTab(
      context_, {}, LadderPrintout::Both,
      {"A Grade",
       "A Grade    Wednesday, 31 March 2004 ",
       "A Grade PREMIERSHIP LADDER up to: Wednesday, 31 March 2004 ",
       {"Anchors", "Bluebells", "Cricketers", "Drovers"},
       {{"Anchors", "7", " def ", "Bluebells", "4"}, {"Cricketers", "5", " drew ", "Drovers", "5"}},
       {{"Anchors", "4", "3", "1", "0", "26", "18", "144.44", "6", "0"},
        {"Drovers", "4", "2", "1", "1", "23", "20", "115.00", "5", "0"},
        {"Cricketers", "4", "1", "2", "1", "20", "23", "86.96", "3", "0"},
        {"Bluebells", "4", "1", "3", "0", "17", "25", "68.00", "0", "-2"}}});
  const auto pages = Pictures();
  ASSERT_EQ(pages.size(), 1U);
  const double line = printer_.TextHeight("x");
  EXPECT_TRUE(pages[0].HasInk(3000, 567, 8000, 567 + line)) << "the association's name";
  KeepUpperPart(pages[0], "printed-page.png");
}

TEST_F(PdfPages, LandscapePaperLiesOnItsSide) {
  printer_.SetOrientation(Orientation::Landscape);
  PrintTab(LadderPrintout::Both);
  const auto pages = Pictures();
  ASSERT_EQ(pages.size(), 1U);
  EXPECT_GT(pages[0].Size().width(), pages[0].Size().height());
}

TEST_F(PdfPages, PlayersOfATeamComeOut) {
  ReportTable night = {
      "Rovers  A Grade  (v's  Hawks)  17/03/2004",
      {{"Player", ""}, {"Agg", "88888"}, {"Sh", "8888"}, {"501", "88888888"}, {"Avg", "8888888"}},
      {{"Archer, Josephine", "505", "20", "57, 121", "25.25"},
       {"Li, Bo", "Forfeit", "Win", "", ""}}};
  PrintReport(context_, {}, {night, night});
  EXPECT_EQ(Pictures().size(), 1U);
}

TEST_F(PdfPages, APreviewShowsTheSamePages) {
  printer_.SetTarget({PrintTarget::Kind::Preview, {}});
  int pages = 0;
  QTimer::singleShot(200, qApp, [&pages] {
    auto* const dialog = dynamic_cast<QPrintPreviewDialog*>(QApplication::activeModalWidget());
    ASSERT_NE(dialog, nullptr);
    auto* const preview = dialog->findChild<QPrintPreviewWidget*>();
    pages = preview->pageCount();
    int turns = 0;
    for (const QAction* action : dialog->findChildren<QAction*>()) {
      const bool turns_paper =
          QStringList{"Portrait", "Landscape", "Page setup"}.contains(action->text());
      if (!turns_paper) continue;
      ++turns;
      EXPECT_FALSE(action->isVisible()) << action->text().toStdString();
    }
    EXPECT_EQ(turns, 3);
    const QString folder = qEnvironmentVariable("MARLOWBECK_PICTURES");
    if (!folder.isEmpty()) dialog->grab().save(QDir(folder).filePath("preview.png"));
    dialog->reject();
  });
  PrintTab(LadderPrintout::Both, {1, 3});
  EXPECT_EQ(pages, 3);
  EXPECT_TRUE(viewed_.isEmpty()) << "no file is made";
  EXPECT_TRUE(session_.MessageText.empty());
}

TEST_F(PdfPages, APrinterThatIsNotThereIsAFailure) {
  printer_.SetTarget({PrintTarget::Kind::Printer, "No such printer"});
  PrintTab(LadderPrintout::Ladder);
  EXPECT_EQ(session_.MessageText, "An unrecognised error occurred while trying to print.    ");
}

TEST_F(PdfPages, ThousandsOfCopiesAreKeptOnce) {
  PrintTab(LadderPrintout::Both, {1, 500});
  EXPECT_LT(QFileInfo(viewed_).size(), 20'000'000);
  QProcess pages;
  pages.start("pdfinfo", {viewed_});
  pages.waitForFinished();
  EXPECT_TRUE(pages.readAllStandardOutput().contains("Pages:           500"));
}

TEST_F(PdfPages, WhatCannotBeWrittenIsAFailureThatLeavesNothing) {
  const QDir documents(QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation));
  QDir().mkpath(QFileInfo(documents.path()).path());
  QDir(documents.path()).removeRecursively();
  QFile in_the_way(documents.path());
  ASSERT_TRUE(in_the_way.open(QIODevice::WriteOnly));
  PrintTab(LadderPrintout::Ladder);
  EXPECT_EQ(session_.MessageText, "An unrecognised error occurred while trying to print.    ");
  EXPECT_TRUE(viewed_.isEmpty());
  in_the_way.remove();
  session_.MessageText.clear();
  PrintTab(LadderPrintout::Ladder);
  EXPECT_TRUE(session_.MessageText.empty());
  EXPECT_TRUE(QFile::exists(viewed_));
}

}  // namespace
}  // namespace marlowbeck
