// Deleting files, and making and deleting folders, with the file copier.

#include "copier.h"

namespace marlowbeck {
namespace {

class DeletingFiles : public CopierTest {};

TEST_F(DeletingFiles, OfOneFileNamesItInCapitals) {
  Open();
  DoAll({"pick BuFileS 1", "answer yes", "click cmdDeleteS"});
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text,
            "You are about to delete WINTER.QZA from\r" + Upper("") + "\r\rAre you Sure?");
  EXPECT_EQ(Boxes()[0].style, kDangerYesNo);
  EXPECT_FALSE(HasFile("Winter.qza"));
  EXPECT_EQ(Lines("BuFileS"), (TextList{"Summer.qza", "Winter_A.qzr"}));
  EXPECT_EQ(Lines("BuFileD"), (TextList{"Summer.qza", "Winter_A.qzr"}));
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_FALSE(Shown("picPb"));
}

TEST_F(DeletingFiles, OfMoreCountsThem) {
  Open();
  DoAll({"select BuFileD 0 2", "answer yes", "click cmdDeleteD"});
  EXPECT_EQ(BoxTexts()[0],
            "You are about to delete 2 files from\r" + Upper("") + "\r\rAre you Sure?");
  EXPECT_EQ(Lines("BuFileD"), TextList{"Winter.qza"});
}

TEST_F(DeletingFiles, RefusedKeepsTheFilesAndUnselects) {
  Open();
  DoAll({"select BuFileS 0 1", "answer no", "click cmdDeleteS"});
  EXPECT_TRUE(HasFile("Summer.qza"));
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Buttons('S'), "A--N--");
}

TEST_F(DeletingFiles, OfAllFilesOffersTheDeletionOfTheFolder) {
  WriteFile("Stick/a.qza", "x");
  OpenWithStick();
  DoAll({"click cmdAllD", "answer yes", "click cmdDeleteD"});
  EXPECT_EQ(Lines("BuFileD"), TextList{});
  EXPECT_EQ(Buttons('D'), "---N-F");
}

TEST_F(DeletingFiles, SparesCommandComInAnyCapitalsThoughItIsCounted) {
  for (const char* name : {"Command.com", "COMMAND.COM.bak", "x.com"}) {
    WriteFile(std::string("Stick/") + name, "x");
  }
  OpenWithStick();
  DoAll({"click opt(0)", "click cmdAllD", "answer yes", "click cmdDeleteD"});
  EXPECT_EQ(BoxTexts()[0],
            "You are about to delete 3 files from\r" + Upper("Stick") + "\r\rAre you Sure?");
  EXPECT_EQ(Lines("BuFileD"), TextList{"Command.com"});
  DoAll({"pick BuFileD 0", "answer yes", "click cmdDeleteD"});
  EXPECT_TRUE(HasFile("Stick/Command.com"));
}

TEST_F(DeletingFiles, ThatFailsLeavesTheRestAndTellsTheError) {
  Open();
  DoAll({"click cmdAllS", "fault delete 2 70", "answer yes", "click cmdDeleteS"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 70);
  EXPECT_FALSE(HasFile("Summer.qza"));
  EXPECT_EQ(Lines("BuFileS"), (TextList{"Winter.qza", "Winter_A.qzr"}));
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_FALSE(Shown("picPb"));
}

TEST_F(DeletingFiles, OfAReadOnlyFileIsRefused) {
  HOLDS_FOR_MODELS_ALONE("the protection is set in the folder of one face");
  Start();
  std::filesystem::permissions(FilePath("Winter.qza"), std::filesystem::perms::owner_read);
  Open();
  DoAll({"pick BuFileS 1", "answer yes", "click cmdDeleteS"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 70);
  EXPECT_TRUE(HasFile("Winter.qza"));
}

TEST_F(DeletingFiles, OfAFileThatHasGoneIsAnError) {
  Open();
  Do("pick BuFileS 1");
  DeleteFile("Winter.qza");
  DoAll({"answer yes", "click cmdDeleteS"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 53);
  EXPECT_EQ(Lines("BuFileS"), (TextList{"Summer.qza", "Winter_A.qzr"}));
}

TEST_F(DeletingFiles, OutOfAFolderThatHasGoneIsAnErrorAndThePaneGoesUp) {
  WriteFile("Stick/Spring.qza", "spring");
  OpenWithStick();
  Do("pick BuFileD 0");
  DeleteFile("Stick/Spring.qza");
  DeleteFile("Stick");
  DoAll({"answer yes", "click cmdDeleteD"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 76);
  EXPECT_EQ(Caption("lblPathD"), Folder().string());
  EXPECT_EQ(Buttons('D'), "A--N--");
}

TEST_F(DeletingFiles, WithNamesThatReadAlikeTakesTheOneThatIsMarked) {
  WriteFile("\u0141.qza", "first");
  WriteFile("\u0143.qza", "second");
  Open();
  DoAll({"pick BuFileS =\u0143.qza", "answer yes", "click cmdDeleteS"});
  EXPECT_EQ(BoxTexts(), TextList{"You are about to delete \u0143.QZA from\r" + Upper("") +
                                 "\r\rAre you Sure?"});
  EXPECT_TRUE(HasFile("\u0141.qza"));
  EXPECT_FALSE(HasFile("\u0143.qza"));
}

class CopierFolders : public CopierTest {};

TEST_F(CopierFolders, AreDeletedWhenTheyAreEmptyAndThePaneGoesUp) {
  OpenWithStick();
  DoAll({"answer yes", "click cmdDelFolderD"});
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].text, "You are about to delete the following folder,\r" + PathOf("Stick") +
                                 "\r\rAre you Sure ?");
  EXPECT_EQ(Boxes()[0].style, kDangerYesNo);
  EXPECT_FALSE(HasFile("Stick"));
  EXPECT_EQ(Caption("lblPathD"), Folder().string());
  EXPECT_EQ(Lines("BuDirS"), TextList{".."});
  EXPECT_EQ(Lines("BuDirD"), TextList{".."});
  EXPECT_EQ(Buttons('D'), "A--N--");
  EXPECT_EQ(Caption("lblD"), " No files selected ");
}

TEST_F(CopierFolders, StayWhenTheAnswerIsNotYes) {
  OpenWithStick();
  DoAll({"answer no", "click cmdDelFolderD"});
  EXPECT_TRUE(HasFile("Stick"));
  EXPECT_EQ(Caption("lblPathD"), PathOf("Stick"));
}

TEST_F(CopierFolders, TakeTheEmptyFilesOfTheFolderAboveWithThem) {
  WriteFile("Empty.qza", "");
  WriteFile("empty.txt", "");
  OpenWithStick();
  DoAll({"answer yes", "click cmdDelFolderD"});
  EXPECT_FALSE(HasFile("Empty.qza"));
  EXPECT_TRUE(HasFile("empty.txt")) << "the filter did not show it";
  EXPECT_TRUE(HasFile("Winter.qza"));
  EXPECT_EQ(Lines("BuFileD"), (TextList{"Summer.qza", "Winter.qza", "Winter_A.qzr"}));
  EXPECT_EQ(Text("txtNumFileS"), "File List = 3");
}

TEST_F(CopierFolders, OfOtherFilesLookEmptyAndCannotBeDeleted) {
  WriteFile("Stick/notes.txt", "x");
  WriteFile("Empty.qza", "");
  OpenWithStick();
  EXPECT_TRUE(Enabled("cmdDelFolderD"));
  DoAll({"answer yes", "click cmdDelFolderD"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 75);
  EXPECT_TRUE(HasFile("Stick/notes.txt"));
  EXPECT_TRUE(HasFile("Empty.qza")) << "nothing else is deleted then";
  EXPECT_EQ(Caption("lblPathD"), Folder().string()) << "the pane stands in the folder above";
  EXPECT_EQ(Lines("BuDirD"), (TextList{"..", "Stick"}));
}

TEST_F(CopierFolders, WithFilesOnShowCannotBeDeletedFromTheScreen) {
  WriteFile("Stick/a.qza", "x");
  OpenWithStick();
  EXPECT_EQ(Refused("click cmdDelFolderD"), "cmdDelFolderD is disabled");
}

TEST_F(CopierFolders, InWhichTheOtherPaneStandsTakeItUpToo) {
  OpenWithStick();
  DoAll({"dblpick BuDirS =Stick", "answer yes", "click cmdDelFolderD"});
  EXPECT_TRUE(EventsNamed("error").empty());
  EXPECT_EQ(Caption("lblPathS"), Folder().string());
  EXPECT_EQ(Lines("BuFileS").size(), 3U);
}

TEST_F(CopierFolders, AreMadeByName) {
  OpenWithStick();
  DoAll({"input Week 7", "click cmdNewD"});
  const Json asked = EventsNamed("input").at(0);
  EXPECT_EQ(asked["prompt"],
            "Create a new folder in...\r" + Upper("Stick") + "\r\rEnter NEW Name for Folder");
  EXPECT_EQ(asked["default"], "New Folder");
  EXPECT_TRUE(HasFile("Stick/Week 7"));
  EXPECT_EQ(Lines("BuDirD"), (TextList{"..", "Week 7"}));
}

TEST_F(CopierFolders, ThatAreNewAreSeenInBothPanes) {
  Open();
  DoAll({"input New Folder", "click cmdNewS"});
  EXPECT_EQ(Lines("BuDirS"), (TextList{"..", "New Folder", "Stick"}));
  EXPECT_EQ(Lines("BuDirD"), (TextList{"..", "New Folder", "Stick"}));
}

TEST_F(CopierFolders, ThatAreNewLeaveTheOtherPanesSelection) {
  Open();
  DoAll({"select BuFileD 0 1", "input Week 7", "click cmdNewS"});
  EXPECT_EQ(Marked("BuFileD"), (std::vector<int>{0, 1}));
  EXPECT_EQ(Text("txtNumFileD"), "2  Files selected.");
  EXPECT_EQ(Buttons('D'), "AUC-D-");
  EXPECT_EQ(Lines("BuDirD"), (TextList{"..", "Stick", "Week 7"}));
}

TEST_F(CopierFolders, AreMadeByNamesBeyondTheCodePageAndOpened) {
  for (const std::string name : {"\u0141\u00F3d\u017A", "\U0001F3AF 180"}) {
    Open();
    DoAll({"input " + name, "click cmdNewS"});
    EXPECT_TRUE(HasFile(name)) << name;
    Do("dblpick BuDirS =" + name);
    EXPECT_EQ(Get("BuDirS")["path"], PathOf(name));
    EXPECT_EQ(Caption("lblPathS"), PathOf(name));
    Do("click cmdCancel");
  }
}

TEST_F(CopierFolders, WithoutANameAreNotMade) {
  Open();
  for (const char* answer : {"input", "input-cancel", "input    "}) {
    DoAll({answer, "click cmdNewS"});
    EXPECT_EQ(Lines("BuDirS"), (TextList{"..", "Stick"})) << answer;
    EXPECT_TRUE(Boxes().empty());
  }
}

TEST_F(CopierFolders, ThatCannotBeMadeAreTold) {
  Open();
  const std::vector<std::pair<std::string, int>> names = {
      {"Stick", 75}, {"STICK", 75}, {"no/such/place", 76}, {std::string(256, 'x'), 52}};
  for (const auto& [name, number] : names) {
    DoAll({"input " + name, "click cmdNewS"});
    EXPECT_EQ(EventsNamed("error").at(0)["number"], number) << name;
    EXPECT_EQ(Lines("BuDirS"), (TextList{"..", "Stick"}));
  }
}

}  // namespace
}  // namespace marlowbeck
