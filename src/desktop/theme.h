#pragma once

#include <QApplication>
#include <QColor>
#include <QIcon>

#include "ui/control.h"

namespace marlowbeck {

// The one place that says how everything looks.

/// The property of a widget that holds its Meaning as a number.
inline constexpr const char* kMeaning = "meaning";
/// The property of a combo that is true while it shows its text and takes no other.
inline constexpr const char* kHeld = "held";

/// Style, palette and type of the whole application.
void ApplyTheme();

/// Dresses the widgets of a form by their `role`: "heading", "hint", "figure", "big", "fixed". One
/// that `keepsRoom` leaves its place empty while it is hidden.
void ApplyRoles(QWidget& window);

/// The colour of what the program means as red or green; ink for anything else.
[[nodiscard]] QColor ColorOf(Meaning meaning);
/// What such a colour means.
[[nodiscard]] Meaning MeaningOf(const QColor& color);

/// A picture of the resources, sharp at every scale.
[[nodiscard]] QIcon IconNamed(const QString& name);

}  // namespace marlowbeck
