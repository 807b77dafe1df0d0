// The save of a score sheet: one record of the grade's results file, and nothing else.

#include "data/competition.h"
#include "data/numbers.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "session/messages.h"

namespace marlowbeck {
void frmResults::cmdSave_Click() {
  Session& session = context_.session;
  if (!chkFF.Value() && !ScoresPass()) return;
  OpenResultSFile(session, context_.channels);
  if (session.EditRecord > 0 && EdCal.Value() != Cal.Value() && DateIsTaken()) {
    return KeepOldDate();
  }
  FillRecord();
  // KEPT: a save refused for its legs leaves the results file open until it is opened again; a
  // repair would close it here.
  if (!scores.HasLegs()) return;
  WriteRecord();
  EdCal.SetValue(session.WorkDate);
  context_.channels.CloseAll();
  // Not before the record has reached the disk.
  OKSound(context_);
  session.EditRecord = 0;
  RePick();
}

bool frmResults::ScoresPass() {
  if (!scores.HasAggregateAndShots()) return false;
  if (!scores.AverageIsPossible()) {
    RestoreWhenEditing();
    scores.txtAgg.SetFocus();
    return false;
  }
  CheckCenturies();
  return context_.session.Flag != 1;
}

/// The player has a result on the date that the one in hand is to be moved to.
bool frmResults::DateIsTaken() {
  const double id = Val(panPlrID.Caption());
  bool taken = false;
  ForEachResult([&](const ResultView& result, int) {
    taken = result.ID() == id && result.GameDate() == EdCal.Value();
    return !taken;
  });
  return taken;
}

void frmResults::KeepOldDate() {
  const std::string date = ShortDate(EdCal.Value());
  Warning(context_, Lines({"Player has already had results entered on " + date + ".",
                           "To make this change possible you must first delete, or",
                           "change the date of results previously entered on " + date + "."}));
  context_.channels.CloseAll();
  GetOldScores();
  fraEdButtons.Show();
  EdCal.SetValue(context_.session.WorkDate);
}

void frmResults::FillRecord() {
  // KEPT: the grade of a record stays what the record buffer last held; a repair would write the
  // grade in hand.
  record_.ID = NarrowToLong(NumberOf(panPlrID.Caption()));
  record_.Team = cboResTeam.Text();
  record_.Opposition = cboOpp.Text();
  record_.GameDate = context_.session.EditRecord > 0 ? EdCal.Value() : context_.session.WorkDate;
  record_.Forfeit.assign(chkFF.Value() ? 1 : 0, 'F');
  scores.MoveInto(record_);
}

void frmResults::WriteRecord() {
  Session& session = context_.session;
  const bool is_new = session.EditRecord == 0;
  const int number = is_new ? ++session.ResultCount : session.EditRecord;
  context_.channels.Put(Channel::Results, number, Encode(record_));
  // Should it fail to reach the disk, the sheet stays open: saving it again is to write this record
  // again, and not a second one.
  session.EditRecord = number;
}

}  // namespace marlowbeck
