#pragma once

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

#include <QDir>
#include <QImage>
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <gtest/gtest.h>

#include "data/real_file_system.h"
#include "desktop/encoding.h"
#include "desktop/page_printer.h"
#include "tests/desktop/still_world.h"
#include "ui/context.h"

namespace marlowbeck {

inline constexpr double kMargin = 360;        // twips round what is printed on
inline constexpr double kTwipsPerPixel = 10;  // at 144 dots to the inch

/// A page as a picture of grey dots, asked for in twips of the printable area.
class PagePicture {
 public:
  explicit PagePicture(QImage image) : image_(std::move(image)) {}
  [[nodiscard]] bool IsEmpty() const { return image_.isNull(); }
  [[nodiscard]] QSize Size() const { return image_.size(); }
  [[nodiscard]] const QImage& Image() const { return image_; }
  /// The darkest dot of an area is dark, its edges included.
  [[nodiscard]] bool HasInk(double x1, double y1, double x2, double y2) const {
    for (int y = Dot(y1); y <= Dot(y2); ++y) {
      for (int x = Dot(x1); x <= Dot(x2); ++x) {
        if (image_.valid(x, y) && qGray(image_.pixel(x, y)) < 128) return true;
      }
    }
    return false;
  }
  /// Every dot of an upright or level line is dark, give or take one dot to its side.
  [[nodiscard]] bool HasRule(double x1, double y1, double x2, double y2) const {
    const int steps = std::max(Dot(x2) - Dot(x1), Dot(y2) - Dot(y1));
    for (int i = 0; i <= steps; ++i) {
      const double x = x1 + (x2 - x1) * i / steps;
      const double y = y1 + (y2 - y1) * i / steps;
      if (!HasInk(x - kTwipsPerPixel, y - kTwipsPerPixel, x + kTwipsPerPixel, y + kTwipsPerPixel)) {
        return false;
      }
    }
    return true;
  }

 private:
  static int Dot(double twips) { return static_cast<int>((twips + kMargin) / kTwipsPerPixel); }
  QImage image_;
};

/// Printouts of a test, which become PDF files, and those pictures.
class PdfDocuments : public testing::Test {
 protected:
  PdfDocuments() {
    QStandardPaths::setTestModeEnabled(true);
    qputenv("HOME", folder_.path().toUtf8());
    printer_.SetTarget({PrintTarget::Kind::Pdf, {}});
    session_.AssociationName = "Marlow and District Darts Association";
    session_.SeasonFile = "S.qzs";
    files_.ChangeFolder(working_folder_);
    QFile season(folder_.filePath("S.qzs"));
    EXPECT_TRUE(season.open(QIODevice::WriteOnly));
    season.write("\"Winter 2004\"\r\n");
  }
  void TearDown() override {
    if (!viewed_.isEmpty()) QFile::remove(viewed_);
  }

  /// The pages of the PDF file that was last handed to the viewer.
  std::vector<PagePicture> Pictures() {
    EXPECT_TRUE(QFile::exists(viewed_));
    const QString name = folder_.filePath("page");
    QProcess::execute("pdftoppm", {"-r", "144", "-gray", viewed_, name});
    std::vector<PagePicture> pictures;
    for (const QFileInfo& file :
         QDir(folder_.path()).entryInfoList({"page*.pgm"}, QDir::Files, QDir::Name)) {
      pictures.emplace_back(QImage(file.filePath()));
      Keep(file.filePath(), pictures.size());
      QFile::remove(file.filePath());
    }
    return pictures;
  }
  /// Where MARLOWBECK_PICTURES names a folder, pictures stay there to be looked at.
  static void Keep(const QString& path, std::size_t page) {
    const QString folder = qEnvironmentVariable("MARLOWBECK_PICTURES");
    if (folder.isEmpty()) return;
    const QString test = testing::UnitTest::GetInstance()->current_test_info()->name();
    QImage(path).save(QDir(folder).filePath(test + QString::number(page) + ".png"));
  }

  double WidestOf(const std::vector<std::string>& texts) {
    double widest = 0;
    for (const std::string& text : texts) widest = std::max(widest, printer_.TextWidth(text));
    return widest;
  }

  QTemporaryDir folder_;
  std::string working_folder_ = FromQt(folder_.path());
  QString viewed_;
  PagePrinter printer_{[this](const QString& path) { viewed_ = path; }};
  StillWorld world_;
  Platform platform_{world_.platform.boxes,     world_.platform.dialogs, printer_,
                     world_.platform.clipboard, world_.platform.sound,   world_.platform.help,
                     world_.platform.clock,     world_.platform.timer,   world_.platform.display,
                     world_.platform.observer};
  RealFileSystem files_;
  Channels channels_{files_};
  Session session_;
  Context context_{session_, channels_, platform_, working_folder_};
};

}  // namespace marlowbeck
