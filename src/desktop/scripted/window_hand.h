#pragma once

#include <QPoint>

#include "desktop/windows.h"
#include "drive/face.h"

namespace marlowbeck {

/// Does a script's actions with mouse and keyboard on the windows, as far as a person could: what
/// cannot be seen or is grey is refused, by the look of the widgets alone.
class WindowHand {
 public:
  WindowHand(Windows& windows, const Boxes& boxes) : windows_(windows), boxes_(boxes) {}

  Outcome Perform(const Action& action);

 private:
  struct Place {
    QWidget* widget = nullptr;  ///< what lies topmost there
    QPoint at;
  };

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
  void Strike(const ScreenWindow& front, int code);
  Outcome PressMnemonic(char letter);
  Outcome Focus(Control& control);
  Outcome Hover(Control& control);
  Outcome HoverScreen(const Screen& screen);
  Outcome CloseScreen(const Screen& screen);

  [[nodiscard]] View& ViewOf(const Control& control) const;
  [[nodiscard]] Outcome CheckLive(const Control& control) const;
  [[nodiscard]] bool HasLine(const Control& control, int line) const;
  [[nodiscard]] std::optional<Place> FreePlace(View& view) const;
  Outcome ClickAt(const std::optional<Place>& place, const Control& control,
                  Qt::KeyboardModifiers modifiers = Qt::NoModifier);
  /// How what was just done went.
  Outcome Taken();

  Windows& windows_;
  const Boxes& boxes_;
};

}  // namespace marlowbeck
