#pragma once

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The reminder to copy the data, whenever the user leaves the program.
struct frmBuend : Screen {
  frmBuend(Screens& screens, const Context& context);

  Label Label1{*this, "Label1", "Marlowbeck Backup Options"};
  Label Label2{*this, "Label2"};
  Panel Frame1{*this, "Frame1"};
  OptionButton optBU0{Frame1, "optBU(0)", "Copy your data to another Disk."};
  OptionButton optBU1{Frame1, "optBU(1)", "No Backup required for this session."};
  Command cmdAddSave0{*this, "cmdAddSave0", "Backup NOW!"};
  Command cmdMainMenu{*this, "cmdMainMenu", "Main Menu"};
  Command cmdHelp{*this, "cmdHelp", "Help"};
  Label lblEsc{*this, "lblEsc", "Press \"Esc\" to Quit Marlowbeck"};

  void Load() override;
  void CloseButton() override;
  void Escape() override;

  void cmdAddSave0_Click();
  void cmdMainMenu_Click();

 private:
  void Backup();
  void Quit();

  const Context& context_;
};

}  // namespace marlowbeck
