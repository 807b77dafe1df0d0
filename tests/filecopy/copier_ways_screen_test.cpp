// The ways into the file copier and out of it, and what it keeps.

#include "copier.h"

namespace marlowbeck {
namespace {

class CopierWays : public CopierTest {
 protected:
  void LeaveByTheReminder() { DoAll({"click imgExit", "click cmdAddSave0"}); }
};

TEST_F(CopierWays, FromTheMainMenuWhichWaitsBehind) {
  Open();
  EXPECT_EQ(Front(), "frmBackup");
  EXPECT_TRUE(Loaded("frmDB"));
  EXPECT_EQ(Get("frmDB.imgbackup")["shown"], true);
  EXPECT_EQ(Refused("click frmDB.imgPlayers").empty(), false);
  EXPECT_EQ(Caption("cmdCancel"), "Main Menu");
  EXPECT_FALSE(Shown("cmdMain"));
}

TEST_F(CopierWays, BackToTheMainMenuByTheCommandTheKeyAndTheWindow) {
  for (const char* way : {"click cmdCancel", "key Esc", "close frmBackup"}) {
    Open();
    Do(way);
    EXPECT_EQ(Front(), "frmDB") << way;
    EXPECT_FALSE(Loaded("frmBackup"));
    EXPECT_TRUE(Enabled("frmDB.imgbackup")) << way;
    EXPECT_EQ(Count("ended"), 0);
  }
}

TEST_F(CopierWays, TheCompetitionIsThereAgainWhereverTheCopierWent) {
  WritePlayers("Winter.qza", {});
  NameOpenFile("Winter.qza");
  OpenWithStick();
  DoAll({"click cmdCancel"});
  EXPECT_EQ(Title("frmDB"), "[Marlowbeck] Filename: WINTER");
}

TEST_F(CopierWays, FromTheReminderToTheEndOfTheProgram) {
  LeaveByTheReminder();
  EXPECT_EQ(Front(), "frmBackup");
  EXPECT_FALSE(Loaded("frmBuend"));
  EXPECT_EQ(Caption("cmdCancel"), "End Marlowbeck");
  EXPECT_TRUE(Shown("cmdMain"));
  EXPECT_EQ(Count("ended"), 0);
  const Json answer = Do("click cmdCancel");
  EXPECT_EQ(answer["ended"], true);
  EXPECT_EQ(Count("ended"), 1);
}

TEST_F(CopierWays, TheWindowEndsTheProgramOnTheWayOutToo) {
  LeaveByTheReminder();
  Do("close frmBackup");
  EXPECT_EQ(Count("ended"), 1);
}

TEST_F(CopierWays, EscEndsTheProgramOnTheWayOutToo) {
  LeaveByTheReminder();
  Do("key Esc");
  EXPECT_EQ(Count("ended"), 1);
}

TEST_F(CopierWays, FromTheReminderBackToTheMainMenuWithAllItsPictures) {
  Do("key Esc");
  DoAll({"click cmdAddSave0", "click cmdMain"});
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmBackup"));
  EXPECT_EQ(Count("ended"), 0);
  EXPECT_TRUE(Enabled("imgbackup"));
  EXPECT_TRUE(Shown("imgExit"));
  Open();
  EXPECT_EQ(Caption("cmdCancel"), "Main Menu");
}

TEST_F(CopierWays, HelpTellsHowToCopy) {
  Open();
  Do("key F1");
  EXPECT_EQ(EventsNamed("help").at(0)["file"], "qz1.HLP");
  EXPECT_EQ(EventsNamed("help").at(0)["topic"], 215);
}

TEST_F(CopierWays, OverwritingIsOffAtFirstAndSaysSo) {
  Open();
  EXPECT_FALSE(Ticked("chkReplace"));
  EXPECT_EQ(File("QzCopy.qz3"), "NO\r\n");
}

TEST_F(CopierWays, OverwritingIsRemembered) {
  OpenWithStick();
  Do("click chkReplace");
  EXPECT_EQ(File("QzCopy.qz3"), "YES\r\n");
  EXPECT_FALSE(HasFile("Stick/QzCopy.qz3")) << "it lies in the program's folder";
  DoAll({"click cmdCancel", "click imgbackup"});
  EXPECT_TRUE(Ticked("chkReplace"));
  Do("click chkReplace");
  EXPECT_EQ(File("QzCopy.qz3"), "NO\r\n");
}

TEST_F(CopierWays, OverwritingIsOffUnlessTheFileSaysYes) {
  const std::vector<std::pair<std::string, bool>> files = {
      {"YES\r\n", true}, {"YES\n", true},       {"\"YES\"\r\n", true},     {"yes\r\n", false},
      {"NO\r\n", false}, {"YESSIR\r\n", false}, {"\x01\x02garbled", false}};
  for (const auto& [content, on] : files) {
    WriteFile("QzCopy.qz3", content);
    Open();
    EXPECT_EQ(Ticked("chkReplace"), on) << content;
    EXPECT_EQ(File("QzCopy.qz3"), content) << "it is not written when it can be read";
    Do("click cmdCancel");
  }
}

TEST_F(CopierWays, AnEmptyFileOfTheChoiceIsWrittenAnew) {
  WriteFile("QzCopy.qz3", "");
  Open();
  EXPECT_FALSE(Ticked("chkReplace"));
  EXPECT_EQ(File("QzCopy.qz3"), "NO\r\n");
}

TEST_F(CopierWays, OfAChoiceThatCannotBeKeptIsTold) {
  Open();
  DoAll({"fault write 1 61", "click chkReplace"});
  EXPECT_EQ(EventsNamed("error").at(0)["number"], 61);
  EXPECT_EQ(File("QzCopy.qz3"), "NO\r\n");
}

}  // namespace
}  // namespace marlowbeck
