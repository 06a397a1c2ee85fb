#include "platform/cartography/cartography.h"

#include <gmock/gmock.h>

#include <map>

#include "platform/cartography/grid_mapping.h"
#include "platform/projection_search.h"

namespace gridbay {
namespace platform_cartography_test {

using ::testing::HasSubstr;
using ::testing::StartsWith;

TEST(MapProjection, ByZoneCodeAndFullText) {
  for (const std::string& text : {std::string("UTM-32"), std::string("EPSG:32632"),
                                  CVdPRJParser::Format("UTM-32"), CVdMapProjection("UTM-32").Wkt()}) {
    const CVdMapProjection map(text);
    ASSERT_TRUE(map.IsValid()) << text;
    EXPECT_FALSE(map.IsLocal());
    double east = 0;
    double north = 0;
    ASSERT_TRUE(map.Geo2Proj(9, 55, &east, &north));
    EXPECT_NEAR(east, 500000, 1e-3);
    EXPECT_NEAR(north, 6094791.419, 1);
    double longitude = 0;
    double latitude = 0;
    ASSERT_TRUE(map.Proj2Geo(east, north, &longitude, &latitude));
    EXPECT_NEAR(longitude, 9, 1e-9);
    EXPECT_NEAR(latitude, 55, 1e-9);
  }
  EXPECT_EQ(CVdMapProjection("UTM-32").Name(), "WGS 84 / UTM zone 32N");
  EXPECT_EQ(CVdMapProjection("UTM-56S").Name(), "WGS 84 / UTM zone 56S");
  EXPECT_EQ(CVdMapProjection("EPSG:28356").Name(), "GDA94 / MGA zone 56");
}

TEST(MapProjection, FullTexts) {
  EXPECT_THAT(CVdPRJParser::Format("UTM-32"), StartsWith("PROJCS[\"WGS_1984_UTM_Zone_32N\""));
  EXPECT_EQ(CVdPRJParser::Format("UTM-32"), CVdMapProjection("UTM-32").GetProjectionString());
  EXPECT_EQ(CVdPRJParser::Format("nonsense"), "");
}

TEST(MapProjection, LocalCoordinatesHaveNoPlace) {
  const std::string local = CVdMapProjection::IDtoProjectionString(1);
  EXPECT_EQ(local, "Local Coordinates");
  for (const std::string& text : {local, std::string(), std::string("LOCAL_CS[\"x\"]")}) {
    const CVdMapProjection map(text);
    EXPECT_TRUE(map.IsLocal());
    EXPECT_TRUE(map.IsValid());
    double east = 7;
    double north = 8;
    EXPECT_FALSE(map.Geo2Proj(9, 55, &east, &north));
    EXPECT_EQ(east, 7);
    EXPECT_FALSE(map.Proj2Geo(1, 2, &east, &north));
    EXPECT_EQ(map.Wkt(), "");
  }
  EXPECT_THAT(CVdMapProjection::IDtoProjectionString(2), HasSubstr("WGS_1984"));
  EXPECT_EQ(CVdMapProjection::IDtoProjectionString(99), "");
}

TEST(MapProjection, TextsThatNameNone) {
  for (const char* text : {"UTM-0", "UTM-61", "UTM-x", "UTM-32Q", "EPSG:1", "PROJCS[", "nonsense"}) {
    EXPECT_FALSE(CVdMapProjection(text).IsValid()) << text;
  }
}

TEST(MapProjection, TheSecondVersionOfTheFullText) {
  EXPECT_THAT(CVdMapProjection("UTM-32").Wkt2(), StartsWith("PROJCRS[\"WGS 84 / UTM zone 32N\""));
  EXPECT_EQ(CVdMapProjection("Local Coordinates").Wkt2(), "");
  EXPECT_EQ(CVdMapProjection(CVdMapProjection("EPSG:28356").Wkt2()).Name(), "GDA94 / MGA zone 56");
}

TEST(GridMapping, ByTheConventions) {
  const auto numbers = [](const std::string& projection) {
    const std::optional<GridMapping> mapping = gridMappingOf(CVdMapProjection(projection).Wkt2());
    EXPECT_TRUE(mapping) << projection;
    std::map<std::string, std::vector<double>> all;
    if (mapping) all.insert(mapping->numbers.begin(), mapping->numbers.end());
    all[mapping ? mapping->name : ""];
    return all;
  };
  auto utm = numbers("EPSG:28356");
  EXPECT_TRUE(utm.contains("transverse_mercator"));
  EXPECT_EQ(utm["longitude_of_central_meridian"], std::vector<double>{153});
  EXPECT_EQ(utm["false_northing"], std::vector<double>{10000000});
  // Lengths in feet are told in metres.
  auto feet = numbers("EPSG:2263");
  EXPECT_TRUE(feet.contains("lambert_conformal_conic"));
  EXPECT_NEAR(feet["false_easting"].at(0), 300000, 1e-6);
  EXPECT_NEAR(feet["standard_parallel"].at(1), 40.6666666666667, 1e-9);
  EXPECT_NEAR(feet["standard_parallel"].at(0), 41.0333333333333, 1e-9);
  EXPECT_TRUE(numbers("EPSG:4326").contains("latitude_longitude"));
  EXPECT_TRUE(numbers("EPSG:3395").contains("mercator"));
  EXPECT_TRUE(numbers("EPSG:28992").contains("stereographic"));
  EXPECT_TRUE(numbers("EPSG:32661").contains("polar_stereographic"));
  EXPECT_TRUE(numbers("EPSG:5070").contains("albers_conical_equal_area"));
  for (const char* text : {"", "nonsense", "EPSG:2056", "EPSG:4978"})
    EXPECT_FALSE(gridMappingOf(text)) << text;
}

TEST(ProjectionSearch, ByAllWordsInAnyCaseTheLikeliestFirst) {
  struct Case {
    const char* words;
    const char* first;  // code and name
  };
  for (const Case& it : std::initializer_list<Case>{
           {"utm 32", "EPSG:32632 WGS 84 / UTM zone 32N"},
           {"wgs84 utm32n", "EPSG:32632 WGS 84 / UTM zone 32N"},
           {"UTM-56S", "EPSG:32756 WGS 84 / UTM zone 56S"},
           {"zone 56 mga", "EPSG:28356 GDA94 / MGA zone 56"},
           {"28356", "EPSG:28356 GDA94 / MGA zone 56"},
           {"epsg:28356", "EPSG:28356 GDA94 / MGA zone 56"},
           {"british grid", "EPSG:27700 OSGB36 / British National Grid"},
           {"gda2020 mga 56", "EPSG:7856 GDA2020 / MGA zone 56"},
           {"lambert nsw gda", "EPSG:3308 GDA94 / NSW Lambert"},
           {"4326", "EPSG:4326 WGS 84"},
       }) {
    const std::vector<KnownProjection> found = findProjections(it.words, 3);
    ASSERT_FALSE(found.empty()) << it.words;
    EXPECT_EQ(found.front().code + " " + found.front().name, it.first) << it.words;
    EXPECT_FALSE(found.front().area.empty());
    EXPECT_LE(found.size(), 3U);
  }
  for (const char* words : {"", "  ", " / ", "utm nowhere", "9999999"})
    EXPECT_TRUE(findProjections(words, 3).empty()) << words;
  EXPECT_TRUE(findProjections("utm", 0).empty());
  // One that is withdrawn.
  EXPECT_TRUE(findProjections("EPSG:2192", 3).empty());
}

TEST(ProjectionSearch, TheTextThatFilesHold) {
  for (const char* code : {"EPSG:32632", "32632", "UTM-32", "UTM-32N", "WGS 84 / UTM zone 32N"}) {
    const Result<std::string> text = projectionText(code);
    ASSERT_TRUE(text) << code;
    EXPECT_EQ(*text, "UTM-32") << code;
  }
  for (const char* code : {"EPSG:32756", "UTM-56S"})
    EXPECT_THAT(*projectionText(code), StartsWith("PROJCS[\"WGS_1984_UTM_Zone_56S\""));
  // Each leads to the same place as its code.
  for (const char* code :
       {"EPSG:28356", "EPSG:27700", "EPSG:2056", "EPSG:3857", "EPSG:28992", "EPSG:32661"}) {
    const Result<std::string> text = projectionText(code);
    ASSERT_TRUE(text) << code;
    const CVdMapProjection byCode(code);
    const CVdMapProjection byText(*text);
    double there[2]{};
    double again[2]{};
    ASSERT_TRUE(byCode.Geo2Proj(8, 60, &there[0], &there[1])) << code;
    ASSERT_TRUE(byText.Geo2Proj(8, 60, &again[0], &again[1])) << code;
    EXPECT_NEAR(there[0], again[0], 1e-3) << code;
    EXPECT_NEAR(there[1], again[1], 1e-3) << code;
  }
  EXPECT_EQ(*projectionText("Local Coordinates"), "Local Coordinates");
  for (const char* code : {"EPSG:1", "1", "foo", "UTM-61", "PROJCS[", "WGS 84 / UTM zone"}) {
    const Result<std::string> text = projectionText(code);
    ASSERT_FALSE(text) << code;
    EXPECT_EQ(text.error(), "\"" + std::string(code) + "\" is no projection that is known");
  }
}

TEST(Cartography, OriginAndRotation) {
  const CVdCartography turned("UTM-32", 1000, 2000, 90);  // y eastwards, x southwards
  double east = 0;
  double north = 0;
  turned.Xy2Proj(0, 10, &east, &north);
  EXPECT_NEAR(east, 1010, 1e-9);
  EXPECT_NEAR(north, 2000, 1e-9);
  double x = 0;
  double y = 0;
  turned.Proj2Xy(east, north, &x, &y);
  EXPECT_NEAR(x, 0, 1e-9);
  EXPECT_NEAR(y, 10, 1e-9);
  const CVdCartography plain("UTM-32", 0, 0, 0);
  double longitude = 0;
  double latitude = 0;
  ASSERT_TRUE(plain.Proj2Geo(500000, 6094791.419, &longitude, &latitude));
  EXPECT_NEAR(longitude, 9, 1e-6);
  EXPECT_NEAR(latitude, 55, 1e-4);
  ASSERT_TRUE(plain.Geo2Proj(9, 55, &east, &north));
  EXPECT_NEAR(east, 500000, 1e-3);
}

}  // namespace platform_cartography_test
}  // namespace gridbay
