#pragma once

#include <string>

namespace marlowbeck {

enum class Orientation { Portrait = 1, Landscape = 2 };

struct PrinterFont {
  std::string name;
  int size = 10;  ///< points
  bool bold = false;
  bool italic = false;
  bool underline = false;
};

/// A document on its way to paper, built operation by operation and sent as a whole by EndDoc.
/// Lengths are twips, 567 to the centimetre. The printing operations throw PrinterOff when the
/// printer fails.
class Printer {
 public:
  virtual ~Printer() = default;

  [[nodiscard]] virtual std::string DeviceName() = 0;
  [[nodiscard]] virtual Orientation GetOrientation() = 0;
  virtual void SetOrientation(Orientation orientation) = 0;
  [[nodiscard]] virtual int PageWidth() = 0;  ///< printable width
  [[nodiscard]] virtual int PageHeight() = 0;

  virtual void SetFont(const PrinterFont& font) = 0;
  /// The font as the printer took it, which may lack what was asked for.
  [[nodiscard]] virtual PrinterFont GetFont() = 0;
  [[nodiscard]] virtual double TextWidth(const std::string& text) = 0;
  [[nodiscard]] virtual double TextHeight(const std::string& text) = 0;

  virtual void Print(double x, double y, const std::string& text) = 0;
  virtual void Line(double x1, double y1, double x2, double y2) = 0;
  virtual void Box(double x1, double y1, double x2, double y2) = 0;
  virtual void NewPage() = 0;
  virtual void EndDoc() = 0;
  virtual void KillDoc() = 0;
};

}  // namespace marlowbeck
