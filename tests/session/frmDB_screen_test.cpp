#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

constexpr const char* kNoFile =
    "No Marlowbeck file is open.\rTo Open an existing file, select       \r"
    "Open from the File Menu.\r\rTo Create a NEW file, select\rNEW from the File Menu.";
constexpr const char* kEmptyFile =
    "Your file does not contain any data.    \r\r"
    "Do you want to enter Grades, Teams and Players now?    ";
constexpr const char* kNotFound =
    "The file name specified could    \rnot be found. Please retry.    ";

class MainMenu : public ClubTest {
 protected:
  /// A competition in the working folder that is open at the start.
  void OpenAtStart(const std::vector<PlayerRecord>& players) {
    WritePlayers("Winter.qza", players);
    NameOpenFile("Winter.qza");
  }

  void OpenTwoTeams() {
    OpenAtStart({Player(1, "Archer", "Jo", "Rovers", "A Grade"),
                 Player(2, "Bull", "Ann", "Hawks", "A Grade")});
  }

  std::string OpenFile() { return InSession("PlayerFile").get<std::string>(); }
  std::string InFolder(const std::string& name) { return FilePath(name).string(); }
  std::string FileNameSays() { return File("FileName.qz3"); }
  std::string Naming(const std::string& name) { return '"' + InFolder(name) + "\"\r\n"; }
};

TEST_F(MainMenu, FirstStartIsQuietWithItsCommandsOff) {
  Do("events");
  EXPECT_TRUE(Events().empty());
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] ");
  for (const char* off : {"imgPlayers", "imgSheets", "imgLadder", "imgKO", "imgPrinter", "mnuClose",
                          "mnuSeason", "mnuGameNames", "mnuPlayersLists", "mnuSearchPlayer"}) {
    EXPECT_FALSE(Enabled(off)) << off;
  }
  for (const char* on : {"imgbackup", "imgExit", "mnuOpen", "mnuNew", "mnuAssociation", "mnuFix"}) {
    EXPECT_TRUE(Enabled(on)) << on;
  }
  EXPECT_EQ(Caption("lblVersion"), "Version 4.2");
  EXPECT_FALSE(Shown("Command1"));
  EXPECT_FALSE(HasFile("FileName.qz3"));
}

TEST_F(MainMenu, StartWritesTheGameNamesEveryInstallationBeginsWith) {
  Start();
  EXPECT_EQ(File("GameName.qz3"), "Triples\r\nDoubles\r\nSingles\r\nTpls\r\nDbls\r\nSgls\r\n");
}

TEST_F(MainMenu, CaptionsOfTheMenus) {
  Start();
  EXPECT_EQ(Caption("mnuFile"), "&File");
  EXPECT_EQ(Caption("mnuExit"), "E&xit");
  EXPECT_EQ(Caption("mnuEdit"), "&Activities");
  EXPECT_EQ(Caption("mnuSeason"), "Change &Season Description");
  EXPECT_EQ(Caption("mnuGameNames"), "Change &Game Names");
  EXPECT_EQ(Caption("mnuSearchPlayer"), "Searc&h for a Player");
  EXPECT_EQ(Caption("mnuAssociation"), "Association &Name");
  EXPECT_EQ(Caption("mnuHelpIndex"), "&Help Table of Contents");
  EXPECT_EQ(Caption("mnuAbout"), "&About Marlow-Beck");
  EXPECT_EQ(Caption("lblEsc"), "Press ESC to Quit");
}

TEST_F(MainMenu, ScreenNarrowerThanItsLeastEndsTheProgram) {
  screen_width = 10999;
  Do("events");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text,
            "Your screen resolution must be set to    \r"
            "a minimum of 800 x 600 (16 bit graphics).    \r"
            "Please adjust your settings and restart Marlowbeck.    ");
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(Count("ended"), 1);
}

TEST_F(MainMenu, ScreenOfTheLeastWidthWillDo) {
  screen_width = 11000;
  Do("events");
  EXPECT_EQ(Count("ended"), 0);
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(MainMenu, LastCompetitionOpensByItself) {
  OpenTwoTeams();
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] Filename: WINTER");
  EXPECT_EQ(Caption("lblHMPlayers"), "2 Players Listed in File. ");
  for (const char* on : {"imgPlayers", "imgSheets", "imgLadder", "imgKO", "imgPrinter", "mnuClose",
                         "mnuSeason", "mnuGameNames", "mnuPlayersLists", "mnuSearchPlayer"}) {
    EXPECT_TRUE(Enabled(on)) << on;
  }
}

TEST_F(MainMenu, FileThatAnotherProgramOpenedIsTheOpenOneOnComingBack) {
  OpenTwoTeams();
  WritePlayers("Other.qza", {Player(7, "Cole", "Sam", "Kings", "B Grade")});
  Start();
  NameOpenFile("Other.qza");
  DoAll({"click mnuAbout", "click cmdOK"});
  EXPECT_EQ(OpenFile(), InFolder("Other.qza"));
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] Filename: OTHER");
  EXPECT_EQ(Caption("lblHMPlayers"), "1 Player Listed in File. ");
}

TEST_F(MainMenu, AnotherCompetitionGoesOnWithTheSameWorkDate) {
  OpenTwoTeams();
  WriteFile("WkDate.qz3", "#2004-03-10#\r\n");
  WritePlayers("Other.qza", {Player(1, "Reed", "Jo", "Rovers", "B Grade"),
                             Player(2, "Hill", "Al", "Hawks", "B Grade")});
  DoAll({"click imgSheets", "date Cal 2004-04-07", "click cmdGotoResults", "close frmResults"});
  DoAll({"file Other.qza", "click mnuOpen"});
  EXPECT_EQ(File("WkDate.qz3"), "#2004-04-07#\r\n");
  Do("click imgSheets");
  EXPECT_EQ(DateOf("Cal"), "2004-04-07");
}

TEST_F(MainMenu, FileOfNoBytesIsAValidEmptyCompetition) {
  OpenAtStart({});
  EXPECT_EQ(Caption("lblHMPlayers"), " Current File is Empty ");
  EXPECT_TRUE(Enabled("imgPlayers"));
  for (const char* off : {"imgSheets", "imgLadder", "imgKO", "imgPrinter"})
    EXPECT_FALSE(Enabled(off));
}

TEST_F(MainMenu, OnePlayerLeavesTheKnockOutAsItStood) {
  OpenAtStart({Player(1, "Archer", "Jo", "Rovers", "A Grade")});
  EXPECT_EQ(Caption("lblHMPlayers"), "1 Player Listed in File. ");
  EXPECT_TRUE(Enabled("imgSheets"));
  EXPECT_FALSE(Enabled("imgKO"));
}

TEST_F(MainMenu, KnockOutOnceLitStaysLitWithOnePlayer) {
  OpenTwoTeams();
  Do("events");
  WritePlayers("Winter.qza", {Player(1, "Archer", "Jo", "Rovers", "A Grade")});
  DoAll({"click mnuAbout", "click cmdOK"});
  EXPECT_EQ(Caption("lblHMPlayers"), "1 Player Listed in File. ");
  EXPECT_TRUE(Enabled("imgKO"));
}

TEST_F(MainMenu, BytesOfAPartialLastRecordAreNotCounted) {
  const auto file = FileOf({Player(1, "Archer", "Jo", "Rovers", "A Grade"),
                            Player(2, "Bull", "Ann", "Hawks", "A Grade")});
  WriteFile("Winter.qza", file.substr(0, 200));
  NameOpenFile("Winter.qza");
  EXPECT_EQ(Caption("lblHMPlayers"), "1 Player Listed in File. ");
}

TEST_F(MainMenu, NameOfAFileThatHasGoneMakesAnEmptyOne) {
  NameOpenFile("Gone.qza");
  EXPECT_EQ(Caption("lblHMPlayers"), " Current File is Empty ");
  EXPECT_EQ(File("Gone.qza"), "");
}

TEST_F(MainMenu, FolderThatHasGoneEndsInTheErrorBoxOnce) {
  WriteFile("FileName.qz3", "\"{folder}/away/Winter.qza\"\r\n");
  Do("events");
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"PATH NOT FOUND    "}));
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 76);
  EXPECT_EQ(Boxes()[0].title, "Marlowbeck Error!");
  EXPECT_EQ(Boxes()[0].style, 16);
  EXPECT_EQ(InSession("PlayerCount"), 0);
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(MainMenu, GarbledFileNameIsPassedOverInSilence) {
  WriteFile("FileName.qz3", "");
  Do("events");
  EXPECT_TRUE(Events().empty());
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] ");
}

TEST_F(MainMenu, FileNameWithUnixLineEndIsRead) {
  WritePlayers("Winter.qza", {Player(1, "Archer", "Jo", "Rovers", "A Grade")});
  WriteFile("FileName.qz3", "\"{folder}/Winter.qza\"\n");
  EXPECT_EQ(Caption("lblHMPlayers"), "1 Player Listed in File. ");
}

TEST_F(MainMenu, EmptyNameTellsThatNoFileIsOpen) {
  WriteFile("FileName.qz3", "\"\"\r\n");
  Do("events");
  ASSERT_EQ(BoxTexts(), (std::vector<std::string>{kNoFile}));
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_EQ(Boxes()[0].title, "Marlowbeck Message");
  EXPECT_EQ(Count("beep"), 1);
  EXPECT_EQ(Caption("lblHMPlayers"), " No File Open ");
}

TEST_F(MainMenu, HoverMarksOneCommandUntilTheBareScreenIsReached) {
  OpenTwoTeams();
  EXPECT_FALSE(Shown("lblDescription"));
  Do("hover imgSheets");
  EXPECT_EQ(Caption("lblDescription"), " Enter results from score sheets. ");
  EXPECT_TRUE(Shown("lblDescription"));
  Do("hover imgExit");
  EXPECT_EQ(Caption("lblDescription"), " Enter results from score sheets. ");
  Do("hover frmDB");
  EXPECT_FALSE(Shown("lblDescription"));
  Do("hover imgExit");
  EXPECT_EQ(Caption("lblDescription"), " Quit Marlowbeck. ");
}

TEST_F(MainMenu, StatusTextOfEachCommand) {
  OpenTwoTeams();
  const std::vector<std::pair<const char*, const char*>> texts = {
      {"imgPlayers", " Add Edit Search - Players Teams Grades. "},
      {"imgSheets", " Enter results from score sheets. "},
      {"imgLadder", " Enter scores for Premiership Ladder. "},
      {"imgKO", " Enter Players for Knock-Out. "},
      {"imgPrinter", " View and print players results. "},
      {"imgbackup", " Copy your data files to another disk. "},
      {"imgExit", " Quit Marlowbeck. "}};
  for (const auto& [picture, text] : texts) {
    DoAll({"hover frmDB", std::string("hover ") + picture});
    EXPECT_EQ(Caption("lblDescription"), text);
  }
}

TEST_F(MainMenu, StatusLineAnswersToTheFocusAsToThePointer) {
  OpenTwoTeams();
  EXPECT_EQ(Focus(), "frmDB.imgPlayers");
  Do("key Tab");
  EXPECT_EQ(Focus(), "frmDB.imgSheets");
  EXPECT_EQ(Caption("lblDescription"), " Enter results from score sheets. ");
  Do("key Down");
  EXPECT_EQ(Caption("lblDescription"), " Enter scores for Premiership Ladder. ");
}

TEST_F(MainMenu, NewMakesAnEmptyFileAndAsksForPlayers) {
  DoAll({"answer no", "file Winter.qza", "click mnuNew"});
  const Json dialog = EventsNamed("file").at(0);
  EXPECT_EQ(dialog["mode"], "save");
  EXPECT_EQ(dialog["title"], "(Marlowbeck)  Create NEW file.");
  EXPECT_EQ(dialog["filter"], "*.qza");
  EXPECT_EQ(dialog["name"], "*.qza");
  EXPECT_EQ(dialog["ext"], "qza");
  ASSERT_EQ(BoxTexts(), (std::vector<std::string>{kEmptyFile}));
  EXPECT_EQ(Boxes()[0].style, 68);
  EXPECT_EQ(File("Winter.qza"), "");
  EXPECT_EQ(FileNameSays(), Naming("Winter.qza"));
  EXPECT_EQ(Caption("lblHMPlayers"), " Current File is Empty ");
  EXPECT_TRUE(Enabled("mnuClose"));
  EXPECT_TRUE(Enabled("mnuSeason"));
}

TEST_F(MainMenu, NewWithYesLeadsToTheSetup) {
  DoAll({"answer yes", "file Winter.qza", "click mnuNew"});
  EXPECT_EQ(Front(), "frmNames");
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(MainMenu, CancelledNewOnAFirstStartChangesNothing) {
  DoAll({"file-cancel", "click mnuNew"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(OpenFile(), "");
}

TEST_F(MainMenu, NameLeftAtThePatternCancelsNew) {
  DoAll({"file *", "click mnuNew"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_FALSE(HasFile("FileName.qz3"));
}

TEST_F(MainMenu, CancellingNewAfterAgreeingToCloseBringsTheOldFileBack) {
  OpenTwoTeams();
  DoAll({"answer no", "answer yes", "file-cancel", "click mnuNew"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{
                            "You have 2 players in your current file:\r" + InFolder("Winter.qza") +
                                "\rDo you want to start your new file using    \r"
                                "the same Grades, Teams and Players ?   ",
                            "The file " + InFolder("Winter.qza") + "    \r" +
                                "must be closed before CREATING a NEW file.    \r\r" +
                                "Do you wish to close this file ?"}));
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
  EXPECT_EQ(Caption("lblHMPlayers"), "2 Players Listed in File. ");
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] Filename: WINTER");
  EXPECT_TRUE(Enabled("mnuClose"));
}

TEST_F(MainMenu, NotClosingTheOldFileStopsNew) {
  OpenTwoTeams();
  DoAll({"answer no", "answer no", "click mnuNew"});
  EXPECT_EQ(Count("file"), 0);
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
}

TEST_F(MainMenu, NewOnANameThatHoldsRecordsLeavesThatFileUntouchedAndOpen) {
  OpenTwoTeams();
  const auto other = std::vector<PlayerRecord>{Player(7, "Cole", "Sam", "Kings", "B Grade")};
  WritePlayers("Other.qza", other);
  DoAll({"answer yes", "file Other.qza", "click mnuNew"});
  EXPECT_EQ(BoxTexts().at(1), "The file you are trying to create    \ralready exists.    ");
  EXPECT_TRUE(SamePlayers(File("Other.qza"), FileOf(other)));
  EXPECT_EQ(OpenFile(), InFolder("Other.qza"));
  EXPECT_EQ(FileNameSays(), Naming("Other.qza"));
  EXPECT_EQ(Caption("lblHMPlayers"), "1 Player Listed in File. ");
}

TEST_F(MainMenu, CarryOverCopiesEveryPlayerAndNothingElse) {
  OpenTwoTeams();
  WriteFile("Winter_A Grade.qzs", "\"OLD\"\r\n");
  const std::string players = File("Winter.qza");
  DoAll({"answer yes", "file Summer.qza", "click mnuNew"});
  EXPECT_TRUE(SamePlayers(File("Summer.qza"), players));
  EXPECT_FALSE(HasFile("Summer_A Grade.qzs"));
  EXPECT_EQ(File("Winter.qza"), players);
  EXPECT_EQ(Caption("lblHMPlayers"), "2 Players Listed in File. ");
  EXPECT_EQ(Boxes().size(), 1U);
}

TEST_F(MainMenu, CarryOverOntoAnExistingEmptyFileCopiesIntoIt) {
  OpenTwoTeams();
  WriteFile("Summer.qza", "");
  DoAll({"answer yes", "file Summer.qza", "click mnuNew"});
  EXPECT_TRUE(SamePlayers(File("Summer.qza"), File("Winter.qza")));
}

TEST_F(MainMenu, CarryOverIsNotOfferedForAnEmptyFile) {
  OpenAtStart({});
  DoAll({"answer yes", "file Summer.qza", "answer no", "click mnuNew"});
  EXPECT_EQ(BoxTexts().size(), 2U);
  EXPECT_EQ(BoxTexts().at(0).substr(0, 9), "The file ");
}

TEST_F(MainMenu, NewInAFolderThatIsNotThereIsToldAndTheOldFileStaysOpen) {
  OpenTwoTeams();
  DoAll({"answer yes", "file {folder}/away/Summer.qza", "click mnuNew"});
  EXPECT_EQ(BoxTexts().at(1), kNotFound);
  EXPECT_EQ(FileNameSays(), Naming("Winter.qza"));
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
  EXPECT_EQ(Count("error"), 0);
}

TEST_F(MainMenu, OpenShowsThePickedCompetition) {
  WritePlayers("Other.qza", {Player(7, "Cole", "Sam", "Kings", "B Grade")});
  DoAll({"file Other.qza", "click mnuOpen"});
  const Json dialog = EventsNamed("file").at(0);
  EXPECT_EQ(dialog["mode"], "open");
  EXPECT_EQ(dialog["title"], "[Marlowbeck] OPEN file.");
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] Filename: OTHER");
  EXPECT_EQ(FileNameSays(), Naming("Other.qza"));
}

TEST_F(MainMenu, LastFourCharactersOfThePickedPathBecomeTheExtension) {
  DoAll({"file Winter.txt", "click mnuOpen"});
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
}

TEST_F(MainMenu, PathWithoutExtensionLosesItsLastFourCharacters) {
  DoAll({"file SomeCups", "click mnuOpen"});
  EXPECT_EQ(OpenFile(), InFolder("Some.qza"));
}

TEST_F(MainMenu, CancelledOpenChangesNothing) {
  OpenTwoTeams();
  DoAll({"file *", "click mnuOpen"});
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
  DoAll({"file-cancel", "click mnuOpen"});
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
}

TEST_F(MainMenu, BadPathInOpenIsToldAndTheOldFileStaysOpen) {
  OpenTwoTeams();
  DoAll({"file {folder}/away/Other.qza", "click mnuOpen"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{kNotFound}));
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
  EXPECT_EQ(FileNameSays(), Naming("Winter.qza"));
}

TEST_F(MainMenu, ClosePutsAllOutButTheNameSearch) {
  OpenTwoTeams();
  Do("click mnuClose");
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{kNoFile}));
  EXPECT_EQ(FileNameSays(), "\"\"\r\n");
  EXPECT_EQ(OpenFile(), "");
  EXPECT_EQ(InSession("PlayerCount"), 0);
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] ");
  EXPECT_EQ(Caption("lblHMPlayers"), " No File Open ");
  for (const char* off : {"imgPlayers", "imgSheets", "imgLadder", "imgKO", "imgPrinter", "mnuClose",
                          "mnuSeason", "mnuGameNames", "mnuPlayersLists"}) {
    EXPECT_FALSE(Enabled(off)) << off;
  }
  EXPECT_TRUE(Enabled("mnuSearchPlayer"));
}

TEST_F(MainMenu, ScoreSheetsWantASecondTeamInTheFirstPlayersGrade) {
  // KEPT: the first grade has one team, another has two; a knock-out is refused for teams too.
  OpenAtStart({Player(1, "Archer", "Jo", "Rovers", "A Grade"),
               Player(2, "Bull", "Ann", "Hawks", "B Grade"),
               Player(3, "Cole", "Sam", "Kings", "B Grade")});
  Do("click imgSheets");
  EXPECT_EQ(BoxTexts(),
            (std::vector<std::string>{"You must have at least 2 Teams in each grade    \r"
                                      "before you can enter player's scores.    "}));
  Do("click imgLadder");
  EXPECT_EQ(BoxTexts(),
            (std::vector<std::string>{"You must have at least 2 Teams in your file    \r"
                                      "before using the Ladder.    "}));
  Do("click imgKO");
  EXPECT_EQ(BoxTexts(),
            (std::vector<std::string>{"You must have at least 2 Players for a Knock-Out.    "}));
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(MainMenu, TeamsDifferByCaseOfTheirLetters) {
  OpenAtStart({Player(1, "Archer", "Jo", "Rovers", "A Grade"),
               Player(2, "Bull", "Ann", "ROVERS", "A Grade")});
  Do("click imgLadder");
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(MainMenu, NameSearchAsksForASurname) {
  OpenTwoTeams();
  DoAll({"input smith", "click mnuSearchPlayer"});
  const Json box = EventsNamed("input").at(0);
  EXPECT_EQ(box["prompt"], "Enter SURNAME to Search for.");
  EXPECT_EQ(box["title"], "Name Search");
  EXPECT_EQ(InSession("SearchText"), "SMITH");
  EXPECT_EQ(Front(), "frmSearchPlayer");
}

TEST_F(MainMenu, FixtureBoxComesBackUntilTheNumberIsInRange) {
  DoAll({"input 51", "input 2", "input -1", "click mnuFix"});
  EXPECT_EQ(Count("input"), 3);
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>(
                            2, "Accepted range is from 3 to 50,    \rPlease try again.    ")));
  EXPECT_EQ(EventsNamed("input").at(0)["title"], "(Marlowbeck) Fixture Generator");
  EXPECT_EQ(EventsNamed("input").at(0)["prompt"],
            "Accepted range for this fixture\rgenerator is from 3 to 50.\r\r\r"
            "How many teams in the fixture ?\r");
  EXPECT_EQ(EventsNamed("input").at(0)["default"], "0");
  EXPECT_EQ(Count("beep"), 2);
}

TEST_F(MainMenu, FixtureReplyThatIsNoNumberReadsAsNothing) {
  DoAll({"input many", "click mnuFix"});
  EXPECT_EQ(Count("input"), 1);
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(MainMenu, FixtureReplyBeyondSixteenBitsOverflows) {
  DoAll({"input 32768", "click mnuFix"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{"OVERFLOW    "}));
  EXPECT_EQ(InSession("ErrorNumber"), 6);
}

TEST_F(MainMenu, AssociationNameIsKeptInItsSideFile) {
  DoAll({"input Millbrook \"A\" League, Inc.", "click mnuAssociation"});
  const Json box = EventsNamed("input").at(0);
  EXPECT_EQ(box["prompt"], "Enter the name of your Association.");
  EXPECT_EQ(box["title"], "Association Name");
  EXPECT_EQ(box["default"], "");
  EXPECT_EQ(File("Association.qz3"), "\"Millbrook \"A\" League, Inc.\"\r\n");
}

TEST_F(MainMenu, AssociationNameIsReadAtTheStartAndOfferedAgain) {
  WriteFile("Association.qz3", "\"Millbrook, Darts\"\r\n");
  EXPECT_EQ(InSession("AssociationName"), "Millbrook, Darts");
  DoAll({"input", "click mnuAssociation"});
  EXPECT_EQ(EventsNamed("input").at(0)["default"], "Millbrook, Darts");
  EXPECT_EQ(File("Association.qz3"), "\"Millbrook, Darts\"\r\n");
  EXPECT_EQ(InSession("AssociationName"), "Millbrook, Darts");
}

TEST_F(MainMenu, AboutNamesTheProgramAndComesBack) {
  Do("click mnuAbout");
  EXPECT_EQ(Front(), "frmAbout");
  EXPECT_EQ(Caption("lblVersion"), "Version 4.2");
  Do("key Enter");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmAbout"));
  EXPECT_FALSE(HasFile("FileName.qz3"));
}

TEST_F(MainMenu, HelpOpensItsContents) {
  Do("click mnuHelpIndex");
  EXPECT_EQ(EventsNamed("help").at(0)["file"], "qz1.HLP");
  EXPECT_EQ(EventsNamed("help").at(0)["topic"], 0);
}

TEST_F(MainMenu, MnemonicsReachTheEntriesOfAMenu) {
  DoAll({"key Alt+H", "key Alt+A"});
  EXPECT_EQ(Front(), "frmAbout");
}

TEST_F(MainMenu, EveryCommandTakesTheStatusLineAway) {
  OpenTwoTeams();
  for (const char* command : {"click mnuFix", "click mnuSearchPlayer", "click imgKO"}) {
    DoAll({"hover frmDB", "hover imgPrinter", command});
    EXPECT_EQ(Get("frmDB.lblDescription")["visible"], false) << command;
  }
}

TEST_F(MainMenu, CommandThatFindsNoFileOpenTakesTheStatusLineAwayToo) {
  OpenTwoTeams();
  Start();
  WriteFile("FileName.qz3", "\"\"\r\n");
  DoAll({"click mnuAbout", "click cmdOK"});
  for (const char* command : {"click mnuSeason", "click mnuGameNames", "click mnuPlayersLists"}) {
    DoAll({"hover frmDB", "hover imgExit", command});
    EXPECT_EQ(Front(), "frmDB") << command;
    EXPECT_FALSE(Shown("lblDescription")) << command;
  }
}

TEST_F(MainMenu, DisabledCommandCannotBePointedAt) {
  OpenAtStart({});
  EXPECT_NE(Refused("hover imgSheets").find("imgSheets"), std::string::npos);
}

TEST_F(MainMenu, FailedOpenBringsTheOldCompetitionBackWhole) {
  OpenTwoTeams();
  WritePlayers("Other.qza", {Player(7, "Cole", "Sam", "Kings", "B Grade")});
  DoAll({"file Other.qza", "fault rename 1 70", "click mnuOpen"});
  EXPECT_EQ(BoxTexts(), (std::vector<std::string>{kNotFound}));
  EXPECT_EQ(OpenFile(), InFolder("Winter.qza"));
  EXPECT_EQ(InSession("PlayerCount"), 2);
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] Filename: WINTER");
  EXPECT_EQ(Caption("lblHMPlayers"), "2 Players Listed in File. ");
}

TEST_F(MainMenu, ProgramCanBeLeftWhenItsFolderHasGone) {
  OpenTwoTeams();
  Do("events");
  HOLDS_FOR_MODELS_ALONE("only one face's folder is taken away");
  const std::string away = Folder().string() + "-away";
  std::filesystem::rename(Folder(), away);
  Do("click imgExit");
  EXPECT_EQ(Front(), "frmBuend");
  DoAll({"click optBU(1)", "click cmdAddSave0"});
  EXPECT_EQ(Count("ended"), 1);
  std::filesystem::rename(away, Folder());
}

TEST_F(MainMenu, NewSurvivesAFailureOfTheSideFile) {
  OpenTwoTeams();
  DoAll({"answer yes", "file Summer.qza", "fault rename 2 61", "click mnuNew"});
  EXPECT_EQ(BoxTexts().at(1), kNotFound);
  EXPECT_EQ(FileNameSays(), Naming("Winter.qza"));
  EXPECT_EQ(Caption("lblHMPlayers"), "2 Players Listed in File. ");
}

}  // namespace
}  // namespace marlowbeck
