#include "results/frmChangeDate.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/messages.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr int kHelpTopic = 251;

}  // namespace

frmChangeDate::frmChangeDate(Screens& screens, const Context& context)
    : Screen(screens, "frmChangeDate", "[Marlowbeck]  Change Game Date"), context_(context) {
  NewCal.Change = [this] { NewCal_Change(); };
  cmdOK.Click = [this] { cmdOK_Click(); };
  cmdCancel.Click = [this] { InScreens().Unload(*this); };
  cmdNewDateHelp.Click = [this] { context_.platform.help.Open("qz1.HLP", kHelpTopic); };

  // The date that the match has is only shown.
  OldCal.Disable();
  for (TextBox* shown_only : {&txtOldDay, &txtNewDay}) {
    shown_only->SetLocked(true);
    shown_only->SetTabStop(false);
  }
  Defaults = {&cmdOK};
  Cancels = {&cmdCancel};
  Helps = {&cmdNewDateHelp};
}

void frmChangeDate::Load() {
  const Session& session = context_.session;
  Frame1.SetCaption(session.Grade);
  lblTeamS.SetCaption(session.Team + "  v's  " + session.Opposition);
  // Enter on what is there changes nothing.
  cmdCancel.SetFocus();
  ReadFileName(context_);
  if (session.PlayerFile.empty()) return;
  const Date date = ReadWorkDate(context_.channels);
  OldCal.SetValue(date);
  NewCal.SetValue(date);
  txtOldDay.SetText(DayName(date));
  txtNewDay.SetText(DayName(date));
}

void frmChangeDate::NewCal_Change() { txtNewDay.SetText(DayName(NewCal.Value())); }

DateChange frmChangeDate::Wanted() const {
  // KEPT: both dates go through a year of two digits, so that 2030 and later read as 1930 and
  // later; a repair would take them as they are.
  return {context_.session.Team, context_.session.Opposition, InTwoDigitYears(OldCal.Value()),
          InTwoDigitYears(NewCal.Value())};
}

void frmChangeDate::cmdOK_Click() {
  const DateChange change = Wanted();
  NameGradeFiles(context_.session);
  if (change.from == change.to) {
    Warning(context_, "No change of date was detected.");
    return;
  }
  if (IsInTheWay(change)) {
    Warning(context_, Lines({change.team + " played " + change.opposition + " on " +
                                 ShortDate(change.to) + ".",
                             "You cannot make this change."}));
    return;
  }
  Move(change);
  OKSound(context_);
  TellSaved();
  InScreens().Unload(*this);
}

bool frmChangeDate::IsInTheWay(const DateChange& change) {
  bool found = false;
  OpenResultSFile(context_.session, context_.channels);
  context_.channels.ForEachRecord(Channel::Results, [&](Bytes bytes, int) {
    found = StandsInTheWay(ResultView(bytes), change);
    return !found;
  });
  context_.channels.CloseAll();
  return found;
}

/// All results of the match move together or none does.
void frmChangeDate::Move(const DateChange& change) {
  const std::string& file = context_.session.ResultsFile;
  std::string results = context_.channels.ReadWhole(file);
  if (MoveMatch(results, change)) context_.channels.ReplaceWhole(file, results);
}

}  // namespace marlowbeck
