#pragma once

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// Puts a results file in date order while the user watches a bar, and goes.
struct frmSort : Screen {
  frmSort(Screens& screens, const Context& context);

  ProgressBar pbWait{*this, "pbWait"};

  void Activate() override;
  void CloseButton() override {}  // the pass is not to be broken off
  void Unload() override;

 private:
  void Sort();
  void ShowProgress(int record);

  const Context& context_;
};

}  // namespace marlowbeck
