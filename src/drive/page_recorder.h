#pragma once

#include <array>
#include <optional>
#include <string>

#include "drive/event_log.h"
#include "platform/printer.h"

namespace marlowbeck {

/// A printer without paper: keeps a document as operations, page by page, and tells it to the log
/// when it ends. Text is measured by a fixed rule: a character is size * 10 twips wide and a text
/// size * 24 high in every font.
class PageRecorder : public Printer {
 public:
  explicit PageRecorder(EventLog& log) : log_(log) {}

  // Set by the script; sizes hold for the present orientation.
  void SetDeviceName(std::string name) { device_name_ = std::move(name); }
  void SetPageWidth(int twips) { Present().width = twips; }
  void SetPageHeight(int twips) { Present().height = twips; }
  /// The nth operation from now on, the first being 1, fails with PrinterOff.
  void FailAt(int nth) { fail_in_ = nth; }

  [[nodiscard]] std::string DeviceName() override { return device_name_; }
  [[nodiscard]] Orientation GetOrientation() override { return orientation_; }
  void SetOrientation(Orientation orientation) override { orientation_ = orientation; }
  [[nodiscard]] int PageWidth() override { return Present().width; }
  [[nodiscard]] int PageHeight() override { return Present().height; }

  void SetFont(const PrinterFont& font) override { font_ = font; }
  [[nodiscard]] PrinterFont GetFont() override { return font_; }
  [[nodiscard]] double TextWidth(const std::string& text) override;
  [[nodiscard]] double TextHeight(const std::string& text) override;

  void Print(double x, double y, const std::string& text) override;
  void Line(double x1, double y1, double x2, double y2) override;
  void Box(double x1, double y1, double x2, double y2) override;
  void NewPage() override;
  void EndDoc() override;
  void KillDoc() override;

 private:
  struct Paper {
    int width = 0;
    int height = 0;
  };

  [[nodiscard]] Paper& Present() { return papers_[orientation_ == Orientation::Portrait ? 0 : 1]; }
  /// Counts an operation, which fails when its time has come.
  void Begin();
  void Add(Json operation) { pages_.back().push_back(std::move(operation)); }
  [[nodiscard]] static Json NoPages() { return Json::array({Json::array()}); }

  EventLog& log_;
  std::string device_name_ = "Test printer";
  Orientation orientation_ = Orientation::Portrait;
  std::array<Paper, 2> papers_ = {{{11906, 16838}, {16838, 11906}}};
  PrinterFont font_;
  std::optional<int> fail_in_;
  Json pages_ = NoPages();
};

}  // namespace marlowbeck
