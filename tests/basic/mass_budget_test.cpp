#include "basic/mass_budget.h"

#include <gtest/gtest.h>

#include "basic/bathymetry.h"
#include "core/edition.h"
#include "tests/support/model.h"

namespace gridbay {
namespace basic_mass_budget_test {

using test::load;
using test::Model;
using test::savedText;
using Corners = std::vector<GridPoint>;

class MassBudget : public ::testing::Test {
 protected:
  Model model;
  CMassBudgetKvs& list = *model.root.massBudget;
  CBathymetryObjectKvs& area = *model.root.bathymetry->GetArea(1);
};

TEST_F(MassBudget, ANewPolygonGoesRoundTheInsideOfArea1) {
  list.SetNoPolygons(1);
  EXPECT_EQ(list.GetItem(1)->associatedArea, 1);
  EXPECT_EQ(list.GetItem(1)->corners, (Corners{{1, 1}, {1, -2}, {-2, -2}, {-2, 1}}));
  area.noJ = 10;
  area.noK = 8;
  list.SetNoPolygons(2);
  EXPECT_EQ(list.GetItem(2)->corners, (Corners{{1, 1}, {1, 6}, {8, 6}, {8, 1}}));
  model.root.bathymetry->SetNoAreas(0);
  list.SetNoPolygons(3);
  EXPECT_EQ(list.GetItem(3)->corners, (Corners{{1, 1}}));
  list.SetNoPolygons(-1);
  EXPECT_EQ(list.GetCount(), 3);
  EXPECT_EQ(list.GetMaxCorners(), 4);
  list.SetNoPolygons(0);
  EXPECT_EQ(list.GetMaxCorners(), 0);
}

TEST_F(MassBudget, IsWrittenInFileOrder) {
  list.SetNoPolygons(1);
  list.GetItem(1)->corners = {{1, 2}, {3, 4}};
  EXPECT_EQ(savedText(list),
            theEdition.wetlandSweepKit
                ? "MASS_BUDGET {\n    NoOfPolygons 0\n}\n"
                : "MASS_BUDGET {\n    NoOfPolygons 1\n    POLYGON_1 {\n        AssociatedArea 1\n"
                  "        NoOfCornerPoints 2\n        CornerPoint_1 1 2\n"
                  "        CornerPoint_2 3 4\n    }\n}\n");
}

TEST_F(MassBudget, IsReadOrEmptied) {
  load(list,
       "MASS_BUDGET { NoOfPolygons 2; POLYGON_1 { AssociatedArea 3; NoOfCornerPoints 2; CornerPoint_1 5 6\n"
       " CornerPoint_2 7 8 } }");
  if (theEdition.wetlandSweepKit) {
    EXPECT_EQ(list.GetCount(), 0);
    return;
  }
  ASSERT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.GetItem(1)->associatedArea, 3);
  EXPECT_EQ(list.GetItem(1)->corners, (Corners{{5, 6}, {7, 8}}));
  EXPECT_TRUE(model.host.texts.empty());  // a polygon that is not there is left as a new one
  Model other;
  other.root.massBudget->CopyFrom(list);
  EXPECT_EQ(savedText(*other.root.massBudget), savedText(list));
  load(list, "OTHER {}");
  EXPECT_EQ(list.GetCount(), 2);
}

TEST(MassBudgetItem, ACornerCountIsBelievedAsFarAsThereAreKeywords) {
  CMassBudgetItemKvs polygon(nullptr);
  load(polygon, "NoOfCornerPoints 2147483647\nCornerPoint_1 5 6\n");
  EXPECT_EQ(polygon.corners, (Corners{{5, 6}}));
  load(polygon, "NoOfCornerPoints 3\nCornerPoint_1 5 6\nCornerPoint_3 7 8\n");
  EXPECT_EQ(polygon.corners, (Corners{{5, 6}, {7, 8}}));
  load(polygon, "NoOfCornerPoints -1\nCornerPoint_1 5 6\n");
  EXPECT_TRUE(polygon.corners.empty());
}

class MassBudgetChecks : public MassBudget {
 protected:
  MassBudgetChecks() {
    area.noJ = 10;
    area.noK = 8;
    list.SetNoPolygons(1);
  }
  std::vector<std::string> faults(int associatedArea, const Corners& corners) {
    list.GetItem(1)->associatedArea = associatedArea;
    list.GetItem(1)->corners = corners;
    const ValidationList messages = test::messagesOf(list);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::massBudget);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  using Texts = std::vector<std::string>;
  const std::string outside = "Point is outside of grid";
};

TEST_F(MassBudgetChecks, Corners) {
  EXPECT_EQ(faults(1, {{1, 1}, {8, 6}}), Texts{});
  EXPECT_EQ(faults(1, {{0, 1}}), Texts{outside});
  EXPECT_EQ(faults(1, {{9, 1}}), Texts{outside});
  EXPECT_EQ(faults(1, {{1, 0}, {1, 1}, {1, 7}}), (Texts{outside, outside}));
  EXPECT_EQ(faults(1, {}), Texts{"To few corner points in polygon"});
}

TEST_F(MassBudgetChecks, TheArea) {
  EXPECT_EQ(faults(2, {{-1, -1}}), Texts{"Invalid associated area"});
  EXPECT_EQ(faults(2, {}), (Texts{"Invalid associated area", "To few corner points in polygon"}));
  EXPECT_EQ(faults(0, {{-1, -1}}), Texts{});
}

TEST_F(MassBudgetChecks, AnAreaThatHasNotBeenReadHoldsNoCorner) {
  area.noJ = 0;
  area.noK = 0;
  EXPECT_EQ(faults(1, {{1, 1}, {2, 2}}), (Texts{outside, outside}));
}

TEST_F(MassBudgetChecks, PolygonsAreCheckedOnlyDeep) {
  list.GetItem(1)->corners = {};
  EXPECT_TRUE(test::messagesOf(list, 0).empty());
}

}  // namespace basic_mass_budget_test
}  // namespace gridbay
