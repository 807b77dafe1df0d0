#pragma once

#include <array>
#include <string>
#include <string_view>

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The main menu: the hub that holds the open competition and from which every other screen is
/// opened. It hides while another screen works and reads everything anew when it comes back.
struct frmDB : Screen {
  frmDB(Screens& screens, const Context& context);

  Picture imgPlayers{*this, "imgPlayers"};
  Picture imgSheets{*this, "imgSheets"};
  Picture imgLadder{*this, "imgLadder"};
  Picture imgKO{*this, "imgKO"};
  Picture imgPrinter{*this, "imgPrinter"};
  Picture imgbackup{*this, "imgbackup"};
  Picture imgExit{*this, "imgExit"};

  Label lblDescription{*this, "lblDescription"};
  Label lblHMPlayers{*this, "lblHMPlayers", " No File Open "};
  Label lblEsc{*this, "lblEsc", "Press ESC to Quit"};
  Label lblVersion{*this, "lblVersion"};
  Command Command1{*this, "Command1", "Command1"};

  MenuEntry mnuFile{*this, "mnuFile", "&File"};
  MenuEntry mnuOpen{mnuFile, "mnuOpen", "&Open"};
  MenuEntry mnuNew{mnuFile, "mnuNew", "&New"};
  MenuEntry mnuClose{mnuFile, "mnuClose", "&Close"};
  MenuEntry mnuExit{mnuFile, "mnuExit", "E&xit"};

  MenuEntry mnuEdit{*this, "mnuEdit", "&Activities"};
  MenuEntry mnuFix{mnuEdit, "mnuFix", "&Fixtures"};
  MenuEntry mnuSeason{mnuEdit, "mnuSeason", "Change &Season Description"};
  MenuEntry mnuGameNames{mnuEdit, "mnuGameNames", "Change &Game Names"};
  MenuEntry mnuPlayersLists{mnuEdit, "mnuPlayersLists", "&Players Lists"};
  MenuEntry mnuSearchPlayer{mnuEdit, "mnuSearchPlayer", "Searc&h for a Player"};
  MenuEntry mnuAssociation{mnuEdit, "mnuAssociation", "Association &Name"};

  MenuEntry mnuHelp{*this, "mnuHelp", "&Help"};
  MenuEntry mnuHelpIndex{mnuHelp, "mnuHelpIndex", "&Help Table of Contents"};
  MenuEntry mnuAbout{mnuHelp, "mnuAbout", "&About Marlow-Beck"};

  void Load() override;
  void Activate() override;
  void CloseButton() override;
  void Escape() override;
  void HelpKey() override;
  void MouseMove() override;

  // The state of the screen.
  void GetPlayerFileName();
  void ShowFileName();
  void Icons();
  void MenuOff();
  void Menus();
  void FileMenuState();
  void OpenPlayerFile();

  // The competition file.
  void mnuOpen_Click();
  void mnuNew_Click();
  void mnuClose_Click();

  // The way to other screens.
  void AddPlayers();
  void imgSheets_Click();
  void imgLadder_Click();
  void imgKO_Click();
  void imgPrinter_Click();
  void imgbackup_Click();
  void mnuFix_Click();
  void mnuSearchPlayer_Click();
  void mnuAssociation_Click();
  void Leave();

 private:
  struct Tile {
    Picture* picture;
    std::string_view status;
  };

  void WireTiles();
  void WireMenus();
  void Mark(const Tile& tile);

  bool AskCarryOver();
  bool AskToClose();
  void ForgetFile();
  std::string AskForNewName();
  void CreateFile(const std::string& path, const std::string& carry_over_source);
  void CarryOver(const std::string& source);
  void DropHalfMade();
  bool MayBeNamed(const std::string& path);
  void AfterCreation();
  void WithOwnWords(const Handler& work);
  void NewCompetition();
  void ReopenNamedFile();

  [[nodiscard]] bool FirstGradeHasTwoTeams();
  void OpenAfterTeamsTest(std::string_view screen, std::string_view refusal);
  void Open(std::string_view screen);
  void OpenWithFile(std::string_view screen);

  const Context& context_;
  Session& session_;
  std::array<Tile, 7> tiles_;
  std::string half_made_;  ///< the file that New has made and not yet named
  bool pointer_on_tile_ = false;
};

}  // namespace marlowbeck
