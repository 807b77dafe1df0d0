#pragma once

#include "platform/platform.h"
#include "session/messages.h"
#include "ui/context.h"
#include "ui/controls.h"

namespace marlowbeck {

/// A label whose caption stands in a font of its own.
class FontLabel : public Label {
 public:
  using Label::Label;

  [[nodiscard]] const PrinterFont& Font() const { return font_; }
  void SetFont(const PrinterFont& font);

 private:
  PrinterFont font_;
};

/// The box that shows the printer font and lets it be chosen, for every screen that has its four
/// controls. A click on `lblFont` opens the font dialog.
class FontBox {
 public:
  struct Controls {
    Panel& fraFontPick;
    FontLabel& lblFont;
    Label& lblPrFont;
    Label& lblFontInfo;  ///< the hint, seen while the pointer is over `lblFont`
  };

  /// Wires the controls and hides the hint. `beep` is that of its warning.
  FontBox(const Context& context, const Controls& controls, Beep beep = Beep::No);

  /// Reads the printer font from its file and shows it.
  void GetFont();
  /// Shows the session's printer font: its name in the font itself, and its size.
  void AlignFontBox();

 private:
  void Choose();
  void Take(const FontChoice& chosen);

  const Context& context_;
  Controls controls_;
  Beep beep_;
};

}  // namespace marlowbeck
