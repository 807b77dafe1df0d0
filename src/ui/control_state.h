#pragma once

#include <optional>
#include <string>
#include <vector>

#include "data/date.h"
#include "ui/control.h"

namespace marlowbeck {

struct ProgressState {
  int min = 0;
  int max = 0;
  int value = 0;
  friend bool operator==(const ProgressState&, const ProgressState&) = default;
};

/// What can be seen of a control, in the terms of every face: the fields that its kind has are set,
/// the others empty. A model and the widget that shows it have equal states after every event.
struct ControlState {
  std::string name;
  Kind kind = Kind::Panel;
  bool visible = false;  ///< its own
  bool shown = false;    ///< it and all that holds it are visible
  bool enabled = false;  ///< it and all that holds it are enabled
  Meaning color = Meaning::None;

  std::optional<std::string> caption;
  std::optional<std::string> text;
  std::optional<bool> locked;
  std::optional<bool> value;
  std::optional<std::vector<std::string>> lines;
  std::optional<int> index;
  std::optional<std::vector<int>> selected;  ///< only where several lines can be marked
  std::optional<std::string> path;
  std::optional<std::vector<std::vector<std::string>>> cells;
  std::optional<int> cols;
  std::optional<int> row;
  std::optional<int> col;
  std::optional<Date> date;
  std::optional<ProgressState> progress;

  friend bool operator==(const ControlState&, const ControlState&) = default;
};

[[nodiscard]] ControlState StateOf(const Control& control);

}  // namespace marlowbeck
