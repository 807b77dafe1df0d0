#include "support/paper.h"

namespace marlowbeck {
namespace {

constexpr double kNothing = 0.01;  // twips

testing::ScopedTrace At(const Here& here) {
  return {here.file_name(), static_cast<int>(here.line()), "from here"};
}

PrintedStroke StrokeOf(const Json& corners) {
  return {corners[0], corners[1], corners[2], corners[3]};
}

PrintedText TextOf(const Json& operation) {
  return {operation["text"], operation["x"],    operation["y"],      operation["font"],
          operation["size"], operation["bold"], operation["italic"], operation["underline"]};
}

PrintedPage PageOf(const Json& operations) {
  PrintedPage page;
  for (const Json& operation : operations) {
    if (operation.contains("line")) page.lines.push_back(StrokeOf(operation["line"]));
    if (operation.contains("box")) page.boxes.push_back(StrokeOf(operation["box"]));
    if (operation.contains("text") && operation["text"] != " ") {
      page.texts.push_back(TextOf(operation));
    }
  }
  return page;
}

}  // namespace

std::vector<std::string> PrintedPage::Words() const {
  std::vector<std::string> words;
  for (const PrintedText& text : texts) words.push_back(text.text);
  return words;
}

PrintedText PrintedPage::Find(const std::string& words, Here here) const {
  for (const PrintedText& text : texts) {
    if (text.text == words) return text;
  }
  const auto trace = At(here);
  ADD_FAILURE() << "\"" << words << "\" is not on the page";
  return {};
}

std::vector<PrintedPage> PagesOf(const std::vector<Json>& printed, Here here) {
  std::vector<PrintedPage> pages;
  if (printed.size() != 1) {
    const auto trace = At(here);
    ADD_FAILURE() << printed.size() << " documents came out";
    return pages;
  }
  for (const Json& page : printed[0]["pages"]) pages.push_back(PageOf(page));
  return pages;
}

void ExpectAt(const PrintedText& text, double x, double y, Here here) {
  const auto trace = At(here);
  EXPECT_NEAR(text.x, x, kNothing) << text.text;
  EXPECT_NEAR(text.y, y, kNothing) << text.text;
}

void ExpectStroke(const PrintedStroke& stroke, const PrintedStroke& expected, Here here) {
  const auto trace = At(here);
  EXPECT_NEAR(stroke.x1, expected.x1, kNothing);
  EXPECT_NEAR(stroke.y1, expected.y1, kNothing);
  EXPECT_NEAR(stroke.x2, expected.x2, kNothing);
  EXPECT_NEAR(stroke.y2, expected.y2, kNothing);
}

}  // namespace marlowbeck
