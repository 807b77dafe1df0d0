#include "ui/controls.h"

#include <gtest/gtest.h>

#include "tests/data/expect_error.h"
#include "tests/ui/workbench.h"
#include "ui/control_state.h"

namespace marlowbeck {
namespace {

class ControlsTest : public testing::Test, protected Workbench {
 protected:
  BenchScreen& a = A();
};

TEST_F(ControlsTest, AssigningATextFiresChangeOnlyWhereItDiffers) {
  a.txtA.SetText("5");
  EXPECT_EQ(Happened(), Log{"change txtA"});
  a.txtA.SetText("5");
  EXPECT_EQ(Happened(), Log{});
  a.cboFree.SetText("Rovers");
  EXPECT_EQ(Happened(), Log{"change cboFree"});
}

TEST_F(ControlsTest, AssigningAnIndexFiresClickAlsoWhenItIsThatAlready) {
  a.lstA.AddLine("one");
  a.lstA.SetIndex(0);
  a.lstA.SetIndex(0);
  EXPECT_EQ(Happened(), (Log{"click lstA", "click lstA"}));
  a.lstA.SetIndex(-1);
  EXPECT_EQ(Happened(), Log{});
  EXPECT_ERROR(9, a.lstA.SetIndex(1));
  EXPECT_ERROR(9, a.lstA.SetIndex(-2));
}

TEST_F(ControlsTest, AssigningAComboIndexTakesTheLineAsTextWithoutChange) {
  a.cboLocked.AddLine("A Grade");
  a.cboLocked.SetIndex(0);
  EXPECT_EQ(Happened(), Log{"click cboLocked"});
  EXPECT_EQ(a.cboLocked.Text(), "A Grade");
}

TEST_F(ControlsTest, AssigningAComboTextFindsItsLineWithoutClick) {
  a.cboLocked.AddLine("A");
  a.cboLocked.AddLine("B");
  a.cboLocked.SetText("B");
  EXPECT_EQ(a.cboLocked.Index(), 1);
  a.cboLocked.SetText("none of them");
  EXPECT_EQ(a.cboLocked.Index(), -1);
  EXPECT_EQ(Happened(), (Log{"change cboLocked", "change cboLocked"}));
}

TEST_F(ControlsTest, AssigningAnOptionACheckOrADateFiresNothing) {
  a.opt0.SetValue(true);
  a.chkA.SetValue(true);
  a.datA.SetValue(Date{38077});
  EXPECT_EQ(Happened(), Log{});
}

TEST_F(ControlsTest, OneOptionOfAPanelIsSelected) {
  a.other.SetValue(true);
  a.opt0.SetValue(true);
  a.opt1.SetValue(true);
  EXPECT_FALSE(a.opt0.Value());
  EXPECT_TRUE(a.opt1.Value());
  EXPECT_TRUE(a.other.Value()) << "in another panel";
  a.opt1.SetValue(false);
  EXPECT_FALSE(a.opt0.Value() || a.opt1.Value() || a.opt2.Value());
}

TEST_F(ControlsTest, RemovingALineMovesTheIndexWithItsLine) {
  for (const char* line : {"a", "b", "c"}) a.lstA.AddLine(line);
  a.lstA.SetIndex(1);
  a.lstA.RemoveLine(0);
  EXPECT_EQ(a.lstA.Index(), 0);
  a.lstA.RemoveLine(0);
  EXPECT_EQ(a.lstA.Index(), -1);
  EXPECT_ERROR(9, a.lstA.RemoveLine(1));
  EXPECT_ERROR(9, (void)a.lstA.Line(1));
  EXPECT_EQ(a.lstA.Find("c"), 0);
  EXPECT_EQ(a.lstA.Find("b"), -1);
}

TEST_F(ControlsTest, RemovingALineMovesTheMarksWithTheirLines) {
  for (const char* line : {"a", "b", "c"}) a.lstA.AddLine(line);
  a.lstA.SetMulti(true);
  a.lstA.SetMarked(0, true);
  a.lstA.SetMarked(2, true);
  a.lstA.RemoveLine(0);
  EXPECT_EQ(a.lstA.Marked(), std::set<int>{1});
  EXPECT_ERROR(9, a.lstA.SetMarked(2, true));
  a.lstA.Clear();
  EXPECT_TRUE(a.lstA.Marked().empty());
}

TEST_F(ControlsTest, ClearingAComboClearsItsText) {
  a.cboFree.AddLine("A");
  a.cboFree.SetIndex(0);
  a.cboFree.Clear();
  EXPECT_EQ(a.cboFree.Text(), "");
  EXPECT_EQ(a.cboFree.Index(), -1);
}

TEST_F(ControlsTest, AGridHasItsSizeAndNoMore) {
  a.grdA.SetSize(2, 3);
  a.grdA.SetCell(1, 2, "x");
  EXPECT_EQ(a.grdA.Cell(1, 2), "x");
  EXPECT_EQ(a.grdA.Cell(2, 0), "");
  EXPECT_ERROR(9, a.grdA.SetCell(2, 0, "y"));
  EXPECT_ERROR(9, a.grdA.SetCell(0, 3, "y"));
  EXPECT_ERROR(9, a.grdA.SetCell(-1, 0, "y"));
  a.grdA.SetCurrent(1, 2);
  a.grdA.SetSize(1, 1);
  EXPECT_EQ(a.grdA.Row(), 0);
  EXPECT_EQ(a.grdA.Col(), 0);
}

TEST_F(ControlsTest, TheRevisionMovesWithEveryChangeAndOnlyThen) {
  const auto before = a.cmdA.Revision();
  a.cmdA.SetCaption("Sa&ve");
  a.cmdA.Show();
  a.cmdA.Enable();
  EXPECT_EQ(a.cmdA.Revision(), before);
  a.cmdA.SetCaption("Save it");
  EXPECT_GT(a.cmdA.Revision(), before);
}

TEST_F(ControlsTest, IsShownAndLiveOnlyWithAllThatHoldsIt) {
  EXPECT_TRUE(a.opt0.Live());
  a.fraA.Disable();
  EXPECT_TRUE(a.opt0.Shown());
  EXPECT_FALSE(a.opt0.Live());
  a.fraA.Enable();
  a.fraA.Hide();
  EXPECT_FALSE(a.opt0.Shown());
  EXPECT_TRUE(a.opt0.Visible()) << "its own";
  a.fraA.Show();
  a.SetEnabled(false);
  EXPECT_FALSE(a.opt0.Live());
  const ControlState state = StateOf(a.opt0);
  EXPECT_TRUE(state.visible && state.shown);
  EXPECT_FALSE(state.enabled);
}

TEST_F(ControlsTest, AreFoundByNameInAnyCase) {
  EXPECT_EQ(a.Find("TXTA"), &a.txtA);
  EXPECT_EQ(a.Find("Opt(1)"), &a.opt1);
  EXPECT_EQ(a.Find("opt"), nullptr);
}

}  // namespace
}  // namespace marlowbeck
