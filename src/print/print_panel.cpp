#include "print/print_panel.h"

#include <algorithm>

#include "data/numbers.h"

namespace marlowbeck {
namespace {

constexpr int kLeastDistance = 2;  // half centimetres
constexpr int kGreatestDistance = 61;

}  // namespace

std::string_view OrientationWord(Orientation orientation) {
  return orientation == Orientation::Portrait ? "Portrait" : "Landscape";
}

void AskForOrientation(Platform& platform) {
  const auto chosen = platform.dialogs.PrinterSetup(platform.printer.GetOrientation());
  if (chosen) platform.printer.SetOrientation(*chosen);
}

void PrintPanel::PrinterInfo() {
  Printer& printer = context_.platform.printer;
  controls_.printer_name.SetCaption(printer.DeviceName());
  controls_.orientation.SetCaption(OrientationWord(printer.GetOrientation()));
}

void PrintPanel::Open() {
  PrinterInfo();
  controls_.copies.SetText("1");
  context_.platform.sound.Beep();
  if (controls_.from_top == nullptr) return;
  controls_.from_top->Clear();
  for (int halves = kLeastDistance; halves <= kGreatestDistance; ++halves) {
    controls_.from_top->AddLine(NumberText(halves / 2.0));
  }
  controls_.from_top->SetIndex(0);
}

void PrintPanel::SetUpPrinter() {
  AskForOrientation(context_.platform);
  PrinterInfo();
}

bool PrintPanel::Check(std::initializer_list<const OptionButton*> options,
                       std::string_view none_selected) {
  const bool any = std::any_of(options.begin(), options.end(),
                               [](const OptionButton* option) { return option->Value(); });
  if (any) return CheckDistance() && CheckCopies();
  Warning(context_, none_selected, beep_);
  return false;
}

bool PrintPanel::CheckDistance() {
  return controls_.from_top == nullptr ||
         AtLeastOne(controls_.from_top->Text(), "You must show CENTIMETRES from Top of Page!    ");
}

bool PrintPanel::CheckCopies() {
  return AtLeastOne(controls_.copies.Text(), "You must show NUMBER of COPIES to print!    ");
}

bool PrintPanel::AtLeastOne(std::string_view text, std::string_view message) {
  if (Val(text) >= 1) return true;
  Warning(context_, message, beep_);
  return false;
}

PrintOptions PrintPanel::Chosen() const {
  PrintOptions chosen;
  chosen.copies = Val(controls_.copies.Text());
  if (controls_.from_top != nullptr) chosen.centimetres = Val(controls_.from_top->Text());
  return chosen;
}

}  // namespace marlowbeck
