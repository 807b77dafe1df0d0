// What the looks of a control tell of what it does.

#include <QApplication>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

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

TEST_F(Looks, TheLongestNamesBreakWhereADateIsChanged) {
  LengthenNames();
  club_.Do("click cmdChangeDate");
  EXPECT_LE(WindowOf("frmChangeDate")->width(), 800);
  const QLabel& match = club_.Find<QLabel>("lblTeamS");
  EXPECT_GT(match.height(), 2 * match.fontMetrics().height() - 4) << "two lines";
  EXPECT_GE(match.height(), match.heightForWidth(match.width()));
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
