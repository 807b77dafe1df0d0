// All grades together, and handicaps.

#include "stats/lists.h"

namespace marlowbeck {
namespace {

using Rows = std::vector<Club::TextList>;

class CombinedGrades : public ListsTest {
 protected:
  /// Archer has played in the second grade too: 40 points there.
  void LayClubOfTwoGrades() {
    LayClub();
    auto results = Results("Winter_B.qzr");
    results.push_back(Night(1, "Bees", "Crows", kFirstNight, 400, 10));
    WriteResults("Winter_B.qzr", results);
  }
  void OpenCombined(Here here = Here::current()) {
    OpenList("Image1", here);
    Do("click cmdCombine", here);
  }
  void ExpectOneGrade(Here here = Here::current()) {
    EXPECT_TRUE(Shown("cmdCombine", here));
    EXPECT_TRUE(Shown("cmdProgress", here));
    EXPECT_FALSE(Shown("cmdReDoAvgs", here));
    EXPECT_FALSE(Shown("FraCombineOptions", here));
    EXPECT_TRUE(Enabled("lstHiDates", here));
    EXPECT_TRUE(Enabled("cboHiGrade", here));
  }
  TextList Listed(Here here = Here::current()) {
    TextList names;
    const auto cells = Cells("grdHI", here);
    for (std::size_t row = 1; row < cells.size(); ++row) names.push_back(cells[row][1]);
    return names;
  }
};

TEST_F(CombinedGrades, AreOfferedForTheAveragesOfSeveralGradesAlone) {
  LayClub();
  OpenList();
  EXPECT_TRUE(Shown("cmdCombine"));
  EXPECT_EQ(Caption("cmdCombine"), "Combine ALL Grades\rUp to: 24/03/2004");
  Do("pick lstHiDates 0");
  EXPECT_EQ(Caption("cmdCombine"), "Combine ALL Grades\rUp to: 17/03/2004");
  DoAll({"click cmdHiMenu", "click Image3"});
  EXPECT_FALSE(Shown("cmdCombine"));
}

TEST_F(CombinedGrades, AreNotOfferedForOneGrade) {
  LayClub();
  auto players = Players("Winter.qza");
  players.pop_back();
  WritePlayers("Winter.qza", players);
  OpenList();
  EXPECT_FALSE(Shown("cmdCombine"));
}

TEST_F(CombinedGrades, KeepTheAverageOfTheLastGradeAndTheGamesOfAll) {
  LayClubOfTwoGrades();
  OpenCombined();
  EXPECT_EQ(Cells("grdHI"), (Rows{{"No.", "Player", "Team", "Grade", "Gms", "Avg"},
                                  {"1", "Archer, Jo", "Rovers", "A", "3", "40.00"},
                                  {"2", "Baker, Al", "Rovers", "A", "1", "30.00"},
                                  {"3", "Clark, Ed", "Hawks", "A", "2", "27.22"},
                                  {"4", "Dean, Di", "Bees", "B", "1", "20.00"}}));
  EXPECT_EQ(File("Combine.qz3"),
            "1,\"Archer, Jo\",\"Rovers\",\"A\",40,3\r\n2,\"Baker, Al\",\"Rovers\",\"A\",30,1\r\n"
            "3,\"Clark, Ed\",\"Hawks\",\"A\",27.22,2\r\n4,\"Dean, Di\",\"Bees\",\"B\",20,1\r\n");
  EXPECT_EQ(InSession("RowCount"), 4);
}

TEST_F(CombinedGrades, SetThePanelForTheListOfAll) {
  LayClubOfTwoGrades();
  OpenList();
  DoAll({"click cmdProgress", "click cmdCombine"});
  EXPECT_EQ(Caption("lblHi(0)"), "Averages for All Grades up to");
  EXPECT_EQ(Caption("lblHi(1)"), "24/03/2004");
  for (const char* hidden : {"cmdProgress", "cmdHcap", "cmdCombine", "lblNoneFound"}) {
    EXPECT_FALSE(Shown(hidden)) << hidden;
  }
  EXPECT_TRUE(Shown("cmdReDoAvgs"));
  EXPECT_EQ(Caption("cmdReDoAvgs"), "Return to:  A");
  EXPECT_TRUE(Shown("FraCombineOptions"));
  EXPECT_TRUE(Ticked("optCombineAvg"));
  EXPECT_FALSE(Ticked("optCombineAlpha"));
  EXPECT_FALSE(Enabled("lstHiDates"));
  EXPECT_FALSE(Enabled("cboHiGrade"));
  EXPECT_TRUE(Enabled("cmdHiPrint"));
  EXPECT_TRUE(Enabled("cmdHiMenu"));
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(CombinedGrades, PassOverLaterNights) {
  LayClubOfTwoGrades();
  OpenList();
  DoAll({"pick lstHiDates 0", "click cmdCombine"});
  EXPECT_EQ(Row("grdHI", 3), (TextList{"3", "Clark, Ed", "Hawks", "A", "1", "25.00"}));
}

TEST_F(CombinedGrades, LeaveTheResultsFileOfTheLastGradeInHand) {
  LayClubOfTwoGrades();
  OpenCombined();
  EXPECT_TRUE(InSession("ResultsFile").get<std::string>().ends_with("Winter_B.qzr"));
  EXPECT_EQ(InSession("Grade"), "A");
}

TEST_F(CombinedGrades, StandFromAToZOrByAverage) {
  LayClubOfTwoGrades();
  auto players = Players("Winter.qza");
  players[0].Surname = "archer";
  WritePlayers("Winter.qza", players);
  OpenCombined();
  Do("click optCombineAlpha");
  EXPECT_EQ(Listed(), (TextList{"Baker, Al", "Clark, Ed", "Dean, Di", "archer, Jo"}))
      << "lower-case names stand after all upper-case ones";
  EXPECT_TRUE(Ticked("optCombineAlpha"));
  EXPECT_FALSE(Ticked("optCombineAvg"));
  EXPECT_EQ(File("Combine.qz3").substr(0, 14), "2,\"Baker, Al\",");
  Do("click optCombineAvg");
  EXPECT_EQ(Listed(), (TextList{"archer, Jo", "Baker, Al", "Clark, Ed", "Dean, Di"}));
  EXPECT_TRUE(Ticked("optCombineAvg"));
  EXPECT_FALSE(Ticked("optCombineAlpha"));
}

TEST_F(CombinedGrades, APressOnTheOrderThatIsSelectedDoesNothing) {
  LayClubOfTwoGrades();
  OpenCombined();
  DeleteFile("Combine.qz3");
  Do("click optCombineAvg");
  EXPECT_TRUE(Events().empty());
  EXPECT_FALSE(HasFile("Combine.qz3"));
}

TEST_F(CombinedGrades, ReturnToTheLatestDateOfTheGrade) {
  LayClubOfTwoGrades();
  OpenList();
  DoAll({"pick lstHiDates 0", "click cmdCombine", "click optCombineAlpha", "click cmdReDoAvgs"});
  ExpectOneGrade();
  EXPECT_EQ(Index("lstHiDates"), 1);
  EXPECT_EQ(Caption("cmdCombine"), "Combine ALL Grades\rUp to: 24/03/2004");
  EXPECT_EQ(Cells("grdHI").at(0), (TextList{"No.", "Player", "Team", "Avg"}));
  EXPECT_EQ(Ranked(), (TextList{"Clark, Ed 30.00", "Archer, Jo 25.25"}));
  EXPECT_TRUE(InSession("ResultsFile").get<std::string>().ends_with("Winter_A.qzr"));
}

TEST_F(CombinedGrades, ExitLeadsToTheMenuAndTheNextListIsOfOneGrade) {
  LayClubOfTwoGrades();
  OpenCombined();
  Do("click cmdHiMenu");
  EXPECT_TRUE(Shown("fraMenu"));
  for (const char* hidden : {"cmdReDoAvgs", "FraCombineOptions", "fraHi"}) {
    EXPECT_FALSE(Shown(hidden)) << hidden;
  }
  Do("click Image1");
  ExpectOneGrade();
}

TEST_F(CombinedGrades, KeepAskingTheListOfOneGradeWhetherThereIsAnything) {
  LayClubOfTwoGrades();
  WriteResults("Winter_A.qzr", {ForfeitNight(2, "Rovers", "Hawks", kFirstNight)});
  OpenList();
  EXPECT_EQ(InSession("RowCount"), 0);
  Do("click cmdCombine");
  EXPECT_TRUE(Shown("lblNoneFound"));
  EXPECT_EQ(Caption("lblNoneFound"), "  No Highest Averages found for A  \r  On 17/03/2004. ");
  EXPECT_FALSE(Shown("fraHi"));
  EXPECT_FALSE(HasFile("Combine.qz3"));
  ExpectOneGrade();
}

TEST_F(CombinedGrades, AskNoListOfAnEarlierReportWhetherThereIsAnything) {
  LayClubOfTwoGrades();
  DeleteFile("Winter_A.qzr");
  OpenList();
  Do("pick cboHiGrade =B");
  ASSERT_EQ(InSession("RowCount"), 2);
  DoAll({"click cmdHiMenu", "click Image1", "click cmdCombine"});
  EXPECT_TRUE(Shown("lblNoneFound"));
  EXPECT_FALSE(Shown("fraHi"));
  EXPECT_FALSE(Shown("cmdReDoAvgs"));
  EXPECT_TRUE(Enabled("cboHiGrade"));
  EXPECT_FALSE(HasFile("Combine.qz3"));
}

TEST_F(CombinedGrades, OfPlayersThatAreAllGoneHaveNoRowsAndNothingToCopy) {
  LayClubOfTwoGrades();
  WritePlayers("Winter.qza",
               {Person(8, "Ghost", "A", "Rovers", "A"), Person(9, "Ghost", "B", "Bees", "B")});
  OpenCombined();
  EXPECT_EQ(Cells("grdHI").size(), 1U);
  EXPECT_EQ(File("Combine.qz3"), "");
  for (const char* command : {"click cmdClipHi", "click cmdHiPrint"}) {
    Do(command);
    EXPECT_TRUE(Events().empty()) << command;
  }
}

TEST_F(CombinedGrades, AFileThatIsGoneIsToldOnceAndTheGradeCanBeReturnedTo) {
  LayClubOfTwoGrades();
  OpenCombined();
  for (const char* spoilt : {"", "1,\"Archer, Jo\"", "1,\"x\",\"y\",\"z\",many,1\r\n",
                             "1e99,\"x\",\"y\",\"z\",1,1\r\n"}) {
    WriteFile("Combine.qz3", spoilt);
    Do("click optCombineAlpha");
    EXPECT_EQ(Errors().size(), 1U) << spoilt;
    EXPECT_EQ(Boxes().size(), 1U) << spoilt;
    EXPECT_FALSE(Shown("fraHi")) << spoilt;
    Do("click cmdReDoAvgs");
    EXPECT_TRUE(Errors().empty()) << spoilt;
    ExpectOneGrade();
    EXPECT_TRUE(Shown("fraHi")) << spoilt;
    Do("click cmdCombine");
    EXPECT_TRUE(Errors().empty()) << spoilt;
    EXPECT_TRUE(Shown("fraHi")) << spoilt;
  }
}

TEST_F(CombinedGrades, OverAThousandPlayersAreASubscriptFailure) {
  HOLDS_FOR_MODELS_ALONE("the limit is a matter of files");
  LayClubOfTwoGrades();
  OpenList();
  auto players = Players("Winter.qza");
  players.resize(1001, Person(99, "Z", "z", "Rovers", "A"));
  WritePlayers("Winter.qza", players);
  Do("click cmdCombine");
  EXPECT_EQ(Errors(), (std::vector<int>{9}));
  EXPECT_FALSE(Shown("fraHi"));
  Do("click cmdReDoAvgs");
  EXPECT_TRUE(Errors().empty());
  ExpectOneGrade();
}

/// Handicaps, over the progressive list of the averages: 30, 27.22 and 25.12.
class Handicaps : public ListsTest {
 protected:
  void OpenProgressive(Here here = Here::current()) {
    LayClub();
    OpenList("Image1", here);
    Do("click cmdProgress", here);
  }
  TextList Column(std::size_t col, Here here = Here::current()) {
    TextList column;
    for (const TextList& row : Cells("grdHI", here)) column.push_back(row.at(col));
    return column;
  }
  void ExpectWithout(Here here = Here::current()) {
    EXPECT_EQ(Cells("grdHI", here).at(0).size(), 5U);
    EXPECT_EQ(Caption("lblHi(0)", here), " PROGRESSIVE Highest Averages ");
    EXPECT_TRUE(Enabled("cmdHcap", here));
  }
};

TEST_F(Handicaps, AskForTheMeanAverageWithTheHighestAsDefault) {
  OpenProgressive();
  DoAll({"input-cancel", "click cmdHcap"});
  EXPECT_EQ(Count("beep"), 1);
  ASSERT_EQ(EventsNamed("input").size(), 1U);
  const Json input = EventsNamed("input")[0];
  EXPECT_EQ(input["prompt"],
            "It is recommended to use the Highest Average as the\r"
            "MEAN AVERAGE. This will assign a ZERO handicap\r"
            "to the Highest Average and assign a Handicap to all\r"
            "other averages.\r\rEnter the MEAN AVERAGE.");
  EXPECT_EQ(input["title"], "Handicaps");
  EXPECT_EQ(input["default"], "30.00");
  EXPECT_EQ(input["topic"], 257);
}

// 501 / 30 is 16.7: none for 30; 501 - 454.574 for 27.22; 501 - 419.504 for 25.12.
TEST_F(Handicaps, StandInAColumnOfTheirOwn) {
  OpenProgressive();
  DoAll({"input 30.00", "click cmdHcap"});
  EXPECT_EQ(Row("grdHI", 0), (TextList{"No.", "Player", "Team", "Avg", "Gms", "H/cap"}));
  EXPECT_EQ(Column(5), (TextList{"H/cap", "0", "46", "81"}));
  EXPECT_EQ(Caption("lblHi(0)"), " PROGRESSIVE Highest Averages (With Handicaps)");
  EXPECT_FALSE(Enabled("cmdHcap"));
  EXPECT_TRUE(Shown("cmdHcap"));
  EXPECT_EQ(Focus(), "frmPMenu.lstHiDates");
  EXPECT_EQ(InSession("MeanAverage"), 30);
  EXPECT_EQ(File("Highest.qz3").find("46"), std::string::npos) << "in the grid alone";
}

TEST_F(Handicaps, AreBelowNoneAboveTheMeanAndRoundHalvesToTheEvenNumber) {
  LayClub();
  WriteResults("Winter_A.qzr", {Night(1, "Rovers", "Hawks", kFirstNight, 200, 10),
                                Night(2, "Rovers", "Hawks", kFirstNight, 100, 10),
                                Night(3, "Hawks", "Rovers", kFirstNight, 220, 10)});
  OpenList();
  DoAll({"click cmdProgress", "input 20", "click cmdHcap"});
  EXPECT_EQ(Column(3), (TextList{"Avg", "22.00", "20.00", "10.00"}));
  EXPECT_EQ(Column(5), (TextList{"H/cap", "-50", "0", "250"}));
}

TEST_F(Handicaps, AnAnswerBelowOneLeavesTheListAsItWas) {
  OpenProgressive();
  for (const char* answer : {"input", "input 0.5", "input -20", "input many", "input-cancel"}) {
    DoAll({answer, "click cmdHcap"});
    EXPECT_EQ(Count("box"), 0) << answer;
    ExpectWithout();
  }
  EXPECT_EQ(InSession("MeanAverage"), 0);
}

TEST_F(Handicaps, AreReadFromTheNumberThatTheAnswerBeginsWith) {
  OpenProgressive();
  DoAll({"input  30 points", "click cmdHcap"});
  EXPECT_EQ(InSession("MeanAverage"), 30);
  EXPECT_EQ(Column(5), (TextList{"H/cap", "0", "46", "81"}));
}

TEST_F(Handicaps, AnyAnswerEndsInNoWorseThanTheErrorBox) {
  OpenProgressive();
  for (const char* answer : {"1e999", "1", "1e308", "99999999999999999999", "30,5", "&H20"}) {
    DoAll({std::string("input ") + answer, "click cmdHcap"});
    EXPECT_LE(Errors().size(), 1U) << answer;
    DoAll({"pick lstHiDates 1", "click cmdProgress"});
    ExpectWithout();
  }
}

TEST_F(Handicaps, OneWithoutRoomLeavesTheListAsItWas) {
  LayClub();
  WriteResults("Winter_A.qzr", {Night(1, "Rovers", "Hawks", kFirstNight, 250, 10),
                                Night(2, "Rovers", "Hawks", kFirstNight, 670, 10)});
  OpenList();
  DoAll({"click cmdProgress", "input 1", "click cmdHcap"});
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_EQ(Boxes().size(), 1U);
  ExpectWithout();
  DoAll({"input 67", "click cmdHcap"});
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Column(5), (TextList{"H/cap", "0", "314"}));  // 501 - 186.94
}

TEST_F(Handicaps, ComeBackWhenTheListHasBeenOfTheDateAndProgressiveAgain) {
  OpenProgressive();
  DoAll({"input 30", "click cmdHcap"});
  EXPECT_FALSE(Enabled("cmdHcap"));
  Do("click cmdProgress");
  EXPECT_FALSE(Shown("cmdHcap"));
  EXPECT_EQ(Cells("grdHI").at(0).size(), 4U);
  Do("click cmdProgress");
  EXPECT_TRUE(Shown("cmdHcap"));
  ExpectWithout();
}

TEST_F(Handicaps, APickOfADateRebuildsTheListWithoutThem) {
  OpenProgressive();
  DoAll({"input 30", "click cmdHcap", "pick lstHiDates 1"});
  EXPECT_EQ(Cells("grdHI").at(0).size(), 4U);
  EXPECT_FALSE(Shown("cmdHcap"));
}

}  // namespace
}  // namespace marlowbeck
