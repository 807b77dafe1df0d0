#include "ui/screens.h"

#include <new>
#include <stdexcept>

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "tests/ui/workbench.h"

namespace marlowbeck {
namespace {

class ScreensTest : public testing::Test, protected Workbench {
 protected:
  BenchScreen& a = A();
};

TEST_F(ScreensTest, AScreenIsLoadedOnceAndActivatedAtEachShowing) {
  screens.Show("frmB");
  EXPECT_EQ(Happened(), (Log{"load frmB", "activate frmB"}));
  screens.Hide(B());
  EXPECT_EQ(Happened(), Log{"activate frmA"});
  screens.Show("frmB");
  EXPECT_EQ(Happened(), Log{"activate frmB"});
}

TEST_F(ScreensTest, HidingTheLastOneActivatesNothing) {
  screens.Hide(a);
  EXPECT_EQ(Happened(), Log{});
  EXPECT_EQ(screens.Front(), nullptr);
  EXPECT_EQ(Focus(), "none");
}

TEST_F(ScreensTest, HidingOneThatIsNotInFrontActivatesNothing) {
  Show("frmB");
  screens.Hide(a);
  EXPECT_EQ(Happened(), Log{});
  EXPECT_EQ(screens.Front(), &B());
}

TEST_F(ScreensTest, UnloadingActivatesTheOneBehindAndTellsTheOpener) {
  BenchScreen& b = Show("frmB");
  b.Closed = [this] { log.push_back("closed"); };
  screens.Unload(b);
  EXPECT_EQ(Happened(), (Log{"activate frmA", "unload frmB", "closed"}));
  EXPECT_EQ(screens.Find("frmB"), nullptr);
  screens.Unload(b);
  EXPECT_EQ(Happened(), Log{}) << "it is on its way out already";
}

TEST_F(ScreensTest, AScreenMayUnloadItselfInTheMiddleOfAHandler) {
  BenchScreen& b = Show("frmB");
  b.cmdA.Click = [&b, this] {
    screens.Unload(b);
    b.lblA.SetCaption("still there");
    log.push_back(b.lblA.Caption());
  };
  hand.Click(b.cmdA);
  EXPECT_EQ(Happened().back(), "still there");
  EXPECT_EQ(screens.Loaded().size(), 1U);
}

TEST_F(ScreensTest, AScreenLoadedAgainInTheSameEventIsANewOne) {
  BenchScreen& b = Show("frmB");
  b.txtA.SetText("old");
  b.cmdA.Click = [&b, this] {
    screens.Unload(b);
    screens.Show("frmB");
  };
  hand.Click(b.cmdA);
  EXPECT_EQ(B().txtA.Text(), "");
  EXPECT_EQ(screens.Front(), &B());
}

TEST_F(ScreensTest, AnUnknownScreenOpensNothing) {
  EXPECT_FALSE(screens.Knows("frmNone"));
  EXPECT_TRUE(screens.Knows("FRMB"));
  EXPECT_EQ(screens.Show("frmNone"), nullptr);
  EXPECT_EQ(screens.Front(), &a);
}

TEST_F(ScreensTest, ShowingQuietlyActivatesNothingNeitherComingNorGoing) {
  screens.Load("frmB");
  log.clear();
  screens.ShowQuietly("frmB");
  EXPECT_EQ(screens.Front(), &B());
  screens.HideQuietly(B());
  EXPECT_EQ(screens.Front(), &a);
  EXPECT_EQ(Happened(), Log{});
}

TEST_F(ScreensTest, NothingIsShownOnceTheProgramHasEnded) {
  screens.End();
  EXPECT_EQ(screens.Show("frmB"), nullptr);
  EXPECT_EQ(Happened(), Log{});
}

TEST_F(ScreensTest, AnErrorGivesUpTheWholeEventAndTheNextOneWorks) {
  a.txtB.Change = [] { throw RunTimeError(ErrorNumber::DiskFull); };
  a.cmdA.Click = [this] {
    a.txtB.SetText("x");
    log.push_back("after");
  };
  hand.Click(a.cmdA);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA", "error 61", "box error"}));
  hand.Click(a.cmdB);
  EXPECT_EQ(Happened().back(), "click cmdB");
}

TEST_F(ScreensTest, AnErrorInAnActivationDoesNotGiveUpWhatCausedIt) {
  struct Failing : Screen {
    explicit Failing(Screens& in) : Screen(in, "frmC", "") {}
    void Load() override { throw RunTimeError(53); }
    void Activate() override { throw RunTimeError(76); }
  };
  screens.Register("frmC", [](Screens& in) { return std::make_unique<Failing>(in); });
  a.cmdA.Click = [this] {
    screens.Show("frmC");
    log.push_back("after");
  };
  hand.Click(a.cmdA);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA", "error 53", "box error", "error 76",
                             "box error", "after"}));
}

TEST_F(ScreensTest, FaultsOfOurOwnAndLackOfMemoryReachTheErrorBoxToo) {
  a.cmdA.Click = [] { throw std::bad_alloc(); };
  a.cmdB.Click = [] { throw std::out_of_range("place"); };
  hand.Click(a.cmdA);
  hand.Click(a.cmdB);
  EXPECT_EQ(Happened(), (Log{"lost txtA", "got cmdA", "error 7", "box error", "lost cmdA",
                             "got cmdB", "error 51", "box error"}));
}

TEST_F(ScreensTest, ACloseButtonUnloadsUnlessTheScreenSaysOtherwise) {
  hand.CloseScreen(Show("frmB"));
  EXPECT_EQ(screens.Find("frmB"), nullptr);
  screens.Hide(a);
  EXPECT_FALSE(hand.CloseScreen(a).Done()) << "it is hidden";
}

TEST_F(ScreensTest, TheFocusOfAScreenIsKeptWhileItIsHidden) {
  hand.Focus(a.txtB);
  screens.Hide(a);
  Show("frmA");
  EXPECT_EQ(Focus(), "txtB");
}

TEST_F(ScreensTest, OnlyTheFrontScreenHasTheFocus) {
  hand.Focus(a.txtB);
  BenchScreen& b = Show("frmB");
  EXPECT_EQ(screens.Focus(), &b.txtA);
  hand.Click(a.cmdA);
  EXPECT_EQ(screens.Focus(), &a.cmdA) << "a click brings its screen to the front";
}

}  // namespace
}  // namespace marlowbeck
