// Stepping among the dates of a team, and keeping the work date.

#include "data/competition.h"
#include "results/frmResults.h"
#include "results/quiet_spell.h"

namespace marlowbeck {
namespace {

constexpr const char* kAsWorkDate = " as WorkDate";
// KEPT: the button asks in other words after a step forward than after the three other steps; a
// repair would choose one wording.
constexpr const char* kAsWorkDateForward = " as Work Date?";

}  // namespace

void frmResults::GetDates() {
  std::vector<Date> dates;
  OpenResultSFile(context_.session, context_.channels);
  ForEachResult([&](const ResultView& result, int) {
    if (result.Team() == context_.session.Team) dates.push_back(result.GameDate());
    return true;
  });
  context_.channels.CloseAll();
  context_.session.TeamDates = WithoutRepeats(dates);
}

/// Not kept beyond this screen: the side file keeps the old work date until it is asked to.
void frmResults::GoToDate(Date date, const char* asked_as) {
  ShowDay(date);
  {
    const QuietSpell quiet(context_.session.Quiet);
    cboResTeam_Click();
  }
  cmdMakeWorkDate.SetCaption("Set " + ShortDate(date) + asked_as);
}

void frmResults::cmdFirst_Click() {
  context_.platform.sound.Beep();
  GetDates();
  if (context_.session.TeamDates.empty()) return;
  GoToDate(context_.session.TeamDates.front(), kAsWorkDate);
}

void frmResults::cmdLast_Click() {
  context_.platform.sound.Beep();
  GetDates();
  if (context_.session.TeamDates.empty()) return;
  GoToDate(context_.session.TeamDates.back(), kAsWorkDate);
}

void frmResults::cmdPrevDate_Click() {
  GetDates();
  const auto step = StepBack(context_.session.TeamDates, context_.session.WorkDate);
  if (!step) return;
  if (step->at_end) context_.platform.sound.Beep();
  GoToDate(step->date, kAsWorkDate);
}

void frmResults::cmdNextDate_Click() {
  GetDates();
  const auto step = StepForward(context_.session.TeamDates, context_.session.WorkDate);
  if (!step) return;
  if (step->at_end) context_.platform.sound.Beep();
  GoToDate(step->date, kAsWorkDateForward);
}

void frmResults::cmdMakeWorkDate_Click() {
  const Date date = context_.session.WorkDate;
  cmdMakeWorkDate.SetCaption("Work Date: " + ShortDate(date));
  ShowDay(date);
  context_.GoToWorkingFolder();
  WriteWorkDate(context_.channels, date);
}

}  // namespace marlowbeck
