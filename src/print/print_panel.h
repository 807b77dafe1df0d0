#pragma once

#include <initializer_list>
#include <string>
#include <string_view>

#include "print/print_job.h"
#include "session/messages.h"
#include "ui/controls.h"

namespace marlowbeck {

/// "Portrait" or "Landscape".
[[nodiscard]] std::string_view OrientationWord(Orientation orientation);

/// The set-up dialog; a cancelled one leaves the printer as it was.
void AskForOrientation(Platform& platform);

/// What the print panels of all screens do alike, on the controls that each of them has. The screen
/// shows and hides the panel itself, and says what is printed.
class PrintPanel {
 public:
  struct Controls {
    Label& printer_name;
    Label& orientation;
    TextBox& copies;
    ComboBox* from_top = nullptr;  ///< null where the distance from the top is not chosen
  };

  /// `beep` is that of its warnings.
  PrintPanel(const Context& context, const Controls& controls, Beep beep = Beep::No)
      : context_(context), controls_(controls), beep_(beep) {}

  /// Shows the printer's name and which way round its paper is.
  void PrinterInfo();
  /// As the panel comes up: the printer, one copy, a beep, the distances with the first selected.
  void Open();
  /// The set-up dialog, and what has come of it.
  void SetUpPrinter();

  /// Whether one of the options is selected, `none_selected` being said where it is not, and the
  /// boxes hold something to print by.
  [[nodiscard]] bool Check(std::initializer_list<const OptionButton*> options,
                           std::string_view none_selected);
  /// Whether there is a number of copies.
  [[nodiscard]] bool CheckCopies();
  [[nodiscard]] PrintOptions Chosen() const;

 private:
  [[nodiscard]] bool CheckDistance();
  [[nodiscard]] bool AtLeastOne(std::string_view text, std::string_view message);

  const Context& context_;
  Controls controls_;
  Beep beep_;
};

}  // namespace marlowbeck
