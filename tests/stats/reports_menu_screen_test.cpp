#include "stats/reports.h"

namespace marlowbeck {
namespace {

class ReportsMenu : public ReportsTest {
 protected:
  void ExpectMenu(Here here = Here::current()) {
    EXPECT_EQ(Title("frmPMenu", here), "[Marlowbeck] Reports");
    EXPECT_TRUE(Shown("fraMenu", here));
    for (const char* hidden : {"lblSeason", "lblNoneFound", "picPrint", "picPrintHI", "fraFontPick",
                               "lblFontInfo", "fraHi", "fraWkProg", "fraWeek", "fraPikHi",
                               "cmdReDoAvgs", "FraCombineOptions", "imgBall"}) {
      EXPECT_FALSE(Shown(hidden, here)) << hidden;
    }
    // It lies in a panel that is hidden itself, so that only its own state tells.
    EXPECT_EQ(Get("fraFFYesNo", here)["visible"], false);
  }
};

const std::vector<std::string> kEntries = {"Image1", "Image3",  "Image2", "Image4",
                                           "Image5", "Image9",  "Image6", "Image7",
                                           "Image8", "Image12", "Image10"};

TEST_F(ReportsMenu, IsAllThatShowsAtFirst) {
  LayRovers();
  OpenReports();
  EXPECT_EQ(Front(), "frmPMenu");
  ExpectMenu();
  for (const std::string& entry : kEntries) EXPECT_TRUE(Shown(entry)) << entry;
}

TEST_F(ReportsMenu, BallStandsAtTheEntryUnderThePointer) {
  LayRovers();
  OpenReports();
  for (const std::string& entry : kEntries) {
    Do("hover " + entry);
    EXPECT_TRUE(Shown("imgBall")) << entry;
  }
  Do("hover fraMenu");
  EXPECT_FALSE(Shown("imgBall"));
}

TEST_F(ReportsMenu, NameSearchAsksForASurname) {
  LayRovers();
  OpenReports();
  Do("input  archer ");
  Do("click Image12");
  ASSERT_EQ(EventsNamed("input").size(), 1U);
  EXPECT_EQ(EventsNamed("input")[0]["prompt"], "Enter SURNAME to Search for.");
  EXPECT_EQ(EventsNamed("input")[0]["title"], "Name Search");
}

TEST_F(ReportsMenu, NameSearchWithoutANameStays) {
  LayRovers();
  OpenReports();
  Do("input-cancel");
  Do("click Image12");
  EXPECT_EQ(Front(), "frmPMenu");
  EXPECT_EQ(InSession("SearchText"), "");
}

TEST_F(ReportsMenu, ExitGoesBackToTheMainMenu) {
  LayRovers();
  OpenReports();
  Do("click Image10");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(Loaded("frmPMenu"));
}

TEST_F(ReportsMenu, EscLeavesTheReportAndThenTheScreen) {
  LayRovers();
  OpenWeekly();
  Do("key Esc");
  ExpectMenu();
  Do("key Esc");
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(ReportsMenu, LeavingWithoutADatePickedWritesNoWorkDate) {
  LayRovers();
  OpenReports();
  Do("close frmPMenu");
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_FALSE(HasFile("WkDate.qz3"));
}

TEST_F(ReportsMenu, ADateThatCannotBeWrittenStillLetsGoOfTheScreen) {
  HOLDS_FOR_MODELS_ALONE("the fault is in the folder of one face");
  LayRovers();
  OpenWeekly();
  Do("fault open 1 61");
  Do("click cmdCancelWK");
  Do("click Image10");
  EXPECT_EQ(Errors(), (std::vector<int>{61}));
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(ReportsMenu, FirstStartWritesTheFontThatEveryInstallationBeginsWith) {
  LayRovers();
  OpenReports();
  EXPECT_EQ(File("FontName.qz3"), "10,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n");
  EXPECT_EQ(InSession("PrintFontSize"), 10);
  EXPECT_EQ(InSession("PrintFontName"), "MS Sans Serif");
  EXPECT_EQ(Caption("lblFont"), "MS Sans Serif");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 10pts.");
}

TEST_F(ReportsMenu, TheFontIsTheOneKept) {
  LayRovers();
  WriteFile("FontName.qz3", "12,\"Liberation, Sans\",#TRUE#,#FALSE#\n");
  OpenReports();
  EXPECT_EQ(Caption("lblFont"), "Liberation, Sans");
  EXPECT_EQ(Caption("lblPrFont"), "Font size = 12pts.");
  EXPECT_EQ(InSession("PrintFontBold"), true);
  EXPECT_EQ(InSession("PrintFontItalic"), false);
}

TEST_F(ReportsMenu, AFontFileThatCannotBeReadIsWrittenAnew) {
  LayRovers();
  for (const char* bad : {"", "12,\"Liberation Sans\",#TRUE#", "big,\"Sans\",#TRUE#,#TRUE#\r\n",
                          "12,\"Sans\",yes,no\r\n", "99999999999,\"Sans\",#TRUE#,#TRUE#\r\n"}) {
    WriteFile("FontName.qz3", bad);
    OpenReports();
    EXPECT_TRUE(Boxes().empty()) << bad;
    EXPECT_EQ(File("FontName.qz3"), "10,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n") << bad;
    EXPECT_EQ(Caption("lblFont"), "MS Sans Serif") << bad;
    Do("click Image10");
  }
}

TEST_F(ReportsMenu, AQuestionThatStoodThereIsGoneFromTheMenuAndFromTheNextReport) {
  LayRovers();
  OpenWeekly();
  EXPECT_TRUE(Shown("fraFFYesNo"));
  Do("click cmdCancelWK");
  ExpectMenu();
}

TEST_F(ReportsMenu, WithoutTheOpenFilesNameWhatWasOpenStays) {
  LayRovers();
  WriteFile("FontName.qz3", "12,\"Sans\",#FALSE#,#FALSE#\r\n");
  Start();
  const Json open = InSession("PlayerFile");
  // The name is written before the screen opens, then the font is read, and the name is last.
  const auto opened = [this] { return Do("fault count")["operations"]["open"].get<int>(); };
  const int before = opened();
  OpenReports();
  const int last = opened() - before;
  Do("click Image10");
  Do("fault open " + std::to_string(last) + " 53");
  OpenReports();
  Do("fault off");
  EXPECT_TRUE(Boxes().empty());
  ExpectMenu();
  EXPECT_EQ(InSession("PlayerFile"), open);
  Do("click Image6");
  EXPECT_EQ(Text("cboResTeam"), "Rovers");
}

TEST_F(ReportsMenu, TheNameThatIsReadIsTheOneThatIsOpen) {
  LayRovers();
  OpenReports();
  EXPECT_EQ(InSession("PlayerFile"), FilePath("Winter.qza").string());
}

}  // namespace
}  // namespace marlowbeck
