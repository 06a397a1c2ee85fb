#include "core/shared_array.h"

#include <gtest/gtest.h>

#include <limits>

namespace gridbay {
namespace core_shared_array_test {

using Numbers = SharedArray<double>;
constexpr std::size_t kBlock = Numbers::kBlock;

Numbers counted(std::size_t size) {
  Numbers numbers;
  for (std::size_t i = 0; i < size; ++i) numbers.push_back(static_cast<double>(i));
  return numbers;
}

// Every value, and that blocks and places tell the same.
void expectCounted(const Numbers& numbers, std::size_t size) {
  ASSERT_EQ(numbers.size(), size);
  ASSERT_EQ(numbers.blockCount(), (size + kBlock - 1) / kBlock);
  std::size_t place = 0;
  for (std::size_t block = 0; block < numbers.blockCount(); ++block) {
    for (const double value : numbers.block(block)) {
      ASSERT_EQ(value, static_cast<double>(place));
      ASSERT_EQ(numbers[place], value);
      ++place;
    }
  }
  EXPECT_EQ(place, size);
}

TEST(SharedArray, GrowsByValues) {
  for (const std::size_t size : {std::size_t{0}, std::size_t{1}, kBlock - 1, kBlock, kBlock + 1, 3 * kBlock})
    expectCounted(counted(size), size);
  EXPECT_TRUE(counted(0).empty());
  EXPECT_FALSE(counted(1).empty());
}

TEST(SharedArray, IsResizedAtTheTail) {
  for (const std::size_t size :
       {std::size_t{0}, std::size_t{7}, kBlock, kBlock + 7, 2 * kBlock, 2 * kBlock + 9}) {
    Numbers numbers = counted(2 * kBlock + 9);
    numbers.resize(size);
    expectCounted(numbers, size);
    numbers.resize(3 * kBlock + 1);
    ASSERT_EQ(numbers.size(), 3 * kBlock + 1);
    EXPECT_EQ(numbers[3 * kBlock], 0);
    for (std::size_t i = size; i < numbers.size(); ++i) ASSERT_EQ(numbers[i], 0) << i;
    for (std::size_t i = 0; i < size; ++i) ASSERT_EQ(numbers[i], static_cast<double>(i));
    numbers.clear();
    EXPECT_TRUE(numbers.empty());
    EXPECT_EQ(numbers.blockCount(), 0U);
  }
}

TEST(SharedArray, AChangeOfACopyLeavesTheOtherOne) {
  const Numbers before = counted(2 * kBlock + 5);
  Numbers edited = before;
  edited.edit(kBlock + 3) = -1;
  EXPECT_EQ(edited[kBlock + 3], -1);
  edited.push_back(9);
  Numbers shorter = before;
  shorter.resize(kBlock + 1);
  Numbers longer = before;
  longer.resize(2 * kBlock + 6);
  expectCounted(before, 2 * kBlock + 5);
  expectCounted(shorter, kBlock + 1);
}

TEST(SharedArray, AChangeCopiesItsBlockAlone) {
  const Numbers before = counted(4 * kBlock);
  Numbers edited = before;
  edited.edit(2 * kBlock) = -1;
  for (const std::size_t block : {0U, 1U, 3U})
    EXPECT_EQ(edited.block(block).data(), before.block(block).data());
  EXPECT_NE(edited.block(2).data(), before.block(2).data());
  const double* own = edited.block(2).data();
  edited.edit(2 * kBlock + 1) = -2;
  EXPECT_EQ(edited.block(2).data(), own);
  const std::size_t pointers = 4 * sizeof(std::shared_ptr<int>);
  EXPECT_EQ(before.bytesBeside(before), pointers);
  EXPECT_EQ(edited.bytesBeside(before), pointers + kBlock * sizeof(double));
  EXPECT_EQ(edited.bytesBeside({}), pointers + 4 * kBlock * sizeof(double));
}

TEST(SharedArray, Appends) {
  Numbers numbers = counted(kBlock / 2);
  Numbers other;
  for (std::size_t i = 0; i < kBlock; ++i) other.push_back(static_cast<double>(kBlock / 2 + i));
  numbers.append(other);
  expectCounted(numbers, kBlock / 2 + kBlock);
  Numbers empty;
  empty.append(numbers);
  EXPECT_EQ(empty, numbers);
  EXPECT_EQ(empty.block(0).data(), numbers.block(0).data());
  numbers.append(numbers);
  EXPECT_EQ(numbers.size(), 3 * kBlock);
  EXPECT_EQ(numbers[3 * kBlock - 1], numbers[kBlock + kBlock / 2 - 1]);
}

TEST(SharedArray, IsEqualToTheLastBit) {
  Numbers a = counted(kBlock + 2);
  EXPECT_EQ(a, counted(kBlock + 2));
  EXPECT_FALSE(a == counted(kBlock + 1));
  a.edit(0) = -0.0;
  EXPECT_FALSE(a == counted(kBlock + 2));
  a.edit(0) = std::numeric_limits<double>::quiet_NaN();
  Numbers b = a;
  b.edit(1) = 1;
  EXPECT_EQ(a, b);
}

}  // namespace core_shared_array_test
}  // namespace gridbay
