#include "data/numbers.h"
#include "data/text.h"
#include "stats/frmPMenu.h"
#include "stats/handicap.h"

namespace marlowbeck {
namespace {

constexpr int kHelpTopic = 257;
constexpr int kAverageColumn = 3;
constexpr int kHandicapColumn = 5;

InputBoxRequest Question(const std::string& highest) {
  return {Lines({"It is recommended to use the Highest Average as the",
                 "MEAN AVERAGE. This will assign a ZERO handicap",
                 "to the Highest Average and assign a Handicap to all", "other averages.", "",
                 "Enter the MEAN AVERAGE."}),
          "Handicaps", highest, kHelpTopic};
}

/// Of every row below the heading, from the average as it is shown.
std::vector<std::string> HandicapsOf(const Grid& grid, double mean) {
  std::vector<std::string> handicaps;
  for (int row = 1; row < grid.Rows(); ++row) {
    handicaps.push_back(NumberText(HandicapOf(mean, Val(grid.Cell(row, kAverageColumn)))));
  }
  return handicaps;
}

}  // namespace

void frmPMenu::cmdHcap_Click() {
  context_.platform.sound.Beep();
  session_.MeanAverage =
      Val(context_.platform.boxes.Input(Question(grdHI.Cell(1, kAverageColumn))));
  if (session_.MeanAverage < 1) return;
  // All of them before the first is shown: one that has no room leaves the list as it was.
  const auto handicaps = HandicapsOf(grdHI, session_.MeanAverage);
  lblHi[0].SetCaption(" PROGRESSIVE " + fraPikHi.Caption() + " (With Handicaps)");
  grdHI.SetSize(grdHI.Rows(), kHandicapColumn + 1);
  grdHI.SetCell(0, kHandicapColumn, "H/cap");
  int row = 0;
  for (const std::string& handicap : handicaps) grdHI.SetCell(++row, kHandicapColumn, handicap);
  cmdHcap.Disable();
  lstHiDates.SetFocus();
}

}  // namespace marlowbeck
