// How found players and peg ratios stand in their tables.

#include <QHeaderView>
#include <QLabel>
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

TEST_F(SeasonLooks, AShortListOfRatiosStandsRightBelowItsHeading) {
  club_.WritePlayers("Winter.qza", {Player(1, "Archer")});
  ResultRecord result;
  result.ID = 1;
  result.Legs = 3;
  result.Pegs = {40, 0, 0, 0, 0, 0};
  club_.WriteResults("Winter_A Grade.qzr", {result});
  club_.DoAll({"click imgPrinter", "click Image8", "pick cboResGrade 0"});
  const QLabel& title = club_.Find<QLabel>("lblHi_0");
  const QLabel& season = club_.Find<QLabel>("lblHi_1");
  const QTableWidget& list = club_.Find<QTableWidget>("grdRatio");
  EXPECT_LT(list.y() - title.y(), 3 * title.fontMetrics().height());
  EXPECT_LE(title.height(), 2 * title.fontMetrics().height());
  EXPECT_LE(season.height(), 2 * season.fontMetrics().height());
}

}  // namespace
}  // namespace marlowbeck
