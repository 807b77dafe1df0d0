#pragma once

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The players whose surname holds the session's SearchText, in any grade. Flag tells who opened
/// it: 1 the main menu, 2 the setup screen, 3 the Reports screen; there it leads back to.
struct frmSearchPlayer : Screen {
  frmSearchPlayer(Screens& screens, const Context& context);

  Panel fraFound{*this, "fraFound"};
  Label lblInfo{fraFound, "lblInfo"};
  Grid grdShow{fraFound, "grdShow"};
  Command cmdClip{*this, "cmdClip", "Copy to Clipboard"};
  Command cmdAgain{*this, "cmdAgain", "Search Again"};
  Command cmdExit{*this, "cmdExit", "Exit"};

  void Load() override;
  void Unload() override;

  void SearchInput();
  void ShowFound();
  void GetPlayers();
  void ClearGrid();
  void cmdClip_Click();

 private:
  void TellCount();

  const Context& context_;
  Session& session_;
};

}  // namespace marlowbeck
