#include "desktop/page_printer.h"

#include <utility>

#include <QApplication>
#include <QDateTime>
#include <QDesktopServices>
#include <QDir>
#include <QFontMetricsF>
#include <QPainter>
#include <QPdfWriter>
#include <QPrintPreviewDialog>
#include <QPrinter>
#include <QPrinterInfo>
#include <QStandardPaths>
#include <QUrl>

#include "data/runtime_error.h"
#include "desktop/encoding.h"
#include "desktop/printer_font.h"

namespace marlowbeck {
namespace {

constexpr int kTwipsPerInch = 1440;
constexpr int kTwipsPerPoint = 20;
constexpr int kPaperWidth = 11906;  ///< A4, in twips
constexpr int kPaperHeight = 16838;
constexpr int kMargin = 360;  ///< that no printer prints on, in twips
constexpr double kRule = 10;  ///< width of lines, in twips

}  // namespace

void OpenInViewer(const QString& path) { QDesktopServices::openUrl(QUrl::fromLocalFile(path)); }

std::string PagePrinter::DeviceName() {
  switch (Target().kind) {
    case PrintTarget::Kind::Printer:
      return FromQt(Target().printer);
    case PrintTarget::Kind::Pdf:
      return "PDF file";
    case PrintTarget::Kind::Preview:
      return "Preview";
  }
  return {};
}

/// The machine's printers are looked for when the first is asked about, not at the start.
const PrintTarget& PagePrinter::Target() {
  if (!std::exchange(target_known_, true)) {
    const QString name = QPrinterInfo::defaultPrinterName();
    if (!name.isEmpty()) target_ = {PrintTarget::Kind::Printer, name};
  }
  return target_;
}

void PagePrinter::SetTarget(const PrintTarget& target) {
  target_ = target;
  target_known_ = true;
}

int PagePrinter::PageWidth() {
  return (orientation_ == Orientation::Portrait ? kPaperWidth : kPaperHeight) - 2 * kMargin;
}

int PagePrinter::PageHeight() {
  return (orientation_ == Orientation::Portrait ? kPaperHeight : kPaperWidth) - 2 * kMargin;
}

double PagePrinter::TextWidth(const std::string& text) {
  return QFontMetricsF(FontInTwips(font_)).horizontalAdvance(ToQt(text));
}

double PagePrinter::TextHeight(const std::string& /*text*/) {
  return QFontMetricsF(FontInTwips(font_)).height();
}

void PagePrinter::Print(double x, double y, const std::string& text) {
  pages_.back().emplace_back(TextAt{{x, y}, ToQt(text), font_});
}

void PagePrinter::Line(double x1, double y1, double x2, double y2) {
  pages_.back().emplace_back(QLineF(x1, y1, x2, y2));
}

void PagePrinter::Box(double x1, double y1, double x2, double y2) {
  pages_.back().emplace_back(QRectF(QPointF(x1, y1), QPointF(x2, y2)));
}

/// An empty page at the end is no page.
void PagePrinter::EndDoc() {
  Pages pages = std::exchange(pages_, Pages(1));
  if (pages.back().empty()) pages.pop_back();
  if (!pages.empty()) Send(pages);
}

void PagePrinter::Send(const Pages& pages) {
  switch (Target().kind) {
    case PrintTarget::Kind::Printer:
      return SendToPrinter(pages);
    case PrintTarget::Kind::Pdf:
      return SendToPdf(pages);
    case PrintTarget::Kind::Preview:
      return SendToPreview(pages);
  }
}

void PagePrinter::SetLayout(QPagedPaintDevice& device) const {
  const bool upright = orientation_ == Orientation::Portrait;
  const double points = static_cast<double>(kMargin) / kTwipsPerPoint;
  device.setPageLayout(QPageLayout(QPageSize(QPageSize::A4),
                                   upright ? QPageLayout::Portrait : QPageLayout::Landscape,
                                   QMarginsF(points, points, points, points)));
}

void PagePrinter::Paint(QPagedPaintDevice& device, const Pages& pages) {
  QPainter painter;
  if (!painter.begin(&device)) throw RunTimeError(ErrorNumber::PrinterOff);
  painter.scale(static_cast<double>(device.logicalDpiX()) / kTwipsPerInch,
                static_cast<double>(device.logicalDpiY()) / kTwipsPerInch);
  for (std::size_t i = 0; i < pages.size(); ++i) {
    if (i > 0 && !device.newPage()) throw RunTimeError(ErrorNumber::PrinterOff);
    for (const Operation& operation : pages[i]) Perform(painter, operation);
  }
  if (!painter.end()) throw RunTimeError(ErrorNumber::PrinterOff);
}

void PagePrinter::Perform(QPainter& painter, const Operation& operation) {
  painter.setPen(QPen(Qt::black, kRule));
  if (const auto* text = std::get_if<TextAt>(&operation)) {
    painter.setFont(FontInTwips(text->font));
    // A text stands by its upper left corner.
    const double ascent = QFontMetricsF(painter.font()).ascent();
    painter.drawText(text->place + QPointF(0, ascent), text->text);
  } else if (const auto* line = std::get_if<QLineF>(&operation)) {
    painter.drawLine(*line);
  } else {
    painter.drawRect(std::get<QRectF>(operation));
  }
}

void PagePrinter::SendToPrinter(const Pages& pages) {
  QPrinter printer(QPrinter::HighResolution);
  printer.setPrinterName(target_.printer);
  if (!printer.isValid()) throw RunTimeError(ErrorNumber::PrinterOff);
  SetLayout(printer);
  Paint(printer, pages);
}

void PagePrinter::SendToPdf(const Pages& pages) const {
  const QDir folder(QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation));
  folder.mkpath(".");
  const QString stamp = QDateTime::currentDateTime().toString("yyyy-MM-dd HH.mm.ss.zzz");
  const QString path = folder.filePath("Marlowbeck " + stamp + ".pdf");
  QPdfWriter writer(path);
  writer.setResolution(kTwipsPerInch);
  writer.setTitle("Marlowbeck");
  SetLayout(writer);
  Paint(writer, pages);
  view_(path);
}

void PagePrinter::SendToPreview(const Pages& pages) {
  QPrinter printer(QPrinter::HighResolution);
  SetLayout(printer);
  QPrintPreviewDialog preview(&printer, QApplication::activeWindow());
  preview.setWindowTitle("Preview");
  QObject::connect(&preview, &QPrintPreviewDialog::paintRequested, &preview,
                   [&](QPrinter* on) { Paint(*on, pages); });
  preview.resize(800, 560);
  preview.exec();
}

}  // namespace marlowbeck
