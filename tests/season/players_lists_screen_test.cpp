// The teams of a grade with their players, read and copied.

#include "support/club.h"
#include "support/record_files.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

const std::string kRule(40, '-');

class PlayersLists : public ClubTest {
 protected:
  static std::vector<PlayerRecord> TwoGrades() {
    return {
        Player(1, "Young", "Al", "Rovers", "A Grade"), Player(2, "Adams", "Bo", "Cubs", "A Grade"),
        Player(3, "Dean", "Cy", "Rovers", "B Grade"),
        Player(4, "Archer", "Di", "Rovers", "A Grade"), Player(5, "Bell", "Ed", "Ants", "B Grade")};
  }
  void Open(const std::vector<PlayerRecord>& players, Here here = Here::current()) {
    WritePlayers("Winter.qza", players);
    NameOpenFile("Winter.qza");
    WriteFile("Association.qz3", "\"Mid Darts\"\r\n");
    Do("click mnuPlayersLists", here);
  }
};

TEST_F(PlayersLists, ShowsTheFirstGradeAtOnce) {
  Open(TwoGrades());
  EXPECT_EQ(Front(), "frmPlayersLists");
  EXPECT_FALSE(Loaded("frmDB") && Shown("frmDB.imgSheets"));
  EXPECT_EQ(Title("frmPlayersLists"), "[Marlowbeck]  Players Lists ");
  EXPECT_EQ(Lines("Combo1"), (TextList{"A Grade", "B Grade"}));
  EXPECT_EQ(Text("Combo1"), "A Grade");
  EXPECT_EQ(Focus(), "frmPlayersLists.cmdClip");
  EXPECT_EQ(InSession("Grade"), "A Grade");
}

TEST_F(PlayersLists, CaptionsOfItsControls) {
  Open(TwoGrades());
  EXPECT_EQ(Caption("Frame1"), "Players Lists");
  EXPECT_EQ(Caption("cmdClip"), "Copy to Clipboard");
  EXPECT_EQ(Caption("cmdExit"), "Exit");
  EXPECT_EQ(Caption("cmdHelp1"), "Help");
}

TEST_F(PlayersLists, TeamsAreSortedAndTheirPlayersInFileOrder) {
  Open(TwoGrades());
  EXPECT_EQ(Lines("lstteams"), (TextList{"Cubs", kRule, "Adams, Bo", "", "Rovers", kRule,
                                         "Young, Al", "Archer, Di", ""}));
}

TEST_F(PlayersLists, ATeamOfAnotherGradeStaysOutEvenWithTheSameName) {
  Open(TwoGrades());
  Do("pick Combo1 =B Grade");
  EXPECT_EQ(Lines("lstteams"),
            (TextList{"Ants", kRule, "Bell, Ed", "", "Rovers", kRule, "Dean, Cy", ""}));
  EXPECT_EQ(InSession("Grade"), "B Grade");
  EXPECT_EQ(Focus(), "frmPlayersLists.cmdClip");
}

TEST_F(PlayersLists, AFileOfOnePlayerShowsTheTeamAlone) {
  Open({Player(1, "Young", "Al", "Rovers", "A Grade")});
  EXPECT_EQ(Lines("lstteams"), (TextList{"Rovers"}));
  EXPECT_EQ(InSession("Grade"), "A Grade");
}

TEST_F(PlayersLists, AFileWithoutPlayersShowsNothing) {
  Open({});
  EXPECT_TRUE(Lines("Combo1").empty());
  EXPECT_TRUE(Lines("lstteams").empty());
  EXPECT_TRUE(Boxes().empty());
}

TEST_F(PlayersLists, BlankTeamsAndNamesAreListedToo) {
  Open({Player(1, "", "Al", "", "A Grade"), Player(2, "Bo", "", "Cubs", "A Grade")});
  EXPECT_EQ(Lines("lstteams"), (TextList{"", kRule, ", Al", "", "Cubs", kRule, "Bo,", ""}));
}

TEST_F(PlayersLists, AThousandPlayersOfAGradeAreTooMany) {
  std::vector<PlayerRecord> players;
  for (int id = 1; id <= 1000; ++id) players.push_back(Player(id, "S", "F", "Rovers", "A Grade"));
  Open(players);
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 9);
  EXPECT_TRUE(Lines("lstteams").empty());
}

TEST_F(PlayersLists, WithoutAnOpenFileThatIsTold) {
  HOLDS_FOR_MODELS_ALONE("the main menu does not open it without a file");
  WriteFile("FileName.qz3", "\"\"\r\n");
  Do("events");  // the main menu's own box at the start
  ScreensOf().Show("frmPlayersLists");
  Do("events");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text.substr(0, 28), "No Marlowbeck file is open.\r");
  EXPECT_TRUE(Lines("lstteams").empty());
}

TEST_F(PlayersLists, TheClipboardGetsTitleAndLines) {
  WriteFile("Winter_B Grade.qzs", "\"Winter 2004  \"\r\n");
  Open(TwoGrades());
  Do("pick Combo1 =B Grade");
  Do("click cmdClip");
  EXPECT_EQ(EventsNamed("clipboard").back(),
            "Mid Darts\r\nWinter 2004\r\nPLAYER LIST\r\n\r\nAnts\r\n" + kRule +
                "\r\nBell, Ed\r\n\r\nRovers\r\n" + kRule + "\r\nDean, Cy\r\n\r\n");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text,
            "The Player List has been copied to the clipboard    \r"
            "and can now be pasted as text into your    \r"
            "favourite spreadsheet or wordprocessor.    \r\r"
            "Note: When you leave this section,    \rthe Clipboard will be cleared !");
}

TEST_F(PlayersLists, LeavingDoesNotClearTheClipboardWhateverTheBoxSaid) {
  // KEPT: the box of the copy says that it is cleared.
  WriteFile("Winter_A Grade.qzs", "\"Winter 2004\"\r\n");
  Open(TwoGrades());
  Do("click cmdClip");
  const auto copied = EventsNamed("clipboard").back();
  Do("click cmdExit");
  EXPECT_EQ(Count("clipboard"), 0);
  EXPECT_EQ(Do("clipboard")["text"], copied);
}

TEST_F(PlayersLists, AGradeThatCannotBeListedIsNotCopiedUnderAnotherOnesTitle) {
  WriteFile("Winter_A Grade.qzs", "\"Title of A\"\r\n");
  WriteFile("Winter_B Grade.qzs", "\"Title of B\"\r\n");
  Open(TwoGrades());
  DoAll({"fault open 1 70", "pick Combo1 =B Grade"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 70);
  EXPECT_TRUE(Lines("lstteams").empty());
  Do("click cmdClip");
  EXPECT_EQ(EventsNamed("clipboard").back(), "Mid Darts\r\nTitle of B\r\nPLAYER LIST\r\n\r\n");
}

TEST_F(PlayersLists, AMissingTitleIsAskedForWhenItIsCopied) {
  Open(TwoGrades());
  Do("input Summer 2004");
  Do("click cmdClip");
  EXPECT_EQ(EventsNamed("input").at(0)["title"], "Competition Name");
  EXPECT_EQ(File("Winter_A Grade.qzs"), "\"Summer 2004\"\r\n");
  EXPECT_EQ(InSession("SeasonDescription"), "Summer 2004");
}

TEST_F(PlayersLists, ExitLeadsBackToTheMainMenu) {
  for (const char* way : {"click cmdExit", "key Esc", "close frmPlayersLists"}) {
    Open(TwoGrades());
    Do(way);
    EXPECT_EQ(Front(), "frmDB") << way;
    EXPECT_FALSE(Loaded("frmPlayersLists")) << way;
  }
}

TEST_F(PlayersLists, NoRecordIsWritten) {
  Open(TwoGrades());
  const std::string before = File("Winter.qza");
  DoAll({"pick Combo1 1", "input T", "click cmdClip", "click cmdExit"});
  EXPECT_EQ(File("Winter.qza"), before);
}

}  // namespace
}  // namespace marlowbeck
