// One player's figures put right from the weekly table.

#include "results/from_reports.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

class EditScore : public FromReports {
 protected:
  static ResultRecord Full() {
    ResultRecord result = Night(11, "Hawks", "Lions");
    result.Grade = "as it was";
    result.HighScore = 180;
    result.Scores180 = 1;
    result.Pegs = {11, 0, 33, 44, 55, 66};
    return result;
  }
  static std::vector<ResultRecord> Season() {
    return {Night(11, "Hawks", "Cubs", 24), Full(), Night(12, "Hawks", "Lions"),
            Night(21, "Lions", "Hawks")};
  }
  /// Opens the first row of the table: Hill, who stands above Hope as they are on one average.
  void Open(const std::vector<ResultRecord>& results = Season(), Here here = Here::current()) {
    Lay(results);
    OpenWeekly("Hawks", here);
    Do("dblcell grdWeek 1 0", here);
  }
  void ExpectSaved(const std::vector<ResultRecord>& results, Here here = Here::current()) {
    EXPECT_TRUE(SameResults(File(kAResults, here), FileOf(results)));
  }
  void ExpectEmptyBoxes(Here here = Here::current()) {
    for (const char* box : {"txtAgg", "txtShots", "txtAvg", "txtHS", "txtCent", "txtHowMany180s",
                            "txtP1", "txtP2", "txtP3", "txtP4", "txtP5", "txtP6", "txtLegs"}) {
      EXPECT_EQ(Text(box, here), "") << box;
      EXPECT_TRUE(Enabled(box, here)) << box;
    }
  }
};

TEST_F(EditScore, ShowsWhoseFiguresTheyAre) {
  Open();
  EXPECT_EQ(Front(), "frmEdScore");
  EXPECT_EQ(Title("frmEdScore"), "[Marlowbeck]  Edit Player Scores");
  EXPECT_EQ(Text("txtGrade"), "A Grade");
  EXPECT_EQ(Text("txtTeam"), "Hawks");
  EXPECT_EQ(Text("txtOpp"), "Lions");
  EXPECT_EQ(Text("txtDate"), "31/03/2004");
  EXPECT_EQ(Text("txtPlayer"), "Hill, Al");
  for (const char* box : {"txtGrade", "txtTeam", "txtOpp", "txtDate", "txtPlayer", "txtAvg"}) {
    Refused(std::string("type ") + box + " x");
  }
}

TEST_F(EditScore, ShowsTheSavedFigures) {
  Open();
  const Entries expected = {{"txtAgg", "950"}, {"txtShots", "20"}, {"txtAvg", "47.50"},
                            {"txtHS", "180"},  {"txtCent", "2"},   {"txtHowMany180s", "1"},
                            {"txtP1", "11"},   {"txtP2", ""},      {"txtP3", "33"},
                            {"txtP4", "44"},   {"txtP5", "55"},    {"txtP6", "66"},
                            {"txtLegs", "9"}};
  for (const auto& [box, text] : expected) EXPECT_EQ(Text(box), text) << box;
  EXPECT_FALSE(Ticked("chkFF"));
  EXPECT_EQ(Focus(), "frmEdScore.txtAgg");
  EXPECT_EQ(InSession("EditRecord"), 2);
  EXPECT_EQ(InSession("Flag"), 11);
  EXPECT_EQ(InSession("BestOfThree"), 333);
}

TEST_F(EditScore, CaptionsOfTheBoxesAndCommands) {
  Open();
  EXPECT_EQ(Caption("lblP1"), " Peg 1:Triples");
  EXPECT_EQ(Caption("lblP4"), " Peg 2:Doubles");
  EXPECT_EQ(Caption("lblLegs"), "Total Legs played:");
  EXPECT_EQ(Caption("chkFF"), "Register a Forfeit Only");
  EXPECT_EQ(Caption("cmdSave"), "Save");
  EXPECT_EQ(Caption("Command2"), "Cancel");
  EXPECT_EQ(Caption("Command3"), "Help");
  const Entries expected = {{"txtGrade", "Grade:"},
                            {"txtTeam", "Team:"},
                            {"txtOpp", "Opposition:"},
                            {"txtDate", "Date:"},
                            {"txtPlayer", "Player:"},
                            {"txtAgg", "Aggregate:"},
                            {"txtShots", "Shots:"},
                            {"txtAvg", "Average:"},
                            {"txtHS", "Highest Score:"},
                            {"txtCent", "Total Centuries:"},
                            {"txtHowMany180s", "Total 180's:"}};
  for (const auto& [box, caption] : expected) {
    EXPECT_EQ(ScreensOf().Find("frmEdScore")->Find(box)->Caption(), caption) << box;
  }
}

TEST_F(EditScore, ADoubleClickInAnotherColumnDoesNothing) {
  Lay(Season());
  OpenWeekly();
  Do("dblcell grdWeek 1 1");
  EXPECT_EQ(Front(), "frmPMenu");
}

TEST_F(EditScore, TheReportsAreOutOfReachUntilItCloses) {
  Open();
  ExpectReportsOutOfReach();
  for (const char* leave : {"click Command2", "close frmEdScore", "key Esc"}) {
    Do("type txtAgg 1");
    Do(leave);
    ExpectReports("frmEdScore");
    ExpectSaved(Season());
    Do("dblcell grdWeek 1 0");
    EXPECT_EQ(Text("txtAgg"), "950") << leave;
  }
}

TEST_F(EditScore, SavesTheFiguresOverTheRecordAndNothingElse) {
  Open();
  TypeInto({{"txtAgg", "1000"},
            {"txtShots", "25"},
            {"txtHS", "140"},
            {"txtCent", "3"},
            {"txtHowMany180s", ""},
            {"txtP1", ""},
            {"txtP2", "22"},
            {"txtLegs", "7"}});
  Do("click cmdSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Count("sound"), 1);
  std::vector<ResultRecord> after = Season();
  ResultRecord& saved = after[1];
  saved.Aggregate = 1000;
  saved.Shots = 25;
  saved.HighScore = 140;
  saved.Centuries = 3;
  saved.Scores180 = 0;
  saved.Pegs = {0, 22, 33, 44, 55, 66};
  saved.Legs = 7;
  ExpectSaved(after);
  EXPECT_EQ(File(kLeagueFile), FileOf(LeaguePlayers()));
}

TEST_F(EditScore, TheTableShowsTheNewFigures) {
  Open();
  EXPECT_EQ(InSession("WorkDate"), "2004-03-31");
  Do("type txtAgg 100");
  Do("click cmdSave");
  ExpectReports("frmEdScore");
  EXPECT_EQ(Row("grdWeek", 1)[0], "Hope, Bo");
  EXPECT_EQ(Row("grdWeek", 2)[1], "100");
  EXPECT_EQ(Row("grdWeek", 2)[9], "5.00");
  // The night of the 24th counts too.
  EXPECT_EQ(Row("grdProg", 2)[1], "1050");
  EXPECT_EQ(Index("lstAllDates"), 1);
}

TEST_F(EditScore, AFailureInTheReportsKeepsNobodyInTheDialog) {
  Open();
  // Another night of the table has lost its shots meanwhile, so that it cannot be put in order.
  std::vector<ResultRecord> results = Season();
  results[2].Shots = 0;
  WriteResults(kAResults, results);
  Do("type txtAgg 951");
  Do("click cmdSave");
  EXPECT_EQ(Errors(), (std::vector<int>{11}));
  EXPECT_EQ(Count("sound"), 1);
  results[1].Aggregate = 951;
  ExpectSaved(results);
  EXPECT_EQ(Front(), "frmPMenu");
  EXPECT_FALSE(Loaded("frmEdScore"));
  EXPECT_TRUE(Enabled("cboResTeam"));
}

TEST_F(EditScore, SavingWhatIsThereChangesNothing) {
  Open();
  Do("click cmdSave");
  EXPECT_EQ(Count("sound"), 1);
  ExpectSaved(Season());
}

TEST_F(EditScore, BoxesRunInTheOrderOfThePaperByEnter) {
  Open();
  for (const char* next : {"txtShots", "txtHS", "txtCent", "txtHowMany180s", "txtP1", "txtP2",
                           "txtP3", "txtP4", "txtP5", "txtP6", "txtLegs", "chkFF"}) {
    Do("key Enter");
    EXPECT_EQ(Focus(), std::string("frmEdScore.") + next);
  }
}

TEST_F(EditScore, HelpOpensItsTopic) {
  Open();
  for (const char* ask : {"click Command3", "key F1"}) {
    Do(ask);
    EXPECT_EQ(EventsNamed("help"), (std::vector<Json>{{{"file", "qz1.HLP"}, {"topic", 250}}}));
  }
}

TEST_F(EditScore, APlayerStaysLookedUpByANameWithOneBlank) {
  Open();
  EXPECT_NE(File("qzEdScor.qz3").find("\"Hill, Al\""), std::string::npos);
  EXPECT_EQ(Text("txtPlayer"), "Hill, Al");
  EXPECT_EQ(Text("txtAgg"), "950");
  Do("click Command2");
  DoAll({"click cmdCancelWK", "click Image10"});
  OpenTeam("Hawks");
  EXPECT_EQ(Lines("lstFinished")[0], "Hill,  Al") << "the score sheets write two";
}

TEST_F(EditScore, NamesWithQuotesAndCommasAreFound) {
  std::vector<PlayerRecord> players = LeaguePlayers();
  players[2].Surname = "O\"Hill\", Jr";
  players[2].FirstName = "Al \"Ace\"";
  Lay(Season());
  WritePlayers(kLeagueFile, players);
  OpenWeekly();
  Do("dblcell grdWeek 1 0");
  EXPECT_EQ(Text("txtPlayer"), "O\"Hill\", Jr, Al \"Ace\"");
  EXPECT_EQ(Text("txtAgg"), "950");
}

TEST_F(EditScore, AForfeitRowFindsNobody) {
  ResultRecord forfeit = Full();
  forfeit.Forfeit = "F";
  Open({forfeit});
  EXPECT_EQ(Text("txtPlayer"), "Hill, Al *");
  ExpectEmptyBoxes();
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(InSession("Flag"), 0);
  for (const char* label : {"lblP1", "lblP2", "lblP6"}) EXPECT_TRUE(Shown(label)) << label;
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
  EXPECT_EQ(Focus(), "frmEdScore.txtAgg");
  ExpectSaved({forfeit});
}

TEST_F(EditScore, ARecordThatIsGoneShowsEmptyBoxes) {
  Lay(Season());
  OpenWeekly();
  const std::vector<ResultRecord> left = {Season()[0], Season()[2]};
  WriteResults(kAResults, left);
  Do("dblcell grdWeek 1 0");
  ExpectEmptyBoxes();
  EXPECT_EQ(InSession("EditRecord"), 0);
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
  Do("click Command2");
  ExpectReports("frmEdScore");
}

TEST_F(EditScore, WithoutARecordTypedValuesAreNotWrittenAnywhere) {
  ResultRecord forfeit = Full();
  forfeit.Forfeit = "F";
  Open({forfeit, Night(12, "Hawks", "Cubs", 24)});
  TypeInto(GoodSheet());
  Do("click cmdSave");
  EXPECT_EQ(Errors(), (std::vector<int>{63}));
  EXPECT_EQ(Count("sound"), 0);
  ExpectSaved({forfeit, Night(12, "Hawks", "Cubs", 24)});
  EXPECT_EQ(Front(), "frmEdScore");
}

TEST_F(EditScore, NothingStaleOfTheScoreSheetsIsOpenedOrWritten) {
  ResultRecord forfeit = Night(12, "Hawks", "Lions");
  forfeit.Forfeit = "F";
  Lay({Full(), forfeit});
  OpenTeam("Hawks");
  Do("pick lstFinished =Hill,  Al");
  EXPECT_EQ(InSession("EditRecord"), 1);
  Do("close frmResults");
  OpenWeekly();
  Do("dblcell grdWeek 2 0");
  EXPECT_EQ(Text("txtPlayer"), "Hope, Bo *");
  ExpectEmptyBoxes();
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(EditScore, NothingStaleOfAnEarlierCorrectionIsLeft) {
  std::vector<PlayerRecord> players = LeaguePlayers();
  players.push_back(Player(44, "Boyd", "Al", "Bees", "B Grade", 111));
  ResultRecord forfeit = Night(44, "Bees", "Crows");
  forfeit.Forfeit = "F";
  Lay({});
  WritePlayers(kLeagueFile, players);
  WriteResults(kBResults, {Night(41, "Bees", "Crows"), forfeit});
  DoAll({"click imgPrinter", "click Image6", "pick cboResGrade =B Grade", "dblcell grdWeek 1 0"});
  EXPECT_EQ(Text("txtPlayer"), "Bell, Di");
  EXPECT_EQ(InSession("Flag"), 41);
  EXPECT_FALSE(Shown("txtP2"));
  DoAll({"click Command2", "dblcell grdWeek 2 0"});
  EXPECT_EQ(Text("txtPlayer"), "Boyd, Al *");
  ExpectEmptyBoxes();
  EXPECT_EQ(InSession("EditRecord"), 0);
  EXPECT_EQ(InSession("Flag"), 0);
  EXPECT_EQ(InSession("BestOfThree"), 0);
  EXPECT_TRUE(Shown("txtP2"));
}

TEST_F(EditScore, AResultOfNumberNoughtIsNotTakenForThatOfAForfeit) {
  ResultRecord forfeit = Full();
  forfeit.Forfeit = "F";
  Open({Night(0, "Hawks", "Lions"), forfeit});
  EXPECT_EQ(Text("txtPlayer"), "Hill, Al *");
  ExpectEmptyBoxes();
  EXPECT_EQ(InSession("EditRecord"), 0);
}

TEST_F(EditScore, TheFirstOfSeveralResultsStaysTheOneOpened) {
  ResultRecord first = Full();
  ResultRecord last = Full();
  last.Aggregate = 400;
  Open({first, last});
  EXPECT_EQ(InSession("EditRecord"), 1);
  EXPECT_EQ(Text("txtAgg"), "950");
  Do("type txtAgg 951");
  Do("click cmdSave");
  first.Aggregate = 951;
  ExpectSaved({first, last});
}

TEST_F(EditScore, ResultsOfAnotherTeamOppositionOrDateAreNotTaken) {
  ResultRecord lower = Night(12, "Hawks", "Lions");
  lower.Aggregate = 100;
  Open({Night(11, "Cubs", "Lions"), Night(11, "Hawks", "Cubs", 24), lower, Full()});
  EXPECT_EQ(InSession("EditRecord"), 4);
}

TEST_F(EditScore, AForfeitMarkStaysWhicheverWay) {
  ResultRecord forfeit = Night(11, "Hawks", "Lions");
  forfeit.Forfeit = "F";
  forfeit.Aggregate = 0;
  forfeit.Shots = 0;
  forfeit.HighScore = 0;
  forfeit.Centuries = 0;
  // The second result's row has no star, and its player's first result is the forfeit.
  Open({forfeit, Full()});
  EXPECT_EQ(InSession("EditRecord"), 1);
  EXPECT_FALSE(Ticked("chkFF"));
  EXPECT_EQ(Text("txtAgg"), "0");
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
  TypeInto(GoodSheet());
  Do("click cmdSave");
  EXPECT_EQ(Results(kAResults)[0].Aggregate, 1000);
  EXPECT_EQ(Results(kAResults)[0].Forfeit.substr(0, 2), "F ");
}

TEST_F(EditScore, TheForfeitBoxStaysWithoutEffect) {
  Open();
  Do("click chkFF");
  EXPECT_TRUE(Ticked("chkFF"));
  EXPECT_EQ(Text("txtAgg"), "950");
  EXPECT_TRUE(Enabled("txtAgg"));
  Do("click cmdSave");
  EXPECT_EQ(Count("sound"), 1);
  ExpectSaved(Season());
}

TEST_F(EditScore, TheHandOverAloneSaysWhoseFiguresTheyAre) {
  HOLDS_FOR_MODELS_ALONE("the screen is shown past the one that opens it");
  Lay(Season());
  ResultRecord night = Night(41, "Bees", "Crows");
  WriteResults(kBResults, {night});
  OpenWeekly();
  WriteFile("qzEdScor.qz3",
            "\"B Grade\"\r\n\"Bees\"\r\n\"Crows\"\r\n\"31/03/2004\"\r\n\"Bell, Di\"\r\n");
  ScreensOf().Show("frmEdScore");
  EXPECT_EQ(Text("txtAgg"), "950");
  TypeInto({{"txtAgg", "960"}, {"txtLegs", "3"}});
  Do("click cmdSave");
  night.Aggregate = 960;
  night.Legs = 3;
  EXPECT_TRUE(SameResults(File(kBResults), FileOf(std::vector{night})));
  ExpectSaved(Season());
}

TEST_F(EditScore, AGradeWithoutBestOfThreeHasThreePegBoxes) {
  Lay({});
  ResultRecord night = Night(41, "Bees", "Crows");
  night.Legs = 3;
  night.Pegs = {1, 2, 3, 4, 5, 6};
  WriteResults(kBResults, {night});
  DoAll({"click imgPrinter", "click Image6", "pick cboResGrade =B Grade", "dblcell grdWeek 1 0"});
  EXPECT_EQ(InSession("BestOfThree"), 111);
  EXPECT_EQ(Caption("lblP1"), " Peg:Triples");
  for (const char* hidden : {"txtP2", "lblP2", "txtP4", "txtP6"}) {
    EXPECT_FALSE(Shown(hidden)) << hidden;
  }
  // Old pegs in hidden boxes are still there after a save.
  Do("type txtAgg 951");
  Do("click cmdSave");
  night.Aggregate = 951;
  EXPECT_TRUE(SameResults(File(kBResults), FileOf(std::vector{night})));
}

TEST_F(EditScore, ANumberAbove32767StaysBeyondReach) {
  std::vector<PlayerRecord> players = LeaguePlayers();
  players[2].ID = 32768;
  ResultRecord night = Full();
  night.ID = 32768;
  Lay({night});
  WritePlayers(kLeagueFile, players);
  OpenWeekly();
  Do("dblcell grdWeek 1 0");
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  ExpectEmptyBoxes();
  EXPECT_EQ(InSession("EditRecord"), 0);
  Do("click Command2");
  ExpectReports("frmEdScore");
}

TEST_F(EditScore, NumbersOfNoughtAndBelowCanBeCorrected) {
  Lay({});
  OpenWeekly();
  for (const int id : {0, -7, -32768}) {
    SCOPED_TRACE(id);
    std::vector<PlayerRecord> players = LeaguePlayers();
    players[2].ID = id;
    ResultRecord night = Full();
    night.ID = id;
    WritePlayers(kLeagueFile, players);
    WriteResults(kAResults, {night});
    Do("pick cboResTeam =Hawks");
    Do("dblcell grdWeek 1 0");
    EXPECT_EQ(InSession("EditRecord"), 1);
    EXPECT_EQ(Text("txtAgg"), "950");
    Do("click Command2");
  }
}

TEST_F(EditScore, TheHighestNumberCanBeCorrected) {
  std::vector<PlayerRecord> players = LeaguePlayers();
  players[2].ID = 32767;
  ResultRecord night = Full();
  night.ID = 32767;
  Lay({night});
  WritePlayers(kLeagueFile, players);
  OpenWeekly();
  Do("dblcell grdWeek 1 0");
  EXPECT_EQ(Text("txtAgg"), "950");
  EXPECT_EQ(InSession("Flag"), 32767);
}

}  // namespace
}  // namespace marlowbeck
