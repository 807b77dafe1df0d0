#pragma once

#include <functional>

#include "desktop/page_printer.h"
#include "platform/platform.h"

namespace marlowbeck {

/// The dialogs for files, fonts and the printer.
class DesktopDialogs : public Dialogs {
 public:
  /// `before` brings the windows up to date.
  DesktopDialogs(PagePrinter& printer, std::function<void()> before)
      : printer_(printer), before_(std::move(before)) {}

  std::optional<std::string> File(const FileDialogRequest& request) override;
  std::optional<FontChoice> Font(const FontChoice& present) override;
  /// Asks where documents go, too.
  std::optional<Orientation> PrinterSetup(Orientation present) override;

 private:
  PagePrinter& printer_;
  std::function<void()> before_;
};

}  // namespace marlowbeck
