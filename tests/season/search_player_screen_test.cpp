// Players found by part of a surname, from three places.

#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

class SearchPlayer : public ClubTest {
 protected:
  void SetUp() override {
    WritePlayers("Winter.qza", {Player(1, "McKay", "Jo", "Rovers", "A Grade"),
                                Player(2, "Tomcat", "Al", "Cubs", "A Grade"),
                                Player(3, "Smith", "Mc", "Rovers", "B Grade"),
                                Player(4, "d\xE9j\xE0", "Bo", "Bees", "B Grade")});
    NameOpenFile("Winter.qza");
  }
  void Search(const std::string& text, Here here = Here::current()) {
    Do("input " + text, here);
    Do("click mnuSearchPlayer", here);
  }
  /// A text as a field of 30 or of 35 holds it.
  static std::string Padded(const std::string& text, std::size_t width) {
    return text + std::string(width - text.size(), ' ');
  }
  TextList Found(int column, Here here = Here::current()) {
    TextList texts;
    for (const TextList& row : Cells("grdShow", here))
      texts.push_back(row.at(static_cast<std::size_t>(column)));
    return texts;
  }
  static std::string Without(std::string text) {
    text.erase(text.find_last_not_of(' ') + 1);
    return text;
  }
  TextList Names(Here here = Here::current()) {
    TextList names;
    for (const std::string& cell : Found(0, here)) names.push_back(Without(cell));
    return names;
  }
};

TEST_F(SearchPlayer, FindsTheLettersAtAnyPlaceInAnyCase) {
  Search("mc");
  EXPECT_EQ(Front(), "frmSearchPlayer");
  EXPECT_EQ(Title("frmSearchPlayer"), "Name Search");
  EXPECT_EQ(Names(), (TextList{"Surname", "McKay", "Tomcat"}));
  EXPECT_EQ(Caption("lblInfo"), "Found 2 names containing: MC");
  EXPECT_EQ(InSession("RowCount"), 2);
}

TEST_F(SearchPlayer, TheFirstNameIsNotSearched) {
  Search("jo");
  EXPECT_EQ(Caption("lblInfo"), "Name/s containing JO not found !");
}

TEST_F(SearchPlayer, OneIsToldAsOne) {
  Search("smi");
  EXPECT_EQ(Caption("lblInfo"), "Found 1 name containing: SMI");
}

TEST_F(SearchPlayer, LettersWithAccentsAreFoundInAnyCase) {
  Search("\xC3\x89J");  // the capital, in UTF-8
  EXPECT_EQ(InSession("RowCount"), 1);
}

TEST_F(SearchPlayer, HeadingsAndCellsAsTheyStandInTheRecord) {
  Search("smith");
  EXPECT_EQ(Row("grdShow", 0), (TextList{"Surname", "Given Name/s", "Team", "Grade"}));
  const PlayerRecord smith = Players("Winter.qza")[2];
  EXPECT_EQ(Row("grdShow", 1), (TextList{smith.Surname, smith.FirstName, smith.Team, smith.Grade}));
  EXPECT_EQ(Row("grdShow", 1)[2].back(), ' ') << "padded as in the record";
}

TEST_F(SearchPlayer, BlanksAroundTheTypedSurnameAreTrimmed) {
  Search("   smith  ");
  EXPECT_EQ(InSession("SearchText"), "SMITH");
  EXPECT_EQ(InSession("RowCount"), 1);
}

TEST_F(SearchPlayer, NothingFoundHidesGridAndCopy) {
  Search("zz");
  EXPECT_FALSE(Shown("grdShow"));
  EXPECT_FALSE(Shown("cmdClip"));
  EXPECT_EQ(Caption("lblInfo"), "Name/s containing ZZ not found !");
}

TEST_F(SearchPlayer, WithoutAnOpenFileNobodyIsFound) {
  Do("click mnuClose");
  Search("mc");
  EXPECT_TRUE(EventsNamed("error").empty());
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Caption("lblInfo"), "Name/s containing MC not found !");
  EXPECT_FALSE(Shown("grdShow"));
  EXPECT_FALSE(Shown("cmdClip"));
  Do("click cmdExit");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(SearchPlayer, SearchAgainShowsTheGridAgain) {
  Search("zz");
  Do("input tom");
  Do("click cmdAgain");
  EXPECT_EQ(EventsNamed("input").at(0)["prompt"], "Enter SURNAME to Search for.");
  EXPECT_EQ(EventsNamed("input").at(0)["title"], "Name Search");
  EXPECT_TRUE(Shown("grdShow"));
  EXPECT_TRUE(Shown("cmdClip"));
  EXPECT_EQ(Names(), (TextList{"Surname", "Tomcat"}));
}

TEST_F(SearchPlayer, ASecondSearchShowsNoRowsOfTheFirst) {
  Search("m");
  EXPECT_EQ(InSession("RowCount"), 3);
  Do("input smith");
  Do("click cmdAgain");
  EXPECT_EQ(Names(), (TextList{"Surname", "Smith"}));
  EXPECT_EQ(Caption("lblInfo"), "Found 1 name containing: SMITH");
}

TEST_F(SearchPlayer, SearchAgainWithNothingTypedRepeatsTheLastSearch) {
  Search("mc");
  for (const char* reply : {"input    ", "input-cancel"}) {
    Do(reply);
    Do("click cmdAgain");
    EXPECT_EQ(InSession("SearchText"), "MC") << reply;
    EXPECT_EQ(Names(), (TextList{"Surname", "McKay", "Tomcat"})) << reply;
  }
}

TEST_F(SearchPlayer, TheClipboardGetsEveryRowWithATabBehindEachCell) {
  Search("mc");
  Do("click cmdClip");
  EXPECT_EQ(EventsNamed("clipboard").back(),
            "Surname\tGiven Name/s\tTeam\tGrade\t\r\n"
            "McKay\tJo\tRovers\tA Grade\t\r\n"
            "Tomcat\tAl\tCubs\tA Grade\t\r\n");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text,
            "Your Search results   \rhave been copied to the clipboard    \r"
            "and can now be pasted as text into your    \r"
            "favourite spreadsheet or wordprocessor.    \r\r"
            "Note: When you leave this section,    \rthe Clipboard will be cleared !");
}

TEST_F(SearchPlayer, LeavingDoesNotClearTheClipboardWhateverTheBoxSaid) {
  // KEPT: the box of the copy says that it is cleared.
  Search("mc");
  Do("click cmdClip");
  const auto copied = EventsNamed("clipboard").back();
  Do("click cmdExit");
  EXPECT_EQ(Count("clipboard"), 0);
  EXPECT_EQ(Do("clipboard")["text"], copied);
}

TEST_F(SearchPlayer, FromTheMainMenuItLeadsBackThere) {
  Search("mc");
  EXPECT_EQ(InSession("Flag"), 1);
  Do("click cmdExit");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmSearchPlayer"));
}

TEST_F(SearchPlayer, FromTheSetupScreenItLeadsBackThere) {
  DoAll({"click imgPlayers", "input mc", "click cmdSearch"});
  EXPECT_EQ(Front(), "frmSearchPlayer");
  EXPECT_EQ(InSession("Flag"), 2);
  Do("key Esc");
  EXPECT_EQ(Front(), "frmNames");
}

TEST_F(SearchPlayer, FromTheReportsItLeadsBackThere) {
  DoAll({"click imgPrinter", "input mc", "click Image12"});
  EXPECT_EQ(Front(), "frmSearchPlayer");
  EXPECT_EQ(InSession("Flag"), 3);
  Do("close frmSearchPlayer");
  EXPECT_EQ(Front(), "frmPMenu");
}

TEST_F(SearchPlayer, APlayerFileThatCannotBeReadIsToldAndTheWayBackStands) {
  Do("input mc");
  Do("fault open 1 70");
  Do("click mnuSearchPlayer");
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 70);
  Do("fault off");
  Do("close frmSearchPlayer");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(SearchPlayer, ASearchThatFailsTellsNoNumberOfTheOneBefore) {
  Search("mc");
  EXPECT_EQ(Caption("lblInfo"), "Found 2 names containing: MC");
  DoAll({"input smith", "fault read 1 57", "click cmdAgain"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 57);
  EXPECT_EQ(Caption("lblInfo"), "");
  EXPECT_EQ(Cells("grdShow").size(), 1U);
  DoAll({"input-cancel", "click cmdAgain"});
  EXPECT_EQ(Caption("lblInfo"), "Found 1 name containing: SMITH");
}

}  // namespace
}  // namespace marlowbeck
