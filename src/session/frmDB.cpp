#include "session/frmDB.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/association.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kTitle = "[Marlowbeck] ";
constexpr int kLeastScreenWidth = 11000;  // twips

}  // namespace

frmDB::frmDB(Screens& screens, const Context& context)
    : Screen(screens, "frmDB", kTitle),
      context_(context),
      session_(context.session),
      tiles_{{{&imgPlayers, " Add Edit Search - Players Teams Grades. "},
              {&imgSheets, " Enter results from score sheets. "},
              {&imgLadder, " Enter scores for Premiership Ladder. "},
              {&imgKO, " Enter Players for Knock-Out. "},
              {&imgPrinter, " View and print players results. "},
              {&imgbackup, " Copy your data files to another disk. "},
              {&imgExit, " Quit Marlowbeck. "}}} {
  Command1.Hide();
  imgLadder.Disable();
  imgKO.Disable();
  WireTiles();
  WireMenus();
}

void frmDB::WireTiles() {
  imgPlayers.Click = [this] { AddPlayers(); };
  imgSheets.Click = [this] { imgSheets_Click(); };
  imgLadder.Click = [this] { imgLadder_Click(); };
  imgKO.Click = [this] { imgKO_Click(); };
  imgPrinter.Click = [this] { imgPrinter_Click(); };
  imgbackup.Click = [this] { imgbackup_Click(); };
  imgExit.Click = [this] { Leave(); };
  for (const Tile& tile : tiles_) {
    tile.picture->MouseMove = [this, &tile] {
      if (!pointer_on_tile_) Mark(tile);
      pointer_on_tile_ = true;
    };
    tile.picture->GotFocus = [this, &tile] { Mark(tile); };
  }
}

void frmDB::WireMenus() {
  mnuOpen.Click = [this] { mnuOpen_Click(); };
  mnuNew.Click = [this] { mnuNew_Click(); };
  mnuClose.Click = [this] { mnuClose_Click(); };
  mnuExit.Click = [this] {
    context_.channels.CloseAll();
    Leave();
  };
  mnuFix.Click = [this] { mnuFix_Click(); };
  mnuSeason.Click = [this] { OpenWithFile("frmSeason"); };
  mnuGameNames.Click = [this] { OpenWithFile("frmGameNames"); };
  mnuPlayersLists.Click = [this] { OpenWithFile("frmPlayersLists"); };
  mnuSearchPlayer.Click = [this] { mnuSearchPlayer_Click(); };
  mnuAssociation.Click = [this] { mnuAssociation_Click(); };
  mnuHelpIndex.Click = [this] { HelpKey(); };
  mnuAbout.Click = [this] {
    Menus();
    InScreens().Hide(*this);
    InScreens().Show("frmAbout");
  };
  Command1.Click = [this] { context_.platform.help.Open("\\help\\qz4-help.chm", 0); };
}

void frmDB::Load() {
  lblVersion.SetCaption("Version 4.2");
  if (context_.platform.display.WidthInTwips() < kLeastScreenWidth) {
    Warning(context_,
            Lines({"Your screen resolution must be set to    ",
                   "a minimum of 800 x 600 (16 bit graphics).    ",
                   "Please adjust your settings and restart Marlowbeck.    "}),
            Beep::First);
    EndProgram(context_, InScreens());
    return;
  }
  context_.GoToWorkingFolder();
  SetWave(context_);
  MenuOff();
  Menus();
  for (MenuEntry* entry :
       {&mnuSeason, &mnuGameNames, &mnuPlayersLists, &mnuSearchPlayer, &mnuClose}) {
    entry->Disable();
  }
  LoadAssociationName(context_);
  GameNames(context_);
}

void frmDB::Activate() { GetPlayerFileName(); }

void frmDB::CloseButton() { Leave(); }

void frmDB::Escape() {
  context_.channels.CloseAll();
  lblDescription.Hide();
  imgExit.Hide();
  lblEsc.Hide();
  Leave();
}

void frmDB::HelpKey() { context_.platform.help.Open("qz1.HLP", 0); }

void frmDB::MouseMove() { Menus(); }

void frmDB::GetPlayerFileName() {
  try {
    ReadFileName(context_);
  } catch (const RunTimeError&) {
    // Nothing has been open yet, or nobody can tell what was: all stays as it stands.
    context_.channels.AbandonAll();
    return;
  }
  if (session_.PlayerFile.empty()) {
    nofile(context_, InScreens(), Beep::First);
    return;
  }
  ShowFileName();
  OpenPlayerFile();
  Icons();
  context_.channels.CloseAll();
  FileMenuState();
}

/// As the other screens do, but that here no open file is told.
void frmDB::OpenPlayerFile() {
  if (session_.PlayerFile.empty()) nofile(context_, InScreens(), Beep::First);
  OpenFile(session_, context_.channels);
}

void frmDB::ShowFileName() {
  const std::string name = UpperCase(FileNameOf(session_.PlayerFile));
  SetTitle("[Marlowbeck] Filename: " + WithoutLast(name, 4));
}

void frmDB::Icons() {
  const bool open = !session_.PlayerFile.empty();
  const int count = open ? int{session_.PlayerCount} : 0;
  imgPlayers.SetEnabled(open);
  for (Picture* picture : {&imgSheets, &imgLadder, &imgPrinter}) picture->SetEnabled(count > 0);
  // KEPT: with exactly one player the knock-out stays as it was, so that one that was lit before a
  // deletion stays lit; a repair would put it out.
  if (count != 1) imgKO.SetEnabled(count > 1);
  imgbackup.Enable();
  if (!open) {
    lblHMPlayers.SetCaption(" No File Open ");
  } else if (count == 0) {
    lblHMPlayers.SetCaption(" Current File is Empty ");
  } else {
    lblHMPlayers.SetCaption(std::to_string(count) + (count == 1 ? " Player" : " Players") +
                            " Listed in File. ");
  }
}

void frmDB::MenuOff() {
  for (Picture* picture : {&imgSheets, &imgPlayers, &imgPrinter}) picture->Disable();
}

void frmDB::Menus() {
  lblDescription.Hide();
  for (const Tile& tile : tiles_) tile.picture->SetBordered(false);
  pointer_on_tile_ = false;
}

void frmDB::Mark(const Tile& tile) {
  for (const Tile& other : tiles_) other.picture->SetBordered(&other == &tile);
  lblDescription.SetCaption(tile.status);
  lblDescription.Show();
}

void frmDB::FileMenuState() {
  const bool open = !session_.PlayerFile.empty();
  for (MenuEntry* entry :
       {&mnuSeason, &mnuPlayersLists, &mnuGameNames, &mnuSearchPlayer, &mnuClose}) {
    entry->SetEnabled(open);
  }
  if (!open) lblHMPlayers.SetCaption(" No File Open ");
}

}  // namespace marlowbeck
