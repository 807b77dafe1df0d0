// How a list of the highest stands in its table.

#include <ctime>

#include <QHeaderView>
#include <QScrollBar>
#include <QTableWidget>

#include "tests/desktop/window_club.h"

namespace marlowbeck {
namespace {

constexpr double kNight = 38063;  // 17/03/2004

class ListLooks : public testing::Test {
 protected:
  QTableWidget& List() { return club_.Find<QTableWidget>("grdHI"); }

  /// "R" or "L" for each column, the same in the heading and in the rows.
  std::string Sides() {
    std::string sides;
    for (int col = 0; col < List().columnCount(); ++col) {
      const auto of_heading = List().horizontalHeaderItem(col)->textAlignment();
      EXPECT_EQ(of_heading, List().item(0, col)->textAlignment()) << col;
      sides += (of_heading & Qt::AlignRight) != 0 ? 'R' : 'L';
    }
    return sides;
  }

  /// As many players as there can be, who have all played once.
  void LayFullGrade() {
    std::vector<PlayerRecord> players(999);
    std::vector<ResultRecord> results(999);
    for (std::size_t i = 0; i < players.size(); ++i) {
      players[i].ID = results[i].ID = static_cast<std::int32_t>(i) + 1;
      players[i].Surname = "Player " + std::to_string(i);
      players[i].FirstName = "Jo";
      players[i].Team = results[i].Team = "Rovers";
      players[i].Grade = "A Grade";
      results[i].GameDate = Date{kNight};
      results[i].Aggregate = static_cast<std::int16_t>(500 + i);
      results[i].Shots = 20;
    }
    club_.WritePlayers("Winter.qza", players);
    club_.WriteResults("Winter_A Grade.qzr", results);
  }

  WindowClub club_;
};

TEST_F(ListLooks, NumbersAndFiguresStandRightAndNamesLeft) {
  club_.DoAll({"click imgPrinter", "click Image1"});
  EXPECT_EQ(Sides(), "RLLR");
  club_.Do("click cmdProgress");
  EXPECT_EQ(Sides(), "RLLRR");
  club_.DoAll({"input 30", "click cmdHcap"});
  EXPECT_EQ(Sides(), "RLLRRR");
  club_.Do("click cmdCombine");
  EXPECT_EQ(Sides(), "RLLLRR");
}

TEST_F(ListLooks, TheNumbersTakeNoMoreRoomThanTheyNeed) {
  club_.DoAll({"click imgPrinter", "click Image1"});
  EXPECT_LT(List().columnWidth(0), 60);
  EXPECT_EQ(List().horizontalHeader()->length(), List().viewport()->width());
}

TEST_F(ListLooks, AThousandRowsAppearWithoutAWaitBelowAHeadingThatStays) {
  LayFullGrade();
  club_.DoAll({"click imgPrinter", "click Image1"});
  const std::clock_t before = std::clock();
  club_.Do("click cmdProgress");
  const double seconds = static_cast<double>(std::clock() - before) / CLOCKS_PER_SEC;
  EXPECT_LT(seconds, 1) << "a tenth of it is what it takes";
  ASSERT_EQ(List().rowCount(), 999);
  EXPECT_EQ(List().rowHeight(998), List().rowHeight(0));
  List().verticalScrollBar()->triggerAction(QScrollBar::SliderToMaximum);
  EXPECT_TRUE(List().visualItemRect(List().item(998, 0)).intersects(List().viewport()->rect()));
  EXPECT_FALSE(List().visualItemRect(List().item(0, 0)).intersects(List().viewport()->rect()));
  EXPECT_TRUE(List().horizontalHeader()->isVisible());
  EXPECT_EQ(List().horizontalHeaderItem(1)->text(), "Player");
}

}  // namespace
}  // namespace marlowbeck
