#include "print/page.h"

#include <gtest/gtest.h>

#include "data/channels.h"
#include "data/real_file_system.h"
#include "desktop/still_world.h"

namespace marlowbeck {
namespace {

/// Writes down what is done to it. Its fonts may come without a bold one.
class RecordingPrinter : public Printer {
 public:
  bool has_bold = true;
  std::string done;

  void SetFont(const PrinterFont& font) override {
    font_ = font;
    font_.bold = font.bold && has_bold;
    done += font.name + " " + std::to_string(font.size) + (font.bold ? " bold" : "") +
            (font.italic ? " italic" : "") + (font.underline ? " underline" : "") + "; ";
  }
  PrinterFont GetFont() override { return font_; }
  void Print(double /*x*/, double /*y*/, const std::string& text) override {
    done += "'" + text + "'; ";
  }

  std::string DeviceName() override { return {}; }
  Orientation GetOrientation() override { return Orientation::Portrait; }
  void SetOrientation(Orientation /*orientation*/) override {}
  int PageWidth() override { return 0; }
  int PageHeight() override { return 0; }
  double TextWidth(const std::string& /*text*/) override { return 0; }
  double TextHeight(const std::string& /*text*/) override { return 0; }
  void Line(double /*x1*/, double /*y1*/, double /*x2*/, double /*y2*/) override {}
  void Box(double /*x1*/, double /*y1*/, double /*x2*/, double /*y2*/) override {}
  void NewPage() override {}
  void EndDoc() override {}
  void KillDoc() override {}

 private:
  PrinterFont font_;
};

class PageTest : public testing::Test {
 protected:
  PageTest() {
    session_.PrintFontName = "Liberation Serif";
    session_.PrintFontSize = 12;
    session_.PrintFontBold = true;
    session_.PrintFontItalic = true;
  }

  RecordingPrinter printer_;
  Session session_;

 private:
  StillWorld world_;
  const Platform& still_ = world_.platform;
  Platform platform_{still_.boxes, still_.dialogs, printer_,     still_.clipboard, still_.sound,
                     still_.help,  still_.clock,   still_.timer, still_.display,   still_.observer};
  RealFileSystem files_;
  Channels channels_{files_};
  std::string folder_;
  Context context_{session_, channels_, platform_, folder_};

 protected:
  Page page_{context_};
};

TEST_F(PageTest, APlainFontGoesBeforeTheChosenOneBehindABlank) {
  page_.SetFont();
  EXPECT_EQ(printer_.done, "' '; Liberation Serif 8; Liberation Serif 12 bold italic; ");
  EXPECT_TRUE(session_.PrintBoldBase);
}

TEST_F(PageTest, WhetherTheFontIsBoldIsWhatThePrinterSays) {
  printer_.has_bold = false;
  page_.SetFont();
  EXPECT_FALSE(session_.PrintBoldBase);
  session_.PrintFontBold = false;
  printer_.has_bold = true;
  page_.SetFont();
  EXPECT_FALSE(session_.PrintBoldBase);
}

TEST_F(PageTest, BoldIsPutBackAsTheFontHasIt) {
  session_.PrintFontBold = false;
  page_.SetFont();
  page_.SetBold(true);
  EXPECT_TRUE(printer_.GetFont().bold);
  page_.RestoreBold();
  EXPECT_FALSE(printer_.GetFont().bold);
  session_.PrintFontBold = true;
  page_.SetFont();
  page_.SetBold(false);
  page_.RestoreBold();
  EXPECT_TRUE(printer_.GetFont().bold);
}

}  // namespace
}  // namespace marlowbeck
