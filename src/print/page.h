#pragma once

#include <string>
#include <vector>

#include "ui/context.h"

namespace marlowbeck {

inline constexpr double kTwipsPerCentimetre = 567;
/// How much wider than its texts a column is, and how much higher than its text a row.
inline constexpr double kRoomFactor = 1.2;

/// The page under way on the printer. Texts stand at a current height, in twips from the top, which
/// each one moves down by its own.
class Page {
 public:
  explicit Page(const Context& context)
      : printer_(context.platform.printer), session_(context.session) {}

  /// Prepares the printer with the session's font, and keeps in `PrintBoldBase` whether that came
  /// out bold. To be called before anything is measured, and at the start of each copy.
  void SetFont();
  void SetBold(bool bold);
  /// Bold as SetFont left it.
  void RestoreBold();

  [[nodiscard]] double Width() const { return printer_.PageWidth(); }  ///< that can be printed on
  [[nodiscard]] double Height() const { return printer_.PageHeight(); }
  [[nodiscard]] double Middle() const { return Width() / 2; }
  [[nodiscard]] double WidthOf(const std::string& text) const { return printer_.TextWidth(text); }
  /// Of the widest of some texts; 0 without any.
  [[nodiscard]] double WidestOf(const std::vector<std::string>& texts) const;
  /// The height of a line, measured on the font's own name.
  [[nodiscard]] double TextHeight() const { return printer_.TextHeight(session_.PrintFontName); }

  [[nodiscard]] double Y() const { return y_; }
  void MoveTo(double y) { y_ = y; }
  void MoveDown(double distance) { y_ += distance; }
  /// Prints a line centred on the page, and moves below it. One of blanks takes no room.
  void PrintCentred(const std::string& line);

  void PrintAt(double x, double y, const std::string& text) { printer_.Print(x, y, text); }
  void Line(double x1, double y1, double x2, double y2) { printer_.Line(x1, y1, x2, y2); }
  void Box(double x1, double y1, double x2, double y2) { printer_.Box(x1, y1, x2, y2); }
  /// Goes on at the top of another page.
  void NewPage();

 private:
  Printer& printer_;
  Session& session_;
  double y_ = 0;
};

}  // namespace marlowbeck
