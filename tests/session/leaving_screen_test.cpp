#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

/// The way out of the program.
class LeavingTheProgram : public ClubTest {
 protected:
  void SetUp() override {
    WritePlayers("Winter.qza", {Player(1, "Archer", "Jo", "Rovers", "A Grade"),
                                Player(2, "Bull", "Ann", "Hawks", "A Grade")});
    NameOpenFile("Winter.qza");
  }
};

TEST_F(LeavingTheProgram, ReminderSaysWhatItRecommends) {
  Do("click imgExit");
  EXPECT_EQ(Front(), "frmBuend");
  EXPECT_EQ(Title("frmBuend"), "[Marlowbeck]  BEFORE YOU QUIT");
  EXPECT_EQ(Caption("Label1"), "Marlowbeck Backup Options");
  EXPECT_EQ(Caption("Label2"),
            "Marlowbeck highly recommends that you copy your\r"
            "data to another disk to avoid data loss, usually caused\r"
            "by accidental erasure or equipment failure.\r\r"
            "To ensure that your data is copied correctly, please\r"
            "follow the step-by-step instructions in the Help file.");
  EXPECT_EQ(Caption("optBU(0)"), "Copy your data to another Disk.");
  EXPECT_EQ(Caption("optBU(1)"), "No Backup required for this session.");
  EXPECT_TRUE(Ticked("optBU(0)"));
  EXPECT_EQ(Caption("cmdAddSave0"), "Backup NOW!");
  EXPECT_EQ(Caption("lblEsc"), "Press \"Esc\" to Quit Marlowbeck");
}

TEST_F(LeavingTheProgram, CaptionFollowsTheOption) {
  DoAll({"click imgExit", "click optBU(1)"});
  EXPECT_EQ(Caption("cmdAddSave0"), "Quit Now");
  Do("click optBU(0)");
  EXPECT_EQ(Caption("cmdAddSave0"), "Backup Now");
  EXPECT_FALSE(Ticked("optBU(1)"));
}

TEST_F(LeavingTheProgram, SecondOptionEndsTheProgram) {
  const Json answer = DoAll({"click imgExit", "click optBU(1)", "click cmdAddSave0"});
  EXPECT_EQ(Count("ended"), 1);
  EXPECT_EQ(answer["ended"], true);
}

TEST_F(LeavingTheProgram, EveryWayOutLeadsToTheReminder) {
  for (const char* way : {"click mnuExit", "close frmDB", "key Esc", "click imgExit"}) {
    Do(way);
    EXPECT_EQ(Front(), "frmBuend") << way;
    EXPECT_FALSE(Shown("frmDB.imgPlayers")) << way;
    Do("click cmdMainMenu");
    EXPECT_EQ(Front(), "frmDB") << way;
    EXPECT_FALSE(Loaded("frmBuend")) << way;
  }
}

TEST_F(LeavingTheProgram, EscHidesWhatLedOutUntilTheMainMenuIsBack) {
  DoAll({"hover imgExit", "key Esc"});
  EXPECT_EQ(Get("frmDB.imgExit")["visible"], false);
  EXPECT_EQ(Get("frmDB.lblEsc")["visible"], false);
  EXPECT_EQ(Get("frmDB.lblDescription")["visible"], false);
  Do("click cmdMainMenu");
  EXPECT_TRUE(Shown("imgExit"));
  EXPECT_TRUE(Shown("lblEsc"));
  EXPECT_EQ(Caption("lblHMPlayers"), "2 Players Listed in File. ");
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] Filename: WINTER");
}

TEST_F(LeavingTheProgram, EscOnTheReminderEndsTheProgram) {
  DoAll({"click imgExit", "key Esc"});
  EXPECT_EQ(Count("ended"), 1);
}

TEST_F(LeavingTheProgram, FirstOptionLeadsToTheCopier) {
  DoAll({"click imgExit", "click cmdAddSave0"});
  EXPECT_EQ(Front(), "frmBackup");
  EXPECT_FALSE(Loaded("frmBuend"));
  EXPECT_EQ(Caption("cmdCancel"), "End Marlowbeck");
  EXPECT_EQ(Count("ended"), 0);
}

TEST_F(LeavingTheProgram, HelpTellsAboutBackups) {
  DoAll({"click imgExit", "click cmdHelp"});
  EXPECT_EQ(EventsNamed("help").at(0)["file"], "qz1.HLP");
  EXPECT_EQ(EventsNamed("help").at(0)["topic"], 215);
}

TEST_F(LeavingTheProgram, NothingIsWrittenOnTheWayOut) {
  Start();
  const std::string before = File("FileName.qz3");
  DoAll({"click imgExit", "click optBU(1)", "click cmdAddSave0"});
  EXPECT_EQ(File("FileName.qz3"), before);
  EXPECT_EQ(Refused("click imgPlayers").empty(), false);
}

}  // namespace
}  // namespace marlowbeck
