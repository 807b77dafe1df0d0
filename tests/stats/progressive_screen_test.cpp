#include "stats/reports.h"

namespace marlowbeck {
namespace {

using ProgressiveReport = ReportsTest;
using TextList = Club::TextList;

TEST_F(ProgressiveReport, StandsBesideTheNightUpToItsDate) {
  LayRovers();
  OpenWeekly();
  EXPECT_EQ(Caption("lblProgInfo"), "Rovers  Progressive details to:  24/03/2004");
  EXPECT_EQ(Row("grdProg", 1),
            (TextList{"Baker, Al", "300", "10", "", "", "", "", "", "2", "30.00"}));
  EXPECT_EQ(Row("grdProg", 2),
            (TextList{"Archer, Jo", "1005", "40", "", "", "", "", "", "2", "25.12"}));
}

TEST_F(ProgressiveReport, OnTheFirstDateEqualsThatNightWithOneGame) {
  LayRovers();
  OpenWeekly();
  Do("pick lstAllDates 0");
  EXPECT_EQ(Row("grdProg", 2),
            (TextList{"Archer, Jo", "500", "20", "", "", "", "", "", "1", "25.00"}));
  EXPECT_FALSE(Shown("fraFFYesNo"));
}

TEST_F(ProgressiveReport, APlayerWithoutAResultHasNoRowButALineInTheFile) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {Night(1, "Rovers", "Hawks", kFirstNight, 500, 20)});
  OpenWeekly();
  EXPECT_EQ(Cells("grdProg").size(), 2U);
  EXPECT_EQ(File("progweek.qz3"),
            "\"Archer, Jo\",500,20,0,0,0,0,0,1,25\r\n\"Baker, Al\",0,0,0,0,0,0,0,0,0\r\n");
}

TEST_F(ProgressiveReport, APlayerWithAForfeitAloneHasNoRowButTheQuestionShows) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {Night(1, "Rovers", "Hawks", kFirstNight, 500, 20),
       ForfeitNight(2, "Rovers", "Hawks", kFirstNight)});
  OpenWeekly();
  EXPECT_EQ(Cells("grdProg").size(), 2U);
  EXPECT_TRUE(Shown("fraFFYesNo"));
}

TEST_F(ProgressiveReport, WithForfeitsAloneTheTableStaysAway) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A")},
      {ForfeitNight(1, "Rovers", "Hawks", kFirstNight)});
  OpenWeekly();
  EXPECT_TRUE(Shown("grdWeek"));
  EXPECT_FALSE(Shown("grdProg"));
  EXPECT_FALSE(Shown("fraFFYesNo"));
}

TEST_F(ProgressiveReport, LeavingForfeitsOutChangesTheGamesAlone) {
  LayRovers();
  OpenWeekly();
  auto expected = Cells("grdProg");
  EXPECT_TRUE(Ticked("optFFyes"));
  Do("click optFFno");
  EXPECT_FALSE(Ticked("optFFyes"));
  EXPECT_EQ(File("Forfeits.qz3"), "0\r\n");
  expected[1][8] = "1";
  EXPECT_EQ(Cells("grdProg"), expected);
  Do("click optFFyes");
  EXPECT_EQ(File("Forfeits.qz3"), "1\r\n");
  EXPECT_EQ(Row("grdProg", 1)[8], "2");
}

TEST_F(ProgressiveReport, FiveGamesOfWhichOneIsAForfeitAreFourWithoutIt) {
  std::vector<ResultRecord> results = {ForfeitNight(1, "Rovers", "Hawks", kFirstNight + 28)};
  for (int week = 0; week < 4; ++week) {
    results.push_back(Night(1, "Rovers", "Hawks", kFirstNight + 7 * week, 100, 10));
  }
  Lay({Person(1, "Archer", "Jo", "Rovers", "A")}, results);
  WriteFile("Forfeits.qz3", "0\n");
  OpenWeekly();
  EXPECT_TRUE(Ticked("optFFno"));
  EXPECT_EQ(Row("grdProg", 1)[8], "4");
}

TEST_F(ProgressiveReport, AForfeitsFileThatCannotBeReadIsWrittenWithYes) {
  LayRovers();
  for (const char* bad : {"", "no\r\n", "\"\"\r\n", ","}) {
    WriteFile("Forfeits.qz3", bad);
    OpenWeekly();
    EXPECT_TRUE(Boxes().empty()) << bad;
    EXPECT_TRUE(Ticked("optFFyes")) << bad;
    EXPECT_EQ(File("Forfeits.qz3"), "1\r\n") << bad;
    Do("click cmdCancelWK");
    Do("click Image10");
  }
}

TEST_F(ProgressiveReport, AnyNumberButZeroMeansYes) {
  LayRovers();
  WriteFile("Forfeits.qz3", "-7");
  OpenWeekly();
  EXPECT_TRUE(Ticked("optFFyes"));
  EXPECT_EQ(File("Forfeits.qz3"), "-7");
}

TEST_F(ProgressiveReport, AnAnswerThatCannotBeReadForAMomentIsNotThrownAway) {
  LayRovers();
  WriteFile("Forfeits.qz3", "0\r\n");
  OpenWeekly();
  int failed = 0;
  for (const char* kind : {"open", "read"}) {
    // Each file of a pick in turn, the answer's own among them.
    for (int nth = 1; nth <= 8; ++nth) {
      Do("fault " + std::string(kind) + " " + std::to_string(nth) + " 57");
      Do("pick lstAllDates 0");
      failed += Count("error");
      Do("fault off");
      EXPECT_EQ(File("Forfeits.qz3"), "0\r\n") << kind << " " << nth;
    }
  }
  EXPECT_GT(failed, 8);
  Do("pick lstAllDates 1");
  EXPECT_EQ(Count("error"), 0);
  EXPECT_TRUE(Ticked("optFFno"));
}

TEST_F(ProgressiveReport, TheAnswerIsReadAgainAtEachPick) {
  LayRovers();
  OpenWeekly();
  EXPECT_EQ(Row("grdProg", 1)[8], "2");
  WriteFile("Forfeits.qz3", "0\r\n");
  Do("pick lstAllDates 1");
  EXPECT_TRUE(Ticked("optFFno"));
  EXPECT_EQ(Row("grdProg", 1)[8], "1");
  WriteFile("Forfeits.qz3", "1\r\n");
  Do("pick lstAllDates 1");
  EXPECT_TRUE(Ticked("optFFyes"));
  EXPECT_EQ(Row("grdProg", 1)[8], "2");
}

TEST_F(ProgressiveReport, ADoubleClickOnYesWritesIt) {
  LayRovers();
  WriteFile("Forfeits.qz3", "-7");
  OpenWeekly();
  EXPECT_TRUE(Ticked("optFFyes"));
  Do("click optFFyes");
  EXPECT_EQ(File("Forfeits.qz3"), "-7") << "a click on the option that is selected is none";
  Do("dblclick optFFyes");
  EXPECT_TRUE(Ticked("optFFyes"));
  EXPECT_EQ(File("Forfeits.qz3"), "1\r\n");
}

TEST_F(ProgressiveReport, AQuestionThatIsShownStaysWhereATableOfNobodyLeavesItAsItWas) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {ForfeitNight(1, "Rovers", "Hawks", kFirstNight),
       ForfeitNight(2, "Rovers", "Hawks", kFirstNight),
       Night(1, "Rovers", "Swifts", kSecondNight, 505, 20)});
  OpenWeekly();
  EXPECT_TRUE(Shown("fraFFYesNo"));
  Do("pick lstAllDates 0");
  EXPECT_FALSE(Shown("grdProg"));
  EXPECT_TRUE(Shown("fraFFYesNo"));
}

TEST_F(ProgressiveReport, APlayerWhoChangedTeamStandsUnderTheNewOneAlone) {
  Lay({Person(1, "Archer", "Jo", "Hawks", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {Night(1, "Rovers", "Owls", kFirstNight, 500, 20),
       Night(2, "Rovers", "Owls", kFirstNight, 100, 10)});
  OpenWeekly();
  Do("pick cboResTeam =Rovers");
  EXPECT_EQ(Cells("grdWeek").size(), 3U);
  ASSERT_EQ(Cells("grdProg").size(), 2U);
  EXPECT_EQ(Row("grdProg", 1)[0], "Baker, Al");
}

TEST_F(ProgressiveReport, AnotherTeamWithoutForfeitsHidesTheQuestion) {
  Lay({Person(1, "Archer", "Jo", "Hawks", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
      {Night(1, "Hawks", "Rovers", kFirstNight, 500, 20),
       ForfeitNight(1, "Hawks", "Owls", kFirstNight),
       Night(2, "Rovers", "Hawks", kFirstNight, 100, 10)});
  OpenWeekly();
  EXPECT_TRUE(Shown("fraFFYesNo"));
  Do("pick cboResTeam =Rovers");
  EXPECT_FALSE(Shown("fraFFYesNo"));
}

}  // namespace
}  // namespace marlowbeck
