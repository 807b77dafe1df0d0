#include <algorithm>

#include "session/forfeits_choice.h"
#include "stats/frmPMenu.h"
#include "ui/grid_rows.h"

namespace marlowbeck {

void frmPMenu::CalcProg() {
  context_.GoToWorkingFolder();
  progressive_ = reports_.CalcProg(session_, context_.channels);
}

void frmPMenu::GridProg() {
  if (!fraWkProg.Visible()) return;
  grdProg.Hide();
  const bool included = ReadForfeitsIncluded(context_);
  (included ? optFFyes : optFFno).SetValue(true);
  lblProgInfo.SetCaption(session_.Team +
                         "  Progressive details to:  " + ShortDate(session_.WorkDate));
  const auto scored = [](const ProgressiveRow& row) { return row.agg > 0; };
  const auto shown = std::count_if(progressive_.begin(), progressive_.end(), scored);
  if (shown == 0) return;
  grdProg.SetSize(static_cast<int>(shown) + 1, 10);
  SetRow<10>(grdProg, 0,
             {"\rPlayer", "\rAgg", "\rShots", "\r180's", "\r100's", "High\rScore", "\rPegs",
              "High\rPeg", "\rGms", "\rAvg"});
  int place = 0;
  for (const ProgressiveRow& row : progressive_) {
    if (!scored(row)) continue;
    SetRow(grdProg, ++place,
           ProgressiveCells(row, optFFno.Value() ? Forfeits::LeftOut : Forfeits::Counted));
  }
  fraFFYesNo.SetVisible(std::any_of(progressive_.begin(), progressive_.end(),
                                    [](const ProgressiveRow& row) { return row.forfeits > 0; }));
  grdProg.Show();
}

void frmPMenu::optFFyes_Click() {
  optFFyes.SetValue(true);
  KeepForfeitsChoice(true);
}

void frmPMenu::optFFno_Click() {
  optFFno.SetValue(true);
  KeepForfeitsChoice(false);
}

void frmPMenu::KeepForfeitsChoice(bool included) {
  WriteForfeitsIncluded(context_, included);
  GridProg();
}

}  // namespace marlowbeck
