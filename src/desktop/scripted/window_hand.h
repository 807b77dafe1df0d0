#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "desktop/scripted/reach.h"
#include "desktop/windows.h"
#include "drive/face.h"

namespace marlowbeck {

[[nodiscard]] Outcome Refused(const Control& control, std::string_view why);
[[nodiscard]] Outcome OutOfReach(const Control& control);

/// Does a script's actions with mouse and keyboard on the windows, as far as a person could: what
/// cannot be seen or is grey is refused, by the look of the widgets alone.
class WindowHand {
 public:
  WindowHand(Windows& windows, const Boxes& boxes) : windows_(windows), boxes_(boxes) {}

  Outcome Perform(const Action& action);

 private:
  Outcome Dispatch(const Action& action);
  Outcome Click(Control& control);
  Outcome ClickMenu(const Control& control);
  Outcome DoubleClick(const Action& action);
  Outcome Type(Control& control, const std::string& text);
  Outcome Pick(Control& control, int line);
  Outcome PickTwice(Control& control, int line);
  Outcome PickInCombo(View& view, int line);
  Outcome PickInList(View& view, int line, Qt::KeyboardModifiers modifiers);
  Outcome Select(Control& control, const std::vector<int>& lines);
  Outcome Cell(Control& control, int row, int col);
  Outcome CellTwice(Control& control, int row, int col);
  Outcome PickDate(Control& control, Date date);
  Outcome Press(Key key);
  Outcome Strike(QWidget& keyboard, int code, Qt::KeyboardModifiers modifiers,
                 const QString& text = {});
  Outcome PressMnemonic(char letter);
  Outcome Focus(Control& control);
  Outcome Hover(Control& control);
  Outcome HoverScreen(const Screen& screen);
  Outcome CloseScreen(const Screen& screen);

  [[nodiscard]] View& ViewOf(const Control& control) const;
  [[nodiscard]] Outcome CheckLive(const Control& control) const;
  [[nodiscard]] Outcome CheckLive(const Screen& screen) const;
  [[nodiscard]] bool HasLine(const Control& control, int line) const;
  [[nodiscard]] bool HasCell(const Control& control, int row, int col) const;
  /// The control is still there for the second click of a double click, and answers to it.
  [[nodiscard]] bool TakesSecondClick(const Control& control) const;
  /// Where the pointer is brought to, once what has dropped down is closed; nothing out of reach.
  [[nodiscard]] std::optional<Place> Reach(View& view) const;
  [[nodiscard]] std::optional<Place> ReachBesideLines(View& view) const;
  /// How what was just done went.
  Outcome Taken();

  Windows& windows_;
  const Boxes& boxes_;
};

}  // namespace marlowbeck
