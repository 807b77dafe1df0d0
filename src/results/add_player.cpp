// Adding a player to the team in hand without leaving the score sheets.

#include <algorithm>

#include "data/competition.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "results/next_player.h"
#include "session/messages.h"

namespace marlowbeck {

void frmResults::panAddNames_Click() {
  unconfirmed_.reset();
  fraTeams.Disable();
  panResAddPlayer.Show();
  txtAddSn0.SetText("");
  txtAddFn0.SetText("");
  txtAddGrd0.SetText(Trimmed(lblHeader[0].Caption()));
  txtAddTm0.SetText(context_.session.Team);
  fraResControls.Hide();
  txtAddSn0.SetFocus();
}

void frmResults::cmdAddCancel0_Click() {
  fraTeams.Enable();
  panResAddPlayer.Hide();
  fraResControls.Show();
}

void frmResults::cmdAddSave0_Click() {
  const auto entries = {&txtAddSn0, &txtAddFn0, &txtAddTm0, &txtAddGrd0};
  if (std::ranges::any_of(entries, [](const TextBox* box) { return box->Text().empty(); })) {
    Warning(context_, Lines({"Surname & First name", "must be completed."}));
    txtAddSn0.SetFocus();
    // KEPT: a refused player leaves the teams within reach beside the panel; a repair would leave
    // them disabled until it closes.
    fraTeams.Enable();
    return;
  }
  GetNoP();
  PutNewPlayer();
  OKSound(context_);
  panResAddPlayer.Hide();
  fraResControls.Show();
  GetPlayers();
  fraTeams.Enable();
}

void frmResults::PutNewPlayer() {
  Session& session = context_.session;
  OpenFile(session, context_.channels);
  const int before = session.PlayerCount - (EndsUnconfirmed() ? 1 : 0);
  NextPlayer next;
  context_.channels.ForEachRecord(Channel::Players, [&](Bytes record, int number) {
    if (number <= before) next.AddPlayer(record);
  });
  unconfirmed_ = Encode(PlayerToAdd(next));
  session.PlayerCount = before + 1;
  context_.channels.Put(Channel::Players, session.PlayerCount, *unconfirmed_);
  context_.channels.CloseAll();
  unconfirmed_.reset();
}

PlayerRecord frmResults::PlayerToAdd(const NextPlayer& next) const {
  PlayerRecord player;
  player.ID = next.ID();
  player.Surname = txtAddSn0.Text();
  player.FirstName = txtAddFn0.Text();
  player.Team = txtAddTm0.Text();
  player.Grade = txtAddGrd0.Text();
  // KEPT: a player added here takes over the reserved date of the file's last record; a repair
  // would write 0.
  player.Reserved1 = next.Reserved1();
  // KEPT: the code is that of the grade in hand, also when another grade was typed; a repair would
  // look the typed grade up.
  player.BestOfThree = context_.session.BestOfThree;
  return player;
}

/// The last record of the open file is one that was written from this panel and did not reach the
/// disk: saving it again is to write it again, and not a second one.
bool frmResults::EndsUnconfirmed() {
  if (!unconfirmed_ || context_.session.PlayerCount == 0) return false;
  PlayerBytes last{};
  context_.channels.Get(Channel::Players, context_.session.PlayerCount, last);
  return last == *unconfirmed_;
}

}  // namespace marlowbeck
