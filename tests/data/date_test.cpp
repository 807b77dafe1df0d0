#include "data/date.h"

#include <cmath>

#include <gtest/gtest.h>

#include "tests/data/expect_error.h"

namespace marlowbeck {
namespace {

TEST(Date, CountsDaysFromTheThirtiethOfDecember1899) {
  EXPECT_EQ(DateFromCivil({1899, 12, 30})->days, 0);
  EXPECT_EQ(DateFromCivil({1900, 1, 1})->days, 2);
  EXPECT_EQ(DateFromCivil({2004, 3, 31})->days, 38077);
  EXPECT_EQ(DateFromCivil({1899, 12, 29})->days, -1);
}

TEST(Date, EndsAtTheYears100And9999) {
  EXPECT_EQ(DateFromCivil({100, 1, 1})->days, -657434);
  EXPECT_EQ(DateFromCivil({9999, 12, 31})->days, 2958465);
  EXPECT_FALSE(DateFromCivil({99, 12, 31}));
  EXPECT_FALSE(DateFromCivil({10000, 1, 1}));
  EXPECT_EQ(ShortDate(Date{-657434}), "01/01/0100");
  EXPECT_EQ(ShortDate(Date{2958465}), "31/12/9999");
  EXPECT_ERROR(6, (void)ShortDate(Date{-657435}));
  EXPECT_ERROR(6, (void)ShortDate(Date{2958466}));
  EXPECT_ERROR(6, (void)LongDate(Date{1e300}));
  EXPECT_ERROR(6, (void)IsoDate(Date{std::nan("")}));
  EXPECT_ERROR(6, (void)DayName(Date{-HUGE_VAL}));
}

TEST(Date, KnowsTheLeapYears) {
  EXPECT_TRUE(DateFromCivil({2004, 2, 29}));
  EXPECT_TRUE(DateFromCivil({2000, 2, 29}));
  EXPECT_FALSE(DateFromCivil({1900, 2, 29}));
  EXPECT_FALSE(DateFromCivil({2003, 2, 29}));
  EXPECT_FALSE(DateFromCivil({2004, 4, 31}));
  EXPECT_FALSE(DateFromCivil({2004, 0, 1}));
  EXPECT_FALSE(DateFromCivil({2004, 13, 1}));
  EXPECT_FALSE(DateFromCivil({2004, 1, 0}));
}

TEST(Date, IsWrittenInItsFixedForms) {
  const Date date{38077};
  EXPECT_EQ(ShortDate(date), "31/03/2004");
  EXPECT_EQ(LongDate(date), "Wednesday, 31 March 2004");
  EXPECT_EQ(LongDate(Date{38078}), "Thursday, 1 April 2004");
  EXPECT_EQ(DayName(date), "Wednesday");
  EXPECT_EQ(IsoDate(date), "2004-03-31");
  EXPECT_EQ(ShortDate(Date{38077.75}), "31/03/2004") << "a time of day is passed over";
}

TEST(Date, ReadsBackWhatItWrites) {
  for (double day = -657434; day <= 2958465; day += 1237) {
    const Date date{day};
    ASSERT_EQ(DateFromIso(IsoDate(date)), date) << day;
    ASSERT_EQ(DateFromText(ShortDate(date)), date) << day;
    ASSERT_EQ(DateFromText(IsoDate(date)), date) << day;
  }
  for (double day = 36526; day <= 36526 + 366; ++day) {
    ASSERT_EQ(DateFromText(LongDate(Date{day})), Date{day});
  }
}

TEST(DateFromText, TakesTwoFiguresOfAYear) {
  EXPECT_EQ(ShortDate(DateFromText("1/2/29")), "01/02/2029");
  EXPECT_EQ(ShortDate(DateFromText("1/2/30")), "01/02/1930");
  EXPECT_EQ(ShortDate(DateFromText("1/2/00")), "01/02/2000");
  EXPECT_EQ(ShortDate(DateFromText(" 31/3/2004 ")), "31/03/2004");
}

TEST(DateFromText, RefusesWhatIsNoDate) {
  for (const char* text : {"", "31", "31/3", "29/2/2003", "2004-3", "a/b/c", "31/03/2004/1",
                           "Wednesday", "Wednesday, 31 Marsh 2004", "31 March", "-1/2/2004",
                           "1/2/20040", "#2004-03-31#", "31/03/99999"}) {
    EXPECT_ERROR(13, (void)DateFromText(text)) << text;
  }
}

TEST(DateFromIso, WantsAYearOfFourFigures) {
  EXPECT_TRUE(DateFromIso("2004-03-31"));
  EXPECT_FALSE(DateFromIso("04-03-31"));
  EXPECT_FALSE(DateFromIso("2004-13-01"));
  EXPECT_FALSE(DateFromIso("2004/03/31"));
  EXPECT_FALSE(DateFromIso(""));
}

TEST(Date, NothingIsSetByZeroOrByNoNumber) {
  EXPECT_FALSE(Date{}.IsSet());
  EXPECT_FALSE(Date{std::nan("")}.IsSet());
  EXPECT_TRUE(Date{1}.IsSet());
}

}  // namespace
}  // namespace marlowbeck
