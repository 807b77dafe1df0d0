#include "results/score_rules.h"

#include <gtest/gtest.h>

#include "data/numbers.h"
#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

TEST(CheckScores, NothingScoredIsWhenAllThreeAreBelowOne) {
  EXPECT_EQ(CheckScores(0, 0, 0), CenturiesCheck::NothingScored);
  EXPECT_EQ(CheckScores(0.9, 0.9, 0.9), CenturiesCheck::NothingScored);
  EXPECT_EQ(CheckScores(-5, 0, 0), CenturiesCheck::NothingScored);
  EXPECT_NE(CheckScores(1, 0, 0), CenturiesCheck::NothingScored);
}

TEST(CheckScores, AHighScoreAbove180IsTheFirstThingSaid) {
  EXPECT_EQ(CheckScores(181, 0, 5), CenturiesCheck::HighScoreAbove180);
  EXPECT_EQ(CheckScores(180, 1, 1), CenturiesCheck::Passed);
}

TEST(CheckScores, CenturiesNeedAHighScore) {
  EXPECT_EQ(CheckScores(0, 1, 0), CenturiesCheck::NoHighScore);
  EXPECT_EQ(CheckScores(0.5, 1, 2), CenturiesCheck::NoHighScore);
}

TEST(CheckScores, CenturiesNeedAHighScoreOf100) {
  EXPECT_EQ(CheckScores(99, 1, 0), CenturiesCheck::HighScoreBelow100);
  EXPECT_EQ(CheckScores(100, 1, 0), CenturiesCheck::Passed);
}

TEST(CheckScores, AHighScoreOf100NeedsCenturies) {
  EXPECT_EQ(CheckScores(100, 0, 0), CenturiesCheck::NoCenturies);
  EXPECT_EQ(CheckScores(99, 0, 0), CenturiesCheck::Passed);
  EXPECT_EQ(CheckScores(180, 0, 0), CenturiesCheck::NoCenturies);
}

TEST(CheckScores, AHighScoreOfExactly180AsksForThe180s) {
  EXPECT_EQ(CheckScores(180, 2, 0), CenturiesCheck::No180s);
  EXPECT_EQ(CheckScores(179, 2, 0), CenturiesCheck::Passed);
}

TEST(CheckScores, A180NeedsAHighScoreOf180) {
  EXPECT_EQ(CheckScores(120, 2, 2), CenturiesCheck::HighScoreNot180);
  EXPECT_EQ(CheckScores(0, 0, 1), CenturiesCheck::HighScoreNot180);
  // Also where there are too few centuries: that is looked at last.
  EXPECT_EQ(CheckScores(120, 1, 2), CenturiesCheck::HighScoreNot180);
}

TEST(CheckScores, EachOf180sIsACentury) {
  EXPECT_EQ(CheckScores(180, 1, 2), CenturiesCheck::FewerCenturiesThan180s);
  EXPECT_EQ(CheckScores(180, 2, 2), CenturiesCheck::Passed);
}

TEST(SheetAverage, IsCutAndNeverRounded) {
  EXPECT_EQ(TwoPlaces(SheetAverage(1000, 21)), "47.61");
  EXPECT_EQ(TwoPlaces(SheetAverage(999, 10)), "99.90");
  EXPECT_EQ(TwoPlaces(SheetAverage(1, 3)), "0.33");
  EXPECT_EQ(TwoPlaces(SheetAverage(2, 3)), "0.66");
}

TEST(SheetAverage, FormsTheQuotientFirst) {
  // 17.9 is a little less than itself once it is taken a hundredfold.
  EXPECT_EQ(TwoPlaces(SheetAverage(179, 10)), "17.89");
}

TEST(SheetAverage, OverflowsBeyondEveryNumber) {
  EXPECT_THROW((void)SheetAverage(7000, 1e-310), RunTimeError);
}

struct PegCase {
  int code;
  std::array<bool, 6> shown;
};

class PegBoxesOf : public ::testing::TestWithParam<PegCase> {};

TEST_P(PegBoxesOf, ShowTwoBoxesWhereTheGameIsBestOfThree) {
  const PegBoxes boxes = PegBoxesFor(GetParam().code, {"Triples", "Doubles", "Singles"});
  EXPECT_EQ(boxes.shown, GetParam().shown);
  const auto first = [&](std::size_t game) {
    return boxes.shown[2 * game + 1] ? std::string(" Peg 1:") : std::string(" Peg:");
  };
  EXPECT_EQ(boxes.captions[0], first(0) + "Triples");
  EXPECT_EQ(boxes.captions[2], first(1) + "Doubles");
  EXPECT_EQ(boxes.captions[4], first(2) + "Singles");
  EXPECT_EQ(boxes.captions[1], " Peg 2:Triples");
  EXPECT_EQ(boxes.captions[3], " Peg 2:Doubles");
  EXPECT_EQ(boxes.captions[5], " Peg 2:Singles");
}

INSTANTIATE_TEST_SUITE_P(Codes, PegBoxesOf,
                         ::testing::Values(PegCase{333, {true, true, true, true, true, true}},
                                           PegCase{0, {true, true, true, true, true, true}},
                                           PegCase{-7, {true, true, true, true, true, true}},
                                           PegCase{330, {true, true, true, true, true, false}},
                                           PegCase{303, {true, true, true, false, true, true}},
                                           PegCase{33, {true, false, true, true, true, true}},
                                           PegCase{300, {true, true, true, false, true, false}},
                                           PegCase{30, {true, false, true, true, true, false}},
                                           PegCase{3, {true, false, true, false, true, true}},
                                           PegCase{111, {true, false, true, false, true, false}}),
                         [](const auto& given) {
                           return given.param.code < 0 ? std::string("Negative")
                                                       : std::to_string(given.param.code);
                         });

}  // namespace
}  // namespace marlowbeck
