#include "session/season.h"

#include "support/club.h"
#include "support/record_files.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kTitleFile = "Winter_A Grade.qzs";

/// A screen that reports, as far as the season's title goes.
struct Reporter : Screen {
  Reporter(Screens& screens, const Context& context) : Screen(screens, "frmPlayersLists", "") {
    cmdReport.Click = [&context] {
      context.session.Grade = "A Grade";
      context.session.SeasonFile = "Winter_A Grade.qzs";
      GetSeason(context);
    };
  }
  Command cmdReport{*this, "cmdReport", "Report"};
};

/// Holds for the models alone: a screen of the test's own has no form.
class GetSeasonTest : public ::testing::Test, protected Club {
 protected:
  GetSeasonTest() : Club(ModelFaceAlone()) {
    registration = [](Screens& screens, const Context& context) {
      RegisterScreens(screens, context);
      screens.Register("frmPlayersLists",
                       [&context](Screens& in) { return std::make_unique<Reporter>(in, context); });
    };
    WritePlayers("Winter.qza", {Player(1, "Archer", "Jo", "Rovers", "A Grade")});
    NameOpenFile("Winter.qza");
  }

  void Report() {
    Do("click mnuPlayersLists");
    Do("click cmdReport");
  }
};

TEST_F(GetSeasonTest, ATitleThatIsThereIsReadWithoutAWord) {
  WriteFile(kTitleFile, "\"Winter 2004\"\r\n");
  Report();
  EXPECT_TRUE(Events().empty());
  EXPECT_EQ(InSession("SeasonDescription"), "Winter 2004");
}

TEST_F(GetSeasonTest, AMissingTitleIsAskedForAndSaved) {
  Do("input Winter 2004");
  Report();
  const Json asked = EventsNamed("input").at(0);
  EXPECT_EQ(asked["title"], "Competition Name");
  EXPECT_EQ(asked["prompt"],
            "Enter a title that describes the Year and Season Name\r"
            "of the competition for A Grade.\r\r"
            "eg: Men's Summer Comp  2000 / 2001.    \r\r"
            "(This will appear on most printed output).    ");
  EXPECT_EQ(asked["default"], "");
  EXPECT_EQ(InSession("SeasonDescription"), "Winter 2004");
  EXPECT_EQ(File(kTitleFile), "\"Winter 2004\"\r\n");
}

TEST_F(GetSeasonTest, TheBoxComesBackUntilThereIsATitle) {
  DoAll({"input-cancel", "input", "input    ", "input Winter 2004"});
  Report();
  EXPECT_EQ(Count("input"), 4);
  EXPECT_EQ(InSession("SeasonDescription"), "Winter 2004");
}

TEST_F(GetSeasonTest, ItCannotBeLeftWithoutATitle) {
  Do("click mnuPlayersLists");
  EXPECT_EQ(Try("click cmdReport")["ok"], false);
  EXPECT_FALSE(HasFile(kTitleFile));
}

TEST_F(GetSeasonTest, AnEmptyFileCountsAsNone) {
  WriteFile(kTitleFile, "");
  Do("input Winter 2004");
  Report();
  EXPECT_EQ(File(kTitleFile), "\"Winter 2004\"\r\n");
}

TEST_F(GetSeasonTest, ATitleThatCannotBeSavedIsTold) {
  Do("click mnuPlayersLists");
  Do("input Winter 2004");
  Do("fault write 1 61");
  Do("click cmdReport");
  EXPECT_EQ(BoxTexts(), std::vector<std::string>{"DISK FULL    "});
  EXPECT_FALSE(HasFile(kTitleFile));
}

}  // namespace
}  // namespace marlowbeck
