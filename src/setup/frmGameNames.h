#pragma once

#include <array>

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The names of the three kinds of game in a match, and their short forms, for all competitions.
struct frmGameNames : Screen {
  frmGameNames(Screens& screens, const Context& context);

  TextBox txtFirst{*this, "txtFirst", "FIRST Game"};
  TextBox txtSecond{*this, "txtSecond", "SECOND Game"};
  TextBox txtThird{*this, "txtThird", "THIRD Game"};
  TextBox txtShFirst{*this, "txtShFirst", "FIRST Game"};
  TextBox txtShSecond{*this, "txtShSecond", "SECOND Game"};
  TextBox txtShThird{*this, "txtShThird", "THIRD Game"};
  Command cmdSave{*this, "cmdSave", "Save"};
  Command cmdExit{*this, "cmdExit", "Exit"};
  Command cmdHelp{*this, "cmdHelp", "Help"};

  void Load() override;
  void Unload() override;

  void cmdSave_Click();

 private:
  /// Answers whether the boxes can be saved; tells what is wrong when they cannot.
  bool Check();

  const Context& context_;
  /// In the order of the file.
  const std::array<TextBox*, 6> boxes_;
};

}  // namespace marlowbeck
