#include <algorithm>

#include "setup_test.h"

namespace marlowbeck {
namespace {

class RenameTest : public SetupTest {
 protected:
  void RenameTeam(const std::string& team, const std::string& reply) {
    Do("pick cboAddTm =" + team);
    Do("input " + reply);
    Do("click cmdEdTeamName");
  }
  void RenameGrade(const std::string& grade, const std::string& reply) {
    Do("pick cboAddGrd =" + grade);
    Do("input " + reply);
    Do("click cmdEdGradeName");
  }
  void ExpectBackAtTheNames() {
    EXPECT_TRUE(Enabled("cmdEdTeamName"));
    EXPECT_TRUE(Enabled("cmdAddCancel"));
    EXPECT_EQ(Focus(), "frmNames.txtAddSn");
    EXPECT_EQ(InSession("EditRecord"), 0);
  }
  /// The names of the competition's files, without the player file's.
  TextList GradeFiles() const {
    TextList names;
    for (const auto& entry : std::filesystem::directory_iterator(Folder())) {
      const std::string name = entry.path().filename().string();
      if (name.starts_with("Winter_")) names.push_back(name.substr(7));
    }
    std::ranges::sort(names);
    return names;
  }
};

std::string Renamed(const std::string& from, const std::string& to) {
  return "    " + from + "\rhas been changed to    \r    " + to + "    ";
}

// Rovers of A Grade become Rangers, then A Grade becomes
// Premier.
class WorkedExample : public RenameTest {
 protected:
  WorkedExample() {
    hawks_at_rovers.Grade = "A Grade";
    rovers_at_hawks.Grade = "A Grade";
  }

  std::vector<PlayerRecord> players = {Player(1, "Archer", "Jo", "Rovers", "A Grade", 330),
                                       Player(2, "Baker", "Al", "Rovers", "A Grade", 330),
                                       Player(3, "Cole", "Di", "Hawks", "A Grade", 330),
                                       Player(4, "Dale", "Ed", "Bulls", "B Grade", 111)};
  ResultRecord rovers_at_hawks = Night(1, "Rovers", "Hawks", 24);
  ResultRecord hawks_at_rovers = Night(3, "Hawks", "Rovers", 24);
  std::vector<LadderRecord> matches = {Match("Hawks", "Rovers"), Match("Hawks", "Lions", 5, 6)};
};

TEST_F(WorkedExample, EveryFileByteForByte) {
  const std::string other_results =
      FileOf(std::vector<ResultRecord>{Night(4, "Bulls", "Rovers", 24)});
  WriteResults(kAResults, {rovers_at_hawks, hawks_at_rovers});
  WriteFile(kALadder, FileOf(matches));
  WriteFile("Winter_B Grade.qzr", other_results);
  OpenSetup(players);

  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("Rovers", "Rangers")});
  players[0].Team = "Rangers";
  players[1].Team = "Rangers";
  rovers_at_hawks.Team = "Rangers";
  hawks_at_rovers.Opposition = "Rangers";
  matches[0].AwayTeam = "Rangers";
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
  const std::string results = FileOf(std::vector<ResultRecord>{rovers_at_hawks, hawks_at_rovers});
  EXPECT_TRUE(SameResults(File(kAResults), results));
  EXPECT_TRUE(SameMatches(File(kALadder), FileOf(matches)));
  EXPECT_EQ(GradeFiles(), (TextList{"A Grade.qzl", "A Grade.qzr", "B Grade.qzr"}));

  RenameGrade("A Grade", "Premier");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("A Grade", "Premier")});
  for (std::size_t i = 0; i < 3; ++i) players[i].Grade = "Premier";
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
  // The grade in the results still is the old one.
  EXPECT_TRUE(SameResults(File("Winter_Premier.qzr"), results));
  EXPECT_TRUE(SameMatches(File("Winter_Premier.qzl"), FileOf(matches)));
  EXPECT_EQ(File("Winter_B Grade.qzr"), other_results);
  EXPECT_EQ(GradeFiles(), (TextList{"B Grade.qzr", "Premier.qzl", "Premier.qzr"}));
}

TEST_F(RenameTest, TheTeamIsAskedForAndToldInAGoodMessage) {
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", "Rangers");
  const Json asked = EventsNamed("input").at(0);
  EXPECT_EQ(asked["prompt"], "Enter NEW Name for    \rRovers");
  EXPECT_EQ(asked["title"], "Edit Team Name");
  EXPECT_EQ(asked["default"], "");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].style, 64);
  EXPECT_EQ(Boxes()[0].title, "Marlowbeck Message");
  EXPECT_EQ(Count("sound"), 0);
}

TEST_F(RenameTest, CaptionsOfTheCommands) {
  OpenSetup(TwoGrades());
  EXPECT_EQ(Caption("cmdEdTeamName"), "Edit Team Name");
  EXPECT_EQ(Caption("cmdEdGradeName"), "Edit Grade Name");
}

TEST_F(RenameTest, ThenTheListsAreAsAtTheStart) {
  OpenSetup(TwoGrades());
  TypeNames("Half", "typed");
  Do("pick cboAddGrd =B Grade");
  RenameTeam("Bulls", "Oxen");
  EXPECT_EQ(Lines("cboAddTm"), (TextList{"Hawks", "Oxen", "Rovers"}));
  EXPECT_EQ(Text("cboAddTm"), "Hawks");
  EXPECT_EQ(Text("cboAddGrd"), "A Grade");
  EXPECT_EQ(Text("txtAddSn"), "");
  EXPECT_EQ(Lines("lstPlayers"), TextList{"Cole, Di"});
  ExpectBackAtTheNames();
}

TEST_F(RenameTest, FilesOfResultsAndLadderComeAboutWithARenamedTeam) {
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(File(kAResults), "");
  EXPECT_EQ(File(kALadder), "");
}

TEST_F(RenameTest, ABlankReplyRenamesNothing) {
  OpenSetup(TwoGrades());
  for (const char* command : {"cmdEdTeamName", "cmdEdGradeName"}) {
    for (const char* reply : {"input-cancel", "input", "input     "}) {
      Do(reply);
      Do(std::string("click ") + command);
      EXPECT_EQ(Count("input"), 1);
      EXPECT_TRUE(Boxes().empty());
      ExpectBackAtTheNames();
    }
  }
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  EXPECT_TRUE(GradeFiles().empty());
}

TEST_F(RenameTest, AReplyThatIsBlankWhereItIsCutRenamesNothing) {
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", std::string(30, ' ') + "x");
  EXPECT_TRUE(Boxes().empty());
  RenameGrade("A Grade", std::string(20, ' ') + "x");
  EXPECT_TRUE(Boxes().empty());
  ExpectBackAtTheNames();
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(RenameTest, ATeamOfAnyGradeIsInUseInAnyCase) {
  OpenSetup(TwoGrades());
  for (const char* reply : {"Hawks", "  bULLs ", "ROVERS", "rovers"}) {
    RenameTeam("Rovers", reply);
    EXPECT_EQ(BoxTexts(), TextList{"Name is already in use.    "}) << reply;
    EXPECT_EQ(Boxes().at(0).style, 48);
    ExpectBackAtTheNames();
  }
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(RenameTest, AGradeIsInUseInAnyCase) {
  WriteResults(kAResults, {Night(1, "Rovers", "Hawks")});
  OpenSetup(TwoGrades());
  for (const char* reply : {"B Grade", "a grade", " A GRADE "}) {
    RenameGrade("A Grade", reply);
    EXPECT_EQ(BoxTexts(), TextList{"Name is already in use.    "}) << reply;
    ExpectBackAtTheNames();
  }
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  EXPECT_EQ(GradeFiles(), TextList{"A Grade.qzr"});
}

TEST_F(RenameTest, TheBlankTeamIsNotRenamed) {
  const std::vector<PlayerRecord> players = {Player(1, "Archer", "Jo", "", "A Grade"),
                                             Player(2, "Baker", "Al", "Rovers", "A Grade")};
  const std::vector<ResultRecord> results = {Night(2, "Rovers", "")};
  WriteResults(kAResults, results);
  OpenSetup(players);
  RenameTeam("", "Rangers");
  EXPECT_TRUE(Boxes().empty());
  ExpectBackAtTheNames();
  EXPECT_EQ(File(kPlayerFile), FileOf(players));
  EXPECT_EQ(File(kAResults), FileOf(results));
}

TEST_F(RenameTest, TheBlankGradeGetsAName) {
  WriteResults("Winter_.qzr", {Night(1, "Rovers", "Hawks")});
  OpenSetup({Player(1, "Archer", "Jo", "Rovers", "", 111)});
  RenameGrade("", "Premier");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("", "Premier")});
  EXPECT_TRUE(SamePlayers(File(kPlayerFile),
                          FileOf({Player(1, "Archer", "Jo", "Rovers", "Premier", 111)})));
  EXPECT_EQ(GradeFiles(), TextList{"Premier.qzr"});
}

TEST_F(RenameTest, TheGradeIsAskedForByItsOwnTitle) {
  OpenSetup(TwoGrades());
  RenameGrade("B Grade", "Reserves");
  EXPECT_EQ(EventsNamed("input").at(0)["prompt"], "Enter NEW Name for    \rB Grade");
  EXPECT_EQ(EventsNamed("input").at(0)["title"], "Edit Grade Name");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("B Grade", "Reserves")});
  EXPECT_EQ(Boxes().at(0).style, 64);
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"A Grade", "Reserves"}));
  ExpectBackAtTheNames();
  EXPECT_TRUE(GradeFiles().empty());
}

TEST_F(RenameTest, AllFilesOfTheGradeFollowButItsWorkFile) {
  for (const char* extension : {".qzr", ".qzl", ".qzi", ".qzs", ".qz3"}) {
    WriteFile(std::string("Winter_A Grade") + extension, extension);
  }
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "Premier");
  EXPECT_EQ(GradeFiles(),
            (TextList{"A Grade.qz3", "Premier.qzi", "Premier.qzl", "Premier.qzr", "Premier.qzs"}));
}

TEST_F(RenameTest, TheChainOfRenamesStopsAtTheFirstMissingFileWithoutAWord) {
  WriteFile("Winter_A Grade.qzr", "");
  WriteFile("Winter_A Grade.qzi", "3 points");
  WriteFile("Winter_A Grade.qzs", "\"Winter\"\r\n");
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "Premier");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("A Grade", "Premier")});
  EXPECT_EQ(GradeFiles(), (TextList{"A Grade.qzi", "A Grade.qzs", "Premier.qzr"}));
  EXPECT_EQ(Lines("cboAddGrd"), (TextList{"B Grade", "Premier"}));
  ExpectBackAtTheNames();
}

TEST_F(RenameTest, AGradeWithoutResultsLosesItsLadderConfiguration) {
  WriteFile("Winter_A Grade.qzi", "3 points");
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "Premier");
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(GradeFiles(), TextList{"A Grade.qzi"});
}

TEST_F(RenameTest, AFileOfTheNewNameEndsTheChainAndStays) {
  const std::string old_ladder = FileOf(std::vector<LadderRecord>{Match("Old", "Older")});
  WriteFile("Winter_A Grade.qzr", "");
  WriteFile(kALadder, FileOf(std::vector<LadderRecord>{Match("Rovers", "Hawks")}));
  WriteFile("Winter_A Grade.qzs", "\"Winter\"\r\n");
  WriteFile("Winter_Premier.qzl", old_ladder);
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "Premier");
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(GradeFiles(), (TextList{"A Grade.qzl", "A Grade.qzs", "Premier.qzl", "Premier.qzr"}));
  EXPECT_EQ(File("Winter_Premier.qzl"), old_ladder);
}

TEST_F(RenameTest, TheFileNamesInHandStayThoseOfTheOldName) {
  WriteFile("Winter_A Grade.qzr", "");
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "Premier");
  const std::string before = InSession("PlayerFile").get<std::string>();
  const std::string base = before.substr(0, before.size() - 4) + "_A Grade";
  EXPECT_EQ(InSession("ResultsFile"), base + ".qzr");
  EXPECT_EQ(InSession("LadderFile"), base + ".qzl");
  EXPECT_EQ(InSession("LadderConfigFile"), base + ".qzi");
  EXPECT_EQ(InSession("SeasonFile"), base + ".qzs");
}

TEST_F(RenameTest, TheBoxComesBeforeTheFilesAreRenamed) {
  HOLDS_FOR_MODELS_ALONE("one face's disk fails");
  WriteFile("Winter_A Grade.qzr", "");
  OpenSetup(TwoGrades());
  Do("fault rename 2 57");  // the first puts the players in their place
  RenameGrade("A Grade", "Premier");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("A Grade", "Premier")});
  EXPECT_EQ(GradeFiles(), TextList{"A Grade.qzr"});
  EXPECT_EQ(Saved().at(0).Grade, FixedWidth("Premier", 20));
}

TEST_F(RenameTest, AGradeIsCutToTwentyLettersInRecordsAndFileNames) {
  WriteFile("Winter_A Grade.qzr", "");
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "Twenty-one characters");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("A Grade", "Twenty-one characters")});
  EXPECT_EQ(Saved().at(0).Grade, "Twenty-one character");
  EXPECT_EQ(GradeFiles(), TextList{"Twenty-one character.qzr"});
}

TEST_F(RenameTest, BlanksRoundAGradeStandInTheRecordsAndNotInFileNames) {
  WriteFile("Winter_A Grade.qzr", "");
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "  Premier  ");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("A Grade", "  Premier  ")});
  EXPECT_EQ(Saved().at(0).Grade, FixedWidth("  Premier", 20));
  EXPECT_EQ(GradeFiles(), TextList{"Premier.qzr"});
  Do("pick cboAddGrd =Premier");
  Do("pick cboAddTm =Hawks");
  EXPECT_EQ(Lines("lstPlayers"), TextList{"Cole, Di"});
}

TEST_F(RenameTest, ANameThatIsTakenOnceItIsCutIsInUse) {
  const std::string thirty = "123456789012345678901234567890";
  OpenSetup({Player(1, "Archer", "Jo", thirty, "Twenty-one character", 111),
             Player(2, "Baker", "Al", "Rovers", "A Grade", 111)});
  RenameTeam("Rovers", thirty + "1");
  EXPECT_EQ(BoxTexts(), TextList{"Name is already in use.    "});
  RenameGrade("A Grade", "Twenty-one characters");
  EXPECT_EQ(BoxTexts(), TextList{"Name is already in use.    "});
  EXPECT_EQ(Saved().at(1).Team, FixedWidth("Rovers", 30));
}

TEST_F(RenameTest, TeamsOfThirtyAndMoreLettersAreCutEverywhereAlike) {
  const std::string thirty = "123456789012345678901234567890";
  WriteResults(kAResults, {Night(1, "Rovers", "Hawks"), Night(3, "Hawks", "Rovers")});
  WriteFile(kALadder, FileOf(std::vector<LadderRecord>{Match("Rovers", "Hawks")}));
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", thirty + "1");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("Rovers", thirty + "1")});
  EXPECT_EQ(Saved().at(0).Team, thirty);
  EXPECT_EQ(Results(kAResults).at(0).Team, thirty);
  EXPECT_EQ(Results(kAResults).at(1).Opposition, thirty);
  EXPECT_TRUE(
      SameMatches(File(kALadder), FileOf(std::vector<LadderRecord>{Match(thirty, "Hawks")})));
  // And back again.
  RenameTeam(thirty, "Rovers");
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(RenameTest, QuotesAndCommasAreLettersLikeOthers) {
  const std::string name = "\"The\" Rovers, O'Hara & Co";
  WriteResults(kAResults, {Night(1, "Rovers", "Hawks")});
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", name);
  EXPECT_EQ(BoxTexts(), TextList{Renamed("Rovers", name)});
  EXPECT_EQ(Results(kAResults).at(0).Team, FixedWidth(name, 30));
  RenameGrade("A Grade", "\"A\", Grade");
  EXPECT_EQ(GradeFiles(), (TextList{"\"A\", Grade.qzl", "\"A\", Grade.qzr"}));
  RenameTeam(name, "Rovers");
  EXPECT_EQ(Results("Winter_\"A\", Grade.qzr").at(0).Team, FixedWidth("Rovers", 30));
}

TEST_F(RenameTest, ATeamMayHaveASlash) {
  WriteResults(kAResults, {Night(1, "Rovers", "Hawks")});
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", "Rovers/2\\3:*?");
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Results(kAResults).at(0).Team, FixedWidth("Rovers/2\\3:*?", 30));
}

TEST_F(RenameTest, AGradeNamedForNoFileKeepsItsFilesAndIsNamedBack) {
  WriteResults(kAResults, {Night(1, "Rovers", "Hawks")});
  WriteFile(kALadder, FileOf(std::vector<LadderRecord>{Match("Rovers", "Hawks")}));
  OpenSetup(TwoGrades());
  RenameGrade("A Grade", "A/B");
  EXPECT_EQ(BoxTexts(), TextList{Renamed("A Grade", "A/B")});
  EXPECT_EQ(Saved().at(0).Grade, FixedWidth("A/B", 20));
  EXPECT_EQ(GradeFiles(), (TextList{"A Grade.qzl", "A Grade.qzr"}));
  ExpectBackAtTheNames();
  RenameGrade("A/B", "A Grade");
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
}

TEST_F(RenameTest, InAGradeNamedForNoFileTheTeamsPlayersAreRenamedAndTheRestIsTold) {
  OpenSetup({Player(1, "Archer", "Jo", "Rovers", "A/B", 111),
             Player(2, "Baker", "Al", "Hawks", "A/B", 111)});
  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(BoxTexts(), TextList{"PATH NOT FOUND    "});
  EXPECT_TRUE(
      SamePlayers(File(kPlayerFile), FileOf({Player(1, "Archer", "Jo", "Rangers", "A/B", 111),
                                             Player(2, "Baker", "Al", "Hawks", "A/B", 111)})));
  EXPECT_TRUE(Enabled("cmdEdTeamName"));
  EXPECT_TRUE(Enabled("cmdAddCancel"));
}

TEST_F(RenameTest, TeamsOfOtherGradesAndTheirFilesAreLeftAlone) {
  const std::string results = FileOf(std::vector<ResultRecord>{Night(4, "Bulls", "Rovers")});
  WriteFile("Winter_B Grade.qzr", results);
  std::vector<PlayerRecord> players = TwoGrades();
  players[3].Team = "Rovers";
  OpenSetup(players);
  RenameTeam("Rovers", "Rangers");
  players[0].Team = "Rangers";
  players[1].Team = "Rangers";
  EXPECT_TRUE(SamePlayers(File(kPlayerFile), FileOf(players)));
  EXPECT_EQ(File("Winter_B Grade.qzr"), results);
}

TEST_F(RenameTest, NamesThatDifferInCaseAreOthers) {
  WriteResults(kAResults, {Night(1, "ROVERS", "Rovers")});
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(Results(kAResults).at(0).Team, FixedWidth("ROVERS", 30));
  EXPECT_EQ(Results(kAResults).at(0).Opposition, FixedWidth("Rangers", 30));
}

TEST_F(RenameTest, FilesCutInARecordKeepTheBytesBehindTheirWholeRecords) {
  const std::string results =
      FileOf(std::vector<ResultRecord>{Night(1, "Rovers", "Hawks"), Night(2, "Rovers", "Hawks")});
  const std::string ladder =
      FileOf(std::vector<LadderRecord>{Match("Rovers", "Hawks"), Match("Hawks", "Rovers")});
  WriteFile(kAResults, results.substr(0, results.size() - 1));
  WriteFile(kALadder, ladder.substr(0, ladder.size() - 1));
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(File(kAResults), FileOf(std::vector<ResultRecord>{Night(1, "Rangers", "Hawks")}) +
                                 results.substr(kResultLength, kResultLength - 1));
  EXPECT_EQ(File(kALadder), FileOf(std::vector<LadderRecord>{Match("Rangers", "Hawks")}) +
                                ladder.substr(kLadderLength, kLadderLength - 1));
}

TEST_F(RenameTest, TooManyResultsAreToldAfterThePlayersAreRenamed) {
  const std::string results(32768 * kResultLength, ' ');
  WriteFile(kAResults, results);
  OpenSetup(TwoGrades());
  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(BoxTexts(), TextList{"OVERFLOW    "});
  EXPECT_EQ(Saved().at(0).Team, FixedWidth("Rangers", 30));
  EXPECT_EQ(File(kAResults), results);
  EXPECT_FALSE(HasFile(kALadder));
}

TEST_F(RenameTest, ATeamIsNamedBackAfterAFailureHalfWay) {
  HOLDS_FOR_MODELS_ALONE("one face's disk fails");
  const std::vector<ResultRecord> results = {Night(1, "Rovers", "Hawks")};
  WriteResults(kAResults, results);
  WriteFile(kALadder, FileOf(std::vector<LadderRecord>{Match("Rovers", "Hawks")}));
  OpenSetup(TwoGrades());
  Do("fault rename 2 57");  // that of the results
  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(BoxTexts(), TextList{"DEVICE I/O ERROR    "});
  EXPECT_EQ(Saved().at(0).Team, FixedWidth("Rangers", 30));
  EXPECT_EQ(File(kAResults), FileOf(results));
  Do("click cmdAddCancel");
  Do("click imgPlayers");
  RenameTeam("Rangers", "Rovers");
  EXPECT_EQ(File(kPlayerFile), FileOf(TwoGrades()));
  RenameTeam("Rovers", "Rangers");
  EXPECT_EQ(Results(kAResults).at(0).Team, FixedWidth("Rangers", 30));
}

TEST_F(RenameTest, AnEmptyPlayerFileHasNothingToRename) {
  OpenSetup({});
  EXPECT_FALSE(Shown("cmdEdTeamName"));
  Refused("click cmdEdTeamName");
  Refused("click cmdEdGradeName");
}

}  // namespace
}  // namespace marlowbeck
