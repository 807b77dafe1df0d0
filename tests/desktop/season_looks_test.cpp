// How found players and peg ratios stand in their tables.

#include <array>

#include <QHeaderView>
#include <QLabel>
#include <QScrollBar>
#include <QTableWidget>

#include "tests/desktop/window_club.h"

namespace marlowbeck {
namespace {

class SeasonLooks : public testing::Test {
 protected:
  static PlayerRecord Player(int id, const std::string& surname) {
    PlayerRecord player;
    player.ID = id;
    player.Surname = surname;
    player.FirstName = "Jo";
    player.Team = "Rovers";
    player.Grade = "A Grade";
    return player;
  }
  /// A grade with one player, who has finished once in three legs.
  void ShowRatiosOf(const std::string& surname) {
    club_.WritePlayers("Winter.qza", {Player(1, surname)});
    ResultRecord result;
    result.ID = 1;
    result.Legs = 3;
    result.Pegs = {40, 0, 0, 0, 0, 0};
    club_.WriteResults("Winter_A Grade.qzr", {result});
    club_.DoAll({"click imgPrinter", "click Image8", "pick cboResGrade 0"});
  }
  QTableWidget& Found() { return club_.Find<QTableWidget>("grdShow"); }
  void Search(const std::string& text) { club_.DoAll({"input " + text, "click mnuSearchPlayer"}); }

  WindowClub club_;
};

TEST_F(SeasonLooks, FoundPlayersStandInFourColumnsAlikeBelowCentredHeadings) {
  club_.WritePlayers("Winter.qza", {Player(1, "Archer"), Player(2, "Barclay")});
  Search("ar");
  const int quarter = Found().viewport()->width() / 4;
  for (int col = 0; col < 4; ++col) {
    EXPECT_NEAR(Found().columnWidth(col), quarter, 1) << col;
    EXPECT_EQ(Found().horizontalHeaderItem(col)->textAlignment(), int{Qt::AlignCenter}) << col;
    EXPECT_NE(Found().item(0, col)->textAlignment() & Qt::AlignLeft, 0) << col;
  }
  EXPECT_EQ(Found().horizontalHeader()->length(), Found().viewport()->width());
}

TEST_F(SeasonLooks, ANameThatNeedsMoreThanAQuarterHasIt) {
  club_.WritePlayers("Winter.qza", {Player(1, std::string(30, 'W')), Player(2, "Wood")});
  WindowOf(club_.Front())->resize(800, 600);
  Search("w");
  const int needed = Found().fontMetrics().horizontalAdvance(QString(30, 'W'));
  EXPECT_GT(needed, Found().viewport()->width() / 4);
  EXPECT_GT(Found().columnWidth(0), needed);
}

TEST_F(SeasonLooks, RatiosStandInColumnsOfTheirShares) {
  ShowRatiosOf("Archer");
  const QTableWidget& list = club_.Find<QTableWidget>("grdRatio");
  constexpr std::array<int, 6> kShares = {350, 1825, 1825, 550, 550, 900};
  constexpr int kAll = 6000;
  for (int col = 0; col < 6; ++col) {
    const int told = list.viewport()->width() * kShares.at(static_cast<std::size_t>(col)) / kAll;
    EXPECT_NEAR(list.columnWidth(col), told, 3) << col;
  }
  EXPECT_NE(list.item(0, 0)->textAlignment() & Qt::AlignRight, 0);
  EXPECT_NE(list.item(0, 1)->textAlignment() & Qt::AlignLeft, 0);
}

TEST_F(SeasonLooks, ALongNameAmongRatiosIsBrokenAndNothingHasToBeScrolledSideways) {
  ShowRatiosOf("Featherstonehaugh-Cholmondeley");
  club_.Do("shot {folder}/ratios.png 800 600");
  const QTableWidget& list = club_.Find<QTableWidget>("grdRatio");
  EXPECT_EQ(list.horizontalScrollBar()->maximum(), 0);
  EXPECT_GE(list.rowHeight(0), 2 * list.fontMetrics().height());
}

TEST_F(SeasonLooks, AShortListOfRatiosStandsRightBelowItsHeading) {
  ShowRatiosOf("Archer");
  const QLabel& title = club_.Find<QLabel>("lblHi_0");
  const QLabel& season = club_.Find<QLabel>("lblHi_1");
  const QTableWidget& list = club_.Find<QTableWidget>("grdRatio");
  EXPECT_LT(list.y() - title.y(), 3 * title.fontMetrics().height());
  EXPECT_LE(title.height(), 2 * title.fontMetrics().height());
  EXPECT_LE(season.height(), 2 * season.fontMetrics().height());
}

}  // namespace
}  // namespace marlowbeck
