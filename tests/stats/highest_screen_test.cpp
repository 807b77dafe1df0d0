// The six lists of the highest, for one date and progressive.

#include "stats/lists.h"

namespace marlowbeck {
namespace {

using HighestLists = ListsTest;
using Rows = std::vector<Club::TextList>;

TEST_F(HighestLists, OpenWithTheLatestDateOfTheFirstGrade) {
  LayClub();
  OpenList();
  EXPECT_EQ(Title("frmPMenu"), "[Marlowbeck] Highest Averages");
  EXPECT_EQ(InSession("ReportChoice"), 0);
  EXPECT_EQ(Caption("fraPikHi"), "Highest Averages");
  EXPECT_EQ(Lines("cboHiGrade"), (TextList{"A", "B"}));
  EXPECT_EQ(Lines("lstHiDates"), (TextList{"17/03/2004", "24/03/2004"}));
  EXPECT_EQ(Index("lstHiDates"), 1);
  EXPECT_FALSE(Shown("fraMenu"));
  EXPECT_TRUE(Shown("fraFontPick"));
  EXPECT_EQ(Caption("lblSeason"), "Winter 2004 ");
  EXPECT_TRUE(Shown("lblSeason"));
  EXPECT_TRUE(Enabled("cmdHiPrint"));
  EXPECT_TRUE(Enabled("cmdClipHi"));
  EXPECT_FALSE(Shown("picPrintHI"));
  EXPECT_FALSE(Shown("FraCombineOptions"));
  EXPECT_FALSE(Shown("cmdReDoAvgs"));
}

TEST_F(HighestLists, CaptionsOfTheControls) {
  LayClub();
  OpenList();
  const std::vector<std::pair<std::string, std::string>> captions = {
      {"cboHiGrade", "Select Grade:"},
      {"lstHiDates", "Select Date:"},
      {"cmdHiPrint", "Print"},
      {"cmdClipHi", "Copy to Clipboard"},
      {"cmdExitHi", "Help"},
      {"cmdHiMenu", "Exit"},
      {"cmdProgress", "Progressive"},
      {"cmdHcap", "Handicaps"},
      {"optCombineAvg", "List by Average"},
      {"optCombineAlpha", "Alphabetical List"}};
  for (const auto& [control, caption] : captions) {
    EXPECT_EQ(ScreensOf().Find("frmPMenu")->Find(control)->Caption(), caption) << control;
  }
}

TEST_F(HighestLists, OneDateRanksTheNight) {
  LayClub();
  OpenList();
  EXPECT_EQ(Caption("lblHi(0)"), " Highest Averages  ");
  EXPECT_EQ(Caption("lblHi(1)"), " A    played on:  24/03/2004 ");
  EXPECT_EQ(Cells("grdHI"), (Rows{{"No.", "Player", "Team", "Avg"},
                                  {"1", "Clark, Ed", "Hawks", "30.00"},
                                  {"2", "Archer, Jo", "Rovers", "25.25"}}));
  EXPECT_TRUE(Shown("cmdProgress"));
  EXPECT_FALSE(Shown("cmdHcap"));
  EXPECT_EQ(InSession("HiLabel"), "Avg");
  EXPECT_EQ(InSession("RowCount"), 2);
  EXPECT_EQ(InSession("WorkDate"), "2004-03-24");
  EXPECT_EQ(File("Highest.qz3"),
            "3,\"Clark, Ed\",\"Hawks\",30,0\r\n1,\"Archer, Jo\",\"Rovers\",25.25,0\r\n");
}

TEST_F(HighestLists, EqualValuesStandAsTheSortLeavesThemWithDifferentNumbers) {
  LayClub();
  OpenList();
  Do("pick lstHiDates 0");
  // 25 A, 30 B, 25 C: C goes below B and, being equal, below A; the last comes first.
  EXPECT_EQ(Cells("grdHI"), (Rows{{"No.", "Player", "Team", "Avg"},
                                  {"1", "Baker, Al", "Rovers", "30.00"},
                                  {"2", "Archer, Jo", "Rovers", "25.00"},
                                  {"3", "Clark, Ed", "Hawks", "25.00"}}));
}

TEST_F(HighestLists, ProgressiveRanksEverythingUpToTheDate) {
  LayClub();
  OpenList();
  Do("click cmdProgress");
  EXPECT_EQ(Caption("lblHi(0)"), " PROGRESSIVE Highest Averages ");
  EXPECT_EQ(Caption("lblHi(1)"), " A  up to:  24/03/2004 ");
  EXPECT_EQ(Cells("grdHI"), (Rows{{"No.", "Player", "Team", "Avg", "Gms"},
                                  {"1", "Baker, Al", "Rovers", "30.00", "1"},
                                  {"2", "Clark, Ed", "Hawks", "27.22", "2"},
                                  {"3", "Archer, Jo", "Rovers", "25.12", "2"}}));
  EXPECT_EQ(Caption("cmdProgress"), "24/03/2004 Only");
  EXPECT_TRUE(Shown("cmdHcap"));
  EXPECT_TRUE(Enabled("cmdHcap"));
  EXPECT_EQ(Focus(), "frmPMenu.lstHiDates");
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_EQ(InSession("RowCount"), 3);
}

TEST_F(HighestLists, TheSameCommandGoesBackToTheDate) {
  LayClub();
  OpenList();
  DoAll({"click cmdProgress", "click cmdProgress"});
  EXPECT_EQ(Caption("cmdProgress"), "Progressive");
  EXPECT_EQ(Cells("grdHI").at(0).size(), 4U);
  EXPECT_EQ(Ranked(), (TextList{"Clark, Ed 30.00", "Archer, Jo 25.25"}));
  EXPECT_FALSE(Shown("cmdHcap"));
  EXPECT_EQ(Focus(), "frmPMenu.lstHiDates");
}

TEST_F(HighestLists, APickOfADateLeavesTheProgressiveList) {
  LayClub();
  OpenList();
  DoAll({"click cmdProgress", "pick lstHiDates 0"});
  EXPECT_EQ(Caption("cmdProgress"), "Progressive");
  EXPECT_EQ(Caption("lblHi(1)"), " A    played on:  17/03/2004 ");
  EXPECT_FALSE(Shown("cmdHcap"));
  Do("click cmdProgress");
  EXPECT_EQ(Caption("cmdProgress"), "17/03/2004 Only");
  EXPECT_EQ(Cells("grdHI").at(1).at(4), "1") << "later nights are passed over";
}

TEST_F(HighestLists, EachEntryOpensItsList) {
  LayClub();
  const std::vector<std::tuple<std::string, std::string, std::string, TextList, TextList>> lists = {
      {"Image3", "Highest Pegs", "Peg", {}, {}},
      {"Image2",
       "Highest Scores",
       "Score",
       {"Clark, Ed 180", "Baker, Al 140", "Archer, Jo 100"},
       {"Clark, Ed 180", "Baker, Al 140", "Archer, Jo 125"}},
      {"Image4", "Most Pegs", "Pegs", {}, {}},
      {"Image5",
       "Most Centuries",
       "100's",
       {"Baker, Al 3", "Archer, Jo 2"},
       {"Archer, Jo 6", "Baker, Al 3", "Clark, Ed 1"}},
      {"Image9", "Most 180's", "180's", {"Archer, Jo 1"}, {"Archer, Jo 1"}}};
  OpenReports();
  int choice = 0;
  for (const auto& [entry, name, heading, first_night, season] : lists) {
    Do("click " + entry);
    EXPECT_EQ(Title("frmPMenu"), "[Marlowbeck] " + name);
    EXPECT_EQ(InSession("ReportChoice"), ++choice);
    EXPECT_EQ(Caption("fraPikHi"), name);
    EXPECT_FALSE(Shown("cmdCombine")) << name;
    Do("pick lstHiDates 0");
    if (!first_night.empty()) {
      EXPECT_EQ(Row("grdHI", 0), (TextList{"No.", "Player", "Team", heading}));
      EXPECT_EQ(Ranked(), first_night) << name;
      EXPECT_EQ(Caption("lblHi(0)"), " " + name + "  ");
      DoAll({"pick lstHiDates 1", "click cmdProgress"});
      EXPECT_EQ(Ranked(), season) << name;
      EXPECT_FALSE(Shown("cmdHcap")) << name;
    }
    Do("click cmdHiMenu");
  }
}

TEST_F(HighestLists, PegsAreHeadedOneWayByDateAndAnotherUpToIt) {
  LayClub();
  auto results = Results("Winter_A.qzr");
  results[3].Pegs = {40, 0, 121, 0, 8, 0};
  results[0].Pegs = {0, 24, 0, 0, 0, 0};
  WriteResults("Winter_A.qzr", results);
  OpenList("Image3");
  EXPECT_EQ(Cells("grdHI"),
            (Rows{{"No.", "Player", "Team", "Peg"}, {"1", "Archer, Jo", "Rovers", "121"}}));
  Do("click cmdProgress");
  EXPECT_EQ(Row("grdHI", 0), (TextList{"No.", "Player", "Team", "Hi Peg", "Gms"}));
  EXPECT_EQ(InSession("HiLabel"), "Hi Peg");
  DoAll({"click cmdHiMenu", "click Image4", "click cmdProgress"});
  EXPECT_EQ(Cells("grdHI"), (Rows{{"No.", "Player", "Team", "Pegs", "Gms"},
                                  {"1", "Archer, Jo", "Rovers", "4", "2"}}));
}

TEST_F(HighestLists, AnEmptyListSaysSoWithTheDateOnTheSecondLine) {
  LayClub();
  OpenList("Image9");
  EXPECT_TRUE(Shown("lblNoneFound"));
  EXPECT_EQ(Caption("lblNoneFound"), "  No Most 180's found for A  \r  On 24/03/2004. ");
  EXPECT_FALSE(Shown("fraHi"));
  EXPECT_EQ(InSession("RowCount"), 0);
  EXPECT_EQ(File("Highest.qz3"), "");
  Do("pick lstHiDates 0");
  EXPECT_FALSE(Shown("lblNoneFound"));
  EXPECT_EQ(Ranked(), (TextList{"Archer, Jo 1"}));
}

TEST_F(HighestLists, ANightOfForfeitsAloneIsEmpty) {
  LayClub();
  WriteResults("Winter_A.qzr", {ForfeitNight(1, "Rovers", "Hawks", kFirstNight)});
  OpenList();
  EXPECT_EQ(Caption("lblNoneFound"), "  No Highest Averages found for A  \r  On 17/03/2004. ");
  Do("click cmdProgress");
  EXPECT_EQ(Caption("cmdProgress"), "17/03/2004 Only");
  EXPECT_FALSE(Shown("fraHi"));
  EXPECT_FALSE(Shown("cmdHcap"));
  EXPECT_TRUE(Shown("lblNoneFound"));
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(HighestLists, AnEmptyListHasNothingToPrintOrToCopy) {
  LayClub();
  OpenList("Image9");
  Do("click cmdHiPrint");
  EXPECT_TRUE(Events().empty());
  EXPECT_FALSE(Shown("picPrintHI"));
  Do("click cmdClipHi");
  EXPECT_TRUE(Events().empty());
}

TEST_F(HighestLists, AnotherGradeHasItsOwnDatesAndList) {
  LayClub();
  OpenList();
  Do("pick cboHiGrade =B");
  EXPECT_EQ(Lines("lstHiDates"), (TextList{"17/03/2004"}));
  EXPECT_EQ(Ranked(), (TextList{"Dean, Di 20.00"}));
  EXPECT_EQ(Caption("lblHi(1)"), " B    played on:  17/03/2004 ");
}

TEST_F(HighestLists, KeepTheSeasonsTitleOfTheFirstGrade) {
  LayClub();
  OpenList();
  Do("pick cboHiGrade =B");
  EXPECT_EQ(Caption("lblSeason"), "Winter 2004 ");
  Do("click cmdClipHi");
  EXPECT_TRUE(EventsNamed("clipboard")
                  .back()
                  .get<std::string>()
                  .starts_with("Marlow Darts\r\nWinter 2004\r\n"));
}

TEST_F(HighestLists, KeepDatesAsTheRecordsLieAndListOneAgainThatComesAgain) {
  LayClub();
  WriteResults("Winter_A.qzr", {Night(1, "Rovers", "Hawks", kSecondNight, 500, 20),
                                Night(2, "Rovers", "Hawks", kSecondNight, 300, 10),
                                Night(1, "Rovers", "Hawks", kFirstNight, 500, 20),
                                Night(3, "Hawks", "Rovers", kSecondNight, 240, 8)});
  OpenList();
  EXPECT_EQ(Lines("lstHiDates"), (TextList{"24/03/2004", "17/03/2004", "24/03/2004"}));
  EXPECT_EQ(InSession("DateCount"), 3);
  EXPECT_EQ(Cells("grdHI").size(), 4U) << "the list is of the date, wherever its records lie";
}

TEST_F(HighestLists, AGradeWithoutResultsIsToldAndThePanelGoes) {
  LayClub();
  DeleteFile("Winter_B.qzr");
  OpenList();
  Do("pick cboHiGrade =B");
  EXPECT_EQ(BoxTexts(), (TextList{"No entries were found to list the B Highest Averages.    "}));
  EXPECT_EQ(Boxes().at(0).style, 48);
  EXPECT_FALSE(Shown("fraPikHi"));
  EXPECT_EQ(Get("cmdHiPrint")["enabled"], false);
  EXPECT_EQ(Get("cmdClipHi")["enabled"], false);
}

TEST_F(HighestLists, OnceThePanelHasGoneClosingAndEscLeadBackToTheMenu) {
  LayClub();
  DeleteFile("Winter_B.qzr");
  OpenReports();
  for (const char* way : {"close frmPMenu", "key Esc"}) {
    DoAll({"click Image1", "pick cboHiGrade =B"});
    EXPECT_FALSE(Shown("fraPikHi")) << way;
    Do(way);
    EXPECT_EQ(Front(), "frmPMenu") << way;
    EXPECT_TRUE(Shown("fraMenu")) << way;
    EXPECT_EQ(Title("frmPMenu"), "[Marlowbeck] Reports") << way;
  }
  Do("key Esc");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(HighestLists, AFirstGradeWithoutResultsLeavesThePanelForAnotherOne) {
  LayClub();
  DeleteFile("Winter_A.qzr");
  OpenList();
  EXPECT_EQ(BoxTexts(), (TextList{"No entries were found to list the A Highest Averages.    "}));
  EXPECT_TRUE(Shown("fraPikHi"));
  EXPECT_FALSE(Enabled("cmdHiPrint"));
  Do("pick cboHiGrade =B");
  EXPECT_EQ(Ranked(), (TextList{"Dean, Di 20.00"}));
  EXPECT_TRUE(Enabled("cmdHiPrint"));
}

// A visit to the ladder leaves 1 in the Flag, which would make the first list a progressive one.
TEST_F(HighestLists, OpenWithOneDateWhateverAnotherScreenLeftInTheFlag) {
  LayClub();
  DoAll({"click imgLadder", "click cmdGotoResults", "click cmdExit"});
  ASSERT_EQ(InSession("Flag"), 1);
  OpenList();
  EXPECT_EQ(Cells("grdHI"), (Rows{{"No.", "Player", "Team", "Avg"},
                                  {"1", "Clark, Ed", "Hawks", "30.00"},
                                  {"2", "Archer, Jo", "Rovers", "25.25"}}));
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(HighestLists, WithoutAGradeThereIsNothingToPickAndNothingIsAsked) {
  LayClub();
  OpenList();
  Do("click cmdHiMenu");
  WritePlayers("Winter.qza", {});
  Do("click Image1");
  EXPECT_EQ(Lines("cboHiGrade"), TextList{});
  EXPECT_EQ(Lines("lstHiDates"), TextList{});
  EXPECT_EQ(Count("input") + Count("box"), 0);
  EXPECT_FALSE(Enabled("cmdHiPrint"));
  EXPECT_FALSE(Shown("cmdProgress"));
  Do("click cmdHiMenu");
  EXPECT_TRUE(Shown("fraMenu"));
}

TEST_F(HighestLists, APlayerWhoIsGoneStandsWithoutAName) {
  LayClub();
  auto players = Players("Winter.qza");
  players.erase(players.begin() + 2);
  WritePlayers("Winter.qza", players);
  OpenList();
  EXPECT_EQ(Row("grdHI", 1), (TextList{"1", "", "Hawks", "30.00"}));
  Do("click cmdProgress");
  EXPECT_EQ(Ranked(), (TextList{"Baker, Al 30.00", "Archer, Jo 25.12"}));
}

TEST_F(HighestLists, APlayerWhoMovedStandsByDateWithTheOldTeamAndProgressivelyWithTheNew) {
  LayClub();
  auto players = Players("Winter.qza");
  players[2].Team = "Crows";
  players[2].Grade = "B";
  WritePlayers("Winter.qza", players);
  OpenList();
  EXPECT_EQ(Row("grdHI", 1), (TextList{"1", "Clark, Ed", "Hawks", "30.00"}));
  Do("click cmdProgress");
  EXPECT_EQ(Row("grdHI", 2), (TextList{"2", "Clark, Ed", "Crows", "27.22", "2"}));
}

TEST_F(HighestLists, TheFileIsOneWhateverTheCaseOfItsName) {
  LayClub();
  WriteFile("hIGHEST.QZ3", "1,\"Ghost, A\",\"x\",1,0\r\n");
  OpenList();
  EXPECT_EQ(Ranked(), (TextList{"Clark, Ed 30.00", "Archer, Jo 25.25"}));
  EXPECT_EQ(File("hIGHEST.QZ3"),
            "3,\"Clark, Ed\",\"Hawks\",30,0\r\n1,\"Archer, Jo\",\"Rovers\",25.25,0\r\n");
  EXPECT_FALSE(HasFile("Highest.qz3"));
}

TEST_F(HighestLists, NamesWithQuotesAndCommasComeThrough) {
  LayClub();
  auto players = Players("Winter.qza");
  players[2].Surname = "Cox \"Ace\"";
  players[2].FirstName = "A, B";
  WritePlayers("Winter.qza", players);
  OpenList();
  EXPECT_EQ(Row("grdHI", 1)[1], "Cox \"Ace\", A, B");
}

TEST_F(HighestLists, HelpIsThePageOfTheList) {
  LayClub();
  OpenReports();
  for (const auto& [entry, topic] : std::vector<std::pair<std::string, int>>{{"Image1", 265},
                                                                             {"Image3", 265},
                                                                             {"Image2", 265},
                                                                             {"Image4", 305},
                                                                             {"Image5", 305},
                                                                             {"Image9", 305}}) {
    DoAll({"click " + entry, "click cmdExitHi"});
    ASSERT_EQ(EventsNamed("help").size(), 1U) << entry;
    EXPECT_EQ(EventsNamed("help")[0]["file"], "qz1.HLP");
    EXPECT_EQ(EventsNamed("help")[0]["topic"], topic) << entry;
    Do("click cmdHiMenu");
  }
}

TEST_F(HighestLists, ExitLeavesCombineShownAndTheNextListHidesItUnlessItIsOfAverages) {
  LayClub();
  OpenList();
  EXPECT_TRUE(Shown("cmdCombine"));
  Do("click cmdHiMenu");
  EXPECT_EQ(Get("cmdCombine")["visible"], true);
  Do("click Image2");
  EXPECT_EQ(Get("cmdCombine")["visible"], false);
  DoAll({"click cmdHiMenu", "click Image1"});
  EXPECT_TRUE(Shown("cmdCombine"));
}

TEST_F(HighestLists, TheDatePickedStaysTheWorkDate) {
  LayClub();
  OpenList();
  DoAll({"pick lstHiDates 0", "click cmdHiMenu", "click Image10"});
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-17#\r\n");
}

TEST_F(HighestLists, EverythingIsWorkedOutAfresh) {
  LayClub();
  OpenList();
  WriteResults("Winter_A.qzr", {Night(2, "Rovers", "Hawks", kSecondNight, 330, 10)});
  Do("pick lstHiDates 1");
  EXPECT_EQ(Ranked(), (TextList{"Baker, Al 33.00"}));
}

}  // namespace
}  // namespace marlowbeck
