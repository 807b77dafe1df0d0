#pragma once

#include <optional>

#include <QComboBox>
#include <QLineEdit>
#include <QPoint>

#include "desktop/screen_window.h"

namespace marlowbeck {

// Where on a window a pointer reaches a control.

struct Place {
  QWidget* widget = nullptr;  ///< what lies topmost there
  QPoint at;
};

/// A point at which the control answers and lies on top; nothing where it cannot be reached.
/// Holders that scroll are scrolled to it first.
std::optional<Place> PlaceOn(View& view, const ScreenWindow& window);
/// The same, but of a list or grid a point where no line or cell is.
std::optional<Place> PlaceBesideLines(View& view, const ScreenWindow& window);

/// The entry that a keyboard would type into; null where nothing can be typed.
QLineEdit* EntryOf(const View& view);
/// Where a combo is clicked on to drop down.
QPoint ArrowOf(const QComboBox& combo);

}  // namespace marlowbeck
