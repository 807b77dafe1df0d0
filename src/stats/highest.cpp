#include "data/competition.h"
#include "data/text.h"
#include "session/messages.h"
#include "session/shared_procedures.h"
#include "stats/frmPMenu.h"
#include "stats/grade_reports.h"

namespace marlowbeck {
namespace {

constexpr int kFirstChoiceWithoutHighest = 3;
constexpr int kHighestHelpTopic = 265;
constexpr int kMostHelpTopic = 305;
constexpr int kFirstFigures = 3;

}  // namespace

void frmPMenu::WireHighest() {
  cmdHcap.Hide();
  int choice = 0;
  for (Picture* entry : {&Image1, &Image3, &Image2, &Image4, &Image5, &Image9}) {
    entry->Click = [this, choice, entry] { OpenList(choice, entry->Caption()); };
    ++choice;
  }
  cboHiGrade.Click = [this] { ListGrades(); };
  lstHiDates.Click = [this] { lstHiDates_Click(); };
  cmdProgress.Click = [this] { cmdProgress_Click(); };
  cmdExitHi.Click = [this] { cmdExitHi_Click(); };
  cmdHiMenu.Click = [this] { cmdHiMenu_Click(); };
}

bool frmPMenu::IsAverages() const {
  return session_.ReportChoice == static_cast<int>(HighestOf::Averages);
}

void frmPMenu::OpenList(int choice, const std::string& name) {
  session_.ReportChoice = choice;
  if (IsAverages()) cmdHcap.Hide();
  WorkScreen();
  SetTitle("[Marlowbeck] " + name);
  fraPikHi.SetCaption(name);
  DoHighest();
}

void frmPMenu::DoHighest() {
  fraMenu.Hide();
  // What an earlier visit listed is nothing to pick from where there is no grade any more.
  for (Command* command : {&cmdProgress, &cmdCombine}) command->Hide();
  lstHiDates.Clear();
  OfferList(false);
  // What other screens and reports leave in these is neither a progressive list nor rows of one.
  session_.Flag = 0;
  session_.RowCount = 0;
  fraPikHi.Show();
  fraFontPick.Show();
  picPrintHI.Hide();
  GetGrades(context_, cboHiGrade);
  // Without a grade there is no season to have a title.
  if (cboHiGrade.Count() == 0) return;
  try {
    cboHiGrade.SetIndex(0);
  } catch (const RunTimeError&) {
    // Another date or grade can be picked, whatever became of the first list.
    context_.channels.AbandonAll();
    ShowListPanel();
    throw;
  }
  ShowListPanel();
}

/// What stands around a list, once the first one has been tried.
void frmPMenu::ShowListPanel() {
  fraPikHi.Show();
  if (IsAverages() && cboHiGrade.Count() > 1) {
    NameCombine();
    cmdCombine.Show();
  }
  GetSeason();
  lblSeason.Show();
}

void frmPMenu::OfferList(bool any) {
  cmdHiPrint.SetEnabled(any);
  cmdClipHi.SetEnabled(any);
}

void frmPMenu::ListGrades() {
  session_.Grade = Trimmed(cboHiGrade.Text());
  // KEPT: here too the season's title stays that of the first grade when another one is picked, on
  // the screen and in a copy for a spreadsheet; a repair would read the title of each grade here.
  NameGradeFiles(session_);
  GetHiDates();
  lstHiDates.Clear();
  std::vector<std::string> lines;
  for (const Date date : session_.TeamDates) lines.push_back(ShortDate(date));
  for (const std::string& line : lines) lstHiDates.AddLine(line);
  OfferList(!lines.empty());
  if (lines.empty()) {
    fraPikHi.Hide();
    Warning(context_, "No entries were found to list the " + session_.Grade + " " +
                          Trim(fraPikHi.Caption()) + ".    ");
    return;
  }
  fraPikHi.Show();
  lstHiDates.SetIndex(lstHiDates.Count() - 1);
}

void frmPMenu::GetHiDates() { marlowbeck::GetHiDates(session_, context_.channels); }

void frmPMenu::lstHiDates_Click() {
  session_.WorkDate = DateFromText(lstHiDates.Line(lstHiDates.Index()));
  cmdProgress.SetCaption(kProgressive);
  cmdHcap.Hide();
  if (IsAverages()) NameCombine();
  ListDateOnly();
}

void frmPMenu::ListDateOnly() {
  ClearGridHi();
  CalcHi();
  cmdProgress.Show();
  lblHi[0].SetCaption(" " + fraPikHi.Caption() + "  ");
  lblHi[1].SetCaption(" " + session_.Grade + "  " +
                      "  played on:  " + ShortDate(session_.WorkDate) + " ");
  GridHi();
}

void frmPMenu::CalcHi() {
  fraHi.Hide();
  context_.GoToWorkingFolder();
  marlowbeck::CalcHi(session_, context_.channels);
}

void frmPMenu::CalcHiProg() {
  context_.GoToWorkingFolder();
  marlowbeck::CalcHiProg(session_, context_.channels);
}

void frmPMenu::cmdProgress_Click() {
  if (cmdProgress.Caption() == kProgressive) {
    ListUpToDate();
  } else {
    session_.Flag = 0;
    cmdProgress.SetCaption(kProgressive);
    ListDateOnly();
    cmdHcap.Hide();
  }
  lstHiDates.SetFocus();
}

void frmPMenu::ListUpToDate() {
  RefillList([this] {
    session_.Flag = 1;
    CalcHiProg();
    GridHi();
  });
  if (IsAverages()) {
    cmdHcap.Enable();
    cmdHcap.Show();
  }
  const std::string date = ShortDate(session_.WorkDate);
  lblHi[0].SetCaption(" PROGRESSIVE " + fraPikHi.Caption() + " ");
  lblHi[1].SetCaption(" " + session_.Grade + "  up to:  " + date + " ");
  cmdProgress.SetCaption(date + " Only");
}

/// A list that cannot be worked out leaves none on show, rather than the one before it.
void frmPMenu::RefillList(const Handler& refill) {
  try {
    refill();
  } catch (const RunTimeError&) {
    session_.Flag = 0;
    fraHi.Hide();
    throw;
  }
}

void frmPMenu::ShowNoneFound() {
  lblNoneFound.SetCaption("  No " + fraPikHi.Caption() + " found for " + session_.Grade +
                          "  \r  On " + ShortDate(session_.WorkDate) + ". ");
  lblNoneFound.Show();
}

void frmPMenu::GridHi() {
  const bool progressive = session_.Flag == 1;
  if (session_.RowCount == 0) {
    fraHi.Hide();
    ShowNoneFound();
    session_.Flag = 0;
    return;
  }
  lblNoneFound.Hide();
  const auto rows = ReadHighestFile(session_, context_.channels);
  const int cols = progressive ? 5 : 4;
  grdHI.SetFiguresFrom(kFirstFigures);
  grdHI.SetSize(session_.RowCount + 1, cols);
  const std::array<std::string, 5> headings = {"No.", "Player", "Team", session_.HiLabel, "Gms"};
  for (int col = 0; col < cols; ++col)
    grdHI.SetCell(0, col, headings[static_cast<std::size_t>(col)]);
  int place = 0;
  for (const HighestRow& row : rows) {
    ++place;
    const auto cells = HighestCells(place, row, static_cast<HighestOf>(session_.ReportChoice));
    for (int col = 0; col < cols; ++col) {
      grdHI.SetCell(place, col, cells[static_cast<std::size_t>(col)]);
    }
  }
  session_.Flag = 0;
  fraHi.Show();
}

void frmPMenu::ClearGridHi() {
  for (int row = 1; row < grdHI.Rows(); ++row) {
    for (int col = 0; col < grdHI.Cols(); ++col) grdHI.SetCell(row, col, "");
  }
}

void frmPMenu::cmdExitHi_Click() {
  context_.platform.help.Open("qz1.HLP", session_.ReportChoice < kFirstChoiceWithoutHighest
                                             ? kHighestHelpTopic
                                             : kMostHelpTopic);
}

void frmPMenu::cmdHiMenu_Click() {
  cmdReDoAvgs.Hide();
  FraCombineOptions.Hide();
  cmdCombine.Show();
  lstHiDates.Enable();
  cboHiGrade.Enable();
  StartScreen();
}

}  // namespace marlowbeck
