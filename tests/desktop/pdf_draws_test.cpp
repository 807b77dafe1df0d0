// The knock-out's table and the chart of fixtures as they come out on paper.

#include "fixtures/fixture_chart.h"
#include "fixtures/print_fixtures.h"
#include "knockout/print_knockout.h"
#include "tests/desktop/pdf_pages.h"

namespace marlowbeck {
namespace {

class KnockOutOnPaper : public PdfDocuments {
 protected:
  static KnockOutPrint APrint(int entrants) {
    KnockOutPrint print;
    print.heading = {"KNOCK-OUT Competition : Wednesday 31 March 2004", "All Association Grades"};
    print.heads = {"#", "Player", "Grade"};
    print.with_grades = true;
    for (int i = 1; i <= entrants; ++i) {
      print.entrants.push_back({"Wandering, William " + std::to_string(i), "B Grade"});
    }
    return print;
  }
  double Line() { return printer_.TextHeight("x"); }
  /// Distances of the column edges from the left one, measured anew.
  std::vector<double> Edges(const KnockOutPrint& print) {
    const double room = 1.2 * printer_.TextWidth("88");
    const double numbers = 1.2 * printer_.TextWidth("8888");
    double names = 0;
    for (const Entrant& entrant : print.entrants) {
      names = std::max(names, printer_.TextWidth(entrant.name));
    }
    const double grades = printer_.TextWidth("B Grade");
    return {0, numbers, numbers + names + room, numbers + names + grades + 2 * room};
  }
};

TEST_F(KnockOutOnPaper, ItsRulesStandWhereTheyWereMeasured) {
  const KnockOutPrint print = APrint(5);
  ASSERT_TRUE(PrintKnockOut(context_, 1, print));
  const auto pages = Pictures();
  ASSERT_EQ(pages.size(), 1U);
  const std::vector<double> edges = Edges(print);
  const double left = (printer_.PageWidth() - edges.back()) / 2;
  const double top = 400 + 2.5 * Line();
  const double pitch = 1.15 * Line();
  for (int row = 0; row <= 6; ++row) {
    const double y = top + row * pitch;
    EXPECT_TRUE(pages[0].HasRule(left, y, left + edges.back(), y)) << "above row " << row;
  }
  for (const double edge : edges) {
    EXPECT_TRUE(pages[0].HasRule(left + edge, top, left + edge, top + 6 * pitch)) << edge;
  }
  for (std::size_t i = 1; i < edges.size(); ++i) {
    for (int row = 0; row < 6; ++row) {
      const double y = top + row * pitch;
      EXPECT_FALSE(
          pages[0].HasInk(left + edges[i] - 45, y + 25, left + edges[i] - 20, y + pitch - 25))
          << "a text touches the rule: row " << row << " column " << i;
    }
  }
}

TEST_F(KnockOutOnPaper, TheByeHasRoomInItsColumn) {
  KnockOutPrint print = APrint(0);
  print.entrants = {{"Li, Bo", "A"}};
  print.with_bye = true;
  ASSERT_TRUE(PrintKnockOut(context_, 1, print));
  EXPECT_EQ(Pictures().size(), 1U);
}

TEST_F(KnockOutOnPaper, SixtyFourTakeASecondPage) {
  ASSERT_TRUE(PrintKnockOut(context_, 1, APrint(64)));
  EXPECT_EQ(Pictures().size(), 2U);
}

class FixturesOnPaper : public PdfDocuments {
 protected:
  void Print(int teams) {
    const FixtureTable table(teams);
    PrintFixtures(context_, FixtureTitle(table), FixtureChart(table), "1");
    EXPECT_TRUE(session_.MessageText.empty());
  }
};

TEST_F(FixturesOnPaper, AllCharactersAreOfOneWidth) {
  for (const char* name : {"Courier New", "courier"}) {
    for (const bool bold : {false, true}) {
      printer_.SetFont({name, 10, bold, false, false});
      const double width = printer_.TextWidth("MMMMMMMMMM");
      for (const char* text : {"iiiiiiiiii", "          ", "1234567890", "v = Bye  1"}) {
        EXPECT_NEAR(printer_.TextWidth(text), width, 1) << name << bold << text;
      }
    }
  }
}

TEST_F(FixturesOnPaper, TheColumnsOfTheChartStandBelowEachOther) {
  Print(14);
  const auto pages = Pictures();
  ASSERT_EQ(pages.size(), 1U);
  printer_.SetFont({"courier", 14, false, false, false});
  double y = 500 + 2 * printer_.TextHeight("x");
  printer_.SetFont({kChartFont, 10, false, false, false});
  const double line = printer_.TextHeight("x");
  const double width = printer_.TextWidth("8");
  const auto has_ink = [&](int character, double at) {
    const double x = 1100 + character * width;
    return pages[0].HasInk(x + width / 4, at + line / 4, x + width * 3 / 4, at + line * 3 / 4);
  };
  for (int match = 0; match < 7; ++match) {
    const double at = y + (2 + match) * line;
    for (int round = 0; round < 7; ++round) {
      EXPECT_TRUE(has_ink(4 + 11 * round, at)) << "units of the lower team";
      EXPECT_TRUE(has_ink(6 + 11 * round, at)) << "v";
      EXPECT_TRUE(has_ink(9 + 11 * round, at)) << "units of the higher team";
      EXPECT_FALSE(has_ink(10 + 11 * round, at)) << "between two rounds";
    }
  }
}

TEST_F(FixturesOnPaper, FiftyTeamsStayWithinThePages) {
  Print(50);
  const auto pages = Pictures();
  EXPECT_EQ(pages.size(), 4U);
  for (const PagePicture& page : pages) {
    EXPECT_TRUE(page.HasInk(1100, 500, 10000, 2000));
    EXPECT_FALSE(
        page.HasInk(printer_.PageWidth() - 50, 0, printer_.PageWidth(), printer_.PageHeight()))
        << "nothing is cut at the right";
  }
}

}  // namespace
}  // namespace marlowbeck
