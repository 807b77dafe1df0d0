#include <stdexcept>

#include <QCheckBox>
#include <QMenu>
#include <QPushButton>
#include <QRadioButton>

#include "desktop/caption_views.h"
#include "desktop/entry_views.h"
#include "desktop/grid_view.h"
#include "desktop/list_view.h"

namespace marlowbeck {
namespace {

/// The object of a control's name and of the class that its kind is shown by.
template <typename Shown>
Shown* Partner(const Control& control, QWidget& window) {
  auto* const partner = window.findChild<Shown*>(ObjectNameOf(control));
  if (partner == nullptr) {
    throw std::logic_error("the form of " + control.InScreen().Name() + " has no " +
                           Shown::staticMetaObject.className() + " " +
                           ObjectNameOf(control).toStdString());
  }
  return partner;
}

template <typename Made, typename Model, typename Shown>
std::unique_ptr<View> Pair(Control& control, QWidget& window, Windows& windows) {
  return std::make_unique<Made>(static_cast<Model&>(control), Partner<Shown>(control, window),
                                windows);
}

QAction* ActionOf(const Control& control, QWidget& window) {
  auto* const menu = window.findChild<QMenu*>(ObjectNameOf(control));
  return menu != nullptr ? menu->menuAction() : Partner<QAction>(control, window);
}

}  // namespace

std::unique_ptr<View> MakeView(Control& control, QWidget& window, Windows& windows) {
  switch (control.GetKind()) {
    case Kind::Panel:
      return Pair<PanelView, Control, QWidget>(control, window, windows);
    case Kind::Label:
      return Pair<LabelView, Control, QLabel>(control, window, windows);
    case Kind::Command:
      return Pair<ButtonView, Control, QPushButton>(control, window, windows);
    case Kind::Picture:
      return Pair<ButtonView, Control, PictureButton>(control, window, windows);
    case Kind::Check:
      return Pair<ButtonView, Control, QCheckBox>(control, window, windows);
    case Kind::Option:
      return Pair<ButtonView, Control, QRadioButton>(control, window, windows);
    case Kind::Menu:
      return std::make_unique<MenuView>(control, ActionOf(control, window), windows);
    case Kind::Text:
      return Pair<TextView, TextBox, QLineEdit>(control, window, windows);
    case Kind::Combo:
      return Pair<ComboView, ComboBox, QComboBox>(control, window, windows);
    case Kind::Date:
      return Pair<DateView, DatePicker, QDateEdit>(control, window, windows);
    case Kind::Grid:
      return Pair<GridView, Grid, QTableWidget>(control, window, windows);
    case Kind::Progress:
      return Pair<ProgressView, ProgressBar, QProgressBar>(control, window, windows);
    case Kind::List:
    case Kind::Drives:
    case Kind::Folders:
    case Kind::Files:
      return Pair<ListView, ListBox, QListWidget>(control, window, windows);
  }
  throw std::logic_error(control.Name() + " is of no kind");
}

}  // namespace marlowbeck
