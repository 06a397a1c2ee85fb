#include "core/number_text.h"

#include <fmt/format.h>
#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <limits>
#include <random>

namespace gridbay {
namespace core_number_text_test {

TEST(NumberText, ShortestTextsAlwaysTellRealsFromIntegers) {
  EXPECT_EQ(numberText(std::int64_t{0}), "0");
  EXPECT_EQ(numberText(std::numeric_limits<std::int64_t>::min()), "-9223372036854775808");
  EXPECT_EQ(numberText(30.0F), "30.0");
  EXPECT_EQ(numberText(0.02F), "0.02");
  EXPECT_EQ(numberText(-0.0), "-0.0");
  EXPECT_EQ(numberText(1e300), "1e+300");
  EXPECT_EQ(numberText(std::numeric_limits<double>::infinity()), "inf");
  EXPECT_EQ(numberText(-std::numeric_limits<float>::infinity()), "-inf");
  EXPECT_EQ(numberText(std::nan("")), "nan");
}

TEST(NumberText, EveryRealComesBack) {
  std::mt19937_64 random(20261121);
  for (int i = 0; i < 200000; ++i) {
    const auto bits = random();
    const double twice = std::bit_cast<double>(bits);
    const float single = std::bit_cast<float>(static_cast<std::uint32_t>(bits));
    if (!std::isnan(twice)) ASSERT_EQ(doubleOfText(numberText(twice)), twice);
    if (!std::isnan(single)) ASSERT_EQ(floatOfText(numberText(single)), single);
  }
}

// Numbers with few decimals go another way than all others; both must write the same.
TEST(NumberText, FewDecimalsAreTheShortestText) {
  std::mt19937_64 random(20261122);
  for (int i = 0; i < 500000; ++i) {
    const double scale = std::pow(10.0, static_cast<double>(random() % 12));
    const auto digits = static_cast<double>(random() % 10'000'000'000'000'000U);
    const double number = (random() % 2 == 0 ? 1 : -1) * std::round(digits / scale) / 1e6;
    std::string expected = fmt::format("{}", number);
    if (expected.find_first_of(".e") == std::string::npos) expected += ".0";
    ASSERT_EQ(numberText(number), expected);
    ASSERT_EQ(doubleOfText(expected), number);
    const double neighbour = std::nextafter(number, 1e300);
    ASSERT_EQ(doubleOfText(numberText(neighbour)), neighbour);
  }
  EXPECT_EQ(numberText(0.001), "0.001");
  EXPECT_EQ(numberText(0.000001), "1e-06");
  EXPECT_EQ(numberText(999999999.999999), "999999999.999999");
  EXPECT_EQ(numberText(1e9), "1000000000.0");
  EXPECT_EQ(numberText(-2.5), "-2.5");
  EXPECT_EQ(numberText(0.0), "0.0");
}

TEST(NumberText, Integers) {
  EXPECT_EQ(int32OfText("2147483647"), 2147483647);
  EXPECT_EQ(int32OfText("-2147483648"), -2147483648LL);
  EXPECT_EQ(int32OfText("2147483648"), std::nullopt);
  EXPECT_EQ(int32OfText("-2147483649"), std::nullopt);
  EXPECT_EQ(int32OfText("3.9"), 3);
  EXPECT_EQ(int32OfText("-3.9"), -3);
  EXPECT_EQ(int32OfText("1e3"), 1000);
  EXPECT_EQ(int32OfText("nan"), std::nullopt);
  EXPECT_EQ(int32OfText("3x"), std::nullopt);
  EXPECT_EQ(int32OfText(""), std::nullopt);
}

}  // namespace core_number_text_test
}  // namespace gridbay
