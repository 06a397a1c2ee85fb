#include "basic/boundary.h"

#include <gtest/gtest.h>

#include "basic/bathymetry.h"
#include "basic/boundary_detection.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace basic_boundary_test {

using test::load;
using test::Model;
using test::savedText;

constexpr float kLand = 10;

// A grid from its picture, the northernmost row first: "." is water, "#" is land.
CVdArray2D<float> picture(const std::vector<std::string>& rows) {
  const int noJ = static_cast<int>(rows.front().size());
  const int noK = static_cast<int>(rows.size());
  CVdArray2D<float> grid(noJ, noK);
  std::size_t at = 0;
  for (int k = 0; k < noK; ++k) {
    for (const char c : rows[static_cast<std::size_t>(noK - 1 - k)])
      grid.values()[at++] = c == '#' ? kLand : -1.0F;
  }
  return grid;
}

std::vector<BoundaryLine> found(const std::vector<std::string>& rows) {
  return findOpenBoundaries(picture(rows), kLand);
}

using Lines = std::vector<BoundaryLine>;

TEST(BoundaryDetection, AnAllLandBorderHasNone) {
  EXPECT_EQ(found({"####", "#..#", "####"}), Lines{});
}

TEST(BoundaryDetection, AnAllWaterBorderHasFour) {
  EXPECT_EQ(found({"...", "...", "..."}),
            (Lines{{{0, 0}, {0, 2}}, {{0, 2}, {2, 2}}, {{2, 0}, {2, 2}}, {{0, 0}, {2, 0}}}));
}

TEST(BoundaryDetection, ASinglePointHasEqualEnds) {
  EXPECT_EQ(found({"####", "...#", "####"}), (Lines{{{0, 1}, {0, 1}}}));
}

TEST(BoundaryDetection, RunsOnAnEdgeStandInRisingOrder) {
  EXPECT_EQ(found({".##", "#.#", ".##"}),
            (Lines{{{0, 0}, {0, 0}}, {{0, 2}, {0, 2}}, {{0, 2}, {0, 2}}, {{0, 0}, {0, 0}}}));
  EXPECT_EQ(found({"#####", "....#", "....#", "#####", "....#", "#####"}),
            (Lines{{{0, 1}, {0, 1}}, {{0, 3}, {0, 4}}}));
}

TEST(BoundaryDetection, AWetCornerBelongsToBothEdges) {
  EXPECT_EQ(found({"..#", ".##", "###"}), (Lines{{{0, 1}, {0, 2}}, {{0, 2}, {1, 2}}}));
  EXPECT_EQ(found({"#..", "##.", "###"}), (Lines{{{1, 2}, {2, 2}}, {{2, 1}, {2, 2}}}));
}

TEST(BoundaryDetection, APointAtTheLandValueIsLand) {
  CVdArray2D<float> grid = picture({"###", "###", "###"});
  grid.values()[3] = kLand - 0.001F;
  EXPECT_EQ(findOpenBoundaries(grid, kLand), (Lines{{{0, 1}, {0, 1}}}));
}

TEST(BoundaryDetection, ThereIsNoCap) {
  std::string edge;
  for (int i = 0; i < 101; ++i) edge += i % 2 == 0 ? '.' : '#';
  EXPECT_EQ(found({edge, std::string(101, '#'), std::string(101, '#')}).size(), 53U);  // and the two corners
  EXPECT_EQ(findOpenBoundaries({}, kLand), Lines{});
}

TEST(Boundary, DefaultsInFileOrder) {
  Model model;
  EXPECT_EQ(savedText(*model.root.boundary),
            "OPEN_BOUNDARY {\n    Number_Of_Boundaries 0\n    Default_Position 1\n}\n");
  model.root.boundary->SetNoBoundaries(1);
  model.root.boundary->GetItem(1)->Set(0, 5, 0, 9);
  EXPECT_EQ(savedText(*model.root.boundary),
            "OPEN_BOUNDARY {\n    Number_Of_Boundaries 1\n    Default_Position 1\n    BOUNDARY_1 {\n"
            "        First_Point 0 5\n        Last_Point 0 9\n    }\n}\n");
  EXPECT_EQ(model.root.boundary->GetItem(1)->Text(), "(0,5) - (0,9)");
}

TEST(Boundary, LoadsAndCopies) {
  Model model;
  CBoundaryKvs& list = *model.root.boundary;
  load(list,
       "OPEN_BOUNDARY { Number_Of_Boundaries 3; Default_Position 0; BOUNDARY_1 { First_Point 1 2; Last_Point "
       "1 4 }\n"
       " BOUNDARY_2 { Last_Point 5 0 } }");
  EXPECT_EQ(list.defaultPosition, 0);
  ASSERT_EQ(list.GetCount(), 3);
  EXPECT_EQ(list.GetItem(1)->Text(), "(1,2) - (1,4)");
  EXPECT_EQ(list.GetItem(2)->Text(), "(0,0) - (5,0)");
  EXPECT_EQ(list.GetItem(3)->Text(), "(0,0) - (0,0)");
  EXPECT_EQ(model.host.texts,
            std::vector<std::string>{"Error in the KVS-FILE\nThe number of Boundary sections does not "
                                     "correspond to the number of sub domaines"});
  load(list, "OPEN_BOUNDARY { Number_Of_Boundaries -1 }");
  EXPECT_EQ(list.GetCount(), 3);
  Model other;
  other.root.boundary->CopyFrom(list);
  EXPECT_EQ(savedText(*other.root.boundary), savedText(list));
}

std::vector<std::string> faultsOf(int firstJ, int firstK, int lastJ, int lastK) {
  CBoundaryObjectKvs boundary(nullptr);
  boundary.Set(firstJ, firstK, lastJ, lastK);
  const ValidationList messages = test::messagesOf(boundary);
  for (const CMessage& message : messages) {
    EXPECT_EQ(message.page, PageId::boundary);
    EXPECT_EQ(message.severity, Severity::fault);
  }
  return test::textsOf(messages);
}

TEST(Boundary, Checks) {
  const std::string first = "First point coordinates can not be negative";
  const std::string last = "Last point coordinates can not be negative";
  const std::string parallel = "Line must be parallel to either X- or Y-axis";
  EXPECT_EQ(faultsOf(3, 1, 3, 1), std::vector<std::string>{});
  EXPECT_EQ(faultsOf(3, 1, 5, 4), std::vector<std::string>{parallel});
  EXPECT_EQ(faultsOf(-1, 1, 5, 1), std::vector<std::string>{first});
  EXPECT_EQ(faultsOf(1, 1, 1, -1), std::vector<std::string>{last});
  EXPECT_EQ(faultsOf(-1, -1, -2, -3), (std::vector<std::string>{first, last, parallel}));
}

TEST(Boundary, EntriesAreCheckedOnlyDeep) {
  Model model;
  model.root.boundary->SetNoBoundaries(2);
  model.root.boundary->GetItem(2)->Set(0, 0, 1, 1);
  EXPECT_EQ(test::messagesOf(*model.root.boundary, 0).size(), 0U);
  EXPECT_EQ(test::messagesOf(*model.root.boundary, 1).size(), 1U);
}

TEST(Boundary, CellSpacingAlongIt) {
  Model model;
  CBathymetryObjectKvs& area = *model.root.bathymetry->GetArea(1);
  area.dx = 20;
  area.dy = 30;
  model.root.boundary->SetNoBoundaries(1);
  CBoundaryObjectKvs& boundary = *model.root.boundary->GetItem(1);
  boundary.Set(0, 0, 0, 9);
  EXPECT_EQ(boundary.CellSpacing(), 30.0F);
  boundary.Set(0, 4, 9, 4);
  EXPECT_EQ(boundary.CellSpacing(), 20.0F);
  boundary.Set(2, 2, 2, 2);
  EXPECT_EQ(boundary.CellSpacing(), 30.0F);
  boundary.Set(0, 0, 1, 1);
  EXPECT_EQ(boundary.CellSpacing(), -1.0F);
  model.root.bathymetry->SetNoAreas(0);
  boundary.Set(0, 0, 0, 9);
  EXPECT_EQ(boundary.CellSpacing(), -1.0F);
}

TEST(Boundary, RecalculationReadsTheGridAndLosesTheOldOnes) {
  const test::TemporaryFolder folder;
  Model model;
  CBoundaryKvs& list = *model.root.boundary;
  test::writeGrid(folder.file("g.tsb2"), {.noJ = 4, .noK = 3},
                  [](int j, int k) { return j == 0 && k > 0 ? -1.0F : 10.0F; });
  model.root.bathymetry->GetArea(1)->fileName = folder.file("g.tsb2");
  list.SetNoBoundaries(5);
  list.RecalculateBoundaries();
  ASSERT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.GetItem(1)->Text(), "(0,1) - (0,2)");
  EXPECT_EQ(list.GetItem(2)->Text(), "(0,2) - (0,2)");
  model.root.bathymetry->GetArea(1)->fileName = folder.file("none.tsb2");
  list.RecalculateBoundaries();
  EXPECT_EQ(list.GetCount(), 0);
  list.SetNoBoundaries(1);
  model.root.bathymetry->SetNoAreas(0);
  list.RecalculateBoundaries();
  EXPECT_EQ(list.GetCount(), 0);
}

}  // namespace basic_boundary_test
}  // namespace gridbay
