#pragma once

#include <functional>
#include <string>

#include "support/club.h"
#include "ui/controls.h"
#include "ui/disk_lists.h"

namespace marlowbeck {

/// A screen with every kind of control, to try the script's words on. Its disk is the working
/// folder.
struct Workbench : Screen {
  Workbench(Screens& screens, const Context& in);

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
  Label lblChange{*this, "lblChange", "change"};  ///< a click on it does what a test wants changed
  Label lblTold{*this, "lblTold"};                ///< what the handlers were told
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
  DriveList drvDrives{*this, "drvDrives", Disk()};
  FolderList dirFolders{*this, "dirFolders", Disk()};
  FileList filFiles{*this, "filFiles", Disk()};

  [[nodiscard]] FileSystem& Disk() const { return context.channels.Files(); }

  void Tell(const std::string& what) { lblTold.SetCaption(lblTold.Caption() + what + ";"); }
  void Box(const std::string& text) {
    context.platform.boxes.Message({text, "Title", BoxStyle::WarningOk});
  }
};

/// A second screen behind the workbench.
struct Shelf : Screen {
  explicit Shelf(Screens& screens) : Screen(screens, "frmShelf", "Shelf") {}
  Command cmdTake{*this, "cmdTake", "Take"};
};

using BenchWork = std::function<void(Workbench&)>;

/// A program that opens on the workbench and has a shelf behind it. `prepare` is called at the
/// making of each workbench.
Program::Registration WithWorkbench(BenchWork prepare);

/// The workbench worked by lines of a script, in every face of the executable.
class WorkbenchTest : public ClubTest {
 protected:
  WorkbenchTest();

  /// What a click on cmdDo does from now on.
  void OnDo(BenchWork work);
  /// Changes something on the workbench, as an event of its own that moves no focus.
  void Change(const BenchWork& change, Here here = Here::current());
  /// Carries out a line and answers what the handlers were told by it.
  std::string ToldBy(std::string_view line, Here here = Here::current());

  BenchWork prepare;  ///< run at the making of the workbench

 private:
  void SetUpBench(Workbench& bench);

  BenchWork do_;
  BenchWork change_;
};

}  // namespace marlowbeck
