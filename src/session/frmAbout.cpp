#include "session/frmAbout.h"

#include "ui/screens.h"

namespace marlowbeck {

frmAbout::frmAbout(Screens& screens, const Context&)
    : Screen(screens, "frmAbout", "[Marlowbeck]  About Marlow-Beck") {
  cmdOK.Click = [this] { InScreens().Unload(*this); };
  Defaults = {&cmdOK};
  Cancels = {&cmdOK};
}

void frmAbout::Unload() { InScreens().Show("frmDB"); }

}  // namespace marlowbeck
