#pragma once

#include <string>

#include "platform/platform.h"

namespace marlowbeck {

/// A world in which nothing happens.
class StillWorld : public Boxes,
                   private Dialogs,
                   private Printer,
                   private Clipboard,
                   private Sound,
                   private Help,
                   private Clock,
                   private Timer,
                   private Display,
                   private Observer {
 public:
  Platform platform{*this, *this, *this, *this, *this, *this, *this, *this, *this, *this};

 protected:
  int ShowMessage(const MessageBoxRequest& /*request*/) override { return kAnswerCancel; }
  std::string ShowInput(const InputBoxRequest& /*request*/) override { return {}; }

 private:
  std::optional<std::string> File(const FileDialogRequest& /*request*/) override { return {}; }
  std::optional<FontChoice> Font(const FontChoice& /*present*/) override { return {}; }
  std::optional<Orientation> PrinterSetup(Orientation /*present*/) override { return {}; }
  std::string DeviceName() override { return {}; }
  Orientation GetOrientation() override { return Orientation::Portrait; }
  void SetOrientation(Orientation /*orientation*/) override {}
  int PageWidth() override { return 0; }
  int PageHeight() override { return 0; }
  void SetFont(const PrinterFont& /*font*/) override {}
  PrinterFont GetFont() override { return {}; }
  double TextWidth(const std::string& /*text*/) override { return 0; }
  double TextHeight(const std::string& /*text*/) override { return 0; }
  void Print(double /*x*/, double /*y*/, const std::string& /*text*/) override {}
  void Line(double /*x1*/, double /*y1*/, double /*x2*/, double /*y2*/) override {}
  void Box(double /*x1*/, double /*y1*/, double /*x2*/, double /*y2*/) override {}
  void NewPage() override {}
  void EndDoc() override {}
  void KillDoc() override {}
  void Clear() override {}
  void SetText(const std::string& /*text*/) override {}
  void Beep() override {}
  void Prepare(const std::string& /*wave_file*/) override {}
  void Play() override {}
  void Open(const std::string& /*file*/, int /*topic*/) override {}
  Date Today() override { return {}; }
  std::uint64_t Seed() override { return 1; }
  int WidthInTwips() override { return 15360; }
  void Refresh() override {}
  void ErrorRaised(int /*number*/) override {}
  void Ended() override {}
};

}  // namespace marlowbeck
