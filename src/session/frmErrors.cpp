#include "session/frmErrors.h"

#include "session/messages.h"
#include "ui/screens.h"

namespace marlowbeck {

frmErrors::frmErrors(Screens& screens, const Context& context)
    : Screen(screens, "frmErrors", "[Marlowbeck]  ERROR!"), context_(context) {}

void frmErrors::Activate() {
  InScreens().HideQuietly(*this);
  GetMessage(context_);
}

}  // namespace marlowbeck
