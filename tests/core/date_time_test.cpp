#include "core/date_time.h"

#include <gtest/gtest.h>

#include <random>

namespace gridbay {
namespace core_date_time_test {

TEST(DateTime, DayNumbers) {
  EXPECT_EQ(DateTime::of({1899, 12, 30, 0, 0, 0}).day, 0);
  EXPECT_EQ(DateTime::of({1899, 12, 31, 12, 0, 0}).day, 1.5);
  EXPECT_EQ(DateTime::of({1990, 1, 1, 12, 0, 0}).day, 32874.5);
  // Before day 0 the time of day is a positive fraction.
  EXPECT_EQ(DateTime::of({1899, 12, 29, 6, 0, 0}).day, -1.25);
  EXPECT_EQ(DateTime::of({1899, 12, 29, 6, 0, 0}).linear(), -0.75);
}

TEST(DateTime, EverySecondComesBack) {
  std::mt19937 random(7);
  std::uniform_int_distribution<int> year(100, 9999), month(1, 12), day(1, 28), hour(0, 23), minute(0, 59);
  for (int i = 0; i < 100000; ++i) {
    const std::array<std::int32_t, 6> parts{year(random), month(random),  day(random),
                                            hour(random), minute(random), minute(random)};
    const DateTime moment = DateTime::of(parts);
    ASSERT_TRUE(moment.valid());
    ASSERT_EQ(moment.parts(), parts);
  }
}

TEST(DateTime, SumsGoStraightThroughDayZero) {
  const DateTime before = DateTime::of({1899, 12, 28, 18, 0, 0});
  EXPECT_EQ(dateTimeText(before.plusDays(1)), "1899-12-29 18:00:00");
  EXPECT_EQ(dateTimeText(before.plusDays(2.25)), "1899-12-31 00:00:00");
}

TEST(DateTime, MomentsThatThereAreNot) {
  for (const std::array<std::int32_t, 6>& parts : {std::array<std::int32_t, 6>{1990, 2, 30, 0, 0, 0},
                                                   {1990, 13, 1, 0, 0, 0},
                                                   {1990, 1, 1, 24, 0, 0},
                                                   {1990, 1, 1, 0, 60, 0},
                                                   {-1, -1, -1, -1, -1, -1},
                                                   {99, 1, 1, 0, 0, 0},
                                                   {10000, 1, 1, 0, 0, 0}}) {
    EXPECT_EQ(DateTime::of(parts).status, 1);
  }
  EXPECT_FALSE(DateTime::invalid().parts());
  EXPECT_EQ(dateTimeText(DateTime::invalid()), "no date");
}

TEST(DateTime, Texts) {
  EXPECT_EQ(dateTimeText(*dateTimeOfText("1993-07-12 13:17:00")), "1993-07-12 13:17:00");
  EXPECT_EQ(dateTimeText(*dateTimeOfText("1993-07-12T13:17")), "1993-07-12 13:17:00");
  EXPECT_EQ(dateTimeText(*dateTimeOfText("1993-07-12")), "1993-07-12 00:00:00");
  for (const char* bad :
       {"", "x", "1993", "1993-07", "1993-07-12 13", "1993-07-32", "1993-07-12 13:17:00x", "12/7/1993"}) {
    EXPECT_FALSE(dateTimeOfText(bad)) << bad;
  }
}

}  // namespace core_date_time_test
}  // namespace gridbay
