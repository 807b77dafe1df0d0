#pragma once

#include <string>
#include <vector>

#include "support/club.h"

namespace marlowbeck {

/// A text as it stands on paper, in twips.
struct PrintedText {
  std::string text;  ///< UTF-8
  double x = 0;
  double y = 0;
  std::string font;
  int size = 0;
  bool bold = false;
  bool italic = false;
  bool underline = false;
};

/// A line, or a box from corner to corner.
struct PrintedStroke {
  double x1 = 0;
  double y1 = 0;
  double x2 = 0;
  double y2 = 0;
};

struct PrintedPage {
  std::vector<PrintedText> texts;  ///< without the single blanks that prepare the printer
  std::vector<PrintedStroke> lines;
  std::vector<PrintedStroke> boxes;

  [[nodiscard]] std::vector<std::string> Words() const;
  /// The text with these words; the test fails where there is none.
  [[nodiscard]] PrintedText Find(const std::string& words, Here here = Here::current()) const;
};

/// The pages of the one document that the club's last command sent to the printer; none, and a
/// failure, when it was not one.
[[nodiscard]] std::vector<PrintedPage> PagesOf(const std::vector<Json>& printed,
                                               Here here = Here::current());

/// Expects a text to stand at a place, to a hundredth of a twip.
void ExpectAt(const PrintedText& text, double x, double y, Here here = Here::current());
void ExpectStroke(const PrintedStroke& stroke, const PrintedStroke& expected,
                  Here here = Here::current());

}  // namespace marlowbeck
