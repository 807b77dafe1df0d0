#include "data/text.h"
#include "print/tabbed_text.h"
#include "session/messages.h"
#include "stats/frmPMenu.h"

namespace marlowbeck {
namespace {

using LastTab = TabbedText::LastTab;

/// The rows of a grid from one on, as it holds them, whether it is seen or not.
void AddRows(TabbedText& text, const Grid& grid, int first, LastTab last_tab) {
  for (int row = first; row < grid.Rows(); ++row) {
    std::vector<std::string> cells;
    cells.reserve(static_cast<std::size_t>(grid.Cols()));
    for (int col = 0; col < grid.Cols(); ++col) cells.push_back(grid.Cell(row, col));
    text.Row(cells, last_tab);
  }
}

// KEPT: the boxes say that the clipboard will be cleared, and nothing clears it; a repair would
// leave the note out.
constexpr const char* kNote =
    "Note: When you leave this section,    \rthe Clipboard will be cleared !";

}  // namespace

void frmPMenu::WireCopying() {
  cmdClipWeek.Click = [this] { cmdClipWeek_Click(); };
  cmdClipHi.Click = [this] { cmdClipHi_Click(); };
}

void frmPMenu::cmdClipWeek_Click() {
  context_.platform.clipboard.Clear();
  GetSeason();
  const auto& games = session_.GameNames;
  TabbedText text;
  text.Line(session_.AssociationName).Line(Trim(session_.SeasonDescription));
  text.Line(Trim(lblOpp.Caption())).Line(Trim(lblDT.Caption()));
  text.Row(
      {"Player", "Agg", "Shots", "180's", "100's", "H/Scr", games[0], games[1], games[2], "Avg"},
      LastTab::No);
  AddRows(text, grdWeek, 1, LastTab::No);
  text.Line({}).Line(Trim(lblProgInfo.Caption()));
  text.Row({"Player", "Agg", "Shots", "180's", "100's", "H/Scr", "Pegs", "Hi/Peg", "Games", "Avg"},
           LastTab::No);
  AddRows(text, grdProg, 1, LastTab::No);
  context_.platform.clipboard.SetText(text.Text());
  GoodMessage(
      context_,
      Lines({"Players results for " + Trim(lblProgInfo.Caption()) + "    ",
             Trim(lblDT.Caption()) + "    ", "(including their progressive results),    ",
             "have been copied to the clipboard    ", "and can now be pasted as text into your    ",
             "favourite spreadsheet or wordprocessor.    ", "", kNote}));
}

void frmPMenu::cmdClipHi_Click() {
  if (ListedRows() == 0) return;
  context_.platform.clipboard.Clear();
  TabbedText text;
  text.Line(session_.AssociationName).Line(Trim(session_.SeasonDescription));
  text.Line(Trim(lblHi[0].Caption())).Line(Trim(lblHi[1].Caption()));
  AddRows(text, grdHI, 0, LastTab::Yes);
  context_.platform.clipboard.SetText(text.Text());
  GoodMessage(context_, Lines({Trim(lblHi[0].Caption()) + "    ", Trim(lblHi[1].Caption()) + "    ",
                               "have been copied to the clipboard    ",
                               "and can now be pasted as text into your    ",
                               "favourite spreadsheet or wordprocessor.    ", "", kNote}));
}

}  // namespace marlowbeck
