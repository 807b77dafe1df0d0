#include "stats/frmPMenu.h"
#include "stats/grade_reports.h"
#include "ui/grid_rows.h"

namespace marlowbeck {
namespace {

constexpr int kColumns = 6;
constexpr int kFirstFigures = 4;

}  // namespace

void frmPMenu::WireCombined() {
  cmdCombine.Click = [this] { cmdCombine_Click(); };
  cmdReDoAvgs.Click = [this] { cmdReDoAvgs_Click(); };
  cmdHcap.Click = [this] { cmdHcap_Click(); };
  for (OptionButton* option : {&optCombineAvg, &optCombineAlpha}) {
    option->Click = [this, option] { PickCombinedOrder(*option); };
  }
}

void frmPMenu::NameCombine() {
  cmdCombine.SetCaption("Combine ALL Grades\rUp to: " + ShortDate(session_.WorkDate));
}

void frmPMenu::cmdCombine_Click() {
  // KEPT: whether there is anything to combine is told by the list of the one grade that is on
  // show; a repair would look at the list of all grades.
  const bool any = session_.RowCount != 0;
  CombineStart();
  if (!any) return;
  RefillList([this] {
    CombineAV();
    CombineSort();
    CombineShow();
  });
}

void frmPMenu::CombineStart() {
  if (session_.RowCount == 0) return ShowNoneFound();
  lblNoneFound.Hide();
  lblHi[0].SetCaption("Averages for All Grades up to");
  lblHi[1].SetCaption(ShortDate(session_.WorkDate));
  for (Command* command : {&cmdProgress, &cmdHcap, &cmdCombine}) command->Hide();
  cmdReDoAvgs.SetCaption("Return to:  " + session_.Grade);
  cmdReDoAvgs.Show();
  optCombineAvg.SetValue(true);
  lstHiDates.Disable();
  cboHiGrade.Disable();
}

void frmPMenu::CombineAV() {
  context_.GoToWorkingFolder();
  marlowbeck::CombineAV(session_, context_.channels, cboHiGrade.Lines());
}

void frmPMenu::CombineSort() {
  context_.GoToWorkingFolder();
  marlowbeck::CombineSort(
      session_, context_.channels,
      optCombineAvg.Value() ? CombinedOrder::ByAverage : CombinedOrder::Alphabetical);
}

void frmPMenu::CombineShow() {
  const auto rows = ReadCombineFile(session_, context_.channels);
  grdHI.SetFiguresFrom(kFirstFigures);
  grdHI.SetSize(session_.RowCount + 1, kColumns);
  SetRow<kColumns>(grdHI, 0, {"No.", "Player", "Team", "Grade", "Gms", "Avg"});
  int place = 0;
  for (const CombinedRow& row : rows) {
    ++place;
    SetRow(grdHI, place, CombinedCells(place, row));
  }
  session_.Flag = 0;
  fraHi.Show();
  FraCombineOptions.Show();
  optCombineAvg.SetValue(true);
}

/// Pressed on; the release of the button selects it again, when the list has selected the other.
void frmPMenu::PickCombinedOrder(OptionButton& picked) {
  picked.SetValue(true);
  RefillList([this] {
    CombineSort();
    CombineShow();
  });
  picked.SetValue(true);
}

void frmPMenu::cmdReDoAvgs_Click() {
  cmdReDoAvgs.Hide();
  FraCombineOptions.Hide();
  NameCombine();
  cmdCombine.Show();
  lstHiDates.Enable();
  cboHiGrade.Enable();
  ListGrades();
}

}  // namespace marlowbeck
