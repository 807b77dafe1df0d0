#include "print/font_box.h"

#include <tuple>

#include "data/numbers.h"
#include "data/runtime_error.h"
#include "data/text.h"
#include "print/font_settings.h"

namespace marlowbeck {
namespace {

constexpr int kTooSmall = 7;  // points; this size and below are passed over
constexpr int kLargest = 24;  // points

auto FieldsOf(const PrinterFont& font) {
  return std::tie(font.name, font.size, font.bold, font.italic, font.underline);
}

}  // namespace

void FontLabel::SetFont(const PrinterFont& font) {
  if (FieldsOf(font_) == FieldsOf(font)) return;
  font_ = font;
  Touch();
}

FontBox::FontBox(const Context& context, const Controls& controls, Beep beep)
    : context_(context), controls_(controls), beep_(beep) {
  controls_.lblFontInfo.Hide();
  controls_.lblFont.Click = [this] { Choose(); };
  controls_.lblFont.MouseMove = [this] { controls_.lblFontInfo.Show(); };
  controls_.fraFontPick.MouseMove = [this] { controls_.lblFontInfo.Hide(); };
}

void FontBox::GetFont() {
  try {
    ReadFontSettings(context_);
  } catch (const RunTimeError&) {
    // The default holds, though it could not be written.
    AlignFontBox();
    throw;
  }
  AlignFontBox();
}

void FontBox::AlignFontBox() {
  const Session& session = context_.session;
  controls_.lblFont.SetFont(PrinterFontOf(session));
  controls_.lblFont.SetCaption(session.PrintFontName);
  controls_.lblPrFont.SetCaption("Font size = " + NumberText(session.PrintFontSize) + "pts.");
}

/// A dialog that is cancelled hands back what it was opened with.
void FontBox::Choose() {
  controls_.lblFontInfo.Hide();
  const PrinterFont font = PrinterFontOf(context_.session);
  const FontChoice present = {font.name, font.size, font.bold, font.italic};
  Take(context_.platform.dialogs.Font(present).value_or(present));
  AlignFontBox();  // it holds, though it may not come to be kept
  WriteFontSettings(context_);
}

void FontBox::Take(const FontChoice& chosen) {
  Session& session = context_.session;
  const std::int32_t old_size = session.PrintFontSize;
  if (!chosen.name.empty()) session.PrintFontName = chosen.name;
  // KEPT: a size that is too small is passed over without a word, one that is too large is told; a
  // repair would tell of both.
  if (chosen.size > kTooSmall) session.PrintFontSize = chosen.size;
  session.PrintFontBold = chosen.bold;
  session.PrintFontItalic = chosen.italic;
  if (session.PrintFontSize <= kLargest) return;
  Warning(context_,
          Lines({"The font size you selected is to large. Please select    ",
                 "fonts 24 points or less. If you select a font size too    ",
                 "large for printing, the print job will automatically be    ",
                 "cancelled and a message will advise you to alter the    ", "font size.   "}),
          beep_);
  session.PrintFontSize = old_size;
}

}  // namespace marlowbeck
