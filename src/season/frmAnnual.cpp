#include "season/frmAnnual.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {

frmAnnual::frmAnnual(Screens& screens, const Context& context)
    : Screen(screens, "frmAnnual", "[Marlowbeck]  Season Report"),
      context_(context),
      session_(context.session) {
  grdAnnual.SetFiguresFrom(2);
  grdTotals.SetFiguresFrom(0);
  WirePicks();
  WirePrinting();
  cmdClipAnnual.Click = [this] { cmdClipAnnual_Click(); };
  cmdPlrResExit.Click = [this] { context_.platform.help.Open("qz1.HLP", 0); };
  cmdCancelAnn.Click = [this] { InScreens().Unload(*this); };
  Cancels = {&cmdBothCancelHI, &cmdCancelAnn};
  Helps = {&cmdPlrResExit};
}

void frmAnnual::WirePicks() {
  cboGrades.Click = [this] { cboGrades_Click(); };
  cboTeams.Click = [this] { cboTeams_Click(); };
  lstPlayers.Click = [this] { lstPlayers_Click(); };
  optFFyes.Click = [this] { KeepForfeitsChoice(true); };
  optFFno.Click = [this] { KeepForfeitsChoice(false); };
}

void frmAnnual::Load() {
  picPrinter.Hide();
  lblNoneFound.Hide();
  GridsOFF();
  font_box_.GetFont();
  ReadFileName(context_);
  GetGrades();
  OfferAll();
}

/// The date in hand is kept on disk alone from here on.
void frmAnnual::Unload() {
  try {
    if (session_.WorkDate.IsSet()) {
      context_.GoToWorkingFolder();
      WriteWorkDate(context_.channels, session_.WorkDate);
      session_.WorkDate = {};
    }
  } catch (const RunTimeError&) {
    // The reports come back all the same, or nobody could go on.
    context_.channels.AbandonAll();
    InScreens().Show("frmPMenu");
    throw;
  }
  InScreens().Show("frmPMenu");
}

void frmAnnual::GetGrades() {
  marlowbeck::GetGrades(context_, cboGrades);
  if (cboGrades.Count() > 0) cboGrades.SetIndex(0);
}

void frmAnnual::cboGrades_Click() {
  FileNames();
  GridsOFF();
  ListNobody();
  GetTeams();
  if (cboTeams.Count() == 0) GetPlayers();
}

void frmAnnual::FileNames() {
  session_.Grade = Trim(cboGrades.Text());
  NameGradeFiles(session_);
}

/// Selecting the first team lists its players.
void frmAnnual::GetTeams() {
  marlowbeck::GetTeams(context_, session_.Grade, cboTeams);
  if (cboTeams.Count() > 0) cboTeams.SetIndex(0);
}

void frmAnnual::cboTeams_Click() {
  GridsOFF();
  GetPlayers();
}

/// Where no players can be listed, none of the grade or team before can be picked.
void frmAnnual::ListNobody() {
  lstPlayers.Clear();
  ids_.clear();
  lblNoneFound.Hide();
  TellCount();
}

void frmAnnual::TellCount() {
  lblHmP.SetCaption("Players (" + std::to_string(lstPlayers.Count()) + ")");
}

void frmAnnual::GetPlayers() {
  ListNobody();
  session_.Team = Trim(cboTeams.Text());
  const SeasonResults season(session_, context_.channels);
  for (const auto& player : season.PlayersOf(session_.Grade, session_.Team)) {
    lstPlayers.AddLine(player.line);
    ids_.push_back(player.id);
  }
  TellCount();
  if (lstPlayers.Count() > 0) return;
  lblNoneFound.SetCaption("  No results found for: \r " + session_.Team + ",  " + session_.Grade +
                          ".  ");
  lblNoneFound.Show();
}

void frmAnnual::lstPlayers_Click() {
  CalcAnnual();
  FillGrid();
  OfferAll();
}

}  // namespace marlowbeck
