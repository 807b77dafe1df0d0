#pragma once

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// Names the program and its version.
struct frmAbout : Screen {
  frmAbout(Screens& screens, const Context& context);

  Label lblName{*this, "lblName", "Marlowbeck"};
  Label lblVersion{*this, "lblVersion", "Version 4.2"};
  Command cmdOK{*this, "cmdOK", "OK"};

  void Unload() override;
};

}  // namespace marlowbeck
