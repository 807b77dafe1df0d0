// The save of a score sheet: one record of the grade's results file, and nothing else.

#include "data/competition.h"
#include "data/numbers.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

std::int16_t Figure(const TextBox& box) {
  return static_cast<std::int16_t>(int{Integer::Narrow(Val(box.Text()))});
}

}  // namespace

void frmResults::cmdSave_Click() {
  Session& session = context_.session;
  if (!chkFF.Value() && !ScoresPass()) return;
  OpenResultSFile(session, context_.channels);
  if (session.EditRecord > 0 && EdCal.Value() != Cal.Value() && DateIsTaken()) {
    return KeepOldDate();
  }
  FillRecord();
  if (Val(txtAgg.Text()) >= 1 && Val(txtLegs.Text()) < 1) {
    // KEPT: a save refused for its legs leaves the results file open until it is opened again; a
    // repair would close it here.
    return Refuse("You must enter Legs before saving !", &txtLegs, &txtLegs);
  }
  WriteRecord();
  EdCal.SetValue(session.WorkDate);
  context_.channels.CloseAll();
  // Not before the record has reached the disk.
  OKSound(context_);
  session.EditRecord = 0;
  RePick();
}

bool frmResults::ScoresPass() {
  if (Val(txtAgg.Text()) < 1 || Val(txtShots.Text()) < 1) {
    Refuse("Must have AGGREGATE and SHOTS before saving !", nullptr, &txtAgg);
    return false;
  }
  if (Val(txtAvg.Text()) > kHighestAverage) {
    Warning(context_, "Some entries seem too high !");
    RestoreWhenEditing();
    txtAgg.SetFocus();
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
  record_.Legs = Figure(txtLegs);
  record_.Aggregate = Figure(txtAgg);
  record_.Shots = NarrowToLong(Val(txtShots.Text()));
  record_.HighScore = Figure(txtHS);
  record_.Centuries = Figure(txtCent);
  record_.Scores180 = Figure(txtHowMany180s);
  for (std::size_t i = 0; i < txtP.size(); ++i) record_.Pegs[i] = Figure(txtP[i]);
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
