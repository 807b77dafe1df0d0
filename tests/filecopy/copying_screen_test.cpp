// Copying files from one pane into the folder of the other.

#include "copier.h"

namespace marlowbeck {
namespace {

class CopyingFiles : public CopierTest {
 protected:
  /// The text of a copy's first question.
  std::string Question(const std::string& files, const std::string& more = "") {
    return "You are about to Copy " + files + " to\r" + Upper("Stick") + "\r\r" + more +
           "Are you Sure?";
  }
  std::string Exists(const std::string& name) {
    return name + " already exists in\r" + PathOf("Stick") + "\r\rDo you wish to replace it?";
  }
};

TEST_F(CopyingFiles, TakesTheSelectedFilesAcross) {
  OpenWithStick();
  DoAll({"select BuFileS 1 2", "answer yes", "click cmdBuS"});
  ASSERT_EQ(Boxes().size(), 2U);
  EXPECT_EQ(Boxes()[0].text, Question("2 files"));
  EXPECT_EQ(Boxes()[0].style, kYesNo);
  EXPECT_EQ(Boxes()[0].title, "Marlowbeck Message");
  EXPECT_EQ(Boxes()[1].text, "2 files have been copied.");
  EXPECT_EQ(Boxes()[1].style, kInformation);
  EXPECT_EQ(File("Stick/Winter.qza"), "players");
  EXPECT_EQ(File("Stick/Winter_A.qzr"), "results");
  EXPECT_FALSE(HasFile("Stick/Summer.qza"));
  EXPECT_EQ(Lines("BuFileD"), (TextList{"Winter.qza", "Winter_A.qzr"}));
}

TEST_F(CopyingFiles, LeavesBothPanesWithNothingSelected) {
  OpenWithStick();
  DoAll({"select BuFileS 1 2", "answer yes", "click cmdBuS"});
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Text("txtNumFileS"), "File List = 3");
  EXPECT_EQ(Text("txtNumFileD"), "File List = 2");
  EXPECT_EQ(Caption("lblS"), " No files selected ");
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_EQ(Buttons('D'), "A--N--") << "a folder with files is not deleted";
  EXPECT_FALSE(Shown("picPb"));
}

TEST_F(CopyingFiles, OfOneFileIsToldOfOne) {
  OpenWithStick();
  DoAll({"pick BuFileS 0", "answer yes", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), (TextList{Question("1 file"), "1 file has been copied."}));
}

TEST_F(CopyingFiles, GoesFromTheRightPaneToTheLeftTheSameWay) {
  OpenWithStick();
  WriteFile("Stick/Spring.qza", "spring");
  DoAll({"click opt(0)", "click opt(1)", "pick BuFileD 0", "answer yes", "click cmdBuD"});
  EXPECT_EQ(BoxTexts(),
            (TextList{"You are about to Copy 1 file to\r" + Upper("") + "\r\rAre you Sure?",
                      "1 file has been copied."}));
  EXPECT_EQ(File("Spring.qza"), "spring");
  EXPECT_EQ(Buttons('D'), "A--N--");
}

TEST_F(CopyingFiles, RefusedChangesNothing) {
  OpenWithStick();
  DoAll({"select BuFileS 0 1", "answer no", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), TextList{Question("2 files")});
  EXPECT_FALSE(HasFile("Stick/Summer.qza"));
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Buttons('S'), "A--N--");
}

TEST_F(CopyingFiles, OfNoFilesIsTold) {
  OpenWithStick();
  DoAll({"pick BuFileS 0", "focus BuDirD", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), TextList{"No files selected to copy."});
  EXPECT_EQ(Boxes()[0].style, kInformation);
  EXPECT_FALSE(Enabled("cmdBuS"));
}

TEST_F(CopyingFiles, OntoItselfIsRefused) {
  Open();
  DoAll({"pick BuFileS 0", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), TextList{"You cannot copy a file to itself !"});
  EXPECT_EQ(Boxes()[0].style, kWarningStyle);
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_EQ(File("Summer.qza"), "summer");
}

TEST_F(CopyingFiles, OntoItselfThroughALinkIsRefusedToo) {
  HOLDS_FOR_MODELS_ALONE("each face would need a link of its own");
  Start();
  std::filesystem::create_directory_symlink(Folder(), Folder() / "Stick/again");
  OpenWithStick();
  DoAll({"dblpick BuDirD =again", "pick BuFileS 0", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), TextList{"You cannot copy a file to itself !"});
  EXPECT_EQ(File("Summer.qza"), "summer");
}

TEST_F(CopyingFiles, AsksAboutAFileThatIsThere) {
  WriteFile("Stick/WINTER.QZA", "old");
  OpenWithStick();
  DoAll({"select BuFileS 1", "answer yes", "answer yes", "click cmdBuS"});
  ASSERT_EQ(Boxes().size(), 3U);
  EXPECT_EQ(Boxes()[1].text, Exists("Winter.qza"));
  EXPECT_EQ(Boxes()[1].style, kYesNoCancel);
  EXPECT_EQ(File("Stick/WINTER.QZA"), "players") << "in any capitals it is that file";
  EXPECT_FALSE(HasFile("Stick/Winter.qza"));
}

TEST_F(CopyingFiles, SkipsAFileThatIsNotToBeReplaced) {
  WriteFile("Stick/Winter.qza", "old");
  OpenWithStick();
  DoAll({"click cmdAllS", "answer yes", "answer no", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(),
            (TextList{Question("3 files"), Exists("Winter.qza"), "2 files have been copied."}));
  EXPECT_EQ(File("Stick/Winter.qza"), "old");
  EXPECT_EQ(File("Stick/Winter_A.qzr"), "results");
}

TEST_F(CopyingFiles, OfFilesThatAreAllSkippedTellsOfNone) {
  WriteFile("Stick/Winter.qza", "old");
  OpenWithStick();
  DoAll({"pick BuFileS 1", "answer yes", "answer no", "click cmdBuS"});
  EXPECT_EQ(BoxTexts().back(), "No files copied.");
}

TEST_F(CopyingFiles, CancelledAtTheThirdOfFiveKeepsTheFirstTwoAndReportsNothing) {
  for (const char* name : {"1.qza", "2.qza", "3.qza", "4.qza", "5.qza"}) {
    WriteFile(std::string("Five/") + name, name);
  }
  WriteFile("Stick/3.qza", "old");
  OpenWithStick();
  DoAll({"dblpick BuDirS =Five", "click cmdAllS", "answer yes", "answer cancel", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), (TextList{Question("5 files"), Exists("3.qza")}));
  EXPECT_EQ(File("Stick/1.qza"), "1.qza");
  EXPECT_EQ(File("Stick/2.qza"), "2.qza");
  EXPECT_EQ(File("Stick/3.qza"), "old");
  EXPECT_FALSE(HasFile("Stick/4.qza"));
  EXPECT_EQ(Lines("BuFileD"), (TextList{"1.qza", "2.qza", "3.qza"}));
  EXPECT_EQ(Caption("lblS"), " No files selected ");
  EXPECT_FALSE(Shown("picPb"));
  EXPECT_EQ(Buttons('S'), "A--N--");
}

TEST_F(CopyingFiles, OverExistingFilesWarnsOnceAndAsksNoMore) {
  WriteFile("Stick/Winter.qza", "old");
  OpenWithStick();
  DoAll({"click chkReplace", "click cmdAllS", "answer yes", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), (TextList{Question("3 files",
                                           "W A R N I N G!\rExisting files will be "
                                           "Overwritten.\r\r"),
                                  "3 files have been copied."}));
  EXPECT_EQ(File("Stick/Winter.qza"), "players");
}

TEST_F(CopyingFiles, SeesAsThereWhatTheTargetsListShows) {
  WriteFile("Stick/notes.txt", "old");
  OpenWithStick();
  // All files are shown, and the target's own is one of them.
  DoAll({"click opt(0)", "pick BuFileS =notes.txt", "answer yes", "answer no", "click cmdBuS"});
  EXPECT_EQ(BoxTexts()[1], Exists("notes.txt"));
  EXPECT_EQ(File("Stick/notes.txt"), "old");
}

TEST_F(CopyingFiles, OverwritesUnaskedWhatHasComeSinceTheListWasRead) {
  OpenWithStick();
  WriteFile("Stick/Winter.qza", "late");
  DoAll({"pick BuFileS 1", "answer yes", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), (TextList{Question("1 file"), "1 file has been copied."}));
  EXPECT_EQ(File("Stick/Winter.qza"), "players");
}

TEST_F(CopyingFiles, IntoAFolderOfAThousandNamesLooksThroughThemAll) {
  HOLDS_FOR_MODELS_ALONE("a thousand files in two folders take their time");
  for (int i = 0; i < 999; ++i) WriteFile("Stick/x" + std::to_string(i) + ".qza", "");
  WriteFile("Stick/Winter.qza", "old");
  OpenWithStick();
  DoAll({"pick BuFileS 1", "answer yes", "answer no", "click cmdBuS"});
  EXPECT_EQ(BoxTexts()[1], Exists("Winter.qza"));
  EXPECT_EQ(BoxTexts().back(), "No files copied.");
}

TEST_F(CopyingFiles, IntoAFolderOfAThousandAndOneNamesFailsBeforeAnythingIsCopied) {
  HOLDS_FOR_MODELS_ALONE("a thousand files in two folders take their time");
  for (int i = 0; i < 1001; ++i) WriteFile("Stick/x" + std::to_string(i) + ".qza", "");
  OpenWithStick();
  DoAll({"pick BuFileS 1", "answer yes", "click cmdBuS"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 9);
  EXPECT_FALSE(HasFile("Stick/Winter.qza"));
  EXPECT_EQ(Buttons('S'), "A--N--");
}

TEST_F(CopyingFiles, KeepsTheTimeOfTheLastChange) {
  HOLDS_FOR_MODELS_ALONE("the time is set in the folder of one face");
  Start();
  const auto changed =
      std::filesystem::last_write_time(FilePath("Winter.qza")) - std::chrono::hours(1000);
  std::filesystem::last_write_time(FilePath("Winter.qza"), changed);
  OpenWithStick();
  DoAll({"pick BuFileS 1", "answer yes", "click cmdBuS"});
  EXPECT_EQ(std::filesystem::last_write_time(FilePath("Stick/Winter.qza")), changed);
}

TEST_F(CopyingFiles, ThatFailsKeepsWhatWasCopiedAndTellsTheError) {
  OpenWithStick();
  DoAll({"click cmdAllS", "answer yes", "fault copy 2 57", "click cmdBuS"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 57);
  EXPECT_EQ(File("Stick/Summer.qza"), "summer");
  EXPECT_FALSE(HasFile("Stick/Winter.qza"));
  EXPECT_EQ(Lines("BuFileD"), TextList{"Summer.qza"});
  EXPECT_FALSE(Shown("picPb"));
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_EQ(Buttons('D'), "A--N--");
}

TEST_F(CopyingFiles, WhoseNamesDoNotReachTheDiskIsToldAsAnError) {
  OpenWithStick();
  DoAll({"pick BuFileS 0", "answer yes", "fault sync 1 57", "click cmdBuS"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 57);
  EXPECT_EQ(BoxTexts().size(), 2U) << "the question and the error, and no report";
  EXPECT_EQ(Buttons('S'), "A--N--");
}

TEST_F(CopyingFiles, OfAFileThatHasGoneIsAnErrorAndTheListSeesIt) {
  OpenWithStick();
  Do("select BuFileS 0 1");
  DeleteFile("Summer.qza");
  DoAll({"answer yes", "click cmdBuS"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 53);
  EXPECT_EQ(Lines("BuFileS"), (TextList{"Winter.qza", "Winter_A.qzr"}));
}

TEST_F(CopyingFiles, IntoAFolderThatHasGoneIsAnErrorOnceItWasAskedFor) {
  OpenWithStick();
  Do("pick BuFileS 0");
  DeleteFile("Stick");
  DoAll({"answer yes", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), (TextList{Question("1 file"), "PATH NOT FOUND    "}));
  EXPECT_EQ(File("Summer.qza"), "summer");
  EXPECT_EQ(Caption("lblPathD"), Folder().string());
  EXPECT_EQ(Buttons('S'), "A--N--");
}

TEST_F(CopyingFiles, OutOfAFolderThatHasGoneIsAnErrorOnceItWasAskedFor) {
  WriteFile("Stick/Spring.qza", "spring");
  OpenWithStick();
  Do("pick BuFileD 0");
  DeleteFile("Stick/Spring.qza");
  DeleteFile("Stick");
  DoAll({"answer yes", "click cmdBuD"});
  EXPECT_EQ(BoxTexts(),
            (TextList{"You are about to Copy 1 file to\r" + Upper("") + "\r\rAre you Sure?",
                      "PATH NOT FOUND    "}));
  EXPECT_EQ(Caption("lblPathD"), Folder().string());
  EXPECT_EQ(Marked("BuFileD"), std::vector<int>{});
  EXPECT_EQ(Buttons('D'), "A--N--");
}

TEST_F(CopyingFiles, WithNamesBeyondTheCodePageKeepsThem) {
  const std::string first = "\u0141\u00F3d\u017A.qza";
  const std::string second = "\u0143\u00F3d\u017A.qza";
  WriteFile(first, "first");
  WriteFile(second, "second");
  WriteFile("Stick/" + second, "old");
  OpenWithStick();
  EXPECT_EQ(Lines("BuFileD"), TextList{second});
  DoAll({"pick BuFileS =" + second, "answer yes", "answer yes", "click cmdBuS"});
  EXPECT_EQ(BoxTexts().at(1),
            second + " already exists in\r" + PathOf("Stick") + "\r\rDo you wish to replace it?");
  EXPECT_EQ(File("Stick/" + second), "second");
  EXPECT_FALSE(HasFile("Stick/" + first));
  DoAll({"pick BuFileS =" + first, "answer yes", "click cmdBuS"});
  EXPECT_EQ(File("Stick/" + first), "first");
  EXPECT_EQ(Lines("BuFileD"), (TextList{first, second}));
}

class FullDisk : public CopyingFiles {
 protected:
  static constexpr const char* kFull =
      "Your disk is full !\rPlease insert another disk.\r\rDo you wish to continue ?";
};

TEST_F(FullDisk, CanBeChangedAndTheSameFileIsCopiedAgain) {
  OpenWithStick();
  DoAll({"click cmdAllS", "fault cut 2 3 61", "answer yes", "answer yes", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), (TextList{Question("3 files"), kFull, "3 files have been copied."}));
  EXPECT_EQ(Boxes()[1].style, kYesNo);
  EXPECT_EQ(File("Stick/Winter.qza"), "players");
  EXPECT_EQ(Lines("BuFileD"), (TextList{"Summer.qza", "Winter.qza", "Winter_A.qzr"}));
}

TEST_F(FullDisk, IsAskedAboutAsOftenAsItIsFull) {
  OpenWithStick();
  DoAll({"pick BuFileS 1", "fault copy 1 61", "fault copy 2 61", "answer yes", "answer yes",
         "answer yes", "click cmdBuS"});
  EXPECT_EQ(BoxTexts(), (TextList{Question("1 file"), kFull, kFull, "1 file has been copied."}));
  EXPECT_EQ(File("Stick/Winter.qza"), "players");
}

TEST_F(FullDisk, ThatIsNotChangedEndsTheRunWithoutAPartOfTheFile) {
  OpenWithStick();
  DoAll({"click opt(0)", "pick BuFileS =Summer.qza", "select BuFileS 3 4", "fault cut 2 3 61",
         "answer yes", "answer no", "click cmdBuS"});
  EXPECT_EQ(BoxTexts().size(), 2U) << "and no report";
  EXPECT_EQ(BoxTexts()[1], kFull);
  EXPECT_EQ(Lines("BuFileD").size(), 1U);
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_EQ(Buttons('D'), "A--N--");
  EXPECT_FALSE(Shown("picPb"));
  EXPECT_EQ(Caption("lblS"), " No files selected ");
}

TEST_F(FullDisk, LeavesTheFileThatWasToBeReplaced) {
  WriteFile("Stick/Winter.qza", "the old one");
  OpenWithStick();
  DoAll({"click chkReplace", "pick BuFileS 1", "fault cut 1 3 61", "answer yes", "answer no",
         "click cmdBuS"});
  EXPECT_EQ(File("Stick/Winter.qza"), "the old one");
  EXPECT_EQ(Lines("BuFileD"), TextList{"Winter.qza"});
}

TEST_F(FullDisk, IsNotAskedAboutTwiceInOneQuestionOfReplacing) {
  WriteFile("Stick/Winter.qza", "the old one");
  OpenWithStick();
  DoAll({"pick BuFileS 1", "fault copy 1 61", "answer yes", "answer yes", "answer yes",
         "click cmdBuS"});
  EXPECT_EQ(BoxTexts(),
            (TextList{Question("1 file"), Exists("Winter.qza"), kFull, "1 file has been copied."}));
}

}  // namespace
}  // namespace marlowbeck
