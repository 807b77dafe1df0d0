#include "data/date_steps.h"

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

const std::vector<Date> kDates = {Date{10}, Date{20}, Date{30}};

void ExpectStep(const std::optional<DateStep>& step, double day, bool at_end) {
  ASSERT_TRUE(step);
  EXPECT_EQ(step->date, Date{day});
  EXPECT_EQ(step->at_end, at_end);
}

TEST(DateSteps, OnlyNeighboursThatAreEqualAreOne) {
  const std::vector<Date> dates = {Date{10}, Date{10}, Date{20}, Date{10}};
  EXPECT_EQ(WithoutRepeats(dates), (std::vector<Date>{Date{10}, Date{20}, Date{10}}));
  EXPECT_TRUE(WithoutRepeats({}).empty());
}

TEST(DateSteps, ForwardGoesToTheFirstLaterDate) {
  ExpectStep(StepForward(kDates, Date{5}), 10, false);
  ExpectStep(StepForward(kDates, Date{10}), 20, false);
}

TEST(DateSteps, ForwardTellsTheLastDateAsTheEndEvenWhenItIsASimpleStep) {
  ExpectStep(StepForward(kDates, Date{20}), 30, true);
}

TEST(DateSteps, ForwardOnTheLastDateStaysAndPastItComesBack) {
  ExpectStep(StepForward(kDates, Date{30}), 30, true);
  ExpectStep(StepForward(kDates, Date{99}), 30, true);
}

TEST(DateSteps, BackIsTheMirrorOfForward) {
  ExpectStep(StepBack(kDates, Date{99}), 30, false);
  ExpectStep(StepBack(kDates, Date{30}), 20, false);
  ExpectStep(StepBack(kDates, Date{20}), 10, true);
  ExpectStep(StepBack(kDates, Date{10}), 10, true);
  ExpectStep(StepBack(kDates, Date{1}), 10, true);
}

TEST(DateSteps, WithoutDatesThereIsNoStep) {
  EXPECT_FALSE(StepForward({}, Date{10}));
  EXPECT_FALSE(StepBack({}, Date{10}));
}

}  // namespace
}  // namespace marlowbeck
