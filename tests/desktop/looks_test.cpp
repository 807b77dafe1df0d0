// What the looks of a control tell of what it does.

#include <QApplication>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QScrollBar>
#include <QTableWidget>

#include "support/record_files.h"
#include "tests/desktop/window_club.h"

namespace marlowbeck {
namespace {

class Looks : public testing::Test {
 protected:
  bool IsDefault(const char* command) { return club_.Find<QPushButton>(command).isDefault(); }
  /// The right end of a combo is plain ground: there is nothing to drop down.
  bool HasNoArrow(const char* combo) {
    constexpr int kFrame = 4;
    constexpr int kArrow = 20;
    const QImage picture = club_.Find<QComboBox>(combo).grab().toImage();
    const QRgb ground = QApplication::palette().color(QPalette::Window).rgb();
    for (int x = picture.width() - kArrow; x < picture.width() - kFrame; ++x) {
      for (int y = kFrame; y < picture.height() - kFrame; ++y) {
        if (picture.pixel(x, y) != ground) return false;
      }
    }
    return true;
  }

  /// Gives two teams the longest names that there are.
  void LengthenNames() {
    club_.DoAll({"click imgPlayers", "pick cboAddTm =Drovers",
                 "input The Wandering Woolwich Wombats", "click cmdEdTeamName",
                 "pick cboAddTm =Engineers", "input MMMMMMMMMM WWWWWWWWWW MMMMMMMM",
                 "click cmdEdTeamName", "click cmdAddCancel", "click imgPrinter", "click Image6",
                 "pick cboResTeam =The Wandering Woolwich Wombats"});
  }
  bool ShowsAll(const char* box) {
    const QLineEdit& edit = club_.Find<QLineEdit>(box);
    return edit.fontMetrics().horizontalAdvance(edit.text()) < edit.width() - 8;
  }

  WindowClub club_;
};

TEST_F(Looks, TheLongestNamesCanBeReadWhereFiguresAreCorrected) {
  LengthenNames();
  club_.Do("dblcell grdWeek 1 0");
  for (const char* box : {"txtPlayer", "txtTeam", "txtOpp", "txtGrade", "txtDate"}) {
    EXPECT_TRUE(ShowsAll(box)) << box;
    EXPECT_EQ(club_.Find<QLineEdit>(box).cursorPosition(), 0) << box;
  }
  EXPECT_LE(WindowOf("frmEdScore")->width(), 800);
  EXPECT_LE(WindowOf("frmEdScore")->height(), 600);
}

TEST_F(Looks, ALadderOfLongNamesShowsAllItsColumnsInTheSmallestWindow) {
  std::vector<PlayerRecord> players;
  for (int id = 1; id <= 14; ++id) {
    const std::string team = "The Wandering Woolwich Team " + std::to_string(id);
    players.push_back(Player(id, "Archer", "Jo", team, "A Grade"));
  }
  club_.WritePlayers("Winter.qza", players);
  std::vector<LadderRecord> matches(40);
  for (std::size_t i = 0; i < matches.size(); ++i) {
    matches[i].GameDate = Date{38028.0 + 7.0 * static_cast<double>(i)};
  }
  club_.WriteFile("Winter_A Grade.qzl", FileOf(matches));
  club_.DoAll({"click imgLadder", "click cmdGotoResults", "click cmdPL",
               "shot {folder}/ladder.png 800 600"});
  const QTableWidget& table = club_.Find<QTableWidget>("grdLad");
  EXPECT_GT(table.verticalScrollBar()->maximum(), 0) << "as wide as it can get";
  EXPECT_EQ(table.horizontalScrollBar()->maximum(), 0);
  const QListWidget& dates = club_.Find<QListWidget>("lstTableDates");
  EXPECT_GT(dates.verticalScrollBar()->maximum(), 0);
  EXPECT_EQ(dates.horizontalScrollBar()->maximum(), 0);
}

TEST_F(Looks, APictureIsTakenOnceWordsThatHaveGrownHaveTheirRoom) {
  club_.DoAll({"click imgLadder", "click cmdGotoResults", "click cmdPL", "click cmdPenalty",
               "pick lstPenalty 0", "type txtPenPts -2", "click cmdPenOK", "click cmdPenalty",
               "pick lstPenalty 0", "shot {folder}/points.png"});
  const QLabel& words = club_.Find<QLabel>("lblPen1");
  ASSERT_TRUE(words.text().contains("ZERO")) << "the team has points to be erased";
  EXPECT_GE(words.height(), words.sizeHint().height());
  EXPECT_GE(words.width(), words.sizeHint().width());
}

TEST_F(Looks, TheLongestNamesBreakWhereADateIsChanged) {
  LengthenNames();
  club_.Do("click cmdChangeDate");
  EXPECT_LE(WindowOf("frmChangeDate")->width(), 800);
  const QLabel& match = club_.Find<QLabel>("lblTeamS");
  EXPECT_GT(match.height(), 2 * match.fontMetrics().height() - 4) << "two lines";
  EXPECT_GE(match.height(), match.heightForWidth(match.width()));
}

TEST_F(Looks, ALongSurnameInAKnockOutTakesItsRoomFromTheGradesBesideIt) {
  club_.WritePlayers("Winter.qza", {Player(1, "Featherstonehaugh", "Bo", "Rovers", "A Grade"),
                                    Player(2, "Archer", "Jo", "Kings", "A Grade")});
  club_.DoAll({"click imgKO", "click cmdOK", "shot {folder}/knock-out.png 800 600"});
  const QTableWidget& table = club_.Find<QTableWidget>("grdKO");
  EXPECT_NEAR(table.columnWidth(1), table.columnWidth(2), 1) << "as told while there is room";
  club_.Do("click cmdALL");
  constexpr int kMargins = 6;  // of a cell, in which no letter stands
  const auto needed = [&](const char* word) {
    return table.fontMetrics().horizontalAdvance(word) + kMargins;
  };
  EXPECT_GE(table.columnWidth(1), needed("Featherstonehaugh,"));
  EXPECT_GE(table.columnWidth(2), needed("A Grade"));
  EXPECT_EQ(table.horizontalScrollBar()->maximum(), 0);
}

TEST_F(Looks, TheCommandThatEnterGoesToLooksLikeIt) {
  club_.DoAll({"click imgPrinter", "click Image6", "click cmdChangeDate"});
  ASSERT_EQ(club_.Focus(), "frmChangeDate.cmdCancel");
  EXPECT_FALSE(IsDefault("cmdOK")) << "Enter cancels";
  club_.Do("focus NewCal");
  EXPECT_TRUE(IsDefault("cmdOK"));
  club_.Do("focus cmdOK");
  EXPECT_TRUE(IsDefault("cmdOK"));
}

TEST_F(Looks, ACommandOfAPanelThatIsAwayIsNotTheOneThatEnterGoesTo) {
  club_.DoAll({"click imgPlayers", "type txtAddSn Archer", "type txtAddFn Jo"});
  EXPECT_TRUE(IsDefault("cmdAddSave"));
  club_.Do("click cmdEdBOT");
  EXPECT_TRUE(IsDefault("cmdNoPOK"));
  EXPECT_FALSE(IsDefault("cmdAddSave"));
}

TEST_F(Looks, AComboThatIsHeldHasNothingToDropDown) {
  club_.Do("click imgPlayers");
  EXPECT_FALSE(HasNoArrow("cboAddTm"));
  club_.DoAll({"pick lstPlayers 0", "click cmdEdName"});
  for (const char* combo : {"cboAddTm", "cboAddGrd"}) EXPECT_TRUE(HasNoArrow(combo)) << combo;
  club_.Do("click cmdClear");
  EXPECT_FALSE(HasNoArrow("cboAddTm"));
}

}  // namespace
}  // namespace marlowbeck
