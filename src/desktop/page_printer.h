#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <variant>
#include <vector>

#include <QFont>
#include <QLineF>
#include <QPageLayout>
#include <QPagedPaintDevice>
#include <QRectF>
#include <QString>

#include "platform/printer.h"

namespace marlowbeck {

/// Where documents go.
struct PrintTarget {
  enum class Kind { Printer, Pdf, Preview };
  Kind kind = Kind::Pdf;
  QString printer;  ///< its name, where it is one
};

/// Documents are kept operation by operation, in twips, and painted as a whole when they end: on a
/// printer, into a PDF file that opens in the viewer, or into a preview. The paper is the printer's
/// own, and A4 where there is none.
class PagePrinter : public Printer {
 public:
  /// `view` is called with the path of each PDF file once it is whole. The files lie in a folder,
  /// by default among the user's documents.
  explicit PagePrinter(std::function<void(const QString& path)> view, QString pdf_folder = {})
      : view_(std::move(view)), pdf_folder_(std::move(pdf_folder)) {}
  std::string DeviceName() override;
  Orientation GetOrientation() override { return orientation_; }
  void SetOrientation(Orientation orientation) override;
  int PageWidth() override;
  int PageHeight() override;

  void SetFont(const PrinterFont& font) override;
  PrinterFont GetFont() override { return font_; }
  double TextWidth(const std::string& text) override;
  double TextHeight(const std::string& text) override;

  void Print(double x, double y, const std::string& text) override;
  void Line(double x1, double y1, double x2, double y2) override;
  void Box(double x1, double y1, double x2, double y2) override;
  void NewPage() override;
  void EndDoc() override;
  void KillDoc() override;

  [[nodiscard]] const PrintTarget& Target();
  void SetTarget(const PrintTarget& target);

 private:
  struct TextAt {
    QPointF place;
    QString text;
    QFont font;
    bool operator==(const TextAt&) const = default;
  };
  using Operation = std::variant<TextAt, QLineF, QRectF>;
  using OnePage = std::vector<Operation>;
  /// Copies that are equal are kept once.
  using Pages = std::vector<std::shared_ptr<const OnePage>>;

  static void Perform(QPainter& painter, const Operation& operation);
  static void Paint(QPagedPaintDevice& device, const Pages& pages);
  /// The paper as it lies now: its size, and what can be printed on.
  [[nodiscard]] const QPageLayout& Layout();
  [[nodiscard]] QPageLayout FindLayout();
  /// Its name; empty where the paper is nobody's.
  [[nodiscard]] QString PrinterInUse();
  void TurnPage();
  void Send(const Pages& pages);
  void SendToPrinter(const Pages& pages);
  void SendToPdf(const Pages& pages);
  void SendToPreview(const Pages& pages);

  std::function<void(const QString&)> view_;
  QString pdf_folder_;  ///< empty for that of the user's documents
  PrinterFont font_;
  QFont drawn_;
  Orientation orientation_ = Orientation::Portrait;
  Pages pages_;      ///< that are whole
  OnePage present_;  ///< the page under way
  PrintTarget target_;
  bool target_known_ = false;
  std::optional<QPageLayout> layout_;  ///< once it has been asked for
};

/// Opens a file in the program that the desktop has for it.
void OpenInViewer(const QString& path);

}  // namespace marlowbeck
