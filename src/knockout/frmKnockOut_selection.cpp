// Who is in the knock-out: from the list of players into the table and back.

#include "data/competition.h"
#include "data/numbers.h"
#include "data/text.h"
#include "knockout/frmKnockOut.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

constexpr const char* kWorkFile = "KO.qz3";
constexpr int kColumns = 3;
constexpr int kNumber = 0;
constexpr int kPlayer = 1;
constexpr int kGrade = 2;

}  // namespace

void frmKnockOut::WireSelection() {
  grdKO.SetSize(kMostEntrants + 1, kColumns);
  grdKO.SetFiguresFrom(kColumns);
  lstAllPlayers.Click = [this] {
    cmdADD.SetEnabled(Selected() < kMostEntrants);
    cmdREMOVE.Disable();
  };
  grdKO.Click = [this] {
    cmdREMOVE.Enable();
    cmdADD.Disable();
  };
  const auto add = [this] {
    ButtonsOff();
    PutInGrid();
  };
  cmdADD.Click = add;
  lstAllPlayers.Entered = add;
  lstAllPlayers.DoubleClick = [this, add] {
    if (Selected() < kMostEntrants) add();
  };
  cmdREMOVE.Click = [this] {
    ButtonsOff();
    RemFromGrd();
  };
  grdKO.Entered = cmdREMOVE.Click;
  grdKO.DoubleClick = cmdREMOVE.Click;
  cmdALL.Click = [this] { cmdALL_Click(); };
  cmdSaveKO.Click = [this] { cmdSaveKO_Click(); };
  cmdOpen.Click = [this] { cmdOpen_Click(); };
}

void frmKnockOut::ButtonsOff() {
  cmdADD.Disable();
  cmdREMOVE.Disable();
}

int frmKnockOut::Selected() const { return static_cast<int>(Val(lblKONOP[3].Caption())); }

/// One beyond the last place when all are taken.
int frmKnockOut::FirstFreePlace() const {
  int row = 1;
  while (row <= kMostEntrants && !EntrantAt(row).IsFree()) ++row;
  return row;
}

Entrant frmKnockOut::EntrantAt(int row) const {
  return {grdKO.Cell(row, kPlayer), grdKO.Cell(row, kGrade)};
}

std::vector<Entrant> frmKnockOut::Entrants() const {
  std::vector<Entrant> entrants;
  for (int row = 1; row <= Selected(); ++row) entrants.push_back(EntrantAt(row));
  return entrants;
}

Places frmKnockOut::PlacesInGrid() const {
  Places places;
  int row = 0;
  for (Entrant& place : places) place = EntrantAt(++row);
  return places;
}

void frmKnockOut::PutAt(int row, const Entrant& entrant) {
  grdKO.SetCell(row, kPlayer, entrant.name);
  grdKO.SetCell(row, kGrade, entrant.grade);
}

void frmKnockOut::PutPlaces(const Places& places) {
  int row = 0;
  for (const Entrant& place : places) PutAt(++row, place);
}

void frmKnockOut::KOGridMT() {
  grdKO.SetCell(0, kNumber, "#");
  PutAt(0, {"Player", "Grade"});
  PutPlaces({});
  for (int row = 1; row <= kMostEntrants; ++row) grdKO.SetCell(row, kNumber, std::to_string(row));
}

void frmKnockOut::GetAssocPlayers() {
  available_.Clear();
  OpenFile(session_, context_.channels);
  lstAllPlayers.Clear();
  lstAllPlayers.SetCursor(0);
  KOGridMT();
  context_.channels.ForEachRecord(Channel::Players, [this](Bytes record, int) {
    const Entrant& player = available_.Add(PlayerView(record));
    if (grade_ == kAllGrades || player.grade == grade_) lstAllPlayers.AddLine(LineOf(player));
    total_available_ = lstAllPlayers.Count();
    lblKONOP[4].SetCaption(std::to_string(total_available_));
  });
  context_.channels.CloseAll();
  UpdateNOP();
}

/// What a grade that could not be listed leaves: nobody, and that is told, since the draw and the
/// print go by the numbers on show.
void frmKnockOut::ListNobody() {
  lstAllPlayers.Clear();
  total_available_ = 0;
  lblKONOP[4].SetCaption("0");
  UpdateNOP();
}

void frmKnockOut::UpdateNOP() {
  lblKONOP[0].SetCaption("Players NOT Selected");
  lblKONOP[1].SetCaption(std::to_string(lstAllPlayers.Count()));
  lblKONOP[2].SetCaption("Players Selected");
  lblKONOP[3].SetCaption(std::to_string(FirstFreePlace() - 1));
  cmdALL.SetEnabled(total_available_ <= kMostEntrants);
}

void frmKnockOut::WarnOfTooMany() {
  Warning(context_,
          Lines({"The MAXIMUM players allowed is 64.", "You can REMOVE players from the selected",
                 "list to make room for other players."}),
          Beep::First);
}

void frmKnockOut::PutInGrid() {
  const int line = lstAllPlayers.Index();
  if (line < 0) return;
  const int row = FirstFreePlace();
  if (row > kMostEntrants) return WarnOfTooMany();
  PutAt(row, available_.Behind(lstAllPlayers.Line(line)));
  lstAllPlayers.RemoveLine(line);
  UpdateNOP();
}

/// Nothing has been moved when the work file cannot be written.
void frmKnockOut::RemFromGrd() {
  const int row = grdKO.Row();
  const Entrant leaving = EntrantAt(row);
  if (row < 1 || grdKO.Col() != kPlayer || leaving.IsFree()) return;
  Places places = PlacesInGrid();
  places.at(static_cast<std::size_t>(row - 1)) = {};
  RefreshGrdKO(places);
  lstAllPlayers.AddLine(LineOf(leaving));
  UpdateNOP();
}

/// Shows places with their gaps closed up, in the same order.
void frmKnockOut::RefreshGrdKO(const Places& places) {
  context_.GoToWorkingFolder();
  context_.channels.OpenOutput(Channel::Side, kWorkFile, Keeping::Working);
  WriteWorkFile(context_.channels.Writer(Channel::Side), {places, grade_});
  context_.channels.Close(Channel::Side);
  context_.channels.OpenInput(Channel::Side, kWorkFile);
  const WorkingList read = ReadWorkFile(context_.channels.Reader(Channel::Side));
  context_.channels.Close(Channel::Side);
  PutPlaces({});
  int row = 0;
  for (const Entrant& place : read.places) {
    if (!place.IsFree()) PutAt(++row, place);
  }
  grade_ = read.grade;
}

void frmKnockOut::cmdALL_Click() {
  if (Selected() != 0) return;
  int row = 0;
  while (lstAllPlayers.Count() > 0 && row < kMostEntrants) {
    PutAt(++row, available_.Behind(lstAllPlayers.Line(0)));
    lstAllPlayers.RemoveLine(0);
  }
  UpdateNOP();
  if (lstAllPlayers.Count() > 0) WarnOfTooMany();
}

}  // namespace marlowbeck
