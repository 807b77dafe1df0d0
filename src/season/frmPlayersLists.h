#pragma once

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The teams of a grade with their players, to be read and to be copied.
struct frmPlayersLists : Screen {
  frmPlayersLists(Screens& screens, const Context& context);

  ComboBox Combo1{*this, "Combo1", "Select Grade to view All Teams and Players:"};
  Panel Frame1{*this, "Frame1", "Players Lists"};
  ListBox lstteams{Frame1, "lstteams"};
  Command cmdClip{*this, "cmdClip", "Copy to Clipboard"};
  Command cmdHelp1{*this, "cmdHelp1", "Help"};
  Command cmdExit{*this, "cmdExit", "Exit"};

  void Load() override;
  void Unload() override;

  void Start();
  void GetGrades();
  void GetTeams();
  void cmdClip_Click();

 private:
  void TakeGrade();
  void ListOnlyPlayersTeam();
  void ListTeams();

  const Context& context_;
  Session& session_;
};

}  // namespace marlowbeck
