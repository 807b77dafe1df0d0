// What the Reports screen hands to the screens that it opens, seen by stand-ins for them.

#include "stats/reports.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

class ReportsHandOver : public ReportsTest {
 protected:
  /// Registers a stand-in for a screen that the reports open.
  void StandIn(const char* name) {
    registration = [name](Screens& screens, const Context& context) {
      RegisterScreens(screens, context);
      screens.Register(
          name, [name](Screens& in) { return std::make_unique<Screen>(in, name, "Stand-in"); });
    };
    LayRovers();
  }

  /// The Reports screen has given way to the stand-in.
  void ExpectInFront(const std::string& name, Here here = Here::current()) {
    EXPECT_EQ(Front(here), name);
    EXPECT_TRUE(Loaded("frmPMenu", here));
    const Json answer = Do("screens", here);
    for (const Json& screen : answer["screens"]) {
      EXPECT_EQ(screen["visible"], screen["name"] == name) << screen;
    }
  }
};

#define STAND_INS_HAVE_NO_WINDOW HOLDS_FOR_MODELS_ALONE("a stand-in has no form to be a window of")

TEST_F(ReportsHandOver, ANameSearchGetsTheSurnameUpperCased) {
  STAND_INS_HAVE_NO_WINDOW;
  StandIn("frmSearchPlayer");
  OpenReports();
  Do("input  o'Brien ");
  Do("click Image12");
  ExpectInFront("frmSearchPlayer");
  EXPECT_EQ(InSession("SearchText"), "O'BRIEN");
  EXPECT_EQ(InSession("Flag"), 3);
  EXPECT_EQ(InSession("ReportChoice"), 12);
}

TEST_F(ReportsHandOver, ANameSearchForBlanksStays) {
  STAND_INS_HAVE_NO_WINDOW;
  StandIn("frmSearchPlayer");
  OpenReports();
  Do("input    ");
  Do("click Image12");
  EXPECT_EQ(Front(), "frmPMenu");
  EXPECT_EQ(InSession("SearchText"), "");
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(ReportsHandOver, TheSeasonReportIsReportSeven) {
  STAND_INS_HAVE_NO_WINDOW;
  StandIn("frmAnnual");
  OpenReports();
  Do("click Image7");
  ExpectInFront("frmAnnual");
  EXPECT_EQ(InSession("ReportChoice"), 7);
}

TEST_F(ReportsHandOver, ThePegRatiosAreReportEight) {
  STAND_INS_HAVE_NO_WINDOW;
  StandIn("frmPegRatio");
  OpenReports();
  Do("click Image8");
  ExpectInFront("frmPegRatio");
  EXPECT_EQ(InSession("ReportChoice"), 8);
}

TEST_F(ReportsHandOver, ADateToBeChangedComesWithItsGradeTeamAndOpposition) {
  STAND_INS_HAVE_NO_WINDOW;
  StandIn("frmChangeDate");
  OpenWeekly();
  Do("pick lstAllDates 0");
  Do("click cmdChangeDate");
  ExpectInFront("frmChangeDate");
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-17#\r\n");
  EXPECT_EQ(File("dc.qz3"), "\"Rovers\"\r\n");
  EXPECT_EQ(InSession("Grade"), "A");
  EXPECT_EQ(InSession("Team"), "Rovers");
  EXPECT_EQ(InSession("Opposition"), "Hawks");
}

TEST_F(ReportsHandOver, AScoreToBeCorrectedComesWithItsPlayer) {
  STAND_INS_HAVE_NO_WINDOW;
  StandIn("frmEdScore");
  OpenWeekly();
  Do("dblcell grdWeek 2 0");
  ExpectInFront("frmEdScore");
  EXPECT_EQ(File("qzEdScor.qz3"),
            "\"A\"\r\n\"Rovers\"\r\n\"Swifts\"\r\n\"24/03/2004\"\r\n\"Baker, Al *\"\r\n");
}

}  // namespace
}  // namespace marlowbeck
