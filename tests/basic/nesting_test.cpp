#include "basic/nesting.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/support/model.h"

namespace gridbay {
namespace basic_nesting_test {

constexpr float kLand = 10;

// Two areas in memory that nest without a fault; each test breaks what it is about.
class Nesting : public ::testing::Test {
 protected:
  Nesting() {
    outer.fileName = "out.tsb2";
    inner.fileName = "in.tsb2";
    shape(outer, 20, 20, 90, 90);
    shape(inner, 31, 31, 30, 30);
    inner.origin = {4, 4};
  }
  static void shape(CBathymetryObjectKvs& area, int noJ, int noK, float dx, float dy) {
    area.noJ = noJ;
    area.noK = noK;
    area.dx = dx;
    area.dy = dy;
    area.landValue = kLand;
    area.grid = CVdArray2D<float>(noJ, noK);
    std::ranges::fill(area.grid.values(), -5.0F);
  }
  void setInner(int j, int k, float value) {
    inner.grid.values()[static_cast<std::size_t>(k) * static_cast<std::size_t>(inner.noJ) +
                        static_cast<std::size_t>(j)] = value;
  }
  void fillColumn(int j) {
    for (int k = 0; k < inner.noK; ++k) setInner(j, k, kLand);
  }
  void fillRow(int k) {
    for (int j = 0; j < inner.noJ; ++j) setInner(j, k, kLand);
  }
  std::string fault() {
    ValidationList messages;
    const unsigned count = CheckNesting(inner, outer, messages);
    EXPECT_EQ(count, messages.size());
    if (messages.empty()) return "";
    EXPECT_EQ(messages.front().page, PageId::bathymetry);
    EXPECT_EQ(messages.front().severity, Severity::fault);
    return messages.front().text;
  }

  CBathymetryObjectKvs outer{nullptr};
  CBathymetryObjectKvs inner{nullptr};
  const std::string start = "Can not nest file in.tsb2 in file out.tsb2";
  const std::string ratio = start + ".  Ratio between gridpoint spacing is not 3.";
  const std::string position = start + ".  Illegal position of area.";
};

TEST_F(Nesting, AGoodPairIsClean) {
  EXPECT_EQ(fault(), "");
}

TEST_F(Nesting, TheRatioHasATolerance) {
  inner.dx = 30.1F;
  EXPECT_EQ(fault(), "");
  inner.dx = 30.2F;
  EXPECT_EQ(fault(), ratio);
  inner.dx = 30;
  inner.dy = 30.2F;
  EXPECT_EQ(fault(), ratio);
  inner.dy = 29.9F;
  EXPECT_EQ(fault(), "");
}

TEST_F(Nesting, TheExtentIsWholeOuterCells) {
  shape(inner, 30, 31, 30, 30);
  EXPECT_EQ(fault(), start + ".  Grid dimension incorrect (jextr).");
  shape(inner, 31, 30, 30, 30);
  EXPECT_EQ(fault(), start + ".  Grid dimension incorrect (kextr).");
  shape(inner, 4, 4, 30, 30);
  EXPECT_EQ(fault(), "");
}

TEST_F(Nesting, TheAreaKeepsAnOuterPointFreeOnEverySide) {
  for (int k = 0; k < inner.noK; ++k) fillRow(k);
  inner.origin = {0, 4};
  EXPECT_EQ(fault(), position);
  inner.origin = {4, 0};
  EXPECT_EQ(fault(), position);
  inner.origin = {8, 4};  // 8 + 10 = NoJ - 2
  EXPECT_EQ(fault(), "");
  inner.origin = {9, 4};
  EXPECT_EQ(fault(), position);
  inner.origin = {4, 8};
  EXPECT_EQ(fault(), "");
  inner.origin = {4, 9};
  EXPECT_EQ(fault(), position);
  inner.origin = {2147483647, 4};
  EXPECT_EQ(fault(), position);
}

TEST_F(Nesting, AnEdgeNearTheOuterBorderIsAllLand) {
  shape(outer, 15, 20, 90, 90);
  inner.origin = {3, 4};  // 3 + 10 = NoJ - 2; the last column is near the border, the first is not
  EXPECT_EQ(fault(), position);
  fillColumn(30);
  EXPECT_EQ(fault(), "");
  setInner(30, 17, kLand - 0.1F);
  EXPECT_EQ(fault(), position);
}

TEST_F(Nesting, AtOneOneTheFirstColumnAndRowAreAllLand) {
  inner.origin = {1, 1};
  EXPECT_EQ(fault(), position);
  fillColumn(0);
  EXPECT_EQ(fault(), position);
  fillRow(0);
  EXPECT_EQ(fault(), "");
  inner.origin = {3, 3};
  shape(inner, 31, 31, 30, 30);
  EXPECT_EQ(fault(), "");
}

TEST_F(Nesting, TheLastRowNearTheBorderIsAllLand) {
  shape(outer, 20, 15, 90, 90);
  inner.origin = {4, 3};
  EXPECT_EQ(fault(), position);
  fillRow(30);
  EXPECT_EQ(fault(), "");
}

TEST_F(Nesting, TheFirstFailureEndsTheCheck) {
  shape(inner, 30, 30, 50, 50);
  inner.origin = {0, 0};
  EXPECT_EQ(fault(), ratio);
}

class Overlap : public ::testing::Test {
 protected:
  Overlap() {
    a.fileName = "a.tsb2";
    b.fileName = "b.tsb2";
    place(a, 3, 3, 10, 10);
    place(b, 20, 20, 10, 10);
  }
  static void place(CBathymetryObjectKvs& area, int j, int k, int noJ, int noK) {
    area.enclosingArea = 1;
    area.origin = {j, k};
    area.noJ = noJ;
    area.noK = noK;
  }
  bool overlaps() {
    ValidationList messages;
    const unsigned first = CheckOverlap(a, b, messages);
    if (first == 1)
      EXPECT_EQ(messages.back(), (CMessage{PageId::bathymetry, "Bathymetriesa.tsb2 and b.tsb2 Overlap"}));
    EXPECT_EQ(CheckOverlap(b, a, messages), first);
    return first == 1;
  }
  CBathymetryObjectKvs a{nullptr};
  CBathymetryObjectKvs b{nullptr};
};

TEST_F(Overlap, ApartAndTouching) {
  EXPECT_FALSE(overlaps());
  place(b, 6, 3, 10, 10);  // the columns J = 18 coincide
  EXPECT_TRUE(overlaps());
  place(b, 7, 3, 10, 10);
  EXPECT_FALSE(overlaps());
  place(b, 6, 6, 10, 10);  // one common corner
  EXPECT_TRUE(overlaps());
}

TEST_F(Overlap, OneInsideTheOther) {
  place(a, 3, 3, 31, 31);
  place(b, 5, 5, 4, 4);
  EXPECT_TRUE(overlaps());
}

TEST_F(Overlap, APlusSignIsNoOverlap) {
  place(a, 1, 5, 31, 4);
  place(b, 5, 1, 4, 31);
  EXPECT_FALSE(overlaps());
}

TEST_F(Overlap, OnlyWithinOneEnclosingAreaAndBetweenTwoAreas) {
  place(b, 3, 3, 10, 10);
  EXPECT_TRUE(overlaps());
  b.enclosingArea = 2;
  EXPECT_FALSE(overlaps());
  ValidationList messages;
  EXPECT_EQ(CheckOverlap(a, a, messages), 0U);
}

}  // namespace basic_nesting_test
}  // namespace gridbay
