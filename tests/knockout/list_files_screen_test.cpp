// A selection saved by name and opened again, and files that are none.

#include "knockout/knock_out.h"

namespace marlowbeck {
namespace {

class KnockOutLists : public KnockOutTest {
 protected:
  void OpenFile(const std::string& name, Here here = Here::current()) {
    DoAll({"file " + name, "click cmdOpen"}, here);
  }
  void ExpectNotFound(Here here = Here::current()) {
    EXPECT_EQ(BoxTexts(), (TextList{kNotFound})) << here.line();
    EXPECT_EQ(Boxes().at(0).style, 48);
    EXPECT_EQ(Count("beep"), 1);
    EXPECT_EQ(Front(here), "frmKnockOut");
  }
};

TEST_F(KnockOutLists, AreSavedByteForByte) {
  OpenFive();
  TakeGrade("A Grade");
  Do("click cmdALL");
  Do("file Cup.ko4");
  Do("click cmdSaveKO");
  const Json dialog = EventsNamed("file").at(0);
  EXPECT_EQ(dialog["mode"], "save");
  EXPECT_EQ(dialog["title"], "[Marlowbeck] SAVE KNOCK-0UT file.");
  EXPECT_EQ(dialog["filter"], "*.ko4");
  EXPECT_EQ(dialog["name"], "*.ko4");
  EXPECT_EQ(dialog["ext"], "ko4");
  EXPECT_EQ(dialog["folder"], Folder().string());
  std::string expected = "\"Moss, Cy\"\r\n\"Archer, Jo\"\r\n\"Young, Al\"\r\n";
  for (int place = 4; place <= 64; ++place) expected += "\"\"\r\n";
  expected += "\"A Grade\"\r\n\"A Grade\"\r\n\"A Grade\"\r\n";
  for (int place = 4; place <= 64; ++place) expected += "\"\"\r\n";
  EXPECT_EQ(File("Cup.ko4"), expected + "#2004-03-31#\r\n\"A Grade\"\r\n");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].style, 64);
  EXPECT_EQ(Boxes()[0].text, FilePath("Cup.ko4").string() + " has been saved!");
}

TEST_F(KnockOutLists, TheTitlesOfBothFileBoxesHaveAZeroForTheLetter) {
  // KEPT: a repair would write KNOCK-OUT.
  OpenFive();
  DoAll({"click cmdALL", "file-cancel", "click cmdSaveKO"});
  EXPECT_EQ(EventsNamed("file").at(0)["title"], "[Marlowbeck] SAVE KNOCK-0UT file.");
  DoAll({"file-cancel", "click cmdOpen"});
  EXPECT_EQ(EventsNamed("file").at(0)["title"], "[Marlowbeck] OPEN KNOCK-0UT file.");
}

TEST_F(KnockOutLists, AnEmptyOneCannotBeSaved) {
  OpenFive();
  Do("click cmdSaveKO");
  EXPECT_EQ(BoxTexts(), (TextList{"Nothing to save!"}));
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_EQ(Count("file"), 0);
}

TEST_F(KnockOutLists, ANameThatIsLeftOrCancelledSavesAndOpensNothing) {
  OpenFive();
  Do("click cmdALL");
  for (const char* answer : {"file *.ko4", "file-cancel"}) {
    for (const char* command : {"click cmdSaveKO", "click cmdOpen"}) {
      DoAll({answer, command});
      EXPECT_EQ(Count("file"), 1) << answer << command;
      EXPECT_TRUE(Boxes().empty()) << answer << command;
      EXPECT_EQ(Players().size(), 5U);
    }
  }
  EXPECT_FALSE(HasFile("*.ko4"));
}

TEST_F(KnockOutLists, OneThatIsOpenedComesBackWithGradeDateAndOrder) {
  OpenFive();
  TakeGrade("A Grade");
  Select({"Young, Al : A Grade", "Moss, Cy : A Grade"});
  DoAll({"click cmdCD", "date ChDate 2004-05-02", "click cmdKOChangeDate", "file Cup.ko4",
         "click cmdSaveKO", "click cmdReRun", "click cmdOK"});
  EXPECT_EQ(Available().size(), 5U);
  OpenFile("Cup.ko4");
  const Json dialog = EventsNamed("file").at(0);
  EXPECT_EQ(dialog["mode"], "open");
  EXPECT_EQ(dialog["title"], "[Marlowbeck] OPEN KNOCK-0UT file.");
  EXPECT_EQ(dialog["filter"], "*.ko4");
  EXPECT_EQ(dialog["ext"], "ko4");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Players(), (TextList{"Young, Al", "Moss, Cy"}));
  EXPECT_EQ(Grades(), (TextList{"A Grade", "A Grade"}));
  EXPECT_EQ(Available(), (TextList{"Archer, Jo : A Grade"}));
  EXPECT_EQ(Counts(), (TextList{"1", "2", "3"}));
  EXPECT_EQ(Caption("lblGrade"), "A Grade");
  EXPECT_EQ(Caption("lblKODate"), "Sunday 2 May 2004");
}

TEST_F(KnockOutLists, OneOfAllGradesBringsBackAllOthers) {
  OpenFive();
  Select({"Ely, Bo : B Grade"});
  DoAll({"file Cup.ko4", "click cmdSaveKO"});
  Do("answer yes");
  TakeGrade("A Grade");
  OpenFile("Cup.ko4");
  EXPECT_EQ(Players(), (TextList{"Ely, Bo"}));
  EXPECT_EQ(Available().size(), 4U);
  EXPECT_EQ(Caption("lblGrade"), "All Association Grades");
}

TEST_F(KnockOutLists, TheNextGradeAndTheNextSaveGoByTheOpenedOne) {
  WriteFile("Old.ko4", ListFile({"Moss, Cy"}, "A Grade"));
  OpenFive();
  OpenFile("Old.ko4");
  DoAll({"file New.ko4", "click cmdSaveKO"});
  EXPECT_EQ(File("New.ko4"), File("Old.ko4"));
  DoAll({"click cmdCD"});
  EXPECT_EQ(DateOf("ChDate"), "2004-03-03");
}

TEST_F(KnockOutLists, ASavedPlayerWhoIsGoneStaysAndCanBeMoved) {
  WriteFile("Old.ko4", ListFile({"Gone, Al", "Moss, Cy"}, "A Grade"));
  OpenFive();
  OpenFile("Old.ko4");
  EXPECT_EQ(Players(), (TextList{"Gone, Al", "Moss, Cy"}));
  EXPECT_EQ(Available(), (TextList{"Archer, Jo : A Grade", "Young, Al : A Grade"}));
  Do("dblcell grdKO 1 1");
  EXPECT_EQ(Available().back(), "Gone, Al : A Grade");
  Do("dblpick lstAllPlayers 2");
  EXPECT_EQ(Players(), (TextList{"Moss, Cy", "Gone, Al"}));
  EXPECT_EQ(Grades().back(), "A Grade");
}

TEST_F(KnockOutLists, EveryEqualLineIsTakenOut) {
  Lay({Player(1, "Hill", "Al", "Rovers", "A Grade"), Player(2, "Hill", "Al", "Cubs", "A Grade"),
       Player(3, "Lee", "Bo", "Cubs", "A Grade")});
  WriteFile("Old.ko4", ListFile({"Hill, Al"}, "A Grade"));
  OpenSelection();
  OpenFile("Old.ko4");
  EXPECT_EQ(Available(), (TextList{"Lee, Bo : A Grade"}));
}

TEST_F(KnockOutLists, BehindAFreePlaceNobodyCounts) {
  WriteFile("Old.ko4", ListFile({"Moss, Cy", "", "Archer, Jo"}, "A Grade"));
  OpenFive();
  OpenFile("Old.ko4");
  EXPECT_EQ(Counts(), (TextList{"2", "1", "3"}));
  EXPECT_EQ(Row("grdKO", 3)[1], "Archer, Jo");
  EXPECT_EQ(Available(), (TextList{"Archer, Jo : A Grade", "Young, Al : A Grade"}));
}

TEST_F(KnockOutLists, AGradeThatIsGoneHasNobodyElse) {
  WriteFile("Old.ko4", ListFile({"Moss, Cy"}, "Z Grade"));
  OpenFive();
  OpenFile("Old.ko4");
  EXPECT_EQ(Caption("lblGrade"), "Z Grade");
  EXPECT_TRUE(Available().empty());
  EXPECT_EQ(Counts(), (TextList{"0", "1", "0"}));
}

TEST_F(KnockOutLists, AMissingFileIsToldAndNothingChanges) {
  OpenFive();
  Select({"Ely, Bo : B Grade"});
  for (const char* name : {"Nowhere.ko4", "no/such/folder/Cup.ko4", "."}) {
    OpenFile(name);
    ExpectNotFound();
    EXPECT_EQ(Players(), (TextList{"Ely, Bo"}));
    EXPECT_EQ(Available().size(), 4U);
    EXPECT_EQ(Caption("lblGrade"), "All Association Grades");
  }
}

TEST_F(KnockOutLists, AFolderThatIsNotThereCannotBeSavedTo) {
  OpenFive();
  Do("click cmdALL");
  DoAll({"file no/such/folder/Cup.ko4", "click cmdSaveKO"});
  ExpectNotFound();
  DoAll({"file Cup.ko4", "click cmdSaveKO"});
  EXPECT_TRUE(HasFile("Cup.ko4"));
}

TEST_F(KnockOutLists, AShortFileFillsTheTableAsFarAsItGoes) {
  const std::string whole = ListFile({"Moss, Cy", "Archer, Jo"}, "A Grade");
  OpenFive();
  std::size_t end = 0;
  for (int lines = 0; lines < 130; ++lines) {
    // A list before, of which nothing stays.
    if (lines % 10 == 0 || lines > 127) {
      SCOPED_TRACE(lines);
      WriteFile("Short.ko4", whole.substr(0, end));
      OpenFile("Short.ko4");
      ExpectNotFound();
      EXPECT_EQ(Caption("lblGrade"), "All Association Grades");
      EXPECT_EQ(Caption("lblKODate"), "Wednesday 31 March 2004");
      EXPECT_EQ(static_cast<int>(Players().size()), std::min(lines, 2));
    }
    end = whole.find("\r\n", end) + 2;
  }
}

TEST_F(KnockOutLists, AFailedOpeningPutsTheGradeBack) {
  WriteFile("Short.ko4", "\"Moss, Cy\"\r\n");
  OpenFive();
  OpenFile("Short.ko4");
  EXPECT_EQ(Counts(), (TextList{"0", "1", "0"}));
  // The work file of a removal has the grade in its last line.
  Do("dblcell grdKO 1 1");
  EXPECT_TRUE(File("KO.qz3").ends_with("\"All Association Grades\"\r\n"));
}

TEST_F(KnockOutLists, WhatIsLeftAfterAShortFileIsNobodyTwice) {
  TextList names;
  std::vector<PlayerRecord> players = ManyPlayers(66);
  for (int id = 1; id <= 64; ++id) names.push_back("P" + std::to_string(id) + ", X");
  Lay(players);
  // Cut behind the last grade, which is one that there is.
  const std::string whole = ListFile(names, "A Grade");
  WriteFile("Short.ko4", whole.substr(0, whole.find('#')));
  OpenSelection();
  OpenFile("Short.ko4");
  ExpectNotFound();
  EXPECT_EQ(Players().size(), 64U);
  EXPECT_EQ(Available(), (TextList{"P65, X : A Grade", "P66, X : A Grade"}));
}

TEST_F(KnockOutLists, LongGarbledAndForeignFilesAreTold) {
  const std::string whole = ListFile({"Moss, Cy"}, "A Grade");
  std::string no_date = whole;
  no_date.replace(no_date.find("#2004-03-03#"), 12, "\"Wednesday\"");
  std::string thousand;
  for (int line = 0; line < 1000; ++line) thousand += "\"Somebody, Else\"\r\n";
  const std::vector<std::string> files = {whole + "\"more\"\r\n",
                                          no_date,
                                          thousand,
                                          FileOf(FivePlayers()),
                                          "",
                                          "\r\n",
                                          std::string(3000, '"'),
                                          std::string(200, '\0'),
                                          whole.substr(0, whole.size() - 5)};
  OpenFive();
  for (const std::string& file : files) {
    SCOPED_TRACE(file.substr(0, 20));
    WriteFile("Bad.ko4", file);
    OpenFile("Bad.ko4");
    ExpectNotFound();
    EXPECT_EQ(Caption("lblGrade"), "All Association Grades");
  }
  WriteFile("Good.ko4", whole);
  OpenFile("Good.ko4");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Players(), (TextList{"Moss, Cy"}));
}

TEST_F(KnockOutLists, NamesOfAnyLettersComeBack) {
  Lay({Player(1, "Smith \"Ace\"", "A, B", "Rovers", "A \"1\", Grade"),
       Player(2, "x\", \"y", "#TRUE#", "Cubs", "A \"1\", Grade"),
       Player(3, "Br\xFCning", "\x8A", "Cubs", "A \"1\", Grade")});
  OpenSelection();
  DoAll({"click cmdALL", "file Cup.ko4", "click cmdSaveKO"});
  const TextList before = Players();
  Do("click cmdScramble");
  OpenFile("Cup.ko4");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Players(), before);
  EXPECT_TRUE(Available().empty());
}

TEST_F(KnockOutLists, OneThatIsThereIsWrittenOver) {
  WriteFile("Cup.ko4", std::string(9000, 'x'));
  OpenFive();
  DoAll({"click cmdALL", "file Cup.ko4", "click cmdSaveKO"});
  EXPECT_EQ(File("Cup.ko4").find('x'), std::string::npos);
  EXPECT_EQ(File("Cup.ko4").find("\"Moss, Cy\"\r\n"), 0U);
}

TEST_F(KnockOutLists, GonePlayersThatMakeSixtyFiveAreNotAllTaken) {
  TextList names = {"Gone, Al"};
  Lay(ManyPlayers(64));
  WriteFile("Old.ko4", ListFile(names, "A Grade"));
  OpenSelection();
  OpenFile("Old.ko4");
  Do("dblcell grdKO 1 1");
  EXPECT_EQ(Available().size(), 65U);
  EXPECT_TRUE(Enabled("cmdALL"));
  Do("click cmdALL");
  EXPECT_EQ(Players().size(), 64U);
  EXPECT_EQ(Available(), (TextList{"Gone, Al : A Grade"}));
  EXPECT_EQ(BoxTexts().size(), 1U);
}

}  // namespace
}  // namespace marlowbeck
