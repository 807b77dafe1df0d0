#pragma once

#include <functional>
#include <memory>

#include "support/club.h"
#include "ui/controls.h"

namespace marlowbeck {

/// A screen with every kind of control, to try the script's words on. It stands in the place of the
/// main menu.
struct Workbench : Screen {
  Workbench(Screens& screens, const Context& in)
      : Screen(screens, "frmDB", "Workbench"), context(in) {
    for (const char* line : {"first", "second", "third"}) {
      for (LineHolder* list : std::initializer_list<LineHolder*>{
               &lstOne, &lstMany, &cboLocked, &cboFree, &drvDrives, &dirFolders, &filFiles}) {
        list->AddLine(line);
      }
    }
    lstMany.SetMulti(true);
    filFiles.SetMulti(true);
    dirFolders.SetPath("/club/data");
    filFiles.SetPath("/club/data");
    grdTable.SetSize(2, 3);
    grdTable.SetCell(0, 0, "Name");
    grdTable.SetCell(1, 2, "17.89");
    txtLocked.SetText("as it is");
    txtLocked.SetLocked(true);
    dtpDay.SetValue(*DateFromCivil({2004, 3, 31}));
    prgBar.SetRange(0, 40);
    prgBar.SetValue(10);
    Helps = {&cmdHelp};
    Cancels = {&cmdEnd};
  }

  const Context& context;

  TextBox txtName{*this, "txtName", "Name"};
  TextBox txtLocked{*this, "txtLocked", "Locked"};
  Command cmdDo{*this, "cmdDo", "&Do it"};
  Command cmdOff{*this, "cmdOff", "Off"};
  Command cmdHelp{*this, "cmdHelp", "Help"};
  Command cmdEnd{*this, "cmdEnd", "End"};
  Panel fraClick{*this, "fraClick", "A panel with a click"};
  Panel fraPlain{*this, "fraPlain", "A panel"};
  OptionButton optBoth0{fraPlain, "optBoth(0)", "One"};
  OptionButton optBoth1{fraPlain, "optBoth(1)", "Both"};
  CheckBox chkTick{*this, "chkTick", "Tick"};
  Label lblPlain{*this, "lblPlain", "plain"};
  Label lblClick{*this, "lblClick", "click me"};
  Picture imgShape{*this, "imgShape", "Shape"};
  MenuEntry mnuFile{*this, "mnuFile", "&File"};
  MenuEntry mnuOpen{mnuFile, "mnuOpen", "&Open"};
  ListBox lstOne{*this, "lstOne", "One"};
  ListBox lstMany{*this, "lstMany", "Many"};
  ComboBox cboLocked{*this, "cboLocked", "Locked"};
  ComboBox cboFree{*this, "cboFree", "Free", ComboBox::Typing::Free};
  Grid grdTable{*this, "grdTable", "Table"};
  DatePicker dtpDay{*this, "dtpDay", "Day"};
  ProgressBar prgBar{*this, "prgBar"};
  DiskList drvDrives{*this, Kind::Drives, "drvDrives"};
  DiskList dirFolders{*this, Kind::Folders, "dirFolders"};
  DiskList filFiles{*this, Kind::Files, "filFiles"};
};

/// A second screen behind the workbench.
struct Shelf : Screen {
  explicit Shelf(Screens& screens) : Screen(screens, "frmShelf", "Shelf") {}
  Command cmdTake{*this, "cmdTake", "Take"};
};

/// The workbench worked by lines of a script. Works models.
class WorkbenchTest : public ::testing::Test, protected Club {
 protected:
  WorkbenchTest() : Club(ModelFaceAlone()) {
    registration = [this](Screens& screens, const Context& context) {
      screens.Register("frmDB", [&](Screens& in) {
        auto made = std::make_unique<Workbench>(in, context);
        bench = made.get();
        if (prepare) prepare(*made);
        return made;
      });
      screens.Register("frmShelf", [](Screens& in) { return std::make_unique<Shelf>(in); });
      screens.Register("frmErrors", MakeErrors(context));
    };
  }

  /// Lets a click on cmdDo do something with what the program works with.
  void OnDo(std::function<void(const Context&)> work) {
    Start();
    bench->cmdDo.Click = [this, work] { work(bench->context); };
  }

  Workbench* bench = nullptr;               ///< once the program runs
  std::function<void(Workbench&)> prepare;  ///< run at the making of the workbench

 private:
  static Screens::Factory MakeErrors(const Context& context);
};

}  // namespace marlowbeck
