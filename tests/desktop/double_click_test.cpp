// What a person's double click does, press by press: one click, and then the double click.

#include <QCheckBox>
#include <QLineEdit>
#include <QListWidget>
#include <QPointer>
#include <QPushButton>

#include "desktop/scripted/gestures.h"
#include "tests/desktop/window_club.h"

namespace marlowbeck {
namespace {

class DoubleClicks : public testing::Test {
 protected:
  void Twice(QWidget& widget, QPoint at) {
    const QPointer<QWidget> still_there(&widget);
    ClickMouse(widget, at);
    if (still_there) ClickMouseAgain(widget, at);
    SettleEvents();
    club_.Do("events");
  }
  void Twice(const char* name) {
    QWidget& widget = club_.Find(name);
    Twice(widget, widget.rect().center());
  }
  void OpenASheet() {
    club_.DoAll({"click imgSheets", "date Cal 2004-04-07", "click cmdGotoResults",
                 "pick cboResTeam =Bluebells", "pick lstResPlayers 0"});
  }

  WindowClub club_;
};

TEST_F(DoubleClicks, OnACheckBoxTickItOnce) {
  OpenASheet();
  Twice("chkFF");
  EXPECT_TRUE(club_.Ticked("chkFF"));
  EXPECT_TRUE(club_.Find<QCheckBox>("chkFF").isChecked());
}

TEST_F(DoubleClicks, OnSaveSaveOnce) {
  OpenASheet();
  club_.DoAll({"type txtAgg 900", "type txtShots 45"});
  Twice("cmdSave");  // the legs are missing, which is told in a box
  EXPECT_EQ(club_.BoxTexts().size(), 1U);
}

TEST_F(DoubleClicks, ActOnNothingThatComesUpUnderThePointer) {
  club_.Do("click imgPlayers");
  QWidget& list = *club_.Find<QListWidget>("lstPlayers").viewport();
  ClickMouse(list, {60, 10});
  // The question has come up over the list: the second press is meant for the list.
  QWidget& edit = club_.Find("cmdCancelDel");
  ClickMouseAgain(edit, edit.rect().center());
  SettleEvents();
  EXPECT_TRUE(club_.Shown("fraNamesMenu"));
  EXPECT_EQ(club_.Do("events")["events"].size(), 0U);
}

TEST_F(DoubleClicks, AreLostWithTheFirstClick) {
  OpenASheet();
  club_.Do("type txtP1 171");
  Twice("chkFF");  // leaving the box tells that the peg is too high
  EXPECT_FALSE(club_.Ticked("chkFF"));
  EXPECT_EQ(club_.BoxTexts().size(), 1U);
  EXPECT_EQ(club_.Focus(), "frmResults.txtP1");
}

TEST_F(DoubleClicks, MarkAWordInAnEntry) {
  club_.DoAll({"click imgPlayers", "type txtAddSn van Dyke", "type txtAddFn Jo"});
  auto& entry = club_.Find<QLineEdit>("txtAddSn");
  const int start = entry.fontMetrics().horizontalAdvance("van D");
  Twice(entry, {start + 4, entry.height() / 2});
  EXPECT_EQ(entry.selectedText(), QString("Dyke"));
  EXPECT_EQ(club_.Text("txtAddSn"), "van Dyke");
}

TEST_F(DoubleClicks, AreFollowedByAClickThatCounts) {
  OpenASheet();
  Twice("chkFF");
  QWidget& box = club_.Find("chkFF");
  ClickMouse(box, box.rect().center());
  EXPECT_FALSE(club_.Ticked("chkFF"));
}

}  // namespace
}  // namespace marlowbeck
