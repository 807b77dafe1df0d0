#include "support/club.h"

namespace marlowbeck {
namespace {

using DriverOnTheMainMenu = ClubTest;

TEST_F(DriverOnTheMainMenu, IsInFrontBeforeTheFirstCommand) {
  EXPECT_EQ(Front(), "frmDB");
  EXPECT_TRUE(Loaded("frmDB"));
}

TEST_F(DriverOnTheMainMenu, TellsTheBoxOfAStartWithNoFileInTheFirstEvents) {
  WriteFile("FileName.qz3", "\"\"\r\n");
  const Json answer = Do("events");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].style, 48);
  EXPECT_EQ(Do("events")["events"], Json::array());
}

}  // namespace
}  // namespace marlowbeck
