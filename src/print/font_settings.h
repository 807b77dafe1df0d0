#pragma once

#include "ui/context.h"
#include "ui/controls.h"

namespace marlowbeck {

/// Reads the printer font from `FontName.qz3` in the working folder into the session: size, name,
/// bold, italic. A file that cannot be read is written anew with 10 points of "MS Sans Serif",
/// neither bold nor italic, which then holds.
void ReadFontSettings(const Context& context);

/// Writes the session's printer font to `FontName.qz3`.
void WriteFontSettings(const Context& context);

/// The words of a font box for the session's printer font: its name, "Font size = 10pts.".
void AlignFontBox(const Session& session, Label& lblFont, Label& lblPrFont);

}  // namespace marlowbeck
