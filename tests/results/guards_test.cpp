// Warnings of the score sheets that no way through the screen leads to: its procedures called by
// themselves.

#include "results/frmResults.h"
#include "support/league.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

class Guards : public ::testing::Test {
 protected:
  void Open(const std::vector<ResultRecord>& results) {
    LayLeague(club_);
    club_.WriteResults(kAResults, results);
    club_.DoAll(ToTeam("A Grade", "Hawks"));
  }
  frmResults& Sheets() { return dynamic_cast<frmResults&>(*club_.ScreensOf().Find("frmResults")); }
  /// Runs a procedure as an event of its own.
  void Run(const std::function<void()>& procedure) {
    EXPECT_TRUE(club_.ScreensOf().GetDispatcher().Run(procedure));
    club_.Do("events");
  }

  Club club_{ModelFaceAlone()};
};

TEST_F(Guards, AConflictIsToldTwiceAndTheListsAreRefreshed) {
  Open({Night(31, "Cubs", "Rovers"), Night(11, "Hawks", "Lions"), Night(12, "Hawks", "Rovers"),
        Night(2, "Rovers", "Gone")});
  Run([&] { Sheets().ChangeOpp(); });
  const std::string told =
      "Hawks versus Rovers\rwas played on Wednesday, 31 March 2004. Therefore\r"
      "Lions cannot play against either team.";
  EXPECT_EQ(club_.BoxTexts(), (std::vector<std::string>{told, told + "\rPlease reselect teams."}));
  EXPECT_EQ(club_.Boxes().front().style, 48);
  EXPECT_EQ(club_.Text("cboOpp"), "Lions");
}

TEST_F(Guards, AConflictFromTheOtherSideIsToldToo) {
  Open({Night(11, "Hawks", "Lions"), Night(1, "Rovers", "Hawks")});
  Run([&] { Sheets().ChangeOpp(); });
  ASSERT_EQ(club_.BoxTexts().size(), 2U);
  EXPECT_EQ(club_.BoxTexts().front(),
            "Rovers versus Hawks\rwas played on Wednesday, 31 March 2004. Therefore\r"
            "Lions cannot play against either team.");
}

TEST_F(Guards, WithoutAConflictNothingIsTold) {
  Open({Night(11, "Hawks", "Lions"), Night(12, "Hawks", "Lions"), Night(31, "Cubs", "Rovers")});
  Run([&] { Sheets().ChangeOpp(); });
  EXPECT_TRUE(club_.BoxTexts().empty());
}

TEST_F(Guards, ASeventhSheetIsRefusedWhereTheQuestionWasNotAsked) {
  std::vector<ResultRecord> results;
  for (int id = 11; id <= 16; ++id) results.push_back(Night(id, "Hawks", "Lions"));
  Open(results);
  Run([&] { Sheets().GotPlayer(); });
  EXPECT_EQ(club_.BoxTexts(), std::vector<std::string>{"Six Players for Hawks have been entered."});
  EXPECT_EQ(club_.Boxes().front().style, 48);
  EXPECT_FALSE(club_.Shown("fraResults"));
  EXPECT_EQ(club_.Lines("lstFinished").size(), 6U);
}

TEST_F(Guards, ASixthSheetIsNot) {
  std::vector<ResultRecord> results;
  for (int id = 11; id <= 15; ++id) results.push_back(Night(id, "Hawks", "Lions"));
  Open(results);
  Run([&] {
    Sheets().lstResPlayers.SetIndex(0);
    Sheets().GotPlayer();
  });
  EXPECT_TRUE(club_.BoxTexts().empty());
  EXPECT_TRUE(club_.Shown("fraResults"));
}

TEST_F(Guards, ASwapWithNobodyToSwapToLeavesTheTeamsUp) {
  Open({Night(11, "Hawks", "Lions"), Night(31, "Cubs", "Rovers")});
  EXPECT_FALSE(club_.Shown("panChangeOpp"));
  Run([&] { Sheets().panChangeOpp_Click(); });
  EXPECT_TRUE(club_.Shown("fraTeams"));
  EXPECT_FALSE(club_.Shown("fraReDoOpp"));
  EXPECT_TRUE(club_.Lines("cboReDoOpp").empty());
}

}  // namespace
}  // namespace marlowbeck
