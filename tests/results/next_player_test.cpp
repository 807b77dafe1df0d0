#include "results/next_player.h"

#include "data/runtime_error.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

NextPlayer After(const std::vector<int>& ids) {
  NextPlayer next;
  for (const int id : ids) next.AddPlayer(Encode(Player(id, "S", "F", "T", "G")));
  return next;
}

TEST(NextPlayer, FollowsTheHighestId) {
  EXPECT_EQ(After({}).ID(), 1);
  EXPECT_EQ(After({1}).ID(), 2);
  EXPECT_EQ(After({5, 40, 7}).ID(), 41);
  EXPECT_EQ(After({-3, -70000}).ID(), 1);
  EXPECT_EQ(After({32766}).ID(), 32767);
}

TEST(NextPlayer, BehindSixteenBitsThereIsNone) {
  EXPECT_THROW(static_cast<void>(After({32767}).ID()), RunTimeError);
  EXPECT_THROW(After({1, 32768}), RunTimeError);
}

TEST(NextPlayer, TakesTheReservedDateOfTheLastRecord) {
  PlayerRecord dated = Player(1, "S", "F", "T", "G");
  dated.Reserved1 = March(3);
  NextPlayer next;
  EXPECT_EQ(next.Reserved1(), Date{});
  next.AddPlayer(Encode(dated));
  EXPECT_EQ(next.Reserved1(), March(3));
  next.AddPlayer(Encode(Player(2, "S", "F", "T", "G")));
  EXPECT_EQ(next.Reserved1(), Date{});
}

}  // namespace
}  // namespace marlowbeck
