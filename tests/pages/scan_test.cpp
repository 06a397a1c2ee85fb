#include "pages/scan.h"

#include <gtest/gtest.h>

namespace gridbay {
namespace pages_scan_test {

TEST(Scan, AllWhiteSpaceIsTrimmed) {
  EXPECT_EQ(trimmed(" \t\r\n\f\va b\v\f\n\r\t "), "a b");
  EXPECT_EQ(trimmed(" \v"), "");
}

TEST(Scan, PointsAreReadFromTheFront) {
  for (const char* text : {"(3,4)", "3,4", "(3,4", "3,4x", "( 3 , 4 )", "+3,4"})
    EXPECT_EQ(scannedPoint(text), (GridPoint{3, 4})) << text;
  for (const char* text : {"3;4", "3", "", "(3;4)", "x", "3,", "99999999999,1"})
    EXPECT_FALSE(scannedPoint(text)) << text;
  EXPECT_EQ(scannedPoint("(-3,-4)"), (GridPoint{-3, -4}));
}

TEST(Scan, RangesHaveAnIntervalOfOneUnlessToldOtherwise) {
  EXPECT_EQ(scannedRange("0-100,5"), (USubLine{0, 100, 5}));
  EXPECT_EQ(scannedRange("0-100"), (USubLine{0, 100, 1}));
  EXPECT_EQ(scannedRange("0-100,x"), (USubLine{0, 100, 1}));
  EXPECT_FALSE(scannedRange("100"));
  EXPECT_FALSE(scannedRange(""));
}

TEST(Scan, Numbers) {
  EXPECT_EQ(scannedInteger("12x"), 12);
  EXPECT_FALSE(scannedInteger("x"));
  EXPECT_FALSE(scannedInteger("99999999999"));
  EXPECT_EQ(plainInteger("12x"), 12);
  EXPECT_EQ(plainInteger("x"), 0);
  EXPECT_EQ(plainInteger("99999999999"), 2147483647);
  EXPECT_EQ(plainInteger("-99999999999"), -2147483647 - 1);
  EXPECT_EQ(scannedReal("1.5 m"), 1.5);
  EXPECT_EQ(scannedReal("+2e3"), 2000);
  for (const char* text : {"nan", "inf", "", "m", "1e999", "+-1"}) EXPECT_FALSE(scannedReal(text)) << text;
}

TEST(Scan, WhatIsReadIsSetAlsoWhereTheTextEndsEarly) {
  float a = -1;
  float b = -1;
  EXPECT_EQ(scan("1.5 of", "%f of %f", {&a, &b}), 1);
  EXPECT_EQ(a, 1.5F);
  EXPECT_EQ(b, -1.0F);
  EXPECT_EQ(scan("2of3", "%f of %f", {&a, &b}), 2);
  EXPECT_EQ(b, 3.0F);
}

}  // namespace pages_scan_test
}  // namespace gridbay
