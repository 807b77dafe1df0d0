#include "support/club.h"

namespace marlowbeck {
namespace {

using FirstEvening = ClubTest;

TEST_F(FirstEvening, EndsWithOnePlayerListed) {
  DoAll({"answer yes", "file Winter.qza", "click mnuNew", "screens", "type txtAddSn0 Archer",
         "type txtAddFn0 Jo", "type txtAddTm0 Rovers", "type txtAddGrd0 A Grade", "click chkNone",
         "click cmdAddSave0"});
  EXPECT_EQ(Caption("lblHMP"), "Players: (1)  Select to Edit or Delete");
  const auto players = Players("Winter.qza");
  ASSERT_EQ(players.size(), 1U);
  EXPECT_EQ(Trim(players[0].Surname), "Archer");
  EXPECT_EQ(Trim(players[0].Grade), "A Grade");
}

}  // namespace
}  // namespace marlowbeck
