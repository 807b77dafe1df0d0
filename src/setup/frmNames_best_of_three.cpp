// The Best of Three setting of a grade on the setup screen.

#include <optional>

#include "data/record_rewriting.h"
#include "data/text.h"
#include "session/messages.h"
#include "session/shared_procedures.h"
#include "setup/frmNames.h"
#include "setup/player_names.h"

namespace marlowbeck {
namespace {

/// Flag while the setting of a grade that has players is being changed.
constexpr int kChanging = 1;

}  // namespace

/// Takes the code of the grade in the combo; 0, and false, while it has no player.
bool frmNames::FindBestOfThree() {
  OpenPlayers();
  const std::optional<Integer> code = BestOfThreeOf(context_.channels, cboAddGrd.Text());
  context_.channels.CloseAll();
  session_.BestOfThree = code.value_or(0);
  return code.has_value();
}

void frmNames::CheckNoP() {
  FindBestOfThree();
  PegsDescription();
}

void frmNames::PegsDescription() {
  const int code = session_.BestOfThree;
  session_.BestOfThreeText = marlowbeck::PegsDescription(session_, code);
  lblNoP.SetCaption(code == 0 ? " Not selected." : session_.BestOfThreeText);
  if (session_.Flag == kChanging) grade_boxes.SetCode(code);
}

void frmNames::GetPegs() {
  ShowBestOfThree(false);
  cmdAddSave.Disable();
  if (FindBestOfThree()) return PegsDescription();
  first_boxes.SetCode(0);
  grade_boxes.SetCode(0);
  NewGradePegs();
}

void frmNames::NewGradePegs() {
  ShowBestOfThree(true);
  fraBoT.Enable();
  grade_boxes.Caption(session_.GameNames);
  session_.BestOfThree = grade_boxes.Code();
  PegsDescription();
  cmdNoPOK.SetFocus();
}

void frmNames::NewPegs0() { session_.BestOfThree = first_boxes.Code(); }

void frmNames::cmdEdBOT_Click() {
  ButtonsOFF();
  fraGT3.Hide();
  fraPList.Hide();
  session_.Flag = kChanging;
  try {
    CheckNoP();
  } catch (const RunTimeError&) {
    // With all of its panels away the screen could not be left.
    context_.channels.AbandonAll();
    session_.Flag = 0;
    CloseBestOfThree();
    throw;
  }
  NewGradePegs();
}

void frmNames::cmdNoPOK_Click() {
  if (session_.BestOfThree == 0) return RefuseBestOfThree();
  if (session_.Flag == kChanging) ChangeBestOfThree();
  session_.Flag = 0;
  CloseBestOfThree();
}

void frmNames::RefuseBestOfThree() {
  Warning(context_,
          Lines({"You have not checked any BEST OF THREE boxes.    ",
                 session_.Flag == kChanging ? "Previous setting will be retained.    "
                                            : "This must be done before you can continue.    "}));
  cmdCancelBo3_Click();
}

void frmNames::cmdCancelBo3_Click() {
  session_.Flag = 0;
  CheckNoP();
  CloseBestOfThree();
}

/// KEPT: the choice of the games ends an edit, so that a player who is moved into a new grade stays
/// where he was and is added there as another one; a repair would go on with the edit.
void frmNames::CloseBestOfThree() {
  cmdAddSave.Enable();
  ShowBestOfThree(false);
  BackToNames();
}

/// All players of the grade change together or none does.
void frmNames::ChangeBestOfThree() {
  session_.Grade = Trim(cboAddGrd.Text());
  OpenPlayers();
  ChangeRecords(context_.channels, Channel::Players, [this](std::span<std::byte> player) {
    return StampBestOfThree(player, session_.Grade, session_.BestOfThree);
  });
}

}  // namespace marlowbeck
