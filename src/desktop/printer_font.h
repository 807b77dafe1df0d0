#pragma once

#include <string>

#include <QFont>
#include <QStringList>

#include "platform/printer.h"

namespace marlowbeck {

inline constexpr int kTwipsPerPoint = 20;

// The printer's font as it is drawn. What a machine has not is drawn in the plain face that every
// system gets; "MS Sans Serif", which only one system has, in one of like widths.

/// Where one unit is a twip.
[[nodiscard]] QFont FontInTwips(const PrinterFont& font);
[[nodiscard]] QFont FontOnScreen(const PrinterFont& font);
/// Faces whose characters are all of one width, for "Courier New" and its like.
[[nodiscard]] QStringList FixedPitchFamilies();
/// Whether another face is drawn for a font of this name, wherever it is.
[[nodiscard]] bool HasStandIn(const std::string& name);

}  // namespace marlowbeck
