// What cannot be worked out or read for a list, and what the screen shows then.

#include "stats/lists.h"

namespace marlowbeck {
namespace {

class ListErrors : public ListsTest {
 protected:
  /// A thousand and one players, of whom the first alone has played.
  void LayTooManyPlayers() {
    LayClub();
    std::vector<PlayerRecord> players = Players("Winter.qza");
    while (players.size() < 1001) {
      players.push_back(Person(static_cast<int>(players.size()) + 1, "Z", "z", "Rovers", "A"));
    }
    WritePlayers("Winter.qza", players);
  }
};

TEST_F(ListErrors, ADateThatCannotBeShownEndsInTheErrorBoxAndTheNextGradeWorks) {
  LayClub();
  WriteResults("Winter_A.qzr", {Night(1, "Rovers", "Hawks", 1e300, 100, 10)});
  OpenList();
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_TRUE(Shown("fraPikHi"));
  EXPECT_EQ(Caption("lblSeason"), "Winter 2004 ");
  Do("pick cboHiGrade =B");
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Ranked(), (TextList{"Dean, Di 20.00"}));
}

TEST_F(ListErrors, DatesThatCannotBeReadLeaveThoseThatStandAndTheNextPickWorks) {
  LayClub();
  OpenList();
  DoAll({"click cmdCombine", "fault open 1 57", "click cmdReDoAvgs"});
  EXPECT_EQ(Errors(), (std::vector<int>{57}));
  EXPECT_EQ(Lines("lstHiDates"), (TextList{"17/03/2004", "24/03/2004"}));
  DoAll({"fault off", "pick lstHiDates 1"});
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Ranked(), (TextList{"Clark, Ed 30.00", "Archer, Jo 25.25"}));
}

TEST_F(ListErrors, OverAThousandResultsOfADateAreASubscriptFailureAndTheNextDateWorks) {
  HOLDS_FOR_MODELS_ALONE("a thousand rows take long to be read back from windows");
  LayClub();
  std::vector<ResultRecord> results(1, Night(1, "Rovers", "Hawks", kFirstNight, 100, 10));
  results.resize(1002, Night(1, "Rovers", "Hawks", kSecondNight, 100, 10));
  WriteResults("Winter_A.qzr", results);
  OpenList();
  EXPECT_EQ(Errors(), (std::vector<int>{9}));
  EXPECT_FALSE(Shown("fraHi"));
  Do("pick lstHiDates 0");
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Ranked(), (TextList{"Archer, Jo 10.00"}));
}

TEST_F(ListErrors, OverAThousandPlayersAreASubscriptFailureOfTheProgressiveListAlone) {
  HOLDS_FOR_MODELS_ALONE("the limit is a matter of files");
  LayClub();
  OpenList();
  LayTooManyPlayers();
  Do("pick lstHiDates 0");
  EXPECT_TRUE(Errors().empty());
  Do("click cmdProgress");
  EXPECT_EQ(Errors(), (std::vector<int>{9}));
  EXPECT_EQ(Boxes().size(), 1U);
  EXPECT_FALSE(Shown("fraHi"));
  EXPECT_EQ(Caption("cmdProgress"), "Progressive");
  EXPECT_EQ(InSession("Flag"), 0);
  Do("pick lstHiDates 0");
  EXPECT_TRUE(Errors().empty());
  EXPECT_EQ(Row("grdHI", 1)[1], "Baker, Al");
}

TEST_F(ListErrors, AFileCutInsideARecordListsTheWholeOnes) {
  LayClub();
  WriteFile("Winter_A.qzr", File("Winter_A.qzr").substr(0, 148 * 2 + 70));
  OpenList();
  EXPECT_EQ(Lines("lstHiDates"), (TextList{"17/03/2004"}));
  EXPECT_EQ(Ranked(), (TextList{"Baker, Al 30.00", "Archer, Jo 25.00"}));
}

TEST_F(ListErrors, APlayerFileCutInsideARecordNamesTheWholeOnes) {
  LayClub();
  WriteFile("Winter.qza", File("Winter.qza").substr(0, 156 * 2 + 70));
  OpenList();
  EXPECT_EQ(Ranked(), (TextList{" 30.00", "Archer, Jo 25.25"}));
}

TEST_F(ListErrors, ResultsOverTheLimitAreAnOverflow) {
  HOLDS_FOR_MODELS_ALONE("the limit is a matter of files");
  LayClub();
  WriteFile("Winter_A.qzr", std::string(std::size_t{148} * 32768, ' '));
  OpenList();
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  EXPECT_EQ(Front(), "frmPMenu");
}

TEST_F(ListErrors, NonsenseInEveryFieldEndsInNoWorseThanTheErrorBox) {
  HOLDS_FOR_MODELS_ALONE("the bytes are no concern of windows");
  LayClub();
  const std::string players = File("Winter.qza");
  const std::string results = File("Winter_A.qzr");
  for (int byte = 0; byte < 256; byte += 15) {
    WriteFile("Winter_A.qzr", results + std::string(148, static_cast<char>(byte)) + results);
    WriteFile("Winter.qza", std::string(156, static_cast<char>(byte)) + players);
    OpenReports();
    for (const char* entry : {"Image1", "Image3", "Image2", "Image4", "Image5", "Image9"}) {
      Do("input A title for a grade of that name");
      Do(std::string("click ") + entry);
      EXPECT_LE(Errors().size(), 1U) << byte;
      if (!Lines("lstHiDates").empty()) {
        Do("pick lstHiDates 0");
        EXPECT_LE(Errors().size(), 1U) << byte;
        Do("click cmdProgress");
        EXPECT_LE(Errors().size(), 1U) << byte;
      }
      Do("forget");
      Do("click cmdHiMenu");
    }
    Do("click Image10");
    EXPECT_EQ(Front(), "frmDB") << byte;
  }
}

TEST_F(ListErrors, AListThatCannotBeWrittenShowsNoneAndTheNextPickWorks) {
  LayClub();
  OpenList();
  for (const char* line : {"pick lstHiDates 0", "click cmdProgress"}) {
    Do("fault write 1 61");
    Do(line);
    Do("fault off");
    EXPECT_EQ(Errors(), (std::vector<int>{61})) << line;
    EXPECT_FALSE(Shown("fraHi")) << line;
    EXPECT_EQ(InSession("Flag"), 0) << line;
    EXPECT_EQ(Caption("cmdProgress"), "Progressive") << line;
    Do("pick lstHiDates 0");
    EXPECT_TRUE(Errors().empty()) << line;
    EXPECT_TRUE(Shown("fraHi")) << line;
    EXPECT_EQ(Row("grdHI", 1)[1], "Baker, Al") << line;
  }
}

}  // namespace
}  // namespace marlowbeck
