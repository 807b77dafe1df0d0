// The main menu's ways to the other screens.

#include "data/competition.h"
#include "data/text.h"
#include "session/association.h"
#include "session/fixture_entry.h"
#include "session/frmDB.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {

void frmDB::AddPlayers() {
  Menus();
  if (!InScreens().Knows("frmNames")) return;
  WriteFileName(context_);
  session_.Flag = 0;
  InScreens().Hide(*this);
  InScreens().Show("frmNames");
}

/// Opens a screen that reads the open competition's name for itself.
void frmDB::Open(std::string_view screen) {
  Menus();
  if (!InScreens().Knows(screen)) return;
  WriteFileName(context_);
  InScreens().Hide(*this);
  InScreens().Show(screen);
}

void frmDB::OpenWithFile(std::string_view screen) {
  Menus();
  if (!session_.PlayerFile.empty()) Open(screen);
}

// KEPT: the test looks at the grade of the first player alone, for the knock-out too, whose words
// speak of players; a repair would look at every grade, and count players for the knock-out.
bool frmDB::FirstGradeHasTwoTeams() {
  OpenPlayerFile();
  std::string grade;
  std::string team;
  bool found = false;
  context_.channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int number) {
    const PlayerView player(bytes);
    if (number == 1) {
      grade = player.Grade();
      team = player.Team();
    }
    found = player.Grade() == grade && player.Team() != team;
    return !found;
  });
  context_.channels.CloseAll();
  return found;
}

void frmDB::OpenAfterTeamsTest(std::string_view screen, std::string_view refusal) {
  Menus();
  if (session_.PlayerFile.empty()) return;
  if (FirstGradeHasTwoTeams()) {
    Open(screen);
  } else {
    Warning(context_, refusal, Beep::First);
  }
}

void frmDB::imgSheets_Click() {
  OpenAfterTeamsTest("frmResults", Lines({"You must have at least 2 Teams in each grade    ",
                                          "before you can enter player's scores.    "}));
}

void frmDB::imgLadder_Click() {
  OpenAfterTeamsTest("frmLadder", Lines({"You must have at least 2 Teams in your file    ",
                                         "before using the Ladder.    "}));
}

void frmDB::imgKO_Click() {
  OpenAfterTeamsTest("frmKnockOut", "You must have at least 2 Players for a Knock-Out.    ");
}

void frmDB::imgPrinter_Click() { OpenWithFile("frmPMenu"); }

void frmDB::imgbackup_Click() {
  Menus();
  context_.channels.CloseAll();
  Screen* const backup = InScreens().Load("frmBackup");
  if (backup == nullptr) return;
  backup->Find("cmdCancel")->SetCaption("Main Menu");
  SetEnabled(false);
  InScreens().Show("frmBackup");
}

void frmDB::mnuFix_Click() {
  Menus();
  if (!AskTeamCount(context_, Beep::First)) return;
  Screen* const fixtures = InScreens().Load("frmFixtures");
  if (fixtures == nullptr) return;
  SetEnabled(false);
  fixtures->Closed = [this] { SetEnabled(true); };
  InScreens().Show("frmFixtures");
}

void frmDB::mnuSearchPlayer_Click() {
  Menus();
  const std::string surname = AskSurname(context_);
  if (surname.empty()) return;
  session_.SearchText = surname;
  session_.Flag = 1;
  InScreens().Hide(*this);
  InScreens().Show("frmSearchPlayer");
}

void frmDB::mnuAssociation_Click() { AskAssociationName(context_); }

void frmDB::Leave() {
  Menus();
  GoToWorkingFolderIfThere(context_);
  InScreens().Hide(*this);
  InScreens().Show("frmBuend");
}

}  // namespace marlowbeck
