#include "ladder/ladder_rules.h"

#include <fstream>

#include <gtest/gtest.h>

#include "data/real_file_system.h"
#include "support/club.h"

namespace marlowbeck {
namespace {

class LadderRulesTest : public ::testing::Test {
 protected:
  LadderRulesTest() : path_((folder_.Path() / "Winter_A.qzi").string()) {}

  /// The five numbers read from a text; nothing when they cannot be read.
  std::vector<int> Read(std::string_view text) {
    std::ofstream(path_, std::ios::binary) << text;
    try {
      const LadderRules rules = ReadLadderRules(channels_, path_);
      return {rules.WinPoints, rules.LossPoints, rules.DrawPoints, rules.FinalsTeams,
              rules.GamesPerMatch};
    } catch (const RunTimeError&) {
      channels_.AbandonAll();
      return {};
    }
  }
  std::string Written(const LadderRules& rules) {
    WriteLadderRules(channels_, path_, rules);
    return channels_.ReadWhole(path_);
  }

  TemporaryFolder folder_;
  std::string path_;
  RealFileSystem files_;
  Channels channels_{files_};
};

using Five = std::vector<int>;

TEST_F(LadderRulesTest, TheUsualRulesAreOneLineOfFreeText) {
  EXPECT_EQ(Written({}), " 2  0  1  4  11 \r\n");
}

TEST_F(LadderRulesTest, ANumberBelowZeroHasItsSignInThePlaceOfTheBlank) {
  LadderRules rules;
  rules.LossPoints = -1;
  rules.GamesPerMatch = -32768;
  EXPECT_EQ(Written(rules), " 2 -1  1  4 -32768 \r\n");
  EXPECT_EQ(Read(Written(rules)), (Five{2, -1, 1, 4, -32768}));
}

TEST_F(LadderRulesTest, NumbersArePartedByBlanksCommasOrLineEnds) {
  EXPECT_EQ(Read(" 2  0  1  4  11 \r\n"), (Five{2, 0, 1, 4, 11}));
  EXPECT_EQ(Read("3 1 2 6 9"), (Five{3, 1, 2, 6, 9}));
  EXPECT_EQ(Read("3,1,2,6,9\r\n"), (Five{3, 1, 2, 6, 9}));
  EXPECT_EQ(Read("3\r\n1\n2\r\n\r\n6 9\r\n"), (Five{3, 1, 2, 6, 9}));
}

TEST_F(LadderRulesTest, DecimalsAreRoundedHalvesToTheEvenNumber) {
  EXPECT_EQ(Read(" 2.5  0.5  1.5  4  10.6 "), (Five{2, 0, 2, 4, 11}));
}

TEST_F(LadderRulesTest, WhatIsEmptyShortOrNoNumberCannotBeRead) {
  for (const char* text :
       {"", "\r\n", " 2  0  1  4 ", " 2  0  1  4  x ", "two", " 2  0  1  4  40000 "}) {
    EXPECT_EQ(Read(text), Five{}) << text;
  }
}

TEST_F(LadderRulesTest, WhatFollowsTheFifthNumberIsNotRead) {
  EXPECT_EQ(Read(" 2  0  1  4  11  x "), (Five{2, 0, 1, 4, 11}));
}

}  // namespace
}  // namespace marlowbeck
