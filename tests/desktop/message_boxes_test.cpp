// Boxes as they stand on the screen.

#include "desktop/message_boxes.h"

#include <QApplication>
#include <QKeyEvent>
#include <QTimer>
#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

constexpr std::array<BoxStyle, 7> kStyles = {
    BoxStyle::StopOk,          BoxStyle::StopOkCancel,  BoxStyle::StopYesNo,
    BoxStyle::WarningOk,       BoxStyle::InformationOk, BoxStyle::InformationYesNoCancel,
    BoxStyle::InformationYesNo};

class RealBoxes : public testing::Test {
 protected:
  /// Shows a box and presses a key on whatever has the focus in it.
  int Press(BoxStyle style, int key) {
    QTimer::singleShot(0, qApp, [&] {
      auto* const box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      ASSERT_NE(box, nullptr);
      seen_text_ = box->text();
      QWidget* const focus = box->focusWidget();
      QKeyEvent press(QEvent::KeyPress, key, Qt::NoModifier);
      QApplication::sendEvent(focus != nullptr ? focus : box, &press);
    });
    return boxes_.Message({"Delete it?    ", "Marlowbeck Message", style});
  }

  QString seen_text_;
  int refreshed_ = 0;
  MessageBoxes boxes_{[this] { ++refreshed_; }, [](int) {}};
};

TEST_F(RealBoxes, LookLikeTheirStyle) {
  for (const BoxStyle style : kStyles) {
    QMessageBox box;
    DressBox(box, style);
    EXPECT_EQ(StyleOf(box), style);
  }
}

TEST_F(RealBoxes, EnterIsSafeWhereSomethingIsDeleted) {
  EXPECT_EQ(Press(BoxStyle::StopOkCancel, Qt::Key_Return), kAnswerCancel);
  EXPECT_EQ(Press(BoxStyle::StopYesNo, Qt::Key_Return), kAnswerNo);
}

TEST_F(RealBoxes, EnterGoesOnElsewhere) {
  EXPECT_EQ(Press(BoxStyle::WarningOk, Qt::Key_Return), kAnswerOk);
  EXPECT_EQ(Press(BoxStyle::InformationYesNo, Qt::Key_Return), kAnswerYes);
}

TEST_F(RealBoxes, EscAnswersCancelElseNoElseOk) {
  EXPECT_EQ(Press(BoxStyle::InformationYesNoCancel, Qt::Key_Escape), kAnswerCancel);
  EXPECT_EQ(Press(BoxStyle::StopOkCancel, Qt::Key_Escape), kAnswerCancel);
  EXPECT_EQ(Press(BoxStyle::StopYesNo, Qt::Key_Escape), kAnswerNo);
  EXPECT_EQ(Press(BoxStyle::InformationYesNo, Qt::Key_Escape), kAnswerNo);
  EXPECT_EQ(Press(BoxStyle::InformationOk, Qt::Key_Escape), kAnswerOk);
}

TEST_F(RealBoxes, KeepTheBlanksBehindAText) {
  Press(BoxStyle::WarningOk, Qt::Key_Return);
  EXPECT_EQ(seen_text_, QString("Delete it?    "));
}

TEST_F(RealBoxes, ComeUpOverWindowsThatAreUpToDate) {
  Press(BoxStyle::WarningOk, Qt::Key_Return);
  EXPECT_EQ(refreshed_, 1);
}

TEST_F(RealBoxes, AnInputBoxThatIsCancelledAnswersNothing) {
  QTimer::singleShot(0, qApp, [] {
    auto* const box = dynamic_cast<InputDialog*>(QApplication::activeModalWidget());
    ASSERT_NE(box, nullptr);
    EXPECT_EQ(box->Entry().text(), QString("Rovers"));
    box->CancelButton().click();
  });
  EXPECT_EQ(boxes_.Input({"Enter a name.", "Name", "Rovers", std::nullopt}), "");
}

TEST_F(RealBoxes, AnInputBoxHasHelpWhereThereIsATopic) {
  int opened = 0;
  const InputDialog with({"?", "?", "", 215}, nullptr, [&](int topic) { opened = topic; });
  const InputDialog without({"?", "?", "", std::nullopt}, nullptr, [](int) {});
  EXPECT_EQ(with.HelpTopic(), 215);
  EXPECT_EQ(without.HelpTopic(), std::nullopt);
  for (QPushButton* button : with.findChildren<QPushButton*>()) {
    if (button->text() == "Help") button->click();
  }
  EXPECT_EQ(opened, 215);
}

}  // namespace
}  // namespace marlowbeck
