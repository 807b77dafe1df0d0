// Documents that become PDF files.

#include "desktop/page_printer.h"

#include <QDir>
#include <QStandardPaths>
#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

class PdfPrinter : public testing::Test {
 protected:
  PdfPrinter() {
    QStandardPaths::setTestModeEnabled(true);
    qputenv("HOME", QDir::tempPath().toUtf8());
    Clean();
    printer_.SetTarget({PrintTarget::Kind::Pdf, {}});
    printer_.SetFont({"MS Sans Serif", 10, false, false, false});
  }
  ~PdfPrinter() override { Clean(); }

  [[nodiscard]] static QFileInfoList Documents() {
    const QDir folder(QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation));
    return folder.entryInfoList({"Marlowbeck *.pdf"}, QDir::Files);
  }

  QString viewed_;
  PagePrinter printer_{[this](const QString& path) { viewed_ = path; }};

 private:
  static void Clean() {
    for (const QFileInfo& file : Documents()) QFile::remove(file.filePath());
  }
};

TEST_F(PdfPrinter, ADocumentBecomesAFile) {
  printer_.Print(1000, 1000, "Rovers");
  printer_.Line(0, 2000, 5000, 2000);
  printer_.EndDoc();
  ASSERT_EQ(Documents().size(), 1);
  EXPECT_GT(Documents().constFirst().size(), 500);
  EXPECT_EQ(viewed_, Documents().constFirst().filePath());
}

TEST_F(PdfPrinter, ADocumentThrownAwayLeavesNothing) {
  printer_.Print(1000, 1000, "Rovers");
  printer_.KillDoc();
  printer_.EndDoc();
  EXPECT_EQ(Documents().size(), 0);
}

TEST_F(PdfPrinter, ThePaperLiesAsItIsTold) {
  EXPECT_LT(printer_.PageWidth(), printer_.PageHeight());
  const int width = printer_.PageWidth();
  printer_.SetOrientation(Orientation::Landscape);
  EXPECT_EQ(printer_.PageHeight(), width);
}

TEST_F(PdfPrinter, TextIsMeasuredInTwips) {
  // Ten points are 200 twips, and a line is somewhat higher than its letters.
  EXPECT_GT(printer_.TextHeight("x"), 200);
  EXPECT_LT(printer_.TextHeight("x"), 300);
  EXPECT_NEAR(printer_.TextWidth("mmmm"), 2 * printer_.TextWidth("mm"), 1);
  const double narrow = printer_.TextWidth("Rovers");
  printer_.SetFont({"MS Sans Serif", 20, false, false, false});
  EXPECT_NEAR(printer_.TextWidth("Rovers"), 2 * narrow, 5);
}

}  // namespace
}  // namespace marlowbeck
