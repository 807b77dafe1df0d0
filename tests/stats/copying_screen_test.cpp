// The tables and the lists as text for a spreadsheet, byte for byte.

#include "stats/lists.h"

namespace marlowbeck {
namespace {

using Copying = ListsTest;

TEST_F(Copying, TheTeamsTablesGoToTheClipboardTogether) {
  LayRovers();
  WriteFile("Association.qz3", "\"Marlow Darts\"\r\n");
  WriteFile("Winter_A.qzs", "\" Winter 2004 \"\r\n");
  OpenWeekly();
  Do("click cmdClipWeek");
  const auto clipboard = EventsNamed("clipboard");
  ASSERT_EQ(clipboard.size(), 2U);
  EXPECT_EQ(clipboard[0], "") << "it is cleared first";
  EXPECT_EQ(clipboard[1],
            "Marlow Darts\r\nWinter 2004\r\nRovers  (A)\r\n24/03/2004 (v's Swifts)\r\n"
            "Player\tAgg\tShots\t180's\t100's\tH/Scr\tTriples\tDoubles\tSingles\tAvg\r\n"
            "Archer, Jo\t505\t20\t\t\t\t\t\t\t25.25\r\n"
            "Baker, Al *\tForfeit\tWin\t\t\t\t\t\t\t\r\n"
            "\r\n"
            "Rovers  Progressive details to:  24/03/2004\r\n"
            "Player\tAgg\tShots\t180's\t100's\tH/Scr\tPegs\tHi/Peg\tGames\tAvg\r\n"
            "Baker, Al\t300\t10\t\t\t\t\t\t2\t30.00\r\n"
            "Archer, Jo\t1005\t40\t\t\t\t\t\t2\t25.12\r\n");
  EXPECT_EQ(BoxTexts(),
            (TextList{"Players results for Rovers  Progressive details to:  24/03/2004    \r"
                      "24/03/2004 (v's Swifts)    \r(including their progressive results),    \r"
                      "have been copied to the clipboard    \r"
                      "and can now be pasted as text into your    \r"
                      "favourite spreadsheet or wordprocessor.    \r\r"
                      "Note: When you leave this section,    \rthe Clipboard will be cleared !"}));
  EXPECT_EQ(Boxes().at(0).style, 64);
}

TEST_F(Copying, TheSeasonsTitleOfTheGradeIsReadFirst) {
  LayRovers();
  OpenWeekly();
  WriteFile("Winter_A.qzs", "\"Autumn 2004\"\r\n");
  Do("click cmdClipWeek");
  EXPECT_TRUE(
      EventsNamed("clipboard").back().get<std::string>().starts_with("\r\nAutumn 2004\r\n"));
  EXPECT_EQ(InSession("SeasonDescription"), "Autumn 2004");
}

TEST_F(Copying, ATableThatIsNotSeenIsCopiedAsItLies) {
  Lay({Person(1, "Archer", "Jo", "Rovers", "A")},
      {ForfeitNight(1, "Rovers", "Hawks", kFirstNight),
       Night(1, "Rovers", "Swifts", kSecondNight, 505, 20)});
  OpenWeekly();
  Do("pick lstAllDates 0");
  EXPECT_FALSE(Shown("grdProg"));
  Do("click cmdClipWeek");
  EXPECT_TRUE(EventsNamed("clipboard")
                  .back()
                  .get<std::string>()
                  .ends_with("Hi/Peg\tGames\tAvg\r\n \t \t \t \t \t \t \t \t \t \r\n"));
}

TEST_F(Copying, AListHasATabBehindEveryCell) {
  LayClub();
  OpenList();
  DoAll({"pick lstHiDates 0", "click cmdClipHi"});
  const auto clipboard = EventsNamed("clipboard");
  ASSERT_EQ(clipboard.size(), 2U);
  EXPECT_EQ(clipboard[0], "");
  EXPECT_EQ(clipboard[1],
            "Marlow Darts\r\nWinter 2004\r\nHighest Averages\r\nA    played on:  17/03/2004\r\n"
            "No.\tPlayer\tTeam\tAvg\t\r\n"
            "1\tBaker, Al\tRovers\t30.00\t\r\n"
            "2\tArcher, Jo\tRovers\t25.00\t\r\n"
            "3\tClark, Ed\tHawks\t25.00\t\r\n");
  EXPECT_EQ(BoxTexts(),
            (TextList{"Highest Averages    \rA    played on:  17/03/2004    \r"
                      "have been copied to the clipboard    \r"
                      "and can now be pasted as text into your    \r"
                      "favourite spreadsheet or wordprocessor.    \r\r"
                      "Note: When you leave this section,    \rthe Clipboard will be cleared !"}));
  EXPECT_EQ(Boxes().at(0).style, 64);
}

TEST_F(Copying, HandicapsAreCopiedWithTheList) {
  LayClub();
  OpenList();
  DoAll({"click cmdProgress", "input 30", "click cmdHcap", "click cmdClipHi"});
  EXPECT_EQ(EventsNamed("clipboard").back(),
            "Marlow Darts\r\nWinter 2004\r\nPROGRESSIVE Highest Averages (With Handicaps)\r\n"
            "A  up to:  24/03/2004\r\n"
            "No.\tPlayer\tTeam\tAvg\tGms\tH/cap\t\r\n"
            "1\tBaker, Al\tRovers\t30.00\t1\t0\t\r\n"
            "2\tClark, Ed\tHawks\t27.22\t2\t46\t\r\n"
            "3\tArcher, Jo\tRovers\t25.12\t2\t81\t\r\n");
}

TEST_F(Copying, AllGradesTogetherAreCopiedInTheOrderShown) {
  LayClub();
  OpenList();
  DoAll({"click cmdCombine", "click optCombineAlpha", "click cmdClipHi"});
  EXPECT_EQ(EventsNamed("clipboard").back(),
            "Marlow Darts\r\nWinter 2004\r\nAverages for All Grades up to\r\n24/03/2004\r\n"
            "No.\tPlayer\tTeam\tGrade\tGms\tAvg\t\r\n"
            "1\tArcher, Jo\tRovers\tA\t2\t25.12\t\r\n"
            "2\tBaker, Al\tRovers\tA\t1\t30.00\t\r\n"
            "3\tClark, Ed\tHawks\tA\t2\t27.22\t\r\n"
            "4\tDean, Di\tBees\tB\t1\t20.00\t\r\n");
}

TEST_F(Copying, KeepTheClipboardAsItIsWhenTheSectionIsLeft) {
  LayClub();
  OpenList();
  Do("click cmdClipHi");
  const Json copied = Do("clipboard")["text"];
  DoAll({"click cmdHiMenu", "click Image10"});
  EXPECT_EQ(Count("clipboard"), 0);
  EXPECT_EQ(Do("clipboard")["text"], copied);
}

}  // namespace
}  // namespace marlowbeck
