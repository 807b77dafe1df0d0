#pragma once

#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "ui/controls.h"
#include "ui/hand.h"
#include "ui/screen.h"
#include "ui/screens.h"

namespace marlowbeck {

using Log = std::vector<std::string>;

/// Boxes that are answered OK, each noted.
class NotedBoxes : public Boxes {
 public:
  explicit NotedBoxes(Log& log) : log_(log) {}

 protected:
  int ShowMessage(const MessageBoxRequest& request) override {
    log_.push_back("box " + request.text);
    return kAnswerOk;
  }
  std::string ShowInput(const InputBoxRequest& request) override {
    log_.push_back("input " + request.prompt);
    return {};
  }

 private:
  Log& log_;
};

/// A screen with a control of each kind, in the order of its tab stops.
struct BenchScreen : Screen {
  BenchScreen(Screens& in, std::string_view name, Log& noted) : Screen(in, name, name), log(noted) {
    for (Control* control : Controls()) Note(*control);
  }

  TextBox txtA{*this, "txtA", "&Aggregate"};
  TextBox txtB{*this, "txtB", "&Shots"};
  ComboBox cboFree{*this, "cboFree", "Team", ComboBox::Typing::Free};
  ComboBox cboLocked{*this, "cboLocked", "Grade"};
  CheckBox chkA{*this, "chkA", "All"};
  Panel fraA{*this, "fraA", "Games"};
  OptionButton opt0{fraA, "opt(0)", "First"};
  OptionButton opt1{fraA, "opt(1)", "Second"};
  OptionButton opt2{fraA, "opt(2)", "Third"};
  Panel fraB{*this, "fraB"};
  OptionButton other{fraB, "other", "Other"};
  ListBox lstA{*this, "lstA", "Players"};
  Grid grdA{*this, "grdA"};
  DatePicker datA{*this, "datA", "Date"};
  Picture imgA{*this, "imgA", "Sheets"};
  Picture imgB{*this, "imgB", "Ladder"};
  Command cmdA{*this, "cmdA", "Sa&ve"};
  Command cmdB{*this, "cmdB", "&Cancel"};
  Label lblA{*this, "lblA", "R&B"};
  ProgressBar pbA{*this, "pbA"};
  MenuEntry mnuFile{*this, "mnuFile", "&File"};
  MenuEntry mnuNew{mnuFile, "mnuNew", "&New"};
  MenuEntry mnuOpen{mnuFile, "mnuOpen", "&Open"};
  MenuEntry mnuHelp{*this, "mnuHelp", "&Help"};

  void Load() override { log.push_back("load " + Name()); }
  void Activate() override { log.push_back("activate " + Name()); }
  void Unload() override { log.push_back("unload " + Name()); }
  void MouseMove() override { log.push_back("mouse " + Name()); }

  Log& log;

 private:
  void Note(Control& control) {
    const auto note = [this, name = control.Name()](const char* what) {
      return [this, entry = std::string(what) + " " + name] { log.push_back(entry); };
    };
    if (control.GetKind() != Kind::Label && control.GetKind() != Kind::Panel &&
        control.GetKind() != Kind::Progress) {
      control.Click = note("click");
    }
    control.DoubleClick = note("dblclick");
    control.Change = note("change");
    control.GotFocus = note("got");
    control.LostFocus = note("lost");
    control.MouseMove = note("hover");
    control.KeyUp = note("keyup");
  }
};

/// Two screens, the hand that works them and all that happens.
class Workbench {
 public:
  Workbench() {
    for (const char* name : {"frmA", "frmB"}) {
      screens.Register(
          name, [this, name](Screens& in) { return std::make_unique<BenchScreen>(in, name, log); });
    }
    Show("frmA");
  }

  BenchScreen& Show(const char* name) {
    Screen* screen = nullptr;
    screens.GetDispatcher().Run([&] { screen = screens.Show(name); });
    screens.Settle();
    log.clear();
    return static_cast<BenchScreen&>(*screen);
  }
  BenchScreen& A() { return static_cast<BenchScreen&>(*screens.Find("frmA")); }
  BenchScreen& B() { return static_cast<BenchScreen&>(*screens.Find("frmB")); }

  /// What has happened since the last look.
  Log Happened() { return std::exchange(log, {}); }
  [[nodiscard]] std::string Focus() const {
    const Control* const control = screens.Focus();
    return control == nullptr ? "none" : control->Name();
  }
  void Box(const std::string& text) { boxes.Message({text, "", BoxStyle::WarningOk}); }

  Log log;
  NotedBoxes boxes{log};
  Screens screens{[this](int number) {
    log.push_back("error " + std::to_string(number));
    Box("error");
  }};
  Hand hand{screens, boxes};
};

}  // namespace marlowbeck
