#include "setup_test.h"

namespace marlowbeck {
namespace {

constexpr const char* kFirstNames = "Triples\r\nDoubles\r\nSingles\r\nTpls\r\nDbls\r\nSgls\r\n";

class GameNamesTest : public SetupTest {
 protected:
  void OpenGameNames() {
    WritePlayers(kPlayerFile, TwoGrades());
    NameOpenFile(kPlayerFile);
    Do("click mnuGameNames");
  }

  TextList Boxes6() {
    TextList texts;
    for (const char* box :
         {"txtFirst", "txtSecond", "txtThird", "txtShFirst", "txtShSecond", "txtShThird"}) {
      texts.push_back(Text(box));
    }
    return texts;
  }

  /// Types one box and expects the saving to be refused in these words, with nothing written.
  void ExpectRefusal(const std::string& type, const std::string& words) {
    Do(type);
    Do("click cmdSave");
    EXPECT_EQ(BoxTexts(), TextList{words});
    EXPECT_EQ(Count("sound"), 0);
    EXPECT_EQ(Front(), "frmGameNames");
    EXPECT_EQ(File("GameName.qz3"), kFirstNames);
  }
};

TEST_F(GameNamesTest, OpensWithTheNamesOfTheFileAndTheFocusInTheFirst) {
  WriteFile("GameName.qz3", "Teams\nPairs\nOnes\nTms\nPrs\n1s\n");
  OpenGameNames();
  EXPECT_EQ(Title("frmGameNames"), "[Marlowbeck]  Change Game Names");
  EXPECT_EQ(Boxes6(), (TextList{"Teams", "Pairs", "Ones", "Tms", "Prs", "1s"}));
  EXPECT_EQ(Focus(), "frmGameNames.txtFirst");
}

TEST_F(GameNamesTest, EnterGoesThroughTheBoxesAsTabDoes) {
  OpenGameNames();
  for (const char* next :
       {"txtSecond", "txtThird", "txtShFirst", "txtShSecond", "txtShThird", "cmdSave"}) {
    Do("key Enter");
    EXPECT_EQ(Focus(), std::string("frmGameNames.") + next);
  }
}

TEST_F(GameNamesTest, SaveWritesOneNameToALineAndGoesBackToTheMenu) {
  OpenGameNames();
  Do("type txtFirst Teams");
  Do("type txtShFirst Tms");
  Do("click cmdSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_EQ(File("GameName.qz3"), "Teams\r\nDoubles\r\nSingles\r\nTms\r\nDbls\r\nSgls\r\n");
  EXPECT_EQ(InSession("GameNames"), Json({"Teams", "Doubles", "Singles", "Tms", "Dbls", "Sgls"}));
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmGameNames"));
}

TEST_F(GameNamesTest, EightLettersAndFourAreAccepted) {
  OpenGameNames();
  Do("type txtThird Eightltr");
  Do("type txtShThird Four");
  Do("click cmdSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(File("GameName.qz3"), "Triples\r\nDoubles\r\nEightltr\r\nTpls\r\nDbls\r\nFour\r\n");
}

TEST_F(GameNamesTest, NineLettersAreRefused) {
  OpenGameNames();
  ExpectRefusal("type txtSecond Ninelette", "Game name/s exceed 8 letters.    ");
}

TEST_F(GameNamesTest, AnEmptyNameIsRefused) {
  OpenGameNames();
  ExpectRefusal("type txtThird", "Game name/s cannot be blank.    ");
}

TEST_F(GameNamesTest, FiveLettersOfAShortFormAreRefused) {
  OpenGameNames();
  ExpectRefusal("type txtShSecond Fives", "Shortened Game name/s exceed 4 letters.    ");
}

TEST_F(GameNamesTest, AnEmptyShortFormIsRefused) {
  OpenGameNames();
  ExpectRefusal("type txtShFirst", "Shortened Game name/s cannot be blank.    ");
}

TEST_F(GameNamesTest, TheFirstFaultOfSeveralIsTold) {
  OpenGameNames();
  Do("type txtShFirst");
  Do("type txtShSecond Fives");
  Do("type txtFirst");
  ExpectRefusal("type txtThird Ninelette", "Game name/s exceed 8 letters.    ");
  ExpectRefusal("type txtThird Singles", "Game name/s cannot be blank.    ");
  ExpectRefusal("type txtFirst Triples", "Shortened Game name/s exceed 4 letters.    ");
  ExpectRefusal("type txtShSecond Dbls", "Shortened Game name/s cannot be blank.    ");
}

TEST_F(GameNamesTest, ABlankIsALetterLikeAnyOther) {
  OpenGameNames();
  Do("type txtFirst  ");
  Do("click cmdSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(GameNamesTest, ExitAndEscSaveNothing) {
  for (const char* leave : {"click cmdExit", "key Esc", "close frmGameNames"}) {
    OpenGameNames();
    Do("type txtFirst Teams");
    Do(leave);
    EXPECT_EQ(Front(), "frmDB");
    EXPECT_EQ(Count("sound"), 0);
    EXPECT_EQ(File("GameName.qz3"), kFirstNames);
  }
}

TEST_F(GameNamesTest, ACommaInANameComesBackAsTwoNames) {
  OpenGameNames();
  Do("type txtFirst A,B");
  Do("click cmdSave");
  EXPECT_EQ(File("GameName.qz3"), "A,B\r\nDoubles\r\nSingles\r\nTpls\r\nDbls\r\nSgls\r\n");
  Do("click mnuGameNames");
  EXPECT_EQ(Boxes6(), (TextList{"A", "B", "Doubles", "Singles", "Tpls", "Dbls"}));
}

TEST_F(GameNamesTest, LettersOutsideAsciiComeBackAsTyped) {
  OpenGameNames();
  Do("type txtFirst Équipes");
  Do("click cmdSave");
  Do("click mnuGameNames");
  EXPECT_EQ(Text("txtFirst"), "Équipes");
  EXPECT_EQ(File("GameName.qz3").substr(0, 9), "\xc9quipes\r\n");
}

TEST_F(GameNamesTest, AFileThatDoesNotHoldSixNamesIsWrittenAnew) {
  for (const char* content : {"", "Teams", "Teams\r\nPairs\r\nOnes\r\nTms\r\nPrs\r\n", "\"Teams"}) {
    WriteFile("GameName.qz3", content);
    OpenGameNames();
    EXPECT_TRUE(Boxes().empty()) << content;
    EXPECT_EQ(Boxes6(), (TextList{"Triples", "Doubles", "Singles", "Tpls", "Dbls", "Sgls"}));
    EXPECT_EQ(File("GameName.qz3"), kFirstNames) << content;
    Do("click cmdExit");
  }
}

TEST_F(GameNamesTest, AFileThatHasGoneIsWrittenAnew) {
  OpenGameNames();
  Do("click cmdExit");
  DeleteFile("GameName.qz3");
  Do("click mnuGameNames");
  EXPECT_EQ(Text("txtShThird"), "Sgls");
  EXPECT_EQ(File("GameName.qz3"), kFirstNames);
}

TEST_F(GameNamesTest, HelpOpensTheHelpFile) {
  OpenGameNames();
  Do("key F1");
  EXPECT_EQ(Events(), Json::parse(R"([{"help": {"file": "qz1.HLP", "topic": 0}}])"));
}

}  // namespace
}  // namespace marlowbeck
