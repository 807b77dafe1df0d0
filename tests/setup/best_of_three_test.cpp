#include "setup/best_of_three.h"

#include <gtest/gtest.h>

#include "support/record_files.h"

namespace marlowbeck {
namespace {

struct Coded {
  BestOfThreeChoice choice;
  int code;
};

const std::vector<Coded> kAllChoices = {
    {{false, false, false, false}, 0}, {{false, false, false, true}, 111},
    {{true, true, true, false}, 333},  {{true, false, false, false}, 300},
    {{false, true, false, false}, 30}, {{false, false, true, false}, 3},
    {{true, true, false, false}, 330}, {{true, false, true, false}, 303},
    {{false, true, true, false}, 33},
};

TEST(BestOfThree, EveryChoiceHasItsCodeAndBack) {
  for (const Coded& coded : kAllChoices) {
    EXPECT_EQ(CodeOf(coded.choice), coded.code);
    EXPECT_EQ(ChoiceOf(coded.code), coded.choice) << coded.code;
  }
}

TEST(BestOfThree, NoneCountsWhateverTheGamesSay) {
  EXPECT_EQ(CodeOf({true, false, true, true}), 111);
  EXPECT_EQ(CodeOf({true, true, true, true}), 111);
}

TEST(BestOfThree, ANumberThatIsNoCodeChoosesNothing) {
  for (const int code : {-1, 1, 2, 10, 100, 110, 222, 332, 334, 3330, 32767}) {
    EXPECT_EQ(ChoiceOf(code), BestOfThreeChoice()) << code;
  }
}

TEST(BestOfThree, StampChangesTheCodeOfAPlayerOfTheGradeAlone) {
  PlayerBytes player = Encode(Player(3, "Cole", "Di", "Hawks", "A Grade", 0));
  EXPECT_FALSE(StampBestOfThree(player, "a grade", 3));
  EXPECT_EQ(player, Encode(Player(3, "Cole", "Di", "Hawks", "A Grade", 0)));
  EXPECT_TRUE(StampBestOfThree(player, " A Grade ", 3));
  EXPECT_EQ(player, Encode(Player(3, "Cole", "Di", "Hawks", "A Grade", 3)));
}

TEST(BestOfThree, StampLeavesEveryOtherByteOfNonsenseAsItIs) {
  std::string player(kPlayerLength, '\xff');
  player.replace(94, 20, "A Grade             ");
  std::string expected = player;
  expected.replace(152, 4, std::string("\x4d\x01\0\0", 4));  // 333
  EXPECT_TRUE(StampBestOfThree(std::as_writable_bytes(std::span(player)), "A Grade", 333));
  EXPECT_EQ(player, expected);
}

}  // namespace
}  // namespace marlowbeck
