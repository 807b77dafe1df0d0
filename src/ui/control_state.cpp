#include "ui/control_state.h"

#include "ui/controls.h"
#include "ui/disk_lists.h"

namespace marlowbeck {
namespace {

void AddLines(ControlState& state, const LineHolder& list) {
  state.lines = list.Lines();
  state.index = list.Index();
}

void AddList(ControlState& state, const ListBox& list) {
  AddLines(state, list);
  if (list.Multi()) state.selected = std::vector<int>(list.Marked().begin(), list.Marked().end());
}

void AddGrid(ControlState& state, const Grid& grid) {
  auto& cells = state.cells.emplace(static_cast<std::size_t>(grid.Rows()));
  for (int row = 0; row < grid.Rows(); ++row) {
    for (int col = 0; col < grid.Cols(); ++col) {
      cells[static_cast<std::size_t>(row)].push_back(grid.Cell(row, col));
    }
  }
  state.cols = grid.Cols();
  state.row = grid.Row();
  state.col = grid.Col();
}

/// The fields that only some kinds have.
void AddFieldsOfKind(ControlState& state, const Control& control) {
  switch (control.GetKind()) {
    case Kind::Command:
    case Kind::Label:
    case Kind::Panel:
    case Kind::Picture:
    case Kind::Menu:
      state.caption = control.Caption();
      return;
    case Kind::Text:
      state.text = static_cast<const TextBox&>(control).Text();
      state.locked = static_cast<const TextBox&>(control).Locked();
      return;
    case Kind::Check:
      state.caption = control.Caption();
      state.value = static_cast<const CheckBox&>(control).Value();
      return;
    case Kind::Option:
      state.caption = control.Caption();
      state.value = static_cast<const OptionButton&>(control).Value();
      return;
    case Kind::Folders:
    case Kind::Files:
      state.path = static_cast<const PathList&>(control).Path();
      [[fallthrough]];
    case Kind::Drives:
    case Kind::List:
      return AddList(state, static_cast<const ListBox&>(control));
    case Kind::Combo:
      AddLines(state, static_cast<const ComboBox&>(control));
      state.text = static_cast<const ComboBox&>(control).Text();
      state.locked = static_cast<const ComboBox&>(control).Locked();
      return;
    case Kind::Grid:
      return AddGrid(state, static_cast<const Grid&>(control));
    case Kind::Date:
      state.date = static_cast<const DatePicker&>(control).Value();
      return;
    case Kind::Progress: {
      const auto& bar = static_cast<const ProgressBar&>(control);
      state.progress = ProgressState{bar.Min(), bar.Max(), bar.Value()};
      return;
    }
  }
}

}  // namespace

ControlState StateOf(const Control& control) {
  ControlState state;
  state.name = control.Name();
  state.kind = control.GetKind();
  state.visible = control.Visible();
  state.shown = control.Shown();
  state.enabled = control.EnabledThroughout();
  state.color = control.GetMeaning();
  AddFieldsOfKind(state, control);
  return state;
}

}  // namespace marlowbeck
