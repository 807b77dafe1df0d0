#include "drive/workbench.h"

namespace marlowbeck {
namespace {

/// Drives, folders and files of a working folder with a few of each.
class DiskLists : public WorkbenchTest {
 protected:
  DiskLists() {
    for (const char* file : {"Winter.qza", "WINTER_A.QZR", "notes.txt", "plain", "Old/Summer.qza",
                             "Old/deep/x.txt", "empty/.keep"}) {
      WriteFile(file, "");
    }
    DeleteFile("empty/.keep");
    prepare = [](Workbench& bench) {
      bench.dirFolders.Click = [&bench] { bench.Tell("folder clicked"); };
      bench.dirFolders.DoubleClick = [&bench] { bench.Tell("folder doubly"); };
      bench.dirFolders.Change = [&bench] {
        bench.Tell("folder changed");
        bench.filFiles.SetPath(bench.dirFolders.Path());
      };
      bench.filFiles.Click = [&bench] { bench.Tell("file clicked"); };
      bench.filFiles.MouseUp = [&bench] { bench.Tell("button up"); };
      bench.drvDrives.Click = [&bench] { bench.Tell("drive clicked"); };
      bench.drvDrives.Change = [&bench] { bench.Tell("drive " + bench.drvDrives.Drive()); };
    };
  }

  std::string PathOf(const std::string& list) { return Get(list)["path"]; }
  std::string Sub(const std::string& name) { return (Folder() / name).string(); }
};

TEST_F(DiskLists, HoldWhatLiesInTheFolderByNameWithoutRegardToCase) {
  EXPECT_EQ(Lines("dirFolders"), (TextList{"..", "empty", "Old"}));
  EXPECT_EQ(Lines("filFiles"), (TextList{"notes.txt", "plain", "Winter.qza", "WINTER_A.QZR"}));
  EXPECT_EQ(PathOf("dirFolders"), Folder().string());
}

TEST_F(DiskLists, AClickOnAFolderOpensNothing) {
  EXPECT_EQ(ToldBy("pick dirFolders =Old"), "folder clicked;");
  EXPECT_EQ(PathOf("dirFolders"), Folder().string());
  EXPECT_EQ(Index("dirFolders"), 2);
}

TEST_F(DiskLists, ADoubleClickOpensTheFolder) {
  EXPECT_EQ(ToldBy("dblpick dirFolders 2"), "folder clicked;folder changed;folder doubly;");
  EXPECT_EQ(PathOf("dirFolders"), Sub("Old"));
  EXPECT_EQ(Lines("dirFolders"), (TextList{"..", "deep"}));
  EXPECT_EQ(Index("dirFolders"), -1);
  EXPECT_EQ(Lines("filFiles"), TextList{"Summer.qza"});
}

TEST_F(DiskLists, ADoubleClickOnTheTwoDotsGoesUp) {
  DoAll({"dblpick dirFolders =Old", "dblpick dirFolders =deep", "dblpick dirFolders 0"});
  EXPECT_EQ(PathOf("dirFolders"), Sub("Old"));
  Do("dblpick dirFolders =..");
  EXPECT_EQ(PathOf("filFiles"), Folder().string());
}

TEST_F(DiskLists, ADoubleClickBesideTheFoldersOpensNothing) {
  Do("pick dirFolders =Old");
  EXPECT_EQ(ToldBy("dblclick dirFolders"), "folder doubly;");
  EXPECT_EQ(PathOf("dirFolders"), Folder().string());
}

TEST_F(DiskLists, EnterOpensTheFolderToo) {
  DoAll({"focus dirFolders", "key Down", "key Down", "key Down"});
  EXPECT_EQ(ToldBy("key Enter"), "folder changed;");
  EXPECT_EQ(PathOf("dirFolders"), Sub("Old"));
  EXPECT_EQ(ToldBy("key Enter"), "");
}

TEST_F(DiskLists, ThereIsNoWayUpFromTheRoot) {
  Change([](Workbench& bench) { bench.dirFolders.SetPath("/"); });
  EXPECT_EQ(PathOf("dirFolders"), "/");
  EXPECT_NE(Lines("dirFolders").at(0), "..");
}

TEST_F(DiskLists, AFolderThatHasGoneEndsInTheErrorBoxAndChangesNothing) {
  Start();
  DeleteFile("Old");
  Do("dblpick dirFolders =Old");
  EXPECT_EQ(EventsNamed("error"), std::vector<Json>{Json::parse(R"({"number": 76})")});
  EXPECT_EQ(PathOf("dirFolders"), Folder().string());
  EXPECT_EQ(Lines("dirFolders"), (TextList{"..", "empty", "Old"}));
}

TEST_F(DiskLists, APathByProgramIsSpelledAsOnTheDiskAndToldOnce) {
  OnDo([](Workbench& bench) {
    bench.Disk().ChangeFolder(bench.context.working_folder);
    bench.dirFolders.SetPath("old/");
  });
  EXPECT_EQ(ToldBy("click cmdDo"), "folder changed;");
  EXPECT_EQ(PathOf("dirFolders"), Sub("Old"));
  EXPECT_EQ(ToldBy("click cmdDo"), "");
}

TEST_F(DiskLists, AfterChangesOnTheDiskARefreshTellsThem) {
  Do("select filFiles 0 1");
  WriteFile("empty/inner/a", "");
  WriteFile("added", "");
  EXPECT_EQ(Lines("filFiles").size(), 4U);
  Change([](Workbench& bench) {
    bench.filFiles.Refresh();
    bench.dirFolders.Refresh();
  });
  EXPECT_EQ(Lines("filFiles").front(), "added");
  EXPECT_EQ(Get("filFiles")["selected"], Json::array());
  EXPECT_EQ(Index("filFiles"), -1);
  EXPECT_EQ(Caption("lblTold"), "file clicked;button up;file clicked;button up;");
}

TEST_F(DiskLists, APatternLetsThroughWhatItFits) {
  Change([](Workbench& bench) { bench.filFiles.SetPattern("*.qza;*.qzr"); });
  EXPECT_EQ(Lines("filFiles"), (TextList{"Winter.qza", "WINTER_A.QZR"}));
  DoAll({"pick filFiles 1", "dblpick dirFolders =Old"});
  EXPECT_EQ(Lines("filFiles"), TextList{"Summer.qza"});
  Change([](Workbench& bench) { bench.filFiles.SetPattern("*.*"); });
  EXPECT_EQ(Lines("filFiles").size(), 1U);
}

TEST_F(DiskLists, APatternStaysAsItWasWhenTheFolderCannotBeRead) {
  Change([](Workbench& bench) {
    bench.filFiles.SetPath(PathIn(bench.context.working_folder, "empty"));
  });
  DeleteFile("empty");
  Change([](Workbench& bench) {
    EXPECT_THROW(bench.filFiles.SetPattern("*.txt"), RunTimeError);
    EXPECT_EQ(bench.filFiles.Pattern(), "*.*");
  });
}

TEST_F(DiskLists, TheButtonComesUpAfterTheClickAndBesideTheLinesAlone) {
  EXPECT_EQ(ToldBy("pick filFiles 1"), "file clicked;button up;");
  EXPECT_EQ(ToldBy("select filFiles"), "file clicked;button up;");
  EXPECT_EQ(ToldBy("click filFiles"), "button up;");
  EXPECT_EQ(ToldBy("key Down"), "file clicked;");
}

TEST_F(DiskLists, APickedDriveIsTheCurrentOne) {
  EXPECT_EQ(ToldBy("pick drvDrives 0"), "drive /;drive clicked;");
  EXPECT_EQ(ToldBy("pick drvDrives 0"), "drive clicked;");
  Change([](Workbench& bench) { bench.drvDrives.Refresh(); });
  EXPECT_EQ(Index("drvDrives"), 0);
}

TEST_F(DiskLists, AScreenCanTellOfADriveThatIsNotReady) {
  Change([](Workbench& bench) {
    bench.drvDrives.Change = [&bench] {
      try {
        bench.dirFolders.SetPath("/no/such/drive");
      } catch (const RunTimeError& error) {
        bench.Box("Drive " + bench.drvDrives.Drive() + " is not available!    ");
      }
    };
  });
  Do("pick drvDrives 0");
  EXPECT_EQ(BoxTexts(), TextList{"Drive / is not available!    "});
  EXPECT_EQ(PathOf("dirFolders"), Folder().string());
}

}  // namespace
}  // namespace marlowbeck
