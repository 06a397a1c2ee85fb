#include "basic/bathymetry.h"

#include <gmock/gmock.h>

#include <cmath>
#include <limits>

#include "basic/bathymetry_requests.h"
#include "core/edition.h"
#include "platform/cartography/cartography.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace basic_bathymetry_test {

using test::GridSpec;
using test::load;
using test::Model;
using test::savedText;
using ::testing::HasSubstr;

TEST(Bathymetry, DefaultsAndTheDefaultsOfAnItemsPlace) {
  Model model;
  CBathymetryKvs& list = *model.root.bathymetry;
  list.SetNoAreas(3);
  EXPECT_EQ(list.hotStart, 0);
  EXPECT_FALSE(list.coriolis || list.landSlides || list.overlandSolver || list.projectionStale);
  EXPECT_EQ(list.projection, "");
  for (int n = 1; n <= 3; ++n) {
    EXPECT_EQ(list.GetArea(n)->origin, (GridPoint{3, 3}));
    EXPECT_EQ(list.GetArea(n)->enclosingArea, n - 1);
    EXPECT_EQ(list.GetArea(n)->noJ, 0);
    EXPECT_EQ(list.GetArea(n)->landValue, 0);
  }
  EXPECT_EQ(list.GetArea(0), nullptr);
  EXPECT_EQ(list.GetArea(4), nullptr);
}

TEST(Bathymetry, IsWrittenInFileOrder) {
  Model model;
  CBathymetryKvs& list = *model.root.bathymetry;
  list.SetNoAreas(2);
  list.projection = "UTM-32";
  list.coriolis = true;
  list.landSlides = true;
  list.overlandSolver = true;
  list.overlandFile = "/case/fine.tsb2";
  list.hotStart = 1;
  list.GetArea(1)->fileName = "/case/a.tsb2";
  list.GetArea(2)->fileName = "/case/sub/b.tsb2";
  list.GetArea(2)->origin = {12, 7};
  const std::string flag = theEdition.wetlandSweepKit ? "#false" : "#true";
  EXPECT_EQ(savedText(list),
            "BATHYMETRY_SELECTION {\n"
            "    Projection \"UTM-32\"\n"
            "    CoriolisForce " +
                flag +
                "\n"
                "    Land_Slides " +
                flag +
                "\n"
                "    Overland_Solver #true\n"
                "    Overland_Filename (file)\"fine.tsb2\"\n"
                "    No_Of_Areas " +
                (theEdition.wetlandSweepKit ? "1" : "2") +
                "\n"
                "    Hot_Start 1\n"
                "    AREA_1 {\n"
                "        DATA_FILE {\n"
                "            FILE_NAME (file)\"a.tsb2\"\n"
                "        }\n"
                "        Origin 3 3\n"
                "        Enclosing_Area 0\n"
                "    }\n"
                "    AREA_2 {\n"
                "        DATA_FILE {\n"
                "            FILE_NAME (file)\"sub/b.tsb2\"\n"
                "        }\n"
                "        Origin 12 7\n"
                "        Enclosing_Area 1\n"
                "    }\n"
                "}\n");
}

constexpr std::string_view kTwoAreas =
    "BATHYMETRY_SELECTION { Projection \"P\"; CoriolisForce #true; Land_Slides #true; Overland_Solver #true\n"
    " Overland_Filename (file)\"fine.tsb2\"; No_Of_Areas 2; Hot_Start 1\n"
    " AREA_1 { DATA_FILE { FILE_NAME (file)\"a.tsb2\" } ; Origin 1 2; Enclosing_Area 0 }\n"
    " AREA_2 { Origin 5 6; Enclosing_Area 1 } }";

TEST(Bathymetry, IsReadOrPinned) {
  Model model;
  CBathymetryKvs& list = *model.root.bathymetry;
  list.coriolis = true;
  load(list, kTwoAreas);
  const bool pinned = theEdition.wetlandSweepKit;
  EXPECT_EQ(list.GetCount(), pinned ? 1 : 2);
  EXPECT_EQ(list.coriolis, !pinned);
  EXPECT_EQ(list.landSlides, !pinned);
  EXPECT_EQ(list.projection, "P");
  EXPECT_TRUE(list.overlandSolver);
  EXPECT_EQ(list.overlandFile.absolute(), "/case/fine.tsb2");
  EXPECT_EQ(list.hotStart, 1);
  EXPECT_EQ(list.GetArea(1)->fileName.absolute(), "/case/a.tsb2");
  EXPECT_EQ(list.GetArea(1)->origin, (GridPoint{1, 2}));
  if (!pinned) {
    EXPECT_EQ(list.GetArea(2)->origin, (GridPoint{5, 6}));
    EXPECT_EQ(list.GetArea(2)->fileName.text(), "");
  }
  EXPECT_TRUE(model.host.texts.empty());
}

TEST(Bathymetry, TheOverlandFileIsReadOnlyBesideItsSolver) {
  Model model;
  load(*model.root.bathymetry,
       "BATHYMETRY_SELECTION { Overland_Filename (file)\"fine.tsb2\"; No_Of_Areas 1; AREA_1 {} }");
  EXPECT_TRUE(model.root.bathymetry->overlandFile.empty());
}

TEST(Bathymetry, MissingSections) {
  Model model;
  CBathymetryKvs& list = *model.root.bathymetry;
  list.SetNoAreas(2);
  list.hotStart = 1;
  load(list, "OTHER {}");
  EXPECT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.hotStart, 1);
  load(list, "BATHYMETRY_SELECTION { No_Of_Areas 1 }");
  EXPECT_EQ(model.host.texts,
            std::vector<std::string>{"Error in the KVS-FILE\nThe number of Bathymetry sections does not "
                                     "correspond to the number of sub domaines"});
}

TEST(Bathymetry, CopyingTakesTheHotStartFlagAndTheWholeAreas) {
  Model model;
  CBathymetryKvs& list = *model.root.bathymetry;
  list.SetNoAreas(2);
  list.hotStart = 1;
  list.projection = "P";
  list.overlandSolver = true;
  CBathymetryObjectKvs& area = *list.GetArea(2);
  area.origin = {8, 9};
  area.fileName = "/x/b.tsb2";
  area.noJ = 3;
  area.noK = 3;
  area.dx = 5;
  area.landValue = 2;
  area.grid = CVdArray2D<float>(3, 3);
  std::ranges::fill(area.grid.values(), 1.5F);
  Model other;
  CBathymetryKvs& copy = *other.root.bathymetry;
  copy.CopyFrom(list);
  ASSERT_EQ(copy.GetCount(), 2);
  EXPECT_EQ(copy.hotStart, 1);
  EXPECT_EQ(copy.projection, "");
  EXPECT_FALSE(copy.overlandSolver);
  EXPECT_EQ(copy.GetArea(2)->origin, (GridPoint{8, 9}));
  EXPECT_EQ(copy.GetArea(2)->grid(2, 2), 1.5F);
  EXPECT_EQ(copy.GetArea(2)->landValue, 2);
  CBathymetryObjectKvs alone(nullptr);
  alone.CopyFrom(area);
  EXPECT_EQ(alone.origin, (GridPoint{8, 9}));
  EXPECT_EQ(alone.enclosingArea, 1);
  EXPECT_EQ(alone.fileName.text(), "/x/b.tsb2");
  EXPECT_EQ(alone.noJ, 0);
  EXPECT_TRUE(alone.grid.empty());
}

// An outer area of 20 x 20 points and an inner one of 31 x 31 at (4, 4), on file.
class TwoAreas : public ::testing::Test {
 protected:
  TwoAreas() {
    list.SetNoAreas(2);
    test::writeGrid(folder.file("out.tsb2"), {.noJ = 20, .noK = 20, .dx = 90, .dy = 90});
    test::writeGrid(folder.file("in.tsb2"), {.noJ = 31, .noK = 31, .dx = 30, .dy = 30},
                    [](int j, int k) { return j == 15 && k == 15 ? -50.0F : -5.0F; });
    list.GetArea(1)->fileName = folder.file("out.tsb2");
    list.GetArea(2)->fileName = folder.file("in.tsb2");
    list.GetArea(2)->origin = {4, 4};
  }
  unsigned check(int deep = 1) {
    messages.clear();
    return list.Validate(messages, deep);
  }

  test::TemporaryFolder folder;
  Model model;
  CBathymetryKvs& list = *model.root.bathymetry;
  ValidationList messages;
};

TEST_F(TwoAreas, AreClean) {
  EXPECT_EQ(check(), 0U);
  EXPECT_TRUE(messages.empty());
}

TEST_F(TwoAreas, AFileThatCannotBeReadEndsTheCheck) {
  list.GetArea(2)->fileName = folder.file("none.tsb2");
  list.GetArea(2)->enclosingArea = 7;
  EXPECT_EQ(check(), 1U);
  ASSERT_EQ(messages.size(), 1U);
  EXPECT_EQ(messages[0].severity, Severity::dependedUpon);
}

TEST_F(TwoAreas, TheNumberOfAreas) {
  EXPECT_EQ(check(0), 0U);
  list.SetNoAreas(9);
  EXPECT_EQ(check(0), 0U);
  list.SetNoAreas(10);
  check(0);
  EXPECT_EQ(messages[0], (CMessage{PageId::bathymetry, "Number of bathymetries should be between 1 and 9",
                                   Severity::dependedUpon}));
  list.SetNoAreas(0);
  EXPECT_EQ(check(), 1U);
  EXPECT_EQ(messages[0].text, "Number of bathymetries should be between 1 and 9");
}

TEST_F(TwoAreas, TheEnclosingArea) {
  for (const int outer : {0, -1, 2, 3}) {
    list.GetArea(2)->enclosingArea = outer;
    EXPECT_EQ(check(), 1U) << outer;
    EXPECT_EQ(messages[0],
              (CMessage{PageId::bathymetry, "Not a valid outer bathymetry chosen", Severity::dependedUpon}));
  }
}

TEST_F(TwoAreas, NestingIsCheckedOnlyDeep) {
  list.GetArea(2)->origin = {0, 4};
  EXPECT_EQ(check(), 1U);
  EXPECT_THAT(messages[0].text, HasSubstr("Illegal position of area."));
  EXPECT_EQ(check(0), 0U);
}

TEST_F(TwoAreas, AnOverlapIsReportedWithoutBeingCounted) {
  list.SetNoAreas(3);
  test::writeGrid(folder.file("third.tsb2"), {.noJ = 4, .noK = 4, .dx = 30, .dy = 30});
  list.GetArea(3)->fileName = folder.file("third.tsb2");
  list.GetArea(3)->enclosingArea = 1;
  list.GetArea(3)->origin = {5, 5};
  for (const int deep : {1, 0}) {
    EXPECT_EQ(check(deep), 0U);
    ASSERT_EQ(messages.size(), 1U);
    EXPECT_EQ(messages[0].text,
              "Bathymetries" + folder.file("in.tsb2") + " and " + folder.file("third.tsb2") + " Overlap");
  }
}

TEST_F(TwoAreas, PointsUnderAnEmbeddedArea) {
  check();
  EXPECT_TRUE(list.IsCoveredByEmbeddedArea(1, 4, 4));
  EXPECT_TRUE(list.IsCoveredByEmbeddedArea(1, 14, 14));  // 4 + 31 / 3
  EXPECT_FALSE(list.IsCoveredByEmbeddedArea(1, 15, 14));
  EXPECT_FALSE(list.IsCoveredByEmbeddedArea(1, 3, 4));
  EXPECT_FALSE(list.IsCoveredByEmbeddedArea(2, 4, 4));
  list.SetNoAreas(0);
  EXPECT_FALSE(list.IsCoveredByEmbeddedArea(1, 4, 4));
}

TEST_F(TwoAreas, TheGreatestCourantNumber) {
  double courant = -1;
  int area = -1;
  list.GetMaxCourant(10, &courant, &area);
  EXPECT_EQ(courant, 0);  // no grid has been read
  EXPECT_EQ(area, 0);
  check();
  list.GetMaxCourant(10, &courant, &area);
  EXPECT_DOUBLE_EQ(courant, 10 * std::sqrt(50.0 * 9.82 / (30.0 * 30.0)));
  EXPECT_EQ(area, 2);
  // A deep point of the outer area under the inner one does not count.
  list.GetArea(1)->grid.values()[5 * 20 + 5] = -5000;
  list.GetMaxCourant(10, &courant, &area);
  EXPECT_EQ(area, 2);
  list.GetArea(1)->grid.values()[0] = -500;
  list.GetMaxCourant(10, &courant, &area);
  EXPECT_EQ(area, 1);
  EXPECT_DOUBLE_EQ(courant, 10 * std::sqrt(500.0 * 9.82 / (90.0 * 90.0)));
}

TEST_F(TwoAreas, AnEarlierAreaWinsATie) {
  check();
  for (const int n : {1, 2}) {
    std::ranges::fill(list.GetArea(n)->grid.values(), -9.0F);
    list.GetArea(n)->dx = 30;
  }
  double courant = 0;
  int area = 0;
  list.GetMaxCourant(1, &courant, &area);
  EXPECT_EQ(area, 1);
}

TEST_F(TwoAreas, SizeOfResults) {
  EXPECT_DOUBLE_EQ(list.EstimateSizeMB(1), 2.0 * 4 / (1024 * 1024));
  check();
  EXPECT_DOUBLE_EQ(list.EstimateSizeMB(3), (21.0 * 21 + 32.0 * 32) * 3 * 4 / (1024 * 1024));
}

TEST_F(TwoAreas, AMapThatFitsAnArea) {
  check();
  CVdFileSelectorDlg selector;
  RequestMatchesArea(*list.GetArea(2), selector);
  CVdFileSelectorDlg byItem;
  RequestMatchesArea(*list.GetArea(2), byItem.AddRequest());
  std::string error;
  EXPECT_TRUE(selector.IsTsbFileValid(folder.file("in.tsb2"), &error)) << error;
  EXPECT_TRUE(byItem.IsTsbFileValid(folder.file("in.tsb2"), &error)) << error;
  EXPECT_FALSE(selector.IsTsbFileValid(folder.file("out.tsb2"), &error));
  EXPECT_EQ(error, "Item 1 \"Item 1\" has 20 points along axis 1; 31 are expected");
  EXPECT_FALSE(byItem.IsTsbFileValid(folder.file("out.tsb2"), &error));
}

class Projection : public ::testing::Test {
 protected:
  int ask(const std::optional<TsbGeography>& place) {
    test::writeGrid(path, {.geography = place});
    list.GetArea(1)->fileName = path;
    return list.GetProjection(&text, &flag);
  }
  test::TemporaryFolder folder;
  Model model;
  CBathymetryKvs& list = *model.root.bathymetry;
  std::string path = folder.file("g.tsb2");
  std::string text;
  int flag = -1;
};

TEST_F(Projection, WithoutAPlaceItIsThatOfLocalCoordinates) {
  list.projection = "held";
  EXPECT_EQ(ask({}), 0);
  EXPECT_EQ(text, CVdMapProjection::IDtoProjectionString(1));
  EXPECT_EQ(list.projection, text);
  EXPECT_EQ(flag, 0);
  list.projection = "held";
  list.GetArea(1)->fileName = folder.file("none.tsb2");
  EXPECT_EQ(list.GetProjection(&text, &flag), 0);
  EXPECT_EQ(text, CVdMapProjection::IDtoProjectionString(1));
  list.SetNoAreas(0);
  EXPECT_EQ(list.GetProjection(&text, &flag), 0);
}

TEST_F(Projection, IsTakenFromTheFileAndSetsTheCoriolisFlag) {
  EXPECT_EQ(ask(TsbGeography{"EPSG:28356", 151.7, -32.9, 0}), 1);
  EXPECT_EQ(text, "EPSG:28356");
  EXPECT_EQ(flag, 1);
  EXPECT_TRUE(list.coriolis);
}

TEST_F(Projection, TheNameUtmAloneGetsItsZone) {
  ask(TsbGeography{"UTM", 9.2, 55, 0});
  EXPECT_EQ(text, "UTM-32");
  list.projection = "";
  ask(TsbGeography{"UTM", 11.9, 55, 0});
  EXPECT_EQ(text, "UTM-32");
  list.projection = "";
  ask(TsbGeography{"UTM-33", 9.2, 55, 0});
  EXPECT_EQ(text, "UTM-33");
}

TEST_F(Projection, AHeldOneIsKeptUnlessItIsStale) {
  list.projection = "UTM-31";
  EXPECT_EQ(ask(TsbGeography{"UTM-33", 15, 55, 0}), 1);
  EXPECT_EQ(text, "UTM-31");
  EXPECT_EQ(flag, 0);
  list.projectionStale = true;
  EXPECT_EQ(ask(TsbGeography{"UTM-33", 15, 55, 0}), 1);
  EXPECT_EQ(text, "UTM-33");
  EXPECT_FALSE(list.projectionStale);
}

TEST_F(Projection, ThePlaceOfTheFirstPoint) {
  double east = 0;
  double north = 0;
  ask(TsbGeography{"UTM-32", 9, 0, 0});
  EXPECT_EQ(list.GetGeoReference(&text, &east, &north), 1);
  EXPECT_EQ(text, "UTM-32");
  EXPECT_NEAR(east, 500000, 1e-3);
  EXPECT_NEAR(north, 0, 1e-3);
  ask({});
  EXPECT_EQ(list.GetGeoReference(&text, &east, &north), 0);
}

// The fine bathymetry of the overland solver, against an Area 1 of 10 x 8 points, 30 m apart.
class Overland : public ::testing::Test {
 protected:
  Overland() {
    area1.noJ = 10;
    area1.noK = 8;
    area1.dx = 30;
    area1.dy = 30;
  }
  std::string fault(const GridSpec& spec, std::vector<std::uint32_t> items = {1}) {
    test::writeGrid(folder.file("f.tsb2"), spec);
    return faultOfFile(items);
  }
  std::string faultOfFile(const std::vector<std::uint32_t>& items) {
    CVdFileSelectorDlg selector;
    selector.AddRequest(std::make_unique<COverlandRqTsbItem>(area1));
    std::string error;
    selector.IsTsbFileValid(folder.file("f.tsb2"), items, &error);
    return error;
  }
  test::TemporaryFolder folder;
  CBathymetryObjectKvs area1{nullptr};
};

TEST_F(Overland, CellsDivideThoseOfArea1) {
  EXPECT_EQ(fault({.noJ = 30, .noK = 16, .dx = 10, .dy = 15}), "");
  EXPECT_EQ(fault({.noJ = 10, .noK = 8, .dx = 30, .dy = 30}), "");
}

TEST_F(Overland, TheFirstRuleThatFailsIsTheMessage) {
  EXPECT_EQ(fault({.noJ = 31, .noK = 17, .items = 2}, {1, 2}), "Please select the first item only.");
  EXPECT_EQ(fault({.noJ = 30, .noK = 16, .items = 2}, {2}), "Please select the first item only.");
  EXPECT_EQ(fault({.noJ = 31, .noK = 17}),
            "The number of cells in J-dir. must be a multiple of the number of cells in area1.");
  EXPECT_EQ(fault({.noJ = 30, .noK = 17}),
            "The number of cells in K-dir. must be a multiple of the number of cells in area1.");
  EXPECT_EQ(fault({.noJ = 30, .noK = 16, .dx = 11, .dy = 15}),
            "The grid spacing in J-dir. must be a multiple of the grid spacing in area1.");
  EXPECT_EQ(fault({.noJ = 30, .noK = 16, .dx = 10, .dy = 15.2}),
            "The grid spacing in K-dir. must be a multiple of the grid spacing in area1.");
  EXPECT_EQ(fault({.noJ = 30, .noK = 16, .dx = 10.03, .dy = 15}), "");  // within a hundredth of its spacing
  test::writeSeries(folder.file("f.tsb2"), {}, 100079, "m");
  EXPECT_EQ(faultOfFile({1}), "2D Equidistant spatial axis required.");
  EXPECT_EQ(fault({.itemType = 100078}),
            "Fine bathymetry file: Item 1 \"Item 1\" is Surface elevation (type 100078); Bathymetry (type "
            "100079) is "
            "expected");
}

}  // namespace basic_bathymetry_test
}  // namespace gridbay
