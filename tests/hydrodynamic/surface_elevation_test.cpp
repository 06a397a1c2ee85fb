#include "hydrodynamic/surface_elevation.h"

#include <gmock/gmock.h>

#include "tests/hydrodynamic/area_fixture.h"

namespace gridbay {
namespace hydrodynamic_surface_elevation_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class SurfaceElevation : public test::AreaTest {
 protected:
  CNhdSurfaceElevationKvs& list() { return *root().nhdSurfaceElevation; }
  std::vector<std::string> faults(int deep = 1) { return faultsOf(list(), PageId::surfaceElevation, deep); }
};

TEST_F(SurfaceElevation, ANewOneIsWrittenInFileOrder) {
  test::Model one;
  EXPECT_EQ(savedText(*one.root.nhdSurfaceElevation),
            "SURFACE_ELEVATION {\n"
            "    AREA_1 {\n"
            "        Type 1\n"
            "        Constant_Value 0.0\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "}\n");
}

TEST_F(SurfaceElevation, IsReadBackAndCopied) {
  const std::string text =
      "SURFACE_ELEVATION {\n"
      "    AREA_1 {\n"
      "        Type 2\n"
      "        Constant_Value 0.25\n"
      "        File_Name (file)\"maps/level.tsb2\"\n"
      "        Item_Numbers 3\n"
      "    }\n"
      "    AREA_2 {\n"
      "        Type 1\n"
      "        Constant_Value -1.5\n"
      "        File_Name (file)\"\"\n"
      "        Item_Numbers 1\n"
      "    }\n"
      "}\n";
  test::load(list(), text);
  EXPECT_EQ(list().at(1).map.fileName.absolute(), "/case/maps/level.tsb2");
  EXPECT_EQ(savedText(list()), text);
  test::Model other;
  other.root.nhdSurfaceElevation->CopyFrom(list());
  EXPECT_EQ(savedText(*other.root.nhdSurfaceElevation), text);
}

TEST_F(SurfaceElevation, AMapFitsItsOwnArea) {
  list().at(1).type = list().at(2).type = 2;
  list().at(1).map.fileName = write("outer.tsb2", {.items = {{"Level", 100000, "m"}}});
  list().at(2).map.fileName = write("inner.tsb2", {.items = {{"Level", 100078, "m"}}, .axes = innerAxes()});
  EXPECT_THAT(faults(), IsEmpty());
  std::swap(list().at(1).map, list().at(2).map);
  EXPECT_THAT(faults(),
              ElementsAre(notValid(folder.file("inner.tsb2")), notValid(folder.file("outer.tsb2"))));
  EXPECT_THAT(faults(0), IsEmpty());
}

TEST_F(SurfaceElevation, WhatAMapMustBe) {
  list().at(1).type = 2;
  const auto isValid = [this](const Spec& spec) {
    list().at(1).map.fileName = write("map.tsb2", spec);
    return faults().empty();
  };
  const std::vector<TsbItem> level{{"Level", 100078, "m"}};
  EXPECT_TRUE(isValid({.items = level}));
  EXPECT_TRUE(isValid({.items = level, .seconds = 1}));
  EXPECT_FALSE(isValid({.items = {{"Depth", 100079, "m"}}}));
  EXPECT_FALSE(isValid({.items = {{"Level", 100078, "cm"}}}));
  EXPECT_FALSE(isValid({.items = level, .axes = {{11, 0, 30, "m"}, {8, 0, 30, "m"}}}));
  EXPECT_FALSE(isValid({.items = level, .axes = {{10, 0, 30, "m"}, {9, 0, 30, "m"}}}));
  EXPECT_FALSE(isValid({.items = level, .axes = {{10, 0, 31, "m"}, {8, 0, 30, "m"}}}));
  EXPECT_FALSE(isValid({.items = level, .axes = {{10, 0, 30, "m"}, {8, 0, 31, "m"}}}));
  EXPECT_FALSE(isValid({.items = level, .axes = {{10, 0, 30, "m"}}}));
  list().at(1).map.items = {2};
  EXPECT_FALSE(isValid({.items = level}));
}

TEST_F(SurfaceElevation, FilesThatCannotBeRead) {
  list().at(1).type = 2;
  for (const std::string& path : {std::string(), folder.file("none.tsb2"), folder.write("text.tsb2", "x"),
                                  folder.write("e.tsb2", "")}) {
    list().at(1).map.fileName = path;
    EXPECT_THAT(faults(), ElementsAre(notValid(path)));
  }
}

TEST_F(SurfaceElevation, AnotherTypeIsTold) {
  for (const std::int32_t type : {0, 3, -1}) {
    list().at(2).type = type;
    EXPECT_THAT(faults(),
                ElementsAre("Initial Surface Elevation : Type of initial surface elevation has to be "
                            "either constant value (1) of from file (2): "));
    EXPECT_THAT(faults(0), IsEmpty());
  }
}

TEST_F(SurfaceElevation, TheRequest) {
  CVdFileSelectorDlg selector;
  list().at(2).RequestMap(selector, 2);
  ASSERT_EQ(selector.requests().size(), 1U);
  EXPECT_EQ(selector.requests()[0]->description(), "Surface elevation");
  EXPECT_EQ(selector.requests()[0]->types(), (std::vector<int>{100000, 100078}));
  EXPECT_FALSE(selector.pluginEnabled());
}

}  // namespace hydrodynamic_surface_elevation_test
}  // namespace gridbay
