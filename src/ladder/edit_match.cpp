// Putting right, moving and deleting what was recorded.

#include "data/competition.h"
#include "data/numbers.h"
#include "data/record_rewriting.h"
#include "data/text.h"
#include "ladder/frmLadder.h"
#include "session/messages.h"

namespace marlowbeck {

void frmLadder::lstDone_Click() {
  session_.EditRecord = 0;
  const int index = lstDone.Index();
  const std::string line = index < 0 ? std::string() : lstDone.Line(index);
  OpenLadderFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Ladder, [&](Bytes bytes, int number) {
    const LadderView match(bytes);
    if (match.GameDate() != session_.WorkDate || line.empty()) return;
    // KEPT: a match is found by its home team's name standing anywhere in the line, and the last
    // such match counts, so that with Red and Redcliffe on one night the line of one can open the
    // other; a repair would look for the whole line.
    if (line.find(match.HomeTeam()) == std::string::npos) return;
    session_.EditRecord = number;
    record_ = DecodeLadder(bytes);
  });
  context_.channels.CloseAll();
  if (session_.EditRecord != 0) OpenEditPanel();
}

void frmLadder::OpenEditPanel() {
  txtEdHome.SetText(Trimmed(record_.HomeTeam));
  txtEdHomeScore.SetText(std::to_string(record_.HomeScore));
  txtEdAway.SetText(Trimmed(record_.AwayTeam));
  txtEdAwayScore.SetText(std::to_string(record_.AwayScore));
  for (Panel* panel : {&fraButtons, &fraPL, &fraCF, &fraScoresIn}) panel->Hide();
  // Another date or grade would change under the match.
  Frame2.Disable();
  cmdChangeGrade.Disable();
  fraEdScore.Show();
  EdCal.SetValue(session_.WorkDate);
  lblHeader[0].SetCaption(session_.Grade);
  lblHeader[1].SetCaption(LongDate(EdCal.Value()));
  txtEdHomeScore.SetFocus();
}

void frmLadder::CloseEditPanel() {
  session_.EditRecord = 0;
  fraEdScore.Hide();
  fraScoresIn.Show();
  Frame2.Enable();
  cmdChangeGrade.Enable();
  fraButtons.Show();
  fraSC.Show();
}

void frmLadder::EdCal_Change() { txtEdHomeScore.SetFocus(); }

void frmLadder::cmdCancelEdit_Click() {
  CloseEditPanel();
  cmdExit.SetFocus();
}

void frmLadder::cmdSaveEdit_Click() {
  Channels& channels = context_.channels;
  if (HasMatchOnNewDate()) {
    Warning(context_, Lines({Trim(txtEdHome.Text()) + " and " + Trim(txtEdAway.Text()),
                             " has scores recorded for " + ShortDate(EdCal.Value()) + "    ", "",
                             "Please select another date.    "}));
    return;
  }
  if (!ScoresPass(txtEdHomeScore, txtEdAwayScore)) return PutStoredScoresBack();
  OpenLadderFile(session_, channels);
  // KEPT: the points given or taken with the last match of the file replace those of this one; a
  // repair would read its own record before it is written.
  record_.HomeTeam = txtEdHome.Text();
  record_.AwayTeam = txtEdAway.Text();
  record_.GameDate = EdCal.Value();
  record_.HomeScore = static_cast<std::int16_t>(int{Integer::Narrow(Val(txtEdHomeScore.Text()))});
  record_.AwayScore = static_cast<std::int16_t>(int{Integer::Narrow(Val(txtEdAwayScore.Text()))});
  channels.Put(Channel::Ladder, session_.EditRecord, Encode(record_));
  channels.CloseAll();
  OKSound(context_);
  CloseEditPanel();
  lstDone.SetFocus();
  SortLadderFile();
  EnterScores();
}

/// Leaves each record in the record buffer, up to the one that is in the way or the last.
bool frmLadder::HasMatchOnNewDate() {
  const std::string_view home = Trimmed(txtEdHome.Text());
  bool found = false;
  record_ = {};
  OpenLadderFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Ladder, [&](Bytes bytes, int number) {
    const LadderView match(bytes);
    record_ = DecodeLadder(bytes);
    // KEPT: only the home team is looked for on the new date, so that the away team may come to
    // have two matches there; a repair would look for both.
    found = number != session_.EditRecord && match.GameDate() != session_.WorkDate &&
            match.GameDate() == EdCal.Value() &&
            (match.HomeTeam() == home || match.AwayTeam() == home);
    return !found;
  });
  context_.channels.CloseAll();
  return found;
}

void frmLadder::PutStoredScoresBack() {
  LadderBytes bytes{};
  OpenLadderFile(session_, context_.channels);
  context_.channels.Get(Channel::Ladder, session_.EditRecord, bytes);
  context_.channels.CloseAll();
  const LadderView match(bytes);
  txtEdHomeScore.SetText(std::to_string(match.HomeScore()));
  txtEdAwayScore.SetText(std::to_string(match.AwayScore()));
  txtEdHomeScore.SetFocus();
}

void frmLadder::cmdDeleteEdit_Click() {
  const int answer =
      Confirm(context_, Lines({"W A R N I N G !", "", "You are about to Delete scores for    ",
                               Trim(txtEdHome.Text()) + " v's " + Trim(txtEdAway.Text()) + "    ",
                               "recorded on " + ShortDate(session_.WorkDate) + "    "}));
  if (answer != kAnswerOk) return txtEdHomeScore.SetFocus();
  try {
    OpenLadderFile(session_, context_.channels);
    RemoveRecords(context_.channels, Channel::Ladder,
                  [&](Bytes, int number) { return number == session_.EditRecord; });
  } catch (const RunTimeError&) {
    // The record may be gone or not: under its number might stand another one.
    context_.channels.AbandonAll();
    CloseEditPanel();
    throw;
  }
  CloseEditPanel();
  lstDone.SetFocus();
  SortLadderFile();
  EnterScores();
}

}  // namespace marlowbeck
