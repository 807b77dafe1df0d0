// Every form against its screen: names, kinds, owners, order, labels.

#include <QAbstractButton>
#include <QAction>
#include <QLabel>
#include <QLayout>
#include <QRegularExpression>
#include <gtest/gtest.h>

#include "data/real_file_system.h"
#include "desktop/form_catalogue.h"
#include "desktop/windows.h"
#include "program/register_screens.h"
#include "tests/desktop/still_world.h"

namespace marlowbeck {
namespace {

class FormLint : public testing::Test {
 protected:
  /// Every screen with controls, with its window.
  void ForEachWindow(const std::function<void(const Screen&, ScreenWindow&)>& look) {
    Windows windows(screens_, hand_, nullptr);
    int looked_at = 0;
    for (const std::string& name : screens_.Names()) {
      const std::shared_ptr<Screen> screen = screens_.Make(name);
      if (screen->Controls().empty()) continue;
      SCOPED_TRACE(screen->Name());
      ScreenWindow window(screen, windows);
      look(*screen, window);
      ++looked_at;
    }
    EXPECT_GT(looked_at, 4);
  }

 private:
  StillWorld world_;
  Session session_;
  RealFileSystem files_;
  Channels channels_{files_};
  std::string folder_ = ".";
  Context context_{session_, channels_, world_.platform, folder_};
  Screens screens_{[](int) {}};
  Hand hand_{screens_, world_};

 public:
  FormLint() { RegisterScreens(screens_, context_); }
};

bool LooksLikeAControl(const QObject& object) {
  static const QRegularExpression kControl(
      "^(cmd|lbl|txt|lst|cbo|fra|pan|opt|chk|pic|grd|img|mnu|cfg|Label)[A-Za-z0-9_]*$");
  return kControl.match(object.objectName()).hasMatch();
}

std::set<QString> ObjectNames(const Screen& screen) {
  std::set<QString> names;
  for (const Control* control : screen.Controls()) names.insert(ObjectNameOf(*control));
  return names;
}

TEST_F(FormLint, EveryControlHasAWidgetOfItsKind) {
  // A window is not made where one is missing.
  EXPECT_NO_THROW(ForEachWindow([](const Screen& screen, const ScreenWindow& window) {
    EXPECT_EQ(screen.Controls().size(), window.Views().size());
  }));
}

TEST_F(FormLint, EveryWidgetNamedLikeAControlIsOne) {
  ForEachWindow([](const Screen& screen, const ScreenWindow& window) {
    const auto names = ObjectNames(screen);
    for (const QObject* object : window.Window().findChildren<QObject*>()) {
      if (!object->isWidgetType() && qobject_cast<const QAction*>(object) == nullptr) continue;
      if (!LooksLikeAControl(*object)) continue;
      EXPECT_TRUE(names.contains(object->objectName())) << object->objectName().toStdString();
    }
  });
}

TEST_F(FormLint, EveryControlLiesInTheWidgetOfItsOwner) {
  ForEachWindow([](const Screen& screen, const ScreenWindow& window) {
    for (const Control* control : screen.Controls()) {
      const QWidget* const widget = window.ViewOf(*control)->Widget();
      if (widget == nullptr) continue;
      const QWidget* const holder = control->InControl() == nullptr
                                        ? &window.Window()
                                        : window.ViewOf(*control->InControl())->Widget();
      EXPECT_TRUE(holder->isAncestorOf(widget)) << control->Name();
      // Nothing between them may hide one without the other.
      const View* const between = window.ViewAt(widget->parent());
      EXPECT_EQ(between == nullptr ? nullptr : &between->GetControl(), control->InControl())
          << control->Name();
    }
  });
}

TEST_F(FormLint, TheTabOrderIsTheOrderOfDeclaration) {
  ForEachWindow([](const Screen& screen, const ScreenWindow& window) {
    std::vector<std::string> declared;
    for (const Control* control : screen.Controls()) {
      if (control->TakesFocus()) declared.push_back(control->Name());
    }
    if (declared.empty()) return;
    const QWidget* const first = window.ViewOf(*screen.Find(declared.front()))->Widget();
    std::vector<std::string> walked{declared.front()};
    for (const QWidget* at = first->nextInFocusChain(); at != first; at = at->nextInFocusChain()) {
      const View* const view = window.ViewAt(at);
      const bool counts =
          view != nullptr && view->Widget() == at && view->GetControl().TakesFocus();
      if (counts) walked.push_back(view->GetControl().Name());
    }
    EXPECT_EQ(walked, declared);
  });
}

TEST_F(FormLint, ACaptionBesideAnEntryBelongsToIt) {
  ForEachWindow([](const Screen& screen, const ScreenWindow& window) {
    for (const Control* control : screen.Controls()) {
      const bool is_entry = control->GetKind() == Kind::Text || control->GetKind() == Kind::Combo ||
                            control->GetKind() == Kind::Date;
      if (!is_entry || control->Caption().empty()) continue;
      const auto* const label =
          window.Window().findChild<QLabel*>("buddy_" + ObjectNameOf(*control));
      ASSERT_NE(label, nullptr) << control->Name();
      EXPECT_EQ(label->buddy(), window.ViewOf(*control)->Widget()) << control->Name();
    }
    const auto names = ObjectNames(screen);
    for (const QLabel* label : window.Window().findChildren<QLabel*>()) {
      if (!label->objectName().startsWith("buddy_")) continue;
      EXPECT_TRUE(names.contains(label->objectName().mid(6))) << label->objectName().toStdString();
    }
  });
}

TEST_F(FormLint, EveryEntryAndListHasANameToBeReadAloud) {
  ForEachWindow([](const Screen& screen, const ScreenWindow& window) {
    for (const Control* control : screen.Controls()) {
      // Some buttons get their caption, by which they are called, later.
      if (!control->TakesFocus()) continue;
      const QWidget& widget = *window.ViewOf(*control)->Widget();
      if (qobject_cast<const QAbstractButton*>(&widget) != nullptr) continue;
      EXPECT_FALSE(widget.accessibleName().isEmpty()) << control->Name();
    }
  });
}

TEST_F(FormLint, EveryFormHasAScreen) {
  std::set<std::string> screens;
  ForEachWindow([&](const Screen& screen, const ScreenWindow&) { screens.insert(screen.Name()); });
  for (const auto& [name, maker] : Forms()) EXPECT_TRUE(screens.contains(name)) << name;
}

}  // namespace
}  // namespace marlowbeck
