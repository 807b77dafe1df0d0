// The two panes of the file copier: what they show, and which commands they offer.

#include "copier.h"

namespace marlowbeck {
namespace {

class CopierPanes : public CopierTest {};

TEST_F(CopierPanes, StandOnTheProgramsFolderAndListItsSeasons) {
  Open();
  EXPECT_EQ(Title("frmBackup"), "[Marlowbeck]  File Copy Utility");
  for (const std::string pane : {"S", "D"}) {
    EXPECT_EQ(Get("BuDir" + pane)["path"], Folder().string());
    EXPECT_EQ(Caption("lblPath" + pane), Folder().string());
    EXPECT_EQ(Lines("BuFile" + pane), (TextList{"Summer.qza", "Winter.qza", "Winter_A.qzr"}));
    EXPECT_EQ(Text("txtNumFile" + pane), "File List = 3");
    EXPECT_EQ(Get("txtNumFile" + pane)["locked"], true);
    EXPECT_EQ(Caption("lbl" + pane), " No files selected ");
    EXPECT_EQ(Color("lbl" + pane), "black");
    EXPECT_EQ(Buttons(pane.front()), "A--N--");
    EXPECT_EQ(Lines("BuDrive" + pane).front(), "/");
    EXPECT_GE(Index("BuDrive" + pane), 0);
  }
  EXPECT_TRUE(Ticked("opt(1)"));
  EXPECT_FALSE(Shown("picPb"));
}

TEST_F(CopierPanes, CaptionsOfTheirControls) {
  Open();
  for (const std::string pane : {"S", "D"}) {
    EXPECT_EQ(Caption("cmdBu" + pane), "Copy");
    EXPECT_EQ(Caption("cmdAll" + pane), "Select All");
    EXPECT_EQ(Caption("cmdUS" + pane), "Unselect");
    EXPECT_EQ(Caption("cmdDelete" + pane), "Delete File/s");
    EXPECT_EQ(Caption("cmdDelFolder" + pane), "Delete Folder");
    EXPECT_EQ(Caption("cmdNew" + pane), "New Folder");
  }
  EXPECT_EQ(Caption("opt(0)"), " Show All Files");
  EXPECT_EQ(Caption("opt(1)"), " Marlowbeck files Only");
  EXPECT_EQ(Caption("chkReplace"), "Overwrite Existing Files");
  EXPECT_EQ(Caption("cmdHelp"), "Help");
  EXPECT_EQ(Caption("cmdMain"), "Main Menu");
}

TEST_F(CopierPanes, WithoutFilesOfferTheDeletionOfTheirFolderAndNothingToSelect) {
  OpenWithStick();
  EXPECT_EQ(Buttons('D'), "---N-F");
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_EQ(Text("txtNumFileD"), "File List = 0");
  EXPECT_EQ(Caption("lblPathD"), PathOf("Stick"));
}

TEST_F(CopierPanes, BecomeTheSourceByAClickOnAFile) {
  OpenWithStick();
  Do("pick BuFileS 1");
  EXPECT_EQ(Caption("lblS"), " SOURCE DRIVE ");
  EXPECT_EQ(Color("lblS"), "green");
  EXPECT_EQ(Caption("lblD"), " TARGET DRIVE ");
  EXPECT_EQ(Color("lblD"), "red");
  EXPECT_EQ(Text("txtNumFileS"), "1  File selected.");
  EXPECT_EQ(Buttons('S'), "AUC-D-");
  EXPECT_EQ(Buttons('D'), "---N-F");
}

TEST_F(CopierPanes, CountTheFilesThatAreSelected) {
  OpenWithStick();
  Do("select BuFileS 0 2");
  EXPECT_EQ(Text("txtNumFileS"), "2  Files selected.");
  EXPECT_EQ(Buttons('S'), "AUC-D-");
  Do("select BuFileS 0 1 2");
  EXPECT_EQ(Text("txtNumFileS"), "3  Files selected.");
  EXPECT_EQ(Buttons('S'), "-UC-D-") << "all of them are selected";
}

TEST_F(CopierPanes, WithTheLastFileUnmarkedHaveNothingToDelete) {
  OpenWithStick();
  DoAll({"select BuFileS 1", "select BuFileS"});
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Text("txtNumFileS"), "0  Files selected.");
  EXPECT_EQ(Buttons('S'), "AUC---") << "as the button comes up";
}

TEST_F(CopierPanes, ExchangeTheirRolesAtAClickInTheOther) {
  Open();
  DoAll({"select BuFileS 0 1", "pick BuFileD 2"});
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Text("txtNumFileS"), "File List = 3");
  EXPECT_EQ(Caption("lblD"), " SOURCE DRIVE ");
  EXPECT_EQ(Color("lblD"), "green");
  EXPECT_EQ(Caption("lblS"), " TARGET DRIVE ");
  EXPECT_EQ(Color("lblS"), "red");
  EXPECT_EQ(Buttons('D'), "AUC-D-");
  EXPECT_EQ(Buttons('S'), "A-----") << "new folders are made where nothing is marked at first";
}

TEST_F(CopierPanes, LoseTheirSelectionWhenTheOthersFoldersTakeTheFocusButStillOfferToCopy) {
  Open();
  DoAll({"select BuFileS 0 1 2", "focus BuDirD"});
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Text("txtNumFileS"), "File List = 3");
  EXPECT_EQ(Buttons('S'), "A-C---");
  EXPECT_EQ(Caption("lblS"), " SOURCE DRIVE ");
}

TEST_F(CopierPanes, KeepTheirSelectionWhenTheOthersDrivesTakeTheFocus) {
  Open();
  DoAll({"select BuFileS 0 1", "focus BuDriveD"});
  EXPECT_EQ(Marked("BuFileS"), (std::vector<int>{0, 1}));
}

TEST_F(CopierPanes, SelectAllMarksEveryFileAndUnmarksTheOthers) {
  Open();
  DoAll({"pick BuFileD 0", "click cmdAllS"});
  EXPECT_EQ(Marked("BuFileS"), (std::vector<int>{0, 1, 2}));
  EXPECT_EQ(Marked("BuFileD"), std::vector<int>{});
  EXPECT_EQ(Text("txtNumFileS"), "3  Files selected.");
  EXPECT_EQ(Text("txtNumFileD"), "File List = 3");
  EXPECT_EQ(Caption("lblS"), " SOURCE DRIVE ");
  EXPECT_EQ(Caption("lblD"), " TARGET DRIVE ");
  EXPECT_EQ(Buttons('S'), "-UC-D-");
  EXPECT_EQ(Buttons('D'), "A-----");
}

TEST_F(CopierPanes, WithAllSelectedHaveTheCopyAtHand) {
  OpenWithStick();
  Do("click cmdAllS");
  EXPECT_EQ(Focus(), "frmBackup.cmdBuS");
}

TEST_F(CopierPanes, UnselectBringsThemBack) {
  Open();
  DoAll({"select BuFileS 0 1", "click cmdUSS"});
  EXPECT_EQ(Marked("BuFileS"), std::vector<int>{});
  EXPECT_EQ(Text("txtNumFileS"), "File List = 3");
  EXPECT_EQ(Buttons('S'), "A--N--");
  EXPECT_EQ(Caption("lblS"), " No files selected ");
  EXPECT_EQ(Color("lblS"), "black");
  EXPECT_EQ(Caption("lblD"), " No files selected ");
}

TEST_F(CopierPanes, ShowAllFilesOrThoseOfMarlowbeckTogether) {
  Open();
  DoAll({"pick BuFileS 0", "click opt(0)"});
  for (const std::string pane : {"S", "D"}) {
    EXPECT_EQ(Lines("BuFile" + pane).size(), Lines("BuFileS").size());
    EXPECT_NE(Lines("BuFile" + pane)[0], "Summer.qza");
    EXPECT_EQ(Marked("BuFile" + pane), std::vector<int>{});
    EXPECT_EQ(Text("txtNumFile" + pane),
              "File List = " + std::to_string(Lines("BuFile" + pane).size()));
  }
  EXPECT_EQ(Buttons('S'), "A--N--");
  Do("click opt(1)");
  EXPECT_EQ(Text("txtNumFileS"), "File List = 3");
  EXPECT_EQ(Lines("BuFileD"), (TextList{"Summer.qza", "Winter.qza", "Winter_A.qzr"}));
}

TEST_F(CopierPanes, KeepTheSelectionWhenTheOptionIsClickedThatIsOn) {
  Open();
  DoAll({"select BuFileS 0 1", "click opt(1)"});
  EXPECT_EQ(Marked("BuFileS"), (std::vector<int>{0, 1}));
}

TEST_F(CopierPanes, ListTheFiveKindsOfSeasonFilesInAnyCapitals) {
  for (const char* name :
       {"a.QZA", "b.qzi", "c.Qzl", "d.qzr", "e.qzs", "f.qz3", "g.ko4", "h.qzax"}) {
    WriteFile(std::string("Stick/") + name, "x");
  }
  OpenWithStick();
  EXPECT_EQ(Lines("BuFileD"), (TextList{"a.QZA", "b.qzi", "c.Qzl", "d.qzr", "e.qzs"}));
  Do("click opt(0)");
  EXPECT_EQ(Lines("BuFileD").size(), 8U);
}

TEST_F(CopierPanes, AChangeOfFolderUnselectsInBoth) {
  Open();
  DoAll({"select BuFileS 0 1", "dblpick BuDirS =Stick"});
  EXPECT_EQ(Get("BuFileS")["path"], PathOf("Stick"));
  EXPECT_EQ(Caption("lblS"), " No files selected ");
  EXPECT_EQ(Buttons('S'), "---N-F");
  Do("dblpick BuDirS =..");
  EXPECT_EQ(Get("BuFileS")["path"], Folder().string());
  EXPECT_EQ(Buttons('S'), "A--N--");
}

TEST_F(CopierPanes, EnterOpensAFolder) {
  Open();
  DoAll({"pick BuDirS =Stick", "key Enter"});
  EXPECT_EQ(Caption("lblPathS"), PathOf("Stick"));
}

TEST_F(CopierPanes, ShortenAPathThatHasNoRoom) {
  const std::string longest = "The winter season of the year of the flood";
  WriteFile(longest + "/a.qza", "x");
  Open();
  DoAll({"dblpick BuDirS =" + longest});
  EXPECT_EQ(Caption("lblPathS"),
            Folder().string().substr(0, 3) + "  ...  " + longest.substr(longest.size() - 40));
  EXPECT_EQ(Get("BuDirS")["path"], PathOf(longest));
}

TEST_F(CopierPanes, SeeWhatHasComeAndGoneOnTheDisk) {
  OpenWithStick();
  WriteFile("Stick/new.qza", "x");
  DeleteFile("Summer.qza");
  DoAll({"pick BuFileS 0", "click cmdUSS"});
  EXPECT_EQ(Lines("BuFileS"), (TextList{"Winter.qza", "Winter_A.qzr"}));
  EXPECT_EQ(Lines("BuFileD"), TextList{"new.qza"});
  EXPECT_EQ(Text("txtNumFileD"), "File List = 1");
}

TEST_F(CopierPanes, WhoseFolderHasGoneStandInTheOneAbove) {
  OpenWithStick();
  DeleteFile("Stick");
  DoAll({"pick BuFileS 0", "click cmdUSS"});
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Caption("lblPathD"), Folder().string());
  EXPECT_EQ(Lines("BuFileD").size(), 3U);
  EXPECT_EQ(Buttons('D'), "A--N--");
}

TEST_F(CopierPanes, TakeNamesOutsideAscii) {
  WriteFile("Stick/Pr\xC3\xA9mi\xC3\xA8re [1] 50%.qza", "x");
  OpenWithStick();
  EXPECT_EQ(Lines("BuFileD"), TextList{"Pr\xC3\xA9mi\xC3\xA8re [1] 50%.qza"});
}

}  // namespace
}  // namespace marlowbeck
