#include "stats/frmPMenu.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kTitle = "[Marlowbeck] Reports";
constexpr int kWeeklyChoice = 6;
constexpr int kSeasonReportChoice = 7;
constexpr int kPegRatiosChoice = 8;
constexpr int kSearchChoice = 12;
constexpr int kSearchFromReports = 3;  // the Flag by which the search knows where to go back to
constexpr int kWeeklyHelpTopic = 245;

}  // namespace

frmPMenu::frmPMenu(Screens& screens, const Context& context)
    : Screen(screens, "frmPMenu", "[Marlowbeck]  Reports"),
      context_(context),
      session_(context.session) {
  imgBall.SetTabStop(false);
  WireMenu();
  WireWeekly();
  WireHighest();
  WireCombined();
  WirePrinting();
  WireListPrinting();
  WireCopying();
  Defaults = {&cmdBothOK, &cmdBothOKHI};
  Cancels = {&cmdBothCancel, &cmdBothCancelHI, &cmdCancelWK, &cmdHiMenu, &Image10};
  Helps = {&cmdWeekHelp, &cmdPlrResExit, &cmdExitHi};
}

void frmPMenu::WireMenu() {
  for (Picture* entry : Entries()) {
    entry->MouseMove = [this, entry] { PointAt(*entry); };
  }
  fraMenu.MouseMove = [this] { PointAtNothing(); };
  Image6.Click = [this] { Image6_Click(); };
  Image7.Click = [this] { OpenReport(kSeasonReportChoice, "frmAnnual"); };
  Image8.Click = [this] { OpenReport(kPegRatiosChoice, "frmPegRatio"); };
  Image12.Click = [this] { Image12_Click(); };
  Image10.Click = [this] { InScreens().Unload(*this); };
}

void frmPMenu::WireWeekly() {
  cboResGrade.Click = [this] { cboResGrade_Click(); };
  cboResTeam.Click = [this] { cboResTeam_Click(); };
  lstAllDates.Click = [this] { FillGrids(); };
  lstAllDates.KeyUp = lstAllDates.Click;
  cmdChangeDate.Click = [this] { cmdChangeDate_Click(); };
  cmdPlrResExit.Click = [this] { context_.platform.help.Open("qz1.HLP", kWeeklyHelpTopic); };
  cmdCancelWK.Click = [this] { StartScreen(); };
  grdWeek.DoubleClick = [this] { grdWeek_DoubleClick(); };
  optFFyes.Click = [this] { optFFyes_Click(); };
  optFFyes.DoubleClick = optFFyes.Click;
  optFFno.Click = [this] { optFFno_Click(); };
}

std::array<Picture*, 11> frmPMenu::Entries() {
  return {&Image1, &Image3, &Image2, &Image4,  &Image5, &Image9,
          &Image6, &Image7, &Image8, &Image12, &Image10};
}

void frmPMenu::Load() {
  StartScreen();
  context_.GoToWorkingFolder();
  context_.channels.CloseAll();
  font_box_.GetFont();
  GetPlayerFileName();
}

/// Another screen may have chosen another font.
void frmPMenu::Activate() { font_box_.AlignFontBox(); }

void frmPMenu::Unload() {
  try {
    if (session_.WorkDate.IsSet()) {
      context_.GoToWorkingFolder();
      WriteWorkDate(context_.channels, session_.WorkDate);
    }
  } catch (const RunTimeError&) {
    // The main menu comes back all the same, or nobody could go on.
    context_.channels.AbandonAll();
    InScreens().Show("frmDB");
    throw;
  }
  InScreens().Show("frmDB");
}

/// Once the panel of the lists has gone, nothing on the screen leads anywhere.
bool frmPMenu::AtDeadEnd() const {
  return !fraMenu.Visible() && !fraWeek.Visible() && !fraPikHi.Visible();
}

void frmPMenu::CloseButton() {
  if (AtDeadEnd()) return cmdHiMenu_Click();
  Screen::CloseButton();
}

void frmPMenu::Escape() {
  if (AtDeadEnd()) return cmdHiMenu_Click();
  Screen::Escape();
}

void frmPMenu::StartScreen() {
  fraFFYesNo.Hide();
  HideAll();
}

void frmPMenu::WorkScreen() { fraFFYesNo.Hide(); }

void frmPMenu::HideAll() {
  for (Control* control : std::initializer_list<Control*>{
           &lblSeason, &lblNoneFound, &picPrint, &picPrintHI, &fraFontPick, &lblFontInfo, &fraHi,
           &fraWkProg, &fraWeek, &fraPikHi, &cmdReDoAvgs, &FraCombineOptions, &imgBall}) {
    control->Hide();
  }
  fraMenu.Show();
  PointAtNothing();
  SetTitle(kTitle);
}

void frmPMenu::GetPlayerFileName() {
  try {
    ReadFileName(context_);
  } catch (const RunTimeError&) {
    // Nobody can tell what was open: it stays as it stands.
    context_.channels.AbandonAll();
  }
}

void frmPMenu::PointAt(Picture& entry) {
  for (Picture* other : Entries()) other->SetBordered(other == &entry);
  imgBall.SetBeside(entry);
  imgBall.Show();
}

void frmPMenu::PointAtNothing() {
  for (Picture* entry : Entries()) entry->SetBordered(false);
  imgBall.Hide();
}

void frmPMenu::Image6_Click() {
  session_.ReportChoice = kWeeklyChoice;
  WorkScreen();
  SetTitle("[Marlowbeck] Weekly Results");
  fraMenu.Hide();
  fraWeek.Show();
  fraFontPick.Show();
  // Last, so that another team can be picked when the first one's night cannot be shown.
  DoWeekly();
  // KEPT: on the way in the tables are shown though the first team may have no night; a repair
  // would leave them hidden.
  fraWkProg.Show();
}

void frmPMenu::Image12_Click() {
  const std::string surname = AskSurname(context_);
  if (surname.empty()) return;
  session_.ReportChoice = kSearchChoice;
  session_.SearchText = surname;
  session_.Flag = kSearchFromReports;
  GoTo("frmSearchPlayer");
}

void frmPMenu::OpenReport(int choice, std::string_view screen) {
  if (!InScreens().Knows(screen)) return;
  session_.ReportChoice = choice;
  GoTo(screen);
}

void frmPMenu::OpenDialog(std::string_view screen, const Handler& saved) {
  Screen* const dialog = InScreens().Load(screen);
  if (dialog == nullptr) return;
  dialog->Saved = saved;
  dialog->Closed = [this] {
    SetEnabled(true);
    InScreens().Show(Name());
  };
  SetEnabled(false);
  GoTo(screen);
}

void frmPMenu::GoTo(std::string_view screen) {
  if (!InScreens().Knows(screen)) return;
  InScreens().Hide(*this);
  InScreens().Show(screen);
}

}  // namespace marlowbeck
