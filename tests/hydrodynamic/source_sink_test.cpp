#include "hydrodynamic/source_sink.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_source_sink_test {

using test::Model;
using test::savedText;
using ::testing::AllOf;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::Not;

constexpr int kEvaporationRate = 100432;
constexpr int kRainfallRate = 100431;
constexpr int kDischarge = 100001;
constexpr int kFlowVelocity = 100016;

// A model with a source, an isolated sink and a pair; the grid of Area 1 is 10 x 8 points of 30 m.
class HdSourceSink : public ::testing::Test {
 protected:
  HdSourceSink() {
    CBathymetryObjectKvs& area = *model.root.bathymetry->GetArea(1);
    area.noJ = 10;
    area.noK = 8;
    area.dx = 30;
    area.dy = 30;
    model.root.sourceSink->SetNoSources(3);
    for (int number = 1; number <= 3; ++number) model.root.sourceSink->GetItem(number)->type = number - 1;
  }
  CNhdSourceSinkKvs& flows() { return *model.root.nhdSourceSink; }
  CNhdSourceSinkObjectKvs& entry(int number) { return *flows().GetItem(number); }
  std::vector<std::string> faults(int deep = 1) {
    const ValidationList messages = test::messagesOf(flows(), deep);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::hdSourceAndSink);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  std::string notValid(const std::string& name) { return "Data file  \" " + name + "\"  is not valid"; }
  struct Item {
    int type;
    std::string unit;
  };
  std::string series(const std::vector<Item>& items, double step = 3000) {
    TsbDefinition definition;
    definition.time.step = step;
    definition.time.count = 2;
    for (const Item& item : items) definition.items.push_back({"Series", item.type, item.unit});
    const std::string path = folder.file("series.tsb0");
    test::writeFile(path, definition);
    return path;
  }
  std::string map(int type, const std::string& unit, int noJ = 10) {
    TsbTimeAxis time;
    time.step = 3000;
    test::GridSpec spec{.noJ = noJ, .itemType = type, .steps = 2, .unit = unit};
    spec.time = time;
    const std::string path = folder.file("map.tsb2");
    test::writeGrid(path, spec);
    return path;
  }

  test::TemporaryFolder folder;
  Model model;
};

constexpr std::string_view kNewEntry =
    "        Outlet_Dir 0.0\n"
    "        Data_Format 0\n"
    "        Constant_Magnitude 0.0\n"
    "        Constant_Velocity 0.0\n"
    "        File_Name (file)\"\"\n"
    "        Item_Numbers 1 2\n"
    "        Item_Magnitude \"\"\n"
    "        Item_Velocity \"\"\n";

TEST_F(HdSourceSink, ANewOneIsWrittenInFileOrder) {
  model.root.sourceSink->SetNoSources(2);
  EXPECT_EQ(savedText(flows()),
            "SOURCE_AND_SINK {\n"
            "    EvaporationType -1\n"
            "    Evaporation 0.0\n"
            "    Evaporation {\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "    NetPrecipitation #false\n"
            "    PrecipitationType -1\n"
            "    Precipitation 0.0\n"
            "    Precipitation {\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "    SOURCE_SINK_1 {\n" +
                std::string(kNewEntry) +
                "    }\n"
                "    SOURCE_SINK_2 {\n" +
                std::string(kNewEntry) +
                "    }\n"
                "    RainOnDryLand #true\n"
                "}\n");
}

constexpr std::string_view kFilled =
    "SOURCE_AND_SINK {\n"
    "    EvaporationType 0\n"
    "    Evaporation 2.5\n"
    "    Evaporation {\n"
    "        File_Name (file)\"evaporation.tsb0\"\n"
    "        Item_Numbers 3\n"
    "    }\n"
    "    NetPrecipitation #true\n"
    "    PrecipitationType 2\n"
    "    Precipitation 4.25\n"
    "    Precipitation {\n"
    "        File_Name (file)\"maps/rain.tsb2\"\n"
    "        Item_Numbers 2\n"
    "    }\n"
    "    SOURCE_SINK_1 {\n"
    "        Outlet_Dir 45.5\n"
    "        Data_Format 1\n"
    "        Constant_Magnitude 3.5\n"
    "        Constant_Velocity 1.25\n"
    "        File_Name (file)\"q.tsb0\"\n"
    "        Item_Numbers 4 2\n"
    "        Item_Magnitude \"Discharge\"\n"
    "        Item_Velocity \"Speed\"\n"
    "    }\n"
    "    RainOnDryLand #false\n"
    "}\n";

TEST_F(HdSourceSink, IsReadBack) {
  model.root.sourceSink->SetNoSources(1);
  test::load(flows(), kFilled);
  EXPECT_EQ(flows().evaporationKind, CNhdSourceSinkKvs::kTimeSeries);
  EXPECT_EQ(flows().evaporation, 2.5F);
  EXPECT_EQ(flows().evaporationFile.items, std::vector<std::uint32_t>{3});
  EXPECT_TRUE(flows().netPrecipitation);
  EXPECT_EQ(flows().precipitationKind, CNhdSourceSinkKvs::kMap);
  EXPECT_EQ(flows().precipitation, 4.25F);
  EXPECT_EQ(flows().precipitationFile.fileName.text(), "maps/rain.tsb2");
  EXPECT_FALSE(flows().rainOnDryLand);
  EXPECT_EQ(entry(1).dataFormat, CNhdSourceSinkObjectKvs::kFromFile);
  EXPECT_EQ(entry(1).outletDirection, 45.5F);
  EXPECT_EQ(entry(1).dataFile.items, (std::vector<std::uint32_t>{4, 2}));
  EXPECT_EQ(entry(1).itemVelocity, "Speed");
  EXPECT_EQ(savedText(flows()), kFilled);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(HdSourceSink, KindsHaveOtherNumbersOnFile) {
  const auto kindOf = [this](const std::string& number) {
    test::load(flows(),
               "SOURCE_AND_SINK { EvaporationType " + number + "; PrecipitationType " + number + " }");
    EXPECT_EQ(flows().evaporationKind, flows().precipitationKind);
    return flows().evaporationKind;
  };
  EXPECT_EQ(kindOf("0"), 1);
  EXPECT_EQ(kindOf("2"), 2);
  EXPECT_EQ(kindOf("-1"), 0);
  EXPECT_EQ(kindOf("2"), 2);
  for (const char* other : {"1", "3", "-2", "2147483647", "-2147483648"})
    EXPECT_EQ(kindOf(other), 2) << other;
  test::load(flows(), "SOURCE_AND_SINK {}");
  EXPECT_EQ(flows().evaporationKind, 2);
  flows().evaporationKind = 3;
  flows().precipitationKind = -1;
  EXPECT_THAT(savedText(flows()),
              AllOf(Not(HasSubstr("EvaporationType")), Not(HasSubstr("PrecipitationType"))));
}

TEST_F(HdSourceSink, WhatIsMissingKeepsItsValue) {
  flows().evaporationFile.fileName = "/a.tsb0";
  flows().precipitationFile.fileName = "/b.tsb0";
  model.root.sourceSink->SetNoSources(0);
  test::load(flows(), "SOURCE_AND_SINK { Evaporation 3.0; Precipitation 6.0 }");
  EXPECT_EQ(flows().evaporation, 3.0F);
  EXPECT_EQ(flows().evaporationFile.fileName.text(), "/a.tsb0");
  EXPECT_EQ(flows().precipitationFile.fileName.text(), "/b.tsb0");
  EXPECT_TRUE(flows().rainOnDryLand);
  test::load(flows(), "OTHER { Evaporation 9.0 }");
  EXPECT_EQ(flows().evaporation, 3.0F);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(HdSourceSink, AMissingEntryIsToldAndTheLoadGoesOn) {
  test::load(flows(),
             "SOURCE_AND_SINK { SOURCE_SINK_1 { Constant_Magnitude 1.0 }\n"
             " SOURCE_SINK_3 { Constant_Magnitude 3.0 }\n RainOnDryLand #false }");
  EXPECT_EQ(model.host.texts,
            std::vector<std::string>{"Error in the KVS-FILE\nThe number of Hydrodynamic Source Sink sections "
                                     "does not correspond to the number of Boundaries"});
  EXPECT_EQ(entry(1).constantMagnitude, 1.0F);
  EXPECT_EQ(entry(2).constantMagnitude, 0.0F);
  EXPECT_EQ(entry(3).constantMagnitude, 3.0F);
  EXPECT_FALSE(flows().rainOnDryLand);
}

TEST_F(HdSourceSink, ACountOfItsOwnMeansNothing) {
  for (const char* count : {"0", "7", "-1", "2147483647", "\"many\"", "#true", "1.5"}) {
    test::load(flows(), std::string("SOURCE_AND_SINK { Number_Of_Sources ") + count +
                            "; SOURCE_SINK_1 {}; SOURCE_SINK_2 {}; SOURCE_SINK_3 { Outlet_Dir 30.0 } }");
    EXPECT_EQ(flows().GetCount(), 3) << count;
    EXPECT_EQ(entry(3).outletDirection, 30.0F) << count;
  }
  EXPECT_TRUE(model.host.texts.empty());
  EXPECT_THAT(savedText(flows()), Not(HasSubstr("Number_Of_Sources")));
}

TEST_F(HdSourceSink, ValuesOfTheWrongKind) {
  test::load(
      flows(),
      "SOURCE_AND_SINK { EvaporationType \"map\"; Evaporation \"much\"; NetPrecipitation \"yes\"\n"
      " SOURCE_SINK_1 { Data_Format \"x\"; Item_Magnitude 5; Item_Numbers \"a\" \"b\" }; SOURCE_SINK_2 {}\n"
      " SOURCE_SINK_3 {} }");
  EXPECT_EQ(flows().GetCount(), 3);
  EXPECT_EQ(entry(1).dataFormat, 0);
}

TEST_F(HdSourceSink, TheSectionsBesideKeywordsOfTheirNamesAreKnown) {
  const std::string place = "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/";
  for (const char* name : {"Evaporation", "Precipitation", "SOURCE_SINK_3"})
    EXPECT_TRUE(model.root.KnowsSection(place + name)) << name;
  for (const char* name : {"NetPrecipitation", "EvaporationType", "SOURCE_SINK_4"})
    EXPECT_FALSE(model.root.KnowsSection(place + name)) << name;
}

TEST_F(HdSourceSink, FollowsTheCountOfLocations) {
  entry(1).constantMagnitude = 1;
  entry(3).constantMagnitude = 3;
  model.root.sourceSink->SetNoSources(2);
  EXPECT_EQ(flows().GetCount(), 2);
  model.root.sourceSink->SetNoSources(3);
  EXPECT_EQ(entry(1).constantMagnitude, 1);
  EXPECT_EQ(entry(3).constantMagnitude, 0);
}

TEST_F(HdSourceSink, CopyingTakesTheConstantsAndTheList) {
  model.root.sourceSink->SetNoSources(1);
  test::load(flows(), kFilled);
  Model other;
  other.root.sourceSink->SetNoSources(2);
  other.root.nhdSourceSink->GetItem(2)->constantMagnitude = 9;
  CNhdSourceSinkKvs& copy = *other.root.nhdSourceSink;
  copy.CopyFrom(flows());
  EXPECT_EQ(copy.evaporation, 2.5F);
  EXPECT_EQ(copy.precipitation, 4.25F);
  EXPECT_EQ(copy.evaporationKind, 0);
  EXPECT_EQ(copy.precipitationKind, 0);
  EXPECT_FALSE(copy.netPrecipitation);
  EXPECT_TRUE(copy.rainOnDryLand);
  EXPECT_TRUE(copy.evaporationFile.fileName.empty());
  EXPECT_TRUE(copy.precipitationFile.fileName.empty());
  ASSERT_EQ(copy.GetCount(), 1);
  EXPECT_EQ(savedText(*copy.GetItem(1)), savedText(entry(1)));
}

TEST_F(HdSourceSink, TheExactStateHasAllOfIt) {
  model.root.sourceSink->SetNoSources(1);
  test::load(flows(), kFilled);
  CNhdSourceSinkKvs copy(nullptr);
  copy.AssignState(flows());
  EXPECT_TRUE(copy.SameState(flows()));
  EXPECT_EQ(savedText(copy), kFilled);
  copy.precipitationKind = 1;
  EXPECT_FALSE(copy.SameState(flows()));
}

TEST_F(HdSourceSink, ConstantsHaveNoLimits) {
  flows().evaporation = -1;
  flows().precipitation = -2;
  flows().precipitationFile.fileName = "/none.tsb0";
  entry(1).constantMagnitude = -5;
  entry(1).outletDirection = 999;
  entry(1).dataFile.fileName = "/none.tsb0";
  EXPECT_TRUE(faults().empty());
}

TEST_F(HdSourceSink, RainThenEvaporationThenEntries) {
  flows().precipitationKind = CNhdSourceSinkKvs::kTimeSeries;
  flows().evaporationKind = CNhdSourceSinkKvs::kMap;
  flows().precipitationFile.fileName = "/p.tsb0";
  flows().evaporationFile.fileName = "/e.tsb2";
  for (const int number : {1, 3}) {
    entry(number).dataFormat = CNhdSourceSinkObjectKvs::kFromFile;
    entry(number).dataFile.fileName = "/q" + std::to_string(number) + ".tsb0";
  }
  const std::string rain =
      notValid("/p.tsb0") + "  Error Message: cannot read \"/p.tsb0\": there is no such file";
  EXPECT_EQ(faults(), (std::vector<std::string>{rain, notValid("/e.tsb2"), notValid("/q1.tsb0"),
                                                notValid("/q3.tsb0")}));
  EXPECT_EQ(faults(0), (std::vector<std::string>{rain, notValid("/e.tsb2")}));
  flows().netPrecipitation = true;
  EXPECT_EQ(faults(0), std::vector<std::string>{rain});
  ValidationList messages;
  EXPECT_EQ(flows().Validate(messages, 1), 3U);
}

TEST_F(HdSourceSink, TimeSeriesOfRain) {
  flows().precipitationKind = CNhdSourceSinkKvs::kTimeSeries;
  for (const Item& item : {Item{100088, "mm d-1"}, {kRainfallRate, "mm h-1"}, {100070, "mm h-1"}}) {
    flows().precipitationFile.fileName = series({item});
    EXPECT_THAT(faults(), ElementsAre()) << item.type;
  }
  flows().precipitationFile.fileName = series({{kEvaporationRate, "mm d-1"}});
  EXPECT_THAT(faults(), ElementsAre(HasSubstr("Rainfall rate: Item 1 \"Series\" is Evaporation rate")));
  flows().precipitationFile.fileName = series({{kRainfallRate, "mm h-1"}}, 10);
  EXPECT_THAT(faults(), ElementsAre(HasSubstr("The file covers")));
  flows().precipitationFile.fileName = series({{kRainfallRate, "mm d-1"}});
  EXPECT_THAT(faults(), ElementsAre(HasSubstr("\"mm h-1\" is expected")));
  flows().precipitationFile.fileName = map(kRainfallRate, "mm h-1");
  EXPECT_THAT(faults(), ElementsAre(HasSubstr("has 2 dimensions; 0 are expected")));
  flows().precipitationFile.fileName = series({{kRainfallRate, "mm h-1"}, {kRainfallRate, "mm h-1"}});
  EXPECT_THAT(faults(), ElementsAre());
  flows().precipitationFile.items = {1, 2};
  EXPECT_THAT(faults(), ElementsAre(HasSubstr("The selection has 2 items; 1 are expected")));
}

TEST_F(HdSourceSink, MapsFitAreaOneAlone) {
  model.root.bathymetry->SetNoAreas(2);
  flows().precipitationKind = CNhdSourceSinkKvs::kMap;
  flows().precipitationFile.fileName = map(kRainfallRate, "mm h-1");
  EXPECT_THAT(faults(), ElementsAre());
  flows().precipitationFile.fileName = map(kRainfallRate, "mm h-1", 9);
  EXPECT_THAT(faults(), ElementsAre(HasSubstr("has 9 points along axis 1; 10 are expected")));
  flows().precipitationKind = CNhdSourceSinkKvs::kConstant;
  flows().evaporationKind = CNhdSourceSinkKvs::kMap;
  flows().evaporationFile.fileName = map(kEvaporationRate, "mm d-1");
  EXPECT_THAT(faults(), ElementsAre());
  flows().evaporationFile.fileName = map(kRainfallRate, "mm h-1");
  EXPECT_THAT(faults(), ElementsAre(notValid(folder.file("map.tsb2"))));
}

TEST_F(HdSourceSink, TimeSeriesOfEvaporation) {
  flows().evaporationKind = CNhdSourceSinkKvs::kTimeSeries;
  flows().evaporationFile.fileName = series({{kEvaporationRate, "mm d-1"}});
  EXPECT_THAT(faults(), ElementsAre());
  flows().evaporationFile.fileName = series({{100088, "mm d-1"}});
  EXPECT_THAT(faults(), ElementsAre(notValid(folder.file("series.tsb0"))));
}

TEST_F(HdSourceSink, ASourceTakesTwoItemsAndAnIsolatedSinkOne) {
  const std::string both = series({{kDischarge, "m3 s-1"}, {kFlowVelocity, "m s-1"}});
  for (const int number : {1, 2, 3}) {
    entry(number).dataFormat = CNhdSourceSinkObjectKvs::kFromFile;
    entry(number).dataFile.fileName = both;
  }
  EXPECT_THAT(faults(), ElementsAre());
  EXPECT_EQ(entry(1).dataFile.items, (std::vector<std::uint32_t>{1, 2}));
  EXPECT_EQ(entry(2).dataFile.items, (std::vector<std::uint32_t>{1}));
  series({{kDischarge, "m3 s-1"}});
  EXPECT_THAT(faults(), ElementsAre(notValid(both), notValid(both)));
  series({{100430, "m3 s-1"}, {100242, "m s-1"}});
  EXPECT_THAT(faults(), ElementsAre());
  series({{kFlowVelocity, "m s-1"}, {kDischarge, "m3 s-1"}});
  EXPECT_THAT(faults(), ElementsAre(notValid(both), notValid(both), notValid(both)));
  // An isolated sink that becomes a source takes the item that follows.
  model.root.sourceSink->GetItem(2)->type = CSourceSinkObjectKvs::kIsolatedSource;
  series({{kDischarge, "m3 s-1"}, {kFlowVelocity, "m s-1"}});
  EXPECT_THAT(faults(), ElementsAre());
  EXPECT_EQ(entry(2).dataFile.items, (std::vector<std::uint32_t>{1, 2}));
}

TEST_F(HdSourceSink, WhatARequestAsks) {
  CVdFileSelectorDlg source;
  entry(1).RequestDataFile(source, 1);
  ASSERT_EQ(source.requests().size(), 2U);
  EXPECT_EQ(source.requests()[0]->description(), "Magnitude");
  EXPECT_THAT(source.requests()[0]->types(), ElementsAre(100001, 100430));
  EXPECT_EQ(source.requests()[1]->description(), "Velocity");
  EXPECT_THAT(source.requests()[1]->types(), ElementsAre(100016, 100242));
  EXPECT_THAT(source.GetSelectedItems(), ElementsAre(1, 2));
  EXPECT_FALSE(source.pluginEnabled());
  CVdFileSelectorDlg sink;
  entry(2).RequestDataFile(sink, 2);
  EXPECT_EQ(sink.requests().size(), 1U);
  EXPECT_THAT(sink.GetSelectedItems(), ElementsAre(1));
  EXPECT_THAT(entry(2).dataFile.items, ElementsAre(1, 2));  // as long as nobody has chosen
  CVdFileSelectorDlg rain;
  flows().RequestPrecipitation(rain);
  EXPECT_EQ(rain.requests().at(0)->description(), "Rainfall rate");
  EXPECT_THAT(rain.requests()[0]->types(), ElementsAre(100088, 100431, 100070));
  EXPECT_FALSE(rain.pluginEnabled());
  CVdFileSelectorDlg evaporation;
  flows().RequestEvaporation(evaporation);
  EXPECT_THAT(evaporation.requests().at(0)->types(), ElementsAre(100432));
  EXPECT_FALSE(evaporation.pluginEnabled());
}

TEST_F(HdSourceSink, WithoutAModelNothingIsKnownOfLocations) {
  CNhdSourceSinkObjectKvs alone(nullptr);
  EXPECT_EQ(alone.NoItems(1), 2);
  EXPECT_EQ(entry(1).NoItems(99), 2);
}

TEST_F(HdSourceSink, RainAndEvaporationAreOn) {
  EXPECT_FALSE(flows().HasPrecipitation());
  EXPECT_FALSE(flows().HasEvaporation());
  flows().netPrecipitation = true;
  EXPECT_FALSE(flows().HasEvaporation());
  flows().precipitation = 0.5F;
  EXPECT_TRUE(flows().HasPrecipitation());
  EXPECT_TRUE(flows().HasEvaporation());
  flows().netPrecipitation = false;
  EXPECT_FALSE(flows().HasEvaporation());
  flows().evaporation = 1;
  EXPECT_TRUE(flows().HasEvaporation());
  flows().precipitation = -1;
  flows().evaporation = -1;
  EXPECT_FALSE(flows().HasPrecipitation());
  EXPECT_FALSE(flows().HasEvaporation());
  flows().precipitationKind = CNhdSourceSinkKvs::kMap;
  flows().evaporationKind = CNhdSourceSinkKvs::kTimeSeries;
  EXPECT_TRUE(flows().HasPrecipitation());
  EXPECT_TRUE(flows().HasEvaporation());
}

}  // namespace hydrodynamic_source_sink_test
}  // namespace gridbay
