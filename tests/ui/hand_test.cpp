#include "ui/hand.h"

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "tests/ui/workbench.h"

namespace marlowbeck {
namespace {

class HandTest : public testing::Test, protected Workbench {
 protected:
  void FillList() {
    for (const char* line : {"one", "two", "three"}) a.lstA.AddLine(line);
  }
  BenchScreen& a = A();
};

TEST_F(HandTest, AScreenOpensOnItsFirstStopWithoutAnEvent) {
  EXPECT_EQ(Focus(), "txtA");
  EXPECT_EQ(Happened(), Log{});
}

TEST_F(HandTest, AClickMovesTheFocusFirstThenClicks) {
  EXPECT_TRUE(hand.Click(a.cmdA).Done());
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA", "click cmdA"}));
  hand.Click(a.cmdA);
  EXPECT_EQ(Happened(), Log{"click cmdA"});
}

TEST_F(HandTest, APickIsOfTheLineThatWasSeenWhereTheFocusBringsTheListUpToDate) {
  FillList();
  a.lstA.GotFocus = [this] {
    a.lstA.Clear();
    for (const char* line : {"new", "one", "two"}) a.lstA.AddLine(line);
  };
  hand.Pick(a.lstA, 1);
  EXPECT_EQ(a.lstA.Line(a.lstA.Index()), "two");
  hand.Focus(a.txtA);
  a.lstA.GotFocus = [this] { a.lstA.Clear(); };
  EXPECT_TRUE(hand.Pick(a.lstA, 1).Done());
  EXPECT_EQ(a.lstA.Index(), -1) << "the line has gone";
}

TEST_F(HandTest, AClickIsLostWhenLeavingShowsABox) {
  a.txtA.LostFocus = [this] { Box("too high"); };
  const Outcome outcome = hand.Click(a.cmdA);
  EXPECT_TRUE(outcome.Done());
  EXPECT_TRUE(outcome.lost);
  EXPECT_EQ(Happened(), (Log{"box too high", "got cmdA"}));
  EXPECT_FALSE(hand.Click(a.cmdA).lost) << "the focus is there by now";
}

TEST_F(HandTest, AClickIsLostWhenLeavingCallsTheFocusBack) {
  a.txtA.LostFocus = [this] { a.txtA.SetFocus(); };
  EXPECT_TRUE(hand.Click(a.cmdA).lost);
  EXPECT_EQ(Happened(), Log{"got txtA"});
  EXPECT_EQ(Focus(), "txtA");
}

TEST_F(HandTest, AClickIsLostWhenLeavingPutsTheFocusElsewhere) {
  a.txtA.LostFocus = [this] { a.txtB.SetFocus(); };
  EXPECT_TRUE(hand.Click(a.cmdA).lost);
  EXPECT_EQ(Happened(), Log{"got txtB"});
  EXPECT_EQ(Focus(), "txtB");
}

TEST_F(HandTest, AClickIsLostWhenLeavingHidesOrDisablesWhatWasClicked) {
  a.txtA.LostFocus = [this] { a.cmdA.Disable(); };
  EXPECT_TRUE(hand.Click(a.cmdA).lost);
  a.txtA.SetFocus();
  a.txtA.LostFocus = [this] { a.fraA.Hide(); };
  EXPECT_TRUE(hand.Click(a.opt0).lost);
}

TEST_F(HandTest, AClickIsLostWhenLeavingFails) {
  a.txtA.LostFocus = [] { throw RunTimeError(6); };
  EXPECT_TRUE(hand.Click(a.cmdA).lost);
  EXPECT_EQ(Happened(), (Log{"error 6", "box error"}));
}

TEST_F(HandTest, TypingPickingCellsAndDatesAreLostInTheSameWay) {
  FillList();
  a.grdA.SetSize(1, 1);
  a.txtA.LostFocus = [this] {
    Box("no");
    a.txtA.SetFocus();
  };
  EXPECT_TRUE(hand.Type(a.txtB, "5").lost);
  EXPECT_TRUE(hand.Pick(a.lstA, 1).lost);
  EXPECT_TRUE(hand.ClickCell(a.grdA, 0, 0).lost);
  EXPECT_TRUE(hand.PickDate(a.datA, Date{38077}).lost);
  EXPECT_EQ(a.txtB.Text(), "");
  EXPECT_EQ(a.lstA.Index(), -1);
}

TEST_F(HandTest, WhatTakesNoFocusLeavesItWhereItIs) {
  hand.Click(a.mnuNew);
  EXPECT_EQ(Happened(), Log{"click mnuNew"});
  EXPECT_EQ(Focus(), "txtA");
}

TEST_F(HandTest, WhatNobodyCouldDoIsRefusedAndChangesNothing) {
  a.cmdA.Disable();
  EXPECT_EQ(hand.Click(a.cmdA).refusal, "cmdA is disabled");
  a.cmdA.Hide();
  EXPECT_EQ(hand.Click(a.cmdA).refusal, "cmdA is hidden");
  a.fraA.Disable();
  EXPECT_FALSE(hand.Click(a.opt0).Done());
  EXPECT_FALSE(hand.Click(a.lblA).Done()) << "a label without a click of its own";
  EXPECT_FALSE(hand.Click(a.pbA).Done());
  EXPECT_FALSE(hand.Type(a.cboLocked, "x").Done());
  EXPECT_FALSE(hand.Type(a.cmdB, "x").Done());
  a.txtB.SetLocked(true);
  EXPECT_FALSE(hand.Type(a.txtB, "x").Done());
  EXPECT_FALSE(hand.Pick(a.lstA, 0).Done()) << "it has no lines";
  EXPECT_FALSE(hand.Pick(a.cmdB, 0).Done());
  EXPECT_FALSE(hand.Select(a.lstA, {0}).Done());
  EXPECT_FALSE(hand.ClickCell(a.grdA, 0, 0).Done());
  EXPECT_FALSE(hand.PickDate(a.txtA, Date{1}).Done());
  EXPECT_FALSE(hand.Focus(a.lblA).Done());
  a.SetEnabled(false);
  EXPECT_FALSE(hand.Click(a.cmdB).Done());
  EXPECT_FALSE(hand.Press(Key::Tab).Done());
  EXPECT_FALSE(hand.CloseScreen(a).Done());
  EXPECT_EQ(Happened(), Log{});
  EXPECT_EQ(a.Focus(), nullptr) << "nothing on a disabled screen has it";
}

TEST_F(HandTest, AComboThatIsHeldIsChangedInNoWay) {
  for (const char* team : {"Hawks", "Rovers"}) a.cboFree.AddLine(team);
  a.cboFree.SetText("Hawks");
  log.clear();
  a.cboFree.SetHeld(true);
  EXPECT_TRUE(a.cboFree.Locked());
  EXPECT_FALSE(hand.Type(a.cboFree, "x").Done());
  EXPECT_EQ(hand.Pick(a.cboFree, 1).refusal, "cboFree is locked");
  EXPECT_TRUE(hand.Focus(a.cboFree).Done());
  hand.Press(Key::Down);
  hand.MoveToLine(a.cboFree, 1);
  EXPECT_EQ(a.cboFree.Text(), "Hawks");
  a.cboFree.SetHeld(false);
  hand.Press(Key::Down);
  EXPECT_EQ(a.cboFree.Text(), "Rovers");
}

TEST_F(HandTest, ALabelAndAPanelWithAClickOfTheirOwnTakeOne) {
  a.lblA.Click = [this] { log.push_back("label"); };
  a.fraA.Click = [this] { log.push_back("panel"); };
  hand.Click(a.lblA);
  hand.Click(a.fraA);
  EXPECT_EQ(Happened(), (Log{"label", "panel"}));
}

TEST_F(HandTest, TypingReplacesTheTextCharacterByCharacter) {
  a.txtA.SetText("old");
  log.clear();
  hand.Type(a.txtA, "12");
  EXPECT_EQ(a.txtA.Text(), "12");
  EXPECT_EQ(Happened(), (Log{"change txtA", "change txtA"}));
  hand.Type(a.txtA, "");
  EXPECT_EQ(a.txtA.Text(), "");
  EXPECT_EQ(Happened(), Log{"change txtA"});
}

TEST_F(HandTest, TypingStopsWhereTheFocusGoesAway) {
  a.txtA.Change = [this] {
    if (a.txtA.Text() == "12") a.txtB.SetFocus();
  };
  hand.Type(a.txtA, "1234");
  EXPECT_EQ(a.txtA.Text(), "12");
}

TEST_F(HandTest, AClickOnACheckBoxTurnsIt) {
  hand.Click(a.chkA);
  EXPECT_TRUE(a.chkA.Value());
  hand.Click(a.chkA);
  EXPECT_FALSE(a.chkA.Value());
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got chkA", "click chkA", "click chkA"}));
}

TEST_F(HandTest, AClickOnAnOptionFiresOnlyWhenItBecomesTheSelectedOne) {
  hand.Click(a.opt1);
  hand.Click(a.opt1);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got opt(1)", "click opt(1)"}));
  EXPECT_TRUE(a.opt1.Value());
}

TEST_F(HandTest, APickOfTheCurrentLineIsAClickLikeAnyOther) {
  FillList();
  hand.Pick(a.lstA, 1);
  hand.Pick(a.lstA, 1);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got lstA", "click lstA", "click lstA"}));
}

TEST_F(HandTest, APickInAListThatMarksSeveralMarksThatLineAlone) {
  FillList();
  a.lstA.SetMulti(true);
  hand.Select(a.lstA, {0, 2});
  EXPECT_EQ(a.lstA.Marked(), (std::set<int>{0, 2}));
  hand.Pick(a.lstA, 1);
  EXPECT_EQ(a.lstA.Marked(), std::set<int>{1});
  hand.Select(a.lstA, {});
  EXPECT_TRUE(a.lstA.Marked().empty());
  EXPECT_FALSE(hand.Select(a.lstA, {3}).Done());
}

TEST_F(HandTest, AShiftClickMarksAllLinesUpToItWithOneClick) {
  FillList();
  EXPECT_FALSE(hand.MarkThrough(a.lstA, 0, 1).Done()) << "it marks one line only";
  a.lstA.SetMulti(true);
  hand.Pick(a.lstA, 0);
  log.clear();
  hand.MarkThrough(a.lstA, 2, 1);
  EXPECT_EQ(a.lstA.Marked(), (std::set<int>{1, 2}));
  EXPECT_EQ(a.lstA.Index(), 1);
  EXPECT_EQ(Happened(), Log{"click lstA"});
  EXPECT_FALSE(hand.MarkThrough(a.lstA, 0, 3).Done());
}

TEST_F(HandTest, ADoubleClickComesAfterItsClick) {
  hand.DoubleClick(a.cmdA);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA", "click cmdA", "dblclick cmdA"}));
  FillList();
  hand.PickTwice(a.lstA, 0);
  EXPECT_EQ(Happened(), (Log{"lost cmdA", "got lstA", "click lstA", "dblclick lstA"}));
}

TEST_F(HandTest, ADoubleClickWhoseClickClosesTheScreenEndsThere) {
  BenchScreen& b = Show("frmB");
  b.cmdA.Click = [&] { screens.Unload(b); };
  EXPECT_TRUE(hand.DoubleClick(b.cmdA).Done());
  EXPECT_EQ(screens.Find("frmB"), nullptr);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA", "activate frmA", "unload frmB"}));
}

TEST_F(HandTest, ADoubleClickWhoseClickDisablesTheControlEndsThere) {
  a.cmdA.Click = [this] { a.cmdA.Disable(); };
  hand.DoubleClick(a.cmdA);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA"}));
}

TEST_F(HandTest, ADateFiresChangeOnlyWhenItIsAnother) {
  hand.PickDate(a.datA, Date{38077});
  hand.PickDate(a.datA, Date{38077});
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got datA", "change datA"}));
}

TEST_F(HandTest, ACellBecomesTheCurrentOneBeforeItsClick) {
  a.grdA.SetSize(3, 3);
  int row = 0;
  a.grdA.Click = [&] { row = a.grdA.Row(); };
  hand.ClickCell(a.grdA, 2, 1);
  EXPECT_EQ(row, 2);
  EXPECT_FALSE(hand.ClickCell(a.grdA, 3, 0).Done());
}

TEST_F(HandTest, EnterInAnEntryBoxIsATab) {
  hand.Press(Key::Enter);
  EXPECT_EQ(Focus(), "txtB");
  hand.Press(Key::Enter);
  EXPECT_EQ(Focus(), "cboFree");
  hand.Press(Key::Enter);
  EXPECT_EQ(Focus(), "cboLocked");
}

TEST_F(HandTest, EnterOnACommandClicksItAndElsewhereTheDefault) {
  a.Defaults = {&a.cmdA, &a.cmdB};
  hand.Focus(a.cmdB);
  log.clear();
  hand.Press(Key::Enter);
  EXPECT_EQ(Happened(), Log{"click cmdB"});
  hand.Focus(a.chkA);
  log.clear();
  hand.Press(Key::Enter);
  EXPECT_EQ(Happened(), Log{"click cmdA"});
  a.cmdA.Hide();
  hand.Press(Key::Enter);
  EXPECT_EQ(Happened(), Log{"click cmdB"}) << "the first live one";
}

TEST_F(HandTest, EscAndF1ClickTheirCommands) {
  a.Cancels = {&a.cmdB};
  a.Helps = {&a.cmdA};
  hand.Press(Key::Escape);
  hand.Press(Key::F1);
  EXPECT_EQ(Happened(), (Log{"click cmdB", "click cmdA"}));
  a.cmdA.Disable();
  hand.Press(Key::F1);
  EXPECT_EQ(Happened(), Log{});
}

TEST_F(HandTest, TabGoesRoundInTheOrderOfDeclarationPastWhatIsNotLive) {
  a.txtB.Hide();
  a.cboFree.Disable();
  hand.Press(Key::Tab);
  EXPECT_EQ(Focus(), "cboLocked");
  hand.Press(Key::BackTab);
  EXPECT_EQ(Focus(), "txtA");
  hand.Press(Key::BackTab);
  EXPECT_EQ(Focus(), "cmdB") << "round the corner";
  hand.Press(Key::Tab);
  EXPECT_EQ(Focus(), "txtA");
  EXPECT_EQ(Happened().front(), "lost txtA");
}

TEST_F(HandTest, TabStopsAtTheSelectedOptionOnly) {
  a.opt1.SetValue(true);
  hand.Focus(a.chkA);
  hand.Press(Key::Tab);
  EXPECT_EQ(Focus(), "opt(1)");
  hand.Press(Key::Tab);
  EXPECT_EQ(Focus(), "other");
}

TEST_F(HandTest, ArrowsGoFromOptionToOptionAndSelect) {
  hand.Click(a.opt0);
  log.clear();
  hand.Press(Key::Down);
  EXPECT_TRUE(a.opt1.Value());
  EXPECT_EQ(Happened(), (Log{"lost opt(0)", "got opt(1)", "click opt(1)"}));
  a.opt0.Disable();
  hand.Press(Key::Up);
  EXPECT_TRUE(a.opt1.Value()) << "there is no live one above";
}

TEST_F(HandTest, AnArrowDoesNotSelectWhereLeavingShowsABox) {
  hand.Click(a.opt0);
  a.opt0.LostFocus = [this] { Box("stay"); };
  hand.Press(Key::Down);
  EXPECT_TRUE(a.opt0.Value());
}

TEST_F(HandTest, ArrowsGoFromPictureToPictureWithoutAClick) {
  hand.Focus(a.imgA);
  log.clear();
  hand.Press(Key::Down);
  EXPECT_EQ(Happened(), (Log{"lost imgA", "got imgB"}));
  hand.Press(Key::Down);
  EXPECT_EQ(Focus(), "imgB");
}

TEST_F(HandTest, ArrowsMoveTheLineOfAList) {
  FillList();
  hand.Focus(a.lstA);
  log.clear();
  hand.Press(Key::Down);
  EXPECT_EQ(a.lstA.Index(), 0);
  EXPECT_EQ(Happened(), Log{"click lstA"});
  hand.Press(Key::Up);
  EXPECT_EQ(Happened(), Log{}) << "it stands on the first line already";
}

TEST_F(HandTest, AnyKeyThatComesUpInAListTellsIt) {
  FillList();
  hand.Focus(a.lstA);
  log.clear();
  hand.Strike(Key::Down);
  EXPECT_EQ(Happened(), (Log{"click lstA", "keyup lstA"}));
  hand.Strike(Key::Up);
  EXPECT_EQ(Happened(), Log{"keyup lstA"}) << "it stands on the first line already";
  hand.Strike(Key::Enter);
  EXPECT_EQ(Happened(), Log{"keyup lstA"});
}

TEST_F(HandTest, AKeyComesUpWhereTheFocusIsByThen) {
  hand.Focus(a.other);
  log.clear();
  hand.Strike(Key::Tab);
  EXPECT_EQ(Happened(), (Log{"lost other", "got lstA", "keyup lstA"}));
  hand.Strike(Key::Tab);
  EXPECT_EQ(Happened(), (Log{"lost lstA", "got grdA"})) << "only lists want to know";
}

TEST_F(HandTest, AKeyThatCallsUpABoxComesUpInThat) {
  FillList();
  hand.Focus(a.lstA);
  a.lstA.Click = [this] { Box("none"); };
  log.clear();
  hand.Strike(Key::Down);
  EXPECT_EQ(Happened(), Log{"box none"});
}

TEST_F(HandTest, AKeyOfAListThatIsGoneTellsNobody) {
  FillList();
  hand.Focus(a.lstA);
  a.lstA.Click = [this] { screens.Unload(a); };
  log.clear();
  hand.Strike(Key::Down);
  EXPECT_EQ(Happened(), Log{"unload frmA"});
}

TEST_F(HandTest, AnArrowInAnEmptyListDoesNothing) {
  hand.Focus(a.lstA);
  log.clear();
  hand.Press(Key::Down);
  hand.Press(Key::Up);
  EXPECT_EQ(a.lstA.Index(), -1);
  EXPECT_EQ(Happened(), Log{});
}

TEST_F(HandTest, AListThatPicksOnEnterMovesACursorUntilThen) {
  FillList();
  a.lstA.SetPicksOnEnter(true);
  hand.Focus(a.lstA);
  log.clear();
  hand.Press(Key::Down);
  EXPECT_EQ(a.lstA.Index(), -1);
  EXPECT_EQ(Happened(), Log{});
  hand.Press(Key::Enter);
  EXPECT_EQ(a.lstA.Index(), 1);
  EXPECT_EQ(Happened(), Log{"click lstA"});
  a.lstA.Clear();
  a.lstA.AddLine("last");
  EXPECT_EQ(a.lstA.Cursor(), 0) << "never below the last line";
}

TEST_F(HandTest, EnterGoesToAListOrATableThatWantsIt) {
  FillList();
  a.grdA.SetSize(2, 2);
  a.lstA.Entered = [this] { log.push_back("entered lstA"); };
  a.grdA.Entered = [this] { log.push_back("entered grdA"); };
  hand.Pick(a.lstA, 1);
  log.clear();
  hand.Press(Key::Enter);
  EXPECT_EQ(a.lstA.Index(), 1);
  hand.ClickCell(a.grdA, 1, 1);
  hand.Press(Key::Enter);
  EXPECT_EQ(Happened(),
            (Log{"entered lstA", "lost lstA", "got grdA", "click grdA", "entered grdA"}));
}

TEST_F(HandTest, TheArrowsGoOnWhereEnterHasTakenALineAway) {
  FillList();
  a.lstA.Entered = [this] { a.lstA.RemoveLine(a.lstA.Index()); };
  hand.Pick(a.lstA, 1);
  const std::string next = a.lstA.Line(2);
  hand.Press(Key::Enter);
  EXPECT_EQ(a.lstA.Index(), -1);
  hand.Press(Key::Down);
  EXPECT_EQ(a.lstA.Line(a.lstA.Index()), next);
}

TEST_F(HandTest, AMnemonicGoesToItsControl) {
  hand.PressMnemonic('v');
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA", "click cmdA"}));
  hand.PressMnemonic('S');
  EXPECT_EQ(Focus(), "txtB");
  EXPECT_FALSE(hand.PressMnemonic('x').Done());
  EXPECT_FALSE(hand.PressMnemonic('b').Done()) << "a label's words are no command";
}

TEST_F(HandTest, AMnemonicOpensAMenuAndThenPicksAnEntry) {
  EXPECT_FALSE(hand.PressMnemonic('n').Done()) << "the menu is closed";
  hand.PressMnemonic('f');
  hand.PressMnemonic('n');
  EXPECT_EQ(Happened(), Log{"click mnuNew"});
  hand.PressMnemonic('f');
  hand.Click(a.cmdB);
  EXPECT_FALSE(hand.PressMnemonic('n').Done()) << "a click has closed it";
  a.mnuHelp.Disable();
  EXPECT_FALSE(hand.PressMnemonic('h').Done());
}

TEST(MnemonicOf, IsTheLetterAfterASingleMark) {
  EXPECT_EQ(MnemonicOf("&Save"), 'S');
  EXPECT_EQ(MnemonicOf("E&xit"), 'X');
  EXPECT_EQ(MnemonicOf("Pegs && L&egs"), 'E');
  EXPECT_EQ(MnemonicOf("Home & Away"), 0);
  EXPECT_EQ(MnemonicOf("Darts &"), 0);
  EXPECT_EQ(MnemonicOf("&&"), 0);
  EXPECT_EQ(MnemonicOf(""), 0);
}

TEST_F(HandTest, TheControlThatAScreenOpensOnLosesTheFocusWithAnEvent) {
  BenchScreen& b = Show("frmB");
  hand.Click(b.txtB);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got txtB", "click txtB"}));
}

TEST_F(HandTest, AFocusSetBeforeTheScreenIsShownIsWhereItOpens) {
  screens.Load("frmB");
  B().txtB.SetFocus();
  BenchScreen& b = Show("frmB");
  EXPECT_EQ(Focus(), "txtB");
  hand.Click(b.cmdA);
  EXPECT_EQ(Happened(), (Log{"lost txtB", "got cmdA", "click cmdA"}));
}

TEST_F(HandTest, WhenTheFocusedControlGoesTheFocusGoesToTheNext) {
  a.cmdA.Click = [this] { a.cmdA.Disable(); };
  hand.Click(a.cmdA);
  EXPECT_EQ(Focus(), "cmdB");
}

TEST_F(HandTest, SettingTheFocusWhereItCannotGoDoesNothing) {
  a.txtB.Disable();
  a.txtB.SetFocus();
  a.opt0.SetFocus();
  EXPECT_EQ(Focus(), "opt(0)");
  a.fraA.Hide();
  a.opt1.SetFocus();
  a.lblA.SetFocus();
  EXPECT_EQ(Focus(), "none");
}

TEST_F(HandTest, HoveringNeedsALiveControl) {
  a.cmdA.Disable();
  EXPECT_FALSE(hand.Hover(a.cmdA).Done());
  EXPECT_EQ(Happened(), Log{});
  a.cmdA.Enable();
  EXPECT_TRUE(hand.Hover(a.cmdA).Done());
  EXPECT_EQ(Happened(), Log{"hover cmdA"});
  EXPECT_TRUE(hand.HoverScreen(a).Done());
  EXPECT_EQ(Happened(), Log{"mouse frmA"});
  a.cmdA.Hide();
  EXPECT_FALSE(hand.Hover(a.cmdA).Done());
}

}  // namespace
}  // namespace marlowbeck
