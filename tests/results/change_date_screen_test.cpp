// A match moved to another date from the weekly table.

#include "data/text.h"
#include "results/from_reports.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

class ChangeDate : public FromReports {
 protected:
  /// Hawks met Lions on the 24th, both sides entered; on other dates both met others.
  static std::vector<ResultRecord> Season() {
    return {Night(11, "Hawks", "Cubs", 10),  Night(21, "Lions", "Rovers", 17),
            Night(11, "Hawks", "Lions", 24), Night(12, "Hawks", "Lions", 24),
            Night(21, "Lions", "Hawks", 24), Night(31, "Cubs", "Rovers", 24)};
  }
  void Open(const std::vector<ResultRecord>& results = Season(), Here here = Here::current()) {
    Lay(results);
    OpenWeekly("Hawks", here);
    Do("click cmdChangeDate", here);
  }
  void Change(const std::string& date) {
    Do("date NewCal " + date);
    Do("click cmdOK");
  }
};

TEST_F(ChangeDate, ShowsTheMatchAndItsDate) {
  Open();
  EXPECT_EQ(Front(), "frmChangeDate");
  EXPECT_EQ(Title("frmChangeDate"), "[Marlowbeck]  Change Game Date");
  EXPECT_EQ(Caption("Frame1"), "A Grade");
  EXPECT_EQ(Caption("lblTeamS"), "Hawks  v's  Lions");
  EXPECT_EQ(DateOf("OldCal"), "2004-03-24");
  EXPECT_EQ(DateOf("NewCal"), "2004-03-24");
  EXPECT_EQ(Text("txtOldDay"), "Wednesday");
  EXPECT_EQ(Text("txtNewDay"), "Wednesday");
  EXPECT_EQ(Caption("cmdOK"), "&OK");
  EXPECT_EQ(Caption("cmdCancel"), "&Cancel");
  EXPECT_EQ(Caption("cmdNewDateHelp"), "&Help");
  const Screen& dialog = *ScreensOf().Find("frmChangeDate");
  EXPECT_EQ(dialog.Find("OldCal")->Caption(), "From ...");
  EXPECT_EQ(dialog.Find("NewCal")->Caption(), "To ...");
  EXPECT_EQ(Focus(), "frmChangeDate.cmdCancel");
}

TEST_F(ChangeDate, OnlyTheNewDateCanBePicked) {
  Open();
  Refused("date OldCal 2004-03-25");
  Refused("type txtOldDay Monday");
  Refused("type txtNewDay Monday");
  Do("date NewCal 2004-03-26");
  EXPECT_EQ(Text("txtNewDay"), "Friday");
  EXPECT_EQ(Text("txtOldDay"), "Wednesday");
  EXPECT_EQ(DateOf("OldCal"), "2004-03-24");
}

TEST_F(ChangeDate, TheReportsAreOutOfReachUntilItCloses) {
  Open();
  ExpectReportsOutOfReach();
  Do("click cmdCancel");
  ExpectReports("frmChangeDate");
}

TEST_F(ChangeDate, MovesTheResultsOfBothSidesAndNoOthers) {
  Open();
  Change("2004-03-31");
  std::vector<ResultRecord> after = Season();
  for (const std::size_t moved : {2U, 3U, 4U}) after[moved].GameDate = March(31);
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(after)));
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_TRUE(Boxes().empty());
  EXPECT_FALSE(HasFile("Winter_A Grade.qzr.new"));
}

TEST_F(ChangeDate, TheNewDateStandsInTheListAndTheOldOneDoesNot) {
  Open();
  Change("2004-03-03");
  ExpectReports("frmChangeDate");
  EXPECT_EQ(Lines("lstAllDates"), (TextList{"03/03/2004", "10/03/2004"}));
  EXPECT_EQ(Index("lstAllDates"), 1);
  EXPECT_EQ(Caption("lblDT"), "10/03/2004 (v's Cubs)");
  Do("pick lstAllDates 0");
  EXPECT_EQ(Caption("lblDT"), "03/03/2004 (v's Lions)");
  EXPECT_EQ(Cells("grdWeek").size(), 3U);
}

TEST_F(ChangeDate, ItIsTheDatePickedThatChanges) {
  Lay(Season());
  OpenWeekly();
  Do("pick lstAllDates 0");
  Do("click cmdChangeDate");
  EXPECT_EQ(Caption("lblTeamS"), "Hawks  v's  Cubs");
  Change("2004-03-11");
  std::vector<ResultRecord> after = Season();
  after[0].GameDate = March(11);
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(after)));
}

TEST_F(ChangeDate, TheSameDateIsNoChange) {
  Open();
  Do("click cmdOK");
  EXPECT_EQ(TheBox(), "No change of date was detected.");
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_EQ(Boxes()[0].title, "Marlowbeck Message");
  EXPECT_EQ(Front(), "frmChangeDate");
  EXPECT_EQ(Count("sound"), 0);
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(Season())));
}

TEST_F(ChangeDate, ADateOnWhichTheTeamPlayedIsRefused) {
  Open();
  Change("2004-03-10");
  EXPECT_EQ(TheBox(), "Hawks played Lions on 10/03/2004.\rYou cannot make this change.");
  EXPECT_EQ(Front(), "frmChangeDate");
  EXPECT_EQ(Count("sound"), 0);
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(Season())));
  // Another date can be picked right away.
  Change("2004-03-11");
  ExpectReports("frmChangeDate");
}

TEST_F(ChangeDate, ADateOnWhichTheTeamWasTheOppositionIsRefusedToo) {
  std::vector<ResultRecord> season = Season();
  season.push_back(Night(31, "Cubs", "Hawks", 31));
  Open(season);
  Change("2004-03-31");
  // The latest date of the Hawks' own is still the 24th.
  EXPECT_EQ(TheBox(), "Hawks played Lions on 31/03/2004.\rYou cannot make this change.");
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(season)));
}

TEST_F(ChangeDate, ADateOnWhichTheOppositionAlonePlayedStaysAllowed) {
  Open();
  Change("2004-03-17");
  EXPECT_TRUE(Boxes().empty());
  ExpectReports("frmChangeDate");
  std::vector<ResultRecord> after = Season();
  for (const std::size_t moved : {2U, 3U, 4U}) after[moved].GameDate = March(17);
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(after)));
}

TEST_F(ChangeDate, ADateFrom2030OnStaysReadAsOneFrom1930On) {
  Open();
  Change("2030-03-24");
  std::vector<ResultRecord> after = Season();
  for (const std::size_t moved : {2U, 3U, 4U}) {
    after[moved].GameDate = *DateFromCivil({1930, 3, 24});
  }
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(after)));
  EXPECT_EQ(Lines("lstAllDates"), (TextList{"24/03/1930", "10/03/2004"}));
}

TEST_F(ChangeDate, AHundredYearsLaterIsNoChange) {
  Open();
  Change("2104-03-24");
  EXPECT_EQ(TheBox(), "No change of date was detected.");
}

TEST_F(ChangeDate, AMatchThatIsDated2030IsNotFound) {
  std::vector<ResultRecord> results = {Night(11, "Hawks", "Lions", 24)};
  results[0].GameDate = *DateFromCivil({2030, 3, 24});
  Open(results);
  EXPECT_EQ(DateOf("OldCal"), "2030-03-24");
  Change("2004-03-24");
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(results)));
  EXPECT_EQ(Count("sound"), 1);
  ExpectReports("frmChangeDate");
}

TEST_F(ChangeDate, CancelCloseAndEscChangeNothing) {
  Open();
  for (const char* leave : {"click cmdCancel", "close frmChangeDate", "key Esc"}) {
    Do("date NewCal 2004-03-31");
    Do(leave);
    ExpectReports("frmChangeDate");
    EXPECT_TRUE(SameResults(File(kAResults), FileOf(Season()))) << leave;
    EXPECT_EQ(Caption("lblDT"), "24/03/2004 (v's Lions)") << leave;
    Do("click cmdChangeDate");
  }
}

TEST_F(ChangeDate, EnterAtOnceCancels) {
  Open();
  Do("key Enter");
  ExpectReports("frmChangeDate");
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(ChangeDate, LettersOfTheCommands) {
  Open();
  Do("key Alt+H");
  EXPECT_EQ(EventsNamed("help"), (std::vector<Json>{{{"file", "qz1.HLP"}, {"topic", 251}}}));
  Do("key Alt+O");
  EXPECT_EQ(TheBox(), "No change of date was detected.");
  Do("key F1");
  EXPECT_EQ(Count("help"), 1);
  Do("key Alt+C");
  ExpectReports("frmChangeDate");
}

TEST_F(ChangeDate, NothingButTheResultsOfTheGradeIsTouched) {
  Open();
  const std::string ladder(160, 'x');
  WriteFile("Winter_A Grade.qzl", ladder);
  WriteResults(kBResults, {Night(41, "Hawks", "Lions", 24)});
  const std::string others = File(kBResults);
  Change("2004-03-31");
  EXPECT_EQ(File("Winter_A Grade.qzl"), ladder);
  EXPECT_EQ(File(kBResults), others);
  EXPECT_EQ(File(kLeagueFile), FileOf(LeaguePlayers()));
}

TEST_F(ChangeDate, TheOrderOfTheFileIsMendedWhenTheScoreSheetsCloseNext) {
  Open();
  Change("2004-03-03");
  EXPECT_EQ(Results(kAResults)[2].GameDate, March(3));
  DoAll({"click cmdCancelWK", "click Image10"});
  OpenGrade();
  Do("click cmdLeaveResults");
  std::vector<Date> dates;
  for (const ResultRecord& result : Results(kAResults)) dates.push_back(result.GameDate);
  EXPECT_TRUE(std::is_sorted(dates.begin(), dates.end()));
}

TEST_F(ChangeDate, ACutRecordAtTheEndStaysWhereItIs) {
  Lay(Season());
  const std::string cut = File(kAResults) + "cut";
  WriteFile(kAResults, cut);
  OpenWeekly();
  Do("click cmdChangeDate");
  Change("2004-03-31");
  EXPECT_EQ(File(kAResults).size(), cut.size());
  EXPECT_TRUE(File(kAResults).ends_with("cut"));
}

TEST_F(ChangeDate, AWorkDateThatCannotBeReadEndsInTheErrorBox) {
  HOLDS_FOR_MODELS_ALONE("the fault is set among the files of one face");
  Lay(Season());
  OpenWeekly();
  // Read in turn: the open file's name, the date.
  Do("fault read 2 57");
  Do("click cmdChangeDate");
  Do("fault off");
  EXPECT_EQ(Errors(), (std::vector<int>{57}));
  EXPECT_EQ(Caption("lblTeamS"), "Hawks  v's  Lions");
  Do("click cmdCancel");
  ExpectReports("frmChangeDate");
}

TEST_F(ChangeDate, AMatchOfDateNoughtCannotBeMoved) {
  std::vector<ResultRecord> results = {Night(11, "Hawks", "Lions"), Night(11, "Hawks", "Cubs")};
  results[0].GameDate = Date{};
  Lay(results);
  OpenWeekly();
  ASSERT_EQ(Lines("lstAllDates"), (TextList{"30/12/1899", "31/03/2004"}));
  Do("pick lstAllDates 0");
  EXPECT_EQ(Caption("lblDT"), "30/12/1899 (v's Lions)");
  Do("click cmdChangeDate");
  EXPECT_EQ(Front(), "frmPMenu");
  EXPECT_FALSE(HasFile("dc.qz3"));
  EXPECT_EQ(File("WkDate.qz3"), "#2004-03-31#\r\n");
}

TEST_F(ChangeDate, WithoutAnOpenCompetitionNoDateIsRead) {
  Lay(Season());
  OpenWeekly();
  WriteFile("FileName.qz3", "\"\"\r\n");
  Do("click cmdChangeDate");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Text("txtOldDay"), "");
  EXPECT_EQ(Text("txtNewDay"), "");
  EXPECT_EQ(Caption("lblTeamS"), "Hawks  v's  Lions");
  Do("date NewCal 2004-03-31");
  Do("click cmdOK");
  EXPECT_TRUE(SameResults(File(kAResults), FileOf(Season()))) << "there is no match to move";
  EXPECT_EQ(Front(), "frmPMenu");
}

TEST_F(ChangeDate, AFailureInTheReportsKeepsNobodyInTheDialog) {
  std::vector<ResultRecord> season = Season();
  // The match of the 10th cannot be put in order, which shows once it is the latest.
  season[0].Shots = 0;
  season.push_back(Night(12, "Hawks", "Cubs", 10));
  Open(season);
  Change("2004-03-03");
  EXPECT_EQ(Errors(), (std::vector<int>{11}));
  EXPECT_EQ(Results(kAResults)[2].GameDate, March(3));
  EXPECT_EQ(Front(), "frmPMenu");
  EXPECT_FALSE(Loaded("frmChangeDate"));
  Do("pick lstAllDates 0");
  EXPECT_EQ(Caption("lblDT"), "03/03/2004 (v's Lions)");
}

}  // namespace
}  // namespace marlowbeck
