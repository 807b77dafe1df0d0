#include "drive/workbench_forms.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDateEdit>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMainWindow>
#include <QMenuBar>
#include <QProgressBar>
#include <QPushButton>
#include <QRadioButton>
#include <QTableWidget>

#include "desktop/form_catalogue.h"
#include "desktop/picture_button.h"

namespace marlowbeck {
namespace {

template <typename Widget>
Widget* Named(const char* name, QWidget* parent) {
  auto* const widget = new Widget(parent);
  widget->setObjectName(name);
  return widget;
}

/// Puts widgets of one class, by their names, into a column of their own.
template <typename Widget>
void AddColumn(QGridLayout& grid, std::initializer_list<const char*> names) {
  auto* const column = new QVBoxLayout;
  for (const char* name : names) column->addWidget(Named<Widget>(name, grid.parentWidget()));
  grid.addLayout(column, grid.count() / 3, grid.count() % 3);
}

void AddMenus(QMainWindow& window) {
  auto* const file = Named<QMenu>("mnuFile", window.menuBar());
  auto* const open = new QAction(&window);
  open->setObjectName("mnuOpen");
  file->addAction(open);
  window.menuBar()->addMenu(file);
}

void AddPanels(QWidget& centre) {
  auto* const options = new QHBoxLayout(centre.findChild<QGroupBox*>("fraPlain"));
  for (const char* name : {"optBoth_0", "optBoth_1"}) {
    options->addWidget(Named<QRadioButton>(name, options->parentWidget()));
  }
  centre.findChild<QGroupBox*>("fraClick")->setMinimumHeight(48);
  centre.findChild<QLabel*>("lblTold")->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
}

std::unique_ptr<QWidget> MakeWorkbench() {
  auto window = std::make_unique<QMainWindow>();
  window->resize(780, 560);
  auto* const centre = new QWidget(window.get());
  window->setCentralWidget(centre);
  auto& grid = *new QGridLayout(centre);
  AddColumn<QLineEdit>(grid, {"txtName", "txtLocked"});
  AddColumn<QPushButton>(grid, {"cmdDo", "cmdOff", "cmdHelp", "cmdEnd"});
  AddColumn<QGroupBox>(grid, {"fraClick", "fraPlain"});
  AddColumn<QLabel>(grid, {"lblPlain", "lblClick", "lblChange", "lblTold"});
  AddColumn<QListWidget>(grid, {"lstOne", "lstMany"});
  AddColumn<QListWidget>(grid, {"drvDrives", "dirFolders", "filFiles"});
  AddColumn<QComboBox>(grid, {"cboLocked", "cboFree"});
  AddColumn<QTableWidget>(grid, {"grdTable"});
  AddColumn<QDateEdit>(grid, {"dtpDay"});
  AddColumn<QCheckBox>(grid, {"chkTick"});
  AddColumn<PictureButton>(grid, {"imgShape"});
  AddColumn<QProgressBar>(grid, {"prgBar"});
  AddPanels(*centre);
  AddMenus(*window);
  return window;
}

std::unique_ptr<QWidget> MakeShelf() {
  auto window = std::make_unique<QWidget>();
  window->resize(300, 100);
  auto& grid = *new QGridLayout(window.get());
  AddColumn<QPushButton>(grid, {"cmdTake"});
  return window;
}

}  // namespace

void AddWorkbenchForms() {
  AddForm("frmBench", MakeWorkbench);
  AddForm("frmShelf", MakeShelf);
}

}  // namespace marlowbeck
