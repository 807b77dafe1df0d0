#include "results/frmResults.h"

#include <utility>

#include "data/competition.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kSortFile = "resfile.qz3";
constexpr int kHelpTopic = 140;
constexpr int kHelpTopicOfAdding = 255;

}  // namespace

frmResults::frmResults(Screens& screens, const Context& context)
    : Screen(screens, "frmResults", "[Marlowbeck]  Results Entry"),
      scores(fraResults, context),
      context_(context) {
  cboResGrade.Click = [this] { cmdGotoResults.SetFocus(); };
  Cal.Change = [this] { Cal_Change(); };
  cmdGotoResults.Click = [this] { StartScores(); };
  cmdExit.Click = [this] { cmdExit_Click(); };
  cmdHelp1.Click = [this] { OpenHelp(kHelpTopic); };

  cboResTeam.Click = [this] { cboResTeam_Click(); };
  cboOpp.Click = [this] { cboOpp_Click(); };
  lstResPlayers.Click = [this] { lstResPlayers_Click(); };
  lstFinished.Click = [this] { lstFinished_Click(); };
  lstResPlayers.SetPicksOnEnter(true);
  lstFinished.SetPicksOnEnter(true);

  cmdChangeGrade.Click = [this] { cmdChangeGrade_Click(); };
  cmdLeaveResults.Click = [this] { InScreens().Unload(*this); };
  cmdFirst.Click = [this] { cmdFirst_Click(); };
  cmdPrevDate.Click = [this] { cmdPrevDate_Click(); };
  cmdNextDate.Click = [this] { cmdNextDate_Click(); };
  cmdLast.Click = [this] { cmdLast_Click(); };
  cmdMakeWorkDate.Click = [this] { cmdMakeWorkDate_Click(); };

  scores.txtAgg.LostFocus = [this] { txtAgg_LostFocus(); };
  scores.txtShots.LostFocus = [this] { scores.ShowAverage(); };
  scores.txtHowMany180s.LostFocus = [this] { CheckCenturies(); };
  for (TextBox& peg : scores.txtP) peg.LostFocus = [this, &peg] { CheckPeg(peg); };
  chkFF.Click = [this] { chkFF_Click(); };
  cmdSave.Click = [this] { cmdSave_Click(); };
  cmdClearRes.Click = [this] { cmdClearRes_Click(); };
  cmdResultsCancel.Click = [this] { RePick(); };
  EdCal.Change = [this] { EdCal_Change(); };
  cmdEdDelete.Click = [this] { cmdEdDelete_Click(); };

  panChangeOpp.Click = [this] { panChangeOpp_Click(); };
  cmdSaveOp.Click = [this] { cmdSaveOp_Click(); };
  SSCommand3.Click = [this] { BackToTeams(); };
  panAddNames.Click = [this] { panAddNames_Click(); };
  cmdAddSave0.Click = [this] { cmdAddSave0_Click(); };
  cmdAddCancel0.Click = [this] { cmdAddCancel0_Click(); };
  SSCommand1.Click = [this] { OpenHelp(kHelpTopicOfAdding); };

  txtDayName.SetLocked(true);
  txtDayName.SetTabStop(false);
  fraResults.SetMeaning(Meaning::Black);
  Defaults = {&cmdSave, &cmdAddSave0, &cmdSaveOp, &cmdGotoResults};
  Cancels = {&cmdResultsCancel, &cmdAddCancel0, &SSCommand3, &cmdExit};
}

void frmResults::Load() {
  for (Label& header : lblHeader) header.Hide();
  for (Panel* panel : {&fraTeams, &panResAddPlayer, &fraReDoOpp}) panel->Hide();
  Start();
}

void frmResults::Activate() {
  // What another screen has left in it is no failed check of this one.
  context_.session.Flag = 0;
  if (const auto left = std::exchange(away_from_, std::nullopt)) StartAgain(*left);
}

void frmResults::HelpKey() { OpenHelp(SSCommand1.Live() ? kHelpTopicOfAdding : kHelpTopic); }

void frmResults::OpenHelp(int topic) { context_.platform.help.Open("qz1.HLP", topic); }

void frmResults::cmdExit_Click() {
  if (fraTeams.Visible()) {
    StartScores();
  } else {
    InScreens().Unload(*this);
  }
}

void frmResults::Unload() {
  const char* next = "frmDB";
  try {
    if (IsOutOfOrder() && InScreens().Knows("frmSort")) {
      NameFileToSort();
      next = "frmSort";
    }
  } catch (const RunTimeError&) {
    // The person must not be left without a screen.
    context_.channels.AbandonAll();
    InScreens().Show("frmDB");
    throw;
  }
  InScreens().Show(next);
}

bool frmResults::IsOutOfOrder() {
  OpenResultSFile(context_.session, context_.channels);
  if (context_.session.ResultsFile.empty()) return false;
  bool ascending = true;
  Date before;
  ForEachResult([&](const ResultView& result, int number) {
    ascending = number == 1 || !(result.GameDate() < before);
    before = result.GameDate();
    return ascending;
  });
  context_.channels.CloseAll();
  return !ascending;
}

void frmResults::NameFileToSort() {
  context_.GoToWorkingFolder();
  WriteOneString(context_.channels, kSortFile, context_.session.ResultsFile);
}

void frmResults::ForEachResult(const std::function<bool(const ResultView&, int)>& visit) {
  const int total = context_.channels.RecordCount(Channel::Results);
  if (total == 0) record_ = {};
  context_.channels.ForEachRecord(Channel::Results, [&](Bytes bytes, int number) {
    const bool go_on = visit(ResultView(bytes), number);
    if (!go_on || number == total) record_ = DecodeResult(bytes);
    return go_on;
  });
}

void frmResults::ReadRecord(int number) {
  ResultBytes bytes{};
  context_.channels.Get(Channel::Results, number, bytes);
  record_ = DecodeResult(bytes);
}

}  // namespace marlowbeck
