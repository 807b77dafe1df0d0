// The saving of players on the setup screen.

#include <algorithm>

#include "data/records.h"
#include "data/text.h"
#include "session/messages.h"
#include "setup/frmNames.h"
#include "setup/player_names.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kLongestSurname = 30;

}  // namespace

bool frmNames::AnyBoxTicked() const {
  return std::ranges::any_of(Controls(), [](const Control* control) {
    return control->GetKind() == Kind::Check && static_cast<const CheckBox*>(control)->Value();
  });
}

void frmNames::cmdAddSave0_Click() {
  if (!AnyBoxTicked()) {
    Warning(context_, Lines({"You have not checked the Best of Three boxes.    ",
                             "This must be done before you can continue.    "}));
    txtAddSn0.SetFocus();
    return;
  }
  NewPegs0();
  if (txtAddSn0.Text().size() > kLongestSurname) {
    Warning(context_, "Surname must be 30 characters or less.    ");
    txtAddSn0.SetFocus();
    return;
  }
  if (!SaveNewPlayer0()) return;
  fraBoT.Hide();
  panAddPlayer0.Hide();
  panAddPlayer.Show();
  Reset();
  fraNoP.Hide();
  cmdClear.Hide();
}

bool frmNames::SaveNewPlayer0() {
  const auto entries = {&txtAddSn0, &txtAddFn0, &txtAddTm0, &txtAddGrd0};
  if (std::ranges::any_of(entries, [](const TextBox* box) { return box->Text().empty(); })) {
    Warning(context_,
            Lines({"All sections must be completed    ", "before you can add to the file.    "}));
    txtAddSn0.SetFocus();
    return false;
  }
  PutFirstPlayer();
  session_.Flag = 0;
  OKSound(context_);
  return true;
}

void frmNames::PutFirstPlayer() {
  PlayerRecord player;
  player.ID = 1;
  player.Surname = txtAddSn0.Text();
  player.FirstName = txtAddFn0.Text();
  player.Team = txtAddTm0.Text();
  player.Grade = txtAddGrd0.Text();
  player.BestOfThree = session_.BestOfThree;
  OpenPlayers();
  context_.channels.Put(Channel::Players, 1, Encode(player));
  context_.channels.CloseAll();
  session_.PlayerCount = 1;
  session_.Team = Trim(player.Team);
  session_.Grade = Trim(player.Grade);
}

/// One name alone leaves the command as it was.
void frmNames::NamesChanged() {
  const bool surname = !txtAddSn.Text().empty();
  const bool first_name = !txtAddFn.Text().empty();
  if (surname == first_name) cmdAddSave.SetEnabled(surname);
}

void frmNames::cmdAddSave_Click() {
  if (!SaveNewPlayer()) return;
  panAddPlayer.SetCaption(kSetupCaption);
  FreeCombos();
  // KEPT: a saved player sounds twice, here and when the record is written; a repair would leave
  // this one out.
  OKSound(context_);
}

bool frmNames::SaveNewPlayer() {
  const std::string grade = cboAddGrd.Text();
  const std::string team = cboAddTm.Text();
  if (Trimmed(txtAddSn.Text()).empty() || Trimmed(txtAddFn.Text()).empty()) {
    Warning(context_, Lines({"Surname & First Name       ", "must be completed.       "}));
    txtAddSn.SetFocus();
    return false;
  }
  PutPlayer();
  session_.Flag = 0;
  Reset();
  CheckNoP();
  PutGradeAndTeamBack(grade, team);
  return true;
}

void frmNames::PutPlayer() {
  OpenPlayers();
  const RecordsBefore before = LookThroughPlayers(context_.channels);
  PlayerRecord player;
  player.ID = NarrowToLong(double{1} + before.highest_id);
  player.Surname = txtAddSn.Text();
  player.FirstName = txtAddFn.Text();
  player.Team = cboAddTm.Text();
  player.Grade = cboAddGrd.Text();
  // KEPT: a saved player takes over the reserved date of the file's last record; a repair would
  // write 0, or leave an edited player's own.
  player.Reserved1 = before.last_reserved1;
  player.BestOfThree = session_.BestOfThree;
  if (session_.EditRecord > 0) {
    PutEdited(player);
  } else {
    Append(player);
  }
}

void frmNames::PutEdited(const PlayerRecord& player) {
  PlayerRecord edited = player;
  edited.ID = session_.Flag;
  context_.channels.Put(Channel::Players, session_.EditRecord, Encode(edited));
  context_.channels.CloseAll();
  // The player is saved: what is typed from here on is another one, whatever becomes of the lists.
  session_.EditRecord = 0;
  session_.Flag = 0;
  ClearNames();
  cmdClear.Hide();
  OKSound(context_);
  PlayerList();
}

void frmNames::Append(const PlayerRecord& player) {
  const Integer count = session_.PlayerCount + 1;
  context_.channels.Put(Channel::Players, count, Encode(player));
  context_.channels.CloseAll();
  session_.PlayerCount = count;
  OKSound(context_);
}

}  // namespace marlowbeck
