#include "results/frmEdScore.h"

#include <array>

#include "data/competition.h"
#include "data/numbers.h"
#include "data/text.h"
#include "results/find_records.h"
#include "session/messages.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kHandOver = "qzEdScor.qz3";
constexpr int kHelpTopic = 250;
// KEPT: a player is looked up by a name with one blank behind the comma, on the score sheets by one
// with two; a repair would write names in one way.
constexpr std::string_view kNameSeparator = ", ";

}  // namespace

frmEdScore::frmEdScore(Screens& screens, const Context& context)
    : Screen(screens, "frmEdScore", "[Marlowbeck]  Edit Player Scores"),
      scores(*this, context),
      context_(context) {
  // KEPT: a peg above 170 is not refused as its box is left, and is saved; a repair would test it
  // as the score sheets do.
  scores.txtAgg.LostFocus = [this] { txtAgg_LostFocus(); };
  scores.txtShots.LostFocus = [this] { scores.ShowAverage(); };
  scores.txtHowMany180s.LostFocus = [this] { CheckCenturies(); };
  // KEPT: the forfeit box says and does nothing here; a repair would show the record's mark in it,
  // and save it.
  cmdSave.Click = [this] { cmdSave_Click(); };
  Command2.Click = [this] { InScreens().Unload(*this); };
  Command3.Click = [this] { context_.platform.help.Open("qz1.HLP", kHelpTopic); };

  for (TextBox* shown_only : {&txtGrade, &txtTeam, &txtOpp, &txtDate, &txtPlayer}) {
    shown_only->SetLocked(true);
    shown_only->SetTabStop(false);
  }
  Defaults = {&cmdSave};
  Cancels = {&Command2};
  Helps = {&Command3};
}

void frmEdScore::Load() {
  Session& session = context_.session;
  // What another screen had open is neither to be opened nor written here.
  session.EditRecord = 0;
  session.Flag = 0;
  session.BestOfThree = 0;
  ClearResults();
  ReadHandOver();
  EnableBoxes();
  if (FindPlayer()) FindRecord();
  WhichBoxes();
  if (session.EditRecord > 0) scores.Fill(record_);
}

void frmEdScore::ReadHandOver() {
  Session& session = context_.session;
  context_.GoToWorkingFolder();
  context_.channels.OpenInput(Channel::Side, kHandOver);
  for (TextBox* box : {&txtGrade, &txtTeam, &txtOpp, &txtDate, &txtPlayer}) {
    box->SetText(context_.channels.Reader(Channel::Side).TextToLastQuote());
  }
  context_.channels.CloseAll();
  session.Grade = Trim(txtGrade.Text());
  session.Team = Trim(txtTeam.Text());
  session.Opposition = Trim(txtOpp.Text());
  NameGradeFiles(session);
}

/// Puts the id into Flag, which stays 0 where there is no such player; so it is for a forfeit,
/// whose star belongs to no name.
bool frmEdScore::FindPlayer() {
  Session& session = context_.session;
  const auto player =
      FindPlayerByLine(session, context_.channels, txtPlayer.Text(), kNameSeparator);
  if (!player) return false;
  // KEPT: the id is held in 16 bits, so that a player numbered above 32767 cannot be corrected
  // here; a repair would hold it in 32.
  session.Flag = player->ID;
  session.BestOfThree = player->BestOfThree;
  return true;
}

void frmEdScore::FindRecord() {
  Session& session = context_.session;
  const ResultKey wanted{session.Flag, session.Team, session.Opposition,
                         DateFromText(txtDate.Text())};
  OpenResultSFile(session, context_.channels);
  context_.channels.ForEachRecord(Channel::Results, [&](Bytes bytes, int number) {
    if (!wanted.Fits(ResultView(bytes))) return true;
    // KEPT: of several results of one night the first is opened here, on the score sheets the last;
    // a repair would look from the same end.
    session.EditRecord = number;
    record_ = DecodeResult(bytes);
    return false;
  });
  context_.channels.CloseAll();
}

void frmEdScore::WhichBoxes() {
  scores.ShowPegBoxes(context_.session.BestOfThree, context_.session.GameNames);
}

void frmEdScore::ClearResults() {
  for (Control* control : Controls()) {
    if (control->GetKind() == Kind::Text) static_cast<TextBox*>(control)->SetText("");
  }
}

void frmEdScore::EnableBoxes() {
  scores.Enable();
  chkFF.SetValue(false);
}

void frmEdScore::ReadRecord() {
  ResultBytes bytes{};
  OpenResultSFile(context_.session, context_.channels);
  context_.channels.Get(Channel::Results, context_.session.EditRecord, bytes);
  context_.channels.CloseAll();
  record_ = DecodeResult(bytes);
}

void frmEdScore::GetOldScores() {
  if (context_.session.EditRecord == 0) return;
  WhichBoxes();
  ReadRecord();
  scores.Restore(record_);
}

void frmEdScore::txtAgg_LostFocus() {
  if (scores.LeaveAggregate()) return;
  if (context_.session.EditRecord > 0) {
    ReadRecord();
    // KEPT: an aggregate that is too high is put back alone; a repair would put all figures back as
    // the score sheets do.
    scores.txtAgg.SetText(NumberText(record_.Aggregate));
  }
  scores.txtAgg.SetFocus();
}

void frmEdScore::CheckCenturies() {
  const CenturiesCheck found = scores.CheckCenturies();
  // KEPT: with all three boxes empty the check is passed here, on the score sheets the flag stands
  // as it was; a repair would let both do the same.
  const bool passed = found == CenturiesCheck::NothingScored || found == CenturiesCheck::Passed;
  context_.session.Flag = passed ? 0 : 1;
  scores.TellCenturies(found);
}

void frmEdScore::cmdSave_Click() {
  if (!scores.HasAggregateAndShots()) return;
  if (!scores.AverageIsPossible()) {
    GetOldScores();
    scores.txtAgg.SetFocus();
    return;
  }
  CheckCenturies();
  if (context_.session.Flag == 1) return;
  // All else of the record stays as it was, a forfeit's mark too.
  scores.MoveInto(record_);
  if (!scores.HasLegs()) return;
  WriteRecord();
  OKSound(context_);
  TellSaved();
  InScreens().Unload(*this);
}

/// Has reached the disk when this returns. Without a record there is no place to write to, which is
/// an error.
void frmEdScore::WriteRecord() {
  OpenResultSFile(context_.session, context_.channels);
  context_.channels.Put(Channel::Results, context_.session.EditRecord, Encode(record_));
  context_.channels.CloseAll();
}

}  // namespace marlowbeck
