#pragma once

#include "platform/printer.h"
#include "ui/context.h"

namespace marlowbeck {

/// Reads the printer font from `FontName.qz3` in the working folder into the session: size, name,
/// bold, italic. A file that cannot be read, or that names no font, is written anew with 10 points
/// of "MS Sans Serif", neither bold nor italic, which then holds.
void ReadFontSettings(const Context& context);

/// Writes the session's printer font to `FontName.qz3`.
void WriteFontSettings(const Context& context);

/// The session's printer font.
[[nodiscard]] PrinterFont PrinterFontOf(const Session& session);

}  // namespace marlowbeck
