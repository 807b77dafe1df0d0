#include "data/numbers.h"

#include <clocale>
#include <cmath>
#include <limits>

#include <gtest/gtest.h>

#include "data/runtime_error.h"
#include "tests/data/expect_error.h"

namespace marlowbeck {
namespace {

TEST(RoundHalfEven, GoesToTheNearestAndHalvesToTheEvenNeighbour) {
  EXPECT_EQ(RoundHalfEven(-2.5), -2);
  EXPECT_EQ(RoundHalfEven(-1.5), -2);
  EXPECT_EQ(RoundHalfEven(-0.5), 0);
  EXPECT_EQ(RoundHalfEven(0.5), 0);
  EXPECT_EQ(RoundHalfEven(1.5), 2);
  EXPECT_EQ(RoundHalfEven(2.5), 2);
  EXPECT_EQ(RoundHalfEven(3.5), 4);
  EXPECT_EQ(RoundHalfEven(2.4999999), 2);
  EXPECT_EQ(RoundHalfEven(2.5000001), 3);
  EXPECT_EQ(RoundHalfEven(-7), -7);
}

TEST(Integer, HoldsTheWholeRangeAndNothingBeyond) {
  EXPECT_EQ(int{Integer(32767)}, 32767);
  EXPECT_EQ(int{Integer(-32768)}, -32768);
  EXPECT_ERROR(6, Integer(32768));
  EXPECT_ERROR(6, Integer(-32769));
}

TEST(Integer, NarrowsHalvesToEvenBeforeItLooksAtTheRange) {
  EXPECT_EQ(int{Integer::Narrow(32767.49)}, 32767);
  EXPECT_ERROR(6, (void)Integer::Narrow(32767.5));
  EXPECT_EQ(int{Integer::Narrow(-32768.5)}, -32768);
  EXPECT_ERROR(6, (void)Integer::Narrow(-32768.51));
  EXPECT_ERROR(6, (void)Integer::Narrow(std::nan("")));
  EXPECT_ERROR(6, (void)Integer::Narrow(HUGE_VAL));
  EXPECT_ERROR(6, (void)Integer::Narrow(-HUGE_VAL));
}

TEST(Integer, SumsAreChecked) {
  Integer number = 32766;
  EXPECT_EQ(int{++number}, 32767);
  EXPECT_ERROR(6, ++number);
  EXPECT_EQ(int{number}, 32767) << "a refused sum changes nothing";
  EXPECT_ERROR(6, number += std::numeric_limits<int>::max());
  number = -32768;
  EXPECT_ERROR(6, number -= 1);
  EXPECT_ERROR(6, number -= std::numeric_limits<int>::min());
  number -= -5;
  EXPECT_EQ(int{number}, -32763);
}

TEST(NarrowToLong, HoldsTheWholeRangeAndNothingBeyond) {
  EXPECT_EQ(NarrowToLong(2147483647.4), 2147483647);
  EXPECT_ERROR(6, (void)NarrowToLong(2147483647.5));
  EXPECT_EQ(NarrowToLong(-2147483648.5), std::numeric_limits<std::int32_t>::min());
  EXPECT_ERROR(6, (void)NarrowToLong(-2147483649.0));
  EXPECT_EQ(NarrowToLong(2.5), 2);
}

TEST(Val, TakesTheLongestNumericPrefix) {
  EXPECT_EQ(Val("180"), 180);
  EXPECT_EQ(Val("  42 darts"), 42);
  EXPECT_EQ(Val("1e5"), 100000);
  EXPECT_EQ(Val("1e"), 1);
  EXPECT_EQ(Val("1e+"), 1);
  EXPECT_EQ(Val("1d3"), 1);
  EXPECT_EQ(Val("1.5.2"), 1.5);
  EXPECT_EQ(Val("1,000"), 1);
  EXPECT_EQ(Val(".5"), 0.5);
  EXPECT_EQ(Val("-.5"), -0.5);
  EXPECT_EQ(Val("5."), 5);
  EXPECT_EQ(Val("-12abc"), -12);
  EXPECT_EQ(Val("+7"), 7);
  EXPECT_EQ(Val("0x10"), 0);
}

TEST(Val, IsZeroWhereThereIsNoNumber) {
  for (const char* text : {"", " ", "-", "+", ".", "-.", "+-5", "-+5", "--5", "- 5", "&H", "&H1F",
                           "e5", "inf", "nan", "infinity", "abc", "\r5"}) {
    EXPECT_EQ(Val(text), 0) << '"' << text << '"';
  }
}

TEST(Val, OfWhatNoDoubleCanHoldIsInfiniteOrZero) {
  EXPECT_EQ(Val("1e400"), HUGE_VAL);
  EXPECT_EQ(Val("-1e400"), -HUGE_VAL);
  EXPECT_EQ(Val("1e-400"), 0);
  EXPECT_EQ(Val("-.1e-400"), 0);
  EXPECT_EQ(Val(std::string(400, '9')), HUGE_VAL);
  EXPECT_EQ(Val("0." + std::string(400, '0') + "1"), 0);
  EXPECT_ERROR(6, (void)Integer::Narrow(Val("1e400")));
}

TEST(NumberOf, TakesAWholeTextOnly) {
  EXPECT_EQ(NumberOf(" 12.5 "), 12.5);
  EXPECT_EQ(NumberOf("-3"), -3);
  for (const char* text : {"", " ", "12 b", "1.5.2", "1 2", "-", "&H10", "twelve"}) {
    EXPECT_ERROR(13, (void)NumberOf(text));
  }
}

TEST(CInt, RoundsHalvesToEvenAndChecksTheRange) {
  EXPECT_EQ(int{CInt("2.5")}, 2);
  EXPECT_EQ(int{CInt("3.5")}, 4);
  EXPECT_EQ(int{CInt("32767.4")}, 32767);
  EXPECT_ERROR(6, (void)CInt("32768"));
  EXPECT_ERROR(6, (void)CInt("1e400"));
  EXPECT_ERROR(13, (void)CInt("a"));
}

TEST(Int, IsTheFloor) {
  EXPECT_EQ(Int(2.9), 2);
  EXPECT_EQ(Int(-2.1), -3);
  EXPECT_EQ(Int(-3), -3);
}

TEST(NumberText, IsAsShortAsTheNumber) {
  EXPECT_EQ(NumberText(50), "50");
  EXPECT_EQ(NumberText(47.5), "47.5");
  EXPECT_EQ(NumberText(-3), "-3");
  EXPECT_EQ(NumberText(-0.0), "0");
  EXPECT_EQ(NumberText(0.1 + 0.2), "0.3");
  EXPECT_EQ(NumberText(32767), "32767");
  EXPECT_EQ(NumberText(123456789012345), "123456789012345");
}

TEST(TwoPlaces, AlwaysHasADigitBeforeThePoint) {
  EXPECT_EQ(TwoPlaces(0.5), "0.50");
  EXPECT_EQ(TwoPlaces(0), "0.00");
  EXPECT_EQ(TwoPlaces(-0.0), "0.00");
  EXPECT_EQ(TwoPlaces(47.61), "47.61");
  EXPECT_EQ(TwoPlaces(1234.5), "1234.50");
  EXPECT_EQ(TwoPlaces(-1.25), "-1.25");
}

TEST(Averages, AreCutAndNeverRounded) {
  EXPECT_EQ(TwoPlaces(AverageQuotientFirst(1000, 21)), "47.61");  // 47.6190...
  EXPECT_EQ(TwoPlaces(AverageQuotientFirst(1, 3)), "0.33");
  EXPECT_EQ(TwoPlaces(AverageQuotientFirst(2, 3)), "0.66");
  EXPECT_EQ(TwoPlaces(AverageQuotientFirst(999, 1000)), "0.99");
  EXPECT_EQ(TwoPlaces(AverageQuotientFirst(500, 10)), "50.00");
}

// 17.9 has no exact double, and a hundred times it lies just below 1790.
TEST(Averages, FormTheQuotientFirstSoThat179Over10Shows1789) {
  EXPECT_EQ(TwoPlaces(AverageQuotientFirst(179, 10)), "17.89");
  EXPECT_EQ(TwoPlaces(AverageHundredfold(179, 10)), "17.89");
}

TEST(Averages, AreTheSameInBothFormsThatReportsWriteThemIn) {
  for (int aggregate = -5; aggregate <= 2000; aggregate += 7) {
    for (int shots = 1; shots <= 90; ++shots) {
      const double quotient_first = Int(double(aggregate) / shots * 100) / 100;
      const double hundredfold = Int(100 * (double(aggregate) / shots)) / 100;
      ASSERT_EQ(AverageQuotientFirst(aggregate, shots), quotient_first);
      ASSERT_EQ(AverageHundredfold(aggregate, shots), hundredfold);
    }
  }
}

TEST(Divide, ByNothingRaisesDivisionByZeroWhateverIsDivided) {
  EXPECT_EQ(Divide(3, 2), 1.5);
  EXPECT_ERROR(11, (void)Divide(3, 0));
  EXPECT_ERROR(11, (void)Divide(0, 0));
}

// A program with windows takes over the machine's habits, a comma for the decimals among them.
TEST(NumbersAsText, DoNotFollowTheMachinesDecimalComma) {
  const std::string before = std::setlocale(LC_ALL, nullptr);
  const char* changed = nullptr;
  for (const char* name : {"de_DE.UTF-8", "de_DE.utf8", "fr_FR.UTF-8", "nl_NL.UTF-8"}) {
    if (changed == nullptr) changed = std::setlocale(LC_ALL, name);
  }
  if (changed == nullptr) GTEST_SKIP() << "no locale with a decimal comma on this machine";
  EXPECT_EQ(TwoPlaces(17.5), "17.50");
  EXPECT_EQ(NumberText(17.5), "17.5");
  EXPECT_EQ(Val("17.5"), 17.5);
  std::setlocale(LC_ALL, before.c_str());
}

}  // namespace
}  // namespace marlowbeck
