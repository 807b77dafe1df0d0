#pragma once

#include "ui/context.h"
#include "ui/screen.h"

namespace marlowbeck {

/// Turns ErrorNumber into the error box. It has no controls; it is seen only for as long as the
/// box stands, and neither its coming nor its going activates the screen behind it.
struct frmErrors : Screen {
  frmErrors(Screens& screens, const Context& context);

  void Activate() override;

 private:
  const Context& context_;
};

}  // namespace marlowbeck
