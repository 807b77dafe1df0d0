// Another opposition for a whole date, in every result of the team that is entered already.

#include "data/competition.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "results/opposition_swap.h"
#include "session/messages.h"

namespace marlowbeck {

void frmResults::panChangeOpp_Click() {
  cboReDoOpp.Clear();
  for (const std::string& team : cboOpp.Lines()) cboReDoOpp.AddLine(Trimmed(team));
  if (cboReDoOpp.Count() == 0) return BackToTeams();
  cboReDoOpp.SetIndex(0);
  fraReDoOpp.SetCaption(context_.session.Team);
  fraReDoOpp.Show();
  fraTeams.Hide();
  lblReDoOpp.SetCaption(
      "Choose another Opposition Team other than " + Trim(cboOpp.Text()) +
      ", from the drop down list below. Your selection will be changed for all results on: " +
      ShortDate(context_.session.WorkDate));
}

void frmResults::BackToTeams() {
  fraTeams.Show();
  fraReDoOpp.Hide();
}

void frmResults::cmdSaveOp_Click() {
  const Session& session = context_.session;
  const std::string opposition = Trim(cboOpp.Text());
  const OppositionSwap swap{session.WorkDate, session.Team, Trim(cboReDoOpp.Text())};
  if (opposition == swap.opposition) return BackToTeams();
  if (const auto side = SideThatMeets(swap)) return RefuseSwap(swap, *side);
  if (AskToSwap(swap, opposition) != kAnswerYes) {
    // KEPT: a swap that is not wanted leaves the results file open until it is opened again; a
    // repair would close it here.
    return BackToTeams();
  }
  ChangeResults(swap);
  BackToTeams();
  ShowDay(session.WorkDate);
  Heading();
  UpdateTeamsInfo();
}

/// The team of the first result that makes the swap impossible. The results file stays open.
std::optional<std::string> frmResults::SideThatMeets(const OppositionSwap& swap) {
  std::optional<std::string> side;
  OpenResultSFile(context_.session, context_.channels);
  ForEachResult([&](const ResultView& result, int) {
    if (IsTakenBy(result, swap)) side = result.Team();
    return !side;
  });
  return side;
}

void frmResults::RefuseSwap(const OppositionSwap& swap, const std::string& side) {
  Warning(context_, Lines({swap.opposition + " and " + side,
                           "played on " + ShortDate(swap.date) + ". This change cannot be made."}));
  BackToTeams();
  context_.channels.CloseAll();
}

int frmResults::AskToSwap(const OppositionSwap& swap, const std::string& opposition) {
  return WarningYesNo(
      context_, Lines({"You are about to swap " + swap.opposition + " for " + opposition,
                       "as the opposition for " + swap.team + " on " + ShortDate(swap.date), "",
                       "Do you still want to make the change?"}));
}

/// All results of the date change together or none does.
void frmResults::ChangeResults(const OppositionSwap& swap) {
  const std::string& file = context_.session.ResultsFile;
  OpenResultSFile(context_.session, context_.channels);
  context_.channels.CloseAll();
  std::string results = context_.channels.ReadWhole(file);
  if (SwapOpposition(results, swap)) context_.channels.ReplaceWhole(file, results);
}

}  // namespace marlowbeck
