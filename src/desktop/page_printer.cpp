#include "desktop/page_printer.h"

#include <exception>
#include <utility>

#include <QAction>
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
#include <QSaveFile>
#include <QStandardPaths>
#include <QUrl>

#include "data/runtime_error.h"
#include "desktop/encoding.h"
#include "desktop/printer_font.h"

namespace marlowbeck {
namespace {

constexpr int kTwipsPerInch = 1440;
constexpr double kUnprinted = 18;  ///< that no printer prints on, in points
constexpr double kRule = 10;       ///< width of lines, in twips

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
  layout_.reset();
}

void PagePrinter::SetOrientation(Orientation orientation) {
  orientation_ = orientation;
  layout_.reset();
}

const QPageLayout& PagePrinter::Layout() {
  if (!layout_) layout_ = FindLayout();
  return *layout_;
}

/// A preview shows the paper of the printer that it would be printed on.
QString PagePrinter::PrinterInUse() {
  switch (Target().kind) {
    case PrintTarget::Kind::Printer:
      return target_.printer;
    case PrintTarget::Kind::Preview:
      return QPrinterInfo::defaultPrinterName();
    case PrintTarget::Kind::Pdf:
      break;
  }
  return {};
}

/// A printer that cannot be reached is measured as A4: that it is not there comes out at the end.
QPageLayout PagePrinter::FindLayout() {
  const auto way =
      orientation_ == Orientation::Portrait ? QPageLayout::Portrait : QPageLayout::Landscape;
  const QString name = PrinterInUse();
  if (!name.isEmpty()) {
    QPrinter printer(QPrinter::HighResolution);
    printer.setPrinterName(name);
    printer.setPageOrientation(way);
    if (printer.isValid()) return printer.pageLayout();
  }
  return {QPageSize(QPageSize::A4), way, QMarginsF(kUnprinted, kUnprinted, kUnprinted, kUnprinted)};
}

int PagePrinter::PageWidth() {
  return qRound(Layout().paintRect(QPageLayout::Point).width() * kTwipsPerPoint);
}

int PagePrinter::PageHeight() {
  return qRound(Layout().paintRect(QPageLayout::Point).height() * kTwipsPerPoint);
}

void PagePrinter::SetFont(const PrinterFont& font) {
  font_ = font;
  drawn_ = FontInTwips(font);
}

double PagePrinter::TextWidth(const std::string& text) {
  return QFontMetricsF(drawn_).horizontalAdvance(ToQt(text));
}

double PagePrinter::TextHeight(const std::string& /*text*/) {
  return QFontMetricsF(drawn_).height();
}

void PagePrinter::Print(double x, double y, const std::string& text) {
  present_.emplace_back(TextAt{{x, y}, ToQt(text), drawn_});
}

void PagePrinter::Line(double x1, double y1, double x2, double y2) {
  present_.emplace_back(QLineF(x1, y1, x2, y2));
}

void PagePrinter::Box(double x1, double y1, double x2, double y2) {
  present_.emplace_back(QRectF(QPointF(x1, y1), QPointF(x2, y2)));
}

void PagePrinter::NewPage() { TurnPage(); }

void PagePrinter::TurnPage() {
  OnePage page = std::exchange(present_, {});
  const bool copy = !pages_.empty() && *pages_.back() == page;
  pages_.push_back(copy ? pages_.back() : std::make_shared<const OnePage>(std::move(page)));
}

/// An empty page at the end is no page.
void PagePrinter::EndDoc() {
  if (!present_.empty()) TurnPage();
  const Pages pages = std::exchange(pages_, {});
  if (!pages.empty()) Send(pages);
}

void PagePrinter::KillDoc() {
  pages_.clear();
  present_.clear();
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

void PagePrinter::Paint(QPagedPaintDevice& device, const Pages& pages) {
  QPainter painter;
  if (!painter.begin(&device)) throw RunTimeError(ErrorNumber::PrinterOff);
  painter.scale(static_cast<double>(device.logicalDpiX()) / kTwipsPerInch,
                static_cast<double>(device.logicalDpiY()) / kTwipsPerInch);
  for (std::size_t i = 0; i < pages.size(); ++i) {
    if (i > 0 && !device.newPage()) throw RunTimeError(ErrorNumber::PrinterOff);
    for (const Operation& operation : *pages[i]) Perform(painter, operation);
  }
  if (!painter.end()) throw RunTimeError(ErrorNumber::PrinterOff);
}

void PagePrinter::Perform(QPainter& painter, const Operation& operation) {
  painter.setPen(QPen(Qt::black, kRule));
  if (const auto* text = std::get_if<TextAt>(&operation)) {
    painter.setFont(text->font);
    // A text stands by its upper left corner.
    const double ascent = QFontMetricsF(text->font).ascent();
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
  printer.setPageLayout(Layout());
  Paint(printer, pages);
}

/// The file is there once it is whole.
void PagePrinter::SendToPdf(const Pages& pages) {
  const QDir folder(pdf_folder_.isEmpty()
                        ? QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation)
                        : pdf_folder_);
  folder.mkpath(".");
  const QString stamp = QDateTime::currentDateTime().toString("yyyy-MM-dd HH.mm.ss.zzz");
  const QString path = folder.filePath("Marlowbeck " + stamp + ".pdf");
  QSaveFile file(path);
  if (!file.open(QIODevice::WriteOnly)) throw RunTimeError(ErrorNumber::PrinterOff);
  {
    QPdfWriter writer(&file);
    writer.setResolution(kTwipsPerInch);
    writer.setTitle("Marlowbeck");
    writer.setPageLayout(Layout());
    Paint(writer, pages);
  }
  if (!file.commit()) throw RunTimeError(ErrorNumber::PrinterOff);
  view_(path);
}

namespace {

/// The paper is turned in the set-up dialog, before a page is laid out on it.
void LeaveThePaperAsItLies(const QPrintPreviewDialog& preview) {
  static const QStringList kTurns = {"Portrait", "Landscape", "Page setup"};
  for (QAction* action : preview.findChildren<QAction*>()) {
    if (kTurns.contains(action->text())) action->setVisible(false);
  }
}

}  // namespace

/// A failure in the middle of the toolkit's own work is told once that is over.
void PagePrinter::SendToPreview(const Pages& pages) {
  QPrinter printer(QPrinter::HighResolution);
  printer.setPageLayout(Layout());
  QPrintPreviewDialog preview(&printer, QApplication::activeWindow());
  preview.setWindowTitle("Preview");
  LeaveThePaperAsItLies(preview);
  std::exception_ptr failure;
  QObject::connect(&preview, &QPrintPreviewDialog::paintRequested, &preview, [&](QPrinter* on) {
    try {
      Paint(*on, pages);
    } catch (...) {
      failure = std::current_exception();
    }
  });
  preview.resize(800, 560);
  preview.exec();
  if (failure) std::rethrow_exception(failure);
}

}  // namespace marlowbeck
