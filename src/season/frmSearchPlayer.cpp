#include "season/frmSearchPlayer.h"

#include <array>

#include "data/competition.h"
#include "data/text.h"
#include "print/tabbed_text.h"
#include "season/name_search.h"
#include "session/messages.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr int kFromSetup = 2;
constexpr int kFromReports = 3;
constexpr std::array<const char*, 4> kHeadings = {"Surname", "Given Name/s", "Team", "Grade"};
constexpr int kColumns = static_cast<int>(kHeadings.size());

}  // namespace

frmSearchPlayer::frmSearchPlayer(Screens& screens, const Context& context)
    : Screen(screens, "frmSearchPlayer", "Name Search"),
      context_(context),
      session_(context.session) {
  grdShow.SetFiguresFrom(kColumns);
  cmdClip.Click = [this] { cmdClip_Click(); };
  cmdAgain.Click = [this] {
    SearchInput();
    ClearGrid();
    ShowFound();
  };
  cmdExit.Click = [this] { InScreens().Unload(*this); };
  Cancels = {&cmdExit};
}

void frmSearchPlayer::Load() { ShowFound(); }

void frmSearchPlayer::Unload() {
  const char* opener = "frmDB";
  if (session_.Flag == kFromSetup) opener = "frmNames";
  if (session_.Flag == kFromReports) opener = "frmPMenu";
  InScreens().Show(opener);
}

/// Nothing typed keeps the text that was searched for last.
void frmSearchPlayer::SearchInput() {
  const std::string surname = AskSurname(context_);
  if (!surname.empty()) session_.SearchText = surname;
}

void frmSearchPlayer::ShowFound() {
  grdShow.SetSize(1, kColumns);
  for (int column = 0; column < kColumns; ++column) {
    grdShow.SetCell(0, column, kHeadings[static_cast<std::size_t>(column)]);
  }
  GetPlayers();
}

void frmSearchPlayer::GetPlayers() {
  session_.RowCount = 0;
  lblInfo.SetCaption("");
  OpenFile(session_, context_.channels);
  // Without an open competition there is nobody to be found.
  if (session_.PlayerFile.empty()) return TellCount();
  NameSearch search(session_.SearchText);
  context_.channels.ForEachRecord(Channel::Players, [&](Bytes record, int) { search.Add(record); });
  context_.channels.CloseAll();
  session_.RowCount = search.Count();
  grdShow.SetSize(session_.RowCount + 1, kColumns);
  for (int row = 1; row <= search.Count(); ++row) {
    int column = 0;
    for (const auto cell : search.Row(row - 1)) grdShow.SetCell(row, column++, cell);
  }
  TellCount();
}

void frmSearchPlayer::TellCount() {
  const int found = session_.RowCount;
  grdShow.SetVisible(found > 0);
  cmdClip.SetVisible(found > 0);
  if (found == 0) {
    lblInfo.SetCaption("Name/s containing " + session_.SearchText + " not found !");
    return;
  }
  lblInfo.SetCaption("Found " + std::to_string(found) + (found == 1 ? " name" : " names") +
                     " containing: " + session_.SearchText);
}

void frmSearchPlayer::ClearGrid() {
  for (int row = 0; row < grdShow.Rows(); ++row) {
    for (int column = 0; column < grdShow.Cols(); ++column) grdShow.SetCell(row, column, "");
  }
}

void frmSearchPlayer::cmdClip_Click() {
  context_.platform.clipboard.Clear();
  TabbedText text;
  for (int row = 0; row < grdShow.Rows(); ++row) {
    std::vector<std::string> cells;
    cells.reserve(kColumns);
    for (int column = 0; column < kColumns; ++column) {
      cells.push_back(Trim(grdShow.Cell(row, column)));
    }
    text.Row(cells, TabbedText::LastTab::Yes);
  }
  context_.platform.clipboard.SetText(text.Text());
  // KEPT: the box says that leaving clears the clipboard, which it does not; a repair would leave
  // those words out.
  GoodMessage(context_,
              Lines({"Your Search results   ", "have been copied to the clipboard    ",
                     "and can now be pasted as text into your    ",
                     "favourite spreadsheet or wordprocessor.    ", "",
                     "Note: When you leave this section,    ", "the Clipboard will be cleared !"}));
}

}  // namespace marlowbeck
