#include "setup/page_places.h"

#include <gtest/gtest.h>

#include <map>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/source_sink.h"
#include "setup/dlg_enumerator.h"
#include "structures/weir.h"
#include "tests/support/model.h"

namespace gridbay {
namespace setup_page_places_test {

TEST(PagePlaces, AMessageLeadsToItsThingAndField) {
  struct Case {
    CMessage message;
    std::string thing;
    std::string field;
    int fieldNumber;
    std::string value;
  };
  const std::vector<ListEntry> second{{2, 3}};
  const Case cases[] = {
      {{PageId::floodAndDry, "Drying depth must be positive"}, "", "Drying depth:", 1, ""},
      {{PageId::simulationPeriod, "Warm-up period can not be negative"}, "", "Last:", 2, ""},
      {{PageId::sourceAndSink, "Sink no.2 is on land", {}, second}, "source 2", "Sink", 1, ""},
      {{PageId::bathymetry, "Data file  \" a b.tsb2\"  is not valid", {}, second},
       "area 2",
       "",
       1,
       "a b.tsb2"},
      {{PageId::bathymetry, "Can not nest file a in file b.  Illegal position of area.", {}, second},
       "area 2",
       "Origin",
       1,
       ""},
      {{PageId::adInitialConcentration, "?", {}, {{2, 3}, {1, 4}}}, "component 2, area 1", "", 1, ""},
      {{PageId::dikes, "Data file  \" d\"  is not valid  Error Message: why", {}, second},
       "dike 2",
       "",
       1,
       "d"},
      {{PageId::hdResult, "Filename: a.tsb2 is not valid", {}, {{1, 1}}},
       "output 1",
       "Data File",
       1,
       "a.tsb2"},
      {{PageId::moduleSelection, "?"}, "", "", 1, ""},
      // One text speaks of other fields on other pages.
      {{PageId::boundary, "First point coordinates can not be negative", {}, second},
       "boundary 2",
       "First point",
       1,
       ""},
      {{PageId::adResult, "First point coordinates can not be negative", {}, second}, "output 2", "J", 1, ""},
      {{PageId::adLineDischarge, "First point coordinates can not be negative", {}, second},
       "line 2",
       "First",
       1,
       ""},
  };
  for (const Case& each : cases) {
    SCOPED_TRACE(each.message.text);
    const PagePlace place = placeOfMessage(each.message);
    EXPECT_EQ(place.page, each.message.page);
    EXPECT_EQ(place.thing, each.thing);
    EXPECT_EQ(place.field, each.field);
    EXPECT_EQ(place.fieldNumber, each.fieldNumber);
    EXPECT_EQ(place.value, each.value);
    EXPECT_EQ(place.entries, each.message.entries);
  }
  // Polygons stand side by side.
  const PagePlace polygon = placeOfMessage({PageId::massBudget, "Invalid polygon", Severity::fault, second});
  EXPECT_EQ(polygon.thing, "polygon 2");
  EXPECT_EQ(polygon.column, 2);
  EXPECT_TRUE(polygon.entries.empty());
  const PagePlace corner =
      placeOfMessage({PageId::massBudget, "Point is outside of grid", Severity::fault, second});
  EXPECT_EQ(corner.column, 2);
  EXPECT_EQ(corner.entries, (std::vector<ListEntry>{{3, 0}}));
}

TEST(PagePlaces, EachKeywordHasItsPageAndEntry) {
  CGlobalKvs model;
  model.bathymetry->SetNoAreas(2);
  model.boundary->SetNoBoundaries(1);
  model.sourceSink->SetNoSources(3);
  model.nhdWeir->SetCount(2);
  const KvsHandle file = kvsCreate();
  model.Save(*file, "/case/setup.v27");
  std::map<std::string, PagePlace> places;
  eachKeyword(*file, [&](const PagePlace& place, const Node&) { places[place.keyword] = place; });
  const auto isAt = [&](const std::string& path, PageId page, const std::string& thing, ListEntry entry) {
    SCOPED_TRACE(path);
    ASSERT_TRUE(places.contains(path));
    EXPECT_EQ(places[path].page, page);
    EXPECT_EQ(places[path].thing, thing);
    EXPECT_EQ(places[path].entries,
              entry.number == 0 ? std::vector<ListEntry>() : std::vector<ListEntry>{entry});
  };
  if (!theEdition.wetlandSweepKit)
    isAt("NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_2/Origin", PageId::bathymetry, "area 2", {2, 2});
  isAt("NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth", PageId::floodAndDry, "", {});
  isAt("HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/SOURCE_SINK_3/File_Name", PageId::hdSourceAndSink, "source 3",
       {3, 3});
  isAt("HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/Precipitation/File_Name", PageId::hdSourceAndSink, "", {});
  isAt("HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/HOTSTART_FILES/AREA_1/File_Name", PageId::hdResult, "", {});
  isAt("HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/WEIR/weir_data[2]/coordinate_type", PageId::weirs, "weir 2",
       {2, 2});
  for (const auto& [path, place] : places) {
    if (place.page != PageId::none) {
      EXPECT_NE(CDlgEnumerator().GetCaption(static_cast<std::int32_t>(place.page)), "") << path;
    }
  }
}

}  // namespace setup_page_places_test
}  // namespace gridbay
