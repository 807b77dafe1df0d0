#include "print/page.h"

#include <algorithm>

#include "data/text.h"
#include "print/font_settings.h"

namespace marlowbeck {
namespace {

constexpr int kPlainSize = 8;  // points

}  // namespace

void Page::SetFont() {
  printer_.Print(0, y_, " ");
  // A plain one first, so that nothing stays of the font before.
  printer_.SetFont({session_.PrintFontName, kPlainSize, false, false, false});
  printer_.SetFont(PrinterFontOf(session_));
  session_.PrintBoldBase = printer_.GetFont().bold;
}

void Page::SetBold(bool bold) {
  PrinterFont font = printer_.GetFont();
  font.bold = bold;
  printer_.SetFont(font);
}

void Page::RestoreBold() { SetBold(session_.PrintBoldBase); }

double Page::WidestOf(const std::vector<std::string>& texts) const {
  double widest = 0;
  for (const std::string& text : texts) widest = std::max(widest, WidthOf(text));
  return widest;
}

void Page::PrintCentred(const std::string& line) {
  if (Trimmed(line).empty()) return;
  PrintAt(Middle() - WidthOf(line) / 2, y_, line);
  MoveDown(TextHeight());
}

void Page::NewPage() {
  printer_.NewPage();
  y_ = 0;
}

}  // namespace marlowbeck
