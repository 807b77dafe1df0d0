#include "print/tabbed_text.h"

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

using LastTab = TabbedText::LastTab;

TEST(TabbedText, LinesEndWithCrLf) {
  EXPECT_EQ(TabbedText().Line("A title").Line("").Text(), "A title\r\n\r\n");
}

TEST(TabbedText, CellsOfARowHaveTabsBetween) {
  EXPECT_EQ(TabbedText().Row({"Jo", "", "12"}, LastTab::No).Text(), "Jo\t\t12\r\n");
}

TEST(TabbedText, ARowMayEndWithATab) {
  EXPECT_EQ(TabbedText().Row({"Jo", "12"}, LastTab::Yes).Text(), "Jo\t12\t\r\n");
}

TEST(TabbedText, ARowWithoutCellsIsAnEmptyLine) {
  EXPECT_EQ(TabbedText().Row({}, LastTab::Yes).Text(), "\r\n");
}

}  // namespace
}  // namespace marlowbeck
