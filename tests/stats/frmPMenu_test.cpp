// What no state of a control tells: where the ball stands, which entry has a border, and what a
// procedure does when it is called while its panel is hidden.

#include "stats/frmPMenu.h"

#include "stats/reports.h"

namespace marlowbeck {
namespace {

class ReportsModel : public ReportsTest {
 protected:
  frmPMenu& Menu() { return static_cast<frmPMenu&>(*ScreensOf().Find("frmPMenu")); }
};

TEST_F(ReportsModel, TheBallStandsBesideTheEntryThatAloneHasABorder) {
  LayRovers();
  OpenReports();
  frmPMenu& menu = Menu();
  const std::vector<const Picture*> entries = {
      &menu.Image1, &menu.Image3, &menu.Image2, &menu.Image4,  &menu.Image5, &menu.Image9,
      &menu.Image6, &menu.Image7, &menu.Image8, &menu.Image12, &menu.Image10};
  for (const Picture* entry : entries) {
    Do("hover " + entry->Name());
    EXPECT_EQ(menu.imgBall.Beside(), entry) << entry->Name();
    for (const Picture* other : entries) {
      EXPECT_EQ(other->Bordered(), other == entry) << other->Name() << " at " << entry->Name();
    }
  }
  Do("hover fraMenu");
  for (const Picture* entry : entries) EXPECT_FALSE(entry->Bordered()) << entry->Name();
}

TEST_F(ReportsModel, TheSeasonIsNotShownWhileItsPanelIsHidden) {
  LayRovers();
  OpenWeekly();
  frmPMenu& menu = Menu();
  WriteFile("Forfeits.qz3", "0\r\n");
  menu.fraWkProg.Hide();
  menu.grdProg.SetCell(1, 0, "as it was");
  menu.lblProgInfo.SetCaption("as it was");
  menu.GridProg();
  EXPECT_EQ(menu.grdProg.Cell(1, 0), "as it was");
  EXPECT_EQ(menu.lblProgInfo.Caption(), "as it was");
  EXPECT_TRUE(menu.grdProg.Visible());
  EXPECT_TRUE(menu.optFFyes.Value()) << "the answer is not read either";
}

TEST_F(ReportsModel, TablesAreFilledForTeamResultsAlone) {
  LayRovers();
  OpenWeekly();
  frmPMenu& menu = Menu();
  menu.fraWeek.SetCaption("Another");
  menu.FillGrids();
  EXPECT_EQ(menu.grdWeek.Cell(1, 0), "Archer, Jo") << "not blanked either";
}

}  // namespace
}  // namespace marlowbeck
