// Points given to a team, or taken from it, with its match of the ladder's date.

#include "data/competition.h"
#include "data/numbers.h"
#include "data/text.h"
#include "ladder/frmLadder.h"

namespace marlowbeck {
namespace {

enum class Side { None, Home, Away };

/// A blank team plays in no match.
Side SideOf(const LadderView& match, std::string_view team) {
  if (team.empty()) return Side::None;
  if (match.HomeTeam() == team) return Side::Home;
  return match.AwayTeam() == team ? Side::Away : Side::None;
}

}  // namespace

void frmLadder::cmdPenalty_Click() {
  for (Panel* panel : {&fraButtons, &fraCmds, &fraHelpExit, &fraPenPts}) panel->Hide();
  fraPL.Disable();  // another date would change under the panel
  fraPenalty.Show();
  lstPenalty.Clear();
  for (const std::string& team : TeamList) lstPenalty.AddLine(team);
  lstPenalty.SetFocus();
}

void frmLadder::lstPenalty_Click() {
  const int line = lstPenalty.Index();
  if (line < 0) return;
  session_.Team = Trim(lstPenalty.Line(line));
  fraPenPts.Show();
  lblPen2.SetCaption(session_.Team);
  lblPen3.SetCaption(ShortDate(session_.LadderDate));
  txtPenPts.SetText({});
  OpenLadderFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Ladder, [&](Bytes bytes, int) {
    const LadderView match(bytes);
    const Side side =
        match.GameDate() == session_.LadderDate ? SideOf(match, session_.Team) : Side::None;
    if (side == Side::None) return true;
    const int points = side == Side::Home ? match.HomePenalty() : match.AwayPenalty();
    if (points != 0) txtPenPts.SetText(std::to_string(points));
    return false;
  });
  context_.channels.CloseAll();
  ShowPenaltyWords();
  txtPenPts.SetFocus();
}

void frmLadder::ShowPenaltyWords() {
  std::string words =
      Lines({"To ADD points, enter the number", "only. This box can't be left blank.", "",
             "To DEDUCT points, enter a MINUS", "sign in front of the number."});
  if (!txtPenPts.Text().empty()) {
    words += "\r\rEnter a  ZERO to erase existing adjustment.";
  }
  lblPen1.SetCaption(words);
}

void frmLadder::SavePen() {
  if (txtPenPts.Text().empty()) return txtPenPts.SetFocus();
  const double points = Val(txtPenPts.Text());
  // KEPT: more points than games in a match are not given, without a word, but any number can be
  // taken; a repair would limit both, and say so.
  if (points > session_.GamesPerMatch) return;
  StorePenalty(points);
  ClosePenalties();
  EraseArrays();
  WorkOutTable();
  context_.channels.CloseAll();
}

// KEPT: points for a team without a match on the date are dropped without a word; a repair would
// say so.
/// Into the team's first match of the date.
void frmLadder::StorePenalty(double points) {
  Channels& channels = context_.channels;
  LadderRecord record;
  int found = 0;
  Side side = Side::None;
  OpenLadderFile(session_, channels);
  channels.ForEachRecord(Channel::Ladder, [&](Bytes bytes, int number) {
    const LadderView match(bytes);
    if (match.GameDate() == session_.LadderDate) side = SideOf(match, session_.Team);
    if (side == Side::None) return true;
    record = DecodeLadder(bytes);
    found = number;
    return false;
  });
  if (found > 0) {
    const auto whole = static_cast<std::int16_t>(int{Integer::Narrow(points)});
    (side == Side::Home ? record.HomePenalty : record.AwayPenalty) = whole;
    channels.Put(Channel::Ladder, found, Encode(record));
  }
  channels.CloseAll();
}

void frmLadder::cmdPenCancel_Click() { ClosePenalties(); }

void frmLadder::ClosePenalties() {
  fraPenalty.Hide();
  fraPenPts.Hide();
  fraPL.Enable();
  for (Panel* panel : {&fraButtons, &fraCmds, &fraHelpExit}) panel->Show();
  cmdPenalty.SetFocus();
}

}  // namespace marlowbeck
